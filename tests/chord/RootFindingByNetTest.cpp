// Root finding by the built-in net. What is under test is the encoding (the
// intervals above the lowest note as the net's inputs) and the decoding (the winner
// as an interval above the lowest note): expectations come from the winners listed
// for the compiled-in weights and, for every pitch class set, from a separate net
// built from the exported data. Spelling is checked in RootSpellingTest.cpp, the
// chord without notes in RootFindingTest.cpp.
#include "support/ChordBuilders.h"
#include "support/NeuronParamGuard.h"
#include "support/SpellingOracle.h"
#include <tonvex/Chord.h>
#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

namespace {

using namespace chordtest;
using oracle::Mod12;

// The root pitch class that root finding by net gives the note numbers; the chord's
// wrap interval and its current root must not matter.
long RootByNet(CMySet<int> const& noteNrs, int wrap = 24, long currentRoot = -1) {
  CChord chord(wrap);
  chord.SetFromNoteNrSet(noteNrs);
  if (currentRoot >= 0) chord.SetRootNote(Nat(currentRoot));
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
  EXPECT_TRUE(chord.RootNoteSpecified());
  return chord.RootNote().NoteNr();
}

TEST(RootFindingByNet, MajorTriadOverItsThirdIsC) {
  // E4 G4 C5: the inputs {0, 3, 8} win at 8, and E + 8 is C, whatever the root was.
  for (long root : {-1L, 60L, 64L, 69L, 255L}) {
    CChord chord = ChordOf({64, 67, 72});
    if (root >= 0) chord.SetRootNote(Nat(root));
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
    EXPECT_EQ(chord.RootNote(), CNote(0, Enh_Natural)) << root;
    EXPECT_TRUE(chord.RootNoteSpecified());
    EXPECT_EQ(NoteNrs(chord), (std::vector<long>{64, 67, 72}));
    for (CNote const& note : chord.Notes()) EXPECT_EQ(note.Enh(), Enh_Natural) << note.NoteNr();
    EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4, 7}));
  }
}

TEST(RootFindingByNet, SingleNoteIsItsOwnRoot) {
  for (int n = 0; n < 128; ++n) {
    EXPECT_EQ(RootByNet({n}), Mod12(n)) << n;
    if (n + 24 < 128) {
      EXPECT_EQ(RootByNet({n, n + 12, n + 24}), Mod12(n)) << n;
    }
  }
}

TEST(RootFindingByNet, ListedWinnersOverEveryBass) {
  struct Telling {
    std::vector<int> set; // above the bass
    int winner;
  } const tellings[] = {{{0}, 0}, {{0, 4, 7}, 0}, {{0, 3, 7}, 0}, {{0, 4, 7, 10}, 0}, {{0, 3, 8}, 8}, {{0, 5, 9}, 5}};
  for (Telling const& t : tellings)
    for (int bass = 0; bass < 12; ++bass) {
      // Close above the bass, the upper notes an octave up, the bass doubled below.
      CMySet<int> close, open, doubled{24 + bass};
      for (int i : t.set) {
        close.insert(36 + bass + i);
        open.insert(36 + bass + i + (i > 0 ? 12 : 0));
        doubled.insert(36 + bass + i);
      }
      long const expected = Mod12(bass + t.winner);
      std::string const label = ListLabel("set", t.set) + " over " + std::to_string(bass);
      EXPECT_EQ(RootByNet(close), expected) << label;
      EXPECT_EQ(RootByNet(open), expected) << label;
      EXPECT_EQ(RootByNet(doubled, 12, 70), expected) << label;
    }
}

TEST(RootFindingByNet, EveryPitchClassSetOverEveryBass) {
  NeuronParamGuard guard;
  NeuronalNet reference(ChordAnalysisNeuronalNet);
  std::set<int> winners;
  bool agreed = true;
  for (unsigned mask = 1; mask < 4096 && agreed; ++mask) {
    for (int bass = 0; bass < 12 && agreed; ++bass) {
      if (!(mask & (1u << bass))) continue;
      // The bass two octaves below the set, which it doubles.
      CMySet<int> notes{36 + bass};
      std::vector<float> inputs(24, 0.0f);
      for (int pc = 0; pc < 12; ++pc) {
        if (!(mask & (1u << pc))) continue;
        notes.insert(60 + pc);
        inputs[static_cast<std::size_t>(Mod12(pc - bass))] = 1.0f;
      }
      reference.use(inputs);
      int const winner = reference.winner();
      winners.insert(winner);
      long const expected = Mod12(bass + winner);
      SCOPED_TRACE("set " + std::to_string(mask) + " over " + std::to_string(bass));
      EXPECT_EQ(RootByNet(notes), expected);
      EXPECT_EQ(RootByNet(notes, 12, 48 + static_cast<long>(mask % 12)), expected);
      agreed = !HasFailure();
    }
  }
  EXPECT_EQ(winners.size(), 12u);
}

// The net evaluates with the process-wide neuron parameters as they stand: a net
// built later changes its answers until the built-in properties are set again.
TEST(RootFindingByNet, EvaluatesWithTheNeuronParametersAsTheyStand) {
  NeuronParamGuard guard;
  CMySet<int> const egc{64, 67, 72};
  ASSERT_EQ(RootByNet(egc), 0);
  {
    // Outputs binarised at a threshold no sigmoid reaches: all 0, so output 0 wins.
    NeuronalNet other(2, 0, nullptr, 1, INPUT_SUM, ACT_SIGM, 0.2f, 2.0f, OUTPUT_BIN, 2.0f);
  }
  EXPECT_EQ(RootByNet(egc), 4); // the lowest note, E
  NeuronalNet const builtIn(ChordAnalysisNeuronalNet);
  EXPECT_EQ(RootByNet(egc), 0);
}

} // namespace
