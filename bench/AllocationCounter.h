// Counts the calls of the global operator new, which this program replaces, so that
// a benchmark can report how many heap allocations one operation makes. The library
// is a shared object and allocates through the same replaced operator.
#ifndef TONVEX_BENCH_ALLOCATIONCOUNTER_H
#define TONVEX_BENCH_ALLOCATIONCOUNTER_H

#include <cstdint>

/// Allocations made by operator new and new[] since the program started.
std::uint64_t AllocationCount();

#endif
