#!/usr/bin/env bash
# The README's demo: runs the command-line host on the bundled samples.
set -euo pipefail
tool=${1:-build/tools/dexchange/dexchange}
run() { echo "\$ dexchange $*"; "$tool" "$@"; echo; }
run --version
run --help
# The formats a host offers when the user exports points.
run formats --export --type POINTS
