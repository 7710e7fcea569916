// Chords: the rule-based score of a pitch class as a chord's root.
#include "Chord.h"

#include "chord/RootWeights.h"
#include "pitch/NoteNrs.h"

#include <cstddef>

int CChord::ProbThatNoteIsRootNote(CNote const& candidate) const {
  RefreshIntvls();
  int const c = PitchClass(candidate.NoteNr());
  int const lowest = PitchClass(LowestNote().NoteNr());
  std::size_t const count = Intvls_.size();

  // Chords the weights misjudge. The cheap comparison with the lowest note comes
  // first; lowest + 2 is not taken round the octave, so with a lowest B flat or B
  // those rules never apply.
  if (c == lowest + 2 && Intvls_.HasExactTheseIntvls(0, 6, 11, -1)) return 33;
  if (c == lowest && Intvls_.HasExactTheseIntvls(0, 4, 9, 10, -1)) return 45;
  if (c == lowest + 2 && Intvls_.HasExactTheseIntvls(0, 2, 6, 11, -1)) return 45;
  if (c == lowest && Intvls_.HasExactTheseIntvls(0, 3, 6, 10, -1)) return 48;
  if (c == lowest && count == 2 && Notes_.size() == 3 && Intvls_.HasExactTheseIntvls(0, 7, -1)) return 5;

  // The pitch class of the first note, lowest first, at each interval 0..11 above
  // the root (-1 where there is none), so that the note of every cached interval
  // is found in one walk over the notes instead of one per interval. An interval
  // without a note (one above 11 inserted directly) takes the lowest note, as
  // IntvlIxToNote does.
  int firstAt[12] = {-1, -1, -1, -1, -1, -1, -1, -1, -1, -1, -1, -1};
  for (CNote const& note : Notes_) {
    int& first = firstAt[AbsKeyIntvlFromTo(RootNote_, note)];
    if (first < 0) first = PitchClass(note.NoteNr());
  }

  int const* weights = RootWeights(count);
  int sum = 0;
  std::size_t index = 0;
  for (int intvl : Intvls_) {
    int noteClass = (intvl < 12 && firstAt[intvl] >= 0) ? firstAt[intvl] : lowest;
    int weight = weights[PitchClass(noteClass - c)];
    sum += (count >= 7 && index < 3) ? 4 * weight : weight;
    ++index;
  }
  return sum;
}
