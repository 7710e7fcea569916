// The library's own instance of the built-in chord analysis net, as loading leaves
// it.
#include "chord/NetForSingleChordAnalysis.h"
#include "support/NeuronParamGuard.h"

#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <vector>

namespace {

// Loading built the net last, so the Neuron parameters are its own (every test
// restores what it changes).
TEST(NetForSingleChordAnalysis, LoadingSetsTheNeuronParameters) {
  EXPECT_EQ(Neuron::input_type, INPUT_SUM);
  EXPECT_EQ(Neuron::activation_type, ACT_SIGM);
  EXPECT_EQ(Neuron::output_type, OUTPUT_NONE);
  EXPECT_EQ(Neuron::combined_type, 0);
  EXPECT_EQ(Neuron::activation_slope, 0.2f);
  EXPECT_EQ(Neuron::activation_threshold, 2.0f);
  EXPECT_EQ(Neuron::output_threshold, 0.0f);
  EXPECT_EQ(Neuron::flat_spot_elimination, 1);
}

TEST(NetForSingleChordAnalysis, HoldsTheCompiledInNet) {
  NeuronParamGuard guard;
  EXPECT_EQ(NetForSingleChordAnalysis.get_input_neuron_count(), 24);
  EXPECT_EQ(NetForSingleChordAnalysis.get_outputs().size(), 12u);

  TPredefinedWeights record = NetForSingleChordAnalysis.get_weights();
  const std::unique_ptr<float[]> owned(record.weights);
  // Field by field: the record has padding before its pointer.
  EXPECT_EQ(std::memcmp(&record.fixed, &ChordAnalysisNeuronalNet.fixed, sizeof(TFixedNetProp)), 0);
  EXPECT_EQ(std::memcmp(&record.dyn, &ChordAnalysisNeuronalNet.dyn, sizeof(TDynNetProp)), 0);
  EXPECT_EQ(std::memcmp(owned.get(), weight_definitions, sizeof weight_definitions), 0);

  // It answers as a net built from the same data.
  NeuronalNet fresh(ChordAnalysisNeuronalNet, weight_definitions);
  for (std::vector<int> set : {std::vector<int>{0, 4, 7}, {0, 3, 8}, {0, 5, 9}, {0, 2, 6, 8}, {}}) {
    std::vector<float> inputs(24, 0.0f);
    for (int i : set) inputs[static_cast<std::size_t>(i)] = 1.0f;
    NetForSingleChordAnalysis.use(inputs);
    fresh.use(inputs);
    EXPECT_EQ(NetForSingleChordAnalysis.get_outputs(), fresh.get_outputs()) << set.size();
  }
}

} // namespace
