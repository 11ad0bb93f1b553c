#!/usr/bin/env bash
# tools/repeat-tests counts the failures of each test case over many runs.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
bin=$scratch/build/bin

# repeat OPTION...: runs the tool on the scratch build, into $output, $errors and $status.
repeat() {
    status=0
    output=$("$tree/tools/repeat-tests" --build "$scratch/build" --busy 0 "$@" \
        2>"$scratch/errors") || status=$?
    errors=$(cat "$scratch/errors")
}

# A test program that fails in every second run, crashes in every third and sees its filter.
stand_in "$bin" test_unit <<'END_OF_PROGRAM'
run=$(($(cat "$0.runs" 2>/dev/null || echo 0) + 1))
echo "$run" >"$0.runs"
echo "$GTEST_FILTER" >"$0.filter"
echo "[ RUN      ] A.good"
echo "[       OK ] A.good (1 ms)"
echo "[ RUN      ] A.second"
if [ $((run % 2)) = 0 ]; then
    echo "A.cpp:1: Failure"
    echo "[  FAILED  ] A.second, where GetParam() = 2 (1 ms)"
    bad=1
else
    echo "[       OK ] A.second (1 ms)"
fi
echo "[ RUN      ] A.third"
[ $((run % 3)) != 0 ] || kill -SEGV $$
echo "[       OK ] A.third (1 ms)"
[ -z "${bad:-}" ] || echo "[  FAILED  ] A.second, where GetParam() = 2"
exit "${bad:-0}"
END_OF_PROGRAM

case_named "failures are counted by case"
repeat --runs 6 --filter 'A.*' unit
expect_equal "$status" 1
expect_contains "$output" "unit: 6 runs, 4 failed"
expect_contains "$output" "3 A.second"
expect_contains "$output" "2 A.third (did not end)"
expect_lacks "$output" "A.good"
expect_contains "$errors" "run 2 failed: A.second"
expect_equal "$(cat "$bin/test_unit.filter")" 'A.*'

case_named "the output of failed runs is kept, and that of others not"
expect_equal "$(ls "$scratch/build/repeat-tests/unit")" "$(printf '%s.log\n' 2 3 4 6)"
expect_contains "$(cat "$scratch/build/repeat-tests/unit/2.log")" "A.cpp:1: Failure"

case_named "runs that all succeed are status 0"
stand_in "$bin" test_good </dev/null
repeat --runs 3 good
expect_equal "$status" 0
expect_contains "$output" "good: 3 runs, 0 failed"

case_named "a program that is no test program is named by its path"
stand_in "$scratch" bad <<<'exit 3'
repeat --runs 2 "$scratch/bad"
expect_equal "$status" 1
expect_contains "$output" "2 $scratch/bad"

case_named "a run that hangs is ended and counts"
stand_in "$bin" test_hanging <<'END_OF_PROGRAM'
echo "[ RUN      ] A.hangs"
exec sleep 1000
END_OF_PROGRAM
repeat --runs 1 --seconds 1 hanging
expect_equal "$status" 1
expect_contains "$output" "1 A.hangs (did not end)"

case_named "unusable arguments are status 2"
for arguments in "" "--runs" "--runs many unit" "--nonsense" "absent"; do
    # shellcheck disable=SC2086 # several arguments
    repeat $arguments
    expect_equal "$status" 2
    expect_contains "$errors" "tools/repeat-tests: "
done

finish
