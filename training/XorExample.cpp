// Worked example: a net learns exclusive or.
//
// Two inputs (0 or 1), one hidden layer, two outputs: output 0 stands for "equal
// inputs", output 1 for "different inputs". The net has no bias weights; the shared
// activation threshold is the only offset, which is why the threshold is not 0.
// Prints the training messages, each pattern's outputs and the recognition result;
// exits with 0 when all four patterns are recognised.
#include <tonvex/NeuronalNet.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

int main() {
  std::srand(1);
  int hiddenSizes[] = {4};
  NeuronalNet net(2, 1, hiddenSizes, 2, INPUT_SUM, ACT_SIGM, 1.0f, 0.5f, OUTPUT_NONE, 0.0f);

  std::vector<training_pattern> patterns;
  for (int a = 0; a <= 1; ++a)
    for (int b = 0; b <= 1; ++b) {
      const float differ = a != b ? 1.0f : 0.0f;
      patterns.push_back({{static_cast<float>(a), static_cast<float>(b)},
                          {1.0f - differ, differ},
                          0.5f,
                          std::to_string(a) + " xor " + std::to_string(b)});
    }

  const float error = net.batch_train(patterns, 0.1f, 5000.0f);
  for (training_pattern const& p : patterns) {
    net.use(p.inputs);
    const std::vector<float> out = net.get_outputs();
    std::printf("%s: equal %.3f, different %.3f -> %s\n", p.name.c_str(), static_cast<double>(out[0]),
                static_cast<double>(out[1]), net.winner() == 1 ? "1" : "0");
  }
  const std::vector<int> failed = net.batch_verify(patterns);
  std::printf("recognised %d of %d patterns (mean error %f)\n", static_cast<int>(patterns.size() - failed.size()),
              static_cast<int>(patterns.size()), static_cast<double>(error));
  return failed.empty() ? 0 : 1;
}
