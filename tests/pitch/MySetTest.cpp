// CMySet behaves as an ordered set on either side of its inline storage: checked
// against std::set on random operations, with values that own memory too (whose
// lifetimes the sanitizer and memcheck runs watch), and on copies and moves of every
// size.
#include <tonvex/MySet.h>

#include <gtest/gtest.h>

#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

template <class T, class Make>
void MatchesStdSet(Make make) {
  std::mt19937 random(7);
  CMySet<T> mine;
  std::set<T> reference;
  for (int step = 0; step < 20000; ++step) {
    T const value = make(static_cast<int>(random() % 40));
    switch (random() % 6) {
    case 0:
    case 1: {
      auto const [pos, inserted] = mine.insert(value);
      ASSERT_EQ(inserted, reference.insert(value).second);
      ASSERT_EQ(*pos, value);
      break;
    }
    case 2: ASSERT_EQ(mine.erase(value), reference.erase(value)); break;
    case 3:
      if (!mine.empty()) {
        auto const index = static_cast<std::ptrdiff_t>(random() % mine.size());
        auto const next = mine.erase(mine.begin() + index);
        auto const refNext = reference.erase(std::next(reference.begin(), index));
        ASSERT_TRUE(next == mine.end() ? refNext == reference.end() : *next == *refNext);
      }
      break;
    case 4: mine = CMySet<T>(mine); break; // copied and moved back
    default:
      ASSERT_EQ(mine.find(value) != mine.end(), reference.count(value) == 1);
      ASSERT_EQ(mine.count(value), reference.count(value));
    }
    ASSERT_EQ(std::vector<T>(mine.begin(), mine.end()), std::vector<T>(reference.begin(), reference.end()));
  }
}

TEST(MySet, MatchesStdSetUnderRandomOperations) {
  MatchesStdSet<int>([](int v) { return v - 10; });
  MatchesStdSet<std::string>([](int v) { return std::string(40, 'x') + std::to_string(1000 + v); });
}

// Every size from empty to well past the inline storage, copied and moved into sets
// of other sizes, keeps behaving as an ordered set afterwards.
TEST(MySet, CopiesAndMovesAcrossTheInlineLimit) {
  int const largest = 2 * static_cast<int>(CMySet<int>::InlineCapacity) + 3;
  auto build = [](int size) {
    CMySet<int> set;
    for (int v = size - 1; v >= 0; --v) set.insert(100 + v); // each at the front
    return set;
  };
  auto values = [](CMySet<int> const& set) { return std::vector<int>(set.begin(), set.end()); };
  for (int a = 0; a <= largest; ++a) {
    CMySet<int> const source = build(a);
    std::vector<int> expected;
    for (int v = 0; v < a; ++v) expected.push_back(100 + v);
    ASSERT_EQ(values(source), expected) << a;
    CMySet<int> copy(source);
    CMySet<int> const moved(std::move(copy));
    EXPECT_EQ(values(moved), expected);
    EXPECT_TRUE(copy.empty());
    copy.insert(7); // a moved-from set is usable
    EXPECT_EQ(values(copy), std::vector<int>{7});
    for (int b = 0; b <= largest; b += 5) {
      CMySet<int> target = build(b), other = build(b), donor = source;
      target = source;
      EXPECT_EQ(values(target), expected) << a << " copied over " << b;
      other = std::move(donor);
      EXPECT_EQ(values(other), expected) << a << " moved over " << b;
      other.insert(99);
      other.insert(100 + a);
      EXPECT_EQ(other.size(), static_cast<std::size_t>(a + 2));
      while (!other.empty()) other.erase(other.begin());
      other.insert(5);
      EXPECT_EQ(values(other), std::vector<int>{5});
    }
    CMySet<int> self = source;
    CMySet<int> const& alias = self;
    self = alias;
    EXPECT_EQ(values(self), expected);
  }
}

} // namespace
