// Training agent of the built-in chord analysis net.
//
//   tonvex_train_chord_net [--quick] [--log FILE] OUTPUT
//
// Trains a 24-15-15-12 net with the built-in properties on the chord patterns
// (training/ChordPatterns.h) and writes the winning net as the generated source of
// ChordAnalysisNeuronalNet and weight_definitions to OUTPUT (training/ChordNetSource.h).
// The shipped nnet/ChordAnalysisNetData.cpp is regenerated, bit for bit, by
//   cmake --build build --target tonvex_regenerate_chord_net
// which runs this program on that file. The log goes to FILE (default
// TrainChordNet.log in the working directory).
//
// Everything is deterministic: the agent seeds rand() itself, runs a fixed schedule
// and decides only on computed figures, never on time. The same build therefore
// writes the same file (g++ 12 and clang 14 on x86-64 with glibc agree bit for bit;
// another maths library may round its exponentials differently).
//
// Schedule:
//   - srand(1); the net gets random start weights, then the pinned entries.
//   - Training runs in epochs of cycles. A cycle shuffles the patterns with rand()
//     as batch_train does and trains them one by one (NeuronalNet::train),
//     re-imposing the pinned entries after every step, so that they keep exactly
//     their given values while every other weight learns around them.
//   - After each epoch the state (weights, mean error, batch_verify failures,
//     accuracy on the unambiguous voicings) goes into the history. A state is better
//     than another with fewer failures, or as many and an error lower by a given
//     gain.
//   - When the best state has not improved for a number of epochs, the agent
//     branches: a new run starts from the best state with the next change of a fixed
//     cycle (half the rate, momentum 0.9, a new seed, momentum 0.3, double the
//     rate), seeded anew, with fresh momentum.
//   - A new best state that recognises every pattern with a low enough error is
//     checked as it would ship: weights fit for the text formats, written and read
//     back with six significant digits. It is the goal when, so rounded, it still
//     names every pattern with a clear margin, the telling chords win above 0.99 and
//     the all-zero input gives output 6, below 0.98.
// The full run writes OUTPUT only on reaching the goal (exit 0), else exits with 1.
// --quick runs a few short epochs that branch early and writes the best state
// whatever it reached: a check of the pipeline, not a net to ship.
#include "training/ChordNetSource.h"
#include "training/ChordNetTargets.h"
#include "training/ChordPatterns.h"
#include "training/LogWriter.h"

#include <tonvex/NeuronalNet.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

