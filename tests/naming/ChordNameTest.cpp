// Chord names: the basic chord texts, the block after the root with its kept
// blanks, names with and without a slash bass under the naming preferences, the
// undefined root, and names for another root. Expected strings are written out.
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"
#include "support/SpellingOracle.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using namespace chordtest;
using C = CChord;

CChord WithRoot(long root, std::vector<long> const& noteNrs) { return NotesThenRoot(Nat(root), noteNrs); }

std::string Label(std::vector<long> const& noteNrs) { return ListLabel("notes", noteNrs); }

// ---- Basic chord texts -------------------------------------------------------------

TEST(BasicChordName, TextsUnderEveryNoteNaming) {
  PrefGuard guard;
  char const* const texts[] = {"no 3", "", "m", "aug", "dim", "sus 4", "sus 2", "5"};
  for (int roman : {0, 1})
    for (int german : {0, 1}) {
      PrefGuard::NoteNaming(roman, german, 1, 1);
      CChordnamePref::MinorSmall = 1;
      for (int bc = 0; bc <= 7; ++bc)
        EXPECT_EQ(BasicChordName(static_cast<C::TBasicChord>(bc), DefaultChordnamePref), texts[bc]) << bc;
      for (int bc : {8, 100, -1})
        EXPECT_EQ(BasicChordName(static_cast<C::TBasicChord>(bc), DefaultChordnamePref), "no 3") << bc;
    }
}

TEST(BasicChordName, StandsAfterTheOptionsOnlyForSuspendedChords) {
  for (int bc = 0; bc <= 7; ++bc) {
    CChord chord(Nat(60), static_cast<C::TBasicChord>(bc), 24);
    ASSERT_EQ(chord.BasicChord(), bc);
    EXPECT_EQ(chord.BasicChordNameAfterOptionsName(), bc == C::bc_sus4 || bc == C::bc_sus2) << bc;
  }
}

// ---- Names under the default preferences -------------------------------------------

struct NameCase {
  long root;
  std::vector<long> notes;
  std::string block;   // BasicChordAndOptionsName
  std::string plain;   // NameWithoutSlash
  std::string slashed; // NameWithSlash
  std::string name;    // Name
};

std::vector<NameCase> const DefaultNames = {
    {60, {60, 64, 67}, "  ", "C  ", "C  ", "C  "},
    {60, {60, 64, 67, 70}, "  7", "C  7", "C  7", "C  7"},
    {60, {60, 63, 67, 70}, " m 7", "C m 7", "C m 7", "C m 7"},
    {60, {60, 63, 67}, " m ", "C m ", "C m ", "C m "},
    {60, {60, 64, 67, 71}, "  ma7", "C  ma7", "C  ma7", "C  ma7"},
    {60, {60, 65, 67, 70}, " 7 sus 4", "C 7 sus 4", "C 7 sus 4", "C 7 sus 4"},
    {60, {60, 65, 67}, "  sus 4", "C  sus 4", "C  sus 4", "C  sus 4"},
    {60, {60, 62, 67}, "  sus 2", "C  sus 2", "C  sus 2", "C  sus 2"},
    {60, {60, 62, 67, 71}, " ma7 sus 2", "C ma7 sus 2", "C ma7 sus 2", "C ma7 sus 2"},
    {60, {60, 64, 68}, " aug ", "C aug ", "C aug ", "C aug "},
    {60, {60, 63, 66, 69}, " dim 7", "C dim 7", "C dim 7", "C dim 7"},
    {60, {60, 63, 66}, " dim ", "C dim ", "C dim ", "C dim "},
    {60, {60, 67}, " 5 ", "C 5 ", "C 5 ", "C 5 "},
    {60, {60, 66}, " no 3 b5", "C no 3 b5", "C no 3 b5", "C no 3 b5"},
    {60, {60, 63, 68}, " no 3 b3/#5", "C no 3 b3/#5", "C no 3 b3/#5", "C no 3 b3/#5"},
    {60, {60, 64, 67, 70, 74}, "  7/9", "C  7/9", "C  7/9", "C  7/9"},
    // One note: the root alone (its block would be that of no basic chord).
    {60, {60}, " no 3 ", "C", "C", "C"},
    // Narrow voicings show no slash, however inverted; wide ones show a bass that
    // is not the root.
    {60, {64, 67, 72}, "  ", "C  ", "C   / E", "C  "},
    {60, {52, 60, 67, 72}, "  ", "C  ", "C   / E", "C   / E"},
    {60, {48, 64, 67, 72}, "  ", "C  ", "C  ", "C  "},
    {60, {43, 60, 64, 67}, "  ", "C  ", "C   / G", "C   / G"},
    {60, {51, 60, 67, 72}, " m ", "C m ", "C m  / Eb", "C m  / Eb"},
    {60, {50, 60, 64, 67, 70}, "  7", "C  7", "C  7 / D", "C  7 / D"},
    // The bass spelled by the chord's scale: a minor second above the root is the
    // lowered second degree.
    {60, {49, 60, 64, 67}, "  ", "C  ", "C   / Db", "C   / Db"},
    {60, {54, 60, 64, 67, 70}, "  7", "C  7", "C  7 / F#", "C  7 / F#"},
    // Other roots, spelled as the natural spelling falls back to.
    {62, {62, 66, 69}, "  ", "D  ", "D  ", "D  "},
    {66, {66, 69, 73}, " m ", "F# m ", "F# m ", "F# m "},
    {63, {63, 67, 70}, "  ", "Eb  ", "Eb  ", "Eb  "},
    {58, {58, 62, 65, 68}, "  7", "Bb  7", "Bb  7", "Bb  7"},
    {69, {45, 60, 64, 69}, " m ", "A m ", "A m ", "A m "},
    // A root that is not among the notes.
    {57, {60, 64, 67}, " m 7", "A m 7", "A m 7 / C", "A m 7"},
};

