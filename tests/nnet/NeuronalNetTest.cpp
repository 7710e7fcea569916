// Net structure: construction, the flat weight order, the forward pass, winners,
// taking weights, copying and the trace.
#include "nnet/NetReference.h"
#include "nnet/NetTestSupport.h"

#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <functional>
#include <string>
#include <vector>

namespace {

using nettest::AsDouble;
using nettest::SetWeights;
using nettest::Shape;
using nettest::Weights;
using NeuronalNetTest = nettest::NetTest;

TEST_F(NeuronalNetTest, FlatOrderOfTenWeights) {
  NeuronalNet net(Shape(3, {2}, 2, ACT_IDENT));
  // Distinct powers of two, so every sum below tells which weights it used.
  const std::vector<float> w = {1, 2, 4, 8, 16, 32, 64, 128, 256, 512};
  SetWeights(net, w);
  EXPECT_EQ(Weights(net), w);
  for (int input = 0; input < 3; ++input) {
    std::vector<float> x(3, 0.0f);
    x[static_cast<std::size_t>(input)] = 1.0f;
    net.use(x);
    // Hidden neuron j holds entries 3j..3j+2 (one per input); output neuron o holds
    // entries 6 + 2o (from hidden 0) and 7 + 2o (from hidden 1).
    const float h0 = w[static_cast<std::size_t>(input)], h1 = w[static_cast<std::size_t>(3 + input)];
    EXPECT_EQ(net.get_outputs(), (std::vector<float>{w[6] * h0 + w[7] * h1, w[8] * h0 + w[9] * h1})) << input;
  }
}

TEST_F(NeuronalNetTest, ForwardPassThroughThreeAndFourHiddenLayers) {
  // The hidden layers ping-pong between two buffers; a wrong buffer shows as wrong
  // outputs. Layer sizes vary so that stale values would be read.
  struct Case {
    int inputs;
    std::vector<int> hidden;
    int outputs;
  } const cases[] = {{2, {3, 1, 4}, 2}, {3, {2, 5, 3, 4}, 6}, {5, {1, 1, 1}, 1}, {4, {6}, 3}};
  std::srand(99);
  for (Case const& c : cases) {
    NeuronalNet net(Shape(c.inputs, c.hidden, c.outputs, ACT_SIGM, 0.7f, 0.4f));
    TPredefinedWeights record = net.get_weights();
    const reference::Net model(record);
    delete[] record.weights;
    for (int trial = 0; trial < 3; ++trial) {
      std::vector<float> x;
      for (int i = 0; i < c.inputs; ++i) x.push_back(static_cast<float>((i + trial) % 3) - 0.5f);
      net.use(x);
      const std::vector<double> expected = model.Outputs(AsDouble(x));
      const std::vector<float> got = net.get_outputs();
      ASSERT_EQ(got.size(), expected.size());
      for (std::size_t j = 0; j < got.size(); ++j)
        EXPECT_NEAR(got[j], expected[j], 1e-6)
            << c.hidden.size() << " hidden layers, trial " << trial << ", output " << j;
    }
  }
}

TEST_F(NeuronalNetTest, WithoutHiddenLayersOutputsHaveNoInputs) {
  NeuronalNet fromRecord(Shape(3, {}, 2, ACT_SIGM, 2.0f, 1.0f));
  NeuronalNet fromArguments(3, 0, nullptr, 2, INPUT_SUM, ACT_SIGM, 2.0f, 1.0f, OUTPUT_NONE, 0.0f);
  for (NeuronalNet* net : {&fromRecord, &fromArguments}) {
    net->use({5.0f, -3.0f, 8.0f});
    const float expected = static_cast<float>(1.0 / (std::exp(2.0) + 1.0));
    EXPECT_EQ(net->get_outputs(), (std::vector<float>{expected, expected}));
    EXPECT_EQ(net->winner(), 0);
  }
  // Entry 0 of the sizes still counts in get_weights' length: h0 * I entries, all 0.
  TPredefinedWeights r = Shape(3, {}, 2);
  r.dyn.hidden_layer_sizes[0] = 4;
  NeuronalNet quirk(r);
  TPredefinedWeights weights = quirk.get_weights();
  for (int i = 0; i < 12; ++i) EXPECT_EQ(weights.weights[i], 0.0f);
  delete[] weights.weights;
}

TEST_F(NeuronalNetTest, ConstructorsDrawTheSameWeights) {
  int sizes[] = {4, 3};
  std::srand(5);
  NeuronalNet byArguments(3, 2, sizes, 2, INPUT_SUM, ACT_SIGM, 0.5f, 1.0f, OUTPUT_NONE, 0.0f);
  std::srand(5);
  NeuronalNet byRecord(Shape(3, {4, 3}, 2, ACT_SIGM, 0.5f, 1.0f));
  EXPECT_EQ(Weights(byArguments), Weights(byRecord));
  TPredefinedWeights r = byArguments.get_weights();
  EXPECT_EQ(r.dyn.hidden_layer_sizes[2], 0);
  EXPECT_EQ(r.dyn.hidden_layer_sizes[3], 0);
  delete[] r.weights;

  // Start weights: one rand() per weight, layer by layer, neuron by neuron.
  std::srand(77);
  std::vector<float> expected;
  for (int i = 0; i < 4 * 3 + 3 * 4 + 2 * 3; ++i) {
    const int draw = std::rand() % 100;
    expected.push_back(draw == 0 ? 0.1f : static_cast<float>(draw) / 100.0f);
  }
  std::srand(77);
  NeuronalNet drawn(Shape(3, {4, 3}, 2));
  EXPECT_EQ(Weights(drawn), expected);
}

TEST_F(NeuronalNetTest, ConstructorFromRecordTakesItsWeights) {
  std::vector<float> w(2 * 3 + 3 * 1);
  for (std::size_t i = 0; i < w.size(); ++i) w[i] = static_cast<float>(i) * 0.5f - 2.0f;
  NeuronalNet net(Shape(2, {3}, 1, ACT_SIGM, 0.3f, 0.1f, w.data()));
  EXPECT_EQ(Weights(net), w);
  NeuronalNet withPointer(Shape(2, {3}, 1, ACT_SIGM, 0.3f, 0.1f, w.data()), nullptr);
  EXPECT_EQ(Weights(withPointer), w);
  std::srand(8);
  NeuronalNet withoutWeights(Shape(2, {3}, 1));
  std::srand(8);
  NeuronalNet random(Shape(2, {3}, 1));
  EXPECT_EQ(Weights(withoutWeights), Weights(random)) << "a null weight pointer leaves the random weights";
}

TEST_F(NeuronalNetTest, ConstructionSetsTheNeuronStatics) {
  Neuron::flat_spot_elimination = 0;
  TPredefinedWeights r = Shape(2, {2}, 2, ACT_TANHYP, 0.25f, 1.5f);
  r.dyn.neuron_prop.input_type = INPUT_MAX;
  r.dyn.neuron_prop.output_type = OUTPUT_BIN;
  r.dyn.neuron_prop.output_threshold = 0.125f;
  NeuronalNet net(r);
  EXPECT_EQ(nettest::NeuronStatics(), std::make_tuple(INPUT_MAX, ACT_TANHYP, 0.25f, 1.5f, OUTPUT_BIN, 0.125f));
  EXPECT_EQ(Neuron::combined_type, (1 * 4 + 2) * 5 + 2);
  EXPECT_EQ(Neuron::flat_spot_elimination, 1);
  net.enable_flat_spot_elimination(false);
  EXPECT_EQ(Neuron::flat_spot_elimination, 0);
  net.enable_flat_spot_elimination(true);
  EXPECT_EQ(Neuron::flat_spot_elimination, 1);
  EXPECT_EQ(net.get_input_neuron_count(), 2);
}

TEST_F(NeuronalNetTest, WinnerTiesGoToTheLowestIndex) {
  const struct {
    std::vector<float> outputs;
    int winner;
  } cases[] = {
      {{0, 0, 0}, 0},       {{1, 3, 3, 2}, 1}, {{5, 1, 5}, 0},     {{-1, -2, -0.5f}, 2},
      {{2, 2, 2, 2.5f}, 3}, {{7}, 0},          {{0.25f, 0.5f}, 1},
  };
  for (auto const& c : cases) {
    // One input, one identity hidden neuron with weight 1: output j is weight j.
    const int count = static_cast<int>(c.outputs.size());
    NeuronalNet net(Shape(1, {1}, count, ACT_IDENT));
    std::vector<float> w = {1.0f};
    w.insert(w.end(), c.outputs.begin(), c.outputs.end());
    SetWeights(net, w);
    net.use({1.0f});
    ASSERT_EQ(net.get_outputs(), c.outputs);
    EXPECT_EQ(net.winner(), c.winner);
  }
  NeuronalNet none(Shape(2, {2}, 0));
  none.use({1.0f, 1.0f});
  EXPECT_TRUE(none.get_outputs().empty());
  EXPECT_EQ(none.winner(), 0);
}

TEST_F(NeuronalNetTest, InputVectorsOfOtherLengths) {
  NeuronalNet probe(Shape(2, {2}, 2, ACT_IDENT));
  SetWeights(probe, {1, 0, 0, 1, 1, 0, 0, 1}); // outputs = inputs
  probe.use({3.0f, 4.0f, 5.0f, 6.0f});
  EXPECT_EQ(probe.get_outputs(), (std::vector<float>{3.0f, 4.0f})) << "surplus values are ignored";
  probe.use({7.0f});
  EXPECT_EQ(probe.get_outputs(), (std::vector<float>{7.0f, 4.0f})) << "missing values keep the last input";
  probe.setInput({});
  probe.use();
  EXPECT_EQ(probe.get_outputs(), (std::vector<float>{7.0f, 4.0f}));
}

TEST_F(NeuronalNetTest, AcquireWeightsComparesEveryField) {
  std::srand(3);
  NeuronalNet net(Shape(3, {2, 2}, 2, ACT_SIGM, 0.5f, 1.0f));
  const std::vector<float> before = Weights(net);
  std::vector<float> other(before.size(), 0.75f);
  using Edit = std::function<void(TPredefinedWeights&)>;
  const struct {
    char const* field;
    Edit edit;
  } mismatches[] = {
      {"input count", [](TPredefinedWeights& r) { r.fixed.input_count = 4; }},
      {"output count", [](TPredefinedWeights& r) { r.fixed.output_count = 3; }},
      {"hidden layer count", [](TPredefinedWeights& r) { r.dyn.hidden_layer_count = 1; }},
      {"hidden size 0", [](TPredefinedWeights& r) { r.dyn.hidden_layer_sizes[0] = 3; }},
      {"hidden size 1", [](TPredefinedWeights& r) { r.dyn.hidden_layer_sizes[1] = 1; }},
      {"input type", [](TPredefinedWeights& r) { r.dyn.neuron_prop.input_type = INPUT_AVG; }},
      {"activation type", [](TPredefinedWeights& r) { r.dyn.neuron_prop.activation_type = ACT_LIN; }},
      {"slope", [](TPredefinedWeights& r) { r.dyn.neuron_prop.activation_slope = 0.50001f; }},
      {"threshold", [](TPredefinedWeights& r) { r.dyn.neuron_prop.activation_threshold = -1.0f; }},
      {"output type", [](TPredefinedWeights& r) { r.dyn.neuron_prop.output_type = OUTPUT_BIN; }},
      {"output threshold", [](TPredefinedWeights& r) { r.dyn.neuron_prop.output_threshold = 1e-30f; }},
      {"weight pointer", [](TPredefinedWeights& r) { r.weights = nullptr; }},
  };
  for (auto const& m : mismatches) {
    TPredefinedWeights record = Shape(3, {2, 2}, 2, ACT_SIGM, 0.5f, 1.0f, other.data());
    m.edit(record);
    EXPECT_FALSE(net.acquire_weights(record)) << m.field;
    EXPECT_EQ(Weights(net), before) << m.field;
  }
  // Sizes beyond the hidden layer count are not compared.
  TPredefinedWeights record = Shape(3, {2, 2}, 2, ACT_SIGM, 0.5f, 1.0f, other.data());
  record.dyn.hidden_layer_sizes[2] = 9;
  record.dyn.hidden_layer_sizes[3] = -1;
  EXPECT_TRUE(net.acquire_weights(record));
  EXPECT_EQ(Weights(net), other);
}

TEST_F(NeuronalNetTest, OwnWeightsRoundTrip) {
  std::srand(21);
  NeuronalNet net(Shape(4, {3, 5}, 3, ACT_SIGM, 0.2f, 2.0f));
  const std::vector<float> input = {1, 0, 1, 1};
  net.use(input);
  const std::vector<float> outputs = net.get_outputs();
  TPredefinedWeights own = net.get_weights();
  EXPECT_TRUE(net.acquire_weights(own));
  delete[] own.weights;
  net.use(input);
  EXPECT_EQ(net.get_outputs(), outputs);
}

TEST_F(NeuronalNetTest, CountsAreMadeValid) {
  TPredefinedWeights r = Shape(-2, {}, -1);
  r.dyn.hidden_layer_count = 7;
  for (int& size : r.dyn.hidden_layer_sizes) size = 2;
  NeuronalNet net(r);
  TPredefinedWeights stored = net.get_weights();
  EXPECT_EQ(stored.fixed.input_count, 0);
  EXPECT_EQ(stored.fixed.output_count, 0);
  EXPECT_EQ(stored.dyn.hidden_layer_count, 4);
  EXPECT_EQ(nettest::WeightCount(stored), 12u);
  delete[] stored.weights;
  net.use({1.0f});
  EXPECT_TRUE(net.get_outputs().empty());
}

TEST_F(NeuronalNetTest, CopyAndAssignment) {
  std::srand(12);
  NeuronalNet source(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.5f));
  source.set_momentum_amount(0.25f);
  const training_pattern pattern{{1.0f, 0.0f}, {0.0f, 1.0f}, 0.5f, "p"};
  source.train(pattern); // leaves previous changes and clears the first-step flag

