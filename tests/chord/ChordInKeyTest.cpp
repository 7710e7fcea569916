// A chord in a key: harmonic function codes, closeness to the key, the notes and
// intervals outside it. Expectations come from the degree tables of major and minor
// keys, the function codes and the closeness tables, all written out here as data.
#include "support/ChordBuilders.h"
#include <tonvex/Chord.h>
#include <tonvex/SignKey.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using namespace chordtest;

// Semitones above the key's root, by degree.
constexpr int MajorDegrees[7] = {0, 2, 4, 5, 7, 9, 11};
constexpr int MinorDegrees[7] = {0, 2, 3, 5, 7, 8, 10};

CSignKey Key(int root, bool major) {
  return CSignKey(Nat(root), major ? CSignKey::SignKey_Major : CSignKey::SignKey_Minor);
}

std::string KeyLabel(int root, bool major) { return std::to_string(root) + (major ? " major" : " minor"); }

// Whether pitch class pc (0..11) lies on a degree of the key.
bool InKey(int pc, int root, bool major) {
  for (int d : major ? MajorDegrees : MinorDegrees)
    if ((root + d) % 12 == pc) return true;
  return false;
}

// A chord of the basic chord built on pitch class pc; for bc_none the notes of
// root, fifth and minor seventh, which classify as no basic chord.
CChord ChordOn(int pc, int bc) {
  if (bc == CChord::bc_none) {
    CChord chord = ChordOf({48 + pc, 55 + pc, 58 + pc});
    chord.SetRootNote(Nat(48 + pc));
    return chord;
  }
  return CChord(Nat(60 + pc), static_cast<CChord::TBasicChord>(bc), 24);
}

// ---- Harmonic function -------------------------------------------------------------

struct FuncRow {
  int degree;
  int bc;
  int code;
};
// Every (degree, basic chord) pair with a code; all others give 0.
std::vector<FuncRow> const FuncCodes = {
    {0, CChord::bc_maj, 1},  {0, CChord::bc_min, 2},  {1, CChord::bc_maj, 3},   {1, CChord::bc_min, 4},
    {1, CChord::bc_dim, 5},  {2, CChord::bc_maj, 6},  {2, CChord::bc_min, 7},   {3, CChord::bc_maj, 8},
    {3, CChord::bc_min, 9},  {4, CChord::bc_maj, 10}, {4, CChord::bc_sus4, 10}, {4, CChord::bc_sus2, 10},
    {4, CChord::bc_min, 11}, {5, CChord::bc_maj, 12}, {5, CChord::bc_min, 13},  {6, CChord::bc_dim, 15}};

int ExpectedCode(int degree, int bc) {
  for (FuncRow const& row : FuncCodes)
    if (row.degree == degree && row.bc == bc) return row.code;
  return 0;
}

TEST(HarmFuncIn, EveryDegreeAndBasicChordInEveryKey) {
  for (bool major : {true, false})
    for (int root = 0; root < 12; ++root) {
      CSignKey key = Key(root, major);
      for (int dist = 0; dist < 12; ++dist) {
        int degree = -1;
        for (int d = 0; d < 7; ++d)
          if ((major ? MajorDegrees : MinorDegrees)[d] == dist) degree = d;
        for (int bc = 0; bc <= 7; ++bc) {
          CChord chord = ChordOn((root + dist) % 12, bc);
          ASSERT_EQ(chord.BasicChord(), bc);
          int expected = degree < 0 ? 0 : ExpectedCode(degree, bc);
          EXPECT_EQ(chord.HarmFuncIn(key), expected) << KeyLabel(root, major) << " distance " << dist << " bc " << bc;
        }
      }
    }
}

