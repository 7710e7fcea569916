// Chord edits: setting from sets, transposing, inverting, placing lowest notes, the
// comping range and moving notes between intervals. Expected note numbers are
// counted out by hand from the octave rules or found by searching a note range.
#include "support/ChordBuilders.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <climits>
#include <set>
#include <string>
#include <vector>

namespace {

using namespace chordtest;

int PitchClass(long n) { return static_cast<int>(((n % 12) + 12) % 12); }

// ---- Setting from sets -------------------------------------------------------------

TEST(ChordSetFrom, NoteSetKeepsNotesAsGiven) {
  CChord chord = RootedChord(62, {62, 66});
  chord.SetFromNoteSet(CMySet<CNote>{CNote(61, Enh_Sharp), CNote(61, Enh_Flat), Nat(64)});
  EXPECT_EQ(chord.NoteCount(), 3u);
  EXPECT_EQ(chord.RootNote(), CNote(61, Enh_Flat));
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 3}));
  chord.SetFromNoteSet(CMySet<CNote>{});
  EXPECT_EQ(chord.RootNote(), CNote_Undef);
  EXPECT_TRUE(chord.IntvlSet().empty());
}

TEST(ChordSetFrom, NoteNrSetClampsAndSpells) {
  CChord chord = RootedChord(62, {62});
  chord.SetFromNoteNrSet(CMySet<int>{300, -5, 61, 255, 70});
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{0, 61, 70, 127, 255}));
  EXPECT_EQ(chord.Note(1).Enh(), Enh_Sharp);
  EXPECT_EQ(chord.Note(2).Enh(), Enh_Flat);
  EXPECT_EQ(chord.RootNote(), Nat(0));
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 1, 3, 7, 10}));
}

TEST(ChordSetFrom, KeyNrSetKeepsASpecifiedRootOnlyWhenItsPitchClassIsThere) {
  CChord plain(24);
  plain.SetFromKeyNrSet(CMySet<int>{0, 4, 7});
  EXPECT_EQ(NoteNrs(plain), (std::vector<long>{0, 4, 7}));
  EXPECT_EQ(plain.RootNote(), Nat(0));
  EXPECT_FALSE(plain.RootNoteSpecified());

  CChord kept = RootedChord(60, {50, 55});
  kept.SetFromKeyNrSet(CMySet<int>{0, 4, 7});
  EXPECT_EQ(NoteNrs(kept), (std::vector<long>{0, 4, 7}));
  EXPECT_EQ(kept.RootNote(), Nat(60));
  EXPECT_TRUE(kept.RootNoteSpecified());
  EXPECT_EQ(Members(kept.IntvlSet()), (Intvls{0, 4, 7}));

  CChord moved = RootedChord(60, {});
  moved.SetFromKeyNrSet(CMySet<int>{4, 7, 11});
  EXPECT_EQ(moved.RootNote(), Nat(4));
  EXPECT_TRUE(moved.RootNoteSpecified()); // left as it was
  EXPECT_EQ(Members(moved.IntvlSet()), (Intvls{0, 3, 7}));

  // Other values are clamped like note numbers; a root D4 finds its pitch class in 14.
  CChord clamped = RootedChord(62, {});
  clamped.SetFromKeyNrSet(CMySet<int>{-3, 14, 200});
  EXPECT_EQ(NoteNrs(clamped), (std::vector<long>{0, 14, 127}));
  EXPECT_EQ(clamped.RootNote(), Nat(62));

  CChord none = RootedChord(60, {60});
  none.SetFromKeyNrSet(CMySet<int>{});
  EXPECT_EQ(none.RootNote(), CNote_Undef);
  EXPECT_EQ(none.NoteCount(), 0u);
}

// ---- Transposing -------------------------------------------------------------------

TEST(ChordTranspose, NotesWrapAndFoldWhileTheRootClamps) {
  struct Case {
    std::vector<long> notes;
    long root;
    int t;
    std::vector<long> result;
    long resultRoot;
  } const cases[] = {
      {{5, 60}, 5, -10, {7, 50}, 0},      // -5 folds up to 7; the root clamps to 0
      {{120, 125}, 120, 10, {2, 7}, 127}, // 130, 135 wrap; re-sorted
      {{60, 64, 67}, 60, 2, {62, 66, 69}, 62},
      {{60}, 255, 0, {60}, 255},
      {{60}, 60, 300, {104}, 127},    // 360 % 128
      {{60}, 60, -300, {8}, 0},       // -240 % 128 = -112, then +12 ten times
      {{60}, 60, INT_MAX, {59}, 127}, // no overflow at the ends of int
      {{60}, 60, INT_MIN, {4}, 0},
  };
  for (Case const& c : cases) {
    CChord chord = RootedChord(c.root, c.notes);
    chord.Transpose(c.t);
    EXPECT_EQ(NoteNrs(chord), c.result) << c.t;
    EXPECT_EQ(chord.RootNote().NoteNr(), c.resultRoot) << c.t;
  }
  // A root landing on 255 is the undefined note.
  CNote high = CNote_Undef;
  high.SetKeyNr(0); // note 252
  CChord chord(24);
  chord.SetRootNote(high);
  chord.Transpose(3);
  EXPECT_EQ(chord.RootNote().NoteNr(), 255);
}

