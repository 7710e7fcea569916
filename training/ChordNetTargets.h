// What the built-in chord analysis net must meet (internal, training tools): entries
// of weight_definitions given as data, which training keeps exactly, and chords whose
// winner must stand out.
#ifndef TONVEX_TRAINING_CHORDNETTARGETS_H
#define TONVEX_TRAINING_CHORDNETTARGETS_H

#include <cstddef>
#include <vector>

struct TChordNetPin {
  std::size_t index;
  float value;
};
inline constexpr TChordNetPin ChordNetPins[] = {
    {0, -12.8459f},   {1, 84.8939f},   {2, 22.1978f},    {3, -43.6413f},  {4, -25.9571f},   {5, 75.0373f},
    {6, 47.4166f},    {7, -31.6487f},  {8, -0.473688f},  {9, 62.579f},    {360, 4.05962f},  {361, 17.7252f},
    {362, 0.737212f}, {363, 26.1606f}, {585, 2.76766f},  {586, 1.16248f}, {587, -11.2484f}, {588, -5.81468f},
    {757, -8.27008f}, {758, 13.1361f}, {759, -9.52837f}, {760, 11.3069f}, {761, -29.4672f}, {762, -16.8347f},
    {763, -13.2241f}, {764, 1.7355f},
};

/// Pitch classes above the bass, and the winner that must stand out for them.
struct TTellingChord {
  std::vector<int> intvls;
  int winner;
};
inline const TTellingChord TellingChords[] = {{{0}, 0},           {{0, 4, 7}, 0}, {{0, 3, 7}, 0},
                                              {{0, 4, 7, 10}, 0}, {{0, 3, 8}, 8}, {{0, 5, 9}, 5}};
/// The telling chords' winning outputs lie above this, the all-zero input's below
/// EmptyOutputBelow.
inline constexpr float TellingOutput = 0.99f;
inline constexpr float EmptyOutputBelow = 0.98f;

#endif
