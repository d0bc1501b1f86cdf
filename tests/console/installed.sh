#!/usr/bin/env bash
# Installs the programs into a fresh folder and runs them from there.
#
#   installed.sh CMAKE BUILD_FOLDER
set -euo pipefail
cmake=$1
build=$2
# shellcheck source=common.sh
. "$(dirname "$0")/common.sh"
unset DESTDIR

"$cmake" --install "$build" --prefix "$scratch/root" > "$scratch/log" 2>&1 ||
    { cat "$scratch/log"; exit 1; }
# Moved, as a package is unpacked anywhere.
mv "$scratch/root" "$scratch/moved"
bin=$scratch/moved/bin

for tool in zelremote zelctl ZELSim; do
    env -u DISPLAY "$bin/$tool" --version > "$scratch/version"
    grep -q "^$tool [0-9]" "$scratch/version" || fail "$tool names no version"
done

"$bin/zelctl" --connect sim: --home "$scratch/home" sweep --image "$scratch/graph.png" \
    > "$scratch/rows"
[ "$(wc -l < "$scratch/rows")" = 302 ] || fail "the sweep has not 302 lines"
[ -s "$scratch/graph.png" ] || fail "the picture is missing"

companion=$(find "$scratch/moved/" -path '*/zelremote/ZELSim/ZELSim')
[ -n "$companion" ] && [ -x "$companion" ] || fail "the panel finds no simulator"
run_simulator "$companion" "$scratch/port"
"$bin/zelctl" --connect "serial:$scratch/port@57600" --home "$scratch/home" info \
    > "$scratch/info"
grep -q '^Model: ' "$scratch/info" || fail "no instrument was found"

for document in README.md CHANGELOG.md LICENSE docs/file-formats.md; do
    [ -n "$(find "$scratch/moved/share/doc" -path "*/$document")" ] ||
        fail "$document is not installed"
done
