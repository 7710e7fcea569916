// Writes the Harte label of every pitch-class set over a root with each of its notes
// in the bass, one line each: the label, then what it must name, as the chord has it
// (the root's pitch class, the pitch classes as a 12-bit mask of intervals above the
// root, the bass's interval above the root). check_harte_labels.py reads them with
// mir_eval. The roots and spellings vary with the set.
#include <tonvex/ChordSymbol.h>

#include <cstdio>

int main() {
  for (unsigned set = 1; set < 4096; ++set)
    for (int bass = 0; bass < 12; ++bass) {
      if ((set & (1u << bass)) == 0) continue;
      int const rootPc = static_cast<int>(set * 5 % 12);
      CMySet<CNote> notes;
      for (int i = 0; i < 12; ++i)
        if ((set & (1u << i)) != 0)
          notes.insert(CNote(48 + bass + (i - bass + 12) % 12 + rootPc,
                             static_cast<TEnh>((set + static_cast<unsigned>(i)) % 5)));
      CChord chord;
      chord.SetFromNoteSet(notes);
      chord.SetRootNote(CNote(rootPc, static_cast<TEnh>(set % 5)));
      std::printf("%s %d %u %d\n", HarteLabel(chord).c_str(), rootPc, set, bass);
    }
  return std::fflush(stdout) == 0 ? 0 : 1;
}
