// Chord symbols: the lead-sheet symbols musicians write ("C9", "Am7", "F#m7b5/C") and
// the chord labels of Harte et al. that music-information tools exchange ("C:9",
// "A:min7", "C:maj/3").
//
// A symbol describes what a chord holds, not how it is voiced: the root as the chord
// has it (RootNote(), with its spelling), the pitch classes of the notes above that
// root, and the bass (the lowest note, spelled as the chord spells it). Every set of
// pitch classes over a root has a symbol that reads back to exactly that set and bass,
// odd sets included: they fall back to added, altered and omitted degrees ("Cadd#11",
// "C(b5,no3)"), and a chord without its root says so ("Cmaj7(no1)/E", "C:maj7(*1)/3").
// The existing names (CChord::Name) are a different, older vocabulary and stay as
// they are.
//
// Lead-sheet vocabulary (over C; the written form first, then what else is read):
//   C        major triad 1 3 5             (CM, Cmaj)
//   Cm       minor triad 1 b3 5            (Cmin, Cmi, C-)
//   Cdim     diminished triad 1 b3 b5      (Co, C°)
//   Caug     augmented triad 1 3 #5        (C+)
//   Csus4    1 4 5                         (Csus)
//   Csus2    1 2 5
//   C5       1 5
//   C6       1 3 5 6                       Cm6   1 b3 5 6
//   C6/9     1 3 5 6 9          (C69)      Cm6/9 1 b3 5 6 9
//   C7       1 3 5 b7                      Cm7   1 b3 5 b7
//   Cmaj7    1 3 5 7   (CM7, CΔ, CΔ7, Cma7, Cj7)
//   Cm(maj7) 1 b3 5 7  (CmM7, Cmmaj7, CmΔ7)
//   Cdim7    1 b3 b5 bb7 (Co7, C°7)        Cm7b5 1 b3 b5 b7 (Cø, Cø7)
//   C7sus4   1 4 5 b7                      C7sus2, Cmaj7sus4, Cmaj7sus2 alike
//   C9       1 3 5 b7 9                    Cmaj9, Cm9, Cm(maj9), C9sus4 alike
//   C11      1 3 5 b7 9 11                 Cm11  1 b3 5 b7 9 11
//   C13      1 3 5 b7 9 13 (the 11th only where it is written: C11add13)
//   Cmaj13   1 3 5 7 9 13                  Cm13  1 b3 5 b7 9 13; C13sus4 alike
// Alterations after the chord change a degree: b5 and #5 replace the 5th, b9 and #9
// the 9th, #11 the 11th, b13 the 13th; where the chord has no such degree they add
// one (C7b9 is 1 3 5 b7 b9, C7#9 holds the #9 beside the 3rd). "alt" stands for
// b5 #5 b9 #9 over the dominant seventh (C7alt). Additions ("add9", "add2", "add4",
// "add11", "add#11", "addb6", "add13", "addb7", "addmaj7") add a degree; omissions
// ("no1", "no3", "no5", also "omit3"; a bare "no root" too) remove one. A slash names
// the bass, a note ("C/E", "Am7/G") or, as in Harte labels, a degree ("C/3"); the bass
// belongs to the chord ("C/D" holds C D E G).
//
// Harte labels: ROOT ":" SHORTHAND ["(" DEGREES ")"] ["/" DEGREE], "N" for no chord.
// The writer uses the shorthands maj, min, dim, aug, maj7, min7, 7, dim7, hdim7,
// minmaj7, maj6, min6, 9, maj9, min9, sus2 and sus4 where one names the chord
// exactly, and a degree list otherwise ("C:(3,5,b7,#9)"); the root is implied in a
// list, "*1" removes it. The reader also knows the shorthands 1, 5, aug7, 11, maj11,
// min11, 13, maj13 and min13, and a list after a shorthand ("C:min7(*5,11)").
#ifndef TONVEX_CHORDSYMBOL_H
#define TONVEX_CHORDSYMBOL_H

