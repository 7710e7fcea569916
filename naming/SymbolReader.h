// The reader of chord symbols: the tones read so far and the state of the reading
// (internal). Lead-sheet symbols and Harte labels have a file each.
#ifndef TONVEX_NAMING_SYMBOLREADER_H
#define TONVEX_NAMING_SYMBOLREADER_H

#include "ChordSymbol.h"
#include "naming/SymbolScanner.h"

// The tones read so far, in the order they were written: the type's first.
class CReadTones {
public:
  static constexpr int Capacity = 32;

  /// Adds the tone unless it is there already; past the capacity, which no
  /// sensible symbol reaches, it is dropped and the tones count as overflowed.
  void Add(CSymbolTone tone) {
    for (int i = 0; i < Count_; ++i)
      if (Tones_[i] == tone) return;
    if (Count_ < Capacity)
      Tones_[Count_++] = tone;
    else
      Overflowed_ = true;
  }
  bool Overflowed() const { return Overflowed_; }
  /// Removes the tones of the role.
  void Omit(int role) {
    RemoveIf([role](CSymbolTone t) { return t.Role == role; });
  }
  /// Removes the tones of the interval (a Harte "*b3").
  void OmitIntvl(int intvl) {
    RemoveIf([intvl](CSymbolTone t) { return t.Intvl == intvl; });
  }
  bool HasRole(int role) const {
    for (int i = 0; i < Count_; ++i)
      if (Tones_[i].Role == role) return true;
    return false;
  }
  /// The altered tone replaces the natural tone of its role, or joins the chord
  /// where that is not there (a second alteration of one role, "C7b9#9").
  void Alter(CSymbolAlteration alteration) {
    for (int i = 0; i < Count_; ++i)
      if (Tones_[i] == alteration.Natural) {
        Tones_[i] = alteration.Altered;
        return;
      }
    Add(alteration.Altered);
  }
  int Count() const { return Count_; }
  CSymbolTone operator[](int i) const { return Tones_[i]; }

private:
  template <class F>
  void RemoveIf(F f) {
    int kept = 0;
    for (int i = 0; i < Count_; ++i)
      if (!f(Tones_[i])) Tones_[kept++] = Tones_[i];
    Count_ = kept;
  }

  CSymbolTone Tones_[Capacity];
  int Count_ = 0;
  bool Overflowed_ = false;
};

enum TQuality : int { Quality_Major, Quality_Minor, Quality_Dim, Quality_HalfDim, Quality_Aug, Quality_Power };

/// The tone of a written degree with its accidentals: an addition.
CSymbolTone AddedTone(int accidentals, int degree);

/// One reading of one text: Read fills the chord, or Problem says what stopped it.
class CSymbolReader {
public:
  explicit CSymbolReader(std::string_view text) : Text_(text), Scan_(text) {}

  bool Read(CChord& chord);
  CChordSymbolProblem Problem() const {
    CChordSymbolProblem problem;
    problem.Offset = FailPos_;
    problem.Part = std::string(Text_.substr(FailPos_));
    problem.Reason = FailReason_;
    return problem;
  }

private:
  bool Fail(std::size_t pos, char const* reason) {
    FailPos_ = pos;
    FailReason_ = reason;
    return false;
  }
  bool Unexpected() { return Fail(Scan_.Pos(), "unexpected text"); }

  // Each Read function reads its part at the scanner's position; false after a
  // Fail, which names the place.
  bool ReadNoChord();
  bool ReadLeadSheet();
  void ReadQuality();
  bool ReadMajorMark(bool& alone);
  bool OmitFollows() const;
  void ReadExtension();
  void ApplyExtension(int ext, bool major);
  bool ReadModifier(bool inGroup);
  bool ReadDegree(int& accidentals, int& degree, bool signs);
  bool ReadHarte();
  bool ReadHarteDegrees(CSymbolScanner& scan, bool omissions);
  bool ReadBass();
  bool Build(CChord& chord);

  std::string_view Text_;
  CSymbolScanner Scan_;
  std::size_t FailPos_ = 0;
  char const* FailReason_ = "";

  CSpelledPitch Root_ = {0, 0};
  TQuality Quality_ = Quality_Major;
  int Extension_ = 0; // 6, 69, 7, 9, 11, 13 or 0
  bool MajorSeventh_ = false;
  CReadTones Tones_;
  bool HasBass_ = false;
  CSpelledPitch Bass_ = {0, 0};
};

#endif
