# Completion of nvldm-emulator. Options and faults are those that the program itself names.

# The kinds of faults; one that needs a value ends with "=".
_nvldm_emulator_faults() {
    "$1" --help | sed -n '/^FAULT is/,/^$/ s/^  \([a-z-]*=\{0,1\}\).*/\1/p'
}

_nvldm_emulator() {
    local program=$1 current=$2 option=$3
    # The shell takes "--option=value" for three words.
    if [ "$current" = = ]; then
        current=
        option=${COMP_WORDS[COMP_CWORD - 1]}
    elif [ "$option" = = ]; then
        option=${COMP_WORDS[COMP_CWORD - 2]}
    fi
    COMPREPLY=()
    case $option in
        --root)
            compopt -o filenames 2>/dev/null
            mapfile -t COMPREPLY < <(compgen -d -- "$current")
            ;;
        --host) mapfile -t COMPREPLY < <(compgen -W '127.0.0.1 0.0.0.0' -- "$current") ;;
        --fault)
            compopt -o nospace 2>/dev/null
            mapfile -t COMPREPLY < <(compgen -W "$(_nvldm_emulator_faults "$program")" -- "$current")
            ;;
        *)
            # An option that takes a value has one in capitals beside it; there is nothing to offer for those.
            "$program" --help | grep -q -- "^  $option [A-Z]" && return
            mapfile -t COMPREPLY < <(
                compgen -W "$("$program" --help | grep -o '^  --[a-z-]*\|, --[a-z-]*' | tr -d ' ,')" -- "$current"
            )
            ;;
    esac
}

complete -F _nvldm_emulator nvldm-emulator
