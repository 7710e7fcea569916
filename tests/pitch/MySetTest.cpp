// CMySet behaves as an ordered set on either side of its inline storage (sizes
// from 0 to 40, copied and moved at every size): checked against std::set on random
// operations, with values that own memory too, whose lifetimes the sanitizer and
// memcheck runs watch.
#include "support/TestPrelude.h"

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
    case 4: { // copied, moved, self-assigned
      CMySet<T> copy(mine), moved(std::move(copy));
      copy = moved;
      mine = std::move(copy);
      CMySet<T> const& self = mine;
      mine = self;
      break;
    }
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

} // namespace
