// Root finding and the small root operations. By rules, the scores and the choice of
// the root are checked against a model written from their description: the weight
// tables of chord/, the intervals computed from the notes' pitch classes, the special
// chords, the tie and the distance rules; how well the net names roots is measured
// by training.root_accuracy. Spelling is checked in RootSpellingTest.cpp.
#include "chord/RootWeights.h"
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"
#include "support/TestPrelude.h"

namespace {

using namespace chordtest;
using oracle::Mod12;

// What the rules read of a chord: its notes' pitch classes, lowest note first, and
// the pitch class of the current root.
struct Model {
  std::vector<int> pcs;
  int root;

  Intvls Cache() const {
    Intvls cache;
    for (int pc : pcs) cache.insert(Mod12(pc - root));
    return cache;
  }

  // Special chords score their candidate (lowest + 2 not taken round the octave); else
  // each interval's note (the one at that pitch class above the root) is weighted by
  // its distance above the candidate, the first three four times with 7 or more.
  int Score(int c) const {
    Intvls const cache = Cache();
    int const low = pcs.front();
    struct Special {
      Intvls cache;
      int candidate, score;
    } const specials[] = {{{0, 6, 11}, low + 2, 33},
                          {{0, 4, 9, 10}, low, 45},
                          {{0, 2, 6, 11}, low + 2, 45},
                          {{0, 3, 6, 10}, low, 48},
                          {{0, 7}, pcs.size() == 3 ? low : -1, 5}};
    for (Special const& s : specials)
      if (cache == s.cache && c == s.candidate) return s.score;
    int sum = 0, k = 0;
    for (int intvl : cache) {
      int const weight = RootWeights(cache.size())[Mod12(root + intvl - c)];
      sum += (cache.size() >= 7 && k++ < 3) ? 4 * weight : weight;
    }
    return sum;
  }

  // A higher score wins; a tie goes by membership of the intervals above the current
  // root, then by the shorter distance to the lowest note.
  int Likeliest() const {
    Intvls const cache = Cache();
    auto distance = [this](int pc) { return std::min(Mod12(pcs.front() - pc), Mod12(pc - pcs.front())); };
    int best = 0, bestPc = 0;
    for (int pc = 0; pc < 12; ++pc) {
      int const p = Score(pc);
      bool const holdsBest = cache.count(Mod12(bestPc - root)) > 0, holdsCandidate = cache.count(Mod12(pc - root)) > 0;
      if (p > best || (p == best && (holdsBest != holdsCandidate ? holdsCandidate : distance(pc) < distance(bestPc))))
        best = p, bestPc = pc;
    }
    return bestPc;
  }
};

// The library's scores of all twelve pitch classes (a candidate counts by its pitch
// class only) and its choice of root agree with the model.
bool AgreesWithModel(CChord chord, Model const& model) {
  std::string const what = ListLabel("pitch classes", model.pcs) + ", root " + std::to_string(model.root);
  for (int pc = 0; pc < 12; ++pc) {
    EXPECT_EQ(chord.ProbThatNoteIsRootNote(CNote(pc, Enh_Natural)), model.Score(pc)) << what << ": " << pc;
    EXPECT_EQ(chord.ProbThatNoteIsRootNote(CNote(84 + pc, Enh_Sharp)), model.Score(pc)) << what << ": " << pc;
  }
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_RULE_WEIGHTS);
  EXPECT_TRUE(chord.RootNote().NoteNr() == model.Likeliest() && chord.RootNoteSpecified()) << what;
  return !::testing::Test::HasFailure();
}

TEST(RootFindingByRules, EveryPitchClassSetUnderEveryRootAndOverEveryBass) {
  for (unsigned mask = 1; mask < 4096; ++mask) {
    std::vector<int> pcs;
    for (int pc = 0; pc < 12; ++pc)
      if (mask >> pc & 1u) pcs.push_back(pc);
    CChord chord(24);
    chord.SetFromKeyNrSet(CMySet<int>(pcs.begin(), pcs.end()));
    ASSERT_TRUE(AgreesWithModel(chord, Model{pcs, pcs.front()}));
    for (int root = 0; root < 12; ++root) {
      chord.SetRootNote(Nat(48 + root));
      ASSERT_TRUE(AgreesWithModel(chord, Model{pcs, root}));
    }
    for (int bass : pcs) {
      CMySet<int> noteNrs{36 + bass};
      std::vector<int> model{bass};
      for (int pc : pcs) {
        noteNrs.insert(60 + pc);
        model.push_back(pc);
      }
      chord.SetFromNoteNrSet(noteNrs);
      ASSERT_TRUE(AgreesWithModel(chord, Model{model, bass}));
    }
  }
}

// What no voicing reaches: an interval cached above the octave (the root given
// before the notes) has no note at its pitch class and counts the lowest note; every
// algorithm value but the net's takes the rules; a chord without notes becomes the
// undefined chord, its cache fresh (a rebuild would set the mark).
TEST(RootFindingByRules, DirectInsertsAlgorithmValuesAndNoNotes) {
  CChord const ninth = RootedChord(60, {64, 67, 74}); // {4, 7, 14}
  EXPECT_EQ(ninth.ProbThatNoteIsRootNote(Nat(0)), 12 + 14 + 12);
  EXPECT_EQ(ninth.ProbThatNoteIsRootNote(Nat(4)), 18 + 12 + 18);
  for (int algo : {-1, 0, 1, 2}) {
    CChord chord = ChordOf({60, 62}); // C D: C by the net, D by the rules
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(static_cast<TSingleChordAnalysisAlgo>(algo));
    EXPECT_EQ(chord.RootNote().NoteNr(), algo == SCA_NEURONAL_NET ? 0 : 2) << algo;
    CChord empty = ChordOf({60});
    empty.IntvlSet();
    empty.DelNote(Nat(60));
    empty.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(static_cast<TSingleChordAnalysisAlgo>(algo));
    EXPECT_TRUE(empty.IsUndefined() && empty.RootNoteSpecified() && empty.IntvlSet().empty()) << algo;
    EXPECT_FALSE(empty.LowestNoteLonely()) << algo;
  }
}

// Whatever the chord held before, root finding leaves the cache and the mark of its
// notes above the root it found, fresh, as a chord given those notes and that root
// builds them.
TEST(RootFinding, LeavesTheCacheOfItsRoot) {
  for (unsigned mask = 1; mask < 4096; mask += 7)
    for (TSingleChordAnalysisAlgo algo : {SCA_RULE_WEIGHTS, SCA_NEURONAL_NET}) {
      std::vector<long> noteNrs{36 + static_cast<long>(mask % 12)};
      for (int pc = 0; pc < 12; ++pc)
        if (mask >> pc & 1u) noteNrs.push_back(48 + pc + 12 * (pc % 2));
      CChord chord = RootedChord(40, noteNrs); // unfolded differences, a ninth as 14
      chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
      CChord const fresh = NotesThenRoot(chord.RootNote(), NoteNrs(chord));
      ASSERT_EQ(Members(chord.IntvlSet()), Members(fresh.IntvlSet())) << mask << " " << algo;
      EXPECT_EQ(chord.LowestNoteLonely(), fresh.LowestNoteLonely()) << mask << " " << algo;
    }
}

} // namespace
