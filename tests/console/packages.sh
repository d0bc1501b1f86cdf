#!/usr/bin/env bash
# Packs the build into Debian packages, installs them into a fresh root, runs the programs from
# there, with no display, and takes the packages away again.
#
#   packages.sh CPACK BUILD_FOLDER
set -euo pipefail
cpack=$1
build=$2
# shellcheck source=common.sh
. "$(dirname "$0")/common.sh"
unset DESTDIR DISPLAY WAYLAND_DISPLAY

(cd "$build" && "$cpack" -G DEB -B "$scratch/packages" > "$scratch/log" 2>&1) ||
    { cat "$scratch/log"; exit 1; }

for name in zelremote zelremote-cli zelremote-draw zelremote-server; do
    package=$(echo "$scratch/packages/${name}_"*.deb)
    [ -f "$package" ] || fail "there is no package $name"
    dpkg-deb -f "$package" Package Version Depends Description > "$scratch/$name.control"
done
if [ "$(sed -n 's/^Description: //p' "$scratch/"*.control | sort -u | wc -l)" != 4 ]; then
    fail "the packages have no summaries of their own"
fi

# The root knows the packages of this machine, so that each dependency has to be met.
mkdir -p "$scratch/root/var/lib/dpkg/info" "$scratch/root/var/lib/dpkg/updates"
cp /var/lib/dpkg/status "$scratch/root/var/lib/dpkg/status"
in_root() {
    dpkg --root="$scratch/root" --force-not-root --force-bad-path --force-script-chrootless \
        --no-pager --log="$scratch/dpkg.log" "$@" > "$scratch/dpkg" 2>&1 ||
        { grep -v 'files list file' "$scratch/dpkg"; fail "dpkg $1"; }
}
in_root --install "$scratch/packages/"*.deb
for name in zelremote zelremote-cli zelremote-draw zelremote-server; do
    state=$(dpkg-query --admindir="$scratch/root/var/lib/dpkg" -W -f '${db:Status-Status}' "$name")
    [ "$state" = installed ] || fail "$name is $state"
    for document in copyright changelog.gz; do
        [ -s "$scratch/root/usr/share/doc/$name/$document" ] || fail "$name has no $document"
    done
done
if grep -qiE 'widgets|gui|svg|qcustomplot|qscintilla' \
    <(grep '^Depends' "$scratch/zelremote-cli.control"); then
    fail "the console depends on a library of windows"
fi
for library in libqt6core6 libqt6network6; do
    grep -q "^Depends:.*$library" "$scratch/zelremote-cli.control" || fail "$library is not named"
done
grep -q '^Depends:.*zelremote-cli' "$scratch/zelremote.control" || fail "the desktop lacks the console"
grep -q '^Depends:.*zelremote-cli' "$scratch/zelremote-server.control" || fail "the server lacks it"

root=$scratch/root/usr
for tool in zelremote zelctl zeldraw ZELSim; do
    "$root/bin/$tool" --version > "$scratch/version"
    grep -q "^$tool [0-9]" "$scratch/version" || fail "$tool names no version"
    "$root/bin/$tool" --help > "$scratch/help"
    zcat "$root/share/man/man1/$tool.1.gz" | sed 's/\\-/-/g' > "$scratch/page"
    while read -r option; do
        grep -q -e "$option" "$scratch/page" || fail "$tool(1) does not name $option"
    done < <(grep -oE -- '(^|[ ,])--[a-z-]+' "$scratch/help" | tr -d ' ,' | sort -u)
    [ -s "$root/share/bash-completion/completions/$tool" ] || fail "$tool has no completion"
done
# Each verb stands in its manual page.
zcat "$root/share/man/man1/zelctl.1.gz" | sed 's/\\-/-/g' > "$scratch/page"
"$root/bin/zelctl" --help | sed -n '/^Subcommands:/,$s/^  \([a-z][a-z]*\).*/\1/p' > "$scratch/verbs"
[ "$(wc -l < "$scratch/verbs")" -ge 11 ] || fail "the verbs cannot be read"
while read -r verb; do
    grep -qE "(^|[ \"])(\.B[RI]* \"?)?$verb( |\"|$)" "$scratch/page" || fail "zelctl(1) does not name $verb"
done < "$scratch/verbs"

# What bash completes is what the program has.
completed=$(bash -c "
    PATH=$root/bin:\$PATH
    . '$root/share/bash-completion/completions/zelctl'
    COMP_WORDS=(zelctl --connect sim: swe) COMP_CWORD=3
    _zelremote zelctl
    echo \"\${COMPREPLY[*]}\"
    COMP_WORDS=(zelctl sweep --im) COMP_CWORD=2
    _zelremote zelctl
    echo \"\${COMPREPLY[*]}\"")
