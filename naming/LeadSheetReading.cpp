// Reading lead-sheet symbols: the quality, the extension and the alterations,
// additions, omissions and suspensions after them.
#include "naming/SymbolReader.h"

bool CSymbolReader::ReadLeadSheet() {
  ReadQuality();
  ReadExtension();
  Tones_.Add(ToneRoot);
  if (Quality_ != Quality_Power) Tones_.Add(Quality_ == Quality_Major || Quality_ == Quality_Aug ? ToneMaj3 : ToneMin3);
  Tones_.Add(Quality_ == Quality_Aug                                  ? ToneAug5
             : Quality_ == Quality_Dim || Quality_ == Quality_HalfDim ? ToneDim5
                                                                      : ToneP5);
  if (Quality_ == Quality_HalfDim && Extension_ == 0) Extension_ = 7;
  ApplyExtension(Extension_, MajorSeventh_);
  // The alterations, additions, omissions and suspensions, alone or in parentheses.
  bool inGroup = false;
  for (;;) {
    Scan_.SkipBlanks();
    char const next = Scan_.Peek();
    if (next == '\0' || next == '/') break;
    if (Scan_.Take(",")) continue;
    if (Scan_.Take("(")) {
      if (inGroup) return Fail(Scan_.Pos() - 1, "'(' inside parentheses");
      inGroup = true;
    } else if (Scan_.Take(")")) {
      if (!inGroup) return Fail(Scan_.Pos() - 1, "')' without '('");
      inGroup = false;
    } else if (!ReadModifier(inGroup)) {
      return false;
    }
  }
  if (inGroup) return Fail(Scan_.Pos(), "missing ')'");
  return true;
}

// The quality right after the root: m min mi - (minor), dim o ° (diminished), ø Ø
// (half-diminished), aug + (augmented), 5 (root and fifth), or a major-seventh mark.
void CSymbolReader::ReadQuality() {
  // "min" and "mi" first ("Mi7" is minor), then the major marks ("maj7" and "ma7"
  // begin with the "m" of minor, "M7" is major).
  CSymbolScanner const start = Scan_;
  if (Scan_.TakeWord("min") || (Scan_.TakeWord("mi") && !Scan_.NextIsLetter())) {
    Quality_ = Quality_Minor;
    return;
  }
  Scan_ = start;
  bool alone = false;
  if (ReadMajorMark(alone)) {
    MajorSeventh_ = true;
  } else if (Scan_.Take("m") || Scan_.Take("-")) {
    Quality_ = Quality_Minor;
    MajorSeventh_ = ReadMajorMark(alone); // mM7, mmaj7, mΔ7
  } else if (Scan_.TakeWord("dim") || Scan_.Take("\xC2\xB0") || (!OmitFollows() && Scan_.Take("o"))) {
    Quality_ = Quality_Dim;
  } else if (Scan_.Take("\xC3\xB8") || Scan_.Take("\xC3\x98")) {
    Quality_ = Quality_HalfDim;
  } else if (Scan_.TakeWord("aug") || Scan_.Take("+")) {
    Quality_ = Quality_Aug;
  } else if (Scan_.Peek() == '5' && !Scan_.IsDigitAt(1) && Scan_.Take("5")) {
    Quality_ = Quality_Power;
  }
  if (alone) Extension_ = 7;
}

// Whether "omit" follows, whose "o" is not the diminished sign ("Coadd9" is).
bool CSymbolReader::OmitFollows() const {
  CSymbolScanner ahead = Scan_;
  return ahead.TakeWord("omit");
}

// A mark of the major seventh: maj, or ma or j before a number, M, Δ. A Δ without
// a number stands for maj7 (alone).
bool CSymbolReader::ReadMajorMark(bool& alone) {
  CSymbolScanner const start = Scan_;
  alone = false;
  if (Scan_.Take("\xCE\x94")) {
    alone = !Scan_.NextIsDigit();
    return true;
  }
  if (Scan_.TakeWord("maj") || ((Scan_.TakeWord("ma") || Scan_.Take("j")) && Scan_.NextIsDigit())) return true;
  Scan_ = start;
  return Scan_.Take("M");
}

// The number after the quality: 6, 6/9, 69, 7, 9, 11, 13.
void CSymbolReader::ReadExtension() {
  if (Extension_ != 0 || Quality_ == Quality_Power) return;
  CSymbolScanner const start = Scan_;
  int number = 0;
  if (!Scan_.TakeNumber(number)) return;
  if (number == 6 && Scan_.Take("/9")) number = 69;
  if (number == 6 || number == 69 || number == 7 || number == 9 || number == 11 || number == 13)
    Extension_ = number;
  else
    Scan_ = start;
}

