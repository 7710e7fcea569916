// Back-propagation with momentum against the reference model, batch training, its
// stop rules and messages, the error measure, verification and the duplicate check.
#include "nnet/NetReference.h"
#include "nnet/NetTestSupport.h"
#include "support/TestPrelude.h"

#include <stdexcept>

namespace {

using namespace nettest;
using NetTrainingTest = NetTest;

std::string Fehler(float mean) {
  char text[64];
  std::snprintf(text, sizeof text, "Fehler: %f\n", static_cast<double>(mean));
  return text;
}

std::vector<training_pattern> FourPatterns() {
  return {{{0.0f, 1.0f}, {1.0f, 0.0f}, 0.5f, "p0"},
          {{1.0f, 0.0f}, {0.0f, 1.0f}, 0.3f, "p1"},
          {{1.0f, 1.0f}, {1.0f, 0.0f}, 0.7f, "p2"},
          {{0.5f, 0.0f}, {0.0f, 1.0f}, 0.2f, "p3"}};
}

// Each step changes the weights by the deltas of the weights before it, plus the
// momentum share of the previous change (none before the first step); the error it
// returns is the length of the error vector after the change.
TEST_F(NetTrainingTest, StepsMatchTheReferenceModel) {
  std::vector<training_pattern> const patterns = FourPatterns();
  for (float momentum : {0.8f, 0.0f})
    for (bool flatSpot : {true, false})
      for (auto const& hidden : std::vector<std::vector<int>>{{4}, {3, 2}, {2, 3, 2}}) {
        NeuronalNet net(Shape(2, hidden, 2, ACT_SIGM, 1.5f, 0.5f));
        net.enable_flat_spot_elimination(flatSpot);
        net.set_momentum_amount(momentum);
        TPredefinedWeights start = net.get_weights();
        reference::Net model(start);
        delete[] start.weights;
        model.flatSpot = flatSpot;
        for (int step = 0; step < 9; ++step) {
          training_pattern const& p = patterns[static_cast<std::size_t>(step) % patterns.size()];
          float const error = net.train(p);
          model.Train(AsDouble(p.inputs), AsDouble(p.outputs), p.training_rate, momentum);
          std::vector<double> const out = model.Outputs(AsDouble(p.inputs));
          EXPECT_NEAR(error, std::hypot(p.outputs[0] - out[0], p.outputs[1] - out[1]), 1e-5);
          std::vector<float> const w = Weights(net);
          std::size_t k = 0;
          for (auto const& layer : model.weights)
            for (auto const& row : layer)
              for (double expected : row) ASSERT_NEAR(w[k++], expected, 1e-5 * (1 + std::fabs(expected))) << step;
        }
      }
}

// A cycle shuffles with rand() (position i swaps with rand() % (i + 1)) and trains
// each pattern once; its mean error is the float sum over the count. Cycles run while
// the error lies above the bound; a cycle whose truncated error rises is saved.
TEST_F(NetTrainingTest, BatchTrainingCyclesAndMessages) {
  std::srand(606);
  NeuronalNet batch(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.2f));
  ::testing::internal::CaptureStdout();
  float const mean = batch.batch_train(FourPatterns(), 0.0f, 1.0f);
  EXPECT_EQ(::testing::internal::GetCapturedStdout(),
            "Abgespeichert bei Cycle: 1\nAbbruch bei Cycle 1\n" + Fehler(mean));
  std::srand(606);
  NeuronalNet manual(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.2f));
  std::vector<training_pattern> order = FourPatterns();
  for (std::size_t i = 1; i < order.size(); ++i)
    std::swap(order[i], order[static_cast<std::size_t>(std::rand()) % (i + 1)]);
  float sum = 0.0f;
  for (training_pattern const& p : order) sum = sum + manual.train(p);
  EXPECT_EQ(Weights(batch), Weights(manual));
  EXPECT_EQ(mean, sum / 4.0f);

  struct Case {
    float bound, cycles;
    char const* messages;
    bool stops; // the stop message and the error end the output
  } const cases[] = {
      {0.0f, 3.0f, "Abgespeichert bei Cycle: 1\nAbgespeichert bei Cycle: 3\nAbbruch bei Cycle 3\n", true},
      {0.0f, 2.5f, "Abgespeichert bei Cycle: 1\nAbgespeichert bei Cycle: 3\n", false},
      {100.0f, 50.0f, "Abgespeichert bei Cycle: 1\nAbbruch bei Cycle 1\n", true},
      {0.0f, 0.0f, "", false}};
  for (Case const& c : cases) {
    std::srand(8);
    NeuronalNet net(Shape(2, {3}, 2));
    ::testing::internal::CaptureStdout();
    float const error = net.batch_train(FourPatterns(), c.bound, c.cycles);
    EXPECT_EQ(::testing::internal::GetCapturedStdout(), c.messages + (c.stops ? Fehler(error) : "")) << c.cycles;
  }
}

// A pattern is missed where the winner differs from its targets' first largest.
TEST_F(NetTrainingTest, ErrorAndVerification) {
  NeuronalNet net(Shape(2, {2}, 2, ACT_IDENT));
  SetWeights(net, {1, 0, 0, 1, 1, 0, 0, 1}); // outputs = inputs
  // getRMS is the length of the error vector, not divided by the count; too few
  // targets throw before anything changes.
  net.use({0.25f, 1.0f});
  EXPECT_FLOAT_EQ(net.getRMS({0.75f, 0.5f, 99.0f}), std::sqrt(0.5f));
  EXPECT_THROW(net.train({{0.25f, 1.0f}, {1.0f}, 0.1f, "short"}), std::out_of_range);
  EXPECT_EQ(Weights(net), (std::vector<float>{1, 0, 0, 1, 1, 0, 0, 1}));
  std::vector<training_pattern> const patterns = {
      {{1.0f, 0.0f}, {1.0f, 0.0f}, 0.1f, "hit"},       {{0.0f, 1.0f}, {1.0f, 0.0f}, 0.1f, "miss"},
      {{0.5f, 0.5f}, {0.2f, 0.2f}, 0.1f, "ties at 0"}, {{0.9f, 0.2f}, {0.4f, 0.4f}, 0.1f, "target tie"},
      {{0.1f, 0.2f}, {0.4f, 0.3f}, 0.1f, "miss"},      {{0.3f, 0.2f}, {}, 0.1f, "no targets: 0"}};
  EXPECT_EQ(net.batch_verify(patterns), (std::vector<int>{1, 4}));
}

} // namespace
