// The forward pass evaluates the neurons of a layer side by side from a transposed
// copy of the weights. Whatever it does, its outputs must be those of Neuron::calcVec
// evaluating the same weights one neuron after the other, to the bit: on nets of
// every shape around the width of a block, with every kind of special value among
// weights, inputs and parameters, and after every way the weights can change.
#include "nnet/NetTestSupport.h"
#include "support/TempFile.h"

#include <tonvex/Neuron.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <iterator>
#include <limits>
#include <memory>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

using namespace nettest;

class PackedForwardTest : public NetTest {};

float FloatFromBits(std::uint32_t bits) {
  float value;
  std::memcpy(&value, &bits, sizeof value);
  return value;
}

// The bits of each value; every NaN as one pattern. Where two NaNs meet in an
// operation, which payload survives is the compiler's choice of operand order (in
// the one-neuron loop as much as in the vector code), so only NaN-ness is compared.
std::vector<std::uint32_t> Bits(std::vector<float> const& values) {
  std::vector<std::uint32_t> bits(values.size());
  for (std::size_t k = 0; k < values.size(); ++k)
    if (values[k] != values[k])
      bits[k] = 0x7fc00000u;
    else
      std::memcpy(&bits[k], &values[k], sizeof(float));
  return bits;
}

// Mostly ordinary values, and each kind of special value now and then: zeros of
// either sign, infinities, NaNs with their own payloads, subnormals, huge values.
float RandomValue(std::mt19937& random) {
  float const sign = random() % 2 == 0 ? 1.0f : -1.0f;
  switch (random() % 20) {
  case 0: return 0.0f;
  case 1: return -0.0f;
  case 2: return sign * std::numeric_limits<float>::infinity();
  case 3: return FloatFromBits((random() % 2 == 0 ? 0x7fc00000u : 0xffc00000u) | (random() & 0x3fffffu));
  case 4: return sign * std::numeric_limits<float>::denorm_min() * static_cast<float>(1 + random() % 1000);
  case 5: return sign * 3e37f;
  case 6: return 1.0f;
  default: return std::uniform_real_distribution<float>(-6.0f, 6.0f)(random);
  }
}

std::vector<float> RandomValues(std::mt19937& random, std::size_t count, bool special) {
  std::vector<float> values(count);
  for (float& v : values)
    v = special ? RandomValue(random) : std::uniform_real_distribution<float>(-3.0f, 3.0f)(random);
  return values;
}

// The shape's layers as the net builds them: each layer's size and input count.
struct CLayerShape {
  int Size;
  int Inputs;
};
std::vector<CLayerShape> Layers(TPredefinedWeights const& shape) {
  std::vector<CLayerShape> layers;
  int previous = shape.fixed.input_count;
  for (int k = 0; k < shape.dyn.hidden_layer_count; ++k) {
    layers.push_back({shape.dyn.hidden_layer_sizes[k], previous});
    previous = shape.dyn.hidden_layer_sizes[k];
  }
  layers.push_back({shape.fixed.output_count, shape.dyn.hidden_layer_count > 0 ? previous : 0});
  return layers;
}

// The outputs of Neuron::calcVec layer by layer on neurons holding the flat weights,
// under the Neuron statics as they stand.
std::vector<float> CalcVecOutputs(TPredefinedWeights const& shape, std::vector<float> const& flat,
                                  std::vector<float> const& inputs) {
  std::vector<float> source = inputs;
  std::size_t at = 0;
  for (CLayerShape const& layer : Layers(shape)) {
    std::vector<std::unique_ptr<Neuron>> neurons;
    std::vector<Neuron*> pointers;
    for (int j = 0; j < layer.Size; ++j) {
      neurons.push_back(std::make_unique<Neuron>(layer.Inputs));
      for (int i = 0; i < layer.Inputs; ++i) neurons.back()->weights[static_cast<std::size_t>(i)] = flat.at(at++);
      pointers.push_back(neurons.back().get());
    }
    std::vector<float> target(static_cast<std::size_t>(layer.Size) + 1);
    source.push_back(0.0f); // data() of an empty vector may be null
    Neuron::calcVec(pointers.data(), source.data(), layer.Inputs, target.data(), layer.Size);
    target.pop_back();
    source = target;
  }
  return source;
}

