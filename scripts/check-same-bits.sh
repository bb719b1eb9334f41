#!/usr/bin/env bash
# The regions answer with the same bits whatever compiler builds them, at whatever level: builds a
# program that hashes every bit of what all operations give, in several ways, and compares.
#   scripts/check-same-bits.sh BUILD   a build to compare with
set -euo pipefail
build=$(realpath "${1:?usage: $0 BUILD}")
cd "$(dirname "$0")/.."

# name, compiler, build type, further flags
ways=(
    "gcc-debug g++ Debug "
    "gcc-native g++ Release -march=native"
    "clang clang++ RelWithDebInfo "
)
expected=$("$build/bin/gmregion_result_hash")
echo "$expected" | tail -1
for way in "${ways[@]}"; do
    read -r name compiler type flags <<<"$way"
    folder=build/bits-$name
    cmake -S . -B "$folder" -G Ninja -DCMAKE_CXX_COMPILER="$compiler" -DCMAKE_BUILD_TYPE="$type" \
        -DCMAKE_CXX_FLAGS="$flags" -DGMKERNEL_BUILD_BENCHMARKS=OFF -DGMKERNEL_BUILD_EXAMPLES=OFF \
        >"$folder.log" 2>&1 || { cat "$folder.log"; exit 1; }
    cmake --build "$folder" --target gmregion_result_hash >"$folder.log" 2>&1 ||
        { cat "$folder.log"; exit 1; }
    diff <(echo "$expected") <("$folder/bin/gmregion_result_hash") ||
        { echo "check-same-bits: $name gives other bits" >&2; exit 1; }
    echo "check-same-bits: $name gives the same bits"
done
