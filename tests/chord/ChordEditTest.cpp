// Chord edits: setting from sets, transposing, inverting, placing lowest notes, the
// comping range and moving notes between intervals. Expected note numbers are
// counted out by hand from the octave rules.
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"

#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <climits>
#include <vector>

namespace {

using namespace chordtest;
using Notes = std::vector<long>;

TEST(ChordSetFrom, NoteSetsNoteNumbersAndKeyNumbers) {
  CChord chord = RootedChord(62, {62, 66});
  chord.SetFromNoteSet(CMySet<CNote>{CNote(61, Enh_Sharp), CNote(61, Enh_Flat), Nat(64)});
  EXPECT_EQ(chord.NoteCount(), 3u); // as given
  EXPECT_EQ(chord.RootNote(), CNote(61, Enh_Flat));
  EXPECT_FALSE(chord.RootNoteSpecified());
  chord.SetFromNoteNrSet(CMySet<int>{300, -5, 61, 255, 70}); // clamped, spelled
  EXPECT_EQ(NoteNrs(chord), (Notes{0, 61, 70, 127, 255}));
  EXPECT_EQ(chord.Note(2).Enh(), Enh_Flat);
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 1, 3, 7, 10}));
  chord.SetFromKeyNrSet(CMySet<int>{});
  EXPECT_EQ(chord.RootNote(), CNote_Undef);
  // A specified root stays while its pitch class is among the key numbers.
  struct Case {
    long root; // -1: none specified
    CMySet<int> keyNrs;
    Notes notes;
    long newRoot;
    Intvls cache;
  } const cases[] = {{-1, {0, 4, 7}, {0, 4, 7}, 0, {0, 4, 7}},
                     {60, {0, 4, 7}, {0, 4, 7}, 60, {0, 4, 7}},
                     {60, {4, 7, 11}, {4, 7, 11}, 4, {0, 3, 7}}, // the flag stays set
                     {62, {-3, 14, 200}, {0, 14, 127}, 62, {0, 10, 17}}};
  for (Case const& c : cases) {
    CChord keys(24);
    if (c.root >= 0) keys.SetRootNote(Nat(c.root));
    keys.SetFromKeyNrSet(c.keyNrs);
    EXPECT_EQ(NoteNrs(keys), c.notes) << c.root;
    EXPECT_EQ(keys.RootNote(), Nat(c.newRoot)) << c.root;
    EXPECT_EQ(keys.RootNoteSpecified(), c.root >= 0);
    EXPECT_EQ(Members(keys.IntvlSet()), c.cache) << c.root;
  }
}

// Notes wrap (and fold up from below 0) while the root clamps; spellings are kept,
// then checked; the cache and flags are untouched.
TEST(ChordTranspose, NotesWrapAndFoldWhileTheRootClamps) {
  struct Case {
    Notes notes;
    long root;
    int t;
    Notes result;
    long resultRoot;
  } const cases[] = {{{5, 60}, 5, -10, {7, 50}, 0}, {{120, 125}, 120, 10, {2, 7}, 127}, {{60}, 255, 0, {60}, 255},
                     {{60}, 60, 300, {104}, 127},   {{60}, 60, -300, {8}, 0},           {{60}, 60, INT_MAX, {59}, 127},
                     {{60}, 60, INT_MIN, {4}, 0}};
  for (Case const& c : cases) {
    CChord chord = RootedChord(c.root, c.notes);
    Intvls const cache = Members(chord.IntvlSet());
    chord.Transpose(c.t);
    EXPECT_EQ(NoteNrs(chord), c.result) << c.t;
    EXPECT_EQ(chord.RootNote().NoteNr(), c.resultRoot) << c.t;
    EXPECT_EQ(Members(chord.IntvlSet()), cache) << c.t;
  }
  CChord chord(24);
  chord.AddNote(CNote(61, Enh_Flat));
  chord.AddNote(CNote(61, Enh_Sharp));
  chord.Transpose(2); // Eb and D#
  EXPECT_EQ(chord.Note(0), CNote(63, Enh_Flat));
  chord.Transpose(-1); // a flat D is not senseful: both become D and merge
  EXPECT_EQ(NoteNrs(chord), Notes{62});
}

