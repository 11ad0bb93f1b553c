#!/usr/bin/env bash
# tools/setup.sh installs only what is missing, and says what to do if it cannot.
source "$(dirname -- "${BASH_SOURCE[0]}")/harness.sh"
bin=$scratch/bin

# A machine made of stand-ins: Debian with the packages given, and a user with that id.
machine() {
    rm -rf "$bin" "$scratch/installed" "$scratch/calls"
    local user=$1 tool
    shift
    printf '%s\n' "$@" >"$scratch/installed"
    : >"$scratch/calls"
    mkdir "$bin"
    for tool in bash cat env grep head sed sort; do
        ln -s "$(type -P "$tool")" "$bin/$tool"
    done
    stand_in "$bin" id <<<"echo $user"
    stand_in "$bin" dpkg-query <<'END'
for package in "${@:4}"; do
    if grep -qxF -- "$package" "$SCRATCH/installed"; then
        echo "installed $package:amd64"
    else
        echo "dpkg-query: no packages found matching $package" >&2
        status=1
    fi
done
exit ${status:-0}
END
    stand_in "$bin" apt-get <<'END'
echo "apt-get $*" >>"$SCRATCH/calls"
echo "what apt-get says"
[ "$DEBIAN_FRONTEND" = noninteractive ] || exit 99
case "$*" in
*update*) exit "${UPDATE_STATUS:-0}" ;;
*install*)
    [ "${INSTALL_STATUS:-0}" = 0 ] || exit "$INSTALL_STATUS"
    while [ $# != 0 ] && [ "$1" != --no-install-recommends ]; do shift; done
    printf '%s\n' "${@:2}" >>"$SCRATCH/installed"
    ;;
esac
END
}

# Runs ensure_packages for the packages; keeps what it prints on either stream.
ensure() {
    output=$(SCRATCH=$scratch PATH=$bin "$bin/bash" -c '
        set -euo pipefail
        setup=$1
        shift
        source "$setup"
        ensure_packages "$@"
    ' bash "$tree/tools/setup.sh" "$@" 2>"$scratch/errors" </dev/null)
    status=$?
    errors=$(cat "$scratch/errors")
    calls=$(cat "$scratch/calls")
}

case_named "with everything there, apt-get is not called and nothing is said"
machine 0 g++ cmake libexpat1-dev
ensure g++ cmake libexpat1-dev
expect_equal "$status|$calls|$output|$errors" "0|||"

case_named "root: the lists are brought up to date once, and only what is missing is installed"
machine 0 cmake
ensure g++ cmake libexpat1-dev
expect_equal "$status" 0
expect_equal "$(wc -l <<<"$calls")" 2
expect_contains "$calls" " update"
expect_contains "$calls" "install -y --no-install-recommends g++ libexpat1-dev"
expect_equal "$output" ""
expect_contains "$errors" "Installing: g++ libexpat1-dev"

case_named "lists that cannot be brought up to date do not keep from installing"
machine 0 cmake
UPDATE_STATUS=100 ensure g++ cmake
expect_equal "$status" 0
expect_contains "$calls" "install -y --no-install-recommends g++"

case_named "an installation that fails is told with the packages' names"
machine 0 cmake
INSTALL_STATUS=100 ensure g++ cmake
expect_equal "$status" 1
expect_contains "$errors" "apt-get could not install them"
expect_contains "$errors" "apt-get install --no-install-recommends g++"
expect_contains "$errors" "a C++20 compiler"

case_named "somebody else: through sudo"
machine 1000 cmake
stand_in "$bin" sudo <<<'shift; exec "$@"'
ln -s "$(type -P true)" "$bin/true"
ensure g++ cmake
expect_equal "$status" 0
expect_contains "$calls" "install -y --no-install-recommends g++"

case_named "a sudo that would ask is not asked where nobody is there"
machine 1000 cmake
stand_in "$bin" sudo <<<'echo asked >>"$SCRATCH/calls"; [ "$1" != -n ]'
ensure g++ cmake
expect_equal "$status" 1
expect_equal "$calls" "asked"
expect_contains "$errors" "installing them takes root or sudo"

case_named "without root and sudo: a word on what to install"
machine 1000 cmake
ensure g++ cmake libexpat1-dev
expect_equal "$status|$calls|$output" "1||"
expect_contains "$errors" "apt-get install --no-install-recommends g++ libexpat1-dev"
expect_lacks "$errors" "CMake 3.25"

case_named "without root, but with the commands from elsewhere, it goes on"
machine 1000 cmake
stand_in "$bin" c++ <<<'exit 0'
ensure g++ cmake
expect_equal "$status|$calls" "1|"
stand_in "$bin" cmake <<<'exit 0'
ensure g++ cmake libexpat1-dev
expect_equal "$status|$calls|$errors" "0||"

case_named "another system: the packages and what they are"
machine 0
rm "$bin/dpkg-query" "$bin/apt-get"
ensure g++ cmake libexpat1-dev
expect_equal "$status" 1
expect_contains "$errors" "Orvane can install them with apt-get only"
expect_contains "$errors" "cmake              CMake 3.25 or newer"
expect_contains "$errors" "libexpat1-dev      Expat with its headers"

case_named "another system with the commands there goes on without a word"
stand_in "$bin" c++ <<<'exit 0'
stand_in "$bin" cmake <<<'exit 0'
ensure g++ cmake libexpat1-dev
expect_equal "$status|$errors" "0|"

case_named "every package that is asked for has its purpose told"
source "$tree/tools/setup.sh"
for package in "${build_packages[@]}" "${check_packages[@]}" clang-tidy gcovr; do
    [ -n "$(purpose_of "$package")" ] || fail "no purpose of $package"
done

# Whether require_cmake takes this version of CMake.
takes_cmake() {
    machine 0
    stand_in "$bin" cmake <<<"echo 'cmake version $1'"
    errors=$(PATH=$bin "$bin/bash" -c 'source "$1"; require_cmake' bash "$tree/tools/setup.sh" 2>&1)
}

case_named "a CMake that is too old is refused with its version"
takes_cmake 3.18.4 && fail "takes 3.18.4"
expect_contains "$errors" "3.25 or newer and this one is 3.18.4"
takes_cmake 3.9.6 && fail "takes 3.9.6"
for version in 3.25.1 3.25.0-rc1 3.31.6 4.0.2; do
    takes_cmake "$version" || fail "refuses $version: $errors"
done

finish
