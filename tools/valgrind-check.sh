#!/usr/bin/env bash
# Runs the test programs and the command-line tests under valgrind's memcheck. Any
# invalid read or write, use of uninitialised memory, bad free or leak (definite,
# indirect or possible) fails the run.
#
# usage: tools/valgrind-check.sh [--quick] [BUILD_DIR]
#   BUILD_DIR  a build without sanitizers; configured here (RelWithDebInfo, for
#              line numbers in the reports) when it does not exist yet, and the
#              programs are brought up to date. Default: build-valgrind.
#   --quick    leaves out the exhaustive sweeps (every pitch-class set under every
#              root, ...), which take minutes under valgrind and which the sanitizer
#              build runs in full anyway.
set -euo pipefail
cd "$(dirname "$0")/.."

quick=0
if [ "${1:-}" = "--quick" ]; then
  quick=1
  shift
fi
build=${1:-build-valgrind}

command -v valgrind >/dev/null || { echo "valgrind is not installed" >&2; exit 2; }
if [ ! -f "$build/CMakeCache.txt" ]; then
  cmake -S . -B "$build" -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo
fi
if grep -q '^TONVEX_SANITIZE:STRING=.\+' "$build/CMakeCache.txt"; then
  echo "$build is a sanitizer build; valgrind needs a build without sanitizers" >&2
  exit 2
fi
cmake --build "$build" --target tonvex_tests tonvex_internal_tests tonvex_cli tonvex_write_test_midi tonvex_xor_example

memcheck="valgrind --quiet --error-exitcode=99 --leak-check=full --show-leak-kinds=definite,indirect,possible"
memcheck+=" --errors-for-leak-kinds=definite,indirect,possible"

# The sweeps over all pitch-class sets and voicings, by test name.
sweeps="RootFindingByRules.EveryPitchClassSetUnderEveryRootAndOverEveryBass:IntvlSet.QueriesOnAllPitchClassSetPairs"
sweeps+=":BasicChord.EveryPitchClassSetOverEveryRoot:BasicChord.IntervalsAboveTheOctave"
sweeps+=":ChordInKey.NotesAndIntervalsOutsideTheKey:MoveInScale.StepsThroughTheScaleNotes"
sweeps+=":RootSpelling.EveryPitchClassSetAfterRootFinding:RootByNetTables.*:ConcurrentAnalysis.*"
sweeps+=":ChordSymbolRoundTrip.EveryPitchClassSetWithEveryBass:ChordSymbolRoundTrip.CatalogueAndXGTypesOnEveryRootInEveryInversion"
filter=()
[ $quick = 1 ] && filter=("--gtest_filter=-$sweeps")

status=0
for program in tonvex_tests tonvex_internal_tests; do
  echo "+ memcheck $program ${filter[*]}"
  GTEST_BRIEF=1 $memcheck "$build/tests/$program" "${filter[@]}" || status=1
done
echo "+ memcheck tonvex_xor_example"
$memcheck "$build/bin/tonvex_xor_example" >/dev/null || status=1

# Every command-line test, with the program under memcheck: a memcheck error turns
# the exit status into 99, which no test expects.
echo "+ memcheck tonvex (command-line tests)"
TONVEX_CLI_LAUNCHER="$memcheck" ctest --test-dir "$build" -R '^cli\.' -E 'installed' -j2 --output-on-failure ||
  status=1

if [ $status = 0 ]; then echo "memcheck: clean"; else echo "memcheck: FAILED" >&2; fi
exit $status
