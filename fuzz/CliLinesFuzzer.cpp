// The command line's batch mode on arbitrary lines, run in-process through the line
// processing that the program applies to each line of its standard input (note
// names in every naming style the options allow), its key reader and the quoting of
// tokens in messages, and its option parser on arbitrary arguments, with the midi
// command's track selection.
#include "FuzzInput.h"

#include "ChordNamer.h"
#include "CommandLine.h"
#include "KeyText.h"
#include "MidiSettings.h"
#include "QuotedText.h"

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

// A quoted token holds no control byte, and at most 40 characters (each escaped in at
// most 8) with the quotes and the cut mark; the text for JSON is never longer than
// the token (a stray byte becoming U+FFFD) and the mark.
void CheckQuoting(std::string_view token) {
  std::string const quoted = Quoted(token);
  std::size_t characters = 0;
  for (char c : quoted) {
    auto const byte = static_cast<unsigned char>(c);
    Require(byte >= 0x20 && byte != 0x7F);
    characters += (byte & 0xC0) != 0x80 ? 1 : 0;
  }
  Require(characters <= 8 * ShownCharacters + 3);
  Require(ShortText(token).size() <= 3 * token.size() + 3);
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
    std::string_view const line = std::string_view(text).substr(start, end - start);
    std::string_view token;
    std::string const problem = namer.Handle(line, ++lineNr, json, out, token);
    // Each named line adds exactly one line of output; a line that cannot be read
    // adds none, and its token lies within it.
    std::size_t const lineEnd = out.find('\n', before);
    Require(out.size() == before || (problem.empty() && lineEnd == out.size() - 1));
    if (!problem.empty()) {
      Require(token.data() >= line.data() && token.data() + token.size() <= line.data() + line.size());
      CheckQuoting(token);
    }
    // The line read as a key: a key read has a tonic and is major or minor.
    CSignKey key;
    if (ReadKey(line, key))
      Require(key.RootNote().NoteNr() >= 0 && key.RootNote().NoteNr() < 12 &&
              (key.SignKeyType() == CSignKey::SignKey_Major || key.SignKeyType() == CSignKey::SignKey_Minor));
    if (report && out.size() != before) namer.AppendReport(out);
    if (out.size() > 4096) out.clear();
    start = end + 1;
  }
  return 0;
}
