// Chord edits: setting from sets, transposing, inverting, placing lowest notes, the
// comping range and moving notes between intervals. Expected note numbers are
// counted out by hand from the octave rules.
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"

#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <vector>

namespace {

using namespace chordtest;
using Notes = std::vector<long>;

// Note numbers are clamped and spelled, note sets taken as given; key numbers keep a
// specified root while its pitch class is among them (the flag stays either way).
TEST(ChordEdit, SettingFromSets) {
  CChord chord = RootedChord(62, {62, 66});
  chord.SetFromNoteNrSet(CMySet<int>{300, -5, 61, 255, 70});
  EXPECT_TRUE(NoteNrs(chord) == (Notes{0, 61, 70, 127, 255}) && chord.Note(2).Enh() == Enh_Flat);
  EXPECT_TRUE(chord.RootNote() == Nat(0) && !chord.RootNoteSpecified());
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 1, 3, 7, 10}));
  chord.SetFromNoteSet(CMySet<CNote>{CNote(61, Enh_Sharp), CNote(61, Enh_Flat)});
  EXPECT_TRUE(chord.NoteCount() == 2 && chord.RootNote() == CNote(61, Enh_Flat));
  struct Case {
    long root; // -1: none specified
    CMySet<int> keyNrs;
    long newRoot;
    Intvls cache;
  } const cases[] = {{-1, {0, 4, 7}, 0, {0, 4, 7}},
                     {60, {0, 4, 7}, 60, {0, 4, 7}},
                     {60, {4, 7, 11}, 4, {0, 3, 7}},
                     {62, {-3, 14, 200}, 62, {0, 10, 17}}, // 0, 14 and 127 under D, inserted directly
                     {60, {}, 255, {}}};
  for (Case const& c : cases) {
    CChord keys(24);
    if (c.root >= 0) keys.SetRootNote(Nat(c.root));
    keys.SetFromKeyNrSet(c.keyNrs);
    EXPECT_TRUE(keys.RootNote().NoteNr() == c.newRoot && keys.RootNoteSpecified() == (c.root >= 0)) << c.root;
    EXPECT_EQ(Members(keys.IntvlSet()), c.cache) << c.root;
  }
}

// Transposed notes wrap (and fold up from below 0) while the root clamps; spellings
// are kept, then checked; the cache is untouched. Inverting moves the lowest note
// above the highest's pitch class, into octave 8 at most.
TEST(ChordEdit, TransposeAndInvert) {
  struct Case {
    Notes notes;
    long root;
    int t;
    Notes result;
    long resultRoot;
  } const cases[] = {{{5, 60}, 5, -10, {7, 50}, 0}, {{120, 125}, 120, 10, {2, 7}, 127}, {{60}, 255, 0, {60}, 255}};
  for (Case const& c : cases) {
    CChord chord = RootedChord(c.root, c.notes);
    Intvls const cache = Members(chord.IntvlSet());
    chord.Transpose(c.t);
    EXPECT_TRUE(NoteNrs(chord) == c.result && chord.RootNote().NoteNr() == c.resultRoot) << c.t;
    EXPECT_EQ(Members(chord.IntvlSet()), cache) << c.t;
  }
  CChord spelled(24);
  spelled.AddNote(CNote(61, Enh_Flat));
  spelled.AddNote(CNote(61, Enh_Sharp));
  spelled.Transpose(1); // D flat D and C double sharp D: both natural D, merged
  EXPECT_TRUE(NoteNrs(spelled) == Notes{62} && spelled.Note(0).Enh() == Enh_Natural);

  Notes const inversions[][2] = {{{60, 64, 67}, {64, 67, 72}}, {{60, 70}, {70, 72}},    {{62, 72}, {72, 74}},
                                 {{104, 119}, {116, 119}},     {{11, 127}, {127, 131}}, {{61}, {109}}};
  for (auto const& c : inversions) {
    CChord chord = RootedChord(60, c[0]);
    chord.Invert();
    EXPECT_EQ(NoteNrs(chord), c[1]) << ListLabel("notes", c[0]);
  }
}

