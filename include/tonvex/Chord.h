// Chords: a root note, the sounding notes, and the intervals of the notes above the
// root; their basic chord, XG chord type, root finding, relation to a key, options
// and names.
//
// A CChord is a plain value; copy it freely. It holds
//   - a root note, which need not be one of the notes: while no root has been
//     specified, the root follows the lowest note;
//   - the sounding notes, an ordered set (lowest first) of distinct notes, where the
//     same pitch in two spellings counts as two notes;
//   - an interval cache (a CIntvlSet with the wrap interval chosen at construction)
//     of the intervals of the notes above the root.
//
// The interval cache is rebuilt lazily: editing the notes or the root marks it
// stale, and the next query rebuilds it from the notes, folded into 0..11 (the
// queries are const; the cache is mutable). Some edits write into the cache
// directly instead and leave it fresh: AddNote under a specified root inserts the
// unfolded difference (so with wrap interval 24 a ninth stays 14 until the next
// rebuild), AddIntvlInCompingRange and ChangeAllNotesWithinIntvlRange insert their
// interval. Transpose and Invert leave the cache as it was. So the cache describes
// the notes only as far as the last rebuild and the direct inserts since; which
// operation does what is documented at each one.
//
// Pitch class arithmetic: the interval of a note n above the root r is
// (n % 12 - r % 12) brought into 0..11; key numbers are brought into 0..11 the same
// way wherever they are compared.
//
// Nothing here throws or fails: note numbers are clamped to 0..127 where they are
// computed (255 is the undefined note), indices out of range give the undefined note
// or -1, and undefined results are the undefined note or chord. Operations that move
// notes by octaves (Invert, SetLowestNoteInOctave) can leave note numbers 128..131,
// which are kept as they are.
//
// Threads. A chord keeps all its state in itself, and what the library shares (the
// tables of root finding, the spelling tables, the built-in net's data) is built
// when the library is loaded and only read afterwards. So any number of threads may
// at once work on chords of their own: set their notes, find their roots by net or
// by rules, name them, relate them to keys. Not safe while other threads do that:
//   - changing a naming preference (CChordnamePref: all are process-wide statics);
//   - building, copying or training a NeuronalNet, or calling Neuron::SetCalcParams:
//     they set the process-wide Neuron parameters that root finding by net reads;
//   - one CChord object used by two threads at once, even through const members
//     only: the queries rebuild its interval cache, SignsCount and NameWithSlash
//     respell its notes; the same for a note handed to a call that respells it
//     (the root given to NameForThisRootNote or NameWithLeastSignsForThisRootNote).
#ifndef TONVEX_CHORD_H
#define TONVEX_CHORD_H

#include "ChordnamePref.h"
#include "IntvlSet.h"
#include "MySet.h"
#include "Note.h"
#include "Scale.h"
#include "TonvexExport.h"

#include <cstddef>
#include <map>
#include <string>
#include <vector>

class CSignKey;

/// Algorithm of root finding (CChord::SetRootNoteAndEnh_ToLikeliestRegardingNoteSet).
/// Every value other than SCA_NEURONAL_NET selects the rule-based scores.
enum TSingleChordAnalysisAlgo : int { SCA_RULE_WEIGHTS = 0, SCA_NEURONAL_NET = 1 };

class TONVEX_API CChord {
public:
  /// Triad family of a chord. Values from 8 upward (and negative values) are accepted
  /// everywhere and mean "nothing" (no notes moved, no intervals, XG value 34, name
  /// "no 3").
  enum TBasicChord : int {
    bc_none = 0,
    bc_maj = 1,
    bc_min = 2,
    bc_aug = 3,
    bc_dim = 4,
    bc_sus4 = 5,
    bc_sus2 = 6,
    bc_drone = 7
  };

  /// An option of a chord name; the value indexes the option texts.
  enum TChordOption : int {
    co_b9 = 0,
    co_add_b9,
    co_9,
    co_add_9,
    co_sharp9,
    co_b3,
    co_3,
    co_11,
    co_add_11,
    co_sharp11,
    co_b5,
    co_5,
    co_b13,
    co_sharp5,
    co_13,
    co_7,
    co_6,
    co_ma7,
    co_j7,
    co_maj7
  };

  // ---- Construction and reset ------------------------------------------------

