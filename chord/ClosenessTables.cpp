// Closeness of a chord to a key: one table per basic chord and key mode, indexed by
// the distance of the chord's root above the key's root. The values are fixed
// answers that hosts rank chords by, so they stand as given, odd ones included: a
// major chord a major third above a major key's root scores 2, diminished and
// augmented chords score 2 everywhere in a major key, and sus2 and drone chords score
// alike in a minor key.
#include "chord/ClosenessTables.h"

namespace {

// clang-format off
//                                           0  1  2  3  4  5  6  7  8  9 10 11
constexpr int bc_maj_closeto_ks_maj[12]   = {2, 0, 0, 0, 2, 2, 0, 2, 0, 0, 0, 0};
constexpr int bc_min_closeto_ks_maj[12]   = {0, 0, 2, 0, 2, 0, 0, 0, 0, 2, 0, 0};
constexpr int bc_dim_closeto_ks_maj[12]   = {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2};
constexpr int bc_aug_closeto_ks_maj[12]   = {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2};
constexpr int bc_sus4_closeto_ks_maj[12]  = {2, 0, 2, 0, 2, 0, 0, 2, 0, 2, 0, 0};
constexpr int bc_sus2_closeto_ks_maj[12]  = {2, 0, 2, 0, 0, 2, 0, 2, 0, 2, 0, 0};
constexpr int bc_drone_closeto_ks_maj[12] = {2, 0, 2, 0, 2, 2, 0, 2, 0, 2, 0, 0};
constexpr int bc_maj_closeto_ks_min[12]   = {0, 0, 0, 2, 0, 1, 0, 2, 2, 0, 2, 0};
constexpr int bc_min_closeto_ks_min[12]   = {2, 0, 0, 0, 0, 2, 0, 2, 0, 2, 0, 0};
constexpr int bc_dim_closeto_ks_min[12]   = {0, 0, 2, 0, 0, 0, 0, 0, 0, 0, 0, 2};
constexpr int bc_aug_closeto_ks_min[12]   = {1, 1, 1, 1, 1, 1, 0, 2, 0, 0, 0, 0};
constexpr int bc_sus4_closeto_ks_min[12]  = {1, 0, 0, 1, 0, 1, 0, 2, 0, 0, 1, 0};
constexpr int bc_sus2_closeto_ks_min[12]  = {1, 0, 0, 1, 0, 1, 0, 1, 1, 0, 1, 0};
constexpr int bc_drone_closeto_ks_min[12] = {1, 0, 0, 1, 0, 1, 0, 1, 1, 0, 1, 0};
// clang-format on

// Indexed by basic chord 1..7: major, minor, augmented, diminished, sus4, sus2, drone.
constexpr int const* MajorKeyTables[7] = {bc_maj_closeto_ks_maj,  bc_min_closeto_ks_maj,  bc_aug_closeto_ks_maj,
                                          bc_dim_closeto_ks_maj,  bc_sus4_closeto_ks_maj, bc_sus2_closeto_ks_maj,
                                          bc_drone_closeto_ks_maj};
constexpr int const* MinorKeyTables[7] = {bc_maj_closeto_ks_min,  bc_min_closeto_ks_min,  bc_aug_closeto_ks_min,
                                          bc_dim_closeto_ks_min,  bc_sus4_closeto_ks_min, bc_sus2_closeto_ks_min,
                                          bc_drone_closeto_ks_min};

} // namespace

int const* ClosenessTable(int basicChord, bool majorKey) {
  if (basicChord < 1 || basicChord > 7) return nullptr;
  return (majorKey ? MajorKeyTables : MinorKeyTables)[basicChord - 1];
}
