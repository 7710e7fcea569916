// The chord type catalogue: named chord types, each an interval set above a root.
//
// A CChordTypes holds the built-in types, fixed by its constructor, and a list of
// types that the client adds. Built-in identifiers follow the chord type numbering of
// the MIDI XG standard: a type with an XG number n has the id n + 1 (major 1, minor 9,
// dominant seventh 20, root-second-fifth 34), so CChord::XGChordIx() + 1 finds the
// entry; types that XG lacks have ids from 100 upward.
//
// Names: "major 7" is the chord with major third and minor seventh, "j7" marks the
// major seventh, "b" and "#" a lowered or raised degree, "added 9" a ninth without a
// seventh. Built-in interval sets have wrap interval 24, so ninths stay 13, 14, 15.
#ifndef TONVEX_CHORDTYPES_H
#define TONVEX_CHORDTYPES_H

#include "IntvlSet.h"
#include "TonvexExport.h"

#include <cstdint>
#include <string>
#include <vector>

/// Identifier of a chord type, unique within its list.
using CChordTypeId = std::int32_t;

/// One named chord type. A plain value: copied and assigned as a whole.
class TONVEX_API CChordType {
public:
  /// Stores the four values; the interval set keeps its own wrap interval.
  CChordType(CChordTypeId id, std::string name, CIntvlSet intvls, int tag);

  CChordTypeId Id() const { return Id_; }
  /// For example "major 7 b9".
  std::string const& Name() const { return Name_; }
  /// The intervals above the root.
  CIntvlSet const& Intvls() const { return Intvls_; }
  /// A number the client attaches to its own types (a sort key, an index into its
  /// own tables, flags); the library only stores and copies it. 0 for every built-in
  /// type.
  int Tag() const { return Tag_; }

private:
  CChordTypeId Id_;
  std::string Name_;
  CIntvlSet Intvls_;
  int Tag_;
};

/// The catalogue: 17 built-in types in a fixed order, and the client's own types.
///
/// Lookups search from the front of one list and the first match wins; they return
/// the end of that list when no entry has the id.
class TONVEX_API CChordTypes {
public:
  using TChordTypeList = std::vector<CChordType>;

  /// The built-in types, in this order (id, name, intervals):
  ///   1 "major" 0 4 7;  9 "minor" 0 3 7;  34 "sus2" 0 2 7;  33 "sus4" 0 5 7;
  ///   2 "major 6" 0 4 7 9;  7 "major 6 added 9" 0 4 7 9 14;  100 "minor b6" 0 3 7 8;
  ///   10 "minor 6" 0 3 7 9;  104 "minor 6 added 9" 0 3 7 9 14;  20 "major 7" 0 4 7 10;
  ///   22 "major 7 b5" 0 4 6 10;  26 "major 7 b9" 0 4 7 10 13;
  ///   28 "major 7 #9" 0 4 7 10 15;  101 "major 7 b5 #9" 0 4 6 10 15;
  ///   3 "major j7" 0 4 7 11;  11 "minor 7" 0 3 7 10;  16 "minor j7" 0 3 7 11.
  /// No user types.
  CChordTypes();

  TChordTypeList const& BuiltInTypes() const { return BuiltIn_; }
  TChordTypeList const& UserTypes() const { return User_; }

  /// The first built-in type with this id, or BuiltInTypes().end().
  TChordTypeList::const_iterator ChordTypeBuiltInFromId(CChordTypeId id) const;
  /// The first user type with this id, or the end of the user list. Through the
  /// non-const form an entry may be replaced (*it = CChordType(...)).
  TChordTypeList::iterator ChordTypeUserFromId(CChordTypeId id);
  TChordTypeList::const_iterator ChordTypeUserFromId(CChordTypeId id) const;

  /// Appends a user type, keeping ids unique within the user list: a type whose id
  /// is already there is not added and false comes back. A user type may share an id
  /// with a built-in type; the two lists are searched separately. Adding may move
  /// the user list, so positions into it obtained before are no longer valid.
  bool AddUserType(CChordType type);

private:
  TChordTypeList BuiltIn_;
  TChordTypeList User_;
};

#endif
