// Harte labels of chords: "C:maj", "A:min7", "C:(3,5,b7,#9)", "C:maj/3".
#include "ChordSymbol.h"
#include "naming/SymbolBody.h"

#include <initializer_list>

namespace {

constexpr unsigned MaskOf(std::initializer_list<int> intvls) {
  unsigned mask = 0;
  for (int i : intvls) mask |= 1u << i;
  return mask;
}

struct CHarteShorthand {
  char const* Name;
  unsigned Intvls;
};

// The shorthands that the label uses, each where it names the set exactly. Their
// degrees agree with the symbol's (the 6th of maj6, the bb7 of dim7, the 2 of sus2).
constexpr CHarteShorthand Shorthands[] = {
    {"maj", MaskOf({0, 4, 7})},         {"min", MaskOf({0, 3, 7})},         {"dim", MaskOf({0, 3, 6})},
    {"aug", MaskOf({0, 4, 8})},         {"maj7", MaskOf({0, 4, 7, 11})},    {"min7", MaskOf({0, 3, 7, 10})},
    {"7", MaskOf({0, 4, 7, 10})},       {"dim7", MaskOf({0, 3, 6, 9})},     {"hdim7", MaskOf({0, 3, 6, 10})},
    {"minmaj7", MaskOf({0, 3, 7, 11})}, {"maj6", MaskOf({0, 4, 7, 9})},     {"min6", MaskOf({0, 3, 7, 9})},
    {"9", MaskOf({0, 2, 4, 7, 10})},    {"maj9", MaskOf({0, 2, 4, 7, 11})}, {"min9", MaskOf({0, 2, 3, 7, 10})},
    {"sus2", MaskOf({0, 2, 7})},        {"sus4", MaskOf({0, 5, 7})}};

char const* ShorthandOf(unsigned intvls) {
  for (CHarteShorthand const& shorthand : Shorthands)
    if (shorthand.Intvls == intvls) return shorthand.Name;
  return nullptr;
}

} // namespace

std::string HarteLabel(CChord const& chord) {
  CSymbolChord const symbol = SymbolChordOf(chord);
  if (!symbol.Defined) return "N";
  CSymbolBody const body = FindSymbolBody(symbol.Intvls, Sym_Plain);
  bool const rootless = (symbol.Intvls & 1u) == 0;

  CSymbolText text;
  text.AddPitch(symbol.Root, false);
  text.Add(':');
  if (char const* shorthand = ShorthandOf(symbol.Intvls | 1u)) {
    text.Add(shorthand);
    if (rootless) text.Add("(*1)");
  } else {
    // The degrees in ascending order; the root is implied, "*1" takes it out.
    CSymbolTone tones[12];
    int count = 0;
    for (int i = 0; i < body.ToneCount; ++i)
      if (body.Tones[i].Intvl != 0) {
        int j = count++;
        for (; j > 0 && (tones[j - 1].Degree > body.Tones[i].Degree ||
                         (tones[j - 1].Degree == body.Tones[i].Degree && tones[j - 1].Intvl > body.Tones[i].Intvl));
             --j)
          tones[j] = tones[j - 1];
        tones[j] = body.Tones[i];
      }
    text.Add(rootless ? "(*1" : "(");
    for (int i = 0; i < count; ++i) {
      if (i > 0 || rootless) text.Add(',');
      text.AddDegree(tones[i], false);
    }
    if (count == 0 && !rootless) text.Add('1');
    text.Add(')');
  }
  if (symbol.BassIntvl != 0) {
    text.Add('/');
    text.AddDegree(body.ToneOf(symbol.BassIntvl), false);
  }
  return text.Str();
}
