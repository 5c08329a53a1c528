#!/usr/bin/env bash
# usage: tone-picker.sh CLOCK_SIM PICTURE_DIRECTORY
# A tone is picked for an alarm: from the editor's row to the tone picker, a program of its own, and back.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/begin.sh" "$@"
export CLOCK_TONE_DIR=$work/tones
mkdir "$work/tones" || exit 1
database=$work/data/clock.db log=$pictures/clock-sim.log
folder=/opt/usr/share/settings/Ringtones

tone_row="120 150" # of the editor, once it is scrolled by three drags
second_tone="150 193" # of the picker
third_tone="150 265"

# A byte, and a number as the sound file has it, lowest byte first.
byte() { printf "\\x$(printf %02x "$1")"; }
number() { byte $(($1 & 255)) && byte $(($1 >> 8)) && printf '\0\0'; }
# tone FILE [TITLE]: a second of silence. The title has an odd number of letters: the chunk is even then.
tone() {
    local title=${2-} length
    length=${#title}
    {
        printf 'RIFF' && number $((8036 + (length ? 29 + length : 0)))
        printf 'WAVEfmt \x10\0\0\0\x01\0\x01\0\x40\x1f\0\0\x40\x1f\0\0\x01\0\x08\0'
        [ -z "$title" ] || {
            printf 'ID3 ' && number $((21 + length)) && printf 'ID3\x04\0\0\0\0\0' && byte $((11 + length))
            printf 'TIT2\0\0\0' && byte $((length + 1)) && printf '\0\0\x03%s' "$title"
        }
        printf 'data' && number 8000 && head -c 8000 /dev/zero | tr '\0' '\200'
    } >"$CLOCK_TONE_DIR/$1"
}
ask() { sqlite3 -readonly "$database" "$1"; }
picker() { xdotool search --onlyvisible --name '^tone-picker$' 2>/dev/null; }
picker_process() { xdotool getwindowpid "$(picker)"; }
is_open() { [ -n "$(picker)" ]; }
is_closed() { [ -z "$(picker)" ]; }
opens() { xdotool mousemove $tone_row mousedown 1 sleep 0.05 mouseup 1 && watch_wait 20 is_open && watch_settled; }
closes() { watch_wait 20 is_closed && watch_settled; }
picture() { watch_picture "$pictures/$1.png"; }
# Pictures show the same, or something else.
pixels() { convert "$pictures/$1.png" rgb:- | cksum; }
same() { is "$(pixels "$1")" "$(pixels "$2")"; }
# marked PICTURE Y: the mark of the row at that height is filled with the accent colour.
marked() { is "$(convert "$pictures/$1.png" -format "%[fx:p{301,$2}.b > 0.9 && p{301,$2}.r < 0.5]" info:-)" 1; }
differs() { ! same "$1" "$2" >/dev/null; }
shows_tone_row() { watch_scroll && watch_scroll && watch_scroll; }
tone_is() { [ "$(ask 'SELECT sound_path, tone_position FROM alarm' 2>/dev/null)" = "$1" ]; }

tone Alarm_Impatient.ogg
tone zz.wav Bells # the title counts, not the file's name
for name in Crickets Morning Ocean Zephyr; do tone $name.wav; done

check "A display starts" watch_display "$work" || exit 1
check "The watch starts on a new alarm" watch_start "$log" "$simulator" --data "$work/data" --24h --create || exit 1
check "The editor is scrolled to the tone" shows_tone_row
picture 1-tone-row

check "A tap on the tone opens the picker" opens
picture 2-picker
check "The picker lies over the editor" differs 1-tone-row 2-picker
check "It belongs to the editor's window" grep -q "$(printf '%#x' "$(xdotool search --onlyvisible --name '^clock-sim$')")" <(xprop -id "$(picker)" WM_TRANSIENT_FOR)
check "The second tone is tapped" watch_tap $second_tone
picture 3-second-tone
check "The tone of the alarm was marked before" marked 2-picker 121
check "The second tone takes the mark over" marked 3-second-tone 193
check "The first one is not marked any more" differs 2-picker 3-second-tone
check "Done is tapped" watch_tap $WATCH_DONE
check "The picker closes" closes
picture 4-picked
check "The editor's row names another tone" differs 1-tone-row 4-picked

check "A tap opens the picker again" opens
picture 5-picker-again
check "The tone that was picked is marked" marked 5-picker-again 187
check "The third tone is tapped" watch_tap $third_tone
check "The back key is pressed" xdotool key XF86Back
check "The back key closes the picker" closes
picture 6-cancelled
check "The editor keeps its tone" same 4-picked 6-cancelled

check "A third tap opens the picker" opens
check "The third tone is tapped once more" watch_tap $third_tone
check "Cancel is tapped" watch_tap $WATCH_CANCEL
check "Cancel closes the picker" closes
picture 7-cancelled-again
check "The editor keeps its tone again" same 4-picked 7-cancelled-again

check "A fourth tap opens the picker" opens
process=$(picker_process)
check "It is killed" kill -KILL "$process"
check "A killed picker is gone" closes
picture 8-killed
check "The editor keeps its tone and goes on" same 4-picked 8-killed

check "Done in the editor" watch_tap $WATCH_DONE
check "The alarm has the tone and its place in the list" watch_wait 10 tone_is "$folder/zz.wav|1"

check "The alarm is opened" watch_tap $WATCH_FIRST_ALARM
check "It is scrolled to its tone" shows_tone_row
rm "$CLOCK_TONE_DIR"/*
check "The picker opens without a tone" opens
picture 9-no-tones
check "It says so" differs 2-picker 9-no-tones
check "Done picks nothing" watch_tap $WATCH_DONE
check "The picker is still there" is_open
process=$(picker_process)
check "The watch ends well under the picker" watch_stop
check "The picker ends with it" watch_wait 10 bash -c "! kill -0 $process"
check "The alarm is as it was" tone_is "$folder/zz.wav|1"
check_end
