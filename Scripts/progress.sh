# shellcheck shell=bash
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# How installing and building show that they are at work. prepare.sh sources it.

progress_seconds=15 # between two lines where there is no terminal

# on_terminal: whether messages go to a terminal that can write its last line again.
on_terminal() { [ -t 2 ] && [ "${TERM-dumb}" != dumb ]; }

# show_progress LOG PARSE: copies its input to the log and shows how far the work is: in one line of the terminal, or
# by a line now and then. PARSE is a function that sets `progress` to such a text where a line of the input has one.
show_progress() {
    local log=$1 parse=$2 line='' part status=0 progress='' shown='' next=0
    while [ "$status" -eq 0 ] || [ "$status" -gt 128 ]; do
        status=0
        # The time-out is for a line now and then also while a single step takes long.
        IFS= read -r -t 1 part || status=$?
        line+=$part
        if [ "$status" -le 128 ] && [ -n "$line" ]; then
            printf '%s\n' "$line" >&3
            "$parse" "$line"
            line=
        fi
        if on_terminal; then
            [ "$progress" = "$shown" ] || printf '\r\033[K%.*s' "$((${COLUMNS:-80} - 1))" "$progress" >&2
            shown=$progress
        elif [ -n "$progress" ] && [ "$SECONDS" -ge "$next" ]; then
            printf '%s\n' "$progress" >&2
            next=$((SECONDS + progress_seconds))
        fi
    done 3>"$log"
    [ -z "$shown" ] || printf '\r\033[K' >&2
}

# Ninja's "[120/760] Building ...", but not its "[0/2] Re-running CMake...", which comes before the steps are known.
# shellcheck disable=SC2034,SC2317 # show_progress calls it and reads what it sets
parse_build_line() {
    if [[ $1 =~ ^\[([0-9]+)/([0-9]+)\]\ (.*) && ${BASH_REMATCH[3]} != Re-* ]]; then
        progress="Building: ${BASH_REMATCH[1]} of ${BASH_REMATCH[2]} steps"
    fi
}

# apt's "dlstatus:1:20.5:Retrieving file 1 of 5" and "pmstatus:cmake:40.2:Unpacking cmake".
# shellcheck disable=SC2034,SC2317
parse_apt_line() {
    case $1 in
    dlstatus:* | pmstatus:*)
        local percent text
        IFS=: read -r _ _ percent text <<<"$1"
        progress="apt: ${percent%.*} %, $text"
        ;;
    esac
}
