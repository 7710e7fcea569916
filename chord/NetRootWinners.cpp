#include "chord/NetRootWinners.h"

#include <cstring>

namespace {

std::uint32_t Bits(float value) {
  std::uint32_t bits;
  std::memcpy(&bits, &value, sizeof bits);
  return bits;
}

} // namespace

bool CNetRootWinners::CParams::operator==(CParams const& other) const {
  return InputType == other.InputType && ActivationType == other.ActivationType && OutputType == other.OutputType &&
         CombinedType == other.CombinedType && Slope == other.Slope && Threshold == other.Threshold &&
         OutputThreshold == other.OutputThreshold;
}

CNetRootWinners::CParams CNetRootWinners::ParamsInForce() {
  return {Neuron::input_type,
          Neuron::activation_type,
          Neuron::output_type,
          Neuron::combined_type,
          Bits(Neuron::activation_slope),
          Bits(Neuron::activation_threshold),
          Bits(Neuron::output_threshold)};
}

CNetRootWinners::CNetRootWinners(NeuronalNet& net) : Net_(net), BuiltWith_(ParamsInForce()) {
  for (std::uint32_t pattern = 0; pattern < PatternCount; ++pattern)
    Winners_[pattern] = static_cast<std::uint8_t>(Net_.Winner(1u | pattern << 1));
}

int CNetRootWinners::Winner(std::uint32_t intvls) const {
  bool const isPattern = (intvls & ~std::uint32_t{0xfff}) == 0 && (intvls & 1u) != 0;
  if (isPattern && ParamsInForce() == BuiltWith_) return Winners_[intvls >> 1];
  return Net_.Winner(intvls);
}
