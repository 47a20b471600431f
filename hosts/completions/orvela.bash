# Completion of the orvela command for bash.

# _orvela_offer WORD LIST [OPTION OF COMPGEN...]: the lines of the list that begin with the word.
_orvela_offer() {
    local IFS=$'\n'
    COMPREPLY+=($(compgen "${@:3}" -W "$2" -- "$1"))
}

# _orvela_offer_names WORD KIND: names that "=" follows; the list may go on after a comma.
_orvela_offer_names() {
    local before=
    [[ $1 == *,* ]] && before=${1%,*},
    _orvela_offer "${1#"$before"}" "$(orvela modes --names "$2" 2>/dev/null)" -P "$before" -S =
    compopt -o nospace
}

# The value of an option.
_orvela_value() {
    case $1 in
        --mode) _orvela_offer "$2" "$(orvela modes --names modes 2>/dev/null; echo FinalTouch)" ;;
        --set) _orvela_offer_names "$2" settings ;;
        --final-touch) _orvela_offer_names "$2" final-touch ;;
        --preset) _orvela_offer "$2" "$(orvela presets list 2>/dev/null)" && return 1 ;;
        --chroma) _orvela_offer "$2" $'full\nhalf' ;;
        --compression) _orvela_offer "$2" $'none\nlzw\ndeflate\npackbits\nzstd\njpeg' ;;
        --names) _orvela_offer "$2" $'modes\nsettings\nfinal-touch' ;;
        *) return 1 ;;
    esac
}

_orvela() {
    local word=$2 command=() each last=$((COMP_CWORD - 1))
    COMPREPLY=()
    # The shell takes NAME=VALUE apart: the option stands before the first name.
    while [[ ${COMP_WORDS[last]} == = ]]; do last=$((last - 2)); done
    for each in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        case ${command[*]}/$each in /enhance | /modes | /presets | presets/[a-z]*) command+=("$each") ;; esac
    done
    _orvela_value "${COMP_WORDS[last]}" "$word" && return
    case ${command[*]}/$word in
        */-*) _orvela_offer "$word" "$(orvela "${command[@]}" --help 2>/dev/null | grep -oE -- '--[a-z-]+')" ;;
        /*) _orvela_offer "$word" $'enhance\nmodes\npresets' ;;
        presets/*) _orvela_offer "$word" $'list\nexport\nimport\nremove' ;;
        "presets export/"* | "presets remove/"*) _orvela_offer "$word" "$(orvela presets list 2>/dev/null)" ;;&
        enhance/* | "presets export/"* | "presets import/"*)
            local IFS=$'\n'
            COMPREPLY+=($(compgen -f -- "$word"))
            compopt -o filenames
            ;;
    esac
}

complete -F _orvela orvela
