// Notes: note numbers, octaves, order and distances; spelling against the letter
// model of SpellingOracle.h.
#include "support/SpellingOracle.h"

#include <tonvex/Note.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <vector>

namespace {

TEnh E(int e) { return static_cast<TEnh>(e); }

TEST(NoteNumber, EverySetterClampsAndLetsTheUndefinedNumberPass) {
  long const cases[][2] = {{-100000, 0}, {-1, 0},    {0, 0},     {127, 127},     {128, 127},
                           {254, 127},   {255, 255}, {256, 127}, {1L << 40, 127}};
  for (auto const& c : cases) {
    CNote note(c[0], Enh_Natural);
    EXPECT_EQ(note.NoteNr(), c[1]) << c[0];
    note.SetNoteNr(c[0]);
    EXPECT_EQ(note.NoteNr(), c[1]) << c[0];
    note.SetNoteNrAndCheckEnh(c[0]);
    EXPECT_EQ(note.NoteNr(), c[1]) << c[0];
    note.SetNoteNrAndEnh(c[0], Enh_Sharp);
    EXPECT_EQ(note.NoteNr(), c[1]) << c[0];
  }
}

// SetKeyNr keeps the octave of the low eight bits and does not clamp; SetOct counts
// octave -1 from note 0, puts octaves above 9 into 8 and leaves minus the key number
// below -1.
TEST(NoteNumber, SetKeyNrAndSetOct) {
  for (long n : {0L, 11L, 12L, 64L, 127L, 255L})
    for (int k = -25; k <= 25; ++k) {
      CNote note(n, Enh_Natural);
      note.SetKeyNr(k);
      EXPECT_EQ(note.NoteNr(), (n & 0xFF) / 12 * 12 + oracle::Mod12(k)) << n << " " << k;
    }
  for (long n = 0; n <= 127; ++n)
    for (int oct = -4; oct <= 13; ++oct) {
      CNote note(n, Enh_Natural);
      TEnh const before = note.Enh();
      note.SetOct(oct);
      long const k = n % 12;
      EXPECT_EQ(note.NoteNr(), oct < -1 ? -k : (oct <= 9 ? k + 12 * oct + 12 : k + 108)) << n << " " << oct;
      EXPECT_EQ(note.Enh(), before);
      EXPECT_EQ(note.IsBlackKey(), note.NoteNr() >= 0 && (k == 1 || k == 3 || k == 6 || k == 8 || k == 10));
    }
}

// Signed shortest step from one pitch class to another, ties (the tritone) down.
int Shortest(int from, int to) {
  int const up = oracle::Mod12(to - from);
  return up < 6 ? up : up - 12;
}

// Every pair of notes in and outside 0..127: SetOct below octave -1 leaves minus the
// key number, octave 9 leaves 128..131, SetKeyNr on the undefined note 253.
TEST(NoteNumber, Distances) {
  std::vector<CNote> notes = {CNote_Undef};
  for (long n = 0; n <= 127; ++n) notes.push_back(CNote(n, Enh_Natural));
  for (int k = 0; k < 12; ++k)
    for (int oct : {-2, 9}) {
      notes.push_back(CNote(k, Enh_Natural));
      notes.back().SetOct(oct);
    }
  notes.push_back(CNote_Undef);
  notes.back().SetKeyNr(1);
  for (CNote const& a : notes)
    for (CNote const& b : notes) {
      int const ka = oracle::Mod12(static_cast<int>(a.NoteNr())), kb = oracle::Mod12(static_cast<int>(b.NoteNr()));
      ASSERT_EQ(IntvlFromTo(a, b), b.NoteNr() - a.NoteNr()) << a << " " << b;
      ASSERT_EQ(DistanceBetween(a, b), std::labs(b.NoteNr() - a.NoteNr())) << a << " " << b;
      ASSERT_EQ(KeyIntvlFromTo(a, b), kb - ka) << a << " " << b;
      ASSERT_EQ(AbsKeyIntvlFromTo(a, b), oracle::Mod12(kb - ka)) << a << " " << b;
      ASSERT_EQ(KeyDistanceBetween(a, b), std::abs(Shortest(ka, kb))) << a << " " << b;
      ASSERT_EQ(SmallestKeyIntvlBetween(a, b), Shortest(ka, kb)) << a << " " << b;
    }
}

// Key numbers 0..11 plus values outside that behave like D.
std::vector<int> KeyNumbers() {
  std::vector<int> keys = {255};
  for (int k = -13; k <= 24; ++k) keys.push_back(k);
  return keys;
}

// One step toward the flats goes to the next flatter senseful spelling, else to the
// flattest; toward the sharps likewise. EnhShift goes flatward from the sharp side
// (and from E and B natural), else sharpward. Spellings outside 0..4 shift to a
// senseful one.
TEST(NoteSpelling, SensefulSpellingsAndShifts) {
  for (int k : KeyNumbers()) {
    std::vector<int> const senseful = oracle::SensefulSpellings(k);
    for (int e = -1; e <= 5; ++e) {
      EXPECT_EQ(IsSensefulEnhForKeyNr(k, E(e)), oracle::Senseful(k, e)) << k << " " << e;
      EXPECT_EQ(MakeSensefulEnhForKeyNr(k, E(e)), e) << "returns the spelling unchanged";
      if (e < 0 || e > 4) {
        EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShiftToFlats(k, E(e)))) << k << " " << e;
        EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShiftToSharps(k, E(e)))) << k << " " << e;
        EXPECT_TRUE(IsSensefulEnhForKeyNr(k, EnhShift(k, E(e)))) << k << " " << e;
        continue;
      }
      int flatter = senseful.front(), sharper = senseful.back();
      for (int s : senseful)
        if (s < e) flatter = s;
      for (auto s = senseful.rbegin(); s != senseful.rend(); ++s)
        if (*s > e) sharper = *s;
      EXPECT_EQ(EnhShiftToFlats(k, E(e)), flatter) << k << " " << e;
      EXPECT_EQ(EnhShiftToSharps(k, E(e)), sharper) << k << " " << e;
      bool const sharpSide = e >= 3 || ((k == 4 || k == 11) && e == 2);
      EXPECT_TRUE(k < 0 || k > 11 || EnhShift(k, E(e)) == (sharpSide ? flatter : sharper)) << k << " " << e;
    }
  }
  // A negative spelling asks for the sharp end in the rows that say so.
  EXPECT_EQ(EnhShiftToSharps(0, E(-1)), Enh_Sharp);
  EXPECT_EQ(EnhShiftToSharps(1, E(-1)), Enh_DoubleSharp);
}

