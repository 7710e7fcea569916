"""Checks the installed man page and bash completion of tonvex against what the
installed program's --help texts say: the page renders without warnings and holds
every help text, and the completion offers exactly the commands, the options of each
command and the values of each option that the help lists.

usage: docs_test.py PROGRAM MAN_PAGE COMPLETION
"""
import re
import subprocess
import sys

PROGRAM, MAN_PAGE, COMPLETION = sys.argv[1:4]
failures = []


def check(condition, message):
    if not condition:
        failures.append(message)


def output(command):
    return subprocess.run(command, capture_output=True, text=True, check=True).stdout


def words(text):
    return " ".join(text.split())


main_help = output([PROGRAM, "--help"])
commands = re.findall(r"^  ([a-z]+) ", main_help.split("\nCommands:\n")[1].split("\n\n")[0], re.M)
helps = {"": main_help}
helps.update({command: output([PROGRAM, command, "--help"]) for command in commands})

# The page: no warnings from groff, the usage lines in the synopsis, the rest of
# every help text in the page (headings lose their colon).
warnings = subprocess.run(["groff", "-man", "-ww", "-z", MAN_PAGE], capture_output=True, text=True).stderr
check(warnings == "", "groff warns: %s" % warnings)
page = words(output(["groff", "-man", "-Tascii", "-P-cbou", "-rLL=200n", MAN_PAGE]))
for command, text in helps.items():
    usage, body = text.split("\n\n", 1)
    for line in usage.splitlines():
        check(words(line.replace("usage: ", "")) in page, "%s: usage line %r not in the page" % (command, line))
    body = re.sub(r"(^|\n\n)([^ \n][^\n]*):\n(?=  )", r"\1\2\n", body)
    check(words(body) in page, "%s: help text not in the page" % (command or "tonvex"))


def complete(*typed):
    """What the completion offers for the words typed after 'tonvex' (the last one
    being completed)."""
    script = 'source "$1"; shift; COMP_WORDS=(tonvex "$@"); COMP_CWORD=$#; _tonvex; printf "%s\\n" "${COMPREPLY[@]}"'
    return set(output(["bash", "-c", script, "bash", COMPLETION] + list(typed)).split())


check(complete("") == set(commands), "commands offered: %s, help lists %s" % (complete(""), commands))
for command, text in helps.items():
    typed = [command] if command else []
    listed = re.findall(r"^  (-[-\w]+)(?:, (--[-\w]+))?(?: ([\w|-]+))?", text, re.M)
    options = {name for short, long, _ in listed for name in (short, long) if name}
    check(complete(*typed, "-") == options, "%s: options offered %s, help lists %s"
          % (command or "tonvex", sorted(complete(*typed, "-")), sorted(options)))
    for short, long, value in listed:
        if "|" in value:
            check(complete(*typed, short, "") == set(value.split("|")), "%s %s: values offered" % (command, short))
check(complete("--key", "note", "-") == complete("-"), "an option's value taken for a command")

for failure in failures:
    print("FAIL:", failure)
sys.exit(1 if failures else 0)
