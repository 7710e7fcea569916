// The spellings root finding gives a found root and the chord's notes, as tables
// (internal).
//
// Root finding spells the root's pitch class with the fewest signs and then every
// note as the chord's scale spells its key number (CChord::SetRootNoteEnhWithLeastSigns,
// CChord::AdjustEnhOfChordNotesToRootScale). For a root that root finding sets (a
// pitch class in the lowest octave, spelled as C major spells it) and a chord whose
// intervals lie within the octave, both depend on nothing but the root's pitch
// class, the basic chord and whether the minor second lies above the root. The
// tables hold them for every such case, computed once when the library is loaded by
// the functions the chord's own operations use.
#ifndef TONVEX_CHORD_ROOTSPELLINGS_H
#define TONVEX_CHORD_ROOTSPELLINGS_H

#include "Chord.h"

/// The spelling of `root` with the fewest signs: root as it is, one enharmonic step
/// toward the flats, or one toward the sharps, by the magnitude of KeySignCount;
/// ties keep the root, then prefer the flats. The root's own count is taken with the
/// basic chord `bcAsIs`, the other two with `bcOthers` (a chord's interval cache may
/// be rebuilt between them). The root comes back as given; a flatter or sharper
/// spelling as its count leaves it (KeySignCount respells one that is not senseful).
CNote LeastSignsRoot(CNote const& root, CChord::TBasicChord bcAsIs, CChord::TBasicChord bcOthers);

class CRootSpellings {
public:
  /// Computes the tables.
  CRootSpellings();

  /// The root root finding sets for the pitch class 0..11 in a chord of basic chord
  /// bc (0..7): LeastSignsRoot of CNote(pitchClass, Enh_Natural).
  CNote const& Root(CChord::TBasicChord bc, int pitchClass) const { return Roots_[bc][pitchClass]; }
  /// The spelling the chord's scale (ChordScale) on Root(bc, rootPitchClass) gives
  /// key number 0..11, unchecked, as CNote::AdjustEnhToScale takes it; and the
  /// spelling CNote::CheckEnh makes of it, which a note ends with.
  struct CNoteEnh {
    signed char Unchecked;
    signed char Checked;
  };
  CNoteEnh NoteEnh(CChord::TBasicChord bc, bool minorSecond, int rootPitchClass, int keyNr) const {
    return NoteEnhs_[bc][minorSecond ? 1 : 0][rootPitchClass][keyNr];
  }

private:
  CNote Roots_[8][12];
  CNoteEnh NoteEnhs_[8][2][12][12];
};

/// Built when the library is loaded (chord/LoadTimeObjects.cpp); never changed.
extern const CRootSpellings RootSpellings;

#endif
