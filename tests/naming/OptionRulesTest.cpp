// The option rules under every basic chord an interval can meet, the basic chord
// given directly rather than recognised (which reaches rule branches that no note
// set classifies into, such as a minor seventh in a diminished chord), and the
// option texts. Expected ranks and options are written out from the rule table.
#include "naming/ChordOptions.h"
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace {

using namespace chordtest;
using C = CChord;
using Ranked = std::vector<std::pair<int, int>>; // rank, option

Ranked Found(CChord const& chord, C::TBasicChord bc) {
  CChordOptions options = FindChordOptions(chord, bc);
  Ranked found;
  for (int slot = 0; slot < CChordOptions::SlotCount; ++slot)
    if (options.Option[slot] != CChordOptions::NoOption)
      found.emplace_back(CChordOptions::Ranks[slot], options.Option[slot]);
  return found;
}

struct RuleCase {
  std::vector<int> intvls;
  C::TBasicChord bc;
  Ranked expected;
};

std::vector<RuleCase> const RuleCases = {
    // 1: b9 beside other options, else add b9; every basic chord alike.
    {{0, 1, 4, 7, 10}, C::bc_maj, {{10, C::co_7}, {13, C::co_b9}}},
    {{0, 1, 4, 7}, C::bc_maj, {{13, C::co_add_b9}}},
    {{0, 1, 3, 7}, C::bc_min, {{13, C::co_add_b9}}},
    {{0, 1, 5, 7}, C::bc_sus4, {{13, C::co_b9}}},
    // 2: nothing in sus2; else 9 beside other options, else add 9.
    {{0, 2, 7}, C::bc_sus2, {}},
    {{0, 2, 7, 10}, C::bc_sus2, {{10, C::co_7}}},
    {{0, 2, 4, 7, 10}, C::bc_maj, {{10, C::co_7}, {14, C::co_9}}},
    {{0, 2, 4, 7}, C::bc_maj, {{14, C::co_add_9}}},
    {{0, 2, 3, 7}, C::bc_min, {{14, C::co_add_9}}},
    {{0, 2, 5, 7}, C::bc_sus4, {{14, C::co_9}}},
    {{0, 2}, C::bc_none, {{14, C::co_add_9}}},
    // 3: #9 beside the major third; b3 when the chord is neither minor nor diminished.
    {{0, 3, 4, 7}, C::bc_maj, {{15, C::co_sharp9}}},
    {{0, 3, 4, 8}, C::bc_aug, {{15, C::co_sharp9}}},
    {{0, 3, 7}, C::bc_min, {}},
    {{0, 3, 6}, C::bc_dim, {}},
    {{0, 3, 7}, C::bc_maj, {{3, C::co_b3}}},
    {{0, 3, 5, 7}, C::bc_sus4, {{3, C::co_b3}}},
    {{0, 3, 7}, C::bc_drone, {{3, C::co_b3}}},
    {{0, 3}, C::bc_none, {{3, C::co_b3}}},
    // 4: the major third is an option unless the chord is major or augmented.
    {{0, 4, 7}, C::bc_maj, {}},
    {{0, 4, 8}, C::bc_aug, {}},
    {{0, 4, 7}, C::bc_min, {{4, C::co_3}}},
    {{0, 4, 5, 7}, C::bc_sus4, {{4, C::co_3}}},
    {{0, 4}, C::bc_none, {{4, C::co_3}}},
    // 5: nothing in sus4; else 11 beside other options, else add 11.
    {{0, 5, 7}, C::bc_sus4, {}},
    {{0, 4, 5, 7, 10}, C::bc_maj, {{10, C::co_7}, {17, C::co_11}}},
    {{0, 4, 5, 7}, C::bc_maj, {{17, C::co_add_11}}},
    {{0, 2, 5, 7}, C::bc_sus2, {{17, C::co_11}}},
    // 6: nothing in diminished; #11 beside a fifth or augmented fifth, else b5.
    {{0, 3, 6}, C::bc_dim, {}},
    {{0, 4, 6, 7, 10}, C::bc_maj, {{10, C::co_7}, {18, C::co_sharp11}}},
    {{0, 4, 6, 8}, C::bc_maj, {{18, C::co_sharp11}, {99, C::co_sharp5}}},
    {{0, 4, 6, 8}, C::bc_aug, {{18, C::co_sharp11}}},
    {{0, 4, 6, 10}, C::bc_maj, {{10, C::co_7}, {99, C::co_b5}}},
    {{0, 3, 6, 10}, C::bc_min, {{10, C::co_7}, {99, C::co_b5}}},
    // 7: the fifth is printed only in diminished, augmented and no basic chord.
    {{0, 4, 7}, C::bc_maj, {}},
    {{0, 3, 7}, C::bc_min, {}},
    {{0, 5, 7}, C::bc_sus4, {}},
    {{0, 7}, C::bc_drone, {}},
    {{0, 3, 6, 7}, C::bc_dim, {{7, C::co_5}}},
    {{0, 4, 7, 8}, C::bc_aug, {{7, C::co_5}}},
    {{0, 7}, C::bc_none, {{7, C::co_5}}},
    // 8: nothing in augmented; b13 beside the fifth, else #5.
    {{0, 4, 8}, C::bc_aug, {}},
    {{0, 4, 7, 8}, C::bc_maj, {{20, C::co_b13}}},
    {{0, 4, 8}, C::bc_maj, {{99, C::co_sharp5}}},
    {{0, 3, 8}, C::bc_none, {{3, C::co_b3}, {99, C::co_sharp5}}},
    // 9: 13 beside a seventh without the minor sixth; else a sixth, which in a
    // diminished chord is the diminished seventh.
    {{0, 4, 7, 9}, C::bc_maj, {{9, C::co_6}}},
    {{0, 3, 6, 9}, C::bc_dim, {{9, C::co_7}}},
    {{0, 4, 7, 9, 10}, C::bc_maj, {{10, C::co_7}, {21, C::co_13}}},
    {{0, 4, 7, 9, 11}, C::bc_maj, {{11, C::co_ma7}, {21, C::co_13}}},
    {{0, 4, 7, 8, 9, 10}, C::bc_maj, {{9, C::co_6}, {10, C::co_7}, {20, C::co_b13}}},
    {{0, 3, 6, 8, 9, 10}, C::bc_dim, {{9, C::co_7}, {10, C::co_7}, {99, C::co_sharp5}}},
    {{0, 2, 4, 5, 7, 9, 10}, C::bc_maj, {{10, C::co_7}, {14, C::co_9}, {17, C::co_11}, {21, C::co_13}}},
    // 10: 7 always; in a diminished chord b5 first, which stays unless #5 took rank 99.
    {{0, 4, 7, 10}, C::bc_maj, {{10, C::co_7}}},
    {{0, 5, 7, 10}, C::bc_sus4, {{10, C::co_7}}},
    {{0, 3, 6, 10}, C::bc_dim, {{10, C::co_7}, {99, C::co_b5}}},
    {{0, 3, 6, 8, 10}, C::bc_dim, {{10, C::co_7}, {99, C::co_sharp5}}},
    // 11: the major seventh as Maj7ShownAs says (default 0: "ma7").
    {{0, 4, 7, 11}, C::bc_maj, {{11, C::co_ma7}}},
    {{0, 11}, C::bc_none, {{11, C::co_ma7}}},
};

TEST(OptionRules, EveryRowUnderTheBasicChordsItMeets) {
  for (RuleCase const& c : RuleCases) {
    EXPECT_EQ(Found(OverC(c.intvls), c.bc), c.expected) << ListLabel("intervals", c.intvls) << " bc " << c.bc;
  }
}

TEST(OptionRules, MajorSeventhSpellingIsChosenWhenFound) {
  PrefGuard guard;
  struct Row {
    int pref;
    int option;
  } const rows[] = {{0, C::co_ma7}, {1, C::co_j7}, {2, C::co_maj7}, {3, C::co_ma7}, {4, C::co_ma7}, {-1, C::co_ma7}};
  for (Row const& row : rows) {
    CChordnamePref::Maj7ShownAs = row.pref;
    EXPECT_EQ(Found(OverC({0, 4, 7, 11}), C::bc_maj), (Ranked{{11, row.option}})) << row.pref;
  }
}

TEST(OptionRules, EmptyIntervalsGiveNoOptions) {
  EXPECT_EQ(Found(CChord(24), C::bc_maj), Ranked{});
  EXPECT_EQ(Found(CChord_Undef, C::bc_none), Ranked{});
}

TEST(OptionRules, TextsByValue) {
  char const* const texts[] = {"b9", "add b9", "9",   "add 9", "#9", "b3", "3", "11",  "add 11", "#11",
                               "b5", "5",      "b13", "#5",    "13", "7",  "6", "ma7", "j7",     "maj7"};
  for (int v = 0; v < 20; ++v) EXPECT_STREQ(OptionText(v), texts[v]) << v;
  for (int v : {-1, 20, 1000}) EXPECT_STREQ(OptionText(v), "") << v;
}

} // namespace
