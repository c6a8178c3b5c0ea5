# Functions and variables shared by the scripts. Source it in bash with `set -euo pipefail`.
# shellcheck shell=bash disable=SC2034

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
script_file=$(readlink -f "$0")
script=scripts/$(basename "$script_file")
jobs=$(nproc)

readonly build_packages=(g++ cmake ninja-build)
readonly clang_packages=(clang-14 libclang-rt-14-dev "${build_packages[@]}")
readonly test_packages=(libgtest-dev)

# Messages go to standard error; standard output belongs to the program that a script runs.
say() {
    printf '%s: %s\n' "$script" "$*" >&2
}

die() {
    say "$*"
    exit 1
}

# Prints the comment at the top of the script.
usage() {
    sed -n '1d; /^#/!q; s/^# \{0,1\}//p' "$script_file"
}

# handle_help "$@": prints the usage and ends if the first argument asks for it.
handle_help() {
    [[ ${1-} == --help || ${1-} == -h ]] || return 0
    usage
    exit 0
}

usage_error() {
    say "$*"
    usage >&2
    exit 2
}

# Without dpkg, a package counts as installed if its command is; CMake looks for the libraries.
is_installed() {
    if command -v dpkg-query >/dev/null; then
        [[ $(dpkg-query -W -f='${db:Status-Status}' "$1" 2>/dev/null) == installed ]]
    else
        [[ $1 == *-dev ]] || command -v "${1%-build}" >/dev/null
    fi
}

# may_install PACKAGE...: whether installing is allowed and possible. Asks before sudo is used, or, where nobody
# can be asked, uses it only if it needs no password.
may_install() {
    [[ ${KEYPROBE_NO_INSTALL:-0} == 0 ]] && command -v apt-get >/dev/null || return 1
    ((EUID != 0)) || return 0
    command -v sudo >/dev/null || return 1
    if [[ -t 0 && -t 2 ]]; then
        local reply
        read -rp "$script: install $* with sudo? [y/N] " reply || echo >&2
        [[ $reply == [yY]* ]]
    else
        sudo -n true &>/dev/null
    fi
}

apt() {
    local -a sudo=()
    ((EUID == 0)) || sudo=(sudo)
    "${sudo[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -qq -o DPkg::Lock::Timeout=300 "$@" </dev/null
}

# The package lists may be absent, or so old that they name files that are gone.
install_packages() {
    apt install -y --no-install-recommends "$@" && return
    apt update && apt install -y --no-install-recommends "$@"
}

# ensure_packages NAME...: installs the Debian packages that are missing. If it must not or cannot, it
# says what to install, and ends.
ensure_packages() {
    local -a missing=()
    local name log=build/install.log
    for name in "$@"; do
        is_installed "$name" || missing+=("$name")
    done
    ((${#missing[@]})) || return 0
    if ! may_install "${missing[@]}"; then
        say "missing packages: ${missing[*]}"
        command -v apt-get >/dev/null || die "this is not a Debian machine; install what these Debian packages contain"
        die "install them, as root, with: apt-get install ${missing[*]}"
    fi
    { mkdir -p "$root/build" && : >"$root/$log"; } || die "cannot write $log"
    say "installing ${missing[*]}"
    install_packages "${missing[@]}" &>"$root/$log" && return
    say "cannot install ${missing[*]}; the end of $log:"
    tail -n 5 "$root/$log" >&2
    exit 1
}

# quietly COMMAND...: runs a command and shows its output only if it fails.
quietly() {
    local output
    output=$("$@" 2>&1 </dev/null) || {
        printf '%s\n' "$output" >&2
        return 1
    }
}

# configure PRESET [CMAKE ARGUMENT...]: configures the build folder of the preset.
configure() {
    quietly cmake -S "$root" --preset "$@" || die "cannot configure the preset $1"
}

# build PRESET [TARGET...]: builds what is out of date in build/PRESET; prints nothing if everything is
# up to date. For a preset that shares another's folder (fuzz: asan, bench: test), pass that other one.
build() {
    local preset=$1
    shift
    local -a arguments=(--build "$root/build/$preset" -j "$jobs")
    (($#)) && arguments+=(--target "$@")
    local plan
    plan=$(cmake "${arguments[@]}" -- -n 2>&1) || {
        printf '%s\n' "$plan" >&2
        return 1
    }
    [[ $plan == *"no work to do"* ]] && return
    say "building ${*:-everything} (preset $preset)"
    if [[ -t 2 ]]; then
        cmake "${arguments[@]}" >&2
    else
        cmake "${arguments[@]}" -- --quiet >&2
    fi
}
