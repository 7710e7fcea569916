#include "LineLoop.h"

#include "Commands.h"
#include "JsonWriter.h"
#include "QuotedText.h"

#include <cerrno>
#include <unistd.h>

namespace {

// Output is written in blocks of about this size, input read in blocks of this size.
constexpr std::size_t OutputBlock = 1 << 16;
constexpr std::size_t InputBlock = 1 << 16;

// Writes text to standard output with write(2); false when that failed.
bool WriteAll(std::string_view text) {
  while (!text.empty()) {
    ssize_t const count = write(STDOUT_FILENO, text.data(), text.size());
    if (count < 0 && errno == EINTR) continue;
    if (count <= 0) return false;
    text.remove_prefix(static_cast<std::size_t>(count));
  }
  return true;
}

// Standard output, written from a block of pending text.
class CBlockOutput {
public:
  CBlockOutput() { Text.reserve(OutputBlock + 256); }
  /// Writes the pending text; false when the output failed.
  bool Flush() {
    if (!WriteAll(Text)) return false;
    Text.clear();
    return true;
  }
  std::string Text;
};

// Standard input cut into lines, read with read(2), which gives a pipe or file in
// whole blocks and a terminal a line as soon as it is typed.
class CLineReader {
public:
  /// The next line, without its line end, valid until the next call; false at the
  /// end of the input or when it could not be read (then Failed). Before a read
  /// that may wait, output's pending text is written; false too when that fails.
  bool Next(std::string_view& line, CBlockOutput& output) {
    for (;;) {
      // Only what has not been searched yet: a long line costs no more than its length.
      std::size_t const end = Text_.find('\n', Searched_);
      if (end != std::string::npos) {
        line = std::string_view(Text_).substr(Start_, end - Start_);
        Start_ = Searched_ = end + 1;
        return true;
      }
      Searched_ = Text_.size();
      if (AtEnd_) {
        if (Failed_ || Start_ == Text_.size()) return false;
        line = std::string_view(Text_).substr(Start_);
        Start_ = Text_.size();
        return true;
      }
      // The unfinished line moves to the front and the next block follows it.
      Text_.erase(0, Start_);
      Searched_ -= Start_;
      Start_ = 0;
      if (!output.Flush()) return false;
      Read();
    }
  }
  bool Failed() const { return Failed_; }

private:
  void Read() {
    std::size_t const kept = Text_.size();
    Text_.resize(kept + InputBlock);
    ssize_t count = 0;
    do count = read(STDIN_FILENO, Text_.data() + kept, InputBlock);
    while (count < 0 && errno == EINTR);
    Text_.resize(kept + static_cast<std::size_t>(count > 0 ? count : 0));
    AtEnd_ = count <= 0;
    Failed_ = count < 0;
  }

  std::string Text_;
  std::size_t Start_ = 0;    ///< where the next line begins
  std::size_t Searched_ = 0; ///< Text_ holds no line end before this
  bool AtEnd_ = false;
  bool Failed_ = false;
};

void AppendErrorObject(std::string& out, long lineNr, std::string const& problem, std::string_view token) {
  CJsonWriter json(out);
  json.BeginObject();
  json.Key("line");
  json.Int(lineNr);
  json.Key("error");
  json.String(problem);
  json.Key("token");
  json.String(ShortText(token));
  json.EndObject();
  out += '\n';
}

} // namespace

int WriteOutput(TCommand command, std::string const& text, int status) {
  if (WriteAll(text)) return status;
  PrintProblem(command, "cannot write the output");
  return 1;
}

int RunLineLoop(CLineHandler& handler, CLineLoopSettings const& settings) {
  // Someone watching a terminal sees each answer next to its problems at once.
  bool const eachLine = settings.LineBuffered || isatty(STDOUT_FILENO) != 0;
  CBlockOutput output;
  CLineReader input;
  std::string_view line;
  long lineNr = 0;
  int status = 0;
  bool written = true;
  while (written && input.Next(line, output)) {
    ++lineNr;
    std::string_view token;
    std::string const problem = handler.Handle(line, lineNr, settings.Json, output.Text, token);
    if (!problem.empty()) {
      PrintProblem(settings.Command, "line " + std::to_string(lineNr) + ": " + problem);
      if (settings.Json) AppendErrorObject(output.Text, lineNr, problem, token);
      status = 1;
    }
    if (eachLine || output.Text.size() >= OutputBlock) written = output.Flush();
  }
  if (input.Failed()) {
    PrintProblem(settings.Command, "cannot read the standard input");
    status = 1;
  }
  if (!written || !output.Flush()) {
    PrintProblem(settings.Command, "cannot write the output");
    status = 1;
  }
  return status;
}
