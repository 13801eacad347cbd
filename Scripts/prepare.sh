# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# shellcheck shell=bash
# What ./run and ./test share: installing what is missing, configuring, building. Sourced, not run.

# shellcheck disable=SC2034 # those who source it use them
build_packages=(build-essential cmake ninja-build qt6-base-dev libgl-dev libpugixml-dev libcli11-dev
    nlohmann-json3-dev)
# shellcheck disable=SC2034
test_packages=(libgtest-dev libgmock-dev libbenchmark-dev python3 tshark clang-format fonts-dejavu-core xvfb dbus
    at-spi2-core gir1.2-atspi-2.0 python3-gi desktop-file-utils appstream
    modemmanager shellcheck lintian fakeroot file systemd python3-jsonschema mandoc bash-completion git
    mypy)
# shellcheck disable=SC2034
fuzz_packages=(clang libclang-rt-14-dev)
# shellcheck disable=SC2034
lint_packages=(clang-tidy cppcheck)

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
    say "Installing ${missing[*]}"
    "${as_root[@]}" apt-get update -qq >&2 &&
        "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends \
            "${missing[@]}" >&2 && return 0
    say "Installing failed. As root, run:"
    say "  apt-get install --no-install-recommends ${missing[*]}"
    return 1
}

# configure PRESET DIRECTORY OPTION...: configures unless that has been done; the options apply then only.
configure() {
    local preset=$1 directory=$2
    shift 2
    [ -f "$directory/build.ninja" ] && [ $# -eq 0 ] && return 0
    cmake --preset "$preset" "$@" >"$directory.log" 2>&1 || {
        cat "$directory.log" >&2
        return 1
    }
}