TEST(ChordName, DefaultPreferences) {
  for (NameCase const& c : DefaultNames) {
    CChord chord = WithRoot(c.root, c.notes);
    EXPECT_EQ(chord.BasicChordAndOptionsName(DefaultChordnamePref), c.block) << Label(c.notes);
    EXPECT_EQ(chord.NameWithoutSlash(DefaultChordnamePref), c.plain) << Label(c.notes);
    EXPECT_EQ(chord.Name(DefaultChordnamePref), c.name) << Label(c.notes);
    EXPECT_EQ(chord.NameWithSlash(DefaultChordnamePref), c.slashed) << Label(c.notes);
  }
}

TEST(ChordName, UnreadPreferencesChangeNoName) {
  PrefGuard guard;
  for (int value : {1, 0, 7, -3}) {
    CChordnamePref::PreferSlashChord = value;
    CChordnamePref::PreferSlashChordIfMoreNotesThan = value;
    CChordnamePref::ShowInversion = value;
    CChordnamePref::InversionAsName = value;
    CChordnamePref::NoDoubleSigns = value;
    for (NameCase const& c : DefaultNames) {
      CChord chord = WithRoot(c.root, c.notes);
      EXPECT_EQ(chord.Name(DefaultChordnamePref), c.name) << Label(c.notes) << " value " << value;
      EXPECT_EQ(chord.NameWithSlash(DefaultChordnamePref), c.slashed) << Label(c.notes) << " value " << value;
    }
  }
}

// ---- Names under other preferences -------------------------------------------------

struct PrefNameCase {
  int* pref;
  int value;
  long root;
  std::vector<long> notes;
  std::string name;
};

