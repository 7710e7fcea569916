#!/usr/bin/env python3
"""Throughput of the tonvex program's batch mode: lines named per second.

Writes a file of chord lines (the voicings of tests/support/Voicings.cpp, same
generator and seed, continued to the requested count; even lines as note names, odd
lines as note numbers separated by commas), then times `tonvex < file > /dev/null`
several times, pinned to one core with taskset when it is available. The whole
process is timed, start-up included. Prints the best and the median run; the best is
the figure to compare, since other load on the machine only ever makes a run slower.
"""
import argparse
import os
import shutil
import statistics
import subprocess
import sys
import tempfile
import time

MASK = (1 << 64) - 1
SEED = 20240611
TEMPLATES = [
    [0, 4, 7], [0, 3, 7], [0, 4, 7, 10], [0, 3, 7, 10],
    [0, 4, 7, 11], [0, 3, 6], [0, 3, 6, 9], [0, 4, 8],
    [0, 5, 7], [0, 2, 7], [0, 4, 7, 9], [0, 3, 6, 10],
    [0, 5, 7, 10], [0, 4, 7, 10, 2], [0, 3, 7, 10, 5], [0, 4, 7, 11, 2],
]
NAMES = ["C", "C#", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"]


class Random:
    """splitmix64, as CBenchRandom."""

    def __init__(self, seed):
        self.state = seed

    def below(self, n):
        self.state = (self.state + 0x9E3779B97F4A7C15) & MASK
        z = self.state
        z = ((z ^ (z >> 30)) * 0xBF58476D1CE4E5B9) & MASK
        z = ((z ^ (z >> 27)) * 0x94D049BB133111EB) & MASK
        return (z ^ (z >> 31)) % n


def next_voicing(random):
    count = 2 + random.below(6)
    notes = set()
    if random.below(4) == 0:
        lowest = 36 + random.below(25)
        notes.add(lowest)
        while len(notes) < count:
            notes.add(lowest + 1 + random.below(30))
        return sorted(notes)
    chord = TEMPLATES[random.below(len(TEMPLATES))]
    root = random.below(12)
    bass_pc = (root + chord[random.below(len(chord)) if random.below(3) == 0 else 0]) % 12
    bass = 36 + bass_pc + 12 * random.below(2)
    notes.add(bass)
    while len(notes) < count:
        pc = (root + chord[random.below(len(chord))]) % 12
        octave = random.below(3)
        note = bass + (pc - bass_pc + 12) % 12 + 12 * octave
        if note == bass and octave == 0:
            note += 12
        notes.add(note)
    return sorted(notes)


def chord_lines(count):
    random = Random(SEED)
    for i in range(count):
        notes = next_voicing(random)
        if i % 2 == 0:
            # Note 60 is C3 under the program's default octave numbering.
            yield " ".join(f"{NAMES[n % 12]}{n // 12 - 2}" for n in notes)
        else:
            yield ", ".join(str(n) for n in notes)


def measure(program, lines, runs, cpu):
    """Seconds of each run of the program over a file of `lines` chord lines."""
    command = [program]
    if cpu and shutil.which("taskset"):
        command = ["taskset", "-c", cpu] + command
    with tempfile.NamedTemporaryFile("w", suffix=".txt", delete=False) as f:
        for line in chord_lines(lines):
            f.write(line + "\n")
        path = f.name
    try:
        seconds = []
        for _ in range(runs):
            with open(path, "rb") as stdin:
                start = time.perf_counter()
                result = subprocess.run(command, stdin=stdin, stdout=subprocess.DEVNULL)
                seconds.append(time.perf_counter() - start)
            if result.returncode != 0:
                sys.exit(f"{' '.join(command)} exited with status {result.returncode}")
    finally:
        os.unlink(path)
    return seconds


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--program", default="build/bin/tonvex")
    parser.add_argument("--lines", type=int, default=100000)
    parser.add_argument("--runs", type=int, default=7)
    parser.add_argument("--cpu", default="0", help="core to pin to (empty: no pinning)")
    args = parser.parse_args()
    seconds = measure(args.program, args.lines, args.runs, args.cpu)
    best, median = min(seconds), statistics.median(seconds)
    print(f"batch mode: {args.lines} lines, {args.runs} runs: best {best * 1e3:.1f} ms "
          f"({args.lines / best:,.0f} lines/s), median {median * 1e3:.1f} ms ({args.lines / median:,.0f} lines/s)")


if __name__ == "__main__":
    main()
