#!/usr/bin/env bash
# Checks that includes go downward only: a file includes what stands in its own room or on a lower
# floor. The kernel and the regions stand side by side and do not know each other; the bridge
# stands on the public headers of both, and drawings, machining and the program stand over them. Who
# may include the public headers of kernel and bridge is listed below; the kernel's private ones are
# its own.
#
# Two places of the kernel may look up, both in a source file: a value answers its bounding
# rectangle, and the pair dispatch reaches contours. Public headers name a class of a higher floor
# by a forward declaration.
set -euo pipefail
cd "$(dirname "$0")/.."

values='GmBase|GmVec|GmPoint|GmAngle|GmDir|GmMatrix|GmRotary|export'
curves='GmCurve|GmRect|GmLine|GmBeam|GmStretch|GmCircle|GmArc|GmHelix'
contour='GmApprDepData|GmContour|GmContElement|KxArray'

# The floor of every room, by the longest path that fits.
declare -A floors=(
    [kernel/values]=1 [kernel/curves]=2 [kernel/contour]=3
    [region/public]=0 [region/model]=1 [region/plane]=2 [region/search]=2 [region/nodes]=3
    [region/link]=4 [region/overlay]=5 [region/offset]=6 [region/operations]=7
    [region/locate]=5 [region/simplify]=5 [region/verify]=6
    [bridge/public]=1 [bridge]=2
    [part/model]=8 [part/kernel]=9 [part/regions]=9 [part/offset]=10 [part/boolean]=10
    [part/corners]=10 [part/clean]=10
    [drawing]=11 [drawing/contours]=12 [drawing/curves]=12 [drawing/dxf]=13 [drawing/svg]=13 [drawing/svg/reading]=13 [drawing/files]=14
    [machining/moves]=15 [machining/runs]=15 [machining/obstacles]=15 [machining/order]=16
    [machining/gcode]=16 [machining/leads]=16 [machining]=17 [machining/picture]=18
    [apps/gmpath]=19
)
# Besides the kernel itself these rooms may include its public headers, and those of the bridge.
kernel_users='^(bridge|bridge/public|part/kernel|machining/leads)$'

# The room of a header or source by its path, empty when it is in none.
room_of() {
    local name=${1#include/}
    if [[ $name =~ ^gmkernel/($values)\.h$ ]]; then echo kernel/values; return; fi
    if [[ $name =~ ^gmkernel/($curves)\.h$ ]]; then echo kernel/curves; return; fi
    if [[ $name =~ ^gmkernel/($contour)\.h$ ]]; then echo kernel/contour; return; fi
    if [[ $name == gmregion/* ]]; then echo region/public; return; fi
    if [[ $name == gmbridge/* ]]; then echo bridge/public; return; fi
    while [[ $name == */* ]]; do
        name=${name%/*}
        if [ -n "${floors[$name]:-}" ]; then echo "$name"; return; fi
    done
}

looks_up_by_design() { # source file, included header
    case "$1 $2" in
        kernel/values/*.cpp\ gmkernel/GmRect.h) return 0 ;;
        kernel/curves/dispatch/*.cpp\ kernel/contour/*) return 0 ;;
        kernel/curves/dispatch/*.cpp\ gmkernel/GmCont*.h) return 0 ;;
        *) return 1 ;;
    esac
}

may_include() { # source file, its room, included header, its room
    local to_kernel=false
    [[ $4 != kernel/* || $2 == kernel/* ]] || to_kernel=true
    if $to_kernel; then
        [[ $2 =~ $kernel_users && $3 == gmkernel/* ]]
        return
    fi
    if [[ $2 == bridge* && $4 == region/* && $4 != region/public ]]; then return 1; fi
    if [[ $4 == bridge/public && ! $2 =~ $kernel_users ]]; then return 1; fi
    [ "$2" = "$4" ] || [ "${floors[$4]}" -lt "${floors[$2]}" ] || looks_up_by_design "$1" "$3"
}

# Libraries that only some places may know.
check_foreign() { # source file, included header
    local places
    case $2 in
        wx/*) places='^kernel/values/(PointerList\.h|TraceText\.cpp)$' ;;
        dxflib/*) places='^drawing/(dxf|files)/' ;;
        pugixml.hpp) places='^drawing/(svg/reading|files)/' ;;
        svgpp/*) places='^drawing/svg/reading/' ;;
        CLI/*) places='^apps/' ;;
        *) return 0 ;;
    esac
    [[ $1 =~ $places ]] && return 0
    echo "check-layers: $1 includes $2, which is kept elsewhere" >&2
    failed=1
}

failed=0
includes=0
declare -A seen=()
while IFS=: read -r file line; do
    [ "$file" != include/gmkernel/gmkernel.h ] || continue
    header=$(sed -E 's/^[^"<]*["<]([^">]*)[">].*/\1/' <<<"$line")
    if [[ $line == *\<* ]]; then
        check_foreign "$file" "$header"
        continue
    fi
    if [[ ! $header =~ ^gm(kernel|region|bridge)/ && ! -e $header ]]; then
        echo "check-layers: $file includes $header, which is no path from the top" >&2
        failed=1
        continue
    fi
    includes=$((includes + 1))
    from=$(room_of "$file")
    to=$(room_of "$header")
    if [ -z "$from" ] || [ -z "$to" ]; then
        echo "check-layers: $file includes $header: one of them stands in no room" >&2
        failed=1
        continue
    fi
    seen[$from]=1
    if [[ $from == kernel/* && $to != kernel/* ]] || ! may_include "$file" "$from" "$header" "$to"; then
        echo "check-layers: $file includes $header, which is not below it" >&2
        failed=1
    fi
done < <(grep -rHE --include='*.h' --include='*.cpp' '^[[:space:]]*#[[:space:]]*include' \
    include kernel region bridge part drawing machining apps)
for room in "${!floors[@]}"; do
    [ -n "${seen[$room]:-}" ] || { echo "check-layers: found no include in $room" >&2; failed=1; }
done
echo "check-layers: $includes includes in ${#seen[@]} rooms"
exit "$failed"
