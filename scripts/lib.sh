# What the scripts share. Sourced, never run; needs bash with `set -euo pipefail`.
# shellcheck shell=bash disable=SC2034

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
script="scripts/$(basename "$0")"
jobs=$(nproc)

readonly build_packages=(g++ cmake ninja-build)
readonly clang_packages=(clang-14 libclang-rt-14-dev "${build_packages[@]}")
readonly test_packages=(libgtest-dev)

# Scripts talk on standard error: standard output belongs to what they run.
say() {
    printf '%s: %s\n' "$script" "$*" >&2
}

die() {
    say "$*"
    exit 1
}

is_installed() {
    [[ $(dpkg-query -W -f='${db:Status-Status}' "$1" 2>/dev/null) == installed ]]
}

apt() {
    local -a sudo=()
    if ((EUID != 0)); then
        command -v sudo >/dev/null || die "not root, and there is no sudo: install $* by hand"
        sudo=(sudo)
    fi
    "${sudo[@]}" env DEBIAN_FRONTEND=noninteractive \
        apt-get -qq -o DPkg::Lock::Timeout=300 "$@" </dev/null >&2
}

# ensure_packages NAME...: installs those Debian packages that are missing.
ensure_packages() {
    local -a missing=()
    local name
    for name in "$@"; do
        is_installed "$name" || missing+=("$name")
    done
    ((${#missing[@]})) || return 0
    command -v apt-get >/dev/null || die "needs a Debian machine, or these packages: ${missing[*]}"
    say "installing ${missing[*]}"
    if ! apt install --simulate --no-install-recommends "${missing[@]}" &>/dev/null; then
        apt update || die "the package lists cannot be refreshed"
    fi
    apt install -y --no-install-recommends "${missing[@]}" || die "cannot install ${missing[*]}"
}

# quietly COMMAND...: runs a command whose output matters only if it fails.
quietly() {
    local output
    output=$("$@" 2>&1 </dev/null) || {
        printf '%s\n' "$output" >&2
        return 1
    }
}

# configure PRESET [CMAKE WORDS...]: brings the folder of the preset in line with it.
configure() {
    quietly cmake -S "$root" --preset "$@" || die "cannot configure the preset $1"
}

# build PRESET [TARGET...]: builds what is out of date in build/PRESET. Quiet if nothing is. A preset
# that builds in the folder of another one (fuzz in asan's, bench in test's) goes by its name here.
build() {
    local preset=$1
    shift
    local -a words=(--build "$root/build/$preset" -j "$jobs")
    (($#)) && words+=(--target "$@")
    local plan
    plan=$(cmake "${words[@]}" -- -n 2>&1) || {
        printf '%s\n' "$plan" >&2
        return 1
    }
    [[ $plan == *"no work to do"* ]] && return
    say "building ${*:-everything} (preset $preset)"
    if [[ -t 2 ]]; then
        cmake "${words[@]}" >&2
    else
        cmake "${words[@]}" -- --quiet >&2
    fi
}
