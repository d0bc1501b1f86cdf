#!/usr/bin/env bash
# Runs a recorded session again: the program sends the same bytes and prints the same. A record in
# which one byte is another one, and one that was cut, are reported.
#
#   run.sh ZELCTL NAME.log
#
# NAME.expected holds what the session prints.
set -euo pipefail

zelctl=$1
log=$2
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

fail() {
    echo "$1"
    exit 1
}

"$zelctl" replay "$log" > "$scratch/printed" 2> "$scratch/errors" || {
    cat "$scratch/errors"
    fail "the program differs from the record"
}
diff -u --label expected --label printed "${log%.log}.expected" "$scratch/printed" ||
    fail "the session printed something else"

# The first bytes that the program sends after the wake-up are "cmd".
sed '0,/> 63 6D 64 0D |cmd.|/s//> 63 6D 65 0D |cme.|/' "$log" > "$scratch/other.log"
status=0
"$zelctl" replay "$scratch/other.log" > "$scratch/printed" 2> "$scratch/errors" || status=$?
[ "$status" = 1 ] || fail "another byte gave the status $status"
grep -q '^line [0-9]*: .*> 63 6D 65 0D |cme.|$' "$scratch/printed" || fail "the line is not named"
grep -q 'differs: 64 instead of 65$' "$scratch/errors" || fail "the byte is not named"

head -c 400 "$log" > "$scratch/cut.log"
status=0
"$zelctl" replay "$scratch/cut.log" > /dev/null 2> "$scratch/errors" || status=$?
[ "$status" = 1 ] || fail "a record that was cut gave the status $status"
grep -q 'is damaged\|was cut' "$scratch/errors" || fail "the cut is not reported"
