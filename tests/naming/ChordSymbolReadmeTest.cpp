// The README's chord symbol tables are what the functions do: each row's symbol is
// what LeadSheetSymbol or HarteLabel writes for a chord of its intervals over C, and
// the symbol and the other spellings of the row read back to those intervals and
// bass. The intervals are turned into pitch classes here, by the test's own table.
#include <tonvex/ChordSymbol.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <regex>
#include <sstream>
#include <string>

namespace {

// "b9" -> 1, "#11" -> 6, "bb7" -> 9; -1 for anything else.
int DegreeSemitones(std::string const& degree) {
  static int const Naturals[14] = {-1, 0, 2, 4, 5, 7, 9, 11, -1, 2, -1, 5, -1, 9};
  std::size_t const digits = degree.find_first_not_of("b#");
  int const number = digits < degree.size() ? std::atoi(degree.c_str() + digits) : 0;
  if (number < 1 || number > 13 || Naturals[number] < 0) return -1;
  int semitones = Naturals[number] + 12;
  for (char c : degree.substr(0, digits)) semitones += c == '#' ? 1 : -1;
  return semitones % 12;
}

// The pitch classes of the chord's notes as bits.
unsigned PitchClasses(CChord const& chord) {
  unsigned bits = 0;
  for (CNote const& note : chord.Notes()) bits |= 1u << (note.NoteNr() % 12);
  return bits;
}

// The rows of the section's "| symbol | intervals | also read |" tables; the chord of
// a row has root C, the bass at the bottom and the other notes above it.
TEST(ChordSymbolReadme, TablesMatchTheFunctions) {
  std::ifstream file(TONVEX_README);
  std::regex const row("\\| `([^`]+)` \\| ([^|]+) \\|(.*)\\|"), quoted("`([^`]+)`");
  bool inSection = false, inTable = false;
  int rows = 0;
  for (std::string line; std::getline(file, line);) {
    if (line.rfind("## ", 0) == 0) inSection = line == "## Chord symbols";
    inTable = inSection && !line.empty() && line[0] == '|' && (inTable || line == "| symbol | intervals | also read |");
    std::smatch m;
    if (!inTable || !std::regex_match(line, m, row)) continue;
    ++rows;
    unsigned intvls = 0;
    int bass = 0;
    std::istringstream words(std::regex_replace(m[2].str(), std::regex("\\(bass (\\S+)\\)"), "/$1"));
    for (std::string word; words >> word;) {
      int const semitones = DegreeSemitones(word[0] == '/' ? word.substr(1) : word);
      ASSERT_GE(semitones, 0) << line;
      intvls |= 1u << semitones;
      if (word[0] == '/') bass = semitones;
    }
    CMySet<CNote> notes;
    for (int i = 0; i < 12; ++i)
      if (intvls >> i & 1u) notes.insert(CNote(48 + bass + (i - bass + 12) % 12, Enh_Natural));
    CChord chord;
    chord.SetFromNoteSet(notes);
    chord.SetRootNote(CNote(0, Enh_Natural));
    std::string const symbol = m[1], texts = m[0];
    EXPECT_EQ(symbol.find(':') != std::string::npos ? HarteLabel(chord) : LeadSheetSymbol(chord), symbol);
    for (std::sregex_iterator text(texts.begin(), texts.end(), quoted), end; text != end; ++text) {
      CChord read;
      ASSERT_TRUE(ReadChordSymbol((*text)[1].str(), read)) << (*text)[1];
      EXPECT_TRUE(PitchClasses(read) == intvls && read.LowestNote().NoteNr() % 12 == bass &&
                  read.RootNote().NoteNr() == 0)
          << (*text)[1];
    }
  }
  EXPECT_GE(rows, 80);
}

} // namespace
