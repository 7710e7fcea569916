// Text forms of a net and the two readers: exact layouts, modes, reader messages and
// a write-read round trip.
#include "nnet/NetTestSupport.h"
#include "support/TempFile.h"

#include <tonvex/NeuronalNet.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <memory>
#include <regex>
#include <string>
#include <vector>

namespace {

using nettest::SetWeights;
using nettest::Shape;
using nettest::Weights;
using NetTextTest = nettest::NetTest;

// The text after the time line and the two line ends that follow it.
std::string Body(std::string const& text) {
  const std::size_t end = text.find('\n');
  EXPECT_TRUE(std::regex_match(text.substr(0, end), std::regex("[A-Z][a-z]{2} [A-Z][a-z]{2} [ 0-9][0-9] "
                                                               "[0-9]{2}:[0-9]{2}:[0-9]{2} [0-9]{4}")))
      << text.substr(0, end);
  EXPECT_EQ(text.compare(end, 3, "\n\n\n"), 0);
  return text.substr(end + 3);
}

// I = 2, one hidden layer of 2, one output; slope 0.2, threshold 2.
class SmallNetText : public nettest::NetTest {
protected:
  void SetUp() override { SetWeights(net, {0.5f, -1.25f, 2.0f, 0.125f, 3.0f, -4.0f}); }
  NeuronalNet net{Shape(2, {2}, 1, ACT_SIGM, 0.2f, 2.0f)};
};

const std::string Report = "Network Properties\n"
                           "------------------\n"
                           "\n"
                           "Number Input Neurons: 2\n"
                           "Number Output Neurons: 1\n"
                           "Number Hidden Layers: 1\n"
                           "Number Neurons in Hidden Layer 0: 2\n"
                           "Type of Input Function: Sum\n"
                           "Type of Activation Function: Sigmoid, Threshold: 2, Slope: 0.2\n"
                           "Type of Output Function: None\n"
                           "\n"
                           "\n";

TEST_F(SmallNetText, ReportAndWeightsByNeuron) {
  const std::string byNeuron = "\n"
                               "Neuron Connection Weights\n"
                               "-------------------------\n"
                               "\n"
                               "Hidden Layer 0, Neuron 0\n"
                               "0.5, -1.25, \n"
                               "Hidden Layer 0, Neuron 1\n"
                               "2, 0.125, \n"
                               "Output Layer Neuron 0\n"
                               "3, -4, \n";
  EXPECT_EQ(Body(net.weights_to_text(0, 0.25f, 100.0f, {})),
            Report + "Overall Error generated: 0.25\nCycles: 100\n\n" + byNeuron);
  EXPECT_EQ(Body(net.weights_to_text(1, -1.0f, 1e7f, {})), Report + "Cycles: 1e+07\n\n" + byNeuron);
  EXPECT_EQ(Body(net.weights_to_text(-3, 0.5f, -1.0f, {})), Report + "Overall Error generated: 0.5\n\n");
}

TEST_F(SmallNetText, StaticDataDefinitions) {
  const std::string staticData = "static float weight_definitions[] =\n"
                                 "{\n"
                                 "0.5, -1.25, \n"
                                 "  2, 0.125, \n"
                                 "  3, -4, \n"
                                 "  };\n"
                                 "\n"
                                 "\n"
                                 "static TPredefinedWeights weights = \n"
                                 "\t {\n"
                                 "\t\t\t{ \t\t\t\t// TFixedNetProp \n"
                                 "\t\t\t\t\t2,\t\t// Number Input Neuron \n"
                                 "\t\t\t\t\t1,\t\t// Number Output Neurons \n"
                                 "\t\t\t}, \n"
                                 "\t\t\t{  \t\t\t\t// TDynNetProp\n"
                                 "\t\t\t\t\t1,\t\t// Number Hidden Layers \n"
                                 "\t\t\t\t\t{ 2,  },\t\t\t\t// Number Neurons per Hidden Layer\n"
                                 "\t\t\t\t\t{\t\t\t\t\t\t\t// TNeuronProp \n"
                                 "\t\t\t\t\t\t\t\tINPUT_SUM,\n"
                                 "\t\t\t\t\t\t\t\tACT_SIGM, \n"
                                 "\t\t\t\t\t\t\t\t0.2, 2,\t// Activation Function Parameters\n"
                                 "\t\t\t\t\t\t\t  OUTPUT_NONE, 0\t\t\t\t\t\t// Output Function Parameters\n"
                                 " \t\t\t\t\t},\n"
                                 "\t\t\t}, \n"
                                 "\t\t\tweight_definitions \n"
                                 "\n"
                                 "\t };\n";
  EXPECT_EQ(Body(net.weights_to_text(2, -1.0f, -1.0f, {})), Report + "\n" + staticData);

  TPredefinedWeights r = Shape(1, {2, 1}, 1, ACT_LIN, 1.5f, -0.25f);
  r.dyn.neuron_prop.input_type = INPUT_MAX;
  r.dyn.neuron_prop.output_type = OUTPUT_BIN;
  r.dyn.neuron_prop.output_threshold = 0.75f;
  NeuronalNet binary(r);
  SetWeights(binary, {1, 2, 3, 4, 5});
  const std::string text = binary.weights_to_text(2, -1.0f, -1.0f, {});
  const std::string tail = "{\n"
                           "1, \n"
                           "  2, \n"
                           "  3, 4, \n"
                           "  5, \n"
                           "  };\n";
  EXPECT_NE(text.find(tail), std::string::npos) << text;
  EXPECT_NE(text.find("\t\t\t\t\t{ 2, 1,  },\t\t\t\t// Number Neurons per Hidden Layer\n"
                      "\t\t\t\t\t{\t\t\t\t\t\t\t// TNeuronProp \n"
                      "\t\t\t\t\t\t\t\tINPUT_MAX,\n"
                      "\t\t\t\t\t\t\t\tACT_LIN, \n"
                      "\t\t\t\t\t\t\t\t1.5, -0.25,\t// Activation Function Parameters\n"
                      "\t\t\t\t\t\t\t  OUTPUT_BIN, 0.75\t\t\t// Output Funcction Parameters\n"),
            std::string::npos)
      << text;
  EXPECT_NE(text.find("Type of Output Function: Binary, Threshold: 0.75\n"), std::string::npos);
}

TEST_F(SmallNetText, PropertyAndWeightList) {
  const std::string list = "2\t// Number Input Neurons\n"
                           "1\t// Number Output Neurons\n"
                           "1\t // Number Hidden Layers\n"
                           "2\t// Number Neurons in Hidden Layer 0\n"
                           "INPUT_SUM\t\t// Type of Input Function\n"
                           "ACT_SIGM \t\t// Type of Activation Function\n"
                           "2\t// Activation Threshold\n"
                           "0.2\t\t// Activation Slope\n"
                           "OUTPUT_NONE\t\t// Type of Output Function\n"
                           "0\t\t// Output Threshold\n"
                           "weight definitions\n"
                           "0.5\n-1.25\n2\n0.125\n3\n-4\n";
  const std::string none = "The following 0 patterns (out of 0) were not recognized correctly by the net: \n";
  EXPECT_EQ(Body(net.weights_to_text(4, -1.0f, -1.0f, {})), none + "\n\n" + list);
  EXPECT_EQ(Body(net.weights_to_text(4, 0.5f, 12.0f, {})),
            none + "\nOverall Error generated: 0.5\nCycles: 12\n\n" + list);
}

TEST_F(NetTextTest, UnrecognisedPatterns) {
  NeuronalNet net(Shape(2, {2}, 2, ACT_IDENT));
  SetWeights(net, {1, 0, 0, 1, 1, 0, 0, 1}); // outputs = inputs
  const std::vector<training_pattern> patterns = {{{1.0f, 0.0f}, {1.0f, 0.0f}, 0.1f, "fine"},
                                                  {{0.0f, 1.0f}, {1.0f, 0.0f}, 0.1f, "wrong one"},
                                                  {{0.5f, 0.25f}, {0.0f, 0.75f}, 0.1f, "wrong two"}};
  const std::string section = "The following 2 patterns (out of 3) were not recognized correctly by the net: \n"
                              "\n"
                              "pattern #1\n"
                              "Inputs: \n"
                              "0, 1, \n"
                              "Outputs: 1, 0, \n"
                              "Telling Name: wrong one\n"
                              "\n"
                              "pattern #2\n"
                              "Inputs: \n"
                              "0.5, 0.25, \n"
                              "Outputs: 0, 0.75, \n"
                              "Telling Name: wrong two\n";
  const std::string text = Body(net.weights_to_text(4, -1.0f, -1.0f, patterns));
  EXPECT_EQ(text.rfind(section + "\n\n2\t// Number Input Neurons\n", 0), 0u) << text;
  EXPECT_NE(net.weights_to_text(3, -1.0f, -1.0f, patterns).find("\n\n" + section + "static float"), std::string::npos);
}

TEST_F(NetTextTest, SectionsByMode) {
  NeuronalNet net(Shape(2, {2}, 1));
  char const* const markers[] = {"Network Properties\n", "The following ", "Neuron Connection Weights\n",
                                 "static float weight_definitions[] =\n", "\t// Number Input Neurons\n"};
  const struct {
    int mode;
    char const* sections; // '1' .. '5' present
  } cases[] = {{-7, "1"}, {-1, "1"}, {0, "13"}, {1, "13"}, {2, "14"}, {3, "124"}, {4, "25"}, {5, ""}, {99, ""}};
  for (auto const& c : cases) {
    const std::string text = net.weights_to_text(c.mode, -1.0f, -1.0f, {});
    for (int s = 0; s < 5; ++s) {
      const bool wanted = std::string(c.sections).find(static_cast<char>('1' + s)) != std::string::npos;
      EXPECT_EQ(text.find(markers[s]) != std::string::npos, wanted) << "mode " << c.mode << " section " << s + 1;
    }
    EXPECT_EQ(text.find("Overall Error"), std::string::npos);
    EXPECT_EQ(text.find("Cycles"), std::string::npos);
  }
}

TEST_F(NetTextTest, TypeNamesInEverySection) {
  char const* const inputReport[] = {"Sum", "Minimum", "Maximum", "Average", "Product"};
  char const* const inputCode[] = {"INPUT_SUM", "INPUT_MIN", "INPUT_MAX", "INPUT_AVG", "INPUT_PROD"};
  char const* const actReport[] = {"Sigmoid, ", "Linear, ", "Tanhyp, ", "Ident. Projection, "};
  char const* const actCode[] = {"ACT_SIGM", "ACT_LIN", "ACT_TANHYP", "ACT_IDENT"};
  for (int i = 0; i < 5; ++i)
    for (int a = 0; a < 4; ++a) {
      TPredefinedWeights r = Shape(2, {2}, 1, static_cast<ACT_TYPE>(a));
      r.dyn.neuron_prop.input_type = static_cast<INPUT_TYPE>(i);
      NeuronalNet net(r);
      const std::string report = net.weights_to_text(2, -1.0f, -1.0f, {});
      const std::string list = net.weights_to_text(4, -1.0f, -1.0f, {});
      EXPECT_NE(report.find("Type of Input Function: " + std::string(inputReport[i]) + "\n"), std::string::npos);
      EXPECT_NE(report.find("Type of Activation Function: " + std::string(actReport[a]) + "Threshold: 0, Slope: 1\n"),
                std::string::npos);
      EXPECT_NE(report.find("\t\t\t\t\t\t\t\t" + std::string(inputCode[i]) + ",\n"), std::string::npos);
      EXPECT_NE(report.find("\t\t\t\t\t\t\t\t" + std::string(actCode[a]) + ", \n"), std::string::npos);
      EXPECT_NE(list.find("\n" + std::string(inputCode[i]) + "\t\t// Type of Input Function\n"), std::string::npos);
      EXPECT_NE(list.find("\n" + std::string(actCode[a]) + " \t\t// Type of Activation Function\n"), std::string::npos);
    }
}

TNetProp ReadProperties(std::string const& text, std::string& printed) {
  TempFile file("props");
  file.Write(text);
  ::testing::internal::CaptureStdout();
  const TNetProp p = NeuronalNet::load_net_properties_from_file(file.CPath());
  printed = ::testing::internal::GetCapturedStdout();
  return p;
}

std::string LoadWeights(NeuronalNet& net, std::string const& text) {
  TempFile file("weights");
  file.Write(text);
  ::testing::internal::CaptureStdout();
  net.load_weights_from_file(file.CPath());
  return ::testing::internal::GetCapturedStdout();
}

// A net shaped like the built-in chord analysis net.
TPredefinedWeights ChordShape() { return Shape(24, {15, 15}, 12, ACT_SIGM, 0.2f, 2.0f); }

TEST_F(NetTextTest, PropertyReaderOnAWrittenList) {
  std::srand(24);
  NeuronalNet net(ChordShape());
  const std::string text = net.weights_to_text(4, 0.01f, 3000.0f, {});
  std::string printed;
  const TNetProp p = ReadProperties(text, printed);
  EXPECT_EQ(printed, "Number Input Neurons erkannt!\n"
                     "Number Output Neurons erkannt!\n"
                     "Number Hidden Layers erkannt!\n"
                     "Number Neurons Hidden Layers erkannt!\n"
                     "Number Neurons Hidden Layers erkannt!\n"
                     "Type of Input Function erkannt!\n"
                     "0\n"
                     "Type of Activation Function erkannt!\n"
                     "0\n"
                     "Activation Threshold erkannt!\n"
                     "Activation Slope erkannt!\n"
                     "Type of Output Function erkannt!\n"
                     "0\n"
                     "Output Threshold erkannt!\n");
  nettest::ExpectChordNetProperties(p.fixed, p.dyn);

  // The 765 weights come back to six significant digits (and one more value is read).
  NeuronalNet fresh(p.fixed, p.dyn);
  printed = LoadWeights(fresh, text);
  EXPECT_EQ(printed.substr(printed.rfind("weight ")), "weight 766, 0.000000\n");
  const std::vector<float> written = Weights(net), read = Weights(fresh);
  ASSERT_EQ(read.size(), 765u);
  for (std::size_t i = 0; i < read.size(); ++i) EXPECT_NEAR(read[i], written[i], 5.1e-6 * std::fabs(written[i])) << i;
}

TEST_F(NetTextTest, PropertyReaderValuesAndKeys) {
  std::string printed;
  TNetProp p = ReadProperties("Number Input Neurons: 7\n"            // the key must end the line
                              "015\t// Number Input Neurons\n"       // leading digits
                              "-3\t// Number Output Neurons\n"       // no leading digits: 0
                              "3 Number Neurons in Hidden Layer 3\n" // any text before the key
                              "ACT_TANHYP\t// Type of Activation Function\n"
                              "INPUT_PROD// Type of Input Function\n"
                              "BOGUS\t// Type of Input Function\n" // unknown: keeps 4
                              "OUTPUT_BIN\t// Type of Output Function\n"
                              "-12.8459\t// Activation Threshold\n"
                              "abc\t// Activation Slope\n"
                              "3.5e-05\t// Output Threshold\n", // read up to the exponent
                              printed);
  EXPECT_EQ(printed, "Number Input Neurons erkannt!\n"
                     "Number Output Neurons erkannt!\n"
                     "Number Neurons Hidden Layers erkannt!\n"
                     "Type of Activation Function erkannt!\n2\n"
                     "Type of Input Function erkannt!\n4\n"
                     "Type of Input Function erkannt!\n4\n"
                     "Type of Output Function erkannt!\n1\n"
                     "Activation Threshold erkannt!\n"
                     "Activation Slope erkannt!\n"
                     "Output Threshold erkannt!\n");
  EXPECT_EQ(p.fixed.input_count, 15);
  EXPECT_EQ(p.fixed.output_count, 0);
  EXPECT_EQ(p.dyn.hidden_layer_sizes[3], 3);
  EXPECT_EQ(p.dyn.neuron_prop.activation_type, ACT_TANHYP);
  EXPECT_EQ(p.dyn.neuron_prop.input_type, INPUT_PROD);
  EXPECT_EQ(p.dyn.neuron_prop.output_type, OUTPUT_BIN);
  EXPECT_EQ(p.dyn.neuron_prop.activation_threshold, -12.8459f);
  EXPECT_EQ(p.dyn.neuron_prop.activation_slope, 0.0f);
  EXPECT_EQ(p.dyn.neuron_prop.output_threshold, 3.5f);

  p = ReadProperties("OUTPUT_BIN\t// Type of Output Function\nOUTPUT_NONE\t// Type of Output Function\n", printed);
  EXPECT_EQ(p.dyn.neuron_prop.output_type, OUTPUT_NONE);
  EXPECT_EQ(printed, "Type of Output Function erkannt!\n1\nType of Output Function erkannt!\n0\n");

  // The key must start within the first 450 characters, of a line cut at 500.
  p = ReadProperties("9" + std::string(448, ' ') + "Number Hidden Layers\n" + "8" + std::string(449, ' ') +
                         "Number Input Neurons\n" + "7" + std::string(470, ' ') + "Number Output Neurons\n",
                     printed);
  EXPECT_EQ(printed, "Number Hidden Layers erkannt!\n");
  EXPECT_EQ(p.dyn.hidden_layer_count, 9);
  EXPECT_EQ(p.fixed.input_count, 0);

  p = ReadProperties("", printed);
  EXPECT_EQ(printed, "");
  EXPECT_EQ(p.fixed.input_count, 0);

  ::testing::internal::CaptureStdout();
  p = NeuronalNet::load_net_properties_from_file("/nonexistent/tonvex/properties");
  EXPECT_EQ(::testing::internal::GetCapturedStdout(), "");
  EXPECT_EQ(p.dyn.hidden_layer_count, 0);
  EXPECT_EQ(p.dyn.neuron_prop.activation_slope, 0.0f);
}

TEST_F(NetTextTest, WeightReader) {
  NeuronalNet net(Shape(2, {2}, 1));
  const std::vector<float> start = {1, 2, 3, 4, 5, 6};
  SetWeights(net, start);

  // A short list fills the first weights; the empty read after the final line
  // break adds one more 0.
  EXPECT_EQ(LoadWeights(net, "report\nx weight definitions\n1.5\n-12.8459\nabc\n"),
            "weight 1, 1.500000\nweight 2, -12.845900\nweight 3, 0.000000\nweight 4, 0.000000\n");
  EXPECT_EQ(Weights(net), (std::vector<float>{1.5f, -12.8459f, 0.0f, 0.0f, 5.0f, 6.0f}));

  SetWeights(net, start);
  EXPECT_EQ(LoadWeights(net, "weight definitions\n7\n8.25"), "weight 1, 7.000000\nweight 2, 8.250000\n");
  EXPECT_EQ(Weights(net), (std::vector<float>{7.0f, 8.25f, 3, 4, 5, 6}));

  SetWeights(net, start);
  EXPECT_EQ(LoadWeights(net, "weight definitions:\n7\n8\nweight definitions trailing\n"), "");
  EXPECT_EQ(Weights(net), start) << "no line ends with the marker";

  const std::string many = LoadWeights(net, "weight definitions\n-1\n-2\n-3\n-4\n-5\n-6\n-7\n-8\n");
  EXPECT_EQ(many.substr(many.rfind("weight 9")), "weight 9, 0.000000\n");
  EXPECT_EQ(Weights(net), (std::vector<float>{-1, -2, -3, -4, -5, -6})) << "surplus values are ignored";

  ::testing::internal::CaptureStdout();
  net.load_weights_from_file("/nonexistent/tonvex/weights");
  EXPECT_EQ(::testing::internal::GetCapturedStdout(), "");
  EXPECT_EQ(Weights(net), (std::vector<float>{-1, -2, -3, -4, -5, -6}));
}

// Written values keep six significant digits: each weight comes back within half a
// unit of the sixth digit (5e-6 relative), and an output, a sigmoid of sums of a
// few dozen such products, within 1e-4.
TEST_F(NetTextTest, RoundTripThroughTheList) {
  const std::vector<training_pattern> patterns = {
      {{1, 0, 0}, {1, 0, 0}, 0.5f, "a"}, {{0, 1, 0}, {0, 1, 0}, 0.5f, "b"}, {{0, 0, 1}, {0, 0, 1}, 0.5f, "c"},
      {{1, 1, 0}, {0, 0, 1}, 0.5f, "d"}, {{0, 1, 1}, {1, 0, 0}, 0.5f, "e"}, {{1, 1, 1}, {0, 1, 0}, 0.5f, "f"},
  };
  std::srand(1234);
  NeuronalNet trained(Shape(3, {6, 5}, 3, ACT_SIGM, 1.0f, 0.5f));
  ::testing::internal::CaptureStdout();
  const float error = trained.batch_train(patterns, 0.05f, 400.0f);
  ::testing::internal::GetCapturedStdout();
  std::vector<float> weights = Weights(trained);
  for (float w : weights)
    ASSERT_TRUE(std::fabs(w) >= 1e-4f && std::fabs(w) < 1e5f) << w << " is written with an exponent";

  TempFile file;
  file.Write(trained.weights_to_text(4, error, 400.0f, patterns));
  ::testing::internal::CaptureStdout();
  const TNetProp props = NeuronalNet::load_net_properties_from_file(file.CPath());
  NeuronalNet fresh(props.fixed, props.dyn);
  fresh.load_weights_from_file(file.CPath());
  const std::string printed = ::testing::internal::GetCapturedStdout();
  EXPECT_NE(printed.find("weight " + std::to_string(weights.size() + 1) + ", 0.000000\n"), std::string::npos);

  TPredefinedWeights record = fresh.get_weights();
  std::unique_ptr<float[]> owned(record.weights);
  record.weights = weights.data();
  EXPECT_TRUE(trained.acquire_weights(record)) << "the properties come back exactly";
  const std::vector<float> read = Weights(fresh);
  ASSERT_EQ(read.size(), weights.size());
  for (std::size_t i = 0; i < read.size(); ++i) EXPECT_NEAR(read[i], weights[i], 5.1e-6 * std::fabs(weights[i])) << i;

  for (training_pattern const& p : patterns) {
    trained.use(p.inputs);
    fresh.use(p.inputs);
    const std::vector<float> a = trained.get_outputs(), b = fresh.get_outputs();
    for (std::size_t j = 0; j < a.size(); ++j) EXPECT_NEAR(a[j], b[j], 1e-4) << p.name;
    EXPECT_EQ(trained.winner(), fresh.winner()) << p.name;
  }
}

} // namespace
