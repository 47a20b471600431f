#!/bin/bash
# The plug-in in GIMP without a display, against `orvela enhance`: headless.sh FOLDER SAMPLES, the folder with the
# programs. GIMP is started twice; its exit status tells nothing.
set -euo pipefail
programs=$1 samples=$2 here=$(dirname "$(readlink -f "$0")")
skip() { echo "Skipped: $*" && exit 77; }
command -v gimp >/dev/null || skip "gimp is not installed"
[ -x "$programs/orvela-gimp" ] || skip "orvela-gimp is not built; install libgimp2.0-dev and configure anew"
scratch=$(mktemp -d)
trap 'rm -r "$scratch"' EXIT
export HOME=$scratch GIMP2_DIRECTORY=$scratch/profile XDG_CONFIG_HOME=$scratch/config TMPDIR=$scratch LC_ALL=C.UTF-8
unset DISPLAY WAYLAND_DISPLAY QT_QPA_PLATFORM
mkdir -p "$GIMP2_DIRECTORY/plug-ins/orvela-gimp" "$XDG_CONFIG_HOME"
ln -s "$programs/orvela-gimp" "$GIMP2_DIRECTORY/plug-ins/orvela-gimp/"
cd "$scratch"

failures=0
fail() { echo "FAILED: $*" >&2 && failures=$((failures + 1)); }
gimp_runs() {
    timeout 120 gimp -i -d -f -c --batch-interpreter=plug-in-script-fu-eval -b "(load \"$here/$1\")" -b '(gimp-quit 0)' \
        >"$1.log" 2>&1 || fail "GIMP ended by itself"
    grep -q "^batch command executed successfully" "$1.log" || { cat "$1.log" >&2 && fail "GIMP did not run $1"; }
}
# same A B [MOST]: pictures of one size whose samples differ by at most MOST of 65535.
same() {
    local difference
    difference=$(compare -metric PAE "$1" "$2" null: 2>&1) || :
    awk -v text="$difference" -v most="${3-0}" 'BEGIN { exit !(text ~ /^[0-9]/ && text + 0 <= most) }' ||
        fail "$1 and $2 differ by $difference of 65535"
}
differ() { ! compare -metric AE "$1" "$2" null: 2>/dev/null || fail "$1 is $2"; }
enhance() { "$programs/orvela" enhance --quiet "$@" || fail "orvela enhance $*"; }

# Pictures of every kind.
small=(-resize '160x120!' -strip)
fade=('(' -size 160x120 gradient: ')' -alpha off -compose CopyOpacity -composite)
convert "$samples/coffee.png" "${small[@]}" -depth 8 PNG24:rgb8.png
convert "$samples/coffee.png" "${small[@]}" "${fade[@]}" -depth 8 PNG32:rgba8.png
convert "$samples/coffee.png" "${small[@]}" -depth 16 PNG48:rgb16.png
convert "$samples/coffee.png" "${small[@]}" "${fade[@]}" -depth 16 PNG64:rgba16.png
for depth in 8 16; do
    convert rgb16.png -colorspace gray -depth $depth -define png:color-type=0 grey$depth.png
done
convert rgba16.png -colorspace gray -depth 8 -define png:color-type=4 greya8.png
convert rgba16.png -colorspace gray -depth 16 greya16.tif
convert rgb16.png -depth 16 rgb16.tif
convert rgb8.png -depth 8 rgb8.tif
enhance --set SaturationValue=300,on --save-preset look.json

gimp_runs enhance.scm
grep -q "^done$" answers.txt || fail "enhance.scm ended early: $(tail -3 answers.txt)"

# file PRECISION OPTION...: what GIMP read it as, and that it was enhanced as the command does.
file() {
    grep -q "^$1 $2$" answers.txt || fail "$1 has precision $(grep "^$1" answers.txt)"
    enhance "$1" "${@:3}" -o "want-$1"
    same "got-$1" "want-$1"
    differ "got-$1" "$1"
}
file rgb8.png 150
file rgba8.png 150 --mode Portrait
file grey8.png 150
file greya8.png 150
file rgb16.tif 250 --mode LandscapePro
file rgba16.png 250 --set SaturationValue=700,on
file grey16.png 250
file greya16.tif 250
file rgb8.tif 150 --preset look.json

# Inside the selection what the command makes of that part alone, outside as it was.
answer() { [ "$(grep "^$1" answers.txt)" = "$1 $2" ] || fail "\"$(grep "^$1" answers.txt)\" instead of \"$1 $2\""; }
answer rectangle "(1 40 30 70 50)"
enhance in-rectangle.png -o enhanced-rectangle.png
convert rgb8.png enhanced-rectangle.png -geometry +40+30 -composite PNG24:want-rectangle.png
same got-rectangle.png want-rectangle.png

# Layers, masks and channels.
same got-layer.png want-rgba8.png
answer offsets "(50 -20)"
answer "selected part of the layer" "(1 0 30 30 50)"
convert rgba8.png -crop 30x50+0+30 +repage PNG32:part.png
enhance part.png -o enhanced-part.png
convert rgba8.png enhanced-part.png -geometry +0+30 -compose Copy -composite PNG32:want-layer-part.png
same got-layer-part.png want-layer-part.png
answer "mask changed" "#t"
same got-masked.png rgb8.png
convert rgb8.png -channel G -separate -define png:color-type=0 green.png
enhance green.png -o want-channel.png
same got-channel.png want-channel.png

# refused NAME TEXT: that it was, and why.
refused() {
    grep -F "refused $1: " answers.txt | grep -qF "$2" || fail "$1: \"$(grep "refused $1:" answers.txt)\" instead of \"$2\""
}
refused mode 'unknown mode "Potrait"; did you mean Portrait'
refused setting "SaturationValue \"1001\": a number from 0 to 1000"
refused "setting without a value" 'NAME=VALUE is needed'
refused "nothing on" "nothing would change; give settings"
refused preset "nonsuch.json: there is neither such a file nor such a preset"
refused "damaged preset" "answers.txt: is no"
refused "last values" "nothing to repeat: nothing was accepted"
refused windows "there is no display for windows"
refused locked '"Background" is locked'
refused group "is a group of layers"
refused indexed '"Background" has indexed colours; choose Image > Mode > RGB'
refused "nothing selected" 'the selection leaves nothing of "rgba8.png"'
refused wide '"wide": is over 32767 pixels wide or high'
! grep CHANGED answers.txt >&2 || fail "a refused image changed"

# Other precisions hold what 16 bits hold, rounded by GIMP.
for precision in 100 200 350 550 600 750; do
    enhance in-$precision.png -o enhanced-$precision.png
done
enhance in-soft.png -o enhanced-soft.png
gimp_runs blend.scm
for precision in 100 200 350 550 600 750; do
    same got-$precision.png want-$precision.png 1
done
# One step of 8 bits: here and there one blends with rounded samples, the other before.
same got-soft.png want-soft.png 257
differ got-soft.png rgb8.png

if grep -E "CRITICAL|crashed|Segmentation|fatal" ./*.log >&2; then fail "GIMP complains"; fi
[ $failures -eq 0 ] && echo "All as orvela enhance has it"
