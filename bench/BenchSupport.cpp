#include "BenchSupport.h"

#include "support/Voicings.h"

std::vector<CMySet<int>> const& Voicings() {
  static std::vector<CMySet<int>> const voicings = MakeVoicings();
  return voicings;
}

std::vector<CChord> const& AnalysedChords() {
  static std::vector<CChord> const chords = [] {
    std::vector<CChord> result;
    for (CMySet<int> const& voicing : Voicings()) {
      CChord chord(24);
      chord.SetFromNoteNrSet(voicing);
      chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
      result.push_back(chord);
    }
    return result;
  }();
  return chords;
}
