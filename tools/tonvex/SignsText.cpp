#include "SignsText.h"

#include <cstdio>

std::string SignsText(int signs) {
  char text[48];
  long count = signs < 0 ? -static_cast<long>(signs) : signs;
  if (signs == 0)
    std::snprintf(text, sizeof text, "0 (none)");
  else
    std::snprintf(text, sizeof text, "%+d (%ld %s%s)", signs, count, signs > 0 ? "sharp" : "flat",
                  count == 1 ? "" : "s");
  return text;
}
