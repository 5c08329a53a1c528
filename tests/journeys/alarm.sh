#!/usr/bin/env bash
# usage: alarm.sh CLOCK_SIM PICTURE_DIRECTORY
# An alarm's life, from the first tap to the database, by pointer and keys alone.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"

minute_is() { [ "$(column min)" = "$1" ]; }
ends() { watch_wait 10 bash -c '! kill -0 '"$watch_pid" && watch_exit; }
watch_exit() { wait "$watch_pid"; }

check "A display starts" watch_display "$work" || exit 1
check "The watch starts" starts
picture 1-no-alarms

# An alarm is created.
check "Create is tapped" watch_tap $WATCH_CREATE
picture 2-editor
check "Create opens the editor" differs 1-no-alarms 2-editor
check "The wheels are turned to 07:30" watch_set_time 06:00 07:30
picture 3-half-past-seven
check "The editor is scrolled to the name" watch_show_name
check "The name is tapped" watch_tap $WATCH_NAME
check "The name is typed" watch_type 'Gym & <tea>'
picture 4-name
check "Nothing is stored before Done" alarms_are 0
before=$(date +%s)
check "Done is tapped" watch_tap $WATCH_DONE
check "The alarm is stored" watch_wait 10 alarms_are 1
after=$(date +%s)
check "A toast tells when it rings" watch_wait 10 toasts_are 1
picture 5-toast

check "hour" is "$(column hour)" 7
check "min" is "$(column min)" 30
check "name, as it was typed" is "$(column name)" 'Gym & <tea>'
check "enable" is "$(column enable)" 1
created=$(column create_time)
check "create_time is the time of the tap" test "$created" -ge "$before" -a "$created" -le "$after"
check "update_time" is "$(column update_time)" "$created"
day=$(date -d "@$created" +%F)
check "alarm_time is 07:30 of the day it was saved on" is "$(column alarm_time)" "$(date -d "$day 07:30" +%s)"
check "alarm_time_base" is "$(column alarm_time_base)" "$(column alarm_time)"
[ "$(date -d "@$created" +%H%M)" \< 0730 ] || day=$(date -d "$day + 1 day" +%F)
check "auto_date is the midnight of the day it rings on" is "$(column auto_date)" "$(date -d "$day" +%s)"
check "manual_date" is "$(column manual_date)" 0
check "time_zone" is "$(column time_zone)" Europe/Berlin
check "repeat_once" is "$(column repeat_once)" 1
check "repeat_weekly" is "$(column repeat_weekly)" 0
check "snooze, its minutes, its number, and those used" is "$(column 'snooze, snooze_duration, snooze_repeat, snooze_count')" '1|5|3|0'
check "type" is "$(column type)" 0
check "sound_path" is "$(column sound_path)" /opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg
check "volume, and whether it rises" is "$(column 'volume, increase_volume')" '7|0'
check "tone_position" is "$(column tone_position)" 0
check "trailing" is "$(column trailing)" 0
id=$(column id)
check "The alarm has a schedule" test "$(column alarm_mgr_id)" -gt 0
check "The toast speaks of the time from now" grep -aq 'Toast: Alarm set for .* from now' "$log"
check "The indicator counts one alarm" grep -rqsE '\b1$' "$XDG_RUNTIME_DIR" --include='*alarm'

# A change is thrown away.
first=$(stored)
check "The alarm in the list is tapped" watch_tap $WATCH_FIRST_ALARM
picture 6-editor-again
check "The minutes are turned" watch_turn $WATCH_MINUTE_X 5
check "The back key is pressed" watch_key XF86Back
picture 7-discard
check "The back key brings the question" differs 6-editor-again 7-discard
check "Done lies below the question and is out of reach" watch_tap $WATCH_DONE
check "Nothing was stored" is "$(stored)" "$first"
check "Discard is tapped" watch_tap $WATCH_DISCARD
picture 8-discarded
check "The database has not changed" is "$(stored)" "$first"

# A change is kept.
check "The alarm is tapped again" watch_tap $WATCH_FIRST_ALARM
picture 9-unchanged
check "The thrown-away change is gone" differs 7-discard 9-unchanged
check "The minutes are turned to 40" watch_turn $WATCH_MINUTE_X 10
check "Escape, the back key of a keyboard, asks again" watch_key Escape
picture 9a-asked-again
check "The question is there again" differs 9-unchanged 9a-asked-again
check "The back key closes the question alone" watch_key XF86Back
picture 10-kept
check "Done is tapped again" watch_tap $WATCH_DONE
check "The new minute is stored" watch_wait 10 minute_is 40
check "There is still one alarm" alarms_are 1
check "It has the same id" is "$(column id)" "$id"
check "Its name is the same" is "$(column name)" 'Gym & <tea>'
check "A second toast came" watch_wait 10 toasts_are 2
picture 11-changed

# It is switched off and on in the list.
check "The switch of the alarm is tapped" watch_tap $WATCH_FIRST_SWITCH
check "The alarm is off" watch_wait 10 column_is enable 0
check "Its ring is cancelled" is "$(ask 'SELECT enabled FROM alarm_schedule')" 0
check "The indicator counts no alarm" grep -rqsE '\b0$' "$XDG_RUNTIME_DIR" --include='*alarm'
picture 11a-off
check "The list shows it" differs 11-changed 11a-off
check "The switch is tapped again" watch_tap $WATCH_FIRST_SWITCH
check "The alarm is on" watch_wait 10 column_is enable 1
check "It rings again" is "$(ask 'SELECT enabled, hour, minute FROM alarm_schedule')" '1|7|40'
check "A third toast tells when" watch_wait 10 toasts_are 3
check "Nothing but the alarm itself is left" is "$(column 'id, hour, min, name')" "$id|7|40|Gym & <tea>"

# Nothing is changed, nothing is asked.
second=$(stored)
check "The alarm is tapped once more" watch_tap $WATCH_FIRST_ALARM
check "Cancel is tapped" watch_tap $WATCH_CANCEL
check "The back key on the list closes the application" xdotool key Escape
check "It ends well" ends
check "The alarm is as it was" is "$(stored)" "$second"

# Whatever ends the watch, the alarm stays.
check "The watch starts on the stored alarm" starts --edit "$id"
picture 12-started-on-alarm
check "--edit opens the editor" differs 1-no-alarms 12-started-on-alarm
check "The end of a session ends it well" watch_stop
check "The watch starts once more" starts
kill -KILL "$watch_pid" && wait "$watch_pid" 2>/dev/null
check "A killed watch loses nothing" is "$(stored)" "$second"
check "No error was logged" no_error_is_logged
check_end
