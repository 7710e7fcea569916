// The chord pattern generator: the chord types, the voicings, their encoding and the
// label convention for pitch-class sets with several readings.
#include "training/ChordPatterns.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace {

int Mod12(int value) { return (value % 12 + 12) % 12; }

TPitchClassMask Mask(std::vector<int> const& pitchClasses) {
  TPitchClassMask mask = 0;
  for (int pc : pitchClasses) mask |= 1u << Mod12(pc);
  return mask;
}

// The set as heard from the note `bass` semitones above its first listed note.
TPitchClassMask FromBass(std::vector<int> const& set, int bass) {
  std::vector<int> shifted;
  for (int pc : set) shifted.push_back(pc - bass);
  return Mask(shifted);
}

TPitchClassMask RelativeMask(std::vector<int> const& notes) {
  const int bass = *std::min_element(notes.begin(), notes.end());
  std::vector<int> relative;
  for (int note : notes) relative.push_back(note - bass);
  return Mask(relative);
}

// The chord type table of XGChordIx, in its order: XG number, intervals.
struct XgRow {
  int xgNr;
  std::vector<int> intvls;
};
const std::vector<XgRow> XgTable = {
    {0, {0, 4, 7}},         {1, {0, 4, 7, 9}},
    {2, {0, 4, 7, 11}},     {3, {0, 4, 7, 11, 6}},
    {4, {0, 4, 7, 2}},      {5, {0, 4, 7, 11, 2}},
    {6, {0, 4, 7, 9, 2}},   {19, {0, 4, 7, 10}},
    {21, {0, 4, 6, 10}},    {22, {0, 4, 7, 10, 2}},
    {23, {0, 4, 7, 10, 6}}, {24, {0, 4, 7, 10, 9}},
    {25, {0, 4, 7, 10, 1}}, {26, {0, 4, 7, 10, 8}},
    {27, {0, 4, 7, 10, 3}}, {8, {0, 3, 7}},
    {9, {0, 3, 7, 9}},      {10, {0, 3, 7, 10}},
    {11, {0, 3, 6, 10}},    {12, {0, 3, 7, 2}},
    {13, {0, 3, 7, 10, 2}}, {14, {0, 3, 7, 10, 5}},
    {15, {0, 3, 7, 11}},    {16, {0, 3, 7, 11, 2}},
    {7, {0, 4, 8}},         {28, {0, 4, 8, 11}},
    {29, {0, 4, 8, 10}},    {17, {0, 3, 6}},
    {18, {0, 3, 6, 9}},     {32, {0, 5, 7}},
    {20, {0, 5, 7, 10}},    {33, {0, 2, 7}},
    {31, {0, 7}},           {30, {0}},
};

TEST(ChordPatternTypes, XgRowsInOrderThenCatalogueOnlyTypes) {
  const std::vector<TChordPatternType> types = ChordPatternTypes();
  ASSERT_EQ(types.size(), XgTable.size() + 3);
  for (std::size_t i = 0; i < XgTable.size(); ++i) {
    EXPECT_EQ(types[i].xgNr, XgTable[i].xgNr) << i;
    EXPECT_EQ(Mask(types[i].intvls), Mask(XgTable[i].intvls)) << types[i].name;
    EXPECT_TRUE(std::is_sorted(types[i].intvls.begin(), types[i].intvls.end())) << types[i].name;
  }
  const std::vector<std::pair<std::string, std::vector<int>>> catalogueOnly = {
      {"minor b6", {0, 3, 7, 8}}, {"minor 6 added 9", {0, 3, 7, 9, 14}}, {"major 7 b5 #9", {0, 4, 6, 10, 15}}};
  for (std::size_t i = 0; i < catalogueOnly.size(); ++i) {
    TChordPatternType const& type = types[XgTable.size() + i];
    EXPECT_EQ(type.name, catalogueOnly[i].first);
    EXPECT_EQ(type.intvls, catalogueOnly[i].second);
    EXPECT_EQ(type.xgNr, -1);
  }
}