TEST(ChordTranspose, SpellingsAreKeptThenCheckedAndCoincidingNotesMerge) {
  CChord chord(24);
  chord.AddNote(CNote(61, Enh_Flat));
  chord.AddNote(CNote(61, Enh_Sharp));
  chord.Transpose(2); // Eb and D#
  EXPECT_EQ(chord.Note(0), CNote(63, Enh_Flat));
  EXPECT_EQ(chord.Note(1), CNote(63, Enh_Sharp));
  chord.Transpose(-1); // a flat D is not senseful: both become D
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{62}));

  CChord wrapped(24);
  wrapped.SetLowestNoteInOctave(11, 9, Enh_Natural); // note 131
  wrapped.AddNote(Nat(3));
  wrapped.Transpose(0); // 131 wraps to 3 and meets the E flat there
  EXPECT_EQ(NoteNrs(wrapped), (std::vector<long>{3}));
  EXPECT_EQ(wrapped.Note(0), CNote(3, Enh_Flat));
}

TEST(ChordTranspose, CacheAndFlagsAreUntouched) {
  CChord chord = RootedChord(60, {60, 74});
  chord.Transpose(5);
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 14}));
  EXPECT_TRUE(chord.RootNoteSpecified());
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{65, 79}));
}

// ---- Inverting ---------------------------------------------------------------------

TEST(ChordInvert, OctaveRules) {
  struct Case {
    std::vector<long> notes;
    std::vector<long> result;
  } const cases[] = {
      {{60, 64, 67}, {64, 67, 72}},
      {{60, 70}, {70, 72}}, // 0 not above 10: the octave above B flat's
      {{62, 72}, {72, 74}}, // 2 above 0: C5's own octave
      {{64, 67, 72}, {67, 72, 76}},
      {{60, 72}, {72, 84}}, // equal pitch classes go up
      {{100, 115}, {115, 124}},
      {{104, 119}, {116, 119}}, // highest at 116 or above: its own octave
      {{8, 120}, {120, 128}},   // 128..131 are kept
      {{11, 127}, {127, 131}},
      {{61}, {109}}, // alone: octave 8
      {{}, {}},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.Invert();
    EXPECT_EQ(NoteNrs(chord), c.result) << (c.notes.empty() ? -1 : c.notes.front());
  }
}

TEST(ChordInvert, KeepsSpellingRootAndCache) {
  CChord chord = RootedChord(60, {64, 67});
  chord.AddNote(CNote(61, Enh_Flat));
  Intvls const cache = Members(chord.IntvlSet());
  chord.Invert();
  EXPECT_EQ(chord.HighestNote(), CNote(73, Enh_Flat));
  EXPECT_EQ(chord.RootNote(), Nat(60));
  EXPECT_EQ(Members(chord.IntvlSet()), cache);

  // A note below 0 (from CNote::SetOct) takes its octave the same way.
  CNote below(61, Enh_Sharp);
  below.SetOct(-2); // note -1
  CChord negative(24);
  negative.AddNote(below);
  negative.AddNote(Nat(60));
  negative.Invert();
  EXPECT_EQ(NoteNrs(negative), (std::vector<long>{60, 71}));
}

// ---- Lowest notes ------------------------------------------------------------------

TEST(ChordLowestNote, ReplacesTheLowestNoteAtOrBelowTheNextOne) {
  struct Case {
    std::vector<long> notes;
    CNote n;
    std::vector<long> result;
  } const cases[] = {
      {{60, 64, 67}, Nat(62), {62, 64, 67}},
      {{60, 64, 67}, Nat(52), {64, 67}}, // E at or below E4 is E4 itself
      {{60, 64, 67}, Nat(55), {55, 64, 67}},
      {{60, 64, 67}, Nat(65), {53, 64, 67}},
      {{60, 72}, CNote(61, Enh_Flat), {61, 72}},
      {{60, 62}, Nat(2), {62}},         // only one D4
      {{}, CNote(63, Enh_Flat), {255}}, // at or below the undefined note 255
      {{}, Nat(60), {127}},             // 252, clamped
      {{60}, Nat(64), {127}},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.SetLowestNote(c.n);
    EXPECT_EQ(NoteNrs(chord), c.result) << c.n;
    EXPECT_EQ(chord.LowestNote().Enh(), c.n.Enh()) << c.n;
  }
}

