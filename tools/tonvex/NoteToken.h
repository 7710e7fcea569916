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

/// The text with the signs people type (♯ ♭ 𝄪 𝄫) written #, b, x and bb. Returns
/// text itself when it has none, else a view of buffer.
std::string_view WithPlainSigns(std::string_view text, std::string& buffer);

/// Reads the note name at the start of text, without an octave, and returns its
/// length (0 when there is none). Under the German or solfège preference the names
/// that the library writes in that style are read too, in any case (Fis, es, B for
/// B flat, H; Do#, Mib), the longest that fits; besides these the German names His,
/// Hisis, Eses and Ases. Otherwise, or when the text after such a name is not one
/// that restFits accepts, a letter A..H (either case) with an optional accidental
/// bb, b, x or # is read as the library reads it (B is B flat under Bb_is_B). The
/// note has a key number 0..11 and the spelling of the name (a bare letter natural,
/// so that the caller's CheckEnh spells a natural black key as usual).
std::size_t ReadNoteNameAtStart(std::string_view text, CNote& note, bool (*restFits)(std::string_view rest));

/// Reads a whole token as a note name: a name as ReadNoteNameAtStart reads it (after
/// WithPlainSigns) and an optional octave number, nothing else; the octave is
/// numbered as CChordnamePref::NoteNr_60_is says. Without an octave the note lies
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
/// the octave numbering in force. The token is quoted as Quoted quotes it.
std::string TokenProblemText(TTokenProblem problem, TTokenKind kind, std::string_view token);

/// Whether the token is a plain decimal number (an optional minus sign and at most
/// nine digits).
bool IsDecimalNumber(std::string_view token);
/// The value of a token that IsDecimalNumber accepts, read the same in every locale.
int DecimalValue(std::string_view token);

/// Whether text starts with prefix, the ASCII letters compared in either case.
bool StartsWithIgnoringCase(std::string_view text, std::string_view prefix);

#endif
