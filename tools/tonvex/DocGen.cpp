// tonvex_docgen man|completion FILE: writes the man page or the bash completion of
// the tonvex program, generated from its help texts and its option table, so that
// both follow every command and option the program has.
#include "Commands.h"

#include <algorithm>
#include <fstream>
#include <iostream>
#include <sstream>
#include <vector>

namespace {

std::vector<std::string> Lines(std::string const& text) {
  std::vector<std::string> lines;
  std::istringstream in(text);
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  return lines;
}

// Text for troff: backslashes and minus signs escaped, no control word at the start.
std::string Troff(std::string const& text) {
  std::string out = !text.empty() && (text[0] == '.' || text[0] == '\'') ? "\\&" : "";
  for (char c : text) {
    if (c == '\\')
      out += "\\e";
    else if (c == '-')
      out += "\\-";
    else
      out += c;
  }
  return out;
}

std::string Trimmed(std::string const& text) {
  std::size_t const first = text.find_first_not_of(' ');
  return first == std::string::npos ? std::string() : text.substr(first);
}

bool IsIndented(std::string const& line) { return line.size() > 2 && line[0] == ' ' && line[1] == ' '; }

// The body of a help text (what follows its usage lines) in man page markup: plain
// lines are filled paragraphs, "Options:" before indented lines a subsection, an
// indented line a tagged item (the tag ends at the first two blanks), and more
// deeply indented lines continue the item.
void WriteBody(std::ostream& out, std::vector<std::string> const& lines, std::size_t first) {
  for (std::size_t i = first; i < lines.size(); ++i) {
    std::string const& line = lines[i];
    bool const afterBlank = lines[i - 1].empty();
    bool const beforeItem = i + 1 < lines.size() && IsIndented(lines[i + 1]);
    if (line.empty()) continue;
    if (!IsIndented(line)) {
      if (afterBlank && beforeItem && line.back() == ':') {
        out << ".SS \"" << Troff(line.substr(0, line.size() - 1)) << "\"\n";
        continue;
      }
      if (afterBlank || IsIndented(lines[i - 1])) out << ".PP\n";
      out << Troff(line) << '\n';
      continue;
    }
    if (line[2] == ' ') {
      out << Troff(Trimmed(line)) << '\n';
      continue;
    }
    std::size_t const gap = line.find("  ", 2);
    out << ".TP\n" << Troff(line.substr(2, gap - 2)) << '\n';
    if (gap != std::string::npos) out << Troff(Trimmed(line.substr(gap))) << '\n';
  }
}

// The usage lines (the help's first paragraph) and the line after them.
std::size_t UsageEnd(std::vector<std::string> const& lines) {
  std::size_t end = 0;
  while (end < lines.size() && !lines[end].empty()) ++end;
  return end;
}

void WriteManPage(std::ostream& out) {
  out << ".\\\" The tonvex man page, generated from the program's help texts.\n"
      << ".TH TONVEX 1 \"\" \"tonvex " << ProgramVersion() << "\" \"User Commands\"\n"
      << ".nh\n.ad l\n"
      << ".SH NAME\ntonvex \\- name chords, and read notes, scales, keys, chord symbols and MIDI files\n"
      << ".SH SYNOPSIS\n.nf\n";
  for (TCommand command : CommandList) {
    std::vector<std::string> const lines = Lines(UsageOf(command));
    for (std::size_t i = 0; i < UsageEnd(lines); ++i) {
      std::string const usage = Trimmed(lines[i].compare(0, 7, "usage: ") == 0 ? lines[i].substr(7) : lines[i]);
      out << Troff(usage) << '\n';
    }
  }
  out << ".fi\n";
  for (TCommand command : CommandList) {
    std::vector<std::string> const lines = Lines(UsageOf(command));
    std::string name = CommandName(command);
    for (char& c : name) c = static_cast<char>(c - 'a' + 'A');
    out << (command == Cmd_Chord ? ".SH DESCRIPTION\n" : ".SH \"THE " + name + " COMMAND\"\n");
    WriteBody(out, lines, UsageEnd(lines) + 1);
  }
}

// The words joined by sep: a bash case pattern "--key|--root" or a word list.
std::string Joined(std::vector<std::string> const& words, char sep = '|') {
  std::string joined;
  for (std::string const& word : words) joined += (joined.empty() ? "" : std::string(1, sep)) + word;
  return joined;
}

void WriteCompletion(std::ostream& out) {
  std::vector<std::string> commands, valued, freeText;
  std::ostringstream choices, options;
  for (TCommand command : CommandList) {
    if (command != Cmd_Chord) commands.push_back(CommandName(command));
    std::string list;
    for (COptionInfo const& option : OptionsOf(command)) {
      list += (list.empty() ? "" : " ") + option.Name;
      if (!option.TakesValue || std::find(valued.begin(), valued.end(), option.Name) != valued.end()) continue;
      valued.push_back(option.Name);
      if (option.Choices.empty()) {
        freeText.push_back(option.Name);
        continue;
      }
      std::string words = option.Choices;
      std::replace(words.begin(), words.end(), '|', ' ');
      choices << "  " << option.Name << ") COMPREPLY=($(compgen -W \"" << words << "\" -- \"$cur\")); return ;;\n";
    }
    options << "  " << (command == Cmd_Chord ? "chord" : CommandName(command)) << ") options=\"" << list << "\" ;;\n";
  }
  out << "# bash completion of tonvex, generated from the program's option table.\n"
      << "_tonvex() {\n"
      << "  local cur=${COMP_WORDS[COMP_CWORD]} prev=${COMP_WORDS[COMP_CWORD - 1]} command=chord operands=0 i\n"
      << "  # The command word is the first operand; an option's value is no operand.\n"
      << "  for ((i = 1; i < COMP_CWORD; i++)); do\n"
      << "    case ${COMP_WORDS[i]} in\n"
      << "    " << Joined(valued) << ") ((i++)) ;;\n"
      << "    -*) ;;\n"
      << "    " << Joined(commands) << ") command=${COMP_WORDS[i]}; break ;;\n"
      << "    *) operands=1; break ;;\n"
      << "    esac\n"
      << "  done\n"
      << "  # An option's value: its choices, else (complete -o default) file names.\n"
      << "  case $prev in\n"
      << choices.str() << "  " << Joined(freeText) << ") return ;;\n"
      << "  esac\n"
      << "  local options\n"
      << "  case $command in\n"
      << options.str() << "  esac\n"
      << "  if [[ $cur == -* ]]; then\n"
      << "    COMPREPLY=($(compgen -W \"$options\" -- \"$cur\"))\n"
      << "  elif [[ $command == chord && $operands == 0 ]]; then\n"
      << "    COMPREPLY=($(compgen -W \"" << Joined(commands, ' ') << "\" -- \"$cur\"))\n"
      << "  fi\n"
      << "}\n"
      << "complete -o default -F _tonvex tonvex\n";
}

} // namespace

int main(int argc, char** argv) {
  std::string const what = argc == 3 ? argv[1] : "";
  if (what != "man" && what != "completion") {
    std::cerr << "usage: tonvex_docgen man|completion FILE\n";
    return 2;
  }
  std::ofstream file(argv[2]);
  if (what == "man")
    WriteManPage(file);
  else
    WriteCompletion(file);
  file.close();
  if (!file) {
    std::cerr << "tonvex_docgen: cannot write " << argv[2] << '\n';
    return 1;
  }
  return 0;
}
