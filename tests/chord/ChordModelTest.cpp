// The chord model: construction, the root, the notes, the lazily rebuilt interval
// cache and its lonely-lowest-note mark, the key number queries, comparisons and the
// undefined chord. Expectations are counted out by hand or from std::set models.
#include "support/ChordBuilders.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>
#include <vector>

namespace {

using namespace chordtest;

// ---- Construction ------------------------------------------------------------------

TEST(ChordModel, ConstructorsAndResets) {
  CChord empty(12);
  EXPECT_EQ(empty.RootNote(), Nat(0));
  EXPECT_EQ(empty.NoteCount(), 0u);
  EXPECT_TRUE(empty.IntvlSet().empty());
  EXPECT_EQ(empty.IntvlSet().WrapIntvl(), 12);
  EXPECT_FALSE(empty.RootNoteSpecified());
  EXPECT_FALSE(empty.LowestNoteLonely());
  EXPECT_EQ(CChord().IntvlSet().WrapIntvl(), 24);

  // The given root does not survive the note set.
  CChord fromNotes(Nat(64), CMySet<CNote>{Nat(60), Nat(55)}, 24);
  EXPECT_EQ(fromNotes.RootNote(), Nat(55));
  EXPECT_FALSE(fromNotes.RootNoteSpecified());
  EXPECT_EQ(Members(fromNotes.IntvlSet()), (Intvls{0, 5}));
  CChord fromNothing(Nat(64), CMySet<CNote>{}, 24);
  EXPECT_EQ(fromNothing.RootNote(), CNote_Undef);
  EXPECT_FALSE(fromNothing.RootNoteSpecified());

  CChord chord = ChordOf({60, 64, 67});
  chord.SetRootNote(Nat(62));
  chord.Init(); // flags only
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(chord.RootNote(), Nat(62));
  EXPECT_EQ(chord.NoteCount(), 3u);

  chord.SetUndefined();
  EXPECT_TRUE(chord.IsUndefined());
  EXPECT_TRUE(chord.RootNoteSpecified());
  EXPECT_EQ(chord.RootNote(), CNote_Undef);
  EXPECT_EQ(chord.NoteCount(), 0u);
  EXPECT_TRUE(chord.IntvlSet().empty());
  EXPECT_EQ(chord.IntvlSet().WrapIntvl(), 24);

  chord.Clear();
  EXPECT_FALSE(chord.IsUndefined());
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(chord.RootNote(), Nat(0));
}

TEST(ChordModel, UndefinedChord) {
  EXPECT_TRUE(CChord_Undef.IsUndefined());
  EXPECT_EQ(CChord_Undef.RootNote().NoteNr(), 255);
  EXPECT_EQ(CChord_Undef.RootNote().Enh(), Enh_Flat);
  EXPECT_TRUE(CChord_Undef.RootNoteSpecified());
  EXPECT_EQ(CChord_Undef.NoteCount(), 0u);
  EXPECT_TRUE(CChord_Undef.IntvlSet().empty());
  EXPECT_EQ(CChord_Undef.IntvlSet().WrapIntvl(), 24);
  EXPECT_EQ(CChord_Undef.BasicChord(), CChord::bc_none);
  EXPECT_EQ(CChord_Undef.XGChordIx(), 34);
  EXPECT_EQ(CChord_Undef, CChord(CNote_Undef, CChord::bc_none, 12));
}

// ---- Root and notes ----------------------------------------------------------------

TEST(ChordModel, RootFollowsTheLowestNoteUntilSpecified) {
  CChord chord(24);
  chord.AddNote(Nat(64));
  chord.AddNote(Nat(60));
  EXPECT_EQ(chord.RootNote(), Nat(60));
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4}));

  chord.SetRootNoteWithoutSpecify(Nat(64));
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 8}));
  chord.AddNote(Nat(55)); // not specified: the root follows the new lowest note
  EXPECT_EQ(chord.RootNote(), Nat(55));

  chord.SetRootNote(Nat(62));
  chord.AddNote(Nat(50));
  EXPECT_EQ(chord.RootNote(), Nat(62));
  EXPECT_TRUE(chord.RootNoteSpecified());
}

