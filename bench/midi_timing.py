#!/usr/bin/env python3
"""Whole-process time of `tonvex midi` on a song: reading the file, the analysis and
writing the timeline, start-up included.

Writes the synthetic four-minute song of bench/MidiSong.cpp (100 bars of 4/4 at 100
beats per minute, piano under the pedal, melody and drums, about 3,000 notes) with
tonvex_song_midi, then runs `tonvex midi [--format F] FILE > /dev/null` on it and on
each FILE given, several times each, pinned to one core with taskset when it is
available. Prints the best and the median run per file; the best is the figure to
compare, since other load on the machine only ever makes a run slower.
"""
import argparse
import os
import shutil
import statistics
import subprocess
import sys
import tempfile
import time
from pathlib import Path


def measure(program, path, runs, cpu, fmt="text"):
    """Seconds of each run of `tonvex midi` on the file."""
    command = [program, "midi", "--format", fmt, path]
    if cpu and shutil.which("taskset"):
        command = ["taskset", "-c", cpu] + command
    seconds = []
    for _ in range(runs):
        start = time.perf_counter()
        result = subprocess.run(command, stdout=subprocess.DEVNULL)
        seconds.append(time.perf_counter() - start)
        if result.returncode != 0:
            sys.exit(f"{' '.join(command)} exited with status {result.returncode}")
    return seconds


def synthetic_song(build, directory):
    path = os.path.join(directory, "song.mid")
    subprocess.run([str(Path(build) / "bin" / "tonvex_song_midi"), path], check=True)
    return path


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("files", nargs="*", help="more MIDI files to time")
    parser.add_argument("--build", default="build")
    parser.add_argument("--runs", type=int, default=50)
    parser.add_argument("--cpu", default="0", help="core to pin to (empty: no pinning)")
    parser.add_argument("--format", default="text", choices=["text", "lab", "json"])
    args = parser.parse_args()
    program = str(Path(args.build) / "bin" / "tonvex")
    with tempfile.TemporaryDirectory() as directory:
        for path in [synthetic_song(args.build, directory)] + args.files:
            seconds = measure(program, path, args.runs, args.cpu, args.format)
            name = "synthetic 4-minute song" if path.startswith(directory) else path
            print(f"tonvex midi --format {args.format}, {name}, {args.runs} runs: "
                  f"best {min(seconds) * 1e3:.2f} ms, median {statistics.median(seconds) * 1e3:.2f} ms")


if __name__ == "__main__":
    main()
