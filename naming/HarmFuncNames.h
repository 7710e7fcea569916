// Texts of harmonic function codes (internal).
#ifndef TONVEX_NAMING_HARMFUNCNAMES_H
#define TONVEX_NAMING_HARMFUNCNAMES_H

/// The name of a harmonic function code (CChord::HarmFuncIn) as a Roman numeral, or
/// with `functional` as a letter of functional harmony, where some codes depend on
/// the key's mode. "undef" for code 0 and every code outside 0..15.
char const* HarmFuncText(int code, bool functional, bool majorKey);

#endif
