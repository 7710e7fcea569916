// A fully connected feed-forward perceptron with back-propagation training and the
// text formats of trained nets.
//
// Layers: the input vector, 0..4 hidden layers, the output layer. There are no bias
// weights; the only offset is the activation threshold, one value for all neurons.
// The neuron function parameters are process-wide Neuron statics: every constructor,
// BuildNet, copy and assignment sets them from this net's properties, so the most
// recently built net decides how all nets evaluate.
//
// Counts are made valid when a structure is built and stored: negative counts become
// 0 and a hidden layer count above 4 becomes 4 (a record holds at most four sizes).
// Everything else is taken as given; nothing is reported.
//
// Random start weights come from the shared rand(), which the library never seeds:
// call srand yourself for reproducible nets and training runs.
#ifndef TONVEX_NEURONALNET_H
#define TONVEX_NEURONALNET_H

#include "NetProperties.h"
#include "Neuron.h"
#include "TonvexExport.h"
#include "TrainingPattern.h"

#include <memory>
#include <string>
#include <vector>

class TONVEX_API NeuronalNet {
public:
  /// Builds the layers with BuildNet.
  NeuronalNet(TFixedNetProp fixed, TDynNetProp dyn);
  /// Builds from the record's properties, then takes its weights with
  /// acquire_weights; should that fail, the random start weights stay, unreported.
  explicit NeuronalNet(TPredefinedWeights net);
  /// As NeuronalNet(TPredefinedWeights); the extra pointer is ignored.
  NeuronalNet(TPredefinedWeights net, float* ignored);
  /// Input count, hidden layer count H, H hidden layer sizes, output count and the
  /// neuron properties (slope before threshold). Reads min(H, 4) entries of
  /// `hiddenSizes` and none when H <= 0 (then it may be null); the remaining size
  /// entries are 0. The output neurons have as many inputs as the last hidden layer
  /// has neurons, and no inputs at all when H is 0. Otherwise the same as BuildNet.
  NeuronalNet(int inputCount, int hiddenLayerCount, int* hiddenSizes, int outputCount, INPUT_TYPE inputType,
              ACT_TYPE activationType, float slope, float threshold, OUTPUT_TYPE outputType, float outputThreshold);
  /// Builds the other net's structure with BuildNet (which draws fresh random
  /// weights, advancing rand()), then copies its weights, its previous weight
  /// changes, its first-step flag, its momentum amount and its records.
  NeuronalNet(NeuronalNet const& other);
  /// Rebuilds this net from the argument's properties with BuildNet, then copies as
  /// the copy constructor does. The argument is a copy, so assigning a net to itself
  /// keeps its weights (and still draws random numbers). Returns a copy of the
  /// result by value.
  NeuronalNet operator=(NeuronalNet other);
  ~NeuronalNet();

  /// Stores both records (counts made valid, see above), sets the first-step flag to
  /// 1 and the momentum amount to 0.6, calls Neuron::SetCalcParams with the neuron
  /// properties and creates the layers: every neuron of hidden layer 0 has I
  /// inputs, of hidden layer k >= 1 h(k-1) inputs, every output neuron h(H-1) inputs
  /// (none when H is 0). Random start weights are drawn layer by layer, neuron by
  /// neuron, weight by weight. Rebuilding releases the previous structure. The
  /// previous weight changes are kept.
  void BuildNet(TFixedNetProp fixed, TDynNetProp dyn);

  /// Copies the first min(size, I) values into the input array: surplus values are
  /// ignored and a shorter vector leaves the remaining inputs as they were.
  void setInput(std::vector<float> const& inputs);
  /// Evaluates the net on the current input array. Allocation-free; the hidden
  /// layers ping-pong between layer buffers 0 and 1 however many there are. Every
  /// layer is evaluated as Neuron::calcVec evaluates it, to the bit (a NaN output
  /// stays NaN; where two NaNs meet, which payload survives is the compiler's
  /// choice in either way); on calcVec's fast path the neurons of a layer are
  /// summed side by side from a transposed copy of the weights, which the first
  /// use after a weight change (copying, acquire_weights, training, loading)
  /// brings up to date.
  void use();
  /// setInput, then use().
  void use(std::vector<float> inputs);
  /// The output neurons' last outputs in index order (empty without outputs).
  std::vector<float> get_outputs();
  /// Index of the largest output; ties go to the lowest index; 0 without outputs.
  int winner();
  int get_input_neuron_count();

  /// The properties with a newly allocated weight array (new[], owned by the
  /// caller: delete[] it) in the flat order. Its length is
  /// h0*I + sum(k=1..H-1) hk*h(k-1) + O*h(H-1), where a net without hidden layers
  /// still counts h0*I (entry 0 of the sizes) and O*0; entries no neuron fills are 0.
  TPredefinedWeights get_weights();
  /// Takes the record's flat weights into the neurons when the record matches this
  /// net: equal input and output counts, hidden layer count, hidden layer sizes
  /// 0..H-1, input, activation and output types, slope, threshold and output
  /// threshold (exact float equality). On a mismatch, or a null weight pointer, it
  /// returns false and changes nothing.
  bool acquire_weights(TPredefinedWeights net);

  void set_momentum_amount(float amount);
  float get_momentum_amount();
  /// Sets Neuron::flat_spot_elimination (for all nets).
  void enable_flat_spot_elimination(bool on);

