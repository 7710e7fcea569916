// Key sign count of a root note with a basic chord.
#include "pitch/KeySignCount.h"

int KeySignCount(CNote const& root, int basicChord) {
  constexpr int Minor = 2, Diminished = 4;
  int p = basicChord == Minor ? 9 : (basicChord == Diminished ? 4 : 0);
  int r = root.KeyNr();

  // Fifths from the start pitch class to the root; six and more fifths up count as
  // flats. A negative key number is never met: the walk gives up after 13 steps.
  int c = 0;
  while (p != r && c < 13) {
    p = (p + 7) % 12;
    ++c;
  }
  if (c > 5) c -= 12;

  bool black = r == 1 || r == 3 || r == 6 || r == 8 || r == 10;
  CNote reference(r, black ? (c < 0 ? Enh_Flat : Enh_Sharp) : Enh_Natural);

  if (!root.HasSensefulEnh()) {
    root.SetEnh(reference.Enh());
    return c;
  }
  // Each enharmonic step between the reference spelling and the root's is twelve
  // fifths. The walk stops when a step changes nothing, which only a reference that
  // had to be clamped onto another key number (a negative root) can meet.
  while (reference.Enh() != root.Enh()) {
    bool towardFlats = reference.Enh() > root.Enh();
    TEnh next = towardFlats ? EnhShiftToFlats(reference.KeyNr(), reference.Enh())
                            : EnhShiftToSharps(reference.KeyNr(), reference.Enh());
    if (next == reference.Enh()) break;
    reference.SetEnh(next);
    c += towardFlats ? -12 : 12;
  }
  return c;
}
