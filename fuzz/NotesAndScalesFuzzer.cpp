// Notes, the note-name parser and note naming under any preferences; scales and keys
// with any root, type, degree, key number and step count.
#include "FuzzInput.h"

#include <tonvex/NoteNames.h>
#include <tonvex/Scale.h>
#include <tonvex/SignKey.h>

#include <sstream>

namespace {

bool IsStoredNoteNr(long n) { return (n >= 0 && n <= 127) || n == 255; }

void NameNote(CNote const& note) {
  Require(!note.KeyName(DefaultChordnamePref).empty());
  Require(!note.KeyNameWithoutEnh(DefaultChordnamePref).empty());
  Require(note.NoteNr() == 255 || !note.OctName(DefaultChordnamePref).empty());
  std::ostringstream out;
  out << note;
}

void ParseAndName(CFuzzInput& in) {
  CNote note = in.Note();
  CNote const before = note;
  if (!note.SetFromString(in.Text(64), DefaultChordnamePref)) Require(note == before);
  NameNote(note);
}

void Spell(CFuzzInput& in) {
  int const keyNr = in.AnyInt();
  TEnh const enh = in.Enh();
  IsSensefulEnhForKeyNr(keyNr, enh);
  EnhShiftToFlats(keyNr, enh);
  EnhShiftToSharps(keyNr, enh);
  EnhShift(keyNr, enh);
  Require(MakeSensefulEnhForKeyNr(keyNr, enh) == enh);
  Require(!KeyNrAndEnhToName(keyNr, enh, DefaultChordnamePref).empty());
  Require(!KeyNrToNameIgnoringEnh(keyNr, enh, DefaultChordnamePref).empty());

  CNote note(in.AnyInt(), enh);
  Require(IsStoredNoteNr(note.NoteNr()) && note.HasSensefulEnh());
  note.SetEnh(in.Enh());
  Require(note.HasSensefulEnh());
  switch (in.Pick(7)) {
  case 0: note.SetNoteNr(in.AnyInt()); break;
  case 1: note.SetNoteNrAndCheckEnh(in.AnyInt()); break;
  case 2: note.SetNoteNrAndEnh(in.AnyInt(), in.Enh()); break;
  case 3: note.SetKeyNr(in.AnyInt()); break;
  case 4: note.SetKeyNrAndEnh(in.AnyInt()); break;
  case 5: note.SetOct(in.AnyInt()); break;
  default: note.Clear(); break;
  }
  note.EnhShift();
  note.EnhShiftToFlats();
  note.EnhShiftToSharps();
  note.IsBlackKey();
  note.CheckEnh();
  Require(note.HasSensefulEnh());
  NameNote(note);
}

void Measure(CFuzzInput& in) {
  CNote const a = in.Note(), b = in.Note();
  IntvlFromTo(a, b);
  Require(DistanceBetween(a, b) >= 0);
  KeyIntvlFromTo(a, b);
  int const abs = AbsKeyIntvlFromTo(a, b);
  Require(abs >= 0 && abs <= 11);
  int const distance = KeyDistanceBetween(a, b);
  Require(distance >= 0 && distance <= 6);
  int const smallest = SmallestKeyIntvlBetween(a, b);
  Require(smallest >= -6 && smallest <= 5);
  Require((a < b) + (b < a) + (a == b) == 1 && (a != b) == !(a == b));
}

void CheckScale(CScale const& scale, CFuzzInput& in) {
  int const n = scale.DegreesPerOctave();
  Require(scale.RootNote().NoteNr() >= 0 && scale.RootNote().NoteNr() <= 11 && scale.RootNote().HasSensefulEnh());
  for (int k = 0; k < 4; ++k) {
    int const d = in.AnyInt();
    int const keyNr = scale.DegreeNrToKeyNr(d);
    Require(keyNr >= 0 && keyNr <= 11);
    NameNote(scale.DegreeNrToKey(d));
    int const degree = scale.KeyNrToDegreeNr(in.AnyInt());
    Require(degree >= -1 && degree < n);
    scale.NoteToDegreeNr(in.Note());
    scale.HasKeyNr(in.AnyInt());
    scale.HasNote(in.Note());
    auto const dir = static_cast<CScale::TQuantizeToScaleDirection>(in.AnyInt());
    int const snapped = scale.KeyNrQuantizeToDegreeNr(in.AnyInt(), dir);
    Require(snapped >= 0 && snapped < n);
    scale.NoteQuantizeToDegreeNr(in.Note(), dir);
    CNote const moved = scale.MoveInScale(in.Note(), in.AnyInt());
    Require(moved.NoteNr() >= 0 && moved.NoteNr() <= 131);
    NameNote(moved);
    scale.EnhForKeynr(in.AnyInt());
    scale.EnhForNote(in.Note());
  }
  scale.SignsCount();
}

void UseScale(CFuzzInput& in) {
  CScale scale = in.Bool() ? CScale() : CScale(in.Note(), static_cast<CScale::TType>(in.IntMostlyIn(0, 8)));
  CheckScale(scale, in);
  switch (in.Pick(6)) {
  case 0: scale.SetRootNoteAndScaleType(in.Note(), static_cast<CScale::TType>(in.AnyInt())); break;
  case 1: scale.SetRootNote(in.Note()); break;
  case 2: scale.SetScaleType(static_cast<CScale::TType>(in.AnyInt())); break;
  case 3: scale.SetScaleTypeWithoutCalcEnh(static_cast<CScale::TType>(in.AnyInt())); break;
  case 4:
    scale.SetEnhForKeyNr(in.AnyInt(), in.Enh());
    scale.SetEnhForNote(in.Note(), in.Enh());
    scale.SetEnhForChromStep(in.AnyInt(), in.Enh());
    break;
  default: scale.CalcEnh(); break;
  }
  CheckScale(scale, in);
  // A note spelled by a scale may carry a spelling outside 0..4 until it is checked.
  CNote note = in.Note();
  note.AdjustEnhToScale(scale);
  NameNote(note);
  note.CheckEnh();
  Require(note.HasSensefulEnh());
}

void UseKey(CFuzzInput& in) {
  CSignKey key(in.Note(), static_cast<CSignKey::TType>(in.AnyInt()));
  switch (in.Pick(3)) {
  case 0: key.SetRootNoteAndSignKeyType(in.Note(), static_cast<CSignKey::TType>(in.AnyInt())); break;
  case 1: key.SetRootNote(in.Note()); break;
  default: key.SetSignKeyType(static_cast<CSignKey::TType>(in.AnyInt())); break;
  }
  Require(key.SignKeyType() == CSignKey::SignKey_Major || key.SignKeyType() == CSignKey::SignKey_Minor);
  Require(!key.Name(DefaultChordnamePref).empty());
  key.SignsCount();
  CheckScale(key.Scale(), in);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  CFuzzInput in(data, size);
  in.SetPreferences();
  for (int step = 0; step < 16 && !in.Empty(); ++step) {
    switch (in.Pick(5)) {
    case 0: ParseAndName(in); break;
    case 1: Spell(in); break;
    case 2: Measure(in); break;
    case 3: UseScale(in); break;
    default: UseKey(in); break;
    }
  }
  return 0;
}
