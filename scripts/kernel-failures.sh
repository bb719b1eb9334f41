#!/usr/bin/env bash
# Lists the contours whose offset by the kernel does not hold, by several distances both ways, and
# compares the others with the offsets of regions:
#
#   scripts/kernel-failures.sh [DRAWING.dxf ...]
#
# Without drawings, parts as they are drawn and 20,000 random contours are taken (about a minute). A
# line for each failure, then sums. Exit code 1 where the engines differ.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
if [ ! -x "$root/build/release/bin/gm_engines" ]; then
    (cd "$root" && cmake --preset release >&2 && cmake --build --preset release --target gm_engines >&2)
fi
exec "$root/build/release/bin/gm_engines" "$@"
