// The fixed set of chord voicings that every benchmark works on, and the tests that
// run the benchmarks' workload.
#ifndef TONVEX_TESTS_VOICINGS_H
#define TONVEX_TESTS_VOICINGS_H

#include <tonvex/MySet.h>

#include <cstdint>
#include <vector>

/// Deterministic generator (splitmix64), so that every run and every machine sees the
/// same voicings; bench/batch_throughput.py implements the same steps.
class CBenchRandom {
public:
  explicit CBenchRandom(std::uint64_t seed) : State_(seed) {}
  std::uint64_t Next();
  /// A value in 0..n-1 (n > 0).
  int Below(int n) { return static_cast<int>(Next() % static_cast<std::uint64_t>(n)); }

private:
  std::uint64_t State_;
};

/// The seed of every benchmark run.
constexpr std::uint64_t VoicingSeed = 20240611;
/// How many voicings the benchmarks cycle through.
constexpr int VoicingCount = 10000;

/// One voicing: 2 to 7 distinct note numbers in 36..95. Three in four are a chord
/// type (triads, sixths, sevenths, ninths, suspensions) on a random root, voiced over
/// three octaves with doubled pitch classes; the others are random clusters.
CMySet<int> NextVoicing(CBenchRandom& random);

/// The first `count` voicings from VoicingSeed.
std::vector<CMySet<int>> MakeVoicings(int count = VoicingCount);

#endif
