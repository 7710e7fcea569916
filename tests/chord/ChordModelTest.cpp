// The chord model: construction, the root, the notes, the lazily rebuilt interval
// cache and its lonely-lowest-note mark, the key number queries, comparisons and the
// undefined chord. Expectations are counted out by hand or come from models.
#include "support/ChordBuilders.h"

#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <vector>

namespace {

using namespace chordtest;

TEST(ChordModel, ConstructionAndResets) {
  CChord const empty(12);
  EXPECT_EQ(empty.RootNote(), Nat(0));
  EXPECT_TRUE(empty.IntvlSet().empty() && empty.IntvlSet().WrapIntvl() == 12 && !empty.RootNoteSpecified());
  // The given root does not survive the note set.
  CChord const fromNotes(Nat(64), CMySet<CNote>{Nat(60), Nat(55)}, 24);
  EXPECT_EQ(fromNotes.RootNote(), Nat(55));
  EXPECT_FALSE(fromNotes.RootNoteSpecified());
  EXPECT_EQ(Members(fromNotes.IntvlSet()), (Intvls{0, 5}));
  EXPECT_EQ(CChord(Nat(64), CMySet<CNote>{}, 24).RootNote(), CNote_Undef);

  CChord chord = ChordOf({60, 64, 67});
  chord.SetRootNote(Nat(62));
  chord.Init(); // the flags only
  EXPECT_FALSE(chord.RootNoteSpecified());
  EXPECT_EQ(chord.RootNote(), Nat(62));
  EXPECT_EQ(chord.NoteCount(), 3u);
  chord.SetUndefined();
  EXPECT_TRUE(chord.IsUndefined() && chord.RootNoteSpecified() && chord.NoteCount() == 0);
  EXPECT_EQ(chord, CChord_Undef);
  EXPECT_EQ(CChord_Undef.RootNote(), CNote(255, Enh_Flat));
  EXPECT_EQ(CChord_Undef.IntvlSet().WrapIntvl(), 24);
  EXPECT_EQ(CChord_Undef.XGChordIx(), 34);
  chord.Clear();
  EXPECT_FALSE(chord.IsUndefined() || chord.RootNoteSpecified());
  EXPECT_EQ(chord.RootNote(), Nat(0));
}

TEST(ChordModel, RootFollowsTheLowestNoteUntilSpecified) {
  CChord chord(24);
  chord.AddNote(Nat(64));
  chord.AddNote(Nat(60));
  EXPECT_EQ(chord.RootNote(), Nat(60));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4}));
  chord.SetRootNoteWithoutSpecify(Nat(64));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 8}));
  chord.AddNote(Nat(55));
  EXPECT_EQ(chord.RootNote(), Nat(55));
  chord.SetRootNote(Nat(62));
  chord.AddNote(Nat(50));
  EXPECT_EQ(chord.RootNote(), Nat(62));
  EXPECT_TRUE(chord.RootNoteSpecified());
}