  /// Root C (note 0, natural), no notes, an empty interval cache with the given wrap
  /// interval (24 keeps ninths and thirteenths; 12 folds into one octave), all flags
  /// clear.
  explicit CChord(int wrapIntvl = 24);
  /// Sets the root, then SetFromNoteSet(notes), which makes the lowest note the root
  /// and clears the root-specified flag: the given root does not survive (the root
  /// is the lowest note, or the undefined note for an empty set). Set the root
  /// afterwards if you want one.
  CChord(CNote root, CMySet<CNote> notes, int wrapIntvl);
  /// An empty chord with the given root as it is (root specified, intervals fresh),
  /// then SetBasicChord(bc): the root's pitch class, third and fifth are added in the
  /// comping range 53..64. The root itself is not moved into that range.
  CChord(CNote root, TBasicChord bc, int wrapIntvl);

  /// Clears the three flags (root specified, intervals stale, lonely lowest note).
  void Init();
  /// Root C (note 0, natural), flags cleared, notes and intervals emptied (the wrap
  /// interval is kept).
  void Clear();
  /// No notes, empty intervals (fresh), root = the undefined note (specified).
  void SetUndefined();
  /// Whether the root's note number is 255.
  bool IsUndefined() const;

  // ---- Root ------------------------------------------------------------------

  CNote RootNote() const;
  /// Whether the root was given explicitly; while it was not, the root follows the
  /// lowest note.
  bool RootNoteSpecified() const;
  /// Sets the root and marks it specified; the intervals become stale when the chord
  /// has notes.
  void SetRootNote(CNote const& root);
  /// Sets the root without changing the root-specified flag.
  void SetRootNoteWithoutSpecify(CNote const& root);

  // ---- Notes -----------------------------------------------------------------

  /// Inserts the note as it is (a note equal in number and spelling is not inserted
  /// twice). While no root is specified the root becomes the lowest note and the
  /// intervals become stale. Then the note's difference to the root is inserted into
  /// the interval cache unfolded (raised by octaves while negative, then folded by the
  /// wrap interval only), unlike a rebuild, which folds into 0..11: under a specified
  /// root C4 and wrap 24, adding D5 puts 14 into the cache. Adding notes under a root
  /// specified before them therefore never triggers a rebuild: the cache, and the
  /// lonely-lowest-note mark that only a rebuild computes, stay as these inserts
  /// leave them until an edit marks the intervals stale.
  void AddNote(CNote const& note);
  /// Removes the note if present; the intervals become stale in any case, so the
  /// next query rebuilds them even when nothing was removed.
  void DelNote(CNote const& note);
  /// Removes the i-th note from the lowest if there is one (then the intervals
  /// become stale); an index out of range changes nothing.
  void DelNote(unsigned long i);
  /// Removes every note of octave oct (note number / 12 - 1, so note 60 is octave 4);
  /// the intervals become stale when a note was removed.
  void DeleteAllNotesInOctave(int oct);
  bool HasNote(CNote const& note) const;
  bool HasNoteNr(int noteNr) const;
  /// The i-th note from the lowest; the undefined note when i is out of range.
  CNote Note(unsigned long i) const;
  /// The sounding notes, lowest first.
  CMySet<CNote> const& Notes() const;
  unsigned long NoteCount() const;
  /// First / last note; the undefined note when the chord has none.
  CNote LowestNote() const;
  CNote HighestNote() const;
  int CountNotesInOctave(int oct) const;
  /// Replaces the lowest note: removes it, then adds n's pitch class (spelled as n,
  /// checked) at or below the new lowest note, within an octave (clamped to 0..127;
  /// on an empty chord the note stands at or below the undefined note 255, that is
  /// 127, or 255 itself for n's pitch class 3). Sets the lonely-lowest-note mark when
  /// n's pitch class is among the intervals of the remaining notes: the opposite
  /// sense to a rebuild's, where the mark means the pitch class stands alone. The
  /// next rebuild overwrites it.
  void SetLowestNote(CNote n);
  /// Adds the note of keyNr (brought into 0..11) in octave oct (limited to -1..9;
  /// note 60 is octave 4), spelled enh and checked. Octave 9 of G# .. B gives note
  /// numbers 128..131, which are kept. Despite the name it only adds: whether the
  /// note becomes the lowest depends on the other notes.
  void SetLowestNoteInOctave(int keyNr, int oct, TEnh enh);
  /// DeleteAllNotesInOctave(oct), then SetLowestNoteInOctave.
  void SetLowestNoteAloneInOctave(int keyNr, int oct, TEnh enh);
  /// Whether highest - lowest note number < 13 (true for an empty chord).
  bool IsNarrowChord() const;
  /// Same root (number and spelling) and the same notes (number and spelling); the
  /// flags and the interval cache are not compared. The same answer as operator==.
  bool IsExactlyTheSame(CChord const& other) const;
  /// The lonely-lowest-note mark that option naming reads (see UpdateIntvlSet and
  /// SetLowestNote for its two senses).
  bool LowestNoteLonely() const;

