# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# shellcheck shell=bash
# What the packaging checks share; sourced with the build tree as the first argument.
set -euo pipefail
export LC_ALL=C.UTF-8
build=$(cd "$1" && pwd)
# shellcheck disable=SC2034 # those who source it use it
source_tree=$(cd "$(dirname "${BASH_SOURCE[0]}")/../.." && pwd)
# shellcheck disable=SC2034
packages=$build/packages-test

say() { printf '%s\n' "$*" >&2; }
fail() { say "$*"; exit 1; }

# need TOOL...: ends the test as skipped where one is missing.
need() {
    local tool
    for tool in "$@"; do
        command -v "$tool" >/dev/null || { say "$tool is missing"; exit 77; }
    done
}

# pack DIRECTORY: makes the packages there of what has been built, without building anything.
pack() {
    local epoch
    epoch=$(dpkg-parsechangelog -l "$source_tree/Packaging/changelog" -S Timestamp)
    rm -rf "$1"
    umask 022 # gets into the packages
    SOURCE_DATE_EPOCH=$epoch cpack --config "$build/CPackConfig.cmake" -B "$1" \
        -D CPACK_OUTPUT_FILE_PREFIX="$1" >"$1.log" 2>&1 || {
        cat "$1.log" >&2
        return 1
    }
}
