// The first steps of the chord timeline (ChordTimeline.h): sounding notes on the beat
// grid, the grid's phase, the units of analysis and their pitch-class evidence.
#ifndef TONVEX_MIDI_TIMELINEEVIDENCE_H
#define TONVEX_MIDI_TIMELINEEVIDENCE_H

#include "ChordTimeline.h"

#include <vector>

/// v within lo..hi; lo for a NaN. Settings pass through it, so that any values a
/// host sets keep the scores finite and ordered.
inline double Within(double v, double lo, double hi) { return !(v >= lo) ? lo : !(v <= hi) ? hi : v; }
/// The largest weight, penalty or cost taken from the settings.
constexpr double MostPenalty = 1e12;

/// A pitch sounding from Start to End, in beat positions of the unshifted grid: held
/// until Release, then sustained by the pedal and fading.
struct CSoundingNote {
  double Start = 0;
  double Release = 0;
  double End = 0;
  int NoteNr = 0;
  double Loudness = 0; // velocity / 127
};

/// A stretch of whole beats [FirstBeat, EndBeat) on the shifted grid, with what
/// sounds there: Weight and Bass per pitch class, each summing to the unit's length
/// in beats (zero when Silent).
struct CTimelineUnit {
  long long FirstBeat = 0;
  long long EndBeat = 0;
  bool Silent = true;
  double Weight[12] = {};
  double Bass[12] = {};
};

/// Step 1: the notes that take part, with the pedal applied and overlapping notes
/// of one pitch merged, ordered by start.
std::vector<CSoundingNote> SoundingNotes(std::vector<CTimedNote> const& notes, std::vector<CTimedPedal> const& pedals,
                                         CMidiTimeMap const& map, CChordTimelineSettings const& settings);

/// Step 2: the phase (0 <= phase < 1 beat) where the onsets cluster.
double OnsetPhase(std::vector<CSoundingNote> const& notes);

/// Steps 3 and 4: the units from the first sounding beat to the last, on the grid
/// shifted by phase.
std::vector<CTimelineUnit> TimelineUnits(std::vector<CSoundingNote> const& notes, double phase, CMidiTimeMap const& map,
                                         CChordTimelineSettings const& settings);

#endif
