// User input shown back in messages and JSON, made safe for a terminal: a 5 MB
// token or a control byte must neither flood nor garble the screen.
#ifndef TONVEX_TOOLS_QUOTEDTEXT_H
#define TONVEX_TOOLS_QUOTEDTEXT_H

#include <string>
#include <string_view>

/// How many characters of user input a message shows, and of a file name: a path
/// that can be opened is shown whole.
constexpr std::size_t ShownCharacters = 40;
constexpr std::size_t PathCharacters = 4096;

/// The text in single quotes for a message: control bytes written \n, \t, \r or
/// \xNN, a backslash \\, bytes that are no UTF-8 \xNN; cut after 40 characters
/// (not bytes, never inside a UTF-8 sequence) with '…' marking the cut:
/// "'C\x09x'", "'XXXX…'". File names are cut after `most` = PathCharacters.
std::string Quoted(std::string_view text, std::size_t most = ShownCharacters);

/// The text cut as Quoted cuts it, for a JSON string: bytes that are no UTF-8 become
/// U+FFFD, everything else stays (the JSON writer escapes the control characters).
std::string ShortText(std::string_view text);

#endif
