// Scales: a root, a scale type and the spelling of every key number in that scale.
//
// A CScale answers which key numbers belong to it and on which degree, maps degrees
// back to key numbers and notes, snaps key numbers onto the scale, moves notes
// within it, and supplies the spelling that notes and chords adopt when they are
// spelled in it (CNote::AdjustEnhToScale). Key signatures (CSignKey) are scales of
// the two types major and minor.
//
// The root is always a key number 0..11 with a senseful spelling. The spelling
// table starts from the key signature of the root (major, or minor for
// Scale_Minor), so a root spelled with a double accidental gives tables far past
// seven signs: D double flat major has 12 flats and spells its lowered sixth as a
// triple flat, stored as the spelling value -1. Such values are kept as computed;
// every function that reads them is defined for them (names treat them as the
// plain spelling, CheckEnh shifts them to a senseful one).
#ifndef TONVEX_SCALE_H
#define TONVEX_SCALE_H

#include "Note.h"
#include "TonvexExport.h"

class TONVEX_API CScale {
public:
  /// Scale types. Degrees above the root, in semitones:
  ///   Scale_Other       as major
  ///   Scale_Major       0 2 4 5 7 9 11
  ///   Scale_Minor       0 2 3 5 7 8 10
  ///   Scale_Chromatic   0 1 2 3 4 5 6 7 8 9 10 11
  ///   Scale_MajorMinor  0 2 3 4 5 7 9 10 11
  ///   Scale_MajorAddb7  0 2 4 5 7 9 10 11
  ///   Scale_MinorHarm   0 2 3 5 7 8 11
  ///   Scale_MinorMelo   0 2 3 5 7 9 11
  /// Any other value (negative, 8 and above) is kept as given and behaves as major.
  /// Only Scale_Minor spells and counts signs as minor; every other type, harmonic
  /// and melodic minor included, spells and counts like major.
  enum TType : int {
    Scale_Other = 0,
    Scale_Major = 1,
    Scale_Minor = 2,
    Scale_Chromatic = 3,
    Scale_MajorMinor = 4,
    Scale_MajorAddb7 = 5,
    Scale_MinorHarm = 6,
    Scale_MinorMelo = 7
  };

  /// Which way a key number between two degrees snaps on a tie. Only zero versus
  /// non-zero is read: 0 (Quantize_Up) takes the upper degree, any other value the
  /// lower one (see KeyNrQuantizeToDegreeNr).
  enum TQuantizeToScaleDirection : int { Quantize_Up = 0, Quantize_Down = 1 };

  /// C major: root C natural, the library's default scale type (major).
  CScale();
  /// The root is reduced to its key number (a negative note number gives key
  /// number 0), keeps its spelling and is checked with CheckEnh; then CalcEnh().
  CScale(CNote root, TType type);

  /// As the constructor.
  void SetRootNoteAndScaleType(CNote root, TType type);
  /// Root as in the constructor, then CalcEnh(); the type is kept.
  void SetRootNote(CNote root);
  /// A different type is stored and the spelling table recomputed; the current type
  /// changes nothing, so entries set with SetEnhForKeyNr survive.
  void SetScaleType(TType type);
  /// Stores the type only; the spelling table keeps its contents.
  void SetScaleTypeWithoutCalcEnh(TType type);

  /// The root: note number 0..11, spelled.
  CNote RootNote() const { return Root_; }
  TType ScaleType() const { return Type_; }

  /// 12 for chromatic, 9 for major-minor, 8 for major with added minor seventh,
  /// else 7.
  int DegreesPerOctave() const;
  /// Key number 0..11 of degree d (degree 0 is the root; degrees repeat every
  /// octave, so degree 7 of a major scale is the root again). A negative degree
  /// gives the root.
  int DegreeNrToKeyNr(int d) const;
  /// The note of degree d: note number 0..11, spelled by the table, then CheckEnh.
  CNote DegreeNrToKey(int d) const;
  /// The degree whose key number is k, or -1. k is not reduced: 12 is not the root.
  int KeyNrToDegreeNr(int k) const;
  /// KeyNrToDegreeNr of the note's key number (NoteNr % 12, negative for a negative
  /// note number, which is then on no degree).
  int NoteToDegreeNr(CNote note) const;
  bool HasKeyNr(int k) const { return KeyNrToDegreeNr(k) >= 0; }
  bool HasNote(CNote note) const { return NoteToDegreeNr(note) >= 0; }

