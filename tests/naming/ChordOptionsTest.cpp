// Chord options of recognised chords: the map of ranks, the texts, their joining
// under both separators, the lonely-lowest-note rule and the undefined root. The
// expected ranks and strings are written out from the rule table.
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <vector>

namespace {

using namespace chordtest;
using C = CChord;
using OptionMap = std::map<int, C::TChordOption>;

CChord WithRoot(long root, std::vector<long> const& noteNrs) { return NotesThenRoot(Nat(root), noteNrs); }

struct OptionCase {
  std::vector<int> intvls;
  C::TBasicChord bc; // as recognised
  OptionMap map;
  std::string slashed;   // ChordOptionSep 0
  std::string bracketed; // ChordOptionSep 1
};

std::vector<OptionCase> const OptionCases = {
    {{0, 4, 7}, C::bc_maj, {}, "", ""},
    {{0, 4, 7, 10}, C::bc_maj, {{10, C::co_7}}, "7", "7"},
    {{0, 4, 7, 11}, C::bc_maj, {{11, C::co_ma7}}, "ma7", "ma7"},
    {{0, 2, 4, 7}, C::bc_maj, {{14, C::co_add_9}}, "add 9", "add 9"},
    {{0, 2, 4, 7, 10}, C::bc_maj, {{10, C::co_7}, {14, C::co_9}}, "7/9", "7(9)"},
    {{0, 1, 4, 7, 10}, C::bc_maj, {{10, C::co_7}, {13, C::co_b9}}, "7/b9", "7(b9)"},
    {{0, 1, 4, 7}, C::bc_maj, {{13, C::co_add_b9}}, "add b9", "add b9"},
    {{0, 3, 4, 7, 10}, C::bc_maj, {{10, C::co_7}, {15, C::co_sharp9}}, "7/#9", "7(#9)"},
    {{0, 4, 6, 7, 10}, C::bc_maj, {{10, C::co_7}, {18, C::co_sharp11}}, "7/#11", "7(#11)"},
    {{0, 4, 6, 10}, C::bc_maj, {{10, C::co_7}, {99, C::co_b5}}, "7/b5", "7(b5)"},
    {{0, 4, 7, 8}, C::bc_maj, {{20, C::co_b13}}, "b13", "b13"},
    {{0, 4, 8}, C::bc_aug, {}, "", ""},
    {{0, 4, 8, 10}, C::bc_aug, {{10, C::co_7}}, "7", "7"},
    {{0, 4, 6, 8}, C::bc_aug, {{18, C::co_sharp11}}, "#11", "#11"},
    {{0, 4, 7, 9}, C::bc_maj, {{9, C::co_6}}, "6", "6"},
    {{0, 4, 7, 9, 10}, C::bc_maj, {{10, C::co_7}, {21, C::co_13}}, "7/13", "7(13)"},
    {{0, 4, 7, 8, 9, 10}, C::bc_maj, {{9, C::co_6}, {10, C::co_7}, {20, C::co_b13}}, "6/7/b13", "6(7)(b13)"},
    {{0, 3, 6, 9}, C::bc_dim, {{9, C::co_7}}, "7", "7"},
    {{0, 3, 6}, C::bc_dim, {}, "", ""},
    {{0, 3, 6, 7}, C::bc_min, {{18, C::co_sharp11}}, "#11", "#11"},
    {{0, 3, 6, 10}, C::bc_min, {{10, C::co_7}, {99, C::co_b5}}, "7/b5", "7(b5)"},
    {{0, 3, 6, 8, 10}, C::bc_min, {{10, C::co_7}, {18, C::co_sharp11}, {99, C::co_sharp5}}, "7/#11/#5", "7(#11)(#5)"},
    {{0, 3, 7}, C::bc_min, {}, "", ""},
    {{0, 3, 7, 10}, C::bc_min, {{10, C::co_7}}, "7", "7"},
    {{0, 3, 4}, C::bc_maj, {{15, C::co_sharp9}}, "#9", "#9"},
    {{0, 3}, C::bc_min, {}, "", ""},
    {{0, 5, 7}, C::bc_sus4, {}, "", ""},
    {{0, 5, 7, 10}, C::bc_sus4, {{10, C::co_7}}, "7", "7"},
    {{0, 2, 5, 7}, C::bc_sus4, {{14, C::co_9}}, "9", "9"},
    {{0, 2, 7}, C::bc_sus2, {}, "", ""},
    {{0, 2, 7, 11}, C::bc_sus2, {{11, C::co_ma7}}, "ma7", "ma7"},
    {{0, 7}, C::bc_drone, {}, "", ""},
    {{0, 7, 10}, C::bc_none, {{7, C::co_5}, {10, C::co_7}}, "5/7", "5(7)"},
    {{0, 4}, C::bc_maj, {}, "", ""},
    {{0, 8}, C::bc_none, {{99, C::co_sharp5}}, "#5", "#5"},
    {{0, 3, 8}, C::bc_none, {{3, C::co_b3}, {99, C::co_sharp5}}, "b3/#5", "b3(#5)"},
    {{0, 6}, C::bc_none, {{99, C::co_b5}}, "b5", "b5"},
    {{0, 6, 7}, C::bc_none, {{7, C::co_5}, {18, C::co_sharp11}}, "5/#11", "5(#11)"},
    {{0}, C::bc_none, {}, "", ""},
    {{0, 2, 4, 5, 7, 9, 10},
     C::bc_maj,
     {{10, C::co_7}, {14, C::co_9}, {17, C::co_11}, {21, C::co_13}},
     "7/9/11/13",
     "7(9)(11)(13)"},
};

std::string Label(std::vector<int> const& intvls) { return ListLabel("intervals", intvls); }

TEST(ChordOptions, MapTextsAndBothSeparators) {
  PrefGuard guard;
  for (OptionCase const& c : OptionCases) {
    CChord chord = OverC(c.intvls);
    ASSERT_EQ(chord.BasicChord(), c.bc) << Label(c.intvls);
    EXPECT_EQ(chord.OptionsMap(DefaultChordnamePref), c.map) << Label(c.intvls);
    std::vector<std::string> texts;
    for (auto const& entry : c.map) texts.push_back(OptionName(entry.second, DefaultChordnamePref));
    EXPECT_EQ(chord.OptionsStringVector(DefaultChordnamePref), texts) << Label(c.intvls);
    for (int sep : {0, 2, -1, 1}) {
      CChordnamePref::ChordOptionSep = sep;
      EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), sep == 1 ? c.bracketed : c.slashed)
          << Label(c.intvls) << " sep " << sep;
    }
    CChordnamePref::ChordOptionSep = 0;
  }
}

