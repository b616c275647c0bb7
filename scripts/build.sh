# What ./run and ./test share: getting what is missing, and building. Sourced by both.
# shellcheck shell=bash

# Used by those who source this.
# shellcheck disable=SC2034
build=build/release

# ON where the sources are changed, and in continuous integration; see build_release.
warnings_as_errors=${PENWICK_WARNINGS_AS_ERRORS:-OFF}

log=build/log.txt

say() {
    printf '==> %s\n' "$*"
}

fail() {
    printf 'error: %s\n' "$*" >&2
    exit 1
}

# Runs a command that says much: what it said is shown only if it fails.
quietly() {
    "$@" >"$log" 2>&1 || {
        tail -n 60 "$log" >&2
        fail "this failed: $*"
    }
}

# Lines "package check" of the package list.
needed() {
    sed -e 's/[[:space:]]*#.*//' -e '/^[[:space:]]*$/d' scripts/packages.txt
}

is_debian() {
    [[ -r /etc/os-release ]] && command -v dpkg-query >/dev/null && (
        . /etc/os-release
        [[ ${ID:-} == debian ]]
    )
}

# Packages that the package manager does not know as installed.
missing_on_debian() {
    local installed package
    # dpkg-query complains about names that it does not know; those are the ones looked for.
    # shellcheck disable=SC2046
    installed=$(dpkg-query -W -f '${db:Status-Status} ${Package}\n' \
        $(needed | awk '{ print $1 }') 2>/dev/null || true)
    while read -r package _; do
        grep -qxF "installed $package" <<<"$installed" || printf '%s\n' "$package"
    done < <(needed) | paste -sd ' '
}

is_there() {
    local kind=${1%%:*} name=${1#*:}
    case $kind in
    command) command -v "$name" >/dev/null ;;
    pkg-config) pkg-config --exists "$name" 2>/dev/null ;;
    header) g++ -x c++ -fsyntax-only -include "$name" /dev/null 2>/dev/null ;;
    font) [[ -n $(fc-list "$name" 2>/dev/null) ]] ;;
    *) fail "scripts/packages.txt: unknown check '$1'" ;;
    esac
}

# What cannot be found, by its name in Debian.
missing_elsewhere() {
    local package check
    while read -r package check; do
        is_there "$check" || printf '%s\n' "$package"
    done < <(needed) | paste -sd ' '
}

# Sets as_root to what goes before a command that only root may run.
become_root() { # why that is necessary
    as_root=()
    ((EUID != 0)) || return 0
    command -v sudo >/dev/null || fail "$1, and there is neither root nor sudo"
    as_root=(sudo)
}

# By itself apt-get takes a network that is down for success.
refresh_package_lists() {
    quietly "${as_root[@]}" apt-get -o APT::Update::Error-Mode=any update
}

install_packages() {
    become_root "these packages are missing: $*"
    say "Installing $* (a minute or two)"
    refresh_package_lists
    quietly "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
        apt-get install -y --no-install-recommends "$@"
}

install_what_is_missing() {
    say "Looking for what is needed"
    local missing
    if ! is_debian; then
        missing=$(missing_elsewhere)
        [[ -z $missing ]] ||
            fail "not a Debian system; please install what Debian calls: $missing"
        return
    fi
    missing=$(missing_on_debian)
    # shellcheck disable=SC2086
    [[ -z $missing ]] || install_packages $missing
}

# Whether what was configured is what is asked for now: a change of the presets, or of the switch
# above, is nothing that the build itself would notice.
is_configured() {
    [[ -e $build/build.ninja && ! CMakePresets.json -nt $build/build.ninja ]] &&
        grep -qx "PENWICK_WARNINGS_AS_ERRORS:[A-Z]*=$warnings_as_errors" "$build/CMakeCache.txt"
}

# Builds the targets given, all of them if none is.
build_release() {
    if ! is_configured; then
        say "Configuring $build"
        quietly cmake --preset release "-DPENWICK_WARNINGS_AS_ERRORS=$warnings_as_errors"
        touch "$build/build.ninja"
    fi
    local first=''
    [[ -e $build/src/libpenwick.so ]] || first=' (several minutes the first time)'
    if (($#)); then
        say "Building the example host$first"
    else
        say "Building everything$first"
    fi
    cmake --build "$build" ${1:+--target "$@"} -- --quiet |
        sed '/^ninja: no work to do\.$/d'
}

# Two of them at a time must not build into the same folder.
prepare() {
    mkdir -p build
    (
        if command -v flock >/dev/null; then
            flock -n 9 || {
                say "Waiting for another build"
                flock 9
            }
        fi
        install_what_is_missing
        build_release "$@"
    ) 9>build/lock
}
