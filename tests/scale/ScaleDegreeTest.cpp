// Roots, degrees and key numbers of every scale type.
#include "ScaleOracle.h"

#include <tonvex/Scale.h>

#include <gtest/gtest.h>

namespace {

using scaleoracle::E;
using scaleoracle::T;

TEST(ScaleDegrees, EveryTypeAndRoot) {
  for (int type : scaleoracle::TypeValues())
    for (int root = 0; root < 12; ++root) {
      CScale const scale(CNote(root, Enh_Natural), T(type));
      std::vector<int> intervals = scaleoracle::DegreeIntervals(type);
      int n = static_cast<int>(intervals.size());
      ASSERT_EQ(scale.DegreesPerOctave(), n) << type;
      EXPECT_EQ(scale.ScaleType(), type);
      for (int d = -3; d < 3 * n; ++d) {
        int expected = d < 0 ? root : (root + intervals[static_cast<std::size_t>(d % n)]) % 12;
        EXPECT_EQ(scale.DegreeNrToKeyNr(d), expected) << "type " << type << " root " << root << " d " << d;
        CNote key = scale.DegreeNrToKey(d);
        EXPECT_EQ(key.NoteNr(), expected);
        EXPECT_TRUE(key.HasSensefulEnh());
      }
      for (int k = -13; k <= 25; ++k) {
        int expected = -1;
        for (int d = n - 1; d >= 0; --d)
          if ((root + intervals[static_cast<std::size_t>(d)]) % 12 == k) expected = d;
        EXPECT_EQ(scale.KeyNrToDegreeNr(k), expected) << "type " << type << " root " << root << " k " << k;
        EXPECT_EQ(scale.HasKeyNr(k), expected >= 0);
        if (k >= 0 && k < 12) {
          EXPECT_EQ(scale.NoteToDegreeNr(CNote(24 + k, Enh_Natural)), expected);
          EXPECT_EQ(scale.HasNote(CNote(108 + k, Enh_Natural)), expected >= 0);
        }
      }
    }
}

TEST(ScaleDegrees, EdgeCases) {
  CScale const dMajor(CNote(62, Enh_Natural), CScale::Scale_Major);
  EXPECT_EQ(dMajor.DegreeNrToKeyNr(-1), 2);
  EXPECT_EQ(dMajor.DegreeNrToKeyNr(7), 2);
  EXPECT_EQ(dMajor.KeyNrToDegreeNr(14), -1); // not reduced: 14 is no key number
  CScale const cMajorMinor(CNote(0, Enh_Natural), CScale::Scale_MajorMinor);
  EXPECT_EQ(cMajorMinor.DegreeNrToKeyNr(7), 10);
  EXPECT_EQ(cMajorMinor.DegreeNrToKeyNr(9), 0);
  // A negative note number has a negative key number, which is on no degree.
  CNote below(4, Enh_Natural);
  below.SetOct(-2);
  EXPECT_EQ(CScale().NoteToDegreeNr(below), -1);
  // Degrees of a chromatic scale are spelled by its table: F sharp over C.
  EXPECT_EQ(CScale(CNote(0, Enh_Natural), CScale::Scale_Chromatic).DegreeNrToKey(6), CNote(6, Enh_Sharp));
}

// The root is a key number with a senseful spelling, whatever note is given.
TEST(ScaleDegrees, RootIsAKeyNumber) {
  struct Case {
    CNote given;
    CNote root;
  };
  CNote negative(61, Enh_Flat);
  negative.SetOct(-3); // note number -1
  CNote uncheckedSharpD(61, Enh_Sharp);
  uncheckedSharpD.SetNoteNr(62); // a sharp on D, not checked yet
  const Case cases[] = {{CNote(69, Enh_Natural), CNote(9, Enh_Natural)},
                        {CNote(127, Enh_DoubleSharp), CNote(7, Enh_DoubleSharp)},
                        {negative, CNote(0, Enh_Natural)}, // flat on C shifts to natural
                        {CNote_Undef, CNote(3, Enh_Flat)},
                        {uncheckedSharpD, CNote(2, Enh_Natural)}};
  for (Case const& c : cases) {
    CScale scale(c.given, CScale::Scale_Minor);
    EXPECT_EQ(scale.RootNote(), c.root) << c.given.NoteNr();
    scale.SetRootNote(CNote(64, Enh_Natural));
    EXPECT_EQ(scale.ScaleType(), CScale::Scale_Minor);
    scale.SetRootNote(c.given);
    EXPECT_EQ(scale.RootNote(), c.root);
    EXPECT_EQ(scale.EnhForKeynr(c.root.KeyNr()), c.root.Enh());
    CScale other;
    other.SetRootNoteAndScaleType(c.given, CScale::Scale_Minor);
    EXPECT_EQ(other.RootNote(), c.root);
    EXPECT_EQ(other.ScaleType(), CScale::Scale_Minor);
  }
}

} // namespace
