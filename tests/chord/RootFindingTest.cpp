// Root finding by rules and the small root operations. The scores and the choice of
// the root are checked against a model written from their description: the weight
// tables as data, the intervals computed from the notes' pitch classes, the special
// chords, the tie and the distance rules. Spelling is checked in RootSpellingTest.cpp.
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <cstddef>
#include <set>
#include <string>
#include <vector>

namespace {

using namespace chordtest;
using oracle::Mod12;

// ---- Model of the scores -----------------------------------------------------------

// Weights by the distance from the candidate up to a note, for 1 or 2 intervals, 3,
// 4 to 6, and 7 or more.
int const Weight2[12] = {3, 0, 0, 2, 2, 0, 0, 1, 0, 0, 2, 2};
int const Weight3[12] = {18, 0, 2, 12, 12, 2, 2, 14, 1, 2, 5, 5};
int const Weight4[12] = {18, 0, 3, 12, 12, 3, 3, 14, 0, 3, 3, 3};
int const Weight7[12] = {18, 8, 8, 12, 12, 6, 5, 14, 4, 4, 10, 10};

// How often each rule decided, so that the exhaustive runs show they reached it.
struct Tally {
  int special[5] = {};        // {0,6,11}, {0,4,9,10}, {0,2,6,11}, {0,3,6,10}, {0,7} of three notes
  int specialBlockedHigh = 0; // {0,6,11} or {0,2,6,11} over a lowest B flat or B
  int tieKept = 0, tieTaken = 0, tieByDistanceTaken = 0, tieByDistanceKept = 0;
};

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
  int Lowest() const { return pcs.empty() ? 255 % 12 : pcs.front(); }

  int Score(int c, Tally* tally = nullptr) const {
    Intvls const cache = Cache();
    int const low = Lowest();
    struct Special {
      Intvls cache;
      int candidate; // not taken round the octave
      int score;
    } const specials[] = {{{0, 6, 11}, low + 2, 33},
                          {{0, 4, 9, 10}, low, 45},
                          {{0, 2, 6, 11}, low + 2, 45},
                          {{0, 3, 6, 10}, low, 48},
                          {{0, 7}, pcs.size() == 3 ? low : -1, 5}};
    for (int s = 0; s < 5; ++s) {
      if (cache != specials[s].cache) continue;
      if (specials[s].candidate > 11 && tally) ++tally->specialBlockedHigh;
      if (c != specials[s].candidate) continue;
      if (tally) ++tally->special[s];
      return specials[s].score;
    }
    std::size_t const n = cache.size();
    int const* table = n <= 2 ? Weight2 : n == 3 ? Weight3 : n <= 6 ? Weight4 : Weight7;
    int sum = 0, k = 0;
    for (int intvl : cache) {
      int notePc = Mod12(root + intvl); // the note that lies at this interval
      int weight = table[Mod12(notePc - c)];
      sum += (n >= 7 && k < 3) ? 4 * weight : weight;
      ++k;
    }
    return sum;
  }

  // The pitch class the rules choose, walked as described: a higher score wins, a
  // tie goes by membership of the intervals above the current root, then by the
  // shorter distance to the lowest note.
  int Likeliest(Tally& tally) const {
    Intvls const cache = Cache();
    int const low = Lowest();
    auto distance = [low](int pc) {
      int d = low > pc ? low - pc : pc - low;
      return d > 6 ? 12 - d : d;
    };
    int best = 0, bestPc = 0;
    for (int pc = 0; pc < 12; ++pc) {
      int const p = Score(pc, &tally);
      if (p > best) {
        best = p;
        bestPc = pc;
        continue;
      }
      if (p < best) continue;
      bool const holdsBest = cache.count(Mod12(bestPc - root)) > 0;
      bool const holdsCandidate = cache.count(Mod12(pc - root)) > 0;
      bool byDistance = false;
      if (!cache.empty() && holdsBest) {
        if (holdsCandidate)
          byDistance = true;
        else
          ++tally.tieKept;
      } else if (!cache.empty() && holdsCandidate) {
        ++tally.tieTaken;
        bestPc = pc;
      } else {
        byDistance = true;
      }
      if (!byDistance || pc == bestPc) continue; // pc 0 against the initial best
      if (distance(pc) < distance(bestPc)) {
        ++tally.tieByDistanceTaken;
        bestPc = pc;
      } else {
        ++tally.tieByDistanceKept;
      }
    }
    return bestPc;
  }
};

std::string Describe(Model const& model) {
  std::string text = "pitch classes";
  for (int pc : model.pcs) text += " " + std::to_string(pc);
  return text + ", root " + std::to_string(model.root);
}

