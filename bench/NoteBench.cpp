// Notes and scales: naming, parsing, building a scale's spelling table.
#include "BenchSupport.h"
#include <tonvex/NoteNames.h>
#include <tonvex/Scale.h>

#include <string>
#include <utility>

namespace {

// The spelled notes of the analysed voicings, one after another.
std::vector<CNote> SpelledNotes() {
  std::vector<CNote> notes;
  for (CChord const& chord : AnalysedChords())
    for (CNote const& note : chord.Notes()) notes.push_back(note);
  return notes;
}

void BM_NoteName(benchmark::State& state) {
  std::vector<CNote> notes = SpelledNotes();
  RunOverItems(state, notes, [](CNote const& note) {
    benchmark::DoNotOptimize(note.KeyName(DefaultChordnamePref));
    benchmark::DoNotOptimize(note.OctName(DefaultChordnamePref));
  });
}
TONVEX_BENCHMARK(BM_NoteName);

void BM_SetFromString(benchmark::State& state) {
  std::vector<std::string> texts;
  for (CNote const& note : SpelledNotes())
    texts.push_back(note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref));
  CNote note;
  RunOverItems(state, texts, [&note](std::string const& text) {
    benchmark::DoNotOptimize(note.SetFromString(text, DefaultChordnamePref));
    benchmark::DoNotOptimize(note);
  });
}
TONVEX_BENCHMARK(BM_SetFromString);

// A scale on every analysed root, the eight scale types in turn.
void BM_ScaleConstruct(benchmark::State& state) {
  std::vector<std::pair<CNote, CScale::TType>> scales;
  for (CChord const& chord : AnalysedChords())
    scales.emplace_back(chord.RootNote(), static_cast<CScale::TType>(scales.size() % 8));
  RunOverItems(state, scales, [](std::pair<CNote, CScale::TType> const& s) {
    CScale scale(s.first, s.second);
    benchmark::DoNotOptimize(scale);
  });
}
TONVEX_BENCHMARK(BM_ScaleConstruct);

} // namespace
