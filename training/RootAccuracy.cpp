// Root finding by rules and by the built-in net, measured on chord voicings.
#include "training/RootAccuracy.h"

#include "pitch/NoteNrs.h"

int FoundRootKeyNr(std::vector<int> const& noteNrs, TSingleChordAnalysisAlgo algo) {
  CChord chord;
  chord.SetFromNoteNrSet(CMySet<int>(noteNrs.begin(), noteNrs.end()));
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
  return chord.IsUndefined() ? -1 : PitchClass(chord.RootNote().NoteNr());
}

int LabelledRootKeyNr(TChordVoicing const& voicing) {
  if (voicing.noteNrs.empty() || voicing.label < 0) return -1;
  return PitchClass(voicing.noteNrs.front() + voicing.label);
}

TRootAccuracy MeasureRootAccuracy(std::vector<TChordVoicing> const& voicings, TRootFinder find) {
  TRootAccuracy accuracy;
  for (std::size_t i = 0; i < voicings.size(); ++i) {
    TChordVoicing const& voicing = voicings[i];
    const int labelled = LabelledRootKeyNr(voicing);
    const bool rulesRight = labelled >= 0 && find(voicing.noteNrs, SCA_RULE_WEIGHTS) == labelled;
    const bool netRight = labelled >= 0 && find(voicing.noteNrs, SCA_NEURONAL_NET) == labelled;
    ++accuracy.voicings;
    accuracy.rules.named += rulesRight;
    accuracy.net.named += netRight;
    if (!voicing.unambiguous) continue;
    ++accuracy.unambiguousVoicings;
    accuracy.rules.unambiguousNamed += rulesRight;
    accuracy.net.unambiguousNamed += netRight;
    if (netRight && !rulesRight) accuracy.onlyNetRight.push_back(i);
    if (rulesRight && !netRight) accuracy.onlyRulesRight.push_back(i);
  }
  return accuracy;
}
