// Development only: writes the chord timeline of MIDI files as .lab files, with a
// private stand-in for the Harte labels, for tools/score-chords.py.
// usage: tonvex_timeline_lab OUT_DIR [--set NAME=VALUE]... FILE.mid...
#include "MidiBytesFile.h"

#include <tonvex/ChordTimeline.h>

#include <charconv>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <set>
#include <string>

namespace {

std::string HarteStandIn(CChord const& chord) {
  static const char* const names[] = {"C", "C#", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"};
  static const char* const degrees[] = {"1", "b2", "2", "b3", "3", "4", "b5", "5", "#5", "6", "b7", "7"};
  int const root = static_cast<int>(chord.RootNote().NoteNr() % 12);
  std::set<int> intvls;
  for (CNote const& n : chord.Notes()) intvls.insert(static_cast<int>((n.NoteNr() - root + 120) % 12));
  static const std::map<std::set<int>, const char*> shorthand = {
      {{0, 4, 7}, "maj"},      {{0, 3, 7}, "min"},       {{0, 3, 6}, "dim"},        {{0, 4, 8}, "aug"},
      {{0, 5, 7}, "sus4"},     {{0, 2, 7}, "sus2"},      {{0, 4, 7, 10}, "7"},      {{0, 4, 7, 11}, "maj7"},
      {{0, 3, 7, 10}, "min7"}, {{0, 3, 6, 10}, "hdim7"}, {{0, 3, 6, 9}, "dim7"},    {{0, 7}, "5"},
      {{0, 4, 7, 9}, "maj6"},  {{0, 3, 7, 9}, "min6"},   {{0, 3, 7, 11}, "minmaj7"}};
  std::string label = names[root];
  auto found = shorthand.find(intvls);
  if (found != shorthand.end())
    label += std::string(":") + found->second;
  else {
    label += ":(";
    bool first = true;
    for (int i : intvls) {
      if (i == 0) continue;
      label += std::string(first ? "" : ",") + degrees[i];
      first = false;
    }
    label += ")";
  }
  int const bass = static_cast<int>((chord.LowestNote().NoteNr() - root + 120) % 12);
  if (bass != 0) label += std::string("/") + degrees[bass];
  return label;
}

bool Set(CChordTimelineSettings& s, std::string const& assignment) {
  auto eq = assignment.find('=');
  if (eq == std::string::npos) return false;
  std::string const name = assignment.substr(0, eq);
  double v = 0;
  char const* const text = assignment.c_str() + eq + 1;
  char const* const end = assignment.c_str() + assignment.size();
  if (std::from_chars(text, end, v).ptr != end) return false;
  if (name == "OffBeatWeight")
    s.OffBeatWeight = v;
  else if (name == "ChordToneMass")
    s.ChordToneMass = v;
  else if (name == "BassWeight")
    s.BassWeight = v;
  else if (name == "RootBassMass")
    s.RootBassMass = v;
  else if (name == "InversionBassMass")
    s.InversionBassMass = v;
  else if (name == "ColourPenalty")
    s.ColourPenalty = v;
  else if (name == "SustainHalfLife")
    s.SustainHalfLife = v;
  else if (name == "SeventhPenalty")
    s.SeventhPenalty = v;
  else if (name == "MissingTonePenalty")
    s.MissingTonePenalty = v;
  else if (name == "Change0")
    s.ChangeCost[0] = v;
  else if (name == "Change1")
    s.ChangeCost[1] = v;
  else if (name == "Change2")
    s.ChangeCost[2] = v;
  else if (name == "MinDuration")
    s.MinDuration = v;
  else if (name == "Grid")
    s.Grid = static_cast<TChordGrid>(static_cast<int>(v));
  else if (name == "Align")
    s.AlignGridToOnsets = v != 0;
  else if (name == "Rules")
    s.Algo = v != 0 ? SCA_RULE_WEIGHTS : SCA_NEURONAL_NET;
  else
    return false;
  return true;
}

} // namespace

int main(int argc, char** argv) {
  if (argc < 3) return 2;
  std::string const outDir = argv[1];
  CChordTimelineSettings settings;
  double seconds = 0;
  for (int a = 2; a < argc; ++a) {
    std::string const arg = argv[a];
    if (arg == "--set") {
      if (++a >= argc || !Set(settings, argv[a])) return 2;
      continue;
    }
    std::vector<unsigned char> bytes;
    if (!ReadBytes(arg, bytes)) return 1;
    auto const t0 = std::chrono::steady_clock::now();
    CMidiFile file;
    CMidiReadResult const result = ReadMidiFile(bytes.data(), bytes.size(), file);
    if (!result.Ok()) {
      std::fprintf(stderr, "%s: %s\n", arg.c_str(), result.Message().c_str());
      continue;
    }
    CMidiTimeMap const map(file);
    auto const segments =
        AnalyseChordTimeline(TimedNotesOf(file, map),
                             getenv("NOPEDAL") ? std::vector<CTimedPedal>() : TimedPedalsOf(file, map), map, settings);
    seconds += std::chrono::duration<double>(std::chrono::steady_clock::now() - t0).count();
    std::string base = arg.substr(arg.find_last_of('/') + 1);
    base = base.substr(0, base.find_last_of('.'));
    FILE* out = std::fopen((outDir + "/" + base + ".lab").c_str(), "w");
    if (out == nullptr) return 1;
    for (CChordSegment const& s : segments)
      std::fprintf(out, "%.6f\t%.6f\t%s\n", s.Start, s.End, s.NoChord ? "N" : HarteStandIn(s.Chord).c_str());
    std::fclose(out);
  }
  std::fprintf(stderr, "analysis time %.3f s\n", seconds);
  return 0;
}
