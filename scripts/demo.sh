#!/usr/bin/env bash
# The README's demo: runs the command-line host on the bundled samples.
set -euo pipefail
tool=${1:-build/tools/dexchange/dexchange}
samples=$(cd "$(dirname "$0")/../samples" && pwd)
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
run() { echo "\$ dexchange $*"; "$tool" "$@"; echo; }
run --version
run --help
# The formats a host offers when the user exports points.
run formats --export --type POINTS
# The bundled survey, CSV -> customizable ASCII (semicolon-delimited, the user's columns), then what
# the written file holds.
fields="Name,Northing,Easting,Ht,FullCodes"
run convert "$samples/survey.csv" "$work/survey.pts" --fields "$fields" --delimiter ';' --force
echo "\$ head -4 survey.pts"; head -4 "$work/survey.pts"; echo
run info "$work/survey.pts" --fields "$fields" --delimiter ';'
# A real job written by field software: easting before northing, dates and times after the code.
run info "$samples/../tests/data/pointfiles/geodepy_Site13-134.txt" --order PENZD
# The survey as a drawing: its coded points joined into kerb, edge and fence lines, then read back.
run convert "$samples/survey.csv" "$work/survey.dxf" --linework --force
run info "$work/survey.dxf"
# A drawing of another program: civil-style point blocks, linework, labels and a terrain model.
run info "$samples/site.dxf"
run convert "$samples/site.dxf" "$work/site.csv" --force
echo "\$ cat site.csv"; cat "$work/site.csv"
