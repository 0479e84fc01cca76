#!/usr/bin/env bash
# Runs the whole test suite of a build once more with a comma-decimal locale active: every test
# program switches to it (DEXCHANGE_TEST_LOCALE, see tests/support/TestLocale.h) and so do the
# programs they start (LC_ALL). When the machine lacks the locale, it is compiled with localedef into
# <build>/tests/locales, the folder the tests' own comma-locale helper uses. A locale that cannot be
# made fails the run; it is never skipped.
# Usage: scripts/locale-test.sh <build dir> [jobs]
set -euo pipefail
cd "$(dirname "$0")/.."

build=$(cd "$1" && pwd)
jobs=${2:-2}
name=de_DE.UTF-8

decimal_point() { LC_ALL=$name locale decimal_point 2>/dev/null || true; }

if [[ "$(decimal_point)" != "," ]]; then
  folder="$build/tests/locales"
  if [[ ! -f $folder/$name/LC_NUMERIC ]]; then
    mkdir -p "$folder"
    scratch=$(mktemp -d "$folder/compiling-XXXXXX")
    # -c writes the locale despite the warnings some locale sources give; the result is checked below.
    localedef -c -i de_DE -f UTF-8 "$scratch/$name" >/dev/null 2>&1 || true
    [[ -f $scratch/$name/LC_NUMERIC ]] && mv -T "$scratch/$name" "$folder/$name"
    rm -rf "$scratch"
  fi
  export LOCPATH=$folder
  if [[ "$(decimal_point)" != "," ]]; then
    echo "locale-test: cannot make $name with a decimal comma (localedef into $folder failed)" >&2
    exit 1
  fi
fi

echo "locale-test: the whole suite under $name${LOCPATH:+ (LOCPATH=$LOCPATH)}"
DEXCHANGE_TEST_LOCALE=$name LC_ALL=$name ctest --test-dir "$build" --output-on-failure -j"$jobs"
