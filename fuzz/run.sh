#!/usr/bin/env bash
# Runs every fuzz target of a fuzzer build (TONVEX_BUILD_FUZZERS=ON), one after
# another, each from its committed seed corpus fuzz/corpus/<target>. New inputs go to
# BUILD_DIR/fuzz/work/<target>, so the committed corpus stays as it is, and inputs
# that crash to BUILD_DIR/fuzz/work/artifacts. Prints libFuzzer's final line per
# target (runs, coverage "cov", features "ft", exec/s); a finding prints the end of
# that target's log and fails the run after the others have run.
#
# usage: fuzz/run.sh [--seconds S | --runs N] [BUILD_DIR]
#   --seconds S  run each target for S seconds (default 600)
#   --runs N     run each target for N inputs (at most 120 seconds)
#   BUILD_DIR    default build-fuzz
set -euo pipefail
cd "$(dirname "$0")/.."

limit=(-max_total_time=600)
case "${1:-}" in
  --seconds) limit=(-max_total_time="$2"); shift 2 ;;
  --runs) limit=(-runs="$2" -max_total_time=120); shift 2 ;;
esac
build=${1:-build-fuzz}
work="$build/fuzz/work"

status=0
found=0
for program in "$build"/fuzz/fuzz_*; do
  [ -f "$program" ] && [ -x "$program" ] || continue
  found=1
  target=${program##*/fuzz_}
  mkdir -p "$work/$target" "$work/artifacts"
  log="$work/$target.log"
  # Standard output is closed: the net file readers print every value they read.
  if "$program" "${limit[@]}" -close_fd_mask=1 -artifact_prefix="$work/artifacts/$target-" \
    "$work/$target" "fuzz/corpus/$target" >"$log" 2>&1; then
    echo "$target: $(grep -E '^#[0-9]+[[:space:]]+DONE' "$log" | tail -n 1)"
  else
    echo "$target: FAILED, see $log" >&2
    tail -n 60 "$log" >&2
    status=1
  fi
done
if [ $found = 0 ]; then
  echo "no fuzz targets in $build/fuzz (configure with CXX=clang++ and -DTONVEX_BUILD_FUZZERS=ON)" >&2
  exit 2
fi
exit $status
