// Back-propagation with momentum, the error measure and the pattern set checks.
#include "NeuronalNet.h"
#include "nnet/FlatWeights.h"
#include "nnet/NumberText.h"

#include <climits>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <limits>
#include <utility>

namespace {

// Mean errors truncated toward zero; NaN and values beyond int saturate instead of
// overflowing (0 for NaN).
int TruncatedLevel(float mean) {
  if (std::isnan(mean)) return 0;
  if (mean >= 2147483648.0f) return INT_MAX;
  if (mean <= -2147483648.0f) return INT_MIN;
  return static_cast<int>(mean);
}

void PrintPatternBlock(int index, training_pattern const& p) {
  std::printf("%i %s: \n", index, p.name.c_str());
  std::printf("Input: ");
  for (float value : p.inputs) std::printf("%s ", FixedText(static_cast<double>(value)).c_str());
  std::printf("\nOutput: ");
  for (float value : p.outputs) std::printf("%s ", FixedText(static_cast<double>(value)).c_str());
  std::printf("\n");
}

void PrintStop(int cycle, float mean) {
  std::printf("Abbruch bei Cycle %d\n", cycle);
  std::printf("Fehler: %s\n", FixedText(static_cast<double>(mean)).c_str());
}

} // namespace

float NeuronalNet::train(training_pattern pattern) {
  setInput(pattern.inputs);
  use();
  const int H = LayerCount();
  const int O = fixed_.output_count;
  const float rate = pattern.training_rate;

  // Deltas live in the layer buffers: the output layer's in buffer H, hidden layer
  // k's in buffer k. All of them are computed from the weights before this step.
  float* outDelta = layer_buffers_[H].data();
  Neuron::Act_AblVec(output_layer_.data(), outDelta, O);
  for (int j = 0; j < O; ++j)
    outDelta[j] *= pattern.outputs.at(static_cast<std::size_t>(j)) - output_layer_[static_cast<std::size_t>(j)]->output;
  for (int k = H - 1; k >= 0; --k) {
    std::vector<Neuron*> const& next = k == H - 1 ? output_layer_ : hidden_layers_[k + 1];
    float const* nextDelta = layer_buffers_[k + 1].data();
    float* delta = layer_buffers_[k].data();
    Neuron::Act_AblVec(hidden_layers_[k].data(), delta, HiddenSize(k));
    for (int i = 0; i < HiddenSize(k); ++i) {
      float sum = 0.0f;
      for (std::size_t j = 0; j < next.size(); ++j) sum += nextDelta[j] * next[j]->weights[static_cast<std::size_t>(i)];
      delta[i] *= sum;
    }
  }

  std::vector<float> changes;
  changes.reserve(FlatWeightCount(neurons_));
  std::size_t previous = 0;
  auto update = [&](std::vector<Neuron*> const& layer, float const* delta, auto inputOf) {
    for (std::size_t j = 0; j < layer.size(); ++j) {
      Neuron& neuron = *layer[j];
      for (int i = 0; i < neuron.input_count; ++i) {
        float& w = neuron.weights[static_cast<std::size_t>(i)];
        const float change = rate * delta[j] * inputOf(i);
        w += change;
        changes.push_back(change);
        if (!first_training_step_ && previous < previous_changes_.size())
          w += momentum_amount_ * previous_changes_[previous++];
      }
    }
  };
  for (int k = H; k >= 0; --k) {
    std::vector<Neuron*> const& layer = k == H ? output_layer_ : hidden_layers_[k];
    if (k == 0)
      update(layer, layer_buffers_[0].data(), [this](int i) { return input_values_[static_cast<std::size_t>(i)]; });
    else
      update(layer, layer_buffers_[k].data(), [&predecessors = hidden_layers_[k - 1]](int i) {
        return predecessors[static_cast<std::size_t>(i)]->output;
      });
  }
  WeightsChanged();
  first_training_step_ = 0;
  previous_changes_ = std::move(changes);

  use();
  return getRMS(pattern.outputs);
}

float NeuronalNet::batch_train(std::vector<training_pattern> patterns, float errorBound, float maxCycles) {
  if (!(maxCycles > 0.0f)) return 0.0f;
  int cycle = 0;
  bool saved = false;
  int level = 0;
  for (;;) {
    for (std::size_t i = 1; i < patterns.size(); ++i)
      std::swap(patterns[i], patterns[static_cast<std::size_t>(std::rand()) % (i + 1)]);
    float sum = 0.0f;
    for (training_pattern const& p : patterns) sum = sum + train(p);
    ++cycle;
    const float mean =
        patterns.empty() ? std::numeric_limits<float>::quiet_NaN() : sum / static_cast<float>(patterns.size());
    if (static_cast<float>(level) < mean && !saved) {
      saved = true;
      std::printf("Abgespeichert bei Cycle: %d\n", cycle);
    } else {
      level = TruncatedLevel(mean);
      saved = false;
    }
    if (-errorBound <= mean && mean <= errorBound) {
      PrintStop(cycle, mean);
      return mean;
    }
    if (maxCycles == static_cast<float>(cycle)) {
      PrintStop(cycle, mean);
      return mean;
    }
    if (!(maxCycles > static_cast<float>(cycle)) || cycle == INT_MAX) return mean;
  }
}

float NeuronalNet::getRMS(std::vector<float> targets) {
  float sum = 0.0f;
  for (std::size_t j = 0; j < output_layer_.size(); ++j) {
    const float difference = targets.at(j) - output_layer_[j]->output;
    sum += difference * difference;
  }
  return std::sqrt(sum);
}

std::vector<int> NeuronalNet::batch_verify(std::vector<training_pattern> patterns) {
  std::vector<int> failed;
  for (std::size_t k = 0; k < patterns.size(); ++k) {
    std::vector<float> const& targets = patterns[k].outputs;
    std::size_t expected = 0;
    for (std::size_t j = 1; j < targets.size(); ++j)
      if (targets[j] > targets[expected]) expected = j;
    use(patterns[k].inputs);
    if (static_cast<std::size_t>(winner()) != expected) failed.push_back(static_cast<int>(k));
  }
  return failed;
}

bool NeuronalNet::check_learn_data_for_duplicates(std::vector<training_pattern> patterns) {
  for (std::size_t i = 0; i < patterns.size(); ++i)
    for (std::size_t j = 0; j < patterns.size(); ++j) {
      if (j == i || patterns[i].inputs != patterns[j].inputs || patterns[i].outputs == patterns[j].outputs) continue;
      std::printf("Warning: input-pattern %i (%s) and %i (%s) seem to contain inconsistencies.\n", static_cast<int>(i),
                  patterns[i].name.c_str(), static_cast<int>(j), patterns[j].name.c_str());
      PrintPatternBlock(static_cast<int>(i), patterns[i]);
      PrintPatternBlock(static_cast<int>(j), patterns[j]);
      return true;
    }
  return false;
}