TEST(ChordVoicings, EveryTypeRootInversionAndLayout) {
  const std::vector<TChordPatternType> types = ChordPatternTypes();
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  std::size_t expected = 0;
  for (TChordPatternType const& type : types) expected += 12 * 4 * type.intvls.size();
  ASSERT_EQ(voicings.size(), expected);

  std::size_t at = 0;
  for (TChordPatternType const& type : types)
    for (int root = 0; root < 12; ++root)
      for (std::size_t inversion = 0; inversion < type.intvls.size(); ++inversion)
        for (int layout = 0; layout < 4; ++layout) {
          TChordVoicing const& v = voicings[at++];
          EXPECT_EQ(v.rootKeyNr, root) << v.name;
          EXPECT_TRUE(std::is_sorted(v.noteNrs.begin(), v.noteNrs.end())) << v.name;
          EXPECT_GE(v.noteNrs.front(), 24);
          EXPECT_LE(v.noteNrs.back(), 127);
          std::vector<int> transposed;
          for (int i : type.intvls) transposed.push_back(root + i);
          EXPECT_EQ(Mask(v.noteNrs), Mask(transposed)) << v.name;
          EXPECT_EQ(Mod12(v.noteNrs.front()), Mod12(root + type.intvls[inversion])) << v.name;
        }
}

// The voicing of a type over a root, an inversion and a layout, found by its place in
// the generator's order.
TChordVoicing const& VoicingOf(std::vector<TChordVoicing> const& voicings, std::string const& typeName, int root,
                               std::size_t inversion, std::size_t layout) {
  std::size_t at = 0;
  for (TChordPatternType const& type : ChordPatternTypes()) {
    if (type.name == typeName)
      return voicings.at(at + (static_cast<std::size_t>(root) * type.intvls.size() + inversion) * 4 + layout);
    at += 12 * 4 * type.intvls.size();
  }
  ADD_FAILURE() << "no type " << typeName;
  return voicings.front();
}

TEST(ChordVoicings, LayoutsAndNames) {
  enum { Close, Open, Spread, Doubled };
  // Names as the library names the notes under the labelled root: the root, the
  // basic chord and option block with its blanks, a slash bass only when the chord
  // spans more than an octave; then the layout.
  struct Case {
    char const* type;
    int root;
    std::size_t inversion;
    std::size_t layout;
    std::vector<int> notes;
    char const* name;
  };
  const Case cases[] = {
      {"major", 0, 0, Close, {36, 40, 43}, "C   (close)"},
      {"major", 0, 0, Open, {36, 40, 55}, "C   (open)"},
      {"major", 0, 0, Spread, {36, 52, 55}, "C   (spread)"},
      {"major", 0, 0, Doubled, {24, 36, 40, 43, 48}, "C   (doubled)"},
      {"major", 0, 1, Close, {40, 43, 48}, "C   (close)"},
      {"major", 0, 2, Spread, {43, 60, 64}, "C   / G (spread)"},
      // Eb minor 7 over G flat is F# A# C# D#, labelled F# major 6 from its bass.
      {"minor 7", 3, 1, Close, {42, 46, 49, 51}, "F#  6 (close)"},
      {"major 6 added 9", 0, 1, Close, {40, 43, 45, 50, 60}, "C  6/9 / E (close)"},
      {"major j7 #11", 6, 0, Close, {42, 46, 49, 53, 60}, "F#  ma7/#11 (close)"},
      // E Gb Bb C, built as C major 7 b5 over E, labelled from the nearer root F#.
      {"major 7 b5", 0, 1, Close, {40, 42, 46, 48}, "F#  7/b5 (close)"},
      {"single note", 9, 0, Doubled, {33, 45, 57}, "A no 3  (doubled)"},
      {"fifth", 10, 1, Spread, {41, 58}, "Bb 5  / F (spread)"},
      {"minor 7", 9, 0, Close, {45, 48, 52, 55}, "A m 7 (close)"},
  };
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  for (Case const& c : cases) {
    TChordVoicing const& v = VoicingOf(voicings, c.type, c.root, c.inversion, c.layout);
    EXPECT_EQ(v.noteNrs, c.notes) << c.name;
    EXPECT_EQ(v.name, c.name);
  }
  EXPECT_EQ(ChordVoicingName({61, 64, 68}, 1, "open"), "C# m  (open)");
  // The root is taken as a pitch class; a bass on the root gets no slash however wide.
  EXPECT_EQ(ChordVoicingName({44, 60, 63, 66}, 20, "spread"), "Ab  7 (spread)");
}

