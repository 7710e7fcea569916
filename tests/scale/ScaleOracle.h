// Scales from first principles, for checking CScale: degree tables read from the
// definition of each scale type, and spellings built from letters (a scale spells
// its seven diatonic degrees with consecutive letters from the root's letter).
#ifndef TONVEX_TESTS_SCALEORACLE_H
#define TONVEX_TESTS_SCALEORACLE_H

#include "support/SpellingOracle.h"

#include <tonvex/Scale.h>

#include <vector>

namespace scaleoracle {

inline TEnh E(int e) { return static_cast<TEnh>(e); }

/// Every scale type value worth trying: the eight types and values beyond them.
inline std::vector<int> TypeValues() { return {-5, -1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 100}; }

inline CScale::TType T(int type) { return static_cast<CScale::TType>(type); }

/// Semitones above the root, by degree.
inline std::vector<int> DegreeIntervals(int type) {
  switch (type) {
  case 2: return {0, 2, 3, 5, 7, 8, 10};
  case 3: return {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11};
  case 4: return {0, 2, 3, 4, 5, 7, 9, 10, 11};
  case 5: return {0, 2, 4, 5, 7, 9, 10, 11};
  case 6: return {0, 2, 3, 5, 7, 8, 11};
  case 7: return {0, 2, 3, 5, 7, 9, 11};
  default: return {0, 2, 4, 5, 7, 9, 11};
  }
}

struct Root {
  int k;
  int e;
};

/// Every senseful spelling of every key number (35 roots).
inline std::vector<Root> Roots() {
  std::vector<Root> roots;
  for (int k = 0; k < 12; ++k)
    for (int e : oracle::SensefulSpellings(k)) roots.push_back({k, e});
  return roots;
}

/// Spellings by key number 0..11.
struct SpellingTable {
  int e[12];
};

/// The spelling of every key number in the scale on `root`: the seven diatonic
/// degrees (natural minor for type 2, major for every other type) with
/// consecutive letters, the chromatic steps as raised or lowered neighbours.
inline SpellingTable Spellings(Root root, int type) {
  bool minor = type == 2;
  const int major[7] = {0, 2, 4, 5, 7, 9, 11}, naturalMinor[7] = {0, 2, 3, 5, 7, 8, 10};
  const int* diatonic = minor ? naturalMinor : major;
  int rootLetter = 0;
  while (oracle::Letters[rootLetter].name != oracle::LetterFor(root.k, root.e)->name) ++rootLetter;

  int byInterval[12] = {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2}; // what no letter lands on stays plain
  for (int i = 0; i < 7; ++i) {
    int pitch = oracle::Letters[(rootLetter + i) % 7].pitch;
    int accidentals = oracle::Mod12(root.k + diatonic[i] - pitch + 6) - 6;
    byInterval[diatonic[i]] = 2 + accidentals;
  }
  if (minor) {
    byInterval[1] = byInterval[2] - 1; // lowered second
    byInterval[4] = byInterval[3] + 1; // raised third
    byInterval[6] = byInterval[5] + 1; // raised fourth
    byInterval[9] = byInterval[8] + 1; // raised sixth
  } else {
    byInterval[1] = byInterval[0] + 1;   // raised root
    byInterval[3] = byInterval[4] - 1;   // lowered third
    byInterval[6] = byInterval[5] + 1;   // raised fourth
    byInterval[8] = byInterval[9] - 1;   // lowered sixth
    byInterval[10] = byInterval[11] - 1; // lowered seventh
  }
  SpellingTable table{};
  for (int i = 0; i < 12; ++i) table.e[oracle::Mod12(root.k + i)] = byInterval[i];
  return table;
}

} // namespace scaleoracle

#endif