  /// The degree a key number snaps to. A key number on a degree gives that degree.
  /// Otherwise the nearest lower and upper candidates are compared by their plain
  /// difference to k (no wrap around the octave), a tie decided by `dir`. Both
  /// candidates start at the root, and that is kept on purpose: when the root lies
  /// above k the lower candidate stays on the root, when it lies below k the upper
  /// candidate does. So in C major key numbers between two degrees snap downward
  /// (1 -> 0, 3 -> 1, 6 -> 3, 8 -> 4, 10 -> 5), and in G major C sharp snaps to
  /// degree 4 (D). Key numbers 11 and 0 compare against the octave's edge: for 11
  /// the upper candidate is C when the scale has it (else the root) and the lower
  /// one the highest degree; for 0 the lower candidate is B when the scale has it
  /// (else the root) and the upper one the lowest degree. Key numbers outside
  /// 0..11 are compared like 1..10. With both candidates starting at the root, a
  /// tie between two different degrees never arises, so `dir` does not change any
  /// result; it is kept for callers that pass it.
  int KeyNrQuantizeToDegreeNr(int k, TQuantizeToScaleDirection dir) const;
  /// KeyNrQuantizeToDegreeNr of the note's key number (NoteNr % 12).
  int NoteQuantizeToDegreeNr(CNote note, TQuantizeToScaleDirection dir) const;

  /// The note moved by `steps` degrees within the scale:
  ///  1. whole octaves: the octave (counted from -1 at note 0, of the low 8 bits of
  ///     the note number) grows by steps / DegreesPerOctave() (truncating) and is
  ///     applied with the rule of CNote::SetOct, so octaves below -1 and above 8
  ///     land where SetOct puts them;
  ///  2. a key number outside the scale is raised a semitone at a time (clamped to
  ///     0..127) until it is in the scale; where note 127 is reached on a key
  ///     number outside the scale it stays there, since it cannot go higher;
  ///  3. the remaining steps % DegreesPerOctave() degrees are walked one degree at a
  ///     time, up for positive and down for negative steps, to the nearest higher
  ///     or lower note in the scale; the walk stops at the edges of 0..127. (Only
  ///     an upward move can reach octave 9 of G# .. B, which SetOct puts at
  ///     128..131 unclamped: such a note stays there.)
  /// So a note off the scale is first snapped up: C sharp moved by -1 in C major is
  /// C, moved by 0 it is D. The result is spelled as the scale spells its key number
  /// and then checked with CheckEnh. The undefined note is not special: note 255
  /// has octave 20 by the rule of step 1, which SetOct puts in octave 8.
  CNote MoveInScale(CNote note, int steps) const;

  /// The spelling table entry of key number k. Every key number, negative or above
  /// 11, reads the entry of its pitch class (k reduced into 0..11).
  TEnh EnhForKeynr(int k) const;
  /// The entry of the note's pitch class.
  TEnh EnhForNote(CNote const& note) const;
  /// Overwrites the entry of k's pitch class (k reduced into 0..11); the spelling
  /// is stored unchecked.
  void SetEnhForKeyNr(int k, TEnh enh);
  /// Overwrites the entry of the note's pitch class, unchecked.
  void SetEnhForNote(CNote const& note, TEnh enh);
  /// Overwrites the entry of the key number `step` semitones above the root
  /// ((root + step) reduced into 0..11), unchecked. Chord spelling uses it to spell
  /// a minor second as a lowered second degree.
  void SetEnhForChromStep(int step, TEnh enh);
  /// Recomputes the spelling table from the key signature of the root (minor for
  /// Scale_Minor, else major) and the chromatic steps between its degrees: above
  /// the root a major-type scale spells interval 1 as the raised root, 3 as the
  /// lowered third, 6 as the raised fourth, 8 as the lowered sixth and 10 as the
  /// lowered seventh; a minor scale spells 1 as the lowered second, 4 as the raised
  /// third, 6 as the raised fourth, 9 as the raised sixth, and leaves interval 11
  /// as the key signature did, which is a plain letter (A minor: key number 8 keeps
  /// the natural spelling, named "G#"; C minor: B).
  void CalcEnh();

  /// Key signature of the scale: sharps positive, flats negative. The root's
  /// spelling decides between enharmonic keys (C sharp major 7, D flat major -5);
  /// double accidentals count 7 per sign (D double flat major -12). Scale_Minor
  /// counts as minor, every other type as major.
  int SignsCount() const;

private:
  CNote Root_;
  TType Type_ = Scale_Major;
  TEnh Enh_[12] = {};
};

#endif
