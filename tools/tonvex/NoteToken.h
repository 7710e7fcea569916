// Strict reading of note tokens: on the command line and in chord lines.
//
// The library parser is lenient (it ignores whatever follows the octave and clamps
// octaves it cannot place); the program rejects such tokens instead of guessing,
// so that a typing error never names a different chord.
#ifndef TONVEX_TOOLS_NOTETOKEN_H
#define TONVEX_TOOLS_NOTETOKEN_H

#include <tonvex/Note.h>

#include <string>
#include <string_view>

/// Why a token is not a note.
enum TTokenProblem : int { Token_Ok = 0, Token_Unreadable, Token_OutOfRange };

/// What a token was read as, for the messages.
enum TTokenKind : int { Kind_NoteName, Kind_Note, Kind_KeyNumber };

/// Reads a whole token as a note name: a letter A..H (either case), an optional
/// accidental (bb, b, x, #) and an optional octave number, nothing else; the octave
/// is numbered as CChordnamePref::NoteNr_60_is says. Without an octave the note lies
/// in the lowest octave (note numbers 0..11). A name whose octave puts it outside
/// 0..127 is out of range (the library would clamp "C12" to note 108). A natural
/// black key (the letter B read as B flat under Bb_is_B) gets its usual spelling.
TTokenProblem ReadNoteName(std::string_view token, CNote& note);

/// Reads a note name (as ReadNoteName) or a note number 0..127, which is spelled as
/// C major spells its key (C#, Eb, F#, Ab, Bb).
TTokenProblem ReadNote(std::string_view token, CNote& note);

/// Reads a key number 0..11 (C = 0).
TTokenProblem ReadKeyNumber(std::string_view token, int& keyNr);

/// "cannot read note 'X9'" or "note 'C12' is out of range (C-2 to G8)": the kind
/// is named "note name", "note" or "key number"; the range of note names follows
/// the octave numbering in force.
std::string TokenProblemText(TTokenProblem problem, TTokenKind kind, std::string_view token);

/// Whether the token is a plain decimal number (an optional minus sign and at most
/// nine digits).
bool IsDecimalNumber(std::string_view token);
/// The value of a token that IsDecimalNumber accepts, read the same in every locale.
int DecimalValue(std::string_view token);

#endif
