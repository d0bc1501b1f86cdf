#!/usr/bin/env bash
# The units of the server are what systemd takes, and leave the service few rights.
#
#   units.sh PACKAGING
set -euo pipefail

packaging=$1
most=3.0  # of 10, by systemd's own measure
if ! command -v systemd-analyze > /dev/null; then
    echo "SKIPPED: systemd-analyze is missing, the units are not verified"
    exit 77
fi
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
# An instance, with a program that is there.
for kind in "" user/; do
    mkdir -p "$scratch/$kind"
    sed 's|/usr/bin/zelctl|/bin/true|' "$packaging/systemd/${kind}zelremote-server@.service" \
        > "$scratch/${kind}zelremote-server@ttyUSB0.service"
done
system=$scratch/zelremote-server@ttyUSB0.service
systemd-analyze --man=no verify "$system" 2> "$scratch/words" || {
    cat "$scratch/words"
    echo "FAILED: verify"
    exit 1
}
if grep "zelremote" "$scratch/words"; then
    echo "FAILED: verify has something to say"
    exit 1
fi
echo "verified: the system's unit"
if systemd-analyze --user --man=no verify "$scratch/user/zelremote-server@ttyUSB0.service" \
    2> "$scratch/words"; then
    ! grep "zelremote" "$scratch/words" || exit 1
    echo "verified: the user's unit"
elif grep -q "zelremote" "$scratch/words"; then
    cat "$scratch/words"
    exit 1
else
    echo "SKIPPED: no manager of a user here"
fi
for right in DynamicUser=yes SupplementaryGroups=dialout DeviceAllow=/dev/%I DevicePolicy=closed \
    Restart=on-failure CapabilityBoundingSet=; do
    grep -q "^$right" "$packaging/systemd/zelremote-server@.service" || {
        echo "FAILED: $right is missing"
        exit 1
    }
done
if systemd-analyze security --offline=true --help > /dev/null 2>&1; then
    exposure=$(systemd-analyze security --offline=true "$system" 2> /dev/null |
        sed -n 's/.*Overall exposure level[^:]*: \([0-9.]*\).*/\1/p')
    [ -n "$exposure" ] || { echo "FAILED: no measure"; exit 1; }
    awk -v got="$exposure" -v most="$most" 'BEGIN { exit !(got <= most) }' || {
        echo "FAILED: exposure $exposure, more than $most"
        exit 1
    }
    echo "exposure $exposure of 10"
fi
