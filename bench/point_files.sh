#!/usr/bin/env bash
# Import and export of a million coded points through the loader and the shipped point-file plug-ins,
# with the baselines run on the same file and machine:
#   - a bare fread + splitter + std::from_chars parse, and a bare std::to_chars write;
#   - the model's heap blocks of a million coded points allocated and written, nothing parsed (the
#     floor of any import into the model on this machine);
#   - ogr2ogr from Debian's gdal-bin reading the file into memory (-f Memory) and writing it (-f CSV);
#     installed when missing, skipped when it cannot be.
# Each benchmark runs in a process of its own so that its peak memory is its own.
#
#   bench/point_files.sh                 (BUILD_DIR=build-rel, DEXCHANGE_BENCH_CSV=/tmp/dexchange-bench-1m.csv)
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${BUILD_DIR:-$root/build-rel}
export DEXCHANGE_BENCH_CSV=${DEXCHANGE_BENCH_CSV:-/tmp/dexchange-bench-1m.csv}
jobs=${JOBS:-2}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# GCC 12 at -O3 reports a false -Wrestrict inside std::string (tools/dexchange/FormatsCommand.cpp).
cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=Release -DDEXCHANGE_BENCH=ON -DDEXCHANGE_WERROR=OFF >/dev/null
cmake --build "$build" -j"$jobs" --target dexchange_bench_PointFilesBench dexchange_tool >/dev/null
bench=$build/bench/dexchange_bench_PointFilesBench
tool=$build/tools/dexchange/dexchange
huge=glibc.malloc.hugetlb=1:glibc.malloc.arena_max=1

echo "== the library, a million points (file: $DEXCHANGE_BENCH_CSV)"
for name in BareParse ModelBlocks LoaderImport BareWrite LoaderExport; do
  "$bench" --benchmark_filter="^$name/" --benchmark_counters_tabular=true 2>/dev/null | grep -E "^(Benchmark|$name)"
done
# Page faults are most of an import's time: the same with glibc's heap on transparent huge pages, as
# the tool runs (a host may set the variable too).
echo
echo "== the same imports with GLIBC_TUNABLES=$huge"
for name in ModelBlocks LoaderImport; do
  GLIBC_TUNABLES=$huge "$bench" --benchmark_filter="^$name/" --benchmark_counters_tabular=true 2>/dev/null \
    | grep -E "^$name"
done

# wall and CPU (user + system) seconds and peak MB of a command; on a shared machine the CPU time is
# the figure to compare
measure() {
  /usr/bin/time -f "%e %U %S %M" -o "$work/time" "$@" >/dev/null 2>&1 || { echo "failed"; return; }
  read -r seconds user system kilobytes <"$work/time"
  echo "$seconds s wall, $(echo "$user + $system" | bc) s CPU, $((kilobytes / 1024)) MB peak"
}

echo
echo "== the tool (worker threads, whole process)"
echo "dexchange info (import):            $(measure "$tool" info "$DEXCHANGE_BENCH_CSV")"
echo "dexchange convert (import, export): $(measure "$tool" convert "$DEXCHANGE_BENCH_CSV" "$work/out.csv" --force)"
echo "dexchange info, glibc defaults:     $(GLIBC_TUNABLES= measure "$tool" info "$DEXCHANGE_BENCH_CSV")"

echo
echo "== ogr2ogr (gdal-bin)"
if ! command -v ogr2ogr >/dev/null 2>&1; then
  if [ "$(id -u)" = 0 ]; then
    (apt-get install -y -qq gdal-bin >/dev/null 2>&1 || { apt-get update -qq && apt-get install -y -qq gdal-bin; }) \
      >/dev/null 2>&1 || true
  else
    (sudo -n apt-get install -y -qq gdal-bin) >/dev/null 2>&1 || true
  fi
fi
if command -v ogr2ogr >/dev/null 2>&1; then
  # The same model of the file: point geometries from the coordinate columns, the rest as fields.
  options=(-oo HEADERS=NO -oo AUTODETECT_TYPE=YES -oo X_POSSIBLE_NAMES=field_3 -oo Y_POSSIBLE_NAMES=field_2
           -oo Z_POSSIBLE_NAMES=field_4)
  echo "ogr2ogr -f Memory (import):         $(measure ogr2ogr -f Memory "$work/memory" "$DEXCHANGE_BENCH_CSV" "${options[@]}")"
  echo "ogr2ogr -f CSV (import, export):    $(measure ogr2ogr -f CSV "$work/ogr.csv" "$DEXCHANGE_BENCH_CSV" "${options[@]}")"
else
  echo "skipped: gdal-bin is not installed and cannot be installed here"
fi
