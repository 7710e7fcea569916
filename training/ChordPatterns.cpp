// Chord voicings, their labels and their encoding for the chord analysis net.
#include "training/ChordPatterns.h"

#include <tonvex/Chord.h>
#include <tonvex/ChordTypes.h>

#include <algorithm>
#include <map>

namespace {

struct XgRow {
  int xgNr;
  char const* name;
  std::vector<int> intvls;
};

// The XG chord type table in the order XGChordIx tries it; tensions written above
// the octave where a voicing puts them.
std::vector<XgRow> XgRows() {
  return {
      {0, "major", {0, 4, 7}},
      {1, "major 6", {0, 4, 7, 9}},
      {2, "major j7", {0, 4, 7, 11}},
      {3, "major j7 #11", {0, 4, 7, 11, 18}},
      {4, "major added 9", {0, 4, 7, 14}},
      {5, "major j7 9", {0, 4, 7, 11, 14}},
      {6, "major 6 added 9", {0, 4, 7, 9, 14}},
      {19, "major 7", {0, 4, 7, 10}},
      {21, "major 7 b5", {0, 4, 6, 10}},
      {22, "major 7 9", {0, 4, 7, 10, 14}},
      {23, "major 7 #11", {0, 4, 7, 10, 18}},
      {24, "major 7 13", {0, 4, 7, 10, 21}},
      {25, "major 7 b9", {0, 4, 7, 10, 13}},
      {26, "major 7 b13", {0, 4, 7, 10, 20}},
      {27, "major 7 #9", {0, 4, 7, 10, 15}},
      {8, "minor", {0, 3, 7}},
      {9, "minor 6", {0, 3, 7, 9}},
      {10, "minor 7", {0, 3, 7, 10}},
      {11, "minor 7 b5", {0, 3, 6, 10}},
      {12, "minor added 9", {0, 3, 7, 14}},
      {13, "minor 7 9", {0, 3, 7, 10, 14}},
      {14, "minor 7 11", {0, 3, 7, 10, 17}},
      {15, "minor j7", {0, 3, 7, 11}},
      {16, "minor j7 9", {0, 3, 7, 11, 14}},
      {7, "augmented", {0, 4, 8}},
      {28, "augmented j7", {0, 4, 8, 11}},
      {29, "augmented 7", {0, 4, 8, 10}},
      {17, "diminished", {0, 3, 6}},
      {18, "diminished 7", {0, 3, 6, 9}},
      {32, "sus4", {0, 5, 7}},
      {20, "7 sus4", {0, 5, 7, 10}},
      {33, "sus2", {0, 2, 7}},
      {31, "fifth", {0, 7}},
      {30, "single note", {0}},
  };
}

int Mod12(int value) { return (value % 12 + 12) % 12; }

TPitchClassMask MaskOf(std::vector<int> const& values, int offset) {
  TPitchClassMask mask = 0;
  for (int value : values) mask |= 1u << Mod12(value - offset);
  return mask;
}

TPitchClassMask Rotated(TPitchClassMask mask, int root) {
  const auto shift = static_cast<unsigned>(root);
  return ((mask << shift) | (mask >> (12 - shift))) & 0xFFFu;
}

struct Interpretation {
  std::size_t typeIx;
  int root; ///< interval above the bass
};

std::vector<Interpretation> Interpretations(std::vector<TChordPatternType> const& types, TPitchClassMask relative) {
  std::vector<Interpretation> found;
  for (std::size_t t = 0; t < types.size(); ++t) {
    const TPitchClassMask own = MaskOf(types[t].intvls, 0);
    for (int root = 0; root < 12; ++root)
      if (Rotated(own, root) == relative) found.push_back({t, root});
  }
  return found;
}

std::vector<int> Stacked(int first, std::vector<int> const& keyNrs) {
  std::vector<int> notes{first};
  for (int keyNr : keyNrs) notes.push_back(notes.back() + 1 + Mod12(keyNr - notes.back() - 1));
  return notes;
}

struct Layout {
  char const* name;
  std::vector<int> (*build)(int bass, std::vector<int> const& upper, int rootKeyNr);
};

std::vector<int> Close(int bass, std::vector<int> const& upper, int) { return Stacked(bass, upper); }

std::vector<int> Open(int bass, std::vector<int> const& upper, int rootKeyNr) {
  std::vector<int> notes = Close(bass, upper, rootKeyNr);
  for (std::size_t i = 2; i < notes.size(); i += 2) notes[i] += 12;
  return notes;
}

std::vector<int> Spread(int bass, std::vector<int> const& upper, int) {
  if (upper.empty()) return {bass};
  std::vector<int> notes{bass};
  for (int note : Stacked(bass + 12 + Mod12(upper.front() - bass), {upper.begin() + 1, upper.end()}))
    notes.push_back(note);
  return notes;
}

std::vector<int> Doubled(int bass, std::vector<int> const& upper, int rootKeyNr) {
  std::vector<int> notes = Close(bass, upper, rootKeyNr);
  notes.push_back(notes.back() + 1 + Mod12(rootKeyNr - notes.back() - 1));
  notes.push_back(bass - 12);
  return notes;
}

const Layout Layouts[] = {{"close", Close}, {"open", Open}, {"spread", Spread}, {"doubled", Doubled}};

} // namespace

