// The chord timeline of a MIDI file as text, as a .lab file of Harte labels, or as
// JSON Lines (the formats of the midi command).
#ifndef TONVEX_TOOLS_TIMELINEWRITER_H
#define TONVEX_TOOLS_TIMELINEWRITER_H

#include "MidiSettings.h"

#include <string>
#include <vector>

/// Appends the segments to out in the settings' format and text columns. With a
/// file name, every JSON object carries it first as "file" (for several files in one
/// stream).
void AppendTimeline(std::string& out, std::vector<CChordSegment> const& segments, CMidiSettings const& settings,
                    std::string const& fileName);

/// "m:ss.sss", the seconds rounded to milliseconds: "0:00.000", "3:59.500", "75:03.250".
std::string MinutesSeconds(double seconds);

#endif
