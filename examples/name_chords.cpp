// Names notes, keys and chords through the public Tonvex interface.
#include <tonvex/Tonvex.h>

#include <iostream>

int main() {
  CChordnamePref& pref = DefaultChordnamePref;

  // Note names in, note numbers and spellings out (note 60 is C3 by default).
  for (const char* text : {"C3", "F#4", "Bb2", "H2"}) {
    CNote note;
    if (!note.SetFromString(text, pref)) continue;
    std::cout << text << ": note " << note.NoteNr() << ", " << note.KeyName(pref)
              << note.OctName(pref) << '\n';
  }

  // A key and its spelled degrees; German names are one preference away.
  CSignKey const key(CNote(6, Enh_Sharp), CSignKey::SignKey_Minor);
  for (int german = 0; german <= 1; ++german) {
    CChordnamePref::AccidentalsAsLetters = german;
    std::cout << "key " << key.Name(pref) << ":";
    for (int degree = 0; degree < 7; ++degree)
      std::cout << ' ' << key.Scale().DegreeNrToKey(degree).KeyName(pref);
    std::cout << '\n';
  }
  CChordnamePref::AccidentalsAsLetters = 0;

  // A chord from note numbers; the built-in net finds the root. Names keep their
  // blanks: "C  " is C major, the empty blocks being basic chord and options.
  CChord chord;
  chord.SetFromNoteNrSet({76, 79, 84}); // E4 G4 C5
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
  std::cout << "E4 G4 C5: \"" << chord.Name(pref) << "\", root "
            << chord.RootNote().KeyName(pref) << '\n';

  // Its harmonic function in G major, as a Roman numeral and as a function letter.
  CSignKey const gMajor(CNote(7, Enh_Natural), CSignKey::SignKey_Major);
  std::cout << "in " << gMajor.Name(pref) << ": " << chord.HarmFuncName(gMajor, pref);
  CChordnamePref::HarmFuncNaming = 1;
  std::cout << ", " << chord.HarmFuncName(gMajor, pref) << '\n';
  CChordnamePref::HarmFuncNaming = 0;

  // The same notes read over different roots.
  chord.SetFromNoteNrSet({69, 72, 76, 79}); // A3 C4 E4 G4
  for (long root : {0, 9})
    std::cout << "A3 C4 E4 G4 over " << CNote(root, Enh_Natural).KeyName(pref) << ": \""
              << chord.NameWithLeastSignsForThisRootNote(CNote(root, Enh_Natural), pref)
              << "\"\n";
}
