// The chord type catalogue and its lookups.
#include "ChordTypes.h"

#include <algorithm>
#include <utility>

namespace {

template <class Iterator>
Iterator FirstWithId(Iterator first, Iterator last, CChordTypeId id) {
  return std::find_if(first, last, [id](CChordType const& type) { return type.Id() == id; });
}

} // namespace

CChordType::CChordType(CChordTypeId id, std::string name, CIntvlSet intvls, int tag)
    : Id_(id), Name_(std::move(name)), Intvls_(std::move(intvls)), Tag_(tag) {}

CChordTypes::CChordTypes() {
  BuiltIn_.reserve(17);
  BuiltIn_.push_back(CChordType(1, "major", CIntvlSet(24, 0, 4, 7, -1), 0));
  BuiltIn_.push_back(CChordType(9, "minor", CIntvlSet(24, 0, 3, 7, -1), 0));
  BuiltIn_.push_back(CChordType(34, "sus2", CIntvlSet(24, 0, 2, 7, -1), 0));
  BuiltIn_.push_back(CChordType(33, "sus4", CIntvlSet(24, 0, 5, 7, -1), 0));
  BuiltIn_.push_back(CChordType(2, "major 6", CIntvlSet(24, 0, 4, 7, 9, -1), 0));
  BuiltIn_.push_back(CChordType(7, "major 6 added 9", CIntvlSet(24, 0, 4, 7, 9, 14, -1), 0));
  BuiltIn_.push_back(CChordType(100, "minor b6", CIntvlSet(24, 0, 3, 7, 8, -1), 0));
  BuiltIn_.push_back(CChordType(10, "minor 6", CIntvlSet(24, 0, 3, 7, 9, -1), 0));
  BuiltIn_.push_back(CChordType(104, "minor 6 added 9", CIntvlSet(24, 0, 3, 7, 9, 14, -1), 0));
  BuiltIn_.push_back(CChordType(20, "major 7", CIntvlSet(24, 0, 4, 7, 10, -1), 0));
  BuiltIn_.push_back(CChordType(22, "major 7 b5", CIntvlSet(24, 0, 4, 6, 10, -1), 0));
  BuiltIn_.push_back(CChordType(26, "major 7 b9", CIntvlSet(24, 0, 4, 7, 10, 13, -1), 0));
  BuiltIn_.push_back(CChordType(28, "major 7 #9", CIntvlSet(24, 0, 4, 7, 10, 15, -1), 0));
  BuiltIn_.push_back(CChordType(101, "major 7 b5 #9", CIntvlSet(24, 0, 4, 6, 10, 15, -1), 0));
  BuiltIn_.push_back(CChordType(3, "major j7", CIntvlSet(24, 0, 4, 7, 11, -1), 0));
  BuiltIn_.push_back(CChordType(11, "minor 7", CIntvlSet(24, 0, 3, 7, 10, -1), 0));
  BuiltIn_.push_back(CChordType(16, "minor j7", CIntvlSet(24, 0, 3, 7, 11, -1), 0));
}

CChordTypes::TChordTypeList::const_iterator CChordTypes::ChordTypeBuiltInFromId(CChordTypeId id) const {
  return FirstWithId(BuiltIn_.begin(), BuiltIn_.end(), id);
}

CChordTypes::TChordTypeList::iterator CChordTypes::ChordTypeUserFromId(CChordTypeId id) {
  return FirstWithId(User_.begin(), User_.end(), id);
}

CChordTypes::TChordTypeList::const_iterator CChordTypes::ChordTypeUserFromId(CChordTypeId id) const {
  return FirstWithId(User_.begin(), User_.end(), id);
}

bool CChordTypes::AddUserType(CChordType type) {
  if (ChordTypeUserFromId(type.Id()) != User_.end()) return false;
  User_.push_back(std::move(type));
  return true;
}
