// Root finding by the built-in net. What is under test is the encoding (the
// intervals above the lowest note as the net's inputs) and the decoding (the winner
// as an interval above the lowest note), on every pitch class set over every bass,
// against a separate net built from the exported data.
#include "support/ChordBuilders.h"
#include "support/NeuronParamGuard.h"
#include "support/SpellingOracle.h"

#include <tonvex/Chord.h>
#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <set>
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

TEST(RootFindingByNet, EveryPitchClassSetOverEveryBass) {
  NeuronParamGuard guard;
  NeuronalNet reference(ChordAnalysisNeuronalNet);
  std::set<int> winners;
  for (unsigned mask = 1; mask < 4096; ++mask)
    for (int bass = 0; bass < 12; ++bass) {
      if (!(mask >> bass & 1u)) continue;
      CMySet<int> notes{36 + bass}; // two octaves below the set, which it doubles
      std::vector<float> inputs(24, 0.0f);
      for (int pc = 0; pc < 12; ++pc)
        if (mask >> pc & 1u) {
          notes.insert(60 + pc);
          inputs[static_cast<std::size_t>(Mod12(pc - bass))] = 1.0f;
        }
      reference.use(inputs);
      winners.insert(reference.winner());
      long const expected = Mod12(bass + reference.winner());
      ASSERT_EQ(RootByNet(notes), expected) << mask << " over " << bass;
      ASSERT_EQ(RootByNet(notes, 12, 48 + static_cast<long>(mask % 12)), expected) << mask << " over " << bass;
    }
  EXPECT_EQ(winners.size(), 12u);
  for (int n = 0; n < 128; ++n) EXPECT_EQ(RootByNet({n}), Mod12(n)) << "a single note is its own root";
}

// The net evaluates with the process-wide neuron parameters as they stand: a net
// built later changes its answers until the built-in properties are set again.
TEST(RootFindingByNet, EvaluatesWithTheNeuronParametersAsTheyStand) {
  NeuronParamGuard guard;
  CMySet<int> const egc{64, 67, 72};
  ASSERT_EQ(RootByNet(egc), 0);
  {
    // Outputs binarised at a threshold no sigmoid reaches: all 0, so output 0 wins.
    NeuronalNet const other(2, 0, nullptr, 1, INPUT_SUM, ACT_SIGM, 0.2f, 2.0f, OUTPUT_BIN, 2.0f);
  }
  EXPECT_EQ(RootByNet(egc), 4); // the lowest note, E
  NeuronalNet const builtIn(ChordAnalysisNeuronalNet);
  EXPECT_EQ(RootByNet(egc), 0);
}

} // namespace
