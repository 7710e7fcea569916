// One labelled example for training and verifying a NeuronalNet.
#ifndef TONVEX_TRAININGPATTERN_H
#define TONVEX_TRAININGPATTERN_H

#include "TonvexExport.h"

#include <string>
#include <vector>

struct TONVEX_API training_pattern {
  std::vector<float> inputs;  ///< one value per input neuron
  std::vector<float> outputs; ///< target value per output neuron; the largest marks the expected class
  float training_rate = 0.0f; ///< learning rate used when this pattern is trained
  std::string name;           ///< label printed in diagnostics and reports
};

#endif
