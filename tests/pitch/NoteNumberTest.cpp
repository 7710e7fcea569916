// Note numbers, key numbers, octaves, comparisons and distances.
#include <tonvex/Note.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <vector>

namespace {

TEST(NoteNumber, EverySetterClampsAndLetsTheUndefinedNumberPass) {
  struct Case {
    long in;
    long out;
  } const cases[] = {{-100000, 0}, {-5, 0},    {-1, 0},    {0, 0},     {60, 60},   {127, 127},
                     {128, 127},   {254, 127}, {255, 255}, {256, 127}, {300, 127}, {1L << 40, 127}};
  for (Case c : cases) {
    EXPECT_EQ(CNote(c.in, Enh_Natural).NoteNr(), c.out) << c.in;
    CNote note;
    note.SetNoteNr(c.in);
    EXPECT_EQ(note.NoteNr(), c.out) << c.in;
    note.SetNoteNrAndCheckEnh(c.in);
    EXPECT_EQ(note.NoteNr(), c.out) << c.in;
    note.SetNoteNrAndEnh(c.in, Enh_Sharp);
    EXPECT_EQ(note.NoteNr(), c.out) << c.in;
  }
}

TEST(NoteNumber, AccessorsAndDefaults) {
  CNote note;
  EXPECT_EQ(note.NoteNr(), 0);
  EXPECT_EQ(note.Enh(), Enh_Natural);
  CNote high(127, Enh_Natural);
  EXPECT_EQ(high.KeyNr(), 7);
  EXPECT_EQ(high.Oct(), 10);
  high.Clear();
  EXPECT_EQ(high, CNote());
  CNote sharp(61, Enh_Sharp);
  sharp.Clear();
  EXPECT_EQ(sharp.Enh(), Enh_Natural);
}

// SetKeyNr keeps the octave of the low eight bits of the note number and does not
// clamp afterwards.
TEST(NoteNumber, SetKeyNrStaysInTheOctave) {
  for (long n : {0L, 11L, 12L, 64L, 127L, 255L})
    for (int k = -25; k <= 25; ++k) {
      CNote note(n, Enh_Natural);
      note.SetKeyNr(k);
      long expected = (n & 0xFF) / 12 * 12 + ((k % 12) + 12) % 12;
      EXPECT_EQ(note.NoteNr(), expected) << "n=" << n << " k=" << k;
    }
  CNote e4(64, Enh_Natural);
  e4.SetKeyNr(1);
  EXPECT_EQ(e4.NoteNr(), 61);
  e4.SetKeyNr(-1);
  EXPECT_EQ(e4.NoteNr(), 71);
  CNote undefined = CNote_Undef;
  undefined.SetKeyNr(1);
  EXPECT_EQ(undefined.NoteNr(), 253);
}

TEST(NoteNumber, SetOctUsesItsOwnNumberingAndDoesNotClamp) {
  for (long n = 0; n <= 127; ++n)
    for (int oct = -4; oct <= 13; ++oct) {
      CNote note(n, Enh_Natural);
      TEnh before = note.Enh();
      note.SetOct(oct);
      long k = n % 12;
      long expected = oct < -1 ? -k : (oct <= 9 ? k + 12 * oct + 12 : k + 108);
      EXPECT_EQ(note.NoteNr(), expected) << "n=" << n << " oct=" << oct;
      EXPECT_EQ(note.Enh(), before);
    }
  CNote cSharp(61, Enh_Sharp);
  cSharp.SetOct(10);
  EXPECT_EQ(cSharp.NoteNr(), 109);
  cSharp.SetOct(-2);
  EXPECT_EQ(cSharp.NoteNr(), -1);
  cSharp.SetOct(-1); // the key number of note -1 is -1 as well
  EXPECT_EQ(cSharp.NoteNr(), -1);
  CNote again(61, Enh_Sharp);
  again.SetOct(-1);
  EXPECT_EQ(again.NoteNr(), 1);
  CNote b(11, Enh_Natural);
  b.SetOct(9);
  EXPECT_EQ(b.NoteNr(), 131);
}

TEST(NoteNumber, BlackKeys) {
  for (long n = 0; n <= 127; ++n) {
    int k = static_cast<int>(n % 12);
    bool black = k == 1 || k == 3 || k == 6 || k == 8 || k == 10;
    EXPECT_EQ(CNote(n, Enh_Natural).IsBlackKey(), black) << n;
  }
  CNote negative(61, Enh_Sharp);
  negative.SetOct(-2); // note number -1
  EXPECT_FALSE(negative.IsBlackKey());
}

TEST(NoteNumber, OrderIsNoteNumberThenSpelling) {
  std::vector<CNote> notes = {CNote(62, Enh_DoubleFlat), CNote(61, Enh_Sharp),       CNote(60, Enh_Natural),
                              CNote(61, Enh_Flat),       CNote(61, Enh_DoubleSharp), CNote(0, Enh_Natural)};
  std::sort(notes.begin(), notes.end());
  std::vector<CNote> expected = {CNote(0, Enh_Natural), CNote(60, Enh_Natural),     CNote(61, Enh_Flat),
                                 CNote(61, Enh_Sharp),  CNote(61, Enh_DoubleSharp), CNote(62, Enh_DoubleFlat)};
  EXPECT_EQ(notes, expected);
  EXPECT_TRUE(CNote(61, Enh_Flat) < CNote(61, Enh_Sharp));
  EXPECT_FALSE(CNote(61, Enh_Sharp) < CNote(61, Enh_Sharp));
  EXPECT_NE(CNote(61, Enh_Flat), CNote(61, Enh_Sharp));
  EXPECT_EQ(CNote(61, Enh_Flat), CNote(61, Enh_Flat));
}

int Shortest(int from, int to) {
  // Signed shortest step from one pitch class to another, ties (the tritone) down.
  for (int d = 0; d <= 6; ++d) {
    if ((from - d + 120) % 12 == to) return -d;
    if (d < 6 && (from + d) % 12 == to) return d;
  }
  return 99;
}

TEST(NoteNumber, DistancesOverAllPairs) {
  for (long a = 0; a <= 127; a += 1)
    for (long b : {0L, 5L, 11L, 12L, 59L, 60L, 66L, 71L, 127L}) {
      CNote na(a, Enh_Natural), nb(b, Enh_Natural);
      int ka = static_cast<int>(a % 12), kb = static_cast<int>(b % 12);
      EXPECT_EQ(IntvlFromTo(na, nb), b - a);
      EXPECT_EQ(DistanceBetween(na, nb), std::labs(b - a));
      EXPECT_EQ(KeyIntvlFromTo(na, nb), kb - ka);
      EXPECT_EQ(AbsKeyIntvlFromTo(na, nb), (kb - ka + 12) % 12);
      EXPECT_EQ(KeyDistanceBetween(na, nb), std::min((kb - ka + 12) % 12, (ka - kb + 12) % 12));
      EXPECT_EQ(SmallestKeyIntvlBetween(na, nb), Shortest(ka, kb)) << a << " " << b;
    }
  CNote c(60, Enh_Natural), fSharp(66, Enh_Sharp), g(67, Enh_Natural), f(65, Enh_Natural), b(71, Enh_Natural);
  EXPECT_EQ(SmallestKeyIntvlBetween(c, fSharp), -6);
  EXPECT_EQ(SmallestKeyIntvlBetween(fSharp, c), -6);
  EXPECT_EQ(SmallestKeyIntvlBetween(c, g), -5);
  EXPECT_EQ(SmallestKeyIntvlBetween(c, f), 5);
  EXPECT_EQ(KeyDistanceBetween(c, b), 1);
  EXPECT_EQ(KeyDistanceBetween(c, fSharp), 6);
  EXPECT_EQ(IntvlFromTo(CNote(0, Enh_Natural), CNote_Undef), 255);
  EXPECT_EQ(IntvlFromTo(CNote_Undef, CNote(0, Enh_Natural)), -255);
}

// SetOct below octave -1 leaves minus the key number (0..-11), octave 9 leaves
// 128..131 and SetKeyNr on the undefined note 253: the key number differences and
// distances stay in their ranges, counted by pitch class.
TEST(NoteNumber, DistancesOfNoteNumbersOutsideTheRange) {
  std::vector<CNote> notes;
  for (int k = 0; k < 12; ++k) {
    CNote below(k, Enh_Natural);
    below.SetOct(-2);
    CNote above(k, Enh_Natural);
    above.SetOct(9);
    notes.insert(notes.end(), {below, above, CNote(60 + k, Enh_Natural)});
  }
  CNote undefinedMoved = CNote_Undef;
  undefinedMoved.SetKeyNr(1);
  notes.insert(notes.end(), {undefinedMoved, CNote_Undef});
  ASSERT_EQ(notes[3 * 11].NoteNr(), -11);
  ASSERT_EQ(notes[3 * 11 + 1].NoteNr(), 131);
  ASSERT_EQ(undefinedMoved.NoteNr(), 253);
  for (CNote const& a : notes)
    for (CNote const& b : notes) {
      int ka = static_cast<int>((a.NoteNr() % 12 + 12) % 12), kb = static_cast<int>((b.NoteNr() % 12 + 12) % 12);
      EXPECT_EQ(KeyIntvlFromTo(a, b), kb - ka) << a << " " << b;
      EXPECT_EQ(AbsKeyIntvlFromTo(a, b), (kb - ka + 12) % 12) << a << " " << b;
      EXPECT_EQ(KeyDistanceBetween(a, b), std::min((kb - ka + 12) % 12, (ka - kb + 12) % 12)) << a << " " << b;
      EXPECT_EQ(SmallestKeyIntvlBetween(a, b), Shortest(ka, kb)) << a << " " << b;
    }
}

} // namespace
