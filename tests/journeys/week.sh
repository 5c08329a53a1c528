#!/usr/bin/env bash
# usage: week.sh CLOCK_SIM PICTURE_DIRECTORY
# An alarm for the working days becomes one for a day of its own, by pointer and keys alone.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"

schedule() { ask "SELECT $1 FROM alarm_schedule JOIN alarm ON alarm_mgr_id = schedule_id"; }
repeat_is() { [ "$(column repeat_weekly)" = "$1" ]; }
# look_through NAME: pictures of the whole editor, from its first row to its last.
look_through() {
    picture "$1-top"
    watch_scroll && picture "$1-middle"
    watch_show_name && picture "$1-end"
}
looks_through_like() {
    local part
    for part in top middle end; do
        looks_like "$1-$part" "$2-$part" || return 1
    done
}
toast_is_gone() { [ "$(watch_look)" != "$toast" ]; }

check "A display starts" watch_display "$work" || exit 1
check "The watch starts" starts

# Monday to Friday.
check "Create is tapped" watch_tap $WATCH_CREATE
check "The wheels are turned to 07:03" watch_set_time 06:00 07:03
check "The editor is scrolled to the repeat row" watch_scroll
picture 1-before
check "Repeat is tapped" watch_tap $WATCH_REPEAT
check "Monday is tapped" watch_tap $WATCH_MONDAY
picture 2-monday
check "The days are scrolled" watch_scroll
check "Tuesday is tapped" watch_tap $WATCH_TUESDAY
check "Wednesday is tapped" watch_tap $WATCH_WEDNESDAY
picture 3-wednesday
check "The days are scrolled to their end" watch_until_still watch_scroll
check "Thursday is tapped" watch_tap $WATCH_THURSDAY
check "Friday is tapped" watch_tap $WATCH_FRIDAY
picture 4-friday
check "The arrow leads back" watch_tap $WATCH_BACK
picture 5-after
check "The repeat row reads otherwise" differs 1-before 5-after

# Vibration and sound, no snooze.
check "Alarm type is tapped" watch_tap $WATCH_TYPE
picture 6-type
check "Vibration and sound is tapped" watch_tap $WATCH_VIBRATION_AND_SOUND
picture 7-type-chosen
check "The type row reads otherwise" differs 5-after 7-type-chosen
check "The editor is scrolled to its end" watch_show_name
check "The editor is scrolled back to snooze" watch_scroll_back
picture 8-snooze-on
check "Snooze is tapped" watch_tap $WATCH_SNOOZE
picture 9-snooze-off
check "The switch of snooze shows it" differs 8-snooze-on 9-snooze-off
check "The editor is scrolled to its top" to_top
look_through 10-made
check "Nothing is stored before Done" alarms_are 0
check "Done is tapped" watch_tap $WATCH_DONE
check "The alarm is stored" watch_wait 10 alarms_are 1
check "A toast tells when it rings" watch_wait 10 toasts_are 1
toast=$(watch_look)
check "The toast goes away" watch_wait 15 toast_is_gone
check "The list is still" watch_settled

check "hour and min" is "$(column 'hour, min')" '7|3'
check "repeat_weekly, Monday to Friday" is "$(column repeat_weekly)" 62
check "repeat_once" is "$(column repeat_once)" 0
check "A weekly alarm has no dates" is "$(column 'auto_date, manual_date')" '0|0'
check "type, vibrate and sound" is "$(column type)" 2
check "snooze" is "$(column snooze)" 0
check "The snooze's minutes and its number are as they were" is "$(column 'snooze_duration, snooze_repeat')" '5|3'
check "enable" is "$(column enable)" 1
check "It rings at 07:03 on the same days" is "$(schedule 'alarm_schedule.hour, minute, weekdays')" '7|3|62'
id=$(column id)

# Everything is as it was.
stored=$(ask 'SELECT * FROM alarm')
check "The alarm in the list is tapped" watch_tap $WATCH_FIRST_ALARM
look_through 11-opened
check "The editor shows what was made" looks_through_like 10-made 11-opened
check "The editor is scrolled to its top" to_top
check "The editor is scrolled to the repeat row" watch_scroll
check "Repeat is tapped again" watch_tap $WATCH_REPEAT
check "The days are scrolled to their end again" watch_until_still watch_scroll
picture 12-days
check "The days are ticked as they were" looks_like 4-friday 12-days
check "The back key leads back" watch_key XF86Back
check "Alarm type is tapped again" watch_tap $WATCH_TYPE
picture 13-type
check "Another type is ticked than at first" differs 6-type 13-type
check "The back key closes the popup" watch_key XF86Back
check "The editor is scrolled to its top again" to_top
picture 14-looked
check "Looking has changed nothing" looks_like 11-opened-top 14-looked
check "Nothing is stored by looking" is "$(ask 'SELECT * FROM alarm')" "$stored"

# A day of its own: the Wednesday in the third week of next month's page.
month=$(date -d "$(date +%Y-%m-01) + 1 month" +%Y-%m)
day=$(printf '%s-%02d' "$month" $((18 - $(date -d "$month-01" +%w))))
check "Date is tapped" watch_tap $WATCH_DATE
picture 15-calendar
check "The calendar opens" differs 14-looked 15-calendar
check "Cancel closes it" watch_tap $WATCH_CALENDAR_CANCEL
picture 16-cancelled
check "Cancel leaves the days as they were" looks_like 14-looked 16-cancelled
check "Date is tapped again" watch_tap $WATCH_DATE
check "The next month is tapped" watch_tap $WATCH_NEXT_MONTH
picture 17-next-month
check "The next month shows" differs 15-calendar 17-next-month
check "A Wednesday is tapped" watch_tap $WATCH_THIRD_WEDNESDAY
picture 18-wednesday
check "Set is tapped" watch_tap $WATCH_SET
picture 19-set
check "The strip tells the day" differs 14-looked 19-set
check "The editor is scrolled to the repeat row once more" watch_scroll
picture 20-never
check "The repeat row reads Never, as at first" differs 10-made-middle 20-never
check "Nothing is stored before Done is tapped again" is "$(ask 'SELECT * FROM alarm')" "$stored"
check "Done is tapped again" watch_tap $WATCH_DONE
check "The alarm has lost its days" watch_wait 10 repeat_is 0

midnight=$(date -d "$day" +%s)
check "repeat_once is set again" is "$(column repeat_once)" 1
check "auto_date is the midnight of the day" is "$(column auto_date)" "$midnight"
check "manual_date is the same" is "$(column manual_date)" "$midnight"
check "There is one alarm, the same" is "$(ask 'SELECT id FROM alarm')" "$id"
check "The rest is as it was" is "$(column 'hour, min, type, snooze')" '7|3|2|0'
check "It rings on that day" is "$(schedule "printf('%04d-%02d-%02d', year, month, day)")" "$day"
check "A second toast came" watch_wait 10 toasts_are 2
check "The watch ends well" watch_stop
check "No error was logged" no_error_is_logged
check_end
