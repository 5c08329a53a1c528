#!/usr/bin/env bash
# usage: accessibility.sh CLOCK_SIM PICTURE_DIRECTORY
# A screen reader on the desktop reads the watch and presses what it names.
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"

reader() { timeout 60 "$journeys/reader.py" clock-sim "$@" 2>>"$pictures/reader.log"; }
tree() { reader tree >"$pictures/$1.txt"; }
# reads FILE LINE: a line of the tree is just this.
reads() { grep -qxE " *$2" "$pictures/$1.txt" || { sed 's/^/  /' "$pictures/$1.txt" && return 1; }; }
# hears PATTERN: the reader that listens has been told so.
hears() { watch_wait 20 grep -qxE "object:state-changed:$1" "$pictures/heard.txt" || { sed 's/^/  /' "$pictures/heard.txt" && return 1; }; }
listens() {
    "$journeys/reader.py" clock-sim listen >"$pictures/heard.txt" 2>>"$pictures/reader.log" &
    watch_pids+=($!)
    watch_wait 20 grep -q listening "$pictures/heard.txt"
}
keeps() {
    "$journeys/reader.py" clock-sim keep "$1" >"$pictures/kept.txt" 2>>"$pictures/reader.log" &
    watch_pids+=($!)
    watch_wait 20 grep -q keeping "$pictures/kept.txt"
}
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
check "Somebody listens" listens
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
check "The reader flips a row" reader press 'Snooze, *'
check "The reader opens a row" reader press 'Repeat weekly, *'
check "The repeat screen opens" reader find 'Every Monday'
check "The reader chooses a day" reader press 'Every Monday'
check "The repeat screen is read" tree 3-repeat
check "The day is marked" reads 3-repeat 'list item \| Every Monday \| checked( \| focused)?'
check "The reader goes back" reader press Back
check "The editor has the day" reader find 'Repeat weekly, Mon*'
check "The reader opens the type" reader press 'Alarm type, *'
check "The popup is called by its title" reader find Type
check "The reader chooses a type" reader press Vibration
check "The editor has the type" reader find 'Alarm type, Vibration'
check "It is told where the focus comes back to" hears 'focused \| list item \| Alarm type, Vibration'
check "A key leads the focus on" watch_key Tab
check "The reader is told of the row" hears 'focused \| list item \| Snooze, .*'
check "The editor is read again" tree 4-focus
check "The row is that" reads 4-focus 'list item \| Snooze, .* \| focused'
check "A reader keeps a key" keeps Down
check "The key is pressed" watch_key Down
check "The reader has had it" watch_wait 10 grep -qx 'kept Down' "$pictures/kept.txt"
check "The editor is read once more" tree 5-kept
check "The focus is where it was" reads 5-kept 'list item \| Snooze, .* \| focused'
check "Another key is pressed" watch_key Tab
check "The watch has had it" hears 'focused \| entry \| Alarm name'
check "The reader sets the alarm" reader press Done
check "The toast is announced" hears 'showing \| notification \| Alarm set for .*'
check "The alarm is stored" watch_wait 10 alarms_are 1
check "It has the day and the type, and no snooze" column_is 'repeat_weekly, type, snooze' '2|1|0'
check "The alarm is in the list" reader find '06:00*'
check "The watch ends" watch_stop
unset DBUS_SESSION_BUS_ADDRESS
: >"$log"
check "Without a session it starts as well" starts
check "It says nothing about that" no_error_is_logged
check_end
