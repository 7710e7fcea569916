// An independent model of spelling, built from letters and accidentals, against
// which the library's spelling tables and names are checked.
//
// A spelling e of a key number k is a letter L with e - 2 accidentals (negative:
// flats) such that pitch(L) + e - 2 == k (mod 12). The letter order C D E F G A B
// and the circle of fifths give names and key-signature counts from first
// principles.
#ifndef TONVEX_TESTS_SPELLINGORACLE_H
#define TONVEX_TESTS_SPELLINGORACLE_H

#include "support/TestPrelude.h"
#include <optional>

namespace oracle {

struct Letter {
  int index;  // 0..6 from C
  char name;  // English letter
  int pitch;  // key number of the plain letter
  int fifths; // position on the circle of fifths: C 0, G 1, ... B 5, F -1
};

inline constexpr Letter Letters[7] = {{0, 'C', 0, 0}, {1, 'D', 2, 2}, {2, 'E', 4, 4}, {3, 'F', 5, -1},
                                      {4, 'G', 7, 1}, {5, 'A', 9, 3}, {6, 'B', 11, 5}};

inline int Mod12(int v) { return ((v % 12) + 12) % 12; }

/// The letter that spells key number k with spelling e, if any.
inline std::optional<Letter> LetterFor(int k, int e) {
  if (e < 0 || e > 4) return std::nullopt;
  if (k < 0 || k > 11) k = 2; // every other key number behaves like D
  for (Letter const& l : Letters)
    if (Mod12(l.pitch + e - 2) == k) return l;
  return std::nullopt;
}

inline bool Senseful(int k, int e) { return LetterFor(k, e).has_value(); }

inline std::vector<int> SensefulSpellings(int k) {
  std::vector<int> result;
  for (int e = 0; e <= 4; ++e)
    if (Senseful(k, e)) result.push_back(e);
  return result;
}

/// The name of a senseful spelling: solmisation syllables, German names (B flat
/// "B", B natural "H", "es" and "is" endings), or English names ("Bbb", "Cx"), where
/// B_is_H writes every B but B flat as H and Bb_is_B writes B flat as B.
inline std::string Name(int k, int e, bool roman = false, bool german = false, bool bbIsB = false, bool bIsH = false) {
  Letter const l = *LetterFor(k, e);
  if (roman) {
    char const* const syllables[7] = {"Do", "Re", "Mi", "Fa", "So", "La", "Ti"};
    char const* const signs[5] = {"bb", "b", "", "#", "x"};
    return std::string(syllables[l.index]) + signs[e];
  }
  if (german) {
    char const* const endings[5] = {"eses", "es", "", "is", "isis"};
    std::string name = std::string(1, l.name == 'B' && e <= 2 ? 'H' : l.name) + endings[e];
    return name == "Hes" ? "B" : name == "Aes" ? "As" : name == "Ees" ? "Es" : name;
  }
  char const* const signs[5] = {"bb", "b", "", "#", "x"};
  std::string name = std::string(1, l.name) + signs[e];
  if (bbIsB && name == "Bb") return "B";
  if (bIsH && l.name == 'B' && name != "Bb") name[0] = 'H';
  return name;
}

/// Signed key-signature count of the key on a root spelled (k, e): the letter's
/// place on the circle of fifths plus seven per accidental, counted from C for
/// major-like chords, from A for minor (2) and from E for diminished (4).
inline int SignCount(int k, int e, int basicChord) {
  int const offset = basicChord == 2 ? 3 : (basicChord == 4 ? 4 : 0);
  return LetterFor(k, e)->fifths + 7 * (e - 2) - offset;
}

} // namespace oracle

#endif
