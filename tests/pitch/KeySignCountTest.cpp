// The key sign count against the letter model: a key's signs are its tonic letter's
// place on the circle of fifths plus seven per accidental.
#include "support/SpellingOracle.h"

#include "pitch/KeySignCount.h"

#include <gtest/gtest.h>

namespace {

TEnh E(int e) { return static_cast<TEnh>(e); }

TEST(KeySignCount, EverySensefulRootSpellingAndBasicChord) {
  for (int basic = -1; basic <= 8; ++basic)
    for (int k = 0; k < 12; ++k)
      for (int e : oracle::SensefulSpellings(k)) {
        CNote root(60 + k, E(e));
        EXPECT_EQ(KeySignCount(root, basic), oracle::SignCount(k, e, basic))
            << "k=" << k << " e=" << e << " basic=" << basic;
        EXPECT_EQ(root.Enh(), e) << "a senseful spelling is kept";
      }
}

// A note carrying spelling e unchecked on key number k: SetNoteNr keeps the
// spelling of a note on which e was senseful.
CNote Unchecked(int k, int e) {
  int home = 0;
  while (!oracle::Senseful(home, e)) ++home;
  CNote note(home, E(e));
  note.SetNoteNr(60 + k);
  return note;
}

// A root spelled in a way its key number cannot take is respelled to the one
// spelling whose count lies in -6..5, and that count is returned.
TEST(KeySignCount, UnsensefulRootIsRespelled) {
  for (int basic : {0, 1, 2, 4})
    for (int k = 0; k < 12; ++k)
      for (int e = 0; e <= 4; ++e) {
        if (oracle::Senseful(k, e)) continue;
        int expectedEnh = -1;
        for (int s : oracle::SensefulSpellings(k)) {
          int count = oracle::SignCount(k, s, basic);
          if (count >= -6 && count <= 5) expectedEnh = s;
        }
        ASSERT_NE(expectedEnh, -1);
        CNote root = Unchecked(k, e);
        ASSERT_EQ(root.Enh(), e);
        EXPECT_EQ(KeySignCount(root, basic), oracle::SignCount(k, expectedEnh, basic))
            << "k=" << k << " e=" << e << " basic=" << basic;
        EXPECT_EQ(root.Enh(), expectedEnh) << "k=" << k << " e=" << e << " basic=" << basic;
      }
}

// A root below note 0 (SetOct below octave -1) has a negative key number; the count
// stays defined and the call returns.
TEST(KeySignCount, NegativeRootTerminates) {
  for (int k = 1; k < 12; ++k)
    for (int e = 0; e <= 4; ++e) {
      CNote root(k, E(e));
      root.SetOct(-2);
      ASSERT_LT(root.NoteNr(), 0);
      int count = KeySignCount(root, 1);
      EXPECT_GE(count, -60);
      EXPECT_LE(count, 60);
    }
}

TEST(KeySignCount, WorkedExamples) {
  struct Case {
    long noteNr;
    TEnh enh;
    int basic;
    int signs;
  } const cases[] = {{60, Enh_Natural, 1, 0},  {67, Enh_Natural, 1, 1}, {62, Enh_Natural, 1, 2},
                     {69, Enh_Natural, 1, 3},  {64, Enh_Natural, 1, 4}, {71, Enh_Natural, 1, 5},
                     {65, Enh_Natural, 1, -1}, {69, Enh_Natural, 2, 0}, {64, Enh_Natural, 2, 1},
                     {62, Enh_Natural, 2, -1}, {61, Enh_Sharp, 1, 7},   {61, Enh_Flat, 1, -5},
                     {66, Enh_Sharp, 1, 6},    {66, Enh_Flat, 1, -6},   {71, Enh_Natural, 4, 1},
                     {64, Enh_Natural, 4, 0},  {255, Enh_Flat, 1, -3},  {60, Enh_DoubleFlat, 1, -12}};
  for (Case c : cases) EXPECT_EQ(KeySignCount(CNote(c.noteNr, c.enh), c.basic), c.signs) << c.noteNr;
}

} // namespace
