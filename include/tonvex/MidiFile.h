// Standard MIDI Files: the reader, and the time map that turns a file's ticks into
// seconds, bars and beats.
//
// ReadMidiFile reads formats 0 and 1 from bytes in memory (format 2, a set of
// independent sequences, is refused). It keeps what a chord analysis needs: the
// notes (note-on to note-off, in ticks), the sustain pedal (controller 64), the
// tempo, time signature and key signature events, and the track names. Everything
// else (other controllers, program changes, pitch bend, aftertouch, sysex and escape
// events, other meta events) is read past and dropped.
//
// How events are read:
//   - running status: a data byte where a status byte is due repeats the last
//     channel status of the track. Meta and sysex events leave the running status as
//     it was (writers that follow the rule never put a data byte after them, so
//     keeping it only accepts more files);
//   - a note-on with velocity 0 is a note-off;
//   - overlapping notes of one key on one channel of one track: each note-off ends
//     the earliest note of that key still sounding (first in, first out);
//   - "all notes off" (controller 123) ends every sounding note of its channel;
//   - notes still sounding at the end of their track end there;
//   - the end-of-track meta event ends the track; bytes after it in the chunk are
//     ignored, and a track without one ends at its chunk's end;
//   - chunks of unknown type are skipped; data after the last announced track is
//     ignored.
//
// A file that cannot be read gives an error with the byte offset where reading
// failed and what was wrong: not a MIDI file, a header or chunk that runs past the
// end, an unsupported format, a time division of 0 or an unknown SMPTE frame rate,
// no tracks, a variable-length number longer than four bytes, a delta time that
// takes a track past MidiMaxTick, a status byte that cannot stand in a track, a data
// byte without a running status, a meta event of the wrong length. The reader never
// reads outside the given bytes, and what it keeps grows with the events actually
// present, so its memory is bounded by a constant times the file's size. Nothing is
// thrown (apart from std::bad_alloc).
#ifndef TONVEX_MIDIFILE_H
#define TONVEX_MIDIFILE_H

#include "TonvexExport.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

/// The largest tick a track may reach: a delta time that takes a track beyond it is
/// an error.
constexpr std::int64_t MidiMaxTick = 0x7fffffff;

/// A note from its note-on to its note-off, in ticks (EndTick >= StartTick).
struct CMidiNote {
  std::int64_t StartTick = 0;
  std::int64_t EndTick = 0;
  int NoteNr = 0;   // 0..127
  int Velocity = 0; // 1..127, of the note-on
  int Channel = 0;  // 0..15; the General MIDI drum channel 10 is 9
  int TrackIx = 0;  // index into CMidiFile::Tracks
};

/// The sustain pedal (controller 64) pressed (value 64 and above) or released.
struct CMidiPedal {
  std::int64_t Tick = 0;
  int Channel = 0;
  int TrackIx = 0;
  bool Down = false;
};

/// A tempo: microseconds per quarter note from Tick on.
struct CMidiTempo {
  std::int64_t Tick = 0;
  int MicrosPerQuarter = 500000; // 1..16777215
};

/// A time signature Numerator / 2^DenominatorPow from Tick on.
struct CMidiTimeSig {
  std::int64_t Tick = 0;
  int Numerator = 4;      // 1..255
  int DenominatorPow = 2; // 0..MidiMaxDenominatorPow: 2 is a quarter, 3 an eighth
};

/// The largest denominator power read (1/256 notes); a larger one is an error.
constexpr int MidiMaxDenominatorPow = 8;

/// A key signature: Sharps > 0 sharps, < 0 flats (-7..7), major or minor.
struct CMidiKeySig {
  std::int64_t Tick = 0;
  int Sharps = 0;
  bool Minor = false;
};

struct CMidiTrack {
  std::string Name;         // the first track-name meta event, as written
  std::int64_t EndTick = 0; // the tick of its end of track (or of its last event)
};