std::vector<PrefNameCase> const PrefNames = {
    {&CChordnamePref::ChordOptionSep, 1, 60, {60, 64, 67, 70, 74}, "C  7(9)"},
    {&CChordnamePref::ChordOptionSep, 1, 60, {60, 63, 67, 70, 74, 77}, "C m 7(9)(11)"},
    {&CChordnamePref::SeparateBlocksInNames, 1, 60, {60, 63, 67, 70}, "C,m,7"},
    {&CChordnamePref::SeparateBlocksInNames, 1, 60, {60, 65, 67, 70}, "C,7,sus 4"},
    {&CChordnamePref::SeparateBlocksInNames, 1, 60, {52, 60, 67, 72}, "C,,,/ E"},
    {&CChordnamePref::SeparateBlocksInNames, 1, 60, {60, 64, 67}, "C,,"},
    {&CChordnamePref::SeparateBlocksInNames, 5, 60, {60, 64, 67, 70, 74}, "C,,7/9"},
    {&CChordnamePref::SeparateBlocksInNames, 1, 60, {60}, "C"},
    {&CChordnamePref::MinorSmall, 1, 60, {60, 63, 67, 70}, "c m 7"},
    {&CChordnamePref::MinorSmall, 1, 60, {60, 64, 67, 70}, "C  7"},
    {&CChordnamePref::MinorSmall, 1, 63, {63, 66, 70}, "eb m "},
    {&CChordnamePref::MinorSmall, 1, 60, {60, 63, 66, 69}, "C dim 7"},
    {&CChordnamePref::MinorSmall, 1, 60, {51, 60, 67, 72}, "c m  / Eb"},
    {&CChordnamePref::MinorSmall, 1, 60, {60}, "C"},
    {&CChordnamePref::NarrowChordsWithoutSlash, 0, 60, {64, 67, 72}, "C   / E"},
    {&CChordnamePref::NarrowChordsWithoutSlash, 0, 60, {60, 64, 67}, "C  "},
    {&CChordnamePref::NarrowChordsWithoutSlash, 0, 60, {55, 60, 64}, "C   / G"},
    {&CChordnamePref::Maj7ShownAs, 0, 60, {60, 64, 67, 71}, "C  ma7"},
    {&CChordnamePref::Maj7ShownAs, 1, 60, {60, 64, 67, 71}, "C  j7"},
    {&CChordnamePref::Maj7ShownAs, 2, 60, {60, 64, 67, 71}, "C  maj7"},
    {&CChordnamePref::Maj7ShownAs, 3, 60, {60, 64, 67, 71}, "C  ma7"},
    {&CChordnamePref::Maj7ShownAs, 9, 60, {60, 64, 67, 71}, "C  ma7"},
    {&CChordnamePref::Maj7ShownAs, 2, 60, {60, 63, 67, 71}, "C m maj7"},
    {&CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord, 0, 60, {50, 60, 64, 67}, "C  add 9 / D"},
    {&CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord, 1, 60, {50, 60, 64, 67}, "C   / D"},
    {&CChordnamePref::AccidentalsAsLetters, 1, 58, {50, 58, 65, 70}, "B   / D"},
    {&CChordnamePref::AccidentalsAsLetters, 1, 61, {61, 64, 68}, "Cis m "},
    {&CChordnamePref::RomanNames, 1, 69, {57, 60, 64, 67}, "La m 7"},
    {&CChordnamePref::B_is_H, 1, 59, {47, 62, 66, 71}, "H m "},
};

TEST(ChordName, PreferencesOneAtATime) {
  for (PrefNameCase const& c : PrefNames) {
    PrefGuard guard;
    *c.pref = c.value;
    EXPECT_EQ(WithRoot(c.root, c.notes).Name(DefaultChordnamePref), c.name) << Label(c.notes) << " value " << c.value;
  }
}

TEST(ChordName, MinorSmallWithSeparatedBlocks) {
  PrefGuard guard;
  CChordnamePref::MinorSmall = 1;
  CChordnamePref::SeparateBlocksInNames = 1;
  CChordnamePref::ChordOptionSep = 1;
  EXPECT_EQ(WithRoot(60, {48, 63, 67, 70, 74}).Name(DefaultChordnamePref), "c,m,7(9)");
  EXPECT_EQ(WithRoot(60, {51, 60, 67, 70}).Name(DefaultChordnamePref), "c,m,7,/ Eb");
}

TEST(ChordName, NameReadsOnlyTheSharedPreferences) {
  CChordnamePref own;
  CChord chord = WithRoot(60, {52, 60, 67, 70});
  EXPECT_EQ(chord.Name(own), "C  7 / E");
  EXPECT_EQ(chord.Name(own), chord.Name(DefaultChordnamePref));
}

TEST(ChordName, KeyNumbersThroughRootFindingToTheName) {
  struct Row {
    CMySet<int> keyNrs;
    char const* name;
  } const rows[] = {{{4, 7, 0}, "C  "},
                    {{10, 0, 4, 7}, "C  7"},
                    {{1, 5, 8}, "Db  "},
                    {{2, 5, 9}, "D m "},
                    {{3, 7, 10, 2}, "Eb  ma7"}};
  for (Row const& row : rows) {
    CChord chord;
    chord.SetFromKeyNrSet(row.keyNrs);
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_RULE_WEIGHTS);
    EXPECT_EQ(chord.Name(DefaultChordnamePref), row.name);
  }
}

// ---- No root -----------------------------------------------------------------------

