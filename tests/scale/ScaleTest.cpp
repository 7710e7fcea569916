// Scales: degrees and key numbers, snapping onto the scale and moving by degrees,
// checked against models built on the scale's own list of key numbers, and the
// spelling tables and sign counts against the letter model.
#include "ScaleOracle.h"
#include "support/TestPrelude.h"

namespace {

using oracle::Mod12;
TEnh E(int e) { return static_cast<TEnh>(e); }
CScale::TType T(int type) { return static_cast<CScale::TType>(type); }

// The scale's key numbers, by degree.
std::vector<int> Keys(CScale const& scale) {
  std::vector<int> keys;
  for (int d = 0; d < scale.DegreesPerOctave(); ++d) keys.push_back(scale.DegreeNrToKeyNr(d));
  return keys;
}

TEST(ScaleDegrees, EveryTypeAndRoot) {
  for (int type : scaleoracle::TypeValues())
    for (int root = 0; root < 12; ++root) {
      CScale const scale(CNote(root, Enh_Natural), T(type));
      std::vector<int> const keys = Keys(scale);
      int const n = static_cast<int>(keys.size());
      for (std::size_t d = 1; d < keys.size(); ++d) ASSERT_GT(Mod12(keys[d] - root), Mod12(keys[d - 1] - root));
      for (int d = -3; d < 3 * n; ++d) {
        int const expected = d < 0 ? root : keys[static_cast<std::size_t>(d % n)];
        EXPECT_EQ(scale.DegreeNrToKeyNr(d), expected) << type << " " << root << " " << d;
        EXPECT_EQ(scale.DegreeNrToKey(d).NoteNr(), expected);
        EXPECT_TRUE(scale.DegreeNrToKey(d).HasSensefulEnh());
      }
      for (int k = -13; k <= 25; ++k) { // not reduced: 14 is no key number
        auto const at = std::find(keys.begin(), keys.end(), k);
        int const expected = at == keys.end() ? -1 : static_cast<int>(at - keys.begin());
        EXPECT_EQ(scale.KeyNrToDegreeNr(k), expected) << type << " " << root << " " << k;
        EXPECT_EQ(scale.HasKeyNr(k), expected >= 0);
        EXPECT_TRUE(k < 0 || k > 11 || scale.NoteToDegreeNr(CNote(24 + k, Enh_Natural)) == expected);
      }
    }
  CNote below(4, Enh_Natural);
  below.SetOct(-2); // a negative key number is on no degree
  EXPECT_EQ(CScale().NoteToDegreeNr(below), -1);
}

// The snap by its candidates: both start at the root r, so for 1..10 (and every k
// outside 0..11) the lower one is r when r lies above k, else the highest key
// number <= k, and the upper one is r when r lies below k, else the lowest key
// number >= k. 11 looks up to C (if in the scale, else r) and down to the highest
// key number; 0 looks down to B (if in the scale, else r) and up to the lowest.
int Snapped(std::vector<int> const& keys, int root, int k, bool tieUp) {
  auto has = [&](int key) { return std::find(keys.begin(), keys.end(), key) != keys.end(); };
  if (has(k)) return k;
  int const lowest = *std::min_element(keys.begin(), keys.end());
  int const highest = *std::max_element(keys.begin(), keys.end());
  int lower = root, upper = root;
  if (k == 11) {
    lower = highest;
    upper = has(0) ? 0 : root;
  } else if (k == 0) {
    lower = has(11) ? 11 : root;
    upper = lowest;
  } else {
    for (int key : keys) {
      if (root <= k && key <= k) lower = std::max(lower, key);
      if (root >= k && key >= k) upper = std::min(upper, key);
    }
  }
  long long const toUpper = std::llabs(upper - static_cast<long long>(k));
  long long const toLower = std::llabs(lower - static_cast<long long>(k));
  return toUpper != toLower ? (toUpper < toLower ? upper : lower) : (tieUp ? upper : lower);
}

TEST(ScaleQuantize, EveryKeyNumberRootTypeAndDirection) {
  std::vector<int> keyNrs = {INT_MIN, INT_MIN + 1, -1000000, 1000000, INT_MAX - 1, INT_MAX};
  for (int k = -3; k <= 14; ++k) keyNrs.push_back(k);
  for (int type : scaleoracle::TypeValues())
    for (int root = 0; root < 12; ++root) {
      CScale const scale(CNote(root, Enh_Natural), T(type));
      for (int k : keyNrs)
        for (int dir : {0, 1, 2, -1}) {
          auto const direction = static_cast<CScale::TQuantizeToScaleDirection>(dir);
          int const degree = scale.KeyNrQuantizeToDegreeNr(k, direction);
          ASSERT_TRUE(degree >= 0 && degree < scale.DegreesPerOctave());
          EXPECT_EQ(scale.DegreeNrToKeyNr(degree), Snapped(Keys(scale), root, k, dir == 0))
              << type << " " << root << " " << k << " " << dir;
          EXPECT_TRUE(k < 0 || k > 11 || scale.NoteQuantizeToDegreeNr(CNote(36 + k, Enh_Natural), direction) == degree);
        }
    }
}

// Moving a note of the scale by s degrees is the note s places further in the list
// of the scale's notes; a note off the scale is first taken up to the next one.
TEST(MoveInScale, StepsThroughTheScaleNotes) {
  for (int type : scaleoracle::TypeValues())
    for (scaleoracle::Root root : scaleoracle::Roots()) {
      CScale const scale(CNote(root.k, E(root.e)), T(type));
      std::vector<long> notes;
      for (long n = 0; n <= 127; ++n)
        if (scale.HasKeyNr(static_cast<int>(n % 12))) notes.push_back(n);
      for (long n = 12; n <= 115; ++n) {
        long const start = std::lower_bound(notes.begin(), notes.end(), n) - notes.begin();
        for (int steps = -12; steps <= 12; ++steps) {
          long const target = start + steps;
          if (target < 0 || target >= static_cast<long>(notes.size()) || notes[static_cast<std::size_t>(target)] > 119)
            continue;
          long const expected = notes[static_cast<std::size_t>(target)];
          ASSERT_EQ(scale.MoveInScale(CNote(n, Enh_Natural), steps),
                    CNote(expected, scale.EnhForKeynr(static_cast<int>(expected % 12))))
              << type << " " << root.k << " " << n << " " << steps;
        }
      }
    }
}

TEST(ScaleSpelling, EveryRootSpellingAndTypeMatchesTheLetterModel) {
  for (scaleoracle::Root root : scaleoracle::Roots())
    for (int type : scaleoracle::TypeValues()) {
      CScale const scale(CNote(48 + root.k, E(root.e)), T(type));
      ASSERT_EQ(scale.RootNote(), CNote(root.k, E(root.e)));
      scaleoracle::SpellingTable const expected = scaleoracle::Spellings(root, type);
      for (int k = 0; k < 12; ++k)
        EXPECT_EQ(scale.EnhForKeynr(k), expected.e[k]) << oracle::Name(root.k, root.e) << " " << type << " " << k;
      EXPECT_EQ(scale.SignsCount(), oracle::SignCount(root.k, root.e, type == 2 ? 2 : 1));
    }
  // The root is a key number with a senseful spelling, whatever note is given.
  CNote negative(61, Enh_Flat), sharpD(61, Enh_Sharp);
  negative.SetOct(-3); // note -1
  sharpD.SetNoteNr(62);
  EXPECT_EQ(CScale(negative, CScale::Scale_Minor).RootNote(), CNote(0, Enh_Natural));
  EXPECT_EQ(CScale(sharpD, CScale::Scale_Minor).RootNote(), CNote(2, Enh_Natural));
  EXPECT_EQ(CScale(CNote_Undef, CScale::Scale_Minor).RootNote(), CNote(3, Enh_Flat));
}

} // namespace
