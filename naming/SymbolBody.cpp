// The lead-sheet vocabulary and the choice of a symbol body for a set of intervals.
#include "naming/SymbolBody.h"

#include "ChordSymbol.h"
#include "pitch/NoteNrs.h"

#include <bitset>
#include <utility>

namespace {

constexpr CSymbolTone Root{0, 1, Role_Root};
constexpr CSymbolTone Maj3{4, 3, Role_Third}, Min3{3, 3, Role_Third};
constexpr CSymbolTone Sus4{5, 4, Role_Third}, Sus2{2, 2, Role_Third};
constexpr CSymbolTone P5{7, 5, Role_Fifth}, Dim5{6, 5, Role_Fifth}, Aug5{8, 5, Role_Fifth};
constexpr CSymbolTone Six{9, 6, Role_Sixth};
constexpr CSymbolTone Min7{10, 7, Role_Seventh}, Maj7{11, 7, Role_Seventh}, Dim7{9, 7, Role_Seventh};
constexpr CSymbolTone Nine{2, 9, Role_Ninth}, Eleven{5, 11, Role_Eleventh}, Thirteen{9, 13, Role_Thirteenth};

// The vocabulary in order of preference: of two types that describe a set with as
// few changes, the earlier is written.
constexpr CSymbolType Types[] = {
    {"", nullptr, 0, {Root, Maj3, P5}},
    {"m", nullptr, 0, {Root, Min3, P5}},
    {"7", nullptr, 0, {Root, Maj3, P5, Min7}},
    {"maj7",
     "\xCE\x94"
     "7",
     Sym_Triangle,
     {Root, Maj3, P5, Maj7}},
    {"m7", nullptr, 0, {Root, Min3, P5, Min7}},
    {"6", nullptr, 0, {Root, Maj3, P5, Six}},
    {"m6", nullptr, 0, {Root, Min3, P5, Six}},
    {"m(maj7)",
     "m\xCE\x94"
     "7",
     Sym_Triangle,
     {Root, Min3, P5, Maj7}},
    {"dim", "o", Sym_DimSign, {Root, Min3, Dim5}},
    {"dim7", "o7", Sym_DimSign, {Root, Min3, Dim5, Dim7}},
    {"m7b5",
     "\xC3\xB8"
     "7",
     Sym_HalfDimSign,
     {Root, Min3, Dim5, Min7}},
    {"aug", "+", Sym_PlusSign, {Root, Maj3, Aug5}},
    {"sus4", nullptr, 0, {Root, Sus4, P5}},
    {"sus2", nullptr, 0, {Root, Sus2, P5}},
    {"7sus4", nullptr, 0, {Root, Sus4, P5, Min7}},
    {"5", nullptr, 0, {Root, P5}},
    {"9", nullptr, 0, {Root, Maj3, P5, Min7, Nine}},
    {"maj9",
     "\xCE\x94"
     "9",
     Sym_Triangle,
     {Root, Maj3, P5, Maj7, Nine}},
    {"m9", nullptr, 0, {Root, Min3, P5, Min7, Nine}},
    {"6/9", nullptr, 0, {Root, Maj3, P5, Six, Nine}},
    {"m6/9", nullptr, 0, {Root, Min3, P5, Six, Nine}},
    {"m(maj9)",
     "m\xCE\x94"
     "9",
     Sym_Triangle,
     {Root, Min3, P5, Maj7, Nine}},
    {"11", nullptr, 0, {Root, Maj3, P5, Min7, Nine, Eleven}},
    {"m11", nullptr, 0, {Root, Min3, P5, Min7, Nine, Eleven}},
    {"13", nullptr, 0, {Root, Maj3, P5, Min7, Nine, Thirteen}},
    {"maj13",
     "\xCE\x94"
     "13",
     Sym_Triangle,
     {Root, Maj3, P5, Maj7, Nine, Thirteen}},
    {"m13", nullptr, 0, {Root, Min3, P5, Min7, Nine, Thirteen}},
    {"9sus4", nullptr, 0, {Root, Sus4, P5, Min7, Nine}},
    {"13sus4", nullptr, 0, {Root, Sus4, P5, Min7, Nine, Thirteen}},
    {"7sus2", nullptr, 0, {Root, Sus2, P5, Min7}},
    {"maj7sus4",
     "\xCE\x94"
     "7sus4",
     Sym_Triangle,
     {Root, Sus4, P5, Maj7}},
    {"maj7sus2",
     "\xCE\x94"
     "7sus2",
     Sym_Triangle,
     {Root, Sus2, P5, Maj7}},
};

// The dominant seventh with both altered fifths and ninths, written "7alt" only
// under Sym_Alt and only for exactly these tones.
constexpr CSymbolType AltType = {
    "7alt",
    nullptr,
    0,
    {Root, Maj3, {6, 5, Role_Fifth}, {8, 5, Role_Fifth}, Min7, {1, 9, Role_Ninth}, {3, 9, Role_Ninth}}};

constexpr unsigned Bit(int intvl) { return 1u << intvl; }

unsigned MaskOf(CSymbolType const& type) {
  unsigned mask = 0;
  for (CSymbolTone const& tone : type.Tones)
    if (tone.Degree != 0) mask |= Bit(tone.Intvl);
  return mask;
}

bool HasRole(CSymbolType const& type, int role) {
  for (CSymbolTone const& tone : type.Tones)
    if (tone.Degree != 0 && tone.Role == role) return true;
  return false;
}

// Whether the symbol may leave the type's tone out: the root, a third (not the tone
// of a suspension) and the fifth of a chord with a third ("C5" keeps its fifth).
bool MayOmit(CSymbolType const& type, CSymbolTone tone) {
  return tone.Role == Role_Root || (tone.Role == Role_Third && tone.Degree == 3) ||
         (tone.Role == Role_Fifth && HasRole(type, Role_Third));
}

// The altered tones that may stand for the natural tone of a role: b5 and #5 for the
// perfect fifth of a chord with a third, b9 and #9, #11, b13.
int Alterations(CSymbolType const& type, CSymbolTone tone, CSymbolTone out[2]) {
  if (tone == P5 && HasRole(type, Role_Third)) {
    out[0] = {6, 5, Role_Fifth};
    out[1] = {8, 5, Role_Fifth};
    return 2;
  }
  if (tone == Nine) {
    out[0] = {1, 9, Role_Ninth};
    out[1] = {3, 9, Role_Ninth};
    return 2;
  }
  if (tone == Eleven) {
    out[0] = {6, 11, Role_Eleventh};
    return 1;
  }
  if (tone == Thirteen) {
    out[0] = {8, 13, Role_Thirteenth};
    return 1;
  }
  return 0;
}

// The degree of an interval that the type does not hold: the tensions of a seventh
// chord (b9, #9 beside a major third, #11, b13, 13), the sixths of a chord without
// a seventh, and the chord tones (3, b3, 5, b7, 7).
CSymbolTone ExtraTone(CSymbolType const& type, int intvl) {
  bool const seventh = HasRole(type, Role_Seventh);
  switch (intvl) {
  case 1: return {1, 9, Role_Ninth};
  case 2: return {2, 9, Role_Added};
  case 3: return MaskOf(type) & Bit(4) ? CSymbolTone{3, 9, Role_Ninth} : CSymbolTone{3, 3, Role_Added};
  case 4: return {4, 3, Role_Added};
  case 5: return {5, 11, Role_Added};
  case 6: return {6, 11, Role_Eleventh};
  case 7: return {7, 5, Role_Added};
  case 8: return seventh ? CSymbolTone{8, 13, Role_Thirteenth} : CSymbolTone{8, 6, Role_Added};
  case 9: return {9, seventh ? 13 : 6, Role_Added};
  case 10: return {10, 7, Role_Added};
  case 11: return {11, 7, Role_Added};
  default: return {intvl, 1, Role_Added};
  }
}

// The body of the set on the type; false when the type cannot describe it (a tone
// it needs, such as its seventh, is missing and may not be omitted).
bool BodyOnType(CSymbolType const& type, unsigned intvls, CSymbolBody& body) {
  body = CSymbolBody();
  body.Type = &type;
  unsigned covered = 0;
  auto take = [&](CSymbolTone tone) {
    body.Tones[body.ToneCount++] = tone;
    covered |= Bit(tone.Intvl);
  };
  for (CSymbolTone const& tone : type.Tones) {
    if (tone.Degree == 0) break;
    if (intvls & Bit(tone.Intvl)) {
      take(tone);
      continue;
    }
    CSymbolTone altered[2];
    int const count = Alterations(type, tone, altered);
    bool replaced = false;
    for (int i = 0; i < count; ++i)
      if ((intvls & ~covered) & Bit(altered[i].Intvl)) {
        body.Altered[body.AlteredCount++] = altered[i];
        take(altered[i]);
        replaced = true;
      }
    if (replaced) continue;
    if (!MayOmit(type, tone)) return false;
    body.Omitted |= 1u << tone.Role;
  }
  for (int intvl = 1; intvl < 12; ++intvl)
    if ((intvls & ~covered) & Bit(intvl)) {
      body.Extra[body.ExtraCount++] = ExtraTone(type, intvl);
      body.Tones[body.ToneCount++] = body.Extra[body.ExtraCount - 1];
    }
  // Extras in the order of their degrees: "add9add11", "b9#11".
  for (int i = 1; i < body.ExtraCount; ++i)
    for (int j = i; j > 0 && body.Extra[j].Degree < body.Extra[j - 1].Degree; --j)
      std::swap(body.Extra[j], body.Extra[j - 1]);
  return true;
}

// The number of written changes. An added major third counts three: a chord with
// both thirds is read as a major chord with a #9 (C7#9, not Cm7add3).
int Cost(CSymbolBody const& body) {
  int cost = body.AlteredCount + static_cast<int>(std::bitset<16>(body.Omitted).count());
  for (int i = 0; i < body.ExtraCount; ++i) cost += body.Extra[i].Intvl == 4 ? 3 : 1;
  return cost;
}

} // namespace

