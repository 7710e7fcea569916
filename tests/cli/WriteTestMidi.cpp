// Writes the MIDI files of the midi command's tests into DIR, and an empty DIR/out for
// the timelines they write. 480 ticks per quarter.
//   song.mid   format 1, 120 beats per minute in 4/4: track 1 "Piano" (channel 1)
//              plays C, A minor, F, G7 a bar each, track 2 "Bass" (channel 3) E, A,
//              F, G under it, track 3 "Drums" (channel 10) a hit on every beat for a
//              bar longer (to 10 seconds)
//   waltz.mid  format 0, 90 beats per minute in 3/4: D minor, G7, C a bar each, and
//              C again in bar 32 (after a minute)
//   broken.mid a header and a track chunk that claims more bytes than follow
// usage: tonvex_write_test_midi DIR
#include "support/MidiBytes.h"

#include <cstdio>
#include <string>
#include <sys/stat.h>

namespace {

constexpr std::uint32_t Beat = 480;

MidiTrackBytes Chords(std::string const& name, std::initializer_list<std::initializer_list<int>> chords,
                      std::uint32_t length, int channel) {
  MidiTrackBytes track;
  track.Name(name);
  for (auto const& chord : chords) track.Chord(0, chord, length, channel);
  return track.End();
}

Bytes Song() {
  MidiTrackBytes conductor;
  conductor.Tempo(0, 500000).TimeSig(0, 4, 2).End();
  MidiTrackBytes drums;
  drums.Name("Drums");
  for (int beat = 0; beat < 20; ++beat) {
    int const key = beat % 2 == 0 ? 36 : 38;
    drums.On(0, key, 110, 9).Off(Beat, key, 9);
  }
  return MidiFileBytes({conductor,
                        Chords("Piano", {{60, 64, 67}, {57, 60, 64}, {57, 60, 65}, {55, 59, 62, 65}}, 4 * Beat, 0),
                        Chords("Bass", {{40}, {33}, {41}, {31}}, 4 * Beat, 2), drums.End()});
}

Bytes Waltz() {
  MidiTrackBytes track;
  track.Tempo(0, 666667).TimeSig(0, 3, 2);
  for (auto const& chord : {std::initializer_list<int>{50, 57, 65}, {43, 59, 65}, {48, 55, 64}})
    track.Chord(0, chord, 3 * Beat);
  track.Chord(28 * 3 * Beat, {48, 55, 64}, 3 * Beat);
  return MidiFileBytes({track.End()}, 0);
}

bool Write(std::string const& path, Bytes const& bytes) {
  FILE* out = std::fopen(path.c_str(), "wb");
  if (out == nullptr) return false;
  bool const written = std::fwrite(bytes.data(), 1, bytes.size(), out) == bytes.size();
  return std::fclose(out) == 0 && written;
}

} // namespace

int main(int argc, char** argv) {
  if (argc != 2) return 2;
  std::string const dir = argv[1];
  Bytes broken = MidiFileBytes({Chords("Piano", {{60, 64, 67}}, Beat, 0)});
  broken.resize(broken.size() - 4);
  mkdir(dir.c_str(), 0777);
  mkdir((dir + "/out").c_str(), 0777);
  bool const ok =
      Write(dir + "/song.mid", Song()) && Write(dir + "/waltz.mid", Waltz()) && Write(dir + "/broken.mid", broken);
  return ok ? 0 : 1;
}
