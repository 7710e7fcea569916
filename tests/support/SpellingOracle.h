// An independent model of spelling, built from letters and accidentals, against
// which the library's spelling tables are checked.
//
// A spelling e of a key number k is a letter L with e - 2 accidentals (negative:
// flats) such that pitch(L) + e - 2 == k (mod 12). The letter order C D E F G A B
// and the circle of fifths give names and key-signature counts from first
// principles.
#ifndef TONVEX_TESTS_SPELLINGORACLE_H
#define TONVEX_TESTS_SPELLINGORACLE_H

#include <tonvex/Note.h>

#include <optional>
#include <vector>

namespace oracle {

struct Letter {
  char name;  // English letter
  int pitch;  // key number of the plain letter
  int fifths; // position on the circle of fifths: C 0, G 1, ... B 5, F -1
};

inline constexpr Letter Letters[7] = {{'C', 0, 0}, {'D', 2, 2}, {'E', 4, 4}, {'F', 5, -1},
                                      {'G', 7, 1}, {'A', 9, 3}, {'B', 11, 5}};

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

/// English name from first principles: letter plus accidentals ("Bbb", "Cx").
inline std::string EnglishName(int k, int e) {
  auto l = LetterFor(k, e);
  std::string name(1, l->name);
  if (e == 0) name += "bb";
  if (e == 1) name += "b";
  if (e == 3) name += "#";
  if (e == 4) name += "x";
  return name;
}

/// Signed key-signature count of the key on a root spelled (k, e): the letter's
/// place on the circle of fifths plus seven per accidental, counted from C for
/// major-like chords, from A for minor (2) and from E for diminished (4).
inline int SignCount(int k, int e, int basicChord) {
  auto l = LetterFor(k, e);
  int offset = basicChord == 2 ? 3 : (basicChord == 4 ? 4 : 0);
  return l->fifths + 7 * (e - 2) - offset;
}

} // namespace oracle

#endif
