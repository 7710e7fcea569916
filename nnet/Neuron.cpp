// Neuron evaluation: input, activation and output functions and the derivative.
#include "Neuron.h"
#include "nnet/FastPath.h"
#include "nnet/NeuronValue.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>

int Neuron::flat_spot_elimination = 1;
float Neuron::activation_threshold = 0.0f;
float Neuron::activation_slope = 0.0f;
float Neuron::output_threshold = 0.0f;
int Neuron::combined_type = 0;
ACT_TYPE Neuron::activation_type = ACT_SIGM;
OUTPUT_TYPE Neuron::output_type = OUTPUT_NONE;
INPUT_TYPE Neuron::input_type = INPUT_SUM;

namespace {

// The flat-spot constant is the float 0.1 added in double, so its widened value
// 0.10000000149011612 is what counts: the built-in net's weights were trained with
// that derivative, and retraining must reproduce them.
constexpr double FlatSpot = static_cast<double>(0.1f);

std::size_t Count(int n) { return static_cast<std::size_t>(std::max(n, 0)); }

float NetInput(float const* x, float const* w, int n, int weightCount) {
  const int terms = std::min(n, weightCount); // weights past the array count as 0
  switch (Neuron::input_type) {
  case INPUT_SUM:
  case INPUT_AVG: {
    float sum = 0.0f;
    for (int i = 0; i < terms; ++i) sum += x[i] * w[i];
    if (Neuron::input_type == INPUT_SUM) return sum;
    return n != 0 ? sum / static_cast<float>(n) : std::numeric_limits<float>::quiet_NaN();
  }
  case INPUT_MIN:
  case INPUT_MAX: {
    float z = x[0];
    for (int i = 1; i < n; ++i)
      if (Neuron::input_type == INPUT_MIN ? x[i] < z : x[i] > z) z = x[i];
    return z;
  }
  case INPUT_PROD: {
    // Starts from x[0] * w[0] even when n is 0, as the minimum and maximum start
    // from x[0]; a neuron without weights has no w[0].
    if (weightCount <= 0) return 0.0f;
    float z = x[0] * w[0];
    for (int i = 1; i < terms; ++i) z *= x[i] * w[i];
    return z;
  }
  }
  return 0.0f;
}

float Activation(float z) {
  const float t = Neuron::activation_threshold;
  const float s = Neuron::activation_slope;
  switch (Neuron::activation_type) {
  case ACT_SIGM: {
    const float arg = (z - t) * -s;
    return ClampToUnit(static_cast<float>(1.0 / (std::exp(static_cast<double>(arg)) + 1.0)));
  }
  case ACT_LIN: {
    const float u = z - t;
    return ClampToUnit(u > 0.0f && u < 1.0f ? u * s : u);
  }
  case ACT_TANHYP: {
    const float u = z - t;
    const double up = std::exp(static_cast<double>(u * s));
    const double down = std::exp(static_cast<double>(u * -s));
    return ClampToUnit(static_cast<float>((up - down) / (up + down)));
  }
  case ACT_IDENT: break;
  }
  return z;
}

// Weighted sum of the fast path, in input order like the reference evaluation, so
// that the two differ only by the exponential's precision.
float DotProduct(float const* x, float const* w, int n) {
  float z = 0.0f;
  for (int i = 0; i < n; ++i) z += x[i] * w[i];
  return z;
}

} // namespace

Neuron::Neuron(int n) : input_count(std::max(n, 0)), weights(new float[Count(n)]) {
  for (int i = 0; i < input_count; ++i) {
    const int r = std::rand() % 100;
    float w = static_cast<float>(r) / 100.0f;
    if (w == 0.0f) w = 0.1f;
    if (w == 1.0f) w = 0.99f;
    weights[static_cast<std::size_t>(i)] = w;
  }
  flat_spot_elimination = 1;
}

Neuron::Neuron(Neuron const& other)
    : input_count(std::max(other.input_count, 0)), weights(new float[Count(other.input_count)]()) {
  std::copy(weights.get(), weights.get() + input_count, other.weights.get());
}

Neuron& Neuron::operator=(Neuron other) {
  input_count = std::max(other.input_count, 0);
  weights.reset(new float[Count(input_count)]());
  std::copy(weights.get(), weights.get() + input_count, other.weights.get());
  return *this;
}

float NeuronValue(float const* inputs, int n, float const* weights, int weightCount, float& netInput) {
  netInput = NetInput(inputs, weights, n, weightCount);
  const float a = Activation(netInput);
  return Neuron::output_type == OUTPUT_BIN ? (a >= Neuron::output_threshold ? 1.0f : 0.0f) : a;
}

void Neuron::calcValue(float const* inputs, int n, float* outputs, int index) {
  output = NeuronValue(inputs, n, weights.get(), input_count, net_input);
  outputs[index] = output;
}

void Neuron::calcVec(Neuron** neurons, float const* inputs, int n, float* outputs, int count) {
  if (combined_type != 0) {
    for (int j = 0; j < count; ++j) neurons[j]->calcValue(inputs, n, outputs, j);
    return;
  }
  const float t = activation_threshold;
  const float s = activation_slope;
  for (int j = 0; j < count; ++j) {
    Neuron& neuron = *neurons[j];
    neuron.net_input = DotProduct(inputs, neuron.weights.get(), std::min(n, neuron.input_count));
    neuron.cached_exp = FastPathExp(FastPathArgument(neuron.net_input, t, s));
    neuron.output = FastPathOutput(neuron.cached_exp);
    outputs[j] = neuron.output;
  }
}

float Neuron::Act_Abl() {
  const float s = activation_slope;
  const float x = (activation_threshold - net_input) * s;
  switch (activation_type) {
  case ACT_SIGM: {
    if (x < -50.0f || x > 50.0f) return flat_spot_elimination ? 0.1f : 0.0f;
    const double e = std::exp(static_cast<double>(x));
    double derivative = e / ((e + 1.0) * (e + 1.0));
    if (flat_spot_elimination) derivative += FlatSpot;
    return static_cast<float>(derivative);
  }
  case ACT_LIN: return net_input >= 0.0f && net_input <= 1.0f ? s : 0.0f;
  case ACT_TANHYP: {
    const double a = std::exp(-static_cast<double>(x));
    const double b = std::exp(static_cast<double>(x));
    const double sd = static_cast<double>(s);
    return static_cast<float>(sd * (a + b) / (a + b) - (a - b) * (sd * a - sd * b) / ((a + b) * (a + b)));
  }
  case ACT_IDENT: return 1.0f;
  }
  return 0.0f;
}

void Neuron::Act_AblVec(Neuron** neurons, float* result, int count) {
  for (int j = 0; j < count; ++j) result[j] = neurons[j]->Act_Abl();
}

void Neuron::SetCalcParams(INPUT_TYPE inputType, ACT_TYPE activationType, OUTPUT_TYPE outputType, float slope,
                           float threshold, float outputThreshold) {
  input_type = inputType;
  activation_type = activationType;
  output_type = outputType;
  activation_slope = slope;
  activation_threshold = threshold;
  output_threshold = outputThreshold;
  const unsigned combined = (static_cast<unsigned>(outputType) * 4u + static_cast<unsigned>(activationType)) * 5u +
                            static_cast<unsigned>(inputType);
  combined_type = static_cast<int>(combined);
}
