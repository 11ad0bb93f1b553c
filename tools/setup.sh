# shellcheck shell=bash
# Sourced by ./run and ./check: what Orvane needs on this machine, and how it gets there. Everything
# said here goes to standard error, because standard output belongs to the program.

# What building needs, and what ./check needs on top. Add here what a CMakeLists.txt looks for.
# shellcheck disable=SC2034
build_packages=(g++ cmake ninja-build libexpat1-dev libncurses-dev qt6-base-dev qt6-tools-dev
    libqt6opengl6-dev)
# shellcheck disable=SC2034
check_packages=(clang libclang-rt-dev llvm clang-format libgtest-dev libgmock-dev libbenchmark-dev
    libvterm-dev python3 python3-dbusmock modemmanager dbus-daemon libglib2.0-bin)

say() { printf '%s\n' "$*" >&2; }

# The command that a package is wanted for, or nothing for a library: CMake looks for those.
command_of() {
    case $1 in
    g++) echo c++ ;;
    ninja-build) echo ninja ;;
    clang) echo clang++ ;;
    llvm) echo llvm-symbolizer ;;
    cmake | clang-format | clang-tidy | gcovr) echo "$1" ;;
    esac
}

# What a package is, for a person on a system that names its packages otherwise.
purpose_of() {
    case $1 in
    g++) echo "a C++20 compiler: g++ 12 or newer" ;;
    cmake) echo "CMake 3.25 or newer" ;;
    ninja-build) echo "Ninja" ;;
    libexpat1-dev) echo "Expat with its headers" ;;
    libncurses-dev) echo "ncurses with its headers, wide characters included" ;;
    qt6-base-dev) echo "Qt 6.4 or newer with its headers" ;;
    qt6-tools-dev) echo "Qt UI Tools, which read interface files" ;;
    libqt6opengl6-dev) echo "Qt OpenGL's CMake package, which that of Qt UI Tools asks for" ;;
    clang) echo "clang 14 or newer" ;;
    libclang-rt-dev) echo "clang's sanitizers and libFuzzer" ;;
    llvm) echo "llvm-symbolizer, for readable sanitizer reports" ;;
    clang-format) echo "clang-format 14 (other versions format differently)" ;;
    clang-tidy) echo "clang-tidy 14" ;;
    libgtest-dev) echo "GoogleTest with its CMake package" ;;
    libgmock-dev) echo "GoogleMock with its CMake package" ;;
    libbenchmark-dev) echo "Google Benchmark with its CMake package" ;;
    libvterm-dev) echo "libvterm with its headers, a terminal for tests" ;;
    python3) echo "Python 3, which plays modems in tests" ;;
    python3-dbusmock) echo "python-dbusmock, which stands in for services on a bus in tests" ;;
    modemmanager) echo "ModemManager, for tests on a bus of their own" ;;
    dbus-daemon) echo "dbus-daemon, for tests on a bus of their own" ;;
    libglib2.0-bin) echo "gdbus, with which tests call services" ;;
    gcovr) echo "gcovr" ;;
    esac
}

# Prints those of the named Debian packages that are not installed.
missing_packages() {
    local installed package
    installed=$(dpkg-query -W -f '${db:Status-Status} ${binary:Package}\n' "$@" 2>/dev/null |
        sed -n 's/^installed \([^:]*\).*/\1/p') || true
    for package in "$@"; do
        grep -qxF -- "$package" <<<"$installed" || echo "$package"
    done
}

# Prints those of the named packages whose command is not on the PATH.
missing_commands() {
    local package command
    for package in "$@"; do
        command=$(command_of "$package")
        [ -z "$command" ] || command -v "$command" >/dev/null || echo "$package"
    done
}

# Sets as_root to what runs a command as root: nothing, a sudo that asks nothing, or one that asks
# where somebody is there to answer. Status 1 when there is no way.
find_root() {
    if [ "$(id -u)" = 0 ]; then
        as_root=()
    elif command -v sudo >/dev/null && sudo -n true 2>/dev/null; then
        as_root=(sudo -n)
    elif command -v sudo >/dev/null && [ -t 2 ] && [ "${CI:-}" != true ]; then
        as_root=(sudo)
    else
        return 1
    fi
}

tell_to_install() {
    local reason=$1 package
    shift
    say "Orvane needs packages that are not on this machine, and $reason."
    say "On Debian 12 or newer, as root:"
    say "  apt-get install --no-install-recommends $*"
    say "On other systems install what these are:"
    for package in "$@"; do
        say "$(printf '  %-18s %s' "$package" "$(purpose_of "$package")")"
    done
}

install_packages() {
    say "Installing: $*"
    local apt=("${as_root[@]}" env DEBIAN_FRONTEND=noninteractive
        apt-get -q -o DPkg::Lock::Timeout=300)
    # A failed update is no reason to stop: the lists that are here may do.
    "${apt[@]}" update </dev/null >&2 || say "apt-get update failed; going on with the lists here."
    "${apt[@]}" install -y --no-install-recommends "$@" </dev/null >&2
}

# Sees to it that the named packages are there, and installs those that are not. Where that is
# impossible but every command is there by other means, goes on. Status 1 after a word on what to do.
ensure_packages() {
    local missing as_root reason
    if command -v dpkg-query >/dev/null && command -v apt-get >/dev/null; then
        mapfile -t missing < <(missing_packages "$@")
        [ "${#missing[@]}" != 0 ] || return 0
        reason="installing them takes root or sudo"
        if find_root; then
            ! install_packages "${missing[@]}" || return 0
            reason="apt-get could not install them (see above)"
        fi
    else
        missing=("$@")
        reason="only Debian's apt-get is known here for installing them"
    fi
    [ -n "$(missing_commands "$@")" ] || return 0
    tell_to_install "$reason" "${missing[@]}"
    return 1
}

# Says so when CMake is too old, as it is on Debian 11. Other tools are left to CMake's own checks.
require_cmake() {
    local version oldest=3.25
    version=$(cmake --version | sed -n 's/^cmake version \([0-9.]*\).*/\1/p')
    if [ "$(printf '%s\n' "$oldest" "$version" | sort -V | head -n 1)" != "$oldest" ]; then
        say "Orvane needs CMake $oldest or newer and this one is $version."
        say "Debian 12 has it; on an older system upgrade it first."
        return 1
    fi
}

# Configures a preset of the source tree given first, with CMake's output on standard error.
configure_preset() {
    local root=$1 preset=$2
    shift 2
    require_cmake || return 1
    if command -v ccache >/dev/null; then
        export CMAKE_CXX_COMPILER_LAUNCHER=ccache
        # Without this it leaves out whatever is compiled with precompiled headers.
        export CCACHE_SLOPPINESS=${CCACHE_SLOPPINESS:-pch_defines,time_macros}
    fi
    if ! (cd "$root" && cmake --preset "$preset" "$@") </dev/null >&2; then
        say "Configuring failed: the lines above say what is missing. A library whose Debian package is"
        say "one of ${build_packages[*]} may have another name here."
        return 1
    fi
}

processors() { nproc 2>/dev/null || getconf _NPROCESSORS_ONLN 2>/dev/null || echo 2; }
