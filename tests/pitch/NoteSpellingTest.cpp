// Spelling rules of notes, checked against the letter model of SpellingOracle.h.
#include "support/SpellingOracle.h"

#include <tonvex/Note.h>

#include <gtest/gtest.h>

namespace {

constexpr int AllSpellings[] = {-1, 0, 1, 2, 3, 4, 5};
TEnh E(int e) { return static_cast<TEnh>(e); }

// Key numbers 0..11 plus values outside that behave like D.
std::vector<int> KeyNumbers() {
  std::vector<int> keys;
  for (int k = -13; k <= 24; ++k) keys.push_back(k);
  keys.push_back(255);
  return keys;
}

TEST(NoteSpelling, SensefulSpellingsAreExactlyTheLetterSpellings) {
  for (int k : KeyNumbers())
    for (int e : AllSpellings)
      EXPECT_EQ(IsSensefulEnhForKeyNr(k, E(e)), oracle::Senseful(k, e)) << "k=" << k << " e=" << e;
}

// One step toward the flats goes to the next flatter senseful spelling; where there
// is none it gives the flattest one (or keeps it). Toward the sharps likewise.
TEST(NoteSpelling, ShiftsStepToTheNeighbouringSensefulSpelling) {
  for (int k : KeyNumbers()) {
    std::vector<int> senseful = oracle::SensefulSpellings(k);
    for (int e = 0; e <= 4; ++e) {
      int flatter = senseful.front();
      for (int s : senseful)
        if (s < e) flatter = s;
      int sharper = senseful.back();
      for (auto it = senseful.rbegin(); it != senseful.rend(); ++it)
        if (*it > e) sharper = *it;
      EXPECT_EQ(EnhShiftToFlats(k, E(e)), flatter) << "k=" << k << " e=" << e;
      EXPECT_EQ(EnhShiftToSharps(k, E(e)), sharper) << "k=" << k << " e=" << e;
    }
  }
}

TEST(NoteSpelling, SpellingsOutsideTheRangeShiftToASensefulSpelling) {
  for (int k : KeyNumbers())
    for (int e : {-1, 5, 100}) {
      EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShiftToFlats(k, E(e)))) << k << " " << e;
      EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShiftToSharps(k, E(e)))) << k << " " << e;
      EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShift(k, E(e)))) << k << " " << e;
    }
  // A negative spelling asks for the sharp end in the rows that say so.
  EXPECT_EQ(EnhShiftToSharps(0, E(-1)), Enh_Sharp);
  EXPECT_EQ(EnhShiftToSharps(2, E(-1)), Enh_DoubleSharp);
  EXPECT_EQ(EnhShiftToSharps(1, E(-1)), Enh_DoubleSharp);
}

// The other spelling: sharp-side spellings (and E and B natural) go flatward.
TEST(NoteSpelling, EnhShiftTogglesBetweenSpellings) {
  for (int k = 0; k < 12; ++k)
    for (int e = 0; e <= 4; ++e) {
      bool sharpSide = e >= 3 || ((k == 4 || k == 11) && e == 2);
      TEnh expected = sharpSide ? EnhShiftToFlats(k, E(e)) : EnhShiftToSharps(k, E(e));
      EXPECT_EQ(EnhShift(k, E(e)), expected) << "k=" << k << " e=" << e;
      EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShift(k, E(e))));
    }
  EXPECT_EQ(EnhShift(1, Enh_Sharp), Enh_Flat);
  EXPECT_EQ(EnhShift(1, Enh_Flat), Enh_Sharp);
  EXPECT_EQ(EnhShift(0, Enh_Natural), Enh_Sharp);
  EXPECT_EQ(EnhShift(0, Enh_Sharp), Enh_Natural);
  EXPECT_EQ(EnhShift(2, Enh_Natural), Enh_DoubleSharp);
  EXPECT_EQ(EnhShift(2, Enh_DoubleSharp), Enh_Natural);
  EXPECT_EQ(EnhShift(4, Enh_Natural), Enh_Flat);
  EXPECT_EQ(EnhShift(4, Enh_Flat), Enh_Natural);
}

