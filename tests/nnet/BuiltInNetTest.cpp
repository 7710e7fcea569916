// The built-in chord analysis net: the library's own instance as loading leaves it,
// and the compiled-in data, which meets the training agent's targets: its given
// entries bit for bit, its telling chords won clearly, the empty input weakly.
#include "chord/NetForSingleChordAnalysis.h"
#include "nnet/NetTestSupport.h"
#include "training/ChordNetTargets.h"

namespace {

using BuiltInNetTest = nettest::NetTest;

std::vector<float> Inputs(std::vector<int> const& set) {
  std::vector<float> inputs(24, 0.0f);
  for (int i : set) inputs[static_cast<std::size_t>(i)] = 1.0f;
  return inputs;
}

// Loading built the net last, so the Neuron parameters are its own (every test
// restores what it changes).
TEST_F(BuiltInNetTest, LoadingLeavesTheCompiledNetAndItsParameters) {
  EXPECT_EQ(NeuronStatics(), std::make_tuple(INPUT_SUM, ACT_SIGM, 0.2f, 2.0f, OUTPUT_NONE, 0.0f, 0, 1));
  // Root finding reads 24 intervals and 12 roots from it.
  EXPECT_TRUE(ChordAnalysisNeuronalNet.fixed.input_count == 24 && ChordAnalysisNeuronalNet.fixed.output_count == 12);
  EXPECT_EQ(ChordAnalysisNeuronalNet.weights, weight_definitions);
  TPredefinedWeights record = NetForSingleChordAnalysis.get_weights();
  std::unique_ptr<float[]> const owned(record.weights);
  // Field by field: the record has padding before its pointer.
  EXPECT_EQ(std::memcmp(&record.fixed, &ChordAnalysisNeuronalNet.fixed, sizeof(TFixedNetProp)), 0);
  EXPECT_EQ(std::memcmp(&record.dyn, &ChordAnalysisNeuronalNet.dyn, sizeof(TDynNetProp)), 0);
  EXPECT_EQ(std::memcmp(owned.get(), weight_definitions, sizeof weight_definitions), 0);
}

TEST_F(BuiltInNetTest, CompiledDataMeetsTheTrainingTargets) {
  for (TChordNetPin const& pin : ChordNetPins)
    EXPECT_EQ(std::memcmp(&weight_definitions[pin.index], &pin.value, sizeof(float)), 0) << pin.index;
  NeuronalNet net(ChordAnalysisNeuronalNet, weight_definitions);
  for (TTellingChord const& chord : TellingChords) {
    net.use(Inputs(chord.intvls));
    EXPECT_EQ(net.winner(), chord.winner) << chord.intvls.back();
    EXPECT_GT(net.get_outputs()[static_cast<std::size_t>(chord.winner)], TellingOutput) << chord.intvls.back();
  }
  net.use(Inputs({}));
  EXPECT_EQ(net.winner(), 6);
  EXPECT_LT(net.get_outputs()[6], EmptyOutputBelow);
}

} // namespace
