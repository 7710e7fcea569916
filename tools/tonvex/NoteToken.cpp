#include "NoteToken.h"

#include "QuotedText.h"

#include <tonvex/ChordnamePref.h>
#include <tonvex/NoteNames.h>

#include <vector>

namespace {

bool IsDigit(char c) { return c >= '0' && c <= '9'; }
bool IsLetter(char c) { return (c >= 'A' && c <= 'H') || (c >= 'a' && c <= 'h'); }
char Lower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

bool IsNumberToken(std::string_view token) {
  return !token.empty() && (IsDigit(token[0]) || (token[0] == '-' && token.size() > 1));
}

bool IsOctaveOrNothing(std::string_view rest) { return rest.empty() || IsDecimalNumber(rest); }

// The text of a note name: "C-2", "G8".
std::string NameWithOctave(long noteNr, TEnh enh) {
  CNote const note(noteNr, enh);
  return note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
}

struct CNoteNameEntry {
  std::string Name;
  int KeyNr;
  TEnh Enh;
};

// The names the library writes for every senseful spelling of every key number in
// one naming style, after the given extra names: reading them back with the
// library's own tables keeps the two in step.
std::vector<CNoteNameEntry> NamesOfStyle(int roman, int german, std::vector<CNoteNameEntry> names) {
  int const savedRoman = CChordnamePref::RomanNames, savedGerman = CChordnamePref::AccidentalsAsLetters;
  CChordnamePref::RomanNames = roman;
  CChordnamePref::AccidentalsAsLetters = german;
  for (int keyNr = 0; keyNr < 12; ++keyNr)
    for (TEnh enh : {Enh_DoubleFlat, Enh_Flat, Enh_Natural, Enh_Sharp, Enh_DoubleSharp})
      if (IsSensefulEnhForKeyNr(keyNr, enh))
        names.push_back({KeyNrAndEnhToName(keyNr, enh, DefaultChordnamePref), keyNr, enh});
  CChordnamePref::RomanNames = savedRoman;
  CChordnamePref::AccidentalsAsLetters = savedGerman;
  return names;
}

std::vector<CNoteNameEntry> const& GermanNames() {
  // The library writes B sharp "Bis" and the double flats "Eeses" and "Aeses".
  static std::vector<CNoteNameEntry> const names = NamesOfStyle(
      0, 1,
      {{"His", 0, Enh_Sharp}, {"Hisis", 1, Enh_DoubleSharp}, {"Eses", 2, Enh_DoubleFlat}, {"Ases", 7, Enh_DoubleFlat}});
  return names;
}

std::vector<CNoteNameEntry> const& SolfegeNames() {
  static std::vector<CNoteNameEntry> const names = NamesOfStyle(1, 0, {});
  return names;
}

// The length of the longest name of the table that text starts with, or 0.
std::size_t ReadStyleName(std::string_view text, std::vector<CNoteNameEntry> const& names, CNote& note) {
  CNoteNameEntry const* best = nullptr;
  for (CNoteNameEntry const& entry : names)
    if ((best == nullptr || entry.Name.size() > best->Name.size()) && StartsWithIgnoringCase(text, entry.Name))
      best = &entry;
  if (best == nullptr) return 0;
  note = CNote(best->KeyNr, best->Enh);
  return best->Name.size();
}

// A letter and its accidental, read by the library.
std::size_t ReadEnglishName(std::string_view text, CNote& note) {
  if (text.empty() || !IsLetter(text[0])) return 0;
  std::size_t length = 1;
  if (text.size() > 2 && text[1] == 'b' && text[2] == 'b')
    length = 3;
  else if (text.size() > 1 && (text[1] == 'b' || text[1] == 'x' || text[1] == '#'))
    length = 2;
  // A fresh natural note, so that a bare letter is read as natural.
  CNote parsed(0, Enh_Natural);
  if (!parsed.SetFromString(std::string(text.substr(0, length)), DefaultChordnamePref)) return 0;
  note = parsed;
  return length;
}

} // namespace

