// The two net file readers on arbitrary file contents, and a net built from the
// properties read when they are of a size worth building: its forward pass, weights,
// text forms and a little training.
#include "FuzzInput.h"

#include <tonvex/NeuronalNet.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <unistd.h>
#include <vector>

namespace {

// Each fuzzer process writes its inputs to a file of its own, removed at exit.
std::string const& FilePath() {
  static std::string const path = "/tmp/tonvex_fuzz_net_" + std::to_string(::getpid()) + ".txt";
  static bool const removeAtExit = std::atexit([] { std::remove(path.c_str()); }) == 0;
  static_cast<void>(removeAtExit);
  return path;
}

void WriteFile(std::string const& contents) {
  std::ofstream out(FilePath(), std::ios::binary | std::ios::trunc);
  out.write(contents.data(), static_cast<std::streamsize>(contents.size()));
}

// Sizes of a net that the fuzzer may build: large enough for every layer shape, small
// enough that an input cannot make it allocate much.
constexpr int MostNeurons = 48;

bool WorthBuilding(TNetProp const& p) {
  auto const small = [](int n) { return n >= 0 && n <= MostNeurons; };
  if (!small(p.fixed.input_count) || !small(p.fixed.output_count)) return false;
  // All four sizes, the unused ones too: a net without hidden layers still counts
  // the first size in the length of its flat weights.
  for (int size : p.dyn.hidden_layer_sizes)
    if (!small(size)) return false;
  return true;
}

std::vector<float> Values(CFuzzInput& in, std::size_t count) {
  std::vector<float> values(count);
  for (float& v : values) v = in.Bool() ? in.Probability() : in.Float();
  return values;
}

std::vector<training_pattern> Patterns(CFuzzInput& in, TNetProp const& p) {
  std::vector<training_pattern> patterns(in.Count(4));
  for (training_pattern& pattern : patterns) {
    pattern.inputs = Values(in, in.Bool() ? static_cast<std::size_t>(p.fixed.input_count) : in.Count(MostNeurons));
    // train() reads a target per output neuron; shorter targets are a documented
    // exception, not a finding.
    pattern.outputs = Values(in, static_cast<std::size_t>(p.fixed.output_count) + in.Count(2));
    pattern.training_rate = in.Probability();
    pattern.name = in.Text(12);
  }
  return patterns;
}

void UseNet(NeuronalNet& net, TNetProp const& p, CFuzzInput& in) {
  net.load_weights_from_file(FilePath().c_str());
  net.use(Values(in, in.Count(MostNeurons)));
  int const winner = net.winner();
  Require(winner >= 0 && (winner < p.fixed.output_count || winner == 0));
  Require(net.get_outputs().size() == static_cast<std::size_t>(p.fixed.output_count));

  TPredefinedWeights weights = net.get_weights();
  Require(net.acquire_weights(weights));
  delete[] weights.weights;

  std::vector<training_pattern> const patterns = Patterns(in, p);
  net.weights_to_text(in.IntMostlyIn(-1, 5), in.Bool() ? -1.0f : in.Float(), in.Bool() ? -1.0f : in.Float(), patterns);
  if (!patterns.empty()) net.train(patterns.front());
  net.batch_train(patterns, in.Probability(), static_cast<float>(in.Count(2)));
  net.batch_verify(patterns);
  net.check_learn_data_for_duplicates(patterns);
  net.getRMS(Values(in, static_cast<std::size_t>(p.fixed.output_count)));

  NeuronalNet copy(net);
  copy = net;
  copy.use();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  // The whole input is the file. How the net built from it is used is read from the
  // same bytes, which the input helper takes from the end.
  WriteFile(std::string(reinterpret_cast<char const*>(data), size));
  CFuzzInput in(data, size);
  std::srand(1);

  TNetProp p = NeuronalNet::load_net_properties_from_file(FilePath().c_str());
  if (in.Bool()) {
    p.dyn.neuron_prop.input_type = static_cast<INPUT_TYPE>(in.IntMostlyIn(-1, 5));
    p.dyn.neuron_prop.activation_type = static_cast<ACT_TYPE>(in.IntMostlyIn(-1, 4));
    p.dyn.neuron_prop.output_type = static_cast<OUTPUT_TYPE>(in.IntMostlyIn(-1, 2));
  }

  // The weight reader on a net of fixed shape, whatever the properties say.
  NeuronalNet fixed(TFixedNetProp{3, 2}, TDynNetProp{1, {2, 0, 0, 0}, p.dyn.neuron_prop});
  fixed.load_weights_from_file(FilePath().c_str());
  fixed.use(std::vector<float>{1.0f, 0.0f, 1.0f});

  if (WorthBuilding(p)) {
    NeuronalNet net(p.fixed, p.dyn);
    UseNet(net, p, in);
    NeuronalNet byArguments(p.fixed.input_count, p.dyn.hidden_layer_count, p.dyn.hidden_layer_sizes,
                            p.fixed.output_count, p.dyn.neuron_prop.input_type, p.dyn.neuron_prop.activation_type,
                            p.dyn.neuron_prop.activation_slope, p.dyn.neuron_prop.activation_threshold,
                            p.dyn.neuron_prop.output_type, p.dyn.neuron_prop.output_threshold);
    byArguments.use();
  }
  return 0;
}
