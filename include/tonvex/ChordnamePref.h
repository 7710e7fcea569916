// Naming preferences.
//
// Every preference is a static member, shared by the whole process: changing one
// changes naming everywhere at once, and nothing guards against changes from two
// threads. Naming functions nevertheless take a CChordnamePref argument; pass
// DefaultChordnamePref when you have none of your own. A flag is off at 0 and on at
// any other value.
#ifndef TONVEX_CHORDNAMEPREF_H
#define TONVEX_CHORDNAMEPREF_H

#include "TonvexExport.h"

class TONVEX_API CChordnamePref {
public:
  /// Octave number shown for note 60 (and read by CNote::SetFromString):
  /// 0 = octave 3 (default), 1 = octave 4, 2 = octave 5.
  static int NoteNr_60_is;
  /// Harmonic function names: 1 = functional letters ("T", "Sp", "D"),
  /// anything else = Roman numerals ("I", "IIm", "V"). Default 0.
  static int HarmFuncNaming;
  /// Separator between chord options: 1 = parentheses ("7(9)"), anything else =
  /// slash ("7/9"). Default 0.
  static int ChordOptionSep;
  /// Stored for programs that keep it; no naming operation reads it. Default 4.
  static int PreferSlashChordIfMoreNotesThan;
  /// Separate the blocks of a chord name with "," instead of " ". Default 0.
  static int SeparateBlocksInNames;
  /// Stored for programs that keep it; no naming operation reads it. Default 0.
  static int PreferSlashChord;
  /// Stored for programs that keep it; no naming operation reads it. Default 0.
  static int InversionAsName;
  /// Stored for programs that keep it; no naming operation reads it. Default 0.
  static int ShowInversion;
  /// Stored for programs that keep it; no naming operation reads it. Default 0.
  static int NoDoubleSigns;
  /// Chords spanning at most an octave are named without a slash bass. Default 1.
  static int NarrowChordsWithoutSlash;
  /// In a chord wider than an octave, an interval whose only note is the lowest one
  /// gives no option. Default 1.
  static int OmitOptionOfLonelyLowestNoteInWideChord;
  /// Major seventh option: 1 = "j7", 2 = "maj7", anything else = "ma7". Default 0.
  static int Maj7ShownAs;
  /// Minor chords start with a small letter ("c m 7"). Default 0.
  static int MinorSmall;
  /// Note names as solmisation syllables (Do Re Mi Fa So La Ti); takes precedence
  /// over AccidentalsAsLetters, Bb_is_B and B_is_H. Default 0.
  static int RomanNames;
  /// German note names (Cis, Es, B, H); takes precedence over Bb_is_B and B_is_H.
  /// Default 0.
  static int AccidentalsAsLetters;
  /// English names: B flat is written "B"; the parser reads the letter B as B flat.
  /// Default 0.
  static int Bb_is_B;
  /// English names: a name beginning with B (other than "Bb") begins with "H".
  /// Default 0.
  static int B_is_H;
};

/// The preference object to pass when a caller has none of its own.
extern TONVEX_API CChordnamePref DefaultChordnamePref;

#endif
