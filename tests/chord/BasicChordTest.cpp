// Basic chord recognition, reshaping into a basic chord, the chord's scale, the XG
// chord type and the key sign count of a chord. Expectations come from a
// classification written out from the recognition rules as a first-match list, from
// the XG rows read as data, and from the letter model of tests/support.
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"
#include <tonvex/Chord.h>

#include <gtest/gtest.h>

#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

using namespace chordtest;

// ---- Independent model of the recognition ----------------------------------------

enum OracleBc { None, Maj, Min, Aug, Dim, Sus4, Sus2, Drone };

// The basic chord of an interval set under a wrap interval, as a list of rules of which
// the first that applies decides. "in any octave" walks x, x + 12, ... below the wrap.
int OracleBasicChord(Intvls const& set, int wrap) {
  auto any = [&](int x) {
    for (int v = x; v < wrap; v += 12)
      if (set.count(v)) return true;
    return false;
  };
  bool maj3 = any(4), min3 = any(3), dim5 = any(6), p5 = any(7), aug5 = any(8), min7 = any(10);
  struct Rule {
    bool applies;
    int bc;
  } const rules[] = {
      {maj3 && !(aug5 && !p5), Maj},
      {maj3, Aug},
      {min3 && dim5 && (p5 || min7), Min},
      {min3 && dim5, Dim},
      {min3 && !(aug5 && !p5), Min},
      // From here on: no third, or a minor third with the augmented fifth and no fifth.
      {!p5, None},
      {any(5), Sus4},
      {any(2), Sus2},
      {set == Intvls{0, 7} || set == Intvls{0, 7, 12}, Drone},
      {true, None},
  };
  for (Rule const& rule : rules)
    if (rule.applies) return rule.bc;
  return None;
}

struct XGRow {
  Intvls intvls;
  int xg;
};
// The XG rows in the order they are tried.
std::vector<XGRow> const XGTable = {{{0, 4, 7}, 0},         {{0, 4, 7, 9}, 1},
                                    {{0, 4, 7, 11}, 2},     {{0, 4, 7, 11, 6}, 3},
                                    {{0, 4, 7, 2}, 4},      {{0, 4, 7, 11, 2}, 5},
                                    {{0, 4, 7, 9, 2}, 6},   {{0, 4, 7, 10}, 19},
                                    {{0, 4, 6, 10}, 21},    {{0, 4, 7, 10, 2}, 22},
                                    {{0, 4, 7, 10, 6}, 23}, {{0, 4, 7, 10, 9}, 24},
                                    {{0, 4, 7, 10, 1}, 25}, {{0, 4, 7, 10, 8}, 26},
                                    {{0, 4, 7, 10, 3}, 27}, {{0, 3, 7}, 8},
                                    {{0, 3, 7, 9}, 9},      {{0, 3, 7, 10}, 10},
                                    {{0, 3, 6, 10}, 11},    {{0, 3, 7, 2}, 12},
                                    {{0, 3, 7, 10, 2}, 13}, {{0, 3, 7, 10, 5}, 14},
                                    {{0, 3, 7, 11}, 15},    {{0, 3, 7, 11, 2}, 16},
                                    {{0, 4, 8}, 7},         {{0, 4, 8, 11}, 28},
                                    {{0, 4, 8, 10}, 29},    {{0, 3, 6}, 17},
                                    {{0, 3, 6, 9}, 18},     {{0, 5, 7}, 32},
                                    {{0, 5, 7, 10}, 20},    {{0, 2, 7}, 33},
                                    {{0, 7}, 31},           {{0}, 30}};
// XG number of basic chords none .. drone where no row matches.
int const XGFallback[] = {34, 0, 8, 7, 17, 32, 33, 31};

int OracleXG(Intvls const& set, int wrap) {
  for (XGRow const& row : XGTable)
    if (row.intvls == set) return row.xg;
  return XGFallback[OracleBasicChord(set, wrap)];
}

// The same rows tried through the interval set's own exact test, to show that the
// chord's fast lookup answers as that test would on every cache.
int XGByExactTest(CChord const& chord) {
  for (XGRow const& row : XGTable) {
    std::vector<int> list(row.intvls.begin(), row.intvls.end());
    if (chord.IntvlSet().HasExactTheseIntvlsFromList(list.data(), list.size())) return row.xg;
  }
  return XGFallback[chord.BasicChord()];
}

