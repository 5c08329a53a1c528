#!/usr/bin/env bash
# usage: panel.sh CLOCK_SIM PICTURE_DIRECTORY
# The control panel beside the face, by clicks: what it sets is seen on the face.
# shellcheck disable=SC2086 # a place is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"

# Places in the panel.
ENGLISH="59 218"
GERMAN="247 218"
RAISE_VOLUME="167 127"
BACK="42 127"
AWAY="200 164"
FRONT="325 164"
TWELVE_HOURS="58 346"
POWER_SAVING="247 346"
NETWORK="320 378"
DATE="190 464"
SET="358 464"
MIDNIGHT="199 496"
ZONE="200 528"
LAMP="+363+40"

window_of() { xdotool search --onlyvisible --name "^$1\$" | tail -1; }
both_are_open() { [ -n "$(window_of clock-sim)" ] && [ -n "$(window_of 'Watch controls')" ]; }
panel_is_gone() { [ -z "$(window_of 'Watch controls')" ]; }
# left_of NAME: where a window begins on the screen
left_of() { xdotool getwindowgeometry --shell "$(window_of "$1")" | sed -n 's/^X=//p'; }
panel() { xdotool mousemove --window "$panel" "$1" "$2" sleep 0.1 click 1; }
tap() { xdotool mousemove --window "$face" "$1" "$2" sleep 0.1 mousedown 1 sleep 0.05 mouseup 1; }
looks() { import -window "$face" rgb:- | cksum; }
# changes COMMAND...: the face looks otherwise after the command, and then stands.
changes() {
    local before
    before=$(looks)
    "$@" && watch_wait 10 is_other "$before"
}
# The readout's date and zone, which stand for hours.
date_of() { import -window "$panel" -crop 150x34+190+18 rgb:- | cksum; }
date_changes() {
    local before
    before=$(date_of)
    "$@" && watch_wait 10 date_is_other "$before"
}
date_is_other() { [ "$(date_of)" != "$1" ]; }
is_other() { [ "$(looks)" != "$1" ]; }
stands() { local now; now=$(looks); sleep 0.3; [ "$(looks)" = "$now" ]; }
settled() { watch_wait 10 stands; }
setting_is() { grep -rqsx -- "$1" "$work/data/settings"; }
picture() { settled; import -window root "png:$pictures/$1.png"; }
lamp() { import -window "$panel" -crop "1x1$LAMP" txt:- | grep -o '#[0-9A-F]\{6\}' | head -1; }
lamp_is_lit() { [ "$(lamp)" != "$dark" ]; }
logged() { grep -aq "$1" "$log"; }

export WATCH_SCREEN=900x700
check "A display with room starts" watch_display "$work" bare || exit 1
openbox >"$work/openbox.log" 2>&1 &
watch_pids+=($!)
"$simulator" --data "$work/data" --24h >>"$log" 2>&1 &
watch_pid=$!
watch_pids+=("$watch_pid")
check "The panel opens with the watch" watch_wait 30 both_are_open || exit 1
face=$(window_of clock-sim) panel=$(window_of 'Watch controls')
stand_beside() { [ "$(left_of 'Watch controls')" -ge "$(($(left_of clock-sim) + 360))" ]; }
check "It stands beside the face" watch_wait 10 stand_beside
settled
picture 1-both

check "German is clicked, and the face speaks German" changes panel $GERMAN
check "The language is the device's" watch_wait 5 setting_is 'string de'
picture 2-german

check "English is clicked, and the face speaks English again" changes panel $ENGLISH

hold_raise() { xdotool mousemove --window "$panel" $RAISE_VOLUME sleep 0.1 mousedown 1 sleep 1.2 mouseup 1; }
check "The volume key is held, and the face shows the volume" changes hold_raise
check "It rose by more than one" watch_wait 5 grep -rqsE '^int (9|1[0-5])$' "$work/data/settings"
picture 3-volume

check "The editor is opened on the face" changes tap $WATCH_CREATE
settled
check "12 hours is clicked, and the wheels follow" changes panel $TWELVE_HOURS
picture 4-twelve-hours

# Clicks in the panel must reach a field too.
set_date() {
    panel $DATE && xdotool sleep 0.3 type --delay 30 '2027-08-01 09:00' && panel $SET
}
check "The clock is set to a summer's day, and the date follows" date_changes set_date
picture 5-summer
check "Ten seconds before midnight is clicked" panel $MIDNIGHT
check "The shift is kept" watch_wait 5 grep -rqsE '^int 2[0-9]{7}$' "$work/data/settings"
set_zone() { panel $ZONE && xdotool sleep 0.8 type --delay 60 'honol' && xdotool sleep 0.5 key Return; }
check "A zone far away is chosen, and the date follows" date_changes set_zone
check "The zone is the device's" watch_wait 5 setting_is 'string Pacific/Honolulu'
picture 6-zone

settled
editor=$(looks)
check "To background is clicked, and the face shows the time" changes panel $AWAY
picture 6-time
check "To front is clicked, and the editor is back" changes panel $FRONT
settled
check "It is as it was" is "$(looks)" "$editor"

check "Power saving is clicked" panel $POWER_SAVING
check "It is on" watch_wait 5 setting_is 'int 2'
check "The back key on the panel leaves the editor" changes panel $BACK
settled
picture 7-back

# Another process changes a setting: the panel's picture follows.
before=$(import -window "$panel" -crop 372x20+14+400 rgb:- | cksum)
"$simulator" --data "$work/data" --set-volume 1
slider_moved() { [ "$(import -window "$panel" -crop 372x20+14+400 rgb:- | cksum)" != "$before" ]; }
check "The panel follows what another process sets" watch_wait 5 slider_moved

check "The focus of the panel sent nothing to the background" test "$(grep -ac 'goes to the background' "$log")" = 1

# The location button of the city picker is felt.
set_network() { panel $NETWORK && xdotool sleep 0.5 type --delay 60 '42901' && xdotool sleep 0.3 key Return; }
check "A network in Nepal is typed" set_network
network_is() { grep -rqsx -- "string $1" "$XDG_RUNTIME_DIR/clock-ui/settings"; }
check "The watch finds it" watch_wait 5 network_is 42901
check "The world clock is opened" changes tap $WATCH_WORLD_CLOCK
settled
check "The city picker is opened" changes tap $WATCH_CREATE
settled
dark=$(lamp)
tap $WATCH_LOCATE
check "The tap lights the panel's lamp" watch_wait 3 lamp_is_lit
lamp_is_dark() { [ "$(lamp)" = "$dark" ]; }
check "It goes out again" watch_wait 5 lamp_is_dark
check "It was a haptic tap" logged 'Haptic tap'
picture 8-city-picker

closes() { xdotool windowfocus --sync "$1" key alt+F4; }
closes "$panel"
check "The panel can be closed" watch_wait 10 panel_is_gone
check "The watch goes on" kill -0 "$watch_pid"
check "The back key still works on the face" changes xdotool windowfocus --sync "$face" key Escape
closes "$face"
check "Closing the face ends the watch" watch_wait 10 bash -c '! kill -0 '"$watch_pid"
check "It ended well" wait "$watch_pid"

"$simulator" --data "$work/data" --no-panel >>"$log" 2>&1 &
watch_pid=$!
watch_pids+=("$watch_pid")
check "Without the panel the face opens" watch_wait 30 test -n "$(sleep 3; window_of clock-sim)"
check "and stays alone" panel_is_gone
watch_stop
# The city picker tells at error priority what it does.
CHECK_USUAL_ERRORS+='|WORLDCLOCK'
check "No other error was logged" no_error_is_logged
check_end
