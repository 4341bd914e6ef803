#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Builds the site below out/docs: the guides, with pictures that the built programs make of
# themselves, and the reference of the headers that hosts use. A warning of Doxygen is an error.
#
#   tools/docs.sh PROGRAMS
#
# PROGRAMS is the folder of a build that holds the program and the examples.

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/packages.sh

Build=$1
Out=out/docs
Pictures=$Out/pictures

# The first page of a table as a picture: pagePicture NAME TABLE [OPTION...]
pagePicture() {
    local name=$1 table=$2
    shift 2
    "$Build/apps/pelloric/pelloric" export "$table" -o "$Pictures/$name.png" --quiet --pages 1 --dpi 80 "$@"
}

makePictures() {
    export QT_QPA_PLATFORM=offscreen
    XDG_CONFIG_HOME=$(mktemp -d)
    export XDG_CONFIG_HOME
    "$Build/apps/pelloric/pelloric" demo --walk "$Pictures" > "$Out/walk.log"
    pagePicture wine_page samples/wine.csv --title Wines --landscape
    pagePicture fitted samples/wine.csv --title Wines --fit
    "$Build/examples/pelloric_orders" --picture "$Pictures/orders.png"
    rm -rf "$XDG_CONFIG_HOME"
}

# Doxygen does not miss a picture that is not there.
requirePictures() {
    local page picture
    for page in "$Out"/html/*.html; do
        while read -r picture; do
            [ -f "$Out/html/$picture" ] || fail "${page##*/} shows $picture, which is not there"
        done < <(sed -n 's/.*<img src="\([^"]*\)".*/\1/p' "$page")
    done
}

needTools doxygen
rm -rf "$Out"
mkdir -p "$Pictures"
makePictures
version=$(sed -n 's/^project(Pelloric VERSION \([0-9.]*\).*/\1/p' CMakeLists.txt)
sed -e "s|@VERSION@|$version|" -e "s|@SOURCE@|$PWD|g" -e "s|@OUT@|$PWD/$Out|" \
    -e "s|@PICTURES@|$PWD/$Pictures|" -e "s|@HEADERS@|$PWD/include/pelloric|" docs/Doxyfile.in > "$Out/Doxyfile"
doxygen "$Out/Doxyfile"
requirePictures
printf 'The site: %s\n' "$PWD/$Out/html/index.html"
