// Note names in every naming style under every combination of the flags, against
// the letter model, and reading note names back.
#include "support/PrefGuard.h"
#include "support/SpellingOracle.h"

#include <tonvex/NoteNames.h>

#include <gtest/gtest.h>

#include <string>

namespace {

TEnh E(int e) { return static_cast<TEnh>(e); }

// The spelling a name is made from: a spelling that does not name the key number is
// named like the senseful one on its side (flat side 0..1, sharp side 3..4), a
// natural black key as C# Eb F# G# Bb, spellings outside 0..4 like the natural.
int NamedSpelling(int k, int e) {
  if (e < 0 || e > 4) e = 2;
  if (oracle::Senseful(k, e)) return e;
  if (e == 2) return k == 3 || k == 10 ? 1 : 3;
  return e == 0 ? 1 : e == 1 ? 0 : e == 3 ? 4 : 3;
}

TEST(NoteNames, EveryKeyAndSpellingUnderEveryFlagCombination) {
  PrefGuard guard;
  for (int flags = 0; flags < 16; ++flags) {
    bool const roman = flags & 1, german = flags & 2, bbIsB = flags & 4, bIsH = flags & 8;
    PrefGuard::NoteNaming(roman, german, bbIsB, bIsH);
    for (int k = -12; k < 24; ++k)
      for (int e = -1; e <= 5; ++e) {
        int const pc = oracle::Mod12(k), named = NamedSpelling(pc, e);
        std::string const name = oracle::Name(pc, named, roman, german, bbIsB, bIsH);
        EXPECT_EQ(KeyNrAndEnhToName(k, E(e), DefaultChordnamePref), name) << k << " " << e << " flags " << flags;
        // Without the accidentals: the syllable, the whole German name, the letter.
        std::string letter = roman ? oracle::Name(pc, named, true).substr(0, 2) : german ? name : name.substr(0, 1);
        if (!roman && !german && bbIsB && pc == 10) letter = "B"; // keyed on the key number: A# too
        EXPECT_EQ(KeyNrToNameIgnoringEnh(k, E(e), DefaultChordnamePref), letter) << k << " " << e << " " << flags;
      }
  }
}

TEST(NoteNames, OctavesAndTheUndefinedNote) {
  PrefGuard guard;
  int const shifts[][2] = {{0, -2}, {1, -1}, {2, 0}, {3, -1}, {-1, -1}}; // preference, octave - NoteNr / 12
  for (auto const& s : shifts) {
    CChordnamePref::NoteNr_60_is = s[0];
    for (long n = 0; n <= 127; ++n)
      EXPECT_EQ(CNote(n, Enh_Natural).OctName(DefaultChordnamePref), std::to_string(n / 12 + s[1]));
    EXPECT_EQ(CNote_Undef.OctName(DefaultChordnamePref), "");
  }
  EXPECT_EQ(CNote_Undef.KeyName(DefaultChordnamePref), "Undefined");
  EXPECT_EQ(CNote_Undef.KeyNameWithoutEnh(DefaultChordnamePref), "Undefined");
  EXPECT_EQ(CNote(61, Enh_Flat).KeyNameWithoutEnh(DefaultChordnamePref), "D");
  CNote negative(61, Enh_Sharp);
  negative.SetOct(-2); // note number -1, named by its pitch class 11 as spelled
  EXPECT_EQ(negative.KeyName(DefaultChordnamePref), "Ax");
}

// Every English name the library prints, with its octave, reads back as the same
// note under every octave numbering ("B#3" is note 60 again).
TEST(NoteParse, PrintedNamesReadBack) {
  PrefGuard guard;
  for (int numbering = 0; numbering <= 2; ++numbering) {
    CChordnamePref::NoteNr_60_is = numbering;
    for (long n = 0; n <= 127; ++n)
      for (int e = 0; e <= 4; ++e) {
        CNote const note(n, E(e));
        std::string const name = note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
        CNote read;
        ASSERT_TRUE(read.SetFromString(name, DefaultChordnamePref)) << name;
        EXPECT_EQ(read, note) << name;
      }
  }
}

// What the printed names do not show: small letters and H, blanks, the octave read
// as atoi reads it, the clamps of SetOct, the preferences. A failure leaves the
// note, 50 natural, as it was; a bare letter keeps the note's spelling unchecked.
TEST(NoteParse, Corpus) {
  struct Case {
    char const* text;
    long noteNr;
    int enh;
  } const corpus[] = {{"c3", 60, 2},
                      {"h2", 59, 2},
                      {"  d#5", 87, 3},
                      {"C12", 108, 2},
                      {"C9", 108, 2},
                      {"B8", 131, 2},
                      {"C-3", 0, 2},
                      {"D-3", -2, 2},
                      {"C 3", 60, 2},
                      {"C+3", 60, 2},
                      {"C3xyz", 60, 2},
                      {"Cis", 24, 2},
                      {"C#junk", 25, 3},
                      {"CB", 24, 2},
                      {"", 50, 2},
                      {"Xb3", 50, 2},
                      {"3C", 50, 2},
                      {"\tC3", 50, 2},
                      {"\xC3\xA9", 50, 2},
                      {"C99999999999999999999", 108, 2},
                      {"C-99999999999999999999", 0, 2}};
  for (Case const& c : corpus) {
    CNote note(50, Enh_Natural);
    EXPECT_EQ(note.SetFromString(c.text, DefaultChordnamePref), c.noteNr != 50) << c.text;
    EXPECT_EQ(note.NoteNr(), c.noteNr) << c.text;
    EXPECT_EQ(note.Enh(), c.enh) << c.text;
  }
  CNote note(61, Enh_Flat);
  EXPECT_TRUE(note.SetFromString("D", DefaultChordnamePref));
  EXPECT_EQ(note.Enh(), Enh_Flat);
  PrefGuard guard;
  CChordnamePref::NoteNr_60_is = 7; // any other value than 0 and 2 reads like 1
  EXPECT_TRUE(note.SetFromString("C4", DefaultChordnamePref) && note.NoteNr() == 60);
  CChordnamePref::Bb_is_B = 1; // B is B flat, H is B
  EXPECT_TRUE(note.SetFromString("B4", DefaultChordnamePref) && note.NoteNr() == 70);
  EXPECT_TRUE(note.SetFromString("H4", DefaultChordnamePref) && note.NoteNr() == 71);
  EXPECT_TRUE(note.SetFromString("Bb", DefaultChordnamePref) && note == CNote(9, Enh_Natural));
}

} // namespace
