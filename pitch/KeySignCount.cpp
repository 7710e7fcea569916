// Key sign count of a root note with a basic chord.
#include "pitch/KeySignCount.h"

namespace {

constexpr int Minor = 2, Diminished = 4;

// The count by its definition: a walk round the circle of fifths from the start
// pitch class, then twelve signs per enharmonic step. Respells a root whose spelling
// is not senseful.
int CountByWalk(CNote const& root, int basicChord) {
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

// The walk's count and the root's spelling after it, for each start pitch class
// (C, A, E) and every root of key number 0..11 and spelling 0..4: a chord's key
// signature is asked for several times per chord, and the walk and its note checks
// would cost more than the lookup.
struct CSignCounts {
  signed char Count[3][12][5];
  signed char Enh[3][12][5];
};

int StartRow(int basicChord) { return basicChord == Minor ? 1 : (basicChord == Diminished ? 2 : 0); }

// Computed on first use (safe under threads, and done while the library is loaded:
// the tables of root finding count signs); only read afterwards.
CSignCounts const& SignCounts() {
  static CSignCounts const counts = [] {
    CSignCounts table{};
    int const basicChords[3] = {1, Minor, Diminished};
    for (int row = 0; row < 3; ++row)
      for (int k = 0; k < 12; ++k)
        for (int e = Enh_DoubleFlat; e <= Enh_DoubleSharp; ++e) {
          // Spelling e on key number k, unchecked: set on a key that takes e, then
          // moved (SetNoteNr keeps the spelling).
          int home = 0;
          while (!IsSensefulEnhForKeyNr(home, static_cast<TEnh>(e))) ++home;
          CNote root(home, static_cast<TEnh>(e));
          root.SetNoteNr(k);
          // Counts stay within a few octaves of fifths (at most 2 steps of 12 past
          // -6..5), far inside a signed char.
          table.Count[row][k][e] = static_cast<signed char>(CountByWalk(root, basicChords[row]));
          table.Enh[row][k][e] = static_cast<signed char>(root.Enh());
        }
    return table;
  }();
  return counts;
}

} // namespace

int KeySignCount(CNote const& root, int basicChord) {
  int const k = root.KeyNr();
  int const e = root.Enh();
  // A negative key number or a spelling outside 0..4 is not in the table.
  if (k < 0 || e < Enh_DoubleFlat || e > Enh_DoubleSharp) return CountByWalk(root, basicChord);
  CSignCounts const& counts = SignCounts();
  int const row = StartRow(basicChord);
  // The walk respells only a root that is not senseful, and to a senseful spelling,
  // which SetEnh keeps.
  if (counts.Enh[row][k][e] != e) root.SetEnh(static_cast<TEnh>(counts.Enh[row][k][e]));
  return counts.Count[row][k][e];
}
