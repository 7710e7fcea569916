// Chords: the basic chord, reshaping into a basic chord, its intervals and scale, and
// the XG chord type.
#include "chord/ChordScale.h"

#include "pitch/NoteNrs.h"

#include <cstdint>

namespace {

using Mask = std::uint32_t;

template <class... Intvls>
constexpr Mask MaskOf(Intvls... intvls) {
  return ((Mask{1} << intvls) | ...);
}

// The interval cache read as bit masks, in one walk: the intervals the recognition
// finds in any octave below the wrap interval (bit x for x in 0..11, as
// CIntvlSet::HasIntvlInAnyOctave finds them), and the exact members when all of them
// fit a mask (no pattern compared with them holds an interval above 31).
struct CIntvlMasks {
  Mask AnyOctave = 0;
  Mask Exact = 0;
  bool ExactFits = true;

  CIntvlMasks() = default;
  explicit CIntvlMasks(CIntvlSet const& set) {
    for (int m : set) {
      if (m < set.WrapIntvl()) AnyOctave |= Mask{1} << (m < 12 ? m : m % 12);
      if (m > 31)
        ExactFits = false;
      else
        Exact |= Mask{1} << m;
    }
  }
  bool Has(int x) const { return (AnyOctave >> x & 1u) != 0; }
  bool IsExactly(Mask m) const { return ExactFits && Exact == m; }
};

// What a basic chord is made of and how SetBasicChord reaches it: notes at the
// intervals lo..hi move to `to`, in order; then the basic chord's intervals are
// ensured, in order.
struct CMove {
  int Lo, Hi, To;
};
struct CBasicChordShape {
  CMove Moves[3];
  int MoveCount;
  int Intvls[3];
  int IntvlCount;
};

// Indexed by basic chord 1..7.
constexpr CBasicChordShape Shapes[] = {{{{3, 3, 4}, {6, 8, 7}}, 2, {0, 4, 7}, 3},             // major
                                       {{{4, 4, 3}, {6, 8, 7}}, 2, {0, 3, 7}, 3},             // minor
                                       {{{3, 3, 4}, {6, 7, 8}}, 2, {0, 4, 8}, 3},             // augmented
                                       {{{4, 4, 3}, {7, 8, 6}}, 2, {0, 3, 6}, 3},             // diminished
                                       {{{3, 4, 5}, {6, 8, 7}}, 2, {0, 5, 7}, 3},             // sus4
                                       {{{3, 5, 2}, {6, 8, 7}}, 2, {0, 2, 7}, 3},             // sus2
                                       {{{4, 9, 7}, {1, 3, 0}, {10, 11, 12}}, 3, {0, 7}, 2}}; // drone

CBasicChordShape const* ShapeOf(CChord::TBasicChord bc) {
  return (bc >= CChord::bc_maj && bc <= CChord::bc_drone) ? &Shapes[bc - CChord::bc_maj] : nullptr;
}

// XG chord type numbers: the first row whose intervals equal the cache wins.
struct CXGRow {
  Mask Intvls;
  int XG;
};
constexpr CXGRow XGRows[] = {{MaskOf(0, 4, 7), 0},         {MaskOf(0, 4, 7, 9), 1},
                             {MaskOf(0, 4, 7, 11), 2},     {MaskOf(0, 4, 7, 11, 6), 3},
                             {MaskOf(0, 4, 7, 2), 4},      {MaskOf(0, 4, 7, 11, 2), 5},
                             {MaskOf(0, 4, 7, 9, 2), 6},   {MaskOf(0, 4, 7, 10), 19},
                             {MaskOf(0, 4, 6, 10), 21},    {MaskOf(0, 4, 7, 10, 2), 22},
                             {MaskOf(0, 4, 7, 10, 6), 23}, {MaskOf(0, 4, 7, 10, 9), 24},
                             {MaskOf(0, 4, 7, 10, 1), 25}, {MaskOf(0, 4, 7, 10, 8), 26},
                             {MaskOf(0, 4, 7, 10, 3), 27}, {MaskOf(0, 3, 7), 8},
                             {MaskOf(0, 3, 7, 9), 9},      {MaskOf(0, 3, 7, 10), 10},
                             {MaskOf(0, 3, 6, 10), 11},    {MaskOf(0, 3, 7, 2), 12},
                             {MaskOf(0, 3, 7, 10, 2), 13}, {MaskOf(0, 3, 7, 10, 5), 14},
                             {MaskOf(0, 3, 7, 11), 15},    {MaskOf(0, 3, 7, 11, 2), 16},
                             {MaskOf(0, 4, 8), 7},         {MaskOf(0, 4, 8, 11), 28},
                             {MaskOf(0, 4, 8, 10), 29},    {MaskOf(0, 3, 6), 17},
                             {MaskOf(0, 3, 6, 9), 18},     {MaskOf(0, 5, 7), 32},
                             {MaskOf(0, 5, 7, 10), 20},    {MaskOf(0, 2, 7), 33},
                             {MaskOf(0, 7), 31},           {MaskOf(0), 30}};

// The basic chord of an interval cache, by the presence of each interval in any
// octave, tested in this order.
CChord::TBasicChord BasicChordOf(CIntvlMasks const& masks) {
  auto has = [&masks](int x) { return masks.Has(x); };
  if (has(4)) return (!has(8) || has(7)) ? CChord::bc_maj : CChord::bc_aug;
  if (has(3)) {
    if (has(6)) return (has(7) || has(10)) ? CChord::bc_min : CChord::bc_dim;
    if (has(7) || !has(8)) return CChord::bc_min;
    // A minor third with the augmented fifth and no fifth: judged as without a third.
  }
  if (!has(7)) return CChord::bc_none;
  if (has(5)) return CChord::bc_sus4; // before the second: 0 2 5 7 is sus4
  if (has(2)) return CChord::bc_sus2;
  if (masks.IsExactly(MaskOf(0, 7)) || masks.IsExactly(MaskOf(0, 7, 12))) return CChord::bc_drone;
  return CChord::bc_none;
}

// XG number of each basic chord 0..7 (all that BasicChordOf gives) where no row
// matches; 34 is XG's "no chord".
constexpr int XGFallbacks[] = {34, 0, 8, 7, 17, 32, 33, 31};

} // namespace

