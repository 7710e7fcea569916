// Degrees and note spellings of chord symbols, shared by the writers and the reader
// (internal).
#ifndef TONVEX_NAMING_SYMBOLDEGREES_H
#define TONVEX_NAMING_SYMBOLDEGREES_H

#include "Note.h"

#include <cstddef>
#include <string>
#include <string_view>

/// The role of a tone in a symbol: omissions ("no3") and alterations ("b9") act on
/// the tones of a role.
enum TSymbolRole : int {
  Role_Root,
  Role_Third, ///< the third, or the 4th or 2nd of a suspended chord
  Role_Fifth,
  Role_Sixth,
  Role_Seventh,
  Role_Ninth,
  Role_Eleventh,
  Role_Thirteenth,
  Role_Added ///< an addition ("add9") or a degree of a Harte list
};

/// A tone of a symbol: its interval above the root (0..11), the degree that names it
/// (1..13; the letter is the root's plus degree - 1) and its role.
struct CSymbolTone {
  int Intvl;
  int Degree;
  int Role;
};

inline bool operator==(CSymbolTone a, CSymbolTone b) {
  return a.Intvl == b.Intvl && a.Degree == b.Degree && a.Role == b.Role;
}

// The tones of the vocabulary's chord types.
constexpr CSymbolTone ToneRoot{0, 1, Role_Root};
constexpr CSymbolTone ToneMaj3{4, 3, Role_Third}, ToneMin3{3, 3, Role_Third};
constexpr CSymbolTone ToneSus4{5, 4, Role_Third}, ToneSus2{2, 2, Role_Third};
constexpr CSymbolTone ToneP5{7, 5, Role_Fifth}, ToneDim5{6, 5, Role_Fifth}, ToneAug5{8, 5, Role_Fifth};
constexpr CSymbolTone ToneSix{9, 6, Role_Sixth};
constexpr CSymbolTone ToneMin7{10, 7, Role_Seventh}, ToneMaj7{11, 7, Role_Seventh}, ToneDim7{9, 7, Role_Seventh};
constexpr CSymbolTone ToneNine{2, 9, Role_Ninth}, ToneEleven{5, 11, Role_Eleventh};
constexpr CSymbolTone ToneThirteen{9, 13, Role_Thirteenth};

/// An alteration of a degree: the altered tone replaces the natural one.
struct CSymbolAlteration {
  CSymbolTone Natural;
  CSymbolTone Altered;
};

/// The six alterations: b5, #5, b9, #9, #11, b13 ("alt" is the first four).
constexpr CSymbolAlteration SymbolAlterations[6] = {
    {ToneP5, {6, 5, Role_Fifth}},   {ToneP5, {8, 5, Role_Fifth}},         {ToneNine, {1, 9, Role_Ninth}},
    {ToneNine, {3, 9, Role_Ninth}}, {ToneEleven, {6, 11, Role_Eleventh}}, {ToneThirteen, {8, 13, Role_Thirteenth}}};

/// Semitones of the natural degree 1..13 above the root, folded into 0..11.
int DegreeIntvl(int degree);
/// The accidentals of a degree that names an interval: intvl - DegreeIntvl(degree),
/// taken into -6..5 (-1 for b9, 1 for #11, -2 for bb7).
int DegreeAccidentals(int intvl, int degree);

/// A spelled pitch: a letter 0..6 (C D E F G A B) and accidentals -2..2.
struct CSpelledPitch {
  int Letter;
  int Accidentals;
};

/// The pitch class 0..11 of a spelled pitch.
int SpelledPitchClass(CSpelledPitch pitch);
/// The spelling of a note's pitch class after its TEnh; a spelling that does not fit
/// the pitch class (left unchecked, or on a note number outside 0..127) gives the
/// usual one (C#, Eb, F#, Ab, Bb and the naturals).
CSpelledPitch SpellNote(CNote const& note);
/// The spelling of the interval above the root as the degree names it; the usual
/// spelling where that would need more than two accidentals.
CSpelledPitch SpellDegree(CSpelledPitch root, int intvl, int degree);
/// The TEnh of a spelled pitch.
TEnh EnhOf(CSpelledPitch pitch);

/// A symbol under construction in a fixed buffer: built without allocating, copied
/// into the returned string once. Text beyond the capacity, which no symbol needs,
/// is dropped.
class CSymbolText {
public:
  void Add(std::string_view text);
  void Add(char c) { Add(std::string_view(&c, 1)); }
  /// Accidentals as "#"/"b" (doubled), or with unicode as the signs ♯ ♭ 𝄪 𝄫.
  void AddAccidentals(int accidentals, bool unicode);
  void AddPitch(CSpelledPitch pitch, bool unicode);
  /// A degree with its accidentals: "b9", "#11", "bb7", "5".
  void AddDegree(CSymbolTone tone, bool unicode);
  std::string Str() const { return std::string(Buf_, Length_); }

private:
  static constexpr std::size_t Capacity = 192;
  char Buf_[Capacity];
  std::size_t Length_ = 0;
};

#endif
