// A small JSON writer (RFC 8259) that appends to a string.
//
// The caller keeps the structure right (a key before every value in an object,
// every Begin closed by its End); the writer places the commas and escapes the
// strings. Strings are taken as UTF-8 and passed through byte for byte except for
// the quotation mark, the backslash and the control characters U+0000..U+001F,
// which are escaped (\b \f \n \r \t, the others as \u00XX).
//
// The output string is only appended to, so one string can be reused line after
// line without allocating again.
#ifndef TONVEX_TOOLS_JSONWRITER_H
#define TONVEX_TOOLS_JSONWRITER_H

#include <string>
#include <string_view>

class CJsonWriter {
public:
  explicit CJsonWriter(std::string& out) : Out_(out) {}

  void BeginObject() { Open('{'); }
  void EndObject() { Close('}'); }
  void BeginArray() { Open('['); }
  void EndArray() { Close(']'); }
  /// The name of the next member of an object.
  void Key(std::string_view name);
  void String(std::string_view text);
  void Int(long value);
  /// A number with exactly `decimals` digits after the point (0.500000).
  void Fixed(double value, int decimals);
  void Null();

private:
  void BeforeValue();
  void Open(char bracket);
  void Close(char bracket);

  std::string& Out_;
  bool NeedsComma_ = false;
};

/// Appends text as a JSON string, quotes included.
void AppendJsonString(std::string& out, std::string_view text);

/// Appends value with exactly `decimals` digits after the point, rounded, the same
/// in every locale ("-0.250000", "12.500"); decimals 0 to 60.
void AppendFixed(std::string& out, double value, int decimals);

#endif
