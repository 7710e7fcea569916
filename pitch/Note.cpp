// Notes, their spelling rules and the distance functions between notes.
#include "Note.h"

#include "ChordnamePref.h"
#include "pitch/NoteNrs.h"

#include <cstdlib>
#include <ostream>

namespace {

// Row of the spelling tables: every key number outside 0..11 behaves like D.
int SpellingRow(int keyNr) { return (keyNr >= 0 && keyNr <= 11) ? keyNr : 2; }

// Senseful spellings per key number, bit e set when TEnh e names the key.
constexpr unsigned Bit(int e) { return 1u << e; }
constexpr unsigned CFBits = Bit(0) | Bit(2) | Bit(3);   // Dbb C B#
constexpr unsigned CsFsBits = Bit(1) | Bit(3) | Bit(4); // Db C# Bx
constexpr unsigned DGABits = Bit(0) | Bit(2) | Bit(4);  // Ebb D Cx
constexpr unsigned EbBbBits = Bit(0) | Bit(1) | Bit(3); // Fbb Eb D#
constexpr unsigned EBBits = Bit(1) | Bit(2) | Bit(4);   // Fb E Dx
constexpr unsigned GsBits = Bit(1) | Bit(3);            // Ab G#
constexpr unsigned SensefulEnhBits[12] = {CFBits,   CsFsBits, DGABits, EbBbBits, EBBits,   CFBits,
                                          CsFsBits, DGABits,  GsBits,  DGABits,  EbBbBits, EBBits};

// One step toward the flats / sharps, by key number row and spelling column 0..4.
constexpr TEnh F = Enh_DoubleFlat, f = Enh_Flat, N = Enh_Natural, s = Enh_Sharp, X = Enh_DoubleSharp;
constexpr TEnh ToFlats[12][5] = {{F, F, F, N, s}, {f, f, f, f, s}, {F, F, F, N, N}, {F, F, f, f, s},
                                 {f, f, f, N, N}, {F, F, F, N, s}, {f, f, f, f, s}, {F, F, F, N, N},
                                 {f, f, f, f, s}, {F, F, F, N, N}, {F, F, f, f, s}, {f, f, f, N, N}};
constexpr TEnh ToSharps[12][5] = {{N, N, s, s, s}, {f, s, s, X, X}, {N, N, X, X, X}, {f, s, s, s, s},
                                  {f, N, X, X, X}, {N, N, s, s, s}, {f, s, s, X, X}, {N, N, X, X, X},
                                  {f, s, s, s, s}, {N, N, X, X, X}, {f, s, s, s, s}, {f, N, X, X, X}};

// Spelling of each key number in the default scale (C major); a black key asked to
// be natural takes it. A fixed table, so that checking a spelling never builds a
// scale; the tests hold it equal to what CScale() computes.
constexpr TEnh DefaultScaleEnh[12] = {N, s, N, f, N, N, s, N, f, N, f, N};

} // namespace

bool IsSensefulEnhForKeyNr(int keyNr, TEnh enh) {
  if (enh < Enh_DoubleFlat || enh > Enh_DoubleSharp) return false;
  return (SensefulEnhBits[SpellingRow(keyNr)] >> enh) & 1u;
}

TEnh EnhShiftToFlats(int keyNr, TEnh enh) {
  // A spelling beyond either end counts as that end.
  int column = enh < Enh_DoubleFlat ? 0 : (enh > Enh_DoubleSharp ? 4 : enh);
  return ToFlats[SpellingRow(keyNr)][column];
}

TEnh EnhShiftToSharps(int keyNr, TEnh enh) {
  // Any spelling outside 0..4 is read as a request for the sharpest spelling.
  int column = (enh < Enh_DoubleFlat || enh > Enh_DoubleSharp) ? 4 : enh;
  return ToSharps[SpellingRow(keyNr)][column];
}

TEnh EnhShift(int keyNr, TEnh enh) {
  bool naturalIsSharpSide = keyNr == 4 || keyNr == 11; // E and B: Fb and Cb lie flatward
  bool sharpSide = enh == Enh_Sharp || enh == Enh_DoubleSharp || (naturalIsSharpSide && enh == Enh_Natural);
  return sharpSide ? EnhShiftToFlats(keyNr, enh) : EnhShiftToSharps(keyNr, enh);
}

TEnh MakeSensefulEnhForKeyNr(int /*keyNr*/, TEnh enh) { return enh; }

