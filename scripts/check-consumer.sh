#!/usr/bin/env bash
# Installs a build into a new folder, moves it, and builds and runs the small program in
# tests/consumer against it: by CMake, and by pkg-config.
#   scripts/check-consumer.sh BUILD_DIR
set -euo pipefail
cd "$(dirname "$0")/.."
build=${1:?usage: $0 BUILD_DIR}

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
cmake --install "$build" --prefix "$work/first" >/dev/null
mv "$work/first" "$work/installed"
prefix=$work/installed

echo "-- by CMake"
cmake -S tests/consumer -B "$work/build" -G Ninja -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build "$work/build"
"$work/build/consumer"

echo "-- by pkg-config"
PKG_CONFIG_PATH=$(dirname "$(find "$prefix" -name gmkernel.pc)")
export PKG_CONFIG_PATH
libdir=$(pkg-config --variable=libdir gmkernel)
read -ra flags <<<"$(pkg-config --cflags --libs gmkernel)"
g++ -std=c++20 -Wall -Wextra -Werror tests/consumer/main.cpp "${flags[@]}" \
    -Wl,-rpath,"$libdir" -o "$work/consumer"
"$work/consumer"

echo "-- the installed program"
"$prefix/bin/gmpath" --help >/dev/null
echo "check-consumer: ok"
