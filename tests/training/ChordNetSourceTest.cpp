// The generated source of the built-in net's data: the shipped file is exactly what
// the writer makes of the compiled-in weights, and weights are fitted to the text
// formats. (The written definitions are checked with the training agent's output,
// reading them back in NetTextLocaleTest.)
#include "training/ChordNetSource.h"
#include "support/NeuronParamGuard.h"

#include <fstream>
#include <iterator>

namespace {

TEST(ChordNetSource, ShippedFileIsTheWritersTextOfTheCompiledWeights) {
  NeuronParamGuard guard;
  NeuronalNet net(ChordAnalysisNeuronalNet, weight_definitions);
  std::ifstream in(TONVEX_CHORD_NET_DATA, std::ios::binary);
  std::string const shipped{std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
  // The writer's text without summary, and the summary lines between, as comments.
  std::string const bare = ChordNetSource(net, "");
  std::size_t const summaryAt = bare.find("#include \"ChordAnalysisNet.h\"\n");
  ASSERT_TRUE(summaryAt != std::string::npos && shipped.size() > bare.size());
  std::string const summary = shipped.substr(summaryAt, shipped.size() - bare.size());
  std::string lines;
  for (std::size_t at = 0; at < summary.size();) {
    ASSERT_EQ(summary.compare(at, 3, "// "), 0) << summary.substr(at);
    std::size_t const end = summary.find('\n', at);
    lines += summary.substr(at + 3, end + 1 - at - 3);
    at = end + 1;
  }
  EXPECT_EQ(ChordNetSource(net, lines), shipped);
  EXPECT_EQ(shipped.compare(0, 20, "// clang-format off\n"), 0) << "formatting would change the text";
  EXPECT_EQ(shipped.find("Network Properties"), std::string::npos) << "the report and the time stay out";
  EXPECT_TRUE(WeightsOfChordNetSource("no definitions here").empty());
}

TEST(ChordNetSource, WeightsFitForTheTextFormats) {
  EXPECT_EQ(WeightsFitForText({1e-5f, -9e-5f, 0.0001f, 2e6f, -1e6f, 999998.0f}),
            (std::vector<float>{0.0f, 0.0f, 0.0001f, 999999.0f, -999999.0f, 999998.0f}));
}

} // namespace
