// Standard MIDI File reader: chunks, events, running status and note pairing.
#include "MidiFile.h"

#include <algorithm>
#include <deque>
#include <map>
#include <tuple>

namespace {

constexpr std::size_t ChunkHeaderSize = 8;
constexpr int MaxVarLenBytes = 4;
constexpr int SustainController = 64;
constexpr int AllNotesOffController = 123;
constexpr int MetaTrackName = 0x03;
constexpr int MetaEndOfTrack = 0x2f;
constexpr int MetaTempo = 0x51;
constexpr int MetaTimeSig = 0x58;
constexpr int MetaKeySig = 0x59;

std::string Count(std::size_t n, const char* unit) { return std::to_string(n) + " " + unit + (n == 1 ? "" : "s"); }

std::string Hex(unsigned value) {
  const char* const digits = "0123456789abcdef";
  std::string text = "0x";
  text += digits[(value >> 4) & 15];
  text += digits[value & 15];
  return text;
}

// A failure while reading: where and what.
struct CReadFailure {
  std::size_t Offset;
  std::string What;
};

// Bytes with a read position; every read checks the bytes left first.
class CByteReader {
public:
  CByteReader(unsigned char const* data, std::size_t end, std::size_t pos) : Data_(data), End_(end), Pos_(pos) {}
  std::size_t Pos() const { return Pos_; }
  std::size_t Left() const { return End_ - Pos_; }
  bool AtEnd() const { return Pos_ >= End_; }
  unsigned Peek() const { return Data_[Pos_]; }

  unsigned Byte(const char* what) {
    if (AtEnd()) throw CReadFailure{Pos_, std::string("file ends in ") + what};
    return Data_[Pos_++];
  }
  std::uint32_t BigEndian(int bytes, const char* what) {
    if (Left() < static_cast<std::size_t>(bytes)) throw CReadFailure{Pos_, std::string("file ends in ") + what};
    std::uint32_t value = 0;
    for (int i = 0; i < bytes; ++i) value = (value << 8) | Data_[Pos_++];
    return value;
  }
  std::uint32_t VarLen(const char* what) {
    std::size_t const start = Pos_;
    std::uint32_t value = 0;
    for (int i = 0; i < MaxVarLenBytes; ++i) {
      unsigned const b = Byte(what);
      value = (value << 7) | (b & 0x7fu);
      if ((b & 0x80u) == 0) return value;
    }
    throw CReadFailure{start, std::string(what) + " is longer than four bytes"};
  }
  // Skips length bytes of the event that began at eventStart.
  void Skip(std::uint32_t length, std::size_t eventStart, const char* what) {
    if (length > Left())
      throw CReadFailure{eventStart, std::string(what) + " of " + Count(length, "byte") +
                                         " runs past the end of its track (" + Count(Left(), "byte") + " left)"};
    Pos_ += length;
  }
  unsigned char const* Here() const { return Data_ + Pos_; }

private:
  unsigned char const* Data_;
  std::size_t End_;
  std::size_t Pos_;
};

// Notes of one track that have started and not yet ended, per channel and key.
using COpenNotes = std::map<std::pair<int, int>, std::deque<CMidiNote>>;

class CTrackReader {
public:
  CTrackReader(CMidiFile& file, int trackIx) : File_(file), TrackIx_(trackIx) {}

  void Read(CByteReader& in) {
    unsigned status = 0;
    while (!in.AtEnd()) {
      std::size_t const eventStart = in.Pos();
      std::uint32_t const delta = in.VarLen("a delta time");
      if (MidiMaxTick - Tick_ < static_cast<std::int64_t>(delta))
        throw CReadFailure{eventStart, "delta time " + std::to_string(delta) + " takes the track past tick " +
                                           std::to_string(MidiMaxTick)};
      Tick_ += delta;
      File_.Tracks[static_cast<std::size_t>(TrackIx_)].EndTick = Tick_;
      std::size_t const statusPos = in.Pos();
      unsigned b = in.Byte("an event");
      if (b < 0x80) {
        if (status == 0) throw CReadFailure{statusPos, "data byte " + Hex(b) + " without a status byte before it"};
        ChannelEvent(status, b, in);
      } else if (b < 0xf0) {
        status = b;
        ChannelEvent(status, in.Byte("a channel event"), in);
      } else if (b == 0xff) {
        if (!MetaEvent(in, statusPos)) break;
      } else if (b == 0xf0 || b == 0xf7) {
        in.Skip(in.VarLen("a sysex length"), statusPos, b == 0xf0 ? "sysex event" : "escape event");
      } else {
        throw CReadFailure{statusPos, "status byte " + Hex(b) + " cannot stand in a track"};
      }
    }
    for (auto& open : Open_)
      for (CMidiNote& note : open.second) EndNote(note, Tick_);
  }

private:
  unsigned DataByte(CByteReader& in) {
    std::size_t const pos = in.Pos();
    unsigned const b = in.Byte("a channel event");
    if (b >= 0x80) throw CReadFailure{pos, "status byte " + Hex(b) + " where a data byte is due"};
    return b;
  }

