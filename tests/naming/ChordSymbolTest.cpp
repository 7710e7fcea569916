// Writing and reading chord symbols. Lead-sheet symbols and Harte labels of chords
// built from notes and a root: the vocabulary's types, alterations, additions,
// omissions, slash basses, spellings and style flags. Symbols read: the vocabulary
// with the spellings people type, Harte labels, slash basses and no chord, each read
// into notes (from the bass up, spelled by degree); and texts that cannot be read,
// with the place named and the chord left as it was. Expected texts and notes are
// written out by hand.
#include <tonvex/ChordSymbol.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

CNote Named(char const* name) {
  CNote note(0, Enh_Natural);
  EXPECT_TRUE(note.SetFromString(name, DefaultChordnamePref)) << name;
  note.CheckEnh();
  return note;
}

// The README's tables hold the vocabulary over C; here the style flags, other roots
// and the spellings of root and bass. The notes keep their spellings.
struct WriteCase {
  char const* root;
  std::vector<char const*> notes;
  int style;
  char const* symbol;
  char const* harte;
} const WriteCases[] = {
    {"C", {"C3", "E3", "G3", "B3"}, Sym_Triangle, "CΔ7", "C:maj7"},
    {"C", {"C3", "Eb3", "G3", "B3"}, Sym_Triangle, "CmΔ7", "C:minmaj7"},
    {"F#", {"C2", "F#3", "A3", "E4"}, 0, "F#m7b5/C", "F#:hdim7/b5"},
    {"F#", {"C2", "F#3", "A3", "E4"}, Sym_HalfDimSign | Sym_UnicodeSigns, "F♯ø7/C", "F#:hdim7/b5"},
    {"C", {"C3", "Eb3", "Gb3", "Bb3"}, Sym_UnicodeSigns, "Cm7♭5", "C:hdim7"},
    {"C", {"C3", "Eb3", "Gb3", "A3"}, Sym_DimSign, "Co7", "C:dim7"},
    {"C", {"C3", "Eb3", "Gb3"}, Sym_DimSign | Sym_UnicodeSigns, "C°", "C:dim"},
    {"C", {"C3", "Db3", "Eb3", "Gb3"}, Sym_DimSign, "Coaddb9", "C:(b3,b5,b9)"},
    {"C", {"C3", "E3", "G#3"}, Sym_PlusSign, "C+", "C:aug"},
    {"C", {"C3", "E3", "Gb3", "G#3", "Bb3", "Db4", "D#4"}, Sym_Alt, "C7alt", "C:(3,b5,#5,b7,b9,#9)"},
    {"Bb", {"Bb2", "D3", "F3", "Ab3", "C4", "G4"}, 0, "Bb13", "Bb:(3,5,b7,9,13)"},
    // The bass as the chord spells it, not as the chord's scale would.
    {"C", {"A#2", "C3", "E3", "G3"}, 0, "C7/A#", "C:7/b7"},
    {"C", {"Eb2", "C3", "G3", "Bb3"}, Sym_UnicodeSigns, "Cm7/E♭", "C:min7/b3"},
    {"C", {"E3", "G3", "Bb3", "D#4"}, 0, "C7#9(no1)/E", "C:(*1,3,5,b7,#9)/3"},
    {"C", {"E3", "Gb3"}, 0, "C(b5,no1)/E", "C:(*1,3,b5)/3"},
    {"Fx", {"B2", "G3", "D4"}, 0, "F##/B", "F##:maj/3"},
    {"Fx", {"B2", "G3", "D4"}, Sym_UnicodeSigns, "F𝄪/B", "F##:maj/3"},
    {"Dbb", {"Dbb3", "Fb3", "Abb3"}, Sym_UnicodeSigns, "D𝄫", "Dbb:maj"},
};

TEST(ChordSymbolWrite, Vocabulary) {
  for (WriteCase const& c : WriteCases) {
    CMySet<CNote> notes;
    for (char const* name : c.notes) notes.insert(Named(name));
    CChord chord;
    chord.SetFromNoteSet(notes);
    chord.SetRootNote(Named(c.root));
    EXPECT_EQ(LeadSheetSymbol(chord, c.style), c.symbol) << c.symbol;
    EXPECT_EQ(HarteLabel(chord), c.harte) << c.symbol;
  }
  // No chord: without notes, or without a root.
  CChord withoutNotes;
  withoutNotes.SetRootNote(CNote(60, Enh_Natural));
  for (CChord const& chord : {CChord_Undef, withoutNotes})
    EXPECT_TRUE(LeadSheetSymbol(chord) == "N.C." && HarteLabel(chord) == "N");
}

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
