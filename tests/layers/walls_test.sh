#!/usr/bin/env bash
# Whether the compiler, given the include directories of one layer, finds each header that the layer
# may see and no header that it must not see.
#   walls_test.sh COMPILER FILE_OF_INCLUDE_DIRECTORIES ALLOWED_HEADER... -- FORBIDDEN_HEADER...
set -uo pipefail
compiler=$1
mapfile -t directories <"$2"
shift 2

# Preprocesses a file that includes the header. Says what the compiler says.
include() {
    printf '#include "%s"\n' "$1" |
        LC_ALL=C "$compiler" -std=c++20 -E -x c++ "${directories[@]/#/-I}" - 2>&1 >/dev/null
}

failed=0
fail() {
    printf '%s\n' "$1"
    failed=1
}

allowed=0
while [ $# != 0 ] && [ "$1" != -- ]; do
    complaint=$(include "$1") || fail "$1 is not found: $complaint"
    allowed=$((allowed + 1))
    shift
done
shift

forbidden=0
for header in "$@"; do
    if complaint=$(include "$header"); then
        fail "$header can be included, but the table of layers does not allow it"
    # Any other complaint would hide a wall that is open.
    elif [[ $complaint != *"$header"*"file not found"* && $complaint != *"$header: No such file"* ]]; then
        fail "$header was refused for another reason: $complaint"
    fi
    forbidden=$((forbidden + 1))
done
echo "$allowed headers allowed, $forbidden forbidden"
[ "$allowed" != 0 ] || fail "no header was tried"
exit "$failed"
