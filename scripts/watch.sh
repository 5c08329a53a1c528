# shellcheck shell=bash
# Sourced by the tour and the journeys: a virtual display, the simulator on it, and a finger.
#
# Every place that is tapped stands here, in pixels of the 360 x 360 face.

WATCH_CREATE="180 325"      # button of the alarm list
WATCH_FIRST_ALARM="180 165" # first row of the alarm list
WATCH_FIRST_SWITCH="285 188" # its switch
WATCH_WORLD_CLOCK="180 60"  # title's button of either list
WATCH_CANCEL="124 60"       # title buttons of the editor
WATCH_DONE="236 60"
WATCH_HOUR_X=122            # wheels of the editor
WATCH_MINUTE_X=238
WATCH_WHEEL_TOP=100
WATCH_WHEEL_BOTTOM=225
WATCH_WHEEL_STEP=54         # height of one value
WATCH_WHEEL_FEW=3           # so many values can be turned without leaving the display
WATCH_LIST_BOTTOM="60 285"  # between these, a drag moves a list by most of what it shows
WATCH_LIST_TOP="60 90"
WATCH_DATE="180 300"        # date button
WATCH_REPEAT="120 215"      # rows, once the editor is scrolled by one drag
WATCH_TYPE="120 303"
WATCH_TYPE_LATER="120 151"  # rows, once it is scrolled by two drags
WATCH_VOLUME_Y=234
WATCH_VOLUME_FROM=89        # what answers touches of the slider
WATCH_VOLUME_WIDTH=226
WATCH_VOLUME_KNOB=28
WATCH_TONE="120 311"
WATCH_NAME="160 208"        # name field, once the editor is scrolled to its end
WATCH_SNOOZE="120 125"      # row, once it is scrolled back from there by one drag
WATCH_BACK="180 60"         # title button of the repeat screen
WATCH_MONDAY="120 265"      # rows of the repeat screen
WATCH_TUESDAY="120 174"     # once it is scrolled by one drag
WATCH_WEDNESDAY="120 246"
WATCH_THURSDAY="120 109"    # once it is scrolled to its end
WATCH_FRIDAY="120 181"
WATCH_SOUND="120 104"               # rows of the type popup
WATCH_VIBRATION="120 176"
WATCH_VIBRATION_AND_SOUND="120 246"
WATCH_TONE_BELOW="120 258"          # row of the tone picker, below the one that is marked at first
WATCH_NEXT_MONTH="266 61"           # calendar: right arrow, and the fourth day of the third week
WATCH_THIRD_WEDNESDAY="179 177"
WATCH_SEARCH="140 112"      # city picker: the field, the location button, the first row
WATCH_LOCATE="296 112"
WATCH_CLEAR="240 112"
WATCH_INDEX_FIRST="341 152" # ends of the index along the rim
WATCH_INDEX_LAST="311 277"
WATCH_FIRST_CITY="150 185"
WATCH_SET="225 310"
WATCH_CALENDAR_CANCEL="134 310"
WATCH_KEEP="115 276"        # buttons of the discard popup
WATCH_DISCARD="245 276"

watch_pids=()

# watch_wait SECONDS COMMAND...: tries until the command succeeds.
watch_wait() {
    local tries=$(($1 * 20))
    shift
    until "$@" >/dev/null 2>&1; do
        tries=$((tries - 1))
        [ $tries -gt 0 ] || return 1
        sleep 0.05
    done
}

# watch_display DIRECTORY [bare]: starts a display of its own, and a window manager on it unless it is
# to be bare.
watch_display() {
    local number=$1/display-number
    # The number of an earlier display must not be taken for this one's.
    rm -f "$number"
    # Without -noreset it starts anew when its last client goes, and refuses the next one meanwhile.
    Xvfb -displayfd 3 -screen 0 "${WATCH_SCREEN-360x360}x24" -nolisten tcp -noreset 3>"$number" 2>"$1/xvfb.log" &
    watch_pids+=($!)
    watch_wait 20 test -s "$number" || return 1
    DISPLAY=:$(cat "$number")
    export DISPLAY
    [ "${2-}" = bare ] && watch_wait 20 xdotool getmouselocation && return
    matchbox-window-manager -use_titlebar no >"$1/window-manager.log" 2>&1 &
    watch_pids+=($!)
    watch_wait 20 xdotool getmouselocation
}

# watch_start LOG PROGRAM [ARGUMENT...]: starts the simulator and waits until its window is there.
watch_start() {
    local log=$1
    shift
    "$@" >>"$log" 2>&1 &
    watch_pid=$!
    watch_pids+=("$watch_pid")
    watch_wait 30 watch_window_or_end || return 1
    kill -0 "$watch_pid" 2>/dev/null && watch_settled
}

watch_window_or_end() {
    xdotool search --onlyvisible --name '^(clock-sim|city-picker)$' || ! kill -0 "$watch_pid"
}

# watch_stop: ends the simulator as a session's end does. Returns its exit status.
watch_stop() {
    kill -TERM "$watch_pid" 2>/dev/null
    wait "$watch_pid"
}

