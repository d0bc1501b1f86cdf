#!/usr/bin/env bash
# Results that cannot be printed end zelctl with status 1 and a word on standard error.
#
#   unprintable.sh ZELCTL
set -euo pipefail
zelctl=$1
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

expectRefused() {
    local name=$1 status=$2
    if [ "$status" != 1 ]; then
        echo "$name: exit status $status where 1 was expected"
        exit 1
    fi
    if ! grep -q '^zelctl: the output cannot be written: ..*' "$scratch/errors"; then
        echo "$name: no word on standard error:"
        cat "$scratch/errors"
        exit 1
    fi
}

sweep=("$zelctl" --connect sim: --home "$scratch/home" sweep --count 100)

status=0
timeout 60 "${sweep[@]}" > /dev/full 2> "$scratch/errors" || status=$?
expectRefused "full disk" "$status"

status=0
{ timeout 60 "${sweep[@]}" 2> "$scratch/errors" || echo "$?" > "$scratch/status"; } | head -n 1 > /dev/null
expectRefused "closed pipe" "$(cat "$scratch/status" 2> /dev/null || echo 0)"

status=0
timeout 60 "$zelctl" --home "$scratch/home" panel > /dev/full 2> "$scratch/errors" \
    < <(echo "show State"; echo "show State") || status=$?
expectRefused "panel" "$status"

status=0
timeout 60 "$zelctl" --version > /dev/full 2> "$scratch/errors" || status=$?
[ "$status" = 1 ] || { echo "version: exit status $status where 1 was expected"; exit 1; }
