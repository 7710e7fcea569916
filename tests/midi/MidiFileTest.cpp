// The MIDI file reader on files written here byte by byte: what it keeps of valid
// files, and where and why it refuses broken ones.
#include "support/MidiBytes.h"
#include <tonvex/MidiFile.h>

#include <gtest/gtest.h>

#include <string>
#include <tuple>
#include <vector>

namespace {

CMidiFile Read(Bytes const& bytes) {
  CMidiFile file;
  CMidiReadResult const result = ReadMidiFile(bytes.data(), bytes.size(), file);
  EXPECT_TRUE(result.Ok()) << result.Message();
  return file;
}

// Start, end, key, velocity, channel and track of each note.
using NoteFact = std::tuple<std::int64_t, std::int64_t, int, int, int, int>;

std::vector<NoteFact> Facts(CMidiFile const& file) {
  std::vector<NoteFact> facts;
  for (CMidiNote const& n : file.Notes)
    facts.emplace_back(n.StartTick, n.EndTick, n.NoteNr, n.Velocity, n.Channel, n.TrackIx);
  return facts;
}

// Running status across note-ons and velocity-0 note-offs, a note-off as 0x80 with a
// meta event and a sysex in between, overlapping notes of one key (first in, first
// out), a note left sounding at the end of its track, and a second track.
TEST(MidiFileTest, EventsBecomeNotes) {
  MidiTrackBytes first;
  first.Name("piano").Event(0, {0x91, 60, 80}).Event(0, {64, 70}).Event(240, {60, 0});
  first.Event(0, {0xf0, 2, 0x7e, 0xf7}).Meta(0, 0x01, {'x'}).Event(0, {64, 0});
  first.On(0, 67, 50).On(100, 67, 40).Off(50, 67).Off(50, 67).On(0, 72, 30).End(60);
  MidiTrackBytes second;
  second.Event(10, {0x99, 36, 100}).Event(20, {0x89, 36, 0}).End();
  CMidiFile const file = Read(MidiFileBytes({first, second}));
  std::vector<NoteFact> const expected = {{0, 240, 60, 80, 1, 0},   {0, 240, 64, 70, 1, 0},   {10, 30, 36, 100, 9, 1},
                                          {240, 390, 67, 50, 0, 0}, {340, 440, 67, 40, 0, 0}, {440, 500, 72, 30, 0, 0}};
  EXPECT_EQ(Facts(file), expected);
  ASSERT_EQ(file.Tracks.size(), 2u);
  EXPECT_EQ(file.Tracks[0].Name, "piano");
  EXPECT_EQ(file.EndTick(), 500);
}

TEST(MidiFileTest, KeepsTempoMeterKeyAndPedal) {
  MidiTrackBytes track;
  track.Tempo(0, 600000).TimeSig(0, 6, 3).Meta(0, 0x59, {0xfd, 1}).Pedal(480, true, 2).Pedal(480, false, 2);
  track.Event(0, {0xb2, 64, 63}).Tempo(0, 400000).End();
  CMidiFile const file = Read(MidiFileBytes({track}, 0, 96));
  ASSERT_EQ(std::make_tuple(file.Tempos.size(), file.TimeSigs.size(), file.KeySigs.size(), file.Pedals.size()),
            std::make_tuple(2u, 1u, 1u, 3u));
  // Format and division, the second tempo, 6/8, E flat minor; the pedal goes down
  // and up on channel index 2, and a value of 63 is up.
  EXPECT_EQ(std::make_tuple(file.Format, file.TicksPerQuarter, file.Tempos[1].Tick, file.Tempos[1].MicrosPerQuarter,
                            file.TimeSigs[0].Numerator, file.KeySigs[0].Sharps, file.KeySigs[0].Minor,
                            file.Pedals[0].Down, file.Pedals[1].Channel, file.Pedals[2].Down),
            std::make_tuple(0, 96, 960, 400000, 6, -3, true, true, 2, false));
}

struct Broken {
  const char* what;
  Bytes bytes;
  std::size_t offset;
  const char* message;
};

Bytes WithTrack(Bytes const& events, int format = 1, std::uint32_t division = 480) {
  MidiTrackBytes track;
  track.Data = events;
  return MidiFileBytes({track}, format, division);
}

// Offsets: the header is 14 bytes, a track's events begin at 22; a meta or sysex
// event is named by its status byte.
TEST(MidiFileTest, BrokenFilesNameOffsetAndProblem) {
  Bytes const valid = WithTrack({0, 0x90, 60, 100, 10, 60, 0});
  Bytes truncated = valid;
  truncated.resize(valid.size() - 2);
  Bytes overlong = valid;
  overlong[21] = 100;
  MidiTrackBytes absurd; // nine times the largest delta time
  absurd.On(0, 60);
  for (int i = 0; i < 9; ++i) absurd.Event(0x0fffffff, {60, 0});
  Bytes const tooFew = {'M', 'T', 'h', 'd', 0, 0, 0, 6, 0, 1, 0, 2, 1, 0xe0};
  std::vector<Broken> const cases = {
      {"empty", {}, 0, "not a MIDI file"},
      {"text", {'h', 'e', 'l', 'l', 'o'}, 0, "not a MIDI file"},
      {"short header", {'M', 'T', 'h', 'd', 0, 0, 0, 6, 0, 1}, 4, "runs past the end of the file"},
      {"header length", {'M', 'T', 'h', 'd', 0, 0, 0, 2, 0, 1}, 4, "header length 2"},
      {"format 2", WithTrack({0, 0xff, 0x2f, 0}, 2), 8, "format 2"},
      {"format 7", WithTrack({0, 0xff, 0x2f, 0}, 7), 8, "unknown format 7"},
      {"no tracks", MidiFileBytes({}), 10, "no tracks"},
      {"division 0", WithTrack({}, 1, 0), 12, "division of 0"},
      {"SMPTE 23 fps", WithTrack({}, 1, 0xe950), 12, "23 frames per second"},
      {"SMPTE 0 ticks", WithTrack({}, 1, 0xe700), 13, "0 ticks per frame"},
      {"missing track", tooFew, 14, "after 0 of 2 tracks"},
      {"truncated track", truncated, 14, "track of 7 bytes runs past the end of the file (5 bytes left)"},
      {"chunk length", overlong, 14, "track of 100 bytes"},
      {"cut chunk header", {'M', 'T', 'h', 'd', 0, 0, 0, 6, 0, 1, 0, 1, 1, 0xe0, 'M', 'T'}, 14, "chunk header"},
      {"long delta", WithTrack({0x80, 0x80, 0x80, 0x80, 0}), 22, "longer than four bytes"},
      {"absurd delta", MidiFileBytes({absurd}), 74, "delta time 268435455 takes the track past tick 2147483647"},
      {"no status", WithTrack({0, 60, 100}), 23, "without a status byte"},
      {"status in data", WithTrack({0, 0x90, 60, 0x90}), 25, "where a data byte is due"},
      {"system status", WithTrack({0, 0xf2, 1, 2}), 23, "status byte 0xf2"},
      {"cut event", WithTrack({0, 0x90, 60}), 25, "file ends in a channel event"},
      {"meta past end", WithTrack({0, 0xff, 0x01, 9, 'a'}), 23,
       "meta event of 9 bytes runs past the end of its track (1 byte left)"},
      {"sysex past end", WithTrack({0, 0xf0, 5, 1}), 23, "sysex event of 5 bytes"},
      {"tempo length", WithTrack({0, 0xff, 0x51, 2, 1, 2}), 23, "tempo meta event of length 2 (3 expected)"},
      {"tempo 0", WithTrack({0, 0xff, 0x51, 3, 0, 0, 0}), 23, "tempo of 0"},
      {"meter 0", WithTrack({0, 0xff, 0x58, 4, 0, 2, 24, 8}), 23, "numerator 0"},
      {"meter 1/2^9", WithTrack({0, 0xff, 0x58, 4, 4, 9, 24, 8}), 23, "denominator 2^9"},
      {"key 8 sharps", WithTrack({0, 0xff, 0x59, 2, 8, 0}), 23, "key signature 8 0"},
  };
  for (Broken const& c : cases) {
    CMidiFile file;
    CMidiReadResult const result = ReadMidiFile(c.bytes.data(), c.bytes.size(), file);
    EXPECT_FALSE(result.Ok()) << c.what;
    EXPECT_EQ(result.Offset, c.offset) << c.what << ": " << result.Message();
    EXPECT_NE(result.What.find(c.message), std::string::npos) << c.what << ": " << result.Message();
    EXPECT_EQ(result.Message().rfind("byte " + std::to_string(c.offset) + ": ", 0), 0u) << c.what;
  }
}

// Every prefix of a valid file is refused at an offset inside it, or read (a file cut
// between chunks after its last track, or inside the bytes ignored after it).
TEST(MidiFileTest, EveryPrefixIsRefusedWithinItOrRead) {
  MidiTrackBytes track;
  track.Name("x").Tempo(0, 500000).TimeSig(0, 3, 2).On(0, 60).Event(0, {0xf0, 1, 0xf7}).Off(0x4000, 60).End();
  Bytes const file = MidiFileBytes({track, track});
  for (std::size_t size = 0; size < file.size(); ++size) {
    CMidiFile read;
    CMidiReadResult const result = ReadMidiFile(file.data(), size, read);
    ASSERT_FALSE(result.Ok()) << size;
    EXPECT_LE(result.Offset, size) << result.Message();
  }
  EXPECT_EQ(Read(file).Notes.size(), 2u);
}

TEST(MidiTimeMapTest, TempoChangesAndSmpte) {
  CMidiTimeMap const map(480, 0, 0, {{960, 1000000}, {0, 500000}}, {});
  struct {
    std::int64_t tick;
    double seconds, quarters;
  } const points[] = {{0, 0, 0}, {480, 0.5, 1}, {960, 1, 2}, {1200, 1.5, 2.5}, {1920, 3, 4}};
  for (auto const& p : points) {
    EXPECT_DOUBLE_EQ(map.TickToSeconds(p.tick), p.seconds) << p.tick;
    EXPECT_DOUBLE_EQ(map.SecondsToQuarters(p.seconds), p.quarters) << p.tick;
    EXPECT_DOUBLE_EQ(map.QuartersToSeconds(p.quarters), p.seconds) << p.tick;
  }
  // 25 frames of 40 ticks: a tick is a millisecond; at 1 s per quarter a beat a second.
  CMidiTimeMap const smpte(0, 25, 40, {{0, 1000000}}, {});
  EXPECT_DOUBLE_EQ(smpte.TickToSeconds(2500), 2.5);
  EXPECT_DOUBLE_EQ(smpte.SecondsToBeatPos(2.5), 2.5);
}

// 4/4 for a bar, 6/8 (two dotted-quarter beats) for two and a half bars, then 3/4
// set in the middle of a beat, which starts a new bar and beat there.
TEST(MidiTimeMapTest, BarsAndBeatsAcrossMeterChanges) {
  CMidiTimeMap const map(480, 0, 0, {}, {{0, 4, 2}, {1920, 6, 3}, {1920 + 1440 * 2 + 360, 3, 2}});
  struct {
    long long beatIx, bar;
    int beat, beatsInBar;
    double seconds;
  } const beats[] = {{0, 1, 1, 4, 0},      {3, 1, 4, 4, 1.5},    {4, 2, 1, 2, 2},
                     {5, 2, 2, 2, 2.75},   {8, 4, 1, 2, 5},      {9, 5, 1, 3, 5.375},
                     {10, 5, 2, 3, 5.875}, {12, 6, 1, 3, 6.875}, {-1, 0, 4, 4, -0.5}};
  for (auto const& b : beats) {
    CMidiTimeMap::CBarBeat const bb = map.BarBeatOf(b.beatIx);
    EXPECT_EQ(bb.Bar, b.bar) << b.beatIx;
    EXPECT_EQ(bb.Beat, b.beat) << b.beatIx;
    EXPECT_EQ(bb.BeatsInBar, b.beatsInBar) << b.beatIx;
    EXPECT_DOUBLE_EQ(map.BeatPosToSeconds(double(b.beatIx)), b.seconds) << b.beatIx;
    EXPECT_DOUBLE_EQ(map.SecondsToBeatPos(b.seconds), double(b.beatIx)) << b.beatIx;
  }
  // The rest of the beat the 3/4 cuts short (positions 8.5 to 9) gives its start.
  double last = map.BeatPosToSeconds(-1);
  for (double pos = -1; pos < 15; pos += 1.0 / 16) {
    double const seconds = map.BeatPosToSeconds(pos);
    EXPECT_GE(seconds, last) << pos;
    last = seconds;
  }
  EXPECT_DOUBLE_EQ(map.BeatPosToSeconds(8.75), 5.375);
}

} // namespace
