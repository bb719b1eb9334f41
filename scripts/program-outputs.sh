#!/usr/bin/env bash
# Runs gmpath in many ways over the drawings (*.dxf) of folders and keeps everything that it wrote:
# files, output, error stream and exit code, one folder a command. Two builds that did the same leave
# the same tree: paths in messages are relative, and equal.
#   scripts/program-outputs.sh GMPATH OUT_DIR PART_DIR...     OUT_DIR is made anew
set -euo pipefail

usage="usage: $0 GMPATH OUT_DIR PART_DIR..."
[ $# -ge 3 ] || { echo "$usage" >&2; exit 2; }
gmpath=$(realpath "$1")
out=$2
shift 2
[ -x "$gmpath" ] || { echo "program-outputs: $gmpath is no program" >&2; exit 2; }

# The commands: a name, then the arguments. PART is the drawing, NEXT the one after it in its folder.
commands() {
    cat <<'TABLE'
info                  info PART
info-joined           info PART --join 0.05
info-scaled           info PART --scale 25.4
info-strict           info PART --strict
offset-waste          offset PART --distance 1 -o a.svg -o a.dxf
offset-fine           offset PART --distance 0.05 -o a.svg -o a.dxf
offset-wide           offset PART --distance 12.5 -o a.svg -o a.dxf
offset-right          offset PART --distance 2 --side right -o a.dxf
offset-left           offset PART --distance 2 --side left -o a.dxf
offset-inside         offset PART --distance 3 --side inside -o a.svg -o a.dxf
offset-outside        offset PART --distance 3 --side outside -o a.svg -o a.dxf
offset-both           offset PART --distance 0.7 --side both -o a.svg -o a.dxf
offset-passes         offset PART --distance 1.5 --count 5 --step 1.25 -o a.svg -o a.dxf
offset-inside-passes  offset PART --distance 1 --count 8 --side inside -o a.svg -o a.dxf
offset-scaled         offset PART --distance 2 --scale 0.1 --join 0.01 -o a.dxf
offset-inches         offset PART --distance 40 --scale 25.4 -o a.dxf
corners-round         corners PART --radius 2 -o a.svg -o a.dxf
corners-convex        corners PART --radius 5 --convex -o a.svg -o a.dxf
corners-concave       corners PART --radius 1 --concave -o a.dxf
corners-bent          corners PART --radius 0.5 --bend 0.5 -o a.dxf
corners-chamfer       corners PART --chamfer 1.5 -o a.svg -o a.dxf
corners-length        corners PART --chamfer-length 1 --convex -o a.dxf
offset-material       offset PART --distance 1 --side material -o a.svg -o a.dxf
offset-each           offset PART --distance 4 --each -o a.dxf
offset-miter          offset PART --distance 2 --join-style miter -o a.dxf
offset-kernel         offset PART --distance 2 --engine kernel -o a.svg -o a.dxf
clean                 clean PART --fit 0.01 -o a.svg -o a.dxf
union-next            union PART NEXT -o a.svg -o a.dxf
subtract-next         subtract PART NEXT -o a.dxf
melt-next             melt PART NEXT -o a.svg -o a.dxf
melt-scaled           melt PART NEXT --scale 1.37 -o a.svg -o a.dxf
melt-itself           melt PART PART -o a.dxf
toolpath              toolpath PART --tool 6 -o a.ngc -o a.svg
toolpath-thin         toolpath PART --tool 1 --conventional -o a.ngc -o a.svg
toolpath-thick        toolpath PART --tool 20 -o a.ngc -o a.svg
toolpath-line         toolpath PART --tool 3 --lead line -o a.ngc -o a.svg
toolpath-long-lead    toolpath PART --tool 3 --lead line --lead-length 9 -o a.ngc -o a.svg
toolpath-across       toolpath PART --tool 4 --lead perpendicular --lead-length 2 -o a.ngc -o a.svg
toolpath-arc          toolpath PART --tool 4 --lead arc -o a.ngc -o a.svg
toolpath-half-arc     toolpath PART --tool 2 --lead arc --lead-radius 5 --lead-angle 180 -o a.ngc
toolpath-stock        toolpath PART --tool 5 --stock 0.3 --count 3 --step 2 --lead arc -o a.ngc -o a.svg
toolpath-levels       toolpath PART --tool 6 --depth 10 --step-down 3 --safe-z 12 -o a.ngc
toolpath-speeds       toolpath PART --tool 6 --feed 900 --plunge 200 --spindle 12000 -o a.ngc
toolpath-inches       toolpath PART --tool 0.25 --units inch --lead arc -o a.ngc -o a.svg
refused               offset PART --distance -1 --count 0 -o a.txt
TABLE
}

seconds=60
parallel=2

# Runs one command in a folder of its own, beside the links to the drawings.
run_command() { # gmpath, folder of the part, line of the table
    local name words
    read -ra words <<<"$3"
    name=${words[0]}
    words=("${words[@]:1}")
    words=("${words[@]/#PART/../part.dxf}")
    words=("${words[@]/#NEXT/../next.dxf}")
    mkdir -p "$2/$name"
    cd "$2/$name"
    local status=0
    LC_ALL=C timeout "$SECONDS_EACH" "$1" "${words[@]}" >stdout 2>stderr </dev/null || status=$?
    echo "$status" >exit-code
}
export -f run_command
export SECONDS_EACH=$seconds

rm -rf "$out"
mkdir -p "$out"
out=$(realpath "$out")
jobs=()
folder_number=0
for folder in "$@"; do
    folder_number=$((folder_number + 1))
    mapfile -t parts < <(find -L "$folder" -maxdepth 1 -name '*.dxf' | LC_ALL=C sort)
    for i in "${!parts[@]}"; do
        place=$out/$folder_number/$(basename "${parts[i]}" .dxf)
        mkdir -p "$place"
        ln -s "$(realpath "${parts[i]}")" "$place/part.dxf"
        ln -s "$(realpath "${parts[(i + 1) % ${#parts[@]}]}")" "$place/next.dxf"
        while read -r line; do
            jobs+=("$gmpath" "$place" "$line")
        done < <(commands)
    done
done
[ ${#jobs[@]} -gt 0 ] || { echo "program-outputs: no drawing in $*" >&2; exit 1; }

printf '%s\0' "${jobs[@]}" |
    xargs -0 -n 3 -P "$parallel" bash -c 'run_command "$@"' run_command
find "$out" -type l -delete

runs=$(find "$out" -name exit-code | wc -l)
[ $((runs * 3)) -eq ${#jobs[@]} ] || { echo "program-outputs: runs are missing" >&2; exit 1; }
files=$(find "$out" \( -name 'a.*' \) | wc -l)
[ "$files" -gt 0 ] || { echo "program-outputs: no command wrote a file" >&2; exit 1; }
codes=$(find "$out" -name exit-code -exec cat {} + | sort -n | uniq -c |
    awk '{ printf "%s%s times %s", (NR > 1 ? ", " : ""), $1, $2 }')
echo "program-outputs: $runs runs, $files files; exit codes: $codes"
