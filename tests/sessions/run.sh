#!/usr/bin/env bash
# Plays one text session on the panel and compares what it prints, to the byte.
#
#   run.sh ZELCTL NAME.txt
#
# NAME.expected holds the output. NAME.args, where there is one, holds further arguments of zelctl,
# quoted as in a shell; NAME.status the exit status, which is 0 otherwise.
set -euo pipefail

zelctl=$1
session=$2
base=${session%.txt}

# The same fonts on every desk.
FONTCONFIG_FILE=$(cd "$(dirname "$0")/.." && pwd)/fonts.conf
export FONTCONFIG_FILE

scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

arguments=()
if [ -e "$base.args" ]; then
    mapfile -d '' -t arguments < <(xargs printf '%s\0' < "$base.args")
fi
wanted=0
[ ! -e "$base.status" ] || wanted=$(tr -d '[:space:]' < "$base.status")
if [ ! -e "$base.expected" ]; then
    echo "$base.expected is missing" >&2
    exit 1
fi

status=0
(cd "$scratch" && "$zelctl" --connect sim: --home "$scratch/home" ${arguments[@]+"${arguments[@]}"} \
    panel "$session" > "$scratch/output" 2> "$scratch/errors" < /dev/null) || status=$?

failed=0
if ! cmp -s "$base.expected" "$scratch/output"; then
    diff -u --label expected --label printed "$base.expected" "$scratch/output" || true
    failed=1
fi
if [ "$status" != "$wanted" ]; then
    echo "exit status $status where $wanted was expected"
    failed=1
fi
if [ "$failed" = 1 ] && [ -s "$scratch/errors" ]; then
    echo "--- standard error"
    cat "$scratch/errors"
fi
exit "$failed"
