#!/bin/bash
# Installs into a scratch prefix, uses what is there, and removes it: installation.sh CMAKE SOURCE BUILD
set -euo pipefail
cmake=$1 source=$2 build=$3
scratch=$(mktemp -d)
export HOME=$scratch XDG_CONFIG_HOME=$scratch/config

trap 'rm -r "$scratch"' EXIT

fail() { echo "FAILED: $*" >&2 && exit 1; }
expect() { [ "$2" = "$3" ] || fail "$1: \"$2\" instead of \"$3\""; }

for shell in bash zsh fish; do command -v $shell >/dev/null || fail "$shell is missing; packages.txt lists what tests need"; done

# The build folder keeps the record of its owner's installation: what is done here is recorded in a copy of its scripts.
records=$scratch/records
(cd "$build" && find . -name cmake_install.cmake -exec cp --parents -t "$(mkdir -p "$records" && echo "$records")" {} +)
find "$records" -type f -exec sed -i -E "s#\"$build/(.*cmake_install.cmake|\\$\{CMAKE_INSTALL_MANIFEST\})\"#\"$records/\1\"#" {} +
owned() { stat -c '%n %Y %i' "$build"/install_*.txt 2>/dev/null || :; }
before=$(owned)
install_to() { "$cmake" --install "$records" --prefix "$1" >"$scratch/log"; }
uninstalling=$(ninja -C "$build" -t commands uninstall | tail -n 1)
[[ $uninstalling == "cd $build && "* ]] || fail "uninstalling goes by \"$uninstalling\""
uninstall() { sh -c "cd '$records' && ${uninstalling#*&& }" >"$scratch/log" 2>&1; }

prefix=$scratch/prefix
mkdir -p "$prefix/share/man" && echo mine >"$prefix/share/mine"
find "$prefix" | sort >"$scratch/before"
install_to "$prefix"
install_to "$prefix" # once more: as it was
export PATH=$prefix/bin:$PATH
share=$prefix/share

# The command works on the installed sample, whose licence lies beside it.
orvela enhance "$share/orvela/samples/coffee.png" -o "$scratch/out.png" --quiet
cmp -s "$scratch/out.png" "$share/orvela/samples/coffee.png" && fail "the sample was not enhanced"
for file in coffee.png rocket.jpg; do
    grep -q "^| $file .*\(CC0\|public domain\)" "$share/orvela/samples/README.md" || fail "no licence of $file"
