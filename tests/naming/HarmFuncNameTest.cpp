// Harmonic function names of chords in keys: chords built on every degree with
// every basic chord in all major and minor keys, named in both styles.
#include "HarmFuncTable.h"
#include "support/ChordBuilders.h"
#include "support/PrefGuard.h"
#include <tonvex/Chord.h>
#include <tonvex/SignKey.h>

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace {

using namespace chordtest;
using C = CChord;

constexpr int MajorDegrees[7] = {0, 2, 4, 5, 7, 9, 11};
constexpr int MinorDegrees[7] = {0, 2, 3, 5, 7, 8, 10};

// The degree and basic chord of each code that a chord can have.
struct CodeChord {
  int code;
  int degree;
  C::TBasicChord bc;
};
constexpr CodeChord CodeChords[] = {{1, 0, C::bc_maj},  {2, 0, C::bc_min},  {3, 1, C::bc_maj},   {4, 1, C::bc_min},
                                    {5, 1, C::bc_dim},  {6, 2, C::bc_maj},  {7, 2, C::bc_min},   {8, 3, C::bc_maj},
                                    {9, 3, C::bc_min},  {10, 4, C::bc_maj}, {10, 4, C::bc_sus4}, {10, 4, C::bc_sus2},
                                    {11, 4, C::bc_min}, {12, 5, C::bc_maj}, {13, 5, C::bc_min},  {15, 6, C::bc_dim},
                                    {0, 0, C::bc_aug},  {0, 6, C::bc_maj},  {0, 3, C::bc_drone}, {0, 5, C::bc_none}};

CChord ChordOn(int pc, C::TBasicChord bc) { return CChord(Nat(60 + pc), bc, 24); }

TEST(HarmFuncName, ChordsOfEveryCodeInEveryKeyInBothStyles) {
  PrefGuard guard;
  std::set<int> codesSeen;
  for (bool major : {true, false})
    for (int root = 0; root < 12; ++root) {
      CSignKey key(Nat(root), major ? CSignKey::SignKey_Major : CSignKey::SignKey_Minor);
      for (CodeChord const& cc : CodeChords) {
        CChord chord = ChordOn((root + (major ? MajorDegrees : MinorDegrees)[cc.degree]) % 12, cc.bc);
        ASSERT_EQ(chord.HarmFuncIn(key), cc.code);
        codesSeen.insert(cc.code);
        harmfunc::Texts const& texts = harmfunc::ByCode[cc.code];
        std::string label = std::to_string(root) + (major ? " major" : " minor") + " code " + std::to_string(cc.code);
        for (int naming : {0, 2, -1}) {
          CChordnamePref::HarmFuncNaming = naming;
          EXPECT_EQ(chord.HarmFuncName(key, DefaultChordnamePref), texts.roman) << label << " naming " << naming;
        }
        CChordnamePref::HarmFuncNaming = 1;
        EXPECT_EQ(chord.HarmFuncName(key, DefaultChordnamePref), major ? texts.functionalMajor : texts.functionalMinor)
            << label;
      }
    }
  // Every code but 14, which no chord has.
  EXPECT_EQ(codesSeen.size(), 15u);
}

TEST(HarmFuncName, NamedCases) {
  PrefGuard guard;
  CSignKey cMajor(Nat(0), CSignKey::SignKey_Major), aMinor(Nat(9), CSignKey::SignKey_Minor);
  struct Row {
    int pc;
    C::TBasicChord bc;
    CSignKey const& key;
    char const* roman;
    char const* functional;
  } const rows[] = {{0, C::bc_maj, cMajor, "I", "T"},
                    {2, C::bc_min, cMajor, "IIm", "Sp"},
                    {4, C::bc_min, cMajor, "IIIm", "Sp"},
                    {9, C::bc_min, cMajor, "VIm", "Tp"},
                    {7, C::bc_maj, cMajor, "V", "D"},
                    {7, C::bc_sus4, cMajor, "V", "D"},
                    {7, C::bc_sus2, cMajor, "V", "D"},
                    {11, C::bc_dim, cMajor, "VIIdim", "VIIdim##in ks_min"},
                    {0, C::bc_maj, aMinor, "III", "P"},
                    {5, C::bc_maj, aMinor, "VI", "sP = G"},
                    {0, C::bc_min, aMinor, "IIIm", "IIIm##in ks_min"},
                    {11, C::bc_dim, aMinor, "IIdim", "IIdim##"},
                    {1, C::bc_maj, cMajor, "undef", "undef"},
                    {0, C::bc_aug, cMajor, "undef", "undef"},
                    {4, C::bc_aug, aMinor, "undef", "undef"}};
  for (Row const& row : rows) {
    CChord chord = ChordOn(row.pc, row.bc);
    CChordnamePref::HarmFuncNaming = 0;
    EXPECT_EQ(chord.HarmFuncName(row.key, DefaultChordnamePref), row.roman) << row.pc << " bc " << row.bc;
    CChordnamePref::HarmFuncNaming = 1;
    EXPECT_EQ(chord.HarmFuncName(row.key, DefaultChordnamePref), row.functional) << row.pc << " bc " << row.bc;
  }
}

TEST(HarmFuncName, NoteNamingPreferencesDoNotApply) {
  PrefGuard guard;
  PrefGuard::NoteNaming(1, 1, 1, 1);
  CChordnamePref::HarmFuncNaming = 0;
  EXPECT_EQ(ChordOn(0, C::bc_maj).HarmFuncName(CSignKey(Nat(5), CSignKey::SignKey_Major), DefaultChordnamePref), "V");
}

} // namespace
