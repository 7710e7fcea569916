// tonvex scale ROOT TYPE and tonvex key ROOT [minor]: scales and keys with their
// spelled degrees and key signatures.
#include "Commands.h"
#include "NoteToken.h"
#include "SignsText.h"

#include <tonvex/ChordnamePref.h>
#include <tonvex/Scale.h>
#include <tonvex/SignKey.h>

#include <cstdio>

namespace {

const char* const TypeNames[] = {"other",       "major",        "minor",          "chromatic",
                                 "major-minor", "major-add-b7", "harmonic-minor", "melodic-minor"};
constexpr int TypeCount = 8;

bool ReadScaleType(std::string const& token, CScale::TType& type) {
  int value = -1;
  if (IsDecimalNumber(token))
    value = DecimalValue(token);
  else
    for (int i = 0; i < TypeCount; ++i)
      if (token == TypeNames[i]) value = i;
  if (value < 0 || value >= TypeCount) return false;
  type = static_cast<CScale::TType>(value);
  return true;
}

std::string DegreeNames(CScale const& scale) {
  std::string names;
  for (int d = 0; d < scale.DegreesPerOctave(); ++d) {
    if (d > 0) names += ' ';
    names += scale.DegreeNrToKey(d).KeyName(DefaultChordnamePref);
  }
  return names;
}

// Checks the operand count and reads the root, the first operand. Returns -1 when
// the command should go on, else the exit status.
int ReadRootArgs(CommandLine const& line, std::size_t least, std::size_t most, CNote& root) {
  Args const& args = line.Operands;
  if (args.size() < least) {
    std::string usage = line.Command == Cmd_Scale ? ScaleUsage() : KeyUsage();
    std::fputs(usage.c_str(), stderr);
    return 2;
  }
  if (args.size() > most) return UsageError(line.Command, "unexpected argument '" + args[most] + "'");
  TTokenProblem problem = ReadNoteName(args[0], root);
  if (problem != Token_Ok) return UsageError(line.Command, TokenProblemText(problem, Kind_NoteName, args[0]));
  return -1;
}

} // namespace

std::string ScaleUsage() {
  return std::string("usage: tonvex scale [OPTIONS] ROOT TYPE\n"
                     "\n"
                     "Prints the degrees of the scale of TYPE on ROOT, spelled as the scale spells them,\n"
                     "and its key signature. ROOT is a note name as 'tonvex note' reads it (a letter\n"
                     "A..H, an optional accidental bb, b, x or #; an octave is accepted and ignored).\n"
                     "TYPE is a name or its number:\n"
                     "  0 other           spelled like major\n"
                     "  1 major\n"
                     "  2 minor           natural minor\n"
                     "  3 chromatic\n"
                     "  4 major-minor     major with minor third and seventh added\n"
                     "  5 major-add-b7    major with minor seventh added\n"
                     "  6 harmonic-minor\n"
                     "  7 melodic-minor\n"
                     "Every type but minor is spelled and counts its signs like major.\n"
                     "\n"
                     "Options:\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp;
}

std::string KeyUsage() {
  return std::string("usage: tonvex key [OPTIONS] ROOT [minor|major]\n"
                     "\n"
                     "Prints the name of the major (default) or minor key on ROOT, its key signature\n"
                     "and its degrees. ROOT is a note name as 'tonvex note' reads it.\n"
                     "\n"
                     "Options:\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp;
}

int RunScaleCommand(CommandLine const& line) {
  CNote root;
  int status = ReadRootArgs(line, 2, 2, root);
  if (status >= 0) return status;
  std::string const& typeName = line.Operands[1];
  CScale::TType type = CScale::Scale_Major;
  if (!ReadScaleType(typeName, type)) return UsageError(Cmd_Scale, "cannot read scale type '" + typeName + "'");
  CScale const scale(root, type);
  std::printf("scale: %s %s\ndegrees: %s\nsigns: %s\n", scale.RootNote().KeyName(DefaultChordnamePref).c_str(),
              TypeNames[type], DegreeNames(scale).c_str(), SignsText(scale.SignsCount()).c_str());
  return 0;
}

int RunKeyCommand(CommandLine const& line) {
  CNote root;
  int status = ReadRootArgs(line, 1, 2, root);
  if (status >= 0) return status;
  Args const& args = line.Operands;
  CSignKey::TType type = CSignKey::SignKey_Major;
  if (args.size() == 2) {
    if (args[1] != "minor" && args[1] != "major") return UsageError(Cmd_Key, "cannot read key type '" + args[1] + "'");
    if (args[1] == "minor") type = CSignKey::SignKey_Minor;
  }
  CSignKey const key(root, type);
  std::printf("key: %s\nsigns: %s\ndegrees: %s\n", key.Name(DefaultChordnamePref).c_str(),
              SignsText(key.SignsCount()).c_str(), DegreeNames(key.Scale()).c_str());
  return 0;
}
