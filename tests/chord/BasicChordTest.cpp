// Basic chord recognition, reshaping into a basic chord, the chord's scale, the XG
// chord type and the key sign count of a chord. Expectations come from the
// recognition rules written out as a first-match list, from the XG rows of the
// training-pattern generator (a table of its own, in XGChordIx's order) and from the
// letter model.
#include "support/ChordBuilders.h"
#include "support/SpellingOracle.h"
#include "support/TestPrelude.h"
#include "training/ChordPatterns.h"

namespace {

using namespace chordtest;
using C = CChord;

// The basic chord of an interval set under a wrap interval, as rules of which the
// first that applies decides; "in any octave" walks x, x + 12, ... below the wrap.
int OracleBasicChord(Intvls const& set, int wrap) {
  auto any = [&](int x) {
    for (int v = x; v < wrap; v += 12)
      if (set.count(v)) return true;
    return false;
  };
  bool const maj3 = any(4), min3 = any(3), dim5 = any(6), p5 = any(7), aug5 = any(8);
  struct Rule {
    bool applies;
    int bc;
  } const rules[] = {{maj3 && !(aug5 && !p5), C::bc_maj},
                     {maj3, C::bc_aug},
                     {min3 && dim5 && (p5 || any(10)), C::bc_min},
                     {min3 && dim5, C::bc_dim},
                     {min3 && !(aug5 && !p5), C::bc_min},
                     // From here on: no third, or a minor third with the augmented fifth and no fifth.
                     {!p5, C::bc_none},
                     {any(5), C::bc_sus4},
                     {any(2), C::bc_sus2},
                     {set == Intvls{0, 7} || set == Intvls{0, 7, 12}, C::bc_drone},
                     {true, C::bc_none}};
  for (Rule const& rule : rules)
    if (rule.applies) return rule.bc;
  return C::bc_none;
}

// The first XG row equal to the set, else the row of the bare basic chord (34, no
// chord, for none).
int OracleXG(Intvls const& set, int wrap) {
  static std::vector<TChordPatternType> const types = ChordPatternTypes();
  for (TChordPatternType const& type : types) {
    Intvls row;
    for (int i : type.intvls) row.insert(i % 12);
    if (type.xgNr >= 0 && row == set) return type.xgNr;
  }
  int const bc = OracleBasicChord(set, wrap);
  return bc == C::bc_none ? 34 : OracleXG(Members(CChord(Nat(60), static_cast<C::TBasicChord>(bc), 24).IntvlSet()), 24);
}

void ExpectRecognised(CChord const& chord, Intvls const& expectedCache, std::string const& what) {
  ASSERT_EQ(Members(chord.IntvlSet()), expectedCache) << what;
  int const wrap = chord.IntvlSet().WrapIntvl();
  EXPECT_EQ(chord.BasicChord(), OracleBasicChord(expectedCache, wrap)) << what;
  EXPECT_EQ(chord.XGChordIx(), OracleXG(expectedCache, wrap)) << what;
}

std::string Describe(Intvls const& set) { return ListLabel("intervals", std::vector<int>(set.begin(), set.end())); }

TEST(BasicChord, EveryPitchClassSetOverEveryRoot) {
  // Notes spread over three octaves, the root set afterwards: the cache is rebuilt
  // from the notes, folded into 0..11.
  for (int root = 0; root < 12; ++root)
    for (unsigned mask = 0; mask < 4096; ++mask) {
      CChord chord(24);
      Intvls expected;
      for (int i = 0; i < 12; ++i)
        if (mask >> i & 1u) {
          expected.insert(i);
          chord.AddNote(Nat(36 + root + i + 12 * static_cast<int>((mask >> i) % 3)));
        }
      chord.SetRootNote(Nat(48 + root));
      ExpectRecognised(chord, expected, std::to_string(root) + ": " + Describe(expected));
    }
}

// Intervals inserted directly above the octave (the root given before the notes)
// count in any octave: a sample of the caches over 0..23.
TEST(BasicChord, IntervalsAboveTheOctave) {
  std::mt19937 random(20240611);
  for (int n = 0; n < 50000; ++n) {
    Intvls cache;
    std::vector<long> notes;
    for (unsigned bits = static_cast<unsigned>(random()), i = 0; i < 24; ++i)
      if (bits >> i & 1u) {
        cache.insert(static_cast<int>(i));
        notes.push_back(60 + i);
      }
    ExpectRecognised(RootedChord(60, notes), cache, Describe(cache));
  }
}

// Built on an empty chord, every basic chord stands in the comping range 53..64,
// one note per interval, and is recognised as itself.
TEST(SetBasicChord, BuildsEveryBasicChordInTheCompingRange) {
  for (int bc = C::bc_none; bc <= C::bc_drone; ++bc)
    for (long rootNr = 0; rootNr < 72; rootNr += 5) {
      CChord const chord(Nat(rootNr), static_cast<C::TBasicChord>(bc), 24);
      Intvls const cache = Members(chord.IntvlSet());
      EXPECT_TRUE(chord.BasicChord() == bc && chord.RootNoteSpecified() && chord.NoteCount() == cache.size()) << bc;
      EXPECT_TRUE(Members(chord.IntvlsInBasicChord()) == cache && chord.IntvlsInBasicChord().WrapIntvl() == 24);
      EXPECT_EQ(chord.ScaleType(), bc == C::bc_min || bc == C::bc_dim ? CScale::Scale_Minor : CScale::Scale_Major);
      for (CNote const& n : chord.Notes())
        EXPECT_TRUE(n.NoteNr() >= 53 && n.NoteNr() <= 64 && n.HasSensefulEnh() &&
                    cache.count(oracle::Mod12(static_cast<int>(n.NoteNr() - rootNr))))
            << n;
    }
}

TEST(SetBasicChord, MovesThirdsAndFifthsOfExistingNotes) {
  // Notes added without a root: the root is the lowest note, the cache stale.
  struct Case {
    std::vector<long> notes;
    int bc;
    std::vector<long> result;
    Intvls cache;
  } const cases[] = {
      {{60, 64, 67}, C::bc_min, {60, 63, 67}, {0, 3, 7}},
      {{60, 64, 67}, C::bc_dim, {60, 63, 66}, {0, 3, 6}},
      {{60, 64, 67}, C::bc_drone, {60, 67}, {0, 7}}, // the third moves onto the fifth
      {{60, 63, 68}, C::bc_sus2, {60, 62, 67}, {0, 2, 7}},
      {{60, 64, 67, 70, 74}, C::bc_sus4, {60, 65, 67, 70, 74}, {0, 2, 5, 7, 10}},
      {{60, 64, 67, 70, 74}, C::bc_drone, {60, 67, 72}, {0, 7, 12}}, // ninth down, seventh up
      {{64, 67}, C::bc_min, {59, 64, 67}, {0, 3, 7}},                // the fifth B is added in 53..64
      {{60, 63, 68}, static_cast<int>(8), {60, 63, 68}, {0, 3, 8}},
  };
  for (Case const& c : cases) {
    CChord chord = ChordOf(c.notes);
    chord.SetBasicChord(static_cast<C::TBasicChord>(c.bc));
    EXPECT_EQ(NoteNrs(chord), c.result) << c.bc << " " << c.notes.size();
    EXPECT_EQ(Members(chord.IntvlSet()), c.cache) << c.bc << " " << c.notes.size();
  }
  CChord minor = ChordOf({60, 64, 67});
  minor.SetBasicChord(C::bc_min);
  EXPECT_EQ(minor.Note(1), CNote(63, Enh_Flat)); // checked
  // A root just set leaves the cache stale: the moves work on it brought up to
  // date, so the drone's 12 stays instead of being folded by a later rebuild.
  CChord drone = ChordOf({47, 50, 56, 64, 66, 90});
  drone.SetRootKeyNr(0);
  drone.SetBasicChord(C::bc_drone);
  EXPECT_EQ(NoteNrs(drone), (std::vector<long>{48, 55, 67, 91}));
  EXPECT_EQ(Members(drone.IntvlSet()), (Intvls{0, 7, 12}));
  // None removes the thirds and the fifth from the cache only.
  CChord none = ChordOf({60, 64, 67, 70});
  none.SetBasicChord(C::bc_none);
  EXPECT_EQ(NoteNrs(none), (std::vector<long>{60, 64, 67, 70}));
  EXPECT_EQ(Members(none.IntvlSet()), (Intvls{0, 10}));
}

// The chord's scale is minor for minor and diminished chords, else major; its minor
// second, when the chord has one, is the lowered second degree: the letter after the
// root's letter. And the sign count of every root spelling and basic chord.
TEST(ChordScaleAndSigns, EveryRootSpellingAndBasicChord) {
  for (int k = 0; k < 12; ++k)
    for (int e : oracle::SensefulSpellings(k))
      for (int bc = C::bc_none; bc <= C::bc_drone; ++bc) {
        CChord chord(CNote(48 + k, static_cast<TEnh>(e)), static_cast<C::TBasicChord>(bc), 24);
        EXPECT_EQ(chord.SignsCount(), oracle::SignCount(k, e, bc)) << k << " " << e << " " << bc;
        chord.AddIntvlInCompingRange(1);
        CScale const scale = chord.Scale();
        EXPECT_EQ(scale.ScaleType(), bc == C::bc_min || bc == C::bc_dim ? CScale::Scale_Minor : CScale::Scale_Major);
        auto const second = oracle::LetterFor((k + 1) % 12, scale.EnhForKeynr((k + 1) % 12));
        EXPECT_TRUE(e == 0 || e == 4 || (second && second->index == (oracle::LetterFor(k, e)->index + 1) % 7))
            << k << " " << e << " " << bc;
      }
  EXPECT_EQ(ChordOf({60, 64, 67}).Scale().EnhForKeynr(1), Enh_Sharp); // without it, C major's C sharp
  CNote root(60, Enh_Natural);
  root.SetNoteNr(61); // a natural spelling left on a black key
  CChord const chord(root, C::bc_maj, 24);
  EXPECT_EQ(chord.SignsCount(), -5); // respelled as D flat
  EXPECT_EQ(chord.RootNote(), CNote(61, Enh_Flat));
}

} // namespace
