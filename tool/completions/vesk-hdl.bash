# Completion of vesk-hdl for bash.

_vesk_hdl() {
    local word=$2 before=$3 command='' option
    for option in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        [[ $option == -* ]] || { command=$option; break; }
    done
    COMPREPLY=()
    case $before in
        --progress | --color) mapfile -t COMPREPLY < <(compgen -W 'auto always never' -- "$word") ;;
        --diagnostics) mapfile -t COMPREPLY < <(compgen -W 'text json' -- "$word") ;;
        --language) mapfile -t COMPREPLY < <(compgen -W 'vhdl verilog both' -- "$word") ;;
        --output-dir | --restrict) mapfile -t COMPREPLY < <(compgen -d -- "$word") ;;
        --off | --only)
            mapfile -t COMPREPLY < <(compgen -W "$(vesk-hdl check --list 2> /dev/null |
                awk '{ print $1 }')" -- "$word") ;;
        --model | --max-memory | --max-output | --restrict-suffix) ;;
        --application | --command | --design | --device | --purpose | --reference) ;;
        *)
            local options='--help'
            case $command in
                '') options='--help --version run check shell commands header' ;;
                run) options+=' --model --vhdl --verilog --output-dir --restrict
                    --restrict-overwrite --restrict-suffix --max-memory --max-output --keep-going
                    --stats --quiet --progress --diagnostics --color' ;;
                check) options+=' --model --language --strict --off --only --list --markdown
                    --max-memory --max-output --diagnostics --color' ;;
                shell) options+=' --model --output-dir --max-memory --max-output' ;;
                commands) options+=' --markdown' ;;
                header) options+=' --verilog --vhdl --design --application --command --device
                    --purpose --reference' ;;
            esac
            if [[ -z $command || $word == -* ]]; then
                mapfile -t COMPREPLY < <(compgen -W "$options" -- "$word")
            elif [[ $command == commands ]]; then
                mapfile -t COMPREPLY < <(compgen -W "$(vesk-hdl commands 2> /dev/null |
                    tr ' ' '\n' | grep -xE '[A-Za-z]+' | sort -u)" -- "$word")
            elif [[ $command != shell ]]; then
                compopt -o filenames 2> /dev/null
                mapfile -t COMPREPLY < <(compgen -f -- "$word")
            fi
            ;;
    esac
}
complete -F _vesk_hdl vesk-hdl
