#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Includes go one way: a room of src includes only rooms before it, and Qt only below a folder qt;
# public headers include nothing of src.

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

# In the order of their dependencies.
Rooms=(platform settings document grids tables report view export print controls ui script host)

found=0

# forbid PATTERN WHY PATH...: reports the lines of the files that match.
forbid() {
    local pattern=$1 why=$2
    shift 2
    if git grep -nE "$pattern" -- "$@"; then
        printf '%s\n' "^^ $why" >&2
        found=1
    fi
}

forbid '^#include <Q' 'Qt is included only below folders named qt' 'src/*.h' 'src/*.cpp' \
    ':!src/*/qt/*'
forbid '^#include "[a-z_]+/qt/' 'the core includes nothing of the Qt side' 'src/*.h' 'src/*.cpp' \
    ':!src/*/qt/*'

forbid '^#include "' 'a public header includes nothing of src' 'include/*.h'
forbid '^#include <pelloric/(export|grids|kestrane|pelloric|preview|printing|report|sorvane)\.h' \
    'the core includes no public header of the Qt side' 'src/*.h' 'src/*.cpp' ':!src/*/qt/*'

for i in "${!Rooms[@]}"; do
    later=("${Rooms[@]:i+1}")
    [ ${#later[@]} -gt 0 ] || continue
    pattern=$(IFS='|'; printf '%s' "${later[*]}")
    forbid "^#include \"($pattern)/" "${Rooms[i]} includes a room that comes after it" \
        "src/${Rooms[i]}/*.h" "src/${Rooms[i]}/*.cpp"
done
exit "$found"
