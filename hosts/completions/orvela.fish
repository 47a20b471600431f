# Completion of the orvela command for fish.

# The options that --help lists, for the subcommands of the line.
function __orvela_options
    orvela (commandline -opc | string match -r '^(?:enhance|modes|presets|list|export|import|remove)$') --help 2>/dev/null |
        string match -rg -- '^ +(?:-[a-z],)?(--[a-z-]+)'
end

# Names for NAME=VALUE, also behind a comma.
function __orvela_assignments
    set -l before (commandline -ct | string match -r '.*,')
    orvela modes --names $argv[1] 2>/dev/null | string replace -r '(.*)' "$before\$1="
end

function __orvela_names
    orvela modes --names modes 2>/dev/null
    echo FinalTouch
end

set -l commands enhance modes presets
set -l actions list export import remove
complete -c orvela -n "not __fish_seen_subcommand_from $commands" -f -a "$commands"
complete -c orvela -n "__fish_seen_subcommand_from presets; and not __fish_seen_subcommand_from $actions" -f -a "$actions"
complete -c orvela -n "__fish_seen_subcommand_from export remove" -a "(orvela presets list 2>/dev/null)"
complete -c orvela -n "__fish_seen_subcommand_from modes" -f
complete -c orvela -n "string match -q -- '-*' (commandline -ct)" -a "(__orvela_options)"
complete -c orvela -l mode -x -a "(__orvela_names)"
complete -c orvela -l set -x -a "(__orvela_assignments settings)"
complete -c orvela -l final-touch -x -a "(__orvela_assignments final-touch)"
complete -c orvela -l preset -r -a "(orvela presets list 2>/dev/null)"
complete -c orvela -l chroma -x -a "full half"
complete -c orvela -l compression -x -a "none lzw deflate packbits zstd jpeg"
complete -c orvela -l names -x -a "modes settings final-touch"
