// Reading a key, the one way that the key and scale commands and --key share.
#ifndef TONVEX_TOOLS_KEYTEXT_H
#define TONVEX_TOOLS_KEYTEXT_H

#include <tonvex/SignKey.h>

#include <string>
#include <string_view>

/// Reads a key: a tonic, a note name without octave as ReadNoteNameAtStart reads it
/// (C, F#, Bb, F♯; with --german Fis, Es, B, H; with --solfege Do, Mib), and an
/// optional mode, attached or after blanks: m, min or minor for minor, maj or major
/// for major; the words in any case ("C", "Cm", "F#m", "Bb major", "C MAJ"). Without
/// a mode a tonic written with a small letter is minor, as in classical notation:
/// "c", "bb", "f# minor", "fis". Blanks around the text are ignored. Returns false,
/// leaving key unchanged, when the text is not such a key.
bool ReadKey(std::string_view text, CSignKey& key);

/// "cannot read key 'H#m7'", the text quoted as Quoted quotes it.
std::string KeyProblemText(std::string_view text);

#endif
