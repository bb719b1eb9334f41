#!/usr/bin/env bash
# Compares the symbols that a shared library shows with its list kept in the project.
#   scripts/exported-symbols.sh LIBRARY            shows the differences and fails if there are any
#   scripts/exported-symbols.sh LIBRARY --update   writes the list anew
set -euo pipefail
library=$(realpath "${1:?usage: $0 LIBRARY [--update]}")
cd "$(dirname "$0")/.."
list=tests/abi/$(basename "${library%.so*}").txt

# Address and kind go: the kind of a symbol differs between compilers, the name does not. The
# variants of one constructor or destructor share a readable name, hence -u.
symbols=$(nm -DC --defined-only "$library" | cut -d' ' -f3- | LC_ALL=C sort -u)
[ -n "$symbols" ] || { echo "exported-symbols: $library shows none" >&2; exit 1; }

if [ "${2:-}" = --update ]; then
    echo "$symbols" >"$list"
    echo "exported-symbols: $(wc -l <"$list") names written to $list"
elif diff -u "$list" - <<<"$symbols"; then
    echo "exported-symbols: $(wc -l <"$list") names, as listed"
else
    echo "exported-symbols: the library and $list differ; after a wanted change run" >&2
    echo "    scripts/exported-symbols.sh LIBRARY --update" >&2
    exit 1
fi