done
grep -q "GNU GENERAL PUBLIC LICENSE" "$share"/doc/*/LICENSE || fail "no licence of the program"

# The manual has every option of the help, and no other.
page=$share/man/man1/orvela.1
for command in "" enhance edit modes presets "presets list" "presets export" "presets import" "presets remove"; do
    orvela $command --help
done | grep -oE -- '(^|[ ,])--?[a-z][a-z-]*' | tr -d ' ,' | sort -u >"$scratch/in_help"
sed 's/\\-/-/g; s/\\f[IR]//g' "$page" | grep -E '^\.(B|BR) +"?-' | grep -oE -- '(^|[ ,"])--?[a-z][a-z-]*' |
    tr -d ' ,"' | sort -u >"$scratch/in_manual"
diff "$scratch/in_help" "$scratch/in_manual" || fail "options of the help (<) and of the manual (>)"
expect "the manual's version" "$(head -1 "$page" | grep -oE 'Orvela [0-9.]+')" "Orvela $(orvela --version | cut -d' ' -f2)"
if command -v groff >/dev/null; then
    expect "warnings of the manual" "$(groff -man -ww -z "$page" 2>&1)" ""
fi

# The desktop finds the program and its description, and the windows are where it looks for them.
entry=$share/applications/example.kestrand.Orvela.desktop
expect "complaints of the desktop entry" "$(desktop-file-validate "$entry")" ""
appstreamcli validate --no-net "$share/metainfo/example.kestrand.Orvela.metainfo.xml" >"$scratch/log" || fail "$(cat "$scratch/log")"
for type in $(sed -n 's/^MimeType=//p' "$entry" | tr ';' ' '); do
    grep -qr "type=\"$type\"" /usr/share/mime/packages || fail "no file has the type $type"
done
mkdir -p "$scratch/edit" && printf '[2000]\nGUI\\batchModeEnabled=true\nGUI\\batchMode=0\n' >"$scratch/edit.conf"
mkdir -p "$XDG_CONFIG_HOME/Kestrand" && cp "$scratch/edit.conf" "$XDG_CONFIG_HOME/Kestrand/Orvela.conf"
QT_QPA_PLATFORM=offscreen TMP=$scratch orvela edit "$share/orvela/samples/coffee.png" -o "$scratch/edited.png" --quiet
cmp "$scratch/edited.png" "$scratch/out.png" || fail "the windows give another picture than the command"
rm "$XDG_CONFIG_HOME/Kestrand/Orvela.conf"

# Icons have the sizes of their folders, and show something.
for size in 16 24 32 48 64 128 256; do
    expect "icon" "$(identify -format '%wx%h' "$share/icons/hicolor/${size}x$size/apps/orvela.png")" "${size}x$size"
done
colors=$(identify -format %k "$share/icons/hicolor/16x16/apps/orvela.png")
[ "$colors" -gt 16 ] || fail "the smallest icon has $colors colours"
cmp "$share/icons/hicolor/scalable/apps/orvela.svg" "$source/src/GUI/artwork/logo_eye.svg"

# completed WORD...: what bash offers for the last word.
completed() {
    bash --norc -c '. "$0" 2>/dev/null; compopt() { :; }; COMP_WORDS=("$@") COMP_CWORD=$(($# - 1))
        _orvela orvela "${@: -1}" "${@: -2:1}"; echo "${COMPREPLY[*]}"' \
        "$share/bash-completion/completions/orvela" "$@"
}
expect "commands" "$(completed orvela e)" "enhance edit"
expect "actions" "$(completed orvela presets '')" "list export import remove"
expect "options" "$(completed orvela enhance --ch)" "--chroma"
expect "options of an action" "$(completed orvela presets export --f)" "--force"
expect "modes" "$(completed orvela enhance --mode Port)" "Portrait PortraitPro"
expect "settings" "$(completed orvela enhance --set SaturationV)" "SaturationValue="
expect "final touch" "$(completed orvela enhance --final-touch AbsContrast = 3,AbsB)" "3,AbsBrightness="
cd "$share/orvela/samples"
expect "files" "$(completed orvela enhance cof)" "coffee.png"

# What stands in the scripts is what the program takes. taken OPTION COMMAND...: the values that a refusal lists.
taken() { { orvela "${@:2}" "$1" '?' 2>&1 || :; } | sed 's/.*{\(.*\)}.*/\1/; s/,/ /g'; }
# listed COMMAND...: its subcommands.
listed() { orvela "$@" --help | sed '1,/^Subcommands:/d' | awk '{ print $1 }' | xargs; }
scripts=("$share/bash-completion/completions/orvela" "$share/zsh/site-functions/_orvela" "$share/fish/vendor_completions.d/orvela.fish")
for values in "$(taken --chroma enhance none.png)" "$(taken --compression enhance none.png)" "$(taken --names modes)" "$(listed)" "$(listed presets)"; do
    for script in "${scripts[@]}"; do
        tr '\n' ' ' <"$script" | sed 's/\\n/ /g' | grep -q "[^a-z]$values[^a-z]" || fail "$script lacks \"$values\""
    done
done

# Real shells complete a typed line. complete_in_SHELL LINE: the words it has then, or what is offered.
zsh -n "$share/zsh/site-functions/_orvela"
mkdir "$scratch/typing" && cd "$scratch/typing"
typed() { printf '%s\t\001printf "%%s|" \005 >out' "$1"; } # completes, goes to the start of the line and to its end
complete_in_bash() {
    printf '. "%s"\n%s\nexit\n' "$share/bash-completion/completions/orvela" "$(typed "orvela $1")" |
        TERM=xterm bash --norc -i >"$scratch/log" 2>&1
    cut -d'|' -f2- out
}
complete_in_zsh() {
    zsh -f -c 'zmodload zsh/zpty && zpty shell zsh -f -i
        zpty -w shell "fpath=($1 \$fpath); autoload -Uz compinit; compinit -u -D; bindkey -e; PS1=READY; echo LOADED"
        zpty -r shell output $'\''*\nLOADED*READY*'\''
        zpty -w -n shell "$2"$'\''\rexit\r'\''
        zpty -r shell output "*NEVER*" || :' zsh "$share/zsh/site-functions" "$(typed "orvela $1")" >"$scratch/log" 2>&1
    cut -d'|' -f2- out
}
complete_in_fish() { fish -c 'source $argv[1]; complete -C $argv[2]' "$share/fish/vendor_completions.d/orvela.fish" "orvela $1" | cut -f1 | paste -sd'|'; }

