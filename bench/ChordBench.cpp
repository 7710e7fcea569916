// Chords: building from note numbers, root finding, naming and the host's whole path.
#include "BenchSupport.h"
#include <tonvex/Neuron.h>

#include <string>

namespace {

void BM_ChordFromNoteNrsToBasicChord(benchmark::State& state) {
  CChord chord(24);
  RunOverItems(state, Voicings(), [&chord](CMySet<int> const& voicing) {
    chord.SetFromNoteNrSet(voicing);
    benchmark::DoNotOptimize(chord.BasicChord());
  });
}
TONVEX_BENCHMARK(BM_ChordFromNoteNrsToBasicChord);

void BM_Name(benchmark::State& state) {
  std::vector<CChord> chords = AnalysedChords();
  RunOverItems(state, chords, [](CChord const& chord) { benchmark::DoNotOptimize(chord.Name(DefaultChordnamePref)); });
}
TONVEX_BENCHMARK(BM_Name);

// Root finding alone, repeated on chords set from the voicings. Either algorithm
// does the same work on a chord whose root it has already found (the net starts
// from the lowest note; the rules score all twelve pitch classes again).
void RootFinding(benchmark::State& state, TSingleChordAnalysisAlgo algo) {
  std::vector<CChord> chords;
  for (CMySet<int> const& voicing : Voicings()) {
    chords.emplace_back(24);
    chords.back().SetFromNoteNrSet(voicing);
  }
  RunOverItems(state, chords, [algo](CChord& chord) { chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo); });
}
void BM_RootByRules(benchmark::State& state) { RootFinding(state, SCA_RULE_WEIGHTS); }
void BM_RootByNet(benchmark::State& state) { RootFinding(state, SCA_NEURONAL_NET); }
TONVEX_BENCHMARK(BM_RootByRules);
TONVEX_BENCHMARK(BM_RootByNet);

// Root finding by net after another net has changed the Neuron parameters: the
// winner comes from the exact forward pass instead of the table made at load. Only
// the output threshold differs here, which the net's output type never reads, so the
// answers stay the built-in net's.
void BM_RootByNetExactPass(benchmark::State& state) {
  float const builtIn = Neuron::output_threshold;
  Neuron::output_threshold = 0.5f;
  RootFinding(state, SCA_NEURONAL_NET);
  Neuron::output_threshold = builtIn;
}
TONVEX_BENCHMARK(BM_RootByNetExactPass);

// What a host does for every incoming note: one chord object, set from the sounding
// note numbers, its root found by the net, its name made.
void BM_HostPath(benchmark::State& state) {
  CChord chord(24);
  RunOverItems(state, Voicings(), [&chord](CMySet<int> const& voicing) {
    chord.SetFromNoteNrSet(voicing);
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
    benchmark::DoNotOptimize(chord.Name(DefaultChordnamePref));
  });
}
TONVEX_BENCHMARK(BM_HostPath);

// The same for a host that builds its note set and a chord object afresh for every
// chord, from the note numbers it has in an array.
void BM_HostPathFreshChord(benchmark::State& state) {
  std::vector<std::vector<int>> arrays;
  for (CMySet<int> const& voicing : Voicings()) arrays.emplace_back(voicing.rbegin(), voicing.rend());
  RunOverItems(state, arrays, [](std::vector<int> const& noteNrs) {
    CMySet<int> sounding;
    for (int n : noteNrs) sounding.insert(n);
    CChord chord(24);
    chord.SetFromNoteNrSet(sounding);
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
    benchmark::DoNotOptimize(chord.Name(DefaultChordnamePref));
  });
}
TONVEX_BENCHMARK(BM_HostPathFreshChord);

} // namespace
