// Root finding and naming keep no state outside the chord they work on: threads
// that analyse chords at the same time get the answers one thread gets alone. The
// ThreadSanitizer build (.ci/run) runs this test to find any data race on the way.
#include "support/TestPrelude.h"
#include "support/Voicings.h"

#include <atomic>
#include <thread>

namespace {

// What a host reads back from a chord after root finding and naming, by both
// algorithms.
std::string Analyse(CChord& chord, CMySet<int> const& voicing) {
  std::ostringstream answer;
  for (TSingleChordAnalysisAlgo algo : {SCA_NEURONAL_NET, SCA_RULE_WEIGHTS}) {
    chord.SetFromNoteNrSet(voicing);
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
    answer << chord.RootNote() << chord.Name(DefaultChordnamePref) << ':';
    for (CNote const& note : chord.Notes()) answer << ' ' << note;
  }
  return answer.str();
}

TEST(ConcurrentAnalysis, EightThreadsGetTheAnswersOfOne) {
  std::vector<CMySet<int>> const voicings = MakeVoicings();
  std::size_t const count = voicings.size();
  std::vector<std::string> expected;
  CChord chord(24);
  for (CMySet<int> const& voicing : voicings) expected.push_back(Analyse(chord, voicing));

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
      for (std::size_t k = 0, i = t * count / ThreadCount; k < count; ++k, i = (i + 1) % count)
        mismatches[t] += Analyse(own, voicings[i]) != expected[i];
    });
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(mismatches, std::vector<int>(ThreadCount, 0));
}

} // namespace
