// The chord model: construction, the root, the notes, the lazily rebuilt interval
// cache and its lonely-lowest-note mark, the key number queries, comparisons, the
// undefined chord, and the chord type catalogue.
#include "support/ChordBuilders.h"

#include <tonvex/Chord.h>
#include <tonvex/ChordTypes.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <vector>

namespace {

using namespace chordtest;

TEST(ChordModel, RootNotesAndResets) {
  // The root follows the lowest note until it is specified; a root given to the
  // constructor does not survive the note set.
  CChord chord(Nat(64), CMySet<CNote>{Nat(64), Nat(60)}, 12);
  EXPECT_TRUE(chord.RootNote() == Nat(60) && !chord.RootNoteSpecified() && chord.IntvlSet().WrapIntvl() == 12);
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 4}));
  chord.SetRootNoteWithoutSpecify(Nat(64));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 8}));
  chord.AddNote(Nat(55));
  EXPECT_EQ(chord.RootNote(), Nat(55));
  chord.SetRootNote(Nat(62));
  chord.AddNote(Nat(50));
  EXPECT_TRUE(chord.RootNote() == Nat(62) && chord.RootNoteSpecified());
  chord.Init(); // the flags only
  EXPECT_TRUE(!chord.RootNoteSpecified() && chord.RootNote() == Nat(62) && chord.NoteCount() == 4);
  // Two spellings of one pitch stand side by side; indices past the end give the
  // undefined note.
  chord.AddNote(CNote(61, Enh_Flat));
  chord.AddNote(CNote(61, Enh_Sharp));
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{50, 55, 60, 61, 61, 64}));
  EXPECT_TRUE(chord.Note(3) == CNote(61, Enh_Flat) && chord.Note(~0UL) == CNote_Undef && chord.Intvl(99) == -1);
  EXPECT_TRUE(chord.HasNoteNr(61) && !chord.HasNote(Nat(62)) && chord.CountNotesInOctave(4) == 4);
  chord.DeleteAllNotesInOctave(4);
  chord.DelNote(0UL);
  EXPECT_EQ(NoteNrs(chord), std::vector<long>{55});
  EXPECT_TRUE(ChordOf({60, 72}).IsNarrowChord() && !ChordOf({60, 73}).IsNarrowChord());
  chord.SetUndefined();
  EXPECT_TRUE(chord.IsUndefined() && chord.RootNoteSpecified() && chord == CChord_Undef);
  EXPECT_TRUE(CChord_Undef.RootNote() == CNote(255, Enh_Flat) && CChord_Undef.IntvlSet().WrapIntvl() == 24);
  chord.Clear();
  EXPECT_TRUE(!chord.IsUndefined() && !chord.RootNoteSpecified() && chord.RootNote() == Nat(0));
  // Equal are chords of equal root (spelling included) and notes, whatever their
  // wrap interval, cache and flags.
  CChord const a = ChordOf({60, 64, 67});
  CChord otherSpelling = a;
  otherSpelling.SetRootNote(CNote(60, Enh_Sharp));
  for (CChord const& other : {otherSpelling, ChordOf({60, 64, 67, 72}), ChordOf({60, 63, 67})})
    EXPECT_TRUE(a != other && !(a == other) && !a.IsExactlyTheSame(other));
  EXPECT_TRUE(a == RootedChord(60, {67, 64, 60}) && a.IsExactlyTheSame(RootedChord(60, {60, 64, 67})));
}

// Under a root given first, notes go into the cache directly, unfolded; whatever
// marks the cache stale (deleting a note the chord does not hold too) makes the next
// query rebuild it from the notes, folded, with its lonely-lowest-note mark: the
// lowest note's pitch class alone, compared by the raw difference of the key numbers
// above the root's.
TEST(ChordIntvls, DirectInsertsAndTheRebuild) {
  CChord chord = RootedChord(60, {50, 60, 64, 67, 74});
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 2, 4, 7, 14}));
  EXPECT_FALSE(chord.LowestNoteLonely()); // never rebuilt, although D stands alone
  chord.DelNote(9UL);                     // out of range: nothing removed, nothing marked
  chord.DeleteAllNotesInOctave(7);
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 2, 4, 7, 14}));
  chord.DelNote(Nat(1));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 2, 4, 7}));
  EXPECT_FALSE(chord.LowestNoteLonely()); // D doubled by D5
  CChord folded(12);                      // wrap 12 folds direct inserts; notes below the root rise
  folded.SetRootNote(Nat(60));
  for (long n : {74L, 43L, 60L}) folded.AddNote(Nat(n));
  EXPECT_EQ(Members(folded.IntvlSet()), (Intvls{0, 2, 7}));
  EXPECT_EQ(Members(NotesThenRoot(Nat(255), {38, 52, 60, 67, 74, 81}).IntvlSet()), (Intvls{1, 4, 6, 9, 11}));
  struct Case {
    std::vector<long> notes;
    long root;
    bool lonely;
  } const cases[] = {{{50, 60, 64, 67}, 60, true},
                     {{48, 60, 64, 67}, 64, true}, // C doubled, but below E's key number: -4 is not 8
                     {{52, 64, 67}, 64, false},
                     {{60}, 60, true}};
  for (Case const& c : cases) {
    CChord const rebuilt = NotesThenRoot(Nat(c.root), c.notes);
    rebuilt.IntvlSet();
    EXPECT_EQ(rebuilt.LowestNoteLonely(), c.lonely) << c.notes.front() << " " << c.root;
  }
}

