// Strict reading of note tokens on the command line.
#ifndef TONVEX_TOOLS_NOTETOKEN_H
#define TONVEX_TOOLS_NOTETOKEN_H

#include "Note.h"

#include <string>

/// Reads a whole token as a note name: a letter A..H (either case), an optional
/// accidental (bb, b, x, #) and an optional octave number, nothing else. The library
/// parser is lenient (it ignores whatever follows the octave); the command line
/// rejects such tokens instead of guessing. Returns false for anything else.
bool ReadNoteName(std::string const& token, CNote& note);

/// Whether the token is a plain decimal number (an optional minus sign and digits).
bool IsDecimalNumber(std::string const& token);

#endif
