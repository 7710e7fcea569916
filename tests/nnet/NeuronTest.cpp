// Single neurons: the three function families, the derivative, the statics, the
// random start weights and the copy behaviour. Expected values come from the
// formulas evaluated here in double precision.
#include "nnet/NetTestSupport.h"
#include "support/NeuronParamGuard.h"

#include <tonvex/Neuron.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <vector>

namespace {

class NeuronTest : public ::testing::Test {
  NeuronParamGuard guard_;
};

void Params(INPUT_TYPE in, ACT_TYPE act, OUTPUT_TYPE out, float slope, float threshold, float outThreshold = 0.0f) {
  Neuron::SetCalcParams(in, act, out, slope, threshold, outThreshold);
}

void SetWeights(Neuron& neuron, std::vector<float> const& w) {
  ASSERT_EQ(neuron.input_count, static_cast<int>(w.size()));
  for (std::size_t i = 0; i < w.size(); ++i) neuron.weights[i] = w[i];
}

// Output of a one-input neuron with weight 1 whose net input is z (INPUT_SUM).
float OutputAt(float z) {
  Neuron neuron(1);
  neuron.weights[0] = 1.0f;
  float out[3] = {-7.0f, -7.0f, -7.0f};
  neuron.calcValue(&z, 1, out, 1);
  EXPECT_EQ(out[1], neuron.output);
  EXPECT_EQ(out[0], -7.0f);
  EXPECT_EQ(out[2], -7.0f);
  EXPECT_EQ(neuron.net_input, z);
  return neuron.output;
}

double Sigmoid(double z, double t, double s) { return 1.0 / (std::exp(-(z - t) * s) + 1.0); }

TEST_F(NeuronTest, InputFunctions) {
  const float x[] = {0.5f, -2.0f, 3.0f};
  struct Case {
    INPUT_TYPE type;
    double expected;
  } const cases[] = {
      {INPUT_SUM, 0.5 * 2 + -2 * 0.25 + 3 * -1},
      {INPUT_MIN, -2},
      {INPUT_MAX, 3},
      {INPUT_AVG, (0.5 * 2 + -2 * 0.25 + 3 * -1) / 3},
      {INPUT_PROD, (0.5 * 2) * (-2 * 0.25) * (3 * -1)},
      {static_cast<INPUT_TYPE>(9), 0},
  };
  for (Case const& c : cases) {
    Params(c.type, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
    Neuron neuron(3);
    SetWeights(neuron, {2.0f, 0.25f, -1.0f});
    float out = 0.0f;
    neuron.calcValue(x, 3, &out, 0);
    EXPECT_FLOAT_EQ(neuron.net_input, static_cast<float>(c.expected)) << c.type;
    EXPECT_EQ(out, neuron.net_input) << "identity passes z unchanged, type " << c.type;
  }
}

TEST_F(NeuronTest, NoInputs) {
  const float x = 4.0f;
  float out = 0.0f;
  Neuron neuron(0);
  for (float slope : {0.2f, 1.0f, 9.0f}) {
    Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, slope, 0.0f);
    neuron.calcValue(&x, 0, &out, 0);
    EXPECT_EQ(neuron.net_input, 0.0f);
    EXPECT_EQ(out, 0.5f);
  }
  Params(INPUT_AVG, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  neuron.calcValue(&x, 0, &out, 0);
  EXPECT_TRUE(std::isnan(out)) << "0 / 0";
  Params(INPUT_MIN, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  neuron.calcValue(&x, 0, &out, 0);
  EXPECT_EQ(out, 4.0f) << "the minimum starts from the first input";
  Params(INPUT_PROD, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  neuron.calcValue(&x, 1, &out, 0);
  EXPECT_EQ(out, 0.0f) << "no weight to multiply";
  Neuron weighted(1);
  weighted.weights[0] = 0.5f;
  weighted.calcValue(&x, 0, &out, 0);
  EXPECT_EQ(out, 2.0f) << "the product starts from x[0] * w[0] like the minimum";
}

TEST_F(NeuronTest, Activations) {
  const float zs[] = {-3.0f, -0.5f, 0.0f, 0.3f, 0.5f, 1.2f, 2.0f, 7.5f};
  for (float t : {0.0f, 0.5f, 2.0f})
    for (float s : {0.2f, 1.0f, 2.0f})
      for (float z : zs) {
        const double u = static_cast<double>(z) - t;
        Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, s, t);
        EXPECT_NEAR(OutputAt(z), Sigmoid(z, t, s), 1e-7) << z << " " << t << " " << s;
        Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, s, t);
        EXPECT_NEAR(OutputAt(z), std::tanh(u * s), 1e-7) << z << " " << t << " " << s;
        Params(INPUT_SUM, ACT_LIN, OUTPUT_NONE, s, t);
        EXPECT_NEAR(OutputAt(z), std::clamp(u > 0 && u < 1 ? u * s : u, -1.0, 1.0), 1e-7) << z << " " << t << " " << s;
        Params(INPUT_SUM, ACT_IDENT, OUTPUT_NONE, s, t);
        EXPECT_EQ(OutputAt(z), z);
        Params(INPUT_SUM, static_cast<ACT_TYPE>(4), OUTPUT_NONE, s, t);
        EXPECT_EQ(OutputAt(z), z) << "an unknown activation leaves z";
      }
}

TEST_F(NeuronTest, LinearScalesOnlyStrictlyBetweenZeroAndOne) {
  Params(INPUT_SUM, ACT_LIN, OUTPUT_NONE, 2.0f, 0.0f);
  const struct {
    float z, expected;
  } cases[] = {{0.5f, 1.0f}, {0.25f, 0.5f}, {1.0f, 1.0f}, {3.0f, 1.0f}, {-3.0f, -1.0f}, {0.0f, 0.0f}, {-0.5f, -0.5f}};
  for (auto const& c : cases) EXPECT_EQ(OutputAt(c.z), c.expected) << c.z;
}

TEST_F(NeuronTest, BinaryOutput) {
  Params(INPUT_SUM, ACT_LIN, OUTPUT_BIN, 1.0f, 0.0f, 0.5f);
  EXPECT_EQ(OutputAt(0.5f), 1.0f) << "equality reaches the threshold";
  EXPECT_EQ(OutputAt(0.49f), 0.0f);
  EXPECT_EQ(OutputAt(0.9f), 1.0f);
  Params(INPUT_SUM, ACT_LIN, static_cast<OUTPUT_TYPE>(5), 1.0f, 0.0f, 0.5f);
  EXPECT_EQ(OutputAt(0.25f), 0.25f) << "an unknown output type passes the activation";
}

TEST_F(NeuronTest, FastPathMatchesTheFormula) {
  // 21 inputs: the fast path's partial sums and its tail are both exercised.
  std::vector<float> x, w;
  for (int i = 0; i < 21; ++i) {
    x.push_back(static_cast<float>((i * 7) % 5) * 0.25f - 0.3f);
    w.push_back(static_cast<float>((i * 3) % 11) * 0.1f - 0.45f);
  }
  Neuron a(21), b(21);
  SetWeights(a, w);
  SetWeights(b, w);
  Neuron* layer[] = {&a, &b};
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2f, 2.0f);
  ASSERT_EQ(Neuron::combined_type, 0);
  float out[2] = {};
  Neuron::calcVec(layer, x.data(), 21, out, 2);
  double z = 0;
  for (int i = 0; i < 21; ++i)
    z += static_cast<double>(x[static_cast<std::size_t>(i)]) * w[static_cast<std::size_t>(i)];
  EXPECT_NEAR(a.net_input, z, 1e-5);
  EXPECT_NEAR(a.cached_exp, std::exp((2.0 - z) * 0.2), 1e-5);
  EXPECT_NEAR(out[0], Sigmoid(z, 2.0, 0.2), 1e-6);
  EXPECT_EQ(out[0], out[1]);
  EXPECT_EQ(a.output, out[0]);

  // Any other combination evaluates through calcValue and leaves the cache alone.
  Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, 0.2f, 2.0f);
  a.cached_exp = -1.0f;
  Neuron::calcVec(layer, x.data(), 21, out, 2);
  EXPECT_EQ(a.cached_exp, -1.0f);
  EXPECT_NEAR(out[0], std::tanh((z - 2.0) * 0.2), 1e-6);
}

