// Scales: degrees and key numbers, checked against the scale's own list of key
// numbers, and the spelling tables and sign counts against the letter model.
#include "ScaleOracle.h"
#include "support/TestPrelude.h"

namespace {

using oracle::Mod12;
TEnh E(int e) { return static_cast<TEnh>(e); }
CScale::TType T(int type) { return static_cast<CScale::TType>(type); }

// The scale's key numbers, by degree.
std::vector<int> Keys(CScale const& scale) {
  std::vector<int> keys;
  for (int d = 0; d < scale.DegreesPerOctave(); ++d) keys.push_back(scale.DegreeNrToKeyNr(d));
  return keys;
}

TEST(ScaleDegrees, EveryTypeAndRoot) {
  for (int type : scaleoracle::TypeValues())
    for (int root = 0; root < 12; ++root) {
      CScale const scale(CNote(root, Enh_Natural), T(type));
      std::vector<int> const keys = Keys(scale);
      int const n = static_cast<int>(keys.size());
      for (std::size_t d = 1; d < keys.size(); ++d) ASSERT_GT(Mod12(keys[d] - root), Mod12(keys[d - 1] - root));
      for (int d = -3; d < 3 * n; ++d) {
        int const expected = d < 0 ? root : keys[static_cast<std::size_t>(d % n)];
        EXPECT_EQ(scale.DegreeNrToKeyNr(d), expected) << type << " " << root << " " << d;
        EXPECT_EQ(scale.DegreeNrToKey(d).NoteNr(), expected);
        EXPECT_TRUE(scale.DegreeNrToKey(d).HasSensefulEnh());
      }
      for (int k = -13; k <= 25; ++k) { // not reduced: 14 is no key number
        auto const at = std::find(keys.begin(), keys.end(), k);
        int const expected = at == keys.end() ? -1 : static_cast<int>(at - keys.begin());
        EXPECT_EQ(scale.KeyNrToDegreeNr(k), expected) << type << " " << root << " " << k;
        EXPECT_EQ(scale.HasKeyNr(k), expected >= 0);
        EXPECT_TRUE(k < 0 || k > 11 || scale.NoteToDegreeNr(CNote(24 + k, Enh_Natural)) == expected);
      }
    }
  CNote below(4, Enh_Natural);
  below.SetOct(-2); // a negative key number is on no degree
  EXPECT_EQ(CScale().NoteToDegreeNr(below), -1);
}

TEST(ScaleSpelling, EveryRootSpellingAndTypeMatchesTheLetterModel) {
  for (scaleoracle::Root root : scaleoracle::Roots())
    for (int type : scaleoracle::TypeValues()) {
      CScale const scale(CNote(48 + root.k, E(root.e)), T(type));
      ASSERT_EQ(scale.RootNote(), CNote(root.k, E(root.e)));
      scaleoracle::SpellingTable const expected = scaleoracle::Spellings(root, type);
      for (int k = 0; k < 12; ++k)
        EXPECT_EQ(scale.EnhForKeynr(k), expected.e[k]) << oracle::Name(root.k, root.e) << " " << type << " " << k;
      EXPECT_EQ(scale.SignsCount(), oracle::SignCount(root.k, root.e, type == 2 ? 2 : 1));
    }
  // The root is a key number with a senseful spelling, whatever note is given.
  CNote negative(61, Enh_Flat), sharpD(61, Enh_Sharp);
  negative.SetOct(-3); // note -1
  sharpD.SetNoteNr(62);
  EXPECT_EQ(CScale(negative, CScale::Scale_Minor).RootNote(), CNote(0, Enh_Natural));
  EXPECT_EQ(CScale(sharpD, CScale::Scale_Minor).RootNote(), CNote(2, Enh_Natural));
  EXPECT_EQ(CScale(CNote_Undef, CScale::Scale_Minor).RootNote(), CNote(3, Enh_Flat));
}

} // namespace
