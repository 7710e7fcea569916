// Root finding and naming keep no state outside the chord they work on: threads
// that analyse chords at the same time get the answers one thread gets alone. The
// ThreadSanitizer build (.ci/run) runs this test to find any data race on the way.
#include "support/PitchClassVoicings.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <atomic>
#include <cstddef>
#include <string>
#include <thread>
#include <vector>

namespace {

// What a host reads back from a chord after root finding and naming.
struct CAnswer {
  CNote Root;
  CMySet<CNote> Notes;
  std::string Name;

  bool operator==(CAnswer const& other) const {
    return Root == other.Root && Notes == other.Notes && Name == other.Name;
  }
};

constexpr TSingleChordAnalysisAlgo Algos[] = {SCA_NEURONAL_NET, SCA_RULE_WEIGHTS};
constexpr std::size_t AlgoCount = 2;

CAnswer Analyse(CChord& chord, CMySet<int> const& voicing, TSingleChordAnalysisAlgo algo) {
  chord.SetFromNoteNrSet(voicing);
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
  return {chord.RootNote(), chord.Notes(), chord.Name(DefaultChordnamePref)};
}

TEST(ConcurrentAnalysis, EightThreadsGetTheAnswersOfOne) {
  std::vector<CMySet<int>> const voicings = PitchClassVoicings();
  std::size_t const count = voicings.size();
  std::vector<CAnswer> expected;
  CChord chord(24);
  for (CMySet<int> const& voicing : voicings)
    for (TSingleChordAnalysisAlgo algo : Algos) expected.push_back(Analyse(chord, voicing, algo));

  constexpr std::size_t ThreadCount = 8;
  std::vector<int> mismatches(ThreadCount, 0);
  std::atomic<std::size_t> waiting{ThreadCount};
  std::vector<std::thread> threads;
  for (std::size_t t = 0; t < ThreadCount; ++t)
    threads.emplace_back([&, t] {
      // All start together, each at another voicing, so that different chords are
      // analysed at the same moment.
      --waiting;
      while (waiting > 0) std::this_thread::yield();
      CChord own(24);
      std::size_t const first = t * count / ThreadCount;
      for (std::size_t k = 0; k < count; ++k) {
        std::size_t const i = (first + k) % count;
        for (std::size_t a = 0; a < AlgoCount; ++a)
          if (!(Analyse(own, voicings[i], Algos[a]) == expected[i * AlgoCount + a])) ++mismatches[t];
      }
    });
  for (std::thread& thread : threads) thread.join();
  for (std::size_t t = 0; t < ThreadCount; ++t) EXPECT_EQ(mismatches[t], 0) << "thread " << t;
}

} // namespace
