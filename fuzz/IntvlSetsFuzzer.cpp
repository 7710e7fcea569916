// Interval sets under any wrap interval (0, negative, INT_MIN included): the
// insertion rule, the list operations, inversion, comparison and printing; the
// chord type catalogue's lookups by any id.
#include "FuzzInput.h"

#include <tonvex/ChordTypes.h>
#include <tonvex/IntvlSet.h>

#include <sstream>
#include <vector>

namespace {

std::vector<int> List(CFuzzInput& in) {
  std::vector<int> values(in.Count(20));
  for (int& v : values) v = in.IntMostlyIn(-2, 40);
  return values;
}

// Every member is left unchanged by the insertion rule, so inserting it into an
// empty set of the same wrap interval stores exactly it.
void CheckMembers(CIntvlSet const& set) {
  int previous = -1;
  for (int m : set) {
    Require(m >= 0 && m > previous);
    previous = m;
    CIntvlSet alone(set.WrapIntvl());
    alone.InsertIntvl(m);
    Require(alone.size() == 1 && alone.HasIntvl(m));
  }
  for (unsigned long n = 0; n < set.size(); ++n) Require(set.HasIntvl(set.Intvl(n)));
  Require(set.Intvl(set.size()) == -1);
}

void Query(CIntvlSet const& set, CFuzzInput& in) {
  std::vector<int> const values = List(in);
  set.HasIntvl(in.AnyInt());
  set.HasIntvlsFromList(values.data(), values.size());
  set.HasExactTheseIntvlsFromList(values.data(), values.size());
  set.HasIntvls(in.AnyInt(), in.AnyInt(), -1);
  set.HasExactTheseIntvls(in.AnyInt(), in.AnyInt(), in.AnyInt(), -1);
  set.HasIntvlInAnyOctave(in.AnyInt());
  set.HasOtherStackedThirdsOptionThan(in.AnyInt());
  set.Intvl(static_cast<unsigned long>(in.AnyInt()));
  CIntvlSet const inverted = set.Inversion(static_cast<unsigned long>(in.AnyInt()));
  CheckMembers(inverted);
  Require(inverted.size() <= set.size());
  std::ostringstream out;
  out << set;
}

void Edit(CIntvlSet& set, CFuzzInput& in) {
  std::vector<int> const values = List(in);
  switch (in.Pick(8)) {
  case 0: set.InsertIntvl(in.AnyInt()); break;
  case 1: set.EraseIntvl(in.AnyInt()); break;
  case 2: set.EraseIntvlsFromTo(in.AnyInt(), in.AnyInt()); break;
  case 3: set.SetIntvlsFromList(values.data(), values.size()); break;
  case 4: set.SetIntvls(in.AnyInt(), in.AnyInt(), in.AnyInt(), -1); break;
  case 5: set.SetWrapIntvl(in.AnyInt()); break;
  case 6: set.Invert(); break;
  default: set.Clear(); break;
  }
  CheckMembers(set);
}

void LookUpChordTypes(CFuzzInput& in) {
  static CChordTypes const catalogue;
  CChordTypes user;
  for (std::size_t k = in.Count(4); k > 0; --k)
    user.AddUserType(CChordType(in.AnyInt(), in.Text(16), CIntvlSet(in.AnyInt(), in.AnyInt(), -1), in.AnyInt()));
  catalogue.ChordTypeBuiltInFromId(in.AnyInt());
  CChordTypes const& constUser = user;
  constUser.ChordTypeUserFromId(in.AnyInt());
  auto const pos = user.ChordTypeUserFromId(in.AnyInt());
  if (pos != user.UserTypes().end()) CheckMembers(pos->Intvls());
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  CFuzzInput in(data, size);
  int const wrap = in.Bool() ? in.IntMostlyIn(-13, 48) : in.AnyInt();
  CIntvlSet set(wrap);
  CIntvlSet other(in.AnyInt(), in.AnyInt(), in.AnyInt(), in.AnyInt(), -1);
  CheckMembers(other);
  for (int step = 0; step < 24 && !in.Empty(); ++step) {
    Edit(set, in);
    if (in.Bool()) Query(set, in);
    if (in.Pick(6) == 0) other = set;
    if (in.Pick(8) == 0) LookUpChordTypes(in);
  }
  Query(set, in);
  static_cast<void>(set == other);
  static_cast<void>(other == set);
  CIntvlSet copy(set);
  Require(copy == set && set == copy && copy.WrapIntvl() == set.WrapIntvl());
  return 0;
}
