// tonvex: chord analysis and naming from the command line.
#include "Commands.h"

#include <tonvex/TonvexVersion.h>

#include <cstdio>

namespace {

void PrintVersion() {
  // The version string starts with the four-character "@(#)" marker.
  const char* text = reinterpret_cast<const char*>(TonvexVersionString) + 4;
  std::printf("tonvex %g\n%s", TonvexVersionNumber, text);
}

std::string UsageOf(TCommand command) {
  switch (command) {
  case Cmd_Note: return NoteUsage();
  case Cmd_Scale: return ScaleUsage();
  case Cmd_Key: return KeyUsage();
  case Cmd_Symbol: return SymbolUsage();
  case Cmd_Midi: return MidiUsage();
  case Cmd_Chord: break;
  }
  return ChordUsage();
}

} // namespace

int main(int argc, char** argv) {
  CommandLine line;
  std::string problem = ParseCommandLine(Args(argv + 1, argv + argc), line);
  if (line.Version != 0) {
    PrintVersion();
    return 0;
  }
  if (line.Help != 0) {
    std::fputs(UsageOf(line.Command).c_str(), stdout);
    return 0;
  }
  if (!problem.empty()) return UsageError(line.Command, problem);
  ApplyNamingPreferences(line);
  switch (line.Command) {
  case Cmd_Note: return RunNoteCommand(line);
  case Cmd_Scale: return RunScaleCommand(line);
  case Cmd_Key: return RunKeyCommand(line);
  case Cmd_Symbol: return RunSymbolCommand(line);
  case Cmd_Midi: return RunMidiCommand(line);
  case Cmd_Chord: break;
  }
  return RunChordCommand(line);
}
