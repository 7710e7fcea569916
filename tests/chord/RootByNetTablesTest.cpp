// Root finding by net answers from tables built at load: the net's winner for each
// pattern of intervals above the lowest note, and the spellings of the root and the
// notes. Every answer must be what the net's own forward pass and the chord's
// spelling operations give, for every pattern over every lowest pitch class, and
// under Neuron parameters other than the built-in net's.
#include "support/ChordBuilders.h"
#include "support/NeuronParamGuard.h"

namespace {

using chordtest::Members;

int constexpr PatternCount = 1 << 11; // intervals 1..11 above the lowest note

// The winner of a net on the inputs 1.0 at interval 0 and at the pattern's intervals.
int WinnerOf(NeuronalNet& net, int pattern) {
  std::vector<float> inputs(24, 0.0f);
  inputs[0] = 1.0f;
  for (int i = 1; i < 12; ++i)
    if (pattern >> (i - 1) & 1) inputs[static_cast<std::size_t>(i)] = 1.0f;
  net.use(inputs);
  return net.winner();
}

// The pattern's notes over the lowest note `lowest`: close above it (wrap 24); the
// others an octave higher and the lowest one doubled, a chord wider than an octave
// (wrap 12); or close, with the lowest pitch also in a second spelling.
CChord Voicing(int layout, int lowest, int pattern) {
  CMySet<CNote> notes{CNote(36 + lowest, Enh_Natural)};
  for (int i = 1; i < 12; ++i)
    if (pattern >> (i - 1) & 1) notes.insert(CNote(36 + lowest + i + (layout == 1 ? 12 : 0), Enh_Natural));
  if (layout == 1) notes.insert(CNote(48 + lowest, Enh_Natural));
  if (layout == 2) {
    CNote other(36 + lowest, Enh_Natural);
    other.EnhShift();
    notes.insert(other);
  }
  CChord chord(layout == 1 ? 12 : 24);
  chord.SetFromNoteSet(notes);
  return chord;
}

TEST(RootByNetTables, EveryPatternOverEveryLowestNoteAsTheNetAndTheSpellingsGiveIt) {
  NeuronParamGuard guard;
  NeuronalNet net(ChordAnalysisNeuronalNet); // the built-in parameters again
  for (int pattern = 0; pattern < PatternCount; ++pattern) {
    int const winner = WinnerOf(net, pattern);
    for (int lowest = 0; lowest < 12; ++lowest)
      for (int layout = 0; layout < 3; ++layout) {
        CChord found = Voicing(layout, lowest, pattern);
        found.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
        // The steps root finding takes after the net, one by one.
        CChord expected = Voicing(layout, lowest, pattern);
        expected.SetRootNote(CNote((lowest + winner) % 12, Enh_Natural));
        expected.SetRootNoteEnhWithLeastSigns();
        expected.AdjustEnhOfChordNotesToRootScale(nullptr);

        SCOPED_TRACE("pattern " + std::to_string(pattern) + " over " + std::to_string(lowest) + " layout " +
                     std::to_string(layout));
        ASSERT_EQ(found.RootNote(), expected.RootNote());
        ASSERT_TRUE(found.Notes() == expected.Notes());
        ASSERT_TRUE(found.RootNoteSpecified());
        ASSERT_EQ(found.LowestNoteLonely(), expected.LowestNoteLonely());
        ASSERT_EQ(Members(found.IntvlSet()), Members(expected.IntvlSet()));
      }
  }
}

// Another net built since the library's own replaces the Neuron parameters: root
// finding then follows the forward pass under those parameters, which a net with the
// built-in weights gives, on the fast path and on the reference path alike.
TEST(RootByNetTables, OtherNeuronParametersFollowTheForwardPass) {
  NeuronParamGuard guard;
  NeuronalNet net(ChordAnalysisNeuronalNet);
  std::vector<int> builtIn;
  for (int pattern = 0; pattern < PatternCount; ++pattern) builtIn.push_back(WinnerOf(net, pattern));
  struct CParams {
    INPUT_TYPE input;
    ACT_TYPE activation;
    float slope, threshold;
    OUTPUT_TYPE output;
    float outputThreshold;
  } const paramSets[] = {{INPUT_SUM, ACT_SIGM, 0.05f, 2.0f, OUTPUT_NONE, 0.0f},
                         {INPUT_AVG, ACT_TANHYP, 0.2f, 0.5f, OUTPUT_NONE, 0.0f},
                         {INPUT_SUM, ACT_SIGM, 0.2f, 2.0f, OUTPUT_BIN, 0.999f}};
  for (CParams const& p : paramSets) {
    int hidden[] = {2};
    NeuronalNet other(3, 1, hidden, 2, p.input, p.activation, p.slope, p.threshold, p.output, p.outputThreshold);
    int changed = 0;
    for (int pattern = 0; pattern < PatternCount; ++pattern) {
      int const winner = WinnerOf(net, pattern);
      changed += winner != builtIn[static_cast<std::size_t>(pattern)];
      int const lowest = pattern % 12;
      CChord chord = Voicing(0, lowest, pattern);
      chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
      ASSERT_EQ(chord.RootNote().NoteNr(), (lowest + winner) % 12)
          << "pattern " << pattern << " activation " << p.activation << " slope " << p.slope;
    }
    EXPECT_GT(changed, 0) << "the parameters change no winner"; // else the tables would do
  }
}

} // namespace
