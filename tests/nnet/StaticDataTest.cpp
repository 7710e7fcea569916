// The static-data text of a trained net, written at build time, compiles as C++ and
// gives back the net: the record acquires into a net of the same shape.
#include "SampleNet.h"
#include "nnet/NetTestSupport.h"

#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

// The text writes six-digit decimals (double literals) for float data.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wfloat-conversion"
#if defined(__clang__)
#pragma GCC diagnostic ignored "-Wimplicit-float-conversion"
#endif
namespace generated {
#include "StaticSampleNet.inc"
} // namespace generated
#pragma GCC diagnostic pop

namespace {

using nettest::Weights;
using StaticDataTest = nettest::NetTest;

TEST_F(StaticDataTest, CompiledRecordAcquiresIntoTheSameShape) {
  NeuronalNet original(sample::Fixed(), sample::Dyn());
  sample::Train(original);
  const std::vector<float> expected = Weights(original);

  TPredefinedWeights const& record = generated::weights;
  EXPECT_EQ(record.weights, generated::weight_definitions);
  ASSERT_EQ(sizeof generated::weight_definitions / sizeof(float), expected.size());
  for (std::size_t i = 0; i < expected.size(); ++i)
    EXPECT_NEAR(generated::weight_definitions[i], expected[i], 5.1e-6 * std::fabs(expected[i])) << i;

  NeuronalNet fresh(sample::Fixed(), sample::Dyn());
  EXPECT_TRUE(fresh.acquire_weights(record));
  EXPECT_EQ(Weights(fresh),
            std::vector<float>(generated::weight_definitions, generated::weight_definitions + expected.size()));
  NeuronalNet built(record);
  EXPECT_EQ(Weights(built), Weights(fresh));
  EXPECT_EQ(record.dyn.hidden_layer_sizes[2], 0) << "sizes not written are zero-initialised";

  const std::vector<float> input = {1, 0, 1};
  original.use(input);
  fresh.use(input);
  EXPECT_EQ(original.winner(), fresh.winner());
}

} // namespace
