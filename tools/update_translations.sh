#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Brings the catalogues of Qt Linguist in line with the texts of the sources: new texts come in
# unfinished, texts that are gone go. With --check nothing is written and the texts that differ are told.
#
# lupdate reads calls with a context and plain literals. What the sources spell as phrase(u"..."),
# phrased(u"...") and phraseText(u"...") it is shown so, in a copy of the sources.

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/packages.sh

# The folders of the sources, and that of their catalogues.
Sets=(
    "include src" src/ui/qt/translations
    apps/pelloric apps/pelloric/translations
)

lupdate=$(command -v lupdate-qt6 || echo /usr/lib/qt6/bin/lupdate)
needTools "$lupdate" perl
isCheck=no
[ "${1:-}" != --check ] || isCheck=yes

copy=$(mktemp -d)
trap 'rm -rf "$copy"' EXIT

# copySources FOLDER...: the copy holds these folders with the calls that lupdate knows.
copySources() {
    cp -r --parents "$@" "$copy"
    find "$copy" \( -name '*.h' -o -name '*.cpp' \) -exec perl -0pi -e '
        s/\bphrase(?:d|Text)?\(\s*((?:u"(?:[^"\\]|\\.)*"\s*)+)/QT_TRANSLATE_NOOP("Phrase", $1)(/g;
        s/(?<!\w)u"/"/g' {} +
}

differ=no
for ((at = 0; at < ${#Sets[@]}; at += 2)); do
    read -r -a sources <<< "${Sets[at]}"
    copySources "${sources[@]}"
    for catalogue in "${Sets[at + 1]}"/*.ts; do
        target=$catalogue
        if [ "$isCheck" = yes ]; then
            target=$(mktemp --suffix=.ts)
            cp "$catalogue" "$target"
        fi
        "$lupdate" -silent -locations none -no-obsolete "${sources[@]/#/$copy/}" -ts "$target"
        if [ "$isCheck" = yes ]; then
            diff -u --label "$catalogue" --label "the sources" "$catalogue" "$target" || differ=yes
            rm -f "$target"
        fi
    done
done
[ "$differ" = no ] || fail "the catalogues lack texts of the sources: run tools/update_translations.sh"
