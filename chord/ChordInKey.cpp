// Chords in relation to a key: harmonic function, closeness, notes outside the key
// and the key sign count of a chord.
#include "Chord.h"

#include "SignKey.h"
#include "chord/ClosenessTables.h"
#include "chord/HarmFuncCodes.h"
#include "pitch/KeySignCount.h"
#include "pitch/NoteNrs.h"

#include <cstdint>

namespace {

// The pitch classes on the key's degrees, as bits 0..11, so that each membership
// test is a bit test rather than a walk of the degrees.
std::uint32_t KeyPitchClasses(CSignKey const& key) {
  CScale const& scale = key.Scale();
  std::uint32_t mask = 0;
  for (int d = 0, n = scale.DegreesPerOctave(); d < n; ++d) mask |= std::uint32_t{1} << scale.DegreeNrToKeyNr(d);
  return mask;
}

// Whether a note's key number (note number % 12, negative for a negative note
// number) is a degree of the key; a negative key number never is, as in CScale.
bool InKey(std::uint32_t keyPitchClasses, CNote const& note) {
  int k = note.KeyNr();
  return k >= 0 && (keyPitchClasses >> k & 1u) != 0;
}

} // namespace

int CChord::HarmFuncIn(CSignKey const& key) const {
  // The first degree on the root's key number (not reduced: a negative one is on
  // no degree); degrees past the seventh exist only in longer scales.
  int degree = key.Scale().KeyNrToDegreeNr(RootNote_.KeyNr());
  if (degree < 0 || degree > 6) return 0;
  int bc = BasicChord();
  return (bc >= 0 && bc <= 7) ? HarmFuncCodes[degree][bc] : 0;
}

int CChord::ClosenessToSignKey(CSignKey const& key) const {
  int distance = PitchClass(RootNote_.KeyNr() - key.RootNote().KeyNr());
  int const* table = ClosenessTable(BasicChord(), key.SignKeyType() == CSignKey::SignKey_Major);
  return table ? table[distance] : CountIntvlsInSignKey(key);
}

int CChord::CountIntvlsInSignKey(CSignKey const& key) const {
  std::uint32_t keyPitchClasses = KeyPitchClasses(key);
  int count = 0;
  int size = static_cast<int>(IntvlSet().size());
  for (int ix = 0; ix < size; ++ix)
    if (InKey(keyPitchClasses, IntvlIxToNote(ix))) ++count;
  return count;
}

int CChord::CountIntvlsNotInSignKey(CSignKey const& key) const {
  int inKey = CountIntvlsInSignKey(key);
  return static_cast<int>(Intvls_.size()) - inKey;
}

int CChord::CountNotesNotInSignKey(CSignKey const& key) const {
  std::uint32_t keyPitchClasses = KeyPitchClasses(key);
  int count = 0;
  for (CNote const& note : Notes_)
    if (!InKey(keyPitchClasses, note)) ++count;
  return count;
}

bool CChord::IsInSignKey(CSignKey const& key) const {
  int inKey = CountIntvlsInSignKey(key);
  return inKey == static_cast<int>(Intvls_.size());
}

int CChord::SignsCount() const { return KeySignCount(RootNote_, BasicChord()); }