  // ---- Interval cache --------------------------------------------------------

  /// Rebuilds the interval cache from the notes: each note's pitch class interval
  /// above the root, 0..11 (then folded by the wrap interval). Also computes the
  /// lonely-lowest-note mark: set, then cleared when a higher note's difference
  /// (its key number - the root's key number, signed and not brought into 0..11)
  /// equals the lowest note's interval. So a doubled lowest pitch class that lies
  /// below the root's pitch class number (raw difference negative) still counts as
  /// lonely. The queries below call it first while the intervals are stale.
  void UpdateIntvlSet() const;
  /// The interval cache, brought up to date.
  CIntvlSet const& IntvlSet() const;
  /// The i-th smallest interval; -1 when i is out of range.
  int Intvl(unsigned long i) const;
  bool HasIntvl(int intvl) const;
  bool HasIntvlInAnyOctave(int intvl) const;
  bool HasOtherStackedThirdsOptionThan(int intvl) const;
  /// The first note (lowest first) whose pitch class interval above the root is the
  /// ix-th interval, else the lowest note (the undefined note for an empty chord).
  /// An ix out of range matches no note and gives the lowest note.
  CNote IntvlIxToNote(int ix) const;
  /// IntvlIxToNote(ix)'s note number % 12.
  int IntvlIxToKeyNr(int ix) const;
  /// Name of IntvlIxToNote(ix) spelled by the chord's scale.
  std::string IntvlIxToKeyName(int ix) const;
  /// Key numbers (0..11) of the cached intervals above the root.
  CMySet<int> KeyNrSet() const;
  /// Whether the cache holds keyNr's interval above the root (any key number is
  /// brought into 0..11 first).
  bool HasKeyNr(int keyNr) const;

  // Key number lists end at exactly -1; every other value, negative ones included,
  // is a key number and is brought into 0..11 (so -2 means 10). A list without its
  // -1 simply ends after its last value. Only int-sized integral values compile (see
  // CIntvlSet::CheckedListValue).

  /// Whether every listed key number is in the chord (its interval above the root is
  /// cached). An empty list, HasKeyNrs(-1), is true on any chord; any listed key
  /// number makes it false on a chord without intervals.
  template <class... Rest>
  bool HasKeyNrs(int first, Rest... rest) const {
    int const values[] = {first, CIntvlSet::CheckedListValue(rest)...};
    return HasKeyNrsFromList(values, sizeof values / sizeof values[0]);
  }
  /// HasKeyNrs on an array of count values (same end test).
  bool HasKeyNrsFromList(int const* keyNrs, std::size_t count) const;
  /// Whether the chord's intervals begin with exactly the intervals of the listed
  /// key numbers, compared one-sidedly: the cache is the left operand of CIntvlSet's
  /// operator==, so only the cache's members are walked. A chord whose cache holds
  /// {0, 4} matches the list 0, 4, 7; a chord without intervals matches every list;
  /// a cache holding {0, 4, 7} does not match 0, 4.
  template <class... Rest>
  bool HasExactTheseKeyNrs(int first, Rest... rest) const {
    int const values[] = {first, CIntvlSet::CheckedListValue(rest)...};
    return HasExactTheseKeyNrsFromList(values, sizeof values / sizeof values[0]);
  }
  /// HasExactTheseKeyNrs on an array of count values (same end test).
  bool HasExactTheseKeyNrsFromList(int const* keyNrs, std::size_t count) const;

  // ---- Setting from sets, transposing, inverting -----------------------------

