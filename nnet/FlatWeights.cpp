#include "nnet/FlatWeights.h"

#include <algorithm>

namespace {

std::size_t Count(Neuron const& neuron) { return static_cast<std::size_t>(std::max(neuron.input_count, 0)); }

} // namespace

std::size_t FlatWeightCount(NeuronList const& neurons) {
  std::size_t count = 0;
  for (auto const& neuron : neurons) count += Count(*neuron);
  return count;
}

void CopyWeightsTo(NeuronList const& neurons, float* flat) {
  for (auto const& neuron : neurons) flat = std::copy_n(neuron->weights.get(), Count(*neuron), flat);
}

void CopyWeightsFrom(NeuronList const& neurons, float const* flat, std::size_t count) {
  for (auto const& neuron : neurons) {
    const std::size_t take = std::min(count, Count(*neuron));
    std::copy_n(flat, take, neuron->weights.get());
    flat += take;
    count -= take;
  }
}

void CopyNeuronWeights(NeuronList const& from, NeuronList const& to) {
  for (std::size_t i = 0; i < from.size() && i < to.size(); ++i)
    std::copy_n(from[i]->weights.get(), std::min(Count(*from[i]), Count(*to[i])), to[i]->weights.get());
}
