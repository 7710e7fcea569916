// Reading chord symbols: the vocabulary with the spellings people type, Harte labels,
// slash basses and no chord, each read into notes that are written out by hand (from
// the bass up, spelled by degree); and texts that cannot be read, with the place
// named and the chord left as it was.
#include <tonvex/ChordSymbol.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

std::string NoteNames(CChord const& chord) {
  std::string names;
  for (CNote const& note : chord.Notes()) names += (names.empty() ? "" : " ") + note.KeyName(DefaultChordnamePref);
  return names;
}

struct ReadCase {
  std::vector<char const*> symbols; // all read as the same chord
  char const* root;
  char const* notes;
};

std::vector<ReadCase> const ReadCases = {
    {{"C", "CM", "Cmaj", " C ", "C:maj", "C:(3,5)"}, "C", "C E G"},
    {{"Cm", "Cmin", "Cmi", "C-", "C:min", "cm"}, "C", "C Eb G"},
    {{"Cdim", "Co", "C\xC2\xB0", "C:dim"}, "C", "C Eb Gb"},
    {{"Caug", "C+", "C(#5)", "C:aug"}, "C", "C E G#"},
    {{"Csus4", "Csus", "CSus4", "C:sus4"}, "C", "C F G"},
    {{"Csus2", "C:sus2"}, "C", "C D G"},
    {{"C5", "C:5", "C(no3)"}, "C", "C G"},
    {{"C6", "C:maj6"}, "C", "C E G A"},
    {{"Cm6", "C:min6"}, "C", "C Eb G A"},
    {{"C6/9", "C69", "C6add9"}, "C", "C E G A D"},
    {{"Cm6/9", "Cm69"}, "C", "C Eb G A D"},
    {{"C7", "C:7", "C(7)"}, "C", "C E G Bb"},
    {{"Cm7", "Cmin7", "Cmi7", "C-7", "CMin7", "C m7", "C:min7"}, "C", "C Eb G Bb"},
    {{"Cmaj7", "CM7", "C\xCE\x94",
      "C\xCE\x94"
      "7",
      "Cma7", "CMA7", "Cj7", "CMaj7", "C:maj7"},
     "C",
     "C E G B"},
    {{"Cm(maj7)", "CmM7", "Cmmaj7",
      "Cm\xCE\x94"
      "7",
      "C-\xCE\x94", "C:minmaj7"},
     "C",
     "C Eb G B"},
    {{"Cdim7", "Co7",
      "C\xC2\xB0"
      "7",
      "C:dim7"},
     "C",
     "C Eb Gb Bbb"},
    {{"Cm7b5", "C\xC3\xB8",
      "C\xC3\xB8"
      "7",
      "C-7b5", "Cm7(b5)", "C:hdim7"},
     "C",
     "C Eb Gb Bb"},
    {{"C7sus4", "C7sus", "C7(sus4)"}, "C", "C F G Bb"},
    {{"C9", "C7(9)", "C:9"}, "C", "C E G Bb D"},
    {{"Cmaj9",
      "C\xCE\x94"
      "9",
      "C:maj9"},
     "C",
     "C E G B D"},
    {{"Cm9", "C:min9"}, "C", "C Eb G Bb D"},
    {{"C11", "C9add11"}, "C", "C E G Bb D F"},
    {{"Cm11", "C:min11"}, "C", "C Eb G Bb D F"},
    {{"C13", "C7(9,13)"}, "C", "C E G Bb D A"},
    {{"C:13", "C11add13"}, "C", "C E G Bb D F A"},
    {{"Cmaj13"}, "C", "C E G B D A"},
    {{"C7b9", "C7-9", "C7(b9)", "C7(addb9)"}, "C", "C E G Bb Db"},
    {{"C7#9", "C7+9", "C:(3,5,b7,#9)"}, "C", "C E G Bb D#"},
    {{"C7#11"}, "C", "C E G Bb F#"},
    {{"C7b13"}, "C", "C E G Bb Ab"},
    {{"C7b5", "C7-5"}, "C", "C E Gb Bb"},
    {{"C7#5", "C7+5", "C+7", "Caug7", "C:aug7"}, "C", "C E G# Bb"},
    {{"C7alt", "C7b5#5b9#9"}, "C", "C E Gb G# Bb Db D#"},
    {{"C7(b9,#11)", "C7b9#11", "C7 (b9, #11)", "C7(#11,b9)"}, "C", "C E G Bb Db F#"},
    {{"C13#11"}, "C", "C E G Bb D F# A"},
    {{"C13b9"}, "C", "C E G Bb Db A"},
    {{"Cadd9", "C(9)", "C:(3,5,9)"}, "C", "C E G D"},
    {{"Cadd2"}, "C", "C D E G"},
    {{"Cadd4"}, "C", "C E F G"},
    {{"Cmadd9", "Cm(add9)"}, "C", "C Eb G D"},
    {{"Cmaddb6"}, "C", "C Eb G Ab"},
    {{"Cmaj7(addb7)"}, "C", "C E G Bb B"},
    {{"C7(no5)", "C7omit5"}, "C", "C E Bb"},
    {{"C(b5)"}, "C", "C E Gb"},
    {{"Cmaj7(no1)", "Cmaj7(no root)", "C:maj7(*1)"}, "C", "E G B"},
    {{"C:min7(*5,11)"}, "C", "C Eb Bb F"},
    {{"C:(1)", "C(no3,no5)"}, "C", "C"},
    // Slash basses: a note as written, or a degree.
    {{"C/E", "C/3", "C:maj/3", "C / E"}, "C", "E G C"},
    {{"C/D"}, "C", "D E G C"},
    {{"C7/Bb", "C:7/b7"}, "C", "Bb C E G"},
    {{"C7/A#"}, "C", "A# C E G"},
    {{"Am7/G", "A:min7/b7"}, "A", "G A C E"},
    {{"C:min7/b3"}, "C", "Eb G Bb C"},
    {{"C6/9/E"}, "C", "E G A C D"},
    // Other roots: every note spelled by its degree.
    {{"F#m7b5/C"}, "F#", "C E F# A"},
    {{"Bb13", "bb13"}, "Bb", "Bb D F Ab C G"},
    {{"Eb7#9", "E\xE2\x99\xAD"
               "7\xE2\x99\xAF"
               "9"},
     "Eb",
     "Eb G Bb Db F#"},
    {{"Ab7b13"}, "Ab", "Ab C Eb Gb Fb"},
    {{"Db7b9"}, "Db", "Db F Ab Cb Ebb"},
    {{"B7#9"}, "B", "B D# F# A Cx"},
    {{"C#m7", "C\xE2\x99\xAF"
              "m7"},
     "C#",
     "C# E G# B"},
    {{"Fx", "F##", "F\xF0\x9D\x84\xAA"}, "Fx", "Fx Ax Cx"},
    {{"Dbb", "D\xF0\x9D\x84\xAB"}, "Dbb", "Dbb Fb Abb"},
    {{"Bb:min9"}, "Bb", "Bb Db F Ab C"},
};

