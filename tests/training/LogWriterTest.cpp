// The training log: header, time-stamped and plain lines, appending.
#include "support/TempFile.h"
#include "support/TestPrelude.h"

#include "training/LogWriter.h"

#include <regex>

namespace {

TEST(LogWriter, HeaderAndLines) {
  TempFile file("log");
  file.Write("old contents\n");
  LogWriter log;
  log.open(file.Path()); // replaces the file
  log.append("x");
  log.append_plain("plain");
  log.append_timestamp(); // the time keeps its own line end: an empty line follows
  log.close();
  EXPECT_TRUE(log.good());
  std::string const time = "[A-Z][a-z]{2} [A-Z][a-z]{2} [ 0-9][0-9] [0-9]{2}:[0-9]{2}:[0-9]{2} [0-9]{4}\n";
  std::string const dashes(64, '-');
  EXPECT_TRUE(std::regex_match(file.Read(), std::regex(dashes + "\nNew log created on " + time + "\n" + dashes + "\n" +
                                                       time + "  \t\t\t\t\t\t\t\t\t\\| x\nplain\n" + time + "\n")))
      << file.Read();
  EXPECT_TRUE(std::regex_match(LogWriter::get_time(), std::regex(time)));
  file.Write("first\n");
  log.open_for_append(file.Path()); // keeps the contents, writes no header
  log.append_plain("second");
  log.close();
  EXPECT_EQ(file.Read(), "first\nsecond\n");
}

} // namespace
