// Scanning the text of chord symbols.
#include "naming/SymbolScanner.h"

namespace {

constexpr std::string_view Flat = "\xE2\x99\xAD";            // ♭
constexpr std::string_view Sharp = "\xE2\x99\xAF";           // ♯
constexpr std::string_view DoubleFlat = "\xF0\x9D\x84\xAB";  // 𝄫
constexpr std::string_view DoubleSharp = "\xF0\x9D\x84\xAA"; // 𝄪

char Lower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

} // namespace

void CSymbolScanner::SkipBlanks() {
  while (Peek() == ' ' || Peek() == '\t' || Peek() == '\r' || Peek() == '\n') ++Pos_;
}

bool CSymbolScanner::AtEnd() {
  SkipBlanks();
  return Pos_ >= Text_.size();
}

bool CSymbolScanner::IsLetterAt(std::size_t ahead) const {
  char const c = Lower(Peek(ahead));
  return c >= 'a' && c <= 'z';
}

bool CSymbolScanner::Take(std::string_view text) {
  if (Text_.substr(Pos_, text.size()) != text) return false;
  Pos_ += text.size();
  return true;
}

bool CSymbolScanner::TakeWord(std::string_view word) {
  if (Text_.size() - Pos_ < word.size()) return false;
  for (std::size_t i = 0; i < word.size(); ++i)
    if (Lower(Text_[Pos_ + i]) != word[i]) return false;
  Pos_ += word.size();
  return true;
}

bool CSymbolScanner::TakeNumber(int& value) {
  if (!NextIsDigit()) return false;
  value = Peek() - '0';
  ++Pos_;
  if (NextIsDigit()) {
    value = value * 10 + (Peek() - '0');
    ++Pos_;
  }
  return true;
}

bool CSymbolScanner::TakeAccidental(int& value, bool doubles, bool signs) {
  if (Take("b") || Take(Flat) || (signs && Take("-")))
    value = -1;
  else if (Take("#") || Take(Sharp) || (signs && Take("+")))
    value = 1;
  else if (doubles && (Take("x") || Take(DoubleSharp)))
    value = 2;
  else if (doubles && Take(DoubleFlat))
    value = -2;
  else
    return false;
  return true;
}

int CSymbolScanner::TakeAccidentals(bool doubles, bool signs) {
  int value = 0;
  for (;;) {
    std::size_t const before = Pos_;
    int one = 0;
    if (!TakeAccidental(one, doubles, signs)) return value;
    // One direction, two at most: the "#" of "Cb#" and the third "b" of "Cbbb" are
    // left for what follows.
    if ((value != 0 && (value > 0) != (one > 0)) || value + one > 2 || value + one < -2) {
      Pos_ = before;
      return value;
    }
    value += one;
  }
}

bool CSymbolScanner::TakeNoteName(CSpelledPitch& pitch) {
  char const c = Lower(Peek());
  if (c < 'a' || c > 'g') return false;
  ++Pos_;
  pitch = {(c - 'a' + 5) % 7, TakeAccidentals(true, false)};
  return true;
}

std::string_view CSymbolScanner::TakeName() {
  std::size_t const start = Pos_;
  while (NextIsLetter() || NextIsDigit()) ++Pos_;
  return Text_.substr(start, Pos_ - start);
}

bool CSymbolScanner::DegreeFollows(bool signs) const {
  CSymbolScanner ahead = *this;
  ahead.TakeAccidentals(false, signs);
  return ahead.NextIsDigit();
}
