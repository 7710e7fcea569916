// The training log: header, time-stamped and plain lines, appending, failures.
#include "support/TempFile.h"

#include "training/LogWriter.h"

#include <gtest/gtest.h>

#include <regex>
#include <sstream>
#include <string>
#include <vector>

namespace {

const std::string Dashes(64, '-');
const std::string Separator = "  \t\t\t\t\t\t\t\t\t| ";
const std::regex TimeText("[A-Z][a-z]{2} [A-Z][a-z]{2} [ 0-9][0-9] [0-9]{2}:[0-9]{2}:[0-9]{2} [0-9]{4}");

std::vector<std::string> Lines(std::string const& text) {
  std::vector<std::string> lines;
  std::istringstream in(text);
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  return lines;
}

TEST(LogWriter, TimeIsAsctimeText) {
  const std::string time = LogWriter::get_time();
  ASSERT_EQ(time.size(), 25u);
  EXPECT_EQ(time.back(), '\n');
  EXPECT_TRUE(std::regex_match(time.substr(0, 24), TimeText)) << time;
}

TEST(LogWriter, HeaderAndLines) {
  TempFile file("log");
  file.Write("old contents\n");
  {
    LogWriter log;
    log.open(file.Path());
    ASSERT_TRUE(log.good());
    log.append("x");
    log.append_plain("plain");
    log.append_timestamp();
    log.close();
    EXPECT_TRUE(log.good());
  }
  const std::string text = file.Read();
  EXPECT_EQ(text.back(), '\n');
  const std::vector<std::string> lines = Lines(text);
  ASSERT_EQ(lines.size(), 9u) << text;
  EXPECT_EQ(lines[0], Dashes);
  ASSERT_EQ(lines[1].rfind("New log created on ", 0), 0u);
  EXPECT_TRUE(std::regex_match(lines[1].substr(19), TimeText)) << lines[1];
  EXPECT_EQ(lines[2], "") << "the time keeps its own line end";
  EXPECT_EQ(lines[3], Dashes);
  EXPECT_TRUE(std::regex_match(lines[4], TimeText)) << lines[4];
  EXPECT_EQ(lines[5], Separator + "x");
  EXPECT_EQ(lines[6], "plain");
  EXPECT_TRUE(std::regex_match(lines[7], TimeText)) << lines[7];
  EXPECT_EQ(lines[8], "") << "append_timestamp leaves an empty line";
  EXPECT_EQ(text.find("old contents"), std::string::npos) << "open replaces the file";
}

TEST(LogWriter, AppendKeepsContentsWithoutHeader) {
  TempFile file("log");
  file.Write("first\n");
  LogWriter log;
  log.open_for_append(file.Path());
  ASSERT_TRUE(log.good());
  log.append_plain("second");
  log.close();
  EXPECT_EQ(file.Read(), "first\nsecond\n");
}

TEST(LogWriter, FailuresSetFailbit) {
  LogWriter log;
  log.open("/nonexistent/tonvex/dir/log.txt");
  EXPECT_TRUE(log.fail());
  log.append("ignored");
  EXPECT_TRUE(log.fail());

  LogWriter appending;
  appending.open_for_append("/nonexistent/tonvex/dir/log.txt");
  EXPECT_TRUE(appending.fail());

  LogWriter neverOpened;
  neverOpened.close();
  EXPECT_TRUE(neverOpened.fail()) << "closing what is not open fails";

  // A failed open followed by a good one starts clean.
  TempFile file("log");
  log.open(file.Path());
  EXPECT_TRUE(log.good());
}

} // namespace
