// The parts of a chord symbol: a chord's pitch classes over its root taken apart
// into a chord type, altered degrees, added degrees and omitted degrees, each tone
// with the degree that names it (internal).
#ifndef TONVEX_NAMING_SYMBOLBODY_H
#define TONVEX_NAMING_SYMBOLBODY_H

#include "Chord.h"
#include "naming/SymbolDegrees.h"

/// A chord type of the lead-sheet vocabulary: the text after the root and the tones
/// it stands for (ending at a tone of degree 0).
struct CSymbolType {
  char const* Text;     ///< plain text: "m7", "maj9", "7sus4"; "" for the major triad
  char const* SignText; ///< the text under SignStyle, or nullptr
  int SignStyle;        ///< the TSymbolStyle flag that selects SignText
  CSymbolTone Tones[8];
};

/// A symbol body: a chord type and the changes to it that give a set of intervals.
///
/// The intervals are those of the set; the reader rebuilds them from the written
/// parts in this order: the type's tones, the altered degrees (each replacing the
/// natural tone of its role, or added where the type has none), the extra degrees
/// (written as alterations where the type has a seventh and not their role, else as
/// additions), then the omissions.
struct CSymbolBody {
  CSymbolType const* Type = nullptr;
  /// Alterations of the type's own roles ("b5" in C7b5, "b9" in C13b9).
  CSymbolTone Altered[6] = {};
  int AlteredCount = 0;
  /// Tones the type does not hold, ascending by degree.
  CSymbolTone Extra[12] = {};
  int ExtraCount = 0;
  /// Roles of the type left out (bits 1 << TSymbolRole).
  unsigned Omitted = 0;
  /// Every interval of the set with its degree, from the type, the alterations and
  /// the extras.
  CSymbolTone Tones[12] = {};
  int ToneCount = 0;

  /// Whether an extra tone is written as an alteration: b9, #9, #11, b13 where the
  /// type has a seventh but not their degree ("C7b9"), else as an addition
  /// ("Caddb9", "C9addb9").
  bool WritesAsAlteration(CSymbolTone extra) const;
  /// Whether the interval is one of the extra tones.
  bool IsExtra(int intvl) const;
  /// The tone of the interval (a member of the set).
  CSymbolTone ToneOf(int intvl) const;
};

/// What a symbol of a chord describes: the root as the chord spells it, the pitch
/// classes of the notes as intervals above it, and the bass (the lowest note).
struct CSymbolChord {
  /// False for a chord without notes or with an undefined root ("N.C.", "N").
  bool Defined = false;
  CSpelledPitch Root = {0, 0};
  /// Bit i: a note lies i semitones above the root (pitch classes).
  unsigned Intvls = 0;
  int BassIntvl = 0;
  CSpelledPitch Bass = {0, 0};
};

CSymbolChord SymbolChordOf(CChord const& chord);

/// The body of the interval set (bit i = interval i above the root, 0..11): the chord
/// type that needs the fewest alterations, extras and omissions, the earlier in the
/// vocabulary on a tie. Sym_Alt in style admits "7alt".
CSymbolBody FindSymbolBody(unsigned intvls, int style);

#endif
