#include "training/LogWriter.h"

#include "nnet/LocalTime.h"

namespace {

const std::string Dashes(64, '-');
constexpr char const* Separator = "  \t\t\t\t\t\t\t\t\t| ";

} // namespace

void LogWriter::OpenWithMode(std::string const& path, std::ios::openmode mode) {
  std::ofstream::open(path, mode);
  if (is_open())
    clear();
  else
    setstate(std::ios::failbit);
}

void LogWriter::open(std::string const& path) {
  OpenWithMode(path, std::ios::out | std::ios::trunc);
  *this << Dashes << std::endl;
  *this << "New log created on " << get_time() << std::endl;
  *this << Dashes << std::endl;
}

void LogWriter::open_for_append(std::string const& path) { OpenWithMode(path, std::ios::out | std::ios::app); }

void LogWriter::append(std::string const& text) { *this << get_time() << Separator << text << std::endl; }

void LogWriter::append_plain(std::string const& text) { *this << text << std::endl; }

void LogWriter::append_timestamp() { *this << get_time() << std::endl; }

std::string LogWriter::get_time() { return LocalTimeText(); }