# watch_end: ends everything that was started here.
watch_end() {
    local index
    for ((index = ${#watch_pids[@]} - 1; index >= 0; index--)); do
        kill "${watch_pids[index]}" 2>/dev/null
        wait "${watch_pids[index]}" 2>/dev/null
    done
    watch_pids=()
}

# Prints a fingerprint of what is on the face.
watch_look() {
    import -window root rgb:- | cksum
}

# Prints whether the simulator sleeps (S) or wants the processor, and the time it has used.
watch_work() {
    cut -d ' ' -f 3,14,15 "/proc/$watch_pid/stat" 2>/dev/null
}

# watch_settled: waits until the face has stopped moving. On a busy machine it stands still for a
# while before it moves, so the simulator must have nothing to do either, three looks in a row.
watch_settled() {
    local before now still=0 tries=100
    before=$(watch_look; watch_work)
    while [ $tries -gt 0 ]; do
        sleep 0.1
        now=$(watch_look; watch_work)
        case $now in
        "$before") [[ $now = *$'\n'S* ]] && still=$((still + 1)) || still=0 ;;
        *) still=0 ;;
        esac
        [ $still -ge 3 ] && return 0
        before=$now
        tries=$((tries - 1))
    done
    return 1
}

# watch_picture FILE: saves what is on the face.
watch_picture() {
    import -window root "png:$1"
}

# watch_tap X Y
watch_tap() {
    xdotool mousemove "$1" "$2" mousedown 1 sleep 0.05 mouseup 1
    watch_settled
}

# watch_drag X1 Y1 X2 Y2: a slow drag that rests before the finger is lifted, so nothing is flung.
watch_drag() {
    local step steps=12
    xdotool mousemove "$1" "$2" mousedown 1
    for ((step = 1; step <= steps; step++)); do
        xdotool mousemove $(($1 + ($3 - $1) * step / steps)) $(($2 + ($4 - $2) * step / steps)) sleep 0.02
    done
    xdotool sleep 0.3 mouseup 1
    watch_settled
}

# watch_turn X STEPS: turns the wheel at X by STEPS values, later ones for positive numbers.
watch_turn() {
    local left=$2 few
    while [ "$left" != 0 ]; do
        few=$left
        [ "$few" -le $WATCH_WHEEL_FEW ] || few=$WATCH_WHEEL_FEW
        [ "$few" -ge -$WATCH_WHEEL_FEW ] || few=-$WATCH_WHEEL_FEW
        if [ "$few" -gt 0 ]; then
            watch_drag "$1" $WATCH_WHEEL_BOTTOM "$1" $((WATCH_WHEEL_BOTTOM - few * WATCH_WHEEL_STEP)) || return 1
        else
            watch_drag "$1" $WATCH_WHEEL_TOP "$1" $((WATCH_WHEEL_TOP - few * WATCH_WHEEL_STEP)) || return 1
        fi
        left=$((left - few))
    done
}

# watch_set_time FROM TO: turns both wheels, for example from 06:00 to 07:30.
watch_set_time() {
    watch_turn $WATCH_HOUR_X $((10#${2%:*} - 10#${1%:*})) &&
        watch_turn $WATCH_MINUTE_X $((10#${2#*:} - 10#${1#*:}))
}

# watch_tap_volume LEVEL: touches the slider's track. A touch of the knob itself leaves it as it is.
watch_tap_volume() {
    watch_tap $((WATCH_VOLUME_FROM + (WATCH_VOLUME_WIDTH * $1 + 7) / 15)) $WATCH_VOLUME_Y
}

# watch_drag_volume FROM TO: takes the knob from one level to another.
watch_drag_volume() {
    local from=$((WATCH_VOLUME_FROM + WATCH_VOLUME_KNOB / 2)) width=$((WATCH_VOLUME_WIDTH - WATCH_VOLUME_KNOB))
    watch_drag $((from + width * $1 / 15)) $WATCH_VOLUME_Y $((from + width * $2 / 15)) $WATCH_VOLUME_Y
}

# watch_hold KEY SECONDS: holds a key down; the keyboard repeats it.
watch_hold() {
    xdotool keydown "$1" sleep "$2" keyup "$1"
    watch_settled
}

# watch_scroll: moves a list on by most of what it shows.
watch_scroll() {
    # shellcheck disable=SC2086
    watch_drag $WATCH_LIST_BOTTOM $WATCH_LIST_TOP
}

# watch_scroll_back: moves a list back as far.
watch_scroll_back() {
    # shellcheck disable=SC2086
    watch_drag $WATCH_LIST_TOP $WATCH_LIST_BOTTOM
}

# watch_until_still COMMAND...: repeats what moves the face until the face stays as it is.
watch_until_still() {
    local before now tries=15
    before=$(watch_look)
    while [ $tries -gt 0 ]; do
        "$@" || return 1
        now=$(watch_look)
        [ "$now" = "$before" ] && return 0
        before=$now
        tries=$((tries - 1))
    done
    return 1
}

# Scrolls the editor to its name field, which is its last row.
watch_show_name() {
    watch_until_still watch_scroll
}

# watch_key KEY...
watch_key() {
    xdotool key "$@"
    watch_settled
}

# watch_type TEXT
watch_type() {
    xdotool type --delay 30 "$1"
    watch_settled
}
