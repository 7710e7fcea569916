"""Checks the library's Harte labels with mir_eval's reader: every label that
tonvex_harte_labels writes must be valid Harte syntax for mir_eval.chord.encode and
name the chord's root, pitch classes and bass.

encode is called with reduce_extended_chords=True, which folds 9ths, 11ths and 13ths
into the octave (otherwise it drops them). It adds the bass to the pitch classes and
reads a label without a bass as one over the root, so a "*1" counts only with a
bass, which a chord without its root always has ("C:maj7(*1)/3"). Exits 77
(skipped) when mir_eval cannot be imported.

usage: check_harte_labels.py PROGRAM
"""
import subprocess
import sys

try:
    import mir_eval.chord as harte
except ImportError:
    print("skipped: mir_eval cannot be imported by %s (Debian: python3-mir-eval)" % sys.executable)
    sys.exit(77)

lines = subprocess.run([sys.argv[1]], capture_output=True, text=True, check=True).stdout.splitlines()
expected = {}
failures = []
for line in lines:
    label, root, intvls, bass = line.split()
    facts = (int(root), int(intvls), int(bass))
    if expected.setdefault(label, facts) != facts:
        failures.append("%s names two chords: %r and %r" % (label, expected[label], facts))

for label, (root, intvls, bass) in expected.items():
    try:
        root_nr, bitmap, bass_nr = harte.encode(label, reduce_extended_chords=True)
    except Exception as error:  # mir_eval raises on invalid syntax
        failures.append("%s: %s" % (label, error))
        continue
    named = sum(1 << i for i, bit in enumerate(bitmap) if bit)
    if (root_nr, named, bass_nr) != (root, intvls, bass):
        failures.append("%s: mir_eval reads root %d, intervals %s, bass %d; the chord has %d, %s, %d"
                        % (label, root_nr, bin(named), bass_nr, root, bin(intvls), bass))

print("%d chords, %d distinct labels checked with mir_eval" % (len(lines), len(expected)))
for failure in failures[:50]:
    print("FAIL:", failure)
sys.exit(1 if failures or not lines else 0)
