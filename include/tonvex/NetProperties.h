// Property records of a neural net: the exchange format of trained nets.
//
// A complete net is a TPredefinedWeights: its fixed interface, its inner shape with
// the neuron function parameters, and a flat weight array. The records are plain
// aggregates so that a net can be compiled in as static data (the text that
// NeuronalNet::weights_to_text writes in mode 2 initialises one). Their layout is
// fixed: thirteen 32-bit words followed by the weight pointer.
#ifndef TONVEX_NETPROPERTIES_H
#define TONVEX_NETPROPERTIES_H

#include "Neuron.h"
#include "TonvexExport.h"

#include <cstddef>

/// The net's fixed interface.
struct TONVEX_API TFixedNetProp {
  int input_count;  ///< length of the input vector
  int output_count; ///< number of output neurons
};

/// Function types and parameters of all neurons (they become the Neuron statics).
struct TONVEX_API TNeuronProp {
  INPUT_TYPE input_type;
  ACT_TYPE activation_type;
  float activation_slope;     ///< s
  float activation_threshold; ///< t
  OUTPUT_TYPE output_type;
  float output_threshold; ///< threshold of OUTPUT_BIN
};

/// The net's inner shape.
struct TONVEX_API TDynNetProp {
  int hidden_layer_count;    ///< H, 0..4
  int hidden_layer_sizes[4]; ///< entry k = neurons of hidden layer k; entries from H on are ignored but kept
  TNeuronProp neuron_prop;
};

/// A complete net. The weights are in the flat order of NeuronalNet (hidden layer 0,
/// hidden layers 1..H-1, output layer; within a layer neuron by neuron, within a
/// neuron in the order of the previous layer). The record does not own them.
struct TONVEX_API TPredefinedWeights {
  TFixedNetProp fixed;
  TDynNetProp dyn;
  float* weights;
};

/// Properties read from a property file (TPredefinedWeights without the weights).
struct TONVEX_API TNetProp {
  TFixedNetProp fixed;
  TDynNetProp dyn;
};

static_assert(sizeof(INPUT_TYPE) == 4 && sizeof(ACT_TYPE) == 4 && sizeof(OUTPUT_TYPE) == 4 && sizeof(int) == 4 &&
                  sizeof(float) == 4,
              "every value field of the records is one 32-bit word");
static_assert(offsetof(TPredefinedWeights, dyn) == 8 && offsetof(TDynNetProp, neuron_prop) == 20 &&
                  sizeof(TNeuronProp) == 24,
              "value fields at word offsets 0..12");
static_assert(offsetof(TPredefinedWeights, dyn) + offsetof(TDynNetProp, neuron_prop) +
                      offsetof(TNeuronProp, output_threshold) ==
                  48,
              "the output threshold is the thirteenth word");
static_assert(offsetof(TPredefinedWeights, weights) == (sizeof(float*) == 8 ? 56 : 52),
              "the weight pointer follows the value words (aligned on 64-bit platforms)");
static_assert(sizeof(TNetProp) == 52, "TNetProp is the thirteen value words");

#endif
