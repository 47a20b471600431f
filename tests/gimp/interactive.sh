#!/bin/bash
# The plug-in in GIMP on a screen of its own, driven by keys and mouse as a user does: interactive.sh FOLDER SAMPLES, the
# folder with the programs. Starts itself once more on that screen. What GIMP has is asked through its own server.
set -euo pipefail
skip() { echo "Skipped: $*" && exit 77; }
command -v gimp >/dev/null || skip "gimp is not installed"
[ -x "$1/orvela-gimp" ] || skip "orvela-gimp is not built; install libgimp2.0-dev and configure anew"
if [ "${3-}" != inside ]; then
    exec xvfb-run -a -s "-screen 0 1280x1000x24" "$0" "$@" inside
fi
programs=$1 samples=$2
scratch=$(mktemp -d)
trap 'kill $(jobs -p) 2>/dev/null || :; wait; rm -r "$scratch"' EXIT
export HOME=$scratch GIMP2_DIRECTORY=$scratch/profile XDG_CONFIG_HOME=$scratch/config XDG_RUNTIME_DIR=$scratch/run
export TMPDIR=$scratch/tmp TMP=$scratch LC_ALL=C.UTF-8
unset QT_QPA_PLATFORM WAYLAND_DISPLAY
mkdir -m 700 "$XDG_RUNTIME_DIR" "$TMPDIR"
mkdir -p "$GIMP2_DIRECTORY"/{brushes,dynamics,patterns,gradients,palettes,fonts,tool-presets,tmp,plug-ins/orvela-gimp}
ln -s "$programs/orvela-gimp" "$GIMP2_DIRECTORY/plug-ins/orvela-gimp/"
cd "$scratch"
cp "$samples/coffee.png" .
"$programs/orvela" enhance coffee.png -o automatic.png --quiet
openbox --sm-disable 2>/dev/null &

shoot() { import -window root "${ORVELA_SHOTS:-$scratch}/$1.png"; }
fail() { shoot failed; [ -z "${ORVELA_SHOTS-}" ] || cp now.png automatic.png "$ORVELA_SHOTS"; echo "FAILED: $*" >&2; grep -v Gtk-WARNING log >&2; exit 1; }
# await COMMAND...: until it succeeds, for thirty seconds.
await() {
    local tries=150
    until "$@" >/dev/null 2>&1; do
        ((--tries)) || fail "waited for: $*"
        sleep 0.2
    done
}
port=$((20000 + RANDOM % 20000))
# scheme TEXT: has GIMP evaluate it, as its server's protocol has it.
scheme() {
    python3 - $port "$1" <<'EOF'
import socket, struct, sys
with socket.create_connection(("127.0.0.1", int(sys.argv[1])), 5) as server:
    text = sys.argv[2].encode()
    server.sendall(b"G" + struct.pack(">H", len(text)) + text)
    answer = server.makefile("rb")
    _, failed, length = struct.unpack(">cBH", answer.read(4))
    print(answer.read(length).decode())
    sys.exit(failed)
EOF
}
save() {
    rm -f "$1"
    scheme "(let* ((image (vector-ref (cadr (gimp-image-list)) 0)) (layer (car (gimp-image-get-active-layer image))))
        (file-png-save-defaults RUN-NONINTERACTIVE image layer \"$scratch/$1\" \"$1\"))" >/dev/null || fail "saving $1"
}
# has NAME PICTURE: whether GIMP's picture is that one.
has() { save now.png && [ "$(compare -metric AE now.png "$2" null: 2>&1)" = 0 ] || fail "$1: the picture is not $2"; }
gimp_window() { xdotool search --onlyvisible --name 'coffee.*GIMP'; }
press() { xdotool windowfocus --sync "$(gimp_window | tail -1)" key "$@" && sleep 0.7; }
windows_process() { pgrep -P "$(pgrep -P $gimp -x orvela-gimp)" -x orvela-windows; }
main_window() { xdotool search --onlyvisible --name '^Orvela 2$'; }
plug_in_ended() { ! pgrep -P $gimp -x orvela-gimp && [[ $(ps -o state= -p "$windows") = Z* || ! -e /proc/$windows ]]; }
# Filters > Kestrand > Orvela… by their letters.
open_windows() {
    press alt+r
    xdotool key k && sleep 0.7
    shoot menu
    xdotool key o
    await main_window
    windows=$(windows_process)
    sleep 0.5
    shoot windows
}

gimp -n -s -d -f --batch-interpreter=plug-in-script-fu-eval \
    -b "(plug-in-script-fu-server RUN-NONINTERACTIVE \"127.0.0.1\" $port \"$scratch/server.log\")" coffee.png >log 2>&1 &
gimp=$!
await gimp_window
await scheme "(gimp-image-list)"

# Automatic, the icon that is the third from above, makes what the command makes; one step of undo takes it back.
open_windows
xdotool mousemove --sync --window "$(main_window)" 17 95 click 1
await plug_in_ended
has "Automatic in the windows" automatic.png
shoot enhanced
press ctrl+z
has "undo" coffee.png

# Repeat Last does the same without windows.
press ctrl+f
await plug_in_ended
has "the last filter once more" automatic.png
press ctrl+z
has "undo of the last filter" coffee.png

# Whoever closes the windows leaves the picture alone.
open_windows
xdotool windowfocus --sync "$(main_window)" key Escape
await plug_in_ended
has "cancelled windows" coffee.png
[ "$(gimp_window | wc -l)" = 1 ] || fail "something was told of cancelling"

# Windows that crash are told.
open_windows
kill -SEGV "$windows"
await plug_in_ended
await xdotool search --onlyvisible --name 'GIMP Message'
shoot crashed
xdotool windowfocus --sync "$(xdotool search --onlyvisible --name 'GIMP Message' | tail -1)" key Escape
has "crashed windows" coffee.png
# Cancel in the status bar, at the lower right of the picture.
open_windows
xdotool mousemove --sync --window "$(gimp_window | tail -1)" 786 751 click 1
await plug_in_ended
has "a run that GIMP cancelled" coffee.png
shoot cancelled
if grep -E "CRITICAL|Segmentation|fatal" log >&2; then fail "GIMP complains"; fi
echo "All as a user expects"
