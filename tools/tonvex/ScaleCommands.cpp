// tonvex scale KEY [TYPE] and tonvex key KEY: scales and keys with their spelled
// degrees and key signatures.
#include "Commands.h"
#include "KeyText.h"
#include "NoteToken.h"
#include "QuotedText.h"
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

// Reads the operands as one key ("F#", "minor" is "F# minor"). Returns -1 when the
// command should go on, else the exit status.
int ReadKeyArgs(CommandLine const& line, std::size_t most, CSignKey& key) {
  Args const& args = line.Operands;
  if (args.empty()) return ShortUsage(line.Command);
  if (args.size() > most) return UsageError(line.Command, "unexpected argument " + Quoted(args[most]));
  std::string text = args[0];
  for (std::size_t i = 1; i < args.size(); ++i) text += ' ' + args[i];
  if (!ReadKey(text, key)) return UsageError(line.Command, KeyProblemText(text));
  return -1;
}

} // namespace

std::string ScaleUsage() {
  return std::string("usage: tonvex scale [OPTIONS] KEY [TYPE]\n"
                     "\n"
                     "Prints the degrees of a scale, spelled as the scale spells them, and its key\n"
                     "signature. KEY is read as 'tonvex key' reads it: its tonic is the scale's root\n"
                     "and, without TYPE, its mode the scale's type (C, Cm, c, Bb major, f# minor);\n"
                     "with TYPE, the scale of that type on the tonic (c harmonic-minor, Bb 1).\n"
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
         NameStyleOptionsHelp + NoteNameOptionsHelp + GeneralOptionsHelp;
}

std::string KeyUsage() {
  return std::string("usage: tonvex key [OPTIONS] KEY\n"
                     "\n"
                     "Prints the name of the key, its key signature and its degrees. KEY is a tonic\n"
                     "(a note name without octave) with an optional mode, attached or after a blank:\n"
                     "m, min or minor for minor, maj or major for major, the words in any case (C,\n"
                     "Cm, F#m, Bb major, Cmaj, Cmin, C MINOR). Without a mode a tonic written with a\n"
                     "small letter is minor (c, bb, f# minor as well). With --german German names\n"
                     "are read too (Fis, fis, Es, es, B for B flat, H), with --solfege solfege names.\n"
                     "The --key option of the chord command reads keys the same way.\n"
                     "\n"
                     "Options:\n") +
         NameStyleOptionsHelp + NoteNameOptionsHelp + GeneralOptionsHelp;
}

int RunScaleCommand(CommandLine const& line) {
  CSignKey key;
  Args const& args = line.Operands;
  CScale::TType type = CScale::Scale_Major;
  // KEY TYPE: the last operand is a type, the others the key whose tonic is taken.
  bool const typed = args.size() >= 2 && ReadScaleType(args.back(), type);
  if (!typed && args.size() == 2 && !ReadKey(args[0] + ' ' + args[1], key) && ReadKey(args[0], key))
    return UsageError(Cmd_Scale, "cannot read scale type " + Quoted(args[1]));
  CommandLine keyLine = line;
  if (typed) keyLine.Operands.pop_back();
  int status = ReadKeyArgs(keyLine, 2, key);
  if (status >= 0) return status;
  if (!typed) type = key.SignKeyType() == CSignKey::SignKey_Minor ? CScale::Scale_Minor : CScale::Scale_Major;
  CScale const scale(key.RootNote(), type);
  std::printf("scale: %s %s\ndegrees: %s\nsigns: %s\n", scale.RootNote().KeyName(DefaultChordnamePref).c_str(),
              TypeNames[type], DegreeNames(scale).c_str(), SignsText(scale.SignsCount()).c_str());
  return 0;
}

int RunKeyCommand(CommandLine const& line) {
  CSignKey key;
  int status = ReadKeyArgs(line, 2, key);
  if (status >= 0) return status;
  std::printf("key: %s\nsigns: %s\ndegrees: %s\n", key.Name(DefaultChordnamePref).c_str(),
              SignsText(key.SignsCount()).c_str(), DegreeNames(key.Scale()).c_str());
  return 0;
}
