# Functions for the scripts at the root: packages and builds, each only when something is missing.
# To be sourced with ROOT set to the repository.

# install_packages: installs what of packages.txt is not there yet.
install_packages() {
    local wanted missing=() package as_root=()
    mapfile -t wanted < <(grep -Ev '^[[:space:]]*(#|$)' "$ROOT/packages.txt")
    for package in "${wanted[@]}"; do
        [ "$(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null)" = installed ] || missing+=("$package")
    done
    [ ${#missing[@]} -gt 0 ] || return 0
    echo "Installing packages: ${missing[*]}" >&2
    if [ "$(id -u)" -ne 0 ]; then
        if ! command -v sudo >/dev/null; then
            echo "These packages need root: apt-get install ${missing[*]}" >&2
            return 1
        fi
        as_root=(sudo)
    fi
    "${as_root[@]}" apt-get update -qq >&2 &&
        "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends \
            "${missing[@]}" >&2
}

# build PRESET [TARGET...]: configures when that has not been done with these presets, and builds what is not up to date.
build() {
    local preset=$1 folder=$ROOT/build/$1 log=$ROOT/build/$1.log
    shift
    mkdir -p "$ROOT/build"
    if [ ! "$folder/build.ninja" -nt "$ROOT/CMakePresets.json" ]; then
        echo "Building Orvela ($preset); the first time takes some minutes" >&2
        (cd "$ROOT" && cmake --preset "$preset") >"$log" 2>&1 || { cat "$log" >&2; return 1; }
    fi
    (cd "$ROOT" && cmake --build --preset "$preset" ${1:+--target "$@"}) >"$log" 2>&1 ||
        { grep -vE '^\[[0-9]+/' "$log" | tail -n 60 >&2; echo "The build failed; see $log" >&2; return 1; }
}