CNote::CNote(long noteNr, TEnh enh) : NoteNr_(ClampNoteNr(noteNr)), Enh_(enh) { CheckEnh(); }

void CNote::SetNoteNr(long noteNr) { NoteNr_ = ClampNoteNr(noteNr); }

void CNote::SetNoteNrAndCheckEnh(long noteNr) {
  NoteNr_ = ClampNoteNr(noteNr);
  CheckEnh();
}

void CNote::SetNoteNrAndEnh(long noteNr, TEnh enh) {
  NoteNr_ = ClampNoteNr(noteNr);
  Enh_ = enh;
  CheckEnh();
}

void CNote::SetKeyNr(int keyNr) {
  std::int32_t base = static_cast<std::int32_t>((static_cast<std::uint32_t>(NoteNr_) & 0xFFu) / 12u * 12u);
  int k = keyNr % 12;
  if (k < 0) k += 12;
  NoteNr_ = base + k;
}

void CNote::SetKeyNrAndEnh(int keyNr) {
  SetKeyNr(keyNr);
  CheckEnh();
}

void CNote::SetOct(int oct) {
  std::int32_t k = NoteNr_ % 12;
  if (oct < -1)
    NoteNr_ = (-NoteNr_) % 12;
  else if (oct <= 9)
    NoteNr_ = k + 12 * oct + 12;
  else
    NoteNr_ = k + 108;
}

void CNote::Clear() {
  NoteNr_ = 0;
  Enh_ = Enh_Natural;
}

void CNote::SetEnh(TEnh enh) const {
  Enh_ = enh;
  CheckEnh();
}

void CNote::CheckEnh() const {
  int k = KeyNr();
  if (IsSensefulEnhForKeyNr(k, Enh_)) return;
  if (Enh_ == Enh_Natural)
    Enh_ = DefaultScaleEnh[SpellingRow(k)]; // only black keys reach this line
  else
    Enh_ = ::EnhShift(k, Enh_);
}

bool CNote::HasSensefulEnh() const { return IsSensefulEnhForKeyNr(KeyNr(), Enh_); }

bool CNote::IsBlackKey() const {
  switch (KeyNr()) {
  case 1:
  case 3:
  case 6:
  case 8:
  case 10: return true;
  default: return false;
  }
}

void CNote::EnhShift() const { Enh_ = ::EnhShift(KeyNr(), Enh_); }
void CNote::EnhShiftToFlats() const { Enh_ = ::EnhShiftToFlats(KeyNr(), Enh_); }
void CNote::EnhShiftToSharps() const { Enh_ = ::EnhShiftToSharps(KeyNr(), Enh_); }

bool operator==(CNote const& a, CNote const& b) { return a.NoteNr() == b.NoteNr() && a.Enh() == b.Enh(); }
bool operator!=(CNote const& a, CNote const& b) { return !(a == b); }
bool operator<(CNote const& a, CNote const& b) {
  if (a.NoteNr() != b.NoteNr()) return a.NoteNr() < b.NoteNr();
  return a.Enh() < b.Enh();
}

std::ostream& operator<<(std::ostream& os, CNote const& note) {
  return os << "CNote: " << note.KeyName(DefaultChordnamePref) << note.OctName(DefaultChordnamePref) << " (NoteNr "
            << note.NoteNr() << ", Enh " << static_cast<int>(note.Enh()) << ")";
}

int IntvlFromTo(CNote const& a, CNote const& b) { return static_cast<int>(b.NoteNr() - a.NoteNr()); }
int DistanceBetween(CNote const& a, CNote const& b) { return std::abs(IntvlFromTo(a, b)); }
// The key numbers are taken as pitch classes: SetOct and the parser leave negative
// note numbers, whose negative key numbers would push the differences to -22..22
// and the distances below out of their ranges.
int KeyIntvlFromTo(CNote const& a, CNote const& b) { return PitchClass(b.KeyNr()) - PitchClass(a.KeyNr()); }

int AbsKeyIntvlFromTo(CNote const& a, CNote const& b) { return PitchClass(KeyIntvlFromTo(a, b)); }

int KeyDistanceBetween(CNote const& a, CNote const& b) {
  int d = std::abs(KeyIntvlFromTo(a, b));
  return d < 7 ? d : 12 - d;
}

int SmallestKeyIntvlBetween(CNote const& a, CNote const& b) {
  int d = KeyIntvlFromTo(a, b);
  if (d > 5) return d - 12;
  if (d >= -6) return d;
  return d + 12;
}
