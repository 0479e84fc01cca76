#!/usr/bin/env bash
# Import and export of a million coded points through the loader and the shipped point-file plug-ins,
# with the baselines run on the same file and machine:
#   - a bare fread + splitter + std::from_chars parse, and a bare std::to_chars write;
#   - the model's heap blocks of a million coded points allocated from the library's allocator and
#     written, nothing parsed (the floor of any import into the model on this machine);
#   - ogr2ogr from Debian's gdal-bin reading the file into memory (-f Memory) and writing it (-f CSV);
#     installed when missing, skipped when it cannot be.
# The imports run twice: with the library's allocator (mimalloc) and with the C library's malloc
# (DEXCHANGE_ALLOCATOR=malloc); the label column names the allocator. A host built against the
# installed package with pkg-config alone runs the import as well. Each benchmark runs in a process of
# its own so that its peak memory is its own. On a shared machine compare the CPU times.
#
#   bench/point_files.sh                 (BUILD_DIR=build-rel, DEXCHANGE_BENCH_CSV=/tmp/dexchange-bench-1m.csv)
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${BUILD_DIR:-$root/build-rel}
export DEXCHANGE_BENCH_CSV=${DEXCHANGE_BENCH_CSV:-/tmp/dexchange-bench-1m.csv}
unset DEXCHANGE_ALLOCATOR
jobs=${JOBS:-2}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# GCC 12 at -O3 reports a false -Wrestrict inside std::string (tools/dexchange/FormatsCommand.cpp).
cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=Release -DDEXCHANGE_BENCH=ON -DDEXCHANGE_WERROR=OFF >/dev/null
cmake --build "$build" -j"$jobs" --target dexchange_bench_PointFilesBench dexchange_tool >/dev/null
bench=$build/bench/dexchange_bench_PointFilesBench
tool=$build/tools/dexchange/dexchange

# First touches of fresh memory cost what the machine's other load and its hypervisor make them cost,
# so each figure is the median of RUNS runs (default 3).
runs=${RUNS:-3}
median() { sort -n -k"$1" | sed -n "$(((runs + 1) / 2))p"; }

# Runs one benchmark RUNS times, each in a process of its own, prints the median row (by CPU time) and
# keeps its CPU milliseconds and peak MB.
declare -A cpu_ms peak_mb
run() {
  local name=$1 key=$2
  shift 2
  local row
  row=$(for ((i = 0; i < runs; ++i)); do
    env "$@" "$bench" --benchmark_filter="^$name/" --benchmark_counters_tabular=true 2>/dev/null |
      grep -E "^$name/"
  done | median 4)
  echo "$row"
  cpu_ms[$key]=$(awk '{print $4}' <<<"$row")
  peak_mb[$key]=$(awk '{print $8}' <<<"$row")
}

echo "== the library, a million points (file: $DEXCHANGE_BENCH_CSV)"
"$bench" --benchmark_filter='^BareParse/' --benchmark_counters_tabular=true 2>/dev/null | grep -E '^Benchmark'
for name in BareParse ModelBlocks LoaderImport LoaderImportJobs BareWrite LoaderExport; do
  run "$name" "$name"
done
echo
echo "== the same imports with DEXCHANGE_ALLOCATOR=malloc (the C library's malloc, glibc defaults)"
for name in ModelBlocks LoaderImport LoaderImportJobs; do
  run "$name" "$name.malloc" DEXCHANGE_ALLOCATOR=malloc
done

# wall and CPU (user + system) seconds and peak MB of a command: the median of RUNS runs by CPU time
measure() {
  local i
  for ((i = 0; i < runs; ++i)); do
    /usr/bin/time -f "%e %U %S %M" -o "$work/time" "$@" >/dev/null 2>&1 || { echo "failed"; return; }
    read -r seconds user system kilobytes <"$work/time"
    echo "$seconds s wall, $(echo "$user + $system" | bc) s CPU, $((kilobytes / 1024)) MB peak"
  done | median 4
}

echo
echo "== the tool (worker threads, whole process)"
echo "dexchange info (import):            $(measure "$tool" info "$DEXCHANGE_BENCH_CSV")"
echo "dexchange convert (import, export): $(measure "$tool" convert "$DEXCHANGE_BENCH_CSV" "$work/out.csv" --force)"
echo "dexchange info, malloc:             $(DEXCHANGE_ALLOCATOR=malloc measure "$tool" info "$DEXCHANGE_BENCH_CSV")"

echo
echo "== a host built against the installed package (pkg-config --cflags --libs dexchange)"
prefix=$work/prefix
cmake --install "$build" --prefix "$prefix" >/dev/null
libdir=$(dirname "$(find "$prefix" -name libdexchange.so -print -quit)")
read -r -a pc_flags <<<"$(PKG_CONFIG_PATH="$libdir/pkgconfig" pkg-config --cflags --libs dexchange)"
c++ -O2 "$root/bench/host/ImportHost.cpp" -o "$work/import_host" "${pc_flags[@]}"
host() {
  local i
  for ((i = 0; i < runs; ++i)); do
    env "$@" LD_LIBRARY_PATH="$libdir" "$work/import_host" "$DEXCHANGE_BENCH_CSV"
  done | median 1
}
echo "import in a worker thread:          $(host)"
echo "the same, malloc:                   $(host DEXCHANGE_ALLOCATOR=malloc)"

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
ogr_cpu=""
if command -v ogr2ogr >/dev/null 2>&1; then
  # The same model of the file: point geometries from the coordinate columns, the rest as fields.
  options=(-oo HEADERS=NO -oo AUTODETECT_TYPE=YES -oo X_POSSIBLE_NAMES=field_3 -oo Y_POSSIBLE_NAMES=field_2
           -oo Z_POSSIBLE_NAMES=field_4)
  memory=$(measure ogr2ogr -f Memory "$work/memory" "$DEXCHANGE_BENCH_CSV" "${options[@]}")
  echo "ogr2ogr -f Memory (import):         $memory"
  echo "ogr2ogr -f CSV (import, export):    $(measure ogr2ogr -f CSV "$work/ogr.csv" "$DEXCHANGE_BENCH_CSV" "${options[@]}")"
  ogr_cpu=$(sed -n 's/.* wall, \([0-9.]*\) s CPU.*/\1/p' <<<"$memory")
else
  echo "skipped: gdal-bin is not installed and cannot be installed here"
fi

# The goals, from the CPU times above.
ratio() { echo "scale=2; $1 / $2" | bc; }
echo
echo "== against the goals (CPU)"
echo "import: ${cpu_ms[LoaderImport]} ms, peak ${peak_mb[LoaderImport]} MB (ModelBlocks floor ${peak_mb[ModelBlocks]} MB);" \
  "malloc: ${cpu_ms[LoaderImport.malloc]} ms, peak ${peak_mb[LoaderImport.malloc]} MB"
if [[ -n "$ogr_cpu" ]]; then
  echo "ogr2ogr -f Memory / import: $(ratio "$ogr_cpu * 1000" "${cpu_ms[LoaderImport]}") x" \
    "(malloc: $(ratio "$ogr_cpu * 1000" "${cpu_ms[LoaderImport.malloc]}") x)"
fi
echo "export / bare write: $(ratio "${cpu_ms[LoaderExport]}" "${cpu_ms[BareWrite]}") x"
echo "five jobs, peak: ${peak_mb[LoaderImportJobs]} MB (malloc: ${peak_mb[LoaderImportJobs.malloc]} MB)"
