// What a host does for every chord allocates nothing on the heap, but the name it
// gets back when the name is too long for the string's inline buffer. Allocations
// are counted by the operator new of support/AllocationCounter.cpp.
#include "support/AllocationCounter.h"
#include "support/TestPrelude.h"

namespace {

// Every pitch-class set holding C, close above C and spread over two octaves above
// a C doubled an octave lower: 1 to 13 notes.
std::vector<CMySet<int>> Voicings() {
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

// The name's own allocation, where it does not fit the string's inline buffer.
std::uint64_t NameAllocations(std::string const& name) { return name.size() > std::string().capacity() ? 1 : 0; }

TEST(Allocation, HostPathAllocatesOnlyLongNames) {
  std::vector<CMySet<int>> const voicings = Voicings();
  CChord reused(24);
  int longNames = 0;
  for (CMySet<int> const& voicing : voicings) {
    for (TSingleChordAnalysisAlgo algo : {SCA_NEURONAL_NET, SCA_RULE_WEIGHTS}) {
      std::string name;
      std::uint64_t const reusedCount = AllocationsOf([&] {
        reused.SetFromNoteNrSet(voicing);
        reused.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        name = reused.Name(DefaultChordnamePref);
      });
      ASSERT_EQ(reusedCount, NameAllocations(name)) << name;
      longNames += static_cast<int>(NameAllocations(name));

      // A host that makes its note set and chord afresh for every chord.
      std::uint64_t const freshCount = AllocationsOf([&] {
        CMySet<int> sounding;
        for (auto n = voicing.rbegin(); n != voicing.rend(); ++n) sounding.insert(*n);
        CChord chord(24);
        chord.SetFromNoteNrSet(sounding);
        chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        name = chord.Name(DefaultChordnamePref);
      });
      ASSERT_EQ(freshCount, NameAllocations(name)) << name;
    }
  }
  // Long names exist, so the allowance above was used and checked.
  EXPECT_GT(longNames, 0);
}

TEST(Allocation, SetsGoToTheHeapOnlyBeyondTheirInlineValues) {
  for (int size = 0; size <= 40; ++size) {
    std::uint64_t const count = AllocationsOf([size] {
      CMySet<int> set;
      for (int v = size; v > 0; --v) set.insert(v);
      CMySet<int> copy = set;
      copy.clear();
      for (int v = 0; v < size; ++v) copy.insert(v);
    });
    // Beyond the inline values each set grows twice as large at a time: 32, 64.
    std::uint64_t const perSet = size <= 16 ? 0 : (size <= 32 ? 1 : 2);
    EXPECT_EQ(count, 2 * perSet) << size;
  }
}

TEST(Allocation, ForwardPassAllocatesNothing) {
  NeuronalNet net(ChordAnalysisNeuronalNet);
  std::vector<float> inputs(24, 0.0f);
  inputs[0] = inputs[4] = inputs[7] = 1.0f;
  EXPECT_EQ(AllocationsOf([&] {
              net.setInput(inputs);
              net.use();
            }),
            0u);
  // New weights are packed again into the same storage.
  TPredefinedWeights weights = net.get_weights();
  ASSERT_TRUE(net.acquire_weights(weights));
  EXPECT_EQ(AllocationsOf([&] { net.use(); }), 0u);
  delete[] weights.weights;
}

} // namespace
