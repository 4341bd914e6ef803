#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Starts the example on an account that has no settings, and on one whose settings file is junk:
#   first_run_e2e.sh EXAMPLE FOLDER
# A real click on its button must show pages, and no message box. Screenshots stay in the folder.

set -euo pipefail

Example=$1
Folder=$2
Patience=400 # looks, 50 ms apart, before a step has failed

fail() {
    printf 'first_run_e2e: %s\n' "$1" >&2
    exit 1
}

# needTool PROGRAM PACKAGE
needTool() {
    command -v "$1" > /dev/null 2>&1 || fail "$1 is missing; install the Debian package $2"
}

needTool Xvfb xvfb
needTool openbox openbox
needTool xdotool xdotool
needTool import imagemagick
needTool xprop x11-utils

rm -rf "$Folder"
mkdir -p "$Folder"
mkdir -m 700 "$Folder/run"
Processes=()

# Only what this script started is ended, by its number.
finish() {
    local process
    for process in "${Processes[@]}"; do
        kill "$process" 2> /dev/null || true
    done
    wait 2> /dev/null || true
}
trap finish EXIT

Xvfb -displayfd 3 -screen 0 1400x1000x24 -nolisten tcp 3> "$Folder/display" 2> "$Folder/server.log" &
Processes+=($!)
for ((look = 0; look < Patience; look++)); do
    [ ! -s "$Folder/display" ] || break
    sleep 0.05
done
[ -s "$Folder/display" ] || fail "the window server did not start"
DISPLAY=:$(cat "$Folder/display")
export DISPLAY
export XDG_RUNTIME_DIR=$Folder/run QT_QPA_PLATFORM=xcb LC_ALL=C.UTF-8
unset QT_SCALE_FACTOR QT_FONT_DPI WAYLAND_DISPLAY XDG_CONFIG_HOME XDG_DATA_HOME

openbox --sm-disable > "$Folder/openbox.log" 2>&1 &
Processes+=($!)
for ((look = 0; look < Patience; look++)); do
    ! xprop -root _NET_SUPPORTING_WM_CHECK 2> /dev/null | grep -q 'window id' || break
    sleep 0.05
done

# windowsNamed NAME: the visible windows of the example with that name, one a line.
windowsNamed() {
    xdotool search --all --onlyvisible --pid "$Host" --name "$1" 2> /dev/null || true
}

# toWindow NAME: waits for the window and makes it the active one.
toWindow() {
    local look
    for ((look = 0; look < Patience; look++)); do
        kill -0 "$Host" 2> /dev/null || fail "the example has ended; waited for the window $1"
        Window=$(windowsNamed "$1" | head -n 1)
        [ -z "$Window" ] || break
        sleep 0.05
    done
    [ -n "$Window" ] || fail "no window named $1"
    timeout 20 xdotool windowactivate --sync "$Window" || fail "the window $1 does not come up"
}

# inkOf PICTURE: how many pixels of it are white, and how many are nearly black.
inkOf() {
    White=$(convert "$1" -fill black +opaque white -fill white -opaque white -format '%[fx:round(mean*w*h)]' info:)
    Black=$(convert "$1" -colorspace Gray -threshold 25% -negate -format '%[fx:round(mean*w*h)]' info:)
}

# clickPreview NAME: clicks the button, waits for a page with text, and looks for boxes.
clickPreview() {
    local look
    mkdir -p "$Home"
    HOME=$Home "$Example" > "$Folder/$1.log" 2>&1 &
    Host=$!
    Processes+=("$Host")
    toWindow '^Stock list$'
    eval "$(xdotool getwindowgeometry --shell "$Window" | grep -E '^(WIDTH|HEIGHT)=')"
    xdotool mousemove --window "$Window" $((WIDTH / 2)) $((HEIGHT - 20))
    sleep 0.2
    xdotool click 1
    toWindow '^Print Preview $'
    for ((look = 0; look < Patience; look++)); do
        import -window "$Window" "$Folder/$1.png"
        inkOf "$Folder/$1.png"
        [ "$White" -lt 100000 ] || [ "$Black" -lt 2000 ] || break
        sleep 0.05
    done
    [ "$White" -ge 100000 ] || fail "$1: no page is seen: $White white pixels"
    [ "$Black" -ge 2000 ] || fail "$1: the page is empty: $Black black pixels"
    [ "$(windowsNamed '.' | wc -l)" -eq 2 ] || fail "$1: there are other windows: $(windowsNamed '.')"
    kill "$Host"
    wait "$Host" 2> /dev/null || true
    [ ! -s "$Folder/$1.log" ] || fail "$1: the example said: $(head -n 1 "$Folder/$1.log")"
}

Settings=.config/pelloric/OstlConfig.ini

Home=$Folder/fresh
clickPreview fresh
[ "$(grep -c '= ' "$Home/$Settings")" -eq 42 ] || fail "fresh: not all settings are there"
grep -q '^HeaderCenter= Stock list' "$Home/$Settings" || fail "fresh: the header was not stored"
[ "$(grep -c '\[Page #' "$Home/$Settings")" -eq 1 ] || fail "fresh: the page number is not printed once"

Home=$Folder/junk
mkdir -p "$(dirname "$Home/$Settings")"
printf '"\r\n"\r\n' > "$Home/$Settings"
clickPreview junk
[ "$(grep -c '= ' "$Home/$Settings")" -eq 42 ] || fail "junk: not all settings are there"
[ "$(wc -c < "$Home/$Settings.bak")" -eq 6 ] || fail "junk: the old file was not kept"

printf 'first_run_e2e: pages on the first click, with no box\n'
