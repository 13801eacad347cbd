# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# shellcheck shell=bash
# What ./run and ./test share: installing what is missing, configuring, building. Sourced, not run.

. Scripts/progress.sh

# shellcheck disable=SC2034 # the scripts that source this file use them
build_packages=(build-essential cmake ninja-build qt6-base-dev libgl-dev libpugixml-dev libcli11-dev
    libboost-dev libgps-dev libsqlite3-dev libthrift-dev libtomlplusplus-dev libutf8proc-dev libxxhash-dev libzstd-dev nettle-dev zlib1g-dev)
# shellcheck disable=SC2034
test_packages=(libgtest-dev libgmock-dev librapidcheck-dev libbenchmark-dev nlohmann-json3-dev python3 tshark gpsd gpsd-clients
    gdal-bin libxml2-utils clang-format-14 jq python3-construct
    fonts-dejavu-core xvfb dbus at-spi2-core gir1.2-atspi-2.0 python3-gi desktop-file-utils appstream
    modemmanager shellcheck reuse git lintian fakeroot file systemd python3-jsonschema mandoc bash-completion tmux
    mypy python3-pandas python3-dask python3-distributed procps chromium chromium-driver firefox-esr weston qt6-wayland)
# shellcheck disable=SC2034
fuzz_packages=(clang libclang-rt-14-dev)
# shellcheck disable=SC2034
valgrind_packages=(valgrind)
# shellcheck disable=SC2034
arm64_packages=(g++-aarch64-linux-gnu qemu-user)
# shellcheck disable=SC2034
cppcheck_packages=(cppcheck git)
# shellcheck disable=SC2034
lint_packages=(clang-tidy)

under=() # see run_programs

say() { printf '%s\n' "$*" >&2; }

