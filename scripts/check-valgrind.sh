#!/usr/bin/env bash
# Runs every command of the program on the example parts under valgrind: no invalid access, no use of
# values that were never set, no leak.
#   scripts/check-valgrind.sh BUILD_DIR
set -euo pipefail
cd "$(dirname "$0")/.."
gmpath=$(realpath "${1:?usage: $0 BUILD_DIR}")/bin/gmpath
[ -x "$gmpath" ] || { echo "check-valgrind: no program in $1" >&2; exit 1; }

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
finding=99  # no exit code of the program's own

commands() {
    cat <<'TABLE'
info PART --join 0.01
offset PART --distance 2 --count 2 -o OUT.svg -o OUT.dxf
corners PART --radius 1.5 -o OUT.svg -o OUT.dxf
offset PART --distance 2 --engine kernel -o OUT.svg
melt PART examples/parts/bracket.dxf -o OUT.svg
clean PART --fit 0.05 -o OUT.dxf
toolpath PART --tool 3 --lead perpendicular -o OUT.ngc -o OUT.svg
toolpath PART --tool 3 --lead arc --depth 4 --step-down 1.5 -o OUT.ngc
offset PART --distance nan -o OUT.svg
TABLE
}

runs=0
for part in examples/parts/*.dxf; do
    while read -r line; do
        line=${line//PART/$part}
        read -ra arguments <<<"${line//OUT/$work/out}"
        status=0
        valgrind --quiet --leak-check=full --errors-for-leak-kinds=definite,indirect,possible \
            --error-exitcode="$finding" --suppressions=scripts/valgrind.supp \
            "$gmpath" "${arguments[@]}" >"$work/out.txt" 2>"$work/err.txt" </dev/null || status=$?
        if [ "$status" -gt 2 ]; then
            echo "check-valgrind: gmpath $line" >&2
            cat "$work/err.txt" >&2
            exit 1
        fi
        runs=$((runs + 1))
    done < <(commands)
done
[ "$runs" -gt 0 ] || { echo "check-valgrind: nothing was run" >&2; exit 1; }
echo "check-valgrind: $runs runs without a finding"