// The tones of an extension: a sixth (and ninth), or a seventh and the tensions up
// to the number (the 13th without the 11th). The seventh is major after a major
// mark, diminished (bb7) in a diminished chord, else minor.
void CSymbolReader::ApplyExtension(int ext, bool major) {
  if (ext == 6 || ext == 69) Tones_.Add(ToneSix);
  if (ext == 69) Tones_.Add(ToneNine);
  if (ext < 7 || ext == 69) return;
  Tones_.Add(major ? ToneMaj7 : Quality_ == Quality_Dim ? ToneDim7 : ToneMin7);
  if (ext >= 9) Tones_.Add(ToneNine);
  if (ext == 11) Tones_.Add(ToneEleven);
  if (ext == 13) Tones_.Add(ToneThirteen);
}

bool CSymbolReader::ReadModifier(bool inGroup) {
  std::size_t const start = Scan_.Pos();
  int accidentals = 0, degree = 0, number = 0;
  if (Scan_.TakeWord("sus")) {
    bool const second = Scan_.Take("2");
    if (!second) Scan_.Take("4");
    Tones_.Omit(Role_Third);
    Tones_.Add(second ? ToneSus2 : ToneSus4);
    return true;
  }
  if (Scan_.TakeWord("alt")) {
    if (!Tones_.HasRole(Role_Seventh)) Tones_.Add(ToneMin7);
    for (int i = 0; i < 4; ++i) Tones_.Alter(SymbolAlterations[i]);
    return true;
  }
  if (Scan_.TakeWord("add")) {
    Scan_.SkipBlanks();
    CSymbolScanner const mark = Scan_;
    if ((Scan_.TakeWord("maj") || Scan_.Take("M") || Scan_.Take("\xCE\x94")) && Scan_.Take("7")) {
      Tones_.Add({11, 7, Role_Added});
      return true;
    }
    Scan_ = mark;
    if (!ReadDegree(accidentals, degree, false)) return false;
    // "add7" could mean either seventh; "addb7" and "addmaj7" say which.
    if (degree == 7 && accidentals == 0) return Fail(start, "ambiguous 'add7' (addb7 or addmaj7)");
    Tones_.Add(AddedTone(accidentals, degree));
    return true;
  }
  if (Scan_.TakeWord("no root")) {
    Tones_.Omit(Role_Root);
    return true;
  }
  if (Scan_.TakeWord("omit") || Scan_.TakeWord("no")) {
    Scan_.SkipBlanks();
    static constexpr int Roles[14] = {-1, Role_Root,  -1, Role_Third,    -1, Role_Fifth,     -1, Role_Seventh,
                                      -1, Role_Ninth, -1, Role_Eleventh, -1, Role_Thirteenth};
    std::size_t const at = Scan_.Pos();
    if (!Scan_.TakeNumber(number) || number > 13 || Roles[number] < 0) return Fail(at, "not a degree to omit");
    Tones_.Omit(Roles[number]);
    if (number == 7) Tones_.Omit(Role_Sixth);
    return true;
  }
  // An extension after a major mark, as in Cm(maj7), or a bare 7 in parentheses.
  bool alone = false;
  bool const major = ReadMajorMark(alone);
  if (major || (inGroup && Scan_.Peek() == '7' && !Scan_.IsDigitAt(1))) {
    if (alone)
      number = 7;
    else if (!Scan_.TakeNumber(number))
      return Fail(start, "a major seventh mark without a number");
    if (Tones_.HasRole(Role_Seventh) || Tones_.HasRole(Role_Sixth) ||
        !(number == 7 || number == 9 || number == 11 || number == 13))
      return Fail(start, "an extension after the chord's seventh or sixth");
    ApplyExtension(number, major);
    return true;
  }
  if (!Scan_.DegreeFollows(true)) return Unexpected();
  if (!ReadDegree(accidentals, degree, true)) return false;
  // A bare degree in parentheses is an addition, as in C7(9, 13).
  if (accidentals == 0 && !inGroup) return Fail(start, "a degree without accidental outside parentheses");
  // The six alterations replace the natural tone of their role; any other degree
  // is added.
  for (CSymbolAlteration const& alteration : SymbolAlterations)
    if (alteration.Altered.Degree == degree &&
        DegreeAccidentals(alteration.Altered.Intvl, alteration.Altered.Degree) == accidentals) {
      Tones_.Alter(alteration);
      return true;
    }
  Tones_.Add(AddedTone(accidentals, degree));
  return true;
}
