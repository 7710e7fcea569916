// Snapping key numbers onto a scale.
#include "ScaleOracle.h"

#include <tonvex/Scale.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <cstdlib>

namespace {

using scaleoracle::T;

// The snap described by its candidates, from the set of the scale's key numbers:
// both candidates start at the root r, so for 1..10 (and every k outside 0..11)
// the lower one is r when r lies above k, else the highest key number <= k, and
// the upper one is r when r lies below k, else the lowest key number >= k. Key
// number 11 looks up to C (if in the scale, else r) and down to the highest key
// number; key number 0 looks down to B (if in the scale, else r) and up to the
// lowest key number.
int ExpectedKeyNr(std::vector<int> const& keys, int root, int k, bool tieUp) {
  auto has = [&](int key) { return std::find(keys.begin(), keys.end(), key) != keys.end(); };
  if (has(k)) return k;
  int lowest = *std::min_element(keys.begin(), keys.end());
  int highest = *std::max_element(keys.begin(), keys.end());
  int lower = root, upper = root;
  if (k == 11) {
    lower = highest;
    upper = has(0) ? 0 : root;
  } else if (k == 0) {
    lower = has(11) ? 11 : root;
    upper = lowest;
  } else {
    if (root <= k)
      for (int key : keys)
        if (key <= k) lower = std::max(lower, key);
    if (root >= k)
      for (int key : keys)
        if (key >= k) upper = std::min(upper, key);
  }
  long long toUpper = std::llabs(upper - static_cast<long long>(k));
  long long toLower = std::llabs(lower - static_cast<long long>(k));
  if (toUpper != toLower) return toUpper < toLower ? upper : lower;
  return tieUp ? upper : lower;
}

// Key numbers around the octave, and far outside it: a host may pass any int, and the
// differences to INT_MIN and INT_MAX do not fit an int.
std::vector<int> KeyNumbersToSnap() {
  std::vector<int> keyNrs = {INT_MIN, INT_MIN + 1, -1000000, 1000000, INT_MAX - 1, INT_MAX};
  for (int k = -3; k <= 14; ++k) keyNrs.push_back(k);
  return keyNrs;
}

TEST(ScaleQuantize, EveryKeyNumberRootTypeAndDirection) {
  for (int type : scaleoracle::TypeValues())
    for (int root = 0; root < 12; ++root) {
      CScale const scale(CNote(root, Enh_Natural), T(type));
      std::vector<int> keys;
      for (int interval : scaleoracle::DegreeIntervals(type)) keys.push_back((root + interval) % 12);
      for (int k : KeyNumbersToSnap())
        for (int dir : {0, 1, 2, -1}) {
          int degree = scale.KeyNrQuantizeToDegreeNr(k, static_cast<CScale::TQuantizeToScaleDirection>(dir));
          ASSERT_GE(degree, 0);
          ASSERT_LT(degree, scale.DegreesPerOctave());
          EXPECT_EQ(scale.DegreeNrToKeyNr(degree), ExpectedKeyNr(keys, root, k, dir == 0))
              << "type " << type << " root " << root << " k " << k << " dir " << dir;
          if (k >= 0 && k < 12) {
            EXPECT_EQ(scale.NoteQuantizeToDegreeNr(CNote(36 + k, Enh_Natural),
                                                   static_cast<CScale::TQuantizeToScaleDirection>(dir)),
                      degree);
          }
        }
    }
}

TEST(ScaleQuantize, WorkedExamples) {
  CScale const cMajor;
  const int cMajorDegrees[12] = {0, 0, 1, 1, 2, 3, 3, 4, 4, 5, 5, 6};
  for (int k = 0; k < 12; ++k) {
    EXPECT_EQ(cMajor.KeyNrQuantizeToDegreeNr(k, CScale::Quantize_Up), cMajorDegrees[k]) << k;
    EXPECT_EQ(cMajor.KeyNrQuantizeToDegreeNr(k, CScale::Quantize_Down), cMajorDegrees[k]) << k;
  }
  CScale const gMajor(CNote(7, Enh_Natural), CScale::Scale_Major);
  EXPECT_EQ(gMajor.KeyNrQuantizeToDegreeNr(1, CScale::Quantize_Up), 4); // D
  EXPECT_EQ(gMajor.KeyNrQuantizeToDegreeNr(1, CScale::Quantize_Down), 4);
  // 0 and 11 look across the octave's edge.
  CScale const dMajor(CNote(2, Enh_Natural), CScale::Scale_Major);
  EXPECT_EQ(dMajor.KeyNrQuantizeToDegreeNr(0, CScale::Quantize_Up), 6); // C#, not B
  CScale const fMajor(CNote(5, Enh_Natural), CScale::Scale_Major);
  EXPECT_EQ(fMajor.KeyNrQuantizeToDegreeNr(11, CScale::Quantize_Up), 3); // Bb, not C
  // The root start: in E major G (7) goes to F# (degree 1), since the upper
  // candidate stays on E.
  CScale const eMajor(CNote(4, Enh_Natural), CScale::Scale_Major);
  EXPECT_EQ(eMajor.KeyNrQuantizeToDegreeNr(7, CScale::Quantize_Up), 1);
  // Far below the octave the nearest candidate is the scale's lowest key number, far
  // above it the highest: in G major C (degree 3) and B (degree 2).
  EXPECT_EQ(gMajor.KeyNrQuantizeToDegreeNr(INT_MIN, CScale::Quantize_Up), 3);
  EXPECT_EQ(gMajor.KeyNrQuantizeToDegreeNr(INT_MAX, CScale::Quantize_Up), 2);
}

} // namespace
