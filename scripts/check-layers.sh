#!/usr/bin/env bash
# Checks that the layers include only downward: values, then curves, then contour. Two places may
# look up, both in a source file: a value answers its bounding rectangle, and the pair dispatch
# reaches contours. Public headers name a class of a higher layer by a forward declaration.
set -euo pipefail
cd "$(dirname "$0")/.."

values='GmBase|GmVec|GmPoint|GmAngle|GmDir|GmMatrix|GmRotary|export'
curves='GmCurve|GmRect|GmLine|GmBeam|GmStretch|GmCircle|GmArc|GmHelix'
contour='GmApprDepData|GmContour|GmContElement|KxArray'

# The layer of a header or source by its path: 1 values, 2 curves, 3 contour, 0 none of them.
layer_of() {
    local name=${1#include/}
    if [[ $name =~ ^values/ || $name =~ ^gmkernel/($values)\.h$ ]]; then echo 1
    elif [[ $name =~ ^curves/ || $name =~ ^gmkernel/($curves)\.h$ ]]; then echo 2
    elif [[ $name =~ ^contour/ || $name =~ ^gmkernel/($contour)\.h$ ]]; then echo 3
    else echo 0
    fi
}

allowed() { # source file, included header
    case "$1 $2" in
        values/*.cpp\ gmkernel/GmRect.h) return 0 ;;
        curves/dispatch/*.cpp\ contour/* | curves/dispatch/*.cpp\ gmkernel/GmCont*.h) return 0 ;;
        *) return 1 ;;
    esac
}

failed=0
includes=0
while IFS=: read -r file line; do
    [ "$file" != include/gmkernel/gmkernel.h ] || continue
    header=$(sed -E 's/^[^"<]*["<]([^">]*)[">].*/\1/' <<<"$line")
    case $header in
        gmkernel/*) target=$header ;;
        values/* | curves/* | contour/*) target=$header ;;
        *)  # a private header beside the source, or not of this project
            target=$(realpath -m --relative-to=. "$(dirname "$file")/$header")
            [ -e "$target" ] || continue ;;
    esac
    includes=$((includes + 1))
    from=$(layer_of "$file")
    to=$(layer_of "$target")
    if [ "$from" = 0 ] || [ "$to" = 0 ]; then
        echo "check-layers: $file includes $target: one of them belongs to no layer" >&2
        failed=1
    elif [ "$to" -gt "$from" ] && ! allowed "$file" "$target"; then
        echo "check-layers: $file includes $target, a higher layer" >&2
        failed=1
    fi
done < <(grep -rHE --include='*.h' --include='*.cpp' '^[[:space:]]*#[[:space:]]*include' \
    include values curves contour)
[ "$includes" -gt 0 ] || { echo "check-layers: found no include to check" >&2; exit 1; }
echo "check-layers: $includes includes"
exit "$failed"
