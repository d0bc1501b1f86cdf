# Completion for zelctl, ZELSim, zeldraw and zelremote: the words come from the programs' own help.

_zelremote_options() {
    "$@" --help 2> /dev/null | grep -oE -- '(^|[ ,])--[a-z-]+' | tr -d ' ,' | sort -u
}

_zelremote_verbs() {
    "$1" --help 2> /dev/null | sed -n '/^Subcommands:/,$s/^  \([a-z][a-z]*\).*/\1/p'
}

_zelremote() {
    local program=$1 current=${COMP_WORDS[COMP_CWORD]} previous=${COMP_WORDS[COMP_CWORD - 1]}
    local word verb='' verbs
    COMPREPLY=()
    case $previous in
        --home | --tls-*)
            mapfile -t COMPREPLY < <(compgen -f -- "$current")
            return
            ;;
        --output | --image | --waterfall | --spectrogram | --log | --screenshot | --link | \
            --phonebook | --mask)
            mapfile -t COMPREPLY < <(compgen -f -- "$current")
            return
            ;;
        --serial)
            mapfile -t COMPREPLY < <(compgen -W "$(echo /dev/ttyUSB* /dev/ttyACM* /dev/ttyS*)" -- "$current")
            return
            ;;
        --theme)
            mapfile -t COMPREPLY < <(compgen -W 'light dark system' -- "$current")
            return
            ;;
        --language)
            mapfile -t COMPREPLY < <(compgen -W 'en de' -- "$current")
            return
            ;;
        --connect | --words | --size | --baud | --listen | --allow | --count | --interval)
            return
            ;;
    esac
    verbs=$(_zelremote_verbs "$program")
    for word in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        if grep -qx -- "$word" <<< "$verbs"; then
            verb=$word
            break
        fi
    done
    if [[ $current == -* ]]; then
        mapfile -t COMPREPLY < <(compgen -W "$(_zelremote_options "$program" $verb)" -- "$current")
    elif [ -n "$verbs" ] && [ -z "$verb" ]; then
        mapfile -t COMPREPLY < <(compgen -W "$verbs" -- "$current")
    else
        mapfile -t COMPREPLY < <(compgen -f -- "$current")
    fi
}
complete -o filenames -F _zelremote zelctl zelremote zeldraw ZELSim
