// Plain-text log file of the training tools (internal, not exported).
//
// A LogWriter is an output file stream with a few log operations on top; it writes
// through the stream operators on itself, and the stream's error state is the only
// failure report: a file that cannot be opened or closed sets failbit, and later
// writes then do nothing.
#ifndef TONVEX_TRAINING_LOGWRITER_H
#define TONVEX_TRAINING_LOGWRITER_H

#include <fstream>
#include <string>

class LogWriter : public std::ofstream {
public:
  /// Opens the file for output, replacing its contents, and writes the header: a
  /// line of 64 dashes, "New log created on " with get_time(), 64 dashes again. The
  /// time keeps its own line end, so an empty line stands before the second dashes.
  /// The header is written even when opening fails (into the failed stream).
  void open(std::string const& path);
  /// Opens the file for appending, keeping its contents; writes no header.
  void open_for_append(std::string const& path);
  /// get_time(), the separator "  \t\t\t\t\t\t\t\t\t| " and the text, then a line end.
  /// The time ends in its own line end, so separator and text begin the next line.
  void append(std::string const& text);
  /// The text and a line end.
  void append_plain(std::string const& text);
  /// get_time() and a line end (which leaves an empty line after the time).
  void append_timestamp();
  /// The local time as asctime writes it: 24 characters and a newline.
  static std::string get_time();
  /// Closes the file (std::ofstream::close); a failure sets failbit.
  using std::ofstream::close;

private:
  // Opens with `mode`; clears the state on success, sets failbit on failure.
  void OpenWithMode(std::string const& path, std::ios::openmode mode);
};

#endif
