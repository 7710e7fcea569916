// Steps 5 and 6 of the chord timeline (ChordTimeline.h): the candidate chords, their
// scores over a unit, and the best sequence of chords over the units.
#ifndef TONVEX_MIDI_CHORDCHOICE_H
#define TONVEX_MIDI_CHORDCHOICE_H

#include "midi/TimelineEvidence.h"

#include <vector>

/// The kinds of chord the analysis chooses from, by their intervals above the root.
enum TChordKind : int {
  ChordKind_Major = 0,
  ChordKind_Minor,
  ChordKind_Dim,
  ChordKind_Aug,
  ChordKind_Sus4,
  ChordKind_Sus2,
  ChordKind_Dom7,
  ChordKind_Maj7,
  ChordKind_Min7,
  ChordKind_HalfDim7,
  ChordKind_Dim7,
  ChordKind_Power
};
constexpr int ChordKindCount = 12;

/// A candidate chord: root pitch class and kind. State NoChordState is no chord.
constexpr int ChordStateCount = 12 * ChordKindCount;
constexpr int NoChordState = ChordStateCount;
inline int ChordState(int root, int kind) { return root * ChordKindCount + kind; }
inline int StateRoot(int state) { return state / ChordKindCount; }
inline TChordKind StateKind(int state) { return static_cast<TChordKind>(state % ChordKindCount); }

/// The intervals above the root of a kind, ending at -1.
int const* ChordKindIntvls(TChordKind kind);

/// Scores of a unit's evidence under each candidate (log-likelihoods and penalties).
class CChordScorer {
public:
  explicit CChordScorer(CChordTimelineSettings const& settings);
  /// The score of every chord state for weights and bass summed over some units.
  void Score(double const weight[12], double const bass[12], double scores[ChordStateCount]) const;

private:
  double Tone_[ChordKindCount][12];
  double Bass_[ChordKindCount][12];
  double Colour_[ChordKindCount];
  double Missing_;
};

/// The best state per unit: NoChordState exactly for the silent units. changeCost[u]
/// is the cost of a change of chord at the start of unit u (infinite where none may
/// happen).
std::vector<int> ChooseChords(std::vector<CTimelineUnit> const& units, std::vector<double> const& changeCost,
                              CChordScorer const& scorer);

#endif
