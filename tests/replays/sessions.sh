#!/usr/bin/env bash
# Records each text session and runs the record again: the same bytes, the same output.
#
#   sessions.sh ZELCTL FOLDER_OF_SESSIONS
set -euo pipefail

zelctl=$1
sessions=$2
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

failed=0
count=0
for session in "$sessions"/*.txt; do
    name=$(basename "$session" .txt)
    # A session that runs again draws nothing, so it reports no picture either.
    [ "$name" != image_refused ] || continue
    count=$((count + 1))
    arguments=()
    if [ -e "${session%.txt}.args" ]; then
        mapfile -d '' -t arguments < <(xargs printf '%s\0' < "${session%.txt}.args")
    fi
    mkdir "$scratch/$name"
    cd "$scratch/$name"
    "$zelctl" --connect sim: --home home --log session.log ${arguments[@]+"${arguments[@]}"} \
        panel "$session" > first 2> errors < /dev/null || true  # some end with a status of theirs
    if ! "$zelctl" replay session.log > second 2> differences < /dev/null; then
        echo "$name: $(tail -1 differences)"
        failed=1
    elif ! diff -u --label "$name" --label again first second; then
        failed=1
    fi
done
[ "$count" -gt 30 ] || { echo "only $count sessions were found"; exit 1; }
exit "$failed"
