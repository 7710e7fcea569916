// The weights of a net's layers laid out for the forward pass (internal).
//
// Neuron::calcVec walks one neuron's weights after the other, so each weighted sum
// is one long chain of dependent additions and the neurons wait for each other. Here
// a layer's weights are transposed into blocks of PackedLanes neurons: for each
// input, the weights into the block's neurons stand side by side, and the block's
// sums are accumulated together in vector registers, each lane still adding
// x[0]*w[0], x[1]*w[1], ... in input order, in float, exactly as calcVec does. The
// bits of every sum are those of the one-neuron loop; only the neurons' chains now
// run side by side.
#ifndef TONVEX_NNET_PACKEDLAYERS_H
#define TONVEX_NNET_PACKEDLAYERS_H

#include "Neuron.h"

#include <cstddef>
#include <vector>

/// Neurons whose sums are accumulated side by side.
constexpr int PackedLanes = 16;

/// Floats the packed weights of a layer of `count` neurons with `inputs` inputs take:
/// whole blocks of PackedLanes neurons, each with a row of PackedLanes weights per
/// input.
inline std::size_t PackedWeightCount(int count, int inputs) {
  if (count <= 0 || inputs <= 0) return 0;
  auto const blocks = static_cast<std::size_t>((count + PackedLanes - 1) / PackedLanes);
  return blocks * static_cast<std::size_t>(inputs) * PackedLanes;
}

/// A layer of a net: its neurons and the input count it is evaluated with, which is
/// the input count of each of its neurons.
struct CNetLayer {
  Neuron** Neurons;
  int Count;
  int Inputs;
};

/// Writes the weights of the layers, one after the other, into `weights` (resized to
/// fit; it allocates only when the net grew): the weight of input i into neuron
/// b * PackedLanes + l of a layer goes to that layer's
/// weights[(b * inputs + i) * PackedLanes + l], 0 in the lanes past its last neuron.
void PackLayers(CNetLayer const* layers, int layerCount, std::vector<float>& weights);

/// PackLayers for one layer of `count` neurons whose weights stand in the flat order
/// (neuron j's weight from input i at flat[j * inputs + i]): writes its
/// PackedWeightCount(count, inputs) packed weights to `packed`.
void PackFlatLayer(int count, int inputs, float const* flat, float* packed);

/// Neuron::calcVec's fast path (INPUT_SUM, ACT_SIGM, OUTPUT_NONE, with the current
/// threshold and slope) of a layer whose weights PackLayers wrote at `weights`:
/// every neuron's net input, cached exponential and output and outputs[0..Count-1]
/// get the very bits calcVec gives them. Allocates nothing.
void ForwardPackedLayer(CNetLayer const& layer, float const* weights, float const* inputs, float* outputs);

/// ForwardPackedLayer for a layer of `count` neurons with `inputs` inputs that only
/// writes outputs[0..count-1], the same bits, and no neuron: it reads nothing but
/// its arguments and the Neuron parameters, so any number of threads may run it at
/// once.
void ForwardPackedOutputs(int count, int inputs, float const* weights, float const* in, float* outputs);

#endif
