// tonvex symbol SYMBOL...: reads chord symbols (lead-sheet symbols and Harte labels)
// and shows their notes; without symbols, reads one from every line of standard
// input.
#include "ChordNamer.h"
#include "Commands.h"
#include "JsonWriter.h"
#include "LineLoop.h"
#include "QuotedText.h"

#include <tonvex/ChordSymbol.h>
#include <tonvex/ChordnamePref.h>

#include <cstdio>
#include <unistd.h>

namespace {

std::string ProblemText(std::string_view symbol, CChordSymbolProblem const& problem) {
  return "cannot read chord symbol " + Quoted(symbol) + ": " + problem.Reason + " at offset " +
         std::to_string(problem.Offset) + " (" + Quoted(problem.Part) + ")";
}

std::string KeyName(CNote const& note) { return note.KeyName(DefaultChordnamePref); }

// "Cmaj7: notes C E G B, pitch classes 0 4 7 11, root C, bass C"
void AppendFacts(std::string& out, std::string_view symbol, CChord const& chord) {
  out += symbol;
  if (chord.IsUndefined()) {
    out += ": no chord\n";
    return;
  }
  out += ": notes";
  for (CNote const& note : chord.Notes()) out += ' ' + KeyName(note);
  out += ", pitch classes";
  for (int keyNr : chord.KeyNrSet()) out += ' ' + std::to_string(keyNr);
  out += ", root " + KeyName(chord.RootNote()) + ", bass " + KeyName(chord.LowestNote()) + '\n';
}

void AppendJson(std::string& out, std::string_view symbol, CChord const& chord, long lineNr) {
  CJsonWriter json(out);
  bool const defined = !chord.IsUndefined();
  json.BeginObject();
  if (lineNr > 0) {
    json.Key("line");
    json.Int(lineNr);
  }
  json.Key("symbol");
  json.String(symbol);
  json.Key("notes");
  json.BeginArray();
  for (CNote const& note : chord.Notes()) json.String(KeyName(note));
  json.EndArray();
  json.Key("pitch_classes");
  json.BeginArray();
  if (defined)
    for (int keyNr : chord.KeyNrSet()) json.Int(keyNr);
  json.EndArray();
  AppendJsonNote(json, "root", chord.RootNote(), defined);
  AppendJsonNote(json, "bass", chord.LowestNote(), defined);
  json.EndObject();
  out += '\n';
}

void Append(std::string& out, std::string_view symbol, CChord const& chord, bool json, long lineNr) {
  if (json)
    AppendJson(out, symbol, chord, lineNr);
  else
    AppendFacts(out, symbol, chord);
}

// The symbol of a line: without the comment ('#' at the start or after a blank,
// outside parentheses, so that "C#" and "C7(b9, #11)" stay whole) and the blanks.
std::string_view SymbolOfLine(std::string_view line) {
  int depth = 0;
  for (std::size_t i = 0; i < line.size(); ++i) {
    char const c = line[i];
    depth += c == '(' ? 1 : c == ')' ? -1 : 0;
    if (c == '#' && depth <= 0 && (i == 0 || line[i - 1] == ' ' || line[i - 1] == '\t')) {
      line = line.substr(0, i);
      break;
    }
  }
  std::size_t const first = line.find_first_not_of(" \t\r");
  if (first == std::string_view::npos) return {};
  return line.substr(first, line.find_last_not_of(" \t\r") - first + 1);
}

// A symbol on every line.
class CSymbolLines : public CLineHandler {
public:
  std::string Handle(std::string_view line, long lineNr, bool json, std::string& out,
                     std::string_view& token) override {
    std::string_view const symbol = SymbolOfLine(line);
    if (symbol.empty()) return std::string();
    CChordSymbolProblem problem;
    if (!ReadChordSymbol(symbol, Chord_, &problem)) {
      token = symbol;
      return ProblemText(symbol, problem);
    }
    Append(out, symbol, Chord_, json, lineNr);
    return std::string();
  }

private:
  CChord Chord_;
};

} // namespace

std::string SymbolUsage() {
  return std::string("usage: tonvex symbol [OPTIONS] SYMBOL...\n"
                     "       tonvex symbol [OPTIONS] [-] < FILE\n"
                     "\n"
                     "Reads chord symbols, lead-sheet symbols (C, Am7, F#m7b5/C, Bb13, C7(b9,#11),\n"
                     "Cadd9, C/E) or Harte labels (C:maj, C:min7/b3, C:(3,5,b7,#9)), and prints for\n"
                     "each its notes from the bass up (spelled by their degrees), its pitch classes\n"
                     "(key numbers, C = 0), its root and its bass. N and N.C. are no chord. Symbols\n"
                     "are read in English letters (B is B natural); the naming options below apply\n"
                     "to the names printed.\n"
                     "\n"
                     "Without SYMBOL, reads a symbol from every line of standard input ('#' at the\n"
                     "start or after a blank begins a comment, blank lines are skipped); a line\n"
                     "that cannot be read is reported on standard error with its number (with\n"
                     "--json also by an object {line, error, token} in its place) and the other\n"
                     "lines go on (exit status 1). Each answer is written before the program waits\n"
                     "for more input. A terminal is read only when '-' is given.\n"
                     "\n"
                     "Options:\n"
                     "  --json              write a JSON object per symbol: symbol, notes,\n"
                     "                      pitch_classes, root and bass ({name, key_number})\n"
                     "  --line-buffered     write each line's answer at once\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp + GeneralOptionsHelp;
}

int RunSymbolCommand(CommandLine const& line) {
  Args const& args = line.Operands;
  bool const json = line.Json != 0;
  if (args.empty() || (args.size() == 1 && args[0] == "-")) {
    if (args.empty() && isatty(STDIN_FILENO) != 0) return ShortUsage(Cmd_Symbol);
    CSymbolLines handler;
    return RunLineLoop(handler, {Cmd_Symbol, json, line.LineBuffered != 0});
  }
  // Every symbol is read before any is shown, so that a bad one shows nothing.
  std::vector<CChord> chords(args.size());
  for (std::size_t i = 0; i < args.size(); ++i) {
    CChordSymbolProblem problem;
    if (!ReadChordSymbol(args[i], chords[i], &problem)) return UsageError(Cmd_Symbol, ProblemText(args[i], problem));
  }
  std::string out;
  for (std::size_t i = 0; i < args.size(); ++i) Append(out, args[i], chords[i], json, 0);
  return WriteOutput(Cmd_Symbol, out, 0);
}
