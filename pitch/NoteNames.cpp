// Note names in English, German and solmisation style, and octave names.
#include "NoteNames.h"

#include "pitch/NoteNameText.h"

#include <string>

namespace {

// Tables by key number 0..11.
constexpr char NaturalLetter[] = "CCDEEFFGGABB";
constexpr char NaturalLetterGerman[] = "CCDEEFFGGAHH";
constexpr char UpperNeighbourLetter[] = "DDEEFGGAABBC";
constexpr char UpperNeighbourLetterGerman[] = "DDEEFGGAAHHC";
constexpr char LowerNeighbourLetter[] = "BCCDDEFFGGAA";
constexpr char PlainSpellingSign[] = " # b  # # b ";
constexpr char SecondFlat[] = "b b  b b b  "; // 'b': the upper neighbour is two semitones up
constexpr char SharpSign[] = "##x#x##x#x#x";
constexpr const char* SpellEnharm2[12] = {" ", "is", " ", "es", " ", " ", "is", " ", "is", " ", "es", " "};
constexpr const char* SpellEnharm1[12] = {"is", "is",   "isis", "is",   "isis", "is",
                                          "is", "isis", "is",   "isis", "is",   "isis"};
constexpr const char* RomanString1[12] = {"Re", "Re", "Mi", "Mi", "Fa", "So", "So", "La", "La", "Ti", "Ti", "Do"};
constexpr const char* RomanString2[12] = {"Ti", "Do", "Do", "Re", "Re", "Mi", "Fa", "Fa", "So", "So", "La", "La"};
constexpr const char* RomanString3[12] = {"Do", "Do", "Re", "Mi", "Mi", "Fa", "Fa", "So", "So", "La", "Ti", "Ti"};

// Every naming system sorts a spelling into one of three paths. Double flats on
// E flat and B flat and double sharps on C sharp and F sharp need a letter of their
// own and are handled apart.
enum class Path { Flat, Sharp, Plain, DoubleFlatOnEbBb, DoubleSharpOnCsFs };

Path PathOf(int k, TEnh e) {
  if (e == Enh_Flat) return Path::Flat;
  if (e == Enh_DoubleFlat) return (k == 3 || k == 10) ? Path::DoubleFlatOnEbBb : Path::Flat;
  if (e == Enh_Sharp) return Path::Sharp;
  if (e == Enh_DoubleSharp) return (k == 1 || k == 6) ? Path::DoubleSharpOnCsFs : Path::Sharp;
  return Path::Plain;
}

int PitchClass(int keyNr) {
  int k = keyNr % 12;
  return k < 0 ? k + 12 : k;
}

CNoteNameText RomanName(int k, Path path) {
  CNoteNameText name;
  switch (path) {
  case Path::Flat:
    name.Add(RomanString1[k]);
    name.Add('b');
    if (SecondFlat[k] == 'b') name.Add('b');
    return name;
  case Path::DoubleFlatOnEbBb: name.Add(k == 10 ? "Dobb" : "Fabb"); return name;
  case Path::Sharp:
    name.Add(RomanString2[k]);
    name.Add(SharpSign[k]);
    return name;
  case Path::DoubleSharpOnCsFs: name.Add(k == 6 ? "Mix" : "Tix"); return name;
  case Path::Plain: break;
  }
  name.Add(RomanString3[k]);
  if (PlainSpellingSign[k] != ' ') name.Add(PlainSpellingSign[k]);
  return name;
}

CNoteNameText GermanName(int k, Path path) {
  CNoteNameText name;
  switch (path) {
  case Path::Flat:
    name.Add(UpperNeighbourLetterGerman[k]);
    name.Add("es");
    if (SecondFlat[k] == 'b') name.Add("es");
    break;
  case Path::DoubleFlatOnEbBb: name.Add(k == 10 ? "Ceses" : "Feses"); return name;
  case Path::Sharp:
    name.Add(LowerNeighbourLetter[k]);
    name.Add(SpellEnharm1[k]);
    return name;
  case Path::DoubleSharpOnCsFs: name.Add(k == 6 ? "Eisis" : "Bisis"); return name;
  case Path::Plain:
    name.Add(NaturalLetterGerman[k]);
    if (SpellEnharm2[k][0] != ' ') name.Add(SpellEnharm2[k]);
    break;
  }
  if (name.View() == "Hes") name.Set("B");
  if (name.View() == "Aes") name.Set("As");
  if (name.View() == "Ees") name.Set("Es");
  return name;
}

CNoteNameText EnglishName(int k, Path path) {
  CNoteNameText name;
  switch (path) {
  case Path::Flat:
    name.Add(UpperNeighbourLetter[k]);
    name.Add('b');
    if (SecondFlat[k] == 'b') name.Add('b');
    break;
  case Path::DoubleFlatOnEbBb: name.Add(k == 10 ? "Cbb" : "Fbb"); break;
  case Path::Sharp:
    name.Add(LowerNeighbourLetter[k]);
    name.Add(SharpSign[k]);
    break;
  case Path::DoubleSharpOnCsFs: name.Add(k == 6 ? "Ex" : "Bx"); break;
  case Path::Plain:
    name.Add(NaturalLetter[k]);
    if (PlainSpellingSign[k] != ' ') name.Add(PlainSpellingSign[k]);
    break;
  }
  if (CChordnamePref::B_is_H && name.Front() == 'B' && name.View() != "Bb") name.Front() = 'H';
  if (CChordnamePref::Bb_is_B && name.View() == "Bb") name.Set("B");
  return name;
}

std::string EnglishLetter(int k, Path path) {
  char letter = 0;
  switch (path) {
  case Path::Flat: letter = UpperNeighbourLetter[k]; break;
  case Path::DoubleFlatOnEbBb: letter = k == 10 ? 'C' : 'F'; break;
  case Path::Sharp: letter = LowerNeighbourLetter[k]; break;
  case Path::DoubleSharpOnCsFs: letter = k == 6 ? 'E' : 'B'; break;
  case Path::Plain: letter = NaturalLetter[k]; break;
  }
  // Unlike the full name, these two rules look at the key number, not at the text.
  if (CChordnamePref::B_is_H && letter == 'B' && k != 10) letter = 'H';
  if (CChordnamePref::Bb_is_B && k == 10) letter = 'B';
  return std::string(1, letter);
}

std::string RomanSyllable(int k, Path path) {
  switch (path) {
  case Path::Flat: return RomanString1[k];
  case Path::DoubleFlatOnEbBb: return k == 10 ? "Do" : "Fa";
  case Path::Sharp: return RomanString2[k];
  case Path::DoubleSharpOnCsFs: return k == 6 ? "Mi" : "Ti";
  case Path::Plain: break;
  }
  return RomanString3[k];
}

std::string Text(CNoteNameText const& name) { return std::string(name.View()); }

} // namespace

