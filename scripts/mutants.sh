#!/usr/bin/env bash
# Sampled mutation testing: N mutants of src/ and plugins/ (one comparison, arithmetic operator,
# boolean or constant changed at a place the seed picks), each built incrementally in a build folder
# of its own and run against the suite (stopping at the first failing test, with a time limit of
# three times the unchanged suite's run). Prints how many the suite caught and which survived; a
# mutant that does not build is listed apart and replaced by the next place. The source is restored
# after every mutant, also on Ctrl-C. scripts/mutants.py tells how places are found and picked.
# Usage: scripts/mutants.sh SEED N [build dir, default build-mutants]   (JOBS: parallel jobs, 2)
set -euo pipefail
cd "$(dirname "$0")/.."

if [[ $# -lt 2 ]]; then
  echo "usage: scripts/mutants.sh SEED N [build dir]" >&2
  exit 2
fi
build=${3:-build-mutants}

launcher=()
if command -v ccache >/dev/null; then
  launcher=(-DCMAKE_CXX_COMPILER_LAUNCHER=ccache -DCMAKE_C_COMPILER_LAUNCHER=ccache)
fi
# The build type of make build (-O3 raises false warnings in the tests); the test programs link the
# library as a shared object: a mutant relinks only the library.
if [[ ! -f $build/CMakeCache.txt ]]; then
  cmake -S . -B "$build" -DCMAKE_BUILD_TYPE=RelWithDebInfo -DCMAKE_LINK_DEPENDS_NO_SHARED=ON "${launcher[@]}" \
    ${CMAKE_ARGS:-} >/dev/null
fi
exec /usr/bin/python3 scripts/mutants.py "$1" "$2" "$build"
