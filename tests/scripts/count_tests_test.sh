#!/usr/bin/env bash
# tools/count-tests counts cases where ctest counts programs.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
results=$scratch/build/Testing/Temporary

# Begins a log like that of ctest.
begin_log() {
    rm -rf "$scratch/build"
    mkdir -p "$results"
    echo "Start testing: Nov 21 10:00 UTC" >"$results/LastTest.log"
}

# add_test NAME: adds a test to the log with standard input as its output.
add_test() {
    {
        printf '1/9 Testing: %s\n1/9 Test: %s\nCommand: "/x"\nOutput:\n-----\n' "$1" "$1"
        cat
        # ctest writes this also if the program could not be started.
        printf '<end of output>\nTest time = 0.00 sec\n-----\nTest Passed.\n\n'
    } >>"$results/LastTest.log"
}

expect_counts() { expect_equal "$("$tree/tools/count-tests" "$scratch/build")" "$1"; }

case_named "the cases of a GoogleTest program count each"
begin_log
add_test unit <<'END'
[ RUN      ] A.one
printed without a newline[       OK ] A.one (0 ms)
[       OK ] A/B.two/1 (12 ms)
[  SKIPPED ] A.three (0 ms)
[  FAILED  ] A.four, where GetParam() = 5 (0 ms)
[  PASSED  ] 2 tests.
[  SKIPPED ] 1 test, listed below:
[  SKIPPED ] A.three
[  FAILED  ] 1 test, listed below:
[  FAILED  ] A.four
END
echo "1:unit" >"$results/LastTestsFailed.log"
expect_counts "2 1 1"

case_named "any other program counts as one"
begin_log
add_test script </dev/null
add_test wrong </dev/null
add_test left_out </dev/null
echo "2:wrong" >"$results/LastTestsFailed.log"
echo "3:left_out" >"$results/LastTestsDisabled.log"
expect_counts "1 1 1"

case_named "a program that crashes after its last good case is a failure"
begin_log
add_test unit <<<'[       OK ] A.one (0 ms)'
add_test next <<<'[       OK ] B.one (0 ms)'
echo "1:unit" >"$results/LastTestsFailed.log"
expect_counts "2 1 0"

case_named "a run without tests"
begin_log
expect_counts "0 0 0"

finish
