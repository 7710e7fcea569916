// The key sign count against the letter model: a key's signs are its tonic letter's
// place on the circle of fifths plus seven per accidental.
#include "support/SpellingOracle.h"
#include "support/TestPrelude.h"

#include "pitch/KeySignCount.h"

namespace {

TEnh E(int e) { return static_cast<TEnh>(e); }

// A note carrying spelling e unchecked on key number k: SetNoteNr keeps the
// spelling of a note on which e was senseful.
CNote Unchecked(int k, int e) {
  int home = 0;
  while (!oracle::Senseful(home, e)) ++home;
  CNote note(home, E(e));
  note.SetNoteNr(60 + k);
  return note;
}

// A senseful root keeps its spelling; one its key number cannot take is respelled
// to the one spelling whose count lies in -6..5, and that count is returned.
TEST(KeySignCount, EveryRootSpellingAndBasicChord) {
  for (int basic = -1; basic <= 8; ++basic)
    for (int k = 0; k < 12; ++k)
      for (int e = 0; e <= 4; ++e) {
        int expected = e;
        if (!oracle::Senseful(k, e))
          for (int s : oracle::SensefulSpellings(k))
            if (oracle::SignCount(k, s, basic) >= -6 && oracle::SignCount(k, s, basic) <= 5) expected = s;
        ASSERT_TRUE(oracle::Senseful(k, expected)) << k << " " << e << " " << basic;
        CNote root = Unchecked(k, e);
        EXPECT_EQ(KeySignCount(root, basic), oracle::SignCount(k, expected, basic)) << k << " " << e << " " << basic;
        EXPECT_EQ(root.Enh(), expected) << k << " " << e << " " << basic;
      }
  EXPECT_EQ(KeySignCount(CNote_Undef, 1), -3); // E flat major
}

} // namespace
