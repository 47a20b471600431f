#!/bin/bash
# Installs into a scratch prefix, uses what is there, and removes it: installation.sh CMAKE SOURCE BUILD
set -euo pipefail
cmake=$1 source=$2 build=$3
scratch=$(mktemp -d)
export HOME=$scratch XDG_CONFIG_HOME=$scratch/config

# The build folder keeps the record of an installation that its owner made.
keep() { for file in install_manifest.txt install_folders.txt; do [ ! -e "$1/$file" ] || mv "$1/$file" "$2"; done; }
keep "$build" "$scratch"
finish() { rm -f "$build"/install_{manifest,folders}.txt && keep "$scratch" "$build" && rm -r "$scratch"; }
trap finish EXIT

fail() { echo "FAILED: $*" >&2 && exit 1; }
expect() { [ "$2" = "$3" ] || fail "$1: \"$2\" instead of \"$3\""; }

prefix=$scratch/prefix
mkdir -p "$prefix/share/man" && echo mine >"$prefix/share/mine"
find "$prefix" | sort >"$scratch/before"
"$cmake" --install "$build" --prefix "$prefix" >"$scratch/log"
"$cmake" --install "$build" --prefix "$prefix" >"$scratch/log" # once more: as it was
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
for command in "" enhance modes presets "presets list" "presets export" "presets import" "presets remove"; do
    orvela $command --help
done | grep -oE -- '(^|[ ,])--?[a-z][a-z-]*' | tr -d ' ,' | sort -u >"$scratch/in_help"
sed 's/\\-/-/g; s/\\f[IR]//g' "$page" | grep -E '^\.(B|BR) +"?-' | grep -oE -- '(^|[ ,"])--?[a-z][a-z-]*' |
    tr -d ' ,"' | sort -u >"$scratch/in_manual"
diff "$scratch/in_help" "$scratch/in_manual" || fail "options of the help (<) and of the manual (>)"
expect "the manual's version" "$(head -1 "$page" | grep -oE 'Orvela [0-9.]+')" "Orvela $(orvela --version | cut -d' ' -f2)"
if command -v groff >/dev/null; then
    expect "warnings of the manual" "$(groff -man -ww -z "$page" 2>&1)" ""
fi

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
expect "commands" "$(completed orvela en)" "enhance"
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
if command -v zsh >/dev/null; then zsh -n "$share/zsh/site-functions/_orvela"; fi
if command -v fish >/dev/null; then
    complete() { fish -c 'source $argv[1]; complete -C $argv[2]' "$share/fish/vendor_completions.d/orvela.fish" "$1" | cut -f1 | xargs; }
    expect "modes in fish" "$(complete 'orvela enhance --mode Portrait')" "Portrait PortraitPro"
    expect "final touch in fish" "$(complete 'orvela enhance --final-touch AbsContrast=3,AbsB')" "AbsContrast=3,AbsBrightness="
    expect "options in fish" "$(complete 'orvela enhance --qua')" "--quality"
fi
cd /

# Removing leaves what was there, also what somebody else put into a folder of it meanwhile.
echo mine >"$share/orvela/samples/mine"
"$cmake" --build "$build" --target uninstall >"$scratch/log"
expect "what is left" "$(find "$share/orvela" -type f)" "$share/orvela/samples/mine"
rm -r "$share/orvela"
find "$prefix" | sort | diff "$scratch/before" - || fail "the prefix before (<) and after (>)"
"$cmake" --build "$build" --target uninstall >"$scratch/log" 2>&1 && fail "nothing was there to remove"
grep -q "Nothing was installed" "$scratch/log" || fail "$(cat "$scratch/log")"

# A package is made below DESTDIR, whatever the prefix.
DESTDIR=$scratch/package "$cmake" --install "$build" --prefix /usr >"$scratch/log"
test -x "$scratch/package/usr/bin/orvela" || fail "DESTDIR does not count"
DESTDIR=$scratch/package "$cmake" --build "$build" --target uninstall >"$scratch/log"
test ! -e "$scratch/package" || fail "$(find "$scratch/package")"
