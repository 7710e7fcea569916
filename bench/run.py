#!/usr/bin/env python3
"""Runs every benchmark the way bench/RESULTS.md was measured and prints its table.

Run from the top of a Release build tree's source directory:
    python3 bench/run.py [--build build] [--repetitions 10] [--cpu 0]
tonvex_bench runs pinned to one core (taskset) with each benchmark repeated; the
table shows per item the smallest time over the repetitions (other load on the
machine only ever adds time) and the median, and the heap allocations per item.
The batch mode line is batch_throughput.py's best of seven runs.
"""
import argparse
import json
import shutil
import statistics
import subprocess
import sys
from pathlib import Path

sys.path.insert(0, str(Path(__file__).resolve().parent))
import batch_throughput  # noqa: E402


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("--build", default="build")
    parser.add_argument("--repetitions", type=int, default=10)
    parser.add_argument("--cpu", default="0", help="core to pin to (empty: no pinning)")
    args = parser.parse_args()

    command = [str(Path(args.build) / "bin" / "tonvex_bench"), f"--benchmark_repetitions={args.repetitions}",
               "--benchmark_min_time=0.2", "--benchmark_format=json", "--benchmark_report_aggregates_only=true"]
    if args.cpu and shutil.which("taskset"):
        command = ["taskset", "-c", args.cpu] + command
    report = json.loads(subprocess.run(command, check=True, stdout=subprocess.PIPE, text=True).stdout)

    rows = {}
    for entry in report["benchmarks"]:
        row = rows.setdefault(entry["run_name"], {})
        row[entry["aggregate_name"]] = entry
    print("| benchmark | ns per item (min) | ns per item (median) | items per second (min time) | heap allocations per item |")
    print("|---|---:|---:|---:|---:|")
    for name, row in rows.items():
        best, median = row["min"]["time_per_item"] * 1e9, row["median"]["time_per_item"] * 1e9
        allocations = row["median"]["allocs_per_item"]
        print(f"| {name} | {best:.1f} | {median:.1f} | {1e9 / best:,.0f} | {allocations:.4f} |")

    lines = 100000
    seconds = batch_throughput.measure(str(Path(args.build) / "bin" / "tonvex"), lines, 7, args.cpu)
    best, median = min(seconds), statistics.median(seconds)
    print(f"| tonvex batch mode, {lines} lines (whole process) | {best / lines * 1e9:.1f} | "
          f"{median / lines * 1e9:.1f} | {lines / best:,.0f} | |")


if __name__ == "__main__":
    main()