  /// Takes the notes as given (numbers and spellings kept); the root becomes the
  /// lowest note (the undefined note for an empty set), not specified; the
  /// intervals become stale.
  void SetFromNoteSet(CMySet<CNote> notes);
  /// Notes from note numbers (clamped to 0..127, 255 kept), naturals corrected by
  /// CNote::CheckEnh; the root becomes the lowest note, not specified.
  void SetFromNoteNrSet(CMySet<int> const& noteNrs);
  /// Notes from key numbers at those very note numbers, so 0..11 become notes in
  /// the lowest octave (other values are clamped like note numbers). A specified
  /// root is kept when its pitch class is among the key numbers; otherwise the root
  /// becomes the lowest note, and the root-specified flag stays as it was (so with
  /// root C4 specified, {4, 7, 11} gives root E at note 4, still "specified").
  void SetFromKeyNrSet(CMySet<int> const& keyNrs);
  /// Notes move by t and wrap: (note + t) % 128 (truncating), a negative result
  /// raised by octaves (5 moved by -10 gives 7, not 123); spellings kept, then
  /// checked. Notes that land on the same number and spelling merge into one. The
  /// root moves by t and clamps to 0..127 (255 is kept), without a spelling check:
  /// root 5 moved by -10 gives 0. The interval cache and flags are not touched.
  void Transpose(int t);
  /// Moves the lowest note L above the others; L keeps its spelling. With H the
  /// highest remaining note (the undefined note 255 if L was alone): if L's pitch
  /// class is at most H's and H is below 116, L goes into the octave above H's,
  /// otherwise into H's own octave (octaves by CNote::SetOct's rule, so an octave
  /// above 9 means octave 8). 60 64 67 gives 64 67 72; 60 70 gives 70 72; 62 72 gives
  /// 72 74; a lone note goes to octave 8. The result can be 128..131 (8 120 gives
  /// 120 128), which is kept. The root, flags and interval cache are not touched.
  /// An empty chord is left as it is.
  void Invert();

  // ---- Comping range (note numbers 53..64) -----------------------------------

  /// Sets the root (specified) to the note's pitch class p (brought into 0..11) at
  /// p + 60 for C .. E and p + 48 for F .. B, spelled as the note, checked. The
  /// undefined note has pitch class 3 and gives E flat 63.
  void SetRootNoteInCompingRange(CNote const& note);
  /// Sets the root (specified) to keyNr + 60 for keyNr below 5, else keyNr + 48,
  /// natural and checked. Meant for key numbers 0..11; other values are clamped to
  /// 0..127 like note numbers (and a sum of 255 is the undefined note).
  void SetRootKeyNr(int keyNr);
  /// SetRootKeyNr(keyNr), then SetBasicChord(bc).
  void SetRootKeyNrAndBasicChord(int keyNr, TBasicChord bc);
  /// Adds the note at interval i above the root's pitch class in the comping range
  /// 53..64 (natural, checked) into the notes, and i (insertion rule) into the
  /// interval cache, directly: the root and the flags are not touched.
  void AddIntvlInCompingRange(int intvl);
  /// Moves every note whose interval above the root ((note - root) brought into
  /// 0..11) lies in lo..hi: with diff = newIntvl - interval, the note moves down by
  /// diff when diff is above 5, else up by diff (down for a negative diff); clamped,
  /// respelled from natural. The downward move subtracts diff itself, so for diff 7
  /// the note lands a fifth below its old place, not on newIntvl (the root's note
  /// with newIntvl 7 goes down to the fourth). When a note moved, the cache loses
  /// lo..hi and gains newIntvl directly; the flags are not touched. When no note lies
  /// in the range, nothing changes.
  void ChangeAllNotesWithinIntvlRange(int lo, int hi, int newIntvl);

  // ---- Basic chord and XG chord type -----------------------------------------

  // Every query here brings the interval cache up to date first; intervals inserted
  // directly above 11 (AddNote under a specified root) count in any octave.

