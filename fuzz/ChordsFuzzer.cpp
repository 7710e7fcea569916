// Chord analysis from arbitrary note and key number sets: every edit with any
// values, both root-finding algorithms, every naming function, the key queries and
// the XG chord type, under any preferences.
#include "FuzzInput.h"

#include <tonvex/Chord.h>
#include <tonvex/SignKey.h>

#include <sstream>

namespace {

CMySet<int> NumberSet(CFuzzInput& in) {
  CMySet<int> numbers;
  for (std::size_t k = in.Count(12); k > 0; --k) numbers.insert(in.IntMostlyIn(-12, 140));
  return numbers;
}

CMySet<CNote> NoteSet(CFuzzInput& in) {
  CMySet<CNote> notes;
  for (std::size_t k = in.Count(8); k > 0; --k) notes.insert(in.Note());
  return notes;
}

CChord NewChord(CFuzzInput& in) {
  int const wrap = in.Bool() ? 24 : in.AnyInt();
  switch (in.Pick(4)) {
  case 0: return CChord(wrap);
  case 1: return CChord(in.Note(), NoteSet(in), wrap);
  case 2: return CChord(in.Note(), static_cast<CChord::TBasicChord>(in.IntMostlyIn(-1, 8)), wrap);
  default: return CChord_Undef;
  }
}

void Edit(CChord& chord, CFuzzInput& in) {
  switch (in.Pick(26)) {
  case 0: chord.SetFromNoteNrSet(NumberSet(in)); break;
  case 1: chord.SetFromKeyNrSet(NumberSet(in)); break;
  case 2: chord.SetFromNoteSet(NoteSet(in)); break;
  case 3: chord.AddNote(in.Note()); break;
  case 4: chord.DelNote(in.Note()); break;
  case 5: chord.DelNote(static_cast<unsigned long>(in.AnyInt())); break;
  case 6: chord.DeleteAllNotesInOctave(in.AnyInt()); break;
  case 7: chord.SetRootNote(in.Note()); break;
  case 8: chord.SetRootNoteWithoutSpecify(in.Note()); break;
  case 9:
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(static_cast<TSingleChordAnalysisAlgo>(in.AnyInt()));
    break;
  case 10: chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(in.Bool() ? SCA_NEURONAL_NET : SCA_RULE_WEIGHTS); break;
  case 11: chord.Transpose(in.AnyInt()); break;
  case 12: chord.Invert(); break;
  case 13: chord.SetLowestNote(in.Note()); break;
  case 14: chord.SetLowestNoteInOctave(in.AnyInt(), in.AnyInt(), in.Enh()); break;
  case 15: chord.SetLowestNoteAloneInOctave(in.AnyInt(), in.AnyInt(), in.Enh()); break;
  case 16: chord.SetBasicChord(static_cast<CChord::TBasicChord>(in.IntMostlyIn(-1, 8))); break;
  case 17: chord.SetRootNoteInCompingRange(in.Note()); break;
  case 18: chord.SetRootKeyNr(in.AnyInt()); break;
  case 19: chord.SetRootKeyNrAndBasicChord(in.AnyInt(), static_cast<CChord::TBasicChord>(in.AnyInt())); break;
  case 20: chord.AddIntvlInCompingRange(in.AnyInt()); break;
  case 21: chord.ChangeAllNotesWithinIntvlRange(in.AnyInt(), in.AnyInt(), in.AnyInt()); break;
  case 22: chord.SetRootNoteToIntvlIx(in.AnyInt()); break;
  case 23: chord.SetRootNoteEnhWithLeastSigns(); break;
  case 24: {
    bool changed = true;
    chord.AdjustEnhOfChordNotesToRootScale(in.Bool() ? &changed : nullptr);
    break;
  }
  default:
    switch (in.Pick(4)) {
    case 0: chord.SetWrapIntvlToNeuronalNetInputCount(); break;
    case 1: chord.Init(); break;
    case 2: chord.Clear(); break;
    default: chord.SetUndefined(); break;
    }
  }
}

// Every query and name; the chord may be changed only where the queries are
// documented to respell or rebuild it.
void Ask(CChord const& chord, CFuzzInput& in) {
  CChordnamePref& pref = DefaultChordnamePref;
  for (CNote const& note : chord.Notes()) Require(note.NoteNr() >= -11 && note.NoteNr() <= 263);

  chord.IsUndefined();
  chord.RootNoteSpecified();
  chord.HasNote(in.Note());
  chord.HasNoteNr(in.AnyInt());
  chord.Note(static_cast<unsigned long>(in.AnyInt()));
  chord.LowestNote();
  chord.HighestNote();
  chord.CountNotesInOctave(in.AnyInt());
  chord.IsNarrowChord();
  chord.LowestNoteLonely();
  chord.IntvlSet();
  chord.Intvl(static_cast<unsigned long>(in.AnyInt()));
  chord.HasIntvl(in.AnyInt());
  chord.HasIntvlInAnyOctave(in.AnyInt());
  chord.HasOtherStackedThirdsOptionThan(in.AnyInt());
  chord.IntvlIxToNote(in.AnyInt());
  chord.IntvlIxToKeyNr(in.AnyInt());
  chord.IntvlIxToKeyName(in.AnyInt());
  for (int keyNr : chord.KeyNrSet()) Require(keyNr >= 0 && keyNr <= 11);
  chord.HasKeyNr(in.AnyInt());
  chord.HasKeyNrs(in.AnyInt(), in.AnyInt(), in.AnyInt(), -1);
  chord.HasExactTheseKeyNrs(in.AnyInt(), in.AnyInt(), in.AnyInt(), in.AnyInt());
  int const bc = chord.BasicChord();
  Require(bc >= CChord::bc_none && bc <= CChord::bc_drone);
  chord.IntvlsInBasicChord();
  chord.ScaleType();
  chord.Scale();
  int const xg = chord.XGChordIx();
  Require(xg >= 0 && xg <= 34);
  Require(chord.ProbThatNoteIsRootNote(in.Note()) >= 0);
  int const lowest = chord.LowestNoteIntvl();
  Require(lowest >= 0 && lowest <= 11);

  CSignKey const key(in.Note(), static_cast<CSignKey::TType>(in.AnyInt()));
  int const code = chord.HarmFuncIn(key);
  Require(code >= 0 && code <= 15);
  chord.ClosenessToSignKey(key);
  int const intvlsIn = chord.CountIntvlsInSignKey(key);
  Require(intvlsIn >= 0 && intvlsIn + chord.CountIntvlsNotInSignKey(key) == static_cast<int>(chord.IntvlSet().size()));
  Require(chord.CountNotesNotInSignKey(key) >= 0);
  chord.IsInSignKey(key);
  chord.SignsCount();

  chord.OptionsMap(pref);
  chord.OptionsStringVector(pref);
  chord.OptionsName(pref);
  chord.BasicChordNameAfterOptionsName();
  chord.BasicChordAndOptionsName(pref);
  Require(!chord.NameWithoutSlash(pref).empty());
  Require(!chord.NameWithSlash(pref).empty());
  Require(!chord.Name(pref).empty());
  Require(!chord.NameForThisRootNote(in.Note(), pref).empty());
  Require(!chord.NameWithLeastSignsForThisRootNote(in.Note(), pref).empty());
  Require(!chord.HarmFuncName(key, pref).empty());
  OptionName(static_cast<CChord::TChordOption>(in.AnyInt()), pref);
  BasicChordName(static_cast<CChord::TBasicChord>(in.AnyInt()), pref);
  chord.UseAllNonDestructiveMemberFunctions();
  chord.Trace();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  CFuzzInput in(data, size);
  in.SetPreferences();
  CChord chord = NewChord(in);
  CChord other = chord;
  for (int step = 0; step < 24 && !in.Empty(); ++step) {
    Edit(chord, in);
    if (in.Bool()) Ask(chord, in);
    if (in.Pick(8) == 0) other = chord;
  }
  Ask(chord, in);
  Require((chord == other) == chord.IsExactlyTheSame(other) && (chord != other) == !(chord == other));
  chord.UseAllMemberFunctions();
  return 0;
}
