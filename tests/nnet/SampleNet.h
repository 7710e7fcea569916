// A small trained net that the static-data writer and its test both rebuild: the
// same seed and the same steps give the same weights.
#ifndef TONVEX_TESTS_SAMPLENET_H
#define TONVEX_TESTS_SAMPLENET_H

#include <tonvex/NeuronalNet.h>

#include <cstdlib>
#include <vector>

namespace sample {

inline TFixedNetProp Fixed() { return {3, 2}; }

inline TDynNetProp Dyn() { return {2, {4, 3, 0, 0}, {INPUT_SUM, ACT_SIGM, 0.5f, 1.0f, OUTPUT_NONE, 0.0f}}; }

/// Seeds rand(), builds the net into `net` and trains it a few steps.
inline void Train(NeuronalNet& net) {
  std::srand(2024);
  net.BuildNet(Fixed(), Dyn());
  const std::vector<training_pattern> patterns = {
      {{1, 0, 1}, {1, 0}, 0.8f, "x"}, {{0, 1, 1}, {0, 1}, 0.8f, "y"}, {{1, 1, 0}, {1, 0}, 0.8f, "z"}};
  for (int cycle = 0; cycle < 30; ++cycle)
    for (training_pattern const& p : patterns) net.train(p);
}

} // namespace sample

#endif
