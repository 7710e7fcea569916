// The lead-sheet vocabulary and the choice of a symbol body for a set of intervals.
#include "naming/SymbolBody.h"

#include "ChordSymbol.h"
#include "pitch/NoteNrs.h"

#include <bitset>
#include <utility>

namespace {

// The vocabulary in order of preference: of two types that describe a set with as
// few changes, the earlier is written.
constexpr CSymbolType Types[] = {
    {"", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5}},
    {"m", nullptr, 0, {ToneRoot, ToneMin3, ToneP5}},
    {"7", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5, ToneMin7}},
    {"maj7",
     "\xCE\x94"
     "7",
     Sym_Triangle,
     {ToneRoot, ToneMaj3, ToneP5, ToneMaj7}},
    {"m7", nullptr, 0, {ToneRoot, ToneMin3, ToneP5, ToneMin7}},
    {"6", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5, ToneSix}},
    {"m6", nullptr, 0, {ToneRoot, ToneMin3, ToneP5, ToneSix}},
    {"m(maj7)",
     "m\xCE\x94"
     "7",
     Sym_Triangle,
     {ToneRoot, ToneMin3, ToneP5, ToneMaj7}},
    {"dim", "o", Sym_DimSign, {ToneRoot, ToneMin3, ToneDim5}},
    {"dim7", "o7", Sym_DimSign, {ToneRoot, ToneMin3, ToneDim5, ToneDim7}},
    {"m7b5",
     "\xC3\xB8"
     "7",
     Sym_HalfDimSign,
     {ToneRoot, ToneMin3, ToneDim5, ToneMin7}},
    {"aug", "+", Sym_PlusSign, {ToneRoot, ToneMaj3, ToneAug5}},
    {"sus4", nullptr, 0, {ToneRoot, ToneSus4, ToneP5}},
    {"sus2", nullptr, 0, {ToneRoot, ToneSus2, ToneP5}},
    {"7sus4", nullptr, 0, {ToneRoot, ToneSus4, ToneP5, ToneMin7}},
    {"5", nullptr, 0, {ToneRoot, ToneP5}},
    {"9", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5, ToneMin7, ToneNine}},
    {"maj9",
     "\xCE\x94"
     "9",
     Sym_Triangle,
     {ToneRoot, ToneMaj3, ToneP5, ToneMaj7, ToneNine}},
    {"m9", nullptr, 0, {ToneRoot, ToneMin3, ToneP5, ToneMin7, ToneNine}},
    {"6/9", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5, ToneSix, ToneNine}},
    {"m6/9", nullptr, 0, {ToneRoot, ToneMin3, ToneP5, ToneSix, ToneNine}},
    {"m(maj9)",
     "m\xCE\x94"
     "9",
     Sym_Triangle,
     {ToneRoot, ToneMin3, ToneP5, ToneMaj7, ToneNine}},
    {"11", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5, ToneMin7, ToneNine, ToneEleven}},
    {"m11", nullptr, 0, {ToneRoot, ToneMin3, ToneP5, ToneMin7, ToneNine, ToneEleven}},
    {"13", nullptr, 0, {ToneRoot, ToneMaj3, ToneP5, ToneMin7, ToneNine, ToneThirteen}},
    {"maj13",
     "\xCE\x94"
     "13",
     Sym_Triangle,
     {ToneRoot, ToneMaj3, ToneP5, ToneMaj7, ToneNine, ToneThirteen}},
    {"m13", nullptr, 0, {ToneRoot, ToneMin3, ToneP5, ToneMin7, ToneNine, ToneThirteen}},
    {"9sus4", nullptr, 0, {ToneRoot, ToneSus4, ToneP5, ToneMin7, ToneNine}},
    {"13sus4", nullptr, 0, {ToneRoot, ToneSus4, ToneP5, ToneMin7, ToneNine, ToneThirteen}},
    {"7sus2", nullptr, 0, {ToneRoot, ToneSus2, ToneP5, ToneMin7}},
    {"maj7sus4",
     "\xCE\x94"
     "7sus4",
     Sym_Triangle,
     {ToneRoot, ToneSus4, ToneP5, ToneMaj7}},
    {"maj7sus2",
     "\xCE\x94"
     "7sus2",
     Sym_Triangle,
     {ToneRoot, ToneSus2, ToneP5, ToneMaj7}},
};

// The dominant seventh with both altered fifths and ninths, written "7alt" only
// under Sym_Alt and only for exactly these tones.
constexpr CSymbolType AltType = {"7alt",
                                 nullptr,
                                 0,
                                 {ToneRoot, ToneMaj3, SymbolAlterations[0].Altered, SymbolAlterations[1].Altered,
                                  ToneMin7, SymbolAlterations[2].Altered, SymbolAlterations[3].Altered}};

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
  int count = 0;
  if (tone == ToneP5 && !HasRole(type, Role_Third)) return 0;
  for (CSymbolAlteration const& alteration : SymbolAlterations)
    if (alteration.Natural == tone) out[count++] = alteration.Altered;
  return count;
}

// The degree of an interval that the type does not hold: the tensions of a seventh
// chord (b9, #9 beside a major third, #11, b13, 13), the sixths of a chord without
// a seventh, and the chord tones (3, b3, 5, b7, 7).
CSymbolTone ExtraTone(CSymbolType const& type, int intvl) {
  bool const seventh = HasRole(type, Role_Seventh);
  switch (intvl) {
  case 1: return SymbolAlterations[2].Altered; // b9
  case 2: return {2, 9, Role_Added};
  case 3: return MaskOf(type) & Bit(4) ? SymbolAlterations[3].Altered : CSymbolTone{3, 3, Role_Added}; // #9
  case 4: return {4, 3, Role_Added};
  case 5: return {5, 11, Role_Added};
  case 6: return SymbolAlterations[4].Altered; // #11
  case 7: return {7, 5, Role_Added};
  case 8: return seventh ? SymbolAlterations[5].Altered : CSymbolTone{8, 6, Role_Added}; // b13
  case 9: return {9, seventh ? 13 : 6, Role_Added};
  case 10: return {10, 7, Role_Added};
  case 11: return {11, 7, Role_Added};
  default: return {intvl, 1, Role_Added};
  }
}

// The body of the set on the type; false when the type cannot describe it (a tone
// it needs, such as its seventh, is missing and may not be omitted).
bool BodyOnType(CSymbolType const& type, unsigned intvls, CSymbolBody& body) {
  // Only the counts are reset: the tone arrays are read up to them, and clearing
  // them for each of the types tried would cost more than the rest.
  body.Type = &type;
  body.AlteredCount = body.ExtraCount = body.ToneCount = 0;
  body.Omitted = 0;
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

// The written changes: an alteration or omission counts 2, an addition 3 (Cm9b5
// rather than Cm7b5add9), an added major third 9 (a chord with both thirds is a
// major chord with a #9: C7#9, not Cm7add3).
int Cost(CSymbolBody const& body) {
  int cost = 2 * (body.AlteredCount + static_cast<int>(std::bitset<16>(body.Omitted).count()));
  for (int i = 0; i < body.ExtraCount; ++i)
    cost += body.Extra[i].Intvl == 4 ? 9 : body.WritesAsAlteration(body.Extra[i]) ? 2 : 3;
  return cost;
}

} // namespace

bool CSymbolBody::WritesAsAlteration(CSymbolTone extra) const {
  return HasRole(*Type, Role_Seventh) && extra.Role != Role_Added && !HasRole(*Type, extra.Role);
}

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
