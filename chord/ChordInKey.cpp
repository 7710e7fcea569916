// Chords in relation to a key.
#include "Chord.h"

#include "pitch/KeySignCount.h"

int CChord::SignsCount() const { return KeySignCount(RootNote_, BasicChord()); }
