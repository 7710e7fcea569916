#include "nnet/FrozenNet.h"

#include "nnet/NeuronValue.h"
#include "nnet/PackedLayers.h"

#include <algorithm>
#include <memory>

CFrozenNet::CFrozenNet(NeuronalNet& net) {
  TPredefinedWeights const record = net.get_weights();
  std::unique_ptr<float[]> const weights(record.weights);
  // The net stores its counts made valid (not negative, at most four hidden
  // layers), and builds its layers from them as follows.
  InputCount_ = record.fixed.input_count;
  Widest_ = std::max(InputCount_, record.fixed.output_count);
  std::size_t flat = 0;
  std::size_t packed = 0;
  auto addLayer = [&](int count, int inputs) {
    Layers_[LayerCount_++] = {count, inputs, flat, packed};
    flat += static_cast<std::size_t>(count) * static_cast<std::size_t>(inputs);
    packed += PackedWeightCount(count, inputs);
    Widest_ = std::max(Widest_, count);
  };
  int inputs = InputCount_;
  for (int k = 0; k < record.dyn.hidden_layer_count; ++k) {
    addLayer(record.dyn.hidden_layer_sizes[k], inputs);
    inputs = record.dyn.hidden_layer_sizes[k];
  }
  // Output neurons of a net without hidden layers have no inputs.
  addLayer(record.fixed.output_count, record.dyn.hidden_layer_count > 0 ? inputs : 0);

  Flat_.assign(weights.get(), weights.get() + flat);
  Packed_.resize(packed);
  for (int k = 0; k < LayerCount_; ++k) {
    CLayer const& layer = Layers_[k];
    PackFlatLayer(layer.Count, layer.Inputs, Flat_.data() + layer.Flat, Packed_.data() + layer.Packed);
  }
}

int CFrozenNet::Winner(std::uint32_t ones) const {
  // use()'s two layer buffers: the inputs go into the first, and the layers
  // ping-pong between them.
  float local[2][LocalWidth] = {};
  std::vector<float> heap;
  float* source = local[0];
  float* target = local[1];
  if (Widest_ > LocalWidth) {
    heap.assign(2 * static_cast<std::size_t>(Widest_), 0.0f);
    source = heap.data();
    target = source + Widest_;
  }
  for (int i = 0; i < InputCount_ && i < 32; ++i) source[i] = (ones >> i & 1u) != 0 ? 1.0f : 0.0f;

  // Read once, as use() reads them: the whole pass takes one way.
  bool const fastPath = Neuron::combined_type == 0;
  for (int k = 0; k < LayerCount_; ++k) {
    CLayer const& layer = Layers_[k];
    if (fastPath) {
      ForwardPackedOutputs(layer.Count, layer.Inputs, Packed_.data() + layer.Packed, source, target);
    } else {
      float netInput = 0.0f;
      float const* weights = Flat_.data() + layer.Flat;
      for (int j = 0; j < layer.Count; ++j, weights += layer.Inputs)
        target[j] = NeuronValue(source, layer.Inputs, weights, layer.Inputs, netInput);
    }
    std::swap(source, target);
  }
  // NeuronalNet::winner: a later output must be strictly greater to win.
  int best = 0;
  for (int j = 1; j < Layers_[LayerCount_ - 1].Count; ++j)
    if (source[j] > source[best]) best = j;
  return best;
}
