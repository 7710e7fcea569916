// tonvex symbol SYMBOL...: reads chord symbols (lead-sheet symbols and Harte labels)
// and shows their notes; without symbols, reads one from every line of standard
// input.
#include "ChordNamer.h"
#include "Commands.h"
#include "JsonWriter.h"

#include <tonvex/ChordSymbol.h>
#include <tonvex/ChordnamePref.h>

#include <cstdio>
#include <iostream>
#include <unistd.h>

namespace {

// A text quoted for a message: control bytes escaped as \xNN, cut after 40 bytes at
// the start of a character.
std::string Quoted(std::string_view text) {
  static char const Hex[] = "0123456789abcdef";
  std::string quoted = "'";
  std::size_t end = text.size() > 40 ? 40 : text.size();
  while (end < text.size() && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80) --end;
  for (char c : text.substr(0, end)) {
    auto const byte = static_cast<unsigned char>(c);
    if (byte < 0x20 || byte == 0x7f || c == '\\') {
      quoted += "\\x";
      quoted += Hex[byte >> 4];
      quoted += Hex[byte & 0xf];
    } else {
      quoted += c;
    }
  }
  return quoted + (end < text.size() ? "...'" : "'");
}

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

bool Write(std::string const& text) { return std::fwrite(text.data(), 1, text.size(), stdout) == text.size(); }

int Finish(int status) {
  if (std::fflush(stdout) != 0 || std::ferror(stdout) != 0) {
    std::fputs("tonvex symbol: cannot write the output\n", stderr);
    return 1;
  }
  return status;
}

int ReadSymbolsOfLines(bool json) {
  std::ios::sync_with_stdio(false);
  bool const eachLine = isatty(STDOUT_FILENO) != 0;
  std::string text, out;
  long lineNr = 0;
  int status = 0;
  CChord chord;
  while (std::getline(std::cin, text)) {
    ++lineNr;
    std::string_view const symbol = SymbolOfLine(text);
    if (symbol.empty()) continue;
    CChordSymbolProblem problem;
    if (!ReadChordSymbol(symbol, chord, &problem)) {
      std::fprintf(stderr, "tonvex symbol: line %ld: %s\n", lineNr, ProblemText(symbol, problem).c_str());
      status = 1;
      continue;
    }
    Append(out, symbol, chord, json, lineNr);
    if (eachLine || out.size() >= (1 << 16)) {
      if (!Write(out)) return Finish(1);
      if (eachLine) std::fflush(stdout);
      out.clear();
    }
  }
  if (std::cin.bad()) {
    std::fputs("tonvex symbol: cannot read the standard input\n", stderr);
    status = 1;
  }
  Write(out);
  return Finish(status);
}

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
                     "that cannot be read is reported on standard error with its number and the\n"
                     "other lines go on (exit status 1). A terminal is read only when '-' is given.\n"
                     "\n"
                     "Options:\n"
                     "  --json              write a JSON object per symbol: symbol, notes,\n"
                     "                      pitch_classes, root and bass ({name, key_number})\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp;
}

int RunSymbolCommand(CommandLine const& line) {
  Args const& args = line.Operands;
  bool const json = line.Json != 0;
  if (args.empty() || (args.size() == 1 && args[0] == "-")) {
    if (args.empty() && isatty(STDIN_FILENO) != 0) {
      std::fputs(SymbolUsage().c_str(), stderr);
      return 2;
    }
    return ReadSymbolsOfLines(json);
  }
  // Every symbol is read before any is shown, so that a bad one shows nothing.
  std::vector<CChord> chords(args.size());
  for (std::size_t i = 0; i < args.size(); ++i) {
    CChordSymbolProblem problem;
    if (!ReadChordSymbol(args[i], chords[i], &problem)) return UsageError(Cmd_Symbol, ProblemText(args[i], problem));
  }
  std::string out;
  for (std::size_t i = 0; i < args.size(); ++i) Append(out, args[i], chords[i], json, 0);
  Write(out);
  return Finish(0);
}