TEST(ChordInvert, OctaveRules) {
  Notes const cases[][2] = {{{60, 64, 67}, {64, 67, 72}}, {{60, 70}, {70, 72}}, // 0 not above 10: above B flat's octave
                            {{62, 72}, {72, 74}},                               // 2 above 0: C5's own octave
                            {{60, 72}, {72, 84}},         {{104, 119}, {116, 119}}, // highest at 116 or above
                            {{8, 120}, {120, 128}},       {{11, 127}, {127, 131}},  {{61}, {109}}, {{}, {}}};
  for (auto const& c : cases) {
    CChord chord = ChordOf(c[0]);
    chord.Invert();
    EXPECT_EQ(NoteNrs(chord), c[1]) << ListLabel("notes", c[0]);
  }
  CChord chord = RootedChord(60, {64, 67});
  chord.AddNote(CNote(61, Enh_Flat));
  Intvls const cache = Members(chord.IntvlSet());
  chord.Invert();
  EXPECT_EQ(chord.HighestNote(), CNote(73, Enh_Flat)); // spelling, root and cache kept
  EXPECT_EQ(chord.RootNote(), Nat(60));
  EXPECT_EQ(Members(chord.IntvlSet()), cache);
}

// SetLowestNote replaces the lowest note by n's pitch class at or below the next
// one; its mark is set when that pitch class is among the other notes.
TEST(ChordLowestNote, ReplacesTheLowestNoteAtOrBelowTheNextOne) {
  struct Case {
    Notes notes;
    CNote n;
    Notes result;
  } const cases[] = {{{60, 64, 67}, Nat(62), {62, 64, 67}}, {{60, 64, 67}, Nat(52), {64, 67}},
                     {{60, 64, 67}, Nat(65), {53, 64, 67}}, {{60, 72}, CNote(61, Enh_Flat), {61, 72}},
                     {{}, CNote(63, Enh_Flat), {255}},      {{}, Nat(60), {127}}};
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.SetLowestNote(c.n);
    EXPECT_EQ(NoteNrs(chord), c.result) << c.n;
    EXPECT_EQ(chord.LowestNote().Enh(), c.n.Enh()) << c.n;
  }
  for (long lowest : {55L, 62L}) { // G is among E G, D is not; a rebuild says the opposite
    CChord chord = RootedChord(60, {60, 64, 67});
    chord.SetLowestNote(Nat(lowest));
    EXPECT_EQ(chord.LowestNoteLonely(), lowest == 55);
    chord.UpdateIntvlSet();
    EXPECT_EQ(chord.LowestNoteLonely(), lowest != 55);
  }
  // In an octave it only adds (octaves limited to -1..9, 131 kept).
  int const inOctave[][3] = {{-1, 4, 71}, {13, 4, 61}, {7, 20, 127}, {11, 9, 131}, {5, -7, 5}};
  for (auto const& c : inOctave) {
    CChord chord = ChordOf({60, 64});
    chord.SetLowestNoteInOctave(c[0], c[1], Enh_Natural);
    EXPECT_TRUE(chord.HasNoteNr(c[2]) && chord.NoteCount() == 3) << c[0] << " " << c[1];
  }
  CChord chord = ChordOf({48, 60, 62, 71, 72});
  chord.SetLowestNoteAloneInOctave(2, 4, Enh_Natural);
  EXPECT_EQ(NoteNrs(chord), (Notes{48, 62, 72}));
}

// The note of pitch class pc in the comping range 53..64.
long InCompingRange(int pc) { return pc < 5 ? 60 + pc : 48 + pc; }

