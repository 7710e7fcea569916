// Text forms of a net: report, static-data definitions, property and weight list,
// and the two readers of the list.
#include "NeuronalNet.h"
#include "nnet/FlatWeights.h"
#include "nnet/LocalTime.h"
#include "nnet/NumberText.h"

#include <algorithm>
#include <cctype>
#include <cfloat>
#include <charconv>
#include <climits>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <limits>
#include <locale>
#include <sstream>

namespace {

using std::endl;

constexpr char const* InputNames[] = {"INPUT_SUM", "INPUT_MIN", "INPUT_MAX", "INPUT_AVG", "INPUT_PROD"};
constexpr char const* ActivationNames[] = {"ACT_SIGM", "ACT_LIN", "ACT_TANHYP", "ACT_IDENT"};
constexpr char const* OutputNames[] = {"OUTPUT_NONE", "OUTPUT_BIN"};
constexpr char const* InputReportNames[] = {"Sum", "Minimum", "Maximum", "Average", "Product"};
constexpr char const* ActivationReportNames[] = {"Sigmoid, ", "Linear, ", "Tanhyp, ", "Ident. Projection, "};
constexpr char const* WeightMarker = "weight definitions";

// names[value] followed by suffix; nothing for a value outside the table.
template <std::size_t N>
std::string Named(char const* const (&names)[N], int value, char const* suffix = "") {
  if (value < 0 || static_cast<std::size_t>(value) >= N) return std::string();
  return std::string(names[value]) + suffix;
}

void WriteErrorAndCycles(std::ostream& out, float error, float cycles) {
  if (error != -1.0f) out << "Overall Error generated: " << error << endl;
  if (cycles != -1.0f) out << "Cycles: " << cycles << endl;
}

void WriteValues(std::ostream& out, float const* values, std::size_t count) {
  for (std::size_t i = 0; i < count; ++i) out << values[i] << ", ";
}

void WriteValues(std::ostream& out, std::vector<float> const& values) {
  WriteValues(out, values.data(), values.size());
}

void WriteWeights(std::ostream& out, Neuron const& neuron) {
  WriteValues(out, neuron.weights.get(), static_cast<std::size_t>(neuron.input_count));
}

// Lines are read into a fixed 500-character frame; keys count only where the line
// ends with them and they start within its first 450 characters.
constexpr std::size_t MaxLineLength = 500;
constexpr std::size_t LastKeyStart = 449;

void CutLine(std::string& line) {
  if (line.size() > MaxLineLength) line.resize(MaxLineLength);
}

bool ReadLine(std::istream& in, std::string& line) {
  if (!std::getline(in, line)) return false;
  CutLine(line);
  return true;
}

bool EndsWithKey(std::string const& line, char const* key) {
  const std::size_t length = std::strlen(key);
  if (line.size() < length || line.size() - length > LastKeyStart) return false;
  return line.compare(line.size() - length, length, key) == 0;
}

// The line's prefix of digits, '-' and '.', at most 49 characters, read as atof
// reads it in the C locale (whatever locale the host set: the files are written with
// a point) and 0 where it holds no number; values beyond float saturate to infinity
// as a float conversion would.
float NumberPrefix(std::string const& line) {
  std::size_t length = 0;
  while (length < line.size() && length < 49 &&
         (std::isdigit(static_cast<unsigned char>(line[length])) || line[length] == '-' || line[length] == '.'))
    ++length;
  double value = 0.0;
  std::from_chars(line.data(), line.data() + length, value);
  if (value > static_cast<double>(FLT_MAX)) return std::numeric_limits<float>::infinity();
  if (value < -static_cast<double>(FLT_MAX)) return -std::numeric_limits<float>::infinity();
  return static_cast<float>(value);
}

// The line's leading digits as a count; saturates at INT_MAX.
int LeadingDigits(std::string const& line) {
  long long value = 0;
  for (char c : line) {
    if (!std::isdigit(static_cast<unsigned char>(c))) break;
    value = std::min(value * 10 + (c - '0'), static_cast<long long>(INT_MAX));
  }
  return static_cast<int>(value);
}

// The index of the name the line starts with (at most its first 10 characters
// compared), or `previous`; printed as the readers report it.
template <std::size_t N>
int TypeValue(std::string const& line, char const* const (&names)[N], int previous) {
  int value = previous;
  for (std::size_t i = 0; i < N; ++i) {
    const std::size_t length = std::min<std::size_t>(std::strlen(names[i]), 10);
    if (line.compare(0, length, names[i], length) == 0) {
      value = static_cast<int>(i);
      break;
    }
  }
  std::printf("%i\n", value);
  return value;
}

enum class Field {
  InputCount,
  OutputCount,
  HiddenLayerCount,
  HiddenSize0,
  HiddenSize1,
  HiddenSize2,
  HiddenSize3,
  InputType,
  ActivationType,
  Threshold,
  Slope,
  OutputType,
  OutputThreshold
};

struct PropertyKey {
  char const* key;
  char const* message;
  Field field;
};

constexpr PropertyKey PropertyKeys[] = {
    {"Number Input Neurons", "Number Input Neurons erkannt!", Field::InputCount},
    {"Number Output Neurons", "Number Output Neurons erkannt!", Field::OutputCount},
    {"Number Hidden Layers", "Number Hidden Layers erkannt!", Field::HiddenLayerCount},
    {"Number Neurons in Hidden Layer 0", "Number Neurons Hidden Layers erkannt!", Field::HiddenSize0},
    {"Number Neurons in Hidden Layer 1", "Number Neurons Hidden Layers erkannt!", Field::HiddenSize1},
    {"Number Neurons in Hidden Layer 2", "Number Neurons Hidden Layers erkannt!", Field::HiddenSize2},
    {"Number Neurons in Hidden Layer 3", "Number Neurons Hidden Layers erkannt!", Field::HiddenSize3},
    {"Type of Input Function", "Type of Input Function erkannt!", Field::InputType},
    {"Type of Activation Function", "Type of Activation Function erkannt!", Field::ActivationType},
    {"Activation Threshold", "Activation Threshold erkannt!", Field::Threshold},
    {"Activation Slope", "Activation Slope erkannt!", Field::Slope},
    {"Type of Output Function", "Type of Output Function erkannt!", Field::OutputType},
    {"Output Threshold", "Output Threshold erkannt!", Field::OutputThreshold},
};

void ApplyProperty(TNetProp& result, Field field, std::string const& line) {
  TNeuronProp& p = result.dyn.neuron_prop;
  switch (field) {
  case Field::InputCount: result.fixed.input_count = LeadingDigits(line); break;
  case Field::OutputCount: result.fixed.output_count = LeadingDigits(line); break;
  case Field::HiddenLayerCount: result.dyn.hidden_layer_count = LeadingDigits(line); break;
  case Field::HiddenSize0: result.dyn.hidden_layer_sizes[0] = LeadingDigits(line); break;
  case Field::HiddenSize1: result.dyn.hidden_layer_sizes[1] = LeadingDigits(line); break;
  case Field::HiddenSize2: result.dyn.hidden_layer_sizes[2] = LeadingDigits(line); break;
  case Field::HiddenSize3: result.dyn.hidden_layer_sizes[3] = LeadingDigits(line); break;
  case Field::InputType: p.input_type = static_cast<INPUT_TYPE>(TypeValue(line, InputNames, p.input_type)); break;
  case Field::ActivationType:
    p.activation_type = static_cast<ACT_TYPE>(TypeValue(line, ActivationNames, p.activation_type));
    break;
  case Field::Threshold: p.activation_threshold = NumberPrefix(line); break;
  case Field::Slope: p.activation_slope = NumberPrefix(line); break;
  case Field::OutputType: p.output_type = static_cast<OUTPUT_TYPE>(TypeValue(line, OutputNames, p.output_type)); break;
  case Field::OutputThreshold: p.output_threshold = NumberPrefix(line); break;
  }
}

} // namespace

