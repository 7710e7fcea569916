// Scales: root, type and degrees.
#include "scale/DefaultScaleType.h"

#include "Scale.h"

const CScale::TType CScale_DefaultScaleType = CScale::Scale_Major;

namespace {

// Key numbers above the root, by degree; entries past the last degree are 0.
constexpr int MajorDegreeKeyNrs[12] = {0, 2, 4, 5, 7, 9, 11, 0, 0, 0, 0, 0};
constexpr int MinorDegreeKeyNrs[12] = {0, 2, 3, 5, 7, 8, 10, 0, 0, 0, 0, 0};
constexpr int ChromDegreeKeyNrs[12] = {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11};
constexpr int MajorMinorDegreeKeyNrs[12] = {0, 2, 3, 4, 5, 7, 9, 10, 11, 0, 0, 0};
constexpr int MajorAddb7DegreeKeyNrs[12] = {0, 2, 4, 5, 7, 9, 10, 11, 0, 0, 0, 0};
constexpr int MinorHarmDegreeKeyNrs[12] = {0, 2, 3, 5, 7, 8, 11, 0, 0, 0, 0, 0};
constexpr int MinorMeloDegreeKeyNrs[12] = {0, 2, 3, 5, 7, 9, 11, 0, 0, 0, 0, 0};

const int* DegreeKeyNrs(CScale::TType type) {
  switch (type) {
  case CScale::Scale_Minor: return MinorDegreeKeyNrs;
  case CScale::Scale_Chromatic: return ChromDegreeKeyNrs;
  case CScale::Scale_MajorMinor: return MajorMinorDegreeKeyNrs;
  case CScale::Scale_MajorAddb7: return MajorAddb7DegreeKeyNrs;
  case CScale::Scale_MinorHarm: return MinorHarmDegreeKeyNrs;
  case CScale::Scale_MinorMelo: return MinorMeloDegreeKeyNrs;
  default: return MajorDegreeKeyNrs; // Scale_Other, Scale_Major and every unknown value
  }
}

// The root of a scale is a key number; a negative note number gives 0. The
// constructor of CNote applies CheckEnh.
CNote RootKey(CNote const& root) {
  long k = root.NoteNr() % 12;
  return CNote(k < 0 ? 0 : k, root.Enh());
}

} // namespace

CScale::CScale() : CScale(CNote(0, Enh_Natural), CScale_DefaultScaleType) {}

CScale::CScale(CNote root, TType type) { SetRootNoteAndScaleType(root, type); }

void CScale::SetRootNoteAndScaleType(CNote root, TType type) {
  Type_ = type;
  SetRootNote(root);
}

void CScale::SetRootNote(CNote root) {
  Root_ = RootKey(root);
  CalcEnh();
}

void CScale::SetScaleType(TType type) {
  if (type == Type_) return;
  Type_ = type;
  CalcEnh();
}

void CScale::SetScaleTypeWithoutCalcEnh(TType type) { Type_ = type; }

int CScale::DegreesPerOctave() const {
  switch (Type_) {
  case Scale_Chromatic: return 12;
  case Scale_MajorMinor: return 9;
  case Scale_MajorAddb7: return 8;
  default: return 7;
  }
}

int CScale::DegreeNrToKeyNr(int d) const {
  int root = Root_.KeyNr();
  if (d < 0) return root;
  return (root + DegreeKeyNrs(Type_)[d % DegreesPerOctave()]) % 12;
}

CNote CScale::DegreeNrToKey(int d) const {
  int k = DegreeNrToKeyNr(d);
  return CNote(k, Enh_[k]);
}

int CScale::KeyNrToDegreeNr(int k) const {
  int n = DegreesPerOctave();
  for (int d = 0; d < n; ++d)
    if (DegreeNrToKeyNr(d) == k) return d;
  return -1;
}

int CScale::NoteToDegreeNr(CNote note) const { return KeyNrToDegreeNr(note.KeyNr()); }
