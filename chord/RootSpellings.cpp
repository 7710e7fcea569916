#include "chord/RootSpellings.h"

#include "chord/ChordScale.h"
#include "pitch/KeySignCount.h"

#include <cstdlib>

CNote LeastSignsRoot(CNote const& root, CChord::TBasicChord bcAsIs, CChord::TBasicChord bcOthers) {
  CNote counted = root; // the count may respell the note it is given
  int const signsAsIs = std::abs(KeySignCount(counted, bcAsIs));
  CNote flatter = root;
  flatter.EnhShiftToFlats();
  CNote sharper = root;
  sharper.EnhShiftToSharps();
  int const signsFlatter = std::abs(KeySignCount(flatter, bcOthers));
  int const signsSharper = std::abs(KeySignCount(sharper, bcOthers));
  if (signsAsIs <= signsFlatter && signsAsIs <= signsSharper) return root;
  if (signsAsIs > signsFlatter && signsFlatter <= signsSharper) return flatter;
  return sharper;
}

CRootSpellings::CRootSpellings() {
  for (int b = CChord::bc_none; b <= CChord::bc_drone; ++b) {
    auto const bc = static_cast<CChord::TBasicChord>(b);
    for (int pc = 0; pc < 12; ++pc) {
      Roots_[b][pc] = LeastSignsRoot(CNote(pc, Enh_Natural), bc, bc);
      for (bool minorSecond : {false, true}) {
        CScale const scale = ChordScale(Roots_[b][pc], bc, minorSecond);
        // Spellings stay within a few accidentals of natural.
        for (int k = 0; k < 12; ++k) {
          TEnh const unchecked = scale.EnhForKeynr(k);
          NoteEnhs_[b][minorSecond ? 1 : 0][pc][k] = {static_cast<signed char>(unchecked),
                                                      static_cast<signed char>(CNote(k, unchecked).Enh())};
        }
      }
    }
  }
}