TEST(ChordModel, NoteAccessAndOctaves) {
  CChord chord(24);
  EXPECT_EQ(chord.LowestNote(), CNote_Undef);
  EXPECT_EQ(chord.HighestNote(), CNote_Undef);
  EXPECT_EQ(chord.Note(0), CNote_Undef);
  EXPECT_EQ(chord.Intvl(0), -1);
  EXPECT_TRUE(chord.IsNarrowChord());

  for (CNote n : {CNote(61, Enh_Flat), CNote(61, Enh_Sharp), Nat(48), Nat(72), Nat(71)}) chord.AddNote(n);
  chord.AddNote(CNote(61, Enh_Sharp)); // already there
  EXPECT_EQ(chord.NoteCount(), 5u);
  EXPECT_EQ(chord.Note(1), CNote(61, Enh_Flat)); // two spellings of one pitch, flat first
  EXPECT_EQ(chord.Note(2), CNote(61, Enh_Sharp));
  EXPECT_EQ(chord.Note(5), CNote_Undef);
  EXPECT_EQ(chord.Note(~0UL), CNote_Undef);
  EXPECT_EQ(chord.LowestNote(), Nat(48));
  EXPECT_EQ(chord.HighestNote(), Nat(72));
  EXPECT_TRUE(chord.HasNote(CNote(61, Enh_Flat)));
  EXPECT_FALSE(chord.HasNote(Nat(62)));
  EXPECT_TRUE(chord.HasNoteNr(71));
  EXPECT_FALSE(chord.HasNoteNr(60));
  EXPECT_EQ(chord.CountNotesInOctave(4), 3);
  EXPECT_EQ(chord.CountNotesInOctave(3), 1);
  EXPECT_EQ(chord.CountNotesInOctave(5), 1);
  EXPECT_EQ(chord.Intvl(1), 1);
  EXPECT_EQ(chord.Intvl(99), -1);

  chord.DeleteAllNotesInOctave(4);
  EXPECT_EQ(chord.NoteCount(), 2u);
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0}));
  chord.DelNote(1UL);
  EXPECT_EQ(chord.HighestNote(), Nat(48));
}

TEST(ChordModel, NarrowChords) {
  struct Case {
    std::vector<long> notes;
    bool narrow;
  } const cases[] = {{{60}, true}, {{60, 72}, true}, {{60, 73}, false}, {{48, 55, 59}, true}, {{48, 64}, false}};
  for (Case const& c : cases) EXPECT_EQ(ChordOf(c.notes).IsNarrowChord(), c.narrow) << c.notes.back();
}

TEST(ChordModel, EqualityComparesRootAndNotesOnly) {
  CChord a = ChordOf({60, 64, 67});
  CChord b(12); // other wrap interval, cache and flags
  b.SetRootNote(Nat(60));
  for (long n : {67L, 64L, 60L}) b.AddNote(Nat(n));
  CChord otherRoot = a;
  otherRoot.SetRootNote(Nat(64));
  CChord otherSpelling = a;
  otherSpelling.SetRootNote(CNote(60, Enh_Sharp));
  CChord moreNotes = ChordOf({60, 64, 67, 72});
  CChord otherNote = ChordOf({60, 63, 67});
  struct Case {
    CChord const& other;
    bool same;
  } const cases[] = {{b, true}, {otherRoot, false}, {otherSpelling, false}, {moreNotes, false}, {otherNote, false}};
  for (Case const& c : cases) {
    EXPECT_EQ(a == c.other, c.same);
    EXPECT_EQ(a != c.other, !c.same);
    EXPECT_EQ(a.IsExactlyTheSame(c.other), c.same);
    EXPECT_EQ(c.other.IsExactlyTheSame(a), c.same);
  }
}

// ---- The interval cache ------------------------------------------------------------

TEST(ChordIntvls, DirectInsertsLastUntilSomethingMarksTheCacheStale) {
  CChord chord(24);
  chord.SetRootNote(Nat(60));
  chord.AddNote(Nat(74)); // D5: the unfolded ninth
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{14}));
  EXPECT_TRUE(chord.HasIntvl(14));
  EXPECT_TRUE(chord.HasIntvlInAnyOctave(2));
  chord.DelNote(1UL); // out of range: nothing removed, nothing marked
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{14}));
  chord.DeleteAllNotesInOctave(7); // no note there
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{14}));
  chord.DelNote(Nat(50)); // not in the chord, yet the cache is stale now
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{2}));

  // With wrap 12 the direct insert folds, and notes below the root rise by octaves.
  CChord folded(12);
  folded.SetRootNote(Nat(60));
  for (long n : {74L, 43L, 60L}) folded.AddNote(Nat(n));
  EXPECT_EQ(Members(folded.IntvlSet()), (Intvls{0, 2, 7}));
}

TEST(ChordIntvls, RebuildFoldsEveryNoteIntoOneOctave) {
  CChord chord = ChordOf({38, 52, 60, 67, 74, 81});
  chord.SetRootNote(Nat(60)); // root C: D, E, C, G, D, A
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 2, 4, 7, 9}));
  chord.SetRootNote(Nat(255)); // the undefined root counts as pitch class 3
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{11, 1, 9, 4, 6}));
}

