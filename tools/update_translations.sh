#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Brings the catalogues of Qt Linguist in line with the texts of the sources: new texts come in
# unfinished, texts that are gone go. With --check nothing is written and the texts that differ are told.

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/packages.sh

# The folders of the sources, and that of their catalogues.
Sets=(
    "include src" src/ui/qt/translations
    apps/pelloric apps/pelloric/translations
)

lupdate=$(command -v lupdate-qt6 || echo /usr/lib/qt6/bin/lupdate)
needTools "$lupdate"
isCheck=no
[ "${1:-}" != --check ] || isCheck=yes

differ=no
for ((at = 0; at < ${#Sets[@]}; at += 2)); do
    read -r -a sources <<< "${Sets[at]}"
    for catalogue in "${Sets[at + 1]}"/*.ts; do
        target=$catalogue
        if [ "$isCheck" = yes ]; then
            target=$(mktemp --suffix=.ts)
            cp "$catalogue" "$target"
        fi
        "$lupdate" -silent -locations none -no-obsolete "${sources[@]}" -ts "$target"
        if [ "$isCheck" = yes ]; then
            diff -u --label "$catalogue" --label "the sources" "$catalogue" "$target" || differ=yes
            rm -f "$target"
        fi
    done
done
[ "$differ" = no ] || fail "the catalogues lack texts of the sources: run tools/update_translations.sh"
