#compdef orvela
# Completion of the orvela command for zsh.

# _orvela_names KIND [OPTION OF COMPADD...]: names that the program lists.
_orvela_names() {
    local -a names=(${(f)"$(orvela modes --names $1 2>/dev/null)"})
    compadd "${@:2}" -a names
}

_orvela_modes() { _orvela_names modes; [[ $words[2] != presets ]] || compadd FinalTouch }

# Those of the line's mode; `enhance` takes those of Advanced where the mode has none.
_orvela_presets() {
    local mode=${${words[(r)--mode=*]}#--mode=}
    local -i at=${words[(i)--mode]}
    (( at < $#words )) && mode=$words[at+1]
    local -a names=(${(f)"$(orvela presets list --mode ${mode:-Advanced} 2>/dev/null ||
        { [[ $words[2] == enhance ]] && orvela presets list 2>/dev/null })"})
    compadd -a names
}

_orvela_presets_or_files() { _orvela_presets; _files }
_orvela_assignments() { compset -P '*,'; _orvela_names $1 -S = }

# What --help lists: "  -o,--output FILE  text", as "--output" and its text.
_orvela_options() {
    local -a options=(${(f)"$(orvela $words[2,1+$1] --help 2>/dev/null |
        sed -nE 's/^ +(-[a-z],)?(--[a-z-]+).*/\2/p')"})
    compadd -a options
}

_orvela() {
    local depth=1 option=$words[CURRENT-1]
    [[ $words[2] == presets ]] && depth=2
    [[ $PREFIX == --*=* ]] && option=${PREFIX%%=*} && compset -P 1 '*='
    case $option in
        --mode) _orvela_modes; return ;;
        --set) _orvela_assignments settings; return ;;
        --final-touch) _orvela_assignments final-touch; return ;;
        --preset) _orvela_presets_or_files; return ;;
        --chroma) compadd full half; return ;;
        --compression) compadd none lzw deflate packbits zstd jpeg; return ;;
        --names) compadd modes settings final-touch; return ;;
        -d|--directory|--trace) _files -/; return ;;
    esac
    if (( CURRENT == 2 )); then
        compadd enhance edit modes presets
    elif [[ $PREFIX == -* ]]; then
        _orvela_options $depth
    elif [[ $words[2] == presets ]] && (( CURRENT == 3 )); then
        compadd list export import remove
    elif [[ "$words[2] $words[3]" == "presets remove" ]]; then
        _orvela_presets
    elif [[ "$words[2] $words[3]" == "presets export" ]]; then
        _orvela_presets_or_files
    elif [[ $words[2] != modes ]]; then
        _files
    fi
}

_orvela "$@"
