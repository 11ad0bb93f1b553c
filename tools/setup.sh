# shellcheck shell=bash
# Sourced by ./run and ./check: what Orvane needs on this machine, and how it gets there. Everything
# said here goes to standard error, because standard output belongs to the program.

# What building needs, and what ./check needs on top. Add here what a CMakeLists.txt looks for.
# shellcheck disable=SC2034
build_packages=(g++ cmake ninja-build libexpat1-dev libncurses-dev qt6-base-dev qt6-tools-dev
    libqt6opengl6-dev)
# shellcheck disable=SC2034
check_packages=(clang libclang-rt-dev lld llvm clang-format libgtest-dev libgmock-dev
    libbenchmark-dev libvterm-dev python3 python3-dbusmock modemmanager dbus-daemon libglib2.0-bin)

say() { printf '%s\n' "$*" >&2; }

# Prints the command that a package is needed for. Prints nothing for a library: CMake finds those.
command_of() {
    case $1 in
    g++) echo c++ ;;
    ninja-build) echo ninja ;;
    clang) echo clang++ ;;
    lld) echo ld.lld ;;
    llvm) echo llvm-symbolizer ;;
    cmake | clang-format | clang-tidy | gcovr) echo "$1" ;;
    esac
}

# Describes a package for a user whose system has other package names.
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
    lld) echo "lld, which links faster than the compiler's own linker" ;;
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

# Sets as_root to the words that run a command as root: none, sudo without a password, or sudo that
# asks for one if there is a terminal. Returns 1 if there is no way.
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
    say "On other systems, install:"
    for package in "$@"; do
        say "$(printf '  %-18s %s' "$package" "$(purpose_of "$package")")"
    done
}

install_packages() {
    say "Installing: $*"
    local apt=("${as_root[@]}" env DEBIAN_FRONTEND=noninteractive
        apt-get -q -o DPkg::Lock::Timeout=300)
    # Continues after a failed update, because the lists on this machine may be enough.
    "${apt[@]}" update </dev/null >&2 || say "apt-get update failed; using the lists on this machine."
    "${apt[@]}" install -y --no-install-recommends "$@" </dev/null >&2
}

# Installs those of the named packages that are missing. If it cannot, but every command that they
# provide exists, continues. Otherwise says what to do and returns 1.
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
        reason="Orvane can install them with apt-get only"
    fi
    [ -n "$(missing_commands "$@")" ] || return 0
    tell_to_install "$reason" "${missing[@]}"
    return 1
}

# Returns 1 with a message if CMake is too old, as on Debian 11. CMake itself checks the other tools.
require_cmake() {
    local version oldest=3.25
    version=$(cmake --version | sed -n 's/^cmake version \([0-9.]*\).*/\1/p')
    if [ "$(printf '%s\n' "$oldest" "$version" | sort -V | head -n 1)" != "$oldest" ]; then
        say "Orvane needs CMake $oldest or newer and this one is $version."
        say "Debian 12 has it. On an older system, install a newer CMake first."
        return 1
    fi
}

# Configures a preset of the given source tree, with CMake's output on standard error.
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
        say "Configuring failed. The lines above say what is missing. These Debian packages may have other"
        say "names on this system: ${build_packages[*]}"
        return 1
    fi
}

processors() { nproc 2>/dev/null || getconf _NPROCESSORS_ONLN 2>/dev/null || echo 2; }
