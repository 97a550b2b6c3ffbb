#!/bin/bash
# Runs a command on an X server of its own, with a window manager. Exit code: that of the command.
d=$(mktemp -d)
chmod 700 "$d"
mkfifo "$d/number"
cleanup() {
    kill $wm $server 2>/dev/null
    wait $wm $server 2>/dev/null
    rm -rf "$d"
}
trap cleanup EXIT
trap 'exit 98' INT TERM
# The server chooses a free number itself, so runs at the same time do not meet.
Xvfb -displayfd 3 -screen 0 1280x1024x24 -nolisten tcp -noreset 3>"$d/number" >"$d/server.log" 2>&1 &
server=$!
read -r -t 20 number <"$d/number" || { echo "no X server: $(cat "$d/server.log")" >&2; exit 99; }
export DISPLAY=:$number QT_QPA_PLATFORM=xcb DBUS_SESSION_BUS_ADDRESS=disabled: XDG_RUNTIME_DIR=$d
unset WAYLAND_DISPLAY
openbox --sm-disable >"$d/wm.log" 2>&1 &
wm=$!
ready=
for ((i = 0; i < 250; ++i)); do
    xprop -root _NET_CLIENT_LIST 2>/dev/null | grep -q 'window id' && { ready=1; break; }
    sleep 0.02
done
[ -n "$ready" ] || { echo "no window manager: $(cat "$d/wm.log")" >&2; exit 99; }
"$@"
