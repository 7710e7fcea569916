// Reading chord symbols: the vocabulary with the spellings people type, Harte labels,
// slash basses and no chord, each read into notes that are written out by hand (from
// the bass up, spelled by degree); and texts that cannot be read, with the place
// named and the chord left as it was.
#include <tonvex/ChordSymbol.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

// The README's tables hold the vocabulary's pitch classes over C; here the spelled
// notes of the voicing, other roots, cases and signs. No chord has no root and no notes.
struct ReadCase {
  std::vector<char const*> symbols; // all read as the same chord
  char const* rootAndNotes;
} const ReadCases[] = {
    {{"CMA7", "C M7", "cma7"}, "C: C E G B"},
    {{"Cdim7", "C°7"}, "C: C Eb Gb Bbb"},
    {{"C7alt"}, "C: C E Gb G# Bb Db D#"},
    {{"C13#11"}, "C: C E G Bb D F# A"},
    {{"Cadd9"}, "C: C E G D"},
    {{"Cadd2"}, "C: C D E G"},
    {{"Cmaj7(no1)", "C:maj7(*1)"}, "C: E G B"},
    {{"C:min7(*5,11)"}, "C: C Eb Bb F"},
    {{"C/E", "C/3"}, "C: E G C"},
    {{"C/D"}, "C: D E G C"},
    {{"C7/A#"}, "C: A# C E G"},
    {{"Am7/G", "A:min7/b7"}, "A: G A C E"},
    {{"C:min7/b3"}, "C: Eb G Bb C"},
    {{"C6/9/E"}, "C: E G A C D"},
    {{"F#m7b5/C"}, "F#: C E F# A"},
    {{"Bb13", "bb13"}, "Bb: Bb D F Ab C G"},
    {{"Eb7#9", "E♭7♯9"}, "Eb: Eb G Bb Db F#"},
    {{"Ab7b13"}, "Ab: Ab C Eb Gb Fb"},
    {{"Db7b9"}, "Db: Db F Ab Cb Ebb"},
    {{"B7#9"}, "B: B D# F# A Cx"},
    {{"C#m7", "C♯m7"}, "C#: C# E G# B"},
    {{"Fx", "F##", "F𝄪"}, "Fx: Fx Ax Cx"},
    {{"Dbb", "D𝄫"}, "Dbb: Dbb Fb Abb"},
    {{"Fbdim7"}, "Fb: Fb Abb Cbb C#"}, // no triple flat: the usual spelling
    {{"Bb:min9"}, "Bb: Bb Db F Ab C"},
    {{"N", "N.C.", "NC", "n.c", " N "}, "Undefined:"},
};

TEST(ChordSymbolRead, Vocabulary) {
  for (ReadCase const& c : ReadCases)
    for (char const* symbol : c.symbols) {
      CChord chord;
      chord.SetFromNoteNrSet(CMySet<int>{60, 64});
      CChordSymbolProblem problem;
      ASSERT_TRUE(ReadChordSymbol(symbol, chord, &problem))
          << symbol << ": " << problem.Reason << " at " << problem.Offset;
      std::string read = chord.RootNote().KeyName(DefaultChordnamePref) + ":";
      for (CNote const& note : chord.Notes()) read += " " + note.KeyName(DefaultChordnamePref);
      EXPECT_EQ(read, c.rootAndNotes) << symbol;
      EXPECT_TRUE(chord.RootNoteSpecified()) << symbol;
    }
}

// Where reading stops (offset) and the rest of the text there (part).
struct ProblemCase {
  char const* text;
  std::size_t offset;
  char const* part;
} const Problems[] = {
    {"", 0, ""},
    {"H7", 0, "H7"},
    {"Cmaj7x9", 5, "x9"},
    {"Cbbb", 3, "b"},
    {"C7(b9", 5, ""},
    {"C7b9)", 4, ")"},
    {"C7(b9,(#11))", 6, "(#11))"},
    {"C7 extra", 3, "extra"},
    {"Cadd7", 1, "add7"},
    {"Cno4", 3, "4"},
    {"C7(maj7)", 3, "maj7)"},
    {"C/X", 2, "X"},
    {"C/E/G", 3, "/G"},
    {"C:foo", 2, "foo"},
    {"C:(3;5)", 4, ";5)"},
    {"C:(3,14)", 5, "14)"},
    {"C:maj/x", 6, "x"},
    {"C(no1,no3,no5)", 0, "C(no1,no3,no5)"},
};

TEST(ChordSymbolRead, ProblemsNameThePlaceAndLeaveTheChord) {
  for (ProblemCase const& c : Problems) {
    CChord chord;
    ASSERT_TRUE(ReadChordSymbol("Am7/G", chord));
    CChord const before = chord;
    CChordSymbolProblem problem;
    EXPECT_FALSE(ReadChordSymbol(c.text, chord, &problem)) << c.text;
    EXPECT_TRUE(chord == before && problem.Offset == c.offset && problem.Part == c.part && !problem.Reason.empty())
        << c.text << ": " << problem.Offset << " " << problem.Part;
    EXPECT_FALSE(ReadChordSymbol(c.text, chord)) << c.text; // without a problem to fill
  }
}

} // namespace
