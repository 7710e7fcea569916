// Net structure, forward pass, flat weights, copying and the trace.
#include "NeuronalNet.h"
#include "nnet/FlatWeights.h"
#include "nnet/PackedLayers.h"

#include <algorithm>
#include <iostream>
#include <utility>

namespace {

std::size_t Count(int n) { return static_cast<std::size_t>(std::max(n, 0)); }

TDynNetProp DynProp(int hiddenLayerCount, int const* hiddenSizes, INPUT_TYPE inputType, ACT_TYPE activationType,
                    float slope, float threshold, OUTPUT_TYPE outputType, float outputThreshold) {
  TDynNetProp dyn{};
  dyn.hidden_layer_count = hiddenLayerCount;
  for (int k = 0; k < std::min(hiddenLayerCount, 4); ++k) dyn.hidden_layer_sizes[k] = hiddenSizes[k];
  dyn.neuron_prop = {inputType, activationType, slope, threshold, outputType, outputThreshold};
  return dyn;
}

// The layers of a net in evaluation order, each with the input count of its
// neurons, which is the count use() evaluates it with. Returns their number.
int NetLayers(TFixedNetProp const& fixed, TDynNetProp const& dyn, std::vector<Neuron*> (&hidden)[4],
              std::vector<Neuron*>& output, CNetLayer (&layers)[5]) {
  int count = 0;
  int n = fixed.input_count;
  for (int k = 0; k < dyn.hidden_layer_count; ++k) {
    layers[count++] = {hidden[k].data(), dyn.hidden_layer_sizes[k], n};
    n = dyn.hidden_layer_sizes[k];
  }
  layers[count++] = {output.data(), fixed.output_count, dyn.hidden_layer_count > 0 ? n : 0};
  return count;
}

bool SameNeuronProp(TNeuronProp const& a, TNeuronProp const& b) {
  return a.input_type == b.input_type && a.activation_type == b.activation_type &&
         a.activation_slope == b.activation_slope && a.activation_threshold == b.activation_threshold &&
         a.output_type == b.output_type && a.output_threshold == b.output_threshold;
}

} // namespace

NeuronalNet::NeuronalNet(TFixedNetProp fixed, TDynNetProp dyn) { BuildNet(fixed, dyn); }

NeuronalNet::NeuronalNet(TPredefinedWeights net) {
  BuildNet(net.fixed, net.dyn);
  acquire_weights(net);
}

NeuronalNet::NeuronalNet(TPredefinedWeights net, float*) : NeuronalNet(net) {}

NeuronalNet::NeuronalNet(int inputCount, int hiddenLayerCount, int* hiddenSizes, int outputCount, INPUT_TYPE inputType,
                         ACT_TYPE activationType, float slope, float threshold, OUTPUT_TYPE outputType,
                         float outputThreshold)
    : NeuronalNet(TFixedNetProp{inputCount, outputCount},
                  DynProp(hiddenLayerCount, hiddenSizes, inputType, activationType, slope, threshold, outputType,
                          outputThreshold)) {}

// BuildNet stores the other net's (already valid) records; what it resets is
// copied afterwards.
NeuronalNet::NeuronalNet(NeuronalNet const& other) : previous_changes_(other.previous_changes_) {
  BuildNet(other.fixed_, other.dyn_);
  CopyNeuronWeights(other.neurons_, neurons_);
  WeightsChanged();
  first_training_step_ = other.first_training_step_;
  momentum_amount_ = other.momentum_amount_;
}

NeuronalNet NeuronalNet::operator=(NeuronalNet other) {
  BuildNet(other.fixed_, other.dyn_);
  CopyNeuronWeights(other.neurons_, neurons_);
  WeightsChanged();
  previous_changes_ = std::move(other.previous_changes_);
  first_training_step_ = other.first_training_step_;
  momentum_amount_ = other.momentum_amount_;
  return *this;
}

NeuronalNet::~NeuronalNet() = default;

void NeuronalNet::BuildNet(TFixedNetProp fixed, TDynNetProp dyn) {
  fixed.input_count = std::max(fixed.input_count, 0);
  fixed.output_count = std::max(fixed.output_count, 0);
  dyn.hidden_layer_count = std::clamp(dyn.hidden_layer_count, 0, 4);
  for (int k = 0; k < dyn.hidden_layer_count; ++k) dyn.hidden_layer_sizes[k] = std::max(dyn.hidden_layer_sizes[k], 0);
  fixed_ = fixed;
  dyn_ = dyn;
  first_training_step_ = 1;
  momentum_amount_ = 0.6f;
  input_values_.assign(Count(fixed.input_count), 0.0f);
  TNeuronProp const& p = dyn.neuron_prop;
  Neuron::SetCalcParams(p.input_type, p.activation_type, p.output_type, p.activation_slope, p.activation_threshold,
                        p.output_threshold);

  neurons_.clear();
  for (std::vector<Neuron*>& view : hidden_layers_) view.clear();
  output_layer_.clear();
  auto addLayer = [this](std::vector<Neuron*>& view, int size, int inputs) {
    for (int j = 0; j < size; ++j) {
      neurons_.push_back(std::make_unique<Neuron>(inputs));
      view.push_back(neurons_.back().get());
    }
  };
  int predecessors = fixed.input_count;
  int longest = std::max(fixed.input_count, fixed.output_count);
  for (int k = 0; k < LayerCount(); ++k) {
    addLayer(hidden_layers_[k], HiddenSize(k), predecessors);
    predecessors = HiddenSize(k);
    longest = std::max(longest, predecessors);
  }
  addLayer(output_layer_, fixed.output_count, OutputInputCount());

  const int buffers = std::max(LayerCount() + 1, 2);
  for (int b = 0; b < 5; ++b) layer_buffers_[b].assign(b < buffers ? Count(longest) : 0, 0.0f);
  // The transposed weights take their room here, so that use() never allocates.
  CNetLayer layers[5];
  PackLayers(layers, NetLayers(fixed_, dyn_, hidden_layers_, output_layer_, layers), packed_weights_);
  packed_stale_ = 0;
}

