# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# shellcheck shell=bash
# Completion of Velmora's programs for bash, by way of bash-completion, which loads it under each one's name.

_velmora_technologies=(IFX Ostrel_GSM Ostrel_CDMA Ostrel_LTE Ostrel_UTRAN2 Modem)

_velmora_roles=(serving serving.{mcc,mnc,area,cell,channel,physical-cell,level,quality} neighbour
    neighbour.{channel,physical-cell,level,quality} registration.state radio.state block-error-rate data-rate)

_velmora_kinds=(cell-reselection handover cell-change technology-change ping-pong late-reselection early-reselection
    radio-state registration-state mobility-state area-update out-of-service limited-service call-setup call-end
    call-lost re-establishment context-up context-down address-change evdo-session sim-change gap malformed clock-jump note
    weak-coverage poor-quality pilot-pollution missing-neighbour block-error-burst data-stall fer-alarm)

# Offers those of the words that begin as the present one does.
_velmora_offer() {
    local word
    COMPREPLY=()
    for word in "$@"; do
        [[ $word != "$cur"* ]] || COMPREPLY+=("$word")
    done
}

# Completes the value of an option that all programs have; fails where there is none to complete.
_velmora_common_value() {
    case $prev in
    --log) _velmora_offer syslog stderr ;;
    --log-level) _velmora_offer 0 1 2 3 4 5 6 7 ;;
    *) return 1 ;;
    esac
}

_velmora() {
    local cur prev words cword split
    _init_completion -s || return
    _velmora_common_value && return
    case $prev in
    --sysroot | --log-directory)
        _filedir -d
        return
        ;;
    --view)
        _velmora_offer panes drive
        return
        ;;
    --mask-key)
        _filedir
        return
        ;;
    --technology)
        _velmora_offer "${_velmora_technologies[@]}"
        return
        ;;
    esac
    $split && return
    case $cur in
    -*) _velmora_offer -h --help --version --sysroot --log-directory --start-service --mask-key --technology --view --self-test --log --log-level ;;
    *) _filedir ;;
    esac
}

# Completes a source: its kind, a scenario's name or a file, and then the options after commas.
_velmora_source() {
    local source=$cur head=${cur%,*},
    case $source in
    scenario:*,*) _velmora_offer "${head}seed=" "${head}speed=" ;;
    scenario:*) _velmora_offer scenario:{gsm,c2k,lte,utran,ifx,modem} ;;
    replay:*,technology=*)
        # What stands before the equals sign is a word of its own to bash.
        cur=${cur##*=}
        _velmora_offer "${_velmora_technologies[@]}"
        ;;
    replay:*,*) _velmora_offer "${head}speed=" "${head}loop" "${head}technology=" ;;
    replay:*)
        cur=${cur#replay:}
        _filedir
        COMPREPLY=("${COMPREPLY[@]/#/replay:}")
        ;;
    modemmanager,*) _velmora_offer modemmanager,modem= modemmanager,sim= ;;
    *) _velmora_offer scenario: replay: modemmanager ;;
    esac
    # An option may follow, or a name.
    compopt -o nospace 2>/dev/null
    __ltrim_colon_completions "$source"
}

_velmora_telephonyd() {
    local cur prev words cword split
    _init_completion -s -n : || return
    _velmora_common_value && return
    if [[ $prev == --source ]]; then
        _velmora_source
        return
    fi
    $split && return
    _velmora_offer -h --help --version --source --log --log-level
}

