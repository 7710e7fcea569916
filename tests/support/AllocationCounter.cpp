#include "support/AllocationCounter.h"

#include <cstdlib>
#include <new>

namespace {
// The programs count on one thread; a plain counter does not disturb a timing.
std::uint64_t Allocations = 0;

void* Allocate(std::size_t size) {
  ++Allocations;
  if (void* p = std::malloc(size == 0 ? 1 : size)) return p;
  throw std::bad_alloc();
}
} // namespace

std::uint64_t AllocationCount() { return Allocations; }

void* operator new(std::size_t size) { return Allocate(size); }
void* operator new[](std::size_t size) { return Allocate(size); }
void* operator new(std::size_t size, std::nothrow_t const&) noexcept {
  ++Allocations;
  return std::malloc(size == 0 ? 1 : size);
}
void* operator new[](std::size_t size, std::nothrow_t const&) noexcept {
  ++Allocations;
  return std::malloc(size == 0 ? 1 : size);
}
void operator delete(void* p) noexcept { std::free(p); }
void operator delete[](void* p) noexcept { std::free(p); }
void operator delete(void* p, std::size_t) noexcept { std::free(p); }
void operator delete[](void* p, std::size_t) noexcept { std::free(p); }