TEST(ChordOptions, MajorSeventhStyles) {
  PrefGuard guard;
  CChord chord = OverC({0, 4, 7, 11});
  char const* const expected[] = {"ma7", "j7", "maj7", "ma7", "ma7"};
  for (int style = 0; style <= 4; ++style) {
    CChordnamePref::Maj7ShownAs = style;
    EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), expected[style]) << style;
  }
  CChordnamePref::Maj7ShownAs = 2;
  EXPECT_EQ(chord.OptionsMap(DefaultChordnamePref), (OptionMap{{11, C::co_maj7}}));
}

// Rank 99 holds the first altered fifth found; the intervals are visited in
// ascending order, so intervals cached above the octave decide which comes first.
TEST(ChordOptions, AlteredFifthsShareRankNinetyNineFirstFoundStays) {
  // b5 from 6, then 20 (an augmented fifth cached above the octave, not "has 8")
  // brings #5, which is dropped. 19 makes the chord major without "has 7".
  CChord flatFirst = RootedChord(60, {60, 64, 66, 79, 80});
  ASSERT_EQ(Members(flatFirst.IntvlSet()), (Intvls{0, 4, 6, 19, 20}));
  ASSERT_EQ(flatFirst.BasicChord(), C::bc_maj);
  EXPECT_EQ(flatFirst.OptionsMap(DefaultChordnamePref), (OptionMap{{99, C::co_b5}}));
  EXPECT_EQ(flatFirst.OptionsName(DefaultChordnamePref), "b5");

  // With a wrap interval of 36: #5 from 20, then b5 from 30, which is dropped.
  CChord sharpFirst(36);
  sharpFirst.SetRootNote(Nat(48));
  for (long n : {48, 52, 67, 68, 78}) sharpFirst.AddNote(Nat(n));
  ASSERT_EQ(Members(sharpFirst.IntvlSet()), (Intvls{0, 4, 19, 20, 30}));
  ASSERT_EQ(sharpFirst.BasicChord(), C::bc_maj);
  EXPECT_EQ(sharpFirst.OptionsMap(DefaultChordnamePref), (OptionMap{{99, C::co_sharp5}}));
  EXPECT_EQ(sharpFirst.OptionsName(DefaultChordnamePref), "#5");
}

