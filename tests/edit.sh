#!/bin/bash
# Photographs in the filter's windows, worked on by mouse and keys as a user does: edit.sh FOLDER SAMPLES, the folder
# with the program. Starts itself once more on a screen of its own.
set -euo pipefail
if [ "${3-}" != inside ]; then
    exec xvfb-run -a -s "-screen 0 1280x800x24" "$0" "$@" inside
fi
programs=$1 samples=$2
scratch=$(mktemp -d)
trap 'kill $(jobs -p) 2>/dev/null || :; rm -r "$scratch"' EXIT
export XDG_CONFIG_HOME=$scratch/config XDG_RUNTIME_DIR=$scratch/run TMP=$scratch LC_ALL=C.UTF-8
export QT_QPA_PLATFORM=xcb TMPDIR=$scratch/tmp
# A crash ends the process by its signal in a sanitized build, too.
export ASAN_OPTIONS=${ASAN_OPTIONS:+$ASAN_OPTIONS:}handle_segv=0
mkdir -m 700 "$XDG_RUNTIME_DIR" "$TMPDIR"
openbox --sm-disable 2>/dev/null &
cd "$scratch"
cp "$samples/coffee.png" a.png
cp a.png b.png
"$programs/orvela" enhance a.png -o automatic.png --quiet

fail() { import -window root "${ORVELA_SHOT:-$scratch/shot.png}"; echo "FAILED: $*" >&2; cat "$scratch/out" >&2; exit 1; }
expect() { [ "$2" = "$3" ] || fail "$1: \"$2\" instead of \"$3\""; }

# await COMMAND...: until it succeeds, for ten seconds.
await() {
    local tries=100
    until "$@" >/dev/null 2>&1; do
        ((--tries)) || fail "waited for: $*"
        sleep 0.1
    done
}
main_window() { xdotool search --onlyvisible --name '^Orvela 2$'; }
edit() { # in the background; its status is that of `wait $editing`
    "$programs/orvela" edit "$@" >"$scratch/out" 2>&1 &
    editing=$!
}
status() { local status=0; wait $editing || status=$?; echo $status >"$scratch/status"; }
ended() { status; expect "status of $1" "$(cat "$scratch/status")" "$2"; }
# The icon of Automatic in the narrow main window, the third from above.
click_automatic() {
    await main_window
    sleep 0.3
    xdotool mousemove --sync --window "$(main_window)" 17 95 click 1
}
# press KEY NAME: in the window of that name, as the keyboard does.
press() {
    local window
    await xdotool search --onlyvisible --name "$2"
    window=$(xdotool search --onlyvisible --name "$2" | tail -1)
    sleep 0.3
    xdotool windowfocus --sync "$window" key "$1"
}
windows_process() { pgrep -P "$editing" -x orvela-windows; }

# Automatic writes the picture that the command makes.
edit a.png -o out.png
click_automatic
ended "an accepted picture" 0
cmp out.png automatic.png || fail "the picture differs from the command's"
expect "what is told" "$(cat out)" "a.png -> out.png"

# Of two photographs the first is cancelled; the second goes on.
edit a.png b.png
press Escape '^Orvela 2$'
sleep 0.5
click_automatic
ended "a cancelled photograph" 6
expect "what is told" "$(cat out)" "a.png: left as it is
b.png -> b-enhanced.png"
cmp b-enhanced.png automatic.png || fail "the second picture differs"
[ ! -e a-enhanced.png ] || fail "a cancelled photograph was written"

# A crash of the windows loses nothing and is told; the log of it outlives that of the next photograph.
rm b-enhanced.png
edit a.png b.png
await main_window
crashed=$(windows_process)
kill -SEGV "$crashed"
await eval '! kill -0 $crashed'
click_automatic
ended "a crash" 1
[ "$(grep -c -- '-> DoStart' orvela-crash.log) $(grep -c -- '<- DoStart' orvela-crash.log)" = "1 0" ] || fail "the log is not that of the crash"
grep -q "a.png: the windows ended by signal Segmentation fault; please report it to .* with the log $scratch/orvela-crash.log; nothing was written" out || fail "the crash is not told"
cmp a.png "$samples/coffee.png" || fail "the photograph was touched"
[ ! -e a-enhanced.png ] || fail "something was written after a crash"

# Who ends the program ends the windows.
edit a.png
await main_window
windows=$(windows_process)
kill -TERM $editing
ended "a terminated program" 143
! kill -0 "$windows" 2>/dev/null || { sleep 1; ! kill -0 "$windows" 2>/dev/null || fail "the windows stay"; }

# The target's folder is full or gone when the user is done: the result is kept elsewhere.
mkdir gone
edit a.png -o gone/out.png
await main_window
rm -r gone
click_automatic
ended "a folder that went" 4
grep -qx "orvela: $TMPDIR/out.png" out || fail "where the result is, is not told"
cmp "$TMPDIR/out.png" automatic.png || fail "the kept result differs"

# From the desktop: told in a window, and a taken name gets a number.
edit --desktop b.png
click_automatic
press Return '^Orvela$'
ended "from the desktop" 0
cmp b-enhanced-2.png automatic.png || fail "the numbered result differs"
echo "no picture" >broken.jpg
edit --desktop broken.jpg
press Return '^Orvela$'
ended "a broken photograph" 1

# What the filter tells about itself; it ends with the program, and by itself.
edit --about
await xdotool search --onlyvisible --name 'Information'
kill -TERM $editing
ended "a terminated window" 143
edit --about
press Escape 'Information'
ended "about" 0
expect "files" "$(ls -A | grep -c part || :)" 0
