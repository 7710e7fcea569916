// tonvex: chord analysis and naming from the command line.
#include "Commands.h"

#include "TonvexVersion.h"

#include <cstdio>
#include <cstring>

namespace {

const char* const Usage = "usage: tonvex COMMAND [ARGS...]\n"
                          "\n"
                          "Commands:\n"
                          "  note NAME...   read note names and show their numbers, spellings and names\n"
                          "  scale ROOT TYPE  show a scale's spelled degrees and key signature\n"
                          "  key ROOT [minor] show a key's name, key signature and degrees\n"
                          "\n"
                          "Options:\n"
                          "  --help         show this text\n"
                          "  --version      show the library version\n"
                          "\n"
                          "Run 'tonvex COMMAND --help' for the options of a command.\n";

void PrintVersion() {
  // The version string starts with the four-character "@(#)" marker.
  const char* text = reinterpret_cast<const char*>(TonvexVersionString) + 4;
  std::printf("tonvex %g\n%s", TonvexVersionNumber, text);
}

} // namespace

int main(int argc, char** argv) {
  Args args(argv + 1, argv + argc);
  if (args.empty()) {
    std::fputs(Usage, stderr);
    return 2;
  }
  std::string const command = args.front();
  Args const rest(args.begin() + 1, args.end());
  if (command == "--help" || command == "-h") {
    std::fputs(Usage, stdout);
    return 0;
  }
  if (command == "--version") {
    PrintVersion();
    return 0;
  }
  if (command == "note") return RunNoteCommand(rest);
  if (command == "scale") return RunScaleCommand(rest);
  if (command == "key") return RunKeyCommand(rest);
  std::fprintf(stderr, "tonvex: unknown command '%s'\n%s", command.c_str(), Usage);
  return 2;
}
