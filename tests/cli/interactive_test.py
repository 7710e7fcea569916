"""Drives tonvex as programs and people do: as a coprocess through pipes (a line
written, its answer read before the next line is written), on a terminal, and with
hostile bytes on standard input. Waits for answers with a timeout only so as to fail
instead of hanging. The environment variable TONVEX_CLI_LAUNCHER may name a command
line that the program runs under (tools/valgrind-check.sh).

usage: interactive_test.py PROGRAM
"""
import json
import os
import pty
import select
import subprocess
import sys

PROGRAM = os.environ.get("TONVEX_CLI_LAUNCHER", "").split() + [sys.argv[1]]
TIMEOUT = 30
failures = []


def check(condition, message):
    if not condition:
        failures.append(message)


def read_line(fd):
    """One line from fd, or None when it does not come within TIMEOUT seconds."""
    data = b""
    while not data.endswith(b"\n"):
        if not select.select([fd], [], [], TIMEOUT)[0]:
            return None
        byte = os.read(fd, 1)
        if not byte:
            return None
        data += byte
    return data.decode()


def coprocess(args, exchanges, status):
    """Writes each line and waits for its answer before writing the next."""
    process = subprocess.Popen(PROGRAM + args, stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                               stderr=subprocess.DEVNULL)
    for line, answer in exchanges:
        process.stdin.write(line.encode() + b"\n")
        process.stdin.flush()
        got = read_line(process.stdout.fileno())
        check(got == answer, "%s: %r gave %r, expected %r" % (args, line, got, answer))
        if got is None:
            break
    process.stdin.close()
    try:
        check(process.wait(TIMEOUT) == status, "%s: exit status %r" % (args, process.returncode))
    except subprocess.TimeoutExpired:
        process.kill()
        check(False, "%s: does not end when its input ends" % args)


coprocess(["--algo", "rules"], [("C4 E4 G4", "C  \n"), ("A3 C4 E4 G4", "A m 7\n")], 0)
coprocess(["symbol", "--json"], [
    ("Am7", '{"line":1,"symbol":"Am7","notes":["A","C","E","G"],"pitch_classes":[0,4,7,9],'
            '"root":{"name":"A","key_number":9},"bass":{"name":"A","key_number":9}}\n'),
    ("Cmaj7x9", '{"line":2,"error":"cannot read chord symbol \'Cmaj7x9\': unexpected text at offset 5 (\'x9\')",'
                '"token":"Cmaj7x9"}\n'),
    ("C", '{"line":3,"symbol":"C","notes":["C","E","G"],"pitch_classes":[0,4,7],'
          '"root":{"name":"C","key_number":0},"bass":{"name":"C","key_number":0}}\n')], 1)
coprocess(["--line-buffered", "--algo", "rules"], [("D4 F#4 A4", "D  \n")], 0)

# On a terminal: without arguments a short usage; with '-' each line is answered.
master, slave = pty.openpty()
result = subprocess.run(PROGRAM, stdin=slave, capture_output=True, timeout=TIMEOUT)
usage = result.stderr.decode()
check((result.returncode, result.stdout, usage.count("\n")) == (2, b"", 4) and usage.startswith("usage: tonvex ")
      and usage.endswith("Run 'tonvex --help' for more.\n"), "terminal without arguments: %r" % (result,))
process = subprocess.Popen(PROGRAM + ["-", "--algo", "rules"], stdin=slave, stdout=subprocess.PIPE)
os.write(master, b"C4 Eb4 G4\n")
check(read_line(process.stdout.fileno()) == "C m \n", "terminal: no answer to a typed line")
os.write(master, b"\x04")  # end of input
try:
    check(process.wait(TIMEOUT) == 0, "terminal: exit status %r" % process.returncode)
except subprocess.TimeoutExpired:
    process.kill()
    check(False, "terminal: end of input not seen")
os.close(master)
os.close(slave)

# Hostile input: a NUL byte, bytes that are no UTF-8, a 5 MB token. Messages stay
# short and printable; JSON stays valid and aligned with the lines.
hostile = b"C4 a\x00b\nC4 \xff\xfe\nC4 " + b"X" * 5000000 + b"\nC4 E4 G4\n"
result = subprocess.run(PROGRAM + ["--json", "--algo", "rules"], input=hostile, capture_output=True, timeout=120)
check(result.stderr.decode() == "tonvex: line 1: cannot read note 'a\\x00b'\n"
      "tonvex: line 2: cannot read note '\\xff\\xfe'\n"
      "tonvex: line 3: cannot read note '%s\u2026'\n" % ("X" * 40), "hostile: stderr %r" % result.stderr[:500])
objects = [json.loads(line) for line in result.stdout.decode().splitlines()]
check([o.get("token") for o in objects] == ["a\x00b", "\ufffd\ufffd", "X" * 40 + "\u2026", None]
      and objects[3]["name"] == "C  " and result.returncode == 1, "hostile: %r" % result.stdout[:500])

for failure in failures:
    print("FAIL:", failure)
sys.exit(1 if failures else 0)
