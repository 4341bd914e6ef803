# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT
# shellcheck shell=bash

# What scripts share that drive programs on a real window server, with real keys and a real pointer:
#   source window_server.sh; startDisplay FOLDER
# Everything that was started ends with the script, by its number.

Patience=400 # looks, 50 ms apart, before a step has failed
Processes=()

fail() {
    printf '%s: %s\n' "$(basename "$0" .sh)" "$1" >&2
    exit 1
}

# needTool PROGRAM PACKAGE
needTool() {
    command -v "$1" > /dev/null 2>&1 || fail "$1 is missing; install the Debian package $2"
}

finish() {
    local process
    for process in "${Processes[@]}"; do
        kill "$process" 2> /dev/null || true
    done
    wait 2> /dev/null || true
}

# startDisplay FOLDER: a window server with a window manager, of this script alone; its logs and the
# runtime folder stand in the folder, which is empty before.
startDisplay() {
    local look
    needTool Xvfb xvfb
    needTool openbox openbox
    needTool xdotool xdotool
    needTool import imagemagick
    needTool xprop x11-utils
    rm -rf "$1"
    mkdir -p "$1"
    mkdir -m 700 "$1/run"
    trap finish EXIT
    Xvfb -displayfd 3 -screen 0 1400x1000x24 -nolisten tcp 3> "$1/display" 2> "$1/server.log" &
    Processes+=($!)
    for ((look = 0; look < Patience; look++)); do
        [ ! -s "$1/display" ] || break
        sleep 0.05
    done
    [ -s "$1/display" ] || fail "the window server did not start"
    DISPLAY=:$(cat "$1/display")
    export DISPLAY
    export XDG_RUNTIME_DIR=$1/run QT_QPA_PLATFORM=xcb LC_ALL=C.UTF-8
    unset QT_SCALE_FACTOR QT_FONT_DPI WAYLAND_DISPLAY XDG_CONFIG_HOME XDG_DATA_HOME
    openbox --sm-disable > "$1/openbox.log" 2>&1 &
    Processes+=($!)
    for ((look = 0; look < Patience; look++)); do
        ! xprop -root _NET_SUPPORTING_WM_CHECK 2> /dev/null | grep -q 'window id' || break
        sleep 0.05
    done
}

# windowsOf PROCESS NAME: its visible windows of that name, one a line.
windowsOf() {
    xdotool search --all --onlyvisible --pid "$1" --name "$2" 2> /dev/null || true
}

# toWindowOf PROCESS NAME: waits for the window, makes it the active one and leaves it in Window.
toWindowOf() {
    local look
    Window=
    for ((look = 0; look < Patience; look++)); do
        kill -0 "$1" 2> /dev/null || fail "the program has ended; waited for the window $2"
        Window=$(windowsOf "$1" "$2" | head -n 1)
        [ -z "$Window" ] || break
        sleep 0.05
    done
    [ -n "$Window" ] || fail "no window named $2"
    timeout 20 xdotool windowactivate --sync "$Window" || fail "the window $2 does not come up"
}

# inkOf PICTURE: how many pixels of it are white, and how many are nearly black.
inkOf() {
    White=$(convert "$1" -fill black +opaque white -fill white -opaque white -format '%[fx:round(mean*w*h)]' info:)
    Black=$(convert "$1" -colorspace Gray -threshold 25% -negate -format '%[fx:round(mean*w*h)]' info:)
}

# waitForInk WINDOW PICTURE WHITE BLACK: until a picture of the window has so many such pixels.
waitForInk() {
    local look
    for ((look = 0; look < Patience; look++)); do
        import -window "$1" "$2"
        inkOf "$2"
        [ "$White" -lt "$3" ] || [ "$Black" -lt "$4" ] || return 0
        sleep 0.05
    done
    fail "$(basename "$2" .png): no page is seen: $White white and $Black black pixels"
}

# waitForEnd PROCESS: until it has ended; leaves its exit status in Status.
waitForEnd() {
    local look
    for ((look = 0; look < Patience; look++)); do
        kill -0 "$1" 2> /dev/null || break
        sleep 0.05
    done
    ! kill -0 "$1" 2> /dev/null || fail "the program does not end"
    Status=0
    # shellcheck disable=SC2034 # the scripts read it
    wait "$1" || Status=$?
}
