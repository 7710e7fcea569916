// Back-propagation with momentum, batch training and its messages, the error
// measure, verification and the duplicate check.
#include "nnet/NetReference.h"
#include "nnet/NetTestSupport.h"

#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace {

using nettest::AsDouble;
using nettest::SetWeights;
using nettest::Shape;
using nettest::Weights;
using NetTrainingTest = nettest::NetTest;

std::string Format(char const* format, double value) {
  char text[64];
  std::snprintf(text, sizeof text, format, value);
  return text;
}

// Two identity layers, one weight each: small enough to follow by hand.
TEST_F(NetTrainingTest, MomentumOfTheSecondStepByHand) {
  NeuronalNet net(Shape(1, {1}, 1, ACT_IDENT));
  SetWeights(net, {0.5f, 2.0f}); // w1: input -> hidden, w2: hidden -> output
  const training_pattern p{{1.0f}, {3.0f}, 0.1f, "p"};

  // Step 1: h = 0.5, o = 1; delta_o = 3 - 1 = 2, delta_h = 2 * w2 = 4;
  // change w2 = 0.1 * 2 * 0.5 = 0.1, change w1 = 0.1 * 4 * 1 = 0.4; no momentum yet.
  net.train(p);
  std::vector<float> w = Weights(net);
  EXPECT_NEAR(w[0], 0.9, 1e-6);
  EXPECT_NEAR(w[1], 2.1, 1e-6);

  // Step 2: h = 0.9, o = 1.89; delta_o = 1.11, delta_h = 1.11 * 2.1 = 2.331;
  // w2 += 0.1 * 1.11 * 0.9 + 0.6 * 0.1, w1 += 0.1 * 2.331 * 1 + 0.6 * 0.4.
  const float error = net.train(p);
  w = Weights(net);
  EXPECT_NEAR(w[0], 0.9 + 0.2331 + 0.24, 1e-5);
  EXPECT_NEAR(w[1], 2.1 + 0.0999 + 0.06, 1e-5);
  // The error is measured after the update: o = 1.3731 * 2.2599.
  EXPECT_NEAR(error, std::fabs(3.0 - 1.3731 * 2.2599), 1e-5);

  net.set_momentum_amount(0.0f);
  net.train(p);
  const double h = 1.3731, w2 = 2.2599, o = h * w2;
  w = Weights(net);
  EXPECT_NEAR(w[0], 1.3731 + 0.1 * (3 - o) * w2, 1e-5) << "no momentum with amount 0";
  EXPECT_NEAR(w[1], 2.2599 + 0.1 * (3 - o) * h, 1e-5);
}

TEST_F(NetTrainingTest, StepsMatchTheReferenceModel) {
  const std::vector<training_pattern> patterns = {
      {{1.0f, 0.0f, 0.5f}, {1.0f, 0.0f}, 0.7f, "a"},
      {{0.0f, 1.0f, 1.0f}, {0.0f, 1.0f}, 0.4f, "b"},
      {{1.0f, 1.0f, 0.0f}, {0.3f, 0.6f}, 0.9f, "c"},
  };
  const std::vector<std::vector<int>> shapes = {{4}, {3, 2}, {2, 3, 2}};
  for (bool flatSpot : {true, false})
    for (auto const& hidden : shapes) {
      std::srand(31);
      NeuronalNet net(Shape(3, hidden, 2, ACT_SIGM, 1.5f, 0.5f));
      net.enable_flat_spot_elimination(flatSpot);
      net.set_momentum_amount(0.8f);
      TPredefinedWeights start = net.get_weights();
      reference::Net model(start);
      delete[] start.weights;
      model.flatSpot = flatSpot;
      for (int step = 0; step < 9; ++step) {
        training_pattern const& p = patterns[static_cast<std::size_t>(step) % patterns.size()];
        const float error = net.train(p);
        model.Train(AsDouble(p.inputs), AsDouble(p.outputs), p.training_rate, 0.8);
        const std::vector<double> out = model.Outputs(AsDouble(p.inputs));
        double sum = 0;
        for (std::size_t j = 0; j < out.size(); ++j) sum += (p.outputs[j] - out[j]) * (p.outputs[j] - out[j]);
        EXPECT_NEAR(error, std::sqrt(sum), 1e-5);
        const std::vector<float> w = Weights(net);
        std::size_t k = 0;
        for (auto const& layer : model.weights)
          for (auto const& row : layer)
            for (double expected : row) {
              ASSERT_NEAR(w[k], expected, 1e-5 * (1 + std::fabs(expected)))
                  << hidden.size() << " hidden layers, step " << step << ", weight " << k;
              ++k;
            }
      }
    }
}