// A chord over root C4 whose cache holds exactly `intvls` (values 0..23), inserted
// directly: the root is specified before the notes are added.
CChord DirectChord(Intvls const& intvls) {
  std::vector<long> notes;
  for (int i : intvls) notes.push_back(60 + i);
  return RootedChord(60, notes);
}

void ExpectRecognised(CChord const& chord, Intvls const& expectedCache, std::string const& what) {
  SCOPED_TRACE(what);
  ASSERT_EQ(Members(chord.IntvlSet()), expectedCache);
  int wrap = chord.IntvlSet().WrapIntvl();
  EXPECT_EQ(chord.BasicChord(), OracleBasicChord(expectedCache, wrap));
  EXPECT_EQ(chord.XGChordIx(), OracleXG(expectedCache, wrap));
  EXPECT_EQ(chord.XGChordIx(), XGByExactTest(chord));
}

std::string Describe(Intvls const& set) {
  std::string text;
  for (int i : set) text += std::to_string(i) + " ";
  return text;
}

// ---- Recognition -------------------------------------------------------------------

TEST(BasicChord, EveryPitchClassSetOverEveryRootIsRecognised) {
  // Notes spread over three octaves and the root set afterwards: the cache is
  // rebuilt from the notes, folded into 0..11.
  for (int root = 0; root < 12; ++root) {
    for (unsigned mask = 0; mask < 4096; ++mask) {
      CChord chord(24);
      Intvls expected;
      for (int i = 0; i < 12; ++i) {
        if (!(mask & (1u << i))) continue;
        expected.insert(i);
        chord.AddNote(CNote(36 + root + i + 12 * static_cast<int>((mask >> i) % 3), Enh_Natural));
      }
      chord.SetRootNote(CNote(48 + root, Enh_Natural));
      ExpectRecognised(chord, expected, "root " + std::to_string(root) + ": " + Describe(expected));
    }
  }
}

TEST(BasicChord, IntervalsInsertedAboveTheOctaveCountInAnyOctave) {
  // Every pitch class set with its intervals lifted by an octave in several patterns,
  // and with both octaves present.
  for (unsigned mask = 0; mask < 4096; ++mask) {
    for (unsigned pattern : {0xFFFu, 0x555u, 0xAAAu, 0x0F0u}) {
      Intvls lifted, doubled;
      for (int i = 0; i < 12; ++i) {
        if (!(mask & (1u << i))) continue;
        lifted.insert(pattern & (1u << i) ? i + 12 : i);
        doubled.insert(i);
        doubled.insert(i + 12 * static_cast<int>(pattern >> i & 1u));
      }
      ExpectRecognised(DirectChord(lifted), lifted, "lifted " + Describe(lifted));
      ExpectRecognised(DirectChord(doubled), doubled, "doubled " + Describe(doubled));
    }
  }
  // And a random sample of all caches over 0..23.
  std::mt19937 random(20240611);
  for (int n = 0; n < 20000; ++n) {
    Intvls set;
    for (unsigned bits = static_cast<unsigned>(random() & 0xFFFFFFu), i = 0; i < 24; ++i)
      if (bits >> i & 1u) set.insert(static_cast<int>(i));
    ExpectRecognised(DirectChord(set), set, "sampled " + Describe(set));
  }
}

TEST(BasicChord, NamedCasesAndConsequences) {
  struct Case {
    Intvls intvls;
    CChord::TBasicChord bc;
    int xg;
  } const cases[] = {
      {{0, 4, 7}, CChord::bc_maj, 0},
      {{0, 2, 4, 7, 10}, CChord::bc_maj, 22},
      {{0, 2, 4, 6, 7, 10}, CChord::bc_maj, 0}, // no row: the major fallback
      {{0, 4, 8}, CChord::bc_aug, 7},
      {{0, 4, 7, 8}, CChord::bc_maj, 0},
      {{0, 3, 6, 10}, CChord::bc_min, 11},
      {{0, 3, 6, 9}, CChord::bc_dim, 18},
      {{0, 3, 6}, CChord::bc_dim, 17},
      {{0, 3, 8}, CChord::bc_none, 34},
      {{0, 3, 4, 7}, CChord::bc_maj, 0}, // no row (27 needs the seventh): the major fallback
      {{0, 3}, CChord::bc_min, 8},
      {{0, 7, 10}, CChord::bc_none, 34},
      {{0, 2, 5, 7}, CChord::bc_sus4, 32},
      {{0, 2, 7}, CChord::bc_sus2, 33},
      {{0, 5, 7, 10}, CChord::bc_sus4, 20},
      {{0, 7}, CChord::bc_drone, 31},
      {{0, 7, 12}, CChord::bc_drone, 31},
      {{7}, CChord::bc_none, 34},
      {{0}, CChord::bc_none, 30},
      {{}, CChord::bc_none, 34},
  };
  for (Case const& c : cases) {
    SCOPED_TRACE(Describe(c.intvls));
    CChord chord = DirectChord(c.intvls);
    EXPECT_EQ(chord.BasicChord(), c.bc);
    EXPECT_EQ(chord.XGChordIx(), c.xg);
  }
}

