#!/usr/bin/env bash
# usage: pick-city.sh CLOCK_SIM PICTURE_DIRECTORY CITY_CALLER
# Another application asks for a city: a city is chosen, the picker is left, killed, and its caller ends.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd) || exit 1
. "$here/journey.sh"
caller=$3
export CLOCK_DATA_DIR=$work/data
application=com.vendra.clock.city-picker

answer=$work/answer
picker_window() { xdotool search --onlyvisible --name '^city-picker$' 2>/dev/null; }
is_open() { [ -n "$(picker_window)" ]; }
is_closed() { [ -z "$(picker_window)" ]; }
caller_has_ended() { ! kill -0 "$caller_pid" 2>/dev/null; }
# asks: the other application asks, and the picker is there.
asks() {
    "$caller" $application >"$answer" 2>>"$log" &
    caller_pid=$!
    watch_pids+=("$caller_pid")
    watch_wait 30 is_open || return 1
    watch_pid=$(xdotool getwindowpid "$(picker_window)")
    watch_settled
}
answered() { watch_wait 20 is_closed && watch_wait 20 caller_has_ended; }
answer_is() { is "$(cat "$answer")" "$1"; }
offset() { TZ=Asia/Kathmandu date +%:z; }

check "A display starts" watch_display "$work" || exit 1

check "Another application asks for a city" asks
picture 1-picker
check "A city is searched" watch_tap $WATCH_SEARCH
check "Its name is typed" watch_type kathm
picture 2-found
check "The list has changed" differs 1-picker 2-found
check "The city is tapped" xdotool mousemove $WATCH_FIRST_CITY mousedown 1 sleep 0.05 mouseup 1
check "The picker ends, and so does the caller" answered
check "The caller has the city" answer_is "result = 0
index_key = 658985929
city = IDS_CITY_NP_KATHMANDU
country = IDS_COUNTRY_NP
timezone = GMT$(offset)
tz_path = Asia/Kathmandu"
check "Nothing was added to the watch's own list" is "$(sqlite3 -readonly "$work/data/world-clock-selection.db" 'SELECT count(*) FROM selected_city')" 0

check "It asks again" asks
check "The picker is left by Cancel" xdotool mousemove $WATCH_BACK mousedown 1 sleep 0.05 mouseup 1
check "The picker ends without a choice" answered
check "The caller is told so" answer_is "result = -2"

check "It asks again and waits" asks
check "The back key is pressed" xdotool key XF86Back
check "The picker ends after the back key" answered
check "The caller is told of that, too" answer_is "result = -2"

check "It asks once more" asks
check "The picker is killed" kill -KILL "$watch_pid"
check "The caller ends all the same" answered
check "The caller is told of the failure" answer_is "result = -1"

check "It asks a last time" asks
process=$watch_pid
check "The caller is killed" kill -KILL "$caller_pid"
check "The picker ends with it" watch_wait 10 bash -c "! kill -0 $process"

check "A person starts the picker" starts --pick-city
check "It is left again" xdotool key XF86Back
check "It ends well" wait "$watch_pid"
check_end
