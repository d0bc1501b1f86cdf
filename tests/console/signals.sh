#!/usr/bin/env bash
# Signals end the programs with LOCAL and a close; a closed pipe and a full file are errors.
#
#   signals.sh ZELCTL ZELSIM [ZELREMOTE]
set -euo pipefail

zelctl=$1
zelsim=$2
zelremote=${3:-}
# shellcheck source=common.sh
. "$(dirname "$0")/common.sh"

# A simulator of its own for each case; its sweeps take as long as the case needs.
start_simulator() {
    : > "$scratch/simulator.log"
    "$zelsim" --tcp 127.0.0.1:0 "$@" > "$scratch/simulator.log" 2>&1 &
    simulator=$!
    until grep -q ':' "$scratch/simulator.log"; do
        kill -0 "$simulator" || fail "the simulator ended"
        sleep 0.05
    done
    address=$(grep -o '127.0.0.1:[0-9]*' "$scratch/simulator.log" | head -1)
}
stop_simulator() {
    kill "$simulator" 2> /dev/null || true
    wait "$simulator" 2> /dev/null || true
    simulator=
}
# The status of a setting, which is 0 in remote state only.
setting_status() {
    local port=${address##*:} first second
    exec 5<> "/dev/tcp/127.0.0.1/$port"
    printf '\r' >&5
    IFS= read -r -t 20 -d $'\r' first <&5
    printf 'set\r' >&5
    IFS= read -r -t 5 -d $'\r' first <&5
    printf 'FREQ,1000000000\r' >&5
    IFS= read -r -t 5 -d $'\r' second <&5
    exec 5>&-
    echo "$second"
}
# ended_in SECONDS: the program ends within them; leaves its status in `status`.
ended_in() {
    local tenths=$(($1 * 10))
    while kill -0 "$program" 2> /dev/null; do
        ((tenths-- > 0)) || fail "it did not end within $1 s"
        sleep 0.1
    done
    status=0
    wait "$program" || status=$?
    program=
}
wait_for() { # FILE TEXT
    local turns=300
    until grep -q "$2" "$1"; do
        kill -0 "$program" 2> /dev/null || fail "the program ended before \"$2\""
        ((turns-- > 0)) || fail "no \"$2\" came"
        sleep 0.1
    done
}

# The doctor finds nothing wrong with what it was not let ask.
start_simulator --fault silence:exchange=1
(trap - INT; exec "$zelctl" --home "$scratch/home" doctor "tcp:$address") \
    > "$scratch/doctor.log" 2>&1 &
program=$!
wait_for "$scratch/doctor.log" 'can be reached'
kill -INT "$program"
ended_in 2
[ "$status" -eq 1 ] || fail "the doctor: status $status"
grep -q 'ended by SIGINT' "$scratch/doctor.log" || fail "the doctor: SIGINT is not reported"
! grep -q '^fault' "$scratch/doctor.log" || fail "the doctor: the end of the program is a fault"
stop_simulator
echo "doctor: no finding after the signal"

# Idle, in a sweep that lasts for minutes, and at each of the three signals.
for signal in INT TERM HUP; do
    start_simulator
    mkfifo "$scratch/lines"
    (trap - INT; exec "$zelctl" --home "$scratch/home" --connect "tcp:$address" panel) \
        < "$scratch/lines" > "$scratch/panel.log" 2>&1 &
    program=$!
    exec 6> "$scratch/lines"
    printf 'connect\nshow isConnected\n' >&6
    wait_for "$scratch/panel.log" true
    kill "-$signal" "$program"
    ended_in 4
    exec 6>&-
    rm "$scratch/lines"
    [ "$status" -eq 1 ] || fail "SIG$signal: status $status"
    grep -q "ended by SIG$signal" "$scratch/panel.log" || fail "SIG$signal is not told"
    [ "$(setting_status)" != 0 ] || fail "SIG$signal: the instrument is still in remote state"
    stop_simulator
    echo "SIG$signal: LOCAL and the close"
done

start_simulator --speed 0.001
"$zelctl" --home "$scratch/home" --connect "tcp:$address" --verbose sweep \
    > "$scratch/sweep.log" 2>&1 &
program=$!
wait_for "$scratch/sweep.log" "CMD <WAIT> starting"
kill -TERM "$program"
ended_in 4
[ "$status" -eq 1 ] || fail "in a sweep: status $status"
[ "$(setting_status)" != 0 ] || fail "in a sweep: the instrument is still in remote state"
stop_simulator
echo "in the middle of a sweep: LOCAL and the close"

if [ -n "$zelremote" ]; then
    start_simulator
    QT_QPA_PLATFORM=offscreen "$zelremote" --home "$scratch/desk" --connect "tcp:$address" \
        > "$scratch/remote.log" 2>&1 &
    program=$!
    sleep 4
    kill -0 "$program" || fail "the desktop program ended by itself"
    kill -TERM "$program"
    ended_in 4
    [ "$status" -eq 1 ] || fail "desktop: status $status"
    [ "$(setting_status)" != 0 ] || fail "desktop: the instrument is still in remote state"
    stop_simulator
    echo "desktop: LOCAL and the close"
fi

status=0
"$zelctl" --home "$scratch/home" --connect tcp:127.0.0.1:1 info > "$scratch/refused.log" 2>&1 ||
    status=$?
[ "$status" -eq 1 ] || fail "a refused connection: status $status"
grep -q "127.0.0.1:1 failed: Connection refused" "$scratch/refused.log" ||
    fail "the reason of a refused connection is not told"
echo "refused connection: told with its reason"

status=0
"$zelctl" --home "$scratch/home" --connect sim: sweep --count 200 2> "$scratch/pipe.log" |
    head -1 > /dev/null || status=${PIPESTATUS[0]}
[ "$status" -lt 128 ] || fail "a closed pipe was a death: $status"
echo "closed pipe: status $status"

status=0
(
    ulimit -f 40
    exec "$zelctl" --home "$scratch/home" --connect sim: \
        record --interval 0.01 --count 100 --output "$scratch/full.csv"
) > "$scratch/full.log" 2>&1 || status=$?
[ "$status" -gt 0 ] && [ "$status" -lt 128 ] || fail "a file at its limit: status $status"
grep -q 'box\[critical\]' "$scratch/full.log" || fail "a file at its limit is not told"
echo "file at its size limit: an error"
