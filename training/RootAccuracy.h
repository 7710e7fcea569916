// Root accuracy of the two root-finding algorithms on the generated chord voicings
// (internal, training tools): each voicing's note numbers go into a chord as a host
// would hand them over (CChord::SetFromNoteNrSet), the chord finds its likeliest
// root, and the root counts as right when its pitch class is the voicing's labelled
// root.
#ifndef TONVEX_TRAINING_ROOTACCURACY_H
#define TONVEX_TRAINING_ROOTACCURACY_H

#include "training/ChordPatterns.h"
#include <tonvex/Chord.h>

#include <cstddef>
#include <vector>

/// Voicings one algorithm names right, all of them and the unambiguous ones.
struct TRootTally {
  int named = 0;
  int unambiguousNamed = 0;
};

struct TRootAccuracy {
  int voicings = 0;
  int unambiguousVoicings = 0;
  TRootTally rules; ///< SCA_RULE_WEIGHTS
  TRootTally net;   ///< SCA_NEURONAL_NET
  /// Indices of the unambiguous voicings that only the net names right, and those
  /// that only the rules name right.
  std::vector<std::size_t> onlyNetRight;
  std::vector<std::size_t> onlyRulesRight;
};

/// The pitch class 0..11 of the root that root finding by `algo` gives a chord of
/// these note numbers; -1 for no notes (the undefined root).
int FoundRootKeyNr(std::vector<int> const& noteNrs, TSingleChordAnalysisAlgo algo);

/// The labelled root of a voicing as a pitch class 0..11; -1 without notes or
/// label (no algorithm counts as right then).
int LabelledRootKeyNr(TChordVoicing const& voicing);

/// Root finding as MeasureRootAccuracy calls it: note numbers and algorithm in, root
/// pitch class (or -1) out.
using TRootFinder = int (*)(std::vector<int> const& noteNrs, TSingleChordAnalysisAlgo algo);

/// Runs both algorithms (through `find`, FoundRootKeyNr unless a test substitutes
/// it) over the voicings.
TRootAccuracy MeasureRootAccuracy(std::vector<TChordVoicing> const& voicings, TRootFinder find = FoundRootKeyNr);

#endif
