# shellcheck shell=bash disable=SC2034
# What the scripts share. Sourced, not run: it changes to the project's root.

self=$(realpath "$0")
startedIn=$PWD
root=$(dirname "$(dirname "$(realpath "${BASH_SOURCE[0]}")")")
cd "$root" || exit
jobs=$(nproc)
buildPackages=(cmake ninja-build g++ libgtest-dev libbenchmark-dev libpng-dev libcli11-dev)
testPackages=(abigail-tools dpkg-dev file make mandoc pkgconf) # what tests of the installed library run

fail() {
    printf '%s: %s\n' "${0##*/}" "$*" >&2
    exit 1
}

# Prints the comment at the head of the running script.
help() {
    sed -n '2,/^[^#]/s/^# \{0,1\}//p' "$self"
}

installed() {
    dpkg-query -W -f '${db:Status-Status}\n' "$1" 2>/dev/null | grep -qx installed
}

# Installs those of the packages that are missing. Where there is no dpkg, the build itself tells what it misses.
needPackages() {
    command -v dpkg-query >/dev/null || return 0
    local package missing=() asRoot=() log
    for package; do
        installed "$package" || missing+=("$package")
    done
    if ((${#missing[@]} == 0)); then return; fi
    if ((EUID != 0)); then
        command -v sudo >/dev/null || fail "packages are missing; as root: apt-get install ${missing[*]}"
        asRoot=(sudo)
    fi
    echo "Installing ${missing[*]}"
    log=$(mktemp)
    local apt=("${asRoot[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -y -o DPkg::Lock::Timeout=300)
    if ! { "${apt[@]}" update && "${apt[@]}" install --no-install-recommends "${missing[@]}"; } &>"$log" </dev/null; then
        cat "$log" >&2
        rm "$log"
        fail "could not install ${missing[*]}"
    fi
    rm "$log"
}

# build PRESET [TARGET...]
build() {
    local preset=$1
    shift
    cmake --preset "$preset"
    cmake --build --preset "$preset" --parallel "$jobs" ${1:+--target "$@"}
}

# Sanitizers want parts of the address space that a kernel with much address randomisation does not leave free. Starts
# the script once more where it does: withFixedAddresses "$@".
withFixedAddresses() {
    if [[ -z ${PYXCC_FIXED_ADDRESSES:-} ]] && setarch -R true 2>/dev/null; then
        PYXCC_FIXED_ADDRESSES=1 exec setarch -R "$self" "$@"
    fi
}
