// tonvex [OPTIONS] NOTE...: names the chord of the notes; without notes, names the
// chord on every line of standard input.
#include "ChordNamer.h"
#include "Commands.h"
#include "KeyText.h"
#include "NoteToken.h"

#include <cstdio>
#include <unistd.h>

namespace {

// Reads --key, --root, --algo and --key-numbers. Returns -1 to go on, else the exit
// status after a usage error.
int ReadSettings(CommandLine const& line, ChordSettings& settings) {
  settings.Algo = line.RulesAlgo != 0 ? SCA_RULE_WEIGHTS : SCA_NEURONAL_NET;
  settings.KeyNumbers = line.KeyNumbers != 0;
  settings.Style = static_cast<TNameStyle>(line.Style < 0 ? Style_Native : line.Style);
  if (!line.Key.empty()) {
    if (!ReadKey(line.Key, settings.Key)) return UsageError(Cmd_Chord, KeyProblemText(line.Key));
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

// Whether the text could have been meant as a command word.
bool IsWord(std::string const& text) {
  for (char c : text)
    if (!((c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'))) return false;
  return text.size() > 2;
}

int NameOneChord(CChordNamer& namer, CommandLine const& line) {
  for (std::string const& operand : line.Operands) {
    std::string_view token;
    std::string problem = namer.Read(operand, token);
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
  return WriteOutput(Cmd_Chord, out, 0);
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
                     "the lowest octave; the Unicode sharp and flat signs are read as # and b) or a\n"
                     "note number 0..127; their order does not matter. With --german German names\n"
                     "are read too (Fis3, Es, As, B is B flat, H), with --solfege solfege names (Do3,\n"
                     "Mib, So#).\n"
                     "\n"
                     "Without NOTE, reads a chord from every line of standard input: notes separated\n"
                     "by blanks or commas, '#' begins a comment, lines without notes are skipped. Writes\n"
                     "a line per chord: its name, or with --json a JSON object that also carries the\n"
                     "line number. A line that cannot be read is reported on standard error with its\n"
                     "number (with --json also by an object {line, error, token} in its place); the\n"
                     "other lines are named. Output is written in large blocks, but what is pending\n"
                     "is written before the program waits for more input, so that a program writing\n"
                     "one line at a time gets each answer at once. A terminal is read only when '-'\n"
                     "is given.\n"
                     "\n"
                     "Chord options:\n"
                     "  --key KEY           also show the chord in KEY: harmonic function (Roman and\n"
                     "                      functional), closeness, the notes outside the key. KEY is\n"
                     "                      a tonic with an optional mode: C, Cm, F#m, Bb major,\n"
                     "                      Cmaj, Cmin, C minor; a small letter alone means minor\n"
                     "                      (c, f#, bb minor); with --german also Fis, fis, Es, B\n"
                     "  --root NOTE         name the chord over this root instead of finding one\n"
                     "  --algo net|rules    find the root with the built-in net (default) or the rules\n"
                     "  --key-numbers       read numbers 0..11 as key numbers (C = 0), the pitch\n"
                     "                      classes of the chord; note names are not read then\n"
                     "  --style native|leadsheet|harte  the name shown: the library's own name\n"
                     "                      (default), the lead-sheet symbol (C7, Am7/G) or the\n"
                     "                      Harte label (C:7, A:min7/b7)\n"
                     "  --json              write a JSON object per chord (name, symbol, label,\n"
                     "                      notes, root, bass, inversion and the other facts)\n"
                     "  --line-buffered     write each line's answer at once\n"
                     "\n"
                     "Naming options:\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp + OctaveOptionHelp + ChordNameOptionsHelp +
         "\n"
         "Commands:\n"
         "  note NAME...        read note names and show their numbers, spellings and names\n"
         "  scale KEY [TYPE]    show a scale's spelled degrees and key signature\n"
         "  key KEY             show a key's name, key signature and degrees\n"
         "  symbol SYMBOL...    read chord symbols (Cmaj7, F#m7b5/C, C:min7/b3) and show\n"
         "                      their notes\n"
         "  midi FILE...        write the chord timeline of MIDI files\n"
         "Run 'tonvex COMMAND --help' for the options of a command.\n"
         "\n"
         "Other options:\n" +
         GeneralOptionsHelp +
         "\n"
         "Exit status: 0 success; 1 some lines of the input could not be read, or the\n"
         "output could not be written; 2 a usage error (an unknown option, a note on the\n"
         "command line that cannot be read, options that conflict or an option given\n"
         "twice with different values).\n";
}

int RunChordCommand(CommandLine const& line) {
  ChordSettings settings;
  int status = ReadSettings(line, settings);
  if (status >= 0) return status;
  CChordNamer namer(settings);
  bool const fromInput = line.Operands.empty() || (line.Operands.size() == 1 && line.Operands[0] == "-");
  if (!fromInput) return NameOneChord(namer, line);
  if (line.Operands.empty() && isatty(STDIN_FILENO) != 0) return ShortUsage(Cmd_Chord);
  return RunLineLoop(namer, {Cmd_Chord, line.Json != 0, line.LineBuffered != 0});
}
