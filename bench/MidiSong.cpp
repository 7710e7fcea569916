#include "MidiSong.h"

#include "support/MidiBytes.h"

namespace {

constexpr std::uint32_t Beat = 480;
constexpr int Bars = 100;

// C Am F G | Em Am Dm7 G7, one chord a bar: root and the chord's pitch classes.
struct CBarChord {
  int Root;
  int Tones[4];
};
CBarChord const Loop[8] = {{0, {0, 4, 7, -1}},  {9, {9, 0, 4, -1}}, {5, {5, 9, 0, -1}}, {7, {7, 11, 2, -1}},
                           {4, {4, 7, 11, -1}}, {9, {9, 0, 4, -1}}, {2, {2, 5, 9, 0}},  {7, {7, 11, 2, 5}}};

// Per half bar the bass for two beats and the chord on each beat, detached a little.
MidiTrackBytes Piano() {
  constexpr std::uint32_t Gap = 40;
  MidiTrackBytes track;
  track.Name("PIANO");
  for (int bar = 0; bar < Bars; ++bar) {
    CBarChord const& chord = Loop[bar % 8];
    int const bass = 36 + chord.Root;
    track.Pedal(0, true);
    for (int half = 0; half < 2; ++half) {
      track.On(0, bass, 90);
      for (int beat = 0; beat < 2; ++beat) {
        for (int i = 0; i < 4 && chord.Tones[i] >= 0; ++i)
          track.On(i == 0 && beat == 1 ? Gap : 0, 60 + chord.Tones[i], 70);
        for (int i = 0; i < 4 && chord.Tones[i] >= 0; ++i) track.Off(i == 0 ? Beat - Gap : 0, 60 + chord.Tones[i]);
      }
      track.Off(Gap, bass);
    }
    track.Pedal(0, false);
  }
  return track.End();
}

// Eighths on chord tones with a passing note between them.
MidiTrackBytes Melody() {
  MidiTrackBytes track;
  track.Name("MELODY");
  for (int bar = 0; bar < Bars; ++bar) {
    CBarChord const& chord = Loop[bar % 8];
    for (int eighth = 0; eighth < 8; ++eighth) {
      int const tone = chord.Tones[(eighth / 2) % 3];
      int const key = 72 + (eighth % 2 == 1 ? (tone + 2) % 12 : tone);
      track.On(0, key, 100, 1).Off(Beat / 2, key, 1);
    }
  }
  return track.End();
}

MidiTrackBytes Drums() {
  MidiTrackBytes track;
  track.Name("DRUMS");
  for (int bar = 0; bar < Bars; ++bar)
    for (int eighth = 0; eighth < 8; ++eighth) {
      int const key = eighth % 4 == 0 ? 36 : eighth % 4 == 2 ? 38 : 42;
      track.On(0, key, 110, 9).Off(Beat / 2, key, 9);
    }
  return track.End();
}

} // namespace

std::vector<unsigned char> SyntheticSongMidi() {
  MidiTrackBytes conductor;
  conductor.Tempo(0, 600000).TimeSig(0, 4, 2).Meta(0, 0x59, {0, 0}).End();
  return MidiFileBytes({conductor, Piano(), Melody(), Drums()});
}
