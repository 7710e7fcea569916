// The text of a chord symbol as the reader walks it: blanks, words, signs, numbers
// and note names (internal).
#ifndef TONVEX_NAMING_SYMBOLSCANNER_H
#define TONVEX_NAMING_SYMBOLSCANNER_H

#include "naming/SymbolDegrees.h"

#include <cstddef>
#include <string_view>

/// A position in a symbol's text. The Take functions consume what they name and
/// return true, or leave the position and return false.
class CSymbolScanner {
public:
  explicit CSymbolScanner(std::string_view text) : Text_(text) {}

  std::size_t Pos() const { return Pos_; }
  void SkipBlanks();
  /// At the end of the text, after blanks.
  bool AtEnd();
  /// The next byte (0 at the end).
  char Peek(std::size_t ahead = 0) const { return Pos_ + ahead < Text_.size() ? Text_[Pos_ + ahead] : '\0'; }
  bool IsDigitAt(std::size_t ahead) const { return Peek(ahead) >= '0' && Peek(ahead) <= '9'; }
  /// An ASCII letter.
  bool IsLetterAt(std::size_t ahead) const;
  bool NextIsDigit() const { return IsDigitAt(0); }
  bool NextIsLetter() const { return IsLetterAt(0); }

  /// Exactly this text (the UTF-8 signs too).
  bool Take(std::string_view text);
  /// This word in any case of its ASCII letters.
  bool TakeWord(std::string_view word);
  /// A decimal number of one or two digits.
  bool TakeNumber(int& value);
  /// One accidental sign: b # ♭ ♯ (and x 𝄪 𝄫 when doubles are admitted, + and -
  /// when signs are); its value -2..2.
  bool TakeAccidental(int& value, bool doubles, bool signs);
  /// Accidentals of one direction, at most two in all ("bb", "#", "𝄪"); their
  /// value, 0 for none.
  int TakeAccidentals(bool doubles, bool signs);
  /// A note name: a letter A..G (either case) and accidentals.
  bool TakeNoteName(CSpelledPitch& pitch);
  /// Letters and digits (a Harte shorthand); empty when none follow.
  std::string_view TakeName();
  /// Whether a degree follows: accidentals (b # ♭ ♯, and + - when signs are
  /// admitted) and a digit.
  bool DegreeFollows(bool signs) const;

private:
  std::string_view Text_;
  std::size_t Pos_ = 0;
};

#endif
