// Key signature sign counts as text.
#ifndef TONVEX_TOOLS_SIGNSTEXT_H
#define TONVEX_TOOLS_SIGNSTEXT_H

#include <string>

/// "+2 (2 sharps)", "-1 (1 flat)", "0 (none)": sharps positive, flats negative.
std::string SignsText(int signs);

#endif
