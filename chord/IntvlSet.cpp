// Interval sets: insertion rule, list operations, queries, inversion, comparison.
#include "IntvlSet.h"

#include "chord/IntvlFold.h"

#include <algorithm>
#include <cstdint>
#include <ostream>
#include <vector>

namespace {

// Lists of the filling operations and of HasIntvls end at a value that, read as an
// unsigned 32-bit number, exceeds this (any negative value or any value above it).
constexpr std::uint32_t MaxListedIntvl = 127;
// The filling operations also stop once the set holds more intervals than this.
constexpr std::size_t MaxFilledCount = 127;

bool EndsFillList(int value) { return static_cast<std::uint32_t>(value) > MaxListedIntvl; }

// The part of a set's members, in order, that a value list names: bit p marks the
// member at position p. Sets of up to 64 members are marked in one word; larger
// ones fall back to a vector.
class CMemberMarks {
public:
  explicit CMemberMarks(std::size_t memberCount) {
    if (memberCount > 64) Large_.resize(memberCount, false);
  }
  // Marks position p; returns whether it was unmarked.
  bool Mark(std::size_t p) {
    if (Large_.empty()) {
      std::uint64_t bit = std::uint64_t{1} << p;
      bool fresh = (Small_ & bit) == 0;
      Small_ |= bit;
      return fresh;
    }
    bool fresh = !Large_[p];
    Large_[p] = true;
    return fresh;
  }

private:
  std::uint64_t Small_ = 0;
  std::vector<bool> Large_;
};

} // namespace

void CIntvlSet::SetIntvlsFromList(int const* values, std::size_t count) {
  Intvls_.clear();
  for (std::size_t k = 0; k < count && !EndsFillList(values[k]) && Intvls_.size() <= MaxFilledCount; ++k)
    Intvls_.insert(FoldedIntvl(values[k], WrapIntvl_)); // InsertIntvl, in line
}

void SetIntvlsFromMask(CIntvlSet& set, std::uint32_t mask) {
  int values[32];
  std::size_t count = 0;
  for (; mask != 0; mask &= mask - 1) values[count++] = __builtin_ctz(mask); // the lowest bit set
  set.SetIntvlsFromList(values, count);
}

bool CIntvlSet::HasIntvlsFromList(int const* values, std::size_t count) const {
  for (std::size_t k = 0; k < count && !EndsFillList(values[k]); ++k)
    if (!HasIntvl(values[k])) return false;
  return true;
}

bool CIntvlSet::HasIntvlInAnyOctave(int i) const {
  // The search visits r = i % 12 (truncating), r + 12, ... while below the wrap
  // interval. Walking the members instead keeps it short under any wrap interval: a
  // member below the wrap interval is visited exactly when it has r's pitch class,
  // since members are never negative and so never lie below r.
  int r = i % 12;
  int pitchClass = r < 0 ? r + 12 : r;
  for (int m : Intvls_) {
    if (m >= WrapIntvl_) break;
    if (m % 12 == pitchClass) return true;
  }
  return false;
}

bool CIntvlSet::HasExactTheseIntvlsFromList(int const* values, std::size_t count) const {
  std::size_t listed = 0;
  while (listed < count && values[listed] >= 0) ++listed;
  // Size first: it rejects most candidates without a look at the members. An empty
  // set matches only the empty list, a non-empty set never matches it.
  if (listed != Intvls_.size()) return false;
  if (listed == 0) return true;

  // Every listed value is a member, and the insertion rule leaves members unchanged,
  // so the distinct listed values are a subset of the members. Ascending, they begin
  // the set exactly when the highest position they occupy is one less than their
  // number.
  CMemberMarks marks(listed);
  std::size_t distinct = 0;
  std::size_t highest = 0;
  for (std::size_t k = 0; k < listed; ++k) {
    auto pos = Intvls_.find(values[k]);
    if (pos == Intvls_.end()) return false;
    auto p = static_cast<std::size_t>(pos - Intvls_.begin());
    if (marks.Mark(p)) ++distinct;
    highest = std::max(highest, p);
  }
  return highest + 1 == distinct;
}

bool CIntvlSet::HasOtherStackedThirdsOptionThan(int i) const {
  return std::any_of(Intvls_.begin(), Intvls_.end(),
                     [i](int m) { return m != 0 && m != 3 && m != 4 && m != 7 && m != i; });
}

int CIntvlSet::Intvl(unsigned long n) const {
  if (n >= Intvls_.size()) return -1;
  return *(Intvls_.begin() + static_cast<std::ptrdiff_t>(n));
}

CIntvlSet CIntvlSet::Inversion(unsigned long n) const {
  if (Intvls_.size() < 2) return *this;
  CIntvlSet result(24);
  long long base = Intvl(n % Intvls_.size());
  // The smallest multiple of 12, at least 12, not below the largest interval
  // (64-bit: the largest interval may lie near the top of int).
  long long largest = *Intvls_.rbegin();
  long long span = largest <= 12 ? 12 : (largest + 11) / 12 * 12;
  // Folding by 24 before the narrowing keeps the value in int; the insertion rule
  // (wrap 24) would fold it the same way.
  for (int i : Intvls_) result.InsertIntvl(static_cast<int>((span + i - base) % span % 24));
  return result;
}

void CIntvlSet::Invert() { *this = Inversion(1); }

bool CIntvlSet::InsertIntvl(int value) { return Intvls_.insert(FoldedIntvl(value, WrapIntvl_)).second; }

bool CIntvlSet::EraseIntvl(int intvl) { return Intvls_.erase(intvl) != 0; }

void CIntvlSet::EraseIntvlsFromTo(int lo, int hi) {
  auto first = std::lower_bound(Intvls_.begin(), Intvls_.end(), lo);
  while (first != Intvls_.end() && *first <= hi) first = Intvls_.erase(first);
}

void CIntvlSet::SetWrapIntvl(int wrapIntvl) {
  WrapIntvl_ = wrapIntvl;
  CMySet<int> old;
  std::swap(old, Intvls_);
  for (int m : old) InsertIntvl(m);
}

bool CIntvlSet::AutoTest() {
  // Each value v from -40 to 100 goes alone into a set under each wrap interval w. The
  // set must hold exactly the value found by counting octaves up and wraps down, and
  // HasIntvlInAnyOctave must agree with a plain walk up the octaves of its argument.
  bool ok = true;
  for (int w = 1; w <= 48; ++w) {
    for (int v = -40; v <= 100; ++v) {
      int expected = v;
      while (expected < 0) expected += 12;
      while (expected >= w) expected -= w;
      CIntvlSet set(w);
      set.InsertIntvl(v);
      ok = ok && set.size() == 1 && set.HasIntvl(expected) && !set.HasIntvl(expected + 1);
      for (int q = -30; q <= w + 12; ++q) {
        bool found = false;
        for (int x = q % 12; x < w; x += 12) found = found || x == expected;
        ok = ok && set.HasIntvlInAnyOctave(q) == found;
      }
    }
  }
  return ok;
}

bool operator==(CIntvlSet const& a, CIntvlSet const& b) {
  auto bPos = b.begin();
  for (int m : a) {
    if (bPos == b.end() || *bPos != m) return false;
    ++bPos;
  }
  return true;
}

std::ostream& operator<<(std::ostream& os, CIntvlSet const& set) {
  os << "CIntvlSet: (";
  for (int m : set) os << ' ' << m;
  return os << " )";
}
