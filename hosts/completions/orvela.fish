# Completion of the orvela command for fish.

# The options that --help lists, for the subcommands of the line.
function __orvela_options
    orvela (commandline -opc | string match -r '^(?:enhance|edit|modes|presets|list|export|import|remove)$') --help 2>/dev/null |
        string match -rg -- '^ +(?:-[a-z],)?(--[a-z-]+)'
end

# Names for NAME=VALUE, also behind a comma.
function __orvela_assignments
    set -l before (commandline -ct | string match -r '.*,')
    orvela modes --names $argv[1] 2>/dev/null | string replace -r '(.*)' "$before\$1="
end

function __orvela_modes
    orvela modes --names modes 2>/dev/null
    __fish_seen_subcommand_from presets; and echo FinalTouch
end

# Those of the line's mode; `enhance` takes those of Advanced where the mode has none.
function __orvela_presets
    set -l words (commandline -op)
    set -l mode Advanced
    set -l at (contains -i -- --mode $words); and set mode $words[(math $at + 1)]
    set -l value (string replace -f -- --mode= '' $words); and set mode $value[1]
    orvela presets list --mode "$mode" 2>/dev/null
    or begin
        __fish_seen_subcommand_from enhance; and orvela presets list 2>/dev/null
    end
end

set -l commands enhance edit modes presets
set -l actions list export import remove
complete -c orvela -n "not __fish_seen_subcommand_from $commands" -f -a "$commands"
complete -c orvela -n "__fish_seen_subcommand_from presets; and not __fish_seen_subcommand_from $actions" -f -a "$actions"
complete -c orvela -n "__fish_seen_subcommand_from export remove" -a "(__orvela_presets)"
complete -c orvela -n "__fish_seen_subcommand_from modes" -f
complete -c orvela -n "string match -q -- '-*' (commandline -ct)" -a "(__orvela_options)"
complete -c orvela -l mode -x -a "(__orvela_modes)"
complete -c orvela -l set -x -a "(__orvela_assignments settings)"
complete -c orvela -l final-touch -x -a "(__orvela_assignments final-touch)"
complete -c orvela -l preset -r -a "(__orvela_presets)"
complete -c orvela -l chroma -x -a "full half"
complete -c orvela -l compression -x -a "none lzw deflate packbits zstd jpeg"
complete -c orvela -l names -x -a "modes settings final-touch"
