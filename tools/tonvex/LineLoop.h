// The loop over the lines of standard input that the chord and symbol commands
// share: block reads, output in large blocks, line numbers, problems reported on
// standard error and, with --json, as JSON objects in their place.
//
// Output is collected and written in blocks for speed, but whatever is pending is
// written before every read of input that may have to wait: a batch file still
// runs in large blocks, while a program that writes one line through a pipe and
// waits (a coprocess) gets that line's answer at once.
#ifndef TONVEX_TOOLS_LINELOOP_H
#define TONVEX_TOOLS_LINELOOP_H

#include "CommandLine.h"

#include <string>
#include <string_view>

/// What a command does with one line of input.
class CLineHandler {
public:
  virtual ~CLineHandler() = default;
  /// Appends the line's answer and a line end to out, or nothing for a line that
  /// holds nothing to answer (blank, a comment). For a line that cannot be read,
  /// appends nothing and returns the problem ("cannot read note 'X5'") with the
  /// token it is about (a view into line); else returns the empty string.
  virtual std::string Handle(std::string_view line, long lineNr, bool json, std::string& out,
                             std::string_view& token) = 0;
};

/// How the loop runs.
struct CLineLoopSettings {
  TCommand Command = Cmd_Chord; // names the program in messages
  bool Json = false;            // problems also as {"line", "error", "token"} objects
  bool LineBuffered = false;    // write each answer at once (always on a terminal)
};

/// Hands every line of standard input (cut as std::getline cuts it: a last line
/// without a line end counts) to the handler, with its number from 1, and writes
/// the answers to standard output. A problem goes to standard error as "tonvex[
/// COMMAND]: line N: PROBLEM", the loop goes on. Returns the exit status: 0, or 1
/// when a line could not be read, or the input or the output failed.
int RunLineLoop(CLineHandler& handler, CLineLoopSettings const& settings);

#endif
