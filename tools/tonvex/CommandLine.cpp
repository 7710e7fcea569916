#include "CommandLine.h"
#include "Commands.h"
#include "QuotedText.h"

#include <tonvex/ChordnamePref.h>
#include <tonvex/TonvexVersion.h>

#include <charconv>
#include <cstdio>
#include <cstring>

namespace {

constexpr unsigned AllCommands = Cmd_Chord | Cmd_Note | Cmd_Scale | Cmd_Key | Cmd_Symbol | Cmd_Midi;
constexpr unsigned NamedNotes = Cmd_Chord | Cmd_Scale | Cmd_Key | Cmd_Symbol | Cmd_Midi;
constexpr unsigned NamedChords = Cmd_Chord | Cmd_Midi;

// An option either stores 1 (a flag), the index of its value among the choices, or
// its value as text.
struct OptionSpec {
  const char* Name;
  unsigned Commands;
  int CommandLine::*Setting;
  const char* Choices; // nullptr for a flag; "a|b|c": value "b" stores 1
  std::string CommandLine::*Text;
};

const OptionSpec Options[] = {
    {"--help", AllCommands, &CommandLine::Help, nullptr, nullptr},
    {"-h", AllCommands, &CommandLine::Help, nullptr, nullptr},
    {"--version", AllCommands, &CommandLine::Version, nullptr, nullptr},
    {"--german", NamedNotes, &CommandLine::German, nullptr, nullptr},
    {"--solfege", NamedNotes, &CommandLine::Solfege, nullptr, nullptr},
    {"--b-is-h", AllCommands, &CommandLine::BIsH, nullptr, nullptr},
    {"--bb-is-b", AllCommands, &CommandLine::BbIsB, nullptr, nullptr},
    {"--octave-of-60", Cmd_Chord | Cmd_Note, &CommandLine::OctaveOf60, "3|4|5", nullptr},
    {"--minor-small", NamedChords, &CommandLine::MinorSmall, nullptr, nullptr},
    {"--separate-blocks", NamedChords, &CommandLine::SeparateBlocks, nullptr, nullptr},
    {"--maj7", NamedChords, &CommandLine::Maj7ShownAs, "ma7|j7|maj7", nullptr},
    {"--option-sep", NamedChords, &CommandLine::OptionSep, "slash|paren", nullptr},
    {"--slash", NamedChords, &CommandLine::SlashAlways, "narrow|always", nullptr},
    {"--no-omit-lonely-bass", NamedChords, &CommandLine::KeepLonelyBass, nullptr, nullptr},
    {"--key", Cmd_Chord, nullptr, nullptr, &CommandLine::Key},
    {"--root", Cmd_Chord, nullptr, nullptr, &CommandLine::Root},
    {"--algo", NamedChords, &CommandLine::RulesAlgo, "net|rules", nullptr},
    {"--key-numbers", Cmd_Chord, &CommandLine::KeyNumbers, nullptr, nullptr},
    {"--json", Cmd_Chord | Cmd_Symbol, &CommandLine::Json, nullptr, nullptr},
    {"--line-buffered", Cmd_Chord | Cmd_Symbol, &CommandLine::LineBuffered, nullptr, nullptr},
    {"--style", NamedChords, &CommandLine::Style, "native|leadsheet|harte", nullptr},
    {"--format", Cmd_Midi, &CommandLine::Format, "text|lab|json", nullptr},
    {"--grid", Cmd_Midi, &CommandLine::Grid, "auto|beat|bar", nullptr},
    {"--include-drums", Cmd_Midi, &CommandLine::IncludeDrums, nullptr, nullptr},
    {"--tracks", Cmd_Midi, nullptr, nullptr, &CommandLine::Tracks},
    {"--exclude-tracks", Cmd_Midi, nullptr, nullptr, &CommandLine::ExcludeTracks},
    {"--channels", Cmd_Midi, nullptr, nullptr, &CommandLine::Channels},
    {"--min-duration", Cmd_Midi, nullptr, nullptr, &CommandLine::MinDuration},
    {"-o", Cmd_Midi, nullptr, nullptr, &CommandLine::Output},
    {"--out-dir", Cmd_Midi, nullptr, nullptr, &CommandLine::OutDir},
};

OptionSpec const* FindOption(std::string const& name) {
  for (OptionSpec const& spec : Options)
    if (name == spec.Name) return &spec;
  return nullptr;
}

bool TakesValue(OptionSpec const& spec) { return spec.Choices != nullptr || spec.Text != nullptr; }

// "ma7, j7 or maj7".
std::string ChoiceList(const char* choices) {
  std::string list = choices;
  std::size_t last = list.rfind('|');
  if (last != std::string::npos) list.replace(last, 1, " or ");
  for (std::size_t bar = list.find('|'); bar != std::string::npos; bar = list.find('|')) list.replace(bar, 1, ", ");
  return list;
}

// Index of value among the '|'-separated choices, or -1.
int ChoiceIndex(const char* choices, std::string const& value) {
  int index = 0;
  for (const char* word = choices;; ++index) {
    const char* end = std::strchr(word, '|');
    std::size_t length = end != nullptr ? static_cast<std::size_t>(end - word) : std::strlen(word);
    if (value.size() == length && value.compare(0, length, word, length) == 0) return index;
    if (end == nullptr) return -1;
    word = end + 1;
  }
}

struct GivenOption {
  OptionSpec const* Spec;
  std::string Value;
};

// Stores one option's value; returns the problem, if any.
std::string StoreOption(GivenOption const& given, CommandLine& line) {
  OptionSpec const& spec = *given.Spec;
  if (spec.Text != nullptr) {
    if (given.Value.empty()) return std::string("option '") + spec.Name + "' needs a value";
    line.*spec.Text = given.Value;
  } else if (spec.Choices != nullptr) {
    int index = ChoiceIndex(spec.Choices, given.Value);
    if (index < 0)
      return std::string("option '") + spec.Name + "' takes " + ChoiceList(spec.Choices) + ", not " +
             Quoted(given.Value);
    line.*spec.Setting = index;
  } else {
    line.*spec.Setting = 1;
  }
  return std::string();
}

} // namespace

