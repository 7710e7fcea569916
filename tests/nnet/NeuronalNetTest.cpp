// Net structure: construction, the flat weight order, the forward pass against the
// reference model, winners, taking weights, copying and rebuilding.
#include "nnet/NetReference.h"
#include "nnet/NetTestSupport.h"
#include "support/TestPrelude.h"

#include <cstddef>

namespace {

using namespace nettest;
using NeuronalNetTest = NetTest;

// The hidden layers ping-pong between buffers of varying sizes, where a wrong buffer
// shows as wrong outputs.
TEST_F(NeuronalNetTest, ForwardPassMatchesTheReferenceModel) {
  std::srand(99);
  for (std::vector<int> const& sizes : std::vector<std::vector<int>>{{2, 3, 1, 4, 2}, {3, 2, 5, 3, 4, 6}, {4, 6, 3}}) {
    std::vector<int> const hidden(sizes.begin() + 1, sizes.end() - 1);
    NeuronalNet net(Shape(sizes.front(), hidden, sizes.back(), ACT_SIGM, 0.7f, 0.4f));
    TPredefinedWeights record = net.get_weights();
    reference::Net const model(record);
    delete[] record.weights;
    for (int trial = 0; trial < 3; ++trial) {
      std::vector<float> x;
      for (int i = 0; i < sizes.front(); ++i) x.push_back(static_cast<float>((i + trial) % 3) - 0.5f);
      net.use(x);
      std::vector<double> const expected = model.Outputs(AsDouble(x));
      for (std::size_t j = 0; j < expected.size(); ++j) EXPECT_NEAR(net.get_outputs()[j], expected[j], 1e-6) << j;
    }
  }
  // Without hidden layers the output neurons have no inputs.
  NeuronalNet flat(3, 0, nullptr, 2, INPUT_SUM, ACT_SIGM, 2.0f, 1.0f, OUTPUT_NONE, 0.0f);
  flat.use({5.0f, -3.0f, 8.0f});
  float const sigmoid = static_cast<float>(1.0 / (std::exp(2.0) + 1.0));
  EXPECT_EQ(flat.get_outputs(), (std::vector<float>{sigmoid, sigmoid}));
}

// Construction draws one rand() per weight, layer by layer (rand() % 100 / 100, 0.1
// for a 0: the ninth draw after srand(7)), unless weights are given; it sets the
// Neuron statics for all nets.
TEST_F(NeuronalNetTest, Construction) {
  std::srand(7);
  std::vector<float> expected;
  for (int i = 0; i < 4 * 3 + 3 * 4 + 2 * 3; ++i) {
    int const draw = std::rand() % 100;
    expected.push_back(draw == 0 ? 0.1f : static_cast<float>(draw) / 100.0f);
  }
  int sizes[] = {4, 3};
  std::srand(7);
  NeuronalNet drawn(3, 2, sizes, 2, INPUT_MAX, ACT_TANHYP, 0.25f, 1.5f, OUTPUT_BIN, 0.125f);
  EXPECT_EQ(Weights(drawn), expected);
  EXPECT_EQ(NeuronStatics(), std::make_tuple(INPUT_MAX, ACT_TANHYP, 0.25f, 1.5f, OUTPUT_BIN, 0.125f));
  std::vector<float> w(2 * 3 + 3 * 1, 0.5f);
  NeuronalNet given(Shape(2, {3}, 1, ACT_SIGM, 0.3f, 0.1f, w.data()));
  EXPECT_EQ(Weights(given), w);
}

TEST_F(NeuronalNetTest, WinnerAndInputVectors) {
  std::vector<float> const cases[] = {{0, 0, 0}, {1, 3, 3, 2}, {5, 1, 5}, {-1, -2, -0.5f}, {2, 2, 2, 2.5f}, {}};
  int const winners[] = {0, 1, 0, 2, 3, 0}; // ties to the lowest index
  for (std::size_t k = 0; k < std::size(cases); ++k) {
    // One input, one identity hidden neuron of weight 1: output j is weight j.
    NeuronalNet net(Shape(1, {1}, static_cast<int>(cases[k].size()), ACT_IDENT));
    std::vector<float> w = {1.0f};
    w.insert(w.end(), cases[k].begin(), cases[k].end());
    SetWeights(net, w);
    net.use({1.0f});
    EXPECT_EQ(net.winner(), winners[k]) << k;
  }
  NeuronalNet probe(Shape(2, {2}, 2, ACT_IDENT));
  SetWeights(probe, {1, 0, 0, 1, 1, 0, 0, 1}); // outputs = inputs
  probe.use({3.0f, 4.0f, 5.0f});
  EXPECT_EQ(probe.get_outputs(), (std::vector<float>{3.0f, 4.0f})) << "surplus values are ignored";
  probe.use({7.0f});
  EXPECT_EQ(probe.get_outputs(), (std::vector<float>{7.0f, 4.0f})) << "missing values keep the last input";
}

// Weights are taken only from a record with a weight array and equal in every field
// of its properties (each changed in turn here), but the hidden layer sizes beyond
// the layer count.
TEST_F(NeuronalNetTest, AcquireWeightsComparesEveryField) {
  NeuronalNet net(Shape(3, {2, 2}, 2, ACT_SIGM, 0.5f, 1.0f));
  std::vector<float> const before = Weights(net);
  std::vector<float> other(before.size(), 0.75f);
  std::size_t const fields = (sizeof(TFixedNetProp) + sizeof(TDynNetProp)) / sizeof(int);
  std::size_t const unread = (sizeof(TFixedNetProp) + offsetof(TDynNetProp, hidden_layer_sizes)) / sizeof(int) + 2;
  for (std::size_t k = 0; k <= fields; ++k) {
    SetWeights(net, before);
    TPredefinedWeights record = Shape(3, {2, 2}, 2, ACT_SIGM, 0.5f, 1.0f, k == fields ? nullptr : other.data());
    int* field = k < sizeof(TFixedNetProp) / sizeof(int) ? reinterpret_cast<int*>(&record.fixed) + k
                                                         : reinterpret_cast<int*>(&record.dyn) + k - 2;
    if (k < fields) *field ^= 0x100;
    bool const taken = k == unread || k == unread + 1;
    EXPECT_EQ(net.acquire_weights(record), taken) << k;
    EXPECT_EQ(Weights(net), taken ? other : before) << k;
  }
}

// A copy or assignment has the same weights, previous changes, flag and momentum, so
// the next steps agree exactly; assignment sets the statics from the source.
// Rebuilding resets the training state.
TEST_F(NeuronalNetTest, CopyAssignmentAndRebuild) {
  NeuronalNet source(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.5f));
  source.set_momentum_amount(0.25f);
  training_pattern const pattern{{1.0f, 0.0f}, {0.0f, 1.0f}, 0.5f, "p"};
  source.train(pattern);
  NeuronalNet copy(source), target(Shape(5, {1, 1}, 4, ACT_TANHYP, 3.0f, 0.0f));
  target = source;
  EXPECT_EQ(Neuron::activation_type, ACT_SIGM);
  float const error = source.train(pattern);
  for (NeuronalNet* net : {&copy, &target}) {
    EXPECT_EQ(net->get_momentum_amount(), 0.25f);
    EXPECT_EQ(net->train(pattern), error);
    EXPECT_EQ(Weights(*net), Weights(source));
  }
  NeuronalNet& alias = target;
  target = alias;
  EXPECT_EQ(Weights(target), Weights(source)) << "self-assignment keeps the weights";
  target.BuildNet(TFixedNetProp{3, 2}, Shape(0, {4}, 0).dyn);
  EXPECT_EQ(target.get_momentum_amount(), 0.6f);
  EXPECT_EQ(Weights(target).size(), 3u * 4 + 4 * 2);
}

} // namespace
