// Sounding notes, the grid's phase, and the units of analysis with their evidence.
#include "midi/TimelineEvidence.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <map>
#include <tuple>
#include <utility>

namespace {

// A note starts on the beat when it lies within this fraction of a beat of it.
constexpr double OnBeatTolerance = 0.125;
// Beat positions are kept within this range, where whole beats are exact in a double
// and fit a long long (a host may hand in any times).
constexpr double FarthestBeat = 4e15;

// The pedal sustains a note for at most this many half-lives of its fading.
constexpr double SustainHalfLives = 4;

double Bounded(double beatPos) { return std::clamp(beatPos, -FarthestBeat, FarthestBeat); }

// The pedal's events per track and channel, by time.
using CPedalKey = std::pair<int, int>;
using CPedalTimeline = std::vector<std::pair<double, bool>>;

std::map<CPedalKey, CPedalTimeline> PedalTimelines(std::vector<CTimedPedal> const& pedals) {
  std::map<CPedalKey, CPedalTimeline> timelines;
  for (CTimedPedal const& pedal : pedals)
    if (std::isfinite(pedal.Time)) timelines[{pedal.TrackIx, pedal.Channel}].emplace_back(pedal.Time, pedal.Down);
  for (auto& timeline : timelines)
    std::stable_sort(timeline.second.begin(), timeline.second.end(),
                     [](auto const& a, auto const& b) { return a.first < b.first; });
  return timelines;
}

// When a note released at end stops sounding: at the pedal's next release if the
// pedal is down then, but no later than the next strike of its key or lastEnd.
double SustainedEnd(CPedalTimeline const* pedal, double end, double nextStrike, double lastEnd) {
  if (pedal == nullptr) return end;
  auto after = std::upper_bound(pedal->begin(), pedal->end(), end,
                                [](double t, std::pair<double, bool> const& event) { return t < event.first; });
  if (after == pedal->begin() || !(after - 1)->second) return end;
  double release = lastEnd;
  for (; after != pedal->end(); ++after)
    if (!after->second) {
      release = after->first;
      break;
    }
  return std::max(end, std::min({release, nextStrike, lastEnd}));
}

} // namespace

bool TakesPart(CTimedNote const& note, CChordTimelineSettings const& settings) {
  if (!settings.IncludeDrums && note.Channel == MidiDrumChannel) return false;
  return note.NoteNr >= 0 && note.NoteNr < 128 && std::isfinite(note.Start) && std::isfinite(note.End) &&
         note.End > note.Start;
}

std::vector<CSoundingNote> SoundingNotes(std::vector<CTimedNote> const& notes, std::vector<CTimedPedal> const& pedals,
                                         CMidiTimeMap const& map, CChordTimelineSettings const& settings) {
  std::vector<CTimedNote> used;
  for (CTimedNote const& note : notes)
    if (TakesPart(note, settings)) used.push_back(note);
  // By key on each track's channel, so that the next strike of a key is the next note.
  auto byKey = [](CTimedNote const& a, CTimedNote const& b) {
    return std::tie(a.TrackIx, a.Channel, a.NoteNr, a.Start) < std::tie(b.TrackIx, b.Channel, b.NoteNr, b.Start);
  };
  std::sort(used.begin(), used.end(), byKey);
  double lastEnd = 0;
  for (CTimedNote const& note : used) lastEnd = std::max(lastEnd, note.End);
  std::map<CPedalKey, CPedalTimeline> const timelines = PedalTimelines(pedals);

  std::vector<CSoundingNote> sounding;
  sounding.reserve(used.size());
  for (std::size_t i = 0; i < used.size(); ++i) {
    CTimedNote const& note = used[i];
    double nextStrike = std::numeric_limits<double>::infinity();
    if (i + 1 < used.size()) {
      CTimedNote const& next = used[i + 1];
      if (next.TrackIx == note.TrackIx && next.Channel == note.Channel && next.NoteNr == note.NoteNr)
        nextStrike = next.Start;
    }
    auto pedal = timelines.find({note.TrackIx, note.Channel});
    double const end = SustainedEnd(pedal == timelines.end() ? nullptr : &pedal->second, note.End, nextStrike, lastEnd);
    double const velocity = std::clamp(note.Velocity, 1, 127);
    double const start = Bounded(map.SecondsToBeatPos(note.Start));
    double const release = Bounded(map.SecondsToBeatPos(note.End));
    double const tailLimit = release + SustainHalfLives * settings.SustainHalfLife;
    double const sustained = std::min(Bounded(map.SecondsToBeatPos(end)), tailLimit);
    sounding.push_back(CSoundingNote{start, release, std::max(release, sustained), note.NoteNr, velocity / 127.0});
  }

  // Overlapping notes of one pitch count once, as long as any of them sounds.
  std::sort(sounding.begin(), sounding.end(), [](CSoundingNote const& a, CSoundingNote const& b) {
    return std::tie(a.NoteNr, a.Start) < std::tie(b.NoteNr, b.Start);
  });
  std::vector<CSoundingNote> merged;
  for (CSoundingNote const& note : sounding) {
    if (!merged.empty() && merged.back().NoteNr == note.NoteNr && note.Start < merged.back().End) {
      merged.back().Release = std::max(merged.back().Release, note.Release);
      merged.back().End = std::max(merged.back().End, note.End);
      merged.back().Loudness = std::max(merged.back().Loudness, note.Loudness);
    } else {
      merged.push_back(note);
    }
  }
  std::stable_sort(merged.begin(), merged.end(),
                   [](CSoundingNote const& a, CSoundingNote const& b) { return a.Start < b.Start; });
  return merged;
}

