// Chords: calls of every member, so that a host's build instantiates and links all
// of them. They have no behaviour of their own.
#include "Chord.h"

void CChord::UseAllNonDestructiveMemberFunctions() const {
  IsUndefined();
  RootNote();
  RootNoteSpecified();
  HasNote(RootNote_);
  HasNoteNr(60);
  Note(0);
  Notes();
  NoteCount();
  LowestNote();
  HighestNote();
  CountNotesInOctave(4);
  IsNarrowChord();
  IsExactlyTheSame(*this);
  LowestNoteLonely();
  UpdateIntvlSet();
  IntvlSet();
  Intvl(0);
  HasIntvl(0);
  HasIntvlInAnyOctave(0);
  HasOtherStackedThirdsOptionThan(0);
  IntvlIxToNote(0);
  IntvlIxToKeyNr(0);
  IntvlIxToKeyName(0);
  KeyNrSet();
  HasKeyNr(0);
  HasKeyNrs(0, 4, 7, -1);
  HasExactTheseKeyNrs(0, 4, 7, -1);
  BasicChord();
  IntvlsInBasicChord();
  ScaleType();
  Scale();
  XGChordIx();
  SignsCount();
  Trace();
  static_cast<void>(*this == *this);
  static_cast<void>(*this != *this);
}

void CChord::UseAllMemberFunctions() {
  // Everything runs on copies: this chord, its interval cache and flags included,
  // stays as it is.
  CChord const original(*this);
  original.UseAllNonDestructiveMemberFunctions();

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
}