TEST(BasicChord, IntervalsAndScaleTypeOfEachBasicChord) {
  struct Case {
    Intvls chord;
    Intvls basic;
    CScale::TType scaleType;
  } const cases[] = {
      {{}, {}, CScale::Scale_Major},
      {{0, 4, 7, 10}, {0, 4, 7}, CScale::Scale_Major},
      {{0, 3, 7, 14}, {0, 3, 7}, CScale::Scale_Minor},
      {{0, 4, 8}, {0, 4, 8}, CScale::Scale_Major},
      {{0, 3, 6, 9}, {0, 3, 6}, CScale::Scale_Minor},
      {{0, 5, 7}, {0, 5, 7}, CScale::Scale_Major},
      {{0, 2, 7}, {0, 2, 7}, CScale::Scale_Major},
      {{0, 7}, {0, 7}, CScale::Scale_Major},
  };
  for (Case const& c : cases) {
    SCOPED_TRACE(Describe(c.chord));
    CChord chord = DirectChord(c.chord);
    CIntvlSet basic = chord.IntvlsInBasicChord();
    EXPECT_EQ(Members(basic), c.basic);
    EXPECT_EQ(basic.WrapIntvl(), 24);
    EXPECT_EQ(chord.ScaleType(), c.scaleType);
  }
}

// ---- Reshaping ---------------------------------------------------------------------

// Intervals of each basic chord, read from its definition.
Intvls const BasicIntvls[] = {{}, {0, 4, 7}, {0, 3, 7}, {0, 4, 8}, {0, 3, 6}, {0, 5, 7}, {0, 2, 7}, {0, 7}};

TEST(SetBasicChord, BuildsEveryBasicChordInTheCompingRange) {
  for (int bc = CChord::bc_maj; bc <= CChord::bc_drone; ++bc) {
    for (int root = 0; root < 12; ++root) {
      for (long rootNr : {long{root}, 60L + root}) {
        SCOPED_TRACE("bc " + std::to_string(bc) + " root " + std::to_string(rootNr));
        CNote rootNote(rootNr, Enh_Natural);
        CChord chord(rootNote, static_cast<CChord::TBasicChord>(bc), 24);
        // The note of each interval's pitch class that lies in 53..64.
        std::set<long> expected;
        for (int i : BasicIntvls[bc])
          for (long n = 53; n <= 64; ++n)
            if (n % 12 == (root + i) % 12) expected.insert(n);
        EXPECT_EQ(NoteNrs(chord), std::vector<long>(expected.begin(), expected.end()));
        EXPECT_EQ(Members(chord.IntvlSet()), BasicIntvls[bc]);
        EXPECT_EQ(chord.BasicChord(), bc);
        EXPECT_EQ(chord.RootNote(), rootNote);
        EXPECT_TRUE(chord.RootNoteSpecified());
        for (CNote const& n : chord.Notes()) EXPECT_TRUE(n.HasSensefulEnh()) << n;
      }
    }
  }
}

