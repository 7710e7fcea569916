// Counts the calls of the global operator new, which AllocationCounter.cpp replaces
// in the program it is linked into (the allocation tests, the benchmarks), so that
// heap allocations of an operation can be counted. The library is a shared object
// and allocates through the same replaced operator.
#ifndef TONVEX_TESTS_ALLOCATIONCOUNTER_H
#define TONVEX_TESTS_ALLOCATIONCOUNTER_H

#include <cstdint>

/// Allocations made by operator new and new[] since the program started.
std::uint64_t AllocationCount();

/// Allocations made while f runs.
template <class F>
std::uint64_t AllocationsOf(F f) {
  std::uint64_t const before = AllocationCount();
  f();
  return AllocationCount() - before;
}

#endif