const char* CommandName(TCommand command) {
  switch (command) {
  case Cmd_Chord: return "";
  case Cmd_Note: return "note";
  case Cmd_Scale: return "scale";
  case Cmd_Key: return "key";
  case Cmd_Symbol: return "symbol";
  case Cmd_Midi: return "midi";
  }
  return "";
}

void PrintProblem(TCommand command, std::string const& text) {
  const char* name = CommandName(command);
  std::fprintf(stderr, "tonvex%s%s: %s\n", *name != '\0' ? " " : "", name, text.c_str());
}

std::string ProgramVersion() {
  char text[32];
  auto const written = std::to_chars(text, text + sizeof text, TonvexVersionNumber);
  return std::string(text, written.ptr);
}

std::string UsageOf(TCommand command) {
  switch (command) {
  case Cmd_Note: return NoteUsage();
  case Cmd_Scale: return ScaleUsage();
  case Cmd_Key: return KeyUsage();
  case Cmd_Symbol: return SymbolUsage();
  case Cmd_Midi: return MidiUsage();
  case Cmd_Chord: break;
  }
  return ChordUsage();
}

int ShortUsage(TCommand command) {
  std::string const help = UsageOf(command);
  const char* name = CommandName(command);
  std::fprintf(stderr, "%sRun 'tonvex%s%s --help' for more.\n", help.substr(0, help.find("\n\n") + 1).c_str(),
               *name != '\0' ? " " : "", name);
  return 2;
}

int UsageError(TCommand command, std::string const& text) {
  PrintProblem(command, text);
  return 2;
}

std::vector<COptionInfo> OptionsOf(TCommand command) {
  std::vector<COptionInfo> options;
  for (OptionSpec const& spec : Options)
    if ((spec.Commands & command) != 0)
      options.push_back({spec.Name, spec.Choices != nullptr ? spec.Choices : "", TakesValue(spec)});
  return options;
}

