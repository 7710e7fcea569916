// The flat weight order of a net: its neurons in order (hidden layers, then the
// output layer), each neuron's weights in the order of its predecessors (internal).
#ifndef TONVEX_NNET_FLATWEIGHTS_H
#define TONVEX_NNET_FLATWEIGHTS_H

#include "Neuron.h"

#include <cstddef>
#include <memory>
#include <vector>

using NeuronList = std::vector<std::unique_ptr<Neuron>>;

/// Number of weights of all neurons.
std::size_t FlatWeightCount(NeuronList const& neurons);
/// Writes all weights to `flat`, which holds FlatWeightCount values.
void CopyWeightsTo(NeuronList const& neurons, float* flat);
/// Fills the first min(count, FlatWeightCount) weights from `flat`; the rest stay.
void CopyWeightsFrom(NeuronList const& neurons, float const* flat, std::size_t count);
/// Copies every weight of `from` into the neuron of `to` at the same place; both
/// lists have the same shape.
void CopyNeuronWeights(NeuronList const& from, NeuronList const& to);

#endif
