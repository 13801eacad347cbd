#!/usr/bin/env bash
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# Prints what bash would offer at the end of a command line, one word a line: complete.bash 'velmora-log de'
set -u
# shellcheck source=/dev/null
source /usr/share/bash-completion/bash_completion
# shellcheck source=../../Resources/completion/velmora.bash
source "$(dirname "$0")/../../Resources/completion/velmora.bash"
set +u # as in the shells that it is made for

COMP_LINE=$1
COMP_POINT=${#COMP_LINE}
# Bash takes colons and equals signs for words of their own.
COMP_WORDS=()
rest=$COMP_LINE
while [[ $rest =~ ^([:=]|[^[:space:]:=]+)[[:space:]]*(.*)$ ]]; do
    COMP_WORDS+=("${BASH_REMATCH[1]}")
    rest=${BASH_REMATCH[2]}
done
[[ $COMP_LINE != *' ' ]] || COMP_WORDS+=('')
COMP_CWORD=$((${#COMP_WORDS[@]} - 1))
COMPREPLY=()
completion=$(complete -p "${COMP_WORDS[0]}") || exit
[[ $completion =~ -F\ ([^ ]+) ]] || exit
"${BASH_REMATCH[1]}"
for word in "${COMPREPLY[@]}"; do
    printf '%s\n' "$word"
done
