#!/usr/bin/env bash
# Builds two commits on this machine and compares every bit of what they answer: the kernel by the
# operations of tools/compare, the program by all that it writes for drawings.
#   scripts/compare-builds.sh BASE [OTHER] [--parts DIR]... [--kernel-only|--program-only]
# OTHER is HEAD unless given; --parts adds a folder of drawings to examples/parts. What is asked comes
# from the working tree, for both commits. Exit code: 0 all equal, 1 differences, 2 no comparison.
set -euo pipefail
here=$PWD
cd "$(dirname "$0")/.."

work=build/compare
shown=10

fail() {
    echo "compare-builds: $1" >&2
    exit 2
}

usage() {
    fail "usage: $0 BASE [OTHER] [--parts DIR]... [--kernel-only|--program-only]"
}

commits=()
parts=(examples/parts)
kernel=true
program=true
while [ $# -gt 0 ]; do
    case $1 in
        --parts)
            [ $# -ge 2 ] || usage
            folder=$(cd "$here" && realpath -e "$2") || fail "no folder $2"
            parts+=("$folder")
            shift ;;
        --kernel-only) program=false ;;
        --program-only) kernel=false ;;
        -*) usage ;;
        *) commits+=("$1") ;;
    esac
    shift
done
case ${#commits[@]} in 1 | 2) ;; *) usage ;; esac
$kernel || $program || usage

sha_of() {
    git rev-parse --verify --quiet "$1^{commit}" || fail "no commit $1"
}
base=$(sha_of "${commits[0]}")
other=$(sha_of "${commits[1]:-HEAD}")

# The sources of a commit; a checkout that was changed by hand is replaced.
check_out() { # sha
    local source=$work/$1/source
    if [ -e "$source/.git" ] && [ -z "$(git -C "$source" status --porcelain)" ] &&
        [ "$(git -C "$source" rev-parse HEAD)" = "$1" ]; then
        return
    fi
    rm -rf "${work:?}/$1" &&
        git worktree prune &&
        mkdir -p "$work/$1" &&
        git worktree add --quiet --detach "$source" "$1"
}

# A build that is finished already costs nothing here.
build() { # sha
    local targets=(gmkernel)
    if $program; then targets+=(gmpath); fi
    cmake -S "$work/$1/source" -B "$work/$1/build" -G Ninja -DCMAKE_BUILD_TYPE=Release \
        -DGMKERNEL_BUILD_TOOLS=ON -DGMKERNEL_BUILD_TESTS=OFF -DGMKERNEL_BUILD_EXAMPLES=OFF \
        -DGMKERNEL_BUILD_BENCHMARKS=OFF &&
        cmake --build "$work/$1/build" --target "${targets[@]}"
}

# The one file of a name in a build; folders differ from commit to commit.
find_built() { # sha, arguments of find
    local found
    found=$(find "$work/$1/build" "${@:2}" -print -quit)
    [ -n "$found" ] || fail "nothing built in $work/$1/build that matches ${*:2}"
    realpath -s "$found"
}

compile_one() { # folder of the object, source, flags
    local launcher=${CMAKE_CXX_COMPILER_LAUNCHER:-}
    ${launcher:+"$launcher"} g++ -std=c++17 -O2 -ffp-contract=off "${@:3}" \
        -c "$2" -o "$1/$(basename "$2").o"
}
export -f compile_one

# Compiles today's questions against the headers and the library of a build.
compile_net() { # sha
    local export_header library target=$work/$1/net
    export_header=$(find_built "$1" -path '*/gmkernel/export.h') || return
    library=$(find_built "$1" -name libgmkernel.so) || return
    rm -rf "$target" && mkdir -p "$target" || return
    printf '%s\0' tools/compare/*.cpp |
        xargs -0 -P "$(nproc)" -I{} bash -c 'compile_one "$@"' compile_one "$target" {} \
            -I"$work/$1/source/include" -I"$(dirname "$(dirname "$export_header")")" &&
        g++ "$target"/*.o "$library" -Wl,-rpath,"$(dirname "$library")" -o "$target/net"
}

prepare() { # sha
    local log=$work/$1.log
    echo "-- building ${1:0:10}: $(git log -1 --format=%s "$1")"
    mkdir -p "$work"
    check_out "$1" >"$log" 2>&1 || { cat "$log" >&2; fail "${1:0:10} cannot be checked out"; }
    build "$1" >>"$log" 2>&1 || { tail -n 30 "$log" >&2; fail "${1:0:10} does not build"; }
    if $kernel; then
        compile_net "$1" >>"$log" 2>&1 ||
            { tail -n 30 "$log" >&2; fail "tools/compare does not compile against ${1:0:10}"; }
    fi
}

# Blocks whose hash differs or stands on one side only: family, operations, both hashes.
differing_blocks() { # hashes, other hashes
    awk 'FNR == NR { base[$1 " " $2] = $3; next }
         { key = $1 " " $2; seen[key] = 1 }
         base[key] != $3 { print key, (key in base ? base[key] : "none"), $3 }
         END { for (key in base) if (!(key in seen)) print key, base[key], "none" }' "$1" "$2"
}

# Where the first differing block differs, and how to see more.
show_block() { # family, operations
    local range=("$1" "${2%-*}" "${2#*-}")
    echo "-- ${range[*]} differs first at"
    diff <("$work/$base/net/net" "${range[@]}" 2>&1 || true) \
        <("$work/$other/net/net" "${range[@]}" 2>&1 || true) | head -n "$shown" || true
    echo "-- to see both in full:"
    echo "   $work/$base/net/net ${range[*]}"
    echo "   $work/$other/net/net ${range[*]}"
}

compare_kernels() {
    local side sha status count=0 equal=true differing
    for side in base other; do
        sha=${!side}
        echo "-- asking the kernel of ${sha:0:10}"
        status=0
        "$work/$sha/net/net" >"$results/$side.hashes" 2>"$results/$side.tallies" || status=$?
        [ "$status" -eq 0 ] || {
            echo "compare-builds: net ends with status $status on ${sha:0:10}," \
                "after $(tail -n 1 "$results/$side.hashes")" >&2
            tail -n 3 "$results/$side.tallies" >&2
            equal=false
        }
    done
    count=$(wc -l <"$results/base.hashes")
    [ "$count" -gt 0 ] || { echo "compare-builds: no hash to compare" >&2; return 1; }
    differing=$(differing_blocks "$results/base.hashes" "$results/other.hashes")
    if [ -n "$differing" ]; then
        echo "compare-builds: $(wc -l <<<"$differing") of $count blocks differ; by family:"
        cut -d' ' -f1 <<<"$differing" | sort | uniq -c
        echo "-- the first ones:"
        head -n "$shown" <<<"$differing"
        read -r family operations _ <<<"$differing"
        show_block "$family" "$operations"
        equal=false
    fi
    $equal || return 1
    echo "compare-builds: kernel: $count blocks, all equal"
}

compare_programs() {
    local side sha gmpath differing
    for side in base other; do
        sha=${!side}
        echo "-- running the program of ${sha:0:10}"
        gmpath=$(find_built "$sha" -type f -name gmpath -perm -u+x) || exit 2
        scripts/program-outputs.sh "$gmpath" "$results/$side" "${parts[@]}" || return 1
    done
    differing=$(diff -rq "$results/base" "$results/other") || {
        echo "compare-builds: $(wc -l <<<"$differing") differences of the program; the first ones:"
        head -n "$shown" <<<"$differing"
        return 1
    }
    echo "compare-builds: program: $(find "$results/base" -type f | wc -l) files, all equal"
}

[ -z "$(git status --porcelain)" ] ||
    echo "compare-builds: changes that are not committed are not compared" >&2
prepare "$base"
prepare "$other"
results=$work/results
rm -rf "$results"
mkdir -p "$results"
different=0
if $kernel; then compare_kernels || different=1; fi
if $program; then compare_programs || different=1; fi
exit "$different"