// Output 0.3 from one identity path: input 0.3, both weights 1.
TEST_F(NetTrainingTest, GetRMSIsTheLengthOfTheErrorVector) {
  NeuronalNet one(Shape(1, {1}, 1, ACT_IDENT));
  SetWeights(one, {1.0f, 1.0f});
  one.use({0.3f});
  EXPECT_FLOAT_EQ(one.getRMS({1.0f}), 0.7f);
  EXPECT_THROW(one.getRMS({}), std::out_of_range);

  NeuronalNet two(Shape(1, {1}, 2, ACT_IDENT));
  SetWeights(two, {1.0f, 1.0f, 1.0f});
  two.use({0.25f});
  EXPECT_FLOAT_EQ(two.getRMS({0.75f, -0.25f, 99.0f}), std::sqrt(0.5f)) << "not divided by the output count";
  EXPECT_THROW(two.getRMS({0.75f}), std::out_of_range);
  EXPECT_THROW(two.train({{0.25f}, {1.0f}, 0.1f, "short"}), std::out_of_range);
  EXPECT_EQ(Weights(two), (std::vector<float>{1.0f, 1.0f, 1.0f})) << "thrown before any change";

  NeuronalNet none(Shape(1, {1}, 0));
  EXPECT_EQ(none.getRMS({}), 0.0f);
}

std::vector<training_pattern> FourPatterns() {
  return {{{0.0f, 1.0f}, {1.0f, 0.0f}, 0.5f, "p0"},
          {{1.0f, 0.0f}, {0.0f, 1.0f}, 0.3f, "p1"},
          {{1.0f, 1.0f}, {1.0f, 0.0f}, 0.7f, "p2"},
          {{0.5f, 0.0f}, {0.0f, 1.0f}, 0.2f, "p3"}};
}

TEST_F(NetTrainingTest, BatchTrainWithoutCyclesDoesNothing) {
  std::srand(2);
  NeuronalNet net(Shape(2, {3}, 2));
  const std::vector<float> before = Weights(net);
  for (float cycles : {0.0f, -1.0f, std::nanf("")}) {
    ::testing::internal::CaptureStdout();
    EXPECT_EQ(net.batch_train(FourPatterns(), 0.1f, cycles), 0.0f);
    EXPECT_EQ(::testing::internal::GetCapturedStdout(), "");
  }
  EXPECT_EQ(Weights(net), before);
}

// A cycle shuffles with rand() (position i swaps with rand() % (i + 1)), then trains
// each pattern once; its mean error is the float sum over the count.
TEST_F(NetTrainingTest, OneCycleIsAShuffledPassOverThePatterns) {
  std::srand(606);
  NeuronalNet batch(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.2f));
  ::testing::internal::CaptureStdout();
  const float mean = batch.batch_train(FourPatterns(), 0.0f, 1.0f);
  const std::string printed = ::testing::internal::GetCapturedStdout();

  std::srand(606);
  NeuronalNet manual(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.2f));
  std::vector<training_pattern> order = FourPatterns();
  for (std::size_t i = 1; i < order.size(); ++i)
    std::swap(order[i], order[static_cast<std::size_t>(std::rand()) % (i + 1)]);
  float sum = 0.0f;
  for (training_pattern const& p : order) sum = sum + manual.train(p);
  EXPECT_EQ(Weights(batch), Weights(manual));
  EXPECT_EQ(mean, sum / 4.0f);
  EXPECT_EQ(printed,
            "Abgespeichert bei Cycle: 1\nAbbruch bei Cycle 1\n" + Format("Fehler: %f\n", static_cast<double>(mean)));

  // The same seed gives the same run.
  std::srand(606);
  NeuronalNet again(Shape(2, {3}, 2, ACT_SIGM, 1.0f, 0.2f));
  ::testing::internal::CaptureStdout();
  EXPECT_EQ(again.batch_train(FourPatterns(), 0.0f, 1.0f), mean);
  ::testing::internal::GetCapturedStdout();
  EXPECT_EQ(Weights(again), Weights(batch));
}