std::vector<TChordPatternType> ChordPatternTypes() {
  const CChordTypes catalogue;
  std::vector<CChordType> const& builtIn = catalogue.BuiltInTypes();
  auto pitchClasses = [](CChordType const& type) {
    return MaskOf(std::vector<int>(type.Intvls().begin(), type.Intvls().end()), 0);
  };
  std::vector<bool> covered(builtIn.size(), false);
  std::vector<TChordPatternType> types;
  for (XgRow const& row : XgRows()) {
    TChordPatternType type{row.name, row.intvls, row.xgNr};
    for (std::size_t c = 0; c < builtIn.size(); ++c)
      if (pitchClasses(builtIn[c]) == MaskOf(row.intvls, 0)) {
        covered[c] = true;
        type.name = builtIn[c].Name();
        type.intvls.assign(builtIn[c].Intvls().begin(), builtIn[c].Intvls().end());
      }
    types.push_back(type);
  }
  for (std::size_t c = 0; c < builtIn.size(); ++c)
    if (!covered[c]) types.push_back({builtIn[c].Name(), {builtIn[c].Intvls().begin(), builtIn[c].Intvls().end()}, -1});
  return types;
}

int LabelledRoot(std::vector<TChordPatternType> const& types, TPitchClassMask relative) {
  std::vector<Interpretation> found = Interpretations(types, relative);
  const bool anyXg =
      std::any_of(found.begin(), found.end(), [&](Interpretation const& i) { return types[i.typeIx].xgNr >= 0; });
  if (anyXg)
    found.erase(
        std::remove_if(found.begin(), found.end(), [&](Interpretation const& i) { return types[i.typeIx].xgNr < 0; }),
        found.end());
  if (found.empty()) return -1;
  for (Interpretation const& i : found)
    if (i.root == 0) return 0;
  // Interpretations come in priority order, each type's roots ascending above the bass.
  return found.front().root;
}

bool IsUnambiguous(std::vector<TChordPatternType> const& types, TPitchClassMask relative) {
  const std::vector<Interpretation> found = Interpretations(types, relative);
  return std::all_of(found.begin(), found.end(), [&](Interpretation const& i) { return i.root == found.front().root; });
}

std::string ChordVoicingName(std::vector<int> const& noteNrs, int rootKeyNr, std::string const& layout) {
  CChord chord;
  chord.SetFromNoteNrSet(CMySet<int>(noteNrs.begin(), noteNrs.end()));
  chord.SetRootNote(CNote(Mod12(rootKeyNr), Enh_Natural));
  return chord.Name(DefaultChordnamePref) + " (" + layout + ")";
}

