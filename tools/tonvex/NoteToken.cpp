#include "NoteToken.h"

#include <tonvex/ChordnamePref.h>

namespace {

bool IsDigit(char c) { return c >= '0' && c <= '9'; }
bool IsLetter(char c) { return (c >= 'A' && c <= 'H') || (c >= 'a' && c <= 'h'); }

bool IsNumberToken(std::string_view token) {
  return !token.empty() && (IsDigit(token[0]) || (token[0] == '-' && token.size() > 1));
}

// The text of a note name: "C-2", "G8".
std::string NameWithOctave(long noteNr, TEnh enh) {
  CNote const note(noteNr, enh);
  return note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
}

} // namespace

// At most nine digits, so the value fits an int.
int DecimalValue(std::string_view token) {
  bool const negative = !token.empty() && token[0] == '-';
  int value = 0;
  for (std::size_t i = negative ? 1 : 0; i < token.size(); ++i) value = value * 10 + (token[i] - '0');
  return negative ? -value : value;
}

bool IsDecimalNumber(std::string_view token) {
  std::size_t i = (!token.empty() && token[0] == '-') ? 1 : 0;
  if (i == token.size() || token.size() - i > 9) return false;
  for (; i < token.size(); ++i)
    if (!IsDigit(token[i])) return false;
  return true;
}

TTokenProblem ReadNoteName(std::string_view token, CNote& note) {
  if (token.empty() || !IsLetter(token[0])) return Token_Unreadable;
  std::size_t i = 1;
  if (token.size() > 2 && token[1] == 'b' && token[2] == 'b')
    i += 2;
  else if (i < token.size() && (token[i] == 'b' || token[i] == 'x' || token[i] == '#'))
    ++i;
  std::string_view const octave = token.substr(i);
  if (!octave.empty() && !IsDecimalNumber(octave)) return Token_Unreadable;
  // A fresh natural note, so that a bare letter is read as natural.
  CNote parsed(0, Enh_Natural);
  if (!parsed.SetFromString(std::string(token), DefaultChordnamePref)) return Token_Unreadable;
  if (!octave.empty()) {
    // The octave as the library places it (note 60 in octave 4): -1..9 is placed
    // exactly, beyond that it clamps.
    int placed = DecimalValue(octave) + (CChordnamePref::NoteNr_60_is == 0   ? 1
                                         : CChordnamePref::NoteNr_60_is == 2 ? -1
                                                                             : 0);
    if (placed < -1 || placed > 9 || parsed.NoteNr() > 127) return Token_OutOfRange;
  }
  parsed.CheckEnh();
  note = parsed;
  return Token_Ok;
}

TTokenProblem ReadNote(std::string_view token, CNote& note) {
  if (!IsNumberToken(token)) return ReadNoteName(token, note);
  if (!IsDecimalNumber(token)) return Token_Unreadable;
  int noteNr = DecimalValue(token);
  if (noteNr < 0 || noteNr > 127) return Token_OutOfRange;
  note = CNote(noteNr, Enh_Natural);
  return Token_Ok;
}

TTokenProblem ReadKeyNumber(std::string_view token, int& keyNr) {
  if (!IsDecimalNumber(token)) return Token_Unreadable;
  int value = DecimalValue(token);
  if (value < 0 || value > 11) return Token_OutOfRange;
  keyNr = value;
  return Token_Ok;
}

std::string TokenProblemText(TTokenProblem problem, TTokenKind kind, std::string_view token) {
  const char* const what = kind == Kind_NoteName ? "note name" : kind == Kind_Note ? "note" : "key number";
  std::string text = problem == Token_Unreadable ? std::string("cannot read ") + what + " '" : what + std::string(" '");
  text += token;
  if (problem == Token_Unreadable) return text + "'";
  text += "' is out of range (";
  if (kind == Kind_KeyNumber)
    text += "0 to 11";
  else if (IsNumberToken(token))
    text += "0 to 127";
  else
    text += NameWithOctave(0, Enh_Natural) + " to " + NameWithOctave(127, Enh_Natural);
  return text + ")";
}
