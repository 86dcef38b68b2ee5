# bash completion of orvex, koratd and orvex-decode. Options and their values are read from --help.

_orvex()
{
    local cur prev words cword split
    _init_completion -s || return

    local value
    value=$("$1" --help 2>/dev/null | sed -n "s/^ *${prev} <\([^>]*\)>.*/\1/p")
    case $prev:$value in
        --technology:*)
            COMPREPLY=($(compgen -W '$("$1" --help | grep -oE "IFX|MRL_[A-Z0-9]+" | sort -u)' -- "$cur"))
            return
            ;;
        *:FILE*)
            _filedir
            return
            ;;
        *:DIR)
            _filedir -d
            return
            ;;
        *:*\|*)
            COMPREPLY=($(compgen -W "${value//|/ }" -- "$cur"))
            return
            ;;
        --*:?*) return ;;
    esac
    $split && return

    if [[ $cur == -* ]]; then
        COMPREPLY=($(compgen -W '$(_parse_help "$1")' -- "$cur"))
    else
        _filedir
    fi
} && complete -F _orvex orvex koratd orvex-decode
