// Chords: finding the likeliest root, spelling it with the fewest signs, spelling the
// notes after it, and the small root operations around them.
#include "Chord.h"

#include "chord/ChordScale.h"
#include "chord/IntvlFold.h"
#include "chord/NetForSingleChordAnalysis.h"
#include "chord/NetRootWinners.h"
#include "chord/RootSpellings.h"
#include "pitch/NoteNrs.h"

#include <cstdint>
#include <cstdlib>

namespace {

// Distance between two pitch classes the shorter way round the octave, 0..6.
int ShorterWay(int a, int b) {
  int d = std::abs(a - b);
  return d > 6 ? 12 - d : d;
}

// Whether a candidate that ties with the best root so far takes its place. The
// intervals are those above the current root's pitch class: a pitch class in the
// chord beats one that is not; between two in the chord, or two outside it, the one
// nearer to the lowest note wins, the earlier one on equal distance.
bool TieGoesToCandidate(CChord const& chord, int best, int candidate) {
  int const root = PitchClass(chord.RootNote().NoteNr());
  bool const bestInChord = chord.HasIntvl(PitchClass(best - root));
  bool const candidateInChord = chord.HasIntvl(PitchClass(candidate - root));
  if (bestInChord != candidateInChord) return candidateInChord;
  int const lowest = PitchClass(chord.LowestNote().NoteNr());
  return ShorterWay(lowest, candidate) < ShorterWay(lowest, best);
}

// The root the rule scores choose: the pitch class in the lowest octave, spelled
// naturally and checked. The scores read the interval cache, rebuilt at most once.
CNote LikeliestRootByRules(CChord const& chord) {
  int best = 0;
  CNote bestRoot(0, Enh_Natural);
  for (int pc = 0; pc < 12; ++pc) {
    CNote const candidate(pc, Enh_Natural);
    int const score = chord.ProbThatNoteIsRootNote(candidate);
    // A tie includes C's score of 0 against the initial best, which changes nothing.
    if (score > best || (score == best && TieGoesToCandidate(chord, bestRoot.KeyNr(), pc))) {
      best = score;
      bestRoot = candidate;
    }
  }
  return bestRoot;
}

// The root the built-in net chooses: the chord's root is set to its lowest note, the
// intervals above it become the net's inputs, and the winning output w is the root's
// interval above the lowest note. The root is that pitch class in the lowest octave,
// in the natural spelling (C major's spelling for a black key).
CNote LikeliestRootByNet(CChord& chord) {
  CNote const lowest = chord.LowestNote();
  chord.SetRootNote(lowest);
  // A rebuilt cache holds intervals 0..22 only (key numbers lie in -11..11).
  std::uint32_t intvls = 0;
  for (int intvl : chord.IntvlSet())
    if (intvl >= 0 && intvl < 32) intvls |= std::uint32_t{1} << intvl;
  int const winner = NetRootWinners.Winner(intvls);
  return CNote(PitchClass(PitchClass(lowest.NoteNr()) + winner), Enh_Natural);
}

// What root finding by net reads from a chord's notes, in one walk.
struct CNetInput {
  int Lowest = 0;             ///< the lowest note's key number
  std::uint32_t Intvls = 0;   ///< bit i: a note's key number lies i above the lowest one's (0..11)
  bool LowestDoubled = false; ///< a higher note has the lowest note's key number
  bool SharedNoteNr = false;  ///< two notes have the same number (in two spellings)
};

// CNote::KeyNr of a note whose number is not negative.
int KeyNrOf(CNote const& note) { return static_cast<int>(static_cast<unsigned long>(note.NoteNr()) % 12u); }

// False when a note number is negative: its key number is, and the interval cache
// would not hold its pitch class interval.
bool ReadNetInput(CMySet<CNote> const& notes, CNetInput& in) {
  if (notes.begin()->NoteNr() < 0) return false; // the lowest: then all are
  in.Lowest = KeyNrOf(*notes.begin());
  in.Intvls = 1;
  for (auto note = notes.begin() + 1; note != notes.end(); ++note) {
    int const k = KeyNrOf(*note);
    in.Intvls |= std::uint32_t{1} << (k >= in.Lowest ? k - in.Lowest : k - in.Lowest + 12);
    in.LowestDoubled = in.LowestDoubled || k == in.Lowest;
    in.SharedNoteNr = in.SharedNoteNr || note->NoteNr() == note[-1].NoteNr();
  }
  return true;
}

// The intervals above the root w semitones above the lowest note, from those above
// the lowest note: a rotation of the twelve pitch classes.
std::uint32_t IntvlsAboveRoot(std::uint32_t aboveLowest, int w) {
  return ((aboveLowest >> w) | (aboveLowest << (12 - w))) & 0xfffu;
}

// Respelling can give two notes of one pitch the same spelling; the set keeps such a
// note once. They are neighbours, since the notes are ordered by number.
void MergeRespelledNotes(CMySet<CNote>& notes) {
  for (auto pos = notes.begin(); pos != notes.end();) {
    auto next = pos + 1;
    if (next != notes.end() && *next == *pos)
      pos = notes.erase(next) - 1;
    else
      pos = next;
  }
}

} // namespace

