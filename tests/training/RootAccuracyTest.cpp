// Root accuracy of the two root-finding algorithms: root finding from note numbers,
// the labelled root, and the tally of right answers.
#include "training/RootAccuracy.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

TEST(RootAccuracy, FoundRootFromNoteNumbers) {
  struct Case {
    std::vector<int> notes;
    int rules, net;
  };
  const Case cases[] = {
      // E G C: the rules score C 18 + 12 + 14; the net's winner for {0, 3, 8} is 8.
      {{64, 67, 72}, 0, 0},
      // C F A: F scores 14 + 18 + 12; the net's winner for {0, 5, 9} is 5.
      {{48, 53, 57}, 5, 5},
      // A single note is its own root for both (the rules score it 3, the net's
      // winner for {0} is 0).
      {{70}, 10, 10},
      {{}, -1, -1},
  };
  for (Case const& c : cases) {
    EXPECT_EQ(FoundRootKeyNr(c.notes, SCA_RULE_WEIGHTS), c.rules) << c.notes.size();
    EXPECT_EQ(FoundRootKeyNr(c.notes, SCA_NEURONAL_NET), c.net) << c.notes.size();
  }
  // Eb Gb C: Eb and C both score 32 by the rules, both lie in the chord, and Eb, the
  // lowest note, is nearer to itself.
  EXPECT_EQ(FoundRootKeyNr({39, 42, 48}, SCA_RULE_WEIGHTS), 3);
}

TEST(RootAccuracy, LabelledRootAboveTheBass) {
  EXPECT_EQ(LabelledRootKeyNr({{40, 43, 48}, 0, "", 8, true}), 0);
  EXPECT_EQ(LabelledRootKeyNr({{47, 50, 54}, 11, "", 0, true}), 11);
  EXPECT_EQ(LabelledRootKeyNr({{43, 48}, 0, "", 5, true}), 0);
  EXPECT_EQ(LabelledRootKeyNr({{43, 48}, 0, "", -1, true}), -1);
  EXPECT_EQ(LabelledRootKeyNr({{}, 0, "", 0, true}), -1);
}

// A stand-in for root finding: the rules always answer the lowest note, the net the
// note a fifth below it.
int LowestOrFifthBelow(std::vector<int> const& notes, TSingleChordAnalysisAlgo algo) {
  return (notes.front() + (algo == SCA_NEURONAL_NET ? 5 : 0)) % 12;
}

TEST(RootAccuracy, TallyPerAlgorithmAndDisagreements) {
  const std::vector<TChordVoicing> voicings = {
      {{48, 52, 55}, 0, "", 0, true},  // rules right
      {{43, 48, 52}, 0, "", 5, true},  // net right
      {{43, 48, 52}, 0, "", 5, false}, // net right, ambiguous
      {{40, 43, 48}, 0, "", 8, true},  // both wrong
      {{50, 53, 57}, 2, "", 0, false}, // rules right, ambiguous
      {{45, 48, 52}, 9, "", 0, true},  // rules right
      {{45, 47}, 0, "", -1, true},     // no label: nobody right
  };
  const TRootAccuracy a = MeasureRootAccuracy(voicings, LowestOrFifthBelow);
  EXPECT_EQ(a.voicings, 7);
  EXPECT_EQ(a.unambiguousVoicings, 5);
  EXPECT_EQ(a.rules.named, 3);
  EXPECT_EQ(a.rules.unambiguousNamed, 2);
  EXPECT_EQ(a.net.named, 2);
  EXPECT_EQ(a.net.unambiguousNamed, 1);
  EXPECT_EQ(a.onlyNetRight, (std::vector<std::size_t>{1}));
  EXPECT_EQ(a.onlyRulesRight, (std::vector<std::size_t>{0, 5}));
}

} // namespace