double OnsetPhase(std::vector<CSoundingNote> const& notes) {
  constexpr int bins = CChordTimelineSettings::PhaseBins;
  double count[bins] = {};
  for (CSoundingNote const& note : notes) {
    double const fraction = note.Start - std::floor(note.Start);
    int const bin = static_cast<int>(std::lround(fraction * bins)) % bins;
    count[bin] += note.Loudness * std::min(note.Release - note.Start, 1.0);
  }
  int const best = static_cast<int>(std::max_element(count, count + bins) - count);
  return double(best) / bins;
}

namespace {

bool StartsOffBeatAndShort(CSoundingNote const& note, double phase) {
  double const pos = note.Start - phase;
  double const offset = std::abs(pos - std::round(pos));
  return offset > OnBeatTolerance && note.Release - note.Start < 1.0;
}

// The note's loudness integrated over [from, to): full while held, then halving every
// halfLife beats.
double Sounded(CSoundingNote const& note, double from, double to, double halfLife) {
  double const held = std::max(0.0, std::min(to, note.Release) - from);
  double tail = 0;
  if (to > note.Release && halfLife > 0) {
    double const a = std::max(from, note.Release) - note.Release, b = to - note.Release;
    tail = halfLife / std::log(2.0) * (std::exp2(-a / halfLife) - std::exp2(-b / halfLife));
  }
  return note.Loudness * (held + tail);
}

// The lowest note sounding at pos: among the held notes, or if none is held, among
// those the pedal sustains. 128 when none sounds.
int LowestAt(std::vector<CSoundingNote const*> const& active, double pos) {
  int held = 128, sustained = 128;
  for (CSoundingNote const* note : active) {
    if (pos < note->Start || pos >= note->End) continue;
    int& lowest = pos < note->Release ? held : sustained;
    lowest = std::min(lowest, note->NoteNr);
  }
  return held < 128 ? held : sustained;
}

// Weight and bass of one unit from the notes sounding in it.
void Gather(CTimelineUnit& unit, std::vector<CSoundingNote const*> const& active, double phase,
            CChordTimelineSettings const& settings) {
  double const u0 = double(unit.FirstBeat) + phase;
  double const u1 = double(unit.EndBeat) + phase;
  std::vector<double> cuts = {u0, u1};
  for (CSoundingNote const* note : active) {
    double const from = std::max(note->Start, u0), to = std::min(note->End, u1);
    if (to <= from) continue;
    double const factor = StartsOffBeatAndShort(*note, phase) ? settings.OffBeatWeight : 1.0;
    unit.Weight[note->NoteNr % 12] += Sounded(*note, from, to, settings.SustainHalfLife) * factor;
    cuts.push_back(from);
    cuts.push_back(to);
  }
  std::sort(cuts.begin(), cuts.end());
  double sounding = 0;
  for (std::size_t i = 0; i + 1 < cuts.size(); ++i) {
    double const a = cuts[i], b = cuts[i + 1];
    if (b <= a) continue;
    int const lowest = LowestAt(active, (a + b) / 2);
    if (lowest == 128) continue;
    unit.Bass[lowest % 12] += b - a;
    sounding += b - a;
  }
  double total = 0;
  for (double w : unit.Weight) total += w;
  unit.Silent = !(sounding > 0 && total > 0);
  if (unit.Silent) return;
  for (double& w : unit.Weight) w *= sounding / total;
}

} // namespace

std::vector<CTimelineUnit> TimelineUnits(std::vector<CSoundingNote> const& notes, double phase,
                                         CChordTimelineSettings const& settings) {
  // A unit boundary at the beat of every onset and end and the beat after it.
  std::vector<long long> cuts;
  cuts.reserve(4 * notes.size());
  for (CSoundingNote const& note : notes) {
    double const s = std::floor(note.Start - phase), e = note.End - phase;
    cuts.push_back(static_cast<long long>(s));
    cuts.push_back(static_cast<long long>(s) + 1);
    cuts.push_back(static_cast<long long>(std::floor(e)));
    cuts.push_back(static_cast<long long>(std::ceil(e)));
  }
  std::sort(cuts.begin(), cuts.end());
  cuts.erase(std::unique(cuts.begin(), cuts.end()), cuts.end());

  std::vector<CTimelineUnit> units;
  std::vector<CSoundingNote const*> active;
  std::size_t next = 0;
  for (std::size_t i = 0; i + 1 < cuts.size(); ++i) {
    CTimelineUnit unit;
    unit.FirstBeat = cuts[i];
    unit.EndBeat = cuts[i + 1];
    double const u0 = double(unit.FirstBeat) + phase, u1 = double(unit.EndBeat) + phase;
    for (; next < notes.size() && notes[next].Start < u1; ++next) active.push_back(&notes[next]);
    active.erase(std::remove_if(active.begin(), active.end(), [&](CSoundingNote const* n) { return n->End <= u0; }),
                 active.end());
    Gather(unit, active, phase, settings);
    units.push_back(unit);
  }
  return units;
}
