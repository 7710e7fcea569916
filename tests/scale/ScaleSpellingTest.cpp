// Spelling tables and sign counts of scales against the letter model.
#include "ScaleOracle.h"

#include <tonvex/NoteNames.h>
#include <tonvex/Scale.h>

#include <gtest/gtest.h>

namespace {

using scaleoracle::E;
using scaleoracle::T;

TEST(ScaleSpelling, EveryRootSpellingAndTypeMatchesTheLetterModel) {
  for (scaleoracle::Root root : scaleoracle::Roots())
    for (int type : scaleoracle::TypeValues()) {
      CScale scale(CNote(48 + root.k, E(root.e)), T(type));
      ASSERT_EQ(scale.RootNote(), CNote(root.k, E(root.e)));
      scaleoracle::SpellingTable expected = scaleoracle::Spellings(root, type);
      for (int k = 0; k < 12; ++k)
        EXPECT_EQ(scale.EnhForKeynr(k), expected.e[k])
            << "root " << oracle::EnglishName(root.k, root.e) << " type " << type << " key " << k;
    }
}

TEST(ScaleSpelling, SignsCountIsTheKeySignatureOfTheRoot) {
  for (scaleoracle::Root root : scaleoracle::Roots())
    for (int type : scaleoracle::TypeValues()) {
      CScale const scale(CNote(root.k, E(root.e)), T(type));
      EXPECT_EQ(scale.SignsCount(), oracle::SignCount(root.k, root.e, type == 2 ? 2 : 1))
          << oracle::EnglishName(root.k, root.e) << " type " << type;
      EXPECT_EQ(scale.RootNote().Enh(), root.e);
    }
}

TEST(ScaleSpelling, WorkedExamples) {
  // C minor: Eb Ab Bb from the signature, B stays natural, Db E F# A between.
  CScale cMinor(CNote(0, Enh_Natural), CScale::Scale_Minor);
  const int cMinorSpellings[12] = {2, 1, 2, 1, 2, 2, 3, 2, 1, 2, 1, 2};
  for (int k = 0; k < 12; ++k) EXPECT_EQ(cMinor.EnhForKeynr(k), cMinorSpellings[k]) << k;
  EXPECT_EQ(cMinor.SignsCount(), -3);

  // A minor leaves key number 8 plain: the natural spelling, named as G#.
  CScale aMinor(CNote(9, Enh_Natural), CScale::Scale_Minor);
  EXPECT_EQ(aMinor.EnhForKeynr(8), Enh_Natural);
  EXPECT_EQ(KeyNrAndEnhToName(8, aMinor.EnhForKeynr(8), DefaultChordnamePref), "G#");

  // D double flat major: twelve flats, its lowered sixth a triple flat (-1).
  CScale dbb(CNote(0, Enh_DoubleFlat), CScale::Scale_Major);
  EXPECT_EQ(dbb.SignsCount(), -12);
  EXPECT_EQ(dbb.EnhForKeynr(8), -1);
  EXPECT_EQ(dbb.DegreeNrToKey(2), CNote(4, Enh_Flat));  // F flat
  EXPECT_EQ(dbb.DegreeNrToKey(6), CNote(11, Enh_Flat)); // C flat
  // B double sharp major: nineteen sharps, its raised fourth a triple sharp (5).
  CScale bx(CNote(1, Enh_DoubleSharp), CScale::Scale_Major);
  EXPECT_EQ(bx.SignsCount(), 19);
  EXPECT_EQ(bx.EnhForKeynr(7), 5);
}

// A natural black key is spelled as the default scale on C spells it.
TEST(ScaleSpelling, CheckEnhFallbackIsTheDefaultScale) {
  CScale const defaultScale;
  EXPECT_EQ(defaultScale.RootNote(), CNote(0, Enh_Natural));
  EXPECT_EQ(defaultScale.ScaleType(), CScale::Scale_Major);
  for (long n = 0; n < 12; ++n) {
    EXPECT_EQ(CNote(n + 60, Enh_Natural).Enh(), defaultScale.EnhForKeynr(static_cast<int>(n))) << n;
    EXPECT_EQ(defaultScale.DegreeNrToKey(static_cast<int>(n)).Enh(), Enh_Natural) << n;
  }
}

// The spelling is copied without a check, from the pitch class of any note number.
TEST(ScaleSpelling, AdjustEnhToScaleCopiesTheEntryOfThePitchClass) {
  CScale const dbb(CNote(0, Enh_DoubleFlat), CScale::Scale_Major);
  std::vector<CNote> notes;
  for (long n = 0; n <= 127; ++n) notes.push_back(CNote(n, Enh_Natural));
  for (long k = 0; k < 12; ++k)
    for (int oct : {-2, 9}) { // note numbers -11..0 and 120..131
      notes.push_back(CNote(k, Enh_Natural));
      notes.back().SetOct(oct);
    }
  notes.push_back(CNote_Undef);
  for (CNote const& note : notes) {
    int pitchClass = oracle::Mod12(static_cast<int>(note.NoteNr()));
    note.AdjustEnhToScale(dbb);
    EXPECT_EQ(note.Enh(), dbb.EnhForKeynr(pitchClass)) << note.NoteNr();
    EXPECT_EQ(dbb.EnhForNote(note), dbb.EnhForKeynr(pitchClass)) << note.NoteNr();
    EXPECT_FALSE(note.KeyName(DefaultChordnamePref).empty());
  }
  CNote aFlat(68, Enh_Flat);
  aFlat.AdjustEnhToScale(dbb);
  EXPECT_EQ(aFlat.Enh(), -1); // unchecked
  EXPECT_EQ(aFlat.KeyName(DefaultChordnamePref), "G#");
}

TEST(ScaleSpelling, SetEnhWritesThePitchClassEntry) {
  CScale scale(CNote(2, Enh_Natural), CScale::Scale_Major); // D major
  scale.SetEnhForKeyNr(-11, Enh_DoubleSharp);               // key number 1
  EXPECT_EQ(scale.EnhForKeynr(1), Enh_DoubleSharp);
  EXPECT_EQ(scale.EnhForKeynr(13), Enh_DoubleSharp);
  EXPECT_EQ(scale.EnhForKeynr(-11), Enh_DoubleSharp);
  scale.SetEnhForNote(CNote(63, Enh_Flat), E(7)); // stored unchecked
  EXPECT_EQ(scale.EnhForKeynr(3), 7);
  scale.SetEnhForChromStep(1, Enh_Flat); // a semitone above D
  EXPECT_EQ(scale.EnhForKeynr(3), Enh_Flat);
  scale.SetEnhForChromStep(-3, Enh_Natural); // B
  EXPECT_EQ(scale.EnhForKeynr(11), Enh_Natural);
  scale.SetEnhForChromStep(22, Enh_Sharp); // C, an octave and a seventh up
  EXPECT_EQ(scale.EnhForKeynr(0), Enh_Sharp);
}

// The same type keeps the table as it is; a different one recomputes it.
TEST(ScaleSpelling, SetScaleTypeRecomputesOnlyOnAChange) {
  CScale scale(CNote(7, Enh_Natural), CScale::Scale_Major);
  scale.SetEnhForKeyNr(6, Enh_Flat);
  scale.SetScaleType(CScale::Scale_Major);
  EXPECT_EQ(scale.EnhForKeynr(6), Enh_Flat);
  scale.SetScaleTypeWithoutCalcEnh(CScale::Scale_Minor);
  EXPECT_EQ(scale.ScaleType(), CScale::Scale_Minor);
  EXPECT_EQ(scale.EnhForKeynr(6), Enh_Flat);
  scale.SetScaleType(CScale::Scale_Other);
  EXPECT_EQ(scale.EnhForKeynr(6), Enh_Sharp); // G major's F#
  scale.SetEnhForKeyNr(6, Enh_Flat);
  scale.SetScaleType(CScale::Scale_Minor);
  EXPECT_EQ(scale.EnhForKeynr(6), Enh_Natural); // G minor leaves interval 11 plain
  EXPECT_EQ(scale.EnhForKeynr(10), Enh_Flat);   // and has B flat
}

} // namespace
