// Reading chord symbols: the text's start, the bass, and the chord's notes.
#include "naming/SymbolReader.h"

#include "pitch/NoteNrs.h"

CSymbolTone AddedTone(int accidentals, int degree) {
  return {PitchClass(DegreeIntvl(degree) + accidentals), degree, Role_Added};
}

bool CSymbolReader::Read(CChord& chord) {
  if (Scan_.AtEnd()) return Fail(Scan_.Pos(), "no chord symbol");
  if (ReadNoChord()) {
    chord.SetUndefined();
    return true;
  }
  std::size_t const rootPos = Scan_.Pos();
  if (!Scan_.TakeNoteName(Root_)) return Fail(rootPos, "not a note name");
  Scan_.SkipBlanks();
  if (!(Scan_.Take(":") ? ReadHarte() : ReadLeadSheet())) return false;
  if (Scan_.Take("/") && !ReadBass()) return false;
  if (!Scan_.AtEnd()) return Unexpected();
  if (Tones_.Overflowed()) return Fail(0, "too many degrees");
  return Build(chord);
}

bool CSymbolReader::ReadNoChord() {
  CSymbolScanner scan = Scan_;
  return (scan.TakeWord("n.c.") || scan.TakeWord("n.c") || scan.TakeWord("nc") || scan.TakeWord("n")) && scan.AtEnd();
}

// A written degree: accidentals and a number 1..13.
bool CSymbolReader::ReadDegree(int& accidentals, int& degree, bool signs) {
  std::size_t const start = Scan_.Pos();
  accidentals = Scan_.TakeAccidentals(false, signs);
  if (!Scan_.TakeNumber(degree) || degree < 1 || degree > 13) return Fail(start, "not a degree");
  return true;
}

// After the slash: a note name ("C/E") or a degree ("C:maj/3", "C/b7").
bool CSymbolReader::ReadBass() {
  Scan_.SkipBlanks();
  std::size_t const start = Scan_.Pos();
  HasBass_ = true;
  if (Scan_.DegreeFollows(false)) {
    int accidentals = 0, degree = 0;
    if (!ReadDegree(accidentals, degree, false)) return false;
    CSymbolTone const tone = AddedTone(accidentals, degree);
    Bass_ = SpellDegree(Root_, tone.Intvl, degree);
    return true;
  }
  if (!Scan_.TakeNoteName(Bass_)) return Fail(start, "not a bass note or degree");
  return true;
}

// The notes in the documented voicing, spelled by their degrees.
bool CSymbolReader::Build(CChord& chord) {
  // One tone per interval, the first written (the type's before the additions).
  CSymbolTone tones[12];
  int count = 0;
  for (int i = 0; i < Tones_.Count(); ++i) {
    bool seen = false;
    for (int j = 0; j < count; ++j) seen = seen || tones[j].Intvl == Tones_[i].Intvl;
    if (!seen) tones[count++] = Tones_[i];
  }
  int const rootPc = SpelledPitchClass(Root_);
  int bassIntvl = -1;
  CSpelledPitch bass = Root_;
  if (HasBass_) {
    bass = Bass_;
    bassIntvl = PitchClass(SpelledPitchClass(Bass_) - rootPc);
  } else {
    // The root, or else the lowest degree.
    int lowest = -1;
    for (int i = 0; i < count; ++i)
      if (lowest < 0 || tones[i].Degree < tones[lowest].Degree) lowest = i;
    if (lowest < 0) return Fail(0, "the symbol names no notes");
    bassIntvl = tones[lowest].Intvl;
    bass = SpellDegree(Root_, bassIntvl, tones[lowest].Degree);
  }
  int const bassNr = 48 + SpelledPitchClass(bass);
  CMySet<CNote> notes;
  notes.insert(CNote(bassNr, EnhOf(bass)));
  for (int i = 0; i < count; ++i) {
    CSymbolTone const tone = tones[i];
    if (tone.Intvl == bassIntvl) continue;
    int const noteNr = bassNr + PitchClass(tone.Intvl - bassIntvl) + (tone.Degree > 7 ? 12 : 0);
    notes.insert(CNote(noteNr, EnhOf(SpellDegree(Root_, tone.Intvl, tone.Degree))));
  }
  CChord result = chord;
  result.SetFromNoteSet(notes);
  result.SetRootNote(CNote(rootPc, EnhOf(Root_)));
  chord = result;
  return true;
}

bool ReadChordSymbol(std::string_view text, CChord& chord, CChordSymbolProblem* problem) {
  CSymbolReader reader(text);
  if (reader.Read(chord)) return true;
  if (problem != nullptr) *problem = reader.Problem();
  return false;
}