TEST(ChordModel, NotesOctavesAndComparison) {
  CChord chord(24);
  EXPECT_EQ(chord.LowestNote(), CNote_Undef);
  EXPECT_EQ(chord.Intvl(0), -1);
  for (CNote n : {CNote(61, Enh_Flat), CNote(61, Enh_Sharp), Nat(48), Nat(72), Nat(71), CNote(61, Enh_Sharp)})
    chord.AddNote(n);
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{48, 61, 61, 71, 72})); // two spellings of one pitch
  EXPECT_EQ(chord.Note(1), CNote(61, Enh_Flat));
  EXPECT_EQ(chord.Note(~0UL), CNote_Undef);
  EXPECT_EQ(chord.HighestNote(), Nat(72));
  EXPECT_TRUE(chord.HasNote(CNote(61, Enh_Flat)) && !chord.HasNote(Nat(62)));
  EXPECT_TRUE(chord.HasNoteNr(71) && !chord.HasNoteNr(60));
  EXPECT_EQ(chord.CountNotesInOctave(4), 3);
  EXPECT_EQ(chord.Intvl(1), 1);
  chord.DeleteAllNotesInOctave(4);
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{48, 72}));
  EXPECT_EQ(Members(chord.IntvlSet()), Intvls{0});
  chord.DelNote(1UL);
  EXPECT_EQ(NoteNrs(chord), std::vector<long>{48});
  EXPECT_TRUE(ChordOf({60, 72}).IsNarrowChord());
  EXPECT_FALSE(ChordOf({60, 73}).IsNarrowChord());

  // Equal are chords of equal root (spelling included) and notes; the wrap interval,
  // cache and flags do not count.
  CChord const a = ChordOf({60, 64, 67});
  CChord otherSpelling = a;
  otherSpelling.SetRootNote(CNote(60, Enh_Sharp));
  struct {
    CChord other;
    bool same;
  } const cases[] = {{RootedChord(60, {67, 64, 60}), true},
                     {otherSpelling, false},
                     {ChordOf({60, 64, 67, 72}), false},
                     {ChordOf({60, 63, 67}), false}};
  for (auto const& c : cases) {
    EXPECT_EQ(a == c.other, c.same);
    EXPECT_EQ(a != c.other, !c.same);
    EXPECT_EQ(a.IsExactlyTheSame(c.other), c.same);
  }
}

// Under a root given first, notes go into the cache directly, unfolded; whatever
// marks the cache stale (even deleting a note the chord does not hold) makes the
// next query rebuild it from the notes, folded, with its lonely-lowest-note mark.
TEST(ChordIntvls, DirectInsertsLastUntilTheCacheIsRebuilt) {
  CChord chord = RootedChord(60, {74});
  EXPECT_EQ(Members(chord.IntvlSet()), Intvls{14});
  EXPECT_TRUE(chord.HasIntvlInAnyOctave(2));
  chord.DelNote(1UL); // out of range: nothing removed, nothing marked
  chord.DeleteAllNotesInOctave(7);
  EXPECT_EQ(Members(chord.IntvlSet()), Intvls{14});
  chord.DelNote(Nat(50));
  EXPECT_EQ(Members(chord.IntvlSet()), Intvls{2});
  CChord folded(12); // wrap 12 folds the direct inserts; notes below the root rise
  folded.SetRootNote(Nat(60));
  for (long n : {74L, 43L, 60L}) folded.AddNote(Nat(n));
  EXPECT_EQ(Members(folded.IntvlSet()), (Intvls{0, 2, 7}));
  CChord lonely = RootedChord(60, {50, 60, 64, 67});
  EXPECT_FALSE(lonely.LowestNoteLonely()); // never rebuilt, although D stands alone
  lonely.DelNote(Nat(1));
  EXPECT_EQ(Members(lonely.IntvlSet()), (Intvls{0, 2, 4, 7}));
  EXPECT_TRUE(lonely.LowestNoteLonely());
  CChord undefinedRoot = NotesThenRoot(Nat(255), {38, 52, 60, 67, 74, 81});
  EXPECT_EQ(Members(undefinedRoot.IntvlSet()), (Intvls{1, 4, 6, 9, 11})); // the pitch class of 255 is 3
}

// The mark after a rebuild: the lowest note's pitch class stands alone, compared by
// the raw difference of the key numbers above the root's.
TEST(ChordIntvls, LonelyLowestNoteAfterARebuild) {
  struct Case {
    std::vector<long> notes;
    long root;
    bool lonely;
  } const cases[] = {{{50, 60, 64, 67}, 60, true},
                     {{50, 62, 64, 67}, 60, false},
                     {{48, 60, 64, 67}, 64, true}, // C doubled, but below E's key number: -4 is not 8
                     {{52, 64, 67}, 64, false},
                     {{60}, 60, true}};
  for (Case const& c : cases) {
    CChord const chord = NotesThenRoot(Nat(c.root), c.notes);
    chord.IntvlSet(); // rebuilds
    EXPECT_EQ(chord.LowestNoteLonely(), c.lonely) << c.notes.front() << " " << c.root;
  }
}