std::string NeuronalNet::weights_to_text(int mode, float error, float cycles, std::vector<training_pattern> patterns) {
  std::ostringstream out;
  out.imbue(std::locale::classic()); // read back by NumberPrefix in any locale
  TNeuronProp const& p = dyn_.neuron_prop;
  const int H = LayerCount();
  out << LocalTimeText() << endl << endl;

  if (mode <= 3) {
    out << "Network Properties" << endl << "------------------" << endl << endl;
    out << "Number Input Neurons: " << fixed_.input_count << endl;
    out << "Number Output Neurons: " << fixed_.output_count << endl;
    out << "Number Hidden Layers: " << H << endl;
    for (int k = 0; k < H; ++k) out << "Number Neurons in Hidden Layer " << k << ": " << HiddenSize(k) << endl;
    out << "Type of Input Function: " << Named(InputReportNames, p.input_type) << endl;
    out << "Type of Activation Function: " << Named(ActivationReportNames, p.activation_type)
        << "Threshold: " << p.activation_threshold << ", Slope: " << p.activation_slope << endl;
    out << "Type of Output Function: ";
    if (p.output_type == OUTPUT_BIN)
      out << "Binary, Threshold: " << p.output_threshold << endl;
    else
      out << "None" << endl;
    out << endl << endl;
    WriteErrorAndCycles(out, error, cycles);
    out << endl;
  }

  if (mode == 3 || mode == 4) {
    const std::vector<int> failed = batch_verify(patterns);
    out << "The following " << failed.size() << " patterns (out of " << patterns.size()
        << ") were not recognized correctly by the net: " << endl;
    for (int k : failed) {
      training_pattern const& pattern = patterns[static_cast<std::size_t>(k)];
      out << endl << "pattern #" << k << endl << "Inputs: " << endl;
      WriteValues(out, pattern.inputs);
      out << endl << "Outputs: ";
      WriteValues(out, pattern.outputs);
      out << endl << "Telling Name: " << pattern.name << endl;
    }
  }

  if (mode == 0 || mode == 1) {
    out << endl << "Neuron Connection Weights" << endl << "-------------------------" << endl << endl;
    for (int k = 0; k < H; ++k)
      for (std::size_t j = 0; j < hidden_layers_[k].size(); ++j) {
        out << "Hidden Layer " << k << ", Neuron " << j << endl;
        WriteWeights(out, *hidden_layers_[k][j]);
        out << endl;
      }
    for (std::size_t j = 0; j < output_layer_.size(); ++j) {
      out << "Output Layer Neuron " << j << endl;
      WriteWeights(out, *output_layer_[j]);
      out << endl;
    }
  }

  if (mode == 2 || mode == 3) {
    out << "static float weight_definitions[] =" << endl << "{" << endl;
    for (auto const& neuron : neurons_) {
      WriteWeights(out, *neuron);
      out << endl << "  ";
    }
    out << "};" << endl << endl << endl;
    out << "static TPredefinedWeights weights = " << endl << "\t {" << endl;
    out << "\t\t\t{ \t\t\t\t// TFixedNetProp " << endl;
    out << "\t\t\t\t\t" << fixed_.input_count << ",\t\t// Number Input Neuron " << endl;
    out << "\t\t\t\t\t" << fixed_.output_count << ",\t\t// Number Output Neurons " << endl;
    out << "\t\t\t}, " << endl;
    out << "\t\t\t{  \t\t\t\t// TDynNetProp" << endl;
    out << "\t\t\t\t\t" << H << ",\t\t// Number Hidden Layers " << endl;
    out << "\t\t\t\t\t{ ";
    for (int k = 0; k < H; ++k) out << HiddenSize(k) << ", ";
    out << " },\t\t\t\t// Number Neurons per Hidden Layer" << endl;
    out << "\t\t\t\t\t{\t\t\t\t\t\t\t// TNeuronProp " << endl;
    out << "\t\t\t\t\t\t\t\t" << Named(InputNames, p.input_type, ",") << endl;
    out << "\t\t\t\t\t\t\t\t" << Named(ActivationNames, p.activation_type, ", ") << endl;
    out << "\t\t\t\t\t\t\t\t" << p.activation_slope << ", " << p.activation_threshold
        << ",\t// Activation Function Parameters" << endl;
    out << "\t\t\t\t\t\t\t  ";
    if (p.output_type == OUTPUT_BIN)
      out << "OUTPUT_BIN, " << p.output_threshold << "\t\t\t// Output Funcction Parameters" << endl;
    else
      out << "OUTPUT_NONE, 0\t\t\t\t\t\t// Output Function Parameters" << endl;
    out << " \t\t\t\t\t}," << endl << "\t\t\t}, " << endl << "\t\t\tweight_definitions " << endl << endl;
    out << "\t };" << endl;
  }

  if (mode == 4) {
    out << endl;
    WriteErrorAndCycles(out, error, cycles);
    out << endl;
    out << fixed_.input_count << "\t// Number Input Neurons" << endl;
    out << fixed_.output_count << "\t// Number Output Neurons" << endl;
    out << H << "\t // Number Hidden Layers" << endl;
    for (int k = 0; k < H; ++k) out << HiddenSize(k) << "\t// Number Neurons in Hidden Layer " << k << endl;
    out << Named(InputNames, p.input_type) << "\t\t// Type of Input Function" << endl;
    out << Named(ActivationNames, p.activation_type, " ") << "\t\t// Type of Activation Function" << endl;
    out << p.activation_threshold << "\t// Activation Threshold" << endl;
    out << p.activation_slope << "\t\t// Activation Slope" << endl;
    out << (p.output_type == OUTPUT_BIN ? "OUTPUT_BIN" : "OUTPUT_NONE") << "\t\t// Type of Output Function" << endl;
    out << p.output_threshold << "\t\t// Output Threshold" << endl;
    out << WeightMarker << endl;
    for (auto const& neuron : neurons_)
      for (int i = 0; i < neuron->input_count; ++i) out << neuron->weights[static_cast<std::size_t>(i)] << endl;
  }
  return out.str();
}

void NeuronalNet::load_weights_from_file(char const* path) {
  std::ifstream in(path);
  std::string line;
  bool found = false;
  while (!found && ReadLine(in, line)) found = EndsWithKey(line, WeightMarker);
  // The end of the file is tested after each line, so a final line break yields
  // one more (empty, 0) value; it lands past the net's weights when the file holds
  // exactly those.
  std::vector<float> values;
  while (found && in.good()) {
    std::getline(in, line);
    CutLine(line);
    values.push_back(NumberPrefix(line));
    std::printf("weight %i, %s\n", static_cast<int>(values.size()),
                FixedText(static_cast<double>(values.back())).c_str());
  }
  CopyWeightsFrom(neurons_, values.data(), values.size());
  WeightsChanged();
}

TNetProp NeuronalNet::load_net_properties_from_file(char const* path) {
  TNetProp result{};
  std::ifstream in(path);
  std::string line;
  while (ReadLine(in, line))
    for (PropertyKey const& key : PropertyKeys)
      if (EndsWithKey(line, key.key)) {
        std::puts(key.message);
        ApplyProperty(result, key.field, line);
        break;
      }
  return result;
}
