// Note names in every naming system and under every combination of the flags.
#include "support/PrefGuard.h"

#include <tonvex/NoteNames.h>

#include <gtest/gtest.h>

#include <sstream>

namespace {

TEnh E(int e) { return static_cast<TEnh>(e); }

struct Names {
  const char* english;
  const char* german;
  const char* solfege;
};

// The names of every senseful spelling and of the plain spelling of each key
// number; nullptr where a spelling is not senseful.
struct Row {
  Names cells[5];
  bool present[5];
};
const Row Table[12] = {
    {{{"Dbb", "Deses", "Rebb"}, {}, {"C", "C", "Do"}, {"B#", "Bis", "Ti#"}, {}}, {1, 0, 1, 1, 0}},
    {{{}, {"Db", "Des", "Reb"}, {"C#", "Cis", "Do#"}, {"C#", "Cis", "Do#"}, {"Bx", "Bisis", "Tix"}}, {0, 1, 1, 1, 1}},
    {{{"Ebb", "Eeses", "Mibb"}, {}, {"D", "D", "Re"}, {}, {"Cx", "Cisis", "Dox"}}, {1, 0, 1, 0, 1}},
    {{{"Fbb", "Feses", "Fabb"}, {"Eb", "Es", "Mib"}, {"Eb", "Es", "Mib"}, {"D#", "Dis", "Re#"}, {}}, {1, 1, 1, 1, 0}},
    {{{}, {"Fb", "Fes", "Fab"}, {"E", "E", "Mi"}, {}, {"Dx", "Disis", "Rex"}}, {0, 1, 1, 0, 1}},
    {{{"Gbb", "Geses", "Sobb"}, {}, {"F", "F", "Fa"}, {"E#", "Eis", "Mi#"}, {}}, {1, 0, 1, 1, 0}},
    {{{}, {"Gb", "Ges", "Sob"}, {"F#", "Fis", "Fa#"}, {"F#", "Fis", "Fa#"}, {"Ex", "Eisis", "Mix"}}, {0, 1, 1, 1, 1}},
    {{{"Abb", "Aeses", "Labb"}, {}, {"G", "G", "So"}, {}, {"Fx", "Fisis", "Fax"}}, {1, 0, 1, 0, 1}},
    {{{}, {"Ab", "As", "Lab"}, {"G#", "Gis", "So#"}, {"G#", "Gis", "So#"}, {}}, {0, 1, 1, 1, 0}},
    {{{"Bbb", "Heses", "Tibb"}, {}, {"A", "A", "La"}, {}, {"Gx", "Gisis", "Sox"}}, {1, 0, 1, 0, 1}},
    {{{"Cbb", "Ceses", "Dobb"}, {"Bb", "B", "Tib"}, {"Bb", "B", "Tib"}, {"A#", "Ais", "La#"}, {}}, {1, 1, 1, 1, 0}},
    {{{}, {"Cb", "Ces", "Dob"}, {"B", "H", "Ti"}, {}, {"Ax", "Aisis", "Lax"}}, {0, 1, 1, 0, 1}},
};

// A spelling that does not name the key number is named like the senseful spelling
// on its side (flat side 0..1, sharp side 3..4); spellings outside 0..4 like 2.
Names Expected(int k, int e) {
  Row const& row = Table[k];
  if (e < 0 || e > 4) return row.cells[2];
  if (row.present[e]) return row.cells[e];
  int other = e == 0 ? 1 : e == 1 ? 0 : e == 3 ? 4 : 3;
  EXPECT_TRUE(row.present[other]) << k << " " << e;
  return row.cells[other];
}

std::string EnglishWithFlags(std::string name, bool bbIsB, bool bIsH) {
  if (bIsH && name[0] == 'B' && name != "Bb") name[0] = 'H';
  if (bbIsB && name == "Bb") name = "B";
  return name;
}

std::string WithoutAccidentals(std::string name) {
  while (!name.empty() && (name.back() == 'b' || name.back() == '#' || name.back() == 'x')) name.pop_back();
  return name;
}

TEST(NoteNames, EveryKeyAndSpellingUnderEveryFlagCombination) {
  PrefGuard guard;
  for (int flags = 0; flags < 16; ++flags) {
    bool roman = flags & 1, german = flags & 2, bbIsB = flags & 4, bIsH = flags & 8;
    PrefGuard::NoteNaming(roman, german, bbIsB, bIsH);
    for (int k = 0; k < 12; ++k)
      for (int e = -1; e <= 5; ++e) {
        Names names = Expected(k, e);
        std::string expected = roman    ? names.solfege
                               : german ? names.german
                                        : EnglishWithFlags(names.english, bbIsB, bIsH);
        EXPECT_EQ(KeyNrAndEnhToName(k, E(e), DefaultChordnamePref), expected)
            << "k=" << k << " e=" << e << " flags=" << flags;

        std::string letter;
        if (roman)
          letter = WithoutAccidentals(names.solfege);
        else if (german)
          letter = names.german;
        else {
          letter = std::string(1, names.english[0]);
          if (bIsH && letter == "B" && k != 10) letter = "H";
          if (bbIsB && k == 10) letter = "B";
        }
        EXPECT_EQ(KeyNrToNameIgnoringEnh(k, E(e), DefaultChordnamePref), letter)
            << "k=" << k << " e=" << e << " flags=" << flags;
      }
  }
}

TEST(NoteNames, WorkedExamples) {
  PrefGuard guard;
  EXPECT_EQ(KeyNrAndEnhToName(10, Enh_Natural, DefaultChordnamePref), "Bb");
  CChordnamePref::B_is_H = 1;
  EXPECT_EQ(KeyNrAndEnhToName(10, Enh_Natural, DefaultChordnamePref), "Bb");
  EXPECT_EQ(KeyNrAndEnhToName(11, Enh_Natural, DefaultChordnamePref), "H");
  EXPECT_EQ(KeyNrAndEnhToName(0, Enh_Sharp, DefaultChordnamePref), "H#");
  CChordnamePref::Bb_is_B = 1;
  EXPECT_EQ(KeyNrAndEnhToName(10, Enh_Flat, DefaultChordnamePref), "B");
  CChordnamePref::B_is_H = 0;
  EXPECT_EQ(KeyNrAndEnhToName(10, Enh_Flat, DefaultChordnamePref), "B");
  EXPECT_EQ(KeyNrAndEnhToName(11, Enh_Natural, DefaultChordnamePref), "B");
  // Bb_is_B keys the letter on key number 10, so A sharp is "B" too.
  EXPECT_EQ(KeyNrToNameIgnoringEnh(10, Enh_Sharp, DefaultChordnamePref), "B");
  EXPECT_EQ(KeyNrAndEnhToName(10, Enh_Sharp, DefaultChordnamePref), "A#");

  PrefGuard::NoteNaming(0, 1, 0, 0);
  EXPECT_EQ(KeyNrAndEnhToName(8, Enh_Flat, DefaultChordnamePref), "As");
  EXPECT_EQ(KeyNrAndEnhToName(3, Enh_Flat, DefaultChordnamePref), "Es");
  EXPECT_EQ(KeyNrAndEnhToName(10, Enh_Flat, DefaultChordnamePref), "B");
  EXPECT_EQ(KeyNrAndEnhToName(7, Enh_DoubleFlat, DefaultChordnamePref), "Aeses");
  EXPECT_EQ(KeyNrAndEnhToName(0, Enh_Sharp, DefaultChordnamePref), "Bis");
  PrefGuard::NoteNaming(1, 1, 0, 0); // solmisation wins over German
  EXPECT_EQ(KeyNrAndEnhToName(8, Enh_Flat, DefaultChordnamePref), "Lab");
}

TEST(NoteNames, KeyNumbersOutsideTheOctaveAreNamedByPitchClass) {
  for (int k = -24; k < 36; ++k)
    for (int e = 0; e <= 4; ++e) {
      int pc = ((k % 12) + 12) % 12;
      EXPECT_EQ(KeyNrAndEnhToName(k, E(e), DefaultChordnamePref), KeyNrAndEnhToName(pc, E(e), DefaultChordnamePref));
      EXPECT_EQ(KeyNrToNameIgnoringEnh(k, E(e), DefaultChordnamePref),
                KeyNrToNameIgnoringEnh(pc, E(e), DefaultChordnamePref));
    }
}

TEST(NoteNames, NoteNamesAndTheUndefinedNote) {
  PrefGuard guard;
  EXPECT_EQ(CNote(61, Enh_Flat).KeyName(DefaultChordnamePref), "Db");
  EXPECT_EQ(CNote(61, Enh_Flat).KeyNameWithoutEnh(DefaultChordnamePref), "D");
  EXPECT_EQ(CNote_Undef.KeyName(DefaultChordnamePref), "Undefined");
  EXPECT_EQ(CNote_Undef.KeyNameWithoutEnh(DefaultChordnamePref), "Undefined");
  EXPECT_EQ(CNote_Undef.OctName(DefaultChordnamePref), "");
  CNote negative(61, Enh_Sharp);
  negative.SetOct(-2); // note number -1, named by its pitch class 11 as spelled
  EXPECT_EQ(negative.KeyName(DefaultChordnamePref), "Ax");
}

TEST(NoteNames, OctaveNumberingFollowsThePreference) {
  PrefGuard guard;
  struct Case {
    int pref;
    int shift; // octave shown = NoteNr / 12 + shift
  } const cases[] = {{0, -2}, {1, -1}, {2, 0}, {3, -1}, {-1, -1}};
  for (Case c : cases) {
    CChordnamePref::NoteNr_60_is = c.pref;
    for (long n = 0; n <= 127; ++n)
      EXPECT_EQ(CNote(n, Enh_Natural).OctName(DefaultChordnamePref), std::to_string(n / 12 + c.shift));
    EXPECT_EQ(CNote_Undef.OctName(DefaultChordnamePref), "");
  }
  CChordnamePref::NoteNr_60_is = 0;
  EXPECT_EQ(CNote(0, Enh_Natural).OctName(DefaultChordnamePref), "-2");
  EXPECT_EQ(CNote(60, Enh_Natural).OctName(DefaultChordnamePref), "3");
  EXPECT_EQ(CNote(127, Enh_Natural).OctName(DefaultChordnamePref), "8");
}

TEST(NoteNames, StreamOperatorUsesTheCurrentPreferences) {
  PrefGuard guard;
  std::ostringstream out;
  out << CNote(61, Enh_Sharp) << "|" << CNote_Undef;
  EXPECT_EQ(out.str(), "CNote: C#3 (NoteNr 61, Enh 3)|CNote: Undefined (NoteNr 255, Enh 1)");
  PrefGuard::NoteNaming(0, 1, 0, 0);
  CChordnamePref::NoteNr_60_is = 1;
  std::ostringstream german;
  german << CNote(70, Enh_Flat);
  EXPECT_EQ(german.str(), "CNote: B4 (NoteNr 70, Enh 1)");
}

} // namespace
