// Chord options: the rules under every basic chord an interval can meet (the basic
// chord given directly reaches branches that no note set is recognised into), their
// ranks, texts and joining, the first-found rank 99 and the lonely lowest note.
// Expected options are written out from the rules.
#include "naming/ChordOptions.h"
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"
#include "support/TestPrelude.h"

namespace {

using namespace chordtest;
using C = CChord;

// The options in rank order, joined by '/'.
std::string Found(CChord const& chord, C::TBasicChord bc) {
  std::string text;
  for (int option : FindChordOptions(chord, bc).Option)
    if (option != CChordOptions::NoOption) text += (text.empty() ? "" : "/") + std::string(OptionText(option));
  return text;
}

// "7/9/11" with ChordOptionSep 1: "7(9)(11)".
std::string Bracketed(std::string const& slashed) {
  std::string text;
  int depth = 0;
  for (char c : slashed) text += c == '/' ? std::string(depth++ ? ")(" : "(") : std::string(1, c);
  return depth ? text + ")" : text;
}

TEST(ChordOptions, RulesUnderEveryBasicChordTheyMeet) {
  PrefGuard guard;
  struct Case {
    std::vector<int> intvls;
    C::TBasicChord bc;
    char const* options;
  } const cases[] = {// 1: b9 beside other options, else add b9.
                     {{0, 1, 4, 7, 10}, C::bc_maj, "7/b9"},
                     {{0, 1, 4, 7}, C::bc_maj, "add b9"},
                     {{0, 1, 5, 7}, C::bc_sus4, "b9"},
                     // 2: nothing in sus2; else 9 beside other options, else add 9.
                     {{0, 2, 7, 10}, C::bc_sus2, "7"},
                     {{0, 2, 4, 7, 10}, C::bc_maj, "7/9"},
                     {{0, 2, 3, 7}, C::bc_min, "add 9"},
                     {{0, 2}, C::bc_none, "add 9"},
                     {{0, 2, 5, 7}, C::bc_sus4, "9"},
                     // 3: #9 beside the major third; b3 unless the chord is minor or diminished.
                     {{0, 3, 4, 7, 10}, C::bc_maj, "7/#9"},
                     {{0, 3, 4, 8}, C::bc_aug, "#9"},
                     {{0, 3, 6}, C::bc_dim, ""},
                     {{0, 3, 7}, C::bc_maj, "b3"},
                     {{0, 3, 7}, C::bc_drone, "b3"},
                     {{0, 3}, C::bc_min, ""},
                     // 4: the major third unless major or augmented.
                     {{0, 4, 7}, C::bc_min, "3"},
                     {{0, 4, 5, 7}, C::bc_sus4, "3"},
                     {{0, 4}, C::bc_maj, ""},
                     // 5: nothing in sus4; else 11 beside other options, else add 11.
                     {{0, 5, 7}, C::bc_sus4, ""},
                     {{0, 4, 5, 7}, C::bc_maj, "add 11"},
                     {{0, 2, 5, 7}, C::bc_sus2, "11"},
                     // 6: nothing in diminished; #11 beside a fifth or augmented fifth, else b5.
                     {{0, 4, 6, 7, 10}, C::bc_maj, "7/#11"},
                     {{0, 4, 6, 8}, C::bc_maj, "#11/#5"},
                     {{0, 4, 6, 8}, C::bc_aug, "#11"},
                     {{0, 3, 6, 10}, C::bc_min, "7/b5"},
                     {{0, 6}, C::bc_none, "b5"},
                     {{0, 6, 7}, C::bc_none, "5/#11"},
                     // 7: the fifth only in diminished, augmented and no basic chord.
                     {{0, 3, 6, 7}, C::bc_dim, "5"},
                     {{0, 4, 7, 8}, C::bc_aug, "5"},
                     {{0, 7, 10}, C::bc_none, "5/7"},
                     {{0, 7}, C::bc_drone, ""},
                     // 8: nothing in augmented; b13 beside the fifth, else #5.
                     {{0, 4, 7, 8}, C::bc_maj, "b13"},
                     {{0, 4, 8, 10}, C::bc_aug, "7"},
                     {{0, 3, 8}, C::bc_none, "b3/#5"},
                     // 9: 13 beside a seventh without the minor sixth; else a sixth, which in a
                     // diminished chord is the diminished seventh.
                     {{0, 4, 7, 9}, C::bc_maj, "6"},
                     {{0, 3, 6, 9}, C::bc_dim, "7"},
                     {{0, 4, 7, 9, 10}, C::bc_maj, "7/13"},
                     {{0, 4, 7, 9, 11}, C::bc_maj, "ma7/13"},
                     {{0, 4, 7, 8, 9, 10}, C::bc_maj, "6/7/b13"},
                     {{0, 3, 6, 8, 9, 10}, C::bc_dim, "7/7/#5"},
                     {{0, 2, 4, 5, 7, 9, 10}, C::bc_maj, "7/9/11/13"},
                     // 10: 7 always; in a diminished chord b5 first, which stays unless #5 took rank 99.
                     {{0, 5, 7, 10}, C::bc_sus4, "7"},
                     {{0, 3, 6, 10}, C::bc_dim, "7/b5"},
                     {{0, 3, 6, 8, 10}, C::bc_dim, "7/#5"},
                     {{0, 3, 6, 8, 10}, C::bc_min, "7/#11/#5"},
                     // 11: the major seventh.
                     {{0, 2, 7, 11}, C::bc_sus2, "ma7"},
                     {{0, 11}, C::bc_none, "ma7"},
                     {{0}, C::bc_none, ""}};
  for (Case const& c : cases) {
    CChord const chord = OverC(c.intvls);
    std::string const label = ListLabel("intervals", c.intvls) + " bc " + std::to_string(c.bc);
    EXPECT_EQ(Found(chord, c.bc), c.options) << label;
    if (chord.BasicChord() != c.bc) continue;
    // Recognised so: the same options through the public names, in both separators.
    EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), c.options) << label;
    CChordnamePref::ChordOptionSep = 1;
    EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), Bracketed(c.options)) << label;
    CChordnamePref::ChordOptionSep = 0;
  }
  CChord const full = OverC({0, 2, 4, 5, 7, 9, 10});
  EXPECT_EQ(full.OptionsMap(DefaultChordnamePref),
            (std::map<int, C::TChordOption>{{10, C::co_7}, {14, C::co_9}, {17, C::co_11}, {21, C::co_13}}));
  EXPECT_EQ(full.OptionsStringVector(DefaultChordnamePref), (std::vector<std::string>{"7", "9", "11", "13"}));
  for (int style : {0, 1, 2, 3, -1}) {
    CChordnamePref::Maj7ShownAs = style;
    EXPECT_EQ(OverC({0, 4, 7, 11}).OptionsName(DefaultChordnamePref), style == 1 ? "j7" : style == 2 ? "maj7" : "ma7");
  }
  EXPECT_STREQ(OptionText(20), "");
  EXPECT_STREQ(OptionText(-1), "");
}

