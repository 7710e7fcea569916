// Key sign count: the single source of key-signature counts (internal).
#ifndef TONVEX_PITCH_KEYSIGNCOUNT_H
#define TONVEX_PITCH_KEYSIGNCOUNT_H

#include "Note.h"

/// Signed number of sharps (positive) or flats (negative) of the key whose tonic is
/// `root`, counted from C for a major-like basic chord, from A for minor (2) and from
/// E for diminished (4). The spelling of the root decides between enharmonic keys
/// (C# major 7, Db major -5) and may push the count beyond +-7 for double
/// accidentals (each enharmonic step is 12 signs).
///
/// A root whose spelling is not senseful for its key number is respelled in place
/// (its spelling is mutable) to the spelling the count assumes.
int KeySignCount(CNote const& root, int basicChord);

#endif
