// Candidate chords, their scores, and the best chord sequence by dynamic programming.
#include "midi/ChordChoice.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>

namespace {

int const KindIntvls[ChordKindCount][5] = {{0, 4, 7, -1},     {0, 3, 7, -1},     {0, 3, 6, -1},     {0, 4, 8, -1},
                                           {0, 5, 7, -1},     {0, 2, 7, -1},     {0, 4, 7, 10, -1}, {0, 4, 7, 11, -1},
                                           {0, 3, 7, 10, -1}, {0, 3, 6, 10, -1}, {0, 3, 6, 9, -1},  {0, 7, -1}};

// Which penalty a kind pays: none for the major and minor triads, SeventhPenalty for
// the diminished triad and the seventh chords, ColourPenalty for the rest.
enum TKindFamily { Family_Triad, Family_Tonal, Family_Colour };
TKindFamily const KindFamily[ChordKindCount] = {Family_Triad,  Family_Triad,  Family_Tonal, Family_Colour,
                                                Family_Colour, Family_Colour, Family_Tonal, Family_Tonal,
                                                Family_Tonal,  Family_Tonal,  Family_Tonal, Family_Colour};

// A chord tone with less than this share of a unit's evidence counts as missing.
constexpr double MissingToneShare = 0.05;

// Masses are kept this far from 0 and 1, so that every logarithm is finite.
constexpr double SmallestMass = 1e-6;

double const Impossible = -std::numeric_limits<double>::infinity();

// How a state was reached at a unit.
enum TFrom : std::uint8_t { From_Same, From_BestChord, From_NoChord };

} // namespace

int const* ChordKindIntvls(TChordKind kind) { return KindIntvls[kind]; }

CChordScorer::CChordScorer(CChordTimelineSettings const& s) {
  double const toneMass = Within(s.ChordToneMass, SmallestMass, 1 - SmallestMass);
  double const rootBass = Within(s.RootBassMass, SmallestMass, 1 - 2 * SmallestMass);
  double const inversionBass = Within(s.InversionBassMass, SmallestMass, 1 - SmallestMass - rootBass);
  double const otherBass = std::max(1 - rootBass - inversionBass, SmallestMass);
  double const bassWeight = Within(s.BassWeight, 0, MostPenalty);
  Missing_ = Within(s.MissingTonePenalty, 0, MostPenalty);
  for (int kind = 0; kind < ChordKindCount; ++kind) {
    bool tone[12] = {};
    int tones = 0;
    for (int const* i = KindIntvls[kind]; *i >= 0; ++i, ++tones) tone[*i] = true;
    for (int i = 0; i < 12; ++i) {
      Tone_[kind][i] = std::log(tone[i] ? toneMass / tones : (1 - toneMass) / (12 - tones));
      double const bass = i == 0 ? rootBass : tone[i] ? inversionBass / (tones - 1) : otherBass / (12 - tones);
      Bass_[kind][i] = bassWeight * std::log(bass);
    }
    switch (KindFamily[kind]) {
    case Family_Triad: Colour_[kind] = 0; break;
    case Family_Tonal: Colour_[kind] = Within(s.SeventhPenalty, 0, MostPenalty); break;
    case Family_Colour: Colour_[kind] = Within(s.ColourPenalty, 0, MostPenalty); break;
    }
  }
}

void CChordScorer::Score(double const weight[12], double const bass[12], double scores[ChordStateCount]) const {
  double length = 0;
  for (int pc = 0; pc < 12; ++pc) length += bass[pc];
  for (int root = 0; root < 12; ++root)
    for (int kind = 0; kind < ChordKindCount; ++kind) {
      double score = -Colour_[kind] * length;
      for (int const* t = KindIntvls[kind]; *t >= 0; ++t)
        if (weight[(root + *t) % 12] < MissingToneShare * length) score -= Missing_ * length;
      for (int pc = 0; pc < 12; ++pc) {
        int const i = (pc - root + 12) % 12;
        score += weight[pc] * Tone_[kind][i] + bass[pc] * Bass_[kind][i];
      }
      scores[ChordState(root, kind)] = score;
    }
}

std::vector<int> ChooseChords(std::vector<CTimelineUnit> const& units, std::vector<double> const& changeCost,
                              CChordScorer const& scorer) {
  std::size_t const n = units.size();
  std::vector<int> chosen(n, NoChordState);
  if (n == 0) return chosen;
  // Per unit: how each state was reached, and the best chord state before it.
  std::vector<std::uint8_t> from(n * (ChordStateCount + 1), From_Same);
  std::vector<int> bestBefore(n, 0);
  double total[ChordStateCount + 1];
  std::fill(total, total + ChordStateCount, Impossible);
  total[NoChordState] = 0;
  double scores[ChordStateCount];
  for (std::size_t u = 0; u < n; ++u) {
    int const best = static_cast<int>(std::max_element(total, total + ChordStateCount) - total);
    bestBefore[u] = best;
    double const noChord = total[NoChordState];
    std::uint8_t* way = &from[u * (ChordStateCount + 1)];
    if (units[u].Silent) {
      bool const fromChord = total[best] > noChord;
      total[NoChordState] = fromChord ? total[best] : noChord;
      way[NoChordState] = fromChord ? From_BestChord : From_NoChord;
      std::fill(total, total + ChordStateCount, Impossible);
      continue;
    }
    scorer.Score(units[u].Weight, units[u].Bass, scores);
    double const changed = total[best] - changeCost[u];
    for (int s = 0; s < ChordStateCount; ++s) {
      double stay = total[s];
      TFrom how = From_Same;
      if (changed > stay) stay = changed, how = From_BestChord;
      if (noChord > stay) stay = noChord, how = From_NoChord;
      total[s] = stay + scores[s];
      way[s] = how;
    }
    total[NoChordState] = Impossible;
  }
  int state = static_cast<int>(std::max_element(total, total + ChordStateCount + 1) - total);
  for (std::size_t u = n; u-- > 0;) {
    chosen[u] = state;
    std::uint8_t const how = from[u * (ChordStateCount + 1) + static_cast<std::size_t>(state)];
    if (how == From_BestChord)
      state = bestBefore[u];
    else if (how == From_NoChord)
      state = NoChordState;
  }
  return chosen;
}
