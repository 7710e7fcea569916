// Assembly of a name from pieces with one allocation at most (internal).
#ifndef TONVEX_NAMING_NAMEPARTS_H
#define TONVEX_NAMING_NAMEPARTS_H

#include <cstddef>
#include <cstring>
#include <string>
#include <string_view>

/// The pieces of a name, collected as views and joined once: the result is reserved
/// at its exact length, so a name costs at most one allocation (none when it fits
/// the string's inline buffer). The viewed texts must outlive Join.
class CNameParts {
public:
  /// Room for a chord name: root, two block separators, the basic chord, fourteen
  /// options (the first one piece, the others up to three) and the slash with the
  /// bass need 46 pieces.
  static constexpr int Capacity = 48;

  void Add(std::string_view part) {
    // A piece beyond Capacity, which no name needs, is dropped rather than written
    // out of bounds.
    if (Count_ == Capacity) return;
    Parts_[Count_++] = {part.data(), part.size()};
    Length_ += part.size();
  }

  std::string Join() const {
    // Sized once, then the pieces copied in place: no append call per piece.
    std::string text(Length_, '\0');
    char* out = text.data();
    for (int i = 0; i < Count_; ++i) {
      std::memcpy(out, Parts_[i].Text, Parts_[i].Size);
      out += Parts_[i].Size;
    }
    return text;
  }

private:
  // Left uninitialised: only the first Count_ pieces are ever read, and a name is
  // made often enough that clearing the whole array would show.
  struct CPiece {
    char const* Text;
    std::size_t Size;
  };
  CPiece Parts_[Capacity];
  int Count_ = 0;
  std::size_t Length_ = 0;
};

#endif