std::vector<TChordVoicing> ChordVoicings() {
  const std::vector<TChordPatternType> types = ChordPatternTypes();
  std::map<TPitchClassMask, std::pair<int, bool>> labels;
  std::vector<TChordVoicing> voicings;
  for (TChordPatternType const& type : types)
    for (int root = 0; root < 12; ++root)
      for (std::size_t inversion = 0; inversion < type.intvls.size(); ++inversion) {
        const int bassKeyNr = Mod12(root + type.intvls[inversion]);
        std::vector<int> upper;
        for (std::size_t k = 1; k < type.intvls.size(); ++k)
          upper.push_back(root + type.intvls[(inversion + k) % type.intvls.size()]);
        for (Layout const& layout : Layouts) {
          std::vector<int> notes = layout.build(36 + bassKeyNr, upper, root);
          std::sort(notes.begin(), notes.end());
          const TPitchClassMask relative = MaskOf(notes, notes.front());
          auto known = labels.find(relative);
          if (known == labels.end())
            known =
                labels.emplace(relative, std::make_pair(LabelledRoot(types, relative), IsUnambiguous(types, relative)))
                    .first;
          const int label = known->second.first;
          std::string name = ChordVoicingName(notes, notes.front() + label, layout.name);
          voicings.push_back({std::move(notes), root, std::move(name), label, known->second.second});
        }
      }
  return voicings;
}

std::vector<float> ChordNetInputs(std::vector<int> const& noteNrs) {
  std::vector<float> inputs(ChordNetInputCount, 0.0f);
  if (noteNrs.empty()) return inputs;
  const int lowest = *std::min_element(noteNrs.begin(), noteNrs.end());
  for (int note : noteNrs) inputs[static_cast<std::size_t>(Mod12(note - lowest))] = 1.0f;
  return inputs;
}

training_pattern ChordTrainingPattern(TChordVoicing const& voicing, float rate) {
  std::vector<float> targets(ChordNetOutputCount, 0.0f);
  targets[static_cast<std::size_t>(voicing.label)] = 1.0f;
  return {ChordNetInputs(voicing.noteNrs), targets, rate, voicing.name};
}

training_pattern EmptyChordPattern(float rate) {
  std::vector<float> targets(ChordNetOutputCount, 0.0f);
  targets[EmptyChordWinner] = EmptyChordTarget;
  return {ChordNetInputs({}), targets, rate, "no notes"};
}

std::vector<TChordPatternClass> ChordPatternClasses(std::vector<TChordVoicing> const& voicings, float rate) {
  std::vector<TChordPatternClass> classes;
  std::map<std::vector<float>, std::size_t> index;
  for (TChordVoicing const& voicing : voicings) {
    training_pattern pattern = ChordTrainingPattern(voicing, rate);
    const auto found = index.find(pattern.inputs);
    if (found != index.end()) {
      ++classes[found->second].voicingCount;
      continue;
    }
    index.emplace(pattern.inputs, classes.size());
    classes.push_back({std::move(pattern), 1, voicing.unambiguous});
  }
  return classes;
}

TChordAccuracy MeasureChordAccuracy(NeuronalNet& net, std::vector<TChordPatternClass> const& classes) {
  TChordAccuracy accuracy;
  for (TChordPatternClass const& c : classes) {
    net.use(c.pattern.inputs);
    const auto expected = std::max_element(c.pattern.outputs.begin(), c.pattern.outputs.end());
    const int named = net.winner() == expected - c.pattern.outputs.begin() ? c.voicingCount : 0;
    accuracy.voicings += c.voicingCount;
    accuracy.named += named;
    if (c.unambiguous) {
      accuracy.unambiguousVoicings += c.voicingCount;
      accuracy.unambiguousNamed += named;
    }
  }
  return accuracy;
}
