#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Checks of the sources and of sanitizer builds: all, or those named as arguments.
#
#   tools/check.sh [format] [layers] [spelling] [licences] [scripts] [translations] [tidy] [asan] [fuzz]
#       [windows]
#
# CHECK_FUZZ_SECONDS (60) is how long each fuzzer runs; with 0 they are only built.

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/packages.sh

AllChecks=(format layers spelling licences scripts translations tidy asan fuzz windows)

cxxFiles() {
    git ls-files -z -- '*.cpp' '*.h'
}

checkFormat() {
    needTools clang-format-14
    cxxFiles | xargs -0 -r clang-format-14 --dry-run -Werror
}

checkLayers() {
    tools/check_layers.sh
}

checkSpelling() {
    needTools codespell
    git ls-files -z | xargs -0 -r codespell
}

checkLicences() {
    needTools reuse
    reuse lint > build/reuse.log 2>&1 || {
        cat build/reuse.log >&2
        return 1
    }
    tail -n 1 build/reuse.log
}

checkScripts() {
    needTools shellcheck
    git ls-files -z -- '*.sh' run .ci/run | xargs -0 -r shellcheck -x
}

checkTranslations() {
    tools/update_translations.sh --check
}

# Reads the compile commands of the preset asan, whose compiler is of the analyser's own version: it
# takes the headers that were compiled for it.
checkTidy() {
    needPackages build test bench
    needTools clang-tidy-14 python3
    configureAndBuild asan > build/tidy-build.log 2>&1 || {
        cat build/tidy-build.log >&2
        return 1
    }
    tools/tidy.py build/asan
}

checkAsan() {
    needPackages build test bench
    needTools ctest
    configureAndBuild asan
    ctest --preset asan
}

checkFuzz() {
    needTools clang++-14
    configureAndBuild fuzz
    local seconds=${CHECK_FUZZ_SECONDS:-60} program name
    [ "$seconds" -gt 0 ] || return 0
    for program in build/fuzz/fuzz/fuzz_*; do
        if [ ! -f "$program" ] || [ ! -x "$program" ]; then
            continue
        fi
        name=${program##*/fuzz_}
        local corpus=("build/fuzz/corpus/$name")
        mkdir -p "${corpus[0]}"
        [ ! -d "fuzz/corpus/$name" ] || corpus+=("fuzz/corpus/$name")
        local words=()
        [ ! -f "fuzz/dictionaries/$name.dict" ] || words=("-dict=fuzz/dictionaries/$name.dict")
        printf -- '-- %s\n' "$name"
        QT_QPA_PLATFORM=offscreen "$program" -max_total_time="$seconds" -timeout=10 \
            -rss_limit_mb=2048 -artifact_prefix="build/fuzz/$name-" -print_final_stats=1 \
            "${words[@]}" "${corpus[@]}"
    done
}

# The core and its tests, compiled for Windows and run by wine.
checkWindows() {
    needPackages build windows
    PATH=$PATH:/usr/lib/wine # where Debian puts wine64
    needTools x86_64-w64-mingw32-g++-posix wine64 wineserver ctest
    export WINEPREFIX=$PWD/build/wine WINEDEBUG=-all
    configureAndBuild windows
    # One server for all tests: one that ends with its last program is sometimes met on its way out.
    mkdir -p "$WINEPREFIX"
    wineserver -p
    # Its services outlive the program that they start with, and would hold what that one writes to.
    wine64 wineboot --init > /dev/null 2>&1 < /dev/null
    local result=0
    ctest --preset windows || result=1
    wineserver -k || true
    return "$result"
}

for check in "$@"; do
    [[ " ${AllChecks[*]} " = *" $check "* ]] || fail "no check '$check'; there are: ${AllChecks[*]}"
done
[ $# -gt 0 ] || set -- "${AllChecks[@]}"
needPackages build test check
needTools git
mkdir -p build

failed=()
for check in "$@"; do
    printf '== %s\n' "$check"
    start=$SECONDS
    # In a subshell outside any condition, so that its first failing command ends it.
    set +e
    (
        set -e
        "check${check^}"
    )
    result=$?
    set -e
    if [ "$result" -eq 0 ]; then
        printf '== %s: good (%d s)\n' "$check" $((SECONDS - start))
    else
        printf '== %s: FAILED (%d s)\n' "$check" $((SECONDS - start))
        failed+=("$check")
    fi
done
[ ${#failed[@]} -eq 0 ] || fail "failed: ${failed[*]}"
