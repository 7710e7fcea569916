// The arguments of the tonvex program: a command word, its operands and options.
//
// Options may stand anywhere (before or after the command word and the operands);
// "--" ends them, so that later arguments are operands even if they start with '-'.
// An option's value follows it as the next argument or after '=' ("--maj7 j7",
// "--maj7=j7"). Each option applies to the commands that can use it; any other
// command rejects it, rather than ignoring it, so that a misplaced option is noticed.
#ifndef TONVEX_TOOLS_COMMANDLINE_H
#define TONVEX_TOOLS_COMMANDLINE_H

#include <string>
#include <vector>

using Args = std::vector<std::string>;

/// The commands, as bits so that an option can name the commands it applies to.
enum TCommand : unsigned {
  Cmd_Chord = 1u,
  Cmd_Note = 2u,
  Cmd_Scale = 4u,
  Cmd_Key = 8u,
  Cmd_Symbol = 16u,
  Cmd_Midi = 32u
};

/// Every command, the chord command first: the parser, the help and the generated
/// man page and shell completion go through this list.
constexpr TCommand CommandList[] = {Cmd_Chord, Cmd_Note, Cmd_Scale, Cmd_Key, Cmd_Symbol, Cmd_Midi};

struct CommandLine {
  TCommand Command = Cmd_Chord;
  /// The operands after the command word.
  Args Operands;
  int Help = 0;
  int Version = 0;

  // Naming preferences, applied by ApplyNamingPreferences.
  int German = 0;
  int Solfege = 0;
  int BIsH = 0;
  int BbIsB = 0;
  int MinorSmall = 0;
  int SeparateBlocks = 0;
  int Maj7ShownAs = 0; // 0 ma7, 1 j7, 2 maj7
  int OptionSep = 0;   // 0 slash, 1 parentheses
  int OctaveOf60 = 0;  // 0 octave 3, 1 octave 4, 2 octave 5
  int SlashAlways = 0; // 0 only for chords wider than an octave, 1 always
  int KeepLonelyBass = 0;

  // Chord settings.
  int RulesAlgo = 0; // 0 the built-in net finds the root, 1 the rules
  int Json = 0;
  int Style = -1; // the name shown: 0 native, 1 lead-sheet symbol, 2 Harte label; -1 not given
  int KeyNumbers = 0;
  int LineBuffered = 0;
  std::string Key;  // empty: no key
  std::string Root; // empty: find the root

  // Timeline settings (the midi command), read by ReadMidiSettings.
  int Format = 0; // 0 text, 1 lab, 2 json
  int Grid = 0;   // 0 auto, 1 beat, 2 bar (TChordGrid)
  int IncludeDrums = 0;
  std::string Tracks, ExcludeTracks, Channels, MinDuration;
  std::string Output, OutDir; // -o, --out-dir
};

/// Reads the arguments (without the program name) into line. Returns the empty
/// string on success, else a one-line description of the first problem (an unknown
/// option, a missing or unknown value, an option that does not apply to the
/// command, an option given twice with different values, options that conflict).
/// --help and --version are reported even when other options are wrong, so that
/// help is always reachable.
std::string ParseCommandLine(Args const& args, CommandLine& line);

/// Sets the process-wide naming preferences from the options.
void ApplyNamingPreferences(CommandLine const& line);

/// The command's name as typed ("note"); the empty string for the chord command.
const char* CommandName(TCommand command);

/// Prints "tonvex[ COMMAND]: <text>" on standard error.
void PrintProblem(TCommand command, std::string const& text);

/// An option of the table, for the generated shell completion.
struct COptionInfo {
  std::string Name;
  /// The values it takes ("ma7|j7|maj7"); empty for a flag or a free text value.
  std::string Choices;
  bool TakesValue = false;
};
/// The options that the command takes, in the order of the table.
std::vector<COptionInfo> OptionsOf(TCommand command);

/// Help text of the naming options, for the usage texts of the commands.
extern const char* const NoteNameOptionsHelp;  // --b-is-h, --bb-is-b
extern const char* const NameStyleOptionsHelp; // --german, --solfege
extern const char* const OctaveOptionHelp;     // --octave-of-60
extern const char* const ChordNameOptionsHelp; // chord name preferences
extern const char* const GeneralOptionsHelp;   // --help, --version

#endif
