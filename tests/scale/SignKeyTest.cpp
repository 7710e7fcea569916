// Keys: names in every naming style, types, sign counts and spellings.
#include "ScaleOracle.h"
#include "support/PrefGuard.h"
#include "support/TestPrelude.h"

namespace {

// Only type 1 is major; the key's scale is the major or minor scale on its root,
// which is taken as a key number; setting the type keeps the root.
TEST(SignKey, EveryRootTypeAndNamingStyle) {
  PrefGuard guard;
  for (scaleoracle::Root root : scaleoracle::Roots())
    for (int type : {-1, 0, 1, 2, 8}) {
      int const scaleType = type == 1 ? 1 : 2;
      CSignKey key(CNote(36 + root.k, static_cast<TEnh>(root.e)), static_cast<CSignKey::TType>(3 - scaleType));
      key.SetSignKeyType(static_cast<CSignKey::TType>(type));
      EXPECT_EQ(key.SignKeyType(), scaleType) << type;
      EXPECT_EQ(key.RootNote(), CNote(root.k, static_cast<TEnh>(root.e)));
      EXPECT_EQ(key.SignsCount(), oracle::SignCount(root.k, root.e, scaleType));
      scaleoracle::SpellingTable const spellings = scaleoracle::Spellings(root, scaleType);
      for (int pc = 0; pc < 12; ++pc) EXPECT_EQ(key.Scale().EnhForKeynr(pc), spellings.e[pc]);
      for (int flags = 0; flags < 16; ++flags) {
        PrefGuard::NoteNaming(flags & 1, flags & 2, flags & 4, flags & 8);
        std::string const name = oracle::Name(root.k, root.e, flags & 1, flags & 2, flags & 4, flags & 8);
        EXPECT_EQ(key.Name(DefaultChordnamePref), type == 1 ? name : name + "m") << flags;
      }
    }
}

} // namespace