// Construction checks the spelling: senseful spellings stay, a natural black key
// takes the C major spelling, anything else is shifted once.
TEST(NoteSpelling, ConstructionMakesEverySpellingSenseful) {
  const TEnh cMajor[12] = {Enh_Natural, Enh_Sharp,   Enh_Natural, Enh_Flat,    Enh_Natural, Enh_Natural,
                           Enh_Sharp,   Enh_Natural, Enh_Flat,    Enh_Natural, Enh_Flat,    Enh_Natural};
  for (long n = 0; n <= 127; ++n)
    for (int e : AllSpellings) {
      int k = static_cast<int>(n % 12);
      CNote note(n, E(e));
      TEnh expected = oracle::Senseful(k, e) ? E(e) : (e == 2 ? cMajor[k] : EnhShift(k, E(e)));
      EXPECT_EQ(note.Enh(), expected) << "n=" << n << " e=" << e;
      EXPECT_TRUE(note.HasSensefulEnh());
      EXPECT_EQ(note.NoteNr(), n);
    }
}

TEST(NoteSpelling, WorkedExamples) {
  EXPECT_EQ(CNote(61, Enh_Natural).Enh(), Enh_Sharp);
  EXPECT_EQ(CNote(63, Enh_Natural).Enh(), Enh_Flat);
  EXPECT_EQ(CNote(60, Enh_Flat).Enh(), Enh_Natural);
  EXPECT_EQ(CNote(60, Enh_DoubleSharp).Enh(), Enh_Sharp);
  EXPECT_EQ(CNote(68, Enh_DoubleFlat).Enh(), Enh_Flat);
  EXPECT_EQ(CNote(68, Enh_DoubleSharp).Enh(), Enh_Sharp);
  EXPECT_EQ(MakeSensefulEnhForKeyNr(1, Enh_Natural), Enh_Natural);
  for (int k = -3; k < 15; ++k)
    for (int e : AllSpellings) EXPECT_EQ(MakeSensefulEnhForKeyNr(k, E(e)), e);
}

TEST(NoteSpelling, UndefinedNoteIsSpelledFlat) {
  EXPECT_EQ(CNote_Undef.NoteNr(), 255);
  EXPECT_EQ(CNote_Undef.Enh(), Enh_Flat);
}

TEST(NoteSpelling, SpellingOperationsRewriteTheMutableSpelling) {
  const CNote note(61, Enh_Sharp);
  note.EnhShift();
  EXPECT_EQ(note.Enh(), Enh_Flat);
  note.EnhShiftToSharps();
  EXPECT_EQ(note.Enh(), Enh_Sharp);
  note.EnhShiftToSharps();
  EXPECT_EQ(note.Enh(), Enh_DoubleSharp);
  note.EnhShiftToFlats();
  EXPECT_EQ(note.Enh(), Enh_Sharp);
  note.SetEnh(Enh_Natural); // checked: C major spelling of C#
  EXPECT_EQ(note.Enh(), Enh_Sharp);
  note.SetEnh(Enh_DoubleFlat); // not senseful on C#: shifted once, sharpward to Db
  EXPECT_EQ(note.Enh(), Enh_Flat);
}

// Setters that do not check the spelling leave it alone until CheckEnh.
TEST(NoteSpelling, UncheckedSettersKeepTheSpelling) {
  CNote note(60, Enh_Natural);
  note.SetNoteNr(61);
  EXPECT_EQ(note.Enh(), Enh_Natural);
  EXPECT_FALSE(note.HasSensefulEnh());
  note.CheckEnh();
  EXPECT_EQ(note.Enh(), Enh_Sharp);

  note.SetKeyNr(3);
  EXPECT_EQ(note.Enh(), Enh_Sharp); // D# is senseful anyway
  note.SetKeyNr(2);
  EXPECT_EQ(note.Enh(), Enh_Sharp);
  note.SetKeyNrAndEnh(2);
  EXPECT_EQ(note.Enh(), Enh_Natural); // a sharp on D is shifted once, flatward

  note.SetNoteNrAndCheckEnh(68); // natural on G#/Ab: the C major spelling
  EXPECT_EQ(note.Enh(), Enh_Flat);
  note.SetNoteNrAndEnh(66, Enh_Natural);
  EXPECT_EQ(note.Enh(), Enh_Sharp);
  note.SetNoteNrAndEnh(66, Enh_Flat);
  EXPECT_EQ(note.Enh(), Enh_Flat);
}

} // namespace
