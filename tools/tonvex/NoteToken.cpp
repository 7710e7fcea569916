#include "NoteToken.h"

#include "ChordnamePref.h"

namespace {
bool IsDigit(char c) { return c >= '0' && c <= '9'; }
bool IsLetter(char c) { return (c >= 'A' && c <= 'H') || (c >= 'a' && c <= 'h'); }
} // namespace

bool IsDecimalNumber(std::string const& token) {
  std::size_t i = (!token.empty() && token[0] == '-') ? 1 : 0;
  if (i == token.size() || token.size() - i > 9) return false;
  for (; i < token.size(); ++i)
    if (!IsDigit(token[i])) return false;
  return true;
}

bool ReadNoteName(std::string const& token, CNote& note) {
  if (token.empty() || !IsLetter(token[0])) return false;
  std::size_t i = 1;
  if (token.compare(i, 2, "bb") == 0)
    i += 2;
  else if (i < token.size() && (token[i] == 'b' || token[i] == 'x' || token[i] == '#'))
    ++i;
  if (i < token.size() && !IsDecimalNumber(token.substr(i))) return false;
  // A fresh natural note, so that a bare letter is read as natural.
  CNote parsed(0, Enh_Natural);
  if (!parsed.SetFromString(token, DefaultChordnamePref)) return false;
  note = parsed;
  return true;
}