TEST(SetBasicChord, MovesThirdsAndFifthsOfExistingNotes) {
  // Notes added without a root: the root is the lowest note.
  struct Case {
    std::vector<long> notes;
    CChord::TBasicChord bc;
    std::vector<long> result;
  } const cases[] = {
      {{60, 64, 67}, CChord::bc_maj, {60, 64, 67}},
      {{60, 64, 67}, CChord::bc_min, {60, 63, 67}},
      {{60, 64, 67}, CChord::bc_aug, {60, 64, 68}},
      {{60, 64, 67}, CChord::bc_dim, {60, 63, 66}},
      {{60, 64, 67}, CChord::bc_sus4, {60, 65, 67}},
      {{60, 64, 67}, CChord::bc_sus2, {60, 62, 67}},
      {{60, 64, 67}, CChord::bc_drone, {60, 67}}, // the third moves onto the fifth
      {{60, 63, 68}, CChord::bc_maj, {60, 64, 67}},
      {{60, 63, 68}, CChord::bc_min, {60, 63, 67}},
      {{60, 63, 68}, CChord::bc_aug, {60, 64, 68}},
      {{60, 63, 68}, CChord::bc_dim, {60, 63, 66}},
      {{60, 63, 68}, CChord::bc_sus4, {60, 65, 67}},
      {{60, 63, 68}, CChord::bc_sus2, {60, 62, 67}},
      {{60, 63, 68}, CChord::bc_drone, {60, 67}},
      {{60, 64, 67, 70, 74}, CChord::bc_sus4, {60, 65, 67, 70, 74}},
      {{60, 64, 67, 70, 74}, CChord::bc_drone, {60, 67, 72}}, // ninth down, seventh up
      {{64, 67}, CChord::bc_min, {59, 64, 67}},               // E G over E: the fifth B is added in 53..64
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.SetBasicChord(c.bc);
    SCOPED_TRACE("bc " + std::to_string(c.bc) + " from " + std::to_string(c.notes.size()) + " notes");
    EXPECT_EQ(NoteNrs(chord), c.result);
    // The cache describes the resulting notes over the root; a drone's octave is
    // inserted as 12.
    Intvls pitchClasses;
    for (long n : c.result) pitchClasses.insert(static_cast<int>((n - chord.RootNote().NoteNr() + 120) % 12));
    if (c.bc == CChord::bc_drone && c.result.back() == 72) pitchClasses.insert(12);
    EXPECT_EQ(Members(chord.IntvlSet()), pitchClasses);
    EXPECT_EQ(chord.BasicChord(), c.bc);
  }
}

TEST(SetBasicChord, MinorFromMajorRespellsTheMovedThird) {
  CChord chord = ChordOf({60, 64, 67});
  chord.SetBasicChord(CChord::bc_min);
  EXPECT_EQ(chord.Note(1), CNote(63, Enh_Flat));
  EXPECT_EQ(chord.Note(0), CNote(60, Enh_Natural));
  EXPECT_EQ(chord.Note(2), CNote(67, Enh_Natural));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 3, 7}));
}

TEST(SetBasicChord, NoneRemovesThirdsAndFifthFromTheCacheOnly) {
  CChord chord(CNote(60, Enh_Natural), CChord::bc_maj, 24); // cache fresh: {0, 4, 7}
  chord.AddIntvlInCompingRange(10);
  chord.SetBasicChord(CChord::bc_none);
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{55, 58, 60, 64}));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 10}));
  EXPECT_EQ(chord.BasicChord(), CChord::bc_none);
  // A stale cache is brought up to date first, so the removal lasts there too.
  CChord stale = ChordOf({60, 64, 67});
  stale.SetBasicChord(CChord::bc_none);
  EXPECT_EQ(Members(stale.IntvlSet()), (Intvls{0}));
}

// A root just set leaves the cache stale; the moves must see it up to date, or the
// drone's 12 is lost when the stale cache is rebuilt after them.
TEST(SetBasicChord, MovesAgainstTheCacheOfTheRootJustSet) {
  CChord chord = ChordOf({47, 50, 56, 64, 66, 90});
  chord.SetRootKeyNr(0);
  chord.SetBasicChord(CChord::bc_drone);
  EXPECT_EQ(NoteNrs(chord), (std::vector<long>{48, 55, 67, 91}));
  EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 7, 12}));
}

TEST(SetBasicChord, ValuesOutsideTheEnumerationDoNothing) {
  for (int bc : {8, 9, 100, -1}) {
    CChord chord = ChordOf({60, 63, 68});
    CChord before = chord;
    chord.SetBasicChord(static_cast<CChord::TBasicChord>(bc));
    EXPECT_EQ(chord, before) << bc;
    EXPECT_EQ(Members(chord.IntvlSet()), (Intvls{0, 3, 8})) << bc;
    CChord empty(CNote(60, Enh_Natural), static_cast<CChord::TBasicChord>(bc), 24);
    EXPECT_EQ(empty.NoteCount(), 0u) << bc;
  }
}