TEST_F(PackedForwardTest, EqualsCalcVecOnRandomNets) {
  std::mt19937 random(2024);
  int const widths[] = {0, 1, 2, 7, 15, 16, 17, 31, 32, 33};
  int const inputCounts[] = {0, 1, 3, 16, 17, 24, 40};
  int const outputCounts[] = {0, 1, 12, 16, 17};
  float const slopes[] = {0.2f, 1.0f, -1.5f, 0.0f, 1e-30f, 40.0f};
  float const thresholds[] = {2.0f, 0.0f, -0.0f, -3.0f};
  for (int c = 0; c < 600; ++c) {
    std::vector<int> hidden(random() % 5);
    for (int& h : hidden) h = widths[random() % std::size(widths)];
    int const inputs = inputCounts[random() % std::size(inputCounts)];
    int const outputs = outputCounts[random() % std::size(outputCounts)];
    // Special values in a third of the nets; the others stay in the ordinary range
    // so that the outputs are not all saturated or NaN.
    bool const special = c % 3 == 0;
    TPredefinedWeights const shape = Shape(inputs, hidden, outputs, ACT_SIGM, slopes[random() % std::size(slopes)],
                                           thresholds[random() % std::size(thresholds)]);
    std::vector<float> flat = RandomValues(random, WeightCount(shape), special);
    TPredefinedWeights record = shape;
    record.weights = flat.data();
    NeuronalNet net(record);
    std::string label = "net " + std::to_string(c) + ": " + std::to_string(inputs) + " inputs, hidden";
    for (int h : hidden) label += " " + std::to_string(h);
    label += ", " + std::to_string(outputs) + " outputs";
    for (int round = 0; round < 4; ++round) {
      std::vector<float> const in = RandomValues(random, static_cast<std::size_t>(inputs), special || round == 3);
      net.use(in);
      std::vector<float> const expected = CalcVecOutputs(shape, flat, in);
      ASSERT_EQ(Bits(net.get_outputs()), Bits(expected)) << label << ", round " << round;
    }
  }
}

TEST_F(PackedForwardTest, FollowsEveryChangeOfTheWeights) {
  std::mt19937 random(5);
  TPredefinedWeights const shape = Shape(20, {17, 9}, 18, ACT_SIGM, 0.7f, 0.5f);
  std::vector<float> first = RandomValues(random, WeightCount(shape), false);
  std::vector<float> const in = RandomValues(random, 20, false);
  auto expectWeights = [&](NeuronalNet& net, char const* after) {
    net.use(in);
    EXPECT_EQ(Bits(net.get_outputs()), Bits(CalcVecOutputs(shape, Weights(net), in))) << after;
  };
  TPredefinedWeights record = shape;
  record.weights = first.data();
  NeuronalNet net(record);
  expectWeights(net, "construction");
  SetWeights(net, RandomValues(random, WeightCount(shape), false));
  expectWeights(net, "acquire_weights");
  net.train({in, std::vector<float>(18, 0.25f), 0.5f, "p"});
  expectWeights(net, "train");
  NeuronalNet copy(net), assigned(shape);
  assigned.use(in); // packs its random start weights
  assigned = net;
  expectWeights(copy, "copy");
  expectWeights(assigned, "assignment");
  TempFile file;
  std::ostringstream list;
  list << "weight definitions\n";
  for (float w : first) list << w << '\n';
  file.Write(list.str());
  testing::internal::CaptureStdout();
  net.load_weights_from_file(file.CPath());
  testing::internal::GetCapturedStdout();
  expectWeights(net, "load_weights_from_file");
}

// Parameters belong to the process, not to the net: a net built in between with
// other function types sends evaluation down the neuron-by-neuron path, and when the
// fast path returns it uses the weights as they are now.
TEST_F(PackedForwardTest, FollowsTheProcessWideParameters) {
  std::mt19937 random(9);
  TPredefinedWeights const shape = Shape(5, {3}, 4, ACT_SIGM, 1.0f, 0.0f);
  std::vector<float> flat = RandomValues(random, WeightCount(shape), false);
  std::vector<float> const in = RandomValues(random, 5, false);
  std::vector<float> const changed = RandomValues(random, WeightCount(shape), false);
  TPredefinedWeights record = shape;
  record.weights = flat.data();
  NeuronalNet net(record);
  net.use(in);
  std::vector<float> const fast = net.get_outputs();

  Neuron::SetCalcParams(INPUT_SUM, ACT_LIN, OUTPUT_NONE, 1.0f, 0.0f, 0.0f);
  net.use(in);
  EXPECT_EQ(Bits(net.get_outputs()), Bits(CalcVecOutputs(shape, flat, in)));
  EXPECT_NE(Bits(net.get_outputs()), Bits(fast));
  SetWeights(net, changed); // while the fast path is not taken

  Neuron::SetCalcParams(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 1.0f, 0.0f, 0.0f);
  net.use(in);
  EXPECT_EQ(Bits(net.get_outputs()), Bits(CalcVecOutputs(shape, changed, in)));
}

} // namespace
