#!/usr/bin/env bash
# Checks that each public header compiles alone and without warnings, with both compilers and both
# standards, and that none of them reaches a header of wxWidgets.
#   scripts/check-headers.sh BUILD_DIR     the folder that holds the generated export header
set -euo pipefail
cd "$(dirname "$0")/.."
build=${1:?usage: $0 BUILD_DIR}

headers=$(cd include && find gmkernel gmregion gmbridge -name '*.h' | sort)
[ -n "$headers" ] || { echo "check-headers: no public header found" >&2; exit 1; }

failed=0
checked=0
for header in $headers; do
    for compiler in g++ clang++; do
        for standard in c++17 c++20; do
            echo "#include \"$header\"" |
                "$compiler" -std="$standard" -Wall -Wextra -Wpedantic -Werror -fsyntax-only \
                    -Iinclude -I"$build/include" -x c++ - ||
                { echo "check-headers: $header fails with $compiler -std=$standard" >&2; failed=1; }
            checked=$((checked + 1))
        done
    done
    # The folders of the toolkit are on the search path here, so that an include of it is seen
    # as such and not as a missing file.
    read -ra toolkit <<<"$(wx-config --cxxflags base)"
    reached=$(echo "#include \"$header\"" |
        g++ -std=c++17 -M -Iinclude -I"$build/include" "${toolkit[@]}" -x c++ -)
    if grep -q '/wx/' <<<"$reached"; then
        echo "check-headers: $header reaches a header of wxWidgets" >&2
        failed=1
    fi
done
echo "check-headers: $checked compilations of $(wc -w <<<"$headers") headers"
exit "$failed"
