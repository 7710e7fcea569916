// Round trips of chord symbols: a chord's lead-sheet symbol (plain and in every
// combination of style flags) and its Harte label read back to the chord's root, pitch classes and
// bass, and writing the chord read gives the same text again. Over every pitch-class
// set above a root with each of its notes in the bass, and over every voicing of the
// chord-type catalogue and the XG types on all roots in every inversion.
#include "training/ChordPatterns.h"
#include <tonvex/ChordSymbol.h>

#include <gtest/gtest.h>

#include <string>

namespace {

// What a symbol keeps of a chord: root, pitch classes and bass, and the bass's
// spelling in a lead-sheet symbol (a Harte label spells the bass by its degree).
std::string Facts(CChord const& chord, bool bassSpelling) {
  unsigned pitchClasses = 0;
  for (CNote const& note : chord.Notes()) pitchClasses |= 1u << (note.NoteNr() % 12);
  return "root " + std::to_string(chord.RootNote().NoteNr() % 12) + "/" + std::to_string(chord.RootNote().Enh()) +
         " pitch classes " + std::to_string(pitchClasses) + " bass " +
         std::to_string(chord.LowestNote().NoteNr() % 12) +
         (bassSpelling ? "/" + std::to_string(chord.LowestNote().Enh()) : "");
}

// The symbol (plain, and in the given combination of style flags) and the label of
// the chord read back to its facts and are written the same again.
void ExpectRoundTrips(CChord const& chord, int style) {
  for (int s : {0, style}) {
    std::string const symbol = LeadSheetSymbol(chord, s);
    CChord read;
    ASSERT_TRUE(ReadChordSymbol(symbol, read)) << symbol;
    ASSERT_EQ(Facts(read, true), Facts(chord, true)) << symbol << " of " << HarteLabel(chord);
    ASSERT_EQ(LeadSheetSymbol(read, s), symbol);
  }
  std::string const label = HarteLabel(chord);
  CChord read;
  ASSERT_TRUE(ReadChordSymbol(label, read)) << label;
  ASSERT_EQ(Facts(read, false), Facts(chord, false)) << label << " of " << LeadSheetSymbol(chord);
  ASSERT_EQ(HarteLabel(read), label);
}

TEST(ChordSymbolRoundTrip, EveryPitchClassSetWithEveryBass) {
  for (unsigned set = 1; set < 4096; ++set)
    for (int bass = 0; bass < 12; ++bass) {
      if ((set & (1u << bass)) == 0) continue;
      // Roots and spellings vary with the set: every pitch class, sharps and flats.
      int const rootPc = static_cast<int>(set * 7 % 12);
      CNote const root(rootPc, static_cast<TEnh>(set % 5));
      CMySet<CNote> notes;
      int const bassNr = 48 + (rootPc + bass) % 12;
      for (int i = 0; i < 12; ++i)
        if ((set & (1u << i)) != 0)
          notes.insert(CNote(bassNr + (i - bass + 12) % 12, static_cast<TEnh>((set + static_cast<unsigned>(i)) % 5)));
      CChord chord;
      chord.SetFromNoteSet(notes);
      chord.SetRootNote(root);
      ExpectRoundTrips(chord, static_cast<int>(set + static_cast<unsigned>(bass)) % 64); // every style
      if (HasFatalFailure()) return;
    }
}

TEST(ChordSymbolRoundTrip, CatalogueAndXGTypesOnEveryRootInEveryInversion) {
  int style = 0;
  for (TChordVoicing const& voicing : ChordVoicings()) {
    CMySet<int> noteNrs(voicing.noteNrs.begin(), voicing.noteNrs.end());
    CChord chord;
    chord.SetFromNoteNrSet(noteNrs);
    chord.SetRootNote(CNote(voicing.rootKeyNr, Enh_Natural));
    chord.SetRootNoteEnhWithLeastSigns();
    chord.AdjustEnhOfChordNotesToRootScale(nullptr);
    ExpectRoundTrips(chord, ++style % 64);
    if (HasFatalFailure()) return;
  }
}

} // namespace
