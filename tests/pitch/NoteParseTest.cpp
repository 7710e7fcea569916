// Reading note names: the corpus covers every branch of the parser and its odd
// cases (accidentals that wrap, octaves read by atoi, the SetOct clamps).
#include "support/PrefGuard.h"

#include <tonvex/Note.h>

#include <gtest/gtest.h>

#include <string>

namespace {

struct ParseCase {
  const char* text;
  int noteNr60Is;
  int bbIsB;
  bool ok;
  long noteNr; // expected note number (unchanged note when !ok)
  TEnh enh;    // expected spelling
};

// The note before parsing: 50 (D), spelled natural.
constexpr long Before = 50;

const ParseCase Corpus[] = {
    // Plain letters and octaves with the default numbering (note 60 is C3).
    {"C3", 0, 0, true, 60, Enh_Natural},
    {"c3", 0, 0, true, 60, Enh_Natural},
    {"A4", 0, 0, true, 81, Enh_Natural},
    {"H2", 0, 0, true, 59, Enh_Natural},
    {"h2", 0, 0, true, 59, Enh_Natural},
    {"B2", 0, 0, true, 59, Enh_Natural},
    {"G#-2", 0, 0, true, 8, Enh_Sharp},
    {"  d#5", 0, 0, true, 87, Enh_Sharp},
    {"Eb", 0, 0, true, 3, Enh_Flat},
    {"E", 0, 0, true, 4, Enh_Natural},
    {"C12", 0, 0, true, 108, Enh_Natural},
    {"C9", 0, 0, true, 108, Enh_Natural}, // octave 10 after the shift: k + 108
    {"C8", 0, 0, true, 120, Enh_Natural},
    {"G8", 0, 0, true, 127, Enh_Natural},
    {"B8", 0, 0, true, 131, Enh_Natural}, // octave 9 of B: 131, not clamped
    {"C-3", 0, 0, true, 0, Enh_Natural},  // octave below -1: minus the key number
    {"D-3", 0, 0, true, -2, Enh_Natural},
    {"D-2", 0, 0, true, 2, Enh_Natural},
    // Accidentals move the key number with wrap-around; the octave comes after.
    {"Cb3", 0, 0, true, 71, Enh_Flat},
    {"B#3", 0, 0, true, 60, Enh_Sharp},
    {"Cbb3", 0, 0, true, 70, Enh_DoubleFlat},
    {"Bx3", 0, 0, true, 61, Enh_DoubleSharp},
    {"Fx3", 0, 0, true, 67, Enh_DoubleSharp},
    {"Ebb", 0, 0, true, 2, Enh_DoubleFlat},
    {"Abb2", 0, 0, true, 55, Enh_DoubleFlat},
    {"Cx", 0, 0, true, 2, Enh_DoubleSharp},
    {"C#", 0, 0, true, 1, Enh_Sharp},
    {"Gb4", 0, 0, true, 78, Enh_Flat},
    // A spelling the key number cannot take is corrected by CheckEnh.
    {"Ab", 0, 0, true, 8, Enh_Flat},
    {"Dbb", 0, 0, true, 0, Enh_DoubleFlat},
    // The octave is read like atoi: white space, sign, trailing characters.
    {"C 3", 0, 0, true, 60, Enh_Natural},
    {"C+3", 0, 0, true, 60, Enh_Natural},
    {"C3xyz", 0, 0, true, 60, Enh_Natural},
    {"Cis", 0, 0, true, 24, Enh_Natural}, // no digits: octave 0
    {"C#junk", 0, 0, true, 25, Enh_Sharp},
    {"CB", 0, 0, true, 24, Enh_Natural}, // 'B' is no accidental
    {"C99999999999999999999", 0, 0, true, 108, Enh_Natural},
    {"C-99999999999999999999", 0, 0, true, 0, Enh_Natural},
    // Octave numbering preferences.
    {"C4", 1, 0, true, 60, Enh_Natural},
    {"C5", 2, 0, true, 60, Enh_Natural},
    {"C3", 2, 0, true, 36, Enh_Natural},
    {"C4", 7, 0, true, 60, Enh_Natural}, // any other value: like 1
    {"C-1", 1, 0, true, 0, Enh_Natural},
    {"C-2", 1, 0, true, 0, Enh_Natural},
    // Bb_is_B: the letter B means B flat.
    {"B3", 0, 1, true, 70, Enh_Natural},
    {"H3", 0, 1, true, 71, Enh_Natural},
    {"Bb", 0, 1, true, 9, Enh_Natural}, // 9 spelled flat, corrected to A natural
    // Failures leave the note as it was.
    {"", 0, 0, false, Before, Enh_Natural},
    {"   ", 0, 0, false, Before, Enh_Natural},
    {"Xb3", 0, 0, false, Before, Enh_Natural},
    {"I3", 0, 0, false, Before, Enh_Natural},
    {"3C", 0, 0, false, Before, Enh_Natural},
    {"#C", 0, 0, false, Before, Enh_Natural},
    {"\tC3", 0, 0, false, Before, Enh_Natural}, // only blanks are skipped
    {"\xC3\xA9", 0, 0, false, Before, Enh_Natural},
};

TEST(NoteParse, Corpus) {
  for (ParseCase const& c : Corpus) {
    PrefGuard guard;
    CChordnamePref::NoteNr_60_is = c.noteNr60Is;
    CChordnamePref::Bb_is_B = c.bbIsB;
    CNote note(Before, Enh_Natural);
    EXPECT_EQ(note.SetFromString(c.text, DefaultChordnamePref), c.ok) << '"' << c.text << '"';
    EXPECT_EQ(note.NoteNr(), c.noteNr) << '"' << c.text << '"';
    EXPECT_EQ(note.Enh(), c.enh) << '"' << c.text << '"';
  }
}

// A bare letter keeps whatever spelling the note had, unchecked.
TEST(NoteParse, BareLetterKeepsThePreviousSpelling) {
  CNote note(61, Enh_Flat);
  EXPECT_TRUE(note.SetFromString("C", DefaultChordnamePref));
  EXPECT_EQ(note.NoteNr(), 0);
  EXPECT_EQ(note.Enh(), Enh_Flat);
  EXPECT_FALSE(note.HasSensefulEnh());
  EXPECT_TRUE(note.SetFromString("D3", DefaultChordnamePref));
  EXPECT_EQ(note.NoteNr(), 62);
  EXPECT_EQ(note.Enh(), Enh_Flat);
}

TEST(NoteParse, EmbeddedZeroEndsTheOctave) {
  CNote note;
  EXPECT_TRUE(note.SetFromString(std::string("C3\0"
                                             "5",
                                             4),
                                 DefaultChordnamePref));
  EXPECT_EQ(note.NoteNr(), 60);
}

// Every English name the library prints, with its octave, reads back as the same
// note under every octave numbering.
TEST(NoteParse, PrintedNamesReadBack) {
  for (int numbering = 0; numbering <= 2; ++numbering) {
    PrefGuard guard;
    CChordnamePref::NoteNr_60_is = numbering;
    for (long n = 0; n <= 127; ++n)
      for (int e = 0; e <= 4; ++e) {
        CNote note(n, static_cast<TEnh>(e));
        std::string name = note.KeyName(DefaultChordnamePref) + note.OctName(DefaultChordnamePref);
        // The octave shown is that of the note number, and the parser applies the
        // octave to the key number the accidental leads to: "B#3" is note 60 again.
        CNote read;
        ASSERT_TRUE(read.SetFromString(name, DefaultChordnamePref)) << name;
        EXPECT_EQ(read.NoteNr(), n) << name;
        EXPECT_EQ(read.Enh(), note.Enh()) << name;
      }
  }
}

} // namespace
