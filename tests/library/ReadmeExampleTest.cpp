// The C++ example of the README, through the umbrella header, with its printed
// results checked.
#include <Tonvex.h>

#include <gtest/gtest.h>

#include <sstream>

TEST(ReadmeExample, NotesNamesAndSpelling) {
  CNote note;
  ASSERT_TRUE(note.SetFromString("Bb3", DefaultChordnamePref));
  EXPECT_EQ(note.NoteNr(), 70);
  EXPECT_EQ(note.KeyName(DefaultChordnamePref), "Bb");
  CChordnamePref::AccidentalsAsLetters = 1;
  EXPECT_EQ(note.KeyName(DefaultChordnamePref), "B");
  CChordnamePref::AccidentalsAsLetters = 0;

  CNote cSharp(61, Enh_Natural);
  cSharp.EnhShift();
  std::ostringstream out;
  out << cSharp;
  EXPECT_EQ(out.str(), "CNote: Db3 (NoteNr 61, Enh 1)");
}
