// The spelling table of a scale and its key signature.
#include "Scale.h"

#include "pitch/KeySignCount.h"

namespace {

// Key numbers of the letters C D E F G A B.
constexpr int NoteNameToKeyNr[7] = {0, 2, 4, 5, 7, 9, 11};

// By interval above the root: -1 spells the key number as the raised form of the
// letter a semitone below, +1 as the lowered form of the letter a semitone above.
constexpr int EnhOffset_stMaj[12] = {0, -1, 0, 1, 0, 0, -1, 0, 1, 0, 1, 0};
constexpr int EnhOffset_stMin[12] = {0, 1, 0, 0, -1, 0, -1, 0, 0, -1, 0, -1};

constexpr int LetterF = 3, LetterB = 6;
constexpr int Major = 1, Minor = 2;

// Reduces any key number (or sum of one with an offset) into 0..11.
int PitchClass(int k) {
  int r = k % 12;
  return r < 0 ? r + 12 : r;
}

// The spelling table of a scale by its definition (see CScale::CalcEnh).
void SpellingByKeySignature(CNote const& root, bool minor, TEnh (&enh)[12]) {
  // The key signature: sharps are added in the order F C G D A E B (a fifth up is
  // four letters on), flats in the order B E A D G C F. Beyond seven signs a letter
  // takes a second (and third) accidental.
  int accidental[7] = {Enh_Natural, Enh_Natural, Enh_Natural, Enh_Natural, Enh_Natural, Enh_Natural, Enh_Natural};
  CNote counted = root; // the count may respell the note it is given
  int signs = KeySignCount(counted, minor ? Minor : Major);
  for (int n = 0, letter = LetterF; n < signs; ++n, letter = (letter + 4) % 7) ++accidental[letter];
  for (int n = 0, letter = LetterB; n < -signs; ++n, letter = (letter + 3) % 7) --accidental[letter];

  for (TEnh& e : enh) e = Enh_Natural;
  for (int i = 0; i < 7; ++i)
    enh[PitchClass(accidental[i] - Enh_Natural + NoteNameToKeyNr[i])] = static_cast<TEnh>(accidental[i]);

  // The chromatic steps between the degrees borrow the spelling of a neighbouring
  // degree. Interval 11 of a minor scale keeps what the key signature gave it.
  int const* offset = minor ? EnhOffset_stMin : EnhOffset_stMaj;
  int rootKeyNr = root.KeyNr();
  for (int i = 0; i < 11; ++i) {
    int k = PitchClass(rootKeyNr + i);
    int j = PitchClass(k + offset[i]);
    enh[k] = static_cast<TEnh>(enh[j] - offset[i]);
  }
}

// The spelling tables of the roots a scale can have (key number 0..11, a senseful
// spelling), major and minor, computed once: every chord spelled after its root
// builds a scale, often more than one per chord. Computed on first use, which the
// language makes safe under threads and which the tables of root finding make
// while the library is loaded; only read afterwards.
struct CSpellings {
  signed char Enh[2][12][5][12];
};

CSpellings const& Spellings() {
  static CSpellings const spellings = [] {
    CSpellings table{};
    for (int minor = 0; minor < 2; ++minor)
      for (int k = 0; k < 12; ++k)
        for (int e = Enh_DoubleFlat; e <= Enh_DoubleSharp; ++e) {
          if (!IsSensefulEnhForKeyNr(k, static_cast<TEnh>(e))) continue;
          TEnh enh[12];
          SpellingByKeySignature(CNote(k, static_cast<TEnh>(e)), minor != 0, enh);
          // Spellings stay within a few accidentals of natural.
          for (int i = 0; i < 12; ++i) table.Enh[minor][k][e][i] = static_cast<signed char>(enh[i]);
        }
    return table;
  }();
  return spellings;
}

} // namespace

void CScale::CalcEnh() {
  int const k = Root_.KeyNr();
  bool const minor = Type_ == Scale_Minor;
  // The root is a key number with a senseful spelling, which the tables hold.
  if (k < 0 || k > 11 || !Root_.HasSensefulEnh()) {
    SpellingByKeySignature(Root_, minor, Enh_);
    return;
  }
  signed char const* table = Spellings().Enh[minor ? 1 : 0][k][Root_.Enh()];
  for (int i = 0; i < 12; ++i) Enh_[i] = static_cast<TEnh>(table[i]);
}

int CScale::SignsCount() const {
  CNote root = Root_; // the count may respell the note it is given
  return KeySignCount(root, Type_ == Scale_Minor ? Minor : Major);
}

TEnh CScale::EnhForKeynr(int k) const { return Enh_[PitchClass(k)]; }

TEnh CScale::EnhForNote(CNote const& note) const { return EnhForKeynr(note.KeyNr()); }

void CScale::SetEnhForKeyNr(int k, TEnh enh) { Enh_[PitchClass(k)] = enh; }

void CScale::SetEnhForNote(CNote const& note, TEnh enh) { SetEnhForKeyNr(note.KeyNr(), enh); }

void CScale::SetEnhForChromStep(int step, TEnh enh) { SetEnhForKeyNr(Root_.KeyNr() + step % 12, enh); }

void CNote::AdjustEnhToScale(CScale const& scale) const { Enh_ = scale.EnhForKeynr(KeyNr()); }