// The library's scores of all twelve pitch classes and its choice of root agree with
// the model. A candidate counts by its pitch class only, whatever its octave and
// spelling. Returns false after the first disagreement, to keep the report short.
bool AgreesWithModel(CChord chord, Model const& model, Tally& tally) {
  SCOPED_TRACE(Describe(model));
  for (int pc = 0; pc < 12; ++pc) {
    int expected = model.Score(pc);
    EXPECT_EQ(chord.ProbThatNoteIsRootNote(CNote(pc, Enh_Natural)), expected) << "candidate " << pc;
    EXPECT_EQ(chord.ProbThatNoteIsRootNote(CNote(84 + pc, Enh_Sharp)), expected) << "candidate " << pc;
  }
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_RULE_WEIGHTS);
  EXPECT_EQ(chord.RootNote().NoteNr(), model.Likeliest(tally));
  EXPECT_TRUE(chord.RootNoteSpecified());
  return !::testing::Test::HasFailure();
}

std::vector<int> PitchClassesOf(unsigned mask) {
  std::vector<int> pcs;
  for (int pc = 0; pc < 12; ++pc)
    if (mask & (1u << pc)) pcs.push_back(pc);
  return pcs;
}

// ---- Every pitch class set -----------------------------------------------------------

TEST(RootFindingByRules, EveryKeyNumberSetUnderEveryCurrentRoot) {
  Tally tally;
  bool agreed = true;
  for (unsigned mask = 1; mask < 4096 && agreed; ++mask) {
    std::vector<int> const pcs = PitchClassesOf(mask);
    CChord chord(24);
    chord.SetFromKeyNrSet(CMySet<int>(pcs.begin(), pcs.end()));
    // As set from key numbers, the lowest note is the root; then every other root.
    agreed = AgreesWithModel(chord, Model{pcs, pcs.front()}, tally);
    for (int root = 0; root < 12 && agreed; ++root) {
      chord.SetRootNote(CNote(48 + root, Enh_Natural));
      agreed = AgreesWithModel(chord, Model{pcs, root}, tally);
    }
  }
  // Key numbers give one note per pitch class, the lowest the smallest: the fifth of
  // three notes and the special chords over a lowest B flat or B are left to the
  // voicings below.
  for (int s = 0; s < 4; ++s) EXPECT_GT(tally.special[s], 0) << "special rule " << s;
  EXPECT_GT(tally.tieKept, 0);
  EXPECT_GT(tally.tieTaken, 0);
  EXPECT_GT(tally.tieByDistanceTaken, 0);
  EXPECT_GT(tally.tieByDistanceKept, 0);
}

TEST(RootFindingByRules, EveryVoicingAboveABassInAnotherOctave) {
  // The bass two octaves below the set, which it doubles: one note more than pitch
  // classes, so {0, 7} over its bass is the three-note fifth.
  Tally tally;
  bool agreed = true;
  for (unsigned mask = 1; mask < 4096 && agreed; ++mask) {
    std::vector<int> const pcs = PitchClassesOf(mask);
    for (int bass : pcs) {
      CMySet<int> noteNrs{36 + bass};
      std::vector<int> model{bass};
      for (int pc : pcs) {
        noteNrs.insert(60 + pc);
        model.push_back(pc);
      }
      CChord chord(24);
      chord.SetFromNoteNrSet(noteNrs);
      if (!(agreed = AgreesWithModel(chord, Model{model, bass}, tally))) break;
    }
  }
  for (int s = 0; s < 5; ++s) EXPECT_GT(tally.special[s], 0) << "special rule " << s;
  EXPECT_GT(tally.specialBlockedHigh, 0);
}

// ---- Worked cases ----------------------------------------------------------------------

TEST(RootFindingByRules, SpecialChords) {
  struct Case {
    std::vector<long> notes;
    int candidate;
    int score;
  } const cases[] = {
      // C F# B: D scores 33 instead of its weighted 19, above B's 32.
      {{60, 66, 71}, 2, 33},
      {{60, 66, 71}, 11, 32},
      // The same shape over A# and over B: L + 2 is 12 or 13, which no pitch class
      // equals, so C and C# keep their weighted 19.
      {{58, 64, 69}, 0, 19},
      {{59, 65, 70}, 1, 19},
      {{60, 64, 69, 70}, 0, 45}, // C E A Bb
      {{60, 62, 66, 71}, 2, 45}, // C D F# B
      {{58, 60, 64, 69}, 0, 36}, // the same over A#: C is weighted, 3 + 18 + 12 + 3
      {{60, 63, 66, 70}, 0, 48}, // C Eb Gb Bb
      // The bare fifth: 5 for the lowest note with three notes, weighted (3 + 1) with
      // two or four.
      {{48, 55, 60}, 0, 5},
      {{48, 55, 67}, 0, 5},
      {{48, 55, 60}, 7, 3},
      {{48, 55}, 0, 4},
      {{48, 55, 60, 67}, 0, 4},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    EXPECT_EQ(chord.ProbThatNoteIsRootNote(Nat(c.candidate)), c.score) << c.notes.front() << " " << c.candidate;
  }
}

