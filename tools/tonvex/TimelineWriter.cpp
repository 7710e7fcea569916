#include "TimelineWriter.h"

#include "ChordNamer.h"
#include "JsonWriter.h"

#include <tonvex/ChordSymbol.h>

#include <algorithm>
#include <cmath>

namespace {

// Times in .lab files and JSON: seconds with microseconds.
constexpr int Decimals = 6;

std::string NoChordName(int style) { return style == Style_Harte ? "N" : "N.C."; }

// The segment's name in a style: the library's name (as it writes it, trailing blanks
// included), the lead-sheet symbol or the Harte label.
std::string NameOf(CChordSegment const& segment, int style) {
  if (segment.NoChord) return NoChordName(style);
  if (style == Style_LeadSheet) return LeadSheetSymbol(segment.Chord);
  if (style == Style_Harte) return HarteLabel(segment.Chord);
  return segment.Chord.Name(DefaultChordnamePref);
}

std::string KeyName(CNote const& note) { return note.KeyName(DefaultChordnamePref); }

void AppendPadded(std::string& out, std::string const& text, std::size_t width, bool right) {
  std::size_t const pad = width > text.size() ? width - text.size() : 0;
  if (right) out.append(pad, ' ');
  out += text;
  if (!right) out.append(pad, ' ');
}

// Aligned columns: the time right-aligned, then bar:beat and the names left-aligned;
// the last column is not padded.
void AppendText(std::string& out, std::vector<CChordSegment> const& segments, int style) {
  std::vector<int> styles;
  if (style < 0)
    styles = {Style_Native, Style_LeadSheet};
  else
    styles = {style};
  std::vector<std::vector<std::string>> rows;
  std::vector<std::size_t> widths(2 + styles.size(), 0);
  for (CChordSegment const& segment : segments) {
    std::vector<std::string> row = {MinutesSeconds(segment.Start),
                                    std::to_string(segment.Bar) + ':' + std::to_string(segment.Beat)};
    for (int s : styles) row.push_back(NameOf(segment, s));
    for (std::size_t c = 0; c < row.size(); ++c) widths[c] = std::max(widths[c], row[c].size());
    rows.push_back(std::move(row));
  }
  for (std::vector<std::string> const& row : rows) {
    for (std::size_t c = 0; c + 1 < row.size(); ++c) {
      AppendPadded(out, row[c], widths[c], c == 0);
      out += "  ";
    }
    out += row.back();
    out += '\n';
  }
}

void AppendLab(std::string& out, std::vector<CChordSegment> const& segments) {
  for (CChordSegment const& segment : segments) {
    AppendFixed(out, segment.Start, Decimals);
    out += '\t';
    AppendFixed(out, segment.End, Decimals);
    out += '\t';
    out += NameOf(segment, Style_Harte);
    out += '\n';
  }
}

void AppendJson(std::string& out, std::vector<CChordSegment> const& segments, std::string const& fileName) {
  for (CChordSegment const& segment : segments) {
    CJsonWriter json(out);
    json.BeginObject();
    if (!fileName.empty()) {
      json.Key("file");
      json.String(fileName);
    }
    json.Key("start");
    json.Fixed(segment.Start, Decimals);
    json.Key("end");
    json.Fixed(segment.End, Decimals);
    json.Key("bar");
    json.Int(static_cast<long>(segment.Bar));
    json.Key("beat");
    json.Int(segment.Beat);
    for (int style : {Style_Native, Style_LeadSheet, Style_Harte}) {
      json.Key(style == Style_Native ? "name" : style == Style_LeadSheet ? "symbol" : "harte");
      json.String(NameOf(segment, style));
    }
    AppendJsonNote(json, "root", segment.Chord.RootNote(), !segment.NoChord);
    AppendJsonNote(json, "bass", segment.Chord.LowestNote(), !segment.NoChord);
    json.Key("notes");
    json.BeginArray();
    if (!segment.NoChord)
      for (CNote const& note : segment.Chord.Notes()) json.String(KeyName(note));
    json.EndArray();
    json.EndObject();
    out += '\n';
  }
}

} // namespace

std::string MinutesSeconds(double seconds) {
  long long const millis = std::llround(seconds * 1000);
  std::string text = std::to_string(millis / 60000) + ':';
  long long const withinMinute = millis % 60000;
  char digits[8] = {
      char('0' + withinMinute / 10000),    char('0' + withinMinute / 1000 % 10), '.',
      char('0' + withinMinute / 100 % 10), char('0' + withinMinute / 10 % 10),   char('0' + withinMinute % 10)};
  return text + digits;
}

void AppendTimeline(std::string& out, std::vector<CChordSegment> const& segments, CMidiSettings const& settings,
                    std::string const& fileName) {
  switch (settings.Format) {
  case Format_Lab: return AppendLab(out, segments);
  case Format_Json: return AppendJson(out, segments, fileName);
  case Format_Text: break;
  }
  AppendText(out, segments, settings.Style);
}
