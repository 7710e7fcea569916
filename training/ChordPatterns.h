// Training patterns of the built-in chord analysis net: chord voicings with their
// roots, encoded as root finding hands a chord to the net (internal, training tools).
//
// Chord types, in this fixed priority order:
//   1. the 34 rows of the XG chord type table, in the order XGChordIx tries them
//      (major, major 6, major j7, ... sus2, fifth, single note). A row whose pitch
//      classes equal a catalogue type takes that type's name and intervals (ninths
//      kept above the octave); the other rows are named in the catalogue's scheme
//      and their tensions are written above the octave as they are voiced
//      (maj7 #11 as 0 4 7 11 18). Folded into one octave every row is its XG set.
//   2. the catalogue types (CChordTypes) that no XG row covers, in catalogue order:
//      "minor b6", "major 7 b5 #9", "minor 6 added 9".
//
// Voicings: every type over each of the 12 roots, in every inversion (each chord
// tone in the bass, tones in the order listed) and in four layouts:
//   "close"    the bass, then the other tones in chord order, each on the next note
//              above the previous one (within about an octave);
//   "open"     the close layout with every second tone above the bass raised an
//              octave (spread over two octaves);
//   "spread"   the bass alone, the other tones in close layout from an octave above
//              it on (two to three octaves);
//   "doubled"  the close layout with the bass doubled an octave below and the root
//              doubled above the top.
// The bass lies in note numbers 36..47 (24..35 for its doubling).
//
// Net encoding (as root finding does it): input i (0..23) is 1.0 when some note lies
// i semitones above the lowest note after folding into 0..11, so inputs 12..23 are
// always 0.0; the target is one-hot over the 12 outputs at the labelled root's
// interval above the lowest note.
//
// Label convention for pitch-class sets that several interpretations share (an
// interpretation is a chord type of the list above with a root whose pitch classes
// are the set):
//   1. Only the XG types compete when any of them fits; the catalogue-only types
//      name just the sets no XG type names (E G B C is C major j7 / E, not E minor
//      b6, and C Eb G Ab is Ab major j7 / C).
//   2. Among the competing ones the bass is the root when it is the root of any of
//      them (C E G A is C major 6 and A C E G is A minor 7; F G C is F sus2; every
//      symmetric chord, augmented or diminished 7, is named from its bass).
//   3. Otherwise the first in the priority order wins (E G A C is C major 6 / E,
//      G C F is C sus4 / G); should that type fit at several roots (major 7 b5 over
//      its third), the root nearest above the bass wins.
// So the label depends only on the net's input, and the training set is free of
// contradictions.
// A set is unambiguous when all its interpretations agree on the root; accuracy
// figures are reported on those.
//
// A single note is its own root (the "single note" row). The all-zero input (no
// notes) never reaches the net, as root finding handles an empty chord before; the
// net is nevertheless taught to answer it with output 6, and only weakly (target
// 0.5 there, 0.0 elsewhere), so that its winning output stays well below 0.98.
#ifndef TONVEX_TRAINING_CHORDPATTERNS_H
#define TONVEX_TRAINING_CHORDPATTERNS_H

#include <tonvex/NeuronalNet.h>
#include <tonvex/TrainingPattern.h>

#include <string>
#include <vector>

/// Input and output counts of the chord analysis net.
constexpr int ChordNetInputCount = 24;
constexpr int ChordNetOutputCount = 12;
/// The winner taught for the all-zero input and its target value.
constexpr int EmptyChordWinner = 6;
constexpr float EmptyChordTarget = 0.5f;

struct TChordPatternType {
  std::string name;        ///< "major 7"
  std::vector<int> intvls; ///< above the root, ascending; tensions may lie above the octave
  int xgNr;                ///< XG chord type number, -1 for a type the XG table lacks
};

struct TChordVoicing {
  std::vector<int> noteNrs; ///< ascending, the lowest is the bass
  int rootKeyNr;            ///< the root the voicing was built on
  std::string name;         ///< ChordVoicingName of its notes and labelled root
  int label;                ///< labelled root as interval 0..11 above the bass
  bool unambiguous;         ///< all interpretations of its pitch classes agree on the root
};

/// A distinct net input with its label and how many voicings give it.
struct TChordPatternClass {
  training_pattern pattern; ///< named after the first voicing that gives it
  int voicingCount;
  bool unambiguous;
};

/// Recognition of the voicings, counted per voicing.
struct TChordAccuracy {
  int voicings = 0;
  int named = 0; ///< voicings whose labelled root is the net's winner
  int unambiguousVoicings = 0;
  int unambiguousNamed = 0;
};

/// The chord types in priority order (see above).
std::vector<TChordPatternType> ChordPatternTypes();

/// Pitch-class set as a 12-bit mask (bit i = pitch class i).
using TPitchClassMask = unsigned;

/// The labelled root of a set given relative to its bass (bit 0 set), as an interval
/// above the bass; -1 when no type of the list fits the set.
int LabelledRoot(std::vector<TChordPatternType> const& types, TPitchClassMask relative);
/// True when every interpretation of the set has the same root (also when there is
/// none).
bool IsUnambiguous(std::vector<TChordPatternType> const& types, TPitchClassMask relative);

/// The pattern name of a voicing: the library's own name (CChord::Name under the
/// current naming preferences, DefaultChordnamePref) of a chord of these note numbers
/// whose root is set to rootKeyNr's pitch class in the natural spelling, followed by
/// the layout in parentheses. The name is kept as the library writes it, blanks
/// included: "C  7 (close)", and with the default preferences a slash bass only for a
/// chord wider than an octave ("C   / E (spread)"). The layout in the name tells
/// close, open, spread and doubled voicings of a chord apart; inversions that stay
/// within an octave still share a name, as the library names them alike.
std::string ChordVoicingName(std::vector<int> const& noteNrs, int rootKeyNr, std::string const& layout);

/// All voicings: types in priority order, then roots 0..11, inversions, layouts.
std::vector<TChordVoicing> ChordVoicings();

/// The 24 net inputs of a set of note numbers (empty notes give all zeros).
std::vector<float> ChordNetInputs(std::vector<int> const& noteNrs);

/// The voicing as a training pattern with the given rate.
training_pattern ChordTrainingPattern(TChordVoicing const& voicing, float rate);
/// The all-zero input with its weak target at EmptyChordWinner.
training_pattern EmptyChordPattern(float rate);

/// The distinct inputs of the voicings, in the order of their first voicing.
std::vector<TChordPatternClass> ChordPatternClasses(std::vector<TChordVoicing> const& voicings, float rate);

/// How many voicings (weighted by each class's voicing count) the net names right.
TChordAccuracy MeasureChordAccuracy(NeuronalNet& net, std::vector<TChordPatternClass> const& classes);

#endif
