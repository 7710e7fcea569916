// Harmonic function names.
#include "naming/HarmFuncNames.h"

#include "Chord.h"
#include "SignKey.h"

namespace {

struct CHarmFuncTexts {
  char const* Roman;
  char const* FunctionalMajor;
  char const* FunctionalMinor;
};

// By code 0..15. The texts are the library's fixed output, which hosts show and
// compare against, so they stand as given, the unfinished-looking ones included;
// code 7 in a major key shares "Sp" with code 4.
constexpr CHarmFuncTexts HarmFuncTexts[] = {{"undef", "undef", "undef"},
                                            {"I", "T", "T"},
                                            {"Im", "t", "t"},
                                            {"II", "DD / SP", "DD / SP"},
                                            {"IIm", "Sp", "Sp"},
                                            {"IIdim", "IIdim##", "IIdim##"},
                                            {"III", "TG", "P"},
                                            {"IIIm", "Sp", "IIIm##in ks_min"},
                                            {"IV", "S", "S"},
                                            {"IVm", "s", "s"},
                                            {"V", "D", "D"},
                                            {"Vm", "d", "d"},
                                            {"VI", "TP", "sP = G"},
                                            {"VIm", "Tp", "sp"},
                                            {"bVII", "SS", "sp"},
                                            {"VIIdim", "VIIdim##in ks_min", "VIIdim##in ks_min"}};
constexpr int HarmFuncCount = sizeof HarmFuncTexts / sizeof HarmFuncTexts[0];

} // namespace

char const* HarmFuncText(int code, bool functional, bool majorKey) {
  CHarmFuncTexts const& texts = HarmFuncTexts[(code >= 0 && code < HarmFuncCount) ? code : 0];
  if (!functional) return texts.Roman;
  return majorKey ? texts.FunctionalMajor : texts.FunctionalMinor;
}

std::string CChord::HarmFuncName(CSignKey key, CChordnamePref& /*pref*/) const {
  return HarmFuncText(HarmFuncIn(key), CChordnamePref::HarmFuncNaming == 1,
                      key.SignKeyType() == CSignKey::SignKey_Major);
}