// The derivative at net input z.
float DerivativeAt(float z) {
  Neuron neuron(0);
  neuron.net_input = z;
  return neuron.Act_Abl();
}

TEST_F(NeuronTest, SigmoidDerivativeAndFlatSpot) {
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 1.0f, 0.0f);
  Neuron probe(0);
  Neuron::flat_spot_elimination = 0;
  probe.net_input = 0.0f;
  EXPECT_EQ(probe.Act_Abl(), 0.25f);
  Neuron::flat_spot_elimination = 1;
  EXPECT_EQ(probe.Act_Abl(), 0.35f);
  EXPECT_EQ(probe.Act_Abl(), static_cast<float>(0.25 + 0.10000000149011612));
  for (float z : {60.0f, -60.0f}) {
    probe.net_input = z;
    Neuron::flat_spot_elimination = 0;
    EXPECT_EQ(probe.Act_Abl(), 0.0f) << z;
    Neuron::flat_spot_elimination = 1;
    EXPECT_EQ(probe.Act_Abl(), 0.1f) << z;
  }
  // The slope enters only the argument, not as a factor.
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2f, 2.0f);
  for (float z : {-40.0f, 0.7f, 2.0f, 13.0f}) {
    const double x = static_cast<double>((2.0f - z) * 0.2f);
    const double plain = std::exp(x) / ((std::exp(x) + 1) * (std::exp(x) + 1));
    EXPECT_FLOAT_EQ(DerivativeAt(z), static_cast<float>(plain + 0.10000000149011612)) << z;
  }
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 2.0f, 0.0f);
  probe.net_input = 25.1f;
  Neuron::flat_spot_elimination = 0;
  EXPECT_EQ(probe.Act_Abl(), 0.0f) << "x = -50.2 lies beyond the cut-off";
  probe.net_input = 24.9f;
  EXPECT_GT(probe.Act_Abl(), 0.0f) << "x = -49.8 is computed";
}

