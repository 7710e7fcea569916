// Single neurons: the three function families, the derivative, the statics, the
// random start weights and the copy behaviour. Expected values come from the
// formulas evaluated here in double precision.
#include "nnet/NetTestSupport.h"

#include <tonvex/Neuron.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <vector>

namespace {

using NeuronTest = nettest::NetTest;

void Params(INPUT_TYPE in, ACT_TYPE act, OUTPUT_TYPE out, float slope, float threshold, float outThreshold = 0.0f) {
  Neuron::SetCalcParams(in, act, out, slope, threshold, outThreshold);
}

void SetWeights(Neuron& neuron, std::vector<float> const& w) { std::copy(w.begin(), w.end(), neuron.weights.get()); }

// The output of a one-input neuron with weight 1 whose net input is z; it is
// written to its place among the outputs and nowhere else.
float OutputAt(float z) {
  Neuron neuron(1);
  neuron.weights[0] = 1.0f;
  float out[3] = {-7.0f, -7.0f, -7.0f};
  neuron.calcValue(&z, 1, out, 1);
  EXPECT_TRUE(out[0] == -7.0f && out[2] == -7.0f && out[1] == neuron.output && neuron.net_input == z);
  return neuron.output;
}

TEST_F(NeuronTest, InputFunctions) {
  float const x[] = {0.5f, -2.0f, 3.0f};
  double const sum = 0.5 * 2 + -2 * 0.25 + 3 * -1;
  struct Case {
    INPUT_TYPE type;
    int n;
    double expected;
  } const cases[] = {{INPUT_SUM, 3, sum},
                     {INPUT_MIN, 3, -2},
                     {INPUT_MAX, 3, 3},
                     {INPUT_AVG, 3, sum / 3},
                     {INPUT_PROD, 3, (0.5 * 2) * (-2 * 0.25) * (3 * -1)},
                     {static_cast<INPUT_TYPE>(9), 3, 0},
                     {INPUT_SUM, 0, 0},
                     {INPUT_MIN, 0, 0.5},
                     {INPUT_MAX, 0, 0.5}, // x[0] read even for n = 0
                     {INPUT_PROD, 0, 1}}; // the product starts from x[0] w[0]
  for (Case const& c : cases) {
    Params(c.type, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
    Neuron neuron(3);
    SetWeights(neuron, {2.0f, 0.25f, -1.0f});
    float out = 0.0f;
    neuron.calcValue(x, c.n, &out, 0);
    EXPECT_FLOAT_EQ(neuron.net_input, static_cast<float>(c.expected)) << c.type << " " << c.n;
    EXPECT_EQ(out, neuron.net_input) << "identity passes z unchanged";
  }
  float out = 0.0f;
  Params(INPUT_PROD, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  Neuron(0).calcValue(x, 1, &out, 0);
  EXPECT_EQ(out, 0.0f) << "without weights";
  Params(INPUT_AVG, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  Neuron(0).calcValue(x, 0, &out, 0);
  EXPECT_TRUE(std::isnan(out)) << "0 / 0";
}

TEST_F(NeuronTest, ActivationsAndOutputs) {
  for (float t : {0.0f, 0.5f, 2.0f})
    for (float s : {0.2f, 1.0f, 2.0f})
      for (float z : {-3.0f, -0.5f, 0.0f, 0.25f, 0.5f, 1.0f, 1.2f, 7.5f}) {
        double const u = static_cast<double>(z) - t;
        Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, s, t);
        EXPECT_NEAR(OutputAt(z), 1.0 / (std::exp(-u * s) + 1.0), 1e-7) << z << " " << t << " " << s;
        Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, s, t);
        EXPECT_NEAR(OutputAt(z), std::tanh(u * s), 1e-7) << z << " " << t << " " << s;
        // The slope scales only values strictly between 0 and 1; all are clamped.
        Params(INPUT_SUM, ACT_LIN, OUTPUT_NONE, s, t);
        EXPECT_NEAR(OutputAt(z), std::clamp(u > 0 && u < 1 ? u * s : u, -1.0, 1.0), 1e-7) << z << " " << t << " " << s;
        for (int act : {3, 4}) { // identity, and an unknown activation, leave z
          Params(INPUT_SUM, static_cast<ACT_TYPE>(act), OUTPUT_NONE, s, t);
          EXPECT_EQ(OutputAt(z), z);
        }
        // OUTPUT_BIN reaches its threshold with equality; unknown output types pass.
        Params(INPUT_SUM, ACT_IDENT, OUTPUT_BIN, s, t, 0.5f);
        EXPECT_EQ(OutputAt(z), z >= 0.5f ? 1.0f : 0.0f);
        Params(INPUT_SUM, ACT_IDENT, static_cast<OUTPUT_TYPE>(5), s, t, 0.5f);
        EXPECT_EQ(OutputAt(z), z);
      }
}

// The fast path (INPUT_SUM, ACT_SIGM, OUTPUT_NONE) sums in float and takes a float
// exponential, which it caches; any other combination evaluates through calcValue.
TEST_F(NeuronTest, FastPathMatchesTheFormula) {
  std::vector<float> x, w;
  for (int i = 0; i < 21; ++i) {
    x.push_back(static_cast<float>((i * 7) % 5) * 0.25f - 0.3f);
    w.push_back(static_cast<float>((i * 3) % 11) * 0.1f - 0.45f);
  }
  Neuron a(21), b(21);
  SetWeights(a, w);
  SetWeights(b, w);
  Neuron* layer[] = {&a, &b};
  double z = 0;
  for (std::size_t i = 0; i < 21; ++i) z += static_cast<double>(x[i]) * w[i];
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2f, 2.0f);
  float out[2] = {};
  Neuron::calcVec(layer, x.data(), 21, out, 2);
  EXPECT_NEAR(a.cached_exp, std::exp((2.0 - z) * 0.2), 1e-5);
  EXPECT_NEAR(out[0], 1.0 / (std::exp((2.0 - z) * 0.2) + 1.0), 1e-6);
  EXPECT_TRUE(out[0] == out[1] && a.output == out[0]);
  Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, 0.2f, 2.0f);
  a.cached_exp = -1.0f;
  Neuron::calcVec(layer, x.data(), 21, out, 2);
  EXPECT_EQ(a.cached_exp, -1.0f);
  EXPECT_NEAR(out[0], std::tanh((z - 2.0) * 0.2), 1e-6);
}