TEST(ChordLowestNote, MarkIsSetWhenThePitchClassIsAmongTheOtherNotes) {
  // Under a specified root nothing rebuilds the cache afterwards, so the mark stays.
  CChord doubled = RootedChord(60, {60, 64, 67});
  doubled.SetLowestNote(Nat(55)); // G is also among E G
  EXPECT_TRUE(doubled.LowestNoteLonely());
  EXPECT_EQ(NoteNrs(doubled), (std::vector<long>{55, 64, 67}));
  EXPECT_EQ(Members(doubled.IntvlSet()), (Intvls{4, 7}));
  doubled.UpdateIntvlSet(); // the rebuild's sense: G is doubled, so not lonely
  EXPECT_FALSE(doubled.LowestNoteLonely());

  CChord alone = RootedChord(60, {60, 64, 67});
  alone.SetLowestNote(Nat(62)); // D is not among E G
  EXPECT_FALSE(alone.LowestNoteLonely());
  EXPECT_EQ(Members(alone.IntvlSet()), (Intvls{2, 4, 7}));
  alone.UpdateIntvlSet();
  EXPECT_TRUE(alone.LowestNoteLonely());

  CChord empty(24);
  empty.SetLowestNote(Nat(60)); // nothing remains to hold the pitch class
  EXPECT_FALSE(empty.LowestNoteLonely());
}

TEST(ChordLowestNote, InOctaveOnlyAdds) {
  struct Case {
    int keyNr, oct;
    TEnh enh;
    std::vector<long> notes;
    TEnh spelled; // of the added note
  } const cases[] = {
      {0, 4, Enh_Natural, {60, 64}, Enh_Natural},       {-1, 4, Enh_Natural, {60, 64, 71}, Enh_Natural},
      {13, 4, Enh_Flat, {60, 61, 64}, Enh_Flat},        {1, 4, Enh_Natural, {60, 61, 64}, Enh_Sharp},
      {7, 20, Enh_Natural, {60, 64, 127}, Enh_Natural}, {11, 9, Enh_Natural, {60, 64, 131}, Enh_Natural},
      {5, -7, Enh_Sharp, {5, 60, 64}, Enh_Sharp},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf({60, 64});
    chord.SetLowestNoteInOctave(c.keyNr, c.oct, c.enh);
    EXPECT_EQ(NoteNrs(chord), c.notes) << c.keyNr << " " << c.oct;
    for (CNote const& n : chord.Notes()) {
      if (n.NoteNr() == 60 || n.NoteNr() == 64) continue;
      EXPECT_EQ(n.Enh(), c.spelled) << c.keyNr << " " << c.oct;
    }
  }
  CChord chord = ChordOf({48, 60, 62, 71, 72});
  chord.SetLowestNoteAloneInOctave(2, 4, Enh_Natural);
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{48, 62, 72}));
}

// ---- Comping range -----------------------------------------------------------------

// The note of pitch class pc in the comping range 53..64.
long InCompingRange(int pc) {
  for (long n = 53; n <= 64; ++n)
    if (PitchClass(n) == pc) return n;
  return -1;
}

TEST(ChordComping, RootsLandInTheCompingRange) {
  for (long n = 0; n < 128; ++n) {
    for (TEnh e : {Enh_Flat, Enh_Natural, Enh_Sharp}) {
      CNote note(n, e);
      CChord chord = ChordOf({40});
      chord.SetRootNoteInCompingRange(note);
      EXPECT_EQ(chord.RootNote(), CNote(InCompingRange(PitchClass(n)), note.Enh())) << note;
      EXPECT_TRUE(chord.RootNoteSpecified());
    }
  }
  CChord undefinedRoot(24);
  undefinedRoot.SetRootNoteInCompingRange(CNote_Undef);
  EXPECT_EQ(undefinedRoot.RootNote(), CNote(63, Enh_Flat));

  for (int k = 0; k < 12; ++k) {
    CChord chord = ChordOf({40});
    chord.SetRootKeyNr(k);
    EXPECT_EQ(chord.RootNote(), Nat(InCompingRange(k))) << k;
    EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{PitchClass(40 - InCompingRange(k))})) << k;
  }
  struct Case {
    int keyNr;
    long root;
  } const outside[] = {{200, 127}, {207, 255}, {-100, 0}, {INT_MAX, 127}, {INT_MIN, 0}};
  for (Case const& c : outside) {
    CChord chord(24);
    chord.SetRootKeyNr(c.keyNr);
    EXPECT_EQ(chord.RootNote().NoteNr(), c.root) << c.keyNr;
  }

  CChord chord = ChordOf({40});
  chord.SetRootKeyNrAndBasicChord(9, CChord::bc_min); // A minor over the E
  EXPECT_EQ(chord.RootNote(), Nat(57));
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{40, 57, 60}));
  EXPECT_EQ(chord.BasicChord(), CChord::bc_min);
}

