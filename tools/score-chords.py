#!/usr/bin/python3
"""Scores chord timelines (.lab files) against reference chord labels with the MIREX
measures of mir_eval (Debian's python3-mir-eval, importable by /usr/bin/python3).

usage: tools/score-chords.py EST_DIR REF_DIR [--songs FIRST-LAST] [--per-song]

Every EST_DIR/NAME.lab is compared with REF_DIR/NAME.lab or, in the layout of the
POP909 data, REF_DIR/NAME/chord_midi.txt. --songs keeps the names that are numbers
from FIRST to LAST. For each measure it prints the duration-weighted figure over all
songs (correct duration / counted duration, the MIREX weighted chord symbol recall)
and the mean of the songs' own figures. The estimate is cut or padded with N to the
reference's time span, as mir_eval.chord.evaluate does.
"""
import argparse
import os
import sys

import mir_eval

MEASURES = ["root", "majmin", "mirex", "thirds", "sevenths"]


def reference_path(ref_dir, name):
    for path in (os.path.join(ref_dir, name + ".lab"), os.path.join(ref_dir, name, "chord_midi.txt")):
        if os.path.exists(path):
            return path
    return None


def song_durations(ref_path, est_path):
    """Per measure: (correct duration, counted duration)."""
    ref_iv, ref_lab = mir_eval.io.load_labeled_intervals(ref_path)
    est_iv, est_lab = mir_eval.io.load_labeled_intervals(est_path)
    est_iv, est_lab = mir_eval.util.adjust_intervals(
        est_iv, est_lab, ref_iv.min(), ref_iv.max(), mir_eval.chord.NO_CHORD, mir_eval.chord.NO_CHORD)
    iv, ref, est = mir_eval.util.merge_labeled_intervals(ref_iv, ref_lab, est_iv, est_lab)
    durations = mir_eval.util.intervals_to_durations(iv)
    result = {}
    for measure in MEASURES:
        comparisons = getattr(mir_eval.chord, measure)(ref, est)
        counted = comparisons >= 0
        result[measure] = (float((durations * comparisons)[counted].sum()), float(durations[counted].sum()))
    return result


def main():
    parser = argparse.ArgumentParser(description=__doc__.split("\n\n")[0])
    parser.add_argument("est_dir")
    parser.add_argument("ref_dir")
    parser.add_argument("--songs", help="FIRST-LAST: only songs whose names are numbers in this range")
    parser.add_argument("--per-song", action="store_true", help="also print each song's figures")
    args = parser.parse_args()
    first, last = (int(x) for x in args.songs.split("-")) if args.songs else (None, None)

    totals = {m: [0.0, 0.0] for m in MEASURES}
    means = {m: [] for m in MEASURES}
    songs = 0
    for entry in sorted(os.listdir(args.est_dir)):
        name, ext = os.path.splitext(entry)
        if ext != ".lab":
            continue
        if first is not None and not (name.isdigit() and first <= int(name) <= last):
            continue
        ref = reference_path(args.ref_dir, name)
        if ref is None:
            print(f"no reference for {name}", file=sys.stderr)
            return 1
        song = song_durations(ref, os.path.join(args.est_dir, entry))
        songs += 1
        for m in MEASURES:
            correct, counted = song[m]
            totals[m][0] += correct
            totals[m][1] += counted
            if counted > 0:
                means[m].append(correct / counted)
        if args.per_song:
            print(name, " ".join(f"{m} {100 * song[m][0] / song[m][1]:.1f}" if song[m][1] else f"{m} -"
                                 for m in MEASURES))
    if songs == 0:
        print("no .lab files to score", file=sys.stderr)
        return 1
    print(f"{songs} songs")
    print(f"{'measure':<10} {'weighted':>9} {'song mean':>10}")
    for m in MEASURES:
        weighted = 100 * totals[m][0] / totals[m][1] if totals[m][1] else 0
        mean = 100 * sum(means[m]) / len(means[m]) if means[m] else 0
        print(f"{m:<10} {weighted:>8.2f}% {mean:>9.2f}%")
    return 0


if __name__ == "__main__":
    sys.exit(main())
