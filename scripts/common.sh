# shellcheck shell=bash
# Shared by the commands in the root and by .ci/run, which source it with the project's root as current folder.

say() {
    printf '%s\n' "$*"
}

# fail MESSAGE [WHAT TO DO...]: says them on standard error, one a line, and ends the command.
fail() {
    printf '%s: error: %s\n' "${0##*/}" "$1" >&2
    shift
    if (($#)); then
        printf '%s\n' "$@" >&2
    fi
    exit 1
}

# The packages of the named lists in scripts/packages that are not installed, one a line.
missing_packages() {
    local list wanted installed
    wanted=$(for list in "$@"; do sed 's/[[:space:]]*#.*//; /^$/d' "scripts/packages/$list"; done | sort -u)
    # dpkg-query complains of every package that it has never heard of; those are the missing ones.
    # shellcheck disable=SC2016,SC2086
    installed=$({ dpkg-query -W -f '${db:Status-Status} ${Package}\n' $wanted 2>/dev/null || true; } |
        sed -n 's/^installed //p' | sort -u)
    comm -23 <(printf '%s\n' "$wanted") <(printf '%s\n' "$installed")
}

as_root() {
    if ((EUID == 0)); then
        "$@"
    else
        sudo "$@"
    fi
}

# install_missing LIST...: installs with apt what the named lists in scripts/packages name and the machine lacks.
install_missing() {
    local missing
    if ! command -v apt-get >/dev/null || ! command -v dpkg-query >/dev/null; then
        say "This machine has no apt. What has to be there is named in: ${*/#/scripts/packages/}"
        return
    fi
    mapfile -t missing < <(missing_packages "$@")
    if ((${#missing[@]} == 0)); then
        return
    fi
    say "Installing with apt: ${missing[*]}"
    if ((EUID != 0)) && ! command -v sudo >/dev/null; then
        fail "installing takes root's rights, and there is no sudo here." \
            "Run this once as root: apt-get install --no-install-recommends ${missing[*]}"
    fi
    if ! as_root apt-get -qq update; then
        say "apt could not refresh its lists of packages; going on with the lists that are there."
    fi
    as_root env DEBIAN_FRONTEND=noninteractive apt-get -q -y install --no-install-recommends "${missing[@]}" ||
        fail "apt could not install what is missing; its own words stand above." \
            "When that is mended, run ${0##*/} again."
}

# configure PRESET TESTS: configures build/PRESET once; TESTS is ON where the tests are to be built, else OFF.
# A folder that has the tests keeps them, so that commands which need none do not configure anew.
configure() {
    local preset=$1 tests=$2 cache="build/$1/CMakeCache.txt"
    if [[ -f build/$preset/build.ninja ]] && { [[ $tests == OFF ]] || grep -q '^KEST_TESTS:BOOL=ON$' "$cache"; }; then
        return
    fi
    say "Configuring build/$preset"
    cmake --preset "$preset" -DKEST_TESTS="$tests" --log-level=WARNING >/dev/null ||
        fail "build/$preset could not be configured; CMake's own words stand above."
}

# build PRESET [TARGET...]: builds what changed.
build() {
    local preset=$1
    shift
    cmake --build "build/$preset" ${1:+--target "$@"} ||
        fail "the build failed; the first error above says where."
}
