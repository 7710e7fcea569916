// Chord timelines: where the chord changes in a piece given as timed notes, and what
// each chord is, the way a musician writes chord symbols over a song.
//
// Input: notes with start and end in seconds, key, velocity, channel and track
// (TimedNotesOf converts a MIDI file's), the sustain pedal, and a time map that gives
// the beats and bars (CMidiTimeMap: a file's tempo and time signatures, or the
// default 120 beats per minute in 4/4 for notes without one). Output: consecutive
// segments from 0 to the last note's end, each a chord (a CChord whose root the
// library's root finding chose) or no chord where nothing sounds.
//
// The method:
//  1. Notes on the drum channel (10) are left out unless IncludeDrums. A note released
//     while its track's and channel's sustain pedal is down sounds on until the pedal
//     goes up or its key is struck again, fading: its weight halves every
//     SustainHalfLife beats, and after four half-lives it is gone (a pedal that is
//     never lifted does not smear a whole song). Overlapping notes of one pitch count
//     once.
//  2. The beat grid comes from the time map. A file cut from a performance often has
//     its notes off the grid by a constant amount (its first beat is not at 0), so
//     the grid is shifted to the phase where the onsets cluster: onsets are counted,
//     weighted by velocity and by duration up to a beat, in PhaseBins bins of the
//     beat, and the fullest bin is the beat (AlignGridToOnsets). An onset up to an
//     eighth of a beat early, or an end up to an eighth late, counts as on the beat.
//  3. Each beat becomes a unit of analysis. Beats in which no note starts or ends
//     merge into the unit before them (nothing changes there), except that such a
//     stretch is cut at its first bar line, so the work grows with the notes, not with
//     the length of the piece. A unit in which nothing sounds is no chord.
//  4. Evidence per unit, per pitch class: how long each note sounds within the unit
//     (in beats) times its velocity / 127, times OffBeatWeight if the note starts
//     off the beat and lasts less than a beat (a passing or ornamental note). The
//     bass: how long each pitch class is the lowest held note (the lowest sustained
//     one while none is held). Both are scaled to sum to the time something sounds in
//     the unit, so a unit counts by its length, not by how many notes it has.
//  5. Candidate chords: the 12 roots times 12 kinds (major, minor, diminished,
//     augmented, sus4, sus2, 7, maj7, m7, m7b5, dim7, power chord). A chord's score
//     over a unit is a log-likelihood: chord tones share ChordToneMass of the
//     pitch-class evidence and the other pitch classes the rest, equally; the bass,
//     weighted by BassWeight, is the root with RootBassMass, another chord tone with
//     InversionBassMass, anything else with what is left. Each chord tone that has
//     less than 5% of the evidence costs MissingTonePenalty per beat (C major is a
//     poor reading of F, A and C over a held C). The diminished triad and the seventh
//     chords pay SeventhPenalty per beat, the augmented, sus and power chords
//     ColourPenalty, so that a melody note does not turn a triad into a seventh or
//     sus chord unless it is held as part of the harmony.
//  6. Dynamic programming (Viterbi) over the units finds the chord sequence with the
//     best total score, where a change of chord costs ChangeCost[level] by the
//     metrical level of the beat it falls on: the first beat of a bar (level 0), the
//     middle beat of a bar of an even number of beats (1), any other beat (2). The
//     Grid setting can allow changes on bar lines only, or on every beat alike
//     (ChangeCost[0] each).
//  7. Neighbouring units with the same chord merge into one segment; with
//     MinDuration, segments shorter than that join a neighbour, the shortest first,
//     each the neighbour whose chord scores better over it. Each segment's chord is
//     built from its chord tones over its bass (the pitch class that is longest the
//     lowest note, if it is a chord tone, else the root), and its root is found by
//     Algo (the built-in net by default) and spelled by the library, so that names
//     come out as the library names chords.
//
// Everything is bounded by the number of notes: the work is O(n log n) plus a
// constant per unit and pitch class. Nothing here throws (apart from std::bad_alloc).
//
// Threads: an analysis keeps all its state in the call (it only reads its arguments
// and returns new segments) and finds roots as Chord.h's thread-safe chords do, so
// any number of threads may analyse at once, different inputs or the same ones,
// while no thread changes what Chord.h names as unsafe meanwhile: a naming
// preference, or the neuron parameters (building, copying or training a NeuronalNet).
// ReadMidiFile, CMidiTimeMap and the conversions below share nothing either.
#ifndef TONVEX_CHORDTIMELINE_H
#define TONVEX_CHORDTIMELINE_H

