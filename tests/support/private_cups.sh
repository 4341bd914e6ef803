#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# usage: private_cups.sh FOLDER
#
# Runs a print scheduler of its own in the foreground, as root or as any user: configuration, queues,
# spool and logs are in FOLDER, which is empty before, and nothing of the machine's own is touched.
# Programs reach it with CUPS_SERVER=FOLDER/cups.sock. It ends with whoever started it.

set -euo pipefail
PATH=$PATH:/usr/sbin:/sbin
folder=$1

if ! command -v cupsd > /dev/null; then
    printf '%s\n' 'cupsd not found: install the package cups-daemon' >&2
    exit 1
fi

mkdir -p "$folder"/{etc/ppd,etc/ssl,spool/tmp,cache,state,log}
user=$(id -un)
group=$(id -gn)
if [ "$(id -u)" -eq 0 ]; then
    # The scheduler refuses to run its helpers as root.
    user='lp'
    group='lp'
    chown -R lp:lp "$folder/spool" "$folder/cache"
    chmod 755 "$folder"
fi
chmod 770 "$folder/spool/tmp"

cat > "$folder/etc/cups-files.conf" << TEXT
ServerRoot $folder/etc
RequestRoot $folder/spool
TempDir $folder/spool/tmp
CacheDir $folder/cache
StateDir $folder/state
AccessLog $folder/log/access_log
ErrorLog $folder/log/error_log
PageLog $folder/log/page_log
User $user
Group $group
SystemGroup root lpadmin
FileDevice Yes
TEXT
cat > "$folder/etc/cupsd.conf" << TEXT
Listen $folder/cups.sock
Browsing Off
WebInterface No
DefaultAuthType None
MaxLogSize 0
MaxJobs 0
PreserveJobHistory Yes
PreserveJobFiles Yes
PageLogFormat job=%j printer=%p media=%{media} sides=%{sides} copies=%{copies} format=%{document-format} state=%{job-state} title=%{job-name}
<Location />
Order allow,deny
Allow all
</Location>
<Policy default>
<Limit All>
Order deny,allow
Allow all
</Limit>
</Policy>
TEXT

# Like a spool on a full disk: no file grows past so many KiB.
if [ -n "${PRIVATE_CUPS_FILE_KIB:-}" ]; then
    trap '' XFSZ
    ulimit -f "$PRIVATE_CUPS_FILE_KIB"
fi

guard=()
if command -v setpriv > /dev/null; then
    guard=(setpriv --pdeathsig TERM)
fi
exec "${guard[@]}" cupsd -f -c "$folder/etc/cupsd.conf" -s "$folder/etc/cups-files.conf"
