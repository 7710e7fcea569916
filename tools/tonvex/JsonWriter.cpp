#include "JsonWriter.h"

#include <charconv>
#include <cstdio>

// A value or a key needs a comma before it exactly when something was written at
// the same level; after a key, its value does not. One flag covers every level,
// since closing a level always leaves a finished value at the level around it.
void CJsonWriter::BeforeValue() {
  if (NeedsComma_) Out_ += ',';
  NeedsComma_ = true;
}

void CJsonWriter::Open(char bracket) {
  BeforeValue();
  Out_ += bracket;
  NeedsComma_ = false;
}

void CJsonWriter::Close(char bracket) {
  Out_ += bracket;
  NeedsComma_ = true;
}

void CJsonWriter::Key(std::string_view name) {
  BeforeValue();
  AppendJsonString(Out_, name);
  Out_ += ':';
  NeedsComma_ = false;
}

void CJsonWriter::String(std::string_view text) {
  BeforeValue();
  AppendJsonString(Out_, text);
}

void CJsonWriter::Int(long value) {
  BeforeValue();
  char digits[24];
  int length = std::snprintf(digits, sizeof digits, "%ld", value);
  Out_.append(digits, static_cast<std::size_t>(length));
}

void CJsonWriter::Fixed(double value, int decimals) {
  BeforeValue();
  AppendFixed(Out_, value, decimals);
}

void CJsonWriter::Null() {
  BeforeValue();
  Out_ += "null";
}

void AppendJsonString(std::string& out, std::string_view text) {
  static const char Hex[] = "0123456789abcdef";
  out += '"';
  for (char c : text) {
    unsigned char const byte = static_cast<unsigned char>(c);
    switch (c) {
    case '"': out += "\\\""; break;
    case '\\': out += "\\\\"; break;
    case '\b': out += "\\b"; break;
    case '\f': out += "\\f"; break;
    case '\n': out += "\\n"; break;
    case '\r': out += "\\r"; break;
    case '\t': out += "\\t"; break;
    default:
      if (byte < 0x20) {
        out += "\\u00";
        out += Hex[byte >> 4];
        out += Hex[byte & 0xf];
      } else {
        out += c;
      }
    }
  }
  out += '"';
}

void AppendFixed(std::string& out, double value, int decimals) {
  // A double has at most 309 digits before the point.
  char digits[400];
  auto const written = std::to_chars(digits, digits + sizeof digits, value, std::chars_format::fixed, decimals);
  if (written.ec == std::errc()) out.append(digits, written.ptr);
}
