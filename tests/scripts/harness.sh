# shellcheck shell=bash
# Sourced by the tests of the project's scripts: a scratch folder, stand-ins for commands, and what
# to expect. A test ends with finish.
set -uo pipefail
# shellcheck disable=SC2034
tree=$(cd -- "$(dirname -- "${BASH_SOURCE[0]}")/../.." && pwd)
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
cases=0 failures=0

# case_named NAME: starts a case; the expectations after it belong to it.
case_named() {
    current=$1
    cases=$((cases + 1))
}

fail() {
    echo "FAILED: $current: $1"
    failures=$((failures + 1))
}

expect_equal() {
    [ "$1" = "$2" ] || fail "$(printf 'got\n%s\nand not\n%s' "$1" "$2")"
}

expect_contains() {
    [[ $1 == *"$2"* ]] || fail "$(printf 'got\n%s\nwithout\n%s' "$1" "$2")"
}

expect_lacks() {
    [[ $1 != *"$2"* ]] || fail "$(printf 'got\n%s\nwith\n%s' "$1" "$2")"
}

# Writes standard input to a file, with its folders.
put() {
    mkdir -p "$(dirname -- "$1")"
    cat >"$1"
}

# stand_in FOLDER NAME: makes a command in the folder: a bash script whose body is standard input.
stand_in() {
    { echo '#!/bin/bash' && cat; } | put "$1/$2"
    chmod +x "$1/$2"
}

finish() {
    echo "$((cases)) cases, $failures failed expectations"
    [ "$failures" = 0 ] && [ "$cases" != 0 ]
    exit
}
