// CMySet behaves as an ordered set: checked against std::set on random operations.
#include <tonvex/MySet.h>
#include <tonvex/Note.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <numeric>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

template <class T>
std::vector<T> Contents(CMySet<T> const& s) {
  return std::vector<T>(s.begin(), s.end());
}
template <class T>
std::vector<T> Contents(std::set<T> const& s) {
  return std::vector<T>(s.begin(), s.end());
}

TEST(MySet, MatchesStdSetUnderRandomOperations) {
  std::mt19937 random(7);
  CMySet<int> mine;
  std::set<int> reference;
  for (int step = 0; step < 20000; ++step) {
    int value = static_cast<int>(random() % 40) - 10;
    switch (random() % 5) {
    case 0:
    case 1: {
      auto [pos, inserted] = mine.insert(value);
      EXPECT_EQ(inserted, reference.insert(value).second);
      EXPECT_EQ(*pos, value);
      break;
    }
    case 2: EXPECT_EQ(mine.erase(value), reference.erase(value)); break;
    case 3:
      if (!mine.empty()) {
        std::size_t index = random() % mine.size();
        auto next = mine.erase(mine.begin() + static_cast<std::ptrdiff_t>(index));
        auto refNext = reference.erase(std::next(reference.begin(), static_cast<std::ptrdiff_t>(index)));
        EXPECT_EQ(next == mine.end(), refNext == reference.end());
        if (next != mine.end()) {
          EXPECT_EQ(*next, *refNext);
        }
      }
      break;
    default:
      EXPECT_EQ(mine.find(value) != mine.end(), reference.count(value) == 1);
      EXPECT_EQ(mine.count(value), reference.count(value));
      break;
    }
    ASSERT_EQ(Contents(mine), Contents(reference));
    ASSERT_EQ(mine.size(), reference.size());
    ASSERT_EQ(mine.empty(), reference.empty());
  }
}

TEST(MySet, NotesAreOrderedByNumberThenSpelling) {
  CMySet<CNote> notes{CNote(61, Enh_Sharp), CNote(60, Enh_Natural), CNote(61, Enh_Flat), CNote(61, Enh_Sharp)};
  ASSERT_EQ(notes.size(), 3u); // two spellings of one pitch stand side by side
  EXPECT_EQ(*notes.begin(), CNote(60, Enh_Natural));
  EXPECT_EQ(*(notes.begin() + 1), CNote(61, Enh_Flat));
  EXPECT_EQ(*notes.rbegin(), CNote(61, Enh_Sharp));
  CMySet<CNote> copy = notes;
  copy.clear();
  EXPECT_TRUE(copy.empty());
  EXPECT_EQ(notes.size(), 3u);
}

// Sets of every size from empty to well past the inline storage, in both places a
// set can live: each must survive copying and moving into sets of every other size
// and keep behaving as an ordered set afterwards.
TEST(MySet, CopiesAndMovesAcrossTheInlineLimit) {
  constexpr int Largest = 2 * static_cast<int>(CMySet<int>::InlineCapacity) + 3;
  std::mt19937 random(11);
  auto build = [&random](int size) {
    std::vector<int> values(static_cast<std::size_t>(size));
    std::iota(values.begin(), values.end(), 100);
    std::shuffle(values.begin(), values.end(), random);
    CMySet<int> set;
    for (int v : values) set.insert(v);
    return set;
  };
  auto expected = [](int size) {
    std::vector<int> values(static_cast<std::size_t>(size));
    std::iota(values.begin(), values.end(), 100);
    return values;
  };
  for (int a = 0; a <= Largest; ++a) {
    SCOPED_TRACE("size " + std::to_string(a));
    CMySet<int> const source = build(a);
    ASSERT_EQ(Contents(source), expected(a));
    CMySet<int> copy(source);
    EXPECT_EQ(Contents(copy), expected(a));
    EXPECT_TRUE(copy == source);
    CMySet<int> moved(std::move(copy));
    EXPECT_EQ(Contents(moved), expected(a));
    EXPECT_TRUE(copy.empty());
    copy.insert(7); // a moved-from set is usable
    EXPECT_EQ(Contents(copy), std::vector<int>{7});
    for (int b = 0; b <= Largest; b += 5) {
      CMySet<int> target = build(b);
      target = source;
      EXPECT_EQ(Contents(target), expected(a)) << "copied over " << b;
      CMySet<int> other = build(b);
      CMySet<int> donor = source;
      other = std::move(donor);
      EXPECT_EQ(Contents(other), expected(a)) << "moved over " << b;
      // The result grows and shrinks across the limit as any set does.
      other.insert(99);
      other.insert(100 + a);
      EXPECT_EQ(other.size(), static_cast<std::size_t>(a + 2));
      EXPECT_EQ(*other.begin(), 99);
      EXPECT_EQ(*other.rbegin(), 100 + a);
      while (!other.empty()) other.erase(other.begin());
      other.insert(5);
      EXPECT_EQ(Contents(other), std::vector<int>{5});
    }
    CMySet<int> self = source;
    CMySet<int> const& alias = self;
    self = alias;
    EXPECT_EQ(Contents(self), expected(a));
  }
}

// A value that owns memory and counts how many of its kind are alive.
struct CCounted {
  inline static int Live = 0;
  std::string Text;
  explicit CCounted(int v) : Text(std::string(40, 'x') + std::to_string(1000 + v)) { ++Live; }
  CCounted(CCounted const& other) : Text(other.Text) { ++Live; }
  CCounted(CCounted&& other) noexcept : Text(std::move(other.Text)) { ++Live; }
  CCounted& operator=(CCounted const&) = default;
  CCounted& operator=(CCounted&&) = default;
  ~CCounted() { --Live; }
  bool operator<(CCounted const& other) const { return Text < other.Text; }
};

// Values that own memory: every value made is destroyed exactly once, whatever the
// set does with it on either side of the inline limit.
TEST(MySet, ConstructsAndDestroysEveryValueOnce) {
  std::mt19937 random(3);
  {
    CMySet<CCounted> set;
    std::set<std::string> reference;
    for (int step = 0; step < 3000; ++step) {
      CCounted value(static_cast<int>(random() % 50));
      if (random() % 3 != 0) {
        set.insert(value);
        reference.insert(value.Text);
      } else {
        set.erase(value);
        reference.erase(value.Text);
      }
      if (step % 500 == 0) {
        CMySet<CCounted> copy = set;
        set = std::move(copy);
      }
      ASSERT_EQ(set.size(), reference.size());
      ASSERT_TRUE(std::equal(set.begin(), set.end(), reference.begin(),
                             [](CCounted const& c, std::string const& t) { return c.Text == t; }));
      ASSERT_EQ(CCounted::Live, static_cast<int>(set.size()) + 1);
    }
    set.clear();
    EXPECT_EQ(CCounted::Live, 0);
  }
  EXPECT_EQ(CCounted::Live, 0);
}

} // namespace