TEST(ChordComping, AddedIntervalsLandInTheCompingRange) {
  for (int root = 0; root < 12; ++root) {
    for (int i = -30; i <= 30; ++i) {
      CChord chord = RootedChord(36 + root, {});
      chord.AddIntvlInCompingRange(i);
      long expected = InCompingRange(PitchClass(root + i));
      ASSERT_EQ(NoteNrs(chord), std::vector<long>{expected}) << root << " " << i;
      EXPECT_TRUE(chord.Note(0).HasSensefulEnh());
      int folded = i;
      while (folded < 0) folded += 12;
      EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{folded % 24})) << root << " " << i;
      EXPECT_EQ(chord.RootNote(), Nat(36 + root));
    }
  }
}

// ---- Moving notes between intervals ------------------------------------------------

TEST(ChordChangeIntvls, SmallStepsGoUpLargeOnesDownByTheStepItself) {
  struct Case {
    std::vector<long> notes; // over root C4, cache fresh
    int lo, hi, to;
    std::vector<long> result;
    Intvls cache;
  } const cases[] = {
      {{60, 64, 67}, 4, 4, 3, {60, 63, 67}, {0, 3, 7}},
      {{60, 64, 67}, 4, 4, 9, {60, 67, 69}, {0, 7, 9}},   // diff 5: up
      {{60, 64, 67}, 4, 4, 10, {58, 60, 67}, {0, 7, 10}}, // diff 6: down 6
      {{60, 64, 67}, 0, 0, 7, {53, 64, 67}, {4, 7}},      // diff 7: a fifth below, on F
      {{60, 64, 67}, 7, 7, 0, {60, 64}, {0, 4}},          // diff -7: down onto C4
      {{60, 64, 67, 71}, 10, 11, 12, {60, 64, 67, 72}, {0, 4, 7, 12}},
      {{60, 64, 67, 74}, 1, 3, 0, {60, 64, 67, 72}, {0, 4, 7, 14}}, // the cache's 14 is not in 1..3
      {{48, 60, 72}, 0, 0, 4, {52, 64, 76}, {4, 12}},               // every octave moves
      {{62, 64}, 2, 2, -10, {50, 64}, {2, 4}},                      // diff -12; -10 rises to 2
      {{61, 64}, 1, 1, 13, {49, 64}, {4, 13}},                      // diff 12: down an octave
  };
  for (Case const& c : cases) {
    CChord chord = RootedChord(60, c.notes);
    chord.ChangeAllNotesWithinIntvlRange(c.lo, c.hi, c.to);
    SCOPED_TRACE(std::to_string(c.lo) + ".." + std::to_string(c.hi) + " -> " + std::to_string(c.to));
    EXPECT_EQ(NoteNrs(chord), c.result);
    EXPECT_EQ(Members(chord.IntvlSet()), c.cache);
    EXPECT_TRUE(chord.RootNoteSpecified());
  }
}

TEST(ChordChangeIntvls, ClampsRespellsAndLeavesAChordWithoutSuchNotesAlone) {
  CChord low = RootedChord(0, {2, 12});
  low.ChangeAllNotesWithinIntvlRange(2, 2, -10); // 2 - 12 clamps to 0
  EXPECT_EQ(NoteNrs(low), (std::vector<long>{0, 12}));

  CChord spelled = RootedChord(60, {60});
  spelled.AddNote(CNote(64, Enh_Flat)); // F flat
  spelled.ChangeAllNotesWithinIntvlRange(4, 4, 4);
  EXPECT_EQ(spelled.HighestNote(), Nat(64));

  CChord untouched = RootedChord(60, {60, 64, 67});
  untouched.AddIntvlInCompingRange(23); // B at 59, and 23 in the cache
  CChord const before = untouched;
  untouched.ChangeAllNotesWithinIntvlRange(8, 10, 0);
  EXPECT_EQ(untouched, before);
  EXPECT_EQ(Members(untouched.IntvlSet()), (Intvls{0, 4, 7, 23}));
  CChord empty(24);
  empty.ChangeAllNotesWithinIntvlRange(0, 11, 4);
  EXPECT_TRUE(empty.IntvlSet().empty());
}

} // namespace