  const int weightCount = 2 * 3 + 3 * 2;
  std::srand(40);
  NeuronalNet copy(source);
  const int afterCopy = std::rand();
  std::srand(40);
  for (int i = 0; i < weightCount; ++i) std::rand();
  EXPECT_EQ(afterCopy, std::rand()) << "copying builds the structure with fresh random weights first";
  EXPECT_EQ(Weights(copy), Weights(source));
  EXPECT_EQ(copy.get_momentum_amount(), 0.25f);
  // Same weights, previous changes, flag and momentum: the next steps agree exactly.
  EXPECT_EQ(copy.train(pattern), source.train(pattern));
  EXPECT_EQ(Weights(copy), Weights(source));

  NeuronalNet target(Shape(5, {1, 1}, 4, ACT_TANHYP, 3.0f, 0.0f));
  NeuronalNet returned = (target = source);
  EXPECT_EQ(Neuron::activation_type, ACT_SIGM) << "assignment sets the statics from the source";
  EXPECT_EQ(target.get_input_neuron_count(), 2);
  EXPECT_EQ(Weights(target), Weights(source));
  EXPECT_EQ(Weights(returned), Weights(source));
  EXPECT_EQ(target.get_momentum_amount(), 0.25f);
  EXPECT_EQ(target.train(pattern), source.train(pattern));

