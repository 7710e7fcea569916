// One unit of a feed-forward net: weights, input function, activation, output.
//
// The choice of the three functions and their parameters is not per neuron: it lives
// in the static members below and holds for every neuron of every net in the process
// at once. Every NeuronalNet construction sets them (SetCalcParams), so the last net
// built decides how all nets evaluate. Nothing here is guarded against threads.
#ifndef TONVEX_NEURON_H
#define TONVEX_NEURON_H

#include "TonvexExport.h"

#include <memory>

/// How the net input z is formed from inputs x[0..n-1] and weights w[0..n-1].
enum INPUT_TYPE : int {
  INPUT_SUM = 0,  ///< sum of x[i]*w[i]
  INPUT_MIN = 1,  ///< smallest x[i], weights ignored
  INPUT_MAX = 2,  ///< largest x[i], weights ignored
  INPUT_AVG = 3,  ///< (sum of x[i]*w[i]) / n
  INPUT_PROD = 4, ///< product of x[i]*w[i]
};

/// Activation a of the net input z, with threshold t and slope s (the statics).
enum ACT_TYPE : int {
  ACT_SIGM = 0,   ///< 1 / (exp(-(z-t)*s) + 1)
  ACT_LIN = 1,    ///< u = z-t; u*s only for 0 < u < 1, else u; clamped to [-1, 1]
  ACT_TANHYP = 2, ///< tanh((z-t)*s) from two exponentials, clamped to [-1, 1]
  ACT_IDENT = 3,  ///< z itself (no threshold, slope or clamping)
};

/// Output o of the activation a.
enum OUTPUT_TYPE : int {
  OUTPUT_NONE = 0, ///< o = a
  OUTPUT_BIN = 1,  ///< o = 1 when a >= output threshold (equality reaches it), else 0
};

class TONVEX_API Neuron {
public:
  /// n incoming weights, each drawn from the shared rand() (never seeded here):
  /// r = rand() % 100, w = r / 100.0f, so w is one of 0.01 .. 0.99, with 0.1 in
  /// place of 0.0. Draws one number per weight, in weight order. A negative n is
  /// taken as 0. Switches flat-spot elimination on for the whole process.
  explicit Neuron(int n);

  /// Copying does NOT copy the weights. It takes the other neuron's input count and
  /// a fresh zero-filled weight array, and then copies that fresh array over the
  /// other neuron's weights (the direction of the copy is reversed on purpose and
  /// kept): afterwards both neurons have all-zero weights. Nets never copy neurons;
  /// they copy weights themselves. Output and net input start at 0.
  Neuron(Neuron const& other);
  /// As the copy constructor, applied to the by-value argument (which is itself a
  /// copy, so the right-hand side's weights are zeroed by that copy). The target's
  /// previous weights are released.
  Neuron& operator=(Neuron other);
  ~Neuron() = default;

  /// Evaluates this neuron on n inputs with the static parameters (reference path,
  /// double-precision exponentials), stores the net input and the output and writes
  /// the output to outputs[index].
  ///
  /// The sums start at 0 and accumulate in input order; with n <= 0 INPUT_SUM gives 0
  /// and INPUT_AVG gives 0/0 (NaN). INPUT_MIN and INPUT_MAX start from inputs[0] and
  /// read it even when n <= 0, so `inputs` must hold at least one value for them.
  /// Weights beyond this neuron's input count do not exist and count as 0 (n larger
  /// than the input count reads no weight past the array). INPUT_PROD starts from
  /// inputs[0] * weights[0], even when n <= 0; a neuron without weights has the net
  /// input 0 under it. An input type outside 0..4
  /// gives the net input 0, an activation type outside 0..3 leaves a = z, and an
  /// output type other than OUTPUT_BIN behaves as OUTPUT_NONE.
  void calcValue(float const* inputs, int n, float* outputs, int index);

  /// Evaluates neurons[0..count-1] of one layer on the same n inputs; outputs[j]
  /// gets neuron j's output. When combined_type is 0 (INPUT_SUM, ACT_SIGM,
  /// OUTPUT_NONE) this is the fast single-precision path: the weighted sum in float
  /// (in input order, as calcValue sums), expf for the
  /// exponential, which is also kept in cached_exp. Its results may differ from
  /// calcValue in the last bits. Any other combination evaluates each neuron with
  /// calcValue. Never allocates.
  static void calcVec(Neuron** neurons, float const* inputs, int n, float* outputs, int count);

  /// Derivative of the activation at the stored net input z, with x = (t - z) * s in
  /// float:
  ///   ACT_SIGM    exp(x) / (exp(x) + 1)^2 in double, plus the float 0.1 widened to
  ///               double when flat-spot elimination is on, rounded to float; for
  ///               x outside [-50, 50] just 0.1 (on) or 0.0 (off). The slope factor
  ///               is deliberately absent;
  ///   ACT_LIN     s when 0 <= z <= 1 (the raw z, without the threshold), else 0;
  ///   ACT_TANHYP  s * (1 - tanh^2) by the quotient rule on A = exp(-x), B = exp(x);
  ///   ACT_IDENT   1; any other type 0.
  float Act_Abl();
  /// result[j] = neurons[j]->Act_Abl() for j = 0..count-1.
  static void Act_AblVec(Neuron** neurons, float* result, int count);

  /// Stores the function types and parameters for all neurons (note the order:
  /// slope before threshold) and recomputes combined_type =
  /// (output * 4 + activation) * 5 + input. Out-of-range type values are combined
  /// modulo 2^32, so no combination overflows.
  static void SetCalcParams(INPUT_TYPE inputType, ACT_TYPE activationType, OUTPUT_TYPE outputType, float slope,
                            float threshold, float outputThreshold);

  // Process-wide function parameters. The slope starts at 0, so nothing meaningful
  // comes out until SetCalcParams (every net constructor calls it).
  static int flat_spot_elimination;  ///< 0 = off, else on; adds 0.1 to the sigmoid derivative; starts at 1
  static float activation_threshold; ///< t, starts at 0
  static float activation_slope;     ///< s, starts at 0
  static float output_threshold;     ///< threshold of OUTPUT_BIN, starts at 0
  static int combined_type;          ///< see SetCalcParams; 0 selects the fast path of calcVec
  static ACT_TYPE activation_type;   ///< starts at ACT_SIGM
  static OUTPUT_TYPE output_type;    ///< starts at OUTPUT_NONE
  static INPUT_TYPE input_type;      ///< starts at INPUT_SUM

  // Per-neuron state, public because nets and training read and write it directly.
  int input_count;                  ///< number of incoming weights
  float output = 0.0f;              ///< last output (after the output function)
  float cached_exp = 0.0f;          ///< exp((t - z) * s) of the last fast-path evaluation
  float net_input = 0.0f;           ///< last net input z, read by Act_Abl
  std::unique_ptr<float[]> weights; ///< weight i belongs to input i of the previous layer
};

#endif
