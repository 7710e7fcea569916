// Chord symbols: writing the lead-sheet symbol and the Harte label of the analysed
// voicings, and reading the symbols back.
#include "BenchSupport.h"

#include <tonvex/ChordSymbol.h>

#include <string>

namespace {

void BM_LeadSheetSymbol(benchmark::State& state) {
  RunOverItems(state, AnalysedChords(), [](CChord const& chord) { benchmark::DoNotOptimize(LeadSheetSymbol(chord)); });
}
TONVEX_BENCHMARK(BM_LeadSheetSymbol);

void BM_HarteLabel(benchmark::State& state) {
  RunOverItems(state, AnalysedChords(), [](CChord const& chord) { benchmark::DoNotOptimize(HarteLabel(chord)); });
}
TONVEX_BENCHMARK(BM_HarteLabel);

void BM_ReadChordSymbol(benchmark::State& state) {
  std::vector<std::string> symbols;
  for (CChord const& chord : AnalysedChords()) symbols.push_back(LeadSheetSymbol(chord));
  CChord chord;
  RunOverItems(state, symbols,
               [&chord](std::string const& symbol) { benchmark::DoNotOptimize(ReadChordSymbol(symbol, chord)); });
}
TONVEX_BENCHMARK(BM_ReadChordSymbol);

} // namespace
