#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Builds and runs a project that uses this one, the way hosts do.
#
#   consumer_test.sh KIND BUILD SOURCE WORK DEFAULT
#
# KIND: static, shared: the libraries as they are installed; moved: an installed prefix that was
# moved; core: without Qt; pkg-config: both kinds without CMake; subdirectory: the sources as a
# part of the host. BUILD is a build folder of this project that gives hosts the kind DEFAULT, WORK is
# emptied first.

set -euo pipefail
kind=$1 build=$2 source=$3 work=$4 default=$5
here=$source/tests/consumer
export QT_QPA_PLATFORM=offscreen LC_ALL=C.UTF-8

fail() {
    printf '%s\n' "$1" >&2
    exit 1
}

for tool in cmake ninja c++ nm pkg-config; do
    command -v "$tool" > /dev/null || fail "not found: $tool"
done
rm -rf "$work"
mkdir -p "$work"

# What was compiled once is not compiled again.
launcher=$(command -v ccache || true)

# install KIND PREFIX: lays down the libraries of a kind and what hosts are built with.
install() {
    local component components=("$1")
    [ "$1" != "$default" ] || components=(runtime development)
    for component in "${components[@]}"; do
        cmake --install "$build" --prefix "$2" --component "$component" >> "$work/install.log"
    done
}

# onlyPublicNames LIBRARY...: fails for a function of the library that public headers do not export, and
# for every name that is not the library's.
onlyPublicNames() {
    local public='pelloric::(version\(\)|RunTimeError|qt::('
    public+='Kestrane|Sorvane|MemoryGrid|Report::|export(Pdf|Png|Svg|Ostl)\(|print(ers|Pages)\(|'
    public+='usePreviewWindow|setPreviewSettings|setSettingsFolder|openInPreview|previewCanvas|'
    public+='installTranslation\(|dataGrid|csvGrid|sqliteGrid|letScriptsCall|gridFor|useScriptCaller))'
    if nm -DC --defined-only "$@" | grep -E '^[0-9a-f]+ T pelloric::' | grep -vE "^[0-9a-f]+ T $public"; then
        fail "these names are exported, and no host is to use them"
    fi
    if nm -DC --defined-only "$@" | grep -E '^[0-9a-f]+ [A-Za-z] ' | grep -v 'pelloric::'; then
        fail "these names are exported, and are not of this library"
    fi
}

# buildAndRun FOLDER OPTION...: configures, builds and runs the host of a folder.
buildAndRun() {
    local folder=$1
    shift
    cmake -S "$here/$folder" -B "$work/build" -G Ninja -DCMAKE_CXX_FLAGS=-O0 -DCMAKE_CXX_COMPILER_LAUNCHER="$launcher" "$@" > "$work/configure.log" ||
        { cat "$work/configure.log"; fail "the host cannot be configured"; }
    cmake --build "$work/build" > "$work/build.log" || { cat "$work/build.log"; fail "the host cannot be built"; }
    "$work/build/consumer"
}

case "$kind" in
    static)
        install static "$work/prefix"
        buildAndRun host -DCMAKE_PREFIX_PATH="$work/prefix" -DEVERY_HEADER=ON
        cmake --build "$work/build" --target alone > "$work/alone.log" ||
            { cat "$work/alone.log"; fail "a header does not compile alone"; }
        ;;
    shared)
        install shared "$work/prefix"
        grep -q '^CMAKE_BUILD_TYPE:.*=Debug$' "$build/CMakeCache.txt" || # which hides nothing
            onlyPublicNames "$(dirname "$(find "$work/prefix" -name libpelloric.so)")"/libpelloric*.so
        buildAndRun host -DCMAKE_PREFIX_PATH="$work/prefix"
        ;;
    moved)
        install shared "$work/first"
        mv "$work/first" "$work/second"
        grep -rIl "$work/first" "$work/second" && fail "the prefix is written down in these files"
        buildAndRun host -DCMAKE_PREFIX_PATH="$work/second"
        ;;
    core)
        for one in static shared; do
            install "$one" "$work/$one"
            buildAndRun core -DCMAKE_PREFIX_PATH="$work/$one" -DCMAKE_DISABLE_FIND_PACKAGE_Qt6=ON
            rm -r "$work/build"
        done
        ;;
    pkg-config)
        for one in static shared; do
            install "$one" "$work/$one"
            PKG_CONFIG_PATH=$(dirname "$(find "$work/$one" -name pelloric-core.pc)")
            export PKG_CONFIG_PATH
            libraries=$(dirname "$PKG_CONFIG_PATH")
            read -ra flags <<< "$(pkg-config --cflags --libs pelloric-script pelloric-tables pelloric-widgets)"
            ${launcher:+"$launcher"} c++ -std=c++20 -O0 -fPIC -I"$here/host" "$here/host/main.cpp" "${flags[@]}" \
                -Wl,-rpath,"$libraries" -o "$work/$one-consumer"
            "$work/$one-consumer"
        done
        ;;
    subdirectory)
        cmake -S "$here/host" -B "$work/build" -G Ninja -DPELLORIC_SOURCE="$source" \
            -DCMAKE_CXX_FLAGS=-O0 -DCMAKE_CXX_COMPILER_LAUNCHER="$launcher" > "$work/configure.log" || { cat "$work/configure.log"; fail "cannot be configured"; }
        cmake --build "$work/build" --target alone > "$work/build.log" ||
            { cat "$work/build.log"; fail "cannot be built"; }
        ;;
    *) fail "no kind '$kind'" ;;
esac