  void ChannelEvent(unsigned status, unsigned first, CByteReader& in) {
    unsigned const kind = status >> 4;
    int const channel = static_cast<int>(status & 15u);
    if (first >= 0x80) throw CReadFailure{in.Pos() - 1, "status byte " + Hex(first) + " where a data byte is due"};
    if (kind == 0xc || kind == 0xd) return; // program change, channel pressure: one data byte
    unsigned const second = DataByte(in);
    int const key = static_cast<int>(first);
    if (kind == 0x9 && second > 0) {
      CMidiNote note;
      note.StartTick = Tick_;
      note.NoteNr = key;
      note.Velocity = static_cast<int>(second);
      note.Channel = channel;
      note.TrackIx = TrackIx_;
      Open_[{channel, key}].push_back(note);
    } else if (kind == 0x8 || kind == 0x9) {
      auto found = Open_.find({channel, key});
      if (found == Open_.end() || found->second.empty()) return; // a note-off without its note-on
      EndNote(found->second.front(), Tick_);
      found->second.pop_front();
    } else if (kind == 0xb && first == SustainController) {
      File_.Pedals.push_back(CMidiPedal{Tick_, channel, TrackIx_, second >= 64});
    } else if (kind == 0xb && first == AllNotesOffController) {
      for (auto& open : Open_) {
        if (open.first.first != channel) continue;
        for (CMidiNote& note : open.second) EndNote(note, Tick_);
        open.second.clear();
      }
    }
  }

  // Returns false at the end of the track.
  bool MetaEvent(CByteReader& in, std::size_t eventStart) {
    unsigned const type = in.Byte("a meta event");
    std::uint32_t const length = in.VarLen("a meta event length");
    unsigned char const* body = in.Here();
    in.Skip(length, eventStart, "meta event");
    auto expect = [&](std::uint32_t wanted, const char* what) {
      if (length != wanted)
        throw CReadFailure{eventStart, std::string(what) + " meta event of length " + std::to_string(length) + " (" +
                                           std::to_string(wanted) + " expected)"};
    };
    switch (type) {
    case MetaTrackName: {
      std::string& name = File_.Tracks[static_cast<std::size_t>(TrackIx_)].Name;
      if (name.empty()) name.assign(reinterpret_cast<const char*>(body), length);
      break;
    }
    case MetaEndOfTrack: return false;
    case MetaTempo: {
      expect(3, "tempo");
      int const micros = (body[0] << 16) | (body[1] << 8) | body[2];
      if (micros == 0) throw CReadFailure{eventStart, "tempo of 0 microseconds per quarter note"};
      File_.Tempos.push_back(CMidiTempo{Tick_, micros});
      break;
    }
    case MetaTimeSig:
      expect(4, "time signature");
      if (body[0] == 0) throw CReadFailure{eventStart, "time signature with numerator 0"};
      if (body[1] > MidiMaxDenominatorPow)
        throw CReadFailure{eventStart, "time signature with denominator 2^" + std::to_string(body[1])};
      File_.TimeSigs.push_back(CMidiTimeSig{Tick_, body[0], body[1]});
      break;
    case MetaKeySig: {
      expect(2, "key signature");
      int const sharps = static_cast<signed char>(body[0]);
      if (sharps < -7 || sharps > 7 || body[1] > 1)
        throw CReadFailure{eventStart, "key signature " + std::to_string(sharps) + " " + std::to_string(body[1])};
      File_.KeySigs.push_back(CMidiKeySig{Tick_, sharps, body[1] == 1});
      break;
    }
    default: break;
    }
    return true;
  }

  void EndNote(CMidiNote& note, std::int64_t tick) {
    note.EndTick = tick;
    File_.Notes.push_back(note);
  }