CChord::TBasicChord CChord::BasicChord() const {
  RefreshIntvls();
  return BasicChordOf(CIntvlMasks(Intvls_));
}

void CChord::SetBasicChord(TBasicChord bc) {
  // The moves below edit the cache in place, which a stale cache would lose: a
  // root just set leaves it stale, and its rebuild folds a moved 12 into 0.
  RefreshIntvls();
  if (bc == bc_none) {
    for (int intvl : {3, 4, 7}) Intvls_.EraseIntvl(intvl);
    return;
  }
  CBasicChordShape const* shape = ShapeOf(bc);
  if (!shape) return;
  for (int m = 0; m < shape->MoveCount; ++m) {
    CMove const& move = shape->Moves[m];
    ChangeAllNotesWithinIntvlRange(move.Lo, move.Hi, move.To);
  }
  for (int k = 0; k < shape->IntvlCount; ++k) {
    int intvl = shape->Intvls[k];
    if (!HasIntvl(intvl)) AddIntvlInCompingRange(intvl);
  }
}

CIntvlSet CChord::IntvlsInBasicChord() const {
  CIntvlSet intvls(24);
  if (CBasicChordShape const* shape = ShapeOf(BasicChord()))
    intvls.SetIntvlsFromList(shape->Intvls, static_cast<std::size_t>(shape->IntvlCount));
  return intvls;
}

CScale::TType ChordScaleType(CChord::TBasicChord bc) {
  return (bc == CChord::bc_min || bc == CChord::bc_dim) ? CScale::Scale_Minor : CScale::Scale_Major;
}

CChord::TBasicChord BasicChordOfPitchClasses(std::uint32_t intvls) {
  CIntvlMasks masks;
  masks.AnyOctave = masks.Exact = intvls;
  return BasicChordOf(masks);
}

CScale ChordScale(CNote const& root, CChord::TBasicChord bc, bool minorSecond) {
  CScale scale(root, ChordScaleType(bc));
  if (minorSecond) {
    // The minor second one step below the second degree: over C, D flat.
    int second = PitchClass(scale.RootNote().KeyNr() + 2);
    scale.SetEnhForChromStep(1, static_cast<TEnh>(scale.EnhForKeynr(second) - 1));
  }
  return scale;
}

CScale::TType CChord::ScaleType() const { return ChordScaleType(BasicChord()); }

CScale CChord::Scale() const {
  TBasicChord bc = BasicChord(); // brings the cache up to date
  return ChordScale(RootNote_, bc, Intvls_.HasIntvl(1));
}

int CChord::XGChordIx() const {
  RefreshIntvls();
  CIntvlMasks masks(Intvls_);
  for (CXGRow const& row : XGRows)
    if (masks.IsExactly(row.Intvls)) return row.XG;
  return XGFallbacks[BasicChordOf(masks)];
}
