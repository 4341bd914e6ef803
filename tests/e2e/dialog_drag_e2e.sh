#!/bin/bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Drags the four margin lines of the page setup dialog with a real pointer, under a window manager
# on a display of its own, presses OK and looks into the settings file.
#
# dialog_drag_e2e.sh PROGRAM    the program that shows the dialog

set -euo pipefail

program=$1
for need in Xvfb:xvfb openbox:openbox xdotool:xdotool; do
    if ! command -v "${need%%:*}" >/dev/null; then
        echo "${need%%:*} is missing: install the package ${need##*:}" >&2
        exit 1
    fi
done

folder=$(mktemp -d)
started=()
finish() {
    for id in "${started[@]}"; do
        kill "$id" 2>/dev/null || true
        wait "$id" 2>/dev/null || true
    done
    rm -rf "$folder"
}
trap finish EXIT

# wait_for FILE PATTERN: until a line of the file matches, 20 seconds at most.
wait_for() {
    for _ in $(seq 200); do
        if grep -q "$2" "$1" 2>/dev/null; then
            return
        fi
        sleep 0.1
    done
    echo "no \"$2\" in $(basename "$1"):" >&2
    cat "$1" >&2 || true
    exit 1
}

Xvfb -noreset -displayfd 3 -screen 0 1280x1024x24 3>"$folder/display" 2>"$folder/xvfb.log" &
started+=($!)
wait_for "$folder/display" '[0-9]'
DISPLAY=:$(cat "$folder/display")
export DISPLAY
export QT_QPA_PLATFORM=xcb
unset QT_SCALE_FACTOR QT_FONT_DPI
openbox --config-file /etc/xdg/openbox/rc.xml >"$folder/openbox.log" 2>&1 &
started+=($!)
for _ in $(seq 100); do
    xdotool get_num_desktops >/dev/null 2>&1 && break # the window manager answers
    sleep 0.1
done

mkdir "$folder/settings"
"$program" "$folder/settings" >"$folder/places" 2>"$folder/program.log" &
shown=$!
started+=("$shown")
wait_for "$folder/places" '^ready$'
window=
for _ in $(seq 100); do
    window=$(timeout 5 xdotool search --onlyvisible --all --pid "$shown" --name 'Page Setup' | tail -1 || true)
    if [ -n "$window" ] && timeout 5 xdotool windowactivate --sync "$window"; then
        break
    fi
    sleep 0.2
done
[ -n "$window" ] || { echo "the dialog does not come up" >&2; exit 1; }

# place NAME: where its middle is in the window.
place() {
    awk -v name="$1" '$1 == name { print $2, $3 }' "$folder/places"
}

# drag NAME DX DY: takes a line and lets it go elsewhere, in a few moves as a hand does.
drag() {
    local x y step
    read -r x y <<<"$(place "$1")"
    xdotool mousemove --window "$window" "$x" "$y"
    sleep 0.2
    xdotool mousedown 1
    for step in 1 2 3 4; do
        xdotool mousemove --window "$window" $((x + $2 * step / 4)) $((y + $3 * step / 4))
        sleep 0.1
    done
    xdotool mouseup 1
    sleep 0.2
}

drag 'PicTop(0)' 0 40
drag 'PicTop(1)' -40 0
drag 'PicTop(2)' 0 -40
drag 'PicTop(3)' 40 0
read -r x y <<<"$(place cmdOk)"
xdotool mousemove --window "$window" "$x" "$y" click 1

status=0
for _ in $(seq 100); do
    kill -0 "$shown" 2>/dev/null || break
    sleep 0.1
done
wait_for "$folder/settings/OstlConfig.ini" '^Right='
kill -0 "$shown" 2>/dev/null && { echo "the dialog did not close" >&2; exit 1; }
wait "$shown" || status=$?
[ "$status" -eq 0 ] || { echo "the dialog ended with $status" >&2; exit 1; }

# All four lines went the same way inwards from 10 mm.
for key in Top Buttom Left Right; do
    value=$(sed -n "s/^$key= \([0-9.]*\).*/\1/p" "$folder/settings/OstlConfig.ini" | head -1)
    echo "$key $value"
    awk -v mm="$value" 'BEGIN { exit !(mm > 30 && mm < 60) }' || {
        echo "$key is $value mm, not 10 mm and the way of the drag" >&2
        exit 1
    }
done
