#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# The larger example leaves its orders as a PDF file with totals at the end, without a display.

set -euo pipefail
command -v pdftotext > /dev/null || {
    echo "pdftotext is needed" >&2
    exit 1
}
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
export QT_QPA_PLATFORM=offscreen XDG_CONFIG_HOME=$folder

"$1" --pdf "$folder/orders.pdf"
pdftotext -layout "$folder/orders.pdf" "$folder/orders.txt"
grep -q '1000 .*2025-01-01 .*Copper wire .* 1 .* 12.50' "$folder/orders.txt"
grep -q '1119 ' "$folder/orders.txt"
# 120 orders of 1 + 7n mod 40 pieces: three rounds of 1 to 40.
grep -q ' 2460  *30750' "$folder/orders.txt" || {
    tail -n 8 "$folder/orders.txt" >&2
    exit 1
}
"$1" --picture "$folder/orders.png"
[ -s "$folder/orders.png" ]
