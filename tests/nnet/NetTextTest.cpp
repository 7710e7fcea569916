// Text forms of a net and the two readers: the report, the recognition report and
// the property-and-weight list as written, and what the readers make of odd lines.
#include "nnet/NetTestSupport.h"
#include "support/TempFile.h"
#include "support/TestPrelude.h"

#include <regex>

namespace {

using namespace nettest;
using NetTextTest = NetTest;

// The text after the time line and the two line ends that follow it.
std::string Body(std::string const& text) {
  std::size_t const end = text.find('\n');
  EXPECT_TRUE(std::regex_match(text.substr(0, end), std::regex("[A-Z][a-z]{2} [A-Z][a-z]{2} [ 0-9][0-9] "
                                                               "[0-9]{2}:[0-9]{2}:[0-9]{2} [0-9]{4}")));
  EXPECT_EQ(text.compare(end, 3, "\n\n\n"), 0);
  return text.substr(end + 3);
}

// Two inputs, one hidden layer of two, one output; slope 0.2, threshold 2.
NeuronalNet SmallNet() {
  NeuronalNet net(Shape(2, {2}, 1, ACT_SIGM, 0.2f, 2.0f));
  SetWeights(net, {0.5f, -1.25f, 2.0f, 0.125f, 3.0f, -4.0f});
  return net;
}

TEST_F(NetTextTest, ReportAndList) {
  NeuronalNet net = SmallNet();
  EXPECT_EQ(Body(net.weights_to_text(0, 0.25f, 1e7f, {})),
            "Network Properties\n------------------\n\n"
            "Number Input Neurons: 2\n"
            "Number Output Neurons: 1\n"
            "Number Hidden Layers: 1\n"
            "Number Neurons in Hidden Layer 0: 2\n"
            "Type of Input Function: Sum\n"
            "Type of Activation Function: Sigmoid, Threshold: 2, Slope: 0.2\n"
            "Type of Output Function: None\n\n\n"
            "Overall Error generated: 0.25\nCycles: 1e+07\n\n"
            "\nNeuron Connection Weights\n-------------------------\n\n"
            "Hidden Layer 0, Neuron 0\n0.5, -1.25, \n"
            "Hidden Layer 0, Neuron 1\n2, 0.125, \n"
            "Output Layer Neuron 0\n3, -4, \n");
  EXPECT_EQ(Body(net.weights_to_text(4, -1.0f, -1.0f, {})),
            "The following 0 patterns (out of 0) were not recognized correctly by the net: \n\n\n"
            "2\t// Number Input Neurons\n1\t// Number Output Neurons\n1\t // Number Hidden Layers\n"
            "2\t// Number Neurons in Hidden Layer 0\nINPUT_SUM\t\t// Type of Input Function\n"
            "ACT_SIGM \t\t// Type of Activation Function\n2\t// Activation Threshold\n0.2\t\t// Activation Slope\n"
            "OUTPUT_NONE\t\t// Type of Output Function\n0\t\t// Output Threshold\n"
            "weight definitions\n0.5\n-1.25\n2\n0.125\n3\n-4\n");
  // The patterns the net does not recognise, listed in modes 3 and 4.
  NeuronalNet identity(Shape(2, {2}, 2, ACT_IDENT));
  SetWeights(identity, {1, 0, 0, 1, 1, 0, 0, 1});
  std::string const text = identity.weights_to_text(
      3, -1.0f, -1.0f, {{{1, 0}, {1, 0}, 0.1f, "fine"}, {{0.5f, 0.25f}, {0, 0.75f}, 0.1f, "wrong"}});
  EXPECT_NE(text.find("\n\nThe following 1 patterns (out of 2) were not recognized correctly by the net: \n\n"
                      "pattern #1\nInputs: \n0.5, 0.25, \nOutputs: 0, 0.75, \nTelling Name: wrong\nstatic float"),
            std::string::npos)
      << text;
}

TNetProp ReadProperties(std::string const& text, std::string* printed = nullptr) {
  TempFile file("props");
  file.Write(text);
  ::testing::internal::CaptureStdout();
  TNetProp const p = NeuronalNet::load_net_properties_from_file(file.CPath());
  std::string const out = ::testing::internal::GetCapturedStdout();
  if (printed) *printed = out;
  return p;
}

// A key counts where it ends the line and starts within its first 450 characters;
// counts read leading digits, reals a prefix of digits, '-' and '.', type names a
// known prefix (an unknown one keeps the value before); each key found is reported.
TEST_F(NetTextTest, PropertyReader) {
  std::string printed;
  TNetProp const p = ReadProperties("Number Input Neurons: 7\n"
                                    "015\t// Number Input Neurons\n"
                                    "-3\t// Number Output Neurons\n"
                                    "3 Number Neurons in Hidden Layer 3\n"
                                    "INPUT_PROD// Type of Input Function\n"
                                    "BOGUS\t// Type of Input Function\n"
                                    "OUTPUT_BIN\t// Type of Output Function\n"
                                    "-12.8459\t// Activation Threshold\n"
                                    "abc\t// Activation Slope\n"
                                    "3.5e-05\t// Output Threshold\n" +
                                        std::string(449, ' ') + "Number Hidden Layers\n" + "9" + std::string(449, ' ') +
                                        "Number Hidden Layers\n",
                                    &printed);
  EXPECT_EQ(printed, "Number Input Neurons erkannt!\nNumber Output Neurons erkannt!\n"
                     "Number Neurons Hidden Layers erkannt!\nType of Input Function erkannt!\n4\n"
                     "Type of Input Function erkannt!\n4\nType of Output Function erkannt!\n1\n"
                     "Activation Threshold erkannt!\nActivation Slope erkannt!\nOutput Threshold erkannt!\n"
                     "Number Hidden Layers erkannt!\n");
  TNetProp expected{{15, 0}, {0, {0, 0, 0, 3}, {INPUT_PROD, ACT_SIGM, 0.0f, -12.8459f, OUTPUT_BIN, 3.5f}}};
  EXPECT_EQ(std::memcmp(&p, &expected, sizeof p), 0);
  EXPECT_EQ(ReadProperties("").fixed.input_count, 0);
  ::testing::internal::CaptureStdout();
  NeuronalNet::load_net_properties_from_file("/nonexistent/tonvex/properties");
  EXPECT_EQ(::testing::internal::GetCapturedStdout(), "");
}

// Values follow the first line that ends with the marker, one per line, into the
// first weights; a final line break adds one more 0, surplus values are ignored.
TEST_F(NetTextTest, WeightReader) {
  NeuronalNet net = SmallNet();
  std::vector<float> const start = Weights(net);
  auto load = [&net](std::string const& text) {
    TempFile file("weights");
    file.Write(text);
    ::testing::internal::CaptureStdout();
    net.load_weights_from_file(file.CPath());
    return ::testing::internal::GetCapturedStdout();
  };
  EXPECT_EQ(load("report\nx weight definitions\n1.5\n-12.8459\nabc\n"),
            "weight 1, 1.500000\nweight 2, -12.845900\nweight 3, 0.000000\nweight 4, 0.000000\n");
  EXPECT_EQ(Weights(net), (std::vector<float>{1.5f, -12.8459f, 0.0f, 0.0f, start[4], start[5]}));
  EXPECT_EQ(load("weight definitions:\n7\n"), "") << "no line ends with the marker";
  load("weight definitions\n-1\n-2\n-3\n-4\n-5\n-6\n-7");
  EXPECT_EQ(Weights(net), (std::vector<float>{-1, -2, -3, -4, -5, -6}));
  EXPECT_EQ(load(""), "");
  EXPECT_EQ(Weights(net), (std::vector<float>{-1, -2, -3, -4, -5, -6}));
}

} // namespace
