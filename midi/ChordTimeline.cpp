// The chord timeline: units to segments, short segments joined, chords built and
// their roots found (the method is described in ChordTimeline.h).
#include "ChordTimeline.h"

#include "midi/ChordChoice.h"

#include <algorithm>
#include <cmath>
#include <functional>
#include <limits>
#include <queue>
#include <utility>

namespace {

// Metrical level of a beat: 0 the first beat of a bar, 1 the middle beat of a bar
// of an even number of beats, 2 any other.
int MetricalLevel(CMidiTimeMap::CBarBeat const& beat) {
  if (beat.Beat == 1) return 0;
  if (beat.BeatsInBar % 2 == 0 && beat.Beat == beat.BeatsInBar / 2 + 1) return 1;
  return 2;
}

std::vector<double> ChangeCosts(std::vector<CTimelineUnit> const& units, CMidiTimeMap const& map,
                                CChordTimelineSettings const& settings) {
  std::vector<double> costs;
  costs.reserve(units.size());
  for (CTimelineUnit const& unit : units) {
    int const level = MetricalLevel(map.BarBeatOf(unit.FirstBeat));
    switch (settings.Grid) {
    case ChordGrid_Beat: costs.push_back(Within(settings.ChangeCost[0], 0, MostPenalty)); break;
    case ChordGrid_Bar:
      costs.push_back(level == 0 ? Within(settings.ChangeCost[0], 0, MostPenalty)
                                 : std::numeric_limits<double>::infinity());
      break;
    case ChordGrid_Auto:
    default: costs.push_back(Within(settings.ChangeCost[level], 0, MostPenalty)); break;
    }
  }
  return costs;
}

// A run of units with one state.
struct CRun {
  std::size_t First, End; // units [First, End)
  int State;
};

std::vector<CRun> Runs(std::vector<int> const& states) {
  std::vector<CRun> runs;
  for (std::size_t u = 0; u < states.size(); ++u) {
    if (!runs.empty() && runs.back().State == states[u])
      runs.back().End = u + 1;
    else
      runs.push_back(CRun{u, u + 1, states[u]});
  }
  return runs;
}

// Evidence summed over a run's units.
void RunEvidence(std::vector<CTimelineUnit> const& units, CRun const& run, double weight[12], double bass[12]) {
  std::fill(weight, weight + 12, 0.0);
  std::fill(bass, bass + 12, 0.0);
  for (std::size_t u = run.First; u < run.End; ++u)
    for (int pc = 0; pc < 12; ++pc) {
      weight[pc] += units[u].Weight[pc];
      bass[pc] += units[u].Bass[pc];
    }
}

// Joins chord runs shorter than minDuration seconds to a neighbouring chord run,
// shortest first: to the one whose chord scores better over it. Runs of no chord
// neither join nor take in others.
void JoinShortRuns(std::vector<CRun>& runs, std::vector<CTimelineUnit> const& units, CMidiTimeMap const& map,
                   double phase, double minDuration, CChordScorer const& scorer) {
  if (!(minDuration > 0)) return;
  std::size_t const n = runs.size();
  auto seconds = [&](CRun const& run) {
    return map.BeatPosToSeconds(double(units[run.End - 1].EndBeat) + phase) -
           map.BeatPosToSeconds(double(units[run.First].FirstBeat) + phase);
  };
  // The runs as a list, linked both ways (n ends it); joined runs are dead.
  std::vector<std::size_t> prev(n), next(n);
  std::vector<bool> alive(n, true);
  using CEntry = std::pair<double, std::size_t>;
  std::priority_queue<CEntry, std::vector<CEntry>, std::greater<CEntry>> shortest;
  for (std::size_t i = 0; i < n; ++i) {
    prev[i] = i == 0 ? n : i - 1;
    next[i] = i + 1;
    if (runs[i].State != NoChordState && seconds(runs[i]) < minDuration) shortest.emplace(seconds(runs[i]), i);
  }
  auto isChord = [&](std::size_t i) { return i < n && runs[i].State != NoChordState; };
  auto unlink = [&](std::size_t i) {
    alive[i] = false;
    if (prev[i] < n) next[prev[i]] = next[i];
    if (next[i] < n) prev[next[i]] = prev[i];
  };
  double weight[12], bass[12], scores[ChordStateCount];
  while (!shortest.empty()) {
    auto const [length, i] = shortest.top();
    shortest.pop();
    if (!alive[i] || length != seconds(runs[i])) continue;
    std::size_t const p = prev[i], q = next[i];
    if (!isChord(p) && !isChord(q)) continue;
    bool toPrev = isChord(p);
    if (isChord(p) && isChord(q)) {
      RunEvidence(units, runs[i], weight, bass);
      scorer.Score(weight, bass, scores);
      toPrev = scores[runs[p].State] >= scores[runs[q].State];
    }
    std::size_t const into = toPrev ? p : q;
    runs[into].First = std::min(runs[into].First, runs[i].First);
    runs[into].End = std::max(runs[into].End, runs[i].End);
    unlink(i);
    // The runs on both sides of the joined one may now be one chord.
    std::size_t const other = toPrev ? next[into] : prev[into];
    if (other < n && runs[other].State == runs[into].State) {
      runs[into].First = std::min(runs[into].First, runs[other].First);
      runs[into].End = std::max(runs[into].End, runs[other].End);
      unlink(other);
    }
    if (seconds(runs[into]) < minDuration) shortest.emplace(seconds(runs[into]), into);
  }
  std::vector<CRun> joined;
  for (std::size_t i = 0; i < n; ++i)
    if (alive[i]) joined.push_back(runs[i]);
  runs.swap(joined);
}

// The chord of a run: its chord tones over its bass, the root found by algo.
CChord RunChord(int state, double const bass[12], TSingleChordAnalysisAlgo algo) {
  int const root = StateRoot(state);
  int const* intvls = ChordKindIntvls(StateKind(state));
  int bassPc = static_cast<int>(std::max_element(bass, bass + 12) - bass);
  bool bassIsTone = false;
  for (int const* i = intvls; *i >= 0; ++i) bassIsTone = bassIsTone || (root + *i) % 12 == bassPc;
  if (!bassIsTone) bassPc = root;
  // The bass in the octave below middle C, the other tones above it within an octave.
  int const bassNote = 48 + bassPc;
  CMySet<int> notes;
  notes.insert(bassNote);
  for (int const* i = intvls; *i >= 0; ++i) notes.insert(bassNote + (root + *i - bassPc + 12) % 12);
  CChord chord;
  chord.SetFromNoteNrSet(notes);
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
  return chord;
}

} // namespace

