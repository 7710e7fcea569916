// The forward pass of a net of the built-in net's shape and weights.
#include "BenchSupport.h"
#include "support/Voicings.h"
#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

namespace {

// The inputs root finding gives the net: 1.0 at each interval above the lowest note.
std::vector<std::vector<float>> IntervalInputs() {
  std::vector<std::vector<float>> inputs;
  for (CMySet<int> const& voicing : Voicings()) {
    std::vector<float> in(24, 0.0f);
    for (int note : voicing) in[static_cast<std::size_t>((note - *voicing.begin()) % 12)] = 1.0f;
    inputs.push_back(in);
  }
  return inputs;
}

// Dense inputs in [0, 1), as the hidden layers see them.
std::vector<std::vector<float>> DenseInputs() {
  CBenchRandom random(VoicingSeed);
  std::vector<std::vector<float>> inputs(static_cast<std::size_t>(VoicingCount), std::vector<float>(24));
  for (std::vector<float>& in : inputs)
    for (float& x : in) x = static_cast<float>(random.Below(1 << 20)) / static_cast<float>(1 << 20);
  return inputs;
}

void Forward(benchmark::State& state, std::vector<std::vector<float>> inputs) {
  // Built after the library's own net with the same properties, so the process-wide
  // neuron parameters stay the built-in ones.
  NeuronalNet net(ChordAnalysisNeuronalNet);
  RunOverItems(state, inputs, [&net](std::vector<float> const& in) {
    net.setInput(in);
    net.use();
    benchmark::ClobberMemory();
  });
}
void BM_NetForwardIntervals(benchmark::State& state) { Forward(state, IntervalInputs()); }
void BM_NetForwardDense(benchmark::State& state) { Forward(state, DenseInputs()); }
TONVEX_BENCHMARK(BM_NetForwardIntervals);
TONVEX_BENCHMARK(BM_NetForwardDense);

} // namespace
