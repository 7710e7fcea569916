// The settings of the midi command, read from its options: which notes of a file are
// analysed, how, and where and how the timelines are written.
#ifndef TONVEX_TOOLS_MIDISETTINGS_H
#define TONVEX_TOOLS_MIDISETTINGS_H

#include "CommandLine.h"

#include <tonvex/ChordTimeline.h>

#include <string>
#include <vector>

enum TTimelineFormat : int { Format_Text = 0, Format_Lab = 1, Format_Json = 2 };

/// The items of --tracks or --exclude-tracks, without blanks at either end: a track's
/// 0-based index (digits only) or its name.
struct CTrackList {
  bool Given = false;
  std::vector<std::string> Items;
};

struct CMidiSettings {
  TTimelineFormat Format = Format_Text;
  /// The name columns of the text format: -1 the library's name and the lead-sheet
  /// symbol, else the one name of that TNameStyle.
  int Style = -1;
  CTrackList Tracks, ExcludedTracks;
  unsigned Channels = 0xffff; // bit c: channel c (0..15) is analysed
  CChordTimelineSettings Timeline;
  std::string Output; // -o: the one input's timeline goes there
  std::string OutDir; // --out-dir: each input's timeline goes to a file there
};

/// Reads the midi command's options and checks that they go together. Returns the
/// empty string, or the problem as a usage error puts it.
std::string ReadMidiSettings(CommandLine const& line, CMidiSettings& settings);

/// Which tracks of the file are analysed (keep[i] for track i): those of the list
/// given by --tracks (all when it is not given) less those of --exclude-tracks.
/// Returns the empty string, or the first index or name of the lists that names no
/// track of the file.
std::string SelectTracks(CMidiFile const& file, CMidiSettings const& settings, std::vector<bool>& keep);

#endif
