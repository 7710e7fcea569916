// The chord model: construction, the root, the notes, the lazily rebuilt interval
// cache and its lonely-lowest-note mark, the key number queries, comparisons, the
// undefined chord, and the chord type catalogue.
#include "support/ChordBuilders.h"
#include "support/TestPrelude.h"

namespace {

using namespace chordtest;

TEST(ChordModel, RootNotesAndResets) {
  // The root follows the lowest note until it is specified; a root given to the
  // constructor does not survive the note set.
  CChord chord(Nat(64), CMySet<CNote>{Nat(64), Nat(60)}, 12);
  EXPECT_TRUE(chord.RootNote() == Nat(60) && !chord.RootNoteSpecified() && chord.IntvlSet().WrapIntvl() == 12);
  chord.AddNote(Nat(55));
  EXPECT_EQ(chord.RootNote(), Nat(55));
  chord.SetRootNote(Nat(62));
  chord.AddNote(Nat(50));
  EXPECT_TRUE(chord.RootNote() == Nat(62) && chord.RootNoteSpecified());
  // Two spellings of one pitch stand side by side; indices past the end give the
  // undefined note.
  chord.AddNote(CNote(61, Enh_Flat));
  chord.AddNote(CNote(61, Enh_Sharp));
  EXPECT_TRUE(chord.Note(3) == CNote(61, Enh_Flat) && chord.Note(~0UL) == CNote_Undef && chord.NoteCount() == 6);
  chord.DeleteAllNotesInOctave(4);
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{50, 55}));
  chord.SetUndefined();
  EXPECT_TRUE(chord.IsUndefined() && chord == CChord_Undef && CChord_Undef.RootNote() == CNote(255, Enh_Flat));
  // Equal are chords of equal root (spelling included) and notes, whatever their
  // wrap interval, cache and flags.
  CChord otherSpelling = ChordOf({60, 64, 67});
  otherSpelling.SetRootNote(CNote(60, Enh_Sharp));
  EXPECT_TRUE(ChordOf({60, 64, 67}) == RootedChord(60, {67, 64, 60}) && ChordOf({60, 64, 67}) != otherSpelling);
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
// values are key numbers (-2 is 10). HasExactTheseKeyNrs compares one-sidedly: the
// chord's intervals must begin those of the listed key numbers.
TEST(ChordKeyNrs, ListsEndAtExactlyMinusOne) {
  CChord const chord = ChordOf({62, 66, 69}), empty(24), ninth = RootedChord(62, {76});
  bool const cases[][2] = {{chord.HasKeyNrs(2, -3, -1), true},
                           {chord.HasKeyNrs(2, -2, -1), false},
                           {chord.HasKeyNrs(2, -1, 5), true},
                           {chord.HasKeyNrs(14, 18, 9), true},
                           {chord.HasExactTheseKeyNrs(-10, 6, 9, 11, -1), true}, // the list may go on
                           {chord.HasExactTheseKeyNrs(2, 6, -1, 9), false},      // the cache may not
                           {empty.HasKeyNrs(2, -1), false},
                           {empty.HasExactTheseKeyNrs(2, -1), true},
                           {ninth.KeyNrSet() == CMySet<int>{4}, true},
                           {ninth.HasKeyNr(4), false}}; // cached as 14
  for (std::size_t i = 0; i < std::size(cases); ++i) EXPECT_EQ(cases[i][0], cases[i][1]) << "case " << i;
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
  EXPECT_TRUE(types.AddUserType(CChordType(1, "power", CIntvlSet(12, 0, 7, -1), -3)));
  EXPECT_FALSE(types.AddUserType(CChordType(1, "other", CIntvlSet(24, 0, -1), 0)));
  EXPECT_EQ(types.ChordTypeBuiltInFromId(1)->Name(), "major"); // the lists are searched apart
}

} // namespace
