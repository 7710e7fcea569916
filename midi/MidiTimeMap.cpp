// The time map of a MIDI file: ticks, seconds, quarter notes and beats as piecewise
// linear functions of each other.
#include "MidiFile.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr int DefaultTicksPerQuarter = 480;
constexpr int DefaultMicrosPerQuarter = 500000;

// Beat length in quarter notes and beats per bar of a time signature: the
// denominator's note, three of them in compound meters.
void BeatOf(CMidiTimeSig const& sig, double& quartersPerBeat, int& beatsInBar) {
  quartersPerBeat = 4.0 / static_cast<double>(1 << sig.DenominatorPow);
  beatsInBar = sig.Numerator;
  bool const compound = sig.Numerator > 3 && sig.Numerator % 3 == 0 && sig.DenominatorPow >= 3;
  if (compound) {
    quartersPerBeat *= 3;
    beatsInBar /= 3;
  }
}

// The last piece whose start (by key) is at or before value; the first piece if none.
template <class Piece, class Key>
Piece const& PieceAt(std::vector<Piece> const& pieces, double value, Key key) {
  auto after = std::upper_bound(pieces.begin() + 1, pieces.end(), value,
                                [&](double v, Piece const& piece) { return v < key(piece); });
  return *(after - 1);
}

} // namespace

CMidiTimeMap::CMidiTimeMap() : CMidiTimeMap(DefaultTicksPerQuarter, 0, 0, {}, {}) {}

CMidiTimeMap::CMidiTimeMap(CMidiFile const& file)
    : CMidiTimeMap(file.TicksPerQuarter, file.FramesPerSecond, file.TicksPerFrame, file.Tempos, file.TimeSigs) {}

CMidiTimeMap::CMidiTimeMap(int ticksPerQuarter, int framesPerSecond, int ticksPerFrame, std::vector<CMidiTempo> tempos,
                           std::vector<CMidiTimeSig> timeSigs) {
  auto byTick = [](auto const& a, auto const& b) { return a.Tick < b.Tick; };
  std::stable_sort(tempos.begin(), tempos.end(), byTick);
  std::stable_sort(timeSigs.begin(), timeSigs.end(), byTick);
  bool const smpte = ticksPerQuarter <= 0;
  double const ticksPerSecond = framesPerSecond == 29 ? 29.97 * ticksPerFrame : double(framesPerSecond) * ticksPerFrame;
  if (smpte && ticksPerSecond <= 0) ticksPerQuarter = DefaultTicksPerQuarter;

  // Tempo pieces; a later event at the same tick replaces an earlier one.
  if (tempos.empty() || tempos.front().Tick > 0) tempos.insert(tempos.begin(), CMidiTempo{0, DefaultMicrosPerQuarter});
  for (CMidiTempo const& tempo : tempos) {
    double const secondsPerQuarter = std::max(tempo.MicrosPerQuarter, 1) / 1e6;
    CTempoPiece piece{tempo.Tick, 0, 0, 0, 0};
    if (ticksPerQuarter > 0) {
      piece.QuartersPerTick = 1.0 / ticksPerQuarter;
      piece.SecondsPerTick = secondsPerQuarter / ticksPerQuarter;
    } else {
      piece.SecondsPerTick = 1.0 / ticksPerSecond;
      piece.QuartersPerTick = piece.SecondsPerTick / secondsPerQuarter;
    }
    if (!Tempo_.empty()) {
      CTempoPiece const& last = Tempo_.back();
      double const ticks = double(piece.Tick - last.Tick);
      piece.Seconds = last.Seconds + ticks * last.SecondsPerTick;
      piece.Quarters = last.Quarters + ticks * last.QuartersPerTick;
      if (piece.Tick == last.Tick) Tempo_.pop_back();
    }
    Tempo_.push_back(piece);
  }

  // Meter pieces, each starting a bar on a whole beat.
  if (timeSigs.empty() || timeSigs.front().Tick > 0) timeSigs.insert(timeSigs.begin(), CMidiTimeSig{0, 4, 2});
  for (CMidiTimeSig const& sig : timeSigs) {
    CMeterPiece piece{0, 0, 1, 1, 4};
    BeatOf(sig, piece.QuartersPerBeat, piece.BeatsInBar);
    double const ticks = double(sig.Tick);
    CTempoPiece const& tempo = PieceAt(Tempo_, ticks, [](CTempoPiece const& p) { return double(p.Tick); });
    piece.Quarters = tempo.Quarters + (ticks - double(tempo.Tick)) * tempo.QuartersPerTick;
    if (!Meter_.empty()) {
      CMeterPiece const& last = Meter_.back();
      double const beats = (piece.Quarters - last.Quarters) / last.QuartersPerBeat;
      long long const wholeBeats = static_cast<long long>(std::ceil(beats - 1e-9));
      piece.BeatIx = last.BeatIx + wholeBeats;
      piece.Bar = last.Bar + (wholeBeats + last.BeatsInBar - 1) / last.BeatsInBar;
      if (piece.Quarters <= last.Quarters) Meter_.pop_back();
    }
    Meter_.push_back(piece);
  }
}

double CMidiTimeMap::TickToSeconds(std::int64_t tick) const {
  CTempoPiece const& piece = PieceAt(Tempo_, double(tick), [](CTempoPiece const& p) { return double(p.Tick); });
  return piece.Seconds + double(tick - piece.Tick) * piece.SecondsPerTick;
}

double CMidiTimeMap::SecondsToQuarters(double seconds) const {
  CTempoPiece const& piece = PieceAt(Tempo_, seconds, [](CTempoPiece const& p) { return p.Seconds; });
  return piece.Quarters + (seconds - piece.Seconds) / piece.SecondsPerTick * piece.QuartersPerTick;
}

double CMidiTimeMap::QuartersToSeconds(double quarters) const {
  CTempoPiece const& piece = PieceAt(Tempo_, quarters, [](CTempoPiece const& p) { return p.Quarters; });
  return piece.Seconds + (quarters - piece.Quarters) / piece.QuartersPerTick * piece.SecondsPerTick;
}

double CMidiTimeMap::SecondsToBeatPos(double seconds) const {
  double const quarters = SecondsToQuarters(seconds);
  CMeterPiece const& piece = PieceAt(Meter_, quarters, [](CMeterPiece const& p) { return p.Quarters; });
  return double(piece.BeatIx) + (quarters - piece.Quarters) / piece.QuartersPerBeat;
}

double CMidiTimeMap::BeatPosToSeconds(double beatPos) const {
  CMeterPiece const& piece = PieceAt(Meter_, beatPos, [](CMeterPiece const& p) { return double(p.BeatIx); });
  double quarters = piece.Quarters + (beatPos - double(piece.BeatIx)) * piece.QuartersPerBeat;
  // A beat cut short by the next time signature ends where that begins.
  if (&piece != &Meter_.back()) quarters = std::min(quarters, (&piece + 1)->Quarters);
  return QuartersToSeconds(quarters);
}

CMidiTimeMap::CBarBeat CMidiTimeMap::BarBeatOf(long long beatIx) const {
  CMeterPiece const& piece = PieceAt(Meter_, double(beatIx), [](CMeterPiece const& p) { return double(p.BeatIx); });
  long long const beats = beatIx - piece.BeatIx;
  long long const inBar = ((beats % piece.BeatsInBar) + piece.BeatsInBar) % piece.BeatsInBar;
  long long const bar = piece.Bar + (beats - inBar) / piece.BeatsInBar;
  return CBarBeat{bar, static_cast<int>(inBar) + 1, piece.BeatsInBar};
}
