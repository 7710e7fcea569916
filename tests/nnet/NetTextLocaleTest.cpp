// The net's text files are written and read alike in every locale: a host may have
// switched the process to one with a decimal comma, as German hosts do. The built-in
// net, written as a property-and-weight list and as generated source, reads back
// identical in the C locale and in German.
#include "nnet/NetTestSupport.h"
#include "support/TempFile.h"
#include "support/TestPrelude.h"
#include "training/ChordNetSource.h"
#include "training/ChordPatterns.h"

#include <clocale>
#include <locale>

namespace {

class NetTextLocale : public nettest::NetTest, public ::testing::WithParamInterface<char const*> {
protected:
  void SetUp() override {
    if (!std::setlocale(LC_ALL, GetParam())) GTEST_SKIP() << "the locale " << GetParam() << " is not installed";
    std::locale::global(std::locale(GetParam()));
  }
  void TearDown() override { std::locale::global(std::locale::classic()); }
};

TEST_P(NetTextLocale, BuiltInNetReadsBackIdentical) {
  if (std::string(GetParam()) != "C") {
    // What a reader or writer that followed the locale would do.
    std::ostringstream comma;
    comma << 84.8939;
    ASSERT_EQ(comma.str(), "84,8939");
    ASSERT_EQ(std::strtod("84.8939", nullptr), 84.0);
  }
  NeuronalNet net(ChordAnalysisNeuronalNet, weight_definitions);
  TempFile file;
  file.Write(net.weights_to_text(4, -1.0f, -1.0f, {}));
  EXPECT_NE(file.Read().find("\n-12.8459\n84.8939\n"), std::string::npos);
  ::testing::internal::CaptureStdout();
  TNetProp const props = NeuronalNet::load_net_properties_from_file(file.CPath());
  NeuronalNet fresh(props.fixed, props.dyn);
  fresh.load_weights_from_file(file.CPath());
  std::string const printed = ::testing::internal::GetCapturedStdout();
  EXPECT_NE(printed.find("weight 2, 84.893898\n"), std::string::npos);
  EXPECT_NE(printed.find("weight 766, 0.000000\n"), std::string::npos); // after the final line break
  EXPECT_EQ(std::memcmp(&props.fixed, &ChordAnalysisNeuronalNet.fixed, sizeof props.fixed), 0);
  EXPECT_EQ(std::memcmp(&props.dyn, &ChordAnalysisNeuronalNet.dyn, sizeof props.dyn), 0); // slope 0.2 included
  std::vector<float> const read = nettest::Weights(fresh);
  ASSERT_EQ(read.size(), 765u);
  EXPECT_EQ(std::memcmp(read.data(), weight_definitions, sizeof weight_definitions), 0);
  // Training messages print their numbers with a point too.
  ::testing::internal::CaptureStdout();
  net.check_learn_data_for_duplicates({{{0.5f, 1}, {1, 0}, 0.1f, "a"}, {{0.5f, 1}, {0, 1}, 0.1f, "b"}});
  net.batch_train({{ChordNetInputs({60}), std::vector<float>(12, 0.0f), 0.0f, "c"}}, 9.0f, 1.0f);
  std::string const messages = ::testing::internal::GetCapturedStdout();
  EXPECT_NE(messages.find("Input: 0.500000 1.000000 \n"), std::string::npos) << messages;
  EXPECT_NE(messages.find("\nFehler: 0."), std::string::npos) << messages;
  std::vector<float> const source = WeightsOfChordNetSource(ChordNetSource(net, ""));
  ASSERT_EQ(source.size(), 765u);
  EXPECT_EQ(std::memcmp(source.data(), weight_definitions, sizeof weight_definitions), 0);
}

INSTANTIATE_TEST_SUITE_P(CAndGerman, NetTextLocale, ::testing::Values("C", "de_DE.UTF-8"));

} // namespace
