// Note names in English, German and solmisation style.
//
// The naming system is chosen by the static preferences of CChordnamePref:
// RomanNames (solmisation) wins over AccidentalsAsLetters (German), which wins over
// the English variants B_is_H and Bb_is_B. The preference object itself is not read.
#ifndef TONVEX_NOTENAMES_H
#define TONVEX_NOTENAMES_H

#include "ChordnamePref.h"
#include "Note.h"
#include "TonvexExport.h"

#include <string>

/// Full name of a key number with its spelling: "C#", "Eb", "Bx", "Fbb" (English),
/// "Cis", "Es", "Heses" (German), "Do#", "Mib" (solmisation).
///
/// The spelling decides the letter; the accidental comes from the letter's distance
/// to the key number, so an unusual pair (double flat on E flat's key) names the
/// nearest flat spelling, and a spelling outside 0..4 or a natural on a black key
/// names the usual spelling (C#, Eb, F#, G#, Bb). A key number outside 0..11 is
/// named by its pitch class (reduced into 0..11).
TONVEX_API std::string KeyNrAndEnhToName(int keyNr, TEnh enh, CChordnamePref const& pref);

/// The letter or syllable of the spelling without its accidental ("C" for C#,
/// "D" for Db, "Do" for Do#). German names are returned whole ("Cis"). With
/// Bb_is_B, key number 10 is "B" whatever its spelling. A key number outside 0..11
/// is named by its pitch class.
TONVEX_API std::string KeyNrToNameIgnoringEnh(int keyNr, TEnh enh, CChordnamePref const& pref);

#endif
