// Restores the process-wide Neuron parameters when a test ends: building any net
// overwrites them, and later tests (and nets) rely on their own.
#ifndef TONVEX_TESTS_NEURONPARAMGUARD_H
#define TONVEX_TESTS_NEURONPARAMGUARD_H

#include <tonvex/Neuron.h>

class NeuronParamGuard {
public:
  NeuronParamGuard() = default;
  ~NeuronParamGuard() {
    Neuron::flat_spot_elimination = flatSpot_;
    Neuron::activation_threshold = threshold_;
    Neuron::activation_slope = slope_;
    Neuron::output_threshold = outputThreshold_;
    Neuron::combined_type = combined_;
    Neuron::activation_type = activation_;
    Neuron::output_type = output_;
    Neuron::input_type = input_;
  }
  NeuronParamGuard(NeuronParamGuard const&) = delete;
  NeuronParamGuard& operator=(NeuronParamGuard const&) = delete;

private:
  int flatSpot_ = Neuron::flat_spot_elimination;
  float threshold_ = Neuron::activation_threshold;
  float slope_ = Neuron::activation_slope;
  float outputThreshold_ = Neuron::output_threshold;
  int combined_ = Neuron::combined_type;
  ACT_TYPE activation_ = Neuron::activation_type;
  OUTPUT_TYPE output_ = Neuron::output_type;
  INPUT_TYPE input_ = Neuron::input_type;
};

#endif
