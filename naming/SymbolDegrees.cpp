// Degrees, spelled pitches and the text buffer of chord symbols.
#include "naming/SymbolDegrees.h"

#include "pitch/NoteNrs.h"

#include <cstring>

namespace {

// Pitch classes of the letters C D E F G A B.
constexpr int LetterPitchClasses[7] = {0, 2, 4, 5, 7, 9, 11};
// The letter of each natural pitch class, -1 for the black keys.
constexpr int NaturalLetters[12] = {0, -1, 1, -1, 2, 3, -1, 4, -1, 5, -1, 6};
// The usual spelling of each pitch class: C C# D Eb E F F# G Ab A Bb B.
constexpr CSpelledPitch UsualSpellings[12] = {{0, 0}, {0, 1}, {1, 0},  {2, -1}, {2, 0},  {3, 0},
                                              {3, 1}, {4, 0}, {5, -1}, {5, 0},  {6, -1}, {6, 0}};
// Semitones of the degrees 1..13 above the root, folded into one octave.
constexpr int DegreeIntvls[14] = {0, 0, 2, 4, 5, 7, 9, 11, 0, 2, 4, 5, 7, 9};

} // namespace

int DegreeIntvl(int degree) { return degree >= 1 && degree <= 13 ? DegreeIntvls[degree] : 0; }

int DegreeAccidentals(int intvl, int degree) {
  int d = PitchClass(intvl - DegreeIntvl(degree));
  return d > 5 ? d - 12 : d;
}

int SpelledPitchClass(CSpelledPitch pitch) { return PitchClass(LetterPitchClasses[pitch.Letter] + pitch.Accidentals); }

CSpelledPitch SpellNote(CNote const& note) {
  int const pc = PitchClass(note.NoteNr());
  TEnh const enh = note.Enh();
  if (enh >= Enh_DoubleFlat && enh <= Enh_DoubleSharp) {
    int const accidentals = enh - Enh_Natural;
    int const letter = NaturalLetters[PitchClass(pc - accidentals)];
    if (letter >= 0) return {letter, accidentals};
  }
  return UsualSpellings[pc];
}

CSpelledPitch SpellDegree(CSpelledPitch root, int intvl, int degree) {
  int const letter = (root.Letter + degree - 1) % 7;
  int const pc = PitchClass(SpelledPitchClass(root) + intvl);
  int accidentals = PitchClass(pc - LetterPitchClasses[letter]);
  if (accidentals > 5) accidentals -= 12;
  if (accidentals < -2 || accidentals > 2) return UsualSpellings[pc];
  return {letter, accidentals};
}

TEnh EnhOf(CSpelledPitch pitch) { return static_cast<TEnh>(Enh_Natural + pitch.Accidentals); }

void CSymbolText::Add(std::string_view text) {
  if (text.size() > Capacity - Length_) return;
  std::memcpy(Buf_ + Length_, text.data(), text.size());
  Length_ += text.size();
}

void CSymbolText::AddAccidentals(int accidentals, bool unicode) {
  if (unicode && accidentals == 2) return Add("\xF0\x9D\x84\xAA");            // 𝄪
  if (unicode && accidentals == -2) return Add("\xF0\x9D\x84\xAB");           // 𝄫
  for (; accidentals > 0; --accidentals) Add(unicode ? "\xE2\x99\xAF" : "#"); // ♯
  for (; accidentals < 0; ++accidentals) Add(unicode ? "\xE2\x99\xAD" : "b"); // ♭
}

void CSymbolText::AddPitch(CSpelledPitch pitch, bool unicode) {
  Add("CDEFGAB"[pitch.Letter]);
  AddAccidentals(pitch.Accidentals, unicode);
}

void CSymbolText::AddDegree(CSymbolTone tone, bool unicode) {
  AddAccidentals(DegreeAccidentals(tone.Intvl, tone.Degree), unicode);
  char digits[2] = {static_cast<char>('0' + tone.Degree / 10), static_cast<char>('0' + tone.Degree % 10)};
  if (tone.Degree >= 10)
    Add(std::string_view(digits, 2));
  else
    Add(digits[1]);
}
