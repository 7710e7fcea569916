// Keys: construction, type setters, sign counts and names.
#include "ScaleOracle.h"
#include "support/PrefGuard.h"

#include <tonvex/SignKey.h>

#include <gtest/gtest.h>

namespace {

using scaleoracle::E;

CSignKey::TType K(int type) { return static_cast<CSignKey::TType>(type); }

// Note names from the letter: German syllables ("es", "is"; B natural and flat
// are H, B sharp stays B) and solmisation syllables.
std::string GermanName(int k, int e) {
  char letter = oracle::LetterFor(k, e)->name;
  std::string name(1, letter == 'B' && e <= 2 ? 'H' : letter);
  const char* suffix[5] = {"eses", "es", "", "is", "isis"};
  name += suffix[e];
  if (name == "Hes") return "B";
  if (name == "Aes") return "As";
  if (name == "Ees") return "Es";
  return name;
}

std::string SolfegeName(int k, int e) {
  const char* syllable[7] = {"Do", "Re", "Mi", "Fa", "So", "La", "Ti"};
  const char* sign[5] = {"bb", "b", "", "#", "x"};
  int letter = 0;
  while (oracle::Letters[letter].name != oracle::LetterFor(k, e)->name) ++letter;
  return std::string(syllable[letter]) + sign[e];
}

std::string ExpectedName(int k, int e, int roman, int german, int bbIsB, int bIsH) {
  if (roman) return SolfegeName(k, e);
  if (german) return GermanName(k, e);
  std::string name = oracle::EnglishName(k, e);
  if (bIsH && name[0] == 'B' && name != "Bb") name[0] = 'H';
  if (bbIsB && name == "Bb") name = "B";
  return name;
}

TEST(SignKey, NamesOfEveryRootModeAndNamingStyle) {
  PrefGuard guard;
  for (int flags = 0; flags < 16; ++flags) {
    int roman = flags & 1, german = (flags >> 1) & 1, bbIsB = (flags >> 2) & 1, bIsH = (flags >> 3) & 1;
    PrefGuard::NoteNaming(roman, german, bbIsB, bIsH);
    for (scaleoracle::Root root : scaleoracle::Roots()) {
      std::string name = ExpectedName(root.k, root.e, roman, german, bbIsB, bIsH);
      CSignKey major(CNote(60 + root.k, E(root.e)), CSignKey::SignKey_Major);
      CSignKey minor(CNote(60 + root.k, E(root.e)), CSignKey::SignKey_Minor);
      EXPECT_EQ(major.Name(DefaultChordnamePref), name) << flags;
      EXPECT_EQ(minor.Name(DefaultChordnamePref), name + "m") << flags;
    }
  }
}

TEST(SignKey, NameExamples) {
  PrefGuard guard;
  CChordnamePref pref;
  EXPECT_EQ(CSignKey(CNote(61, Enh_Flat), K(2)).Name(pref), "Dbm");
  EXPECT_EQ(CSignKey(CNote(61, Enh_Flat), K(2)).RootNote(), CNote(1, Enh_Flat));
  EXPECT_EQ(CSignKey().Name(pref), "C");
  EXPECT_EQ(CSignKey(CNote(69, Enh_Natural), K(2)).Name(pref), "Am");
  EXPECT_EQ(CSignKey(CNote(66, Enh_Sharp), K(2)).Name(pref), "F#m");
  EXPECT_EQ(CSignKey(CNote(63, Enh_Flat), K(1)).Name(pref), "Eb");
  CChordnamePref::AccidentalsAsLetters = 1;
  EXPECT_EQ(CSignKey(CNote(63, Enh_Flat), K(1)).Name(pref), "Es");
  EXPECT_EQ(CSignKey(CNote(66, Enh_Sharp), K(2)).Name(pref), "Fism");
  CChordnamePref::RomanNames = 1;
  EXPECT_EQ(CSignKey().Name(pref), "Do");
  EXPECT_EQ(CSignKey(CNote(69, Enh_Natural), K(2)).Name(pref), "Lam");
}

// Only 1 is major; the key's scale is the major or minor scale on its root.
TEST(SignKey, EveryTypeValueAndRoot) {
  for (int type : {-1, 0, 1, 2, 3, 5, 7, 8, 100})
    for (scaleoracle::Root root : scaleoracle::Roots()) {
      int scaleType = type == 1 ? 1 : 2;
      CSignKey key(CNote(36 + root.k, E(root.e)), K(type));
      EXPECT_EQ(key.SignKeyType(), scaleType) << type;
      EXPECT_EQ(key.Scale().ScaleType(), scaleType);
      EXPECT_EQ(key.RootNote(), CNote(root.k, E(root.e)));
      EXPECT_EQ(key.SignsCount(), oracle::SignCount(root.k, root.e, scaleType));
      scaleoracle::SpellingTable spellings = scaleoracle::Spellings(root, scaleType);
      for (int k = 0; k < 12; ++k) EXPECT_EQ(key.Scale().EnhForKeynr(k), spellings.e[k]);

      CSignKey set;
      set.SetRootNoteAndSignKeyType(CNote(root.k, E(root.e)), K(type));
      EXPECT_EQ(set.SignKeyType(), scaleType);
      EXPECT_EQ(set.RootNote(), key.RootNote());
      EXPECT_EQ(set.SignsCount(), key.SignsCount());
    }
}

TEST(SignKey, Setters) {
  CSignKey key(CNote(64, Enh_Natural), CSignKey::SignKey_Minor); // E minor
  key.SetSignKeyType(K(5));
  EXPECT_EQ(key.SignKeyType(), CSignKey::SignKey_Minor);
  EXPECT_EQ(key.SignsCount(), 1);
  key.SetSignKeyType(CSignKey::SignKey_Major);
  EXPECT_EQ(key.SignsCount(), 4);
  EXPECT_EQ(key.Scale().EnhForKeynr(5), Enh_Sharp); // E# above the root of a major key
  key.SetSignKeyType(K(5));
  EXPECT_EQ(key.SignKeyType(), CSignKey::SignKey_Minor);
  EXPECT_EQ(key.Scale().EnhForKeynr(5), Enh_Natural); // F, the lowered second of a minor key
  key.SetRootNote(CNote(70, Enh_Sharp));              // A# minor, type kept
  EXPECT_EQ(key.SignKeyType(), CSignKey::SignKey_Minor);
  EXPECT_EQ(key.RootNote(), CNote(10, Enh_Sharp));
  EXPECT_EQ(key.SignsCount(), 7);
  CNote negative(64, Enh_Natural);
  negative.SetOct(-2);
  key.SetRootNote(negative);
  EXPECT_EQ(key.RootNote(), CNote(0, Enh_Natural));
}

} // namespace
