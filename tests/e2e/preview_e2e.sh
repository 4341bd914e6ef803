#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Drives the demonstration on a real window server with real keys and a real pointer:
#   preview_e2e.sh PROGRAM FOLDER
# The program's state log tells what came of each step; screenshots stay in the folder.

set -euo pipefail
Tests=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
# shellcheck source=tests/e2e/window_server.sh
. "$Tests/e2e/window_server.sh"

Program=$1
Folder=$2
Log=$Folder/state.log

needTool lpadmin cups-client
startDisplay "$Folder"
mkdir "$Folder/config"
export XDG_CONFIG_HOME=$Folder/config

# A print scheduler of its own, with one queue that keeps its jobs.
Cups=$(mktemp -d)
trap 'finish; rm -rf "$Cups"' EXIT
"$Tests/support/private_cups.sh" "$Cups" > "$Folder/cups.log" 2>&1 &
Processes+=($!)
export CUPS_SERVER=$Cups/cups.sock
for ((look = 0; look < Patience; look++)); do
    ! lpstat -r 2> /dev/null | grep -q 'is running' || break
    sleep 0.05
done
lpadmin -p E2E -E -v file:/dev/null -P "$Tests/data/forms.ppd" 2> "$Folder/lpadmin.log" ||
    fail "no print queue: $(cat "$Folder/cups.log" "$Folder/lpadmin.log")"
lpadmin -d E2E
"$Program" demo --log "$Log" > "$Folder/program.log" 2>&1 &
Demo=$!
Processes+=("$Demo")

# waitFor PATTERN: until the last state matches the extended regular expression.
waitFor() {
    local look last
    for ((look = 0; look < Patience; look++)); do
        last=$(grep '^state' "$Log" 2> /dev/null | tail -n 1 || true)
        if [[ $last =~ $1 ]]; then
            return 0
        fi
        kill -0 "$Demo" 2> /dev/null || fail "the program has ended; waited for: $1"
        sleep 0.05
    done
    fail "waited for: $1; the last states are: $(tail -n 3 "$Log" 2> /dev/null)"
}

# valueOf NAME: a value of the last state.
valueOf() {
    grep '^state' "$Log" | tail -n 1 | tr ' ' '\n' | sed -n "s/^$1=//p"
}

# toWindow TITLE: waits for the window and makes it the active one.
toWindow() {
    toWindowOf "$Demo" "$1"
}

# pointAt NAME NUMBER: the pointer over a control of the preview window.
pointAt() {
    local place
    place=$(grep "^place $1 $2 " "$Log" | tail -n 1) || fail "no place of $1 $2"
    read -r _ _ _ X Y _ <<< "$place"
    xdotool mousemove --window "$Window" "$X" "$Y"
    sleep 0.05
}

shoot() {
    import -window root "$Folder/$1.png"
}

# clickTool NAME NUMBER PATTERN: clicks a tool, waits for its state, takes a picture.
clickTool() {
    pointAt "$1" "$2"
    xdotool click 1
    waitFor "$3"
    shoot "$1-$2"
}

# needEnd: until the program has ended, with nothing to say.
needEnd() {
    waitForEnd "$Demo"
    [ "$Status" -eq 0 ] || fail "the program ended with status $Status"
    [ ! -s "$Folder/program.log" ] || fail "the program said: $(head -n 1 "$Folder/program.log")"
}

toWindow '^Pelloric Demonstration'
shoot demo
xdotool key alt+p
waitFor 'open busy=0 total=[1-9][0-9]+ current=1 mode=1 .*top=-'
toWindow '^Print Preview'
sleep 0.3
Total=$(valueOf total)
shoot preview

clickTool tool7 7 'current=2 '
clickTool tool8 8 "current=$Total "
clickTool tool5 5 'current=1 '
clickTool tool15 16 'mode=2 window=2 first=0 last=1 '
clickTool tool15 18 'mode=3 window=4 first=0 last=3 '
clickTool tool9 9 'mode=4 window=0 '
clickTool tool10 10 'mode=1 '
clickTool tool15 15 'mode=[01] .*visible=1'
xdotool key ctrl+l
xdotool type 100
xdotool key Return
waitFor 'divisor=1 '
clickTool toolOut 3 'divisor=0.5 '

# A drag over the page moves it when the button is released.
Before=$(valueOf y)
xdotool mousemove --window "$Window" 500 500
sleep 0.1
xdotool mousedown 1
xdotool mousemove --window "$Window" 480 420
xdotool mousemove --window "$Window" 460 340
xdotool mouseup 1
for ((look = 0; look < Patience; look++)); do
    [ "$(valueOf y)" = "$Before" ] || break
    sleep 0.05
done
[ "$(valueOf y)" -lt "$Before" ] || fail "dragging did not move the page"
shoot dragged

# The vertical bar, clicked below its handle: the pages go up.
Before=$(valueOf y)
read -r Width Height <<< "$(valueOf size | tr 'x' ' ')"
xdotool mousemove --window "$Window" $((Width - 8)) $((Height - 60)) click 1
for ((look = 0; look < Patience; look++)); do
    [ "$(valueOf y)" = "$Before" ] || break
    sleep 0.05
done
[ "$(valueOf y)" -lt "$Before" ] || fail "the scroll bar did not move the page"

xdotool key ctrl+s
waitFor 'top=QFileDialog'
sleep 0.3
xdotool type --delay 5 "$Folder/saved.ostl"
xdotool key Return
waitFor 'top=-'
for ((look = 0; look < Patience; look++)); do
    [ ! -s "$Folder/saved.ostl" ] || break
    sleep 0.05
done
[ -s "$Folder/saved.ostl" ] || fail "the document was not saved"

xdotool mousemove --window "$Window" 500 500 click 3
waitFor 'top=QMenu'
shoot menu
xdotool key Down Return
waitFor 'total=1 .*top=-'
shoot cleared

xdotool key ctrl+o
waitFor 'top=QFileDialog'
sleep 0.3
shoot open-dialog
xdotool type --delay 5 "$Folder/saved.ostl"
xdotool key Return
waitFor "total=$Total current=1 .*top=-"
shoot reopened

# Every page is a job of its own, named after the file it was opened from.
xdotool key ctrl+p
waitFor 'top=pelloric::qt::PrintOptionsDialog'
sleep 0.3
shoot print-options
xdotool key Return
waitFor 'top=-'
for ((look = 0; look < Patience; look++)); do
    [ "$(lpstat -W completed -o | wc -l)" -lt "$Total" ] || break
    sleep 0.05
done
Jobs=$(lpstat -W completed -o | wc -l)
[ "$Jobs" -eq "$Total" ] || fail "$Jobs jobs of $Total pages"
grep -q "title=saved . page 1\$" "$Cups/log/page_log" || fail "no job is named saved – page 1"

pointAt toolExit 17
xdotool click 1
waitFor 'state closed'
toWindow '^Pelloric Demonstration'
xdotool key alt+F4
needEnd

# A preview of its own keeps its title whatever the report's is, and its exit ends the program.
printf 'town,people\nUlm,126000\n' > "$Folder/towns.csv"
"$Program" preview "$Folder/towns.csv" --title Towns > "$Folder/program.log" 2>&1 &
Demo=$!
Processes+=("$Demo")
toWindow '.'
Title=$(xdotool getwindowname "$Window")
[ "$Title" = 'Print Preview ' ] || fail "the preview's title is \"$Title\""
xdotool key ctrl+w
needEnd
printf 'preview_e2e: %s pages, every step as expected\n' "$Total"
