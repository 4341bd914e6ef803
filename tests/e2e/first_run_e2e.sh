#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Starts the example on an account that has no settings, and on one whose settings file is junk:
#   first_run_e2e.sh EXAMPLE FOLDER
# A real click on its button must show pages, and no message box. Screenshots stay in the folder.

set -euo pipefail

# shellcheck source-path=SCRIPTDIR
source "$(dirname "${BASH_SOURCE[0]}")/window_server.sh"

Example=$1
Folder=$2
startDisplay "$Folder"

# clickPreview NAME [VARIABLE=VALUE...]: clicks the button, waits for a page with text, and looks for
# boxes.
clickPreview() {
    mkdir -p "$Home"
    env HOME="$Home" "${@:2}" "$Example" > "$Folder/$1.log" 2>&1 &
    Host=$!
    Processes+=("$Host")
    toWindowOf "$Host" '^Stock list$'
    eval "$(xdotool getwindowgeometry --shell "$Window" | grep -E '^(WIDTH|HEIGHT)=')"
    xdotool mousemove --window "$Window" $((WIDTH / 2)) $((HEIGHT - 20))
    sleep 0.2
    xdotool click 1
    toWindowOf "$Host" '^Print Preview $'
    waitForInk "$Window" "$Folder/$1.png" 100000 2000
    [ "$(windowsOf "$Host" '.' | wc -l)" -eq 2 ] || fail "$1: there are other windows: $(windowsOf "$Host" '.')"
    kill "$Host"
    wait "$Host" 2> /dev/null || true
}

# needSilence NAME: the example has said nothing.
needSilence() {
    [ ! -s "$Folder/$1.log" ] || fail "$1: the example said: $(head -n 1 "$Folder/$1.log")"
}

Settings=.config/pelloric/OstlConfig.ini

Home=$Folder/fresh
clickPreview fresh
needSilence fresh
[ "$(grep -c '= ' "$Home/$Settings")" -eq 42 ] || fail "fresh: not all settings are there"
grep -q '^HeaderCenter= Stock list' "$Home/$Settings" || fail "fresh: the header was not stored"
[ "$(grep -c '\[Page #' "$Home/$Settings")" -eq 1 ] || fail "fresh: the page number is not printed once"

Home=$Folder/junk
mkdir -p "$(dirname "$Home/$Settings")"
printf '"\r\n"\r\n' > "$Home/$Settings"
clickPreview junk
needSilence junk
[ "$(grep -c '= ' "$Home/$Settings")" -eq 42 ] || fail "junk: not all settings are there"
[ "$(wc -c < "$Home/$Settings.bak")" -eq 6 ] || fail "junk: the old file was not kept"

# Where numbers have commas, the settings that are deployed are read as they are written.
Home=$Folder/german
clickPreview german LC_ALL=de_DE.UTF-8
needSilence german
cmp -s "$Folder/fresh/$Settings" "$Home/$Settings" || fail "german: the settings are others"
[ "$(compare -metric AE "$Folder/fresh.png" "$Folder/german.png" null: 2>&1)" -lt 2000 ] ||
    fail "german: the page is another one"

# Without a single font the window opens with hollow boxes, and the log says why.
mkdir "$Folder/no-fonts"
printf '<?xml version="1.0"?><fontconfig><dir>%s</dir></fontconfig>\n' "$Folder/no-fonts" \
    > "$Folder/no-fonts/fonts.conf"
Home=$Folder/bare
clickPreview bare FONTCONFIG_FILE="$Folder/no-fonts/fonts.conf"
grep -q 'no font is installed' "$Folder/bare.log" || fail "bare: nobody says that there is no font"

printf 'first_run_e2e: pages on the first click, with no box\n'
