// The steps of a neuron's evaluation on the fast path (INPUT_SUM, ACT_SIGM,
// OUTPUT_NONE) after its weighted sum z (internal): shared by Neuron::calcVec and
// the packed forward pass, so that both give the same bits. The arithmetic steps
// are templates for a float and for a vector of floats (the compiler's vector
// extension), which apply the same IEEE operation to each lane.
#ifndef TONVEX_NNET_FASTPATH_H
#define TONVEX_NNET_FASTPATH_H

#include <cmath>

/// a clamped to [-1, 1]; NaN passes.
template <class T>
T ClampToUnit(T a) {
  T const one = T{} + 1.0f;
  a = a > 1.0f ? one : a;
  return a < -1.0f ? -one : a;
}

/// The argument (t - z) * s of the exponential, with threshold t and slope s.
template <class T>
T FastPathArgument(T z, float t, float s) {
  return (t - z) * s;
}

/// The single-precision exponential of the C library.
inline float FastPathExp(float argument) { return std::exp(argument); }

/// The output 1 / (e + 1), clamped, of the exponential e.
template <class T>
T FastPathOutput(T e) {
  return ClampToUnit(1.0f / (e + 1.0f));
}

#endif