# Offers the paths of the fields that velmora-log lists, of the technology where the command names one. What
# follows a name and an equals sign is a word of its own to bash.
_velmora_path() {
    local i name='' technology=() path
    for ((i = 1; i < cword; ++i)); do
        [[ ${words[i]} != --technology ]] || technology=(--technology "${words[i + 1]}")
    done
    cur=${cur#[\'\"]}
    cur=${cur//\\/}
    if [[ $cur == [!/]*=* ]]; then
        [[ $COMP_WORDBREAKS == *=* ]] || name=${cur%%=*}=
        cur=${cur#*=}
    fi
    COMPREPLY=()
    # The second cell; a path with a comma is quoted there, and is left out.
    while IFS=, read -r _ path _; do
        [[ $path != /* || $path != "$cur"* ]] || COMPREPLY+=("$name$path")
    done < <("${words[0]}" fields "${technology[@]}" --format csv 2>/dev/null)
    compopt -o filenames 2>/dev/null # so that bash quotes the blanks
}

_velmora_log() {
    local cur prev words cword split
    _init_completion -s || return
    _velmora_common_value && return
    local i command='' files=0
    for ((i = 1; i < cword; ++i)); do
        case ${words[i]} in
        --log | --log-level | --format | --every | --select | --from | --to | --code | --technology | --jobs | \
            --max-age | --max-gap | --track | --gps | --duration | --count | --timeout | --description | --role | --kind | --severity | --clock | \
            --rules | --exec | --exec-timeout | --fail-on | --by | --out | \
            --compact | --level | --key | --new-key | --known)
            ((++i))
            ;;
        -?*) ;;
        *)
            if [[ -z $command ]]; then
                command=${words[i]}
            else
                ((++files))
            fi
            ;;
        esac
    done
    case $prev in
    --format)
        case $command in
        info | diff) _velmora_offer text json ;;
        fields | stats) _velmora_offer text json csv ;;
        events) _velmora_offer text jsonl csv ;;
        *) _velmora_offer text json jsonl csv ;;
        esac
        return
        ;;
    --role)
        _velmora_offer "${_velmora_roles[@]}"
        return
        ;;
    --kind)
        # The last one of a list.
        local earlier=''
        [[ $cur != *,* ]] || earlier=${cur%,*},
        _velmora_offer "${_velmora_kinds[@]/#/$earlier}"
        return
        ;;
    --severity | --fail-on | --bell)
        _velmora_offer info warning critical
        return
        ;;
    --clock)
        _velmora_offer arrival modem
        return
        ;;
    --rules)
        _filedir toml
        return
        ;;
    --exec)
        mapfile -t COMPREPLY < <(compgen -c -- "$cur")
        return
        ;;
    --every)
        _velmora_offer refresh message
        return
        ;;
    --by)
        _velmora_offer file technology cell minute
        return
        ;;
    --technology)
        _velmora_offer "${_velmora_technologies[@]}" GSM CDMA LTE UTRAN
        return
        ;;
    --level)
        _velmora_offer identity location all
        return
        ;;
    --mask)
        # With the equals sign alone: without one a file follows.
        if $split || [[ $cur == = ]]; then
            cur=${cur#=}
            _velmora_offer identity location all
            return
        fi
        ;;
    --key | --new-key | --known)
        _filedir
        return
        ;;
    --select)
        _velmora_path
        return
        ;;
    -o | --output)
        _filedir html
        return
        ;;
    --out | --compact)
        _filedir -d
        return
        ;;
    --track)
        _filedir
        return
        ;;
    --gps)
        _filedir
        mapfile -t -O ${#COMPREPLY[@]} COMPREPLY < <(compgen -W 'gpsd modem' -- "$cur")
        return
        ;;
    --max-age | --max-gap | --from | --to | --code | --jobs | --duration | --count | --timeout | --description | \
        --exec-timeout)
        return # nothing that could be guessed
        ;;
    esac
    $split && return

    local options=(-h --help --log --log-level -v --verbose)
    case $command in
    '')
        if [[ $cur == -* ]]; then
            _velmora_offer "${options[@]}" --version
        else
            _velmora_offer decode browse watch record convert info fields events rules stats diff report mask columns
        fi
        return
        ;;
    decode) options+=(--format --every --samples --wide --positions --max-gap --safe --max-age --select --from --to --code --warm --technology --mask --key --strict --jobs) ;;
    browse) options+=(--line --technology --mask --key) ;;
    watch) options+=(--once --timeout --bell --mask --key) ;;
    record) options+=(--force --duration --count --timeout --gps) ;;
    convert) options+=(--force --from --to --code --technology --description --strict --track --select --role --max-gap) ;;
    info) options+=(--format --technology) ;;
    fields) options+=(--technology --role --format --safe) ;;
    events) options+=(--format --safe --records --positions --max-gap --live --clock --technology --mask --key --kind --severity --from --to --rules
        --no-rules --exec --exec-timeout --fail-on --duration --count --timeout) ;;
    stats) options+=(--format --safe --histogram --by --select --role --from --to --clock --technology --max-gap) ;;
    diff) options+=(--format --display --select --role --clock --technology) ;;
    report) options+=(-o --output --force --with-identities --rules --no-rules --clock --technology --mask --key) ;;
    mask) options+=(--level --key --technology --keep-unknown --report --force --new-key --check --known) ;;
    columns) options+=(--out --compact --technology --mask --key) ;;
    esac
    if [[ $cur == -* ]]; then
        _velmora_offer "${options[@]}"
        return
    fi
    # As many files as the command takes.
    case $command:$files in
    rules:0) _velmora_offer check test ;;
    rules:*) _filedir toml ;;
    convert:1) _filedir '@(pcapng|velmora|dlf|sqlite|gpx|geojson|kml)' ;;
    decode:* | browse:* | info:* | events:* | stats:* | report:* | columns:* | record:0 | convert:0 | diff:[01] | mask:[01])
        _filedir '@(pcapng|velmora|dlf)'
        ;;
    esac
}

complete -F _velmora velmora
complete -F _velmora_telephonyd velmora-telephonyd
complete -F _velmora_log velmora-log
