// One neuron's reference evaluation without the neuron object (internal).
#ifndef TONVEX_NNET_NEURONVALUE_H
#define TONVEX_NNET_NEURONVALUE_H

/// What Neuron::calcValue computes for a neuron with these `weightCount` weights on
/// n inputs, under the Neuron parameters as they stand: returns the output and
/// writes the net input to `netInput`. Neuron::calcValue is this, stored in the
/// neuron.
float NeuronValue(float const* inputs, int n, float const* weights, int weightCount, float& netInput);

#endif