TEST_F(NetTrainingTest, BatchTrainMessagesAndStopRules) {
  struct Case {
    float bound, cycles;
    char const* messages; // without the error line
    bool stops;           // the stop messages end the output
  } const cases[] = {
      // The error (between 0 and 1) rises above the level 0 in every second cycle.
      {0.0f, 3.0f, "Abgespeichert bei Cycle: 1\nAbgespeichert bei Cycle: 3\nAbbruch bei Cycle 3\n", true},
      {0.0f, 2.5f, "Abgespeichert bei Cycle: 1\nAbgespeichert bei Cycle: 3\n", false},
      {100.0f, 50.0f, "Abgespeichert bei Cycle: 1\nAbbruch bei Cycle 1\n", true},
      {0.0f, 4.0f, "Abgespeichert bei Cycle: 1\nAbgespeichert bei Cycle: 3\nAbbruch bei Cycle 4\n", true},
  };
  for (Case const& c : cases) {
    std::srand(8);
    NeuronalNet net(Shape(2, {3}, 2));
    ::testing::internal::CaptureStdout();
    const float mean = net.batch_train(FourPatterns(), c.bound, c.cycles);
    const std::string expected =
        std::string(c.messages) + (c.stops ? Format("Fehler: %f\n", static_cast<double>(mean)) : "");
    EXPECT_EQ(::testing::internal::GetCapturedStdout(), expected) << c.cycles;
    EXPECT_GT(mean, 0.0f);
    EXPECT_LT(mean, 1.0f);
  }

  NeuronalNet net(Shape(2, {3}, 2));
  ::testing::internal::CaptureStdout();
  EXPECT_TRUE(std::isnan(net.batch_train({}, 1.0f, 2.0f))) << "the mean of no patterns";
  const std::string printed = ::testing::internal::GetCapturedStdout();
  EXPECT_EQ(printed.rfind("Abbruch bei Cycle 2\nFehler: ", 0), 0u) << printed;
}

TEST_F(NetTrainingTest, BatchVerifyListsTheMisses) {
  NeuronalNet net(Shape(2, {2}, 2, ACT_IDENT));
  SetWeights(net, {1, 0, 0, 1, 1, 0, 0, 1}); // outputs = inputs
  const std::vector<training_pattern> patterns = {
      {{1.0f, 0.0f}, {1.0f, 0.0f}, 0.1f, "hit"},
      {{0.0f, 1.0f}, {1.0f, 0.0f}, 0.1f, "miss"},
      {{0.5f, 0.5f}, {0.2f, 0.2f}, 0.1f, "both tie at 0"},
      {{0.2f, 0.9f}, {0.0f, 1.0f}, 0.1f, "hit"},
      {{0.9f, 0.2f}, {0.4f, 0.4f}, 0.1f, "target tie at 0"},
      {{0.1f, 0.2f}, {0.4f, 0.3f}, 0.1f, "miss"},
      {{0.3f, 0.2f}, {}, 0.1f, "no targets: 0"},
  };
  ::testing::internal::CaptureStdout();
  EXPECT_EQ(net.batch_verify(patterns), (std::vector<int>{1, 5}));
  EXPECT_EQ(::testing::internal::GetCapturedStdout(), "");
  EXPECT_TRUE(net.batch_verify({}).empty());
}

// The check's result and what it printed.
std::pair<bool, std::string> CheckForDuplicates(NeuronalNet& net, std::vector<training_pattern> const& patterns) {
  ::testing::internal::CaptureStdout();
  const bool found = net.check_learn_data_for_duplicates(patterns);
  return {found, ::testing::internal::GetCapturedStdout()};
}

TEST_F(NetTrainingTest, DuplicateCheck) {
  NeuronalNet net(Shape(2, {2}, 2));
  std::vector<training_pattern> patterns = {
      {{1.0f, 0.5f}, {1.0f, 0.0f}, 0.1f, "a"},
      {{1.0f, 0.5f}, {1.0f, 0.0f}, 0.2f, "same as a"},
      {{0.0f, 0.5f}, {1.0f, 0.0f}, 0.1f, "c"},
      {{1.0f, 0.5f, 0.0f}, {0.0f, 1.0f}, 0.1f, "longer input"},
  };
  EXPECT_EQ(CheckForDuplicates(net, patterns), std::make_pair(false, std::string()));

  patterns.push_back({{0.0f, 0.5f}, {0.0f, 1.0f}, 0.1f, "d"});
  patterns.push_back({{1.0f, 0.5f}, {1.0f, 0.0f, 0.0f}, 0.1f, "longer target"});
  EXPECT_EQ(CheckForDuplicates(net, patterns),
            std::make_pair(true, std::string("Warning: input-pattern 0 (a) and 5 (longer target) seem to contain "
                                             "inconsistencies.\n"
                                             "0 a: \nInput: 1.000000 0.500000 \nOutput: 1.000000 0.000000 \n"
                                             "5 longer target: \nInput: 1.000000 0.500000 \nOutput: 1.000000 "
                                             "0.000000 0.000000 \n")));
  patterns.pop_back();
  EXPECT_EQ(CheckForDuplicates(net, patterns),
            std::make_pair(true, std::string("Warning: input-pattern 2 (c) and 4 (d) seem to contain inconsistencies.\n"
                                             "2 c: \nInput: 0.000000 0.500000 \nOutput: 1.000000 0.000000 \n"
                                             "4 d: \nInput: 0.000000 0.500000 \nOutput: 0.000000 1.000000 \n")));
}

} // namespace
