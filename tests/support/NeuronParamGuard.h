// Restores the process-wide Neuron parameters when a test ends: building any net
// overwrites them, and later tests (and nets) rely on their own.
#ifndef TONVEX_TESTS_NEURONPARAMGUARD_H
#define TONVEX_TESTS_NEURONPARAMGUARD_H

#include "support/TestPrelude.h"

/// The statics: the six of TNeuronProp in its order, the combined type and flat-spot
/// elimination.
inline auto NeuronStatics() {
  return std::tie(Neuron::input_type, Neuron::activation_type, Neuron::activation_slope, Neuron::activation_threshold,
                  Neuron::output_type, Neuron::output_threshold, Neuron::combined_type, Neuron::flat_spot_elimination);
}

class NeuronParamGuard {
public:
  ~NeuronParamGuard() { NeuronStatics() = saved_; }

private:
  std::tuple<INPUT_TYPE, ACT_TYPE, float, float, OUTPUT_TYPE, float, int, int> saved_ = NeuronStatics();
};

#endif