void CChord::SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(TSingleChordAnalysisAlgo algo) {
  if (Notes_.empty()) {
    SetUndefined();
    return;
  }
  CNetInput in;
  if (algo == SCA_NEURONAL_NET && Intvls_.WrapIntvl() >= 12 && ReadNetInput(Notes_, in)) {
    // No note number below 0 and a wrap interval that folds nothing within the
    // octave: the cache would hold the pitch class intervals, so the root, the
    // spellings, the cache and its mark that the steps further below leave follow
    // from bit masks and tables (chord/RootSpellings.h), the same in every bit.
    int const winner = NetRootWinners.Winner(in.Intvls);
    int const root = (in.Lowest + winner) % 12;
    std::uint32_t const intvls = IntvlsAboveRoot(in.Intvls, winner);
    TBasicChord const bc = BasicChordOfPitchClasses(intvls);
    bool const minorSecond = (intvls & 2u) != 0;
    RootNote_ = RootSpellings.Root(bc, root);
    RootNoteSpecified_ = 1;
    for (CNote const& note : Notes_) {
      // A note spelled as it is to end is left alone; SetEnh checks what it sets.
      CRootSpellings::CNoteEnh const enh = RootSpellings.NoteEnh(bc, minorSecond, root, KeyNrOf(note));
      if (note.Enh() != enh.Checked) note.SetEnh(static_cast<TEnh>(enh.Unchecked));
    }
    if (in.SharedNoteNr) MergeRespelledNotes(Notes_);
    SetIntvlsFromMask(Intvls_, intvls);
    IntvlsStale_ = 0;
    // The rebuild's mark: a higher note at the lowest note's interval above the root
    // clears it, and a key number 0..11 lies there only when the lowest note's key
    // number is not below the root's.
    LowestNoteLonely_ = in.LowestDoubled && in.Lowest >= root ? 0 : 1;
    return;
  }
  SetRootNote(algo == SCA_NEURONAL_NET ? LikeliestRootByNet(*this) : LikeliestRootByRules(*this));
  // Both algorithms finish alike: the root's spelling with the fewest signs, then
  // the notes spelled after it. Setting the root marked the intervals stale, so the
  // spelling's sign counts rebuilt them for the root's note number, which the
  // respelled root keeps: the rebuild that spelling the notes would ask for next
  // gives that same cache and lonely-lowest-note mark, and is left out.
  SetRootNoteEnhWithLeastSigns();
  IntvlsStale_ = 0;
  AdjustEnhOfChordNotesToRootScale(nullptr);
}

void CChord::SetRootNoteEnhWithLeastSigns() {
  RootNote_.CheckEnh();
  CNote const asIs = RootNote_;
  // The root's own count reads the basic chord of the cache as it stands (rebuilt
  // when stale). The other spellings are counted with the root set to them, which
  // marks the intervals stale; they keep the root's note number, so the intervals
  // rebuilt for them are those of the root as it is: when the count has just
  // rebuilt them, its basic chord serves all three; otherwise they are rebuilt once
  // here.
  bool const rebuiltForAsIs = IntvlsStale_ != 0;
  TBasicChord const bcAsIs = BasicChord();
  if (!rebuiltForAsIs) SetRootNote(asIs);
  SetRootNote(LeastSignsRoot(asIs, bcAsIs, BasicChord()));
}

void CChord::AdjustEnhOfChordNotesToRootScale(bool* changed) {
  CScale const scale = Scale();
  for (CNote const& note : Notes_) {
    note.AdjustEnhToScale(scale);
    note.CheckEnh();
  }
  MergeRespelledNotes(Notes_);
  if (changed) *changed = false;
}

int CChord::LowestNoteIntvl() const { return AbsKeyIntvlFromTo(RootNote_, LowestNote()); }

void CChord::SetRootNoteToIntvlIx(int ix) {
  if (ix < 0) return;
  int const intvl = Intvl(static_cast<unsigned long>(ix));
  for (CNote const& note : Notes_) {
    if (AbsKeyIntvlFromTo(RootNote_, note) == intvl) {
      SetRootNote(note);
      return;
    }
  }
}

void CChord::SetWrapIntvlToNeuronalNetInputCount() {
  // Folding the cached intervals by the new wrap interval adds each x % 24 to the
  // cache as it stands; the next query rebuilds it from the notes in any case.
  Intvls_.SetWrapIntvl(NetForSingleChordAnalysis.get_input_neuron_count());
  IntvlsStale_ = 1;
}
