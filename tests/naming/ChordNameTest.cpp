// Chord names: the block after the root with its kept blanks, names with and without
// a slash bass under the naming preferences, the undefined root, the respelled bass
// and names for another root. Expected strings are written out.
#include "scale/ScaleOracle.h"
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"

namespace {

using namespace chordtest;

// The block after the root, the name without and with a slash bass, and the name, each
// between bars.
std::string Names(CChord const& chord) {
  return "|" + chord.BasicChordAndOptionsName(DefaultChordnamePref) + "|" +
         chord.NameWithoutSlash(DefaultChordnamePref) + "|" + chord.NameWithSlash(DefaultChordnamePref) + "|" +
         chord.Name(DefaultChordnamePref) + "|";
}

TEST(ChordName, DefaultPreferences) {
  std::pair<std::vector<long>, char const*> const cases[] = {
      {{60, 64, 67}, "|  |C  |C  |C  |"},
      {{60, 65, 67, 70}, "| 7 sus 4|C 7 sus 4|C 7 sus 4|C 7 sus 4|"},
      {{60, 62, 67, 71}, "| ma7 sus 2|C ma7 sus 2|C ma7 sus 2|C ma7 sus 2|"},
      {{60, 64, 68}, "| aug |C aug |C aug |C aug |"},
      {{60, 63, 66, 69}, "| dim 7|C dim 7|C dim 7|C dim 7|"},
      {{60, 67}, "| 5 |C 5 |C 5 |C 5 |"},
      {{60, 63, 68}, "| no 3 b3/#5|C no 3 b3/#5|C no 3 b3/#5|C no 3 b3/#5|"},
      {{60}, "| no 3 |C|C|C|"}, // the root alone
      // Narrow voicings show no slash, however inverted; wide ones a bass other than
      // the root, spelled by the chord's scale (a minor second as the lowered second).
      {{64, 67, 72}, "|  |C  |C   / E|C  |"},
      {{48, 64, 67, 72}, "|  |C  |C  |C  |"},
      {{51, 60, 67, 72}, "| m |C m |C m  / Eb|C m  / Eb|"},
      {{50, 60, 64, 67, 70}, "|  7|C  7|C  7 / D|C  7 / D|"},
      {{49, 60, 64, 67}, "|  |C  |C   / Db|C   / Db|"},
      {{54, 60, 64, 67, 70}, "|  7|C  7|C  7 / F#|C  7 / F#|"}};
  for (auto const& [notes, names] : cases) EXPECT_EQ(Names(NotesThenRoot(Nat(60), notes)), names);
  EXPECT_EQ(Names(NotesThenRoot(Nat(57), {60, 64, 67})), "| m 7|A m 7|A m 7 / C|A m 7|"); // a root not among the notes
  for (int bc : {8, 100, -1})
    EXPECT_EQ(BasicChordName(static_cast<CChord::TBasicChord>(bc), DefaultChordnamePref), "no 3");
}

TEST(ChordName, Preferences) {
  struct Case {
    int* pref;
    int value;
    long root;
    std::vector<long> notes;
    char const* name;
  } const cases[] = {{&CChordnamePref::ChordOptionSep, 1, 60, {60, 63, 67, 70, 74, 77}, "C m 7(9)(11)"},
                     {&CChordnamePref::SeparateBlocksInNames, 1, 60, {60, 65, 67, 70}, "C,7,sus 4"},
                     {&CChordnamePref::SeparateBlocksInNames, 5, 60, {60, 64, 67, 70, 74}, "C,,7/9"},
                     {&CChordnamePref::SeparateBlocksInNames, 1, 60, {60}, "C"},
                     {&CChordnamePref::MinorSmall, 1, 63, {63, 66, 70}, "eb m "},
                     {&CChordnamePref::MinorSmall, 1, 60, {60, 63, 66, 69}, "C dim 7"},
                     {&CChordnamePref::MinorSmall, 1, 60, {51, 60, 67, 72}, "c m  / Eb"},
                     {&CChordnamePref::NarrowChordsWithoutSlash, 0, 60, {60, 64, 67}, "C  "},
                     {&CChordnamePref::AccidentalsAsLetters, 1, 58, {50, 58, 65, 70}, "B   / D"},
                     {&CChordnamePref::AccidentalsAsLetters, 1, 61, {61, 64, 68}, "Cis m "},
                     {&CChordnamePref::RomanNames, 1, 69, {57, 60, 64, 67}, "La m 7"},
                     {&CChordnamePref::B_is_H, 1, 59, {47, 62, 66, 71}, "H m "}};
  for (Case const& c : cases) {
    PrefGuard guard;
    *c.pref = c.value;
    EXPECT_EQ(NotesThenRoot(Nat(c.root), c.notes).Name(DefaultChordnamePref), c.name) << c.value;
  }
  PrefGuard guard;
  CChordnamePref::MinorSmall = CChordnamePref::SeparateBlocksInNames = CChordnamePref::ChordOptionSep = 1;
  EXPECT_EQ(NotesThenRoot(Nat(60), {48, 63, 67, 70, 74}).Name(DefaultChordnamePref), "c,m,7(9)");
  EXPECT_EQ(NotesThenRoot(Nat(60), {51, 60, 67, 70}).Name(DefaultChordnamePref), "c,m,7,/ Eb");
}

// Without a root the name is "No Chord", a wide chord's bass (its own pitch class,
// not the undefined root's 3) after it; with a root but no notes, the root alone.
TEST(ChordName, UndefinedRootAndEmptyChord) {
  PrefGuard guard;
  EXPECT_EQ(CChord_Undef.Name(DefaultChordnamePref), "No Chord");
  CChord const wide = NotesThenRoot(CNote_Undef, {48, 64, 67});
  EXPECT_EQ(Names(wide), "|  |No Chord|No Chord / C|No Chord / C|");
  EXPECT_EQ(Names(NotesThenRoot(CNote_Undef, {51, 64, 67})), "|  |No Chord|No Chord|No Chord|");
  CChordnamePref::SeparateBlocksInNames = 1;
  EXPECT_EQ(wide.Name(DefaultChordnamePref), "No Chord,/ C");
  CChord const empty = RootedChord(60, {});
  EXPECT_EQ(empty.Name(DefaultChordnamePref), "C");
  EXPECT_EQ(empty.NameWithSlash(DefaultChordnamePref), "C,/ Undefined");
}

// Naming respells the stored bass by the chord's scale, unless it is the root or
// a second spelling of the same pitch stands above it (the set stays ordered).
TEST(ChordName, RespellsTheStoredBass) {
  CChord chord = NotesThenRoot(Nat(60), {49, 60, 64, 67});
  EXPECT_EQ(chord.Name(DefaultChordnamePref), "C   / Db");
  EXPECT_EQ(chord.LowestNote(), CNote(49, Enh_Flat));
  struct Case {
    CNote bass, second;
    char const* name;
    CNote stored;
  } const cases[] = {{CNote(52, Enh_Flat), CNote(52, Enh_DoubleSharp), "C   / E", Nat(52)},
                     {CNote(52, Enh_Flat), Nat(52), "C   / E", CNote(52, Enh_Flat)},
                     {CNote(48, Enh_Sharp), CNote(48, Enh_Sharp), "C 5 ", CNote(48, Enh_Sharp)}};
  for (Case const& c : cases) {
    CChord bass = ChordOf({60, 67, 72});
    bass.AddNote(c.bass);
    bass.AddNote(c.second);
    bass.SetRootNote(Nat(60));
    EXPECT_EQ(bass.NameWithSlash(DefaultChordnamePref), c.name) << c.bass << " " << c.second;
    EXPECT_EQ(bass.LowestNote(), c.stored) << c.bass << " " << c.second;
  }
}

// A note of key number k spelled e, senseful or not: made where e is senseful, then
// moved without a spelling check.
CNote Given(int k, int e) {
  CNote note(e == 1 || e == 4 ? 61 : 60, static_cast<TEnh>(e));
  note.SetNoteNr(60 + k);
  return note;
}

// The major triad on key number k named over a given root: its spelling checked as a
// note's is (a natural black key as C major spells it, else shifted once); the chord
// keeps its root, and fewer signs do not win.
TEST(ChordName, NamesForAnotherRoot) {
  for (int k = 0; k < 12; ++k)
    for (int e = 0; e <= 4; ++e) {
      CChord const triad = NotesThenRoot(Nat(60), {60 + k, 64 + k, 67 + k});
      int const checked = oracle::Senseful(k, e) ? e
                          : e == 2               ? scaleoracle::DefaultSpelling(k)
                                                 : EnhShift(k, static_cast<TEnh>(e));
      CNote root = Given(k, e), other = Given(k, e);
      EXPECT_EQ(triad.NameForThisRootNote(root, DefaultChordnamePref),
                oracle::Name(k, oracle::Senseful(k, e) ? e : scaleoracle::DefaultSpelling(k)) + "  ")
          << k << " " << e;
      EXPECT_EQ(triad.NameWithLeastSignsForThisRootNote(other, DefaultChordnamePref), oracle::Name(k, checked) + "  ")
          << k << " " << e;
      EXPECT_EQ(other.Enh(), checked) << k << " " << e;
      EXPECT_EQ(triad.RootNote(), Nat(60));
    }
  // Over F sharp, C sharp, F and G sharp are a suspended second with a major seventh;
  // this chord's own root, spelled as no key can be, is respelled to D flat.
  CNote root(60, Enh_Natural);
  root.SetNoteNr(61);
  CChord chord = ChordOf({61, 65, 68});
  chord.SetRootNote(root);
  EXPECT_EQ(chord.NameWithLeastSignsForThisRootNote(CNote(66, Enh_Sharp), DefaultChordnamePref), "F# ma7 sus 2");
  EXPECT_EQ(chord.RootNote(), CNote(61, Enh_Flat));
}

} // namespace
