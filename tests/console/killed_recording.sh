#!/usr/bin/env bash
# Kills a recording at arbitrary moments: the file loads, and only the trace in progress is lost.
#
#   killed_recording.sh ZELCTL
set -euo pipefail

zelctl=$1
scratch=$(mktemp -d)
recorder=
trap '[ -z "$recorder" ] || kill -9 "$recorder" 2> /dev/null || true; rm -rf "$scratch"' EXIT
rows_of_a_trace=301

for round in 1 2 3 4 5 6; do
    file=$scratch/trace$round.csv
    "$zelctl" --connect sim: --home "$scratch/home$round" \
        record --interval 0.001 --count 1000000 --output "$file" > "$scratch/log" 2>&1 &
    recorder=$!
    enough=$((round * 40000 + RANDOM))
    until [ -e "$file" ] && [ "$(stat -c %s "$file")" -ge "$enough" ]; do
        if ! kill -0 "$recorder" 2> /dev/null; then
            echo "the recording ended by itself"
            cat "$scratch/log"
            exit 1
        fi
        sleep 0.01
    done
    kill -9 "$recorder"
    wait "$recorder" 2> /dev/null || true
    recorder=

    begun=$(grep -c '^Trace Name;' "$file")
    "$zelctl" --home "$scratch/home$round" show "$file" > "$scratch/shown"
    whole=$(awk -v rows="$rows_of_a_trace" '
        BEGIN { RS = ""; FS = "\n" }
        { count = NF; if (NR == 1) --count }  # the header
        count == rows { ++whole }
        END { print whole + 0 }' "$scratch/shown")
    echo "round $round: $begun traces begun, $whole whole"
    if [ "$begun" -lt 3 ] || [ "$whole" -lt "$((begun - 1))" ]; then
        echo "more than the trace in progress was lost"
        exit 1
    fi
done
