// A synthetic pop song as a Standard MIDI File, for the chord timeline benchmarks: four
// minutes at 100 beats per minute in 4/4 (100 bars), a piano with bass and chords under
// the sustain pedal, a melody of eighths and a drum track, about 3,000 notes in all.
#ifndef TONVEX_BENCH_MIDISONG_H
#define TONVEX_BENCH_MIDISONG_H

#include <vector>

std::vector<unsigned char> SyntheticSongMidi();

#endif
