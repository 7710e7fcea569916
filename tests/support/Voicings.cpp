#include "support/Voicings.h"

namespace {

// Intervals above the root of the chord types a voicing is drawn from.
struct CTemplate {
  int Intvls[5];
  int Count;
};
constexpr CTemplate Templates[] = {
    {{0, 4, 7}, 3},     {{0, 3, 7}, 3},        {{0, 4, 7, 10}, 4},    {{0, 3, 7, 10}, 4},
    {{0, 4, 7, 11}, 4}, {{0, 3, 6}, 3},        {{0, 3, 6, 9}, 4},     {{0, 4, 8}, 3},
    {{0, 5, 7}, 3},     {{0, 2, 7}, 3},        {{0, 4, 7, 9}, 4},     {{0, 3, 6, 10}, 4},
    {{0, 5, 7, 10}, 4}, {{0, 4, 7, 10, 2}, 5}, {{0, 3, 7, 10, 5}, 5}, {{0, 4, 7, 11, 2}, 5}};
constexpr int TemplateCount = sizeof Templates / sizeof Templates[0];

} // namespace

std::uint64_t CBenchRandom::Next() {
  std::uint64_t z = (State_ += 0x9e3779b97f4a7c15u);
  z = (z ^ (z >> 30)) * 0xbf58476d1ce4e5b9u;
  z = (z ^ (z >> 27)) * 0x94d049bb133111ebu;
  return z ^ (z >> 31);
}

CMySet<int> NextVoicing(CBenchRandom& random) {
  auto const count = static_cast<std::size_t>(2 + random.Below(6));
  CMySet<int> notes;
  if (random.Below(4) == 0) {
    int const lowest = 36 + random.Below(25);
    notes.insert(lowest);
    while (notes.size() < count) notes.insert(lowest + 1 + random.Below(30));
    return notes;
  }
  CTemplate const& chord = Templates[random.Below(TemplateCount)];
  int const root = random.Below(12);
  // The bass is mostly the root, else another member of the chord (an inversion).
  int const bassPc = (root + chord.Intvls[random.Below(3) == 0 ? random.Below(chord.Count) : 0]) % 12;
  int const bass = 36 + bassPc + 12 * random.Below(2);
  notes.insert(bass);
  while (notes.size() < count) {
    int const pc = (root + chord.Intvls[random.Below(chord.Count)]) % 12;
    int const octave = random.Below(3);
    int note = bass + ((pc - bassPc + 12) % 12) + 12 * octave;
    if (note == bass && octave == 0) note += 12;
    notes.insert(note);
  }
  return notes;
}

std::vector<CMySet<int>> MakeVoicings(int count) {
  CBenchRandom random(VoicingSeed);
  std::vector<CMySet<int>> voicings;
  voicings.reserve(static_cast<std::size_t>(count));
  for (int i = 0; i < count; ++i) voicings.push_back(NextVoicing(random));
  return voicings;
}
