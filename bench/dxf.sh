#!/usr/bin/env bash
# A drawing of a million coded points and a hundred thousand polylines imported and exported through
# the loader and the shipped DXF plug-ins, against GDAL's ogr2ogr on the same file in the same run:
#   - import: the loader (in-process benchmark, and `dexchange info` as a whole process) against
#     `ogr2ogr -f Memory`;
#   - export: the loader writing the model (in-process), and `dexchange convert` (read and write)
#     against `ogr2ogr -f DXF` (read and write).
# The drawing is the exporter's own: each point a POINT and an INSERT with NAME, HEIGHT and CODE
# attributes. Each measurement runs in a process of its own so that its peak memory is its own.
#
#   bench/dxf.sh          (BUILD_DIR=build-rel, DEXCHANGE_BENCH_DXF=/tmp/dexchange-bench-drawing.dxf)
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${BUILD_DIR:-$root/build-rel}
export DEXCHANGE_BENCH_DXF=${DEXCHANGE_BENCH_DXF:-/tmp/dexchange-bench-drawing.dxf}
jobs=${JOBS:-2}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=Release -DDEXCHANGE_BENCH=ON -DDEXCHANGE_WERROR=OFF >/dev/null
cmake --build "$build" -j"$jobs" --target dexchange_bench_DxfBench dexchange_tool >/dev/null
bench=$build/bench/dexchange_bench_DxfBench
tool=$build/tools/dexchange/dexchange

echo "== the library through the loader (file: $DEXCHANGE_BENCH_DXF)"
for name in LoaderImport LoaderExport; do
  "$bench" --benchmark_filter="^$name" --benchmark_counters_tabular=true 2>/dev/null | grep -E "^(Benchmark|$name)"
done
ls -l "$DEXCHANGE_BENCH_DXF" | awk '{ printf "drawing: %.0f MB\n", $5 / 1048576 }'

# wall and CPU (user + system) seconds and peak MB of a command; on a shared machine the CPU time is
# the figure to compare
measure() {
  /usr/bin/time -f "%e %U %S %M" -o "$work/time" "$@" >/dev/null 2>&1 || { echo "failed"; return; }
  read -r seconds user system kilobytes <"$work/time"
  echo "$seconds s wall, $(echo "$user + $system" | bc) s CPU, $((kilobytes / 1024)) MB peak"
}

echo
echo "== whole processes"
echo "dexchange info (import):                   $(measure "$tool" info "$DEXCHANGE_BENCH_DXF")"
echo "dexchange info, plain malloc:              $(DEXCHANGE_ALLOCATOR=malloc measure "$tool" info "$DEXCHANGE_BENCH_DXF")"
echo "dexchange convert (import, export):        $(measure "$tool" convert "$DEXCHANGE_BENCH_DXF" "$work/out.dxf" --force)"
if command -v ogr2ogr >/dev/null 2>&1; then
  echo "ogr2ogr -f Memory (import):                $(measure ogr2ogr -f Memory "$work/memory" "$DEXCHANGE_BENCH_DXF")"
  echo "ogr2ogr -f DXF (import, export):           $(measure ogr2ogr -f DXF "$work/ogr.dxf" "$DEXCHANGE_BENCH_DXF")"
else
  echo "skipped: gdal-bin is not installed (scripts/deps.sh installs it)"
fi