bool CSymbolBody::HasSeventh() const { return HasRole(*Type, Role_Seventh); }

bool CSymbolBody::TypeHasRole(int role) const { return HasRole(*Type, role); }

bool CSymbolBody::IsExtra(int intvl) const {
  for (int i = 0; i < ExtraCount; ++i)
    if (Extra[i].Intvl == intvl) return true;
  return false;
}

CSymbolTone CSymbolBody::ToneOf(int intvl) const {
  for (int i = 0; i < ToneCount; ++i)
    if (Tones[i].Intvl == intvl) return Tones[i];
  return {intvl, 1, Role_Added};
}

CSymbolChord SymbolChordOf(CChord const& chord) {
  CSymbolChord symbol;
  CNote const root = chord.RootNote();
  if (root.NoteNr() == 255 || chord.NoteCount() == 0) return symbol;
  symbol.Defined = true;
  symbol.Root = SpellNote(root);
  int const rootPc = SpelledPitchClass(symbol.Root);
  for (CNote const& note : chord.Notes()) symbol.Intvls |= Bit(PitchClass(note.NoteNr() - rootPc));
  CNote const bass = chord.LowestNote();
  symbol.Bass = SpellNote(bass);
  symbol.BassIntvl = PitchClass(bass.NoteNr() - rootPc);
  return symbol;
}

CSymbolBody FindSymbolBody(unsigned intvls, int style) {
  CSymbolBody best, candidate;
  if ((style & Sym_Alt) != 0 && intvls == MaskOf(AltType)) {
    BodyOnType(AltType, intvls, best);
    return best;
  }
  int bestCost = -1;
  for (CSymbolType const& type : Types)
    if (BodyOnType(type, intvls, candidate) && (bestCost < 0 || Cost(candidate) < bestCost)) {
      best = candidate;
      bestCost = Cost(candidate);
    }
  return best;
}
