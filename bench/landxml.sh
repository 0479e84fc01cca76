#!/usr/bin/env bash
# LandXML import and export through the loader and the shipped plug-ins, with the baselines run on the
# same files and machine (bench/LandXmlBench.cpp): a million coded CgPoints, and a surface of a
# million triangles; the bare xmlTextReader pass and the bare buffered write of the same text; and the
# model-block floor of the point-file benchmark (ModelBlocks of bench/PointFilesBench.cpp). Each
# benchmark runs in a process of its own. CPU times are compared (the machine may be shared):
#   import goal: ModelBlocks + 1.25 x BarePass of the file;   export goal: 2.5 x BareWrite of the file.
#
#   bench/landxml.sh        (BUILD_DIR=build-rel; DEXCHANGE_BENCH_LANDXML_POINTS, ..._SURFACE: the files)
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${BUILD_DIR:-$root/build-rel}
jobs=${JOBS:-2}

# GCC 12 at -O3 reports a false -Wrestrict inside std::string (tools/dexchange/FormatsCommand.cpp).
cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=Release -DDEXCHANGE_BENCH=ON -DDEXCHANGE_WERROR=OFF >/dev/null
cmake --build "$build" -j"$jobs" --target dexchange_bench_LandXmlBench dexchange_bench_PointFilesBench >/dev/null
landxml=$build/bench/dexchange_bench_LandXmlBench
points=$build/bench/dexchange_bench_PointFilesBench

# The CPU milliseconds of one benchmark, run in a process of its own.
cpu() {
  "$1" --benchmark_filter="^$2/" --benchmark_format=csv 2>/dev/null | awk -F, -v name="\"$2/" \
    'index($1, name) == 1 { print $4; exit }'
}

floor=$(cpu "$points" ModelBlocks)
echo "ModelBlocks (a million coded points' heap blocks): ${floor} ms CPU"
for arg in 0 1; do
  what=$([ "$arg" = 0 ] && echo "1,000,000 CgPoints with codes" || echo "a surface of 1,000,000 triangles")
  bare=$(cpu "$landxml" "BarePass/$arg")
  import=$(cpu "$landxml" "LoaderImport/$arg")
  write=$(cpu "$landxml" "BareWrite/$arg")
  export=$(cpu "$landxml" "LoaderExport/$arg")
  echo
  echo "== $what"
  awk -v bare="$bare" -v import="$import" -v floor="$floor" -v write="$write" -v export="$export" 'BEGIN {
    goal = floor + 1.25 * bare
    printf "import  %8.0f ms CPU; bare pass %6.0f ms; goal ModelBlocks + 1.25 x bare = %6.0f ms: %s\n",
           import, bare, goal, import <= goal ? "met" : "missed"
    printf "export  %8.0f ms CPU; bare write %5.0f ms; goal 2.5 x bare write = %6.0f ms: %s (%.2f x)\n",
           export, write, 2.5 * write, export <= 2.5 * write ? "met" : "missed", export / write
  }'
done