  /// The triad family of the cached intervals. With "has x" meaning x in any octave
  /// below the wrap interval:
  ///   - a major third: major, unless the augmented fifth is there without the fifth
  ///     (augmented); so C E G G# is major;
  ///   - else a minor third with a diminished fifth: minor if the fifth or the minor
  ///     seventh is there (C Eb Gb Bb is minor), else diminished;
  ///   - else a minor third: minor, unless the augmented fifth is there without the
  ///     fifth (then as below, which gives none: C Eb G# is no chord);
  ///   - otherwise, with the fifth: sus4 if the fourth is there, else sus2 if the
  ///     second is, else drone for exactly {0, 7} or {0, 7, 12}; everything else
  ///     (no fifth at all, or C G Bb) is none.
  TBasicChord BasicChord() const;
  /// Reshapes the chord into the given basic chord. The interval cache is brought up
  /// to date first, as for every query; then notes at the wrong third or fifth are
  /// moved (ChangeAllNotesWithinIntvlRange), then the missing intervals of
  /// the basic chord are added in the comping range (AddIntvlInCompingRange):
  ///   bc_maj   3 -> 4, 6..8 -> 7, then ensure 0, 4, 7
  ///   bc_min   4 -> 3, 6..8 -> 7, then ensure 0, 3, 7
  ///   bc_aug   3 -> 4, 6..7 -> 8, then ensure 0, 4, 8
  ///   bc_dim   4 -> 3, 7..8 -> 6, then ensure 0, 3, 6
  ///   bc_sus4  3..4 -> 5, 6..8 -> 7, then ensure 0, 5, 7
  ///   bc_sus2  3..5 -> 2, 6..8 -> 7, then ensure 0, 2, 7
  ///   bc_drone 4..9 -> 7, 1..3 -> 0, 10..11 -> 12, then ensure 0, 7
  /// so 60 64 67 over root 60 with bc_min becomes 60 63 67 with the cache {0, 3, 7}.
  /// bc_none removes 3, 4 and 7 from the interval cache and leaves the notes alone
  /// (the next rebuild brings them back). Other values change nothing.
  void SetBasicChord(TBasicChord bc);
  /// The intervals of the basic chord (wrap 24): major {0, 4, 7}, minor {0, 3, 7},
  /// augmented {0, 4, 8}, diminished {0, 3, 6}, sus4 {0, 5, 7}, sus2 {0, 2, 7},
  /// drone {0, 7}; empty for bc_none.
  CIntvlSet IntvlsInBasicChord() const;
  /// Scale_Minor for minor and diminished chords, Scale_Major otherwise.
  CScale::TType ScaleType() const;
  /// The scale that spells the chord: on the root's pitch class and spelling, of
  /// ScaleType(). When the cache holds the minor second (1), that step is spelled as
  /// a lowered second degree (over C: D flat, not C sharp).
  CScale Scale() const;
  /// XG chord type number 0..34: the first of the XG rows whose interval set equals
  /// the cache exactly, else the number of the basic chord (major 0, minor 8,
  /// augmented 7, diminished 17, sus4 32, sus2 33, drone 31, none 34). A cache
  /// holding only the root gives 30, an empty one 34 (no chord).
  int XGChordIx() const;

  // ---- Root finding ----------------------------------------------------------

  // "Setting the root" below always means what SetRootNote does: the root becomes
  // specified, and the intervals become stale when the chord has notes.