// Rank 99 holds the first altered fifth found, in ascending order of the cached
// intervals, so intervals cached above the octave decide which comes first; a ninth
// cached as 14 is an added ninth beside a triad.
TEST(ChordOptions, IntervalsCachedAboveTheOctave) {
  CChord const flatFirst = RootedChord(60, {60, 64, 66, 79, 80}); // b5 from 6, then #5 from 20
  EXPECT_EQ(flatFirst.OptionsName(DefaultChordnamePref), "b5");
  CChord sharpFirst(36);
  sharpFirst.SetRootNote(Nat(48));
  for (long n : {48, 52, 67, 68, 78}) sharpFirst.AddNote(Nat(n)); // #5 from 20, then b5 from 30
  EXPECT_EQ(sharpFirst.OptionsName(DefaultChordnamePref), "#5");
  EXPECT_EQ(RootedChord(60, {60, 64, 67, 74}).OptionsName(DefaultChordnamePref), "add 9");
  EXPECT_EQ(RootedChord(60, {60, 64, 67, 70, 74}).OptionsName(DefaultChordnamePref), "7/9");
}

// In a chord wider than an octave a lowest note that the rebuild marked lonely gives
// no option, unless OmitOptionOfLonelyLowestNoteInWideChord is 0.
TEST(ChordOptions, LonelyLowestNoteInWideChords) {
  PrefGuard guard;
  struct Case {
    long root;
    std::vector<long> notes;
    char const *omitted, *kept;
  } const cases[] = {{60, {50, 60, 64, 67}, "", "add 9"},          // D alone, span 17
                     {60, {62, 64, 67, 72}, "add 9", "add 9"},     // span 10: not wide
                     {60, {50, 60, 64, 67, 74}, "add 9", "add 9"}, // D doubled
                     {64, {48, 64, 68, 71, 72}, "", "b13"},        // C doubled, but below E by key number
                     {60, {44, 60, 64, 67, 80}, "b13", "b13"},     // A flat doubled above C by key number
                     {64, {48, 52, 55, 59, 61}, "6", "6/b13"},     // an octave and a semitone is wide
                     {60, {50, 60, 64, 67, 70}, "7", "7/9"}};      // only its own interval is hidden
  for (Case const& c : cases)
    for (int omit : {1, 7, 0}) {
      CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord = omit;
      EXPECT_EQ(NotesThenRoot(Nat(c.root), c.notes).OptionsName(DefaultChordnamePref), omit ? c.omitted : c.kept)
          << c.notes.front() << " " << c.root << " " << omit;
    }
}

TEST(ChordOptions, UndefinedRootHasOptionsButNoOptionsName) {
  CChord const chord = NotesThenRoot(CNote_Undef, {60, 64, 67, 70}); // above key number 3: 9 1 4 7
  EXPECT_EQ(chord.OptionsStringVector(DefaultChordnamePref), (std::vector<std::string>{"6", "b9"}));
  EXPECT_EQ(chord.OptionsName(DefaultChordnamePref), "");
  EXPECT_TRUE(CChord(24).OptionsMap(DefaultChordnamePref).empty());
}

} // namespace
