#!/usr/bin/env bash
# The window as a screen reader finds it: the program runs on a virtual screen, connected to a
# simulated instrument, and is read over the bus of the assistive technologies.
# Usage: on_the_bus.sh ZELREMOTE ZELSIM. Skipped where the bus or the screen is not installed.
set -euo pipefail
exec < /dev/null
here=$(dirname "$(realpath "${BASH_SOURCE[0]}")")
for needed in Xvfb dbus-run-session; do
    command -v "$needed" > /dev/null || { echo "skipped: $needed is not installed"; exit 77; }
done
[[ -e /usr/share/dbus-1/services/org.a11y.Bus.service ]] ||
    { echo "skipped: at-spi2-core is not installed"; exit 77; }
/usr/bin/python3 -c 'import dbus' 2> /dev/null ||
    { echo "skipped: python3-dbus is not installed"; exit 77; }

scratch=$(mktemp -d)
trap 'kill $(jobs -p) 2> /dev/null || true; wait; rm -rf "$scratch"' EXIT

# The number of a screen does not yet say that it takes clients: one was seen to refuse the first.
answers() {
    /usr/bin/python3 - "$1" << 'END'
import socket, sys
with socket.socket(socket.AF_UNIX) as screen:
    screen.connect("/tmp/.X11-unix/X" + sys.argv[1])
END
}
display=
for _ in 1 2 3; do
    Xvfb -displayfd 3 -screen 0 1400x900x24 -nolisten tcp 3> "$scratch/display" \
        2> "$scratch/screen.log" &
    for _ in $(seq 100); do [[ -s $scratch/display ]] && break; sleep 0.1; done
    sleep 1
    number=$(< "$scratch/display")
    if [[ -n $number ]] && answers "$number" 2>> "$scratch/screen.log"; then
        display=:$number
        break
    fi
    kill $! 2> /dev/null || true
done
[[ -n $display ]] || { cat "$scratch/screen.log"; echo "skipped: no virtual screen"; exit 77; }
"$2" --pty --link "$scratch/port" > "$scratch/simulator.log" &
for _ in $(seq 100); do [[ -e $scratch/port ]] && break; sleep 0.1; done

env -u WAYLAND_DISPLAY -u QT_QPA_PLATFORM -u QT_ACCESSIBILITY DISPLAY="$display" \
    XDG_RUNTIME_DIR="$scratch" QT_LINUX_ACCESSIBILITY_ALWAYS_ON=1 LC_ALL=C.UTF-8 \
    dbus-run-session -- /usr/bin/python3 "$here/on_the_bus.py" "$1" "$scratch/port" "$scratch/home"