TEST(ChordName, ChordWithoutRoot) {
  PrefGuard guard;
  EXPECT_EQ(CChord_Undef.Name(DefaultChordnamePref), "No Chord");
  EXPECT_EQ(CChord_Undef.NameWithSlash(DefaultChordnamePref), "No Chord");
  EXPECT_EQ(CChord_Undef.NameWithoutSlash(DefaultChordnamePref), "No Chord");

  // Wide, bass C (pitch class 0, not the undefined root's 3): the slash part
  // follows "No Chord". The chord's scale is E flat major, which spells C plainly.
  CChord wide = NotesThenRoot(CNote_Undef, {48, 64, 67});
  EXPECT_EQ(wide.Name(DefaultChordnamePref), "No Chord / C");
  EXPECT_EQ(wide.NameWithoutSlash(DefaultChordnamePref), "No Chord");
  // The block is written, without options.
  EXPECT_EQ(wide.BasicChordAndOptionsName(DefaultChordnamePref), "  ");
  CChordnamePref::SeparateBlocksInNames = 1;
  EXPECT_EQ(wide.Name(DefaultChordnamePref), "No Chord,/ C");
  CChordnamePref::SeparateBlocksInNames = 0;

  // Bass E flat has the undefined root's key number; narrow chords show no slash.
  EXPECT_EQ(NotesThenRoot(CNote_Undef, {51, 64, 67}).Name(DefaultChordnamePref), "No Chord");
  EXPECT_EQ(NotesThenRoot(CNote_Undef, {60, 64, 67}).Name(DefaultChordnamePref), "No Chord");
  EXPECT_EQ(NotesThenRoot(CNote_Undef, {60, 64, 67}).NameWithSlash(DefaultChordnamePref), "No Chord / C");
}

TEST(ChordName, EmptyChordWithARoot) {
  CChord empty(24);
  empty.SetRootNote(Nat(60));
  EXPECT_EQ(empty.Name(DefaultChordnamePref), "C");
  EXPECT_EQ(empty.BasicChordAndOptionsName(DefaultChordnamePref), " no 3 ");
  // Without notes the undefined note stands in for the bass.
  EXPECT_EQ(empty.NameWithSlash(DefaultChordnamePref), "C / Undefined");
}

// ---- The stored bass is respelled ----------------------------------------------------

TEST(NameWithSlash, RespellsTheStoredLowestNoteByTheChordsScale) {
  CChord chord = ChordOf({60, 67, 72});
  chord.AddNote(CNote(52, Enh_Flat)); // F flat
  chord.SetRootNote(Nat(60));
  EXPECT_EQ(chord.NameWithSlash(DefaultChordnamePref), "C   / E");
  EXPECT_EQ(chord.LowestNote(), CNote(52, Enh_Natural));

  // C sharp under C major is the lowered second: D flat.
  CChord second = WithRoot(60, {49, 60, 64, 67});
  ASSERT_EQ(second.LowestNote(), CNote(49, Enh_Sharp));
  EXPECT_EQ(second.Name(DefaultChordnamePref), "C   / Db");
  EXPECT_EQ(second.LowestNote(), CNote(49, Enh_Flat));
  EXPECT_EQ(second.NoteCount(), 4u);

  // A bass that is the root is left as it is.
  CChord rooted = ChordOf({60, 67, 72});
  rooted.AddNote(CNote(48, Enh_Sharp)); // B sharp
  rooted.SetRootNote(Nat(60));
  EXPECT_EQ(rooted.NameWithSlash(DefaultChordnamePref), "C 5 ");
  EXPECT_EQ(rooted.LowestNote(), CNote(48, Enh_Sharp));
}

// C and G over a bass E stored in two spellings: F flat and the given one.
CChord BassInTwoSpellings(TEnh second) {
  CChord chord = ChordOf({60, 67});
  chord.AddNote(CNote(52, Enh_Flat));
  chord.AddNote(CNote(52, second));
  chord.SetRootNote(Nat(60));
  return chord;
}

TEST(NameWithSlash, SecondSpellingOfTheBassKeepsTheNoteSetOrdered) {
  // With D double sharp: the lowest, F flat, becomes E, still below D double sharp.
  CChord below = BassInTwoSpellings(Enh_DoubleSharp);
  EXPECT_EQ(below.NameWithSlash(DefaultChordnamePref), "C   / E");
  EXPECT_EQ(below.Note(0), CNote(52, Enh_Natural));
  EXPECT_EQ(below.Note(1), CNote(52, Enh_DoubleSharp));

  // With E: respelling F flat would make it a second E, so it stays stored as it
  // is; the name shows the bass as the scale spells it.
  CChord same = BassInTwoSpellings(Enh_Natural);
  EXPECT_EQ(same.NameWithSlash(DefaultChordnamePref), "C   / E");
  EXPECT_EQ(same.Note(0), CNote(52, Enh_Flat));
  EXPECT_EQ(same.Note(1), CNote(52, Enh_Natural));
  EXPECT_EQ(same.NoteCount(), 4u);
}

// ---- Names for another root ----------------------------------------------------------

