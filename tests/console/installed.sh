#!/usr/bin/env bash
# Installs the programs into a fresh folder and runs them from there.
#
#   installed.sh CMAKE BUILD_FOLDER
set -euo pipefail
cmake=$1
build=$2
scratch=$(mktemp -d)
simulator=
finish() {
    [ -z "$simulator" ] || kill "$simulator" 2> /dev/null || true
    rm -rf "$scratch"
}
trap finish EXIT
unset DESTDIR

"$cmake" --install "$build" --prefix "$scratch/root" > "$scratch/log" 2>&1 ||
    { cat "$scratch/log"; exit 1; }
# Moved, as a package is unpacked anywhere.
mv "$scratch/root" "$scratch/moved"
bin=$scratch/moved/bin

for program in zelremote zelctl ZELSim; do
    env -u DISPLAY "$bin/$program" --version > "$scratch/version"
    grep -q "^$program [0-9]" "$scratch/version" || { echo "$program names no version"; exit 1; }
done

"$bin/zelctl" --connect sim: --home "$scratch/home" sweep --image "$scratch/graph.png" \
    > "$scratch/rows"
[ "$(wc -l < "$scratch/rows")" = 302 ] || { echo "the sweep has not 302 lines"; exit 1; }
[ -s "$scratch/graph.png" ] || { echo "the picture is missing"; exit 1; }

companion=$(find "$scratch/moved/" -path '*/zelremote/ZELSim/ZELSim')
[ -n "$companion" ] && [ -x "$companion" ] || { echo "the panel finds no simulator"; exit 1; }
"$companion" --pty --link "$scratch/port" > "$scratch/simulator.log" &
simulator=$!
for _ in $(seq 100); do
    [ ! -e "$scratch/port" ] || break
    sleep 0.1
done
"$bin/zelctl" --connect "serial:$scratch/port@57600" --home "$scratch/home" info | grep -q '^Model: '

for document in README.md CHANGELOG.md LICENSE docs/file-formats.md; do
    find "$scratch/moved/share/doc" -path "*/$document" | grep -q . ||
        { echo "$document is not installed"; exit 1; }
done
