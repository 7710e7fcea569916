// Chord symbols: ReadChordSymbol on any text, and the writers on any chord. Whatever
// is read, or whatever chord is given, its lead-sheet symbol (in any style) and its
// Harte label read back to the same root, pitch classes and bass; a text that cannot
// be read leaves the chord as it was and names a place inside the text.
#include "FuzzInput.h"

#include <tonvex/ChordSymbol.h>

namespace {

int PitchClassOf(long noteNr) { return static_cast<int>((noteNr % 12 + 12) % 12); }

struct CFacts {
  bool Defined;
  int RootPc;
  unsigned PitchClasses;
  int BassPc;
};

CFacts FactsOf(CChord const& chord) {
  CFacts facts{chord.RootNote().NoteNr() != 255 && chord.NoteCount() > 0, PitchClassOf(chord.RootNote().NoteNr()), 0,
               PitchClassOf(chord.LowestNote().NoteNr())};
  for (CNote const& note : chord.Notes()) facts.PitchClasses |= 1u << PitchClassOf(note.NoteNr());
  return facts;
}

void RequireRoundTrips(CChord const& chord, int style) {
  CFacts const facts = FactsOf(chord);
  for (std::string const& text : {LeadSheetSymbol(chord, style), HarteLabel(chord)}) {
    CChord read;
    Require(ReadChordSymbol(text, read));
    CFacts const back = FactsOf(read);
    if (!facts.Defined) {
      Require(read.IsUndefined());
      continue;
    }
    Require(back.Defined && back.RootPc == facts.RootPc && back.PitchClasses == facts.PitchClasses &&
            back.BassPc == facts.BassPc);
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  CFuzzInput in(data, size);
  int const style = in.Pick(64);
  if (in.Bool()) {
    std::string const text = in.Rest();
    CChord chord;
    chord.SetFromNoteNrSet(CMySet<int>{40, 67});
    CChord const before = chord;
    CChordSymbolProblem problem;
    if (ReadChordSymbol(text, chord, &problem)) {
      RequireRoundTrips(chord, style);
    } else {
      Require(chord == before && problem.Offset <= text.size() && problem.Part == text.substr(problem.Offset) &&
              !problem.Reason.empty());
    }
    return 0;
  }
  // A chord as a host can make one: any notes (numbers outside 0..127 and unchecked
  // spellings included) and any root, also none.
  CChord chord;
  CMySet<CNote> notes;
  for (std::size_t k = in.Count(12); k > 0; --k) notes.insert(in.Note());
  chord.SetFromNoteSet(notes);
  if (in.Bool()) chord.SetRootNote(in.Note());
  RequireRoundTrips(chord, style);
  return 0;
}