  /// Sets the likeliest root and its spelling from the notes.
  ///
  /// A chord without notes becomes the undefined chord whatever the algorithm: notes
  /// and intervals emptied (the wrap interval kept), root the undefined note,
  /// specified, intervals fresh, lonely-lowest-note mark clear.
  ///
  /// By rules (SCA_RULE_WEIGHTS, and every value other than SCA_NEURONAL_NET) the
  /// pitch classes 0..11 are scored in turn with ProbThatNoteIsRootNote, relative to
  /// the current root; the highest score wins. On a tie with the best so far (a
  /// score of 0 for C counts as one), with R the current root's pitch class:
  ///   - when the cache holds the best one's interval above R but not the
  ///     candidate's, the best one stays; when it holds the candidate's but not the
  ///     best one's, the candidate wins;
  ///   - when it holds both or neither, the one nearer to the lowest note's pitch
  ///     class the shorter way round the octave wins, the earlier pitch class on
  ///     equal distance.
  /// The winner is set as the root: its pitch class 0..11 (the lowest octave), in
  /// the natural spelling (C major's spelling for a black key).
  ///
  /// By the built-in chord analysis net (SCA_NEURONAL_NET; see ChordAnalysisNet.h)
  /// the root is first set to the lowest note (number and spelling), so that the
  /// interval cache holds the intervals above it; input i of the net is 1.0 when the
  /// cache holds i, else 0.0 (inputs 12..23 stay 0.0, the cache being folded into
  /// 0..11). The winning output w (the largest, the lowest index on ties) names the
  /// root: the pitch class w semitones above the lowest note's, in the lowest octave
  /// and the natural spelling. So E4 G4 C5 gives the inputs {0, 3, 8}, the winner 8
  /// and the root C. The current root plays no part.
  ///
  /// The net's answers are those of its forward pass under the process-wide Neuron
  /// parameters (Neuron.h) as they stand: loading the library sets them to the
  /// built-in net's, and building any other NeuronalNet afterwards replaces them,
  /// which changes the net's answers. The library does not restore them. A host
  /// that builds nets of its own in the same process should build one from
  /// ChordAnalysisNeuronalNet last (or call Neuron::SetCalcParams with its
  /// properties) before it finds roots by net again. While the parameters are the
  /// built-in net's, the winners come from a table made at load, one per set of
  /// intervals above a lowest note within the octave; otherwise from the exact
  /// forward pass of a read-only copy of the net. Either way nothing is allocated,
  /// locked or written outside this chord: chords on different threads may find
  /// their roots at once (see Threads above).
  ///
  /// Both algorithms finish with SetRootNoteEnhWithLeastSigns and then
  /// AdjustEnhOfChordNotesToRootScale.
  void SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(TSingleChordAnalysisAlgo algo);
  /// Rule-based score of the candidate's pitch class c as the root; larger is
  /// likelier, never negative. It reads the interval cache relative to the current
  /// root (rebuilt first when stale); L is the lowest note's pitch class (that of
  /// the undefined note 255, 3, for an empty chord). The first rule that applies:
  ///   cache exactly {0, 6, 11} and c == L + 2      -> 33
  ///   cache exactly {0, 4, 9, 10} and c == L       -> 45
  ///   cache exactly {0, 2, 6, 11} and c == L + 2   -> 45
  ///   cache exactly {0, 3, 6, 10} and c == L       -> 48
  ///   cache exactly {0, 7}, three notes, c == L    -> 5
  ///   otherwise the sum, over the cached intervals in ascending order, of a weight
  ///   for the distance from c up to the pitch class of IntvlIxToNote of that
  ///   index; the weights depend on the number of intervals (1..2, 3, 4..6, 7 and
  ///   more, where the first three intervals count four times); 0 for an empty
  ///   cache.
  /// L + 2 is not taken round the octave, so with L of B flat or B the two rules
  /// that compare with it never apply.
  int ProbThatNoteIsRootNote(CNote const& candidate) const;
  /// Sets the interval cache's wrap interval to the built-in net's input count (24,
  /// read from the net) and marks the intervals stale, so the next query rebuilds
  /// them under it.
  void SetWrapIntvlToNeuronalNetInputCount();
  /// Interval of the lowest note's pitch class above the root's, 0..11 (for an empty
  /// chord that of the undefined note, pitch class 3).
  int LowestNoteIntvl() const;
  /// Sets the root to the first note, lowest first, whose pitch class interval above
  /// the root is the ix-th cached interval (number and spelling; specified). When no
  /// note lies there (ix out of range, or an interval above 11 inserted directly)
  /// nothing changes, the intervals included.
  void SetRootNoteToIntvlIx(int ix);
  /// Respells the root (its note number stays) to the spelling whose chord has the
  /// fewest key-signature signs, by SignsCount's magnitude: the root as it is
  /// (after CheckEnh), or one enharmonic step toward the flats, or one toward the
  /// sharps. Ties keep the root's spelling first, then prefer the flats. Sets the
  /// root (specified, intervals stale when there are notes).
  void SetRootNoteEnhWithLeastSigns();
  /// Spells every note as the chord's scale (Scale()) spells its pitch class, then
  /// CheckEnh: so in an A minor chord a G sharp, left plain by the minor scale,
  /// becomes C major's A flat. Two notes of one pitch in two spellings thereby
  /// become the same note and are kept once. The root and the flags are not
  /// touched. When `changed` is not null, false is written through it whether or
  /// not a spelling changed: callers cannot learn from it that anything changed.
  void AdjustEnhOfChordNotesToRootScale(bool* changed);

  // ---- The chord in a key ----------------------------------------------------

  // A key number belongs to the key when it is the key number of one of the key's
  // degrees (CScale::DegreeNrToKeyNr). Key numbers are note number % 12 with the
  // truncating remainder, so a note or root with a negative note number is on no
  // degree and counts as outside every key.

