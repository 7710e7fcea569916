// Commands of the tonvex program. Each returns the process exit status: 0 success,
// 1 some input could not be read or the output could not be written, 2 a usage
// error (an unknown option, a missing or unreadable argument).
#ifndef TONVEX_TOOLS_COMMANDS_H
#define TONVEX_TOOLS_COMMANDS_H

#include "CommandLine.h"

#include <string>

int RunChordCommand(CommandLine const& line);
int RunNoteCommand(CommandLine const& line);
int RunScaleCommand(CommandLine const& line);
int RunKeyCommand(CommandLine const& line);
int RunSymbolCommand(CommandLine const& line);
int RunMidiCommand(CommandLine const& line);

/// The help texts (standard output for --help, standard error after a usage error).
std::string ChordUsage(); // the program's help: the chord command and the list of commands
std::string NoteUsage();
std::string ScaleUsage();
std::string KeyUsage();
std::string SymbolUsage();
std::string MidiUsage();

/// The version of the library the program runs with: "103.4".
std::string ProgramVersion();

/// The command's help text.
std::string UsageOf(TCommand command);
/// Prints the usage lines of the command's help and where to find the rest on
/// standard error; returns 2 (for a command called without what it needs).
int ShortUsage(TCommand command);

/// Prints "tonvex[ COMMAND]: <text>" on standard error; returns 2.
int UsageError(TCommand command, std::string const& text);

/// Writes text to standard output; returns status, or 1 after saying so on
/// standard error when the output could not be written.
int WriteOutput(TCommand command, std::string const& text, int status);

#endif
