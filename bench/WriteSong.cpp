// Writes the synthetic four-minute song of MidiSong.h to a file, for the whole-process
// timing of `tonvex midi` (bench/midi_timing.py).
// usage: tonvex_song_midi FILE.mid
#include "MidiSong.h"

#include <cstdio>

int main(int argc, char** argv) {
  if (argc != 2) {
    std::fputs("usage: tonvex_song_midi FILE.mid\n", stderr);
    return 2;
  }
  std::vector<unsigned char> const bytes = SyntheticSongMidi();
  FILE* out = std::fopen(argv[1], "wb");
  if (out == nullptr) return 1;
  bool const written = std::fwrite(bytes.data(), 1, bytes.size(), out) == bytes.size();
  return std::fclose(out) == 0 && written ? 0 : 1;
}
