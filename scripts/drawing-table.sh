#!/usr/bin/env bash
# Prints the table of drawing-like parts: offsets of parts in every position, rounding and start, and
# what became of them. What goes wrong stands on stderr, one line each. About four minutes.
#   scripts/drawing-table.sh            all of the table
#   scripts/drawing-table.sh --every N  every Nth drawing of it
set -euo pipefail
cd "$(dirname "$0")/.."
cmake --preset release >&2
cmake --build --preset release --target gmregion_sweep >&2
exec build/release/bin/gmregion_sweep "$@"
