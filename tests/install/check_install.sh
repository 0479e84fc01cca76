#!/usr/bin/env bash
# Installs the build into a scratch prefix and checks that the package serves hosts outside the tree:
# the installed layout, the dexchange tool running through its RPATH, a host built with pkg-config and
# one built with find_package, the plug-in search of a moved installation.
#
# usage: check_install.sh <build dir> <tests/install source dir> <scratch dir>
set -euo pipefail

if [[ $# -ne 3 ]]; then
  echo "usage: $0 <build dir> <tests/install source dir> <scratch dir>" >&2
  exit 2
fi
build_dir=$(cd "$1" && pwd)
source_dir=$(cd "$2" && pwd)
scratch=$3

fail() {
  echo "check_install: FAILED: $*" >&2
  exit 1
}
step() { echo "check_install: $*"; }

# Runs a command quietly; on failure shows its output and fails with the message.
run_logged() {
  local message=$1 log=$2
  shift 2
  if ! "$@" >"$log" 2>&1; then
    cat "$log" >&2
    fail "$message (log: $log)"
  fi
}

# The plug-in search and the log must not be steered by the caller's environment.
unset DEXCHANGE_PLUGIN_PATH DEXCHANGE_LOG LD_LIBRARY_PATH

rm -rf "$scratch"
mkdir -p "$scratch"
scratch=$(cd "$scratch" && pwd)
prefix=$scratch/prefix

step "installing into $prefix"
run_logged "cmake --install failed" "$scratch/install.log" cmake --install "$build_dir" --prefix "$prefix"

# GNUInstallDirs picks lib or lib/<multiarch> (or lib64) depending on the platform and prefix.
libdir=""
for candidate in lib lib64 "lib/$(gcc -print-multiarch 2>/dev/null || true)"; do
  if [[ -e "$prefix/$candidate/libdexchange.so" ]]; then
    libdir=$candidate
    break
  fi
done
[[ -n "$libdir" ]] || fail "libdexchange.so is not installed under $prefix/lib*"
step "library folder: $libdir"

step "checking the installed layout"
expect_file() { [[ -e "$prefix/$1" ]] || fail "missing from the installation: $1"; }
expect_file "include/dexchange/dexchange.h"
expect_file "include/dexchange/hostlibs/DexApi.h"
expect_file "include/dexchange/hostlibs/VynString.h"
expect_file "$libdir/pkgconfig/dexchange.pc"
expect_file "$libdir/cmake/dexchange/dexchangeConfig.cmake"
expect_file "$libdir/cmake/dexchange/dexchangeConfigVersion.cmake"
expect_file "$libdir/cmake/dexchange/dexchangeTargets.cmake"
expect_file "bin/dexchange"
if find "$prefix/include" -path '*/detail/*' | grep -q .; then
  fail "private detail/ headers are installed"
fi
# Every header the umbrella names is installed.
while read -r header; do
  expect_file "include/dexchange/$header"
done < <(sed -n 's/^#include "\(.*\)"$/\1/p' "$prefix/include/dexchange/dexchange.h")
# Every plug-in the build ships is installed into the plug-in folder.
if compgen -G "$build_dir/lib/plugins/*.so" >/dev/null; then
  for plugin in "$build_dir"/lib/plugins/*.so; do
    expect_file "$libdir/dexchange/plugins/$(basename "$plugin")"
  done
fi
# Nothing installed may depend on the build tree.
shopt -s nullglob
for binary in "$prefix/bin/dexchange" "$prefix/$libdir"/libdexchange.so "$prefix/$libdir"/dexchange/plugins/*.so; do
  search_path=$(readelf -d "$binary" | grep -E 'R(UN)?PATH' || true)
  if [[ "$search_path" == *"$build_dir"* ]]; then
    fail "$binary still looks for libraries in the build tree"
  fi
done
shopt -u nullglob

step "running the installed tool"
tool_version=$("$prefix/bin/dexchange" version) || fail "bin/dexchange does not run from the installation"
pc_version=$(PKG_CONFIG_PATH="$prefix/$libdir/pkgconfig" pkg-config --modversion dexchange) ||
  fail "pkg-config does not find dexchange.pc"
[[ "$tool_version" == "$pc_version" ]] ||
  fail "the tool says version '$tool_version', dexchange.pc says '$pc_version'"

# A test plug-in placed in the installed plug-in folder, to be found through the library's own folder.
test_plugin=$build_dir/tests/plugins/libDexTestHello.so
plugin_argument=()
if [[ -e "$test_plugin" ]]; then
  mkdir -p "$prefix/$libdir/dexchange/plugins"
  cp "$test_plugin" "$prefix/$libdir/dexchange/plugins/"
  plugin_argument=(DexTestHello)
fi

compiler=$(sed -n 's/^CMAKE_CXX_COMPILER:[A-Z]*=//p' "$build_dir/CMakeCache.txt")
compiler=${compiler:-g++}

step "building a host with pkg-config"
read -r -a pc_flags <<<"$(PKG_CONFIG_PATH="$prefix/$libdir/pkgconfig" pkg-config --cflags --libs dexchange)"
run_logged "the pkg-config host does not build" "$scratch/pkgconfig-host.log" \
  "$compiler" "$source_dir/host.cpp" -o "$scratch/pkgconfig-host" "${pc_flags[@]}"
host_version=$(LD_LIBRARY_PATH="$prefix/$libdir" "$scratch/pkgconfig-host" "${plugin_argument[@]}") ||
  fail "the pkg-config host fails"
[[ "$host_version" == "$tool_version" ]] || fail "the pkg-config host says version '$host_version'"

step "building a host with find_package"
run_logged "the find_package host does not configure" "$scratch/cmake-host-configure.log" \
  cmake -S "$source_dir" -B "$scratch/cmake-host" -DCMAKE_PREFIX_PATH="$prefix" -DCMAKE_CXX_COMPILER="$compiler"
run_logged "the find_package host does not build" "$scratch/cmake-host-build.log" \
  cmake --build "$scratch/cmake-host"
host_version=$("$scratch/cmake-host/host" "${plugin_argument[@]}") || fail "the find_package host fails"
[[ "$host_version" == "$tool_version" ]] || fail "the find_package host says version '$host_version'"

step "moving the installation"
moved=$scratch/moved
mv "$prefix" "$moved"
"$moved/bin/dexchange" version >/dev/null || fail "bin/dexchange does not run from a moved installation"
LD_LIBRARY_PATH="$moved/$libdir" "$scratch/pkgconfig-host" "${plugin_argument[@]}" >/dev/null ||
  fail "a host does not find its plug-ins in a moved installation"
moved_cflags=$(PKG_CONFIG_PATH="$moved/$libdir/pkgconfig" pkg-config --cflags dexchange)
[[ "$moved_cflags" == *"$moved/"* ]] || fail "dexchange.pc does not follow a moved installation: $moved_cflags"

step "the package serves out-of-tree hosts (version $tool_version)"
