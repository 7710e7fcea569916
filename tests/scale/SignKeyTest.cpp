// Keys: names in every naming style, types, sign counts and spellings, setters.
#include "ScaleOracle.h"
#include "support/PrefGuard.h"

#include <tonvex/SignKey.h>

#include <gtest/gtest.h>

namespace {

TEnh E(int e) { return static_cast<TEnh>(e); }
CSignKey::TType K(int type) { return static_cast<CSignKey::TType>(type); }

// Only type 1 is major; the key's scale is the major or minor scale on its root.
TEST(SignKey, EveryRootTypeAndNamingStyle) {
  PrefGuard guard;
  for (scaleoracle::Root root : scaleoracle::Roots())
    for (int type : {-1, 0, 1, 2, 3, 8, 100}) {
      int const scaleType = type == 1 ? 1 : 2;
      CSignKey const key(CNote(36 + root.k, E(root.e)), K(type));
      CSignKey set;
      set.SetRootNoteAndSignKeyType(CNote(root.k, E(root.e)), K(type));
      for (CSignKey const& k : {key, set}) {
        EXPECT_EQ(k.SignKeyType(), scaleType) << type;
        EXPECT_EQ(k.RootNote(), CNote(root.k, E(root.e)));
        EXPECT_EQ(k.SignsCount(), oracle::SignCount(root.k, root.e, scaleType));
        scaleoracle::SpellingTable const spellings = scaleoracle::Spellings(root, scaleType);
        for (int pc = 0; pc < 12; ++pc) EXPECT_EQ(k.Scale().EnhForKeynr(pc), spellings.e[pc]);
      }
      for (int flags = 0; flags < 16; ++flags) {
        PrefGuard::NoteNaming(flags & 1, flags & 2, flags & 4, flags & 8);
        std::string const name = oracle::Name(root.k, root.e, flags & 1, flags & 2, flags & 4, flags & 8);
        EXPECT_EQ(key.Name(DefaultChordnamePref), type == 1 ? name : name + "m") << flags;
      }
    }
}

TEST(SignKey, Setters) {
  CSignKey key(CNote(64, Enh_Natural), CSignKey::SignKey_Minor); // E minor
  key.SetSignKeyType(CSignKey::SignKey_Major);
  EXPECT_EQ(key.SignsCount(), 4);
  EXPECT_EQ(key.Scale().EnhForKeynr(5), Enh_Sharp); // E# above the root of a major key
  key.SetSignKeyType(K(5));
  EXPECT_EQ(key.SignKeyType(), CSignKey::SignKey_Minor);
  EXPECT_EQ(key.Scale().EnhForKeynr(5), Enh_Natural); // F, the lowered second of a minor key
  key.SetRootNote(CNote(70, Enh_Sharp));              // A# minor, the type kept
  EXPECT_EQ(key.SignsCount(), 7);
  CNote negative(64, Enh_Natural);
  negative.SetOct(-2);
  key.SetRootNote(negative);
  EXPECT_EQ(key.RootNote(), CNote(0, Enh_Natural));
}

} // namespace
