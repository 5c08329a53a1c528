#!/usr/bin/env bash
# usage: sound.sh CLOCK_SIM PICTURE_DIRECTORY
# What an alarm sounds like: its volume by touch, by keys and from outside, and its tone.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"
preview=$pictures/preview.wav

# Another process of the device.
elsewhere() { (unset DISPLAY && timeout 60 "$simulator" --data "$work/data" "$@") 2>"$work/elsewhere"; }
system_volume() { tr -dc '0-9' <"$work/data/settings/db%2Fprivate%2Fsound%2Fvolume%2Falarm"; }
system_volume_is() { is "$(system_volume)" "$1"; }
volume_is() { column_is volume "$1"; }
# A WAV file's head has 44 bytes; silence is made of zeros.
sounds() { [ "$(tail -c +45 "$1" | tr -d '\0' | wc -c)" -gt 1000 ]; }
# A toast covers the button of the list.
button() { import -window root -crop 40x8+100+328 +repage rgb:- | cksum; }
toast_is_gone() { [ "$(button)" = "$bare_button" ]; }
opens() { watch_wait 15 toast_is_gone && watch_tap $WATCH_FIRST_ALARM && scrolls 2; }
done_with_volume() { watch_tap $WATCH_DONE && watch_wait 10 volume_is "$1"; }
picker_is_open() { xdotool search --onlyvisible --name '^tone-picker$'; }
picker_is_gone() { ! picker_is_open; }
picker_opens() { watch_tap $WATCH_TONE && watch_wait 20 picker_is_open && watch_settled; }
picker_closes() { watch_wait 20 picker_is_gone && watch_settled; }
# went TIMES, came TIMES: so often the application was left, and so often it came back.
went() { [ "$(grep -ac 'The application goes to the background' "$log")" = "$1" ]; }
came() { [ "$(grep -ac 'The application comes back' "$log")" = "$1" ]; }
went_and_came() { went "$1" && came "$1"; }
leaves_and_comes() { watch_key F5 && watch_key F6; }

# Settings from outside, before there is a watch.
check "Another process sets the volume, without a display" elsewhere --set-volume 5
check "The volume is set" system_volume_is 5

check "A display starts" watch_display "$work" || exit 1
export CLOCK_AUDIO_SINK="audioconvert ! wavenc ! filesink location=$preview sync=true"
check "The watch starts" starts
picture 1-list
bare_button=$(button)

# The keys on a screen that leaves them to the system.
check "The raise key is pressed" xdotool key XF86AudioRaiseVolume
check "The system takes it" watch_wait 5 system_volume_is 6
check "The face stands still" watch_settled
picture 2-system-volume
check "The level shows on the face" differs 1-list 2-system-volume
level_is_gone() { watch_settled && picture 3-level-gone && looks_like 1-list 3-level-gone >/dev/null; }
check "The level goes away" watch_wait 10 level_is_gone
check "A key that stands in for the lower key is held" watch_hold F2 1.5
check "It lowers the volume step by step" test "$(system_volume)" -le 3

# By touch.
check "Create is tapped" watch_tap $WATCH_CREATE
check "A new alarm has the level 7, and so has the system now" system_volume_is 7
check "The editor is scrolled to the volume" scrolls 2
picture 4-seven
check "The track is tapped" watch_tap_volume 12
picture 5-twelve
check "The knob moves below the finger" differs 4-seven 5-twelve
check "The alarm's tone is heard" watch_wait 5 sounds "$preview"
check "The system's volume is its own" system_volume_is 7
check "Done is tapped" watch_tap $WATCH_DONE
check "The alarm is stored" watch_wait 10 alarms_are 1
check "Its level is that of the tap" is "$(column volume)" 12
id=$(column id)
check "The alarm is opened" opens
picture 6-twelve-again
check "The slider shows the stored level" looks_like 5-twelve 6-twelve-again
check "The knob is dragged from 12 to 4" watch_drag_volume 12 4
check "Four is stored" done_with_volume 4

# By keys.
check "The alarm is opened again" opens
check "The system has the alarm's level" system_volume_is 4
check "The raise key is pressed twice" watch_key XF86AudioRaiseVolume XF86AudioRaiseVolume
picture 7-six
check "The lower key is held" watch_hold XF86AudioLowerVolume 3
picture 8-silent
check "A held key goes on to silence" differs 7-six 8-silent
check "The raise key is pressed three times" watch_key XF86AudioRaiseVolume XF86AudioRaiseVolume XF86AudioRaiseVolume
check "Its stand-in is pressed twice" watch_key F3 F3
check "The system stays out of keys that the editor has taken" system_volume_is 4
check "Five is stored" done_with_volume 5

