// The built-in chord analysis net, which tells root finding which interval above a
// chord's lowest note is its root (internal).
//
// Built when the library is loaded, right after CNote_Undef and CChord_Undef, from
// ChordAnalysisNeuronalNet and weight_definitions, and destroyed when it is unloaded.
// Building it sets the process-wide Neuron parameters to its own (and flat-spot
// elimination on) and draws 765 numbers from rand() for start weights that its data
// then replaces. Any net built later replaces the parameters and so changes how this
// one evaluates; nothing restores them. The net keeps its last input and outputs, so
// root finding does not evaluate it: it asks NetRootWinners (chord/NetRootWinners.h),
// built from it right after it, which no thread writes.
#ifndef TONVEX_CHORD_NETFORSINGLECHORDANALYSIS_H
#define TONVEX_CHORD_NETFORSINGLECHORDANALYSIS_H

#include "NeuronalNet.h"

extern NeuronalNet NetForSingleChordAnalysis;

#endif
