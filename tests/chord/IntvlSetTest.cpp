// Interval sets: the insertion rule, value lists and their end tests, membership
// queries, the one-sided comparison and inversion. Expectations come from bit masks,
// std::set models and plain octave counting, never from CIntvlSet itself.
#include "support/TestPrelude.h"

namespace {

std::vector<int> Members(CIntvlSet const& set) { return std::vector<int>(set.begin(), set.end()); }

// The insertion rule: octaves up while negative, then wraps down while too large; a
// negative wrap interval folds by its magnitude, 0 does not fold.
int Folded(long long value, long long wrap) {
  if (value < 0) value = (value % 12 + 12) % 12;
  return static_cast<int>(wrap == 0 ? value : value % (wrap < 0 ? -wrap : wrap));
}

std::vector<int> MaskValues(unsigned mask) {
  std::vector<int> values;
  for (int i = 0; i < 12; ++i)
    if (mask >> i & 1u) values.push_back(i);
  return values;
}

CIntvlSet FromMask(unsigned mask, int wrap) {
  CIntvlSet set(wrap);
  for (int i : MaskValues(mask)) set.InsertIntvl(i);
  return set;
}

// The fillers and HasIntvls end at -1, at any negative value or at one above 127
// (or after their last value); HasExactTheseIntvls only at a negative value.
TEST(IntvlSet, ValueListsEndAtTheirOwnEndValues) {
  EXPECT_EQ(Members(CIntvlSet(12, 0, 4, 19, -1)), (std::vector<int>{0, 4, 7}));
  EXPECT_EQ(Members(CIntvlSet(24, 0, 200, 4, -1)), std::vector<int>{0});
  EXPECT_EQ(Members(CIntvlSet(1000, 0, -5, 4, -1)), std::vector<int>{0});
  CIntvlSet set(1000, 0, 127, 3);
  EXPECT_TRUE(set.HasIntvls(0, 200, 5, -1) && set.HasIntvls(0, -7, 5) && !set.HasIntvls(5, 200));
  set.SetIntvls(200, -1);
  EXPECT_TRUE(set.empty());
  set.InsertIntvl(200);
  EXPECT_TRUE(set.HasExactTheseIntvls(200, -1, 9));
}

// Every subset of 0..11 against every subset written as an ascending list, and the
// one-sided comparison: the left operand's members must begin the right operand.
TEST(IntvlSet, QueriesOnAllPitchClassSetPairs) {
  std::vector<CIntvlSet> left, right;
  std::vector<std::vector<int>> lists;
  for (unsigned mask = 0; mask < 4096; ++mask) {
    left.push_back(FromMask(mask, 12));
    right.push_back(FromMask(mask, 24));
    lists.push_back(MaskValues(mask));
    lists.back().push_back(-1);
  }
  for (unsigned s = 0; s < 4096; ++s)
    for (unsigned l = 0; l < 4096; ++l) {
      std::vector<int> const& list = lists[l];
      ASSERT_EQ(right[s].HasIntvlsFromList(list.data(), list.size()), (l & ~s) == 0) << s << " " << l;
      ASSERT_EQ(right[s].HasExactTheseIntvlsFromList(list.data(), list.size()), l == s) << s << " " << l;
      std::vector<int> const& a = lists[s];
      bool const begins = a.size() <= list.size() && std::equal(a.begin(), a.end() - 1, list.begin());
      ASSERT_EQ(left[s] == right[l], begins) << s << " " << l; // wrap intervals ignored
    }
}

// Insertions, removals and wrap changes against a std::set model, and the queries on
// every state: HasIntvlInAnyOctave(i) walks i's signed remainder + 12, + 24, ...
// below the wrap; Intvl(n) is the n-th member or -1; Inversion(n) moves each member
// to its distance above the n-th (n taken round the set) within the span, the largest
// member rounded up to octaves, folded by 24 (sets below two members are copied);
// Invert is Inversion(1); HasExactTheseIntvls compares any list with the members.
TEST(IntvlSet, OperationsAndQueriesMatchAModel) {
  std::mt19937 random(5);
  int const wraps[] = {INT_MIN, -7, 0, 1, 5, 12, 13, 24, 36, 1000};
  CIntvlSet set(24);
  std::set<int> model;
  int wrap = 24;
  for (int step = 0; step < 40000; ++step) {
    int v = static_cast<int>(random() % 2400) - 400;
    if (step % 101 == 0) v = step % 2 ? INT_MAX : INT_MIN;
    switch (random() % 7) {
    case 0:
    case 1:
    case 2: EXPECT_EQ(set.InsertIntvl(v), model.insert(Folded(v, wrap)).second); break;
    case 3: EXPECT_EQ(set.EraseIntvl(v % 40), model.erase(v % 40) == 1); break;
    case 4: {
      int const lo = v % 50, hi = lo + static_cast<int>(random() % 30) - 5;
      set.EraseIntvlsFromTo(lo, hi);
      for (int i = lo; i <= hi; ++i) model.erase(i);
      break;
    }
    default:
      if (random() % 50 == 0) {
        wrap = wraps[random() % std::size(wraps)];
        set.SetWrapIntvl(wrap);
        std::set<int> folded;
        for (int m : model) folded.insert(Folded(m, wrap));
        model = folded;
      } else if (random() % 20 == 0) {
        set.Clear();
        model.clear();
      }
    }
    std::vector<int> const members(model.begin(), model.end());
    ASSERT_EQ(Members(set), members);
    ASSERT_EQ(set.WrapIntvl(), wrap);
    int const i = v % 60;
    bool found = false;
    for (int r = i % 12; r < wrap; r += 12) found = found || model.count(r) == 1;
    ASSERT_EQ(set.HasIntvlInAnyOctave(i), found) << set << " " << i;
    unsigned long const n = random() % 20;
    ASSERT_EQ(set.Intvl(n), n < members.size() ? members[n] : -1);
    std::set<int> inverted = model;
    if (members.size() >= 2) {
      inverted.clear();
      long long const base = members[n % members.size()], span = (members.back() + 11LL) / 12 * 12;
      for (int m : members) inverted.insert(static_cast<int>(((m - base) % span + span) % span % 24));
    }
    ASSERT_EQ(Members(set.Inversion(n)), std::vector<int>(inverted.begin(), inverted.end())) << set << " " << n;
    ASSERT_EQ(set.Inversion(n).WrapIntvl(), members.size() >= 2 ? 24 : wrap);
    CIntvlSet once = set;
    once.Invert();
    ASSERT_EQ(Members(once), Members(set.Inversion(1)));
    // The exact test on lists of any length (past 64 members too), in any order, a
    // repeated value counting toward the length but compared once.
    std::vector<int> list(members.rbegin(), members.rend()), lost = list;
    if (list.size() >= 2) list.front() = list[1]; // the largest replaced by a repeat: true
    ASSERT_TRUE(set.HasExactTheseIntvlsFromList(list.data(), list.size()));
    if (lost.size() >= 2) lost.back() = lost.front(); // the smallest lost: false
    ASSERT_EQ(set.HasExactTheseIntvlsFromList(lost.data(), lost.size()), lost.size() < 2);
  }
}

} // namespace
