// Weights of the rule-based root scores (internal).
#ifndef TONVEX_CHORD_ROOTWEIGHTS_H
#define TONVEX_CHORD_ROOTWEIGHTS_H

#include <cstddef>

inline constexpr int RootWeights2[12] = {3, 0, 0, 2, 2, 0, 0, 1, 0, 0, 2, 2};
inline constexpr int RootWeights3[12] = {18, 0, 2, 12, 12, 2, 2, 14, 1, 2, 5, 5};
inline constexpr int RootWeights4[12] = {18, 0, 3, 12, 12, 3, 3, 14, 0, 3, 3, 3};
inline constexpr int RootWeights7[12] = {18, 8, 8, 12, 12, 6, 5, 14, 4, 4, 10, 10};

/// Weights by the distance in semitones from the candidate up to a chord note, for
/// a chord of `count` intervals: one table for 1 or 2, 3, 4 to 6, 7 and more.
constexpr int const* RootWeights(std::size_t count) {
  return count <= 2 ? RootWeights2 : (count == 3 ? RootWeights3 : (count <= 6 ? RootWeights4 : RootWeights7));
}

#endif