// ---- Scale -------------------------------------------------------------------------

int LetterIndex(char letter) { return static_cast<int>(std::string("CDEFGAB").find(letter)); }

TEST(ChordScale, MinorSecondIsSpelledAsTheLoweredSecondDegree) {
  CChord chord = ChordOf({60, 61, 64, 67});
  EXPECT_EQ(chord.Scale().EnhForKeynr(1), Enh_Flat); // D flat, not C sharp
  EXPECT_EQ(chord.IntvlIxToKeyName(1), "Db");
  chord.DelNote(CNote(61, Enh_Sharp));
  EXPECT_EQ(chord.Scale().EnhForKeynr(1), Enh_Sharp); // without it, C major's C sharp

  // Over every root spelled with at most one accidental, in major and minor chords,
  // the minor second takes the letter after the root's letter.
  for (int k = 0; k < 12; ++k) {
    for (TEnh e : {Enh_Flat, Enh_Natural, Enh_Sharp}) {
      if (!oracle::Senseful(k, e)) continue;
      for (CChord::TBasicChord bc : {CChord::bc_maj, CChord::bc_min}) {
        CChord c(CNote(48 + k, e), bc, 24);
        c.AddIntvlInCompingRange(1);
        CScale scale = c.Scale();
        EXPECT_EQ(scale.ScaleType(), bc == CChord::bc_min ? CScale::Scale_Minor : CScale::Scale_Major);
        EXPECT_EQ(scale.RootNote(), CNote(k, e));
        int step = (k + 1) % 12;
        auto second = oracle::LetterFor(step, scale.EnhForKeynr(step));
        ASSERT_TRUE(second.has_value()) << k << " " << e << " " << bc;
        EXPECT_EQ(LetterIndex(second->name), (LetterIndex(oracle::LetterFor(k, e)->name) + 1) % 7)
            << k << " " << e << " " << bc;
      }
    }
  }
}

// ---- Key sign count ----------------------------------------------------------------

TEST(ChordSignsCount, NamedExamples) {
  struct Case {
    CNote root;
    CChord::TBasicChord bc;
    int signs;
  } const cases[] = {
      {CNote(60, Enh_Natural), CChord::bc_maj, 0},  {CNote(67, Enh_Natural), CChord::bc_maj, 1},
      {CNote(65, Enh_Natural), CChord::bc_maj, -1}, {CNote(69, Enh_Natural), CChord::bc_min, 0},
      {CNote(64, Enh_Natural), CChord::bc_min, 1},  {CNote(62, Enh_Natural), CChord::bc_min, -1},
      {CNote(61, Enh_Sharp), CChord::bc_maj, 7},    {CNote(61, Enh_Flat), CChord::bc_maj, -5},
      {CNote(66, Enh_Sharp), CChord::bc_maj, 6},    {CNote(66, Enh_Flat), CChord::bc_maj, -6},
      {CNote(71, Enh_Natural), CChord::bc_dim, 1},  {CNote(64, Enh_Natural), CChord::bc_dim, 0},
  };
  for (Case const& c : cases) {
    CChord chord(c.root, c.bc, 24);
    EXPECT_EQ(chord.SignsCount(), c.signs) << c.root << " " << c.bc;
  }
}

TEST(ChordSignsCount, EverySensefulRootAndBasicChordCountsItsFifths) {
  for (int k = 0; k < 12; ++k) {
    for (int e : oracle::SensefulSpellings(k)) {
      for (int bc = CChord::bc_none; bc <= CChord::bc_drone; ++bc) {
        CChord chord(CNote(48 + k, static_cast<TEnh>(e)), static_cast<CChord::TBasicChord>(bc), 24);
        ASSERT_EQ(chord.BasicChord(), bc);
        EXPECT_EQ(chord.SignsCount(), oracle::SignCount(k, e, bc)) << k << " " << e << " " << bc;
      }
    }
  }
}

TEST(ChordSignsCount, RespellsARootThatIsNotSenseful) {
  CNote root(60, Enh_Natural);
  root.SetNoteNr(61); // a natural spelling left on a black key
  CChord chord(root, CChord::bc_maj, 24);
  EXPECT_EQ(chord.SignsCount(), -5);
  EXPECT_EQ(chord.RootNote(), CNote(61, Enh_Flat));
}

} // namespace
