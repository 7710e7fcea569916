"""Runs an installed tonvex on a file of chords, as a pipeline would, and checks the
names, the JSON objects (read by Python's JSON parser), the handling of a line that
cannot be read, and a long stream.

usage: installed_batch_test.py PROGRAM
"""
import json
import subprocess
import sys

PROGRAM = sys.argv[1]
# Lines and the names they give (None: no chord); the roots are found by the rules.
LINES = [("# a file of chords", None), ("C4 E4 G4 Bb4", "C  7"), ("", None),
         ("A3,C4,E4,G4   # the bass decides", "A m 7"), ("C4 H#x G4", None), ("  60 64 67 71\t", "C  ma7"),
         ("E2 C3 G3 C4\r", "C   / E"), ("D4 F#4 A4", "D  ")]
CHORDS = "".join(text + "\n" for text, _ in LINES)
NAMES = [name for _, name in LINES if name]
BAD_LINE = "tonvex: line 5: cannot read note 'H#x'\n"
failures = []


def run(args, stdin_text=""):
    result = subprocess.run([PROGRAM] + args, input=stdin_text.encode(), capture_output=True)
    return result.returncode, result.stdout.decode(), result.stderr.decode()


def check(condition, message):
    if not condition:
        failures.append(message)


check(run(["--algo", "rules"], CHORDS) == (1, "\n".join(NAMES) + "\n", BAD_LINE), "names")
status, out, err = run(["--algo", "rules", "--json", "--key", "C"], CHORDS)
objects = [json.loads(line) for line in out.splitlines()]
check((status, err) == (1, BAD_LINE), "json: status %d, stderr %r" % (status, err))
# The line that cannot be read has an object in its place, so that the output stays
# aligned with the input.
check(objects[2] == {"line": 5, "error": "cannot read note 'H#x'", "token": "H#x"}, "json error %r" % objects[2])
del objects[2]
check([(o["line"], o["name"]) for o in objects] == list(zip([2, 4, 6, 7, 8], NAMES)), "json lines %r" % out)
check(objects[0] == {"line": 2, "name": "C  7", "symbol": "C7", "harte": "C:7", "root": {"name": "C", "key_number": 0},
                     "bass": {"name": "C", "key_number": 0}, "inversion": None, "notes": [
    {"name": "C4", "number": 72}, {"name": "E4", "number": 76}, {"name": "G4", "number": 79},
    {"name": "Bb4", "number": 82}], "basic_chord": {"number": 1, "name": "", "kind": "major"}, "options": ["7"],
    "xg_chord_type": 19, "signs": 0, "key": {"name": "C", "signs": 0, "function": "I", "functional": "T",
                                             "closeness": 2, "notes_outside": {"count": 1, "notes": ["Bb4"]}}},
      "json C7 %r" % objects[0])
check(objects[1]["basic_chord"]["kind"] == "minor" and objects[1]["key"]["functional"] == "Tp", "json Am7")
check((objects[3]["bass"], objects[3]["inversion"]) == ({"name": "E", "key_number": 4}, 4), "json C/E %r" % objects[3])
# Key numbers say so (error objects of symbols: interactive_test.py).
status, out, err = run(["--json", "--key-numbers", "--algo", "rules", "0", "4", "7"])
check(json.loads(out)["notes"][1] == {"name": "E", "key_number": 4}, "key numbers %r" % out)
# One chord from the command line: one object, without a line number; German names.
status, out, err = run(["--german", "--json", "--algo", "rules", "--key", "Eb", "Bb3", "D4", "F4", "Ab4"])
single = json.loads(out)
check((status, err, out.count("\n")) == (0, "", 1) and "line" not in single, "single %r" % out)
check(single["name"] == "B  7" and single["key"]["name"] == "Es" and single["key"]["function"] == "V", "single")
# A long stream, as written in large blocks.
status, out, err = run([], "C4 E4 G4 Bb4\nA3 C4 E4 G4\nD4 F#4 A4\nE2 C3 G3 C4\n" * 25000)
check((status, err, out.count("\n")) == (0, "", 100000), "stream: %d %r %d" % (status, err[:200], out.count("\n")))
for failure in failures:
    print("FAIL:", failure)
sys.exit(1 if failures else 0)