// SetLowestNote replaces the lowest note by n's pitch class at or below the next one,
// marking it when that pitch class is among the other notes (a rebuild says the
// opposite); SetLowestNoteInOctave only adds.
TEST(ChordEdit, LowestNotes) {
  struct Case {
    Notes notes;
    CNote n;
    Notes result;
  } const cases[] = {{{60, 64, 67}, Nat(62), {62, 64, 67}},
                     {{60, 64, 67}, Nat(52), {64, 67}},
                     {{60, 64, 67}, Nat(65), {53, 64, 67}},
                     {{}, Nat(60), {127}}};
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.SetLowestNote(c.n);
    EXPECT_EQ(NoteNrs(chord), c.result) << c.n;
  }
  for (long lowest : {55L, 62L}) { // G is among E G, D is not
    CChord chord = RootedChord(60, {60, 64, 67});
    chord.SetLowestNote(Nat(lowest));
    EXPECT_EQ(chord.LowestNoteLonely(), lowest == 55);
    chord.UpdateIntvlSet();
    EXPECT_EQ(chord.LowestNoteLonely(), lowest != 55);
  }
  CChord chord = ChordOf({48, 60, 62, 71, 72});
  chord.SetLowestNoteAloneInOctave(2, 4, Enh_Natural);
  chord.SetLowestNoteInOctave(11, 9, Enh_Natural);  // octave 9 of B: 131, kept
  chord.SetLowestNoteInOctave(-7, 20, Enh_Natural); // key numbers folded, octaves limited to -1..9
  EXPECT_EQ(NoteNrs(chord), (Notes{48, 62, 72, 125, 131}));
}

// Roots and intervals in the comping range 53..64: C..E above middle C, F..B below.
TEST(ChordEdit, CompingRange) {
  for (int k = 0; k < 12; ++k) {
    long const comping = k < 5 ? 60 + k : 48 + k;
    CChord chord = ChordOf({40});
    chord.SetRootNoteInCompingRange(CNote(24 + k, Enh_Flat));
    EXPECT_TRUE(chord.RootNote() == CNote(comping, CNote(k, Enh_Flat).Enh()) && chord.RootNoteSpecified()) << k;
    chord.SetRootKeyNr(k);
    EXPECT_EQ(chord.RootNote(), Nat(comping)) << k;
    EXPECT_EQ(Members(chord.IntvlSet()), Intvls{oracle::Mod12(40 - k)}) << k; // rebuilt
    for (int i = -30; i <= 30; ++i) {
      CChord added = RootedChord(36 + oracle::Mod12(k - i), {});
      added.AddIntvlInCompingRange(i);
      ASSERT_EQ(NoteNrs(added), Notes{comping}) << k << " " << i;
      EXPECT_EQ(Members(added.IntvlSet()), Intvls{i < 0 ? oracle::Mod12(i) : i % 24}) << k << " " << i;
    }
  }
  CChord chord = ChordOf({40});
  chord.SetRootKeyNrAndBasicChord(9, CChord::bc_min); // A minor over the E
  EXPECT_EQ(NoteNrs(chord), (Notes{40, 57, 60}));
}

// Small steps go up, large ones down by the step itself (a fifth below for 7);
// clamped and respelled; the cache loses lo..hi and gains the new interval.
TEST(ChordEdit, ChangeAllNotesWithinIntvlRange) {
  struct Case {
    Notes notes; // over root C4, the cache fresh
    int lo, hi, to;
    Notes result;
    Intvls cache;
  } const cases[] = {{{60, 64, 67}, 4, 4, 9, {60, 67, 69}, {0, 7, 9}},             // diff 5: up
                     {{60, 64, 67}, 4, 4, 10, {58, 60, 67}, {0, 7, 10}},           // diff 6: down 6
                     {{60, 64, 67}, 0, 0, 7, {53, 64, 67}, {4, 7}},                // diff 7: a fifth below
                     {{60, 64, 67, 74}, 1, 3, 0, {60, 64, 67, 72}, {0, 4, 7, 14}}, // 14 is not in 1..3
                     {{48, 60, 72}, 0, 0, 4, {52, 64, 76}, {4, 12}},               // every octave moves
                     {{62, 64}, 2, 2, -10, {50, 64}, {2, 4}},                      // -10 rises to 2
                     {{60, 64, 67}, 8, 10, 0, {60, 64, 67}, {0, 4, 7}}};           // no note there
  for (Case const& c : cases) {
    CChord chord = RootedChord(60, c.notes);
    chord.ChangeAllNotesWithinIntvlRange(c.lo, c.hi, c.to);
    EXPECT_TRUE(NoteNrs(chord) == c.result && Members(chord.IntvlSet()) == c.cache) << c.lo << " " << c.to;
  }
  CChord low = RootedChord(0, {2, 12});
  low.AddNote(CNote(4, Enh_Flat));               // F flat, respelled when moved
  low.ChangeAllNotesWithinIntvlRange(2, 4, -10); // 2 - 12 clamps to 0
  EXPECT_TRUE(NoteNrs(low) == (Notes{0, 12}) && low.Note(0).Enh() == Enh_Natural);
}

} // namespace
