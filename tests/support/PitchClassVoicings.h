// The chords the tests of a host's path (allocations, threads) analyse: every
// pitch-class set holding C, close above C and spread over two octaves above a C
// doubled an octave lower, 1 to 13 notes. Over C they reach every pattern of
// intervals above the lowest note that root finding by net looks up.
#ifndef TONVEX_TESTS_PITCHCLASSVOICINGS_H
#define TONVEX_TESTS_PITCHCLASSVOICINGS_H

#include <tonvex/MySet.h>

#include <vector>

inline std::vector<CMySet<int>> PitchClassVoicings() {
  std::vector<CMySet<int>> voicings;
  for (unsigned mask = 1; mask < 4096; mask += 2) {
    CMySet<int> close, spread{36};
    for (int pc = 0, step = 0; pc < 12; ++pc)
      if (mask >> pc & 1u) {
        close.insert(48 + pc);
        spread.insert(48 + pc + 12 * (step++ % 2));
      }
    voicings.insert(voicings.end(), {close, spread});
  }
  return voicings;
}

#endif
