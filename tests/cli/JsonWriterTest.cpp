// The program's JSON writer: string escaping and the placing of commas.
#include "JsonWriter.h"

#include <gtest/gtest.h>

#include <climits>
#include <cstdio>
#include <string>

namespace {

// The escape RFC 8259 prescribes for one byte: the two-character forms where the
// RFC has one, \u00XX for the other control characters, the byte itself otherwise.
std::string ExpectedEscape(int byte) {
  switch (byte) {
  case '"': return "\\\"";
  case '\\': return "\\\\";
  case 0x08: return "\\b";
  case 0x09: return "\\t";
  case 0x0a: return "\\n";
  case 0x0c: return "\\f";
  case 0x0d: return "\\r";
  }
  if (byte < 0x20) {
    char text[8];
    std::snprintf(text, sizeof text, "\\u%04x", byte);
    return text;
  }
  return std::string(1, static_cast<char>(byte));
}

TEST(JsonWriter, EscapesEveryByteAsTheRfcSays) {
  for (int byte = 0; byte < 256; ++byte) {
    std::string out;
    AppendJsonString(out, std::string(1, static_cast<char>(byte)));
    EXPECT_EQ(out, "\"" + ExpectedEscape(byte) + "\"") << "byte " << byte;
  }
}

TEST(JsonWriter, EscapesInsideLongerTexts) {
  std::string out = "prefix ";
  AppendJsonString(out, std::string("C \"maj\"\\7\n\0end", 14));
  EXPECT_EQ(out, "prefix \"C \\\"maj\\\"\\\\7\\n\\u0000end\"");
}

TEST(JsonWriter, KeepsTrailingBlanksAndUtf8) {
  std::string out;
  AppendJsonString(out, "C  ");
  AppendJsonString(out, "Fa\xc3\x9f");
  EXPECT_EQ(out, "\"C  \"\"Fa\xc3\x9f\"");
}

TEST(JsonWriter, PlacesCommasAtEveryLevel) {
  std::string out;
  CJsonWriter json(out);
  json.BeginObject();
  json.Key("name");
  json.String("C m ");
  json.Key("notes");
  json.BeginArray();
  json.BeginObject();
  json.Key("number");
  json.Int(60);
  json.EndObject();
  json.BeginObject();
  json.EndObject();
  json.Int(-3);
  json.EndArray();
  json.Key("empty");
  json.BeginArray();
  json.EndArray();
  json.Key("flags");
  json.BeginArray();
  json.Bool(true);
  json.Bool(false);
  json.EndArray();
  json.EndObject();
  EXPECT_EQ(out, "{\"name\":\"C m \",\"notes\":[{\"number\":60},{},-3],\"empty\":[],\"flags\":[true,false]}");
}

TEST(JsonWriter, FreshWriterAppendsWithoutLeadingComma) {
  std::string out = "{\"a\":1}\n";
  CJsonWriter json(out);
  json.BeginObject();
  json.Key("b");
  json.Int(LONG_MIN);
  json.EndObject();
  EXPECT_EQ(out, "{\"a\":1}\n{\"b\":" + std::to_string(LONG_MIN) + "}");
}

} // namespace
