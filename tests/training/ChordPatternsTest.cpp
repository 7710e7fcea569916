// The chord pattern generator: its chord types against the library, the voicings,
// their names and encoding, the label convention for pitch-class sets with several
// readings, and the accuracy count.
#include "training/ChordPatterns.h"
#include "support/ChordBuilders.h"
#include "support/NeuronParamGuard.h"
#include "support/TestPrelude.h"

namespace {

int Mod12(int value) { return (value % 12 + 12) % 12; }

TPitchClassMask Mask(std::vector<int> const& pitchClasses) {
  TPitchClassMask mask = 0;
  for (int pc : pitchClasses) mask |= 1u << Mod12(pc);
  return mask;
}

// The XG types, over C, are recognised as their XG numbers (in XGChordIx's order, so
// the first row a set matches is its own); then the catalogue types XG lacks.
TEST(ChordPatternTypes, XGTypesThenCatalogueOnlyTypes) {
  std::vector<TChordPatternType> const types = ChordPatternTypes();
  CChordTypes const catalogue;
  std::size_t xgTypes = 0;
  for (TChordPatternType const& type : types) {
    EXPECT_TRUE(std::is_sorted(type.intvls.begin(), type.intvls.end())) << type.name;
    std::vector<long> notes;
    for (int i : type.intvls) notes.push_back(60 + i);
    if (type.xgNr >= 0) {
      EXPECT_EQ(xgTypes++, static_cast<std::size_t>(&type - types.data())) << "XG types come first";
      EXPECT_EQ(chordtest::NotesThenRoot(chordtest::Nat(60), notes).XGChordIx(), type.xgNr) << type.name;
      continue;
    }
    auto const entry = std::find_if(catalogue.BuiltInTypes().begin(), catalogue.BuiltInTypes().end(),
                                    [&](CChordType const& t) { return t.Name() == type.name; });
    ASSERT_NE(entry, catalogue.BuiltInTypes().end()) << type.name;
    EXPECT_EQ(chordtest::Members(entry->Intvls()), chordtest::Intvls(type.intvls.begin(), type.intvls.end()));
  }
  EXPECT_EQ(xgTypes, 34u);
  EXPECT_EQ(types.size(), 37u);
}

// Every type over every root in every inversion and four layouts, in that order: the
// type's pitch classes above the root, the inversion's tone in the bass, and a name
// that shows the labelled root (C major's spelling of black keys), a slash bass
// exactly when the chord spans more than an octave over a bass other than the root,
// and the layout.
TEST(ChordVoicings, EveryTypeRootInversionAndLayout) {
  char const* const roots[12] = {"C", "C#", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"};
  char const* const layouts[4] = {"close", "open", "spread", "doubled"};
  std::vector<TChordVoicing> const voicings = ChordVoicings();
  std::size_t at = 0;
  for (TChordPatternType const& type : ChordPatternTypes())
    for (int root = 0; root < 12; ++root)
      for (int inversion : type.intvls)
        for (char const* layout : layouts) {
          ASSERT_LT(at, voicings.size());
          TChordVoicing const& v = voicings[at++];
          EXPECT_EQ(v.rootKeyNr, root) << v.name;
          EXPECT_TRUE(std::is_sorted(v.noteNrs.begin(), v.noteNrs.end()) && v.noteNrs.front() >= 24 &&
                      v.noteNrs.back() <= 127)
              << v.name;
          std::vector<int> transposed;
          for (int i : type.intvls) transposed.push_back(root + i);
          EXPECT_EQ(Mask(v.noteNrs), Mask(transposed)) << v.name;
          EXPECT_EQ(Mod12(v.noteNrs.front()), Mod12(root + inversion)) << v.name;
          std::string const head = std::string(roots[Mod12(v.noteNrs.front() + v.label)]) + " ";
          EXPECT_EQ(v.name.rfind(head, 0), 0u) << v.name;
          std::string const tail = std::string(" (") + layout + ")";
          EXPECT_EQ(v.name.substr(v.name.size() - tail.size()), tail) << v.name;
          bool const slash = v.noteNrs.back() - v.noteNrs.front() > 12 && v.label != 0;
          EXPECT_EQ(v.name.find(" / ") != std::string::npos, slash) << v.name;
          std::vector<float> inputs(24, 0.0f); // the intervals above the bass, folded
          for (int n : v.noteNrs) inputs[static_cast<std::size_t>(Mod12(n - v.noteNrs.front()))] = 1.0f;
          EXPECT_EQ(ChordNetInputs(v.noteNrs), inputs) << v.name;
        }
  EXPECT_EQ(at, voicings.size());
}

// The sets several interpretations share, worked out by hand, are exactly the
// ambiguous ones; the label follows the convention.
TEST(ChordVoicings, AmbiguityAndLabels) {
  std::set<TPitchClassMask> shared;
  for (std::vector<int> const& set : std::vector<std::vector<int>>{{0, 4, 7, 9},    // C major 6 = A minor 7
                                                                   {0, 4, 7, 11},   // C major j7 = E minor b6
                                                                   {0, 2, 4, 7, 9}, // C major 6 added 9 = A minor 7 11
                                                                   {0, 4, 6, 10},   // C major 7 b5 = F# major 7 b5
                                                                   {0, 3, 7, 9},    // C minor 6 = A minor 7 b5
                                                                   {0, 4, 8},       // augmented
                                                                   {0, 3, 6, 9},    // diminished 7
                                                                   {0, 5, 7}})      // C sus4 = F sus2
    for (int bass : set) {
      std::vector<int> relative;
      for (int pc : set) relative.push_back(pc - bass);
      shared.insert(Mask(relative));
    }
  EXPECT_EQ(shared.size(), 24u);
  std::set<TPitchClassMask> seen;
  for (TChordVoicing const& v : ChordVoicings()) {
    std::vector<int> relative;
    for (int n : v.noteNrs) relative.push_back(n - v.noteNrs.front());
    seen.insert(Mask(relative));
    EXPECT_EQ(v.unambiguous, shared.count(Mask(relative)) == 0) << v.name;
  }
  for (TPitchClassMask mask : shared) EXPECT_EQ(seen.count(mask), 1u) << mask;

  std::pair<std::vector<int>, int> const labels[] = {
      {{0, 4, 7, 9}, 0},      // C E G A: C major 6
      {{0, 3, 7, 10}, 0},     // A C E G: A minor 7, the bass reading
      {{0, 3, 5, 8}, 8},      // E G A C: neither reading from the bass, major 6 first
      {{0, 3, 7, 8}, 8},      // E G B C: C major j7 / E (XG types before minor b6)
      {{0, 2, 7}, 0},         // F G C: F sus2
      {{0, 5, 10}, 5},        // G C F: C sus4 / G
      {{0, 3, 6, 9}, 0},      // diminished 7: the bass
      {{0, 2, 6, 8}, 2},      // E Gb Bb C: the nearer root above the bass
      {{0, 2, 5, 7, 10}, 10}, // D E G A C: C major 6 added 9 / D
      {{0, 4, 6, 9}, 9},      // Eb G A C: C minor 6 / Eb before A minor 7 b5
      {{0, 3, 4, 6, 10}, 0},  // major 7 b5 #9 (catalogue only)
      {{0, 1, 2}, -1}};       // no type fits
  std::vector<TChordPatternType> const types = ChordPatternTypes();
  for (auto const& [set, label] : labels) EXPECT_EQ(LabelledRoot(types, Mask(set)), label) << Mask(set);
  EXPECT_TRUE(IsUnambiguous(types, Mask({0, 1, 2})));
}

// One-hot targets at the label, the same for every voicing of an input; one class
// per input, counting its voicings. A net with all weights 0 has the winner 0, so
// the accuracy count names exactly the voicings labelled 0.
TEST(ChordTrainingPatterns, TargetsClassesAndTheAccuracyCount) {
  std::vector<TChordVoicing> const voicings = ChordVoicings();
  std::map<std::vector<float>, std::vector<float>> targets;
  TChordAccuracy expected;
  for (TChordVoicing const& v : voicings) {
    training_pattern const p = ChordTrainingPattern(v, 0.25f);
    std::vector<float> oneHot(12, 0.0f);
    oneHot[static_cast<std::size_t>(v.label)] = 1.0f;
    EXPECT_TRUE(p.name == v.name && p.training_rate == 0.25f && p.outputs == oneHot) << v.name;
    EXPECT_EQ(targets.emplace(p.inputs, p.outputs).first->second, p.outputs) << v.name;
    ++expected.voicings;
    expected.named += v.label == 0;
    expected.unambiguousVoicings += v.unambiguous;
    expected.unambiguousNamed += v.unambiguous && v.label == 0;
  }
  std::vector<TChordPatternClass> const classes = ChordPatternClasses(voicings, 0.25f);
  ASSERT_EQ(classes.size(), targets.size());
  int count = 0;
  for (TChordPatternClass const& c : classes) {
    EXPECT_EQ(c.pattern.outputs, targets[c.pattern.inputs]) << c.pattern.name;
    count += c.voicingCount;
  }
  EXPECT_EQ(count, static_cast<int>(voicings.size()));
  std::vector<float> zeros(765, 0.0f);
  TPredefinedWeights record = ChordAnalysisNeuronalNet;
  record.weights = zeros.data();
  NeuronParamGuard guard;
  NeuronalNet net(record);
  TChordAccuracy const measured = MeasureChordAccuracy(net, classes);
  EXPECT_TRUE(measured.voicings == expected.voicings && measured.named == expected.named &&
              measured.unambiguousVoicings == expected.unambiguousVoicings &&
              measured.unambiguousNamed == expected.unambiguousNamed);
  EXPECT_TRUE(measured.named > 0 && measured.named < measured.voicings);
  training_pattern const empty = EmptyChordPattern(0.5f);
  std::vector<float> weakSix(12, 0.0f);
  weakSix[6] = 0.5f;
  EXPECT_TRUE(empty.inputs == std::vector<float>(24, 0.0f) && empty.outputs == weakSix);
}

} // namespace
