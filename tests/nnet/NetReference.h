// A double-precision model of a net, written from the textbook description, to
// check NeuronalNet's forward pass and back-propagation against: weights per layer,
// neuron and predecessor, sigmoid or identity activation, input sum, no output
// function, momentum kept per weight.
#ifndef TONVEX_TESTS_NETREFERENCE_H
#define TONVEX_TESTS_NETREFERENCE_H

#include "support/TestPrelude.h"

namespace reference {

using Matrix = std::vector<std::vector<double>>; // [neuron][predecessor]

struct Net {
  std::vector<int> sizes;      // input count, hidden sizes, output count
  std::vector<Matrix> weights; // one per layer after the inputs
  std::vector<Matrix> lastChange;
  ACT_TYPE activation = ACT_SIGM;
  double slope = 1, threshold = 0;
  bool flatSpot = true;
  bool trained = false;

  // Reads the flat weight order: layer by layer, neuron by neuron, predecessor by
  // predecessor.
  explicit Net(TPredefinedWeights const& record) {
    sizes.push_back(record.fixed.input_count);
    for (int k = 0; k < record.dyn.hidden_layer_count; ++k) sizes.push_back(record.dyn.hidden_layer_sizes[k]);
    sizes.push_back(record.fixed.output_count);
    activation = record.dyn.neuron_prop.activation_type;
    slope = record.dyn.neuron_prop.activation_slope;
    threshold = record.dyn.neuron_prop.activation_threshold;
    float const* flat = record.weights;
    for (std::size_t l = 1; l < sizes.size(); ++l) {
      Matrix m(static_cast<std::size_t>(sizes[l]), std::vector<double>(static_cast<std::size_t>(sizes[l - 1])));
      for (auto& row : m)
        for (double& w : row) w = *flat++;
      weights.push_back(m);
    }
  }

  double Activate(double z) const {
    return activation == ACT_IDENT ? z : 1.0 / (std::exp(-(z - threshold) * slope) + 1.0);
  }
  double Derivative(double z) const {
    if (activation == ACT_IDENT) return 1.0;
    const double e = std::exp((threshold - z) * slope);
    return e / ((e + 1) * (e + 1)) + (flatSpot ? 0.10000000149011612 : 0.0);
  }

  // Net inputs and outputs of every layer; layer 0 holds the inputs as outputs.
  void Forward(std::vector<double> const& x, std::vector<std::vector<double>>& z,
               std::vector<std::vector<double>>& out) const {
    z.assign(1, {});
    out.assign(1, x);
    for (Matrix const& m : weights) {
      std::vector<double> layerZ, layerOut;
      for (auto const& row : m) {
        double sum = 0;
        for (std::size_t i = 0; i < row.size(); ++i) sum += row[i] * out.back()[i];
        layerZ.push_back(sum);
        layerOut.push_back(Activate(sum));
      }
      z.push_back(layerZ);
      out.push_back(layerOut);
    }
  }

  std::vector<double> Outputs(std::vector<double> const& x) const {
    std::vector<std::vector<double>> z, out;
    Forward(x, z, out);
    return out.back();
  }

  // One on-line back-propagation step with momentum on each weight's previous change.
  void Train(std::vector<double> const& x, std::vector<double> const& target, double rate, double momentum) {
    std::vector<std::vector<double>> z, out;
    Forward(x, z, out);
    const std::size_t layers = weights.size();
    std::vector<std::vector<double>> delta(layers + 1);
    for (std::size_t j = 0; j < out[layers].size(); ++j)
      delta[layers].push_back(Derivative(z[layers][j]) * (target[j] - out[layers][j]));
    for (std::size_t l = layers - 1; l >= 1; --l) {
      for (std::size_t i = 0; i < out[l].size(); ++i) {
        double sum = 0;
        for (std::size_t j = 0; j < delta[l + 1].size(); ++j) sum += delta[l + 1][j] * weights[l][j][i];
        delta[l].push_back(Derivative(z[l][i]) * sum);
      }
    }
    std::vector<Matrix> change = weights;
    for (std::size_t l = 0; l < layers; ++l)
      for (std::size_t j = 0; j < weights[l].size(); ++j)
        for (std::size_t i = 0; i < weights[l][j].size(); ++i) {
          change[l][j][i] = rate * delta[l + 1][j] * out[l][i];
          weights[l][j][i] += change[l][j][i] + (trained ? momentum * lastChange[l][j][i] : 0.0);
        }
    lastChange = change;
    trained = true;
  }
};

} // namespace reference

#endif
