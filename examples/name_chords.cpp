// Reads note names and names notes and keys through the public Tonvex interface.
#include <Tonvex.h>

#include <iostream>

int main() {
  // Note names in, note numbers and spellings out (note 60 is C3 by default).
  for (const char* text : {"C3", "F#4", "Bb2", "H2"}) {
    CNote note;
    if (!note.SetFromString(text, DefaultChordnamePref)) continue;
    std::cout << text << ": note " << note.NoteNr() << ", " << note.KeyName(DefaultChordnamePref)
              << note.OctName(DefaultChordnamePref) << '\n';
  }

  // A key and its spelled degrees; German names are one preference away.
  CSignKey const key(CNote(6, Enh_Sharp), CSignKey::SignKey_Minor);
  for (int german = 0; german <= 1; ++german) {
    CChordnamePref::AccidentalsAsLetters = german;
    std::cout << "key " << key.Name(DefaultChordnamePref) << ":";
    for (int degree = 0; degree < 7; ++degree)
      std::cout << ' ' << key.Scale().DegreeNrToKey(degree).KeyName(DefaultChordnamePref);
    std::cout << '\n';
  }
  CChordnamePref::AccidentalsAsLetters = 0;
}
