// tonvex scale ROOT TYPE and tonvex key ROOT [minor]: scales and keys with their
// spelled degrees and key signatures.
#include "Commands.h"
#include "NoteToken.h"

#include "ChordnamePref.h"
#include "Scale.h"
#include "SignKey.h"

#include <cstdio>
#include <cstdlib>

namespace {

const char* const ScaleUsage = "usage: tonvex scale ROOT TYPE\n"
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
                               "Every type but minor is spelled and counts its signs like major.\n";

const char* const KeyUsage = "usage: tonvex key ROOT [minor|major]\n"
                             "\n"
                             "Prints the name of the major (default) or minor key on ROOT, its key signature\n"
                             "and its degrees. ROOT is a note name as 'tonvex note' reads it.\n";

const char* const TypeNames[] = {"other",       "major",        "minor",          "chromatic",
                                 "major-minor", "major-add-b7", "harmonic-minor", "melodic-minor"};
constexpr int TypeCount = 8;

bool ReadScaleType(std::string const& token, CScale::TType& type) {
  int value = -1;
  if (IsDecimalNumber(token))
    value = std::atoi(token.c_str());
  else
    for (int i = 0; i < TypeCount; ++i)
      if (token == TypeNames[i]) value = i;
  if (value < 0 || value >= TypeCount) return false;
  type = static_cast<CScale::TType>(value);
  return true;
}

// "+2 (2 sharps)", "-1 (1 flat)", "0 (none)".
std::string SignsText(int signs) {
  char text[48];
  int count = signs < 0 ? -signs : signs;
  if (signs == 0)
    std::snprintf(text, sizeof text, "0 (none)");
  else
    std::snprintf(text, sizeof text, "%+d (%d %s%s)", signs, count, signs > 0 ? "sharp" : "flat",
                  count == 1 ? "" : "s");
  return text;
}

std::string DegreeNames(CScale const& scale) {
  std::string names;
  for (int d = 0; d < scale.DegreesPerOctave(); ++d) {
    if (d > 0) names += ' ';
    names += scale.DegreeNrToKey(d).KeyName(DefaultChordnamePref);
  }
  return names;
}

// Prints the one-line error about an unreadable token; returns the exit status.
int CannotRead(const char* command, const char* what, std::string const& token) {
  std::fprintf(stderr, "tonvex %s: cannot read %s '%s'\n", command, what, token.c_str());
  return 2;
}

// Handles --help and the argument count and reads the root, the first argument.
// Returns -1 when the command should go on, else the exit status.
int ReadRootArgs(Args const& args, std::size_t least, std::size_t most, const char* usage, const char* command,
                 CNote& root) {
  for (std::string const& token : args)
    if (token == "--help" || token == "-h") {
      std::fputs(usage, stdout);
      return 0;
    }
  if (args.size() < least) {
    std::fputs(usage, stderr);
    return 2;
  }
  if (args.size() > most) {
    std::fprintf(stderr, "tonvex %s: unexpected argument '%s'\n", command, args[most].c_str());
    return 2;
  }
  if (!ReadNoteName(args[0], root)) return CannotRead(command, "note name", args[0]);
  return -1;
}

} // namespace

int RunScaleCommand(Args const& args) {
  CNote root;
  int status = ReadRootArgs(args, 2, 2, ScaleUsage, "scale", root);
  if (status >= 0) return status;
  CScale::TType type = CScale::Scale_Major;
  if (!ReadScaleType(args[1], type)) return CannotRead("scale", "scale type", args[1]);
  CScale const scale(root, type);
  std::printf("scale: %s %s\ndegrees: %s\nsigns: %s\n", scale.RootNote().KeyName(DefaultChordnamePref).c_str(),
              TypeNames[type], DegreeNames(scale).c_str(), SignsText(scale.SignsCount()).c_str());
  return 0;
}

int RunKeyCommand(Args const& args) {
  CNote root;
  int status = ReadRootArgs(args, 1, 2, KeyUsage, "key", root);
  if (status >= 0) return status;
  CSignKey::TType type = CSignKey::SignKey_Major;
  if (args.size() == 2) {
    if (args[1] != "minor" && args[1] != "major") return CannotRead("key", "key type", args[1]);
    if (args[1] == "minor") type = CSignKey::SignKey_Minor;
  }
  CSignKey const key(root, type);
  std::printf("key: %s\nsigns: %s\ndegrees: %s\n", key.Name(DefaultChordnamePref).c_str(),
              SignsText(key.SignsCount()).c_str(), DegreeNames(key.Scale()).c_str());
  return 0;
}
