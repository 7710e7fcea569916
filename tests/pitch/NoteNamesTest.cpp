// Note names in every naming style under every combination of the flags, against
// the letter model, and reading note names back.
#include "support/PrefGuard.h"
#include "support/SpellingOracle.h"

namespace {

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
    using P = CChordnamePref;
    bool const roman = flags & 1, german = flags & 2, bbIsB = flags & 4, bIsH = flags & 8;
    std::tie(P::RomanNames, P::AccidentalsAsLetters, P::Bb_is_B, P::B_is_H) =
        std::make_tuple(roman, german, bbIsB, bIsH);
    for (int k = -12; k < 24; ++k)
      for (int e = -1; e <= 5; ++e) {
        int const pc = oracle::Mod12(k), named = NamedSpelling(pc, e);
        std::string const name = oracle::Name(pc, named, roman, german, bbIsB, bIsH);
        EXPECT_EQ(KeyNrAndEnhToName(k, static_cast<TEnh>(e), DefaultChordnamePref), name)
            << k << " " << e << " " << flags;
        // Without the accidentals: the syllable, the whole German name, the letter
        // (B for key number 10 under Bb_is_B, A sharp too).
        std::string letter = roman ? oracle::Name(pc, named, true).substr(0, 2) : german ? name : name.substr(0, 1);
        if (!roman && !german && bbIsB && pc == 10) letter = "B";
        EXPECT_EQ(KeyNrToNameIgnoringEnh(k, static_cast<TEnh>(e), DefaultChordnamePref), letter) << k << " " << e;
      }
  }
  EXPECT_EQ(CNote_Undef.KeyName(DefaultChordnamePref) + CNote_Undef.OctName(DefaultChordnamePref), "Undefined");
}

// Every English name the library prints, with its octave, reads back as the same
// note under every octave numbering ("B#3" is note 60 again).
TEST(NoteParse, PrintedNamesReadBack) {
  PrefGuard guard;
  for (int numbering = -1; numbering <= 3; ++numbering) { // note 60 is C3, C4, C5; other values C4
    CChordnamePref::NoteNr_60_is = numbering;
    EXPECT_EQ(CNote(60, Enh_Natural).OctName(DefaultChordnamePref), numbering == 0 ? "3" : numbering == 2 ? "5" : "4");
    for (long n = 0; n <= 127; ++n)
      for (int e = 0; e <= 4; ++e) {
        CNote const note(n, static_cast<TEnh>(e));
        std::string const name = note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
        CNote read;
        ASSERT_TRUE(read.SetFromString(name, DefaultChordnamePref)) << name;
        EXPECT_EQ(read, note) << name;
      }
  }
}

// What the printed names do not show: small letters, blanks, the octave read as atoi
// reads it, the clamps of SetOct, B as B flat under Bb_is_B. A failure leaves the
// note, 50 natural, as it was; a bare letter keeps the note's spelling unchecked.
TEST(NoteParse, Corpus) {
  PrefGuard guard;
  struct Case {
    char const* text;
    long noteNr;
    int enh, bbIsB;
  } const corpus[] = {
      {"h2", 59, 2, 0},     {"  d#5", 87, 3, 0}, {"C12", 108, 2, 0},  {"B8", 131, 2, 0},
      {"D-3", -2, 2, 0},    {"C+3", 60, 2, 0},   {"C3xyz", 60, 2, 0}, {"Cis", 24, 2, 0},
      {"C#junk", 25, 3, 0}, {"CB", 24, 2, 0},    {"", 50, 2, 0},      {"Xb3", 50, 2, 0},
      {"\tC3", 50, 2, 0},   {"B3", 70, 2, 1},    {"Bb", 9, 2, 1},     {"C-99999999999999999999", 0, 2, 0}};
  for (Case const& c : corpus) {
    CChordnamePref::Bb_is_B = c.bbIsB;
    CNote note(50, Enh_Natural);
    EXPECT_EQ(note.SetFromString(c.text, DefaultChordnamePref), c.noteNr != 50) << c.text;
    EXPECT_TRUE(note.NoteNr() == c.noteNr && note.Enh() == c.enh) << c.text;
  }
  CNote note(61, Enh_Flat);
  EXPECT_TRUE(note.SetFromString("D", DefaultChordnamePref));
  EXPECT_EQ(note.Enh(), Enh_Flat);
}

} // namespace