namespace {

constexpr unsigned StartSeed = 1;
constexpr float StartRate = 0.2f;
constexpr float StartMomentum = 0.6f;
constexpr int HiddenSize = 15;
constexpr std::size_t WeightCount = 765;

struct Schedule {
  int epochCycles;
  int maxEpochs;
  int patience; ///< epochs without a better state before a branch
  float gain;   ///< relative error decrease that makes a state better
  float goalError;
  float goalMargin; ///< labelled output minus the largest other, for every pattern
};
constexpr Schedule FullSchedule{100, 300, 3, 0.02f, 0.02f, 0.2f};
constexpr Schedule QuickSchedule{4, 10, 1, 0.25f, 0.02f, 0.2f};

struct Params {
  float rate;
  float momentum;
  unsigned seed;
};

struct State {
  std::vector<float> weights;
  float error;
  int failures;
  TChordAccuracy accuracy;
  int cycles; ///< cycles trained to reach this state
  Params params;
};

struct Change {
  char const* what;
  Params (*apply)(Params);
};
const Change Changes[] = {
    {"half the rate",
     [](Params p) {
       return Params{p.rate * 0.5f, p.momentum, p.seed};
     }},
    {"momentum 0.9",
     [](Params p) {
       return Params{p.rate, 0.9f, p.seed};
     }},
    {"a new seed",
     [](Params p) {
       return Params{p.rate, p.momentum, p.seed + 1};
     }},
    {"momentum 0.3",
     [](Params p) {
       return Params{p.rate, 0.3f, p.seed};
     }},
    {"double the rate",
     [](Params p) {
       return Params{p.rate * 2.0f, p.momentum, p.seed};
     }},
};

TPredefinedWeights BuiltInShape(float* weights) {
  return {{ChordNetInputCount, ChordNetOutputCount},
          {2, {HiddenSize, HiddenSize, 0, 0}, {INPUT_SUM, ACT_SIGM, 0.2f, 2.0f, OUTPUT_NONE, 0.0f}},
          weights};
}

// A net with the built-in properties: random start weights (drawn from rand()) or
// the given ones.
std::unique_ptr<NeuronalNet> MakeNet(std::vector<float> weights) {
  if (weights.empty()) {
    const TPredefinedWeights shape = BuiltInShape(nullptr);
    return std::make_unique<NeuronalNet>(shape.fixed, shape.dyn);
  }
  return std::make_unique<NeuronalNet>(BuiltInShape(weights.data()));
}

std::vector<float> WeightsOf(NeuronalNet& net) {
  const std::unique_ptr<float[]> owned(net.get_weights().weights);
  return std::vector<float>(owned.get(), owned.get() + WeightCount);
}

void ImposePins(NeuronalNet& net) {
  TPredefinedWeights record = net.get_weights();
  const std::unique_ptr<float[]> owned(record.weights);
  for (TChordNetPin const& pin : ChordNetPins) record.weights[pin.index] = pin.value;
  net.acquire_weights(record);
}

// Cycles as batch_train runs them, with the pins re-imposed after every step;
// returns the last cycle's mean error.
float TrainCycles(NeuronalNet& net, std::vector<training_pattern>& patterns, int cycles) {
  float mean = 0.0f;
  for (int c = 0; c < cycles; ++c) {
    for (std::size_t i = 1; i < patterns.size(); ++i)
      std::swap(patterns[i], patterns[static_cast<std::size_t>(std::rand()) % (i + 1)]);
    float sum = 0.0f;
    for (training_pattern const& p : patterns) {
      sum += net.train(p);
      ImposePins(net);
    }
    mean = sum / static_cast<float>(patterns.size());
  }
  return mean;
}

// How a net would do as shipped.
struct Verdict {
  int failures;
  TChordAccuracy accuracy;
  float minMargin;
  float minTellingOutput; ///< winning output of the telling chords, 0 when one loses
  int emptyWinner;
  float emptyOutput;
  bool goal;
};

Verdict Judge(NeuronalNet& net, std::vector<training_pattern> const& patterns,
              std::vector<TChordPatternClass> const& classes, Schedule const& schedule) {
  Verdict v{};
  v.failures = static_cast<int>(net.batch_verify(patterns).size());
  v.accuracy = MeasureChordAccuracy(net, classes);
  v.minMargin = 1.0f;
  for (training_pattern const& p : patterns) {
    net.use(p.inputs);
    const std::vector<float> out = net.get_outputs();
    const auto label =
        static_cast<std::size_t>(std::max_element(p.outputs.begin(), p.outputs.end()) - p.outputs.begin());
    for (std::size_t j = 0; j < out.size(); ++j)
      if (j != label) v.minMargin = std::min(v.minMargin, out[label] - out[j]);
  }
  v.minTellingOutput = 1.0f;
  for (TTellingChord const& chord : TellingChords) {
    net.use(ChordNetInputs(chord.intvls));
    v.minTellingOutput = net.winner() == chord.winner
                             ? std::min(v.minTellingOutput, net.get_outputs()[static_cast<std::size_t>(chord.winner)])
                             : 0.0f;
  }
  net.use(ChordNetInputs({}));
  v.emptyWinner = net.winner();
  v.emptyOutput = net.get_outputs()[static_cast<std::size_t>(v.emptyWinner)];
  v.goal = v.failures == 0 && v.minMargin >= schedule.goalMargin && v.minTellingOutput > TellingOutput &&
           v.emptyWinner == EmptyChordWinner && v.emptyOutput < EmptyOutputBelow;
  return v;
}

// The weights as they ship: fit for the text formats, then rounded by the text.
std::vector<float> ShippedWeights(std::vector<float> const& weights) {
  const std::unique_ptr<NeuronalNet> net = MakeNet(WeightsFitForText(weights));
  return WeightsOfChordNetSource(ChordNetSource(*net, ""));
}

std::string Percent(int part, int whole) {
  char text[32];
  std::snprintf(text, sizeof text, "%.2f%%", whole > 0 ? 100.0 * part / whole : 0.0);
  return text;
}

std::string Describe(State const& s) {
  std::ostringstream out;
  out << "cycle " << s.cycles << ": error " << s.error << ", " << s.failures << " patterns not recognised, "
      << s.accuracy.unambiguousNamed << " of " << s.accuracy.unambiguousVoicings << " unambiguous voicings named ("
      << Percent(s.accuracy.unambiguousNamed, s.accuracy.unambiguousVoicings) << "); rate " << s.params.rate
      << ", momentum " << s.params.momentum << ", seed " << s.params.seed;
  return out.str();
}

std::string Summary(State const& s, Verdict const& v) {
  std::ostringstream out;
  out << "Trained from seed " << StartSeed << " in " << s.cycles << " cycles (last rate " << s.params.rate
      << ", momentum " << s.params.momentum << ", seed " << s.params.seed << "), mean error " << s.error << ".\n"
      << "As shipped it names the labelled root of " << v.accuracy.named << " of " << v.accuracy.voicings
      << " generated voicings (" << Percent(v.accuracy.named, v.accuracy.voicings) << ") and of "
      << v.accuracy.unambiguousNamed << " of " << v.accuracy.unambiguousVoicings << " unambiguous ones ("
      << Percent(v.accuracy.unambiguousNamed, v.accuracy.unambiguousVoicings) << ").\n";
  return out.str();
}

void Say(LogWriter& log, std::string const& text) {
  std::puts(text.c_str());
  log.append(text);
}

int Usage() {
  std::fputs("usage: tonvex_train_chord_net [--quick] [--log FILE] OUTPUT\n", stderr);
  return 2;
}

} // namespace

