#!/bin/bash
# Runs a command on an X server of its own, under a window manager, and leaves nothing behind.
#
#   run-under-xvfb.sh [--depth BITS] COMMAND [ARGUMENT...]
#
# The exit status is the command's; 70 when the server or the window manager is missing or does not start.
set -u

readonly no_server=70
readonly start_seconds=20
depth=24
if [ "${1-}" = --depth ]; then
    depth=$2
    shift 2
fi
if [ $# -eq 0 ]; then
    echo "usage: $0 [--depth BITS] COMMAND [ARGUMENT...]" >&2
    exit 2
fi

fail() {
    echo "run-under-xvfb: $*" >&2
    exit "$no_server"
}

for tool in Xvfb openbox xdotool xprop xwininfo xclip setpriv; do
    command -v "$tool" >/dev/null ||
        fail "$tool is missing; Debian has it in xvfb, openbox, xdotool, x11-utils, xclip and util-linux"
done

scratch=$(mktemp -d) || fail "cannot make a directory for the session"
processes=()
finish() {
    for process in "${processes[@]}"; do
        kill "$process" 2>/dev/null
    done
    wait
    rm -rf "$scratch"
}
trap finish EXIT
trap 'exit 130' INT
trap 'exit 143' TERM HUP

# Nothing of the user's session counts, and no session bus may be started: its daemon would stay.
unset WAYLAND_DISPLAY XMODIFIERS SDL_VIDEODRIVER SDL_IM_MODULE
export DBUS_SESSION_BUS_ADDRESS=disabled: NO_AT_BRIDGE=1 LC_ALL=C.UTF-8
export HOME=$scratch XDG_CONFIG_HOME=$scratch XDG_CACHE_HOME=$scratch XDG_RUNTIME_DIR=$scratch

# Clicks give the focus and reach the window too, new windows get the focus, and of the keys only A-F4 is taken from them.
cat >"$scratch/openbox.xml" <<'END'
<?xml version="1.0" encoding="UTF-8"?>
<openbox_config xmlns="http://openbox.org/3.4/rc">
  <focus><focusNew>yes</focusNew><followMouse>no</followMouse></focus>
  <placement><policy>Smart</policy></placement>
  <desktops><number>1</number><popupTime>0</popupTime></desktops>
  <keyboard><keybind key="A-F4"><action name="Close"/></keybind></keyboard>
  <mouse>
    <context name="Client">
      <mousebind button="Left" action="Press"><action name="Focus"/><action name="Raise"/></mousebind>
    </context>
  </mouse>
  <menu/>
</openbox_config>
END

# The parent's death ends both, however this script ends. The server chooses a display that is free and names it.
mkfifo "$scratch/display"
setpriv --pdeathsig TERM Xvfb -displayfd 3 -screen 0 "1024x768x$depth" -nolisten tcp -noreset \
    3>"$scratch/display" >"$scratch/server.log" 2>&1 &
processes+=($!)
read -r -t "$start_seconds" number <"$scratch/display" ||
    fail "the X server did not start: $(cat "$scratch/server.log")"
export DISPLAY=:$number

setpriv --pdeathsig TERM openbox --sm-disable --config-file "$scratch/openbox.xml" >"$scratch/manager.log" 2>&1 &
processes+=($!)
deadline=$((SECONDS + start_seconds))
# The list of windows comes last; a window that is shown before may never be managed.
until xprop -root _NET_CLIENT_LIST 2>/dev/null | grep -q 'window id'; do
    [ $SECONDS -lt $deadline ] || fail "the window manager did not start: $(cat "$scratch/manager.log")"
    sleep 0.05
done

"$@"
