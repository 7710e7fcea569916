// Writes Standard MIDI Files byte by byte, for the tests and the benchmarks: a track
// is a list of events with delta times, a file is a header and its track chunks.
#ifndef TONVEX_TESTS_MIDIBYTES_H
#define TONVEX_TESTS_MIDIBYTES_H

#include <cstdint>
#include <initializer_list>
#include <string>
#include <vector>

using Bytes = std::vector<unsigned char>;

inline void AppendVarLen(Bytes& out, std::uint32_t value) {
  unsigned char groups[5];
  int count = 0;
  do {
    groups[count++] = static_cast<unsigned char>(value & 0x7f);
    value >>= 7;
  } while (value != 0);
  while (count > 1) out.push_back(static_cast<unsigned char>(groups[--count] | 0x80));
  out.push_back(groups[0]);
}

inline void AppendBigEndian(Bytes& out, std::uint32_t value, int bytes) {
  for (int shift = 8 * (bytes - 1); shift >= 0; shift -= 8) out.push_back(static_cast<unsigned char>(value >> shift));
}

class MidiTrackBytes {
public:
  /// Any event: the delta time, then the bytes as given (a status byte may be left
  /// out for running status).
  MidiTrackBytes& Event(std::uint32_t delta, std::initializer_list<int> bytes) {
    AppendVarLen(Data, delta);
    for (int b : bytes) Data.push_back(static_cast<unsigned char>(b));
    return *this;
  }
  MidiTrackBytes& On(std::uint32_t delta, int key, int velocity = 100, int channel = 0) {
    return Event(delta, {0x90 | channel, key, velocity});
  }
  MidiTrackBytes& Off(std::uint32_t delta, int key, int channel = 0) { return Event(delta, {0x80 | channel, key, 0}); }
  MidiTrackBytes& Pedal(std::uint32_t delta, bool down, int channel = 0) {
    return Event(delta, {0xb0 | channel, 64, down ? 127 : 0});
  }
  MidiTrackBytes& Meta(std::uint32_t delta, int type, Bytes const& body) {
    Event(delta, {0xff, type});
    AppendVarLen(Data, static_cast<std::uint32_t>(body.size()));
    Data.insert(Data.end(), body.begin(), body.end());
    return *this;
  }
  MidiTrackBytes& Tempo(std::uint32_t delta, std::uint32_t microsPerQuarter) {
    Bytes body;
    AppendBigEndian(body, microsPerQuarter, 3);
    return Meta(delta, 0x51, body);
  }
  MidiTrackBytes& TimeSig(std::uint32_t delta, int numerator, int denominatorPow) {
    return Meta(delta, 0x58,
                {static_cast<unsigned char>(numerator), static_cast<unsigned char>(denominatorPow), 24, 8});
  }
  MidiTrackBytes& Name(std::string const& name) { return Meta(0, 0x03, Bytes(name.begin(), name.end())); }
  MidiTrackBytes& End(std::uint32_t delta = 0) { return Meta(delta, 0x2f, {}); }
  /// Notes of one chord at once, held for length ticks (note-off as note-on with
  /// velocity 0, in running status).
  MidiTrackBytes& Chord(std::uint32_t delta, std::vector<int> const& keys, std::uint32_t length, int channel = 0) {
    Event(delta, {0x90 | channel, keys[0], 90});
    for (std::size_t i = 1; i < keys.size(); ++i) Event(0, {keys[i], 90});
    Event(length, {keys[0], 0});
    for (std::size_t i = 1; i < keys.size(); ++i) Event(0, {keys[i], 0});
    return *this;
  }

  Bytes Data;
};

/// A whole file: "MThd", format, track count, division, then an "MTrk" chunk per track.
inline Bytes MidiFileBytes(std::vector<MidiTrackBytes> const& tracks, int format = 1, std::uint32_t division = 480) {
  Bytes out = {'M', 'T', 'h', 'd', 0, 0, 0, 6};
  AppendBigEndian(out, static_cast<std::uint32_t>(format), 2);
  AppendBigEndian(out, static_cast<std::uint32_t>(tracks.size()), 2);
  AppendBigEndian(out, division, 2);
  for (MidiTrackBytes const& track : tracks) {
    out.insert(out.end(), {'M', 'T', 'r', 'k'});
    AppendBigEndian(out, static_cast<std::uint32_t>(track.Data.size()), 4);
    out.insert(out.end(), track.Data.begin(), track.Data.end());
  }
  return out;
}

#endif
