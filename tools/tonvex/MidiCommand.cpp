// tonvex midi [OPTIONS] FILE...: the chord timeline of each MIDI file.
#include "Commands.h"
#include "MidiSettings.h"
#include "QuotedText.h"
#include "TimelineWriter.h"

#include <algorithm>
#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <set>

namespace {

// Larger files are refused before they are read: a MIDI file of a whole opera has a
// few megabytes, and reading a device or an endless pipe must end.
constexpr std::size_t MaxFileSize = std::size_t(1) << 26;

// Reads the whole file; returns the empty string or the problem.
std::string ReadFile(std::string const& path, std::vector<unsigned char>& bytes) {
  FILE* in = std::fopen(path.c_str(), "rb");
  if (in == nullptr) return std::string("cannot open: ") + std::strerror(errno);
  std::string problem;
  unsigned char block[1 << 16];
  for (;;) {
    std::size_t const count = std::fread(block, 1, sizeof block, in);
    bytes.insert(bytes.end(), block, block + count);
    if (bytes.size() > MaxFileSize) {
      problem = "larger than 64 MiB, too large for a MIDI file";
      break;
    }
    if (count < sizeof block) {
      if (std::ferror(in) != 0) problem = std::string("cannot read: ") + std::strerror(errno);
      break;
    }
  }
  std::fclose(in);
  return problem;
}

// Writes text to the file; returns the empty string or the problem.
std::string WriteFile(std::string const& path, std::string const& text) {
  FILE* out = std::fopen(path.c_str(), "wb");
  bool written = out != nullptr && std::fwrite(text.data(), 1, text.size(), out) == text.size();
  int error = errno;
  if (out != nullptr && std::fclose(out) != 0 && written) {
    written = false;
    error = errno;
  }
  return written ? std::string() : "cannot write " + Quoted(path, PathCharacters) + ": " + std::strerror(error);
}

const char* Extension(TTimelineFormat format) {
  switch (format) {
  case Format_Lab: return ".lab";
  case Format_Json: return ".jsonl";
  case Format_Text: break;
  }
  return ".txt";
}

// DIR/NAME.EXT for the input DIRS/NAME.mid.
std::string OutputPath(std::string const& input, CMidiSettings const& settings) {
  std::string name = input.substr(input.find_last_of('/') + 1);
  std::size_t const dot = name.find_last_of('.');
  if (dot != std::string::npos && dot > 0) name.erase(dot);
  std::string const& dir = settings.OutDir;
  return dir + (dir.back() == '/' ? "" : "/") + name + Extension(settings.Format);
}

// The timeline runs to the last note-off of the file, of any track or channel: where
// the analysed notes end earlier, no chord fills the rest.
void ExtendToEnd(std::vector<CChordSegment>& segments, CMidiFile const& file, CMidiTimeMap const& map) {
  std::int64_t endTick = 0;
  for (CMidiNote const& note : file.Notes) endTick = std::max(endTick, note.EndTick);
  double const end = map.TickToSeconds(endTick);
  double const start = segments.empty() ? 0.0 : segments.back().End;
  if (!(end > start)) return;
  if (!segments.empty() && segments.back().NoChord) {
    segments.back().End = end;
    return;
  }
  CChordSegment rest;
  rest.Start = start;
  rest.End = end;
  CMidiTimeMap::CBarBeat const barBeat = map.BarBeatOf(static_cast<long long>(std::floor(map.SecondsToBeatPos(start))));
  rest.Bar = barBeat.Bar;
  rest.Beat = barBeat.Beat;
  segments.push_back(rest);
}

// The segments of the selected notes of a file read.
std::vector<CChordSegment> Timeline(CMidiFile const& file, CMidiSettings const& settings,
                                    std::vector<bool> const& tracks) {
  CMidiTimeMap const map(file);
  auto const dropped = [&](int trackIx, int channel) {
    return !tracks[static_cast<std::size_t>(trackIx)] || (settings.Channels >> channel & 1u) == 0;
  };
  std::vector<CTimedNote> notes = TimedNotesOf(file, map);
  notes.erase(
      std::remove_if(notes.begin(), notes.end(), [&](CTimedNote const& n) { return dropped(n.TrackIx, n.Channel); }),
      notes.end());
  std::vector<CTimedPedal> pedals = TimedPedalsOf(file, map);
  pedals.erase(
      std::remove_if(pedals.begin(), pedals.end(), [&](CTimedPedal const& p) { return dropped(p.TrackIx, p.Channel); }),
      pedals.end());
  std::vector<CChordSegment> segments = AnalyseChordTimeline(notes, pedals, map, settings.Timeline);
  ExtendToEnd(segments, file, map);
  // Times are written in microseconds: a segment that would be written as empty is
  // left out, the one before it ending where it ended.
  std::vector<CChordSegment> kept;
  for (CChordSegment const& segment : segments) {
    if (std::llround(segment.Start * 1e6) < std::llround(segment.End * 1e6))
      kept.push_back(segment);
    else if (!kept.empty())
      kept.back().End = segment.End;
  }
  return kept;
}

// Prints "tonvex midi: 'FILE': PROBLEM" on standard error; returns status.
int FileProblem(std::string const& path, std::string const& problem, int status) {
  PrintProblem(Cmd_Midi, Quoted(path, PathCharacters) + ": " + problem);
  return status;
}

// Reads and analyses one file and appends its timeline to text. Returns the exit
// status for it: 0, 1 when it could not be read, 2 when a track selection names a
// track it does not have.
int AnalyseFile(std::string const& path, CMidiSettings const& settings, std::string const& jsonName,
                std::string& text) {
  std::vector<unsigned char> bytes;
  std::string problem = ReadFile(path, bytes);
  if (!problem.empty()) return FileProblem(path, problem, 1);
  CMidiFile file;
  CMidiReadResult const read = ReadMidiFile(bytes.data(), bytes.size(), file);
  if (!read.Ok()) return FileProblem(path, read.Message(), 1);
  std::vector<bool> tracks;
  problem = SelectTracks(file, settings, tracks);
  if (!problem.empty()) return FileProblem(path, problem, 2);
  AppendTimeline(text, Timeline(file, settings, tracks), settings, jsonName);
  return 0;
}

} // namespace