orvela enhance --mode Saturation --value 5 --save-preset "$scratch/look.json"
for name in 'My Look' '$(touch PWNED)'; do orvela presets import "$scratch/look.json" "$name"; done
orvela presets import --mode Adjustments "$scratch/look.json" Mine
for shell in bash zsh; do
    complete=complete_in_$shell
    expect "blank in $shell" "$($complete 'presets remove My')" "presets|remove|My Look|"
    expect "blank in a quoted word in $shell" "$($complete 'enhance --preset "My L')" "enhance|--preset|My Look|"
    expect "shell code in $shell" "$($complete 'presets export \$')" 'presets|export|$(touch PWNED)|'
    expect "quoted shell code in $shell" "$($complete 'presets export "\$')" 'presets|export|$(touch PWNED)|'
    expect "mode behind = in $shell" "$($complete 'enhance --mode=PortraitP')" "enhance|--mode=PortraitPro|"
    expect "preset of a mode in $shell" "$($complete 'presets remove --mode Adjustments M')" "presets|remove|--mode|Adjustments|Mine|"
    expect "preset of a mode for enhance in $shell" "$($complete 'enhance --mode=Adjustments --preset=M')" \
        "enhance|--mode=Adjustments|--preset=Mine|"
    expect "preset for a mode without in $shell" "$($complete 'enhance --mode Macro --preset M')" "enhance|--mode|Macro|--preset|My Look|"
    expect "final touch has presets in $shell" "$($complete 'presets list --mode FinalT')" "presets|list|--mode|FinalTouch|"
    expect "final touch is no mode in $shell" "$($complete 'enhance --mode FinalT')" "enhance|--mode|FinalT|"
    rm out
done
expect "modes in fish" "$(complete_in_fish 'enhance --mode Portrait')" "Portrait|PortraitPro"
expect "mode behind = in fish" "$(complete_in_fish 'enhance --mode=PortraitP')" "--mode=PortraitPro"
expect "final touch in fish" "$(complete_in_fish 'enhance --final-touch AbsContrast=3,AbsB')" "AbsContrast=3,AbsBrightness="
expect "options in fish" "$(complete_in_fish 'enhance --qua')" "--quality"
expect "presets in fish" "$(complete_in_fish 'presets remove ')" '$(touch PWNED)|My Look'
expect "preset of a mode in fish" "$(complete_in_fish 'presets remove --mode Adjustments ')" "Mine"
expect "preset of a mode for enhance in fish" "$(complete_in_fish 'enhance --mode=Adjustments --preset=')" "--preset=Mine"
expect "preset for a mode without in fish" "$(complete_in_fish 'enhance --mode Macro --preset ')" '$(touch PWNED)|My Look'
expect "final touch has presets in fish" "$(complete_in_fish 'presets list --mode FinalT')" "FinalTouch"
expect "final touch is no mode in fish" "$(complete_in_fish 'enhance --mode FinalT')" ""
expect "what completing ran" "$(ls)" ""
cd /

# Removing leaves what was there, also what somebody else put into a folder of it meanwhile.
echo mine >"$share/orvela/samples/mine"
uninstall || fail "$(cat "$scratch/log")"
expect "what is left" "$(find "$share/orvela" -type f)" "$share/orvela/samples/mine"
rm -r "$share/orvela"
find "$prefix" | sort | diff "$scratch/before" - || fail "the prefix before (<) and after (>)"
uninstall && fail "nothing was there to remove"
grep -q "Nothing was installed" "$scratch/log" || fail "$(cat "$scratch/log")"

# Brackets in a path and what looks like a refusal of CMake are names like others.
for odd in "$scratch/[odd" "$scratch/[a-c]" "$scratch/a-NOTFOUND"; do
    install_to "$odd"
    echo mine >"$odd/share/orvela/samples/mine-NOTFOUND"
    uninstall || fail "$(cat "$scratch/log")"
    expect "what is left" "$(find "$odd" -type f)" "$odd/share/orvela/samples/mine-NOTFOUND"
done

# A package is made below DESTDIR, whatever the prefix; removing it needs no DESTDIR and leaves the prefix itself alone.
mkdir -p "$scratch/system/bin" && echo mine >"$scratch/system/bin/orvela"
for package in "$scratch/package" package; do
    (cd "$scratch" && DESTDIR=$package install_to "$scratch/system")
    test -x "$scratch/package$scratch/system/bin/orvela" || fail "DESTDIR does not count"
    uninstall || fail "$(cat "$scratch/log")"
    test ! -e "$scratch/package" || fail "$(find "$scratch/package")"
    expect "the system's file" "$(cat "$scratch/system/bin/orvela")" "mine"
done
expect "the owner's record" "$(owned)" "$before"
