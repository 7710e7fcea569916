// The harmonic function names by code, as data shared by the tests of the texts
// and of the names of chords in keys.
#ifndef TONVEX_TESTS_NAMING_HARMFUNCTABLE_H
#define TONVEX_TESTS_NAMING_HARMFUNCTABLE_H

namespace harmfunc {

struct Texts {
  char const* roman;
  char const* functionalMajor; // in a major key
  char const* functionalMinor; // in a minor key
};

// By code 0..15.
inline constexpr Texts ByCode[16] = {{"undef", "undef", "undef"},
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

} // namespace harmfunc

#endif
