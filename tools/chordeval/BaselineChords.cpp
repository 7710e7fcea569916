// The simplest honest chord timeline, to compare the analysis with: per beat of the
// file's own tempo map, the lowest sounding note is the root, and the chord is minor
// if the minor third above it sounds longer than the major third, else major; a beat
// in which nothing sounds is N. Drums (channel 10) are left out, the sustain pedal
// is ignored. Writes OUT_DIR/NAME.lab per file NAME.mid (start, end, Harte label).
// usage: tonvex_baseline_chords OUT_DIR FILE.mid...
#include "MidiBytesFile.h"

#include <tonvex/ChordTimeline.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <string>

namespace {

const char* const RootNames[] = {"C", "C#", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"};

std::string BeatLabel(std::vector<CTimedNote> const& notes, double from, double to) {
  int lowest = 128;
  for (CTimedNote const& n : notes)
    if (n.Start < to && n.End > from) lowest = std::min(lowest, n.NoteNr);
  if (lowest == 128) return "N";
  int const root = lowest % 12;
  double third[2] = {0, 0}; // minor, major
  for (CTimedNote const& n : notes) {
    int const intvl = (n.NoteNr % 12 - root + 12) % 12;
    double const overlap = std::min(n.End, to) - std::max(n.Start, from);
    if (overlap > 0 && (intvl == 3 || intvl == 4)) third[intvl - 3] += overlap;
  }
  return std::string(RootNames[root]) + (third[0] > third[1] ? ":min" : ":maj");
}

bool WriteLab(CMidiFile const& file, std::string const& path) {
  CMidiTimeMap const map(file);
  std::vector<CTimedNote> notes;
  double end = 0;
  for (CTimedNote const& n : TimedNotesOf(file, map))
    if (n.Channel != MidiDrumChannel && n.End > n.Start) {
      notes.push_back(n);
      end = std::max(end, n.End);
    }
  FILE* out = std::fopen(path.c_str(), "w");
  if (out == nullptr) return false;
  std::string label;
  double labelStart = 0;
  std::size_t first = 0; // notes before it have ended before the current beat
  std::sort(notes.begin(), notes.end(), [](CTimedNote const& a, CTimedNote const& b) { return a.Start < b.Start; });
  std::vector<CTimedNote> sounding;
  for (long long beat = 0; end > 0; ++beat) {
    double const from = map.BeatPosToSeconds(double(beat)), to = std::min(map.BeatPosToSeconds(double(beat + 1)), end);
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
  if (argc < 3) {
    std::fputs("usage: tonvex_baseline_chords OUT_DIR FILE.mid...\n", stderr);
    return 2;
  }
  int status = 0;
  for (int a = 2; a < argc; ++a) {
    std::string const path = argv[a];
    std::vector<unsigned char> bytes;
    CMidiFile file;
    CMidiReadResult result;
    if (!ReadBytes(path, bytes))
      result.What = "cannot read the file";
    else
      result = ReadMidiFile(bytes.data(), bytes.size(), file);
    std::string name = path.substr(path.find_last_of('/') + 1);
    name = name.substr(0, name.find_last_of('.'));
    if (result.Ok() && !WriteLab(file, std::string(argv[1]) + "/" + name + ".lab"))
      result.What = "cannot write " + name + ".lab";
    if (!result.Ok()) {
      std::fprintf(stderr, "tonvex_baseline_chords: %s: %s\n", path.c_str(), result.What.c_str());
      status = 1;
    }
  }
  return status;
}
