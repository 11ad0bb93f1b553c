#!/usr/bin/env bash
# ./check: which steps it takes, what a failure of each does to the rest, and its last line.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
unset CMAKE_CXX_COMPILER_LAUNCHER CTEST_PARALLEL_LEVEL CMAKE_BUILD_PARALLEL_LEVEL CI
copy=$scratch/copy
mkdir -p "$copy/tools" "$copy/.ci"
cp "$tree/check" "$copy/"
cp "$tree/.ci/run" "$copy/.ci/"
cp "$tree"/tools/* "$copy/tools/"

# Stand-ins for the tools that ./check calls; they record their calls. FAIL names the call that fails.
note='
call="$(basename "$0") $*"
echo "$call" >>"$SCRATCH/calls"
[ "$call" != "${FAIL:-}" ] || exit 3
'
for tool in clang-tidy gcovr; do
    stand_in "$scratch/bin" "$tool" <<<"$note"
done
for tool in check-format check-sources run-tidy; do
    stand_in "$copy/tools" "$tool" <<<"$note"
done
stand_in "$scratch/bin" nproc <<<'echo 2'
stand_in "$scratch/bin" dpkg-query <<<$'shift 3\nprintf \'installed %s\\n\' "$@"'
stand_in "$scratch/bin" apt-get <<<"$note"
stand_in "$scratch/bin" cmake <<<"[ \"\$1\" != --version ] || exec echo 'cmake version 3.25.1'
$note"
# Three cases pass. A fourth fails if the suite is to fail.
stand_in "$scratch/bin" ctest <<'END'
echo "ctest $2" >>"$SCRATCH/calls"
! read -r line || echo "ctest reads $line" >>"$SCRATCH/calls"
results=build/$2/Testing/Temporary
mkdir -p "$results"
exec >"$results/LastTest.log"
echo "1/1 Test: unit"
[ "ctest-empty $2" != "${FAIL:-}" ] || { : >"$results/LastTest.log" && exit 8; }
for name in one two three; do echo "[       OK ] A.$name (0 ms)"; done
if [ "ctest $2" = "${FAIL:-}" ]; then
    echo "[  FAILED  ] A.four (0 ms)"
    echo "1:unit" >"$results/LastTestsFailed.log"
    exit 8
fi
END

# Runs ./check with the options; sets its report, its last line and its calls.
run_check() {
    : >"$scratch/calls"
    # Results of an earlier run must not count.
    mkdir -p "$copy/build/dev/Testing/Temporary" "$copy/build/coverage"
    echo "1:unit" >"$copy/build/dev/Testing/Temporary/LastTestsFailed.log"
    report=$(SCRATCH=$scratch PATH=$scratch/bin:$PATH "$copy/${script:-check}" "$@" 2>"$scratch/errors" <<<"typed")
    status=$?
    closing=$(tail -n 1 <<<"$report")
    calls=$(cat "$scratch/calls")
}

case_named "everything in order, with nothing read from standard input"
run_check
expect_equal "$calls" "check-format 
check-sources 
cmake --preset dev
cmake --build --preset dev
ctest dev
cmake --preset asan-ubsan
cmake --build --preset asan-ubsan
ctest asan-ubsan
cmake --preset core-only
cmake --build --preset core-only --target layers"
expect_equal "$status|$closing" "0|6 passed, 0 failed"
expect_contains "$report" "[4/8] Build with g++ ..."
expect_contains "$report" "[4/8] Build with g++: ok, 0:0"
expect_contains "$report" "Tests with g++: 3 passed, 0 failed"
expect_equal "$(cat "$scratch/errors")" ""

case_named "--quick"
run_check --quick
expect_contains "$calls" "ctest dev"
expect_lacks "$calls" "asan"
expect_lacks "$calls" "core-only"
expect_equal "$status|$closing" "0|3 passed, 0 failed"

case_named "the further steps"
run_check --quick --tsan --tidy --coverage
expect_contains "$calls" "ctest tsan"
expect_contains "$calls" "run-tidy build/dev"
expect_contains "$calls" "ctest coverage"
expect_contains "$calls" "gcovr --root $copy"
expect_equal "$status|$closing" "0|9 passed, 0 failed"

case_named "a failed suite fails the run, which goes on"
FAIL="ctest dev" run_check
expect_contains "$calls" "ctest asan-ubsan"
expect_equal "$status|$closing" "1|6 passed, 1 failed"
expect_contains "$report" "FAILED  0:0"
expect_contains "$report" "Tests with g++: 3 passed, 1 failed"

case_named "so does a suite that has no tests"
FAIL="ctest-empty dev" run_check
expect_contains "$calls" "ctest asan-ubsan"
expect_equal "$status|$closing" "1|3 passed, 1 failed"

case_named "a source that breaks a rule fails the run, which goes on"
FAIL="check-sources " run_check
expect_contains "$calls" "ctest asan-ubsan"
expect_equal "$status|$closing" "1|6 passed, 1 failed"

case_named "a failed build ends the run, and what was not run is named"
FAIL="cmake --build --preset dev" run_check
expect_lacks "$calls" "ctest"
expect_lacks "$calls" "asan"
expect_equal "$status|$closing" "1|0 passed, 1 failed"
expect_contains "$report" "Build with g++: FAILED"
expect_contains "$report" "not run       Tests with g++"
expect_contains "$report" "not run       Build without Qt"

case_named "a failed configuration ends the run"
FAIL="cmake --preset asan-ubsan" run_check
expect_contains "$calls" "ctest dev"
expect_lacks "$calls" "cmake --build --preset asan-ubsan"
expect_equal "$status|$closing" "1|3 passed, 1 failed"

case_named "a report of the coverage that cannot be made is a failure"
stand_in "$scratch/bin" gcovr <<<'exit 1'
run_check --quick --coverage
expect_equal "$status|$closing" "1|6 passed, 1 failed"

case_named "continuous integration runs all of it"
script=.ci/run run_check
expect_contains "$calls" "ctest asan-ubsan"
expect_equal "$status|$closing" "0|6 passed, 0 failed"

case_named "help, and options that are none"
run_check --help
expect_equal "$status|$calls" "0|"
expect_contains "$report" "Usage: ./check"
run_check --all
expect_equal "$status|$calls|$report" "2||"
expect_contains "$(cat "$scratch/errors")" "unknown option --all"

finish
