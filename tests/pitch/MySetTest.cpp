// CMySet behaves as an ordered set: checked against std::set on random operations.
#include "MySet.h"
#include "Note.h"

#include <gtest/gtest.h>

#include <random>
#include <set>
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
  ASSERT_EQ(notes.size(), 3u);  // two spellings of one pitch stand side by side
  EXPECT_EQ(*notes.begin(), CNote(60, Enh_Natural));
  EXPECT_EQ(*(notes.begin() + 1), CNote(61, Enh_Flat));
  EXPECT_EQ(*notes.rbegin(), CNote(61, Enh_Sharp));
  CMySet<CNote> copy = notes;
  copy.clear();
  EXPECT_TRUE(copy.empty());
  EXPECT_EQ(notes.size(), 3u);
}

} // namespace
