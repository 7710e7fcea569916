// Numbers in the net's messages, written alike in every locale.
#include "nnet/NumberText.h"

#include <charconv>

std::string FixedText(double value) {
  // DBL_MAX has 309 digits before the point.
  char text[330];
  std::to_chars_result const result = std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, 6);
  return std::string(text, result.ptr);
}
