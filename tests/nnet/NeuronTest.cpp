// Single neurons: the three function families, the fast path, the derivative, the
// statics, the random start weights and the copy behaviour. Expected values come from
// the formulas evaluated here in double precision.
#include "nnet/NetTestSupport.h"

namespace {

using NeuronTest = nettest::NetTest;

void Params(int in, int act, int out, float slope, float threshold, float outThreshold = 0.0f) {
  Neuron::SetCalcParams(static_cast<INPUT_TYPE>(in), static_cast<ACT_TYPE>(act), static_cast<OUTPUT_TYPE>(out), slope,
                        threshold, outThreshold);
}

TEST_F(NeuronTest, InputFunctions) {
  float const x[] = {0.5f, -2.0f, 3.0f};
  double const sum = 0.5 * 2 + -2 * 0.25 + 3 * -1;
  struct Case {
    int type, n;
    double expected;
  } const cases[] = {{INPUT_SUM, 3, sum},
                     {INPUT_MIN, 3, -2},
                     {INPUT_MAX, 3, 3},
                     {INPUT_AVG, 3, sum / 3},
                     {INPUT_PROD, 3, (0.5 * 2) * (-2 * 0.25) * (3 * -1)},
                     {9, 3, 0},
                     {INPUT_SUM, 0, 0},
                     {INPUT_MIN, 0, 0.5},
                     {INPUT_MAX, 0, 0.5}, // x[0] read even for n = 0
                     {INPUT_PROD, 0, 1}}; // the product starts at x[0] w[0]
  for (Case const& c : cases) {
    Params(c.type, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
    Neuron neuron(3);
    std::copy_n(std::vector<float>{2.0f, 0.25f, -1.0f}.begin(), 3, neuron.weights.get());
    float out[3] = {-7.0f, -7.0f, -7.0f};
    neuron.calcValue(x, c.n, out, 1);
    EXPECT_FLOAT_EQ(neuron.net_input, static_cast<float>(c.expected)) << c.type << " " << c.n;
    EXPECT_TRUE(out[0] == -7.0f && out[1] == neuron.net_input && out[2] == -7.0f && neuron.output == out[1]);
  }
  float out = 0.0f;
  Params(INPUT_PROD, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  Neuron(0).calcValue(x, 1, &out, 0);
  EXPECT_EQ(out, 0.0f) << "without weights";
  Params(INPUT_AVG, ACT_IDENT, OUTPUT_NONE, 1.0f, 0.0f);
  Neuron(0).calcValue(x, 0, &out, 0);
  EXPECT_TRUE(std::isnan(out)) << "0 / 0";
}

// Each activation by its formula; the linear one scales only values strictly between
// 0 and 1 and clamps; an unknown activation leaves z. OUTPUT_BIN reaches its
// threshold with equality, an unknown output type passes the activation. The fast
// path (sum, sigmoid, no output function) of calcVec takes a float exponential, which
// it caches; every other combination evaluates through calcValue.
TEST_F(NeuronTest, ActivationsOutputsAndTheFastPath) {
  Neuron neuron(1);
  neuron.weights[0] = 1.0f;
  Neuron* layer[] = {&neuron};
  for (float t : {0.0f, 0.5f, 2.0f})
    for (float s : {0.2f, 1.0f, 2.0f})
      for (float z : {-3.0f, -0.5f, 0.0f, 0.25f, 0.5f, 1.0f, 1.2f, 7.5f}) {
        double const u = static_cast<double>(z) - t, sigmoid = 1.0 / (std::exp(-u * s) + 1.0);
        double const expected[] = {sigmoid, std::clamp(u > 0 && u < 1 ? u * s : u, -1.0, 1.0), std::tanh(u * s), z, z};
        for (int act = 0; act <= 4; ++act)
          for (int output : {0, 1, 5}) {
            Params(INPUT_SUM, act, output, s, t, 0.5f);
            float out = 0.0f;
            neuron.cached_exp = -1.0f;
            Neuron::calcVec(layer, &z, 1, &out, 1);
            double const a = expected[act];
            EXPECT_NEAR(out, output == 1 ? (a >= 0.5 ? 1.0 : 0.0) : a, 1e-6) << z << " " << t << " " << s << " " << act;
            bool const fast = act == 0 && output == 0;
            EXPECT_TRUE(fast ? std::fabs(neuron.cached_exp / std::exp(-u * s) - 1) < 1e-6 : neuron.cached_exp == -1.0f);
          }
      }
}

// The sigmoid derivative leaves out the slope as a factor and adds the float 0.1 with
// flat-spot elimination; beyond +-50 it is that constant alone. The linear one tests
// the raw net input; Act_AblVec gives each neuron's.
TEST_F(NeuronTest, Derivatives) {
  Neuron probe(0), other(0); // made first: constructing a neuron sets flat-spot elimination
  auto at = [&probe](float z) {
    probe.net_input = z;
    return probe.Act_Abl();
  };
  for (float z : {-300.0f, -3.0f, -0.01f, 0.0f, 0.7f, 1.0f, 1.01f, 2.0f, 13.0f, 300.0f}) {
    Params(INPUT_SUM, ACT_SIGM, OUTPUT_NONE, 0.2f, 2.0f);
    double const x = static_cast<double>((2.0f - z) * 0.2f);
    double const plain = std::fabs(x) > 50 ? 0.0 : std::exp(x) / ((std::exp(x) + 1) * (std::exp(x) + 1));
    Neuron::flat_spot_elimination = 1;
    EXPECT_EQ(at(z), static_cast<float>(plain + 0.10000000149011612)) << z;
    Neuron::flat_spot_elimination = 0;
    EXPECT_EQ(at(z), static_cast<float>(plain)) << z;
    Params(INPUT_SUM, ACT_LIN, OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(at(z), z >= 0.0f && z <= 1.0f ? 1.5f : 0.0f) << z;
    Params(INPUT_SUM, ACT_TANHYP, OUTPUT_NONE, 1.5f, 0.5f);
    double const th = std::tanh((static_cast<double>(z) - 0.5) * 1.5);
    EXPECT_TRUE(std::fabs(z) > 50 || std::fabs(at(z) - 1.5 * (1 - th * th)) < 1e-6) << z;
    Params(INPUT_SUM, ACT_IDENT, OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(at(z), 1.0f);
    Params(INPUT_SUM, -1, OUTPUT_NONE, 1.5f, 0.5f);
    EXPECT_EQ(at(z), 0.0f);
  }
  other.net_input = 5.0f;
  Neuron* layer[] = {&probe, &other};
  float result[3] = {0, 0, -9.0f};
  Neuron::Act_AblVec(layer, result, 2);
  EXPECT_TRUE(result[0] == probe.Act_Abl() && result[1] == other.Act_Abl() && result[2] == -9.0f);
}

// SetCalcParams numbers every valid combination (output * 4 + activation) * 5 +
// input; constructing a neuron switches flat-spot elimination back on. (The stored
// values and start weights are checked with a net's in NeuronalNetTest.)
TEST_F(NeuronTest, Statics) {
  for (int c = 0; c < 40; ++c) {
    Params(c % 5, c / 5 % 4, c / 20, 1, 0);
    EXPECT_EQ(Neuron::combined_type, c);
  }
  Neuron::flat_spot_elimination = 0;
  Neuron const neuron(1);
  EXPECT_EQ(Neuron::flat_spot_elimination, 1);
}

} // namespace
