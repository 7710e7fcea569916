// Reading a note name.
#include "ChordnamePref.h"
#include "Note.h"

#include <climits>
#include <string_view>

namespace {

// Key number of a note letter A..H in either case, or -1.
int LetterKeyNr(char c) {
  switch (c) {
  case 'A':
  case 'a': return 9;
  case 'B':
  case 'b': return CChordnamePref::Bb_is_B ? 10 : 11;
  case 'C':
  case 'c': return 0;
  case 'D':
  case 'd': return 2;
  case 'E':
  case 'e': return 4;
  case 'F':
  case 'f': return 5;
  case 'G':
  case 'g': return 7;
  case 'H':
  case 'h': return 11;
  default: return -1;
  }
}

bool IsSpace(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

// Decimal conversion with the rules of atoi (leading white space, a sign, digits up
// to the first other character, 0 without digits), saturating instead of
// overflowing so that an absurdly long octave number stays defined.
int ReadOctaveNumber(std::string_view text, std::size_t i) {
  while (i < text.size() && IsSpace(text[i])) ++i;
  bool negative = false;
  if (i < text.size() && (text[i] == '+' || text[i] == '-')) negative = text[i++] == '-';
  long value = 0;
  for (; i < text.size() && text[i] >= '0' && text[i] <= '9'; ++i)
    if (value < INT_MAX) value = value * 10 + (text[i] - '0');
  if (value > INT_MAX) value = INT_MAX;
  return static_cast<int>(negative ? -value : value);
}

int Wrapped(int keyNr) { return ((keyNr % 12) + 12) % 12; }

} // namespace

bool CNote::SetFromString(std::string textGiven, CChordnamePref const& /*pref*/) {
  // Read through a view: its length and characters stay in registers across the
  // calls below, which the string's own members would not.
  std::string_view const text = textGiven;
  std::size_t i = 0;
  while (i < text.size() && text[i] == ' ') ++i;
  if (i == text.size()) return false;
  int keyNr = LetterKeyNr(text[i]);
  if (keyNr < 0) return false;

  NoteNr_ = keyNr; // a bare letter keeps the spelling the note had
  if (++i == text.size()) return true;

  // The accidental moves the key number only; the octave is applied afterwards.
  auto applyAccidental = [this](int semitones, TEnh enh, std::size_t length, std::size_t& at) {
    NoteNr_ = Wrapped(NoteNr_ + semitones);
    Enh_ = enh;
    CheckEnh();
    at += length;
  };
  if (text[i] == 'b') {
    if (i + 1 < text.size() && text[i + 1] == 'b')
      applyAccidental(-2, Enh_DoubleFlat, 2, i);
    else
      applyAccidental(-1, Enh_Flat, 1, i);
  } else if (text[i] == 'x') {
    applyAccidental(2, Enh_DoubleSharp, 1, i);
  } else if (text[i] == '#') {
    applyAccidental(1, Enh_Sharp, 1, i);
  }
  if (i == text.size()) return true;

  long octave = ReadOctaveNumber(text, i);
  if (CChordnamePref::NoteNr_60_is == 0)
    ++octave;
  else if (CChordnamePref::NoteNr_60_is == 2)
    --octave;
  SetOct(octave < INT_MIN ? INT_MIN : (octave > INT_MAX ? INT_MAX : static_cast<int>(octave)));
  return true;
}