// Construction checks the spelling: senseful spellings stay, a natural black key
// takes the C major spelling, anything else is shifted once.
TEST(NoteSpelling, ConstructionMakesEverySpellingSenseful) {
  int const cMajor[12] = {2, 3, 2, 1, 2, 2, 3, 2, 1, 2, 1, 2};
  for (long n = 0; n <= 127; ++n)
    for (int e = -1; e <= 5; ++e) {
      int const k = static_cast<int>(n % 12);
      CNote const note(n, E(e));
      EXPECT_EQ(note.Enh(), oracle::Senseful(k, e) ? E(e) : (e == 2 ? E(cMajor[k]) : EnhShift(k, E(e)))) << n;
      EXPECT_EQ(note.NoteNr(), n);
    }
  EXPECT_EQ(CNote_Undef, CNote(255, Enh_Flat));
}

// The spelling is mutable in a const note; SetEnh checks it, SetNoteNr does not.
TEST(NoteSpelling, CheckedAndUncheckedSetters) {
  const CNote note(61, Enh_Sharp);
  note.EnhShift();
  EXPECT_EQ(note.Enh(), Enh_Flat);
  note.SetEnh(Enh_DoubleFlat); // shifted once, sharpward
  EXPECT_EQ(note.Enh(), Enh_Flat);
  CNote plain(60, Enh_Natural);
  plain.SetNoteNr(61);
  EXPECT_FALSE(plain.HasSensefulEnh());
  plain.CheckEnh();
  EXPECT_EQ(plain.Enh(), Enh_Sharp);
  plain.SetKeyNrAndEnh(2); // a sharp on D, shifted flatward
  EXPECT_EQ(plain.Enh(), Enh_Natural);
  plain.SetNoteNrAndEnh(66, Enh_Natural);
  EXPECT_EQ(plain.Enh(), Enh_Sharp);
}

} // namespace
