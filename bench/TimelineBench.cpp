// The chord timeline of a whole song: reading the MIDI file from memory, its time map
// and the analysis, for the synthetic four-minute song (bench/MidiSong.h) or, with
// TONVEX_BENCH_MIDI=PATH, for a file of one's own.
#include "BenchSupport.h"
#include "MidiSong.h"

#include <tonvex/ChordTimeline.h>

#include <cstdlib>
#include <fstream>
#include <iterator>

namespace {

std::vector<unsigned char> SongBytes() {
  char const* path = std::getenv("TONVEX_BENCH_MIDI");
  if (path == nullptr) return SyntheticSongMidi();
  std::ifstream in(path, std::ios::binary);
  return std::vector<unsigned char>(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

void BM_ChordTimelineOfSong(benchmark::State& state) {
  std::vector<std::vector<unsigned char>> songs = {SongBytes()};
  RunOverItems(state, songs, [](std::vector<unsigned char> const& bytes) {
    CMidiFile file;
    ReadMidiFile(bytes.data(), bytes.size(), file);
    CMidiTimeMap const map(file);
    benchmark::DoNotOptimize(
        AnalyseChordTimeline(TimedNotesOf(file, map), TimedPedalsOf(file, map), map, CChordTimelineSettings()));
  });
}
TONVEX_BENCHMARK(BM_ChordTimelineOfSong);

} // namespace
