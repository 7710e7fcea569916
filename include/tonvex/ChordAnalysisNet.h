// The built-in chord analysis net as data: its property record and its trained
// weights.
//
// The net has 24 inputs, two hidden layers of 15 neurons and 12 outputs, INPUT_SUM,
// ACT_SIGM with slope 0.2 and threshold 2.0, and OUTPUT_NONE. Input i is 1.0 when a
// chord has a note i semitones above its lowest note (folded into one octave, so
// inputs 12..23 stay 0.0); output j scores the pitch class j semitones above the
// lowest note as the chord's root, and the winner (NeuronalNet::winner) is taken.
//
// Build a net of your own with NeuronalNet(ChordAnalysisNeuronalNet): the record's
// weight pointer is weight_definitions. Building a net sets the process-wide Neuron
// parameters, and the net evaluates as trained only while they are this record's,
// so build (or rebuild) it after any other net. The library never writes the data.
#ifndef TONVEX_CHORDANALYSISNET_H
#define TONVEX_CHORDANALYSISNET_H

#include "NetProperties.h"
#include "TonvexExport.h"

/// The properties of the built-in net; its weights are weight_definitions.
extern TONVEX_API TPredefinedWeights ChordAnalysisNeuronalNet;

/// The 765 weights in the flat order: hidden layer 0 (entry j*24 + i from input i
/// into neuron j), hidden layer 1 (360 + j*15 + i), output layer (585 + j*15 + i).
extern TONVEX_API float weight_definitions[765];

#endif