  /// Writes the properties to std::cerr (19 lines, enumerations as numbers).
  void trace();

  // Training by on-line back-propagation with momentum.

  /// One step on one pattern: forward pass, deltas (with the weights from before the
  /// step), weight updates Delta = rate * delta[j] * x[i] in the order output layer,
  /// hidden layers H-1 .. 0. Unless this is the net's first step, each weight also
  /// gets momentum * (the previous step's plain Delta of the same weight), taken in
  /// the order in which that step made its changes; when the previous changes run
  /// out (the net was rebuilt with more weights) the rest get no momentum term.
  /// Returns getRMS of the targets after a second forward pass. Targets shorter than
  /// the output count throw std::out_of_range before any weight changes.
  float train(training_pattern pattern);
  /// Trains cycle after cycle, each on a rand()-shuffled order of the patterns,
  /// until the mean error of a cycle lies within [-errorBound, errorBound] or
  /// `maxCycles` cycles are done; returns the last cycle's mean error, 0 when
  /// maxCycles is not above 0 (then nothing is trained), NaN means for an empty set.
  /// Prints "Abgespeichert bei Cycle: %d\n" whenever the error rises above the
  /// remembered integer level (a marker only; nothing is saved), and
  /// "Abbruch bei Cycle %d\n" and "Fehler: %f\n" when it stops by either rule.
  float batch_train(std::vector<training_pattern> patterns, float errorBound, float maxCycles);
  /// Euclidean length of (targets - outputs) over the output neurons (not divided by
  /// the output count, despite the name); 0 without outputs. Targets shorter than
  /// the output count throw std::out_of_range.
  float getRMS(std::vector<float> targets);
  /// Indices of the patterns whose winner is not the index of their largest target
  /// (the first on ties, 0 for empty targets). Prints nothing.
  std::vector<int> batch_verify(std::vector<training_pattern> patterns);
  /// True, with a printed report of the first such pair, when two patterns have equal
  /// inputs but different targets.
  bool check_learn_data_for_duplicates(std::vector<training_pattern> patterns);

  // Text formats of trained nets.

  /// The net as text, starting with the local time (asctime) and two line ends, then
  /// by `mode`: a property report (mode <= 3), the patterns the net does not
  /// recognise (3, 4; this evaluates the net), the weights neuron by neuron (0, 1),
  /// static-data definitions of weight_definitions and a TPredefinedWeights (2, 3)
  /// and the property and weight list that the two readers accept (4). An error or
  /// cycle count of -1 suppresses its line. Numbers use the stream's default
  /// formatting (six significant digits). Type values outside their enumerations
  /// are written as empty names (an output type other than OUTPUT_BIN as none).
  std::string weights_to_text(int mode, float error, float cycles, std::vector<training_pattern> patterns);
  /// Reads a weight list (the lines after the first line that ends with "weight
  /// definitions") into the neurons in the flat order, printing "weight %i, %f\n"
  /// per value read. Each line's value is its prefix of digits, '-' and '.', so a
  /// number written in exponent form is read up to its 'e' only; a line without such
  /// a prefix gives 0. Lines are cut at 500 characters. A file with fewer values than
  /// the net has weights fills the first weights and leaves the rest; surplus values
  /// are ignored. A file that cannot be opened reads as empty.
  void load_weights_from_file(char const* path);
  /// Reads a property list: every line that ends with one of the keys written by
  /// weights_to_text mode 4 (starting within its first 450 characters) prints
  /// "<key> erkannt!" ("Number Neurons Hidden Layers erkannt!" for the four hidden
  /// sizes) and sets that field from the line's start: counts from the leading
  /// digits, types by name (compared on at most the name's first 10 characters,
  /// followed by "%i\n" with the value; an unknown name keeps the previous value),
  /// reals from the prefix of digits, '-' and '.'. Fields not found are 0. Static,
  /// so that a net can be built from the result.
  static TNetProp load_net_properties_from_file(char const* path);

private:
  int LayerCount() const { return dyn_.hidden_layer_count; }
  int HiddenSize(int k) const { return dyn_.hidden_layer_sizes[k]; }
  int OutputInputCount() const { return LayerCount() > 0 ? HiddenSize(LayerCount() - 1) : 0; }
  // Marks the transposed weights of the forward pass out of date; every change of
  // a weight calls it.
  void WeightsChanged() { packed_stale_ = 1; }

  // Field order as in the exchange description; ownership by value members.
  std::vector<float> input_values_;
  std::vector<Neuron*> hidden_layers_[4]; ///< views into neurons_, the form Neuron::calcVec takes
  std::vector<Neuron*> output_layer_;
  std::vector<float> layer_buffers_[5]; ///< max(H+1, 2) used: a net without hidden layers still ping-pongs
  std::vector<float> previous_changes_;
  int first_training_step_ = 1;
  float momentum_amount_ = 0.6f;
  TFixedNetProp fixed_{};
  TDynNetProp dyn_{};
  std::vector<std::unique_ptr<Neuron>> neurons_; ///< owns every neuron, in the flat order
  std::vector<float> packed_weights_;            ///< each layer transposed (nnet/PackedLayers.h), in layer order
  int packed_stale_ = 1;                         ///< packed_weights_ lag behind the neurons' weights
};

#endif
