#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Runs scripts that show the preview window, and a preview by settings that cannot be used:
#   run_window_e2e.sh PROGRAM FOLDER
# The window of `pelloric run --window` stays until the person closes it, and the script's exit
# status is the program's. Screenshots stay in the folder.

set -euo pipefail

# shellcheck source-path=SCRIPTDIR
source "$(dirname "${BASH_SOURCE[0]}")/window_server.sh"

Program=$1
Folder=$2
startDisplay "$Folder"
export HOME=$Folder/home
mkdir "$HOME"

printf 'town,people\nUlm,126000\nBonn,331000\nRostock,209000\n' > "$Folder/towns.csv"
cat > "$Folder/shown.js" << 'SCRIPT'
const report = new Kestrane();
report.AddHeader("Towns", AlignmentType.LocCenter);
report.ShowHeader = true;
report.doPreview(csv(args[0]));
const canvas = previewCanvas();
print("pages " + canvas.Totalpages + " page " + canvas.Currentpage);
SCRIPT
cat > "$Folder/ended.js" << 'SCRIPT'
const report = new Kestrane();
report.doPreview(csv(args[0]));
wait(4000);
exit(3);
SCRIPT

# start SCRIPT: runs it in a window; what it says is in $Folder/SCRIPT.out and .err.
start() {
    "$Program" run --window "$Folder/$1.js" "$Folder/towns.csv" > "$Folder/$1.out" 2> "$Folder/$1.err" &
    Host=$!
    Processes+=("$Host")
    toWindowOf "$Host" '^Print Preview $'
}

start shown
waitForInk "$Window" "$Folder/shown.png" 100000 400
for ((look = 0; look < Patience; look++)); do
    [ ! -s "$Folder/shown.out" ] || break
    sleep 0.05
done
[ "$(cat "$Folder/shown.out")" = 'pages 1 page 1' ] || fail "the script said: $(cat "$Folder/shown.out")"
[ "$(windowsOf "$Host" '.' | wc -l)" -eq 1 ] || fail "there are other windows"
sleep 0.3
kill -0 "$Host" 2> /dev/null || fail "the program did not wait for the person"
# The tools work while the script has ended: two pages side by side, then one again.
xdotool key ctrl+2
sleep 0.3
import -window "$Window" "$Folder/fitted.png"
! cmp -s "$Folder/shown.png" "$Folder/fitted.png" || fail "the window does not answer keys"
xdotool key alt+F4
waitForEnd "$Host"
[ "$Status" -eq 0 ] || fail "the program ended with status $Status"
[ ! -s "$Folder/shown.err" ] || fail "the program said: $(head -n 1 "$Folder/shown.err")"
grep -q '^HeaderCenter= Towns' "$HOME/.config/pelloric/OstlConfig.ini" || fail "the header was not stored"

# A script that ends the program takes its window along.
start ended
waitForEnd "$Host"
[ "$Status" -eq 3 ] || fail "the script's status 3 became $Status"

# A value that no page can be built by leaves a window that says so; restoring the defaults mends it.
Settings=$HOME/.config/pelloric/OstlConfig.ini
sed -i 's/^Top= .*/Top= 4000\r/' "$Settings"
"$Program" preview "$Folder/towns.csv" > "$Folder/bad.out" 2> "$Folder/bad.err" &
Host=$!
Processes+=("$Host")
toWindowOf "$Host" '^Print Preview $'
sleep 0.5
import -window "$Window" "$Folder/bad.png"
grep -q 'Top= 4000 in .*OstlConfig.ini: this margin is at most 361 mm' "$Folder/bad.err" ||
    fail "nobody says which setting cannot be used: $(cat "$Folder/bad.err")"
xdotool key alt+f
waitForInk "$Window" "$Folder/mended.png" 100000 400
grep -q '^Top= 10' "$Settings" || fail "the bad value was not mended"
grep -q '^Top= 4000' "$Settings.bak" || fail "the old settings were not kept beside"
xdotool key alt+F4
waitForEnd "$Host"
[ "$Status" -eq 0 ] || fail "the preview ended with status $Status"

# Without a window server the program says so, and what to do.
Status=0
env -u DISPLAY -u QT_QPA_PLATFORM "$Program" run --window "$Folder/shown.js" "$Folder/towns.csv" \
    > "$Folder/nowhere.out" 2> "$Folder/nowhere.err" || Status=$?
[ "$Status" -ne 0 ] || fail "there was no display, and no error"
grep -q 'there is no display' "$Folder/nowhere.err" || fail "no display: $(cat "$Folder/nowhere.err")"

printf 'run_window_e2e: a script shows, waits and ends; a preview that cannot be built is mended\n'
