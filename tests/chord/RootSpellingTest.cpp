// Spelling after root finding: the root's spelling with the fewest key-signature signs
// and the notes spelled after the root's scale. Expectations come from the letter
// model of tests/support (sign counts, senseful spellings) and the letter-built scales
// of tests/scale.
#include "scale/ScaleOracle.h"
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace {

using namespace chordtest;
using oracle::Mod12;

TEnh E(int e) { return static_cast<TEnh>(e); }

// The spelling a natural black key is corrected to: that of the default scale, C
// major.
int DefaultSpelling(int pc) { return scaleoracle::Spellings({0, 2}, 1).e[pc]; }

// The next senseful spelling of pc toward the flats or the sharps; at the end of the
// row the spelling itself.
int StepToFlats(int pc, int e) {
  for (int f = e - 1; f >= 0; --f)
    if (oracle::Senseful(pc, f)) return f;
  return e;
}
int StepToSharps(int pc, int e) {
  for (int s = e + 1; s <= 4; ++s)
    if (oracle::Senseful(pc, s)) return s;
  return e;
}

// Which spelling of a root (pc, e) gives the chord of basic chord bc the fewest signs:
// the spelling itself, one step toward the flats or one toward the sharps; ties keep
// the spelling, then take the flats.
int FewestSignsSpelling(int pc, int e, int bc) {
  auto signs = [pc, bc](int spelling) { return std::abs(oracle::SignCount(pc, spelling, bc)); };
  int const flat = StepToFlats(pc, e), sharp = StepToSharps(pc, e);
  int const asIs = signs(e), flatter = signs(flat), sharper = signs(sharp);
  if (asIs <= flatter && asIs <= sharper) return e;
  if (flatter < asIs && flatter <= sharper) return flat;
  return sharp;
}

// The spelling of every pitch class in the scale of a chord on the root (pc, e): minor
// for minor and diminished chords, else major; a minor second above the root, when
// the chord has one, as the lowered second degree. Then corrected as a note is: a
// natural black key (the minor scale leaves its raised seventh plain) takes the
// default spelling.
scaleoracle::SpellingTable ChordNoteSpellings(int pc, int e, int bc, bool minorSecond) {
  scaleoracle::SpellingTable table = scaleoracle::Spellings({pc, e}, (bc == 2 || bc == 4) ? 2 : 1);
  if (minorSecond) table.e[Mod12(pc + 1)] = table.e[Mod12(pc + 2)] - 1;
  for (int k = 0; k < 12; ++k) {
    if (oracle::Senseful(k, table.e[k])) continue;
    EXPECT_EQ(table.e[k], Enh_Natural) << "root " << oracle::Name(pc, e) << " key " << k;
    table.e[k] = DefaultSpelling(k);
  }
  return table;
}

// ---- After root finding --------------------------------------------------------------

// Root finding by both algorithms on every pitch class set, as key numbers and as a
// voicing over a bass two octaves down: the found root (pitch class k in the lowest
// octave, first spelled as C major spells k) takes the spelling with the fewest
// signs, and every note the spelling of the scale on it.
TEST(RootSpelling, EveryPitchClassSetAfterRootFinding) {
  for (TSingleChordAnalysisAlgo algo : {SCA_RULE_WEIGHTS, SCA_NEURONAL_NET}) {
    SCOPED_TRACE(algo == SCA_NEURONAL_NET ? "by net" : "by rules");
    bool rootSeen[12][2] = {};
    int respelledRoots = 0;
    bool agreed = true;
    for (unsigned mask = 1; mask < 4096 && agreed; ++mask) {
      CMySet<int> keyNrs, voicing;
      for (int pc = 0; pc < 12; ++pc) {
        if (!(mask & (1u << pc))) continue;
        keyNrs.insert(pc);
        voicing.insert(60 + pc);
      }
      voicing.insert(36 + *keyNrs.rbegin());
      for (bool voiced : {false, true}) {
        CChord chord(24);
        if (voiced)
          chord.SetFromNoteNrSet(voicing);
        else
          chord.SetFromKeyNrSet(keyNrs);
        chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        SCOPED_TRACE("set " + std::to_string(mask) + (voiced ? " voiced" : ""));

        long const k = chord.RootNote().NoteNr();
        ASSERT_TRUE(k >= 0 && k < 12);
        int const pc = static_cast<int>(k);
        int const bc = chord.BasicChord();
        int const spelling = FewestSignsSpelling(pc, DefaultSpelling(pc), bc);
        EXPECT_EQ(chord.RootNote().Enh(), spelling);
        respelledRoots += spelling != DefaultSpelling(pc);
        rootSeen[pc][bc == 2 || bc == 4] = true;

        scaleoracle::SpellingTable const expected =
            ChordNoteSpellings(pc, spelling, bc, keyNrs.count(Mod12(pc + 1)) > 0);
        for (CNote const& note : chord.Notes())
          EXPECT_EQ(note.Enh(), expected.e[note.KeyNr()]) << "note " << note.NoteNr();
        agreed = !HasFailure();
      }
    }
    for (int pc = 0; pc < 12; ++pc) {
      EXPECT_TRUE(rootSeen[pc][0]) << "major-type root " << pc;
      EXPECT_TRUE(rootSeen[pc][1]) << "minor-type root " << pc;
    }
    EXPECT_GT(respelledRoots, 0);
  }
}

// ---- Fewest signs --------------------------------------------------------------------

TEST(RootSpelling, FewestSignsForEveryRootSpellingAndBasicChord) {
  int kept = 0, toFlats = 0, toSharps = 0;
  for (int k = 0; k < 12; ++k) {
    for (int e : oracle::SensefulSpellings(k)) {
      for (int bc = CChord::bc_none; bc <= CChord::bc_drone; ++bc) {
        CChord chord(CNote(48 + k, E(e)), static_cast<CChord::TBasicChord>(bc), 24);
        ASSERT_EQ(chord.BasicChord(), bc);
        chord.SetRootNoteEnhWithLeastSigns();
        int const expected = FewestSignsSpelling(k, e, bc);
        EXPECT_EQ(chord.RootNote(), CNote(48 + k, E(expected))) << oracle::Name(k, e) << " bc " << bc;
        EXPECT_TRUE(chord.RootNoteSpecified());
        kept += expected == e;
        toFlats += expected < e;
        toSharps += expected > e;
      }
    }
  }
  EXPECT_GT(kept, 0);
  EXPECT_GT(toFlats, 0);
  EXPECT_GT(toSharps, 0);
}

TEST(RootSpelling, FewestSignsExamples) {
  struct Case {
    int k, e;
    CChord::TBasicChord bc;
    int expected;
  } const cases[] = {
      {1, Enh_Sharp, CChord::bc_maj, Enh_Flat},           // C# major (7) -> Db (-5)
      {6, Enh_Sharp, CChord::bc_maj, Enh_Sharp},          // F# (6) ties with Gb (-6): kept
      {6, Enh_Flat, CChord::bc_maj, Enh_Flat},            // and Gb is kept the same way
      {8, Enh_Flat, CChord::bc_min, Enh_Sharp},           // Ab minor (-7) -> G# minor (5)
      {11, Enh_DoubleSharp, CChord::bc_maj, Enh_Natural}, // Ax major (17) -> B (5)
  };
  for (Case const& c : cases) {
    CChord chord(CNote(60 + c.k, E(c.e)), c.bc, 24);
    chord.SetRootNoteEnhWithLeastSigns();
    EXPECT_EQ(chord.RootNote().Enh(), c.expected) << oracle::Name(c.k, c.e);
  }

  // A root spelled as no key can be (a triple flat from a scale on a double flat) is
  // corrected first: to G#, whose major chord then goes to Ab.
  CNote tripleFlat(56, Enh_Natural);
  tripleFlat.AdjustEnhToScale(CScale(CNote(0, Enh_DoubleFlat), CScale::Scale_Major));
  ASSERT_EQ(tripleFlat.Enh(), -1);
  CChord chord(tripleFlat, CChord::bc_maj, 24);
  chord.SetRootNoteEnhWithLeastSigns();
  EXPECT_EQ(chord.RootNote(), CNote(56, Enh_Flat));

  // The root is set: specified, and the intervals are rebuilt (the ninth inserted
  // directly as 14 folds to 2) even where the spelling stays.
  CChord ninth = RootedChord(60, {60, 74});
  ASSERT_EQ(Members(ninth.IntvlSet()), (Intvls{0, 14}));
  ninth.Init(); // flags only: not specified, the cache kept
  ninth.SetRootNoteEnhWithLeastSigns();
  EXPECT_EQ(ninth.RootNote(), Nat(60));
  EXPECT_TRUE(ninth.RootNoteSpecified());
  EXPECT_EQ(Members(ninth.IntvlSet()), (Intvls{0, 2}));
}

// ---- Notes after the root's scale ----------------------------------------------------

TEST(RootSpelling, AdjustEnhOfChordNotesToRootScale) {
  // Db major held as C#, F, G#: all but F respelled.
  CChord dFlat(24);
  for (CNote n : {CNote(61, Enh_Sharp), CNote(65, Enh_Natural), CNote(68, Enh_Sharp)}) dFlat.AddNote(n);
  dFlat.SetRootNote(CNote(61, Enh_Flat));
  bool changed = true;
  dFlat.AdjustEnhOfChordNotesToRootScale(&changed);
  EXPECT_FALSE(changed); // false whatever happened
  EXPECT_EQ(dFlat.Note(0), CNote(61, Enh_Flat));
  EXPECT_EQ(dFlat.Note(1), CNote(65, Enh_Natural));
  EXPECT_EQ(dFlat.Note(2), CNote(68, Enh_Flat));
  EXPECT_EQ(dFlat.RootNote(), CNote(61, Enh_Flat));

  CChord cMajor = ChordOf({60, 64, 67});
  changed = true;
  cMajor.AdjustEnhOfChordNotesToRootScale(&changed);
  EXPECT_FALSE(changed);
  EXPECT_EQ(cMajor, ChordOf({60, 64, 67}));
  cMajor.AdjustEnhOfChordNotesToRootScale(nullptr);
  EXPECT_EQ(cMajor, ChordOf({60, 64, 67}));

  // A minor with its raised seventh: the minor scale leaves G# plain, and a plain
  // black key is C major's A flat.
  CChord aMinor(24);
  for (CNote n : {Nat(57), Nat(60), Nat(64), CNote(68, Enh_Sharp)}) aMinor.AddNote(n);
  aMinor.AdjustEnhOfChordNotesToRootScale(nullptr);
  EXPECT_EQ(aMinor.Note(3), CNote(68, Enh_Flat));

  // C# and Db over C, with G: the minor second is Db, and the two become one note.
  CChord twoSpellings(24);
  for (CNote n : {Nat(60), CNote(61, Enh_Sharp), CNote(61, Enh_Flat), Nat(67)}) twoSpellings.AddNote(n);
  ASSERT_EQ(twoSpellings.NoteCount(), 4u);
  twoSpellings.AdjustEnhOfChordNotesToRootScale(nullptr);
  ASSERT_EQ(twoSpellings.NoteCount(), 3u);
  EXPECT_EQ(twoSpellings.Note(1), CNote(61, Enh_Flat));
  EXPECT_EQ(twoSpellings.Note(2), Nat(67));
  EXPECT_EQ(Members(twoSpellings.IntvlSet()), (Intvls{0, 1, 7}));
}

} // namespace
