// The simplest honest chord timeline, to compare the analysis with: per beat of the
// file's own tempo map, the lowest sounding note (the pitch class that is lowest for
// the longest time in the beat) is the root, and the chord is minor if the minor third
// above it sounds longer than the major third, else major; a beat in which nothing
// sounds is N. Drums (channel 10) are left out, the sustain pedal
// is ignored. Writes OUT_DIR/NAME.lab per file NAME.mid (start, end, Harte label).
// With --align the beats are shifted to where the onsets cluster, as the chord
// timeline shifts them (ChordTimeline.h, step 2), to show what that alone is worth.
// usage: tonvex_baseline_chords [--align] OUT_DIR FILE.mid...
#include "MidiBytesFile.h"

#include <tonvex/ChordTimeline.h>

#include "midi/TimelineEvidence.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <string>

namespace {

const char* const RootNames[] = {"C", "C#", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"};

// The pitch class that is the lowest sounding note for the longest time in
// [from, to), or -1 when nothing sounds.
int LongestLowest(std::vector<CTimedNote> const& notes, double from, double to) {
  std::vector<double> cuts = {from, to};
  for (CTimedNote const& n : notes) {
    if (n.Start > from && n.Start < to) cuts.push_back(n.Start);
    if (n.End > from && n.End < to) cuts.push_back(n.End);
  }
  std::sort(cuts.begin(), cuts.end());
  double lowestFor[12] = {};
  for (std::size_t i = 0; i + 1 < cuts.size(); ++i) {
    double const mid = (cuts[i] + cuts[i + 1]) / 2;
    int lowest = 128;
    for (CTimedNote const& n : notes)
      if (n.Start <= mid && mid < n.End) lowest = std::min(lowest, n.NoteNr);
    if (lowest < 128) lowestFor[lowest % 12] += cuts[i + 1] - cuts[i];
  }
  int const best = static_cast<int>(std::max_element(lowestFor, lowestFor + 12) - lowestFor);
  return lowestFor[best] > 0 ? best : -1;
}

std::string BeatLabel(std::vector<CTimedNote> const& notes, double from, double to) {
  int const root = LongestLowest(notes, from, to);
  if (root < 0) return "N";
  double third[2] = {0, 0}; // minor, major
  for (CTimedNote const& n : notes) {
    int const intvl = (n.NoteNr % 12 - root + 12) % 12;
    double const overlap = std::min(n.End, to) - std::max(n.Start, from);
    if (overlap > 0 && (intvl == 3 || intvl == 4)) third[intvl - 3] += overlap;
  }
  return std::string(RootNames[root]) + (third[0] > third[1] ? ":min" : ":maj");
}

bool WriteLab(CMidiFile const& file, std::string const& path, bool align) {
  CMidiTimeMap const map(file);
  std::vector<CTimedNote> notes;
  double end = 0;
  for (CTimedNote const& n : TimedNotesOf(file, map))
    if (n.Channel != MidiDrumChannel && n.End > n.Start) {
      notes.push_back(n);
      end = std::max(end, n.End);
    }
  double const phase = align ? OnsetPhase(SoundingNotes(notes, {}, map, CChordTimelineSettings())) : 0.0;
  FILE* out = std::fopen(path.c_str(), "w");
  if (out == nullptr) return false;
  std::string label;
  double labelStart = 0;
  std::size_t first = 0; // notes before it have ended before the current beat
  std::sort(notes.begin(), notes.end(), [](CTimedNote const& a, CTimedNote const& b) { return a.Start < b.Start; });
  std::vector<CTimedNote> sounding;
  for (long long beat = 0; end > 0; ++beat) {
    double const from = std::max(0.0, map.BeatPosToSeconds(double(beat - 1) + phase));
    double const to = std::min(map.BeatPosToSeconds(double(beat) + phase), end);
    if (!(to > from)) continue;
    for (; first < notes.size() && notes[first].Start < to; ++first) sounding.push_back(notes[first]);
    sounding.erase(std::remove_if(sounding.begin(), sounding.end(), [&](CTimedNote const& n) { return n.End <= from; }),
                   sounding.end());
    std::string const now = BeatLabel(sounding, from, to);
    if (now != label) {
      if (!label.empty()) std::fprintf(out, "%.6f\t%.6f\t%s\n", labelStart, from, label.c_str());
      label = now;
      labelStart = from;
    }
    if (to >= end) break;
  }
  if (!label.empty()) std::fprintf(out, "%.6f\t%.6f\t%s\n", labelStart, end, label.c_str());
  return std::fclose(out) == 0;
}

} // namespace

int main(int argc, char** argv) {
  bool const align = argc > 1 && std::string(argv[1]) == "--align";
  int const first = align ? 2 : 1;
  if (argc < first + 2) {
    std::fputs("usage: tonvex_baseline_chords [--align] OUT_DIR FILE.mid...\n", stderr);
    return 2;
  }
  int status = 0;
  for (int a = first + 1; a < argc; ++a) {
    std::string const path = argv[a];
    std::vector<unsigned char> bytes;
    CMidiFile file;
    std::string problem;
    if (!ReadBytes(path, bytes))
      problem = "cannot read the file";
    else
      problem = ReadMidiFile(bytes.data(), bytes.size(), file).Message();
    std::string name = path.substr(path.find_last_of('/') + 1);
    name = name.substr(0, name.find_last_of('.'));
    if (problem.empty() && !WriteLab(file, std::string(argv[first]) + "/" + name + ".lab", align))
      problem = "cannot write " + name + ".lab";
    if (!problem.empty()) {
      std::fprintf(stderr, "tonvex_baseline_chords: %s: %s\n", path.c_str(), problem.c_str());
      status = 1;
    }
  }
  return status;
}
