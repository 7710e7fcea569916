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

bool TakesPart(CTimedNote const& note, CChordTimelineSettings const& settings) {
  if (!settings.IncludeDrums && note.Channel == MidiDrumChannel) return false;
  return note.NoteNr >= 0 && note.NoteNr < 128 && std::isfinite(note.Start) && std::isfinite(note.End) &&
         note.End > note.Start;
}

} // namespace

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
    double const tailLimit = release + SustainHalfLives * Within(settings.SustainHalfLife, 0, MostPenalty);
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

bool StartsOffBeatAndShort(CSoundingNote const& note) {
  double const offset = std::abs(note.Start - std::round(note.Start));
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

// Where a note starts or stops being held or sustained within a unit.
struct CBassEvent {
  double Pos;
  int NoteNr;
  int Held, Sustained; // changes of the counts
};

// How long each pitch class is the lowest note in [u0, u1): the lowest of the held
// notes, or while none is held, the lowest of those the pedal sustains. Returns the
// time anything sounds.
double GatherBass(std::vector<CSoundingNote const*> const& active, double u0, double u1, double bass[12]) {
  std::vector<CBassEvent> events;
  for (CSoundingNote const* note : active) {
    double const from = std::max(note->Start, u0), to = std::min(note->End, u1);
    if (to <= from) continue;
    double const release = std::clamp(note->Release, from, to);
    events.push_back({from, note->NoteNr, 1, 0});
    events.push_back({release, note->NoteNr, -1, 1});
    events.push_back({to, note->NoteNr, 0, -1});
  }
  std::sort(events.begin(), events.end(), [](CBassEvent const& a, CBassEvent const& b) { return a.Pos < b.Pos; });
  int held[128] = {}, sustained[128] = {};
  double sounding = 0;
  for (std::size_t i = 0; i < events.size();) {
    double const pos = events[i].Pos;
    for (; i < events.size() && events[i].Pos == pos; ++i) {
      held[events[i].NoteNr] += events[i].Held;
      sustained[events[i].NoteNr] += events[i].Sustained;
    }
    if (i == events.size()) break;
    int lowest = 0;
    while (lowest < 128 && held[lowest] == 0) ++lowest;
    if (lowest == 128)
      for (lowest = 0; lowest < 128 && sustained[lowest] == 0;) ++lowest;
    if (lowest == 128) continue;
    double const length = events[i].Pos - pos;
    bass[lowest % 12] += length;
    sounding += length;
  }
  return sounding;
}

// Weight and bass of one unit from the notes sounding in it.
void Gather(CTimelineUnit& unit, std::vector<CSoundingNote const*> const& active,
            CChordTimelineSettings const& settings) {
  double const u0 = double(unit.FirstBeat);
  double const u1 = double(unit.EndBeat);
  for (CSoundingNote const* note : active) {
    double const from = std::max(note->Start, u0), to = std::min(note->End, u1);
    if (to <= from) continue;
    double const factor = StartsOffBeatAndShort(*note) ? Within(settings.OffBeatWeight, 0, 1) : 1.0;
    unit.Weight[note->NoteNr % 12] +=
        Sounded(*note, from, to, Within(settings.SustainHalfLife, 0, MostPenalty)) * factor;
  }
  double const sounding = GatherBass(active, u0, u1, unit.Bass);
  double total = 0;
  for (double w : unit.Weight) total += w;
  unit.Silent = !(sounding > 0 && total > 0);
  if (unit.Silent) return;
  for (double& w : unit.Weight) w *= sounding / total;
}

} // namespace

std::vector<CTimelineUnit> TimelineUnits(std::vector<CSoundingNote> const& notes, double phase, CMidiTimeMap const& map,
                                         CChordTimelineSettings const& settings) {
  // On the shifted grid, with onsets just before a beat and ends just after one
  // moved onto it, so that a note played a little early or held a little long does
  // not leave a sliver of itself in the beat next to its own.
  std::vector<CSoundingNote> shifted = notes;
  for (CSoundingNote& note : shifted) {
    note.Start -= phase;
    note.Release -= phase;
    note.End -= phase;
    if (note.Start - std::floor(note.Start) > 1 - OnBeatTolerance) note.Start = std::ceil(note.Start);
    if (note.End - std::floor(note.End) < OnBeatTolerance && std::floor(note.End) > note.Start)
      note.End = std::floor(note.End);
    note.Release = std::clamp(note.Release, note.Start, std::max(note.Start, note.End));
    note.End = std::max(note.End, note.Start);
  }

  // A unit boundary at the beat of every onset and end and the beat after it.
  std::vector<long long> cuts;
  cuts.reserve(5 * shifted.size());
  for (CSoundingNote const& note : shifted) {
    auto const s = static_cast<long long>(std::floor(note.Start));
    cuts.push_back(s);
    cuts.push_back(s + 1);
    cuts.push_back(static_cast<long long>(std::floor(note.End)));
    cuts.push_back(static_cast<long long>(std::ceil(note.End)));
  }
  std::sort(cuts.begin(), cuts.end());
  cuts.erase(std::unique(cuts.begin(), cuts.end()), cuts.end());
  // A stretch without onsets or ends that spans a bar line is cut there too, so that
  // the chord may change on the bar line.
  for (std::size_t i = 0, count = cuts.size(); i + 1 < count; ++i) {
    CMidiTimeMap::CBarBeat const at = map.BarBeatOf(cuts[i]);
    long long const barLine = cuts[i] + at.BeatsInBar - at.Beat + 1;
    if (barLine < cuts[i + 1] && map.BarBeatOf(barLine).Beat == 1) cuts.push_back(barLine);
  }
  std::sort(cuts.begin(), cuts.end());

  std::vector<CTimelineUnit> units;
  std::vector<CSoundingNote const*> active;
  std::size_t next = 0;
  for (std::size_t i = 0; i + 1 < cuts.size(); ++i) {
    CTimelineUnit unit;
    unit.FirstBeat = cuts[i];
    unit.EndBeat = cuts[i + 1];
    double const u0 = double(unit.FirstBeat), u1 = double(unit.EndBeat);
    for (; next < shifted.size() && shifted[next].Start < u1; ++next) active.push_back(&shifted[next]);
    active.erase(std::remove_if(active.begin(), active.end(), [&](CSoundingNote const* n) { return n->End <= u0; }),
                 active.end());
    Gather(unit, active, settings);
    units.push_back(unit);
  }
  return units;
}
