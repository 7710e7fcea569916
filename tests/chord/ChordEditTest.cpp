// Chord edits: setting from sets, transposing, inverting, placing lowest notes, the
// comping range and moving notes between intervals. Expected note numbers are
// counted out by hand from the octave rules.
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"
#include "support/TestPrelude.h"

namespace {

using namespace chordtest;
using Notes = std::vector<long>;

// Note numbers are clamped and spelled; key numbers keep a specified root while its
// pitch class is among them, else the root is the lowest note (the flag stays).
TEST(ChordEdit, SettingFromSets) {
  CChord chord = RootedChord(62, {62, 66});
  chord.SetFromNoteNrSet(CMySet<int>{300, -5, 61, 255, 70});
  EXPECT_TRUE(NoteNrs(chord) == (Notes{0, 61, 70, 127, 255}) && chord.Note(2).Enh() == Enh_Flat);
  EXPECT_TRUE(chord.RootNote() == Nat(0) && !chord.RootNoteSpecified());
  for (CMySet<int> const& keyNrs : {CMySet<int>{0, 4, 7}, CMySet<int>{4, 7, 11}}) {
    CChord keys = RootedChord(60, {});
    keys.SetFromKeyNrSet(keyNrs);
    EXPECT_TRUE(keys.RootNote() == Nat(keyNrs.count(0) ? 60 : 4) && keys.RootNoteSpecified());
    EXPECT_EQ(Members(keys.IntvlSet()), (keyNrs.count(0) ? Intvls{0, 4, 7} : Intvls{0, 3, 7}));
  }
}

// Transposed notes wrap (and fold up from below 0) while the root clamps, the cache
// untouched; inverting moves the lowest note above the highest's pitch class, into
// octave 8 at most; a new lowest note lies at or below the next one.
TEST(ChordEdit, TransposeInvertAndLowestNote) {
  CChord chord = RootedChord(5, {5, 60});
  chord.Transpose(-10);
  EXPECT_TRUE(NoteNrs(chord) == (Notes{7, 50}) && chord.RootNote() == Nat(0));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 7}));
  Notes const inversions[][2] = {{{60, 64, 67}, {64, 67, 72}}, {{60, 70}, {70, 72}},
                                 {{62, 72}, {72, 74}},         {{60, 72}, {72, 84}}, // equal pitch classes go up
                                 {{104, 119}, {116, 119}},     {{11, 127}, {127, 131}}};
  for (auto const& c : inversions) {
    CChord inverted = ChordOf(c[0]);
    inverted.Invert();
    EXPECT_EQ(NoteNrs(inverted), c[1]) << ListLabel("notes", c[0]);
  }
  CChord lowest = ChordOf({60, 64, 67});
  lowest.SetLowestNote(Nat(65));
  EXPECT_EQ(NoteNrs(lowest), (Notes{53, 64, 67}));
}

// Roots and intervals in the comping range 53..64: C..E above middle C, F..B below.
TEST(ChordEdit, CompingRange) {
  for (int k = 0; k < 12; ++k) {
    long const comping = k < 5 ? 60 + k : 48 + k;
    CChord chord = ChordOf({40});
    chord.SetRootKeyNr(k);
    EXPECT_TRUE(chord.RootNote() == Nat(comping) && chord.RootNoteSpecified()) << k;
    EXPECT_EQ(Members(chord.IntvlSet()), Intvls{oracle::Mod12(40 - k)}) << k; // rebuilt
    for (int i = -30; i <= 30; ++i) {
      CChord added = RootedChord(36 + oracle::Mod12(k - i), {});
      added.AddIntvlInCompingRange(i);
      ASSERT_EQ(NoteNrs(added), Notes{comping}) << k << " " << i;
      EXPECT_EQ(Members(added.IntvlSet()), Intvls{i < 0 ? oracle::Mod12(i) : i % 24}) << k << " " << i;
    }
  }
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
                     {{60, 64, 67}, 8, 10, 0, {60, 64, 67}, {0, 4, 7}}};           // no note there
  for (Case const& c : cases) {
    CChord chord = RootedChord(60, c.notes);
    chord.ChangeAllNotesWithinIntvlRange(c.lo, c.hi, c.to);
    EXPECT_TRUE(NoteNrs(chord) == c.result && Members(chord.IntvlSet()) == c.cache) << c.lo << " " << c.to;
  }
}

} // namespace
