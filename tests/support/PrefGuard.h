// Restores every naming preference when a test ends, so that tests that change the
// process-wide statics cannot leak them into other tests.
#ifndef TONVEX_TESTS_PREFGUARD_H
#define TONVEX_TESTS_PREFGUARD_H

#include "support/TestPrelude.h"

/// Every naming preference.
inline auto NamingPrefRefs() {
  using P = CChordnamePref;
  return std::tie(P::NoteNr_60_is, P::HarmFuncNaming, P::ChordOptionSep, P::PreferSlashChordIfMoreNotesThan,
                  P::SeparateBlocksInNames, P::PreferSlashChord, P::InversionAsName, P::ShowInversion, P::NoDoubleSigns,
                  P::NarrowChordsWithoutSlash, P::OmitOptionOfLonelyLowestNoteInWideChord, P::Maj7ShownAs,
                  P::MinorSmall, P::RomanNames, P::AccidentalsAsLetters, P::Bb_is_B, P::B_is_H);
}

template <class... T>
std::tuple<std::remove_reference_t<T>...> Copied(std::tuple<T...> const& refs) {
  return refs;
}

class PrefGuard {
public:
  PrefGuard() = default;
  PrefGuard(PrefGuard const&) = delete;
  PrefGuard& operator=(PrefGuard const&) = delete;
  ~PrefGuard() { NamingPrefRefs() = saved_; }

  /// Sets the four note-naming flags at once.
  static void NoteNaming(int roman, int german, int bbIsB, int bIsH) {
    using P = CChordnamePref;
    std::tie(P::RomanNames, P::AccidentalsAsLetters, P::Bb_is_B, P::B_is_H) = std::tie(roman, german, bbIsB, bIsH);
  }

private:
  decltype(Copied(NamingPrefRefs())) saved_ = Copied(NamingPrefRefs());
};

#endif
