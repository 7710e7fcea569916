// The chord type catalogue: the built-in list read as data, lookups, user types.
#include <tonvex/ChordTypes.h>

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

namespace {

struct Row {
  CChordTypeId id;
  char const* name;
  std::vector<int> intvls;
};

// The catalogue in its order.
std::vector<Row> const Catalogue = {
    {1, "major", {0, 4, 7}},
    {9, "minor", {0, 3, 7}},
    {34, "sus2", {0, 2, 7}},
    {33, "sus4", {0, 5, 7}},
    {2, "major 6", {0, 4, 7, 9}},
    {7, "major 6 added 9", {0, 4, 7, 9, 14}},
    {100, "minor b6", {0, 3, 7, 8}},
    {10, "minor 6", {0, 3, 7, 9}},
    {104, "minor 6 added 9", {0, 3, 7, 9, 14}},
    {20, "major 7", {0, 4, 7, 10}},
    {22, "major 7 b5", {0, 4, 6, 10}},
    {26, "major 7 b9", {0, 4, 7, 10, 13}},
    {28, "major 7 #9", {0, 4, 7, 10, 15}},
    {101, "major 7 b5 #9", {0, 4, 6, 10, 15}},
    {3, "major j7", {0, 4, 7, 11}},
    {11, "minor 7", {0, 3, 7, 10}},
    {16, "minor j7", {0, 3, 7, 11}},
};

std::vector<int> Members(CIntvlSet const& set) { return std::vector<int>(set.begin(), set.end()); }

TEST(ChordTypes, BuiltInTypesInCatalogueOrder) {
  CChordTypes types;
  auto const& builtIn = types.BuiltInTypes();
  ASSERT_EQ(builtIn.size(), Catalogue.size());
  for (std::size_t k = 0; k < Catalogue.size(); ++k) {
    Row const& row = Catalogue[k];
    CChordType const& type = builtIn[k];
    EXPECT_EQ(type.Id(), row.id) << k;
    EXPECT_EQ(type.Name(), row.name) << k;
    EXPECT_EQ(Members(type.Intvls()), row.intvls) << row.name;
    EXPECT_EQ(type.Intvls().WrapIntvl(), 24) << row.name;
    EXPECT_EQ(type.Tag(), 0) << row.name;
  }
  EXPECT_TRUE(types.UserTypes().empty());
  // The added ninth is kept as 14: wrap 24 does not fold it to 2.
  EXPECT_TRUE(builtIn[5].Intvls().HasIntvl(14));
  EXPECT_FALSE(builtIn[5].Intvls().HasIntvl(2));
}

TEST(ChordTypes, BuiltInLookupByIdOrEnd) {
  CChordTypes const types;
  for (Row const& row : Catalogue) {
    auto found = types.ChordTypeBuiltInFromId(row.id);
    ASSERT_NE(found, types.BuiltInTypes().end()) << row.id;
    EXPECT_EQ(found->Name(), row.name);
  }
  for (CChordTypeId missing : {0, 4, 5, 8, 35, 99, 102, 103, 105, -1, -100000})
    EXPECT_EQ(types.ChordTypeBuiltInFromId(missing), types.BuiltInTypes().end()) << missing;
  EXPECT_EQ(types.ChordTypeUserFromId(1), types.UserTypes().end());
  CChordTypes mutableTypes;
  EXPECT_EQ(mutableTypes.ChordTypeUserFromId(1), mutableTypes.ChordTypeUserFromId(1));
  EXPECT_TRUE(mutableTypes.ChordTypeUserFromId(1) == std::as_const(mutableTypes).UserTypes().end());
}

TEST(ChordTypes, UserTypesAreKeptApartAndUniqueById) {
  CChordTypes types;
  EXPECT_TRUE(types.AddUserType(CChordType(500, "quartal", CIntvlSet(24, 0, 5, 10, -1), 7)));
  EXPECT_TRUE(types.AddUserType(CChordType(1, "power", CIntvlSet(12, 0, 7, -1), -3)));
  EXPECT_FALSE(types.AddUserType(CChordType(500, "other", CIntvlSet(24, 0, -1), 0)));
  ASSERT_EQ(types.UserTypes().size(), 2u);

  auto quartal = types.ChordTypeUserFromId(500);
  ASSERT_NE(quartal, types.UserTypes().end());
  EXPECT_EQ(quartal->Name(), "quartal");
  EXPECT_EQ(quartal->Tag(), 7);
  EXPECT_EQ(Members(quartal->Intvls()), (std::vector<int>{0, 5, 10}));

  CChordTypes const& view = types;
  auto power = view.ChordTypeUserFromId(1);
  ASSERT_NE(power, view.UserTypes().end());
  EXPECT_EQ(power->Name(), "power");
  EXPECT_EQ(power->Intvls().WrapIntvl(), 12);
  EXPECT_EQ(power->Tag(), -3);
  EXPECT_EQ(view.ChordTypeBuiltInFromId(1)->Name(), "major"); // the lists are searched apart
  EXPECT_EQ(view.BuiltInTypes().size(), Catalogue.size());
  EXPECT_EQ(view.ChordTypeUserFromId(9), view.UserTypes().end());

  *types.ChordTypeUserFromId(500) = CChordType(500, "quartal 4", CIntvlSet(24, 0, 5, 10, 15, -1), 8);
  EXPECT_EQ(view.ChordTypeUserFromId(500)->Name(), "quartal 4");
  EXPECT_EQ(view.ChordTypeUserFromId(500)->Intvls().size(), 4u);

  CChordType copy = *view.ChordTypeUserFromId(1);
  EXPECT_EQ(copy.Id(), 1);
  EXPECT_EQ(copy.Name(), "power");
  EXPECT_EQ(copy.Intvls().WrapIntvl(), 12);
  EXPECT_EQ(copy.Tag(), -3);
}

} // namespace