// Spelling of each key number in the C major scale.
constexpr int CMajorSpelling[12] = {2, 3, 2, 1, 2, 2, 3, 2, 1, 2, 1, 2};

// What CNote::CheckEnh makes of the spellings that are not senseful: a natural
// black key takes the C major spelling, any other spelling is shifted once.
int Checked(int k, int e) {
  if (oracle::Senseful(k, e)) return e;
  if (e == 2) return CMajorSpelling[k];
  struct Shift {
    int k, e, to;
  } const shifts[] = {{0, 1, 2}, {0, 4, 3}, {1, 0, 1}, {2, 1, 2},  {2, 3, 2},  {3, 4, 3}, {4, 0, 1},
                      {4, 3, 2}, {5, 1, 2}, {5, 4, 3}, {6, 0, 1},  {7, 1, 2},  {7, 3, 2}, {8, 0, 1},
                      {8, 4, 3}, {9, 1, 2}, {9, 3, 2}, {10, 4, 3}, {11, 0, 1}, {11, 3, 2}};
  for (Shift const& s : shifts)
    if (s.k == k && s.e == e) return s.to;
  return -1;
}

// A note of key number k (note 60 + k) spelled e, senseful or not: made on a key
// number where e is senseful, then moved without a spelling check.
CNote Given(int k, int e) {
  CNote note(e == 1 || e == 4 ? 61 : 60, static_cast<TEnh>(e));
  note.SetNoteNr(60 + k);
  return note;
}

// The major triad on key number k, rooted on C.
CChord TriadOn(int k) { return WithRoot(60, {60 + k, 64 + k, 67 + k}); }

TEST(NameForThisRootNote, EveryRootInEverySpelling) {
  for (int k = 0; k < 12; ++k)
    for (int e = 0; e <= 4; ++e) {
      CNote root = Given(k, e);
      int expected = oracle::Senseful(k, e) ? e : CMajorSpelling[k];
      CChord chord = TriadOn(k);
      EXPECT_EQ(chord.NameForThisRootNote(root, DefaultChordnamePref), oracle::Name(k, expected) + "  ")
          << k << " " << e;
      EXPECT_EQ(root.Enh(), expected) << k << " " << e;
      EXPECT_EQ(root.NoteNr(), 60 + k);
      // The chord itself keeps its root.
      EXPECT_EQ(chord.RootNote(), Nat(60));
    }
}

TEST(NameWithLeastSignsForThisRootNote, EveryRootKeepsItsCheckedSpelling) {
  for (int k = 0; k < 12; ++k)
    for (int e = 0; e <= 4; ++e) {
      CNote root = Given(k, e);
      int expected = Checked(k, e);
      ASSERT_GE(expected, 0) << k << " " << e;
      EXPECT_EQ(TriadOn(k).NameWithLeastSignsForThisRootNote(root, DefaultChordnamePref),
                oracle::Name(k, expected) + "  ")
          << k << " " << e;
      EXPECT_EQ(root.Enh(), expected) << k << " " << e;
    }
}

TEST(NameWithLeastSignsForThisRootNote, FewerSignsDoNotWin) {
  // C sharp major has seven sharps, D flat major five flats: the given spelling
  // stands all the same.
  CChord chord = TriadOn(1);
  EXPECT_EQ(chord.NameWithLeastSignsForThisRootNote(CNote(61, Enh_Sharp), DefaultChordnamePref), "C#  ");
  EXPECT_EQ(chord.NameWithLeastSignsForThisRootNote(CNote(61, Enh_Flat), DefaultChordnamePref), "Db  ");
  EXPECT_EQ(chord.NameWithLeastSignsForThisRootNote(CNote(61, Enh_DoubleSharp), DefaultChordnamePref), "Bx  ");
}

TEST(NameWithLeastSignsForThisRootNote, RespellsThisChordsRootWhenNotSenseful) {
  CNote root(60, Enh_Natural);
  root.SetNoteNr(61); // C sharp spelled as a natural
  CChord chord = ChordOf({61, 65, 68});
  chord.SetRootNote(root);
  ASSERT_EQ(chord.RootNote().Enh(), Enh_Natural);
  // Over F sharp the notes C sharp, F and G sharp are a suspended second with a
  // major seventh.
  EXPECT_EQ(chord.NameWithLeastSignsForThisRootNote(CNote(66, Enh_Sharp), DefaultChordnamePref), "F# ma7 sus 2");
  // The key of D flat major, five flats, is the one counted for this root.
  EXPECT_EQ(chord.RootNote(), CNote(61, Enh_Flat));
}

} // namespace
