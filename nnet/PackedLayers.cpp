#include "nnet/PackedLayers.h"

#include "nnet/FastPath.h"

#include <algorithm>
#include <cstring>

namespace {

// Four floats, operated on lane by lane: the compiler's vector extension applies
// each operator as the same IEEE operation to every lane, in one instruction.
using CVec = float __attribute__((vector_size(4 * sizeof(float))));
constexpr int VecWidth = 4;
constexpr int VecsPerBlock = 4;
static_assert(VecsPerBlock * VecWidth == PackedLanes, "a block is four vectors");

CVec LoadVec(float const* p) {
  CVec v;
  std::memcpy(&v, p, sizeof v);
  return v;
}

void StoreVec(float* p, CVec v) { std::memcpy(p, &v, sizeof v); }

// The weighted sums of one block into z, each lane adding its terms in input order
// as calcVec does. Kept out of line: next to the exponential's calls, which may
// change every vector register, the sums would be kept in memory, and each addition
// would wait for the one before it to be stored and loaded again.
__attribute__((noinline)) void SumBlock(float const* weights, float const* inputs, int inputCount, float* z) {
  CVec sum0 = {};
  CVec sum1 = {};
  CVec sum2 = {};
  CVec sum3 = {};
  for (int i = 0; i < inputCount; ++i, weights += PackedLanes) {
    float const x = inputs[i];
    sum0 += x * LoadVec(weights);
    sum1 += x * LoadVec(weights + VecWidth);
    sum2 += x * LoadVec(weights + 2 * VecWidth);
    sum3 += x * LoadVec(weights + 3 * VecWidth);
  }
  StoreVec(z, sum0);
  StoreVec(z + VecWidth, sum1);
  StoreVec(z + 2 * VecWidth, sum2);
  StoreVec(z + 3 * VecWidth, sum3);
}

// The weights of one layer, packed: `weightOf(j, i)` is the weight from input i into
// neuron j.
template <class WeightOf>
float* PackLayer(int count, int inputs, WeightOf weightOf, float* w) {
  for (int first = 0; first < count; first += PackedLanes) {
    int const lanes = std::min(PackedLanes, count - first);
    for (int i = 0; i < inputs; ++i)
      for (int l = 0; l < PackedLanes; ++l) *w++ = l < lanes ? weightOf(first + l, i) : 0.0f;
  }
  return w;
}

// calcVec's fast path for each block of a layer: `store(first, lanes, z, e, a)` gets
// the net inputs, exponentials and outputs of the block's neurons first ..
// first + lanes - 1.
template <class Store>
void ForwardBlocks(int count, int inputCount, float const* weights, float const* inputs, Store store) {
  float const t = Neuron::activation_threshold;
  float const s = Neuron::activation_slope;
  for (int first = 0; first < count; first += PackedLanes) {
    float z[PackedLanes];
    SumBlock(weights, inputs, inputCount, z);
    weights += static_cast<std::size_t>(inputCount) * PackedLanes;

    // Then calcVec's steps, each over the whole block: the arithmetic lane by lane,
    // the exponentials one call after the other. Lanes past the layer's last neuron
    // take the exponential 0, which keeps their division harmless.
    int const lanes = std::min(PackedLanes, count - first);
    float e[PackedLanes];
    float a[PackedLanes];
    for (int v = 0; v < VecsPerBlock; ++v)
      StoreVec(e + v * VecWidth, FastPathArgument(LoadVec(z + v * VecWidth), t, s));
    for (int l = 0; l < PackedLanes; ++l) e[l] = l < lanes ? FastPathExp(e[l]) : 0.0f;
    for (int v = 0; v < VecsPerBlock; ++v) StoreVec(a + v * VecWidth, FastPathOutput(LoadVec(e + v * VecWidth)));
    store(first, lanes, z, e, a);
  }
}

} // namespace

void PackLayers(CNetLayer const* layers, int layerCount, std::vector<float>& weights) {
  std::size_t total = 0;
  for (int k = 0; k < layerCount; ++k) total += PackedWeightCount(layers[k].Count, layers[k].Inputs);
  weights.resize(total);
  float* w = weights.data();
  for (int k = 0; k < layerCount; ++k) {
    Neuron* const* neurons = layers[k].Neurons;
    w = PackLayer(
        layers[k].Count, layers[k].Inputs,
        [neurons](int j, int i) { return neurons[j]->weights[static_cast<std::size_t>(i)]; }, w);
  }
}

void PackFlatLayer(int count, int inputs, float const* flat, float* packed) {
  auto const row = static_cast<std::size_t>(inputs);
  PackLayer(
      count, inputs,
      [flat, row](int j, int i) { return flat[static_cast<std::size_t>(j) * row + static_cast<std::size_t>(i)]; },
      packed);
}

void ForwardPackedLayer(CNetLayer const& layer, float const* weights, float const* inputs, float* outputs) {
  ForwardBlocks(layer.Count, layer.Inputs, weights, inputs,
                [&layer, outputs](int first, int lanes, float const* z, float const* e, float const* a) {
                  for (int l = 0; l < lanes; ++l) {
                    Neuron& neuron = *layer.Neurons[first + l];
                    neuron.net_input = z[l];
                    neuron.cached_exp = e[l];
                    neuron.output = a[l];
                    outputs[first + l] = a[l];
                  }
                });
}

void ForwardPackedOutputs(int count, int inputs, float const* weights, float const* in, float* outputs) {
  ForwardBlocks(count, inputs, weights, in,
                [outputs](int first, int lanes, float const*, float const*, float const* a) {
                  for (int l = 0; l < lanes; ++l) outputs[first + l] = a[l];
                });
}
