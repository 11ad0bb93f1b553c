#!/usr/bin/env bash
# tools/check-format names the files that clang-format would change, and --fix changes them.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
if ! clang-format --version 2>/dev/null | grep -q 'version 14\.'; then
    echo "clang-format 14 is not installed"
    exit 77
fi
cd "$scratch" || exit 1
cp "$tree/.clang-format" .
put app/Good.cpp <<<'int good() { return 1; }'
put app/Bad.cpp <<<'int  bad( ){return 1;}'
put ui/Bad.h <<<$'#pragma once\nint   *pointer;'
put build/Bad.cpp <<<'int  bad( ){return 1;}'

case_named "files that differ are named, others not"
output=$("$tree/tools/check-format" . 2>&1) && status=0 || status=$?
expect_equal "$status" 1
expect_contains "$output" "app/Bad.cpp:1: not formatted"
expect_contains "$output" "ui/Bad.h:2: not formatted"
expect_lacks "$output" "Good"
expect_lacks "$output" "build/"
expect_equal "$(cat app/Bad.cpp)" 'int  bad( ){return 1;}'

case_named "a file that clang-format dies of is named, and the others are still looked at"
stand_in "$scratch/dying" clang-format-14 <<'END'
case "$*" in
--version) echo "clang-format version 14.0.6" ;;
*Good*) kill -SEGV $$ ;;
*) clang-format "$@" ;;
esac
END
output=$(PATH=$scratch/dying:$PATH "$tree/tools/check-format" . 2>/dev/null) && status=0 || status=$?
expect_equal "$status" 1
expect_contains "$output" "app/Good.cpp: clang-format-14 crashes on it"
expect_contains "$output" "app/Bad.cpp:1: not formatted"

case_named "--fix changes them"
"$tree/tools/check-format" --fix .
expect_equal "$(cat app/Bad.cpp)" 'int bad() { return 1; }'
output=$("$tree/tools/check-format" . 2>&1) && status=0 || status=$?
expect_equal "$status" 0
expect_equal "$output" ""

case_named "another version of clang-format decides nothing, and that is said"
put app/Bad.cpp <<<'int  bad( ){return 1;}'
stand_in "$scratch/bin" clang-format <<<'echo "clang-format version 19.1.0"'
stand_in "$scratch/bin" clang-format-14 <<<'echo "clang-format version 19.1.0"'
output=$(PATH=$scratch/bin:$PATH "$tree/tools/check-format" . 2>&1) && status=0 || status=$?
expect_equal "$status" 0
expect_contains "$output" "not checked"

finish
