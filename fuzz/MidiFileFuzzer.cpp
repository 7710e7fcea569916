// The MIDI file reader on arbitrary bytes, then the time map and the chord timeline
// of what it read, under settings taken from the last byte. Stops on a broken
// property: an error offset outside the input, a note that ends before it starts or
// after its track, more events kept than the bytes could hold, a time map that runs
// backwards, a timeline whose segments do not follow each other from 0 or hold a
// chord without notes.
#include <tonvex/ChordTimeline.h>
#include <tonvex/MidiFile.h>

#include <cstdint>
#include <cstdlib>

namespace {

void Check(bool property) {
  if (!property) std::abort();
}

// The smallest event a track can hold is three bytes (a delta time and two data
// bytes in running status); each note needs its note-on.
constexpr std::size_t SmallestEvent = 3;

void CheckTimeMap(CMidiFile const& file) {
  CMidiTimeMap const map(file);
  double lastSeconds = -1, lastBeat = -1e300;
  for (CMidiNote const& note : file.Notes) {
    double const seconds = map.TickToSeconds(note.StartTick);
    double const beat = map.SecondsToBeatPos(seconds);
    Check(seconds >= lastSeconds && seconds >= 0);
    Check(beat >= lastBeat - 1e-6);
    Check(map.TickToSeconds(note.EndTick) >= seconds);
    long long const beatIx = static_cast<long long>(beat);
    CMidiTimeMap::CBarBeat const bb = map.BarBeatOf(beatIx);
    Check(bb.Beat >= 1 && bb.Beat <= bb.BeatsInBar && bb.Bar >= 1);
    lastSeconds = seconds;
    lastBeat = beat;
  }
}

void CheckTimeline(CMidiFile const& file, unsigned char choice) {
  CMidiTimeMap const map(file);
  CChordTimelineSettings settings;
  settings.Grid = static_cast<TChordGrid>(choice % 3);
  settings.IncludeDrums = (choice & 4) != 0;
  settings.AlignGridToOnsets = (choice & 8) == 0;
  settings.Algo = (choice & 16) != 0 ? SCA_RULE_WEIGHTS : SCA_NEURONAL_NET;
  settings.MinDuration = (choice & 32) != 0 ? 0.5 : 0.0;
  std::vector<CChordSegment> const segments =
      AnalyseChordTimeline(TimedNotesOf(file, map), TimedPedalsOf(file, map), map, settings);
  double end = 0;
  for (CChordSegment const& segment : segments) {
    Check(segment.Start == end && segment.End > segment.Start);
    Check(segment.Beat >= 1);
    Check(segment.NoChord || (segment.Chord.NoteCount() >= 2 && !segment.Chord.IsUndefined()));
    end = segment.End;
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  CMidiFile file;
  CMidiReadResult const result = ReadMidiFile(data, size, file);
  Check(result.Ok() || result.Offset <= size);
  Check(result.Ok() == result.Message().empty());
  std::size_t const events =
      file.Notes.size() + file.Pedals.size() + file.Tempos.size() + file.TimeSigs.size() + file.KeySigs.size();
  Check(events * SmallestEvent <= size);
  for (CMidiNote const& note : file.Notes) {
    Check(note.StartTick >= 0 && note.StartTick <= note.EndTick && note.EndTick <= MidiMaxTick);
    Check(note.EndTick <= file.Tracks.at(static_cast<std::size_t>(note.TrackIx)).EndTick);
    Check(note.NoteNr >= 0 && note.NoteNr < 128 && note.Velocity > 0 && note.Velocity < 128);
    Check(note.Channel >= 0 && note.Channel < 16);
  }
  if (result.Ok()) CheckTimeMap(file);
  if (size > 0) CheckTimeline(file, data[size - 1]);
  return 0;
}
