// The chord timeline of MIDI files written here byte by byte, each with the timeline
// a musician would write over it. 480 ticks per quarter, 120 beats per minute unless
// a case says otherwise: a beat lasts half a second, a 4/4 bar two seconds.
#include "support/MidiBytes.h"
#include <tonvex/ChordTimeline.h>

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <thread>
#include <vector>

namespace {

constexpr std::uint32_t Beat = 480;
constexpr std::uint32_t Bar = 4 * Beat;

// "start-end name@bar:beat" per segment, times in seconds with two decimals.
std::string Timeline(Bytes const& bytes, CChordTimelineSettings const& settings = {}) {
  CMidiFile file;
  CMidiReadResult const result = ReadMidiFile(bytes.data(), bytes.size(), file);
  EXPECT_TRUE(result.Ok()) << result.Message();
  CMidiTimeMap const map(file);
  std::string text;
  for (CChordSegment const& s :
       AnalyseChordTimeline(TimedNotesOf(file, map), TimedPedalsOf(file, map), map, settings)) {
    char times[64];
    std::snprintf(times, sizeof times, "%.2f-%.2f ", s.Start, s.End);
    text += times + (s.NoChord ? std::string("N") : s.Chord.Name(DefaultChordnamePref)) + "@" + std::to_string(s.Bar) +
            ":" + std::to_string(s.Beat) + "|";
  }
  return text;
}

// Whole-bar block chords in the left hand.
MidiTrackBytes BlockChords(std::vector<std::vector<int>> const& chords, std::uint32_t length = Bar) {
  MidiTrackBytes track;
  for (auto const& chord : chords) track.Chord(0, chord, length);
  return track.End();
}

MidiTrackBytes Conductor(std::uint32_t micros = 500000) {
  MidiTrackBytes track;
  track.Tempo(0, micros).TimeSig(0, 4, 2);
  return track.End();
}

std::vector<std::vector<int>> const CAmFG = {{48, 55, 64}, {45, 52, 60}, {41, 57, 60}, {43, 59, 62}};
std::string const CAmFGTimeline = "0.00-2.00 C  @1:1|2.00-4.00 A m @2:1|4.00-6.00 F  @3:1|6.00-8.00 G  @4:1|";

// A melody of eighths and quarters over the block chords, with passing and neighbour
// notes off the beat (D over C, B over A minor, G over F, E and C over G).
MidiTrackBytes Melody() {
  MidiTrackBytes track;
  int const notes[][2] = {{72, 240}, {74, 240}, {76, 960}, {76, 480},                        // C: E D passing
                          {72, 240}, {71, 240}, {69, 960}, {72, 480},                        // Am: B neighbour
                          {69, 240}, {67, 240}, {65, 960}, {69, 480},                        // F: G passing
                          {71, 240}, {72, 240}, {74, 480}, {76, 240}, {74, 240}, {67, 480}}; // G: C, E
  for (auto const& n : notes) track.On(0, n[0], 100, 1).Off(static_cast<std::uint32_t>(n[1]), n[0], 1);
  return track.End();
}

struct TimelineCase {
  const char* What;
  Bytes Song;
  std::string Expected;
  CChordTimelineSettings Settings = {};
};

TEST(ChordTimelineTest, SongsAndTheirTimelines) {
  // A chorale in four voices, a chord on every beat: I IV V I | vi ii V7 I.
  std::vector<std::vector<int>> const chorale = {{48, 64, 67, 72}, {41, 65, 69, 72}, {43, 62, 67, 71},
                                                 {48, 64, 67, 72}, {45, 64, 69, 72}, {38, 65, 69, 74},
                                                 {43, 65, 67, 71}, {36, 64, 67, 72}};
  // Broken chords, one note per eighth over a bass held through the bar: C, F over
  // C, G7 (B F D F over G), C.
  int const patterns[][5] = {{36, 60, 64, 67, 72}, {36, 60, 65, 69, 72}, {43, 59, 65, 62, 65}, {36, 60, 64, 67, 72}};
  MidiTrackBytes bass, broken;
  for (auto const& p : patterns) {
    bass.On(0, p[0], 80).Off(Bar, p[0]);
    for (int i = 0; i < 8; ++i) broken.On(0, p[1 + i % 4], 70, 1).Off(Beat / 2, p[1 + i % 4], 1);
  }
  MidiTrackBytes slower, meters, waltz, pedal, dry, late, shortF;
  slower.Tempo(0, 500000).TimeSig(0, 4, 2).Tempo(2 * Bar, 1000000).End();
  meters.Tempo(0, 500000).TimeSig(0, 4, 2).TimeSig(Bar, 3, 2).End();
  waltz.Tempo(0, 500000).TimeSig(0, 3, 2).Chord(0, {48, 55, 64}, 4 * Beat).Chord(0, {43, 59, 62}, 5 * Beat).End();
  pedal.Pedal(0, true).Chord(0, {48, 55, 64}, Beat / 8).Pedal(2 * Beat - Beat / 8, false);
  pedal.Chord(Beat, {45, 52, 60}, Beat).End();
  dry.Chord(0, {48, 55, 64}, Beat / 8).Chord(3 * Beat - Beat / 8, {45, 52, 60}, Beat).End();
  late.Event(Beat / 5, {0xff, 0x01, 0});
  for (unsigned char b : BlockChords(CAmFG).Data) late.Data.push_back(b);
  shortF.Chord(0, {48, 55, 64}, Bar).Chord(0, {48, 53, 57}, Bar / 2).Chord(0, {48, 55, 64}, Bar).End();
  CChordTimelineSettings bars, joined;
  bars.Grid = ChordGrid_Bar;
  joined.MinDuration = 1.5;
  TimelineCase const cases[] = {
      {"block chords", MidiFileBytes({Conductor(), BlockChords(CAmFG)}), CAmFGTimeline},
      {"melody over block chords", MidiFileBytes({Conductor(), BlockChords(CAmFG), Melody()}), CAmFGTimeline},
      {"chorale", MidiFileBytes({Conductor(), BlockChords(chorale, Beat)}),
       "0.00-0.50 C  @1:1|0.50-1.00 F  @1:2|1.00-1.50 G  @1:3|1.50-2.00 C  @1:4|2.00-2.50 A m @2:1|"
       "2.50-3.00 D m @2:2|3.00-3.50 G  7@2:3|3.50-4.00 C  @2:4|"},
      {"arpeggios", MidiFileBytes({Conductor(), bass.End(), broken.End()}),
       "0.00-2.00 C  @1:1|2.00-4.00 F  @2:1|4.00-6.00 G  7@3:1|6.00-8.00 C  @4:1|"},
      // 120 beats per minute for two bars, then 60: bars 3 and 4 last four seconds.
      {"tempo change", MidiFileBytes({slower, BlockChords(CAmFG)}),
       "0.00-2.00 C  @1:1|2.00-4.00 A m @2:1|4.00-8.00 F  @3:1|8.00-12.00 G  @4:1|"},
      // A bar of 4/4, then 3/4: the chords change every three beats and the bars follow.
      {"4/4 then 3/4", MidiFileBytes({meters, BlockChords({{48, 55, 64}, {43, 59, 62}, {45, 52, 60}}, 3 * Beat)}),
       "0.00-1.50 C  @1:1|1.50-3.00 G  @1:4|3.00-4.50 A m @2:3|"},
      // On a bar grid a chord that starts on the second beat of a bar must wait for
      // a bar line: here the earlier one, where it lasts longer.
      {"waltz on beats", MidiFileBytes({waltz}), "0.00-2.00 C  @1:1|2.00-4.50 G  @2:2|"},
      {"waltz on bars", MidiFileBytes({waltz}), "0.00-1.50 C  @1:1|1.50-4.50 G  @2:1|", bars},
      // A short chord held by the pedal for two beats sounds for them; after the pedal
      // and a beat of silence comes A minor. Without the pedal it ends with its beat.
      {"sustain pedal", MidiFileBytes({Conductor(), pedal}), "0.00-1.00 C  @1:1|1.00-1.50 N@1:3|1.50-2.00 A m @1:4|"},
      {"no pedal", MidiFileBytes({Conductor(), dry}), "0.00-0.50 C  @1:1|0.50-1.50 N@1:2|1.50-2.00 A m @1:4|"},
      {"empty track", MidiFileBytes({Conductor(), MidiTrackBytes().End()}), ""},
      // Notes a fifth of a beat late throughout: the grid follows them, and the silence
      // before the first is no chord.
      {"late notes", MidiFileBytes({Conductor(), late}),
       "0.00-0.10 N@0:4|0.10-2.10 C  @1:1|2.10-4.10 A m @2:1|4.10-6.10 F  @3:1|6.10-8.10 G  @4:1|"},
      // A segment shorter than MinDuration joins its better neighbour: a beat of F
      // over the bass C between two bars of C becomes C.
      {"short F", MidiFileBytes({Conductor(), shortF}), "0.00-2.00 C  @1:1|2.00-3.00 F  @2:1|3.00-5.00 C  @2:3|"},
      {"short F joined", MidiFileBytes({Conductor(), shortF}), "0.00-5.00 C  @1:1|", joined},
  };
  for (TimelineCase const& c : cases) EXPECT_EQ(Timeline(c.Song, c.Settings), c.Expected) << c.What;
}

// Drums on channel 10 (a kick on every beat would be the bass) are left out unless
// asked for; an empty track changes nothing.
TEST(ChordTimelineTest, DrumsLeftOutUnlessAskedFor) {
  MidiTrackBytes drums;
  for (int i = 0; i < 16; ++i) drums.On(0, 36, 120, 9).Off(Beat, 36, 9);
  Bytes const song = MidiFileBytes({Conductor(), MidiTrackBytes().End(), BlockChords(CAmFG), drums.End()});
  EXPECT_EQ(Timeline(song), CAmFGTimeline);
  CChordTimelineSettings withDrums;
  withDrums.IncludeDrums = true;
  EXPECT_NE(Timeline(song, withDrums), CAmFGTimeline);
}

// The analysis keeps no state outside its call: threads that analyse songs at the
// same time, by net and by rules, get the timelines one thread gets alone. The
// ThreadSanitizer build (.ci/run) runs this test to find any data race on the way.
TEST(ConcurrentAnalysis, TimelinesOnFourThreads) {
  std::vector<Bytes> const songs = {MidiFileBytes({Conductor(), BlockChords(CAmFG), Melody()}),
                                    MidiFileBytes({Conductor(600000), BlockChords(CAmFG, Beat)})};
  CChordTimelineSettings byRules;
  byRules.Algo = SCA_RULE_WEIGHTS;
  std::vector<CChordTimelineSettings> const settings = {CChordTimelineSettings(), byRules};
  std::vector<std::string> expected;
  for (Bytes const& song : songs)
    for (CChordTimelineSettings const& s : settings) expected.push_back(Timeline(song, s));
  std::vector<int> mismatches(4, 0);
  std::vector<std::thread> threads;
  for (std::size_t t = 0; t < mismatches.size(); ++t)
    threads.emplace_back([&, t] {
      for (std::size_t k = 0; k < 40; ++k) {
        std::size_t const i = (t + k) % expected.size();
        if (Timeline(songs[i / 2], settings[i % 2]) != expected[i]) ++mismatches[t];
      }
    });
  for (std::thread& thread : threads) thread.join();
  for (int count : mismatches) EXPECT_EQ(count, 0);
}

} // namespace