std::vector<CTimedNote> TimedNotesOf(CMidiFile const& file, CMidiTimeMap const& map) {
  std::vector<CTimedNote> notes;
  notes.reserve(file.Notes.size());
  for (CMidiNote const& n : file.Notes)
    notes.push_back(CTimedNote{map.TickToSeconds(n.StartTick), map.TickToSeconds(n.EndTick), n.NoteNr, n.Velocity,
                               n.Channel, n.TrackIx});
  return notes;
}

std::vector<CTimedPedal> TimedPedalsOf(CMidiFile const& file, CMidiTimeMap const& map) {
  std::vector<CTimedPedal> pedals;
  pedals.reserve(file.Pedals.size());
  for (CMidiPedal const& p : file.Pedals)
    pedals.push_back(CTimedPedal{map.TickToSeconds(p.Tick), p.Channel, p.TrackIx, p.Down});
  return pedals;
}

std::vector<CChordSegment> AnalyseChordTimeline(std::vector<CTimedNote> const& notes,
                                                std::vector<CTimedPedal> const& pedals, CMidiTimeMap const& map,
                                                CChordTimelineSettings const& settings) {
  std::vector<CChordSegment> segments;
  std::vector<CSoundingNote> const sounding = SoundingNotes(notes, pedals, map, settings);
  if (sounding.empty()) return segments;
  double lastEnd = 0;
  for (CSoundingNote const& note : sounding) lastEnd = std::max(lastEnd, note.End);
  lastEnd = map.BeatPosToSeconds(lastEnd);
  double const phase = settings.AlignGridToOnsets ? OnsetPhase(sounding) : 0.0;
  std::vector<CTimelineUnit> const units = TimelineUnits(sounding, phase, map, settings);
  CChordScorer const scorer(settings);
  std::vector<CRun> runs = Runs(ChooseChords(units, ChangeCosts(units, map, settings), scorer));
  JoinShortRuns(runs, units, map, phase, settings.MinDuration, scorer);

  auto add = [&](double start, double end, long long beatIx, CRun const* run) {
    start = std::max(start, 0.0);
    end = std::min(end, lastEnd);
    if (!(end > start)) return;
    bool const noChord = run == nullptr || run->State == NoChordState;
    if (noChord && !segments.empty() && segments.back().NoChord) {
      segments.back().End = end;
      return;
    }
    CChordSegment segment;
    segment.Start = segments.empty() ? 0.0 : start;
    segment.End = end;
    CMidiTimeMap::CBarBeat const barBeat = map.BarBeatOf(beatIx);
    segment.Bar = barBeat.Bar;
    segment.Beat = barBeat.Beat;
    segment.NoChord = noChord;
    if (!noChord) {
      double weight[12], bass[12];
      RunEvidence(units, *run, weight, bass);
      segment.Chord = RunChord(run->State, bass, settings.Algo);
    }
    segments.push_back(segment);
  };
  double const firstStart = map.BeatPosToSeconds(double(units.front().FirstBeat) + phase);
  if (firstStart > 0) add(0, firstStart, static_cast<long long>(std::floor(map.SecondsToBeatPos(0) - phase)), nullptr);
  for (CRun const& run : runs)
    add(map.BeatPosToSeconds(double(units[run.First].FirstBeat) + phase),
        map.BeatPosToSeconds(double(units[run.End - 1].EndBeat) + phase), units[run.First].FirstBeat, &run);
  return segments;
}
