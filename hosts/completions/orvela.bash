# Completion of the orvela command for bash.

# _orvela_offer WORD LIST [BEFORE AFTER]: the lines of the list that begin with the word, between the two texts.
_orvela_offer() {
    local lines each
    mapfile -t lines <<<"$2"
    for each in "${lines[@]}"; do
        [[ -n $each && $each == "$1"* ]] && COMPREPLY+=("${3-}$each${4-}")
    done
}

# _orvela_offer_names WORD KIND: names that "=" follows; the list may go on after a comma.
_orvela_offer_names() {
    local before=
    [[ $1 == *,* ]] && before=${1%,*},
    _orvela_offer "${1#"$before"}" "$(orvela modes --names "$2" 2>/dev/null)" "$before" =
    compopt -o nospace
}

# _orvela_presets COMMAND: those of the line's mode; `enhance` takes those of Advanced where the mode has none.
_orvela_presets() {
    local mode=Advanced at
    for ((at = 1; at < ${#COMP_WORDS[@]}; ++at)); do
        [[ ${COMP_WORDS[at]} == --mode ]] || continue
        [[ ${COMP_WORDS[at + 1]-} == = ]] && at=$((at + 1))
        mode=${COMP_WORDS[at + 1]-} # quotes in it do not matter to the program
    done
    orvela presets list --mode "$mode" 2>/dev/null || { [[ $1 == enhance ]] && orvela presets list 2>/dev/null; }
}

_orvela_offer_files() {
    local files
    mapfile -t files < <(compgen -f -- "$1")
    COMPREPLY+=("${files[@]}")
    compopt -o filenames
}

# _orvela_offer_presets WORD COMMAND [files]: presets, and files where the line may go on with one.
_orvela_offer_presets() {
    local word found
    IFS= read word <<<"$1" # takes the backslashes away
    _orvela_offer "$word" "$(_orvela_presets "$2")"
    found=${#COMPREPLY[@]}
    [[ ${3-} != files ]] || _orvela_offer_files "$1"
    # Behind an open quote the shell quotes names of files well; elsewhere it would leave $( of a preset as it is.
    if ((found == 0)) || [[ ${COMP_WORDS[COMP_CWORD]} == [\"\']* ]]; then
        compopt -o filenames
    else
        compopt +o filenames
        mapfile -t COMPREPLY < <(printf '%q\n' "${COMPREPLY[@]}")
    fi
}

# _orvela_value OPTION WORD COMMAND: the value of an option.
_orvela_value() {
    case $1 in
        --mode)
            _orvela_offer "$2" "$(orvela modes --names modes 2>/dev/null)"
            [[ $3 != presets ]] || _orvela_offer "$2" FinalTouch
            ;;
        --set) _orvela_offer_names "$2" settings ;;
        --final-touch) _orvela_offer_names "$2" final-touch ;;
        --preset) _orvela_offer_presets "$2" "$3" files ;;
        --chroma) _orvela_offer "$2" $'full\nhalf' ;;
        --compression) _orvela_offer "$2" $'none\nlzw\ndeflate\npackbits\nzstd\njpeg' ;;
        --names) _orvela_offer "$2" $'modes\nsettings\nfinal-touch' ;;
        *) return 1 ;;
    esac
}

_orvela() {
    local word=$2 command=() each at=$COMP_CWORD
    COMPREPLY=()
    # The shell takes --OPTION=VALUE and NAME=VALUE apart: the option stands before the first "=" or name.
    [[ ${COMP_WORDS[at]} == = ]] || at=$((at - 1))
    while ((at > 1)) && [[ ${COMP_WORDS[at]} == = ]]; do
        at=$((at - 1))
        [[ ${COMP_WORDS[at]} == --* ]] || at=$((at - 1))
    done
    for each in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        case ${command[*]}/$each in /enhance | /edit | /modes | /presets | presets/[a-z]*) command+=("$each") ;; esac
    done
    _orvela_value "${COMP_WORDS[at]}" "$word" "${command[0]-}" && return
    case ${command[*]}/$word in
        */-*) _orvela_offer "$word" "$(orvela "${command[@]}" --help 2>/dev/null | grep -oE -- '--[a-z-]+')" ;;
        /*) _orvela_offer "$word" $'enhance\nedit\nmodes\npresets' ;;
        presets/*) _orvela_offer "$word" $'list\nexport\nimport\nremove' ;;
        "presets export/"*) _orvela_offer_presets "$word" presets files ;;
        "presets remove/"*) _orvela_offer_presets "$word" presets ;;
        enhance/* | edit/* | "presets import/"*) _orvela_offer_files "$word" ;;
    esac
}

complete -F _orvela orvela
