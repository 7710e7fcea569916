// Chords: construction and reset, the root, the notes and their comparisons.
#include "Chord.h"

#include <algorithm>
#include <iterator>
#include <utility>

CChord::CChord(int wrapIntvl) : Intvls_(wrapIntvl) {}

CChord::CChord(CNote root, CMySet<CNote> notes, int wrapIntvl) : Intvls_(wrapIntvl) {
  SetRootNote(root);
  // Takes the lowest note as the root again and clears the root-specified flag.
  SetFromNoteSet(std::move(notes));
}

CChord::CChord(CNote root, TBasicChord bc, int wrapIntvl) : RootNote_(root), Intvls_(wrapIntvl) {
  RootNoteSpecified_ = 1;
  SetBasicChord(bc);
}

void CChord::Init() {
  RootNoteSpecified_ = 0;
  IntvlsStale_ = 0;
  LowestNoteLonely_ = 0;
}

void CChord::Clear() {
  Init();
  RootNote_ = CNote();
  Notes_.clear();
  Intvls_.Clear();
}

void CChord::SetUndefined() {
  Clear();
  RootNote_ = CNote(255, Enh_Natural);
  RootNoteSpecified_ = 1;
}

bool CChord::IsUndefined() const { return RootNote_.NoteNr() == 255; }

CNote CChord::RootNote() const { return RootNote_; }

bool CChord::RootNoteSpecified() const { return RootNoteSpecified_ != 0; }

void CChord::SetRootNote(CNote const& root) {
  SetRootNoteWithoutSpecify(root);
  RootNoteSpecified_ = 1;
}

void CChord::SetRootNoteWithoutSpecify(CNote const& root) {
  RootNote_ = root;
  IntvlsStale_ = Notes_.empty() ? 0 : 1;
}

void CChord::AddNote(CNote const& note) {
  Notes_.insert(note);
  if (!RootNoteSpecified_) {
    RootNote_ = *Notes_.begin();
    IntvlsStale_ = 1;
  }
  // Note numbers lie within -11..263 (setters clamp, octave moves stay near the
  // range), so the difference fits an int.
  Intvls_.InsertIntvl(static_cast<int>(note.NoteNr() - RootNote_.NoteNr()));
}

void CChord::DelNote(CNote const& note) {
  Notes_.erase(note);
  IntvlsStale_ = 1;
}

void CChord::DelNote(unsigned long i) {
  if (i >= Notes_.size()) return;
  Notes_.erase(std::next(Notes_.begin(), static_cast<std::ptrdiff_t>(i)));
  IntvlsStale_ = 1;
}

namespace {
// Octave of a note number as the chord's octave arguments count it: note 60 is in
// octave 4 (truncating division, like the rest of the note arithmetic).
long OctOf(CNote const& note) { return note.NoteNr() / 12 - 1; }
} // namespace

void CChord::DeleteAllNotesInOctave(int oct) {
  for (auto pos = Notes_.begin(); pos != Notes_.end();) {
    if (OctOf(*pos) == oct) {
      pos = Notes_.erase(pos);
      IntvlsStale_ = 1;
    } else {
      ++pos;
    }
  }
}

bool CChord::HasNote(CNote const& note) const { return Notes_.find(note) != Notes_.end(); }

bool CChord::HasNoteNr(int noteNr) const {
  return std::any_of(Notes_.begin(), Notes_.end(), [noteNr](CNote const& n) { return n.NoteNr() == noteNr; });
}

CNote CChord::Note(unsigned long i) const {
  if (i >= Notes_.size()) return CNote_Undef;
  return *std::next(Notes_.begin(), static_cast<std::ptrdiff_t>(i));
}

CMySet<CNote> const& CChord::Notes() const { return Notes_; }

unsigned long CChord::NoteCount() const { return Notes_.size(); }

CNote CChord::LowestNote() const { return Notes_.empty() ? CNote_Undef : *Notes_.begin(); }

CNote CChord::HighestNote() const { return Notes_.empty() ? CNote_Undef : *Notes_.rbegin(); }

int CChord::CountNotesInOctave(int oct) const {
  return static_cast<int>(
      std::count_if(Notes_.begin(), Notes_.end(), [oct](CNote const& n) { return OctOf(n) == oct; }));
}

bool CChord::IsNarrowChord() const { return HighestNote().NoteNr() - LowestNote().NoteNr() < 13; }

bool CChord::IsExactlyTheSame(CChord const& other) const {
  return Notes_.size() == other.Notes_.size() && Notes_ == other.Notes_ && RootNote_ == other.RootNote_;
}

bool CChord::LowestNoteLonely() const { return LowestNoteLonely_ != 0; }

void CChord::Trace() const {
  for (CNote const& note : Notes_) note.Trace();
}

bool operator==(CChord const& a, CChord const& b) {
  return a.RootNote() == b.RootNote() && a.NoteCount() == b.NoteCount() && a.Notes() == b.Notes();
}

bool operator!=(CChord const& a, CChord const& b) { return !(a == b); }