void NeuronalNet::setInput(std::vector<float> const& inputs) {
  const std::size_t count = std::min(inputs.size(), input_values_.size());
  std::copy(inputs.begin(), inputs.begin() + static_cast<std::ptrdiff_t>(count), input_values_.begin());
}

void NeuronalNet::use() {
  std::copy(input_values_.begin(), input_values_.end(), layer_buffers_[0].begin());
  CNetLayer layers[5];
  const int layerCount = NetLayers(fixed_, dyn_, hidden_layers_, output_layer_, layers);

  // The parameters are read as they stand now: another net may have changed them.
  const bool fastPath = Neuron::combined_type == 0;
  if (fastPath && packed_stale_) {
    PackLayers(layers, layerCount, packed_weights_);
    packed_stale_ = 0;
  }
  float* source = layer_buffers_[0].data();
  float* target = layer_buffers_[1].data();
  float const* weights = packed_weights_.data();
  for (int k = 0; k < layerCount; ++k) {
    CNetLayer const& layer = layers[k];
    if (fastPath) {
      ForwardPackedLayer(layer, weights, source, target);
      weights += PackedWeightCount(layer.Count, layer.Inputs);
    } else {
      Neuron::calcVec(layer.Neurons, source, layer.Inputs, target, layer.Count);
    }
    std::swap(source, target);
  }
}

void NeuronalNet::use(std::vector<float> inputs) {
  setInput(inputs);
  use();
}

std::vector<float> NeuronalNet::get_outputs() {
  std::vector<float> outputs;
  outputs.reserve(output_layer_.size());
  for (Neuron const* neuron : output_layer_) outputs.push_back(neuron->output);
  return outputs;
}

int NeuronalNet::winner() {
  int best = 0;
  for (int j = 1; j < fixed_.output_count; ++j)
    if (output_layer_[Count(j)]->output > output_layer_[Count(best)]->output) best = j;
  return best;
}

int NeuronalNet::get_input_neuron_count() { return fixed_.input_count; }

TPredefinedWeights NeuronalNet::get_weights() {
  // Without hidden layers the length formula still counts entry 0 of the sizes
  // times the input count; those entries belong to no neuron and stay 0.
  std::size_t length = FlatWeightCount(neurons_);
  if (LayerCount() == 0) length += Count(dyn_.hidden_layer_sizes[0]) * Count(fixed_.input_count);
  auto* flat = new float[length]();
  CopyWeightsTo(neurons_, flat);
  return TPredefinedWeights{fixed_, dyn_, flat};
}

bool NeuronalNet::acquire_weights(TPredefinedWeights net) {
  if (net.fixed.input_count != fixed_.input_count || net.fixed.output_count != fixed_.output_count ||
      net.dyn.hidden_layer_count != dyn_.hidden_layer_count || !SameNeuronProp(net.dyn.neuron_prop, dyn_.neuron_prop))
    return false;
  for (int k = 0; k < LayerCount(); ++k)
    if (net.dyn.hidden_layer_sizes[k] != HiddenSize(k)) return false;
  const std::size_t count = FlatWeightCount(neurons_);
  if (net.weights == nullptr && count > 0) return false;
  CopyWeightsFrom(neurons_, net.weights, count);
  WeightsChanged();
  return true;
}

void NeuronalNet::set_momentum_amount(float amount) { momentum_amount_ = amount; }

float NeuronalNet::get_momentum_amount() { return momentum_amount_; }

void NeuronalNet::enable_flat_spot_elimination(bool on) { Neuron::flat_spot_elimination = on ? 1 : 0; }

void NeuronalNet::trace() {
  std::ostream& out = std::cerr;
  TNeuronProp const& p = dyn_.neuron_prop;
  out << "Neuronal Net Trace" << std::endl << "------------------" << std::endl;
  out << "Fixed Network Properties:" << std::endl;
  out << "input count: " << fixed_.input_count << std::endl;
  out << "output count: " << fixed_.output_count << std::endl << std::endl;
  out << "Dynamic Network Properties: " << std::endl;
  out << "Hidden Layers: " << LayerCount() << std::endl << "( ";
  for (int k = 0; k < LayerCount(); ++k) out << HiddenSize(k) << " ";
  out << ")" << std::endl << std::endl;
  out << "Neuron Properties: " << std::endl;
  out << "Input Type: " << static_cast<int>(p.input_type) << std::endl;
  out << "Activation Type: " << static_cast<int>(p.activation_type) << std::endl;
  out << "Activation Slope: " << p.activation_slope << std::endl;
  out << "Activation Threshold: " << p.activation_threshold << std::endl;
  out << "Output Type: " << static_cast<int>(p.output_type) << std::endl;
  out << "Output Threshold: " << p.output_threshold << std::endl;
  out << "End Neuronal Net Trace" << std::endl << "----------------------" << std::endl;
}