#include "Chord.h"
#include "MidiFile.h"
#include "TonvexExport.h"

#include <vector>

/// A note in seconds.
struct CTimedNote {
  double Start = 0;
  double End = 0;
  int NoteNr = 60;
  int Velocity = 100; // 1..127
  int Channel = 0;    // 0..15; 9 is the drum channel
  int TrackIx = 0;
};

/// The sustain pedal of a track's channel going down or up.
struct CTimedPedal {
  double Time = 0;
  int Channel = 0;
  int TrackIx = 0;
  bool Down = false;
};

/// The drum channel of General MIDI (channel 10, counted from 0).
constexpr int MidiDrumChannel = 9;

/// Where the chord may change.
enum TChordGrid : int {
  ChordGrid_Auto = 0, // on any beat, most easily on strong beats
  ChordGrid_Beat = 1, // on any beat alike
  ChordGrid_Bar = 2   // on the first beat of a bar only
};

struct CChordTimelineSettings {
  TSingleChordAnalysisAlgo Algo = SCA_NEURONAL_NET;
  TChordGrid Grid = ChordGrid_Auto;
  bool IncludeDrums = false;
  bool AlignGridToOnsets = true;
  /// Segments shorter than this (seconds) join a neighbour; 0 keeps every segment.
  double MinDuration = 0;

  // The model (see the method above). Scores are natural logarithms, penalties and
  // costs in the same unit per beat of evidence. Values out of range are taken as
  // the nearest sensible one (masses within 0..1, weights and costs not negative).
  static constexpr int PhaseBins = 48;
  double OffBeatWeight = 1.0;   // short notes starting off the beat
  double SustainHalfLife = 0.5; // beats
  double ChordToneMass = 0.9;
  double BassWeight = 0.5;
  double RootBassMass = 0.6;
  double InversionBassMass = 0.3;
  double MissingTonePenalty = 0.25;
  double ColourPenalty = 1.0;               // augmented, sus4, sus2, power chord
  double SeventhPenalty = 0.3;              // diminished triad and the seventh chords
  double ChangeCost[3] = {0.75, 1.0, 1.25}; // bar line, middle of the bar, other beats
};

/// One segment of the timeline.
struct CChordSegment {
  double Start = 0; // seconds
  double End = 0;
  /// The bar and beat where it starts, on the grid after its shift: bars from 1,
  /// beats from 1 to the bar's count. A stretch before the first beat of the grid
  /// lies in bar 0.
  long long Bar = 1;
  int Beat = 1;
  /// No chord: nothing sounds. Otherwise Chord holds the chord: its notes are the
  /// chord tones, the bass lowest, and its root is found.
  bool NoChord = true;
  CChord Chord;
};

/// The notes and pedal events of a MIDI file in seconds.
TONVEX_API std::vector<CTimedNote> TimedNotesOf(CMidiFile const& file, CMidiTimeMap const& map);
TONVEX_API std::vector<CTimedPedal> TimedPedalsOf(CMidiFile const& file, CMidiTimeMap const& map);

/// The chord timeline of the notes (in any order): consecutive segments from 0 to the
/// latest note end (none when no note is left to analyse).
TONVEX_API std::vector<CChordSegment> AnalyseChordTimeline(std::vector<CTimedNote> const& notes,
                                                           std::vector<CTimedPedal> const& pedals,
                                                           CMidiTimeMap const& map,
                                                           CChordTimelineSettings const& settings);

#endif