CNoteNameText KeyNameText(int keyNr, TEnh enh) {
  int k = PitchClass(keyNr);
  Path path = PathOf(k, enh);
  if (CChordnamePref::RomanNames) return RomanName(k, path);
  if (CChordnamePref::AccidentalsAsLetters) return GermanName(k, path);
  return EnglishName(k, path);
}

CNoteNameText KeyNameText(CNote const& note) {
  if (note.NoteNr() == 255) {
    CNoteNameText undefined;
    undefined.Add("Undefined");
    return undefined;
  }
  return KeyNameText(note.KeyNr(), note.Enh());
}

std::string KeyNrAndEnhToName(int keyNr, TEnh enh, CChordnamePref const& /*pref*/) {
  return Text(KeyNameText(keyNr, enh));
}

std::string KeyNrToNameIgnoringEnh(int keyNr, TEnh enh, CChordnamePref const& pref) {
  int k = PitchClass(keyNr);
  Path path = PathOf(k, enh);
  if (CChordnamePref::RomanNames) return RomanSyllable(k, path);
  if (CChordnamePref::AccidentalsAsLetters) return KeyNrAndEnhToName(k, enh, pref);
  return EnglishLetter(k, path);
}

std::string CNote::KeyName(CChordnamePref const& /*pref*/) const { return Text(KeyNameText(*this)); }

std::string CNote::KeyNameWithoutEnh(CChordnamePref const& pref) const {
  if (NoteNr_ == 255) return "Undefined";
  return KeyNrToNameIgnoringEnh(KeyNr(), Enh_, pref);
}

std::string CNote::OctName(CChordnamePref const& /*pref*/) const {
  if (NoteNr_ == 255) return std::string();
  int q = NoteNr_ / 12;
  int oct = CChordnamePref::NoteNr_60_is == 0 ? q - 2 : (CChordnamePref::NoteNr_60_is == 2 ? q : q - 1);
  return std::to_string(oct);
}
