#!/usr/bin/env bash
# The console needs no library of windows, and says what is missing when it has to draw.
#
#   no_windows.sh ZELCTL
set -euo pipefail
zelctl=$1
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

needs=$(ldd "$zelctl")
grep -q 'libQt6Core' <<< "$needs" || { echo "the libraries cannot be read"; exit 1; }
for library in libQt6Gui libQt6Widgets libQt6PrintSupport libQt6Svg libQCustomPlot libX11 libGLX \
    libEGL libqscintilla; do
    if grep -q "$library" <<< "$needs"; then
        echo "zelctl needs $library"
        exit 1
    fi
done

# Alone in a folder: no drawing program beside it, none in the PATH.
cp "$zelctl" "$scratch/zelctl"
status=0
env PATH=/nowhere "$scratch/zelctl" --connect sim: --home "$scratch/home" \
    sweep --image "$scratch/graph.png" > "$scratch/rows" 2> "$scratch/errors" || status=$?
[ "$status" = 1 ] || { echo "the status is $status"; exit 1; }
[ ! -s "$scratch/rows" ] || { echo "it measured for a picture that it cannot draw"; exit 1; }
grep -q 'install the package zelremote-draw' "$scratch/errors" ||
    { cat "$scratch/errors"; echo "it does not say what to install"; exit 1; }

# Over a serial line nothing of TCP is loaded; what is missing is named when it is needed.
if grep -q 'libQt6Network' <<< "$needs"; then echo "zelctl loads the sockets at once"; exit 1; fi
status=0
"$scratch/zelctl" --connect tcp:127.0.0.1:2277 --home "$scratch/home" info \
    > "$scratch/rows" 2> "$scratch/errors" || status=$?
[ "$status" = 1 ] && grep -q 'A part of the program cannot be loaded (.*zelremote-network' \
    "$scratch/errors" || { cat "$scratch/errors"; echo "missing sockets are not named"; exit 1; }

# A session goes on; its picture is refused in words.
printf '%s\n' connect "answer $scratch/graph.png" 'click MenuFileSaveImage' 'show State' |
    env PATH=/nowhere "$scratch/zelctl" --connect sim: --home "$scratch/home" panel \
        > "$scratch/session" 2>&1
grep -q 'install the package zelremote-draw' "$scratch/session" ||
    { cat "$scratch/session"; echo "the session does not say what to install"; exit 1; }
[ ! -e "$scratch/graph.png" ]

# A sweep without a picture needs none of it.
env PATH=/nowhere "$scratch/zelctl" --connect sim: --home "$scratch/home" sweep > "$scratch/rows"
[ "$(wc -l < "$scratch/rows")" = 302 ] || { echo "the sweep has not 302 lines"; exit 1; }

# In the PATH it is found.
env PATH="$(dirname "$zelctl")" "$scratch/zelctl" --connect sim: --home "$scratch/home" \
    sweep --image "$scratch/graph.png" > "$scratch/rows"
[ -s "$scratch/graph.png" ] || { echo "the drawing program in the PATH was not found"; exit 1; }

# One that is something else is reported, and no picture is left.
printf '#!/bin/sh\necho broken >&2\nexit 1\n' > "$scratch/zeldraw"
chmod +x "$scratch/zeldraw"
status=0
"$scratch/zelctl" --connect sim: --home "$scratch/home" sweep --image "$scratch/other.png" \
    > "$scratch/rows" 2> "$scratch/errors" || status=$?
[ "$status" = 1 ] && grep -q 'the image could not be written: broken' "$scratch/errors" ||
    { cat "$scratch/errors"; echo "a failure of the drawing program is not reported"; exit 1; }
[ ! -e "$scratch/other.png" ]
