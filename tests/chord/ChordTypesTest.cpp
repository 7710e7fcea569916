// The chord type catalogue: built-in types found by id and, where XG has the type,
// recognised as it; user types kept apart and unique by id.
#include "support/ChordBuilders.h"

#include <tonvex/ChordTypes.h>

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace {

using namespace chordtest;

TEST(ChordTypes, BuiltInTypesAreFoundByIdAndRecognisedAsTheirXGType) {
  CChordTypes const types;
  std::set<CChordTypeId> ids;
  for (CChordType const& type : types.BuiltInTypes()) {
    EXPECT_TRUE(ids.insert(type.Id()).second) << type.Id();
    EXPECT_EQ(types.ChordTypeBuiltInFromId(type.Id())->Name(), type.Name());
    EXPECT_EQ(type.Intvls().WrapIntvl(), 24) << type.Name(); // a ninth stays 14
    EXPECT_EQ(type.Tag(), 0);
    std::vector<long> notes;
    for (int i : type.Intvls()) notes.push_back(60 + i);
    // An XG type numbered n has the id n + 1; the others have ids from 100.
    EXPECT_TRUE(type.Id() >= 100 || NotesThenRoot(Nat(60), notes).XGChordIx() + 1 == type.Id()) << type.Name();
  }
  EXPECT_EQ(ids.size(), 17u);
  for (CChordTypeId missing : {0, 4, 35, 99, 102, -1})
    EXPECT_EQ(types.ChordTypeBuiltInFromId(missing), types.BuiltInTypes().end()) << missing;
}

TEST(ChordTypes, UserTypesAreKeptApartAndUniqueById) {
  CChordTypes types;
  EXPECT_TRUE(types.AddUserType(CChordType(500, "quartal", CIntvlSet(24, 0, 5, 10, -1), 7)));
  EXPECT_TRUE(types.AddUserType(CChordType(1, "power", CIntvlSet(12, 0, 7, -1), -3)));
  EXPECT_FALSE(types.AddUserType(CChordType(500, "other", CIntvlSet(24, 0, -1), 0)));
  ASSERT_EQ(types.UserTypes().size(), 2u);
  *types.ChordTypeUserFromId(500) = CChordType(500, "quartal 4", CIntvlSet(24, 0, 5, 10, 15, -1), 8);
  CChordTypes const& view = types;
  EXPECT_EQ(view.ChordTypeUserFromId(500)->Name(), "quartal 4");
  EXPECT_EQ(view.ChordTypeUserFromId(500)->Intvls().size(), 4u);
  CChordType const power = *view.ChordTypeUserFromId(1);
  EXPECT_EQ(power.Name(), "power");
  EXPECT_EQ(power.Intvls().WrapIntvl(), 12);
  EXPECT_EQ(power.Tag(), -3);
  EXPECT_EQ(view.ChordTypeBuiltInFromId(1)->Name(), "major"); // the lists are searched apart
  EXPECT_EQ(view.ChordTypeUserFromId(9), view.UserTypes().end());
}

} // namespace
