// The insertion rule of interval sets, and filling a set from a bit mask (internal).
#ifndef TONVEX_CHORD_INTVLFOLD_H
#define TONVEX_CHORD_INTVLFOLD_H

#include "IntvlSet.h"

#include <cstdint>

/// Raises a negative value by whole octaves to the smallest value 0 or above, then
/// folds it by the wrap interval (0 = no folding; a negative wrap interval folds
/// like its magnitude, as the truncating remainder does). Never negative.
inline int FoldedIntvl(int value, int wrapIntvl) {
  if (value < 0) {
    value %= 12;
    if (value < 0) value += 12;
  }
  // The usual case, a value below a positive wrap interval, is its own remainder;
  // the division is left to the others.
  if (value < wrapIntvl || wrapIntvl == 0) return value;
  // value >= 0 here, so the remainder is defined under every wrap interval (-1 and
  // INT_MIN included) and is not negative.
  return value % wrapIntvl;
}

/// Empties the set (the wrap interval is kept), then inserts by the insertion rule
/// each value 0..31 whose bit is set in `mask`, ascending.
void SetIntvlsFromMask(CIntvlSet& set, std::uint32_t mask);

#endif