// Key number lists end at exactly -1 (or after their last value); other negative
// values are key numbers (-2 is 10). Over root E from every pitch class set, lists
// derived from it: HasExactTheseKeyNrs asks whether the intervals of the listed key
// numbers over E, ascending, begin with the chord's, HasKeyNrs whether each is there.
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
    lists[3].front() -= 36;               // the same pitch class, three octaves down
    for (std::vector<int> list : lists) {
      std::set<int> listed;
      for (int k : list) listed.insert(((k - 4) % 12 + 12) % 12);
      bool const exact = intvls.size() <= listed.size() && std::equal(intvls.begin(), intvls.end(), listed.begin());
      bool const all = std::all_of(list.begin(), list.end(), [&](int k) { return chord.HasKeyNr(k); });
      list.push_back(-1);
      list.push_back(5); // after the end
      ASSERT_EQ(chord.HasExactTheseKeyNrsFromList(list.data(), list.size()), exact) << mask;
      ASSERT_EQ(chord.HasKeyNrsFromList(list.data(), list.size()), all) << mask;
    }
  }
  CChord const empty(24), ninth = RootedChord(62, {76}); // 14 names pitch class 4, but is no member
  EXPECT_TRUE(empty.HasKeyNrs(-1) && !empty.HasKeyNrs(2, -1) && empty.HasExactTheseKeyNrs(2, -1));
  EXPECT_TRUE(ninth.KeyNrSet() == CMySet<int>{4} && !ninth.HasKeyNr(4));
}

// Built-in types are found by id and, where XG has the type (the id is its XG number
// + 1), recognised as it; user types are kept apart and unique by id.
TEST(ChordTypes, CatalogueAndUserTypes) {
  CChordTypes types;
  std::set<CChordTypeId> ids;
  for (CChordType const& type : types.BuiltInTypes()) {
    EXPECT_TRUE(ids.insert(type.Id()).second && type.Tag() == 0 && type.Intvls().WrapIntvl() == 24) << type.Name();
    EXPECT_EQ(types.ChordTypeBuiltInFromId(type.Id())->Name(), type.Name());
    std::vector<long> notes;
    for (int i : type.Intvls()) notes.push_back(60 + i);
    EXPECT_TRUE(type.Id() >= 100 || NotesThenRoot(Nat(60), notes).XGChordIx() + 1 == type.Id()) << type.Name();
  }
  EXPECT_EQ(ids.size(), 17u);
  EXPECT_EQ(types.ChordTypeBuiltInFromId(99), types.BuiltInTypes().end());
  EXPECT_TRUE(types.AddUserType(CChordType(500, "quartal", CIntvlSet(24, 0, 5, 10, -1), 7)));
  EXPECT_TRUE(types.AddUserType(CChordType(1, "power", CIntvlSet(12, 0, 7, -1), -3)));
  EXPECT_FALSE(types.AddUserType(CChordType(500, "other", CIntvlSet(24, 0, -1), 0)));
  *types.ChordTypeUserFromId(500) = CChordType(500, "quartal 4", CIntvlSet(24, 0, 5, 10, 15, -1), 8);
  CChordTypes const& view = types;
  EXPECT_TRUE(view.ChordTypeUserFromId(500)->Name() == "quartal 4" && view.UserTypes().size() == 2);
  EXPECT_TRUE(view.ChordTypeUserFromId(1)->Tag() == -3 && view.ChordTypeBuiltInFromId(1)->Name() == "major");
  EXPECT_EQ(view.ChordTypeUserFromId(9), view.UserTypes().end());
}

} // namespace
