// The built-in net's answers to root finding (internal).
//
// Root finding by net gives the net 1.0 at the intervals above a chord's lowest note
// and reads the winner. For chords whose intervals all lie in one octave the inputs
// are one of 2048 patterns (interval 0, the lowest note itself, and any of 1..11),
// and under the Neuron parameters the net was built with, each pattern's winner is
// a constant: they are computed once, when the library is loaded, and looked up.
// Under other parameters (a net built since has replaced them) and for other
// inputs, the winner comes from the exact forward pass of a frozen copy of the net
// (nnet/FrozenNet.h), which gives what the net's own use() and winner() give.
//
// Either way nothing is allocated, locked or written outside the caller's stack: any
// number of threads may ask at once, while no thread changes the Neuron parameters.
#ifndef TONVEX_CHORD_NETROOTWINNERS_H
#define TONVEX_CHORD_NETROOTWINNERS_H

#include "NeuronalNet.h"
#include "nnet/FrozenNet.h"

#include <cstdint>

class CNetRootWinners {
public:
  /// Copies the net and finds the winner of every pattern under the Neuron
  /// parameters in force, which it keeps as the condition of the lookup.
  explicit CNetRootWinners(NeuronalNet& net);

  /// The net's winner on the inputs 1.0 at each interval i whose bit i is set in
  /// `intvls` (and i is below the net's input count), 0.0 at the others, under the
  /// Neuron parameters as they stand.
  int Winner(std::uint32_t intvls) const;

private:
  // The parameters the forward pass reads; the floats as bits, so that only the very
  // values the table was made with count as equal.
  struct CParams {
    int InputType, ActivationType, OutputType, CombinedType;
    std::uint32_t Slope, Threshold, OutputThreshold;
    bool operator==(CParams const& other) const;
  };
  static CParams ParamsInForce();

  static constexpr int PatternCount = 1 << 11; ///< intervals 1..11 above the lowest note

  CFrozenNet Net_;
  CParams BuiltWith_;
  std::uint8_t Winners_[PatternCount] = {};
};

/// Built when the library is loaded, right after NetForSingleChordAnalysis and under
/// its parameters (chord/LoadTimeObjects.cpp); never changed.
extern const CNetRootWinners NetRootWinners;

#endif
