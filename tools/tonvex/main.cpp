// tonvex: chord analysis and naming from the command line.
#include "Commands.h"

#include <cstdio>

int main(int argc, char** argv) {
  CommandLine line;
  std::string problem = ParseCommandLine(Args(argv + 1, argv + argc), line);
  if (line.Version != 0) {
    std::printf("tonvex %s\n", ProgramVersion().c_str());
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
