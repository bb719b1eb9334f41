#!/usr/bin/env bash
# Installs a build into a new folder, moves it, and builds and runs programs against it: the one in
# tests/consumer by CMake and by pkg-config, and the example of the README.
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
"$work/build/regions"
"$work/build/bridge"

echo "-- by pkg-config"
PKG_CONFIG_PATH=$(dirname "$(find "$prefix" -name gmkernel.pc)")
export PKG_CONFIG_PATH
libdir=$(pkg-config --variable=libdir gmkernel)
read -ra flags <<<"$(pkg-config --cflags --libs gmkernel)"
flags+=("-Wl,-rpath,$libdir")
g++ -std=c++20 -Wall -Wextra -Werror tests/consumer/main.cpp "${flags[@]}" -o "$work/consumer"
"$work/consumer"
read -ra region_flags <<<"$(pkg-config --cflags --libs gmregion)"
g++ -std=c++20 -Wall -Wextra -Werror tests/consumer/regions.cpp "${region_flags[@]}" \
    "-Wl,-rpath,$libdir" -o "$work/regions"
"$work/regions"
read -ra bridge_flags <<<"$(pkg-config --cflags --libs gmbridge)"
g++ -std=c++20 -Wall -Wextra -Werror tests/consumer/bridge.cpp "${bridge_flags[@]}" \
    "-Wl,-rpath,$libdir" -o "$work/bridge"
"$work/bridge"

echo "-- the example of the README"
awk '/^```cpp$/ { inside = 1; next } /^```$/ { inside = 0 } inside' README.md >"$work/readme.cpp"
g++ -std=c++17 -Wall -Wextra -Werror "$work/readme.cpp" "${flags[@]}" -o "$work/readme"
"$work/readme" | tee "$work/readme.out"
[ -s "$work/readme.out" ]

echo "-- the installed program"
"$prefix/bin/gmpath" --help >/dev/null
echo "check-consumer: ok"
