// Restores every naming preference when a test ends, so that tests that change the
// process-wide statics cannot leak them into other tests.
#ifndef TONVEX_TESTS_PREFGUARD_H
#define TONVEX_TESTS_PREFGUARD_H

#include "support/TestPrelude.h"

#include <array>

class PrefGuard {
public:
  PrefGuard() {
    for (std::size_t i = 0; i < Members.size(); ++i) saved_[i] = *Members[i];
  }
  ~PrefGuard() {
    for (std::size_t i = 0; i < Members.size(); ++i) *Members[i] = saved_[i];
  }
  PrefGuard(PrefGuard const&) = delete;
  PrefGuard& operator=(PrefGuard const&) = delete;

  /// Sets the four note-naming flags at once.
  static void NoteNaming(int roman, int german, int bbIsB, int bIsH) {
    CChordnamePref::RomanNames = roman;
    CChordnamePref::AccidentalsAsLetters = german;
    CChordnamePref::Bb_is_B = bbIsB;
    CChordnamePref::B_is_H = bIsH;
  }

  static constexpr std::array<int*, 17> Members = {&CChordnamePref::NoteNr_60_is,
                                                   &CChordnamePref::HarmFuncNaming,
                                                   &CChordnamePref::ChordOptionSep,
                                                   &CChordnamePref::PreferSlashChordIfMoreNotesThan,
                                                   &CChordnamePref::SeparateBlocksInNames,
                                                   &CChordnamePref::PreferSlashChord,
                                                   &CChordnamePref::InversionAsName,
                                                   &CChordnamePref::ShowInversion,
                                                   &CChordnamePref::NoDoubleSigns,
                                                   &CChordnamePref::NarrowChordsWithoutSlash,
                                                   &CChordnamePref::OmitOptionOfLonelyLowestNoteInWideChord,
                                                   &CChordnamePref::Maj7ShownAs,
                                                   &CChordnamePref::MinorSmall,
                                                   &CChordnamePref::RomanNames,
                                                   &CChordnamePref::AccidentalsAsLetters,
                                                   &CChordnamePref::Bb_is_B,
                                                   &CChordnamePref::B_is_H};

private:
  std::array<int, 17> saved_{};
};

#endif
