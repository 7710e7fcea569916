// Writes the static-data text (weights_to_text mode 2) of the sample net to the
// file named by the argument, with the report that precedes the definitions
// commented out, so that a test can compile it.
#include "SampleNet.h"

#include <tonvex/NeuronalNet.h>

#include <fstream>
#include <iostream>
#include <string>

int main(int argc, char** argv) {
  if (argc != 2) {
    std::cerr << "usage: tonvex_static_data_writer OUTPUT\n";
    return 2;
  }
  NeuronalNet net(sample::Fixed(), sample::Dyn());
  sample::Train(net);
  const std::string text = net.weights_to_text(2, -1.0f, -1.0f, {});
  const std::size_t definitions = text.find("static float weight_definitions[]");
  if (definitions == std::string::npos) {
    std::cerr << "no static-data definitions in the text\n";
    return 1;
  }
  std::ofstream out(argv[1]);
  out << "/*\n" << text.substr(0, definitions) << "*/\n" << text.substr(definitions);
  return out.good() ? 0 : 1;
}