// The sigmoid derivative leaves out the slope as a factor and adds the float 0.1 with
// flat-spot elimination; beyond +-50 it is that constant alone. The linear one tests
// the raw net input.
TEST_F(NeuronTest, Derivatives) {
  Neuron probe(0); // made first: constructing a neuron sets flat-spot elimination
  auto DerivativeAt = [&probe](float z) {
    probe.net_input = z;
    return probe.Act_Abl();
  };
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2f, 2.0f);
  for (float z : {-300.0f, -40.0f, 0.7f, 2.0f, 13.0f, 300.0f})
    for (int flatSpot : {0, 1}) {
      Neuron::flat_spot_elimination = flatSpot;
      double const x = static_cast<double>((2.0f - z) * 0.2f);
      double const plain = std::fabs(x) > 50 ? 0.0 : std::exp(x) / ((std::exp(x) + 1) * (std::exp(x) + 1));
      EXPECT_EQ(DerivativeAt(z), static_cast<float>(plain + (flatSpot ? 0.10000000149011612 : 0.0))) << z;
    }
  for (float z : {-3.0f, -0.01f, 0.0f, 0.4f, 1.0f, 1.01f, 4.0f}) {
    Params(INPUT_SUM, ACT_LIN, OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(DerivativeAt(z), z >= 0.0f && z <= 1.0f ? 1.5f : 0.0f) << z;
    Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, 1.5f, 0.5f);
    double const th = std::tanh((static_cast<double>(z) - 0.5) * 1.5);
    EXPECT_NEAR(DerivativeAt(z), 1.5 * (1 - th * th), 1e-6) << z;
    Params(INPUT_SUM, ACT_IDENT, OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(DerivativeAt(z), 1.0f);
    Params(INPUT_SUM, static_cast<ACT_TYPE>(-1), OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(DerivativeAt(z), 0.0f);
  }
  Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.7f, 0.3f);
  Neuron a(0), b(0);
  a.net_input = -1.0f;
  b.net_input = 5.0f;
  Neuron* layer[] = {&a, &b};
  float result[3] = {0, 0, -9.0f};
  Neuron::Act_AblVec(layer, result, 2);
  EXPECT_TRUE(result[0] == a.Act_Abl() && result[1] == b.Act_Abl() && result[2] == -9.0f);
}

// Every valid combination has its own number, (output * 4 + activation) * 5 + input,
// and only the fast one is 0.
TEST_F(NeuronTest, SetCalcParamsStoresAndCombines) {
  Neuron::SetCalcParams(INPUT_AVG, ACT_TANHYP, OUTPUT_BIN, 0.25f, 3.0f, 0.75f);
  EXPECT_EQ(nettest::NeuronStatics(), std::make_tuple(INPUT_AVG, ACT_TANHYP, 0.25f, 3.0f, OUTPUT_BIN, 0.75f));
  for (int o = 0; o <= 1; ++o)
    for (int a = 0; a <= 3; ++a)
      for (int i = 0; i <= 4; ++i) {
        Params(static_cast<INPUT_TYPE>(i), static_cast<ACT_TYPE>(a), static_cast<OUTPUT_TYPE>(o), 1, 0);
        EXPECT_EQ(Neuron::combined_type, (o * 4 + a) * 5 + i);
      }
}

// Start weights are rand() % 100 / 100 with 0.1 for 0; constructing a neuron switches
// flat-spot elimination back on. Copying builds a fresh array and copies it over the
// other neuron's weights instead of from them.
TEST_F(NeuronTest, StartWeightsAndCopies) {
  std::srand(4242);
  Neuron::flat_spot_elimination = 0;
  Neuron const neuron(300);
  EXPECT_EQ(Neuron::flat_spot_elimination, 1);
  std::srand(4242);
  for (std::size_t i = 0; i < 300; ++i) {
    int const r = std::rand() % 100;
    ASSERT_EQ(neuron.weights[i], r == 0 ? 0.1f : static_cast<float>(r) / 100.0f) << i;
  }
  EXPECT_EQ(Neuron(-4).input_count, 0);
  Neuron source(3), target(4);
  SetWeights(source, {1.0f, 2.0f, 3.0f});
  Neuron const copy(source);
  EXPECT_TRUE(copy.input_count == 3 && copy.weights[2] == 0.0f && source.weights[2] == 0.0f);
  SetWeights(source, {1.0f, 2.0f, 3.0f});
  target = source;
  EXPECT_TRUE(target.input_count == 3 && target.weights[2] == 0.0f &&
              source.weights[2] == 0.0f); // by the by-value copy
}

} // namespace
