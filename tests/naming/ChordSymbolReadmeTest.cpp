// The README's chord symbol tables are what the functions do: each row's symbol is
// what LeadSheetSymbol or HarteLabel writes for a chord of its intervals over C, and
// the symbol and the other spellings of the row read back to those intervals and
// bass. The intervals are turned into pitch classes here, by the test's own table.
#include <tonvex/ChordSymbol.h>

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>
#include <vector>

namespace {

struct Row {
  std::string Symbol;
  unsigned Intvls = 0; // bit i: i semitones above C
  int Bass = 0;        // the bass's interval above C
  std::vector<std::string> AlsoRead;
};

// "b9" -> 1, "#11" -> 6, "bb7" -> 9; -1 for anything else.
int DegreeSemitones(std::string const& degree) {
  static int const Naturals[14] = {-1, 0, 2, 4, 5, 7, 9, 11, -1, 2, -1, 5, -1, 9};
  std::size_t i = degree.find_first_not_of("b#");
  if (i == std::string::npos || i == degree.size()) return -1;
  int const number = std::stoi(degree.substr(i));
  if (number < 1 || number > 13 || Naturals[number] < 0) return -1;
  int semitones = Naturals[number];
  for (char c : degree.substr(0, i)) semitones += c == '#' ? 1 : -1;
  return (semitones + 12) % 12;
}

std::vector<std::string> Cells(std::string const& line) {
  std::vector<std::string> cells;
  std::stringstream stream(line.substr(1));
  for (std::string cell; std::getline(stream, cell, '|');) {
    std::size_t const first = cell.find_first_not_of(' '), last = cell.find_last_not_of(' ');
    cells.push_back(first == std::string::npos ? "" : cell.substr(first, last - first + 1));
  }
  return cells;
}

// The texts in backticks: "`C7-9`, `C7(b9)`".
std::vector<std::string> Quoted(std::string const& cell) {
  std::vector<std::string> texts;
  for (std::size_t open = cell.find('`'); open != std::string::npos; open = cell.find('`', open)) {
    std::size_t const close = cell.find('`', open + 1);
    texts.push_back(cell.substr(open + 1, close - open - 1));
    open = close + 1;
  }
  return texts;
}

// The rows of the "| symbol | intervals | also read |" tables of the section.
std::vector<Row> ReadmeRows() {
  std::ifstream file(TONVEX_README);
  std::vector<Row> rows;
  bool inSection = false, inTable = false;
  for (std::string line; std::getline(file, line);) {
    if (line.rfind("## ", 0) == 0) inSection = line == "## Chord symbols";
    if (!inSection) continue;
    if (line == "| symbol | intervals | also read |") inTable = true;
    if (line.empty() || line[0] != '|') inTable = false;
    if (!inTable || line.rfind("| `", 0) != 0) continue;
    std::vector<std::string> const cells = Cells(line);
    EXPECT_EQ(cells.size(), 3u) << line;
    if (cells.size() != 3) continue;
    Row row;
    row.Symbol = Quoted(cells[0]).at(0);
    row.AlsoRead = Quoted(cells[2]);
    std::stringstream intervals(cells[1]);
    for (std::string word; intervals >> word;) {
      bool const bass = word == "(bass";
      if (bass) intervals >> word;
      if (bass) word.pop_back(); // ")"
      int const semitones = DegreeSemitones(word);
      EXPECT_GE(semitones, 0) << line;
      if (bass)
        row.Bass = semitones;
      else if (semitones >= 0)
        row.Intvls |= 1u << semitones;
    }
    rows.push_back(row);
  }
  return rows;
}

// The chord of the row: root C, the bass at the bottom, the others above it.
CChord ChordOf(Row const& row) {
  CMySet<CNote> notes;
  for (int i = 0; i < 12; ++i)
    if ((row.Intvls & (1u << i)) != 0 || i == row.Bass)
      notes.insert(CNote(48 + row.Bass + (i - row.Bass + 12) % 12, Enh_Natural));
  CChord chord;
  chord.SetFromNoteSet(notes);
  chord.SetRootNote(CNote(0, Enh_Natural));
  return chord;
}

TEST(ChordSymbolReadme, TablesMatchTheFunctions) {
  std::vector<Row> const rows = ReadmeRows();
  EXPECT_GE(rows.size(), 80u);
  for (Row const& row : rows) {
    CChord const chord = ChordOf(row);
    bool const harte = row.Symbol.find(':') != std::string::npos;
    EXPECT_EQ(harte ? HarteLabel(chord) : LeadSheetSymbol(chord), row.Symbol);
    std::vector<std::string> texts = row.AlsoRead;
    texts.push_back(row.Symbol);
    for (std::string const& text : texts) {
      CChord read;
      ASSERT_TRUE(ReadChordSymbol(text, read)) << text;
      unsigned intvls = 0;
      for (CNote const& note : read.Notes()) intvls |= 1u << (note.NoteNr() % 12);
      EXPECT_EQ(intvls, row.Intvls | (1u << row.Bass)) << text;
      EXPECT_EQ(read.LowestNote().NoteNr() % 12, row.Bass) << text;
      EXPECT_EQ(read.RootNote().NoteNr(), 0) << text;
    }
  }
}

} // namespace
