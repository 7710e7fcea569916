// Building nets of a given shape and reading their weights in the tests.
#ifndef TONVEX_TESTS_NETTESTSUPPORT_H
#define TONVEX_TESTS_NETTESTSUPPORT_H

#include "support/NeuronParamGuard.h"
#include "support/TestPrelude.h"

namespace nettest {

/// Restores the Neuron statics after each test.
class NetTest : public ::testing::Test {
  NeuronParamGuard guard_;
};

inline TPredefinedWeights Shape(int inputs, std::vector<int> const& hidden, int outputs, ACT_TYPE act = ACT_SIGM,
                                float slope = 1.0f, float threshold = 0.0f, float* weights = nullptr) {
  TPredefinedWeights r{};
  r.fixed = {inputs, outputs};
  r.dyn.hidden_layer_count = static_cast<int>(hidden.size());
  for (std::size_t k = 0; k < hidden.size() && k < 4; ++k) r.dyn.hidden_layer_sizes[k] = hidden[k];
  r.dyn.neuron_prop = {INPUT_SUM, act, slope, threshold, OUTPUT_NONE, 0.0f};
  r.weights = weights;
  return r;
}

/// Number of weights of a shape: each layer's size times its predecessor's.
inline std::size_t WeightCount(TPredefinedWeights const& r) {
  std::size_t count = 0;
  int previous = r.fixed.input_count;
  for (int k = 0; k < r.dyn.hidden_layer_count; ++k) {
    count += static_cast<std::size_t>(r.dyn.hidden_layer_sizes[k] * previous);
    previous = r.dyn.hidden_layer_sizes[k];
  }
  return count + static_cast<std::size_t>(r.fixed.output_count * (r.dyn.hidden_layer_count > 0 ? previous : 0));
}

/// The net's weights in the flat order (get_weights' array, released here).
inline std::vector<float> Weights(NeuronalNet& net) {
  TPredefinedWeights r = net.get_weights();
  std::unique_ptr<float[]> owned(r.weights);
  return std::vector<float>(owned.get(), owned.get() + WeightCount(r));
}

/// Sets the net's weights; fails the test when they do not fit.
inline void SetWeights(NeuronalNet& net, std::vector<float> weights) {
  TPredefinedWeights r = net.get_weights();
  std::unique_ptr<float[]> owned(r.weights);
  r.weights = weights.data();
  ASSERT_TRUE(WeightCount(r) == weights.size() && net.acquire_weights(r));
}

/// The Neuron function statics in the order of TNeuronProp.
inline auto NeuronStatics() {
  return std::make_tuple(Neuron::input_type, Neuron::activation_type, Neuron::activation_slope,
                         Neuron::activation_threshold, Neuron::output_type, Neuron::output_threshold);
}

inline std::vector<double> AsDouble(std::vector<float> const& v) { return std::vector<double>(v.begin(), v.end()); }

} // namespace nettest

#endif