std::string MidiUsage() {
  return std::string("usage: tonvex midi [OPTIONS] FILE...\n"
                     "\n"
                     "Writes the chord timeline of each Standard MIDI File (format 0 or 1): where the\n"
                     "chord changes and what it is, from 0 to the last note-off. The chords are\n"
                     "found from all tracks and channels but drums (channel 10), the melody\n"
                     "included; the roots are found as the chord command finds them.\n"
                     "\n"
                     "Formats:\n"
                     "  text   a line per chord, aligned: start time (m:ss.sss), bar:beat (bars from\n"
                     "         1, bar 0 before the first beat), the library's name (as it writes it)\n"
                     "         and the lead-sheet symbol; no chord is N.C.\n"
                     "  lab    start<TAB>end<TAB>label: seconds with 6 decimals, Harte labels, N for no\n"
                     "         chord, consecutive from 0 to the last note-off\n"
                     "  json   a JSON object per chord (JSON Lines): start, end, bar, beat, name,\n"
                     "         symbol, harte, root and bass ({name, key_number}; null for no chord,\n"
                     "         whose harte is N) and notes (names, from the bass up)\n"
                     "\n"
                     "Options:\n"
                     "  --format text|lab|json  output format (default text)\n"
                     "  --tracks LIST       analyse only these tracks: names or 0-based indices\n"
                     "                      (as stored in the file, track 0 first), separated by\n"
                     "                      commas; digits are an index\n"
                     "  --exclude-tracks LIST  leave these tracks out (names or indices as above)\n"
                     "  --channels LIST     analyse only these channels, 1 to 16, separated by commas\n"
                     "  --include-drums     analyse channel 10 too\n"
                     "  --grid auto|beat|bar  where the chord may change: on any beat, most easily on\n"
                     "                      strong beats (default), on any beat alike, on bar lines\n"
                     "  --min-duration SECONDS  join chords shorter than this to a neighbour\n"
                     "  --algo net|rules    find the roots with the built-in net (default) or the rules\n"
                     "  --style native|leadsheet|harte  text format: show only the library's name,\n"
                     "                      only the lead-sheet symbol or only the Harte label\n"
                     "  -o FILE             write the timeline of the one input to FILE\n"
                     "  --out-dir DIR       write each timeline to DIR/NAME.txt, .lab or .jsonl, NAME\n"
                     "                      being the input's file name without its extension\n"
                     "\n"
                     "Naming options (names and notes of the text and JSON formats):\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp + ChordNameOptionsHelp +
         "\n"
         "Without -o or --out-dir the timelines go to standard output; with several files\n"
         "each text timeline is headed by its file name and each JSON object carries it\n"
         "as \"file\" (the lab format needs --out-dir). A file that cannot be read is\n"
         "reported on standard error with its name and the problem, and the other files\n"
         "go on.\n"
         "\n"
         "Exit status: 0 success; 1 a file could not be read or written; 2 a usage error,\n"
         "or a name or index in --tracks or --exclude-tracks that a file has no track for\n"
         "(the other files go on).\n"
         "\n"
         "Other options:\n" +
         GeneralOptionsHelp;
}

int RunMidiCommand(CommandLine const& line) {
  if (line.Operands.empty()) return ShortUsage(Cmd_Midi);
  CMidiSettings settings;
  std::string const problem = ReadMidiSettings(line, settings);
  if (!problem.empty()) return UsageError(Cmd_Midi, problem);
  if (!settings.OutDir.empty()) {
    std::set<std::string> paths;
    for (std::string const& input : line.Operands)
      if (!paths.insert(OutputPath(input, settings)).second)
        return UsageError(Cmd_Midi,
                          "two files would be written to " + Quoted(OutputPath(input, settings), PathCharacters));
  }
  bool const toStdout = settings.Output.empty() && settings.OutDir.empty();
  bool const several = line.Operands.size() > 1;
  bool written = false; // some timeline went to standard output
  int status = 0;
  for (std::string const& input : line.Operands) {
    std::string text;
    int const fileStatus = AnalyseFile(input, settings, toStdout && several ? input : std::string(), text);
    status = std::max(status, fileStatus);
    if (fileStatus != 0) continue;
    if (!toStdout) {
      std::string const path = settings.Output.empty() ? OutputPath(input, settings) : settings.Output;
      std::string const unwritten = WriteFile(path, text);
      if (!unwritten.empty()) status = std::max(status, FileProblem(input, unwritten, 1));
      continue;
    }
    if (several && settings.Format == Format_Text) text.insert(0, (written ? "\n" : "") + input + ":\n");
    written = true;
    if (std::fwrite(text.data(), 1, text.size(), stdout) != text.size()) break;
  }
  if (std::fflush(stdout) != 0 || std::ferror(stdout) != 0) {
    PrintProblem(Cmd_Midi, "cannot write the output");
    return std::max(status, 1);
  }
  return status;
}
