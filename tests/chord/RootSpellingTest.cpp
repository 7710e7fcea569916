// Spelling after root finding: the root's spelling with the fewest key-signature signs
// and the notes spelled after the root's scale, against the letter model and the
// letter-built scales.
#include "scale/ScaleOracle.h"
#include "support/ChordBuilders.h"
#include "support/TestPrelude.h"

namespace {

using namespace chordtest;
using oracle::Mod12;
using scaleoracle::DefaultSpelling;

// Which spelling of a root (pc, e) gives the chord of basic chord bc the fewest signs:
// the spelling itself, one step toward the flats or one toward the sharps (shifts
// checked in NoteTest.cpp); ties keep the spelling, then take the flats.
int FewestSignsSpelling(int pc, int e, int bc) {
  auto signs = [pc, bc](int spelling) { return std::abs(oracle::SignCount(pc, spelling, bc)); };
  int const flat = EnhShiftToFlats(pc, static_cast<TEnh>(e)), sharp = EnhShiftToSharps(pc, static_cast<TEnh>(e));
  if (signs(e) <= signs(flat) && signs(e) <= signs(sharp)) return e;
  return signs(flat) <= signs(sharp) ? flat : sharp;
}

// The spelling of every pitch class in the scale of a chord on the root (pc, e): minor
// for minor and diminished chords, else major; a minor second above the root, when
// the chord has one, as the lowered second degree; a natural black key (the minor
// scale leaves its raised seventh plain) corrected to the default spelling.
scaleoracle::SpellingTable ChordNoteSpellings(int pc, int e, int bc, bool minorSecond) {
  scaleoracle::SpellingTable table = scaleoracle::Spellings({pc, e}, (bc == 2 || bc == 4) ? 2 : 1);
  if (minorSecond) table.e[Mod12(pc + 1)] = table.e[Mod12(pc + 2)] - 1;
  for (int k = 0; k < 12; ++k)
    if (!oracle::Senseful(k, table.e[k])) table.e[k] = DefaultSpelling(k);
  return table;
}

// Both algorithms on every pitch class set, as key numbers and as a voicing over a
// bass two octaves down: the found root (pitch class k in the lowest octave, first
// spelled as C major spells k) takes the spelling with the fewest signs, and every
// note the spelling of the scale on it.
TEST(RootSpelling, EveryPitchClassSetAfterRootFinding) {
  for (TSingleChordAnalysisAlgo algo : {SCA_RULE_WEIGHTS, SCA_NEURONAL_NET}) {
    int respelledRoots = 0;
    for (unsigned mask = 1; mask < 4096; ++mask) {
      CMySet<int> keyNrs, voicing;
      for (int pc = 0; pc < 12; ++pc)
        if (mask >> pc & 1u) {
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
        std::string const what = std::to_string(algo) + " " + std::to_string(mask) + (voiced ? " voiced" : "");
        int const pc = static_cast<int>(chord.RootNote().NoteNr());
        ASSERT_TRUE(pc >= 0 && pc < 12) << what;
        int const bc = chord.BasicChord(), spelling = FewestSignsSpelling(pc, DefaultSpelling(pc), bc);
        ASSERT_EQ(chord.RootNote().Enh(), spelling) << what;
        respelledRoots += spelling != DefaultSpelling(pc);
        scaleoracle::SpellingTable const expected = ChordNoteSpellings(pc, spelling, bc, keyNrs.count(Mod12(pc + 1)));
        for (CNote const& note : chord.Notes()) ASSERT_EQ(note.Enh(), expected.e[note.KeyNr()]) << what << " " << note;
      }
    }
    EXPECT_GT(respelledRoots, 0);
  }
}

TEST(RootSpelling, FewestSignsForEveryRootSpellingAndBasicChord) {
  for (int k = 0; k < 12; ++k)
    for (int e : oracle::SensefulSpellings(k))
      for (int bc = CChord::bc_none; bc <= CChord::bc_drone; ++bc) {
        CChord chord(CNote(48 + k, static_cast<TEnh>(e)), static_cast<CChord::TBasicChord>(bc), 24);
        chord.SetRootNoteEnhWithLeastSigns();
        EXPECT_EQ(chord.RootNote(), CNote(48 + k, static_cast<TEnh>(FewestSignsSpelling(k, e, bc))))
            << oracle::Name(k, e) << " " << bc;
        EXPECT_TRUE(chord.RootNoteSpecified());
      }
  // A root spelled as no key can be (a triple flat from a scale on a double flat) is
  // corrected first: to G#, whose major chord then goes to Ab.
  CNote tripleFlat(56, Enh_Natural);
  tripleFlat.AdjustEnhToScale(CScale(CNote(0, Enh_DoubleFlat), CScale::Scale_Major));
  CChord chord(tripleFlat, CChord::bc_maj, 24);
  chord.SetRootNoteEnhWithLeastSigns();
  EXPECT_EQ(chord.RootNote(), CNote(56, Enh_Flat));
  // The root is set: the intervals are rebuilt even where the spelling stays.
  CChord ninth = RootedChord(60, {60, 74});
  ninth.SetRootNoteEnhWithLeastSigns();
  EXPECT_EQ(Members(ninth.IntvlSet()), (Intvls{0, 2}));
}

// C sharp and D flat over C, with G: the minor second is D flat, and the two become
// one note; the flag comes back false whatever happened.
TEST(RootSpelling, AdjustEnhOfChordNotesToRootScale) {
  CChord chord(24);
  for (CNote n : {Nat(60), CNote(61, Enh_Sharp), CNote(61, Enh_Flat), Nat(67)}) chord.AddNote(n);
  bool changed = true;
  chord.AdjustEnhOfChordNotesToRootScale(&changed);
  EXPECT_TRUE(!changed && NoteNrs(chord) == (std::vector<long>{60, 61, 67}) && chord.Note(1) == CNote(61, Enh_Flat));
}

} // namespace