# install_missing PACKAGE...: installs the Debian packages that are not there yet.
install_missing() {
    local package missing=() as_root=()
    if ! command -v dpkg-query >/dev/null; then
        say "This is no Debian system, so nothing can be installed here. What is needed, by Debian's names:"
        say "  $*"
        return 0
    fi
    for package in "$@"; do
        [ "$(dpkg-query -W -f '${db:Status-Status}' "$package" 2>/dev/null)" = installed ] || missing+=("$package")
    done
    [ ${#missing[@]} -eq 0 ] && return 0
    if [ "$(id -u)" -ne 0 ]; then
        if ! command -v sudo >/dev/null; then
            say "Missing packages: ${missing[*]}"
            say "Installing them takes root, and there is no sudo. As root, run:"
            say "  apt-get install --no-install-recommends ${missing[*]}"
            return 1
        fi
        as_root=(sudo)
    fi
    say "Installing ${#missing[@]} packages: ${missing[*]}"
    mkdir -p build
    run_apt update && run_apt install -y --no-install-recommends "${missing[@]}" && return 0
    say "Installing failed. As root, run:"
    say "  apt-get install --no-install-recommends ${missing[*]}"
    return 1
}

# run_apt ARGUMENT...: apt-get, with its progress shown; its messages are printed only if it fails.
run_apt() {
    "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -q -o APT::Status-Fd=1 -o Dpkg::Use-Pty=0 "$@" \
        </dev/null 2>&1 | show_progress build/apt.log parse_apt_line || {
        grep -vE '^(dl|pm)status:' build/apt.log >&2
        return 1
    }
}

# install_column_readers: the programs that the tests read columns with, from npm, into build/column-readers. Without them
# that test is skipped, and says so.
install_column_readers() {
    local directory=build/column-readers
    if ! command -v npm >/dev/null; then
        say "There is no npm: the test that reads columns with programs of others is skipped"
        return 0
    fi
    mkdir -p "$directory"
    cmp -s Tests/Columns/Readers/package-lock.json "$directory/installed" && return 0
    cp Tests/Columns/Readers/package.json Tests/Columns/Readers/package-lock.json "$directory"
    say "Installing the programs that columns are read with"
    if npm install --prefix "$directory" --ignore-scripts --no-audit --no-fund >"$directory/npm.log" 2>&1 </dev/null; then
        cp Tests/Columns/Readers/package-lock.json "$directory/installed"
    else
        say "npm could not install them (see $directory/npm.log): the test that reads columns with them is skipped"
    fi
}

# install_page_checkers: what the tests check pages with for accessibility, from npm, into build/page-checkers. Without it
# the pages are not checked for that, and the test says so.
install_page_checkers() {
    local directory=build/page-checkers
    command -v npm >/dev/null || return 0
    mkdir -p "$directory"
    cmp -s Tests/Browser/Checkers/package-lock.json "$directory/installed" && return 0
    cp Tests/Browser/Checkers/package.json Tests/Browser/Checkers/package-lock.json "$directory"
    say "Installing what pages are checked with"
    if npm install --prefix "$directory" --ignore-scripts --no-audit --no-fund >"$directory/npm.log" 2>&1 </dev/null; then
        cp Tests/Browser/Checkers/package-lock.json "$directory/installed"
    else
        say "npm could not install it (see $directory/npm.log): pages are not checked for accessibility"
    fi
}

# configure PRESET DIRECTORY OPTION...: configures unless that has been done; the options apply then only.
configure() {
    local preset=$1 directory=$2
    shift 2
    [ -f "$directory/build.ninja" ] && [ $# -eq 0 ] && return 0
    say "Configuring $directory"
    mkdir -p "$directory"
    # Where ccache compiles, precompiled headers would cost more than they spare.
    if [[ $preset =~ ^(release|fuzz)$ ]] && [ -z "${CMAKE_CXX_COMPILER_LAUNCHER-}" ]; then
        set -- -DVELMORA_PRECOMPILED_HEADERS=ON "$@"
    fi
    cmake --preset "$preset" "$@" >"$directory/configure.log" 2>&1 || {
        cat "$directory/configure.log" >&2
        return 1
    }
}

# has_options DIRECTORY OPTION...: whether the tree is configured with all of these turned on.
has_options() {
    local cache=$1/CMakeCache.txt option
    shift
    for option in "$@"; do
        grep -qs "^$option:BOOL=ON" "$cache" || return 1
    done
}

# build DIRECTORY [TARGET...]: builds the targets, or everything. On a terminal Ninja shows how far it is.
build() {
    local directory=$1 command=(cmake --build "$1") result=0
    shift
    [ $# -eq 0 ] || command+=(--target "$@")
    local -x NINJA_STATUS='[%f/%t] '
    trap 'exit 130' INT # Ninja ends with a status of its own then, as if something had not compiled
    if on_terminal; then
        "${command[@]}" >&2 || result=1
    elif ! "${command[@]}" 2>&1 | show_progress "$directory/build.log" parse_build_line; then
        grep -vE '^\[[0-9]+/[0-9]+\] ' "$directory/build.log" >&2 || true
        result=1
    fi
    trap - INT
    return "$result"
}

# run_programs DIRECTORY TEST... -- ARGUMENT...: the test programs of a tree, each as a whole, several in parallel. The
# array `under` may hold a program that runs them. Prints how many cases each has, and all output of those that fail.
run_programs() {
    local directory=$1 programs=() program running=0 result=0
    shift
    while [ "$1" != -- ]; do
        programs+=("$1")
        shift
    done
    shift
    for program in "${programs[@]}"; do
        if [ "$running" -ge "$(nproc)" ]; then
            wait -n || result=1
            running=$((running - 1))
        fi
        run_program "$directory" "$program" "$@" &
        running=$((running + 1))
    done
    while [ "$running" -gt 0 ]; do
        wait -n || result=1
        running=$((running - 1))
    done
    return "$result"
}

# run_program DIRECTORY TEST ARGUMENT...: one of them.
run_program() {
    local directory=$1 program=$2
    local log=$directory/$program.log
    shift 2
    if "${under[@]}" "$directory/tests/$program" --gtest_brief=1 "$@" >"$log" 2>&1; then
        say "$program: $(sed -n 's/^\[==========\] //p' "$log" | tail -n 1)"
    else
        say "$program failed, with status $?:"
        cat "$log" >&2
        return 1
    fi
}
