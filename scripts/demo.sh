#!/usr/bin/env bash
# Installs what is missing, builds gmpath, offsets the example parts and makes a program that cuts one
# of them out; the results are in out/.
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
echo "== bracket: paths of a 6 mm cutter, along the edges and 1.5 mm off them before that"
"$gmpath" offset examples/parts/bracket.dxf --distance 3 --count 2 --step 1.5 \
    -o out/bracket.svg -o out/bracket.dxf
echo
echo "== bracket: cut out 8 mm deep with that cutter, in quarter-circle arcs onto the cut and off it"
"$gmpath" toolpath examples/parts/bracket.dxf --tool 6 --stock 0.2 --count 2 --step 1.5 \
    --lead arc --depth 8 --step-down 4 --feed 900 --spindle 12000 \
    -o out/bracket.ngc -o out/bracket-toolpath.svg
echo
echo "== hourglass plate: from the rim inwards; the paths part at the neck"
"$gmpath" info examples/parts/hourglass-plate.dxf
"$gmpath" offset examples/parts/hourglass-plate.dxf --side inside \
    --distance 2 --count 6 --step 2.5 \
    -o out/hourglass-plate.svg -o out/hourglass-plate.dxf
"$gmpath" info out/hourglass-plate.dxf
echo
echo "== gasket: one sixth drawn once and inserted six times"
"$gmpath" info examples/parts/gasket.dxf
"$gmpath" offset examples/parts/gasket.dxf --distance 2 -o out/gasket.svg -o out/gasket.dxf

echo
echo "== tee: corners rounded outside; then bracket and tee, which lies on its end, as one part"
"$gmpath" corners examples/parts/tee.dxf --radius 6 --convex -o out/tee.svg -o out/tee.dxf
"$gmpath" union examples/parts/bracket.dxf out/tee.dxf \
    -o out/bracket-with-tee.svg -o out/bracket-with-tee.dxf

echo
echo "Pictures and drawings of the results:"
ls -1 "$PWD"/out/*.svg "$PWD"/out/*.dxf "$PWD"/out/*.ngc
