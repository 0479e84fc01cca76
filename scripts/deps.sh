#!/usr/bin/env bash
# Installs the Debian packages the build needs when they are missing; a no-op when all are present.
set -euo pipefail

packages=(cmake g++ make pkg-config libxml2-dev libxml2-utils googletest libgtest-dev libgmock-dev libbenchmark-dev
  locales gcovr
  python3)  # the tool tests read its JSON reports with Python's json module
packages+=(libmimalloc-dev)  # the allocator of the model's blocks (src/hostlibs/VynAlloc.cpp)
# The independent DXF readers and writers the DXF tests compare against (/usr/bin/python3 sees python3-ezdxf).
packages+=(python3-ezdxf gdal-bin)
if [[ "${DEXCHANGE_FUZZ:-}" == "ON" ]]; then
  packages+=(clang libclang-rt-dev)
fi

missing=()
for package in "${packages[@]}"; do
  if ! dpkg-query -W -f='${Status}' "$package" 2>/dev/null | grep -q "install ok installed"; then
    missing+=("$package")
  fi
done
[[ ${#missing[@]} -eq 0 ]] && exit 0

echo "deps: installing ${missing[*]}"
if [[ $(id -u) -ne 0 ]]; then
  if command -v sudo >/dev/null; then
    exec sudo env DEBIAN_FRONTEND=noninteractive bash -c "apt-get update -q && apt-get install -y -q ${missing[*]}"
  fi
  echo "deps: run this script as root to install: ${missing[*]}" >&2
  exit 1
fi
export DEBIAN_FRONTEND=noninteractive
apt-get update -q
apt-get install -y -q --no-install-recommends "${missing[@]}"
