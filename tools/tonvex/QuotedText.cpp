#include "QuotedText.h"

namespace {

bool IsContinuation(std::string_view text, std::size_t i) {
  return i < text.size() && (static_cast<unsigned char>(text[i]) & 0xC0) == 0x80;
}

// The length of the UTF-8 character at text[i], or 0 where the bytes are no
// well-formed UTF-8 (a stray continuation byte, a cut or overlong sequence, a
// surrogate, a code point above U+10FFFF).
std::size_t CharLength(std::string_view text, std::size_t i) {
  auto const lead = static_cast<unsigned char>(text[i]);
  if (lead < 0x80) return 1;
  std::size_t const length = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : lead >= 0xC0 ? 2 : 0;
  if (length == 0 || lead > 0xF4) return 0;
  char32_t code = lead & (0x7F >> length);
  for (std::size_t k = 1; k < length; ++k) {
    if (!IsContinuation(text, i + k)) return 0;
    code = code << 6 | (static_cast<unsigned char>(text[i + k]) & 0x3F);
  }
  char32_t const least[] = {0, 0, 0x80, 0x800, 0x10000};
  if (code < least[length] || code > 0x10FFFF || (code >= 0xD800 && code <= 0xDFFF)) return 0;
  return length;
}

void AppendHex(std::string& out, unsigned char byte) {
  static char const Hex[] = "0123456789abcdef";
  out += "\\x";
  out += Hex[byte >> 4];
  out += Hex[byte & 0xF];
}

// One character (or stray byte) as a message shows it.
void AppendEscaped(std::string& out, std::string_view text, std::size_t i, std::size_t length) {
  auto const byte = static_cast<unsigned char>(text[i]);
  if (length == 0) return AppendHex(out, byte);
  // C1 control characters (U+0080..U+009F) steer terminals as the C0 ones do.
  bool const c1 = length == 2 && byte == 0xC2 && static_cast<unsigned char>(text[i + 1]) < 0xA0;
  if (c1) {
    AppendHex(out, byte);
    return AppendHex(out, static_cast<unsigned char>(text[i + 1]));
  }
  if (length > 1 || (byte >= 0x20 && byte != 0x7F && byte != '\\')) {
    out.append(text, i, length);
    return;
  }
  switch (byte) {
  case '\n': out += "\\n"; break;
  case '\t': out += "\\t"; break;
  case '\r': out += "\\r"; break;
  case '\\': out += "\\\\"; break;
  default: AppendHex(out, byte);
  }
}

// The first `most` characters of text, each escaped or kept, and '…' if more follow.
std::string Shortened(std::string_view text, std::size_t most, bool escape) {
  std::string out;
  std::size_t i = 0;
  for (std::size_t shown = 0; i < text.size() && shown < most; ++shown) {
    std::size_t const length = CharLength(text, i);
    if (escape)
      AppendEscaped(out, text, i, length);
    else if (length == 0)
      out += "\xEF\xBF\xBD";
    else
      out.append(text, i, length);
    i += length == 0 ? 1 : length;
  }
  if (i < text.size()) out += "\xE2\x80\xA6";
  return out;
}

} // namespace

std::string Quoted(std::string_view text, std::size_t most) { return "'" + Shortened(text, most, true) + "'"; }

std::string ShortText(std::string_view text) { return Shortened(text, ShownCharacters, false); }
