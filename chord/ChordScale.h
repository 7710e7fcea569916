// The basic chord and the scale that spells a chord, for callers that already know
// what they depend on (internal).
#ifndef TONVEX_CHORD_CHORDSCALE_H
#define TONVEX_CHORD_CHORDSCALE_H

#include "Chord.h"

#include <cstdint>

/// CChord::BasicChord() of an interval cache that holds the intervals 0..11 whose
/// bits are set in `intvls`, under a wrap interval of 12 or more.
CChord::TBasicChord BasicChordOfPitchClasses(std::uint32_t intvls);

/// Scale_Minor for minor and diminished chords, Scale_Major for every other value.
CScale::TType ChordScaleType(CChord::TBasicChord bc);
/// CChord::Scale() of a chord with this root and basic chord: the scale of
/// ChordScaleType(bc) on the root's pitch class and spelling, with the minor second
/// (when the interval cache holds 1) spelled as a lowered second degree.
CScale ChordScale(CNote const& root, CChord::TBasicChord bc, bool minorSecond);

#endif
