// The tally of right root answers of the two root-finding algorithms, per voicing
// and on the unambiguous ones.
#include "training/RootAccuracy.h"
#include "support/TestPrelude.h"

namespace {

// A stand-in for root finding: the rules answer the lowest note, the net the note a
// fifth below it.
int LowestOrFifthBelow(std::vector<int> const& notes, TSingleChordAnalysisAlgo algo) {
  return (notes.front() + (algo == SCA_NEURONAL_NET ? 5 : 0)) % 12;
}

TEST(RootAccuracy, TallyPerAlgorithmAndDisagreements) {
  std::vector<TChordVoicing> const voicings = {
      {{48, 52, 55}, 0, "", 0, true},  // rules right
      {{43, 48, 52}, 0, "", 5, true},  // net right
      {{43, 48, 52}, 0, "", 5, false}, // net right, ambiguous
      {{40, 43, 48}, 0, "", 8, true},  // both wrong
      {{50, 53, 57}, 2, "", 0, false}, // rules right, ambiguous
      {{45, 47}, 0, "", -1, true},     // no label: nobody right
  };
  TRootAccuracy const a = MeasureRootAccuracy(voicings, LowestOrFifthBelow);
  EXPECT_TRUE(a.voicings == 6 && a.unambiguousVoicings == 4);
  EXPECT_TRUE(a.rules.named == 2 && a.rules.unambiguousNamed == 1);
  EXPECT_TRUE(a.net.named == 2 && a.net.unambiguousNamed == 1);
  EXPECT_EQ(a.onlyNetRight, (std::vector<std::size_t>{1}));
  EXPECT_EQ(a.onlyRulesRight, (std::vector<std::size_t>{0}));
}

} // namespace
