// Chords: setting from sets, transposing, inverting, placing lowest notes and the
// comping range operations.
#include "Chord.h"

#include "chord/IntvlFold.h"
#include "pitch/NoteNrs.h"

#include <algorithm>
#include <cstdint>
#include <utility>

namespace {

// The comping range is note numbers 53..64 (F below middle C up to the E above it):
// C .. E sit above middle C, F .. B below it.
long long CompingRootNoteNr(long long keyNr) { return keyNr < 5 ? keyNr + 60 : keyNr + 48; }
constexpr long CompingRangeLow = 53;

// Interval of a note above the root by note number difference, 0..11.
int NoteNrIntvl(CNote const& note, CNote const& root) { return PitchClass(note.NoteNr() - root.NoteNr()); }

} // namespace

void CChord::SetFromNoteSet(CMySet<CNote> notes) {
  Clear();
  Notes_ = std::move(notes);
  SetRootNoteWithoutSpecify(LowestNote());
}

void CChord::SetFromNoteNrSet(CMySet<int> const& noteNrs) {
  Clear();
  // What adding the notes one by one leaves: the numbers ascend and stay in order
  // when clamped (the note constructor clamps to 0..127, 255 passes, and respells
  // the naturals), so the first note is the root all along, and each note's
  // difference to it goes into the (stale) cache by the insertion rule. Differences
  // lie in 0..255; under a wrap interval up to 32 they fold below 32 and are
  // collected in a mask.
  int const wrap = Intvls_.WrapIntvl();
  bool const masked = wrap > 0 && wrap <= 32;
  std::uint32_t intvls = 0;
  for (int noteNr : noteNrs) {
    CNote const note(noteNr, Enh_Natural);
    Notes_.insert(note);
    int const difference = static_cast<int>(note.NoteNr() - Notes_.begin()->NoteNr());
    if (masked)
      intvls |= std::uint32_t{1} << FoldedIntvl(difference, wrap);
    else
      Intvls_.InsertIntvl(difference);
  }
  if (masked) SetIntvlsFromMask(Intvls_, intvls);
  SetRootNoteWithoutSpecify(LowestNote());
}

void CChord::SetFromKeyNrSet(CMySet<int> const& keyNrs) {
  bool keepRoot = RootNoteSpecified_ != 0;
  CNote root = RootNote_;
  Clear();
  if (keepRoot) SetRootNote(root);
  for (int keyNr : keyNrs) AddNote(CNote(keyNr, Enh_Natural));
  // Under a specified root the cache holds the intervals just inserted.
  if (keepRoot && HasIntvl(0)) return;
  SetRootNoteWithoutSpecify(LowestNote());
}

void CChord::Transpose(int t) {
  CMySet<CNote> moved;
  for (CNote note : Notes_) {
    long long v = (note.NoteNr() + static_cast<long long>(t)) % 128;
    while (v < 0) v += 12;
    note.SetNoteNrAndCheckEnh(static_cast<long>(v));
    moved.insert(note);
  }
  Notes_ = std::move(moved);
  RootNote_.SetNoteNr(ClampNoteNr(RootNote_.NoteNr() + static_cast<long long>(t)));
}

void CChord::Invert() {
  if (Notes_.empty()) return;
  CNote moved = *Notes_.begin();
  Notes_.erase(Notes_.begin());
  long highest = HighestNote().NoteNr();
  // Into the octave above the highest note when the moved pitch class is not above
  // the highest one, else into the highest note's octave. CNote::SetOct's rule puts
  // octaves above 9 into octave 8, as the moves require, and keeps 128..131.
  bool octaveAbove = moved.KeyNr() <= highest % 12 && highest < 116;
  long oct = octaveAbove ? highest / 12 : highest / 12 - 1;
  moved.SetOct(static_cast<int>(oct));
  Notes_.insert(moved);
}

void CChord::SetLowestNote(CNote n) {
  DelNote(LowestNote());
  int intvl = PitchClass(n.KeyNr() - RootNote_.KeyNr());
  RefreshIntvls();
  LowestNoteLonely_ = Intvls_.HasIntvl(intvl) ? 1 : 0;
  CNote lowest = LowestNote();
  // The note constructor clamps to 0..127 (255 passes) and checks the spelling.
  AddNote(CNote(lowest.NoteNr() - PitchClass(lowest.KeyNr() - n.KeyNr()), n.Enh()));
}

void CChord::SetLowestNoteInOctave(int keyNr, int oct, TEnh enh) {
  CNote note(PitchClass(keyNr), enh);
  // (oct + 1) * 12 + the pitch class, up to 131 in octave 9, which is kept.
  note.SetOct(std::clamp(oct, -1, 9));
  AddNote(note);
}

void CChord::SetLowestNoteAloneInOctave(int keyNr, int oct, TEnh enh) {
  DeleteAllNotesInOctave(oct);
  SetLowestNoteInOctave(keyNr, oct, enh);
}

void CChord::SetRootNoteInCompingRange(CNote const& note) {
  SetRootNote(CNote(static_cast<long>(CompingRootNoteNr(PitchClass(note.NoteNr()))), note.Enh()));
}

void CChord::SetRootKeyNr(int keyNr) { SetRootNote(CNote(ClampNoteNr(CompingRootNoteNr(keyNr)), Enh_Natural)); }

void CChord::SetRootKeyNrAndBasicChord(int keyNr, TBasicChord bc) {
  SetRootKeyNr(keyNr);
  SetBasicChord(bc);
}

void CChord::AddIntvlInCompingRange(int intvl) {
  long noteNr = PitchClass(RootNote_.KeyNr() + static_cast<long long>(intvl)) + 48;
  if (noteNr < CompingRangeLow) noteNr += 12;
  Notes_.insert(CNote(noteNr, Enh_Natural));
  Intvls_.InsertIntvl(intvl);
}

void CChord::ChangeAllNotesWithinIntvlRange(int lo, int hi, int newIntvl) {
  auto inRange = [&](CNote const& note) {
    int d = NoteNrIntvl(note, RootNote_);
    return d >= lo && d <= hi;
  };
  if (std::none_of(Notes_.begin(), Notes_.end(), inRange)) return;

  CMySet<CNote> changed;
  for (CNote const& note : Notes_) {
    if (!inRange(note)) {
      changed.insert(note);
      continue;
    }
    // Up by diff for a small step (or down for a negative one), down by diff itself
    // for a large one: diff 7 lands a fifth below the old place, not on newIntvl.
    long long diff = static_cast<long long>(newIntvl) - NoteNrIntvl(note, RootNote_);
    long long noteNr = diff > 5 ? note.NoteNr() - diff : note.NoteNr() + diff;
    changed.insert(CNote(ClampNoteNr(noteNr), Enh_Natural));
  }
  Notes_ = std::move(changed);
  Intvls_.EraseIntvlsFromTo(lo, hi);
  Intvls_.InsertIntvl(newIntvl);
}
