// A file path in the temporary directory, unique to the running test and process,
// removed when the test ends.
#ifndef TONVEX_TESTS_TEMPFILE_H
#define TONVEX_TESTS_TEMPFILE_H

#include "support/TestPrelude.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <unistd.h>

class TempFile {
public:
  explicit TempFile(std::string const& tag = "file") {
    ::testing::TestInfo const* info = ::testing::UnitTest::GetInstance()->current_test_info();
    std::string name = std::string(info->test_suite_name()) + "_" + info->name(); // "/" in parameterised tests
    std::replace(name.begin(), name.end(), '/', '_');
    path_ = (std::filesystem::temp_directory_path() / ("tonvex_" + name + "_" + tag + "_" + std::to_string(::getpid())))
                .string();
  }
  ~TempFile() {
    std::error_code ignored;
    std::filesystem::remove(path_, ignored);
  }
  TempFile(TempFile const&) = delete;
  TempFile& operator=(TempFile const&) = delete;

  std::string const& Path() const { return path_; }
  char const* CPath() const { return path_.c_str(); }
  void Write(std::string const& text) const { std::ofstream(path_, std::ios::binary) << text; }
  std::string Read() const {
    std::ifstream in(path_, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
  }

private:
  std::string path_;
};

#endif
