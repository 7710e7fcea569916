// The command line's batch mode on arbitrary lines, run in-process through the line
// processing that the program applies to each line of its standard input, and its
// option parser on arbitrary arguments, with the midi command's track selection.
#include "FuzzInput.h"

#include "ChordNamer.h"
#include "CommandLine.h"
#include "MidiSettings.h"

#include <string_view>

namespace {

ChordSettings Settings(CFuzzInput& in) {
  ChordSettings settings;
  settings.Algo = static_cast<TSingleChordAnalysisAlgo>(in.IntMostlyIn(0, 1));
  settings.KeyNumbers = in.Pick(4) == 0;
  settings.HasKey = in.Bool();
  if (settings.HasKey) settings.Key = CSignKey(in.Note(), static_cast<CSignKey::TType>(in.IntMostlyIn(1, 2)));
  // The program reads a root with its strict note reader; any note at all is harder.
  settings.HasRoot = in.Pick(4) == 0;
  if (settings.HasRoot) settings.Root = in.Note();
  settings.Style = static_cast<TNameStyle>(in.Pick(3));
  return settings;
}

// The midi command's options, and the tracks they select from a file whose track
// names come from the input.
void SelectSomeTracks(CFuzzInput& in, CommandLine const& line) {
  CMidiSettings settings;
  if (!ReadMidiSettings(line, settings).empty()) return;
  CMidiFile file;
  for (std::size_t k = in.Count(4); k > 0; --k) file.Tracks.push_back(CMidiTrack{in.Text(8), 0});
  std::vector<bool> keep;
  std::string const missing = SelectTracks(file, settings, keep);
  Require(!missing.empty() || keep.size() == file.Tracks.size());
}

// Options as a user might type them; when they parse, they set the preferences as
// the program does, else the preferences are drawn directly.
void Preferences(CFuzzInput& in) {
  Args args;
  for (std::size_t k = in.Count(4); k > 0; --k) args.push_back(in.Text(24));
  CommandLine line;
  if (ParseCommandLine(args, line).empty()) {
    ApplyNamingPreferences(line);
    if (line.Command == Cmd_Midi) SelectSomeTracks(in, line);
  } else {
    in.SetPreferences();
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  CFuzzInput in(data, size);
  Preferences(in);
  ChordSettings const settings = Settings(in);
  bool const json = in.Bool();
  bool const report = in.Bool();
  CChordNamer namer(settings);

  std::string const text = in.Rest();
  std::string out;
  long lineNr = 0;
  for (std::size_t start = 0; start <= text.size();) {
    std::size_t end = text.find('\n', start);
    if (end == std::string::npos) end = text.size();
    std::size_t const before = out.size();
    std::string const problem = namer.NameLine(std::string_view(text).substr(start, end - start), ++lineNr, json, out);
    // Each named line adds exactly one line of output; a line that cannot be read
    // adds none.
    std::size_t const lineEnd = out.find('\n', before);
    Require(out.size() == before || (problem.empty() && lineEnd == out.size() - 1));
    if (report && out.size() != before) namer.AppendReport(out);
    if (out.size() > 4096) out.clear();
    start = end + 1;
  }
  return 0;
}
