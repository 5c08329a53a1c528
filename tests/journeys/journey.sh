# shellcheck shell=bash
# Sourced by the journeys that use the watch with a pointer and keys.
# usage: . journey.sh CLOCK_SIM PICTURE_DIRECTORY
# shellcheck disable=SC2034 # variables of the journeys
. "$(dirname "${BASH_SOURCE[0]}")/begin.sh" "$@"
database=$work/data/clock.db log=$pictures/clock-sim.log

starts() { watch_start "$log" "$simulator" --data "$work/data" --24h "$@"; }
ask() { sqlite3 -readonly "$database" "$1"; }
column() { ask "SELECT $1 FROM alarm"; }
stored() { ask 'SELECT * FROM alarm'; }
alarms_are() { [ "$(ask 'SELECT count(*) FROM alarm' 2>/dev/null)" = "$1" ]; }
# column_is COLUMNS VALUES
column_is() { [ "$(column "$1")" = "$2" ]; }
toasts_are() { [ "$(grep -ac 'Toast: ' "$log")" = "$1" ]; }
no_error_is_logged() { [ -z "$(grep -a Critical "$log" | grep -avE "$CHECK_USUAL_ERRORS" | tee -a /dev/stderr)" ]; }
picture() { watch_picture "$pictures/$1.png"; }
# What lies below the title: that of a new alarm reads otherwise than that of a stored one.
below_title() { convert "$pictures/$1.png" -crop 360x275+0+85 rgb:- | cksum; }
# looks_like NAME NAME: the two pictures show the same below the title.
looks_like() { is "$(below_title "$1")" "$(below_title "$2")"; }
differs() { ! looks_like "$1" "$2" >/dev/null; }
to_top() { watch_until_still watch_scroll_back; }
# scrolls TIMES: moves the editor on by so many drags.
scrolls() {
    local left
    for ((left = $1; left > 0; left--)); do
        watch_scroll || return 1
    done
}
