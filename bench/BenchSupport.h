// What the benchmarks share: the loop over a set of items with its counters, and the
// voicings analysed once.
#ifndef TONVEX_BENCH_BENCHSUPPORT_H
#define TONVEX_BENCH_BENCHSUPPORT_H

#include "support/AllocationCounter.h"
#include <tonvex/Chord.h>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <vector>

/// Runs op on every item once per benchmark iteration, so that no single chord is
/// measured over and over (the branch predictor would learn it). Reports
/// items_per_second, time_per_item (seconds) and allocs_per_item (heap allocations per item).
template <class Items, class Op>
void RunOverItems(benchmark::State& state, Items& items, Op op) {
  std::uint64_t allocations = 0;
  for (auto _ : state) {
    std::uint64_t const before = AllocationCount();
    for (auto& item : items) op(item);
    allocations += AllocationCount() - before;
  }
  auto const perIteration = static_cast<double>(items.size());
  auto const total = static_cast<double>(state.iterations()) * perIteration;
  state.SetItemsProcessed(static_cast<std::int64_t>(total));
  state.counters["time_per_item"] =
      benchmark::Counter(perIteration, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
  state.counters["allocs_per_item"] = static_cast<double>(allocations) / total;
}

/// The smallest of the repetitions' values: the run least disturbed by other load.
inline double MinOf(std::vector<double> const& values) {
  return values.empty() ? 0.0 : *std::min_element(values.begin(), values.end());
}
/// Registers a benchmark with the statistic "min" besides the default ones.
#define TONVEX_BENCHMARK(fn) BENCHMARK(fn)->ComputeStatistics("min", MinOf)

/// The voicings as note number sets (tests/support/Voicings.h).
std::vector<CMySet<int>> const& Voicings();
/// Each voicing as a chord whose root was found by the built-in net and whose notes
/// are spelled after it: the state in which a host names a chord.
std::vector<CChord> const& AnalysedChords();

#endif