TEST(ChordIntvls, LonelyLowestNoteAfterARebuild) {
  struct Case {
    std::vector<long> notes;
    long root;
    bool lonely;
  } const cases[] = {
      {{50, 60, 64, 67}, 60, true},  // D alone
      {{50, 62, 64, 67}, 60, false}, // D doubled
      {{48, 60, 64, 67}, 64, true},  // C doubled, but below E's pitch class: raw -4 is not 8
      {{52, 64, 67}, 64, false},     // E doubled over root E
      {{60}, 60, true},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.SetRootNote(Nat(c.root));
    chord.UpdateIntvlSet();
    EXPECT_EQ(chord.LowestNoteLonely(), c.lonely) << c.notes.front() << " over " << c.root;
  }
  CChord emptied = ChordOf({60});
  emptied.DelNote(Nat(60));
  EXPECT_TRUE(emptied.IntvlSet().empty());
  EXPECT_TRUE(emptied.LowestNoteLonely());
}

TEST(ChordIntvls, LonelyMarkIsNotComputedWhileTheRootPrecedesTheNotes) {
  CChord chord(24);
  chord.SetRootNote(Nat(60));
  for (long n : {50L, 60L, 64L, 67L}) chord.AddNote(Nat(n));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 2, 4, 7}));
  EXPECT_FALSE(chord.LowestNoteLonely()); // never rebuilt, although D stands alone
  chord.DelNote(Nat(1));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 2, 4, 7}));
  EXPECT_TRUE(chord.LowestNoteLonely());
}

TEST(ChordIntvls, IntervalIndexToNote) {
  CChord chord = ChordOf({52, 60, 64, 67, 76});
  chord.SetRootNote(Nat(60)); // intervals {0, 4, 7}
  EXPECT_EQ(chord.IntvlIxToNote(0), Nat(60));
  EXPECT_EQ(chord.IntvlIxToNote(1), Nat(52)); // the first E, lowest first
  EXPECT_EQ(chord.IntvlIxToNote(2), Nat(67));
  EXPECT_EQ(chord.IntvlIxToNote(3), Nat(52)); // out of range: the lowest note
  EXPECT_EQ(chord.IntvlIxToNote(-1), Nat(52));
  EXPECT_EQ(chord.IntvlIxToKeyNr(2), 7);
  EXPECT_EQ(chord.IntvlIxToKeyName(2), "G");
  EXPECT_EQ(CChord(24).IntvlIxToNote(0), CNote_Undef);
  EXPECT_EQ(CChord(24).IntvlIxToKeyNr(0), 3);
}

// ---- Key numbers -------------------------------------------------------------------

TEST(ChordKeyNrs, KeyNrSetAndSingleKeyNrs) {
  CChord chord = ChordOf({62, 66, 69, 72});
  EXPECT_EQ(chord.KeyNrSet(), (CMySet<int>{0, 2, 6, 9}));
  for (int k = -30; k < 30; ++k) {
    int pc = ((k % 12) + 12) % 12;
    EXPECT_EQ(chord.HasKeyNr(k), pc == 0 || pc == 2 || pc == 6 || pc == 9) << k;
  }
  // Intervals inserted above the octave name their pitch class.
  CChord ninth(24);
  ninth.SetRootNote(Nat(62));
  ninth.AddNote(Nat(76));
  EXPECT_EQ(ninth.KeyNrSet(), (CMySet<int>{4}));
  EXPECT_FALSE(ninth.HasKeyNr(4)); // the cache holds 14, not 2
  EXPECT_TRUE(CChord(24).KeyNrSet().empty());
}