/// What ReadMidiFile keeps of a file. The event lists are ordered by tick (notes by
/// start tick, then track and note number); the tempo and time signature lists are
/// what the file says, not yet with the defaults that CMidiTimeMap adds.
struct TONVEX_API CMidiFile {
  int Format = 1;
  /// Ticks per quarter note (TicksPerQuarter > 0), or SMPTE time: FramesPerSecond
  /// (24, 25, 29 for 29.97 drop-frame, 30) with TicksPerFrame (TicksPerQuarter 0).
  int TicksPerQuarter = 480;
  int FramesPerSecond = 0;
  int TicksPerFrame = 0;
  std::vector<CMidiTrack> Tracks;
  std::vector<CMidiNote> Notes;
  std::vector<CMidiPedal> Pedals;
  std::vector<CMidiTempo> Tempos;
  std::vector<CMidiTimeSig> TimeSigs;
  std::vector<CMidiKeySig> KeySigs;
  /// The largest end tick of a track.
  std::int64_t EndTick() const;
};

/// Outcome of ReadMidiFile: Ok, or the byte offset where reading failed and what was
/// wrong there.
struct CMidiReadResult {
  std::size_t Offset = 0;
  std::string What; // empty when the file was read
  bool Ok() const { return What.empty(); }
  /// "byte 1234: <what>"; the empty string when Ok.
  TONVEX_API std::string Message() const;
};

/// Reads a Standard MIDI File from size bytes at data into file (which is replaced;
/// after an error it holds what was read up to the problem).
TONVEX_API CMidiReadResult ReadMidiFile(unsigned char const* data, std::size_t size, CMidiFile& file);

/// Ticks to seconds, to quarter notes and to bars and beats, from a file's tempo and
/// time signature events.
///
/// Before the first tempo event the tempo is 120 beats per minute, before the first
/// time signature the meter is 4/4. With SMPTE time a tick lasts
/// 1 / (frames per second x ticks per frame) seconds whatever the tempo, and the
/// tempo only says how long a quarter note is, for the beats.
///
/// A time signature starts a new bar where it stands (in files it stands at a bar
/// line anyway). Its beat is the note of its denominator, and in compound meters
/// (6, 9, 12, ... over 8 or shorter notes) three of them: 6/8 has two dotted-quarter
/// beats. Beat positions are counted from the start of the file, one per beat, so a
/// position 12.5 lies halfway through the thirteenth beat. A beat that a time
/// signature cuts short ends where the time signature stands: the positions of its
/// missing part all give that time, so time and beat position never run against
/// each other.
class TONVEX_API CMidiTimeMap {
public:
  /// 480 ticks per quarter, 120 beats per minute, 4/4.
  CMidiTimeMap();
  /// The time map of a file read by ReadMidiFile.
  explicit CMidiTimeMap(CMidiFile const& file);
  /// From parts: ticksPerQuarter > 0 (or SMPTE as in CMidiFile), events in any order.
  CMidiTimeMap(int ticksPerQuarter, int framesPerSecond, int ticksPerFrame, std::vector<CMidiTempo> tempos,
               std::vector<CMidiTimeSig> timeSigs);

  double TickToSeconds(std::int64_t tick) const;
  /// Quarter notes from the start (continuous).
  double SecondsToQuarters(double seconds) const;
  double QuartersToSeconds(double quarters) const;
  /// Beat position (continuous, see above) of a time, and the time of one.
  double SecondsToBeatPos(double seconds) const;
  double BeatPosToSeconds(double beatPos) const;

  /// Bar and beat of the beat that begins at the whole beat position beatIx:
  /// Bar from 1, Beat from 1 to BeatsInBar.
  struct CBarBeat {
    long long Bar = 1;
    int Beat = 1;
    int BeatsInBar = 4;
  };
  CBarBeat BarBeatOf(long long beatIx) const;

private:
  // Piecewise linear pieces: from Tick (or Quarters, Beat) on, these rates hold.
  struct CTempoPiece {
    std::int64_t Tick;
    double Seconds, Quarters;
    double SecondsPerTick, QuartersPerTick;
  };
  struct CMeterPiece {
    double Quarters;
    long long BeatIx, Bar;
    double QuartersPerBeat;
    int BeatsInBar;
  };
  std::vector<CTempoPiece> Tempo_;
  std::vector<CMeterPiece> Meter_;
};

#endif
