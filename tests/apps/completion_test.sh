#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# What zsh and fish make of the completions that the program writes, each shell asked by itself.
#
#   completion_test.sh PROGRAM

set -euo pipefail
for tool in zsh fish; do
    command -v "$tool" > /dev/null || {
        printf '%s is needed\n' "$tool" >&2
        exit 1
    }
done

program=$1
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
export HOME=$folder XDG_CONFIG_HOME=$folder
mkdir "$folder/functions"
"$program" completion zsh > "$folder/functions/_pelloric"
"$program" completion fish > "$folder/pelloric.fish"
touch "$folder/stock.csv"
cd "$folder"

failed=no
# expect SHELL LINE WANTED GOT: the answer to a line holds what is wanted.
expect() {
    if [[ $4 != *"$3"* ]]; then
        printf '%s completes "%s" to:\n%s\nand not to: %s\n' "$1" "$2" "$4" "$3" >&2
        failed=yes
    fi
}

# What fish offers for a line, a candidate a line.
askFish() {
    fish --no-config -c "source pelloric.fish; complete -C '$1'"
}

# What stands in the line of an interactive zsh after the Tab key.
askZsh() {
    zsh -f -c '
        zmodload zsh/zpty
        zpty shell zsh -f -i
        zpty -w shell "PROMPT=; fpath=('"$folder"'/functions \$fpath); autoload -U compinit; compinit -u -D; print READY\$((40 + 2))"
        until [[ $seen == *READY42* ]]; do
            zpty -r shell piece || exit 1
            seen+=$piece
        done
        zpty -n -w shell "$1"$'"'\\t'"'
        sleep 2
        zpty -w shell " ; print DONE\$((40 + 3))"
        seen=
        until [[ $seen == *DONE43* ]]; do
            zpty -r shell piece || exit 1
            seen+=$piece
        done
        print -r -- $seen' zsh "$1"
}

expect fish 'pelloric exp' export "$(askFish 'pelloric exp')"
expect fish 'pelloric export --landsc' --landscape "$(askFish 'pelloric export --landsc')"
expect fish 'pelloric export st' stock.csv "$(askFish 'pelloric export st')"
expect fish 'pelloric completion f' fish "$(askFish 'pelloric completion f')"
expect zsh 'pelloric exp' 'pelloric export' "$(askZsh 'pelloric exp')"
expect zsh 'pelloric export --landsc' --landscape "$(askZsh 'pelloric export --landsc')"
expect zsh 'pelloric export sto' stock.csv "$(askZsh 'pelloric export sto')"
expect zsh 'pelloric completion fi' 'completion fish' "$(askZsh 'pelloric completion fi')"
[ "$failed" = no ]
