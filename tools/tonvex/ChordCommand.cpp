// tonvex [OPTIONS] NOTE...: names the chord of the notes; without notes, names the
// chord on every line of standard input.
#include "ChordNamer.h"
#include "Commands.h"
#include "NoteToken.h"

#include <cerrno>
#include <cstdio>
#include <string_view>
#include <unistd.h>

namespace {

// Output is collected and written in blocks of about this size, and input read in
// blocks of this size.
constexpr std::size_t OutputBlock = 1 << 16;
constexpr std::size_t InputBlock = 1 << 16;

// Standard input cut into lines as std::getline cuts them: a last line without its
// line end counts, nothing after the last line end does. Read with read(2), which
// gives a pipe or file in whole blocks and a terminal a line as soon as it is typed.
class CLineReader {
public:
  /// The next line, without its line end, valid until the next call; false at the
  /// end of the input or when it could not be read (then Failed).
  bool Next(std::string_view& line) {
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

// KEY: a tonic (letter and accidental, no octave) and an optional "m" for minor; a
// small letter also means minor, as in "c" for C minor.
bool ReadKey(std::string const& text, CSignKey& key) {
  std::string tonic = text;
  bool minor = false;
  if (!tonic.empty() && tonic.back() == 'm') {
    tonic.pop_back();
    minor = true;
  }
  if (tonic.empty() || (tonic.back() >= '0' && tonic.back() <= '9')) return false;
  CNote root;
  if (ReadNoteName(tonic, root) != Token_Ok) return false;
  if (tonic[0] >= 'a' && tonic[0] <= 'h') minor = true;
  key = CSignKey(root, minor ? CSignKey::SignKey_Minor : CSignKey::SignKey_Major);
  return true;
}

// Reads --key, --root, --algo and --key-numbers. Returns -1 to go on, else the exit
// status after a usage error.
int ReadSettings(CommandLine const& line, ChordSettings& settings) {
  settings.Algo = line.RulesAlgo != 0 ? SCA_RULE_WEIGHTS : SCA_NEURONAL_NET;
  settings.KeyNumbers = line.KeyNumbers != 0;
  settings.Style = static_cast<TNameStyle>(line.Style < 0 ? Style_Native : line.Style);
  if (!line.Key.empty()) {
    if (!ReadKey(line.Key, settings.Key)) return UsageError(Cmd_Chord, "cannot read key '" + line.Key + "'");
    settings.HasKey = true;
  }
  if (!line.Root.empty()) {
    TTokenProblem problem = ReadNoteName(line.Root, settings.Root);
    if (problem != Token_Ok)
      return UsageError(Cmd_Chord, TokenProblemText(problem, Kind_NoteName, line.Root) + " (--root)");
    settings.HasRoot = true;
  }
  return -1;
}

bool Write(std::string const& text) { return std::fwrite(text.data(), 1, text.size(), stdout) == text.size(); }

// Flushes standard output; returns status, or 1 when the output could not be written.
int Finish(int status) {
  if (std::fflush(stdout) != 0 || std::ferror(stdout) != 0) {
    std::fputs("tonvex: cannot write the output\n", stderr);
    return 1;
  }
  return status;
}

// Whether the text could have been meant as a command word.
bool IsWord(std::string const& text) {
  for (char c : text)
    if (!((c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'))) return false;
  return text.size() > 2;
}

int NameOneChord(CChordNamer& namer, CommandLine const& line) {
  for (std::string const& operand : line.Operands) {
    std::string problem = namer.Read(operand);
    if (problem.empty()) continue;
    if (&operand == &line.Operands.front() && IsWord(operand))
      problem += " (the commands are note, scale, key, symbol and midi)";
    return UsageError(Cmd_Chord, problem);
  }
  if (namer.Empty()) return UsageError(Cmd_Chord, "no notes given");
  namer.Analyse();
  std::string out;
  if (line.Json != 0) {
    namer.AppendJson(out, 0);
    out += '\n';
  } else {
    namer.AppendReport(out);
  }
  Write(out);
  return Finish(0);
}

int NameChordsOfLines(CChordNamer& namer, bool json) {
  // Someone watching a terminal sees each name at once; a pipe gets full blocks.
  bool const eachLine = isatty(STDOUT_FILENO) != 0;
  CLineReader input;
  std::string_view text;
  std::string out;
  out.reserve(OutputBlock + 256);
  long lineNr = 0;
  int status = 0;
  while (input.Next(text)) {
    ++lineNr;
    std::string const problem = namer.NameLine(text, lineNr, json, out);
    if (!problem.empty()) {
      std::fprintf(stderr, "tonvex: line %ld: %s\n", lineNr, problem.c_str());
      status = 1;
      continue;
    }
    if (eachLine || out.size() >= OutputBlock) {
      if (!Write(out)) return Finish(1);
      if (eachLine) std::fflush(stdout);
      out.clear();
    }
  }
  if (input.Failed()) {
    std::fputs("tonvex: cannot read the standard input\n", stderr);
    status = 1;
  }
  Write(out);
  return Finish(status);
}

} // namespace

std::string ChordUsage() {
  return std::string("usage: tonvex [OPTIONS] NOTE...      name the chord of the notes\n"
                     "       tonvex [OPTIONS] [-] < FILE   name the chord on each line of FILE\n"
                     "       tonvex COMMAND [OPTIONS] ARGS...\n"
                     "\n"
                     "Names a chord: its name on the first line (exactly as the library writes it,\n"
                     "trailing blanks included), then its notes (spelled after the root), root, basic\n"
                     "chord, options, XG chord type and the signs of its key signature. A NOTE is a\n"
                     "note name (C4, Eb3, F#, Bbb2, H2; note 60 is C3, a name without octave lies in\n"
                     "the lowest octave) or a note number 0..127; their order does not matter.\n"
                     "\n"
                     "Without NOTE, reads a chord from every line of standard input: notes separated\n"
                     "by blanks or commas, '#' begins a comment, lines without notes are skipped. Writes\n"
                     "a line per chord: its name, or with --json a JSON object that also carries the\n"
                     "line number. A line that cannot be read is reported on standard error with its\n"
                     "number; the other lines are named. A terminal is read only when '-' is given.\n"
                     "\n"
                     "Chord options:\n"
                     "  --key KEY           also show the chord in KEY: harmonic function (Roman and\n"
                     "                      functional), closeness, the notes outside the key. KEY is\n"
                     "                      a tonic with an optional m for minor (C, F#m, Ebm); a small\n"
                     "                      letter means minor as well (c, f#, bb)\n"
                     "  --root NOTE         name the chord over this root instead of finding one\n"
                     "  --algo net|rules    find the root with the built-in net (default) or the rules\n"
                     "  --key-numbers       read numbers 0..11 as key numbers (C = 0), the pitch\n"
                     "                      classes of the chord; note names are not read then\n"
                     "  --style native|leadsheet|harte  the name shown: the library's own name\n"
                     "                      (default), the lead-sheet symbol (C7, Am7/G) or the\n"
                     "                      Harte label (C:7, A:min7/b7)\n"
                     "  --json              write a JSON object per chord (name, symbol and label)\n"
                     "\n"
                     "Naming options:\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp + OctaveOptionHelp + ChordNameOptionsHelp +
         "\n"
         "Commands:\n"
         "  note NAME...        read note names and show their numbers, spellings and names\n"
         "  scale ROOT TYPE     show a scale's spelled degrees and key signature\n"
         "  key ROOT [minor]    show a key's name, key signature and degrees\n"
         "  symbol SYMBOL...    read chord symbols (Cmaj7, F#m7b5/C, C:min7/b3) and show\n"
         "                      their notes\n"
         "  midi FILE...        write the chord timeline of MIDI files\n"
         "Run 'tonvex COMMAND --help' for the options of a command.\n"
         "\n"
         "  --help              show this text\n"
         "  --version           show the library version\n"
         "\n"
         "Exit status: 0 success; 1 some lines of the input could not be read, or the\n"
         "output could not be written; 2 a usage error (an unknown option, a note on the\n"
         "command line that cannot be read).\n";
}

int RunChordCommand(CommandLine const& line) {
  ChordSettings settings;
  int status = ReadSettings(line, settings);
  if (status >= 0) return status;
  CChordNamer namer(settings);
  bool const fromInput = line.Operands.empty() || (line.Operands.size() == 1 && line.Operands[0] == "-");
  if (!fromInput) return NameOneChord(namer, line);
  if (line.Operands.empty() && isatty(STDIN_FILENO) != 0) {
    std::fputs(ChordUsage().c_str(), stderr);
    return 2;
  }
  return NameChordsOfLines(namer, line.Json != 0);
}
