// Scales from first principles, for checking CScale: every root spelling, and the
// spellings a scale gives, built from letters (a scale spells its seven diatonic
// degrees with consecutive letters from the root's letter).
#ifndef TONVEX_TESTS_SCALEORACLE_H
#define TONVEX_TESTS_SCALEORACLE_H

#include "support/SpellingOracle.h"
#include "support/TestPrelude.h"

namespace scaleoracle {

/// Every scale type value worth trying: the eight types and values beyond them.
inline std::vector<int> TypeValues() { return {-5, -1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 100}; }

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
/// degrees (natural minor for type 2, major for every other type) with consecutive
/// letters, the chromatic steps as raised or lowered neighbours.
inline SpellingTable Spellings(Root root, int type) {
  bool const minor = type == 2;
  int const major[7] = {0, 2, 4, 5, 7, 9, 11}, naturalMinor[7] = {0, 2, 3, 5, 7, 8, 10};
  int const* diatonic = minor ? naturalMinor : major;
  int const rootLetter = oracle::LetterFor(root.k, root.e)->index;
  int byInterval[12] = {2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2, 2}; // what no letter lands on stays plain
  for (int i = 0; i < 7; ++i) {
    int const pitch = oracle::Letters[(rootLetter + i) % 7].pitch;
    byInterval[diatonic[i]] = 2 + oracle::Mod12(root.k + diatonic[i] - pitch + 6) - 6;
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

/// The spelling of key number k in the default scale, C major: what a natural black
/// key is corrected to.
inline int DefaultSpelling(int k) { return Spellings({0, 2}, 1).e[k]; }

} // namespace scaleoracle

#endif
