// The compiled-in data of the built-in chord analysis net: the record, the given
// entries bit for bit, the telling winners, and the weights surviving get_weights
// and the text formats unchanged.
#include "nnet/NetTestSupport.h"
#include "support/TempFile.h"

#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstring>
#include <vector>

namespace {

using ChordAnalysisNetTest = nettest::NetTest;
constexpr std::size_t WeightCount = 765;

std::uint32_t Bits(float value) {
  std::uint32_t bits = 0;
  std::memcpy(&bits, &value, sizeof bits);
  return bits;
}

// The net as root finding builds it; building sets the Neuron statics it needs.
NeuronalNet BuiltInNet() { return NeuronalNet(ChordAnalysisNeuronalNet, weight_definitions); }

std::vector<float> Inputs(std::vector<int> const& set) {
  std::vector<float> inputs(24, 0.0f);
  for (int i : set) inputs[static_cast<std::size_t>(i)] = 1.0f;
  return inputs;
}

TEST_F(ChordAnalysisNetTest, RecordHoldsTheBuiltInProperties) {
  TPredefinedWeights const& r = ChordAnalysisNeuronalNet;
  nettest::ExpectChordNetProperties(r.fixed, r.dyn);
  EXPECT_EQ(Bits(r.dyn.neuron_prop.activation_slope), 0x3E4CCCCDu);
  EXPECT_EQ(Bits(r.dyn.neuron_prop.activation_threshold), 0x40000000u);
  EXPECT_EQ(Bits(r.dyn.neuron_prop.output_threshold), 0u);
  EXPECT_EQ(r.weights, weight_definitions);
  EXPECT_EQ(sizeof weight_definitions / sizeof weight_definitions[0], WeightCount);
}

TEST_F(ChordAnalysisNetTest, GivenEntriesAreExact) {
  struct Entry {
    std::size_t index;
    float value;
  };
  const Entry entries[] = {
      {0, -12.8459f},   {1, 84.8939f},   {2, 22.1978f},    {3, -43.6413f},  {4, -25.9571f},   {5, 75.0373f},
      {6, 47.4166f},    {7, -31.6487f},  {8, -0.473688f},  {9, 62.579f},    {360, 4.05962f},  {361, 17.7252f},
      {362, 0.737212f}, {363, 26.1606f}, {585, 2.76766f},  {586, 1.16248f}, {587, -11.2484f}, {588, -5.81468f},
      {757, -8.27008f}, {758, 13.1361f}, {759, -9.52837f}, {760, 11.3069f}, {761, -29.4672f}, {762, -16.8347f},
      {763, -13.2241f}, {764, 1.7355f},
  };
  for (Entry const& e : entries) EXPECT_EQ(Bits(weight_definitions[e.index]), Bits(e.value)) << "entry " << e.index;
}

TEST_F(ChordAnalysisNetTest, TellingChordsWinClearly) {
  struct Case {
    std::vector<int> set;
    int winner;
  };
  const Case cases[] = {
      {{0}, 0},           // a single note is its own root
      {{0, 4, 7}, 0},     // major triad from its root
      {{0, 3, 7}, 0},     // minor triad
      {{0, 4, 7, 10}, 0}, // dominant seventh
      {{0, 3, 8}, 8},     // major triad over its third
      {{0, 5, 9}, 5},     // major triad over its fifth
  };
  NeuronalNet net = BuiltInNet();
  ASSERT_EQ(net.get_input_neuron_count(), 24);
  for (Case const& c : cases) {
    net.use(Inputs(c.set));
    const std::vector<float> out = net.get_outputs();
    ASSERT_EQ(out.size(), 12u);
    EXPECT_EQ(net.winner(), c.winner) << "set of " << c.set.size() << " ending in " << c.set.back();
    EXPECT_GT(out[static_cast<std::size_t>(c.winner)], 0.98f) << "winner " << c.winner;
  }
}

TEST_F(ChordAnalysisNetTest, NoNotesGiveAWeakSix) {
  NeuronalNet net = BuiltInNet();
  net.use(Inputs({}));
  EXPECT_EQ(net.winner(), 6);
  EXPECT_LT(net.get_outputs()[6], 0.98f);
}

TEST_F(ChordAnalysisNetTest, GetWeightsReproducesRecordAndValues) {
  NeuronalNet net = BuiltInNet();
  TPredefinedWeights r = net.get_weights();
  const std::unique_ptr<float[]> owned(r.weights);
  // Field by field: the record has padding before its pointer.
  EXPECT_EQ(std::memcmp(&r.fixed, &ChordAnalysisNeuronalNet.fixed, sizeof(TFixedNetProp)), 0);
  EXPECT_EQ(std::memcmp(&r.dyn, &ChordAnalysisNeuronalNet.dyn, sizeof(TDynNetProp)), 0);
  for (std::size_t i = 0; i < WeightCount; ++i) EXPECT_EQ(Bits(owned[i]), Bits(weight_definitions[i])) << "entry " << i;
}

// The weights are six-digit decimals the readers understand: a weight list written
// and read back restores every value bit for bit, and none is written in exponent
// form (which the readers would cut at its 'e').
TEST_F(ChordAnalysisNetTest, WeightListRoundTripsExactly) {
  for (float w : weight_definitions) {
    const float magnitude = std::fabs(w);
    EXPECT_TRUE(magnitude == 0.0f || (magnitude >= 1e-4f && magnitude < 1e6f)) << w;
  }
  NeuronalNet net = BuiltInNet();
  TempFile file;
  file.Write(net.weights_to_text(4, -1.0f, -1.0f, {}));
  std::vector<float> zeros(WeightCount, 0.0f);
  nettest::SetWeights(net, zeros);
  testing::internal::CaptureStdout();
  net.load_weights_from_file(file.CPath());
  testing::internal::GetCapturedStdout();
  const std::vector<float> read = nettest::Weights(net);
  for (std::size_t i = 0; i < WeightCount; ++i) EXPECT_EQ(Bits(read[i]), Bits(weight_definitions[i])) << "entry " << i;
}

} // namespace
