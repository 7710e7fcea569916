// Harmonic function texts of every code, including the code that no chord
// produces (14) and codes outside 0..15.
#include "HarmFuncTable.h"
#include "naming/HarmFuncNames.h"

#include <gtest/gtest.h>

namespace {

TEST(HarmFuncText, EveryCodeInBothStylesAndModes) {
  for (int code = 0; code < 16; ++code) {
    harmfunc::Texts const& texts = harmfunc::ByCode[code];
    EXPECT_STREQ(HarmFuncText(code, false, true), texts.roman) << code;
    EXPECT_STREQ(HarmFuncText(code, false, false), texts.roman) << code;
    EXPECT_STREQ(HarmFuncText(code, true, true), texts.functionalMajor) << code;
    EXPECT_STREQ(HarmFuncText(code, true, false), texts.functionalMinor) << code;
  }
}

TEST(HarmFuncText, CodesOutsideTheTableAreUndefined) {
  for (int code : {16, 17, 1000, -1})
    for (bool functional : {false, true})
      for (bool major : {false, true}) EXPECT_STREQ(HarmFuncText(code, functional, major), "undef") << code;
}

} // namespace
