// The generated source of the built-in net's data: the shipped file is exactly what
// the writer makes of the compiled-in weights, and its weights read back unchanged.
#include "training/ChordNetSource.h"
#include "support/NeuronParamGuard.h"

#include <tonvex/ChordAnalysisNet.h>
#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstring>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

namespace {

std::string ShippedSource() {
  std::ifstream in(TONVEX_CHORD_NET_DATA, std::ios::binary);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

std::vector<std::uint32_t> Bits(float const* values, std::size_t count) {
  std::vector<std::uint32_t> bits(count);
  std::memcpy(bits.data(), values, count * sizeof(float));
  return bits;
}

class ChordNetSourceTest : public ::testing::Test {
protected:
  NeuronParamGuard guard;
  NeuronalNet net{ChordAnalysisNeuronalNet, weight_definitions};
};

TEST_F(ChordNetSourceTest, ShippedFileIsTheWritersTextOfTheCompiledWeights) {
  const std::string shipped = ShippedSource();
  ASSERT_FALSE(shipped.empty());
  const std::string bare = ChordNetSource(net, "");
  const std::size_t summaryAt = bare.find("#include \"ChordAnalysisNet.h\"\n");
  ASSERT_NE(summaryAt, std::string::npos);
  ASSERT_GT(shipped.size(), bare.size());
  EXPECT_EQ(shipped.substr(0, summaryAt), bare.substr(0, summaryAt));
  EXPECT_EQ(shipped.substr(shipped.size() - (bare.size() - summaryAt)), bare.substr(summaryAt));

  // Between them stand the summary lines, as comments.
  const std::string summary = shipped.substr(summaryAt, shipped.size() - bare.size());
  std::string lines;
  for (std::size_t at = 0; at < summary.size();) {
    ASSERT_EQ(summary.compare(at, 3, "// "), 0) << summary.substr(at);
    const std::size_t end = summary.find('\n', at);
    lines += summary.substr(at + 3, end + 1 - at - 3);
    at = end + 1;
  }
  EXPECT_EQ(ChordNetSource(net, lines), shipped);
}

TEST_F(ChordNetSourceTest, DefinitionsAreRenamedAndExported) {
  const std::string source = ChordNetSource(net, "first\nsecond\n");
  EXPECT_EQ(source.compare(0, 20, "// clang-format off\n"), 0) << "formatting would change the text";
  EXPECT_NE(source.find("exported.\n// first\n// second\n#include \"ChordAnalysisNet.h\"\n"), std::string::npos);
  EXPECT_NE(source.find("\nTONVEX_API float weight_definitions[] =\n{\n-12.8459, 84.8939, "), std::string::npos);
  EXPECT_NE(source.find("\nTONVEX_API TPredefinedWeights ChordAnalysisNeuronalNet = \n"), std::string::npos);
  EXPECT_NE(source.find("\t\t\tweight_definitions \n"), std::string::npos);
  EXPECT_EQ(source.find("static "), std::string::npos);
  EXPECT_EQ(source.find("Network Properties"), std::string::npos) << "the report and the time stay out";
  const std::string end = "};\n\n#pragma GCC diagnostic pop\n";
  EXPECT_EQ(source.compare(source.size() - end.size(), end.size(), end), 0);
}

TEST_F(ChordNetSourceTest, WeightsReadBackBitForBit) {
  const std::vector<float> read = WeightsOfChordNetSource(ShippedSource());
  ASSERT_EQ(read.size(), 765u);
  EXPECT_EQ(Bits(read.data(), read.size()), Bits(weight_definitions, 765));
  EXPECT_TRUE(WeightsOfChordNetSource("no definitions here").empty());
}

TEST(ChordNetSource, WeightsFitForTheTextFormats) {
  const std::vector<float> fitted =
      WeightsFitForText({1e-5f, -9e-5f, 0.0001f, -0.0f, 2e6f, -1e6f, 999998.0f, -161.907f, 0.01f});
  const std::vector<float> expected = {0.0f, 0.0f, 0.0001f, 0.0f, 999999.0f, -999999.0f, 999998.0f, -161.907f, 0.01f};
  EXPECT_EQ(fitted, expected);
  EXPECT_FALSE(std::signbit(fitted[3]));
}

} // namespace