TEST(RootFindingByRules, MajorTriadOverItsThird) {
  // E4 G4 C5 with the root at C: the cache is {0, 4, 7} and C scores 18 + 12 + 14.
  CChord chord = ChordOf({64, 67, 72});
  chord.SetRootNote(Nat(60));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4, 7}));
  EXPECT_EQ(chord.ProbThatNoteIsRootNote(Nat(0)), 44);
  EXPECT_EQ(chord.ProbThatNoteIsRootNote(Nat(4)), 31); // 1 + 18 + 12
  EXPECT_EQ(chord.ProbThatNoteIsRootNote(Nat(7)), 22); // 2 + 2 + 18
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_RULE_WEIGHTS);
  EXPECT_EQ(chord.RootNote(), Nat(0));
  EXPECT_TRUE(chord.RootNoteSpecified());
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{64, 67, 72}));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4, 7}));
}

TEST(RootFindingByRules, IntervalWithoutANoteCountsTheLowestNote) {
  // Under the root C, specified before the notes, E4 G4 D5 leave {4, 7, 14}: no note
  // lies at 14 above C by pitch class, so that interval counts the lowest note, E.
  CChord chord = RootedChord(60, {64, 67, 74});
  ASSERT_EQ(Members(chord.IntvlSet()), (Intvls{4, 7, 14}));
  EXPECT_EQ(chord.ProbThatNoteIsRootNote(Nat(0)), 12 + 14 + 12);
  EXPECT_EQ(chord.ProbThatNoteIsRootNote(Nat(4)), 18 + 12 + 18);
}

TEST(RootFindingByRules, EveryAlgorithmValueButTheNetsTakesTheRules) {
  for (std::vector<long> const& notes :
       std::vector<std::vector<long>>{{64, 67, 72}, {60, 66, 71}, {57, 60, 64, 67}, {62, 65, 69, 72, 76}}) {
    CChord byRules = ChordOf(notes);
    byRules.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_RULE_WEIGHTS);
    for (int algo : {-1, 2, 7, 1000}) {
      CChord chord = ChordOf(notes);
      chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(static_cast<TSingleChordAnalysisAlgo>(algo));
      EXPECT_EQ(chord, byRules) << notes.front() << " algo " << algo;
    }
  }
}

TEST(RootFinding, ChordWithoutNotesBecomesUndefinedUnderEveryAlgorithm) {
  for (int algo : {0, 1, 2, -1}) {
    CChord chord(12);
    chord.AddNote(Nat(60));
    chord.AddNote(Nat(64));
    chord.IntvlSet();
    ASSERT_TRUE(chord.LowestNoteLonely()); // the rebuild marked it
    chord.DelNote(Nat(60));
    chord.DelNote(Nat(64));
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(static_cast<TSingleChordAnalysisAlgo>(algo));
    EXPECT_EQ(chord.RootNote(), CNote_Undef) << algo;
    EXPECT_TRUE(chord.IsUndefined());
    EXPECT_TRUE(chord.RootNoteSpecified());
    EXPECT_EQ(chord.NoteCount(), 0u);
    EXPECT_FALSE(chord.LowestNoteLonely());
    // The intervals are fresh: a rebuild would have set the mark again.
    EXPECT_TRUE(chord.IntvlSet().empty());
    EXPECT_FALSE(chord.LowestNoteLonely());
    EXPECT_EQ(chord.IntvlSet().WrapIntvl(), 12);
  }
}

// ---- Root operations ---------------------------------------------------------------

