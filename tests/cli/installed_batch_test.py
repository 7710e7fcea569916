"""Runs an installed tonvex on a file of chords, as a pipeline would, and checks
the names, the JSON objects (read by Python's JSON parser) and the handling of a
line that cannot be read.

usage: installed_batch_test.py PROGRAM WORK_DIR
"""
import json
import os
import subprocess
import sys
import time

PROGRAM, WORK_DIR = sys.argv[1], sys.argv[2]

# (line text, expected name); None marks lines that name nothing. Chords whose root
# is decided by the rules, found with --algo rules below.
LINES = [
    ("# a file of chords", None),
    ("C4 E4 G4 Bb4", "C  7"),
    ("", None),
    ("A3,C4,E4,G4   # A m 7: the bass decides", "A m 7"),
    ("C4 Eb4 G4", "C m "),
    ("C4 H#x G4", None),  # unreadable: reported, skipped
    ("  60 64 67 71\t", "C  ma7"),
    ("E2 C3 G3 C4\r", "C   / E"),
    ("D4 F#4 A4", "D  "),
]
BAD_LINE = 6

failures = []


def check(condition, message):
    if not condition:
        failures.append(message)


def run(args, stdin_text):
    result = subprocess.run([PROGRAM] + args, input=stdin_text.encode(), capture_output=True)
    return result.returncode, result.stdout.decode(), result.stderr.decode()


os.makedirs(WORK_DIR, exist_ok=True)
chords = "".join(text + "\n" for text, _ in LINES)
with open(os.path.join(WORK_DIR, "chords.txt"), "w", newline="") as f:
    f.write(chords)
expected_names = [name for _, name in LINES if name is not None]
named_lines = [nr for nr, (_, name) in enumerate(LINES, 1) if name is not None]
bad_line_error = "tonvex: line %d: cannot read note 'H#x'\n" % BAD_LINE

# Names, one per line, trailing blanks kept.
status, out, err = run(["--algo", "rules"], chords)
check(status == 1, "names: exit status %d, expected 1" % status)
check(out.split("\n") == expected_names + [""], "names: got %r" % out)
check(err == bad_line_error, "names: stderr %r" % err)

# JSON: one object per named line, with the facts of the chord in C major.
status, out, err = run(["--algo", "rules", "--json", "--key", "C"], chords)
check(status == 1, "json: exit status %d, expected 1" % status)
check(err == bad_line_error, "json: stderr %r" % err)
objects = [json.loads(line) for line in out.splitlines()]
check([o["line"] for o in objects] == named_lines, "json: lines %r" % [o.get("line") for o in objects])
check([o["name"] for o in objects] == expected_names, "json: names %r" % [o.get("name") for o in objects])

by_name = {o["name"]: o for o in objects}
seventh = by_name.get("C  7", {})
check(seventh.get("notes") == [{"name": "C4", "number": 72}, {"name": "E4", "number": 76},
                               {"name": "G4", "number": 79}, {"name": "Bb4", "number": 82}],
      "json: notes of C7 %r" % seventh.get("notes"))
check(seventh.get("root") == {"name": "C", "key_number": 0}, "json: root of C7 %r" % seventh.get("root"))
check((seventh.get("symbol"), seventh.get("harte")) == ("C7", "C:7"), "json: symbol and label of C7 %r" % seventh)
check(seventh.get("basic_chord") == {"number": 1, "name": "", "kind": "major"},
      "json: basic chord of C7 %r" % seventh.get("basic_chord"))
check(seventh.get("options") == ["7"], "json: options of C7 %r" % seventh.get("options"))
check(seventh.get("xg_chord_type") == 19, "json: XG type of C7 %r" % seventh.get("xg_chord_type"))
check(seventh.get("signs") == 0, "json: signs of C7 %r" % seventh.get("signs"))
check(seventh.get("key") == {"name": "C", "signs": 0, "function": "I", "functional": "T", "closeness": 2,
                             "notes_outside": {"count": 1, "notes": ["Bb4"]}},
      "json: C7 in C %r" % seventh.get("key"))

minor_seventh = by_name.get("A m 7", {})
check(minor_seventh.get("basic_chord") == {"number": 2, "name": "m", "kind": "minor"},
      "json: basic chord of Am7 %r" % minor_seventh.get("basic_chord"))
check(minor_seventh.get("key", {}).get("function") == "VIm" and minor_seventh["key"].get("functional") == "Tp",
      "json: Am7 in C %r" % minor_seventh.get("key"))

d_major = by_name.get("D  ", {})
check(d_major.get("signs") == 2, "json: signs of D %r" % d_major.get("signs"))
check(d_major.get("key") == {"name": "C", "signs": 0, "function": "II", "functional": "DD / SP", "closeness": 0,
                             "notes_outside": {"count": 1, "notes": ["F#4"]}},
      "json: D in C %r" % d_major.get("key"))

slash = by_name.get("C   / E", {})
check([n["name"] for n in slash.get("notes", [])] == ["E2", "C3", "G3", "C4"], "json: notes of C/E %r" % slash)
check((slash.get("symbol"), slash.get("harte")) == ("C/E", "C:maj/3"), "json: symbol and label of C/E %r" % slash)
check("key" in slash and slash["key"]["notes_outside"] == {"count": 0, "notes": []}, "json: C/E in C %r" % slash)

# One chord from the command line: one object, without a line number; German names.
status, out, err = run(["--german", "--json", "--algo", "rules", "--key", "Eb", "Bb3", "D4", "F4", "Ab4"], "")
check(status == 0 and err == "", "single: status %d, stderr %r" % (status, err))
single = json.loads(out)
check(out.endswith("}\n") and out.count("\n") == 1, "single: not one line: %r" % out)
check("line" not in single, "single: has a line number")
check(single.get("name") == "B  7", "single: name %r" % single.get("name"))
check(single.get("key", {}).get("name") == "Es" and single["key"].get("function") == "V",
      "single: key facts %r" % single.get("key"))

# A long stream is named at the pace of a pipeline.
count = 200000
stream = "C4 E4 G4 Bb4\nA3 C4 E4 G4\nD4 F#4 A4\nE2 C3 G3 C4\n" * (count // 4)
start = time.monotonic()
status, out, err = run([], stream)
seconds = time.monotonic() - start
check(status == 0 and err == "", "stream: status %d, stderr %r" % (status, err[:200]))
check(out.count("\n") == count, "stream: %d lines named, expected %d" % (out.count("\n"), count))
print("named %d chords in %.2f s" % (count, seconds))

for failure in failures:
    print("FAIL:", failure)
sys.exit(1 if failures else 0)
