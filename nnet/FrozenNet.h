// A copy of a net's weights that any number of threads may evaluate at once
// (internal).
//
// NeuronalNet::use keeps the inputs, the layer results and every neuron's output in
// the net object, so one net serves one thread at a time. A frozen net holds only a
// copy of the weights, in the flat order and transposed for the fast path, is never
// written after it is built, and evaluates into buffers on the caller's stack. It
// reads the process-wide Neuron parameters as they stand, as use() does, and gives
// the winner that use() and winner() give the net it was copied from, to the bit:
// the same fast path (nnet/PackedLayers.h) or the same reference evaluation per
// neuron (nnet/NeuronValue.h), layer by layer, with the same inputs.
#ifndef TONVEX_NNET_FROZENNET_H
#define TONVEX_NNET_FROZENNET_H

#include "NeuronalNet.h"

#include <cstddef>
#include <cstdint>
#include <vector>

class CFrozenNet {
public:
  /// Copies the net's shape and weights; later changes to the net are not seen.
  explicit CFrozenNet(NeuronalNet& net);

  int InputCount() const { return InputCount_; }
  /// The winner (NeuronalNet::winner) of the net on the inputs 1.0 at each input i
  /// whose bit i is set in `ones`, 0.0 at the others (inputs from 32 on are 0.0).
  /// Allocates nothing for nets whose layers are at most LocalWidth wide, as the
  /// built-in net's are; a wider net takes its buffers from the heap.
  int Winner(std::uint32_t ones) const;

  static constexpr int LocalWidth = 32;

private:
  struct CLayer {
    int Count;          ///< neurons
    int Inputs;         ///< inputs of each neuron
    std::size_t Flat;   ///< start of its weights in Flat_
    std::size_t Packed; ///< start of its weights in Packed_
  };

  std::vector<float> Flat_;
  std::vector<float> Packed_;
  CLayer Layers_[5] = {};
  int LayerCount_ = 0;
  int InputCount_ = 0;
  int Widest_ = 0; ///< the longest of the inputs and the layers
};

#endif
