#include "KeyText.h"

#include "NoteToken.h"
#include "QuotedText.h"

namespace {

enum TMode : int { Mode_None, Mode_Major, Mode_Minor, Mode_Unreadable };

bool IsBlank(char c) { return c == ' ' || c == '\t'; }

std::string_view Trimmed(std::string_view text) {
  while (!text.empty() && IsBlank(text.front())) text.remove_prefix(1);
  while (!text.empty() && IsBlank(text.back())) text.remove_suffix(1);
  return text;
}

bool EqualsIgnoringCase(std::string_view text, std::string_view word) {
  return text.size() == word.size() && StartsWithIgnoringCase(text, word);
}

// The mode after the tonic. A capital M alone is not read: in chord symbols it means
// major, which would surprise whoever meant "Cm".
TMode ModeOf(std::string_view rest) {
  rest = Trimmed(rest);
  if (rest.empty()) return Mode_None;
  if (rest == "m") return Mode_Minor;
  for (std::string_view word : {"min", "minor"})
    if (EqualsIgnoringCase(rest, word)) return Mode_Minor;
  for (std::string_view word : {"maj", "major"})
    if (EqualsIgnoringCase(rest, word)) return Mode_Major;
  return Mode_Unreadable;
}

bool IsMode(std::string_view rest) { return ModeOf(rest) != Mode_Unreadable; }

} // namespace

bool ReadKey(std::string_view text, CSignKey& key) {
  std::string buffer;
  std::string_view const plain = Trimmed(WithPlainSigns(text, buffer));
  CNote tonic;
  std::size_t const length = ReadNoteNameAtStart(plain, tonic, IsMode);
  if (length == 0) return false;
  tonic.CheckEnh();
  TMode mode = ModeOf(plain.substr(length));
  if (mode == Mode_None) mode = plain[0] >= 'a' && plain[0] <= 'z' ? Mode_Minor : Mode_Major;
  key = CSignKey(tonic, mode == Mode_Minor ? CSignKey::SignKey_Minor : CSignKey::SignKey_Major);
  return true;
}

std::string KeyProblemText(std::string_view text) { return "cannot read key " + Quoted(text); }
