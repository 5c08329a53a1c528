#!/usr/bin/env bash
# usage: accessibility.sh CLOCK_SIM PICTURE_DIRECTORY
# A screen reader on the desktop reads the watch and presses what it names.
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"

reader() { timeout 60 "$journeys/reader.py" clock-sim "$@" 2>>"$pictures/reader.log"; }
tree() { reader tree >"$pictures/$1.txt"; }
# reads FILE LINE: a line of the tree is just this.
reads() { grep -qxE " *$2" "$pictures/$1.txt" || { sed 's/^/  /' "$pictures/$1.txt" && return 1; }; }
session_starts() {
    DBUS_SESSION_BUS_ADDRESS=unix:path=$work/bus
    export DBUS_SESSION_BUS_ADDRESS
    dbus-daemon --session --nofork --address="$DBUS_SESSION_BUS_ADDRESS" 2>"$work/bus.log" &
    watch_pids+=($!)
    watch_wait 20 test -S "$work/bus" || return 1
    /usr/libexec/at-spi-bus-launcher --launch-immediately --a11y=1 --screen-reader=1 2>"$work/launcher.log" &
    watch_pids+=($!)
}

check "A display starts" watch_display "$work" || exit 1
check "A session with a screen reader starts" session_starts
check "The watch starts" starts
check "Create is called so" reader find Create
check "The list is read" tree 1-alarms
check "Create is a button" reads 1-alarms 'push button \| Create( \| focused)?'
check "The reader presses it" reader press Create
check "The editor opens" reader find Done
check "The editor is read" tree 2-editor
check "The wheels tell their value" reads 2-editor '(spin button|spinner) \| [Hh]our, .*'
check "A row has its name" reads 2-editor 'list item \| Repeat weekly.*'
check "A switch has the name of its row and is on" reads 2-editor 'check box \| Snooze, .* \| checked'
check "A row out of sight has its name" reads 2-editor 'list item \| Snooze, .*'
check "The slider tells its value" reads 2-editor 'slider \| Alarm volume, [0-9]+ / 15'
check "Cancel is a button" reads 2-editor 'push button \| Cancel( \| focused)?'
check "The reader leaves" reader press Cancel
check "The watch ends" watch_stop
unset DBUS_SESSION_BUS_ADDRESS
: >"$log"
check "Without a session it starts as well" starts
check "It says nothing about that" no_error_is_logged
check_end
