#!/usr/bin/env bash
# Installs what is missing, builds gmpath and offsets the example parts; the drawings of the
# results are in out/.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/setup.sh
cmake --preset release
cmake --build --preset release --target gmpath
gmpath=build/release/bin/gmpath
mkdir -p out

echo
echo "== bracket: what the drawing holds"
"$gmpath" info examples/parts/bracket.dxf
echo
echo "== bracket: paths of a 6 mm cutter around the part, and a second turn 3 mm further out"
"$gmpath" offset examples/parts/bracket.dxf --distance 3 --count 2 --step 3 \
    -o out/bracket.svg -o out/bracket.dxf
echo
echo "== hourglass: clearing the pocket from its rim inwards; the paths part at the neck"
"$gmpath" offset examples/parts/hourglass-plate.dxf --side inside --distance 2 --count 7 --step 2.5 \
    -o out/hourglass-plate.svg -o out/hourglass-plate.dxf
echo
echo "== gasket: one sixth drawn once and inserted six times"
"$gmpath" offset examples/parts/gasket.dxf --distance 2 -o out/gasket.svg -o out/gasket.dxf
echo
echo "Pictures: $PWD/out/bracket.svg, hourglass-plate.svg and gasket.svg beside it"