bool StartsWithIgnoringCase(std::string_view text, std::string_view prefix) {
  if (text.size() < prefix.size()) return false;
  for (std::size_t i = 0; i < prefix.size(); ++i)
    if (Lower(text[i]) != Lower(prefix[i])) return false;
  return true;
}

std::string_view WithPlainSigns(std::string_view text, std::string& buffer) {
  static std::string_view const Signs[][2] = {
      {"\xE2\x99\xAF", "#"}, {"\xE2\x99\xAD", "b"}, {"\xF0\x9D\x84\xAA", "x"}, {"\xF0\x9D\x84\xAB", "bb"}};
  bool plain = true;
  for (char c : text) plain = plain && static_cast<unsigned char>(c) < 0x80;
  if (plain) return text;
  buffer.clear();
  for (std::size_t i = 0; i < text.size();) {
    std::size_t replaced = 0;
    for (auto const& sign : Signs)
      if (text.substr(i, sign[0].size()) == sign[0]) {
        buffer += sign[1];
        replaced = sign[0].size();
      }
    if (replaced == 0) buffer += text[i];
    i += replaced == 0 ? 1 : replaced;
  }
  return buffer;
}

std::size_t ReadNoteNameAtStart(std::string_view text, CNote& note, bool (*restFits)(std::string_view rest)) {
  // Solfège wins over German, as in the library's names.
  std::vector<CNoteNameEntry> const* names = CChordnamePref::RomanNames             ? &SolfegeNames()
                                             : CChordnamePref::AccidentalsAsLetters ? &GermanNames()
                                                                                    : nullptr;
  CNote read;
  std::size_t length = names != nullptr ? ReadStyleName(text, *names, read) : 0;
  if (length == 0 || !restFits(text.substr(length))) length = ReadEnglishName(text, read);
  if (length == 0 || !restFits(text.substr(length))) return 0;
  note = read;
  return length;
}

bool IsDecimalNumber(std::string_view token) {
  std::size_t i = (!token.empty() && token[0] == '-') ? 1 : 0;
  if (i == token.size() || token.size() - i > 9) return false;
  for (; i < token.size(); ++i)
    if (!IsDigit(token[i])) return false;
  return true;
}

// At most nine digits, so the value fits an int.
int DecimalValue(std::string_view token) {
  bool const negative = !token.empty() && token[0] == '-';
  int value = 0;
  for (std::size_t i = negative ? 1 : 0; i < token.size(); ++i) value = value * 10 + (token[i] - '0');
  return negative ? -value : value;
}

TTokenProblem ReadNoteName(std::string_view token, CNote& note) {
  std::string buffer;
  std::string_view const text = WithPlainSigns(token, buffer);
  CNote parsed;
  std::size_t const length = ReadNoteNameAtStart(text, parsed, IsOctaveOrNothing);
  if (length == 0) return Token_Unreadable;
  std::string_view const octave = text.substr(length);
  if (!octave.empty()) {
    // The octave as the library places it (note 60 in octave 4): -1..9 is placed
    // exactly, beyond that it clamps.
    int placed = DecimalValue(octave) + (CChordnamePref::NoteNr_60_is == 0   ? 1
                                         : CChordnamePref::NoteNr_60_is == 2 ? -1
                                                                             : 0);
    if (placed < -1 || placed > 9) return Token_OutOfRange;
    parsed.SetOct(placed);
    if (parsed.NoteNr() > 127) return Token_OutOfRange;
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
  if (problem == Token_Unreadable) return std::string("cannot read ") + what + ' ' + Quoted(token);
  std::string text = what + (' ' + Quoted(token)) + " is out of range (";
  if (kind == Kind_KeyNumber)
    text += "0 to 11";
  else if (IsNumberToken(token))
    text += "0 to 127";
  else
    text += NameWithOctave(0, Enh_Natural) + " to " + NameWithOctave(127, Enh_Natural);
  return text + ")";
}
