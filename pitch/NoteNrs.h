// Arithmetic on computed note numbers and key numbers (internal).
#ifndef TONVEX_PITCH_NOTENRS_H
#define TONVEX_PITCH_NOTENRS_H

#include <cstdint>

/// The note number that every setter stores for a computed value: 255 (the undefined
/// note) passes, a value below 0 becomes 0 and a value above 127 becomes 127. Taking
/// a 64-bit value lets callers add offsets without overflow.
inline std::int32_t ClampNoteNr(long long noteNr) {
  if (noteNr == 255) return 255;
  if (noteNr < 0) return 0;
  if (noteNr > 127) return 127;
  return static_cast<std::int32_t>(noteNr);
}

/// The pitch class 0..11 of any value: the remainder by 12 made non-negative.
inline int PitchClass(long long value) {
  auto r = static_cast<int>(value % 12);
  return r < 0 ? r + 12 : r;
}

#endif
