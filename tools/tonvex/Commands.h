// Subcommands of the tonvex program. Each returns the process exit status:
// 0 success, 1 a failure while running, 2 a usage error or unreadable input.
#ifndef TONVEX_TOOLS_COMMANDS_H
#define TONVEX_TOOLS_COMMANDS_H

#include <string>
#include <vector>

using Args = std::vector<std::string>;

int RunNoteCommand(Args const& args);
int RunScaleCommand(Args const& args);
int RunKeyCommand(Args const& args);

#endif