TEST(HarmFuncIn, NamedCases) {
  CSignKey cMajor = Key(0, true);
  EXPECT_EQ(ChordOn(0, CChord::bc_maj).HarmFuncIn(cMajor), 1);
  EXPECT_EQ(ChordOn(2, CChord::bc_min).HarmFuncIn(cMajor), 4);
  EXPECT_EQ(ChordOn(11, CChord::bc_dim).HarmFuncIn(cMajor), 15);
  EXPECT_EQ(ChordOn(7, CChord::bc_sus4).HarmFuncIn(cMajor), 10);
  EXPECT_EQ(ChordOn(7, CChord::bc_min).HarmFuncIn(cMajor), 11);
  EXPECT_EQ(ChordOn(10, CChord::bc_maj).HarmFuncIn(cMajor), 0);
  // The root counts by its pitch class, whatever its octave or spelling.
  CChord chord = ChordOf({43, 47, 50});
  chord.SetRootNote(CNote(31, Enh_DoubleSharp)); // G spelled F double sharp
  EXPECT_EQ(chord.HarmFuncIn(cMajor), 10);
  // The undefined root has key number 3: the third degree of C minor.
  CChord undefinedRoot = ChordOf({51, 55, 58});
  undefinedRoot.SetRootNote(CNote_Undef);
  EXPECT_EQ(undefinedRoot.HarmFuncIn(Key(0, false)), 6);
}

// ---- Closeness ---------------------------------------------------------------------

// The closeness tables by key mode and basic chord 1..7, indexed by the root's
// distance above the key's root.
struct ClosenessTable {
  bool major;
  int bc;
  int values[12];
};
std::vector<ClosenessTable> const ClosenessTables = {
    {true, CChord::bc_maj, {2, 0, 0, 0, 2, 2, 0, 2, 0, 0, 0, 0}},
    {true, CChord::bc_min, {0, 0, 2, 0, 2, 0, 0, 0, 0, 2, 0, 0}},
    {true, CChord::bc_dim, {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2}},
    {true, CChord::bc_aug, {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2}},
    {true, CChord::bc_sus4, {2, 0, 2, 0, 2, 0, 0, 2, 0, 2, 0, 0}},
    {true, CChord::bc_sus2, {2, 0, 2, 0, 0, 2, 0, 2, 0, 2, 0, 0}},
    {true, CChord::bc_drone, {2, 0, 2, 0, 2, 2, 0, 2, 0, 2, 0, 0}},
    {false, CChord::bc_maj, {0, 0, 0, 2, 0, 1, 0, 2, 2, 0, 2, 0}},
    {false, CChord::bc_min, {2, 0, 0, 0, 0, 2, 0, 2, 0, 2, 0, 0}},
    {false, CChord::bc_dim, {0, 0, 2, 0, 0, 0, 0, 0, 0, 0, 0, 2}},
    {false, CChord::bc_aug, {1, 1, 1, 1, 1, 1, 0, 2, 0, 0, 0, 0}},
    {false, CChord::bc_sus4, {1, 0, 0, 1, 0, 1, 0, 2, 0, 0, 1, 0}},
    {false, CChord::bc_sus2, {1, 0, 0, 1, 0, 1, 0, 1, 1, 0, 1, 0}},
    {false, CChord::bc_drone, {1, 0, 0, 1, 0, 1, 0, 1, 1, 0, 1, 0}},
};

TEST(ClosenessToSignKey, EveryTableEntryInEveryKey) {
  ASSERT_EQ(ClosenessTables.size(), 14u);
  for (ClosenessTable const& table : ClosenessTables)
    for (int root = 0; root < 12; ++root) {
      CSignKey key = Key(root, table.major);
      for (int dist = 0; dist < 12; ++dist) {
        CChord chord = ChordOn((root + dist) % 12, table.bc);
        ASSERT_EQ(chord.BasicChord(), table.bc);
        EXPECT_EQ(chord.ClosenessToSignKey(key), table.values[dist])
            << KeyLabel(root, table.major) << " distance " << dist << " bc " << table.bc;
      }
    }
}

TEST(ClosenessToSignKey, NoBasicChordGivesItsCountOfIntervalsInTheKey) {
  for (bool major : {true, false})
    for (int root = 0; root < 12; ++root)
      for (int pc = 0; pc < 12; ++pc) {
        // Root, fifth and minor seventh: no basic chord.
        int expected = 0;
        for (int intvl : {0, 7, 10}) expected += InKey((pc + intvl) % 12, root, major) ? 1 : 0;
        EXPECT_EQ(ChordOn(pc, CChord::bc_none).ClosenessToSignKey(Key(root, major)), expected)
            << KeyLabel(root, major) << " root " << pc;
      }
  EXPECT_EQ(CChord(24).ClosenessToSignKey(Key(0, true)), 0);
}

