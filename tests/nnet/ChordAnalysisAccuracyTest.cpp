// How well the compiled-in chord analysis net names the roots of the generated chord
// voicings, encoded as root finding encodes a chord.
#include "support/NeuronParamGuard.h"
#include "training/ChordPatterns.h"

#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <map>
#include <vector>

namespace {

int Mod12(int value) { return (value % 12 + 12) % 12; }

// The net's winner for each distinct set of pitch classes above the bass.
class Namer {
public:
  int Winner(std::vector<int> const& notes) {
    const int bass = *std::min_element(notes.begin(), notes.end());
    std::vector<float> inputs(24, 0.0f);
    for (int note : notes) inputs[static_cast<std::size_t>(Mod12(note - bass))] = 1.0f;
    auto known = winners_.find(inputs);
    if (known == winners_.end()) {
      net_.use(inputs);
      known = winners_.emplace(inputs, net_.winner()).first;
    }
    return known->second;
  }

private:
  NeuronParamGuard guard_;
  NeuronalNet net_{ChordAnalysisNeuronalNet, weight_definitions};
  std::map<std::vector<float>, int> winners_;
};

// Unambiguous voicings are judged against the root they were built on, every
// voicing against its label.
TEST(ChordAnalysisAccuracy, NamesTheRootsOfTheGeneratedVoicings) {
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  Namer namer;
  int unambiguous = 0, unambiguousNamed = 0, named = 0;
  for (TChordVoicing const& v : voicings) {
    const int winner = namer.Winner(v.noteNrs);
    named += winner == v.label;
    if (!v.unambiguous) continue;
    ++unambiguous;
    const int builtRoot = Mod12(v.rootKeyNr - v.noteNrs.front());
    unambiguousNamed += winner == builtRoot;
  }
  std::cout << "named " << named << " of " << voicings.size() << " voicings, " << unambiguousNamed << " of "
            << unambiguous << " unambiguous ones\n";
  RecordProperty("voicings", static_cast<int>(voicings.size()));
  RecordProperty("named", named);
  RecordProperty("unambiguous_voicings", unambiguous);
  RecordProperty("unambiguous_named", unambiguousNamed);
  EXPECT_GT(unambiguous, 4000);
  EXPECT_GE(unambiguousNamed * 100, unambiguous * 99);
  EXPECT_GE(named * 100, static_cast<int>(voicings.size()) * 99);
}

// MeasureChordAccuracy counts voicings, not distinct inputs: a net with all weights
// 0 gives equal outputs and so the winner 0, which names exactly the voicings
// labelled 0.
TEST(ChordAnalysisAccuracy, MeasureCountsEachVoicing) {
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  TChordAccuracy expected;
  for (TChordVoicing const& v : voicings) {
    ++expected.voicings;
    expected.named += v.label == 0;
    expected.unambiguousVoicings += v.unambiguous;
    expected.unambiguousNamed += v.unambiguous && v.label == 0;
  }
  std::vector<float> zeros(765, 0.0f);
  TPredefinedWeights record = ChordAnalysisNeuronalNet;
  record.weights = zeros.data();
  NeuronParamGuard guard;
  NeuronalNet net(record);
  const TChordAccuracy measured = MeasureChordAccuracy(net, ChordPatternClasses(voicings, 0.1f));
  EXPECT_EQ(measured.voicings, expected.voicings);
  EXPECT_EQ(measured.named, expected.named);
  EXPECT_EQ(measured.unambiguousVoicings, expected.unambiguousVoicings);
  EXPECT_EQ(measured.unambiguousNamed, expected.unambiguousNamed);
  EXPECT_GT(measured.named, 0);
  EXPECT_LT(measured.named, measured.voicings);
}

} // namespace
