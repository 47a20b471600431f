# Functions for the scripts at the root: packages and builds, each only when something is missing.
# To be sourced with ROOT set to the repository.

# missing_packages [GROUP]: lists what of packages.txt, or of one of its groups, is not there yet.
missing_packages() {
    local package
    awk -v wanted="${1:+[$1]}" '/^[[:space:]]*(#|$)/ { next } /^\[/ { group = $1; next } group == wanted' \
        "$ROOT/packages.txt" |
        while read -r package; do
            [ "$(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null)" = installed ] || echo "$package"
        done
}

# apt_install PACKAGE...: installs them, as root or by sudo.
apt_install() {
    local as_root=()
    if [ "$(id -u)" -ne 0 ]; then
        if ! command -v sudo >/dev/null; then
            echo "These packages need root: apt-get install $*" >&2
            return 1
        fi
        as_root=(sudo)
    fi
    "${as_root[@]}" apt-get update -qq >&2 &&
        "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends "$@" >&2
}

# install_packages: installs what of packages.txt is not there yet, its groups left out.
install_packages() {
    local missing
    mapfile -t missing < <(missing_packages)
    [ ${#missing[@]} -gt 0 ] || return 0
    echo "Installing packages: ${missing[*]}" >&2
    apt_install "${missing[@]}"
}

# install_optional GROUP: the same for a group of packages.txt. Where that does not work, one line tells why.
install_optional() {
    local missing log=$ROOT/build/packages-$1.log
    mapfile -t missing < <(missing_packages "$1")
    [ ${#missing[@]} -gt 0 ] || return 0
    echo "Installing packages for [$1]: ${missing[*]}" >&2
    mkdir -p "$ROOT/build"
    apt_install "${missing[@]}" 2>"$log" && return
    echo "Packages of [$1] cannot be installed (${missing[*]}): $(grep -m 1 -E '^(E:|sudo:|These)' "$log" ||
        tail -n 1 "$log")" >&2
    return 1
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