TEST(ChordSymbolRead, Vocabulary) {
  for (ReadCase const& c : ReadCases)
    for (char const* symbol : c.symbols) {
      CChord chord;
      CChordSymbolProblem problem;
      ASSERT_TRUE(ReadChordSymbol(symbol, chord, &problem))
          << symbol << ": " << problem.Reason << " at " << problem.Offset;
      EXPECT_EQ(chord.RootNote().KeyName(DefaultChordnamePref), c.root) << symbol;
      EXPECT_TRUE(chord.RootNoteSpecified()) << symbol;
      EXPECT_EQ(NoteNames(chord), c.notes) << symbol;
    }
}

TEST(ChordSymbolRead, NoChord) {
  for (char const* symbol : {"N", "N.C.", "NC", "n.c", " N "}) {
    CChord chord;
    chord.SetFromNoteNrSet(CMySet<int>{60, 64});
    ASSERT_TRUE(ReadChordSymbol(symbol, chord)) << symbol;
    EXPECT_TRUE(chord.IsUndefined()) << symbol;
    EXPECT_EQ(chord.NoteCount(), 0u) << symbol;
  }
}

struct ProblemCase {
  char const* text;
  std::size_t offset;
  char const* part;
};

std::vector<ProblemCase> const Problems = {
    {"", 0, ""},
    {"   ", 3, ""},
    {"H7", 0, "H7"},
    {"Cmaj7x9", 5, "x9"},
    {"Cbbb", 3, "b"},
    {"C###", 3, "#"},
    {"C7(b9", 5, ""},
    {"C7b9)", 4, ")"},
    {"C7(b9,(#11))", 6, "(#11))"},
    {"C7 extra", 3, "extra"},
    {"C7 9", 3, "9"},
    {"Cadd7", 1, "add7"},
    {"Cadd", 4, ""},
    {"Cno4", 3, "4"},
    {"C7(maj7)", 3, "maj7)"},
    {"C/X", 2, "X"},
    {"C/E/G", 3, "/G"},
    {"C:foo", 2, "foo"},
    {"C:", 2, ""},
    {"C:(3,5", 6, ""},
    {"C:(3;5)", 4, ";5)"},
    {"C:(3,14)", 5, "14)"},
    {"C:maj/x", 6, "x"},
    {"C(no1,no3,no5)", 0, "C(no1,no3,no5)"},
    {"C:(*1)", 0, "C:(*1)"},
    {"X", 0, "X"},
};

TEST(ChordSymbolRead, ProblemsNameThePlaceAndLeaveTheChord) {
  for (ProblemCase const& c : Problems) {
    CChord chord;
    ASSERT_TRUE(ReadChordSymbol("Am7/G", chord));
    CChord const before = chord;
    CChordSymbolProblem problem;
    EXPECT_FALSE(ReadChordSymbol(c.text, chord, &problem)) << c.text;
    EXPECT_TRUE(chord == before) << c.text;
    EXPECT_EQ(problem.Offset, c.offset) << c.text;
    EXPECT_EQ(problem.Part, c.part) << c.text;
    EXPECT_FALSE(problem.Reason.empty()) << c.text;
    EXPECT_FALSE(ReadChordSymbol(c.text, chord)) << c.text; // without a problem to fill
  }
}

} // namespace