// What every name shows, read from the notes and the label alone: the labelled
// root (C major's spelling of black keys), a slash bass exactly when the chord spans
// more than an octave over a bass other than the root, and the layout.
TEST(ChordVoicings, EveryNameShowsItsRootBassAndLayout) {
  const char* const roots[12] = {"C", "C#", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"};
  const char* const layouts[4] = {"close", "open", "spread", "doubled"};
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  for (std::size_t i = 0; i < voicings.size(); ++i) {
    TChordVoicing const& v = voicings[i];
    const std::string root = roots[Mod12(v.noteNrs.front() + v.label)];
    EXPECT_EQ(v.name.rfind(root + " ", 0), 0u) << v.name;
    const std::string layout = std::string(" (") + layouts[i % 4] + ")";
    ASSERT_GT(v.name.size(), layout.size());
    EXPECT_EQ(v.name.substr(v.name.size() - layout.size()), layout) << v.name;
    const bool slash = v.noteNrs.back() - v.noteNrs.front() > 12 && v.label != 0;
    EXPECT_EQ(v.name.find(" / ") != std::string::npos, slash) << v.name;
  }
}

TEST(ChordNetInputs, IntervalsAboveTheLowestNoteFoldedIntoOneOctave) {
  std::vector<float> expected(24, 0.0f);
  expected[0] = expected[3] = expected[8] = 1.0f;
  EXPECT_EQ(ChordNetInputs({60, 40, 43, 48, 67}), expected);
  EXPECT_EQ(ChordNetInputs({}), std::vector<float>(24, 0.0f));
  std::vector<float> single(24, 0.0f);
  single[0] = 1.0f;
  EXPECT_EQ(ChordNetInputs({50, 62, 74}), single);
}

// The sets several interpretations share, worked out by hand: each pair of
// readings heard from every one of its notes.
std::set<TPitchClassMask> SharedSets() {
  const std::vector<std::vector<int>> sets = {
      {0, 4, 7, 9},    // C major 6 = A minor 7
      {0, 4, 7, 11},   // C major j7 = E minor b6
      {0, 2, 4, 7, 9}, // C major 6 added 9 = A minor 7 11
      {0, 4, 6, 10},   // C major 7 b5 = F# major 7 b5
      {0, 3, 7, 9},    // C minor 6 = A minor 7 b5
      {0, 4, 8},       // augmented
      {0, 3, 6, 9},    // diminished 7
      {0, 5, 7},       // C sus4 = F sus2
  };
  std::set<TPitchClassMask> shared;
  for (std::vector<int> const& set : sets)
    for (int bass : set) shared.insert(FromBass(set, bass));
  return shared;
}

TEST(ChordVoicings, AmbiguousExactlyWhereReadingsDisagree) {
  const std::set<TPitchClassMask> shared = SharedSets();
  EXPECT_EQ(shared.size(), 24u);
  std::set<TPitchClassMask> seen;
  for (TChordVoicing const& v : ChordVoicings()) {
    const TPitchClassMask relative = RelativeMask(v.noteNrs);
    seen.insert(relative);
    EXPECT_EQ(v.unambiguous, shared.count(relative) == 0) << v.name;
  }
  for (TPitchClassMask mask : shared) EXPECT_EQ(seen.count(mask), 1u) << mask;
}

TEST(ChordVoicings, LabelConvention) {
  struct Case {
    std::vector<int> set; // above the bass
    int label;
  };
  const Case cases[] = {
      {{0, 4, 7, 9}, 0},      // C E G A: C major 6
      {{0, 3, 7, 10}, 0},     // A C E G: A minor 7, the bass reading
      {{0, 3, 5, 8}, 8},      // E G A C: neither reading from the bass, major 6 first
      {{0, 2, 5, 9}, 5},      // G A C E: C major 6 / G
      {{0, 3, 7, 8}, 8},      // E G B C: C major j7 / E (XG types before minor b6)
      {{0, 4, 5, 9}, 5},      // G B C E
      {{0, 1, 5, 8}, 1},      // B C E G
      {{0, 2, 7}, 0},         // F G C: F sus2
      {{0, 5, 10}, 5},        // G C F: C sus4 / G
      {{0, 5, 7}, 0},         // C F G: C sus4
      {{0, 4, 8}, 0},         // augmented: the bass
      {{0, 3, 6, 9}, 0},      // diminished 7: the bass
      {{0, 4, 6, 10}, 0},     // major 7 b5 from a root: the bass
      {{0, 2, 6, 8}, 2},      // E Gb Bb C: the nearer root above the bass
      {{0, 3, 5, 7, 10}, 0},  // A C D E G: A minor 7 11
      {{0, 2, 5, 7, 10}, 10}, // D E G A C: C major 6 added 9 / D
      {{0, 4, 6, 9}, 9},      // Eb G A C: C minor 6 / Eb before A minor 7 b5
      {{0, 3, 6, 10}, 0},     // A C Eb G: A minor 7 b5
      {{0, 3, 8}, 8},         // major triad over its third
      {{0, 5, 9}, 5},         // major triad over its fifth
      {{0, 5}, 5},            // a fifth over its upper note
      {{0}, 0},               // a single note
      {{0, 3, 4, 6, 10}, 0},  // major 7 b5 #9 (catalogue only)
      {{0, 1, 2}, -1},        // no type fits
  };
  const std::vector<TChordPatternType> types = ChordPatternTypes();
  for (Case const& c : cases) EXPECT_EQ(LabelledRoot(types, Mask(c.set)), c.label) << Mask(c.set);
  EXPECT_TRUE(IsUnambiguous(types, Mask({0, 1, 2})));
}

TEST(ChordTrainingPatterns, OneHotTargetsWithoutContradictions) {
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  std::map<std::vector<float>, std::vector<float>> targets;
  for (TChordVoicing const& v : voicings) {
    const training_pattern p = ChordTrainingPattern(v, 0.25f);
    EXPECT_EQ(p.name, v.name);
    EXPECT_EQ(p.training_rate, 0.25f);
    ASSERT_EQ(p.outputs.size(), 12u);
    EXPECT_EQ(std::count(p.outputs.begin(), p.outputs.end(), 1.0f), 1);
    EXPECT_EQ(std::count(p.outputs.begin(), p.outputs.end(), 0.0f), 11);
    EXPECT_EQ(p.outputs[static_cast<std::size_t>(v.label)], 1.0f);
    const auto [at, added] = targets.emplace(p.inputs, p.outputs);
    if (!added) {
      EXPECT_EQ(at->second, p.outputs) << v.name;
    }
  }

  const std::vector<TChordPatternClass> classes = ChordPatternClasses(voicings, 0.25f);
  ASSERT_EQ(classes.size(), targets.size());
  int count = 0;
  for (TChordPatternClass const& c : classes) {
    EXPECT_EQ(c.pattern.outputs, targets[c.pattern.inputs]) << c.pattern.name;
    count += c.voicingCount;
  }
  EXPECT_EQ(count, static_cast<int>(voicings.size()));
  EXPECT_EQ(classes.front().pattern.name, "C   (close)");
  EXPECT_EQ(classes.front().voicingCount, 12 * 4);
}

TEST(ChordTrainingPatterns, NoNotesTeachAWeakSix) {
  const training_pattern p = EmptyChordPattern(0.5f);
  EXPECT_EQ(p.inputs, std::vector<float>(24, 0.0f));
  std::vector<float> expected(12, 0.0f);
  expected[6] = 0.5f;
  EXPECT_EQ(p.outputs, expected);
  EXPECT_EQ(p.training_rate, 0.5f);
}

} // namespace
