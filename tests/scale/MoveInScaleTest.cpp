// Moving notes by degrees within a scale.
#include "ScaleOracle.h"

#include <tonvex/Scale.h>

#include <gtest/gtest.h>

#include <climits>

namespace {

using scaleoracle::E;
using scaleoracle::T;

// The scale's notes in 0..127, ascending.
std::vector<long> ScaleNotes(CScale const& scale) {
  std::vector<long> notes;
  for (long n = 0; n <= 127; ++n)
    if (scale.HasKeyNr(static_cast<int>(n % 12))) notes.push_back(n);
  return notes;
}

// Moving a note of the scale by s degrees is the note s places further in the
// list of the scale's notes; a note off the scale is first taken up to the next one.
TEST(MoveInScale, StepsThroughTheScaleNotes) {
  for (int type : scaleoracle::TypeValues())
    for (scaleoracle::Root root : scaleoracle::Roots()) {
      CScale const scale(CNote(root.k, E(root.e)), T(type));
      std::vector<long> notes = ScaleNotes(scale);
      long count = static_cast<long>(notes.size());
      for (long n = 12; n <= 115; ++n) {
        long start = 0;
        while (notes[static_cast<std::size_t>(start)] < n) ++start;
        for (int steps = -12; steps <= 12; ++steps) {
          long target = start + steps;
          if (target < 0 || target >= count || notes[static_cast<std::size_t>(target)] > 119) continue;
          long expected = notes[static_cast<std::size_t>(target)];
          CNote moved = scale.MoveInScale(CNote(n, Enh_Natural), steps);
          ASSERT_EQ(moved.NoteNr(), expected) << "type " << type << " root " << root.k << " n " << n << " s " << steps;
          EXPECT_EQ(moved, CNote(expected, scale.EnhForKeynr(static_cast<int>(expected % 12))));
        }
      }
    }
}

TEST(MoveInScale, Examples) {
  CScale const cMajor;
  EXPECT_EQ(cMajor.MoveInScale(CNote(64, Enh_Natural), 2), CNote(67, Enh_Natural));  // E -> G
  EXPECT_EQ(cMajor.MoveInScale(CNote(64, Enh_Natural), -9), CNote(48, Enh_Natural)); // an octave and two down
  EXPECT_EQ(cMajor.MoveInScale(CNote(61, Enh_Flat), 0), CNote(62, Enh_Natural));     // snapped up
  EXPECT_EQ(cMajor.MoveInScale(CNote(61, Enh_Flat), -1), CNote(60, Enh_Natural));
  EXPECT_EQ(cMajor.MoveInScale(CNote(61, Enh_Flat), 1), CNote(64, Enh_Natural));
  // Spelled as the scale spells: D flat major moves C# to Db.
  CScale const dFlat(CNote(1, Enh_Flat), CScale::Scale_Major);
  EXPECT_EQ(dFlat.MoveInScale(CNote(61, Enh_Sharp), 7), CNote(73, Enh_Flat));
  // Chromatic C: the raised root is C#.
  CScale const chromatic(CNote(0, Enh_Natural), CScale::Scale_Chromatic);
  EXPECT_EQ(chromatic.MoveInScale(CNote(60, Enh_Natural), 13), CNote(73, Enh_Sharp));
}

TEST(MoveInScale, Edges) {
  // C sharp major has no G: note 127 cannot be raised and stays.
  CScale const cSharp(CNote(1, Enh_Sharp), CScale::Scale_Major);
  EXPECT_EQ(cSharp.MoveInScale(CNote(127, Enh_Natural), 0).NoteNr(), 127);
  EXPECT_EQ(cSharp.MoveInScale(CNote(115, Enh_Natural), 7).NoteNr(), 127);
  EXPECT_EQ(cSharp.MoveInScale(CNote(125, Enh_Natural), 3).NoteNr(), 126); // as far as it can
  // The octave rule places A flat major's G# at 128, where it stays.
  CScale const aFlat(CNote(8, Enh_Flat), CScale::Scale_Major);
  EXPECT_EQ(aFlat.MoveInScale(CNote(116, Enh_Flat), 7).NoteNr(), 128);
  EXPECT_EQ(aFlat.MoveInScale(CNote(116, Enh_Flat), 8).NoteNr(), 128);
  EXPECT_EQ(aFlat.MoveInScale(CNote(116, Enh_Flat), 6).NoteNr(), 116 + 11);
  EXPECT_EQ(aFlat.MoveInScale(CNote(116, Enh_Flat), 13).NoteNr(), 128);
  // Far below octave -1 the note falls to its negative key number, which is raised
  // onto the scale; the walk down stops at 0.
  CScale const cMajor;
  EXPECT_EQ(cMajor.MoveInScale(CNote(64, Enh_Natural), -50), CNote(0, Enh_Natural));
  EXPECT_EQ(cMajor.MoveInScale(CNote(64, Enh_Natural), -49), CNote(0, Enh_Natural));
  // Far above, SetOct puts the note in octave 8.
  EXPECT_EQ(cMajor.MoveInScale(CNote(64, Enh_Natural), 70), CNote(112, Enh_Natural));
  // The undefined note is moved from note number 255: octave 20, so octave 8, and
  // E flat is raised to E.
  EXPECT_EQ(cMajor.MoveInScale(CNote_Undef, 0), CNote(112, Enh_Natural));
  for (int steps : {INT_MIN, INT_MIN + 1, -1000, 1000, INT_MAX})
    for (long n : {0L, 60L, 127L, 255L}) {
      CNote moved = cMajor.MoveInScale(CNote(n, Enh_Natural), steps);
      EXPECT_GE(moved.NoteNr(), 0);
      EXPECT_LE(moved.NoteNr(), 127);
      EXPECT_TRUE(cMajor.HasNote(moved)) << n << " " << steps;
    }
}

} // namespace
