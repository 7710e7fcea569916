// The generated source file that carries the built-in chord analysis net's data
// (internal, training tools).
//
// The file is a fixed preamble followed by the static-data text that
// NeuronalNet::weights_to_text writes in mode 2, from its definitions on (the time
// and the property report before them are left out, so that the file depends on the
// weights alone). The only change to that text: "static float weight_definitions[]"
// becomes the exported "TONVEX_API float weight_definitions[]" and
// "static TPredefinedWeights weights" the exported
// "TONVEX_API TPredefinedWeights ChordAnalysisNeuronalNet".
//
// The text writes every weight with six significant digits, so the shipped net is
// the rounded one; WeightsOfChordNetSource reads those values back as the compiler
// does (decimal to double to float).
#ifndef TONVEX_TRAINING_CHORDNETSOURCE_H
#define TONVEX_TRAINING_CHORDNETSOURCE_H

#include <tonvex/NeuronalNet.h>

#include <string>
#include <vector>

/// The source file of the net's data. `summary` lines (each ending in '\n') are
/// placed as comments into the preamble.
std::string ChordNetSource(NeuronalNet& net, std::string const& summary);

/// The values of weight_definitions in a text written by ChordNetSource (or of
/// "static float weight_definitions[]" in a mode-2 text); empty when there is none.
std::vector<float> WeightsOfChordNetSource(std::string const& source);

/// Weights that the text formats carry unchanged in meaning: a magnitude below 1e-4
/// (other than 0) would be written in exponent form, which the weight file readers
/// cut at the 'e', so it becomes 0; magnitudes from 999999 up (written as 1e+06
/// once rounded) are clamped to 999999. -0 becomes 0.
std::vector<float> WeightsFitForText(std::vector<float> weights);

#endif
