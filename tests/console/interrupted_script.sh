#!/usr/bin/env bash
# Signals end scripts that pause, wait for a press or show a box at once, with status 1. A script that
# writes and is killed leaves whole lines.
#
#   interrupted_script.sh ZELCTL
set -euo pipefail

zelctl=$1
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
cd "$scratch"

wait_for() {
    for _ in $(seq 200); do
        [ ! -s "$1" ] || return 0
        sleep 0.05
    done
    echo "$1 was not written"
    exit 1
}

printf 'SAVERESULTS OUT.TXT\nCOMMENT A\nPAUSE 600\nCOMMENT B\n' > pause.txt
printf 'SAVERESULTS OUT.TXT\nCOMMENT A\nSTEPMODE\nCOMMENT B\n' > step.txt
printf 'SAVERESULTS OUT.TXT\nCOMMENT A\nSHOWDIALOG X\nCOMMENT B\n' > box.txt

# A shell's background commands ignore the interrupt key; python's do not. The input stays open.
interrupted() { # SIGNAL SCRIPT [CONNECTION...]
    rm -f OUT.TXT
    python3 - "$zelctl" "$@" <<'EOF'
import os, signal, subprocess, sys, time
zelctl, name, script, *connection = sys.argv[1:]
run = subprocess.Popen([zelctl, *connection, "--home", "home", "run", script], stdin=subprocess.PIPE,
                       preexec_fn=lambda: signal.signal(signal.SIGINT, signal.SIG_DFL))
for _ in range(400):
    if os.path.exists("OUT.TXT") and os.path.getsize("OUT.TXT") > 0:
        break
    time.sleep(0.05)
time.sleep(0.2)
run.send_signal(getattr(signal, name))
try:
    sys.exit(run.wait(timeout=20))
except subprocess.TimeoutExpired:
    run.kill()
    sys.exit(99)
EOF
}
for case in "SIGINT pause.txt" "SIGINT step.txt" "SIGINT box.txt" "SIGINT step.txt --connect sim:" \
    "SIGINT box.txt --connect sim:" "SIGTERM pause.txt" "SIGTERM step.txt"; do
    status=0
    # shellcheck disable=SC2086
    interrupted $case || status=$?
    [ "$status" = 1 ] || { echo "$case: status $status"; exit 1; }
    [ "$(wc -l < OUT.TXT)" = 1 ] || { echo "$case: the run went on"; cat OUT.TXT; exit 1; }
done

printf 'SAVERESULTS LOG.TXT\nDO\nCOMMENT PASS I OF MANY\nLOOP -1\n' > endless.txt
"$zelctl" --home home run endless.txt < /dev/null &
process=$!
wait_for LOG.TXT
sleep 0.3
kill -9 "$process"
wait "$process" 2>/dev/null || true
whole=$(grep -ac 'PASSOF MANY'$'\r''$' LOG.TXT || true)
[ "$whole" -gt 10 ] || { echo "only $whole lines"; exit 1; }
[ "$(tail -c 2 LOG.TXT | od -An -tx1 | tr -d ' \n')" = 0d0a ] || { echo "the last line is cut"; exit 1; }
[ "$(wc -l < LOG.TXT)" = "$whole" ] || { echo "lines that are not whole"; exit 1; }
