// A chord in a key: harmonic function codes and names, closeness, the notes and intervals
// outside the key, for chords on every pitch class in every major and minor key,
// read through the key's own list of degrees and the tables of chord/.
#include "chord/ClosenessTables.h"
#include "chord/HarmFuncCodes.h"
#include "naming/HarmFuncNames.h"
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"
#include "support/TestPrelude.h"

namespace {

using namespace chordtest;

std::vector<CSignKey> AllKeys() {
  std::vector<CSignKey> keys;
  for (int root = 0; root < 12; ++root)
    for (auto type : {CSignKey::SignKey_Major, CSignKey::SignKey_Minor}) keys.emplace_back(Nat(root), type);
  return keys;
}

// A chord of the basic chord on pitch class pc; for bc_none root, fifth and minor
// seventh, which are no basic chord.
CChord ChordOn(int pc, int bc) {
  if (bc == CChord::bc_none) return NotesThenRoot(Nat(48 + pc), {48 + pc, 55 + pc, 58 + pc});
  return CChord(Nat(60 + pc), static_cast<CChord::TBasicChord>(bc), 24);
}

TEST(ChordInKey, FunctionAndClosenessOfEveryBasicChordOnEveryPitchClass) {
  PrefGuard guard;
  for (CSignKey const& key : AllKeys()) {
    CScale const& scale = key.Scale();
    int const keyRoot = key.RootNote().KeyNr();
    bool const major = key.SignKeyType() == CSignKey::SignKey_Major;
    for (int distance = 0; distance < 12; ++distance) {
      int degree = -1; // of the chord's root in the key
      for (int d = 0; d < 7; ++d)
        if (scale.DegreeNrToKeyNr(d) == (keyRoot + distance) % 12) degree = d;
      for (int bc = CChord::bc_none; bc <= CChord::bc_drone; ++bc) {
        CChord const chord = ChordOn((keyRoot + distance) % 12, bc);
        ASSERT_EQ(chord.BasicChord(), bc);
        int const code = degree < 0 ? 0 : HarmFuncCodes[degree][bc];
        EXPECT_EQ(chord.HarmFuncIn(key), code) << key.Name(DefaultChordnamePref) << " " << distance << " " << bc;
        for (int naming : {0, 1, 2}) { // only 1 names functions
          CChordnamePref::HarmFuncNaming = naming;
          EXPECT_EQ(chord.HarmFuncName(key, DefaultChordnamePref), HarmFuncText(code, naming == 1, major)) << naming;
        }
        int const* closeness = ClosenessTable(bc, major);
        EXPECT_EQ(chord.ClosenessToSignKey(key), closeness ? closeness[distance] : chord.CountIntvlsInSignKey(key))
            << key.Name(DefaultChordnamePref) << " " << distance << " " << bc;
      }
    }
  }
  // The root counts by its pitch class, whatever its octave or spelling; the
  // undefined root has key number 3.
  CSignKey const cMajor(Nat(0), CSignKey::SignKey_Major), cMinor(Nat(0), CSignKey::SignKey_Minor);
  EXPECT_EQ(NotesThenRoot(CNote(31, Enh_DoubleSharp), {43, 47, 50}).HarmFuncIn(cMajor), 10);
  EXPECT_EQ(NotesThenRoot(CNote_Undef, {51, 55, 58}).HarmFuncIn(cMinor), 6);
}

// Every pitch class set in every key: pitch classes divisible by 3 doubled two
// octaves up count twice among the notes, once among the intervals.
TEST(ChordInKey, NotesAndIntervalsOutsideTheKey) {
  for (CSignKey const& key : AllKeys()) {
    for (unsigned set = 0; set < 4096; ++set) {
      CMySet<int> noteNrs;
      int in = 0, out = 0, notesOut = 0;
      for (int pc = 0; pc < 12; ++pc) {
        if ((set >> pc & 1u) == 0) continue;
        bool const inKey = key.Scale().HasKeyNr(pc);
        (inKey ? in : out) += 1;
        noteNrs.insert(48 + pc);
        notesOut += inKey ? 0 : pc % 3 == 0 ? 2 : 1;
        if (pc % 3 == 0) noteNrs.insert(72 + pc);
      }
      CChord chord;
      chord.SetFromNoteNrSet(noteNrs);
      ASSERT_EQ(chord.CountIntvlsInSignKey(key), in) << key.Name(DefaultChordnamePref) << " " << set;
      ASSERT_EQ(chord.CountIntvlsNotInSignKey(key), out) << key.Name(DefaultChordnamePref) << " " << set;
      ASSERT_EQ(chord.CountNotesNotInSignKey(key), notesOut) << key.Name(DefaultChordnamePref) << " " << set;
      ASSERT_EQ(chord.IsInSignKey(key), out == 0) << key.Name(DefaultChordnamePref) << " " << set;
    }
    EXPECT_TRUE(CChord_Undef.IsInSignKey(key));
  }
  // Under a root given first, C sharp an octave up is cached as 13, which no note's
  // pitch class interval matches: it stands for the lowest note, C, in C major.
  CChord const chord = RootedChord(60, {60, 64, 67, 73});
  CSignKey const cMajor(Nat(0), CSignKey::SignKey_Major);
  EXPECT_EQ(chord.CountIntvlsInSignKey(cMajor), 4);
  EXPECT_EQ(chord.CountNotesNotInSignKey(cMajor), 1);
}

} // namespace
