// Worked example: a net learns to read the ten digits of a small bitmap font.
//
// Each digit is drawn below as 5 x 7 pixels ('#' = ink); the 35 pixels are the
// inputs (1 for ink, 0 for paper), output d stands for digit d. After training on
// the clean glyphs the net is asked to read them again and to read noisy copies
// with one or two pixels flipped. Exits with 0 when all ten clean digits and at
// least 18 of the 20 noisy copies are recognised.
#include <tonvex/NeuronalNet.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

constexpr int Width = 5;
constexpr int Height = 7;

// clang-format off
constexpr char const* Glyphs[10][Height] = {
    {" ### ", "#   #", "#  ##", "# # #", "##  #", "#   #", " ### "},
    {"  #  ", " ##  ", "  #  ", "  #  ", "  #  ", "  #  ", " ### "},
    {" ### ", "#   #", "    #", "   # ", "  #  ", " #   ", "#####"},
    {"#####", "   # ", "  #  ", "   # ", "    #", "#   #", " ### "},
    {"   # ", "  ## ", " # # ", "#  # ", "#####", "   # ", "   # "},
    {"#####", "#    ", "#### ", "    #", "    #", "#   #", " ### "},
    {"  ## ", " #   ", "#    ", "#### ", "#   #", "#   #", " ### "},
    {"#####", "    #", "   # ", "  #  ", " #   ", " #   ", " #   "},
    {" ### ", "#   #", "#   #", " ### ", "#   #", "#   #", " ### "},
    {" ### ", "#   #", "#   #", " ####", "    #", "   # ", " ##  "},
};
// clang-format on

training_pattern Digit(int d) {
  training_pattern p;
  for (char const* row : Glyphs[d])
    for (int x = 0; x < Width; ++x) p.inputs.push_back(row[x] == '#' ? 1.0f : 0.0f);
  p.outputs.assign(10, 0.0f);
  p.outputs[static_cast<std::size_t>(d)] = 1.0f;
  p.training_rate = 0.3f;
  p.name = "digit " + std::to_string(d);
  return p;
}

// A copy of digit d with `flips` pixels inverted, chosen with rand().
training_pattern Noisy(int d, int flips) {
  training_pattern p = Digit(d);
  p.name += ", " + std::to_string(flips) + " pixel(s) flipped:";
  for (int f = 0; f < flips; ++f) {
    const int pixel = std::rand() % (Width * Height);
    float& value = p.inputs[static_cast<std::size_t>(pixel)];
    value = 1.0f - value;
    p.name += " " + std::to_string(pixel);
  }
  return p;
}

void Report(NeuronalNet& net, std::vector<training_pattern> const& patterns, std::vector<int> const& failed) {
  for (std::size_t k = 0; k < patterns.size(); ++k) {
    net.use(patterns[k].inputs);
    bool missed = false;
    for (int f : failed) missed = missed || f == static_cast<int>(k);
    std::printf("  %-40s read as %d%s\n", patterns[k].name.c_str(), net.winner(), missed ? "  (wrong)" : "");
  }
  std::printf("  recognised %d of %d\n", static_cast<int>(patterns.size() - failed.size()),
              static_cast<int>(patterns.size()));
}

} // namespace

int main() {
  std::srand(3);
  NeuronalNet net(TFixedNetProp{Width * Height, 10},
                  TDynNetProp{1, {12, 0, 0, 0}, {INPUT_SUM, ACT_SIGM, 1.0f, 0.5f, OUTPUT_NONE, 0.0f}});

  std::vector<training_pattern> digits;
  for (int d = 0; d < 10; ++d) digits.push_back(Digit(d));
  if (net.check_learn_data_for_duplicates(digits)) return 1;
  net.batch_train(digits, 0.05f, 3000.0f);

  std::printf("clean digits:\n");
  const std::vector<int> cleanFailed = net.batch_verify(digits);
  Report(net, digits, cleanFailed);

  std::vector<training_pattern> noisy;
  for (int d = 0; d < 10; ++d) noisy.push_back(Noisy(d, 1));
  for (int d = 0; d < 10; ++d) noisy.push_back(Noisy(d, 2));
  std::printf("noisy digits:\n");
  const std::vector<int> noisyFailed = net.batch_verify(noisy);
  Report(net, noisy, noisyFailed);
  return cleanFailed.empty() && noisyFailed.size() <= 2 ? 0 : 1;
}