TEST(ChordOptions, NinthCachedAboveTheOctaveIsAnAddedNinth) {
  // The root specified first keeps D5 as 14; no option other than 14 itself.
  CChord chord = RootedChord(60, {60, 64, 67, 74});
  ASSERT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4, 7, 14}));
  EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), "add 9");
  EXPECT_EQ(RootedChord(60, {60, 64, 67, 70, 74}).OptionsName(DefaultChordnamePref), "7/9");
}

struct LonelyCase {
  long root;
  std::vector<long> notes;
  std::string omitted; // OmitOptionOfLonelyLowestNoteInWideChord on
  std::string kept;    // off
};

std::vector<LonelyCase> const LonelyCases = {
    // D alone in its pitch class, span 17: no add 9.
    {60, {50, 60, 64, 67}, "", "add 9"},
    // Span 10: not wide.
    {60, {62, 64, 67, 72}, "add 9", "add 9"},
    // The lowest D doubled above: not lonely.
    {60, {50, 60, 64, 67, 74}, "add 9", "add 9"},
    // C under an E major chord, doubled two octaves up; C's pitch class number lies
    // below E's, so the doubling does not count and the C stays lonely.
    {64, {48, 64, 68, 71, 72}, "", "b13"},
    // The same shape over C with A flat, whose pitch class lies above C's: the
    // doubling counts.
    {60, {44, 60, 64, 67, 80}, "b13", "b13"},
    // C under E minor, lonely by its pitch class number: an octave is not wide, an
    // octave and a semitone is.
    {64, {48, 52, 55, 59, 60}, "b13", "b13"},
    {64, {48, 52, 55, 59, 61}, "6", "6/b13"},
    // A lonely lowest note only hides its own interval.
    {60, {50, 60, 64, 67, 70}, "7", "7/9"},
};

TEST(ChordOptions, LonelyLowestNoteInWideChords) {
  PrefGuard guard;
  for (LonelyCase const& c : LonelyCases) {
    CChord chord = WithRoot(c.root, c.notes);
    std::string label = "lowest " + std::to_string(c.notes.front()) + " root " + std::to_string(c.root);
    CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord = 1;
    EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), c.omitted) << label;
    CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord = 7;
    EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), c.omitted) << label;
    CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord = 0;
    EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), c.kept) << label;
  }
}

TEST(ChordOptions, UndefinedRootHasOptionsButNoOptionsName) {
  CChord chord = ChordOf({60, 64, 67, 70});
  chord.SetRootNote(CNote_Undef);
  // Above key number 3: C 9, E 1, G 4, B flat 7: a major chord with 6 and b9.
  EXPECT_EQ(chord.OptionsMap(DefaultChordnamePref), (OptionMap{{9, C::co_6}, {13, C::co_b9}}));
  EXPECT_EQ(chord.OptionsStringVector(DefaultChordnamePref), (std::vector<std::string>{"6", "b9"}));
  EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), "");
}

TEST(ChordOptions, EmptyChordHasNone) {
  EXPECT_TRUE(CChord(24).OptionsMap(DefaultChordnamePref).empty());
  EXPECT_TRUE(CChord(24).OptionsStringVector(DefaultChordnamePref).empty());
  EXPECT_EQ(CChord(24).OptionsName(DefaultChordnamePref), "");
  EXPECT_EQ(CChord_Undef.OptionsName(DefaultChordnamePref), "");
}

TEST(ChordOptions, OptionNameOutsideTheEnumerationIsEmpty) {
  EXPECT_EQ(OptionName(C::co_add_11, DefaultChordnamePref), "add 11");
  EXPECT_EQ(OptionName(C::co_maj7, DefaultChordnamePref), "maj7");
  EXPECT_EQ(OptionName(static_cast<C::TChordOption>(20), DefaultChordnamePref), "");
  EXPECT_EQ(OptionName(static_cast<C::TChordOption>(-1), DefaultChordnamePref), "");
}

} // namespace
