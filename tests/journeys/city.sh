#!/usr/bin/env bash
# usage: city.sh CLOCK_SIM PICTURE_DIRECTORY
# Cities for the world clock: searched, looked up by the index, located, added, refused and removed.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"
# The city picker tells at error priority what it does.
CHECK_USUAL_ERRORS+='|WORLDCLOCK'

cities() { sqlite3 -readonly "$work/data/world-clock-selection.db" "SELECT $1 FROM selected_city ORDER BY position"; }
cities_are() { is "$(cities 'city, position')" "$1"; }
# The pointer has a form of its own over the search field.
picture() { xdotool mousemove 5 5 && watch_settled && watch_picture "$pictures/$1.png"; }
# Number of pixels in the first row that have the colour of a highlight.
highlighted() {
    convert "$pictures/$1.png" -crop 260x60+40+140 +repage -fuzz 15% -fill black +opaque '#4DB6FF' \
        -fuzz 0 -fill white +opaque black -format '%[fx:round(mean*w*h)]' info:-
}
more_highlighted() { [ "$(highlighted "$2")" -gt "$(highlighted "$1")" ]; }
is_refused() { grep -aq 'Toast: Kathmandu has already been added' "$log"; }
# network CODE: the watch finds another mobile network.
network() {
    local settings=$XDG_RUNTIME_DIR/clock-ui/settings
    mkdir -p "$settings" && echo "string $1" >"$work/network" && mv "$work/network" "$settings/memory%2Ftelephony%2Fplmn"
}
toast_is_gone() { [ "$(watch_look)" != "$toast" ]; }

check "A display starts" watch_display "$work" || exit 1
check "The watch starts" starts
picture 1-alarms
check "The title's button is tapped" watch_tap $WATCH_WORLD_CLOCK
picture 2-no-cities
check "It leads to the world clock" differs 1-alarms 2-no-cities
check "Add city is tapped" watch_tap $WATCH_CREATE
picture 3-picker
check "The city picker opens" differs 2-no-cities 3-picker

# Searching.
check "The search field is tapped" watch_tap $WATCH_SEARCH
check "Two letters are typed" watch_type ka
picture 4-two-letters
check "The list is narrowed" differs 3-picker 4-two-letters
check "What was typed is highlighted" more_highlighted 3-picker 4-two-letters
check "Four more are typed" watch_type thma
picture 5-six-letters
check "The list is narrowed further" differs 4-two-letters 5-six-letters
check "More is highlighted" more_highlighted 4-two-letters 5-six-letters
check "Letters that no city has are typed" watch_type qqq
picture 6-nothing
check "The picker says so" differs 5-six-letters 6-nothing
check "The field is cleared" watch_tap $WATCH_CLEAR
check "The keypad is sent away" watch_key Return
picture 7-all
check "All cities are back" looks_like 3-picker 7-all

# The index.
check "The index is tapped at its lower end" watch_tap $WATCH_INDEX_LAST
picture 8-east
check "The list moves there" differs 7-all 8-east
check "The finger goes up along the rim" watch_drag $WATCH_INDEX_LAST $WATCH_INDEX_FIRST
picture 9-west
check "The list is at its top again" looks_like 7-all 9-west

# Locating.
check "The location button is tapped without a network" watch_tap $WATCH_LOCATE
check "A toast says that there is none" grep -aq 'Toast: Location services are not available' "$log"
toast=$(watch_look)
check "The toast goes away" watch_wait 15 toast_is_gone
check "The watch finds a network in Nepal" network 42901
check "The location button is tapped" watch_tap $WATCH_LOCATE
picture 10-nepal
check "The list is narrowed to the country" differs 7-all 10-nepal
check "The first city is tapped" watch_tap $WATCH_FIRST_CITY
picture 11-added
check "The world clock is back with the city" differs 2-no-cities 11-added
check "It is stored as the first one" cities_are 'IDS_CITY_NP_KATHMANDU|0'
check "It is stored by its key" is "$(cities key)" 658985929

# The same city again, and another one.
check "Add city is tapped again" watch_tap $WATCH_CREATE
check "The search field is tapped again" watch_tap $WATCH_SEARCH
check "The same city is typed" watch_type kathmandu
picture 12-again
check "It is tapped" watch_tap $WATCH_FIRST_CITY
check "A toast says that it is there already" watch_wait 10 is_refused
check "The list stays as it was" cities_are 'IDS_CITY_NP_KATHMANDU|0'
toast=$(watch_look)
check "The toast goes away as well" watch_wait 15 toast_is_gone
check "The field is cleared again" watch_tap $WATCH_CLEAR
check "Another city is typed" watch_type honolulu
check "It is tapped, too" watch_tap $WATCH_FIRST_CITY
picture 13-two
check "It is the second one" cities_are $'IDS_CITY_NP_KATHMANDU|0\nIDS_CITY_US_HAWAII_HONOLULU|1'
check "The list shows where it is" differs 11-added 13-two

# One leaves, and nothing is lost.
check "The watch ends well" watch_stop
check "It starts on the world clock" starts --world-clock
picture 14-started
check "The list begins with the first city" differs 2-no-cities 14-started
check "The first city is tapped" watch_tap $WATCH_FIRST_ALARM
picture 15-question
check "The watch asks" differs 14-started 15-question
check "Cancel is tapped" watch_tap $WATCH_KEEP
check "Both cities are still there" is "$(cities 'count(*)')" 2
check "The first city is tapped again" watch_tap $WATCH_FIRST_ALARM
check "Remove is tapped" watch_tap $WATCH_DISCARD
picture 16-removed
check "It is gone from the list" differs 14-started 16-removed
check "The other one is left" cities_are 'IDS_CITY_US_HAWAII_HONOLULU|1'
check "The picker is opened once more" watch_tap $WATCH_CREATE
check "Cancel is tapped in the picker" watch_tap $WATCH_BACK
picture 17-cancelled
check "Nothing was added" cities_are 'IDS_CITY_US_HAWAII_HONOLULU|1'
check "The title's button leads back" watch_tap $WATCH_WORLD_CLOCK
picture 18-alarms
check "The alarms are there again" looks_like 1-alarms 18-alarms
check "The watch ends well again" watch_stop
check "No error was logged" no_error_is_logged
check_end
