// Restores the process-wide Neuron parameters when a test ends: building any net
// overwrites them, and later tests (and nets) rely on their own.
#ifndef TONVEX_TESTS_NEURONPARAMGUARD_H
#define TONVEX_TESTS_NEURONPARAMGUARD_H

#include "support/TestPrelude.h"

/// The statics, in the order of the guard's copy.
inline auto NeuronStaticsRefs() {
  return std::tie(Neuron::flat_spot_elimination, Neuron::activation_threshold, Neuron::activation_slope,
                  Neuron::output_threshold, Neuron::combined_type, Neuron::activation_type, Neuron::output_type,
                  Neuron::input_type);
}

class NeuronParamGuard {
public:
  NeuronParamGuard() = default;
  NeuronParamGuard(NeuronParamGuard const&) = delete;
  NeuronParamGuard& operator=(NeuronParamGuard const&) = delete;
  ~NeuronParamGuard() { NeuronStaticsRefs() = saved_; }

private:
  std::tuple<int, float, float, float, int, ACT_TYPE, OUTPUT_TYPE, INPUT_TYPE> saved_ = NeuronStaticsRefs();
};

#endif
