// Note names written into a buffer of their own (internal): chord names are put
// together from pieces, and building a std::string for the root and another for the
// bass cost more than the rest of many a name.
#ifndef TONVEX_PITCH_NOTENAMETEXT_H
#define TONVEX_PITCH_NOTENAMETEXT_H

#include "Note.h"

#include <cstddef>
#include <string_view>

/// A note name: up to five characters ("Ceses", "Eisis"), or "Undefined".
class CNoteNameText {
public:
  void Add(char c) { Text_[Size_++] = c; }
  void Add(std::string_view text) {
    for (char c : text) Add(c);
  }
  /// Replaces the whole text.
  void Set(std::string_view text) {
    Size_ = 0;
    Add(text);
  }
  char& Front() { return Text_[0]; }
  bool Empty() const { return Size_ == 0; }
  std::string_view View() const { return {Text_, Size_}; }

private:
  char Text_[16];
  std::size_t Size_ = 0;
};

/// KeyNrAndEnhToName of the key number and spelling, under the current preferences.
CNoteNameText KeyNameText(int keyNr, TEnh enh);
/// CNote::KeyName: "Undefined" for the undefined note, else KeyNameText.
CNoteNameText KeyNameText(CNote const& note);

#endif
