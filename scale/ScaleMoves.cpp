// Snapping key numbers onto a scale and moving notes within it.
#include "Scale.h"

#include <cstdint>

namespace {

// A degree with its key number, while the nearest one is looked for.
struct Candidate {
  int keyNr;
  int degree;
};

// Plain difference of two key numbers; k may be any int, so the difference is
// taken in 64 bits (0 - INT_MIN does not fit an int).
long long Distance(long long a, long long b) { return a > b ? a - b : b - a; }

constexpr long HighestNoteNr = 127;

} // namespace

int CScale::KeyNrQuantizeToDegreeNr(int k, TQuantizeToScaleDirection dir) const {
  // Both candidates start at degree 0 whatever its key number. That decides
  // results (a root above k keeps the lower candidate on the root) and is kept.
  int root = DegreeNrToKeyNr(0);
  if (root == k) return 0;
  Candidate lower{root, 0}, upper{root, 0};
  int n = DegreesPerOctave();
  for (int d = 1; d < n; ++d) {
    int kd = DegreeNrToKeyNr(d);
    if (kd == k) return d;
    bool takeLower = false, takeUpper = false;
    if (k == 11) {
      takeLower = kd > lower.keyNr;
      takeUpper = (kd == 0 || kd == 11) && kd < upper.keyNr;
    } else if (k == 0) {
      takeLower = (kd == 11 || kd <= 0) && kd > lower.keyNr;
      takeUpper = kd < upper.keyNr;
    } else {
      takeLower = kd <= k && kd > lower.keyNr;
      takeUpper = kd >= k && kd < upper.keyNr;
    }
    if (takeLower) lower = {kd, d};
    if (takeUpper) upper = {kd, d};
  }
  long long toUpper = Distance(upper.keyNr, k), toLower = Distance(lower.keyNr, k);
  if (toUpper != toLower) return toUpper < toLower ? upper.degree : lower.degree;
  return dir == Quantize_Up ? upper.degree : lower.degree;
}

int CScale::NoteQuantizeToDegreeNr(CNote note, TQuantizeToScaleDirection dir) const {
  return KeyNrQuantizeToDegreeNr(note.KeyNr(), dir);
}

CNote CScale::MoveInScale(CNote note, int steps) const {
  int n = DegreesPerOctave();
  CNote result = note;
  int octave = static_cast<int>((static_cast<std::uint32_t>(note.NoteNr()) & 0xFFu) / 12u) - 1;
  result.SetOct(octave + steps / n);

  // Snap upward onto the scale. SetNoteNr clamps, so the search ends at 127 at the
  // latest: a note that cannot go higher stays where it is.
  while (!HasKeyNr(result.KeyNr())) {
    long before = result.NoteNr();
    result.SetNoteNr(before + 1);
    if (result.NoteNr() == before) break;
  }

  long noteNr = result.NoteNr();
  for (int left = steps % n; left != 0; left += left > 0 ? -1 : 1) {
    long next = noteNr;
    if (left > 0) {
      do ++next;
      while (next <= HighestNoteNr && !HasKeyNr(static_cast<int>(next % 12)));
      if (next > HighestNoteNr) break;
    } else {
      do --next;
      while (next >= 0 && !HasKeyNr(static_cast<int>(next % 12)));
      if (next < 0) break;
    }
    noteNr = next;
  }
  if (noteNr != result.NoteNr()) result.SetNoteNr(noteNr); // a note left at 128..131 keeps its number
  result.SetEnh(EnhForKeynr(result.KeyNr()));
  return result;
}
