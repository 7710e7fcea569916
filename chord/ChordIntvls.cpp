// Chords: the interval cache, its queries and the key number queries.
#include "Chord.h"

#include "chord/IntvlFold.h"
#include "pitch/NoteNrs.h"

#include <algorithm>
#include <cstdint>

namespace {

// Interval of a note above the root by pitch class, 0..11.
int PitchClassIntvl(CNote const& note, CNote const& root) { return PitchClass(note.KeyNr() - root.KeyNr()); }

// Interval above the root of a listed key number, 0..11.
int KeyNrIntvl(int keyNr, CNote const& root) { return PitchClass(PitchClass(keyNr) - root.KeyNr()); }

// Key number lists end at exactly this value; other negative values are key numbers.
constexpr int KeyNrListEnd = -1;

} // namespace

void CChord::UpdateIntvlSet() const {
  // A key number lies in -11..11 (note number % 12), so a difference of two lies in
  // -22..22 and its folded interval in 0..22: a mask collects the intervals, which
  // then go into the cache in ascending order.
  std::uint32_t folded = 0;
  bool lonely = true;
  if (!Notes_.empty()) {
    int const rootKeyNr = RootNote_.KeyNr();
    int const wrap = Intvls_.WrapIntvl();
    int const lowest = PitchClassIntvl(*Notes_.begin(), RootNote_);
    folded = std::uint32_t{1} << FoldedIntvl(Notes_.begin()->KeyNr() - rootKeyNr, wrap);
    for (auto note = Notes_.begin() + 1; note != Notes_.end(); ++note) {
      // raw stays signed on purpose: a repeat of the lowest pitch class that lies
      // below the root's pitch class number never clears the mark.
      int const raw = note->KeyNr() - rootKeyNr;
      folded |= std::uint32_t{1} << FoldedIntvl(raw, wrap);
      lonely = lonely && raw != lowest;
    }
  }
  LowestNoteLonely_ = lonely ? 1 : 0;
  SetIntvlsFromMask(Intvls_, folded);
  IntvlsStale_ = 0;
}

CIntvlSet const& CChord::IntvlSet() const {
  RefreshIntvls();
  return Intvls_;
}

int CChord::Intvl(unsigned long i) const {
  RefreshIntvls();
  return Intvls_.Intvl(i);
}

bool CChord::HasIntvl(int intvl) const {
  RefreshIntvls();
  return Intvls_.HasIntvl(intvl);
}

bool CChord::HasIntvlInAnyOctave(int intvl) const {
  RefreshIntvls();
  return Intvls_.HasIntvlInAnyOctave(intvl);
}

bool CChord::HasOtherStackedThirdsOptionThan(int intvl) const {
  RefreshIntvls();
  return Intvls_.HasOtherStackedThirdsOptionThan(intvl);
}

CNote CChord::IntvlIxToNote(int ix) const {
  // A negative index is out of range as well; Intvl gives -1, which no note matches.
  int intvl = ix < 0 ? -1 : Intvl(static_cast<unsigned long>(ix));
  auto pos = std::find_if(Notes_.begin(), Notes_.end(),
                          [&](CNote const& note) { return PitchClassIntvl(note, RootNote_) == intvl; });
  return pos != Notes_.end() ? *pos : LowestNote();
}

int CChord::IntvlIxToKeyNr(int ix) const { return IntvlIxToNote(ix).KeyNr(); }

std::string CChord::IntvlIxToKeyName(int ix) const {
  CNote note = IntvlIxToNote(ix);
  note.AdjustEnhToScale(Scale());
  return note.KeyName(DefaultChordnamePref);
}

CMySet<int> CChord::KeyNrSet() const {
  RefreshIntvls();
  CMySet<int> keyNrs;
  for (int intvl : Intvls_) keyNrs.insert(PitchClass(RootNote_.KeyNr() + intvl % 12));
  return keyNrs;
}

bool CChord::HasKeyNr(int keyNr) const {
  RefreshIntvls();
  return Intvls_.HasIntvl(KeyNrIntvl(keyNr, RootNote_));
}

bool CChord::HasKeyNrsFromList(int const* keyNrs, std::size_t count) const {
  RefreshIntvls();
  for (std::size_t k = 0; k < count && keyNrs[k] != KeyNrListEnd; ++k)
    if (!Intvls_.HasIntvl(KeyNrIntvl(keyNrs[k], RootNote_))) return false;
  return true;
}

bool CChord::HasExactTheseKeyNrsFromList(int const* keyNrs, std::size_t count) const {
  RefreshIntvls();
  // The listed intervals all lie in 0..11, so a 12-bit mask holds the set that
  // the cache is compared with; its members, ascending, are the set bits.
  std::uint32_t listed = 0;
  for (std::size_t k = 0; k < count && keyNrs[k] != KeyNrListEnd; ++k)
    listed |= std::uint32_t{1} << KeyNrIntvl(keyNrs[k], RootNote_);
  // The one-sided comparison of CIntvlSet: the cache's members, ascending, must be
  // the smallest listed intervals, one for one; the list may go on beyond them.
  for (int member : Intvls_) {
    if (listed == 0) return false;
    int smallest = 0;
    while ((listed >> smallest & 1u) == 0) ++smallest;
    if (member != smallest) return false;
    listed &= listed - 1;
  }
  return true;
}
