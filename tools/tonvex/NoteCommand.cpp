// tonvex note NAME...: how the library reads and names notes.
#include "Commands.h"
#include "NoteToken.h"

#include <tonvex/ChordnamePref.h>
#include <tonvex/NoteNames.h>

#include <cstdio>
#include <vector>

namespace {

const char* SpellingWord(TEnh enh) {
  switch (enh) {
  case Enh_DoubleFlat: return "double flat";
  case Enh_Flat: return "flat";
  case Enh_Natural: return "natural";
  case Enh_Sharp: return "sharp";
  case Enh_DoubleSharp: return "double sharp";
  }
  return "?";
}

std::string NameInStyle(CNote const& note, int roman, int german) {
  int savedRoman = CChordnamePref::RomanNames, savedGerman = CChordnamePref::AccidentalsAsLetters;
  CChordnamePref::RomanNames = roman;
  CChordnamePref::AccidentalsAsLetters = german;
  std::string name = note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
  CChordnamePref::RomanNames = savedRoman;
  CChordnamePref::AccidentalsAsLetters = savedGerman;
  return name;
}

} // namespace

std::string NoteUsage() {
  return std::string("usage: tonvex note [OPTIONS] NAME...\n"
                     "\n"
                     "Reads each note name (a letter A..H, an optional accidental bb, b, x or #, and an\n"
                     "optional octave number; note 60 is C3) and prints its note number, its spelling\n"
                     "and its name in English, German and solfege style.\n"
                     "\n"
                     "Options:\n") +
         NoteNameOptionsHelp + OctaveOptionHelp + GeneralOptionsHelp;
}

int RunNoteCommand(CommandLine const& line) {
  Args const& args = line.Operands;
  if (args.empty()) return ShortUsage(Cmd_Note);
  std::vector<CNote> notes;
  for (std::string const& token : args) {
    CNote note;
    TTokenProblem problem = ReadNoteName(token, note);
    if (problem != Token_Ok) return UsageError(Cmd_Note, TokenProblemText(problem, Kind_NoteName, token));
    notes.push_back(note);
  }
  for (std::size_t i = 0; i < notes.size(); ++i) {
    CNote const& note = notes[i];
    std::printf("%s: note number %ld, %s, English %s, German %s, solfege %s\n", args[i].c_str(), note.NoteNr(),
                SpellingWord(note.Enh()), NameInStyle(note, 0, 0).c_str(), NameInStyle(note, 0, 1).c_str(),
                NameInStyle(note, 1, 0).c_str());
  }
  return 0;
}
