# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT
# shellcheck shell=bash
# The lists are read by the names of their groups.
# shellcheck disable=SC2034

# The Debian packages the project needs, by what they are for, and what installs those that are
# missing. Read by other scripts; does nothing by itself.

# Compiles the libraries, the program and the tests. The fonts are what pages are drawn with.
PackagesBuild=(
    ccache
    cmake
    fonts-arphic-uming
    fonts-dejavu-core
    g++
    libcups2-dev
    libdeflate-dev
    libfontconfig-dev
    libgmock-dev
    libgtest-dev
    libharfbuzz-dev
    libpng-dev
    libqt6sql6-sqlite
    libuchardet-dev
    libzip-dev
    ninja-build
    nlohmann-json3-dev
    qt6-base-dev
    qt6-declarative-dev
    qt6-l10n-tools
    qt6-svg-dev
    qt6-tools-dev
)

# What tests start or read: a window server and its helpers, a print scheduler, readers of PDF.
PackagesTest=(
    cups-client
    cups-daemon
    fish
    fontconfig
    ghostscript
    imagemagick
    librsvg2-bin
    mupdf-tools
    openbox
    pkgconf
    poppler-utils
    python3
    python3-pikepdf
    qpdf
    sqlite3
    strace
    x11-apps
    x11-utils
    xauth
    xdotool
    xvfb
    zsh
)

# Measures.
PackagesBench=(
    libbenchmark-dev
)

# Judges the sources: format, mistakes, spelling, licences, and the compiler of the fuzzers.
PackagesCheck=(
    clang-14
    clang-format-14
    clang-tidy-14
    codespell
    git
    libclang-rt-14-dev
    llvm-14
    reuse
    shellcheck
)

# Makes the site of the guides and the reference.
PackagesDocs=(
    doxygen
)

# Compiles the core for Windows and runs its tests; GoogleTest is compiled from its sources.
PackagesWindows=(
    g++-mingw-w64-x86-64-posix
    googletest
    wine64
)

# Makes and judges the Debian packages.
PackagesPackage=(
    desktop-file-utils
    dpkg-dev
    file
    lintian
)

# fail TEXT: ends the script with one line on standard error.
fail() {
    printf '%s: %s\n' "${0##*/}" "$1" >&2
    exit 1
}

# needTools NAME...: ends the script unless each program is there, naming those that are not.
needTools() {
    local tool missing=()
    for tool in "$@"; do
        command -v "$tool" > /dev/null 2>&1 || missing+=("$tool")
    done
    [ ${#missing[@]} -eq 0 ] || fail "not found: ${missing[*]}"
}

# asRoot COMMAND...: runs it as root, through sudo where this is another user.
asRoot() {
    if [ "$(id -u)" -eq 0 ]; then
        "$@"
    elif command -v sudo > /dev/null 2>&1; then
        sudo -- "$@"
    else
        fail "packages are missing and there is no sudo; as root run: $*"
    fi
}

# How long to wait for another package manager, and between two tries: seconds.
LongestLock=${LongestLock:-900}
LockPause=${LockPause:-5}

# aptGet ARGUMENT...: runs apt-get as root; while another package manager is at work, waits for it.
aptGet() {
    local errors status end=$((SECONDS + LongestLock)) told=no
    errors=$(mktemp)
    while :; do
        status=0
        asRoot env LC_ALL=C DEBIAN_FRONTEND=noninteractive apt-get "$@" 2> "$errors" || status=$?
        if [ "$status" -eq 0 ] || [ "$SECONDS" -ge "$end" ] ||
            ! grep -q 'Could not get lock\|Unable to lock\|Unable to acquire' "$errors"; then
            break
        fi
        [ "$told" = yes ] || printf 'Another package manager is at work; waiting for it.\n' >&2
        told=yes
        sleep "$LockPause"
    done
    cat "$errors" >&2
    rm -f "$errors"
    return "$status"
}

# needPackages GROUP...: installs what is missing of the groups: build, test, bench, check, docs,
# windows, package.
needPackages() {
    local group list package missing=()
    for group in "$@"; do
        list="Packages${group^}[@]"
        for package in "${!list}"; do
            [ "$(dpkg-query -W -f='${db:Status-Status}' "$package" 2> /dev/null)" = installed ] ||
                missing+=("$package")
        done
    done
    [ ${#missing[@]} -gt 0 ] || return 0
    command -v apt-get > /dev/null 2>&1 ||
        fail "no apt-get here; install these Debian packages or their like: ${missing[*]}"
    printf 'Installing: %s\n' "${missing[*]}"
    aptGet update -q || fail "apt-get update failed; is the network there?"
    aptGet install -q -y --no-install-recommends "${missing[@]}" ||
        fail "apt-get could not install: ${missing[*]}"
}

# configureAndBuild PRESET [TARGET...]: configures the preset and builds it, or only the targets.
configureAndBuild() {
    local preset=$1
    shift
    needTools cmake ninja
    # The presets dev and core compile the same files with the same flags in different folders.
    export CCACHE_NOHASHDIR=1
    cmake --preset "$preset" || fail "configuring the preset $preset failed"
    cmake --build --preset "$preset" --parallel "$(nproc)" ${1:+--target "$@"} ||
        fail "building the preset $preset failed"
}