  /// Harmonic function code 0..15: by the degree of the root's key number and the
  /// basic chord (0 = undefined, also for a root on no degree):
  ///   degree I    major 1 (I), minor 2 (Im)
  ///   degree II   major 3 (II), minor 4 (IIm), diminished 5 (IIdim)
  ///   degree III  major 6 (III), minor 7 (IIIm)
  ///   degree IV   major 8 (IV), minor 9 (IVm)
  ///   degree V    major, sus4 and sus2 10 (V), minor 11 (Vm)
  ///   degree VI   major 12 (VI), minor 13 (VIm)
  ///   degree VII  diminished 15 (VIIdim)
  /// Code 14 (bVII) has a name but no chord gets it.
  int HarmFuncIn(CSignKey const& key) const;
  /// How close the chord lies to the key, 0..2, from a table per basic chord and key
  /// mode indexed by the root's distance above the key's root. The tables are fixed
  /// answers that hosts rank chords by, surprising values included (in a major key
  /// a major chord on the major third scores 2, diminished and augmented chords
  /// score 2 everywhere). For basic chord none the result is CountIntvlsInSignKey
  /// instead.
  int ClosenessToSignKey(CSignKey const& key) const;
  /// How many of the cached intervals lie in the key, each interval counted once by
  /// the note it stands for (IntvlIxToNote). An interval cached above the octave
  /// (direct inserts under a specified root) matches no note's pitch class interval
  /// and so stands for the lowest note.
  int CountIntvlsInSignKey(CSignKey const& key) const;
  /// The interval count minus CountIntvlsInSignKey.
  int CountIntvlsNotInSignKey(CSignKey const& key) const;
  /// How many stored notes lie outside the key; octave doublings count each time.
  int CountNotesNotInSignKey(CSignKey const& key) const;
  /// Whether every interval lies in the key; true for a chord without intervals.
  bool IsInSignKey(CSignKey const& key) const;
  /// Signs of the key the root and basic chord imply (positive sharps, negative
  /// flats). May respell a root whose spelling is not senseful.
  int SignsCount() const;

  // ---- Options and names -----------------------------------------------------

