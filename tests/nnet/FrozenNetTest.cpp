// A frozen copy of a net evaluates on the caller's stack, and its winner must be the
// one the net's own forward pass gives: on nets without hidden layers, with one and
// with four, with layers wider than its stack buffers, and under parameters that
// take either way through a layer (the fast path and the reference evaluation).
#include "nnet/FrozenNet.h"
#include "nnet/NetTestSupport.h"

#include <cstdint>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

using namespace nettest;

using FrozenNetTest = NetTest;

TEST_F(FrozenNetTest, WinnerOfTheNetsOwnForwardPass) {
  struct CCase {
    int Inputs;
    std::vector<int> Hidden;
    int Outputs;
    INPUT_TYPE Input;
    ACT_TYPE Activation;
  } const cases[] = {{24, {15, 15}, 12, INPUT_SUM, ACT_SIGM},    {24, {15, 15}, 12, INPUT_SUM, ACT_TANHYP},
                     {40, {37}, 33, INPUT_SUM, ACT_SIGM},        {40, {37}, 33, INPUT_AVG, ACT_LIN},
                     {9, {6, 20, 17, 8}, 5, INPUT_SUM, ACT_LIN}, {6, {}, 4, INPUT_MAX, ACT_SIGM}};
  std::mt19937 random(11);
  std::uniform_real_distribution<float> weight(-3.0f, 3.0f);
  for (CCase const& c : cases) {
    std::vector<int> hidden = c.Hidden;
    NeuronalNet net(c.Inputs, static_cast<int>(hidden.size()), hidden.data(), c.Outputs, c.Input, c.Activation, 0.7f,
                    0.1f, OUTPUT_NONE, 0.0f);
    std::vector<float> weights = Weights(net);
    for (float& w : weights) w = weight(random);
    SetWeights(net, weights);
    CFrozenNet const frozen(net);

    std::set<int> winners;
    for (int k = 0; k < 300; ++k) {
      std::uint32_t const ones = static_cast<std::uint32_t>(random());
      std::vector<float> inputs(static_cast<std::size_t>(c.Inputs), 0.0f);
      for (std::size_t i = 0; i < inputs.size() && i < 32; ++i) inputs[i] = (ones >> i & 1u) != 0 ? 1.0f : 0.0f;
      net.use(inputs);
      ASSERT_EQ(frozen.Winner(ones), net.winner()) << c.Inputs << " inputs, " << hidden.size() << " hidden, " << k;
      winners.insert(net.winner());
    }
    // Nets with hidden layers pick more than one output over these inputs, so the
    // comparison has seen the winner move.
    EXPECT_GT(winners.size(), hidden.empty() ? 0u : 1u) << c.Inputs << " inputs, " << hidden.size() << " hidden";
  }
}

} // namespace