  const std::vector<float> kept = Weights(target);
  NeuronalNet& alias = target;
  target = alias;
  EXPECT_EQ(Weights(target), kept) << "self-assignment keeps the weights";
}

TEST_F(NeuronalNetTest, RebuildResetsTrainingState) {
  std::srand(4);
  NeuronalNet net(Shape(2, {2}, 1));
  net.set_momentum_amount(0.1f);
  net.BuildNet(TFixedNetProp{3, 2}, Shape(0, {4}, 0).dyn);
  EXPECT_EQ(net.get_momentum_amount(), 0.6f);
  EXPECT_EQ(net.get_input_neuron_count(), 3);
  EXPECT_EQ(Weights(net).size(), 3u * 4 + 4 * 2);
  net.use({1.0f, 1.0f, 1.0f});
  EXPECT_EQ(net.get_outputs().size(), 2u);
}

TEST_F(NeuronalNetTest, TraceText) {
  NeuronalNet net(Shape(4, {5, 3}, 2, ACT_SIGM, 0.2f, 2.0f));
  ::testing::internal::CaptureStderr();
  net.trace();
  EXPECT_EQ(::testing::internal::GetCapturedStderr(), "Neuronal Net Trace\n"
                                                      "------------------\n"
                                                      "Fixed Network Properties:\n"
                                                      "input count: 4\n"
                                                      "output count: 2\n"
                                                      "\n"
                                                      "Dynamic Network Properties: \n"
                                                      "Hidden Layers: 2\n"
                                                      "( 5 3 )\n"
                                                      "\n"
                                                      "Neuron Properties: \n"
                                                      "Input Type: 0\n"
                                                      "Activation Type: 0\n"
                                                      "Activation Slope: 0.2\n"
                                                      "Activation Threshold: 2\n"
                                                      "Output Type: 0\n"
                                                      "Output Threshold: 0\n"
                                                      "End Neuronal Net Trace\n"
                                                      "----------------------\n");

  TPredefinedWeights r = Shape(1, {}, 1, ACT_IDENT, 1.0f / 3, -0.5f);
  r.dyn.neuron_prop.input_type = INPUT_PROD;
  r.dyn.neuron_prop.output_type = OUTPUT_BIN;
  r.dyn.neuron_prop.output_threshold = 1234567.0f;
  NeuronalNet other(r);
  ::testing::internal::CaptureStderr();
  other.trace();
  const std::string text = ::testing::internal::GetCapturedStderr();
  EXPECT_NE(text.find("Hidden Layers: 0\n( )\n"), std::string::npos) << text;
  EXPECT_NE(text.find("Input Type: 4\nActivation Type: 3\nActivation Slope: 0.333333\n"
                      "Activation Threshold: -0.5\nOutput Type: 1\nOutput Threshold: 1.23457e+06\n"),
            std::string::npos)
      << text;
}

} // namespace
