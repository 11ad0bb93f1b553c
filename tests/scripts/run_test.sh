#!/usr/bin/env bash
# ./run builds what is out of date, leaves standard output to the program, and execs it.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
unset CMAKE_CXX_COMPILER_LAUNCHER
copy=$scratch/copy
program=$copy/build/release/bin/orvane

# A tree with ./run and a stand-in for CMake. Its build makes a program that prints how it was
# started.
make_copy() {
    rm -rf "$copy" "$scratch/bin" "$scratch/calls"
    put "$copy/app/main.cpp" </dev/null
    put "$copy/cmake/Layers.cmake" </dev/null
    put "$copy/CMakeLists.txt" </dev/null
    put "$copy/CMakePresets.json" </dev/null
    mkdir "$copy/tools"
    cp "$tree/run" "$copy/"
    cp "$tree/tools/setup.sh" "$copy/tools/"
    stand_in "$scratch/bin" dpkg-query <<'END'
printf 'installed %s\n' "${@:4}"
END
    stand_in "$scratch/bin" apt-get <<<'echo "apt-get" >>"$SCRATCH/calls"'
    stand_in "$scratch/bin" cmake <<'END'
if [ "$1" = --version ]; then
    echo "cmake version 3.25.1"
    exit
fi
echo "cmake $*" >>"$SCRATCH/calls"
echo "what CMake says"
if [ "$1" = --preset ]; then
    [ "${CONFIGURE_STATUS:-0}" = 0 ] || exit "$CONFIGURE_STATUS"
    mkdir -p build/release
    touch build/release/build.ninja
    exit
fi
[ "${BUILD_STATUS:-0}" = 0 ] || exit "$BUILD_STATUS"
mkdir -p "$2/bin"
touch "$2/bin/telephonyd"
chmod +x "$2/bin/telephonyd"
cat >"$2/bin/orvane" <<'PROGRAM'
#!/bin/bash
echo "pid $$ in $PWD:"
printf '<%s>\n' "$@"
read -r line && echo "read $line"
exit 7
PROGRAM
chmod +x "$2/bin/orvane"
END
}

# Starts ./run in the background with the arguments, to know its process id.
start() {
    : >"$scratch/calls"
    SCRATCH=$scratch PATH=$scratch/bin:$PATH "$copy/run" "$@" \
        >"$scratch/output" 2>"$scratch/errors" <<<"a line" &
    pid=$!
    wait "$pid"
    status=$?
    output=$(cat "$scratch/output")
    errors=$(cat "$scratch/errors")
    calls=$(cat "$scratch/calls")
}

cd "$scratch" || exit 1

case_named "the first start configures, builds and becomes the program, on the simulated phone"
make_copy
start
expect_equal "$output" "pid $pid in $scratch:"$'\n<--demo>\nread a line'
expect_equal "$status" 7
expect_contains "$calls" "cmake --preset release"
expect_contains "$calls" "cmake --build $copy/build/release --target orvane telephonyd"
expect_lacks "$calls" "apt-get"
expect_contains "$errors" "Building Orvane"
expect_contains "$errors" "what CMake says"

case_named "the second start says nothing and builds nothing; arguments reach the program"
start open "a file.dlf" --ui text
expect_equal "$output" "pid $pid in $scratch:"$'\n<open>\n<a file.dlf>\n<--ui>\n<text>\nread a line'
expect_equal "$status|$calls|$errors" "7||"

# expect_build WHAT COMMAND...: the first start after that change builds, and the second does not.
expect_build() {
    case_named "a start after $1 builds"
    # Makes the last build old, since the resolution of file times is too coarse for this test.
    find "$copy" -exec touch -d '1 hour ago' {} +
    "${@:2}"
    start
    expect_contains "$calls" "cmake --build"
    start
    expect_equal "$calls" ""
}

expect_build "a changed source" touch "$copy/app/main.cpp"
expect_build "a new source" touch "$copy/app/Other.cpp"
expect_build "a removed source" rm "$copy/app/Other.cpp"
expect_build "a changed build description" touch "$copy/cmake/Layers.cmake"
expect_build "the loss of the program" rm "$program"
expect_build "the loss of the server" rm "$copy/build/release/bin/telephonyd"

case_named "changed presets are configured anew, other changes not"
find "$copy" -exec touch -d '1 hour ago' {} +
touch "$copy/app/main.cpp"
start
expect_lacks "$calls" "--preset"
touch "$copy/CMakePresets.json"
start
expect_contains "$calls" "cmake --preset release"
expect_contains "$calls" "cmake --build"

case_named "a failed build starts nothing, and the next start tries again"
find "$copy" -exec touch -d '1 hour ago' {} +
touch "$copy/app/main.cpp"
BUILD_STATUS=3 start
expect_equal "$output" ""
expect_equal "$status" 3
start
expect_equal "$status" 7
expect_contains "$calls" "cmake --build"

case_named "a failed configuration starts nothing and says where to look"
make_copy
CONFIGURE_STATUS=1 start
expect_equal "$status|$output" "1|"
expect_contains "$errors" "Configuring failed"

case_named "it starts through a link and from any folder"
make_copy
ln -s "$copy/run" "$scratch/link"
(cd / && SCRATCH=$scratch PATH=$scratch/bin:$PATH "$scratch/link" --version) \
    >"$scratch/output" 2>/dev/null </dev/null
expect_contains "$(cat "$scratch/output")" "in /:"

finish
