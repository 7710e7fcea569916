// The program's JSON writer's string escaping (its commas are checked in the
// program's JSON output by the command-line tests).
#include "JsonWriter.h"
#include "support/TestPrelude.h"

namespace {

// Every byte alone, as RFC 8259 prescribes: the two-character escapes where it has
// one, \u00XX for the other control characters, the byte itself otherwise (UTF-8 and
// trailing blanks pass unchanged).
TEST(JsonWriter, EscapesEveryByteAsTheRfcSays) {
  std::string const shortForms = "\"\"\\\\\bb\tt\nn\ff\rr";
  for (int byte = 0; byte < 256; ++byte) {
    std::string out = "x";
    AppendJsonString(out, std::string(1, static_cast<char>(byte)));
    std::string expected(1, static_cast<char>(byte));
    std::size_t const at = shortForms.find(static_cast<char>(byte));
    char hex[8];
    std::snprintf(hex, sizeof hex, "\\u%04x", byte);
    if (byte != 0 && at != std::string::npos && at % 2 == 0)
      expected = std::string("\\") + shortForms[at + 1];
    else if (byte < 0x20)
      expected = hex;
    EXPECT_EQ(out, "x\"" + expected + "\"") << "byte " << byte;
  }
  std::string out;
  AppendJsonString(out, std::string("C  \"m\"\\7\n\0Fa\xc3\x9f", 14));
  EXPECT_EQ(out, "\"C  \\\"m\\\"\\\\7\\n\\u0000Fa\xc3\x9f\"");
}

} // namespace
