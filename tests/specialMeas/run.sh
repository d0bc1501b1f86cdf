#!/usr/bin/env bash
# Runs an example script on the built-in simulator and compares the files that it makes, to the byte.
#
#   run.sh ZELCTL SCRIPT.txt EXPECTED_FOLDER
#
# The folder holds the files; of those that are named in its `made` only the name counts. `input`
# goes to standard input, `errors` is what standard error must hold.
set -euo pipefail

zelctl=$1
script=$2
expected=$3

scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
mkdir "$scratch/work"
input=/dev/null
[ ! -e "$expected/input" ] || input="$expected/input"

status=0
(cd "$scratch/work" && "$zelctl" --connect sim: --home "$scratch/home" run "$script" \
    < "$input" > "$scratch/output" 2> "$scratch/errors") || status=$?

failed=0
[ "$status" = 0 ] || { echo "exit status $status"; failed=1; }
[ ! -s "$scratch/output" ] || { echo "standard output is not empty"; failed=1; }
if [ -e "$expected/errors" ]; then
    diff -u "$expected/errors" "$scratch/errors" || failed=1
elif [ -s "$scratch/errors" ]; then
    cat "$scratch/errors"
    failed=1
fi
made=$(cd "$scratch/work" && ls)
wanted=$( (cd "$expected" && ls | grep -vx -e input -e errors -e made || true; cat made 2>/dev/null || true) | LC_ALL=C sort)
if [ "$(LC_ALL=C sort <<< "$made")" != "$wanted" ]; then
    printf 'files made:\n%s\nfiles expected:\n%s\n' "$made" "$wanted"
    failed=1
fi
for file in $made; do
    [ -e "$expected/$file" ] || continue
    cmp "$expected/$file" "$scratch/work/$file" || failed=1
done
exit "$failed"
