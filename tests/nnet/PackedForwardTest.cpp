// The forward pass evaluates the neurons of a layer side by side from a transposed
// copy of the weights. Whatever it does, its outputs must be those of Neuron::calcVec
// evaluating the same weights one neuron after the other, to the bit: on nets of
// every shape around the width of a block, with every kind of special value among
// weights, inputs and parameters, after every way the weights can change, and under
// the process-wide parameters as they stand. A frozen copy of each net, which
// evaluates on the caller's stack, must give the net's own winner.
#include "nnet/FrozenNet.h"
#include "nnet/NetTestSupport.h"
#include "support/TempFile.h"

#include <limits>

namespace {

using namespace nettest;
using PackedForwardTest = NetTest;

// The bits of each value; every NaN as one pattern (which payload survives where two
// meet is the compiler's choice of operand order).
std::vector<std::uint32_t> Bits(std::vector<float> const& values) {
  std::vector<std::uint32_t> bits(values.size(), 0x7fc00000u);
  for (std::size_t k = 0; k < values.size(); ++k)
    if (values[k] == values[k]) std::memcpy(&bits[k], &values[k], sizeof(float));
  return bits;
}

// Ordinary values, with each kind of special value now and then where asked: zeros
// of either sign, infinities, NaNs with their own payloads, subnormals, huge values.
std::vector<float> RandomValues(std::mt19937& random, std::size_t count, bool special) {
  std::vector<float> values(count);
  for (float& v : values) {
    float const sign = random() % 2 == 0 ? 1.0f : -1.0f;
    std::uint32_t const nan = (random() % 2 == 0 ? 0x7fc00000u : 0xffc00000u) | (random() & 0x3fffffu);
    switch (special ? random() % 20 : 19) {
    case 0: v = sign * 0.0f; break;
    case 1: v = sign * std::numeric_limits<float>::infinity(); break;
    case 2: std::memcpy(&v, &nan, sizeof v); break;
    case 3: v = sign * std::numeric_limits<float>::denorm_min() * static_cast<float>(1 + random() % 1000); break;
    case 4: v = sign * 3e37f; break;
    default: v = std::uniform_real_distribution<float>(-3.0f, 3.0f)(random);
    }
  }
  return values;
}

// The outputs of Neuron::calcVec layer by layer on neurons holding the flat weights.
std::vector<float> CalcVecOutputs(TPredefinedWeights const& shape, std::vector<float> const& flat,
                                  std::vector<float> source) {
  std::size_t at = 0;
  for (int k = 0; k <= shape.dyn.hidden_layer_count; ++k) {
    bool const output = k == shape.dyn.hidden_layer_count;
    int const size = output ? shape.fixed.output_count : shape.dyn.hidden_layer_sizes[k];
    int const inputs = k > 0 ? shape.dyn.hidden_layer_sizes[k - 1] : output ? 0 : shape.fixed.input_count;
    std::vector<Neuron> neurons(static_cast<std::size_t>(size), Neuron(0));
    std::vector<Neuron*> pointers;
    for (Neuron& neuron : neurons) {
      neuron = Neuron(inputs); // the reversed copy leaves the weights to be set
      for (int i = 0; i < inputs; ++i) neuron.weights[static_cast<std::size_t>(i)] = flat.at(at++);
      pointers.push_back(&neuron);
    }
    std::vector<float> target(static_cast<std::size_t>(size) + 1);
    source.push_back(0.0f); // data() of an empty vector may be null
    Neuron::calcVec(pointers.data(), source.data(), inputs, target.data(), size);
    target.pop_back();
    source = target;
  }
  return source;
}

// Every third net takes another input function and activation, and so the
// neuron-by-neuron path; its neurons all have inputs, as functions other than the
// sum read the first input even without any.
TEST_F(PackedForwardTest, EqualsCalcVecAndTheFrozenNetOnRandomNets) {
  std::mt19937 random(2024);
  int const widths[] = {0, 1, 2, 7, 15, 16, 17, 31, 32, 33}, inputCounts[] = {0, 1, 3, 16, 17, 24, 40};
  float const slopes[] = {0.2f, 1.0f, -1.5f, 0.0f, 1e-30f, 40.0f}, thresholds[] = {2.0f, 0.0f, -0.0f, -3.0f};
  int winnerMoved = 0;
  for (int c = 0; c < 600; ++c) {
    bool const other = c % 3 == 1;
    std::vector<int> hidden(random() % 4 + (other ? 1 : random() % 2));
    for (int& h : hidden) h = widths[other + random() % (std::size(widths) - other)];
    TPredefinedWeights shape = Shape(inputCounts[other + random() % (std::size(inputCounts) - other)], hidden,
                                     widths[random() % 6], ACT_SIGM, slopes[random() % 6], thresholds[random() % 4]);
    if (other) {
      shape.dyn.neuron_prop.input_type = static_cast<INPUT_TYPE>(random() % 5);
      shape.dyn.neuron_prop.activation_type = static_cast<ACT_TYPE>(1 + random() % 3);
    }
    bool const special = c % 3 == 0; // else the outputs are not all saturated or NaN
    std::vector<float> flat = RandomValues(random, WeightCount(shape), special);
    shape.weights = flat.data();
    NeuronalNet net(shape);
    CFrozenNet const frozen(net);
    std::set<int> winners;
    for (int round = 0; round < 8; ++round) {
      std::vector<float> const in =
          RandomValues(random, static_cast<std::size_t>(shape.fixed.input_count), special || round == 3);
      net.use(in);
      ASSERT_EQ(Bits(net.get_outputs()), Bits(CalcVecOutputs(shape, flat, in))) << "net " << c << " round " << round;
      std::uint32_t const ones = static_cast<std::uint32_t>(random());
      std::vector<float> bits(in.size(), 0.0f);
      for (std::size_t i = 0; i < bits.size() && i < 32; ++i) bits[i] = static_cast<float>(ones >> i & 1u);
      net.use(bits);
      ASSERT_EQ(frozen.Winner(ones), net.winner()) << "net " << c << " round " << round;
      winners.insert(net.winner());
    }
    winnerMoved += winners.size() > 1;
  }
  EXPECT_GT(winnerMoved, 30) << "the frozen nets' winners hardly vary with the inputs";
}

// New weights are packed again (training and copies are checked by their steps'
// errors); a net built in between with other function types sends evaluation down
// the neuron-by-neuron path, and the fast path then uses the weights as they are.
TEST_F(PackedForwardTest, FollowsTheWeightsAndTheProcessWideParameters) {
  std::mt19937 random(5);
  TPredefinedWeights const shape = Shape(20, {17, 9}, 18, ACT_SIGM, 0.7f, 0.5f);
  std::vector<float> const in = RandomValues(random, 20, false);
  auto expect = [&](NeuronalNet& net, char const* after) {
    net.use(in);
    EXPECT_EQ(Bits(net.get_outputs()), Bits(CalcVecOutputs(shape, Weights(net), in))) << after;
  };
  NeuronalNet net(shape);
  SetWeights(net, RandomValues(random, WeightCount(shape), false));
  expect(net, "acquire_weights");
  std::ostringstream list;
  list << "weight definitions\n";
  for (float w : RandomValues(random, WeightCount(shape), false)) list << w << '\n';
  TempFile file;
  file.Write(list.str());
  testing::internal::CaptureStdout();
  net.load_weights_from_file(file.CPath());
  testing::internal::GetCapturedStdout();
  expect(net, "load_weights_from_file");
  Neuron::SetCalcParams(INPUT_SUM, ACT_LIN, OUTPUT_NONE, 0.7f, 0.5f, 0.0f);
  expect(net, "another activation");
  SetWeights(net, RandomValues(random, WeightCount(shape), false));
  Neuron::SetCalcParams(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.7f, 0.5f, 0.0f);
  expect(net, "weights changed on the other path");
}

} // namespace
