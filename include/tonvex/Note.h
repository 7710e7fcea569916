// Notes and their enharmonic spelling.
//
// A CNote is a pitch on the MIDI scale (note number 0..127, 60 = middle C, 255 =
// undefined) together with the way it is spelled (C sharp or D flat). Everything
// in Tonvex passes notes by value. Nothing here allocates and nothing fails: note
// numbers are clamped and spellings are corrected.
//
// Three quantities are kept apart:
//   note number  the absolute pitch, NoteNr();
//   key number   the pitch class NoteNr % 12 (truncating remainder, so a negative
//                note number has a negative key number), C = 0 .. B = 11;
//   octave       NoteNr / 12 (truncating).
#ifndef TONVEX_NOTE_H
#define TONVEX_NOTE_H

#include "TonvexExport.h"

#include <cstdint>
#include <iosfwd>
#include <string>

class CChordnamePref;
class CScale;

/// Enharmonic spelling, ordered from the flattest to the sharpest. The values are
/// stored in tables and compared with `<`; values outside 0..4 are tolerated
/// everywhere (they are never senseful, see IsSensefulEnhForKeyNr).
enum TEnh : int { Enh_DoubleFlat = 0, Enh_Flat = 1, Enh_Natural = 2, Enh_Sharp = 3, Enh_DoubleSharp = 4 };

/// A pitch with its spelling.
///
/// The spelling is a presentation detail: it is `mutable`, and the spelling
/// operations (CheckEnh, SetEnh, EnhShift...) are const although they rewrite it.
/// Every note number setter clamps: 255 (undefined) passes, values below 0 become 0,
/// values above 127 become 127. SetKeyNr, SetOct and the parser's octave rule may
/// leave a note number outside 0..127 (negative, 128..131, 253); see each operation.
class TONVEX_API CNote {
public:
  /// Note number 0 (C), natural.
  CNote() = default;
  /// Clamps the note number, stores both values, then CheckEnh().
  CNote(long noteNr, TEnh enh);

  long NoteNr() const { return NoteNr_; }
  /// NoteNr % 12 with the truncating remainder (negative for a negative NoteNr).
  int KeyNr() const { return NoteNr_ % 12; }
  /// NoteNr / 12 (truncating); note 60 is octave 5 by this count.
  int Oct() const { return NoteNr_ / 12; }
  TEnh Enh() const { return Enh_; }

  /// Clamps and stores the note number; the spelling is left as it is.
  void SetNoteNr(long noteNr);
  /// Clamps and stores the note number, then CheckEnh().
  void SetNoteNrAndCheckEnh(long noteNr);
  /// Clamps and stores the note number, stores the spelling, then CheckEnh().
  void SetNoteNrAndEnh(long noteNr, TEnh enh);
  /// Replaces the key number and keeps the octave: the octave base is
  /// (low 8 bits of NoteNr) / 12 * 12, the key number is reduced into 0..11.
  /// Not clamped afterwards (the undefined note 255 with key number 1 becomes 253).
  /// The spelling is left as it is.
  void SetKeyNr(int keyNr);
  /// SetKeyNr(keyNr), then CheckEnh().
  void SetKeyNrAndEnh(int keyNr);
  /// Replaces the octave and keeps the key number k = NoteNr % 12. Octave -1 starts
  /// at note 0 (note 60 is octave 4) whatever the naming preferences say:
  ///   oct < -1        NoteNr = -k (zero or negative, not clamped);
  ///   -1 <= oct <= 9  NoteNr = k + 12 * oct + 12 (octave 9 of G# .. B gives 128..131);
  ///   oct >= 10       NoteNr = k + 108 (octave 8, not 9).
  /// The spelling is untouched.
  void SetOct(int oct);
  /// Note number 0, natural.
  void Clear();

  /// Stores the spelling, then CheckEnh().
  void SetEnh(TEnh enh) const;
  /// Makes the spelling senseful for the key number: a senseful spelling stays; a
  /// natural spelling of a black key becomes the spelling of the default C major
  /// scale (C#, Eb, F#, Ab, Bb); anything else is shifted once with ::EnhShift.
  void CheckEnh() const;
  /// IsSensefulEnhForKeyNr(KeyNr(), Enh()).
  bool HasSensefulEnh() const;
  /// Key number 1, 3, 6, 8 or 10 (a negative key number is never black).
  bool IsBlackKey() const;
  /// Replace the spelling by the free function of the same name.
  void EnhShift() const;
  void EnhShiftToFlats() const;
  void EnhShiftToSharps() const;
  /// Spells the note as the scale spells its key number (CScale::EnhForKeynr; a
  /// negative key number reads the entry of its pitch class). The spelling is not
  /// checked afterwards: a scale on a double-flat root can hand out a triple flat
  /// (-1), which the note keeps until something calls CheckEnh.
  void AdjustEnhToScale(CScale const& scale) const;

