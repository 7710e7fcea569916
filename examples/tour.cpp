// A guided tour of the library: notes, names, keys and scales, chords, root finding,
// harmonic function and the naming preferences. Its output is in tour.expected.
#include <tonvex/Tonvex.h>

#include <iostream>

int main() {
  // Preferences are process-wide statics; pass this object where one is asked for.
  CChordnamePref& pref = DefaultChordnamePref;

  // A note: a note number (60 = middle C, shown as C3) with its spelling.
  CNote note;
  note.SetFromString("Bb3", pref);
  std::cout << note.KeyName(pref) << note.OctName(pref) << ' ' << note.NoteNr() << '\n';
  note.EnhShift(); // the other spelling of the same pitch
  std::cout << note.KeyName(pref) << '\n';

  // Keys and scales, spelled from their key signature.
  CSignKey dMinor(CNote(2, Enh_Natural), CSignKey::SignKey_Minor);
  std::cout << dMinor.Name(pref) << ' ' << dMinor.SignsCount() << '\n';
  CScale eFlatMajor(CNote(3, Enh_Flat), CScale::Scale_Major);
  for (int d = 0; d < eFlatMajor.DegreesPerOctave(); ++d)
    std::cout << eFlatMajor.DegreeNrToKey(d).KeyName(pref) << ' ';
  std::cout << '\n';

  // A chord from note numbers (E Bb C G); the built-in net finds its root.
  CChord chord;
  chord.SetFromNoteNrSet(CMySet<int>{52, 58, 60, 67});
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
  std::cout << '[' << chord.Name(pref) << "]\n";
  std::cout << chord.RootNote().KeyName(pref) << " basic chord " << chord.BasicChord()
            << ", options " << chord.OptionsName(pref) << ", XG " << chord.XGChordIx()
            << '\n';

  // The chord in F major: the dominant, as a numeral and as a function letter.
  CSignKey fMajor(CNote(5, Enh_Natural), CSignKey::SignKey_Major);
  std::cout << chord.HarmFuncName(fMajor, pref) << ' ';
  CChordnamePref::HarmFuncNaming = 1;
  std::cout << chord.HarmFuncName(fMajor, pref) << '\n';
  CChordnamePref::HarmFuncNaming = 0;

  // German names and separated blocks, for D Ab Bb F.
  CChordnamePref::AccidentalsAsLetters = 1;
  CChordnamePref::SeparateBlocksInNames = 1;
  chord.SetFromNoteNrSet(CMySet<int>{50, 56, 58, 65});
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
  std::cout << '[' << chord.Name(pref) << "]\n";
}
