// The scale that spells a chord, for callers that already know its basic chord
// (internal).
#ifndef TONVEX_CHORD_CHORDSCALE_H
#define TONVEX_CHORD_CHORDSCALE_H

#include "Chord.h"

/// Scale_Minor for minor and diminished chords, Scale_Major for every other value.
CScale::TType ChordScaleType(CChord::TBasicChord bc);
/// CChord::Scale() of a chord with this root, basic chord and interval cache: the
/// scale of ChordScaleType(bc) on the root's pitch class and spelling, with the minor
/// second (interval 1 in the cache) spelled as a lowered second degree.
CScale ChordScale(CNote const& root, CChord::TBasicChord bc, CIntvlSet const& intvls);

#endif