#include "Chord.h"
#include "TonvexExport.h"

#include <cstddef>
#include <string>
#include <string_view>

/// Style flags of LeadSheetSymbol; 0 is plain ASCII ("#", "b", "maj7", "m7b5", "dim",
/// "aug"). Combine them with |.
enum TSymbolStyle : int {
  Sym_Plain = 0,
  /// "♯", "♭", "𝄪", "𝄫" for the accidentals, of the root, the bass and the degrees.
  Sym_UnicodeSigns = 1,
  /// "Δ" for the major seventh: CΔ7, CΔ9, CmΔ7.
  Sym_Triangle = 2,
  /// "ø7" for the half-diminished seventh: Cø7.
  Sym_HalfDimSign = 4,
  /// "o" for diminished, "°" with Sym_UnicodeSigns: Co, Co7, C°7.
  Sym_DimSign = 8,
  /// "+" for the augmented triad: C+.
  Sym_PlusSign = 16,
  /// "7alt" for the dominant seventh with b5, #5, b9 and #9 and nothing else.
  Sym_Alt = 32
};

/// The lead-sheet symbol of the chord: "C", "Am7", "F#m7b5/C", "Bb13", "C7#9",
/// "C/E". Style is a combination of TSymbolStyle flags. Root and bass are spelled as
/// the chord spells them (its root, its lowest note); the bass is written after a
/// slash whenever its pitch class is not the root's, however narrow the voicing. A
/// bass that is only an added tone stands after the slash alone ("C/D", not
/// "Cadd9/D"). A chord without notes or with an undefined root is "N.C.". The result
/// reads back (ReadChordSymbol) to the same root, pitch classes and bass.
TONVEX_API std::string LeadSheetSymbol(CChord const& chord, int style = 0);

/// The Harte label of the chord: "C:maj", "A:min7", "C:maj/3", "C:7/b7",
/// "C:(3,5,b7,#9)", "C:maj7(*1)/3"; "N" for a chord without notes or with an
/// undefined root. It names exactly the chord's pitch classes and bass, the degrees
/// spelled as the lead-sheet symbol names them.
TONVEX_API std::string HarteLabel(CChord const& chord);

/// Where and why ReadChordSymbol stopped.
struct CChordSymbolProblem {
  /// Byte offset of the first character that could not be read.
  std::size_t Offset = 0;
  /// The text from there on, as it was given.
  std::string Part;
  /// What was wrong there: "not a note name", "unexpected text", ...
  std::string Reason;
};

/// Reads a lead-sheet symbol or a Harte label into the chord (a text whose root is
/// followed by ":" is read as a Harte label; "N", "NC" and "N.C." are no chord and
/// make the chord undefined). Blanks may stand around the text and between its parts
/// ("C7 (b9, #11)"); words are read in any case ("MAJ7", "Sus4"), the single letters
/// by case ("m" minor, "M" major); the signs ♯ ♭ 𝄪 𝄫 Δ ø Ø ° are read as well as
/// # b x, "o" and "+"/"-" before a degree.
///
/// The chord gets its notes in this voicing: the bass at note number 48 + its pitch
/// class, the other degrees up to the 7th within the octave above it, the 9th, 11th
/// and 13th (and additions written as those) an octave higher. Without a slash the
/// root is the bass, or the chord's lowest degree when the root is left out. Each
/// note is spelled by its degree above the root as the symbol names it (C7#9 holds
/// D#, C7b13 Ab, F#m7b5 C), or by its usual spelling where that would need more than
/// two accidentals; a bass given as a note keeps its spelling as written. The root is
/// set (specified) at its key number 0..11 with its spelling as written.
///
/// Returns false and leaves the chord unchanged when the text cannot be read; the
/// problem, when given, then says where and why.
TONVEX_API bool ReadChordSymbol(std::string_view text, CChord& chord, CChordSymbolProblem* problem = nullptr);

#endif
