#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Missing packages are installed once another package manager has let go of its lock; an apt-get of
# our own says "locked" a few times, and what is there of dpkg is asked for a package that nobody has.

set -euo pipefail
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT

cat > "$folder/apt-get" << TEXT
#!/usr/bin/env bash
echo "\$*" >> "$folder/calls"
if [ "\$(wc -l < "$folder/calls")" -le "\$LOCKED_CALLS" ]; then
    echo 'E: Could not get lock /var/lib/dpkg/lock-frontend. It is held by process 1' >&2
    exit 100
fi
[ "\$1" = "\$FAILING_COMMAND" ] && { echo 'E: Unable to locate package' >&2; exit 100; }
exit 0
TEXT
chmod +x "$folder/apt-get"
export PATH=$folder:$PATH LockPause=0

# install LOCKED FAILING: needs a package that nobody has, as root; prints what is told.
install() {
    rm -f "$folder/calls"
    LOCKED_CALLS=$1 FAILING_COMMAND=${2:-none} bash -c '
        . "$0/../../tools/packages.sh"
        asRoot() { "$@"; }
        PackagesTrial=(no-such-package-anywhere)
        needPackages trial' "$here" 2>&1
}

# expect WHAT TEXT PATTERN: ends the test unless the text matches.
expect() {
    grep -q "$3" <<< "$2" || {
        printf '%s: "%s" is not in:\n%s\n' "$1" "$3" "$2" >&2
        exit 1
    }
}

told=$(install 3)
expect 'a lock that goes' "$told" 'Another package manager is at work; waiting for it.'
[ "$(grep -c 'waiting' <<< "$told")" -eq 1 ] || { echo 'it is told more than once' >&2; exit 1; }
[ "$(grep -c '^update' "$folder/calls")" -eq 4 ] || { echo 'updates were not tried again' >&2; exit 1; }
[ "$(grep -c '^install' "$folder/calls")" -eq 1 ] || { echo 'nothing was installed' >&2; exit 1; }

told=$(install 0 install || true)
expect 'another failure' "$told" 'could not install: no-such-package-anywhere'
expect 'another failure' "$told" 'Unable to locate package'
[ "$(grep -c '^install' "$folder/calls")" -eq 1 ] || { echo 'it was tried again' >&2; exit 1; }

told=$(LongestLock=0 install 5 || true)
expect 'a lock that stays' "$told" 'apt-get update failed'
expect 'a lock that stays' "$told" 'Could not get lock'
echo 'The lock of another package manager is waited for.'
