// Reading Harte labels: shorthands, degree lists and omissions.
#include "naming/SymbolReader.h"

namespace {

struct CHarteShorthand {
  char const* Name;
  char const* Degrees;
};

constexpr CHarteShorthand HarteShorthands[] = {{"maj", "3,5"},
                                               {"min", "b3,5"},
                                               {"dim", "b3,b5"},
                                               {"aug", "3,#5"},
                                               {"maj7", "3,5,7"},
                                               {"min7", "b3,5,b7"},
                                               {"7", "3,5,b7"},
                                               {"dim7", "b3,b5,bb7"},
                                               {"hdim7", "b3,b5,b7"},
                                               {"minmaj7", "b3,5,7"},
                                               {"maj6", "3,5,6"},
                                               {"min6", "b3,5,6"},
                                               {"9", "3,5,b7,9"},
                                               {"maj9", "3,5,7,9"},
                                               {"min9", "b3,5,b7,9"},
                                               {"sus2", "2,5"},
                                               {"sus4", "4,5"},
                                               {"1", ""},
                                               {"5", "5"},
                                               {"aug7", "3,#5,b7"},
                                               {"11", "3,5,b7,9,11"},
                                               {"maj11", "3,5,7,9,11"},
                                               {"min11", "b3,5,b7,9,11"},
                                               {"13", "3,5,b7,9,11,13"},
                                               {"maj13", "3,5,7,9,11,13"},
                                               {"min13", "b3,5,b7,9,11,13"}};

} // namespace

bool CSymbolReader::ReadHarte() {
  Scan_.SkipBlanks();
  std::size_t const start = Scan_.Pos();
  std::string_view const name = Scan_.TakeName();
  Tones_.Add(ToneRoot);
  if (!name.empty()) {
    CHarteShorthand const* found = nullptr;
    for (CHarteShorthand const& shorthand : HarteShorthands) {
      CSymbolScanner scan(name);
      if (found == nullptr && scan.TakeWord(shorthand.Name) && scan.AtEnd()) found = &shorthand;
    }
    if (found == nullptr) return Fail(start, "unknown Harte shorthand");
    CSymbolScanner degrees(found->Degrees);
    ReadHarteDegrees(degrees, false);
  }
  Scan_.SkipBlanks();
  if (!Scan_.Take("(")) {
    if (name.empty()) return Fail(start, "missing Harte shorthand or degrees");
    return true;
  }
  if (!ReadHarteDegrees(Scan_, true)) return false;
  Scan_.SkipBlanks();
  if (!Scan_.Take(")")) return Fail(Scan_.Pos(), "missing ')'");
  return true;
}

// Degrees separated by commas; with omissions, "*" before a degree removes it.
bool CSymbolReader::ReadHarteDegrees(CSymbolScanner& scan, bool omissions) {
  for (bool first = true; !scan.AtEnd() && scan.Peek() != ')'; first = false) {
    if (!first && !scan.Take(",")) return Fail(scan.Pos(), "expected ',' between degrees");
    scan.SkipBlanks();
    bool const omit = omissions && scan.Take("*");
    std::size_t const at = scan.Pos();
    int const accidentals = scan.TakeAccidentals(false, false);
    int degree = 0;
    if (!scan.TakeNumber(degree) || degree < 1 || degree > 13) return Fail(at, "not a degree");
    CSymbolTone const tone = AddedTone(accidentals, degree);
    if (omit)
      Tones_.OmitIntvl(tone.Intvl);
    else
      Tones_.Add(tone);
  }
  return true;
}
