#include "MidiSettings.h"

#include "NoteToken.h"
#include "QuotedText.h"

#include <charconv>
#include <cmath>
#include <string_view>

namespace {

std::string_view Trimmed(std::string_view text) {
  std::size_t const first = text.find_first_not_of(" \t");
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(" \t") - first + 1);
}

// A track index: digits only (nine at most: no file has that many tracks).
bool IsIndex(std::string_view text) { return IsDecimalNumber(text) && text[0] != '-'; }

// The comma-separated items of an option's value, each without blanks at either end;
// false if one is empty.
bool SplitList(std::string const& value, std::vector<std::string>& items) {
  std::string_view rest = value;
  for (;;) {
    std::size_t const comma = rest.find(',');
    std::string_view const item = Trimmed(rest.substr(0, comma));
    if (item.empty()) return false;
    items.emplace_back(item);
    if (comma == std::string_view::npos) return true;
    rest.remove_prefix(comma + 1);
  }
}

std::string ReadTrackList(const char* option, std::string const& value, CTrackList& list) {
  if (value.empty()) return std::string();
  list.Given = true;
  if (!SplitList(value, list.Items))
    return std::string("option '") + option + "' takes track names or indices separated by commas, not " +
           Quoted(value);
  return std::string();
}

std::string ReadChannels(std::string const& value, unsigned& channels) {
  if (value.empty()) return std::string();
  std::vector<std::string> items;
  bool ok = SplitList(value, items);
  channels = 0;
  for (std::string const& item : items) {
    int const channel = IsDecimalNumber(item) ? DecimalValue(item) : 0;
    ok = ok && channel >= 1 && channel <= 16;
    if (ok) channels |= 1u << (channel - 1);
  }
  if (!ok) return "option '--channels' takes channels 1 to 16 separated by commas, not " + Quoted(value);
  return std::string();
}

std::string ReadSeconds(std::string const& value, double& seconds) {
  if (value.empty()) return std::string();
  char const* const end = value.data() + value.size();
  auto const read = std::from_chars(value.data(), end, seconds);
  if (read.ec != std::errc() || read.ptr != end || !std::isfinite(seconds) || seconds < 0)
    return "option '--min-duration' takes seconds (a number, 0 or more), not " + Quoted(value);
  return std::string();
}

// Whether a list item names the track: its index, or its name (without blanks at
// either end).
bool Names(std::string const& item, std::size_t trackIx, CMidiTrack const& track) {
  if (!IsIndex(item)) return Trimmed(track.Name) == item;
  return static_cast<std::size_t>(DecimalValue(item)) == trackIx;
}

// Marks the tracks that the list names as named; returns the first item that names none.
std::string MarkTracks(CMidiFile const& file, CTrackList const& list, std::vector<bool>& named) {
  named.assign(file.Tracks.size(), false);
  for (std::string const& item : list.Items) {
    bool found = false;
    for (std::size_t t = 0; t < file.Tracks.size(); ++t)
      if (Names(item, t, file.Tracks[t])) found = named[t] = true;
    if (!found) return item;
  }
  return std::string();
}

} // namespace

std::string ReadMidiSettings(CommandLine const& line, CMidiSettings& settings) {
  settings.Format = static_cast<TTimelineFormat>(line.Format);
  settings.Style = line.Style;
  settings.Timeline.Algo = line.RulesAlgo != 0 ? SCA_RULE_WEIGHTS : SCA_NEURONAL_NET;
  settings.Timeline.Grid = static_cast<TChordGrid>(line.Grid);
  settings.Timeline.IncludeDrums = line.IncludeDrums != 0;
  settings.Output = line.Output;
  settings.OutDir = line.OutDir;
  for (std::string const& problem :
       {ReadTrackList("--tracks", line.Tracks, settings.Tracks),
        ReadTrackList("--exclude-tracks", line.ExcludeTracks, settings.ExcludedTracks),
        ReadChannels(line.Channels, settings.Channels), ReadSeconds(line.MinDuration, settings.Timeline.MinDuration)})
    if (!problem.empty()) return problem;
  if (!line.Output.empty() && !line.OutDir.empty()) return "options '-o' and '--out-dir' do not go together";
  if (!line.Output.empty() && line.Operands.size() > 1) return "option '-o' takes the timeline of one file only";
  if (line.Style >= 0 && settings.Format != Format_Text) return "option '--style' applies to the text format only";
  if (settings.Format == Format_Lab && line.Operands.size() > 1 && line.OutDir.empty())
    return "the lab format of several files needs --out-dir";
  return std::string();
}

std::string SelectTracks(CMidiFile const& file, CMidiSettings const& settings, std::vector<bool>& keep) {
  std::vector<bool> excluded;
  std::string missing;
  if (settings.Tracks.Given && !(missing = MarkTracks(file, settings.Tracks, keep)).empty())
    return "no track " + Quoted(missing) + " (--tracks)";
  if (!settings.Tracks.Given) keep.assign(file.Tracks.size(), true);
  if (!(missing = MarkTracks(file, settings.ExcludedTracks, excluded)).empty())
    return "no track " + Quoted(missing) + " (--exclude-tracks)";
  for (std::size_t t = 0; t < keep.size(); ++t) keep[t] = keep[t] && !excluded[t];
  return std::string();
}
