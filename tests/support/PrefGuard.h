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
std::tuple<T...> Copied(std::tuple<T&...> const& refs) {
  return refs;
}

class PrefGuard {
public:
  ~PrefGuard() { NamingPrefRefs() = saved_; }

private:
  decltype(Copied(NamingPrefRefs())) saved_ = Copied(NamingPrefRefs());
};

#endif