  CMidiFile& File_;
  int TrackIx_;
  std::int64_t Tick_ = 0;
  COpenNotes Open_;
};

void ReadHeader(CByteReader& in, CMidiFile& file, unsigned& trackCount) {
  if (in.Left() < 4 || std::string(reinterpret_cast<const char*>(in.Here()), 4) != "MThd")
    throw CReadFailure{0, "not a MIDI file (it does not begin with \"MThd\")"};
  in.Skip(4, 0, "header");
  std::uint32_t const length = in.BigEndian(4, "the header");
  if (length < 6) throw CReadFailure{4, "header length " + std::to_string(length) + " (at least 6 expected)"};
  if (length > in.Left())
    throw CReadFailure{4, "header length " + std::to_string(length) + " runs past the end of the file"};
  std::size_t const bodyEnd = in.Pos() + length;
  file.Format = static_cast<int>(in.BigEndian(2, "the header"));
  trackCount = in.BigEndian(2, "the header");
  std::uint32_t const division = in.BigEndian(2, "the header");
  if (file.Format == 2) throw CReadFailure{8, "format 2 (independent sequences) is not supported"};
  if (file.Format > 2) throw CReadFailure{8, "unknown format " + std::to_string(file.Format)};
  if (trackCount == 0) throw CReadFailure{10, "the file has no tracks"};
  if ((division & 0x8000u) == 0) {
    if (division == 0) throw CReadFailure{12, "time division of 0 ticks per quarter note"};
    file.TicksPerQuarter = static_cast<int>(division);
  } else {
    int const fps = -static_cast<signed char>(division >> 8);
    file.TicksPerQuarter = 0;
    file.FramesPerSecond = fps;
    file.TicksPerFrame = static_cast<int>(division & 0xffu);
    if (fps != 24 && fps != 25 && fps != 29 && fps != 30)
      throw CReadFailure{12, "SMPTE time division with " + std::to_string(fps) + " frames per second"};
    if (file.TicksPerFrame == 0) throw CReadFailure{13, "SMPTE time division with 0 ticks per frame"};
  }
  in.Skip(static_cast<std::uint32_t>(bodyEnd - in.Pos()), 4, "header");
}

void ReadFile(unsigned char const* data, std::size_t size, CMidiFile& file) {
  CByteReader in(data, size, 0);
  unsigned trackCount = 0;
  ReadHeader(in, file, trackCount);
  while (file.Tracks.size() < trackCount) {
    std::size_t const chunkStart = in.Pos();
    if (in.AtEnd())
      throw CReadFailure{chunkStart, "file ends after " + std::to_string(file.Tracks.size()) + " of " +
                                         std::to_string(trackCount) + " tracks"};
    if (in.Left() < ChunkHeaderSize) throw CReadFailure{chunkStart, "file ends in a chunk header"};
    bool const isTrack = std::string(reinterpret_cast<const char*>(in.Here()), 4) == "MTrk";
    in.Skip(4, chunkStart, "chunk");
    std::uint32_t const length = in.BigEndian(4, "a chunk header");
    if (length > in.Left())
      throw CReadFailure{chunkStart, std::string(isTrack ? "track" : "chunk") + " of " + Count(length, "byte") +
                                         " runs past the end of the file (" + Count(in.Left(), "byte") + " left)"};
    if (isTrack) {
      file.Tracks.emplace_back();
      CByteReader track(data, in.Pos() + length, in.Pos());
      CTrackReader(file, static_cast<int>(file.Tracks.size() - 1)).Read(track);
    }
    in.Skip(length, chunkStart, "chunk");
  }
}

} // namespace

std::int64_t CMidiFile::EndTick() const {
  std::int64_t end = 0;
  for (CMidiTrack const& track : Tracks) end = std::max(end, track.EndTick);
  return end;
}

std::string CMidiReadResult::Message() const {
  if (Ok()) return std::string();
  return "byte " + std::to_string(Offset) + ": " + What;
}

CMidiReadResult ReadMidiFile(unsigned char const* data, std::size_t size, CMidiFile& file) {
  file = CMidiFile();
  CMidiReadResult result;
  try {
    ReadFile(data, size, file);
  } catch (CReadFailure const& failure) {
    result.Offset = failure.Offset;
    result.What = failure.What;
  }
  auto byStart = [](CMidiNote const& a, CMidiNote const& b) {
    return std::tie(a.StartTick, a.TrackIx, a.NoteNr, a.Channel) <
           std::tie(b.StartTick, b.TrackIx, b.NoteNr, b.Channel);
  };
  std::stable_sort(file.Notes.begin(), file.Notes.end(), byStart);
  auto byTick = [](auto const& a, auto const& b) { return a.Tick < b.Tick; };
  std::stable_sort(file.Pedals.begin(), file.Pedals.end(), byTick);
  std::stable_sort(file.Tempos.begin(), file.Tempos.end(), byTick);
  std::stable_sort(file.TimeSigs.begin(), file.TimeSigs.end(), byTick);
  std::stable_sort(file.KeySigs.begin(), file.KeySigs.end(), byTick);
  return result;
}