# The quick panel.
check "The alarm is opened for the panel" opens
picture 9-five
check "The quick panel is pulled down" watch_key F4
picture 10-panel
check "The panel covers the face" differs 9-five 10-panel
check "The raise key is pressed below the panel" watch_key XF86AudioRaiseVolume
check "Now it is the system's" system_volume_is 6
check "Another process sets the volume meanwhile" elsewhere --set-volume 2
check "The quick panel is pushed up" watch_key F4
picture 11-two
check "The slider shows the volume of the system" differs 9-five 11-two
check "The raise key is pressed above the panel" watch_key XF86AudioRaiseVolume
check "It is the editor's again" system_volume_is 2
check "Three is stored" done_with_volume 3

# Rows that come and go.
check "The alarm is opened for its type" opens
picture 12-sound
check "Alarm type is tapped" watch_tap $WATCH_TYPE_LATER
check "Vibration is tapped" watch_tap $WATCH_VIBRATION
picture 13-vibration
check "The volume and the tone are gone" differs 12-sound 13-vibration
check "The raise key has nothing to raise" watch_key XF86AudioRaiseVolume
picture 14-vibration
check "Nothing moves" looks_like 13-vibration 14-vibration
check "It is not the system's either" system_volume_is 3
check "The editor is scrolled to its top" to_top
check "It is scrolled to the type" watch_scroll
check "Alarm type is tapped again" watch_tap $WATCH_TYPE
check "Sound is tapped" watch_tap $WATCH_SOUND
check "The editor is scrolled on" watch_scroll
picture 15-sound
check "The volume and the tone are back" looks_like 12-sound 15-sound
check "Power saving is switched on" watch_key F10
picture 16-power-saving
check "The tone is gone" differs 15-sound 16-power-saving
check "Power saving is switched off" watch_key F10
picture 17-no-power-saving
check "The tone is back" looks_like 15-sound 17-no-power-saving
check "Another process switches power saving on" elsewhere --power-saving on
picture 18-not-yet
check "The editor does not look at it by itself" looks_like 15-sound 18-not-yet
check "The application is left and comes back" leaves_and_comes
picture 19-power-saving
check "Now the tone is gone" looks_like 16-power-saving 19-power-saving
check "Another process switches power saving off" elsewhere --power-saving off
check "The application is left and comes back again" leaves_and_comes

# Another tone.
check "The tone picker opens" picker_opens
picture 20-picker
check "It lies over the editor" differs 15-sound 20-picker
check "The application went to the background" went 3
check "Another process sets the volume behind it" elsewhere --set-volume 9
check "The tone below the marked one is tapped" watch_tap $WATCH_TONE_BELOW
picture 21-marked
check "It is marked" differs 20-picker 21-marked
check "Done is tapped in the picker" watch_tap $WATCH_DONE
check "The picker goes" picker_closes
check "The application came back" watch_wait 5 went_and_came 3
picture 22-chosen
check "The editor shows what has changed" differs 15-sound 22-chosen
check "The level that was set meanwhile is stored" done_with_volume 9
tone=$(column 'sound_path, tone_position')
check "The chosen tone is stored, and its place in the list" is "$tone" '/opt/usr/share/settings/Ringtones/Alarm_Marimba.ogg|2'
check "No error was logged so far" no_error_is_logged

# A picker that dies.
check "The alarm is opened for the last time" opens
picture 23-before
check "The tone picker opens again" picker_opens
check "The picker is killed" kill -KILL "$(pgrep -P "$watch_pid" -f com.vendra.setting.sound-tone-list)"
check "Its window goes" picker_closes
check "The application came back from it" watch_wait 5 went_and_came 4
picture 24-after
check "The editor is as it was" looks_like 23-before 24-after
check "Its volume can still be changed" watch_tap_volume 1
check "One is stored" done_with_volume 1
check "The tone is the same" is "$(column 'sound_path, tone_position')" "$tone"
check "There is one alarm" alarms_are 1
check "The log tells of the picker's end" grep -aq 'com.vendra.setting.sound-tone-list .*without an answer' "$log"
check "The watch ends well" watch_stop

# Without a window manager nobody has the focus.
watch_end
check "A bare display starts" watch_display "$work" bare || exit 1
check "The watch starts on the alarm" starts --edit "$id"
check "The editor is scrolled to the tone" scrolls 2
check "The tone picker opens on the bare display" picker_opens
check "The application was left for it" watch_wait 5 went 5
check "Cancel is tapped in the picker" watch_tap $WATCH_CANCEL
check "The picker goes from the bare display" picker_closes
check "The application came back once more" watch_wait 5 went_and_came 5
check "The watch ends well again" watch_stop
CHECK_USUAL_ERRORS+='|app_control_get_extra_data failed|without an answer'
check "No other error was logged" no_error_is_logged
check_end