  /// Option rank -> option; ascending rank is the print order. Each cached interval
  /// i, visited in ascending order, gives at most one option by the row of its pitch
  /// class ("has n": n is in the cache exactly; "others": the cache holds an
  /// interval other than 0, 3, 4, 7 and i as cached):
  ///   1   rank 13: "b9" with others, else "add b9"
  ///   2   rank 14 (not in sus2): "9" with others, else "add 9"
  ///   3   has 4: rank 15 "#9"; else, unless minor or diminished, rank 3 "b3"
  ///   4   unless major or augmented: rank 4 "3"
  ///   5   rank 17 (not in sus4): "11" with others, else "add 11"
  ///   6   not in diminished: has 7 or 8: rank 18 "#11", else rank 99 "b5"
  ///   7   in diminished, augmented and none only: rank 7 "5"
  ///   8   not in augmented: has 7: rank 20 "b13", else rank 99 "#5"
  ///   9   has 10 or 11 without 8: rank 21 "13"; else rank 9 "6" ("7" in diminished)
  ///   10  in diminished first rank 99 "b5"; then rank 10 "7"
  ///   11  rank 11: "j7" (Maj7ShownAs 1), "maj7" (2), else "ma7"
  /// A rank already filled keeps its option: of "b5" and "#5", which share rank 99,
  /// the first found stays. In a chord wider than an octave (highest - lowest note
  /// number > 12) whose lowest note is marked lonely (see UpdateIntvlSet), the
  /// lowest note's interval gives no option while
  /// CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord is on.
  std::map<int, TChordOption> OptionsMap(CChordnamePref& pref) const;
  /// The option texts in rank order, also for an undefined root.
  std::vector<std::string> OptionsStringVector(CChordnamePref& pref) const;
  /// Options joined with "/" ("7/9"), or with ChordOptionSep 1 the later ones in
  /// parentheses ("7(9)"); "" for an undefined root.
  std::string OptionsName(CChordnamePref& pref) const;
  /// True for sus4 and sus2, whose text stands after the options ("C 7 sus 4").
  bool BasicChordNameAfterOptionsName() const;
  /// The block after the root name: a separator, the basic chord text, a separator,
  /// the options (options first for sus4 and sus2). The separator is " ", or ","
  /// with SeparateBlocksInNames, and is kept even around empty parts, so a major
  /// triad's block is two blanks ("C  ") and a minor triad's "m" plus a blank
  /// ("C m "). Names are never trimmed.
  std::string BasicChordAndOptionsName(CChordnamePref& pref) const;
  /// "No Chord" for an undefined root; else the root name and, for more than one
  /// note, the block. With MinorSmall a minor chord's root begins with a small
  /// letter and still has its "m" ("c m 7").
  std::string NameWithoutSlash(CChordnamePref& pref) const;
  /// NameWithoutSlash plus " / " (",/ " with SeparateBlocksInNames) and the bass
  /// when the bass's key number differs from the root's ("C   / E", also
  /// "No Chord / C"). The bass is spelled by the chord's scale, and so is the stored
  /// lowest note, which keeps that spelling (the one exception: where the notes
  /// hold the same pitch in a second spelling that the new one would reach or pass
  /// in the notes' order, the stored note keeps its spelling). A chord without notes
  /// shows the undefined note as its bass ("C / Undefined").
  std::string NameWithSlash(CChordnamePref& pref) const;
  /// The name to show: with NarrowChordsWithoutSlash (the default) a chord spanning
  /// at most an octave is named without slash, however inverted; otherwise
  /// NameWithSlash. Names under DefaultChordnamePref whatever object is passed
  /// (all preferences are shared statics anyway). The preferences PreferSlashChord,
  /// PreferSlashChordIfMoreNotesThan, ShowInversion, InversionAsName and
  /// NoDoubleSigns change no name.
  std::string Name(CChordnamePref& pref) const;
  /// Name() of a copy with the given root. The root is checked with CheckEnh (the
  /// given note receives the checked spelling) and then named as spelled: the
  /// fewest-signs choice between it and its enharmonic neighbours counts the signs
  /// of this chord, not of the chord with the new root, so it always keeps the
  /// given spelling (C sharp stays C sharp although D flat has fewer signs). Like
  /// SignsCount, it respells this chord's root when that is not senseful.
  std::string NameWithLeastSignsForThisRootNote(CNote const& root, CChordnamePref& pref) const;
  /// Name() of a copy with the given root; a root spelling that is not senseful is
  /// replaced by the C major spelling (C#, Eb, F#, Ab, Bb, naturals), in the given
  /// note too.
  std::string NameForThisRootNote(CNote const& root, CChordnamePref& pref) const;
  /// Harmonic function name of HarmFuncIn(key): Roman ("IIm", "V", "VIIdim") or,
  /// with HarmFuncNaming 1, functional letters ("Sp", "D"), some by the key's mode
  /// ("III" is "TG" in a major key, "P" in a minor one). Code 0 is "undef". The
  /// texts are fixed output that hosts compare against, unfinished-looking ones
  /// included ("IIdim##", "VIIdim##in ks_min").
  std::string HarmFuncName(CSignKey key, CChordnamePref& pref) const;

  // ---- Diagnostics -----------------------------------------------------------

  /// Walks the notes; prints nothing.
  void Trace() const;
  /// Calls every member once (on copies; this chord is not changed).
  void UseAllMemberFunctions();
  /// Calls every const member once.
  void UseAllNonDestructiveMemberFunctions() const;

private:
  // Rebuilds the interval cache when it is stale; every interval query starts here.
  void RefreshIntvls() const {
    if (IntvlsStale_) UpdateIntvlSet();
  }

  CNote RootNote_;
  CMySet<CNote> Notes_;
  mutable CIntvlSet Intvls_;
  int RootNoteSpecified_ = 0;
  mutable int IntvlsStale_ = 0;
  mutable int LowestNoteLonely_ = 0;
};

/// Equal root (number and spelling), note count and notes.
TONVEX_API bool operator==(CChord const& a, CChord const& b);
TONVEX_API bool operator!=(CChord const& a, CChord const& b);

/// The undefined chord: root note 255, no notes, basic chord none, wrap interval 24
/// (the built-in net's input count).
extern TONVEX_API const CChord CChord_Undef;

/// Text of an option ("b9", "add 9", "#11", "ma7"); "" outside 0..19.
TONVEX_API std::string OptionName(CChord::TChordOption option, CChordnamePref& pref);
/// Text of a basic chord: "" major, "m", "aug", "dim", "sus 4", "sus 2", "5"; "no 3"
/// for none and any value above 7.
TONVEX_API std::string BasicChordName(CChord::TBasicChord bc, CChordnamePref& pref);

#endif
