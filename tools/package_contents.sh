#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Holds the files of the Debian packages in a folder against packaging/contents, which names each as
# PACKAGE: PATH, with MULTIARCH for the folder of the processor and VERSION for that of the release:
#   package_contents.sh FOLDER [--write]
# With --write the list is written anew.

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
. tools/packages.sh
needTools dpkg-deb dpkg-architecture

List=packaging/contents
multiarch=$(dpkg-architecture -qDEB_HOST_MULTIARCH)
found=$(mktemp)
trap 'rm -f "$found"' EXIT

shopt -s nullglob
packages=("$1"/*.deb)
[ ${#packages[@]} -gt 0 ] || fail "no package in $1"
for package in "${packages[@]}"; do
    name=$(dpkg-deb -f "$package" Package)
    version=$(dpkg-deb -f "$package" Version)
    dpkg-deb --fsys-tarfile "$package" | tar -t | sed -n -e '/\/$/d' -e "s|^\.|$name: |p" |
        sed -e "s|$multiarch|MULTIARCH|" -e "s|\.so\.$version\$|.so.VERSION|"
done | LC_ALL=C sort > "$found"

if [ "${2:-}" = --write ]; then
    cp "$found" "$List"
else
    diff -u "$List" "$found" || fail "the packages hold other files than $List says; see $0"
fi
