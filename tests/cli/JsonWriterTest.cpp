// The program's JSON writer: string escaping and the placing of commas.
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

TEST(JsonWriter, PlacesCommasAtEveryLevel) {
  std::string out = "{\"a\":1}\n"; // a fresh writer appends without a leading comma
  CJsonWriter json(out);
  json.BeginObject();
  json.Key("name");
  json.String("C m ");
  json.Key("notes");
  json.BeginArray();
  json.BeginObject();
  json.Key("number");
  json.Int(LONG_MIN);
  json.EndObject();
  json.BeginObject();
  json.EndObject();
  json.Bool(true);
  json.Bool(false);
  json.EndArray();
  json.Key("empty");
  json.BeginArray();
  json.EndArray();
  json.EndObject();
  EXPECT_EQ(out, "{\"a\":1}\n{\"name\":\"C m \",\"notes\":[{\"number\":" + std::to_string(LONG_MIN) +
                     "},{},true,false],\"empty\":[]}");
}

} // namespace
