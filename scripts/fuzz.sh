#!/usr/bin/env bash
# Runs the libFuzzer programs of a fuzz build one after the other, each for a given time on a scratch
# copy of its seed corpus (fuzz/corpus/ is never written), with its dictionary and its options
# (fuzz/options/<target>.options, one libFuzzer option a line) when it has them.
# Usage: scripts/fuzz.sh <fuzz build dir> <seconds per target> [target...]   (default: every target)
# Each target leaves its log, its grown corpus and any crash, leak, timeout or out-of-memory input in
# <build>/fuzz-runs/<target>/; a summary line per target goes to <build>/fuzz-runs/summary.txt. The
# script fails when any target found something.
set -uo pipefail
cd "$(dirname "$0")/.."

build=$(cd "$1" && pwd)
seconds=$2
shift 2
targets=("$@")
if [[ ${#targets[@]} -eq 0 ]]; then
  mapfile -t targets < <(find "$build/fuzz" -maxdepth 1 -type f -name 'fuzz_*' -perm -u+x ! -name 'fuzz_replay_*' \
    -printf '%f\n' | sed 's/^fuzz_//' | sort)
fi
[[ ${#targets[@]} -gt 0 ]] || { echo "fuzz: no fuzz programs in $build/fuzz" >&2; exit 1; }

runs="$build/fuzz-runs"
mkdir -p "$runs"
summary="$runs/summary.txt"
: >"$summary"
failed=()

count_files() { find "$1" -type f | wc -l; }

for target in "${targets[@]}"; do
  program="$build/fuzz/fuzz_$target"
  [[ -x $program ]] || { echo "fuzz: $program is missing" >&2; failed+=("$target"); continue; }
  work="$runs/$target"
  rm -rf "$work"
  mkdir -p "$work/corpus" "$work/artifacts"
  cp -R fuzz/corpus/"$target"/. "$work/corpus/"
  seeds=$(count_files "$work/corpus")

  options=(-max_total_time="$seconds" -timeout=25 -rss_limit_mb=2560 -print_final_stats=1
           -artifact_prefix="$work/artifacts/")
  [[ -f fuzz/dict/$target.dict ]] && options+=(-dict="$PWD/fuzz/dict/$target.dict")
  if [[ -f fuzz/options/$target.options ]]; then
    while read -r option; do
      [[ -z $option || $option == \#* ]] || options+=("-$option")
    done <"fuzz/options/$target.options"
  fi

  echo "fuzz: $target for ${seconds}s"
  TIMEFORMAT='%3U %3S'
  { time "$program" "${options[@]}" "$work/corpus" >"$work/log" 2>&1; } 2>"$work/cpu"
  status=$?
  read -r user system <"$work/cpu"
  cpu=$(awk -v u="$user" -v s="$system" 'BEGIN { printf "%.1f", u + s }')
  executions=$(sed -n 's/^stat::number_of_executed_units: *//p' "$work/log" | tail -1)
  finds=$(find "$work/artifacts" -type f | wc -l)
  line="$target: cpu ${cpu}s, executions ${executions:-?}, corpus $seeds -> $(count_files "$work/corpus"), finds $finds, exit $status"
  echo "fuzz: $line"
  echo "$line" >>"$summary"
  if [[ $status -ne 0 || $finds -ne 0 ]]; then
    tail -n 40 "$work/log" >&2
    failed+=("$target")
  fi
done

if [[ ${#failed[@]} -gt 0 ]]; then
  echo "fuzz: found faults in: ${failed[*]} (inputs in $runs/<target>/artifacts/)" >&2
  exit 1
fi
echo "fuzz: no finds (summary in $summary)"
