// Root accuracy of both root-finding algorithms on the generated chord voicings.
//
//   tonvex_root_accuracy [--check]
//
// Every voicing of the chord pattern generator (training/ChordPatterns.h) is handed
// to a chord by its note numbers, and root finding by rules and by the built-in net
// each choose a root; a root is right when its pitch class is the voicing's labelled
// root. Prints, per algorithm, the voicings named right of all voicings and of the
// unambiguous ones (those whose every reading has the same root), and how many
// unambiguous voicings only one of the two algorithms names right; the unambiguous
// voicings that only the rules name right are listed by name and notes.
//
// With --check the exit status is 1 unless the net names the labelled root of at
// least 99% of the unambiguous voicings and names right every unambiguous voicing
// that the rules name right.
#include "training/RootAccuracy.h"

#include <cstdio>
#include <string>

namespace {

constexpr int RequiredNetPercent = 99;

void PrintLine(char const* algo, TRootTally const& tally, TRootAccuracy const& accuracy) {
  auto percent = [](int part, int whole) { return whole > 0 ? 100.0 * part / whole : 0.0; };
  std::printf("%-6s %5d of %5d voicings (%6.2f%%), %5d of %5d unambiguous (%6.2f%%)\n", algo, tally.named,
              accuracy.voicings, percent(tally.named, accuracy.voicings), tally.unambiguousNamed,
              accuracy.unambiguousVoicings, percent(tally.unambiguousNamed, accuracy.unambiguousVoicings));
}

} // namespace

int main(int argc, char** argv) {
  bool check = false;
  for (int a = 1; a < argc; ++a) {
    if (std::string(argv[a]) != "--check") {
      std::fputs("usage: tonvex_root_accuracy [--check]\n", stderr);
      return 2;
    }
    check = true;
  }

  const std::vector<TChordVoicing> voicings = ChordVoicings();
  const TRootAccuracy accuracy = MeasureRootAccuracy(voicings);
  std::puts("Labelled root found by root finding on the generated chord voicings:");
  PrintLine("rules", accuracy.rules, accuracy);
  PrintLine("net", accuracy.net, accuracy);
  std::printf("unambiguous voicings only the net names right: %zu; only the rules: %zu\n", accuracy.onlyNetRight.size(),
              accuracy.onlyRulesRight.size());
  for (std::size_t i : accuracy.onlyRulesRight) {
    TChordVoicing const& v = voicings[i];
    std::printf("  only the rules: %s, notes", v.name.c_str());
    for (int note : v.noteNrs) std::printf(" %d", note);
    std::printf(", net %d, labelled %d\n", FoundRootKeyNr(v.noteNrs, SCA_NEURONAL_NET), LabelledRootKeyNr(v));
  }
  if (!check) return 0;

  const bool netEnough = accuracy.unambiguousVoicings > 0 &&
                         accuracy.net.unambiguousNamed * 100 >= accuracy.unambiguousVoicings * RequiredNetPercent;
  if (!netEnough)
    std::printf("check failed: the net names fewer than %d%% of the unambiguous voicings\n", RequiredNetPercent);
  if (!accuracy.onlyRulesRight.empty())
    std::puts("check failed: the rules name unambiguous voicings right that the net does not");
  return netEnough && accuracy.onlyRulesRight.empty() ? 0 : 1;
}