std::string ParseCommandLine(Args const& args, CommandLine& line) {
  std::string problem;
  std::vector<GivenOption> given;
  Args operands;
  bool optionsEnded = false;
  for (std::size_t i = 0; i < args.size(); ++i) {
    std::string const& arg = args[i];
    // "-" (standard input) and negative numbers are operands, not options.
    bool isOption = !optionsEnded && arg.size() > 1 && arg[0] == '-' && !(arg[1] >= '0' && arg[1] <= '9');
    if (!isOption) {
      operands.push_back(arg);
      continue;
    }
    if (arg == "--") {
      optionsEnded = true;
      continue;
    }
    std::size_t equals = arg.find('=');
    std::string name = arg.substr(0, equals);
    OptionSpec const* spec = FindOption(name);
    if (spec == nullptr) {
      if (problem.empty()) problem = "unknown option " + Quoted(name);
      continue;
    }
    GivenOption option{spec, std::string()};
    if (equals != std::string::npos) {
      option.Value = arg.substr(equals + 1);
      if (!TakesValue(*spec) && problem.empty()) problem = "option '" + name + "' takes no value";
    } else if (TakesValue(*spec)) {
      if (i + 1 < args.size())
        option.Value = args[++i];
      else if (problem.empty())
        problem = "option '" + name + "' needs a value" +
                  (spec->Choices != nullptr ? std::string(": ") + ChoiceList(spec->Choices) : std::string());
    }
    given.push_back(option);
  }

  std::size_t first = 0;
  if (!operands.empty()) {
    for (TCommand command : CommandList)
      if (command != Cmd_Chord && operands[0] == CommandName(command)) {
        line.Command = command;
        first = 1;
      }
  }
  line.Operands.assign(operands.begin() + static_cast<std::ptrdiff_t>(first), operands.end());

  for (std::size_t k = 0; k < given.size(); ++k) {
    GivenOption const& option = given[k];
    std::string stored;
    if ((option.Spec->Commands & line.Command) == 0)
      stored = std::string("option '") + option.Spec->Name + "' does not apply to this command";
    else
      stored = StoreOption(option, line);
    // A value given again must be the same: the last one silently winning would
    // hide a mistake.
    for (std::size_t earlier = 0; earlier < k && stored.empty(); ++earlier)
      if (given[earlier].Spec == option.Spec && given[earlier].Value != option.Value)
        stored = std::string("option '") + option.Spec->Name + "' is given twice, as " + Quoted(given[earlier].Value) +
                 " and as " + Quoted(option.Value);
    if (problem.empty()) problem = stored;
  }
  if (problem.empty() && line.German != 0 && line.Solfege != 0)
    problem = "options '--german' and '--solfege' do not go together";
  if (line.Help != 0 || line.Version != 0) return std::string();
  return problem;
}

void ApplyNamingPreferences(CommandLine const& line) {
  CChordnamePref::AccidentalsAsLetters = line.German;
  CChordnamePref::RomanNames = line.Solfege;
  CChordnamePref::B_is_H = line.BIsH;
  CChordnamePref::Bb_is_B = line.BbIsB;
  CChordnamePref::MinorSmall = line.MinorSmall;
  CChordnamePref::SeparateBlocksInNames = line.SeparateBlocks;
  CChordnamePref::Maj7ShownAs = line.Maj7ShownAs;
  CChordnamePref::ChordOptionSep = line.OptionSep;
  CChordnamePref::NoteNr_60_is = line.OctaveOf60;
  CChordnamePref::NarrowChordsWithoutSlash = line.SlashAlways != 0 ? 0 : 1;
  CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord = line.KeepLonelyBass != 0 ? 0 : 1;
}

const char* const NoteNameOptionsHelp = "  --b-is-h            English names: B natural written H (Bb stays)\n"
                                        "  --bb-is-b           English names: B flat written B; the letter B is read\n"
                                        "                      as B flat (with --b-is-h: the German pair H and B)\n";

const char* const NameStyleOptionsHelp =
    "  --german            German names: Cis, Es, B, H; notes and keys are read in\n"
    "                      them too (Fis, es, As, B is B flat)\n"
    "  --solfege           solmisation names: Do, Re, Mi, Fa, So, La, Ti; notes and\n"
    "                      keys are read in them too (not with --german)\n";

const char* const OctaveOptionHelp = "  --octave-of-60 3|4|5  octave number of note 60, middle C (default 3); used\n"
                                     "                      for reading and for writing note names\n";

const char* const GeneralOptionsHelp = "  -h, --help          show this text\n"
                                       "  --version           show the program's version\n";

const char* const ChordNameOptionsHelp =
    "  --minor-small       minor chords begin with a small letter: c m 7\n"
    "  --separate-blocks   separate the blocks of a name with commas: C,m,7\n"
    "  --maj7 ma7|j7|maj7  text of the major seventh (default ma7)\n"
    "  --option-sep slash|paren  options written 7/9 (default) or 7(9)\n"
    "  --slash narrow|always  name the bass after a slash only in chords wider than\n"
    "                      an octave (default), or whenever it is not the root\n"
    "  --no-omit-lonely-bass  in chords wider than an octave, name an option even\n"
    "                      when only the bass gives it\n";
