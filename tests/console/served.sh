#!/usr/bin/env bash
# The server as a process: search, scanners, a flood, networks, addresses of both kinds, signals.
#
#   served.sh ZELCTL ZELSIM [MEGABYTES]
set -euo pipefail

zelctl=$1
zelsim=$2
megabytes=${3:-4}
scratch=$(mktemp -d)
simulator=
silent=
server=
cleanup() {
    for pid in $server $simulator $silent; do kill -9 "$pid" 2> /dev/null || true; done
    rm -rf "$scratch"
}
trap cleanup EXIT
fail() {
    echo "FAILED: $*"
    for log in "$scratch"/*.log; do echo "--- $log"; head -40 "$log"; done
    exit 1
}
cd "$scratch"

"$zelsim" --pty --link "$scratch/instrument" --strict-baud > simulator.log 2>&1 &
simulator=$!
until [ -s simulator.log ]; do sleep 0.05; done

wait_for() { # FILE PATTERN
    local turns=600
    until grep -q "$2" "$1"; do
        kill -0 "$server" 2> /dev/null || fail "the server ended before \"$2\""
        ((turns-- > 0)) || fail "no \"$2\" came"
        sleep 0.05
    done
}
start_server() { # OPTIONS...
    : > server.log
    "$zelctl" --home home serve --serial "$scratch/instrument" "$@" > server.log \
        2> server.errors.log &
    server=$!
    wait_for server.log '^instrument'
    port=$(sed -n 's/^listening .*://p' server.log)
}
stop_server() { # SIGNAL
    kill "-${1:-TERM}" "$server"
    status=0
    wait "$server" || status=$?
    server=
    [ "$status" -eq 0 ] || fail "the server ended with status $status"
    [ "$(tail -1 server.log)" = closed ] || fail "the server did not say closed"
}
works() { # ADDRESS
    timeout 60 "$zelctl" --home client --connect "tcp:$1:$port" info > client.log \
        2> client.errors.log || fail "the next client: status $?"
    grep -q '^Identity: Marlow' client.log || fail "the next client got no identity"
    [ ! -s client.errors.log ] || fail "the next client had something to report"
}
# Bytes of another program; the connection ends after them.
scan() { # TEXT
    exec 5<> "/dev/tcp/127.0.0.1/$port"
    printf "$1" >&5
    sleep 0.3
    exec 5>&-
}

start_server --listen 127.0.0.1:0
grep -q "^instrument $scratch/instrument 57600" server.log || fail "another speed was found"
works 127.0.0.1
scan 'GET / HTTP/1.1\r\nHost: here\r\n\r\n'
works 127.0.0.1
scan '\x16\x03\x01\x00\xf1\x01\x00\x00\xed\x03\x03\xa5\xa5\xa5\xa5\xa5'
works 127.0.0.1
scan 'SSH-2.0-scanner\r\n'
works 127.0.0.1
echo "scanners hold up nobody"

exec 5<> "/dev/tcp/127.0.0.1/$port"
(head -c "${megabytes}M" /dev/zero >&5) 2> /dev/null &
flood=$!
most=0
for _ in $(seq 40); do
    kill -0 "$flood" 2> /dev/null || break
    now=$(awk '/^VmRSS/ {print $2}' "/proc/$server/status")
    [ "$now" -le "$most" ] || most=$now
    sleep 0.1
done
kill "$flood" 2> /dev/null || true
wait "$flood" 2> /dev/null || true
exec 5>&-
limit=100000
# A sanitizer keeps memory of its own.
if [[ $(ldd "$zelctl") == *lib[at]san* ]]; then limit=400000; fi
[ "$most" -lt "$limit" ] || fail "a flood took $most kB of memory"
works 127.0.0.1
echo "flood: at most $most kB of memory"
stop_server TERM
log=$(ls home/ELOG_*.log | head -1)
grep -q 'listening 127.0.0.1' "$log" && grep -q 'client gone' "$log" || fail "no log of the server"
# entry FILE HEAD TEXT: an entry that begins with that line, with its time and that description.
entry() {
    tr -d '\r' < "$1" | awk -v head="$2" -v text="          DESCRIPTION : $3" '
        !/^          / { inside = $0 == head; timed = 0 }
        inside && /^          TIME        : [0-9][0-9]*-[0-9][0-9]-[0-9][0-9] / { timed = 1 }
        inside && timed && index($0, text) == 1 { found = 1 }
        END { exit !found }' || fail "$1 has no entry \"$2\" with \"$3\""
}
entry "$log" '.      Info' 'listening 127.0.0.1'
entry "$log" '.      Info' 'client gone'
rm -f home/ELOG_*.log

start_server --listen 127.0.0.1:0 --allow 10.0.0.0/8 --baud 57600
status=0
timeout 60 "$zelctl" --home client --connect "tcp:127.0.0.1:$port" info > client.log \
    2> client.errors.log || status=$?
[ "$status" -eq 1 ] || fail "a client that is not on the list: status $status"
grep -q 'The server closed the connection' client.errors.log || fail "it is not told why"
[ ! -s client.log ] || fail "something was shown"
grep -q '^refused 127.0.0.1' server.log || fail "no word of the refused client"
stop_server INT
entry "$(ls home/ELOG_*.log | head -1)" '****   Error' 'refused 127.0.0.1'
echo "who is not on the list is refused"

if [ -e /proc/net/if_inet6 ] && grep -q ' lo$' /proc/net/if_inet6; then
    start_server --listen '[::1]:0' --baud 57600
    grep -q '^listening \[::1\]:' server.log || fail "the address is not shown"
    works '[::1]'
    grep -q '^client ::1' server.log || fail "the client's address is not shown"
    stop_server HUP
    echo "IPv6"
else
    echo "SKIPPED: this machine has no IPv6"
fi
start_server --listen '*:0' --baud 57600
works 127.0.0.1
grep -q '^client 127.0.0.1' server.log || fail "the client's address is not the plain one"
stop_server

# A signal ends the search as well.
"$zelsim" --pty --link "$scratch/silent" --fault silence:byte=1 > silent.log 2>&1 &
silent=$!
until [ -s silent.log ]; do sleep 0.05; done
: > server.log
"$zelctl" --home home serve --serial "$scratch/silent" --listen 127.0.0.1:0 > server.log \
    2> server.errors.log &
server=$!
wait_for server.log '^listening'
stop_server
! grep -q '^instrument' server.log || fail "an instrument was found where none answers"
kill "$silent"
echo "signals"

# A device is named from the working folder as well.
for name in instrument ./instrument; do
    timeout 60 "$zelctl" --home client --connect "serial:$name" info > client.log \
        2> client.errors.log || fail "the device $name: status $?"
    : > server.log
    "$zelctl" --home home serve --serial "$name" --baud 57600 --listen 127.0.0.1:0 > server.log \
        2> server.errors.log &
    server=$!
    wait_for server.log '^instrument'
    stop_server
done
echo "devices of the working folder"

status=0
"$zelctl" --home home serve --serial ttyNone --listen 127.0.0.1:0 > server.log \
    2> server.errors.log || status=$?
[ "$status" -eq 1 ] || fail "a name that is no device: status $status"
grep -q '/dev/ttyNone is not there' server.errors.log || fail "no reason for a name"
status=0
"$zelctl" --home home serve --serial "$scratch/none" --listen 127.0.0.1:0 > server.log \
    2> server.errors.log || status=$?
[ "$status" -eq 1 ] || fail "a port that is not there: status $status"
grep -q 'Could not connect to the specified COM port!' server.errors.log || fail "no words"
start_server --listen 127.0.0.1:0 --baud 57600
status=0
"$zelctl" --home home serve --serial "$scratch/none" --listen "127.0.0.1:$port" \
    > second.log 2> second.errors.log || status=$?
[ "$status" -eq 1 ] || fail "a TCP port in use: status $status"
grep -q 'The TCP port cannot be used' second.errors.log || fail "no words for a TCP port in use"
kill "$simulator"
wait "$simulator" 2> /dev/null || true
simulator=
status=0
wait "$server" || status=$?
server=
[ "$status" -eq 1 ] || fail "an instrument that goes: status $status"
grep -q '^error ' server.log || fail "an instrument that goes is not told"
echo "ports that fail"

# A failure inside of a handler: the log is switched on for it.
status=0
printf 'fail 13 "Bridge" "type mismatch"\n' | "$zelctl" --home failed panel > failed.log 2>&1 || status=$?
[ "$status" -eq 1 ] || fail "a failure gave the status $status"
log=$(ls failed/ELOG_*.log | head -1)
entry "$log" '*******Fatal' 'Program type mismatch'
grep -q '^          ERROR NUMBER: D (13)' "$log" || fail "the failure's number is missing"
grep -q '>ZELRemote.Program_EventHandler' "$log" || fail "the calls are missing"
echo "entries of the log by their level"
