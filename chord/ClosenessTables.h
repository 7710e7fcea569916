// How close a chord lies to a key, by basic chord and key mode (internal).
#ifndef TONVEX_CHORD_CLOSENESSTABLES_H
#define TONVEX_CHORD_CLOSENESSTABLES_H

/// The closeness table of a basic chord (1..7) in a major or minor key: twelve values
/// 0..2 indexed by the distance of the chord's root above the key's root in
/// semitones (0..11). Null for basic chord none and any value outside 1..7.
int const* ClosenessTable(int basicChord, bool majorKey);

#endif
