// Chords: finding the likeliest root, spelling it with the fewest signs, spelling the
// notes after it, and the small root operations around them.
#include "Chord.h"

#include "chord/NetForSingleChordAnalysis.h"
#include "pitch/KeySignCount.h"
#include "pitch/NoteNrs.h"

#include <cstddef>
#include <cstdlib>
#include <vector>

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

// The built-in net's input vector, kept between calls so that root finding allocates
// nothing once the first call has sized it. Shared as the net itself is.
std::vector<float>& NetInputs() {
  static std::vector<float> inputs;
  return inputs;
}

// The root the built-in net chooses: the chord's root is set to its lowest note, the
// intervals above it (0..11) become the net's inputs, and the winning output w is
// the root's interval above the lowest note. The root is that pitch class in the
// lowest octave, in the natural spelling (C major's spelling for a black key).
CNote LikeliestRootByNet(CChord& chord) {
  CNote const lowest = chord.LowestNote();
  chord.SetRootNote(lowest);
  // Nets store their counts made valid, never negative.
  auto const inputCount = static_cast<std::size_t>(NetForSingleChordAnalysis.get_input_neuron_count());
  std::vector<float>& inputs = NetInputs();
  inputs.assign(inputCount, 0.0f);
  for (int intvl : chord.IntvlSet())
    if (intvl >= 0 && static_cast<std::size_t>(intvl) < inputCount) inputs[static_cast<std::size_t>(intvl)] = 1.0f;
  NetForSingleChordAnalysis.setInput(inputs);
  NetForSingleChordAnalysis.use();
  int const winner = NetForSingleChordAnalysis.winner();
  return CNote(PitchClass(PitchClass(lowest.NoteNr()) + winner), Enh_Natural);
}

// What every algorithm does once it has set the root: the root's spelling with the
// fewest signs, then the notes spelled after it.
void SpellRootAndNotes(CChord& chord) {
  chord.SetRootNoteEnhWithLeastSigns();
  chord.AdjustEnhOfChordNotesToRootScale(nullptr);
}

} // namespace

void CChord::SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(TSingleChordAnalysisAlgo algo) {
  if (Notes_.empty()) {
    SetUndefined();
    return;
  }
  SetRootNote(algo == SCA_NEURONAL_NET ? LikeliestRootByNet(*this) : LikeliestRootByRules(*this));
  SpellRootAndNotes(*this);
}

void CChord::SetRootNoteEnhWithLeastSigns() {
  RootNote_.CheckEnh();
  CNote const asIs = RootNote_;
  bool const rebuiltBySignsCount = IntvlsStale_ != 0;
  int const signsAsIs = std::abs(SignsCount());

  // The other spellings are counted with the root set to them, which marks the
  // intervals stale. They keep the root's note number, so the intervals rebuilt for
  // them are those of the root as it is: when SignsCount has just rebuilt them, the
  // basic chord it read serves all three; otherwise they are rebuilt once here.
  if (!rebuiltBySignsCount) SetRootNote(asIs);
  TBasicChord const bc = BasicChord();
  CNote flatter = asIs;
  flatter.EnhShiftToFlats();
  CNote sharper = asIs;
  sharper.EnhShiftToSharps();
  int const signsFlatter = std::abs(KeySignCount(flatter, bc));
  int const signsSharper = std::abs(KeySignCount(sharper, bc));

  // Ties keep the spelling as it is, then prefer the flats.
  if (signsAsIs <= signsFlatter && signsAsIs <= signsSharper)
    SetRootNote(asIs);
  else if (signsAsIs > signsFlatter && signsFlatter <= signsSharper)
    SetRootNote(flatter);
  else
    SetRootNote(sharper);
}

void CChord::AdjustEnhOfChordNotesToRootScale(bool* changed) {
  CScale const scale = Scale();
  for (CNote const& note : Notes_) {
    note.AdjustEnhToScale(scale);
    note.CheckEnh();
  }
  // Notes of one pitch in two spellings now have the same spelling; the set keeps
  // such a note once. They are neighbours, since the notes are ordered by number.
  for (auto pos = Notes_.begin(); pos != Notes_.end();) {
    auto next = pos + 1;
    if (next != Notes_.end() && *next == *pos)
      pos = Notes_.erase(next) - 1;
    else
      pos = next;
  }
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