  /// "Undefined" for the undefined note, else KeyNrAndEnhToName of the key number.
  /// A negative key number is named by its pitch class.
  std::string KeyName(CChordnamePref const& pref) const;
  /// "Undefined" for the undefined note, else KeyNrToNameIgnoringEnh.
  std::string KeyNameWithoutEnh(CChordnamePref const& pref) const;
  /// The octave number as shown under CChordnamePref::NoteNr_60_is (by default note
  /// 60 is octave 3); the empty string for the undefined note.
  std::string OctName(CChordnamePref const& pref) const;

  /// Parses a note name such as "C3", "eb", "G#-2", "  d#5", "Bbb4", "H2".
  ///
  /// Leading blanks are skipped; a letter A..H (either case) gives the key number
  /// (B is B flat when CChordnamePref::Bb_is_B is on; H is always B natural). An
  /// accidental "bb", "b", "x" or "#" (case-sensitive) moves the key number with
  /// wrap-around and sets the spelling; a bare letter keeps the spelling the note
  /// had. The rest is read as a decimal octave number (leading white space and a
  /// sign allowed, trailing characters ignored, no digits = 0) under NoteNr_60_is and
  /// applied by the rule of SetOct. The accidental never changes the octave: "Cb3"
  /// is key number 11 in octave 3 and "B#3" is note 60.
  ///
  /// Returns false, leaving the note unchanged, when the text is empty, all blanks,
  /// or does not start (after blanks) with a letter A..H.
  bool SetFromString(std::string text, CChordnamePref const& pref);

  /// Diagnostic hook; prints nothing.
  void Trace() const {}

private:
  std::int32_t NoteNr_ = 0;
  mutable TEnh Enh_ = Enh_Natural;
};

/// The undefined note: note number 255, spelled flat (255 % 12 = 3, where a natural
/// spelling is not senseful). Recognise undefined notes by NoteNr() == 255.
extern TONVEX_API const CNote CNote_Undef;

/// Equal note number and equal spelling: C sharp and D flat are different notes.
TONVEX_API bool operator==(CNote const& a, CNote const& b);
TONVEX_API bool operator!=(CNote const& a, CNote const& b);
/// Note number first, then spelling (double flat .. double sharp).
TONVEX_API bool operator<(CNote const& a, CNote const& b);

/// "CNote: " + name + octave (under the current preferences) + " (NoteNr n, Enh e)",
/// for example "CNote: C#3 (NoteNr 61, Enh 3)". No line end.
TONVEX_API std::ostream& operator<<(std::ostream& os, CNote const& note);

// Spellings of a key number. A key number outside 0..11 behaves like D (key 2).

/// Whether the spelling names the key number with a letter and at most two
/// accidentals of that kind (C: Dbb, C, B#; C#: Db, C#, Bx; G#: Ab, G# ...).
TONVEX_API bool IsSensefulEnhForKeyNr(int keyNr, TEnh enh);
/// One step toward the flat side (C# -> Db, C -> Dbb, E -> Fb ...).
TONVEX_API TEnh EnhShiftToFlats(int keyNr, TEnh enh);
/// One step toward the sharp side (Db -> C#, C -> B#, E -> Dx ...).
TONVEX_API TEnh EnhShiftToSharps(int keyNr, TEnh enh);
/// The other spelling: sharp-side spellings (and a natural E or B) step toward the
/// flats, all others toward the sharps. C# and Db toggle, C goes to B# and back.
TONVEX_API TEnh EnhShift(int keyNr, TEnh enh);
/// Returns the spelling unchanged, whatever the key number. Kept for programs that
/// call it; use CNote::CheckEnh to obtain a senseful spelling.
TONVEX_API TEnh MakeSensefulEnhForKeyNr(int keyNr, TEnh enh);

// Intervals and distances between two notes.

/// b.NoteNr - a.NoteNr (positive when b is higher).
TONVEX_API int IntvlFromTo(CNote const& a, CNote const& b);
/// |a.NoteNr - b.NoteNr|.
TONVEX_API int DistanceBetween(CNote const& a, CNote const& b);
/// b.KeyNr - a.KeyNr, not normalised (-11..11). Each key number is taken as its
/// pitch class 0..11 first, so a note with a negative note number (left by SetOct
/// or the parser) counts by its pitch class here and in the three functions below.
TONVEX_API int KeyIntvlFromTo(CNote const& a, CNote const& b);
/// The key number difference brought into 0..11.
TONVEX_API int AbsKeyIntvlFromTo(CNote const& a, CNote const& b);
/// Shortest distance between the key numbers around the octave (0..6).
TONVEX_API int KeyDistanceBetween(CNote const& a, CNote const& b);
/// Signed shortest way from a's key number to b's, in -6..5: the tritone is
/// always -6.
TONVEX_API int SmallestKeyIntvlBetween(CNote const& a, CNote const& b);

#endif