TEST(ClosenessToSignKey, NamedCases) {
  CSignKey cMajor = Key(0, true), aMinor = Key(9, false);
  EXPECT_EQ(ChordOn(4, CChord::bc_maj).ClosenessToSignKey(cMajor), 2);
  EXPECT_EQ(ChordOn(9, CChord::bc_min).ClosenessToSignKey(cMajor), 2);
  EXPECT_EQ(ChordOn(1, CChord::bc_dim).ClosenessToSignKey(Key(7, true)), 2);
  EXPECT_EQ(ChordOn(5, CChord::bc_maj).ClosenessToSignKey(aMinor), 2);
  EXPECT_EQ(ChordOn(2, CChord::bc_maj).ClosenessToSignKey(aMinor), 1);
}

// ---- Notes and intervals in the key --------------------------------------------------

TEST(ChordInKeyCounts, EveryPitchClassSetInEveryKey) {
  for (bool major : {true, false})
    for (int root = 0; root < 12; ++root) {
      CSignKey key = Key(root, major);
      for (unsigned set = 1; set < 4096; ++set) {
        // Each pitch class once, and those divisible by 3 doubled two octaves up.
        CMySet<int> noteNrs;
        int in = 0, out = 0, notesOut = 0;
        for (int pc = 0; pc < 12; ++pc) {
          if ((set >> pc & 1u) == 0) continue;
          bool inKey = InKey(pc, root, major);
          (inKey ? in : out) += 1;
          noteNrs.insert(48 + pc);
          notesOut += inKey ? 0 : 1;
          if (pc % 3 == 0) {
            noteNrs.insert(72 + pc);
            notesOut += inKey ? 0 : 1;
          }
        }
        CChord chord;
        chord.SetFromNoteNrSet(noteNrs);
        ASSERT_EQ(chord.CountIntvlsInSignKey(key), in) << KeyLabel(root, major) << " set " << set;
        ASSERT_EQ(chord.CountIntvlsNotInSignKey(key), out) << KeyLabel(root, major) << " set " << set;
        ASSERT_EQ(chord.CountNotesNotInSignKey(key), notesOut) << KeyLabel(root, major) << " set " << set;
        ASSERT_EQ(chord.IsInSignKey(key), out == 0) << KeyLabel(root, major) << " set " << set;
      }
    }
}

TEST(ChordInKeyCounts, EmptyChordIsInEveryKey) {
  for (bool major : {true, false})
    for (int root = 0; root < 12; ++root) {
      CSignKey key = Key(root, major);
      CChord empty(24);
      EXPECT_TRUE(empty.IsInSignKey(key)) << KeyLabel(root, major);
      EXPECT_EQ(empty.CountIntvlsInSignKey(key), 0);
      EXPECT_EQ(empty.CountIntvlsNotInSignKey(key), 0);
      EXPECT_EQ(empty.CountNotesNotInSignKey(key), 0);
      EXPECT_TRUE(CChord_Undef.IsInSignKey(key));
    }
}

TEST(ChordInKeyCounts, DoubledNotesCountTwiceOnlyAmongNotes) {
  CSignKey cMajor = Key(0, true);
  // D major with F sharp in three octaves.
  CChord chord = ChordOf({50, 54, 57, 66, 78});
  EXPECT_EQ(chord.CountNotesNotInSignKey(cMajor), 3);
  EXPECT_EQ(chord.CountIntvlsNotInSignKey(cMajor), 1);
  EXPECT_EQ(chord.CountIntvlsInSignKey(cMajor), 2);
  EXPECT_FALSE(chord.IsInSignKey(cMajor));
  EXPECT_TRUE(chord.IsInSignKey(Key(2, true)));
}

TEST(ChordInKeyCounts, IntervalsAboveTheOctaveCountByTheLowestNote) {
  // Under a root specified first, C sharp an octave up is cached as 13, which no
  // note's pitch class interval matches: the interval stands for the lowest note,
  // here C, which is in C major.
  CChord chord = RootedChord(60, {60, 64, 67, 73});
  ASSERT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4, 7, 13}));
  CSignKey cMajor = Key(0, true);
  EXPECT_EQ(chord.CountIntvlsInSignKey(cMajor), 4);
  EXPECT_TRUE(chord.IsInSignKey(cMajor));
  EXPECT_EQ(chord.CountNotesNotInSignKey(cMajor), 1);
}

} // namespace