TEST_F(NeuronTest, OtherDerivatives) {
  Params(INPUT_SUM, ACT_LIN, OUTPUT_NONE, 2.0f, 0.5f);
  const struct {
    float z, expected;
  } linear[] = {{0.0f, 2.0f}, {0.2f, 2.0f}, {1.0f, 2.0f}, {1.01f, 0.0f}, {-0.01f, 0.0f}};
  for (auto const& c : linear) EXPECT_EQ(DerivativeAt(c.z), c.expected) << "raw z " << c.z;

  for (float z : {-3.0f, 0.0f, 0.4f, 1.5f, 4.0f}) {
    Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, 1.5f, 0.5f);
    const double th = std::tanh((static_cast<double>(z) - 0.5) * 1.5);
    EXPECT_NEAR(DerivativeAt(z), 1.5 * (1 - th * th), 1e-6) << z;
    Params(INPUT_SUM, ACT_IDENT, OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(DerivativeAt(z), 1.0f);
    Params(INPUT_SUM, static_cast<ACT_TYPE>(-1), OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(DerivativeAt(z), 0.0f);
  }
}

TEST_F(NeuronTest, DerivativeVector) {
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.7f, 0.3f);
  Neuron a(0), b(0), c(0);
  a.net_input = -1.0f;
  b.net_input = 0.3f;
  c.net_input = 5.0f;
  Neuron* layer[] = {&a, &b, &c};
  float result[4] = {0, 0, 0, -9.0f};
  Neuron::Act_AblVec(layer, result, 3);
  EXPECT_EQ(result[0], a.Act_Abl());
  EXPECT_EQ(result[1], b.Act_Abl());
  EXPECT_EQ(result[2], c.Act_Abl());
  EXPECT_EQ(result[3], -9.0f);
}

TEST_F(NeuronTest, SetCalcParamsStoresAndCombines) {
  Neuron::SetCalcParams(INPUT_AVG, ACT_TANHYP, OUTPUT_BIN, 0.25f, 3.0f, 0.75f);
  EXPECT_EQ(Neuron::combined_type, 33);
  EXPECT_EQ(nettest::NeuronStatics(), std::make_tuple(INPUT_AVG, ACT_TANHYP, 0.25f, 3.0f, OUTPUT_BIN, 0.75f));

  // Every valid combination has its own number and only the fast one is 0.
  std::vector<int> seen;
  for (int o = 0; o <= 1; ++o)
    for (int a = 0; a <= 3; ++a)
      for (int i = 0; i <= 4; ++i) {
        Neuron::SetCalcParams(static_cast<INPUT_TYPE>(i), static_cast<ACT_TYPE>(a), static_cast<OUTPUT_TYPE>(o), 1, 0,
                              0);
        EXPECT_EQ(Neuron::combined_type == 0, i == 0 && a == 0 && o == 0);
        EXPECT_EQ(std::count(seen.begin(), seen.end(), Neuron::combined_type), 0);
        seen.push_back(Neuron::combined_type);
      }
}

TEST_F(NeuronTest, RandomStartWeights) {
  for (unsigned seed : {1u, 17u, 4242u}) {
    std::srand(seed);
    Neuron neuron(300);
    std::srand(seed);
    for (int i = 0; i < 300; ++i) {
      const int r = std::rand() % 100;
      const float expected = r == 0 ? 0.1f : static_cast<float>(r) / 100.0f;
      ASSERT_EQ(neuron.weights[static_cast<std::size_t>(i)], expected) << "seed " << seed << " weight " << i;
      ASSERT_GE(expected, 0.01f);
      ASSERT_LE(expected, 0.99f);
    }
  }
  Neuron::flat_spot_elimination = 0;
  Neuron neuron(2);
  EXPECT_EQ(Neuron::flat_spot_elimination, 1) << "constructing a neuron switches it back on";
  EXPECT_EQ(neuron.input_count, 2);
  EXPECT_EQ(Neuron(-4).input_count, 0);
}

TEST_F(NeuronTest, CopyingZeroesInsteadOfCopying) {
  Neuron source(3);
  SetWeights(source, {1.0f, 2.0f, 3.0f});
  Neuron copy(source);
  ASSERT_EQ(copy.input_count, 3);
  for (std::size_t i = 0; i < 3; ++i) {
    EXPECT_EQ(copy.weights[i], 0.0f);
    EXPECT_EQ(source.weights[i], 0.0f) << "the fresh array is copied over the source";
  }

  Neuron right(2);
  SetWeights(right, {4.0f, 5.0f});
  Neuron target(4);
  SetWeights(target, {9.0f, 9.0f, 9.0f, 9.0f});
  target = right;
  ASSERT_EQ(target.input_count, 2);
  for (std::size_t i = 0; i < 2; ++i) {
    EXPECT_EQ(target.weights[i], 0.0f);
    EXPECT_EQ(right.weights[i], 0.0f) << "zeroed by the by-value argument's copy";
  }
}

} // namespace
