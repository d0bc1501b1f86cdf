# What the scripts of this folder begin with: a scratch folder that goes at the end, processes that
# end with the script, a failure that shows the logs. To be sourced.

scratch=$(mktemp -d)
simulator=
server=
program=
cleanup() {
    for pid in $program $server $simulator; do kill -9 "$pid" 2> /dev/null || true; done
    rm -rf "$scratch"
}
trap cleanup EXIT

fail() {
    echo "FAILED: $*"
    for log in "$scratch"/*.log; do
        [ ! -e "$log" ] || { echo "--- $log"; head -60 "$log"; }
    done
    exit 1
}

# run_simulator ZELSIM LINK: one that stays at a pseudo terminal of that name.
run_simulator() {
    "$1" --pty --link "$2" > "$scratch/simulator.log" 2>&1 &
    simulator=$!
    for _ in $(seq 100); do
        [ ! -e "$2" ] || return 0
        sleep 0.1
    done
    fail "the simulator made no port"
}