TEST(ChordComping, RootsAndIntervalsLandInTheCompingRange) {
  for (long n = 0; n < 128; ++n) {
    CChord chord = ChordOf({40});
    chord.SetRootNoteInCompingRange(CNote(n, Enh_Flat));
    EXPECT_EQ(chord.RootNote(), CNote(InCompingRange(static_cast<int>(n % 12)), CNote(n, Enh_Flat).Enh())) << n;
    EXPECT_TRUE(chord.RootNoteSpecified());
  }
  for (int k = 0; k < 12; ++k) {
    CChord chord = ChordOf({40});
    chord.SetRootKeyNr(k);
    EXPECT_EQ(chord.RootNote(), Nat(InCompingRange(k))) << k;
    EXPECT_EQ(Members(chord.IntvlSet()), Intvls{oracle::Mod12(40 - k)}) << k; // rebuilt
    for (int i = -30; i <= 30; ++i) {
      CChord added = RootedChord(36 + k, {});
      added.AddIntvlInCompingRange(i);
      ASSERT_EQ(NoteNrs(added), Notes{InCompingRange(oracle::Mod12(k + i))}) << k << " " << i;
      EXPECT_EQ(Members(added.IntvlSet()), Intvls{i < 0 ? oracle::Mod12(i) : i % 24}) << k << " " << i;
    }
  }
  long const outside[][2] = {{200, 127}, {207, 255}, {-100, 0}, {INT_MAX, 127}, {INT_MIN, 0}};
  for (auto const& c : outside) {
    CChord chord(24);
    chord.SetRootKeyNr(static_cast<int>(c[0]));
    EXPECT_EQ(chord.RootNote().NoteNr(), c[1]) << c[0];
  }
  CChord chord = ChordOf({40});
  chord.SetRootKeyNrAndBasicChord(9, CChord::bc_min); // A minor over the E
  EXPECT_EQ(NoteNrs(chord), (Notes{40, 57, 60}));
  EXPECT_EQ(chord.RootNote(), Nat(57));
}

// Small steps go up, large ones down by the step itself (a fifth below for 7);
// clamped and checked; the cache loses lo..hi and gains the new interval.
TEST(ChordChangeIntvls, SmallStepsGoUpLargeOnesDownByTheStepItself) {
  struct Case {
    Notes notes; // over root C4, the cache fresh
    int lo, hi, to;
    Notes result;
    Intvls cache;
  } const cases[] = {{{60, 64, 67}, 4, 4, 9, {60, 67, 69}, {0, 7, 9}},             // diff 5: up
                     {{60, 64, 67}, 4, 4, 10, {58, 60, 67}, {0, 7, 10}},           // diff 6: down 6
                     {{60, 64, 67}, 0, 0, 7, {53, 64, 67}, {4, 7}},                // diff 7: a fifth below, on F
                     {{60, 64, 67}, 7, 7, 0, {60, 64}, {0, 4}},                    // diff -7: onto C4
                     {{60, 64, 67, 74}, 1, 3, 0, {60, 64, 67, 72}, {0, 4, 7, 14}}, // the cache's 14 is not in 1..3
                     {{48, 60, 72}, 0, 0, 4, {52, 64, 76}, {4, 12}},               // every octave moves
                     {{62, 64}, 2, 2, -10, {50, 64}, {2, 4}},                      // -10 rises to 2 in the cache
                     {{61, 64}, 1, 1, 13, {49, 64}, {4, 13}},                      // diff 12: down an octave
                     {{60, 64, 67}, 8, 10, 0, {60, 64, 67}, {0, 4, 7}}};           // no note there: nothing changes
  for (Case const& c : cases) {
    CChord chord = RootedChord(60, c.notes);
    chord.ChangeAllNotesWithinIntvlRange(c.lo, c.hi, c.to);
    EXPECT_EQ(NoteNrs(chord), c.result) << c.lo << ".." << c.hi << " -> " << c.to;
    EXPECT_EQ(Members(chord.IntvlSet()), c.cache) << c.lo << ".." << c.hi << " -> " << c.to;
  }
  CChord low = RootedChord(0, {2, 12});
  low.ChangeAllNotesWithinIntvlRange(2, 2, -10); // 2 - 12 clamps to 0
  EXPECT_EQ(NoteNrs(low), (Notes{0, 12}));
  CChord spelled = RootedChord(60, {60});
  spelled.AddNote(CNote(64, Enh_Flat)); // F flat, respelled when moved
  spelled.ChangeAllNotesWithinIntvlRange(4, 4, 4);
  EXPECT_EQ(spelled.HighestNote(), Nat(64));
}

} // namespace
