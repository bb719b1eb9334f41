#!/usr/bin/env bash
# Installs the Debian packages that the project needs and the machine lacks.
#   scripts/setup.sh        what building, testing and the demo need
#   scripts/setup.sh --ci   also what the further checks of .ci/run need
set -euo pipefail

packages=(
    g++ cmake ninja-build pkg-config
    libboost-dev libwxgtk3.2-dev          # the library
    libdxflib-dev libcli11-dev libsvgpp-dev libpugixml-dev  # gmpath
    libutfcpp-dev                         # gmpath and the examples
    libgtest-dev librapidcheck-dev libgeos-dev  # tests
    libbenchmark-dev                      # benchmarks
)
case "${1:-}" in
    "") ;;
    --ci) packages+=(clang clang-format clang-tidy doxygen libclang-rt-dev libxml2-utils valgrind) ;;
    *) echo "usage: $0 [--ci]" >&2; exit 2 ;;
esac

installed=$(dpkg-query -W -f '${Package} ${db:Status-Status}\n' "${packages[@]}" 2>/dev/null || true)
missing=()
for package in "${packages[@]}"; do
    grep -qx "$package installed" <<<"$installed" || missing+=("$package")
done
if [ ${#missing[@]} -eq 0 ]; then
    echo "setup: nothing to install"
    exit 0
fi

as_root=()
can_install=true
command -v apt-get >/dev/null || can_install=false
if [ "$(id -u)" -ne 0 ]; then
    as_root=(sudo)
    command -v sudo >/dev/null || can_install=false
fi
if ! $can_install; then
    echo "setup: cannot install packages here (that takes Debian, and root or sudo)." >&2
    echo "setup: please install: ${missing[*]}" >&2
    exit 1
fi

echo "setup: installing ${missing[*]}"
"${as_root[@]}" apt-get update -q </dev/null
"${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
    apt-get install -y -q --no-install-recommends "${missing[@]}" </dev/null
