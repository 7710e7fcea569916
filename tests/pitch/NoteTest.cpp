// Notes: note numbers, octaves and distances; spelling against the letter model.
#include "support/SpellingOracle.h"
#include "support/TestPrelude.h"

namespace {

using oracle::Mod12;
TEnh E(int e) { return static_cast<TEnh>(e); }

// Every setter clamps to 0..127 and lets 255 pass. SetKeyNr keeps the octave of the
// low eight bits; SetOct counts octave -1 from note 0, puts octaves above 9 into 8
// and leaves minus the key number below -1; neither clamps nor respells.
TEST(NoteNumber, SettersAndOctaves) {
  for (long n : {-100000L, -1L, 0L, 127L, 128L, 254L, 255L, 256L, 1L << 40}) {
    long const clamped = n == 255 ? 255 : n < 0 ? 0 : n > 127 ? 127 : n;
    CNote note(n, Enh_Natural);
    note.SetNoteNr(n);
    EXPECT_EQ(note.NoteNr(), clamped) << n;
    note.SetNoteNrAndEnh(n, Enh_Sharp);
    EXPECT_EQ(note.NoteNr(), clamped) << n;
    for (int k = -25; k <= 25; ++k) {
      note.SetNoteNr(n);
      note.SetKeyNr(k);
      EXPECT_EQ(note.NoteNr(), (clamped & 0xFF) / 12 * 12 + Mod12(k)) << n << " " << k;
    }
  }
  for (long n = 0; n <= 127; ++n)
    for (int oct = -4; oct <= 13; ++oct) {
      CNote note(n, Enh_Sharp);
      TEnh const before = note.Enh();
      note.SetOct(oct);
      long const k = n % 12;
      EXPECT_EQ(note.NoteNr(), oct < -1 ? -k : (oct <= 9 ? k + 12 * oct + 12 : k + 108)) << n << " " << oct;
      EXPECT_EQ(note.Enh(), before);
      EXPECT_EQ(note.IsBlackKey(), note.NoteNr() >= 0 && (k == 1 || k == 3 || k == 6 || k == 8 || k == 10));
    }
}

// Every pair of notes in and outside 0..127 (SetOct leaves -11..0 and 128..131,
// SetKeyNr on the undefined note 253); key distances count by pitch class, the
// shortest step down at the tritone.
TEST(NoteNumber, Distances) {
  std::vector<CNote> notes = {CNote_Undef, CNote_Undef};
  notes.back().SetKeyNr(1);
  for (long n = 0; n <= 127; ++n) notes.push_back(CNote(n, Enh_Natural));
  for (int k = 0; k < 24; ++k) {
    notes.push_back(CNote(k % 12, Enh_Natural));
    notes.back().SetOct(k < 12 ? -2 : 9);
  }
  for (CNote const& a : notes)
    for (CNote const& b : notes) {
      int const up = Mod12(static_cast<int>(b.NoteNr() - a.NoteNr()));
      ASSERT_EQ(IntvlFromTo(a, b), b.NoteNr() - a.NoteNr()) << a << " " << b;
      ASSERT_EQ(DistanceBetween(a, b), std::labs(b.NoteNr() - a.NoteNr())) << a << " " << b;
      ASSERT_EQ(KeyIntvlFromTo(a, b), Mod12(static_cast<int>(b.NoteNr())) - Mod12(static_cast<int>(a.NoteNr())));
      ASSERT_EQ(AbsKeyIntvlFromTo(a, b), up) << a << " " << b;
      ASSERT_EQ(SmallestKeyIntvlBetween(a, b), up < 6 ? up : up - 12) << a << " " << b;
      ASSERT_EQ(KeyDistanceBetween(a, b), up <= 6 ? up : 12 - up) << a << " " << b;
    }
}

// One step toward the flats goes to the next flatter senseful spelling, else to the
// flattest; toward the sharps likewise. EnhShift goes flatward from the sharp side
// (and from E and B natural). Any spelling outside 0..4 shifts to a senseful one.
// Key numbers outside 0..11 behave like D.
TEST(NoteSpelling, SensefulSpellingsAndShifts) {
  for (int k = -13; k <= 255; k = k == 24 ? 255 : k + 1) {
    std::vector<int> const senseful = oracle::SensefulSpellings(k);
    for (int e = -1; e <= 5; ++e) {
      EXPECT_EQ(IsSensefulEnhForKeyNr(k, E(e)), oracle::Senseful(k, e)) << k << " " << e;
      EXPECT_EQ(MakeSensefulEnhForKeyNr(k, E(e)), e) << "returns the spelling unchanged";
      if (e < 0 || e > 4) {
        for (TEnh (*shift)(int, TEnh) : {&EnhShiftToFlats, &EnhShiftToSharps, &EnhShift})
          EXPECT_TRUE(oracle::Senseful(k, shift(k, E(e)))) << k << " " << e;
        continue;
      }
      int flatter = senseful.front(), sharper = senseful.back();
      for (int s : senseful) flatter = s < e ? s : flatter;
      for (auto s = senseful.rbegin(); s != senseful.rend(); ++s) sharper = *s > e ? *s : sharper;
      EXPECT_EQ(EnhShiftToFlats(k, E(e)), flatter) << k << " " << e;
      EXPECT_EQ(EnhShiftToSharps(k, E(e)), sharper) << k << " " << e;
      bool const sharpSide = e >= 3 || ((k == 4 || k == 11) && e == 2);
      EXPECT_TRUE(k < 0 || k > 11 || EnhShift(k, E(e)) == (sharpSide ? flatter : sharper)) << k << " " << e;
    }
  }
  EXPECT_EQ(EnhShiftToSharps(1, E(-1)), Enh_DoubleSharp); // a negative spelling asks for the sharp end
}

// Construction checks the spelling: senseful spellings stay, a natural black key
// takes the C major spelling, anything else is shifted once. The spelling is
// mutable in a const note; setters without "Check" leave it alone.
TEST(NoteSpelling, CheckedAndUncheckedSpellings) {
  int const cMajor[12] = {2, 3, 2, 1, 2, 2, 3, 2, 1, 2, 1, 2};
  for (long n = 0; n <= 127; ++n)
    for (int e = -1; e <= 5; ++e) {
      int const k = static_cast<int>(n % 12);
      EXPECT_EQ(CNote(n, E(e)).Enh(), oracle::Senseful(k, e) ? E(e) : (e == 2 ? E(cMajor[k]) : EnhShift(k, E(e))));
    }
  EXPECT_EQ(CNote_Undef, CNote(255, Enh_Flat));
  const CNote note(61, Enh_Sharp);
  note.EnhShift();
  EXPECT_EQ(note.Enh(), Enh_Flat);
  CNote plain(60, Enh_Natural);
  plain.SetNoteNr(61);
  EXPECT_FALSE(plain.HasSensefulEnh());
  plain.CheckEnh();
  EXPECT_EQ(plain.Enh(), Enh_Sharp);
  plain.SetKeyNrAndEnh(2); // a sharp on D, shifted flatward
  EXPECT_EQ(plain.Enh(), Enh_Natural);
}

} // namespace
