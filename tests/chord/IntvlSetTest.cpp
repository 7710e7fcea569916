// Interval sets: insertion rule, value lists and their end tests, membership queries,
// the one-sided comparison, inversion and printing. Expectations come from bit masks,
// std::set models and plain octave counting, never from CIntvlSet itself.
#include <tonvex/IntvlSet.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <random>
#include <set>
#include <sstream>
#include <vector>

namespace {

std::vector<int> Members(CIntvlSet const& set) { return std::vector<int>(set.begin(), set.end()); }

// The insertion rule counted out: octaves up while negative, wraps down while too large.
int ExpectedFold(long long value, int wrap) {
  while (value < 0) value += 12;
  while (value >= wrap) value -= wrap;
  return static_cast<int>(value);
}

// The subset of 0..11 given by a 12-bit mask, built under the given wrap interval.
CIntvlSet FromMask(unsigned mask, int wrap) {
  CIntvlSet set(wrap);
  for (int i = 0; i < 12; ++i)
    if (mask & (1u << i)) set.InsertIntvl(i);
  return set;
}
std::vector<int> MaskValues(unsigned mask) {
  std::vector<int> values;
  for (int i = 0; i < 12; ++i)
    if (mask & (1u << i)) values.push_back(i);
  return values;
}
unsigned LowestBits(unsigned mask, int count) {
  unsigned result = 0;
  for (int i = 0; i < 12 && count > 0; ++i)
    if (mask & (1u << i)) {
      result |= 1u << i;
      --count;
    }
  return result;
}
int BitCount(unsigned mask) {
  int n = 0;
  for (; mask != 0; mask &= mask - 1) ++n;
  return n;
}

TEST(IntvlSet, ValueListsEndAtTheirOwnEndValues) {
  struct Case {
    CIntvlSet set;
    std::vector<int> members;
  } const cases[] = {
      {CIntvlSet(12, 0, 4, 19, -1), {0, 4, 7}},
      {CIntvlSet(24, 0, 4, 19, -1), {0, 4, 19}},
      {CIntvlSet(24, 0, 200, 4, -1), {0}}, // 200 > 127 ends the list
      {CIntvlSet(24, 0, 4, 128, 7, -1), {0, 4}},
      {CIntvlSet(24, 0, -5, 4, -1), {0}},  // any negative value ends it too
      {CIntvlSet(24, 0, 127, -1), {0, 7}}, // 127 is still a value
      {CIntvlSet(1000, 0, 100, 127, -1), {0, 100, 127}},
      {CIntvlSet(24, -1), {}},
      {CIntvlSet(24, 300, 4, -1), {}},
      {CIntvlSet(24, 0, 4, 7), {0, 4, 7}}, // no -1: the list ends with its last value
      {CIntvlSet(24, 7, 0, 7, 31, 4, -1), {0, 4, 7}},
      {CIntvlSet(5), {}},
  };
  for (auto const& c : cases) EXPECT_EQ(Members(c.set), c.members) << c.set;

  CIntvlSet set(12, 1, 2, 3, -1);
  set.SetIntvls(0, 16, 200, 5, -1);
  EXPECT_EQ(Members(set), (std::vector<int>{0, 4}));
  EXPECT_EQ(set.WrapIntvl(), 12);
  set.SetIntvls(-1);
  EXPECT_TRUE(set.empty());

  std::vector<int> all(128);
  for (int i = 0; i < 128; ++i) all[static_cast<std::size_t>(i)] = 127 - i;
  set.SetWrapIntvl(1000);
  set.SetIntvlsFromList(all.data(), all.size());
  EXPECT_EQ(set.size(), 128u);
  EXPECT_EQ(set.Intvl(127), 127);
}

TEST(IntvlSet, HasIntvlsEndsLikeTheFillersAndHasExactTheseIntvlsOnlyAtNegatives) {
  CIntvlSet chord(24, 0, 4, 7, -1);
  EXPECT_TRUE(chord.HasIntvls(0, 4, -1));
  EXPECT_TRUE(chord.HasIntvls(7, 0));
  EXPECT_FALSE(chord.HasIntvls(0, 5, -1));
  EXPECT_TRUE(chord.HasIntvls(0, 200, 5, -1)); // 200 ends the list before 5
  EXPECT_TRUE(chord.HasIntvls(0, -7, 5));
  EXPECT_FALSE(chord.HasIntvls(5, 200));
  EXPECT_TRUE(chord.HasIntvls(-1));
  EXPECT_TRUE(CIntvlSet(24).HasIntvls(-1));
  EXPECT_FALSE(CIntvlSet(24).HasIntvls(0, -1));
  EXPECT_FALSE(CIntvlSet(24).HasIntvl(0));

  CIntvlSet wide(1000);
  for (int v : {0, 4, 200}) wide.InsertIntvl(v);
  EXPECT_TRUE(wide.HasExactTheseIntvls(0, 4, 200, -1)); // 200 belongs to the list
  EXPECT_TRUE(wide.HasExactTheseIntvls(200, 0, 4));
  EXPECT_FALSE(wide.HasExactTheseIntvls(0, 4, -1));
  EXPECT_FALSE(wide.HasExactTheseIntvls(0, 4, 200, 300, -1));
  EXPECT_FALSE(CIntvlSet(1000, 0, 4, -1).HasExactTheseIntvls(0, 4, 200, -1));
  EXPECT_TRUE(wide.HasExactTheseIntvls(0, 4, 200, -1, 9)); // nothing after the -1 counts

  EXPECT_TRUE(chord.HasExactTheseIntvls(0, 4, 7, -1));
  EXPECT_FALSE(CIntvlSet(24, 0, 4, 7, 11, -1).HasExactTheseIntvls(0, 4, 7, -1));
  EXPECT_TRUE(CIntvlSet(24).HasExactTheseIntvls(-1));
  EXPECT_FALSE(CIntvlSet(24).HasExactTheseIntvls(0, -1));
  EXPECT_FALSE(CIntvlSet(24, 0, -1).HasExactTheseIntvls(-1));
  // Unfolded: 12 is not 0, and 19 is not 7 in a wrap-24 set.
  EXPECT_FALSE(CIntvlSet(24, 0, 7, -1).HasExactTheseIntvls(0, 7, 12, -1));
  EXPECT_TRUE(CIntvlSet(24, 0, 7, 12, -1).HasExactTheseIntvls(0, 7, 12, -1));
  EXPECT_FALSE(CIntvlSet(24, 0, 4, 19, -1).HasExactTheseIntvls(0, 4, 7, -1));
}

// Duplicates count toward the size but collapse among the values compared: on
// {0, 4, 7} the list 0, 4, 4 has three values (the size matches), each a member, and
// its distinct values 0, 4 are the two smallest members, so the one-sided comparison
// with them on the left is true. 0, 7, 7 fails that comparison (7 stands where 4 is).
TEST(IntvlSet, HasExactTheseIntvlsCountsDuplicatesButComparesThemOnce) {
  CIntvlSet chord(24, 0, 4, 7, -1);
  EXPECT_TRUE(chord.HasExactTheseIntvls(0, 4, 4, -1));
  EXPECT_TRUE(chord.HasExactTheseIntvls(0, 0, 0, -1));
  EXPECT_TRUE(chord.HasExactTheseIntvls(4, 0, 0, -1));
  EXPECT_FALSE(chord.HasExactTheseIntvls(0, 7, 7, -1));
  EXPECT_FALSE(chord.HasExactTheseIntvls(4, 4, 7, -1));
  EXPECT_FALSE(chord.HasExactTheseIntvls(0, 4, -1));
  EXPECT_FALSE(chord.HasExactTheseIntvls(0, 4, 4, 7, -1));

  // More than 64 members: the same rule on a wrap-1000 set holding 0..99.
  CIntvlSet big(1000);
  std::vector<int> values;
  for (int v = 0; v < 100; ++v) {
    big.InsertIntvl(v);
    values.push_back(v);
  }
  std::mt19937 random(3);
  std::shuffle(values.begin(), values.end(), random);
  EXPECT_TRUE(big.HasExactTheseIntvlsFromList(values.data(), values.size()));
  std::replace(values.begin(), values.end(), 99, 98); // 0..98 begin the set
  EXPECT_TRUE(big.HasExactTheseIntvlsFromList(values.data(), values.size()));
  std::replace(values.begin(), values.end(), 0, 1); // 1..98 do not
  EXPECT_FALSE(big.HasExactTheseIntvlsFromList(values.data(), values.size()));
}

// Random lists with repeats against every subset of 0..11, and big sets under wrap 1000,
// judged by the stated steps on a std::set model.
TEST(IntvlSet, HasExactTheseIntvlsFollowsItsStepsOnRandomLists) {
  std::mt19937 random(11);
  auto expected = [](std::set<int> const& members, std::vector<int> const& list) {
    std::set<int> distinct;
    for (int v : list) {
      if (members.count(v) == 0) return false;
      distinct.insert(v);
    }
    if (list.size() != members.size()) return false;
    return std::equal(distinct.begin(), distinct.end(), members.begin());
  };
  for (unsigned mask = 0; mask < 4096; ++mask) {
    std::vector<int> maskValues = MaskValues(mask);
    std::set<int> members(maskValues.begin(), maskValues.end());
    CIntvlSet set = FromMask(mask, 24);
    for (int trial = 0; trial < 8; ++trial) {
      std::vector<int> list;
      std::size_t length = maskValues.size() + random() % 3 - (maskValues.empty() ? 0 : 1);
      for (std::size_t k = 0; k < length; ++k) {
        bool fromSet = !maskValues.empty() && random() % 8 != 0;
        list.push_back(fromSet ? maskValues[random() % maskValues.size()] : static_cast<int>(random() % 14));
      }
      ASSERT_EQ(set.HasExactTheseIntvlsFromList(list.data(), list.size()), expected(members, list)) << set;
    }
  }
  for (int trial = 0; trial < 300; ++trial) {
    std::set<int> members;
    CIntvlSet set(1000);
    std::size_t count = 60 + random() % 20;
    while (members.size() < count) {
      int v = static_cast<int>(random() % 1000);
      members.insert(v);
      set.InsertIntvl(v);
    }
    std::vector<int> ordered(members.begin(), members.end());
    std::vector<int> list(ordered.begin(), ordered.end());
    for (std::size_t k = 0; k < 1 + random() % 3; ++k)
      list[random() % list.size()] = ordered[random() % ordered.size()];
    std::shuffle(list.begin(), list.end(), random);
    ASSERT_EQ(set.HasExactTheseIntvlsFromList(list.data(), list.size()), expected(members, list)) << set;
  }
}

// Every subset of 0..11 against every subset written as an ascending list.
TEST(IntvlSet, ListQueriesOnAllPitchClassSets) {
  std::vector<CIntvlSet> sets;
  std::vector<std::vector<int>> lists;
  for (unsigned mask = 0; mask < 4096; ++mask) {
    sets.push_back(FromMask(mask, 24));
    lists.push_back(MaskValues(mask));
    lists.back().push_back(-1);
  }
  for (unsigned s = 0; s < 4096; ++s)
    for (unsigned l = 0; l < 4096; ++l) {
      auto const& list = lists[l];
      ASSERT_EQ(sets[s].HasIntvlsFromList(list.data(), list.size()), (l & ~s) == 0) << s << " " << l;
      ASSERT_EQ(sets[s].HasExactTheseIntvlsFromList(list.data(), list.size()), l == s) << s << " " << l;
    }
}

// operator== is one-sided: the left operand's members must begin the right operand.
TEST(IntvlSet, ComparisonWalksOnlyTheLeftOperand) {
  EXPECT_TRUE(CIntvlSet(24) == CIntvlSet(24, 0, 4, 7, -1));  // empty left: anything
  EXPECT_FALSE(CIntvlSet(24, 0, 4, 7, -1) == CIntvlSet(24)); // right runs out
  EXPECT_TRUE(CIntvlSet(24, 0, 4, -1) == CIntvlSet(24, 0, 4, 7, -1));
  EXPECT_FALSE(CIntvlSet(24, 0, 4, 7, -1) == CIntvlSet(24, 0, 4, -1));
  EXPECT_FALSE(CIntvlSet(24, 0, 7, -1) == CIntvlSet(24, 0, 4, 7, -1));
  EXPECT_TRUE(CIntvlSet(12, 0, 4, 7, -1) == CIntvlSet(36, 0, 4, 7, 30, -1)); // wraps ignored

  std::vector<CIntvlSet> left, right;
  for (unsigned mask = 0; mask < 4096; ++mask) {
    left.push_back(FromMask(mask, 12));
    right.push_back(FromMask(mask, 24));
  }
  for (unsigned a = 0; a < 4096; ++a)
    for (unsigned b = 0; b < 4096; ++b)
      ASSERT_EQ(left[a] == right[b], LowestBits(b, BitCount(a)) == a) << a << " " << b;
}

// The insertion rule under many wrap intervals, for small, large and extreme values.
TEST(IntvlSet, InsertionRaisesByOctavesThenWraps) {
  for (int wrap : {1, 2, 5, 7, 11, 12, 13, 24, 25, 36, 100, 1000}) {
    for (int v = -400; v <= 1400; ++v) {
      CIntvlSet set(wrap);
      EXPECT_TRUE(set.InsertIntvl(v));
      ASSERT_EQ(Members(set), std::vector<int>{ExpectedFold(v, wrap)}) << "wrap " << wrap << " value " << v;
      EXPECT_FALSE(set.InsertIntvl(v));
      if (v >= 0 && v <= 127) {
        EXPECT_EQ(Members(CIntvlSet(wrap, v, -1)), Members(set));
      }
    }
    // INT_MIN = -2147483648 lies 8 below a multiple of 12, so it rises to 4.
    CIntvlSet bottom(wrap);
    bottom.InsertIntvl(INT_MIN);
    EXPECT_EQ(Members(bottom), std::vector<int>{ExpectedFold(4, wrap)});
    CIntvlSet top(wrap);
    top.InsertIntvl(INT_MAX);
    EXPECT_EQ(Members(top), std::vector<int>{static_cast<int>(INT_MAX % wrap)});
  }
}

// A random mix of insertions, removals and wrap changes against a std::set model.
TEST(IntvlSet, MaintenanceOperationsMatchAModel) {
  std::mt19937 random(5);
  int const wraps[] = {12, 24, 36, 100, 1000};
  for (int wrap : wraps) {
    CIntvlSet set(wrap);
    std::set<int> model;
    int modelWrap = wrap;
    for (int step = 0; step < 4000; ++step) {
      int v = static_cast<int>(random() % 2400) - 400;
      switch (random() % 8) {
      case 0:
      case 1:
      case 2: EXPECT_EQ(set.InsertIntvl(v), model.insert(ExpectedFold(v, modelWrap)).second); break;
      case 3: EXPECT_EQ(set.EraseIntvl(v % 40), model.erase(v % 40) == 1); break;
      case 4: {
        int lo = v % 50, hi = lo + static_cast<int>(random() % 30) - 5;
        set.EraseIntvlsFromTo(lo, hi);
        for (int i = lo; i <= hi; ++i) model.erase(i);
        break;
      }
      case 5:
        if (random() % 50 == 0) {
          modelWrap = wraps[random() % 5];
          set.SetWrapIntvl(modelWrap);
          std::set<int> folded;
          for (int m : model) folded.insert(ExpectedFold(m, modelWrap));
          model = folded;
        }
        break;
      case 6:
        if (random() % 100 == 0) {
          set.Clear();
          model.clear();
        }
        break;
      default: {
        int query = v % 60;
        EXPECT_EQ(set.HasIntvl(query), model.count(query) == 1);
        break;
      }
      }
      ASSERT_EQ(Members(set), std::vector<int>(model.begin(), model.end()));
      ASSERT_EQ(set.WrapIntvl(), modelWrap);
      ASSERT_EQ(set.size(), model.size());
    }
  }
  CIntvlSet set(24, 0, 5, 9, -1);
  set.EraseIntvlsFromTo(INT_MIN, INT_MAX);
  EXPECT_TRUE(set.empty());
  EXPECT_EQ(set.WrapIntvl(), 24);
}

// Wrap intervals of 0 and below: 0 does not fold, a negative one folds by its
// magnitude; the any-octave search finds nothing under either.
TEST(IntvlSet, NonPositiveWrapIntervalsAreDefined) {
  struct Case {
    int wrap;
    int value;
    int stored;
  } const cases[] = {{0, -1, 11},     {0, 500, 500},     {0, -25, 11},  {0, INT_MAX, INT_MAX}, {-1, 77, 0},
                     {-1, -5, 0},     {-12, 19, 7},      {-12, -1, 11}, {-24, 19, 19},         {-24, 30, 6},
                     {INT_MIN, 5, 5}, {INT_MIN, -1, 11}, {-7, 100, 2},  {-1, INT_MIN, 0}};
  for (Case c : cases) {
    CIntvlSet set(c.wrap);
    set.InsertIntvl(c.value);
    EXPECT_EQ(Members(set), std::vector<int>{c.stored}) << c.wrap << " " << c.value;
    for (int q = -30; q <= 30; ++q) EXPECT_FALSE(set.HasIntvlInAnyOctave(q)) << c.wrap << " " << q;
    EXPECT_TRUE(set.HasExactTheseIntvls(c.stored, -1));
  }
  CIntvlSet unwrapped(0, 0, 100, 3, -1);
  EXPECT_EQ(Members(unwrapped), (std::vector<int>{0, 3, 100}));
  EXPECT_EQ(Members(unwrapped.Inversion(1)), (std::vector<int>{0, 1, 9})); // span 108: 97 folds to 1
}

TEST(IntvlSet, AnyOctaveSearchWalksUpFromTheSignedRemainder) {
  CIntvlSet ninth(24, 0, 14, -1);
  EXPECT_TRUE(ninth.HasIntvlInAnyOctave(2));
  EXPECT_TRUE(ninth.HasIntvlInAnyOctave(14));
  EXPECT_TRUE(ninth.HasIntvlInAnyOctave(26));
  EXPECT_TRUE(ninth.HasIntvlInAnyOctave(-10)); // -10, 2, 14
  EXPECT_TRUE(ninth.HasIntvlInAnyOctave(-22)); // remainder -10 as well
  EXPECT_FALSE(ninth.HasIntvlInAnyOctave(-2)); // -2, 10, 22
  EXPECT_TRUE(ninth.HasIntvlInAnyOctave(-12)); // 0
  EXPECT_FALSE(CIntvlSet(24).HasIntvlInAnyOctave(0));

  // Random sets under wraps 12 and 24 (and wider): the stated walk on a std::set model.
  std::mt19937 random(9);
  for (int wrap : {12, 24, 30, 48}) {
    for (int trial = 0; trial < 400; ++trial) {
      CIntvlSet set(wrap);
      std::set<int> model;
      for (int k = 0; k < static_cast<int>(random() % 7); ++k) {
        int v = static_cast<int>(random() % static_cast<unsigned>(wrap));
        set.InsertIntvl(v);
        model.insert(v);
      }
      for (int i = -60; i <= 60; ++i) {
        bool found = false;
        for (int r = i % 12; r < wrap; r += 12) found = found || model.count(r) == 1;
        ASSERT_EQ(set.HasIntvlInAnyOctave(i), found) << set << " " << i;
      }
    }
  }
}

TEST(IntvlSet, OtherStackedThirdsOption) {
  EXPECT_FALSE(CIntvlSet(24, 0, 4, 7, 10, -1).HasOtherStackedThirdsOptionThan(10));
  EXPECT_TRUE(CIntvlSet(24, 0, 4, 7, 10, 14, -1).HasOtherStackedThirdsOptionThan(10));
  unsigned const thirds = (1u << 0) | (1u << 3) | (1u << 4) | (1u << 7);
  for (unsigned mask = 0; mask < 4096; ++mask) {
    CIntvlSet set = FromMask(mask, 12);
    for (int i = -1; i <= 12; ++i) {
      unsigned allowed = thirds | (i >= 0 && i < 12 ? 1u << i : 0u);
      ASSERT_EQ(set.HasOtherStackedThirdsOptionThan(i), (mask & ~allowed) != 0) << mask << " " << i;
    }
  }
}

TEST(IntvlSet, IndexedIntervalsAscendAndOutOfRangeGivesMinusOne) {
  CIntvlSet set(24, 7, 19, 0, 4, -1);
  int const expected[] = {0, 4, 7, 19};
  for (unsigned long n = 0; n < 4; ++n) EXPECT_EQ(set.Intvl(n), expected[n]);
  EXPECT_EQ(set.Intvl(4), -1);
  EXPECT_EQ(set.Intvl(ULONG_MAX), -1);
  EXPECT_EQ(CIntvlSet(24).Intvl(0), -1);
}

// Each interval i moves to i - base, brought into 0..span-1 by adding or taking away
// spans, then folded by 24. A largest interval that is a whole span lands on the base.
TEST(IntvlSet, InversionRotatesWithinTheSpan) {
  EXPECT_EQ(Members(CIntvlSet(24, 0, 4, 7, -1).Inversion(1)), (std::vector<int>{0, 3, 8}));
  EXPECT_EQ(Members(CIntvlSet(24, 0, 4, 7, -1).Inversion(2)), (std::vector<int>{0, 5, 9}));
  EXPECT_EQ(Members(CIntvlSet(24, 0, 4, 7, -1).Inversion(3)), (std::vector<int>{0, 4, 7}));
  EXPECT_EQ(Members(CIntvlSet(24, 0, 4, 7, 14, -1).Inversion(1)), (std::vector<int>{0, 3, 10, 20}));
  EXPECT_EQ(Members(CIntvlSet(24, 0, 4, 7, 12, -1).Inversion(0)), (std::vector<int>{0, 4, 7}));
  EXPECT_EQ(Members(CIntvlSet(24, 0, 4, 7, 12, -1).Inversion(1)), (std::vector<int>{0, 3, 8}));
  EXPECT_EQ(CIntvlSet(12, 0, 4, 7, -1).Inversion(1).WrapIntvl(), 24);

  std::mt19937 random(13);
  for (int trial = 0; trial < 3000; ++trial) {
    int wrap = trial % 2 == 0 ? 24 : 100;
    CIntvlSet set(wrap);
    std::set<int> model;
    for (int k = 0; k < 2 + static_cast<int>(random() % 6); ++k) {
      int v = static_cast<int>(random() % static_cast<unsigned>(wrap));
      set.InsertIntvl(v);
      model.insert(v);
    }
    if (model.size() < 2) continue;
    unsigned long n = random() % 20;
    std::vector<int> ordered(model.begin(), model.end());
    int base = ordered[n % ordered.size()];
    int span = 12;
    while (span < ordered.back()) span += 12;
    std::set<int> expected;
    for (int i : ordered) {
      int d = i - base;
      while (d < 0) d += span;
      while (d >= span) d -= span;
      expected.insert(d % 24);
    }
    CIntvlSet inverted = set.Inversion(n);
    ASSERT_EQ(Members(inverted), std::vector<int>(expected.begin(), expected.end())) << set << " n=" << n;
    ASSERT_EQ(inverted.WrapIntvl(), 24);
  }
}

TEST(IntvlSet, SetsBelowTwoMembersInvertToExactCopies) {
  for (int wrap : {5, 12, 1000}) {
    for (int v : {-1, 0, 3, 400}) {
      CIntvlSet set(wrap);
      if (v >= 0) set.InsertIntvl(v);
      for (unsigned long n : {0ul, 1ul, 7ul}) {
        CIntvlSet copy = set.Inversion(n);
        EXPECT_EQ(Members(copy), Members(set));
        EXPECT_EQ(copy.WrapIntvl(), wrap);
      }
      set.Invert();
      EXPECT_EQ(set.WrapIntvl(), wrap);
      EXPECT_EQ(set.size(), v >= 0 ? 1u : 0u);
    }
  }
  CIntvlSet triad(12, 0, 4, 7, -1);
  triad.Invert();
  EXPECT_EQ(Members(triad), (std::vector<int>{0, 3, 8}));
  EXPECT_EQ(triad.WrapIntvl(), 24);
}

TEST(IntvlSet, PrintsItsMembersInOrder) {
  auto printed = [](CIntvlSet const& set) {
    std::ostringstream out;
    out << set;
    return out.str();
  };
  EXPECT_EQ(printed(CIntvlSet(24, 7, 0, 4, -1)), "CIntvlSet: ( 0 4 7 )");
  EXPECT_EQ(printed(CIntvlSet(24)), "CIntvlSet: ( )");
  EXPECT_EQ(printed(CIntvlSet(1000, 0, 127, -1)), "CIntvlSet: ( 0 127 )");
}

TEST(IntvlSet, CopiesCarryTheWrapInterval) {
  CIntvlSet original(36, 0, 30, -1);
  CIntvlSet copy(original);
  EXPECT_EQ(copy.WrapIntvl(), 36);
  EXPECT_EQ(Members(copy), (std::vector<int>{0, 30}));
  CIntvlSet assigned(12);
  assigned = original;
  assigned.InsertIntvl(31);
  EXPECT_EQ(Members(assigned), (std::vector<int>{0, 30, 31}));
  EXPECT_EQ(original.size(), 2u);
}

TEST(IntvlSet, SelfTestPasses) { EXPECT_TRUE(CIntvlSet::AutoTest()); }

} // namespace