int main(int argc, char** argv) {
  bool quick = false;
  std::string logPath = "TrainChordNet.log";
  std::string outputPath;
  for (int a = 1; a < argc; ++a) {
    const std::string arg = argv[a];
    if (arg == "--quick")
      quick = true;
    else if (arg == "--log" && a + 1 < argc)
      logPath = argv[++a];
    else if (!arg.empty() && arg[0] != '-' && outputPath.empty())
      outputPath = arg;
    else
      return Usage();
  }
  if (outputPath.empty()) return Usage();
  Schedule const& schedule = quick ? QuickSchedule : FullSchedule;

  LogWriter log;
  log.open(logPath);
  const std::vector<TChordVoicing> voicings = ChordVoicings();
  std::vector<TChordPatternClass> classes = ChordPatternClasses(voicings, StartRate);
  std::vector<training_pattern> patterns;
  for (TChordPatternClass const& c : classes) patterns.push_back(c.pattern);
  patterns.push_back(EmptyChordPattern(StartRate));
  Say(log, std::to_string(voicings.size()) + " voicings, " + std::to_string(patterns.size()) +
               " distinct patterns (the all-zero input included)");

  Params params{StartRate, StartMomentum, StartSeed};
  std::srand(params.seed);
  std::unique_ptr<NeuronalNet> net = MakeNet({});
  net->set_momentum_amount(params.momentum);
  if (net->check_learn_data_for_duplicates(patterns)) return 1;
  ImposePins(*net);

  std::vector<State> history;
  std::size_t best = 0;
  int sinceBest = 0;
  std::size_t nextChange = 0;
  int cycles = 0;
  bool reached = false;
  Verdict verdict{};
  std::vector<float> shipped;
  for (int epoch = 0; epoch < schedule.maxEpochs && !reached; ++epoch) {
    for (training_pattern& p : patterns) p.training_rate = params.rate;
    const float error = TrainCycles(*net, patterns, schedule.epochCycles);
    cycles += schedule.epochCycles;
    history.push_back(State{WeightsOf(*net), error, static_cast<int>(net->batch_verify(patterns).size()),
                            MeasureChordAccuracy(*net, classes), cycles, params});
    State const& now = history.back();
    Say(log, Describe(now));

    State const& bestState = history[best];
    const bool better = history.size() == 1 || now.failures < bestState.failures ||
                        (now.failures == bestState.failures && now.error < bestState.error * (1.0f - schedule.gain));
    if (better) {
      best = history.size() - 1;
      sinceBest = 0;
      if (now.failures == 0 && now.error <= schedule.goalError) {
        shipped = ShippedWeights(now.weights);
        const std::unique_ptr<NeuronalNet> rounded = MakeNet(shipped);
        verdict = Judge(*rounded, patterns, classes, schedule);
        reached = verdict.goal;
        Say(log, std::string("as shipped: ") + std::to_string(verdict.failures) + " failures, margin " +
                     std::to_string(verdict.minMargin) + ", telling outputs from " +
                     std::to_string(verdict.minTellingOutput) + ", all-zero input " +
                     std::to_string(verdict.emptyWinner) + " at " + std::to_string(verdict.emptyOutput) +
                     (reached ? ": goal reached" : ": not yet"));
      }
      continue;
    }
    if (++sinceBest < schedule.patience || epoch + 1 == schedule.maxEpochs) continue;

    Change const& change = Changes[nextChange++ % (sizeof Changes / sizeof Changes[0])];
    State const& from = history[best];
    params = change.apply(from.params);
    cycles = from.cycles;
    sinceBest = 0;
    Say(log, "progress stalls: branching from the state of " + Describe(from) + " with " + change.what);
    std::srand(params.seed);
    net = MakeNet(from.weights);
    net->set_momentum_amount(params.momentum);
  }

  State const& winner = history[best];
  if (!reached) {
    if (!quick) {
      Say(log, "goal not reached; " + outputPath + " left as it was");
      return 1;
    }
    shipped = ShippedWeights(winner.weights);
    const std::unique_ptr<NeuronalNet> rounded = MakeNet(shipped);
    verdict = Judge(*rounded, patterns, classes, schedule);
  }
  for (TChordNetPin const& pin : ChordNetPins)
    if (shipped[pin.index] != pin.value) {
      Say(log, "pinned entry " + std::to_string(pin.index) + " does not survive the text");
      return 1;
    }
  const std::unique_ptr<NeuronalNet> finalNet = MakeNet(shipped);
  const std::string source = ChordNetSource(*finalNet, Summary(winner, verdict));
  if (WeightsOfChordNetSource(source) != shipped) {
    Say(log, "the written weights do not read back as checked");
    return 1;
  }
  std::ofstream out(outputPath, std::ios::binary);
  out << source;
  out.close();
  if (!out) {
    Say(log, "cannot write " + outputPath);
    return 1;
  }
  Say(log, "wrote " + outputPath + ": " + Summary(winner, verdict));
  return 0;
}