[ "$completed" = $'sweep\n--image' ] || fail "bash completes: $completed"

# A measurement with a picture; the example scripts are there on the first start.
"$root/bin/zelctl" --connect sim: --home "$scratch/home" sweep --image "$scratch/graph.svg" \
    > "$scratch/rows"
[ "$(wc -l < "$scratch/rows")" = 302 ] || fail "the sweep has not 302 lines"
grep -q '<svg' "$scratch/graph.svg" || fail "the picture is missing"
[ -s "$scratch/home/settings.ini" ] || fail "the settings are missing"
ls "$scratch/home/specialMeas/"*.txt > /dev/null || fail "the example scripts are missing"

companion=$(find "$root/" -path '*/zelremote/ZELSim/ZELSim')
[ -x "$companion" ] || fail "the panel finds no simulator"
run_simulator "$companion" "$scratch/port"
QT_QPA_PLATFORM=offscreen "$root/bin/zelremote" --connect "serial:$scratch/port@57600" \
    --home "$scratch/home2" --screenshot "$scratch/window.png"
[ -s "$scratch/window.png" ] || fail "the window cannot be drawn"

# The sockets are loaded from the companions' folder.
: > "$scratch/served"
"$root/bin/zelctl" --home "$scratch/home4" serve --serial "$scratch/port" --listen 127.0.0.1:0 \
    > "$scratch/served" 2>&1 &
server=$!
for _ in $(seq 100); do
    ! grep -q "^instrument" "$scratch/served" || break
    sleep 0.1
done
address=$(sed -n 's/^listening //p' "$scratch/served")
[ -n "$address" ] || { cat "$scratch/served"; fail "nothing is served"; }
"$root/bin/zelctl" --connect "tcp:$address" --home "$scratch/home5" info > "$scratch/info"
kill "$server"
grep -q '^Model: ' "$scratch/info" || fail "no instrument was found over TCP"

[ -n "$(find "$root/" -path '*/zelremote/translations/zelremote_de.qm' -size +8k)" ] ||
    fail "the German texts are missing"
QT_QPA_PLATFORM=offscreen "$root/bin/zelremote" --language en --home "$scratch/home2" \
    --screenshot "$scratch/english.png"
QT_QPA_PLATFORM=offscreen "$root/bin/zelremote" --language de --home "$scratch/home2" \
    --screenshot "$scratch/german.png"
! cmp -s "$scratch/english.png" "$scratch/german.png" || fail "the window speaks no German"

if [ -e "$build/help/zelremote.qch" ]; then
    [ -n "$(find "$root/" -path '*/zelremote/help/zelremote.qch' -size +20k)" ] ||
        fail "the help book is missing"
    [ -s "$root/share/doc/zelremote/html/index.html" ] || fail "the help site is missing"
    book=$(echo 'show help' | "$root/bin/zelctl" --home "$scratch/home3" panel)
    [ -s "$book" ] || fail "the console does not find the help book: $book"
fi

for file in lib/systemd/system/zelremote-server@.service lib/udev/rules.d/70-zelremote.rules \
    share/applications/example.zelremote.ZELRemote.desktop share/mime/packages/zelremote.xml \
    share/metainfo/example.zelremote.ZELRemote.metainfo.xml \
    share/icons/hicolor/scalable/apps/zelremote.svg share/doc/zelremote/README.md; do
    [ -s "$root/$file" ] || fail "$file is missing"
done
documentation=$(sed -n 's|^Documentation=file:///usr/||p' "$root/lib/systemd/system/zelremote-server@.service")
[ -s "$root/$documentation" ] || fail "the unit names a document that is not there: $documentation"

if command -v desktop-file-validate > /dev/null; then
    desktop-file-validate "$root/share/applications/"*.desktop
fi
if command -v appstreamcli > /dev/null; then
    appstreamcli validate --no-net "$root/share/metainfo/"*.xml > "$scratch/log" ||
        { cat "$scratch/log"; exit 1; }
fi
if command -v lintian > /dev/null; then
    lintian --fail-on error "$scratch/packages/"*.deb 2> /dev/null
fi

in_root --purge zelremote zelremote-server zelremote-draw zelremote-cli
left=$(find "$scratch/root/" ! -type d ! -path '*/var/lib/dpkg/*')
[ -z "$left" ] || fail "left after the removal: $left"
