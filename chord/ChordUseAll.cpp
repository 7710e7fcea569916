// Chords: calls of every member, so that a host's build instantiates and links all
// of them. They have no behaviour of their own: both work on copies, since even
// const members may respell mutable parts (SignsCount, NameWithSlash).
#include "Chord.h"
#include "SignKey.h"

namespace {

// The const members, called on a copy of the chord.
void CallConstMembers(CChord const& chord) {
  CSignKey const key(CNote(0, Enh_Natural), CSignKey::SignKey_Major);
  CNote const root = chord.RootNote();
  chord.IsUndefined();
  chord.RootNote();
  chord.RootNoteSpecified();
  chord.HasNote(root);
  chord.HasNoteNr(60);
  chord.Note(0);
  chord.Notes();
  chord.NoteCount();
  chord.LowestNote();
  chord.HighestNote();
  chord.CountNotesInOctave(4);
  chord.IsNarrowChord();
  chord.IsExactlyTheSame(chord);
  chord.LowestNoteLonely();
  chord.UpdateIntvlSet();
  chord.IntvlSet();
  chord.Intvl(0);
  chord.HasIntvl(0);
  chord.HasIntvlInAnyOctave(0);
  chord.HasOtherStackedThirdsOptionThan(0);
  chord.IntvlIxToNote(0);
  chord.IntvlIxToKeyNr(0);
  chord.IntvlIxToKeyName(0);
  chord.KeyNrSet();
  chord.HasKeyNr(0);
  chord.HasKeyNrs(0, 4, 7, -1);
  chord.HasExactTheseKeyNrs(0, 4, 7, -1);
  chord.BasicChord();
  chord.IntvlsInBasicChord();
  chord.ScaleType();
  chord.Scale();
  chord.XGChordIx();
  chord.SignsCount();
  chord.Trace();
  static_cast<void>(chord == chord);
  static_cast<void>(chord != chord);
  chord.ProbThatNoteIsRootNote(root);
  chord.LowestNoteIntvl();
  chord.HarmFuncIn(key);
  chord.ClosenessToSignKey(key);
  chord.CountIntvlsInSignKey(key);
  chord.CountIntvlsNotInSignKey(key);
  chord.CountNotesNotInSignKey(key);
  chord.IsInSignKey(key);
  chord.OptionsMap(DefaultChordnamePref);
  chord.OptionsStringVector(DefaultChordnamePref);
  chord.OptionsName(DefaultChordnamePref);
  chord.BasicChordNameAfterOptionsName();
  chord.BasicChordAndOptionsName(DefaultChordnamePref);
  chord.NameWithoutSlash(DefaultChordnamePref);
  chord.NameWithSlash(DefaultChordnamePref);
  chord.Name(DefaultChordnamePref);
  chord.NameWithLeastSignsForThisRootNote(root, DefaultChordnamePref);
  chord.NameForThisRootNote(root, DefaultChordnamePref);
  chord.HarmFuncName(key, DefaultChordnamePref);
}

} // namespace

void CChord::UseAllNonDestructiveMemberFunctions() const { CallConstMembers(CChord(*this)); }

void CChord::UseAllMemberFunctions() {
  // Everything runs on copies: this chord, its interval cache and flags included,
  // stays as it is.
  UseAllNonDestructiveMemberFunctions();

  CChord chord(*this);
  CChord fromNotes(RootNote_, Notes_, Intvls_.WrapIntvl());
  CChord fromBasicChord(RootNote_, bc_maj, Intvls_.WrapIntvl());
  chord.Init();
  chord.Clear();
  chord.SetUndefined();
  chord.SetRootNote(RootNote_);
  chord.SetRootNoteWithoutSpecify(RootNote_);
  chord.AddNote(CNote(60, Enh_Natural));
  chord.DelNote(CNote(60, Enh_Natural));
  chord.DelNote(0UL);
  chord.DeleteAllNotesInOctave(4);
  chord.SetLowestNote(CNote(60, Enh_Natural));
  chord.SetLowestNoteInOctave(0, 4, Enh_Natural);
  chord.SetLowestNoteAloneInOctave(0, 4, Enh_Natural);
  chord.SetFromNoteSet(Notes_);
  chord.SetFromNoteNrSet(CMySet<int>{60, 64, 67});
  chord.SetFromKeyNrSet(CMySet<int>{0, 4, 7});
  chord.Transpose(1);
  chord.Invert();
  chord.SetRootNoteInCompingRange(RootNote_);
  chord.SetRootKeyNr(0);
  chord.SetRootKeyNrAndBasicChord(0, bc_maj);
  chord.AddIntvlInCompingRange(7);
  chord.ChangeAllNotesWithinIntvlRange(3, 3, 4);
  chord.SetBasicChord(bc_min);
  chord.SetRootNoteToIntvlIx(0);
  chord.SetRootNoteEnhWithLeastSigns();
  chord.AdjustEnhOfChordNotesToRootScale(nullptr);
  chord.SetWrapIntvlToNeuronalNetInputCount();
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_RULE_WEIGHTS);
  chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(SCA_NEURONAL_NET);
}
