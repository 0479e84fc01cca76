#!/usr/bin/env bash
# The line and branch summary of src/, plugins/ and tools/ from a build made with --coverage and run.
# gcov must run where the compiler ran (the source paths may be relative when ccache's base_dir is
# set), so each folder of the build that holds a CMakeFiles folder is read on its own and the parts
# are added up. Writes <build>/coverage.txt (per file) and <build>/coverage.json (per line).
# Usage: scripts/coverage-report.sh BUILD_DIR [JOBS]
set -euo pipefail
cd "$(dirname "$0")/.."

build=${1:?usage: scripts/coverage-report.sh BUILD_DIR [JOBS]}
jobs=${2:-2}
parts="$build/coverage-parts"
rm -rf "$parts"
mkdir -p "$parts"
filters=(--filter 'src/' --filter 'plugins/' --filter 'tools/' --exclude-throw-branches
  --exclude-unreachable-branches)

n=0
while IFS= read -r cmakefiles; do
  folder=$(dirname "$cmakefiles")
  find "$cmakefiles" -name '*.gcda' -print -quit | grep -q . || continue
  n=$((n + 1))
  gcovr -r . -j"$jobs" --object-directory "$folder" "${filters[@]}" --json "$parts/part$n.json" "$cmakefiles"
done < <(find "$build" -type d -name CMakeFiles -prune)

tracefiles=()
for part in "$parts"/part*.json; do tracefiles+=(--add-tracefile "$part"); done
gcovr -r . "${filters[@]}" "${tracefiles[@]}" --txt "$build/coverage.txt" --json "$build/coverage.json" \
  --print-summary
