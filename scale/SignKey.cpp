// Keys: a major or minor scale with its name.
#include "SignKey.h"

namespace {

CScale::TType ScaleTypeOf(CSignKey::TType type) {
  return type == CSignKey::SignKey_Major ? CScale::Scale_Major : CScale::Scale_Minor;
}

} // namespace

CSignKey::CSignKey() : Scale_(CNote(0, Enh_Natural), CScale::Scale_Major) {}

CSignKey::CSignKey(CNote const& root, TType const& type) : Scale_(root, ScaleTypeOf(type)) {}

void CSignKey::SetRootNoteAndSignKeyType(CNote root, TType type) {
  Scale_.SetRootNoteAndScaleType(root, ScaleTypeOf(type));
}

void CSignKey::SetRootNote(CNote const& root) { Scale_.SetRootNote(root); }

void CSignKey::SetSignKeyType(TType type) { Scale_.SetScaleType(ScaleTypeOf(type)); }

CSignKey::TType CSignKey::SignKeyType() const {
  return Scale_.ScaleType() == CScale::Scale_Major ? SignKey_Major : SignKey_Minor;
}

std::string CSignKey::Name(CChordnamePref& pref) const {
  std::string name = Scale_.RootNote().KeyName(pref);
  if (SignKeyType() != SignKey_Major) name += 'm';
  return name;
}