TEST(ChordIntvls, IntervalIndexToNote) {
  CChord const chord = NotesThenRoot(Nat(60), {52, 60, 64, 67, 76}); // {0, 4, 7}
  EXPECT_EQ(chord.IntvlIxToNote(1), Nat(52));                        // the first E, lowest first
  EXPECT_EQ(chord.IntvlIxToNote(2), Nat(67));
  EXPECT_EQ(chord.IntvlIxToNote(3), Nat(52)); // out of range: the lowest note
  EXPECT_EQ(chord.IntvlIxToKeyName(2), "G");
  EXPECT_EQ(CChord(24).IntvlIxToNote(0), CNote_Undef);
  EXPECT_EQ(CChord(24).IntvlIxToKeyNr(0), 3);
}

// Key number lists end at exactly -1 (or after their last value); other negative
// values are key numbers (-2 is 10).
TEST(ChordKeyNrs, ListsEndAtExactlyMinusOne) {
  CChord const chord = ChordOf({62, 66, 69}), empty(24);
  EXPECT_EQ(chord.KeyNrSet(), (CMySet<int>{2, 6, 9}));
  EXPECT_TRUE(empty.KeyNrSet().empty());
  bool const cases[][2] = {{chord.HasKeyNrs(-1), true},
                           {empty.HasKeyNrs(2, -1), false},
                           {chord.HasKeyNrs(2, -3, -1), true},
                           {chord.HasKeyNrs(2, -2, -1), false},
                           {chord.HasKeyNrs(2, -1, 5), true},
                           {chord.HasKeyNrs(2, 6, 10), false},
                           {chord.HasKeyNrs(14, 18, -1), true},
                           {chord.HasExactTheseKeyNrs(-10, 6, 9, -1), true},
                           {chord.HasExactTheseKeyNrs(2, 6, 9, 11, -1), true}, // the list may go on
                           {chord.HasExactTheseKeyNrs(2, 6, -1), false},       // the cache may not
                           {chord.HasExactTheseKeyNrs(2, 6, -1, 9), false},
                           {chord.HasExactTheseKeyNrs(-1), false},
                           {empty.HasExactTheseKeyNrs(2, -1), true}};
  for (std::size_t i = 0; i < std::size(cases); ++i) EXPECT_EQ(cases[i][0], cases[i][1]) << "case " << i;
  // Intervals inserted above the octave name their pitch class but are no member.
  CChord const ninth = RootedChord(62, {76});
  EXPECT_EQ(ninth.KeyNrSet(), CMySet<int>{4});
  EXPECT_FALSE(ninth.HasKeyNr(4));
}

// Chords over root E from every pitch class set, against lists derived from it: the
// intervals of the listed key numbers over E, ascending, must begin with the chord's.
TEST(ChordKeyNrs, KeyNrListsOnEveryPitchClassSet) {
  for (unsigned mask = 1; mask < 4096; ++mask) {
    std::vector<long> notes;
    std::vector<int> keys;
    for (int i = 0; i < 12; ++i)
      if (mask >> i & 1u) {
        notes.push_back(64 + i);
        keys.push_back((4 + i) % 12);
      }
    CChord const chord = NotesThenRoot(Nat(64), notes);
    std::vector<int> const intvls(chord.IntvlSet().begin(), chord.IntvlSet().end());
    std::vector<std::vector<int>> lists = {keys, keys, keys, keys};
    lists[1].pop_back();                  // one fewer
    lists[2].push_back(keys.front() + 1); // maybe one more
    lists[3].front() += 36;               // the same pitch class, three octaves up
    for (std::vector<int> list : lists) {
      std::set<int> listed;
      for (int k : list) listed.insert(((k - 4) % 12 + 12) % 12);
      bool const exact = intvls.size() <= listed.size() && std::equal(intvls.begin(), intvls.end(), listed.begin());
      bool const all = std::all_of(list.begin(), list.end(), [&](int k) { return chord.HasKeyNr(k); });
      list.push_back(-1);
      ASSERT_EQ(chord.HasExactTheseKeyNrsFromList(list.data(), list.size()), exact) << mask;
      ASSERT_EQ(chord.HasKeyNrsFromList(list.data(), list.size()), all) << mask;
    }
  }
}

} // namespace