// Whatever the chord held before, root finding leaves the interval cache and the
// lonely-lowest-note mark of its notes above the root it found, fresh, exactly as a
// chord given those notes and that root builds them; a direct insert afterwards
// lands in that cache in both.
TEST(RootFinding, LeavesTheCacheOfItsRoot) {
  for (unsigned mask = 1; mask < 4096; mask += 7)
    for (TSingleChordAnalysisAlgo algo : {SCA_RULE_WEIGHTS, SCA_NEURONAL_NET}) {
      // Notes added under a root given first: the cache holds their unfolded
      // differences (a ninth as 14) until something rebuilds it.
      std::vector<long> noteNrs{36 + static_cast<long>(mask % 12)};
      for (int pc = 0; pc < 12; ++pc)
        if (mask >> pc & 1u) noteNrs.push_back(48 + pc + 12 * (pc % 2));
      CChord chord = RootedChord(40, noteNrs);
      chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);

      CChord fresh(24);
      fresh.SetFromNoteSet(chord.Notes());
      fresh.SetRootNote(chord.RootNote());
      SCOPED_TRACE("mask " + std::to_string(mask) + " algo " + std::to_string(algo));
      ASSERT_EQ(Members(chord.IntvlSet()), Members(fresh.IntvlSet()));
      EXPECT_EQ(chord.LowestNoteLonely(), fresh.LowestNoteLonely());
      chord.AddIntvlInCompingRange(14);
      fresh.AddIntvlInCompingRange(14);
      EXPECT_EQ(Members(chord.IntvlSet()), Members(fresh.IntvlSet()));
    }
}

TEST(RootOperations, SetRootNoteToIntvlIxTakesTheFirstNoteAtThatInterval) {
  CChord chord = ChordOf({64, 67, 72, 84}); // root E: {0, 3, 8}
  chord.SetRootNoteToIntvlIx(2);
  EXPECT_EQ(chord.RootNote(), Nat(72)); // C5, not C6
  EXPECT_TRUE(chord.RootNoteSpecified());
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4, 7}));

  CChord flats(24);
  flats.AddNote(CNote(58, Enh_Flat));
  flats.AddNote(CNote(61, Enh_Flat));
  flats.SetRootNoteToIntvlIx(1);
  EXPECT_EQ(flats.RootNote(), CNote(61, Enh_Flat)); // number and spelling
}

TEST(RootOperations, SetRootNoteToIntvlIxWithoutANoteThereChangesNothing) {
  for (int ix : {3, 4, -1, 1000}) {
    CChord chord = ChordOf({64, 67, 72});
    chord.SetRootNoteToIntvlIx(ix);
    EXPECT_EQ(chord.RootNote(), Nat(64)) << ix;
    EXPECT_FALSE(chord.RootNoteSpecified()) << ix;
    EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 3, 8})) << ix;
  }
  // A ninth inserted directly as 14 has no note at that pitch class interval; the
  // cache is not marked stale either (a rebuild would fold it to 2).
  CChord ninth = RootedChord(60, {60, 74});
  ASSERT_EQ(Members(ninth.IntvlSet()), (Intvls{0, 14}));
  ninth.SetRootNoteToIntvlIx(1);
  EXPECT_EQ(ninth.RootNote(), Nat(60));
  EXPECT_EQ(Members(ninth.IntvlSet()), (Intvls{0, 14}));
}

TEST(RootOperations, LowestNoteIntvl) {
  struct Case {
    std::vector<long> notes;
    long root; // -1: the root as the notes left it
    int intvl;
  } const cases[] = {
      {{64, 67, 72}, -1, 0},  {{64, 67, 72}, 60, 4}, {{64, 67, 72}, 69, 7},
      {{64, 67, 72}, 100, 0}, {{}, -1, 3}, // the undefined note's pitch class above C
      {{}, 65, 10},                        // ... above F
      {{}, 255, 0},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    if (c.root >= 0) chord.SetRootNote(Nat(c.root));
    EXPECT_EQ(chord.LowestNoteIntvl(), c.intvl) << c.notes.size() << " " << c.root;
  }
}

TEST(RootOperations, SetWrapIntvlToNeuronalNetInputCount) {
  // The directly inserted 14 goes; the intervals are rebuilt from the notes.
  CChord ninth = RootedChord(60, {60, 74});
  ninth.SetWrapIntvlToNeuronalNetInputCount();
  EXPECT_EQ(ninth.IntvlSet().WrapIntvl(), 24);
  EXPECT_EQ(Members(ninth.IntvlSet()), (Intvls{0, 2}));

  for (int wrap : {12, 7, 48}) {
    CChord chord(wrap);
    chord.SetRootNote(Nat(60));
    chord.AddNote(Nat(60));
    chord.AddNote(Nat(79));
    chord.SetWrapIntvlToNeuronalNetInputCount();
    EXPECT_EQ(chord.IntvlSet().WrapIntvl(), 24) << wrap;
    EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 7})) << wrap;
  }

  // Even without notes the intervals are marked stale: the rebuild sets the mark.
  CChord empty(12);
  ASSERT_FALSE(empty.LowestNoteLonely());
  empty.SetWrapIntvlToNeuronalNetInputCount();
  EXPECT_EQ(empty.IntvlSet().WrapIntvl(), 24);
  EXPECT_TRUE(empty.LowestNoteLonely());
}

} // namespace