TEST(ChordKeyNrs, ListsEndAtExactlyMinusOne) {
  CChord chord = ChordOf({62, 66, 69}); // D major
  CChord empty(24);
  struct Case {
    bool result;
    bool expected;
  } const cases[] = {
      {chord.HasKeyNrs(-1), true},
      {empty.HasKeyNrs(-1), true},
      {empty.HasKeyNrs(2, -1), false},
      {chord.HasKeyNrs(2, 6, -1), true},
      {chord.HasKeyNrs(9, 2, 6, 9, -1), true},
      {chord.HasKeyNrs(2, -3, -1), true},  // -3 is key number 9
      {chord.HasKeyNrs(2, -2, -1), false}, // -2 is key number 10
      {chord.HasKeyNrs(2, -1, 5), true},   // 5 lies after the end
      {chord.HasKeyNrs(2, 6, 9), true},    // no end value: the list ends with it
      {chord.HasKeyNrs(2, 6, 10), false},
      {chord.HasKeyNrs(14, 18, -1), true},
      {chord.HasExactTheseKeyNrs(2, 6, 9, -1), true},
      {chord.HasExactTheseKeyNrs(9, 6, 2, -1), true},
      {chord.HasExactTheseKeyNrs(-10, 6, 9, -1), true},
      {chord.HasExactTheseKeyNrs(2, 6, 9, 11, -1), true}, // the list may go on
      {chord.HasExactTheseKeyNrs(2, 6, -1), false},       // the cache may not
      {chord.HasExactTheseKeyNrs(2, 6, -1, 9), false},
      {chord.HasExactTheseKeyNrs(2, 5, 9, -1), false},
      {chord.HasExactTheseKeyNrs(-1), false},
      {empty.HasExactTheseKeyNrs(2, -1), true},
      {empty.HasExactTheseKeyNrs(-1), true},
  };
  for (std::size_t i = 0; i < sizeof cases / sizeof cases[0]; ++i)
    EXPECT_EQ(cases[i].result, cases[i].expected) << "case " << i;
}

TEST(ChordKeyNrs, ExactKeyNrsMatchTheOneSidedComparisonOnEverySet) {
  // Chords over root E from every pitch class set, against lists derived from it.
  for (unsigned mask = 1; mask < 4096; ++mask) {
    CChord chord(24);
    std::vector<int> keys;
    for (int i = 0; i < 12; ++i)
      if (mask & (1u << i)) {
        chord.AddNote(Nat(64 + i));
        keys.push_back((4 + i) % 12);
      }
    chord.SetRootNote(Nat(64));
    std::vector<int> const intvls(chord.IntvlSet().begin(), chord.IntvlSet().end());
    std::vector<std::vector<int>> lists = {keys, keys, keys, keys};
    lists[1].pop_back();                  // one fewer
    lists[2].push_back(keys.front() + 1); // maybe one more
    lists[3].front() = keys.front() + 36; // the same pitch class, three octaves up
    for (std::vector<int> list : lists) {
      // The intervals of the listed key numbers over E, ascending, must begin with
      // the chord's intervals.
      std::set<int> listed;
      for (int k : list) listed.insert(((k - 4) % 12 + 12) % 12);
      bool expected = intvls.size() <= listed.size() && std::equal(intvls.begin(), intvls.end(), listed.begin());
      list.push_back(-1);
      ASSERT_EQ(chord.HasExactTheseKeyNrsFromList(list.data(), list.size()), expected) << mask;
      bool all = std::all_of(list.begin(), list.end() - 1, [&](int k) { return chord.HasKeyNr(k); });
      ASSERT_EQ(chord.HasKeyNrsFromList(list.data(), list.size()), all) << mask;
    }
  }
}

// ---- Whole-chord helpers -----------------------------------------------------------

TEST(ChordModel, UseAllMemberFunctionsLeavesTheChordAsItWas) {
  CChord chord(24);
  chord.SetRootNote(CNote(61, Enh_Sharp));
  for (long n : {49L, 61L, 65L, 68L, 75L}) chord.AddNote(Nat(n)); // cache fresh, 14 inside
  CIntvlSet const cache = chord.IntvlSet();
  CChord const before = chord;
  chord.UseAllMemberFunctions();
  EXPECT_EQ(chord, before);
  EXPECT_EQ(Members(chord.IntvlSet()), Members(cache));
  EXPECT_TRUE(chord.HasIntvl(14));
  EXPECT_TRUE(chord.RootNoteSpecified());
  EXPECT_FALSE(chord.LowestNoteLonely());
}

// Naming a wide chord respells its stored bass (G flat under C major becomes F sharp);
// the diagnostic caller works on a copy and leaves it alone.
TEST(ChordModel, UseAllNonDestructiveMemberFunctionsKeepsSpellings) {
  CChord chord(24);
  chord.AddNote(CNote(54, Enh_Flat));
  for (long n : {60L, 64L, 67L}) chord.AddNote(Nat(n));
  chord.SetRootNote(Nat(60));
  ASSERT_EQ(chord.LowestNote().Enh(), Enh_Flat);
  chord.UseAllNonDestructiveMemberFunctions();
  EXPECT_EQ(chord.LowestNote().Enh(), Enh_Flat);
  chord.Name(DefaultChordnamePref);
  EXPECT_EQ(chord.LowestNote().Enh(), Enh_Sharp);
}

} // namespace
