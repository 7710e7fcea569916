// Lead-sheet symbols and Harte labels of chords built from notes and a root: the
// vocabulary's types, alterations, additions, omissions, slash basses, spellings and
// style flags. Expected texts are written out.
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
    {"A", {"A2", "C3", "E3", "G3"}, 0, "Am7", "A:min7"},
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

} // namespace
