#!/usr/bin/env bash
# usage: script.sh CLOCK_SIM PICTURE_DIRECTORY
# Scripts and commands: what they do to a watch without a display, and how they fail.
set -u
. "$(dirname "${BASH_SOURCE[0]}")/begin.sh" "$@"
data=$work/data

# runs STATUS ARGUMENT...: runs the simulator; what it prints is in $out and $err afterwards.
runs() {
    local expected=$1 status
    shift
    timeout 180 "$simulator" "$@" >"$work/out" 2>"$work/err"
    status=$?
    out=$(tr -d '\0' <"$work/out") err=$(tr -d '\0' <"$work/err")
    is "$status" "$expected" || {
        tail -n 3 "$work/err"
        return 1
    }
}
# scripted STATUS: runs the script of the standard input on a watch of its own.
scripted() {
    cat >"$work/day.script"
    runs "$1" --data "$data" --24h --script "$work/day.script"
}
# says LINE TEXT: the only line about the script names the line and the reason.
says() {
    is "$(grep -ac "^$work/day.script:" "$work/err")" 1 &&
        contains "$(grep -a "^$work/day.script:" "$work/err")" "day.script:$1: $2"
}
# command STATUS LINE...: sends commands to the watch that runs.
command_gives() {
    local status=$1 line
    local arguments=()
    shift
    for line in "$@"; do arguments+=(--command "$line"); done
    runs "$status" "${arguments[@]}"
}
ask() { sqlite3 -readonly "$data/clock.db" "$1"; }
is_png() { is "$(identify -format '%m %wx%h' "$1")" "PNG 360x360"; }
# pixel FILE X Y: its colour with opacity.
pixel() { convert "$1" -format "%[pixel:p{$2,$3}]" info:; }
# Its pictures, each in a chunk of its own.
frames_of() { grep -ao ANMF "$1" | wc -l; }

# A whole day's work.
cd "$pictures" || exit 1
check "A script sets an alarm and adds a city" scripted 0 <<'SCRIPT'
# Monday to Friday at half past seven.
record start day.webp 20
tap Create
time 07:30
scroll-to "Repeat weekly"
tap "Repeat weekly"
scroll-to "Every Monday"
tap "Every Monday"
scroll-to "Every Tuesday"
tap "Every Tuesday"
scroll-to "Every Wednesday"
tap "Every Wednesday"
scroll-to "Every Thursday"
tap "Every Thursday"
scroll-to "Every Friday"
tap "Every Friday"
key XF86Back
# The tones are an application of their own.
scroll-to "Alarm tone"
tap "Alarm tone"
wait Marimba
tap Marimba
screenshot tones.png
tap Done
wait idle
scroll-to Alarm
tap Alarm
type "Swim \"early\""
expect "Swim \"early\""
screenshot name.png square
tap Done
wait "Alarm set for" 5
screenshot list.png
record stop
expect 07:30
tap "World clock"
tap "Add city"
tap Search
type kathm
tap Kathmandu
wait idle
expect Kathmandu
texts
SCRIPT
check "The alarm is stored" is "$(ask 'SELECT hour, min, name, repeat_weekly FROM alarm')" '7|30|Swim "early"|62'
check "Its tone is stored" contains "$(ask 'SELECT sound_path FROM alarm')" Marimba
check "It is scheduled" is "$(ask 'SELECT hour, minute FROM alarm_schedule')" "7|30"
check "The city is stored" is "$(sqlite3 -readonly "$data/world-clock-selection.db" 'SELECT city FROM selected_city')" IDS_CITY_NP_KATHMANDU
check "The texts are printed with their places" grep -Eq '^ *[0-9]+ +[0-9]+ .* World clock$' "$work/out"
for picture in tones name list; do check "The picture of $picture is there" is_png "$picture.png"; done
check "Outside the circle there is nothing" is "$(pixel list.png 2 2)" "srgba(0,0,0,0)" || pixel list.png 2 2
check "A square picture shows the watch's body" contains "$(pixel name.png 2 2)" "srgb"
check "The tone picker looks unlike the list" bash -c '! cmp -s tones.png list.png'
check "The recording is an animated picture" is "$(head -c 16 day.webp | tail -c 8)" WEBPVP8X
check "It has many pictures" test "$(frames_of day.webp)" -gt 30

# What is open follows the clock and the zone.
check "An open editor follows the clock, midnight and the zone" scripted 0 <<'SCRIPT'
set time-zone Europe/Berlin
set clock "2026-11-18 09:41"
tap Create
time 06:05
expect "Tomorrow - Thu, Nov 19"
set clock before-midnight
expect "Tomorrow - Thu, Nov 19"
wait "Today - Thu, Nov 19" 13
set clock "2026-11-25 05:00"
expect "Today - Wed, Nov 25"
set time-zone Asia/Tokyo
expect "Tomorrow - Thu, Nov 26"
SCRIPT
check "The world clock does, too" scripted 0 <<'SCRIPT'
set time-zone Europe/Berlin
set clock "2026-11-18 09:41"
tap "World clock"
expect 14:26
set clock before-midnight
expect 04:44
wait 04:45 13
set time-zone Asia/Tokyo
expect 04:45
set clock real
SCRIPT

# The language of a run ends with a choice.
check "A language is stored" scripted 0 <<<'set language de'
printf 'expect Create\nset language de\nexpect Erstellen\nexpect-setting language de\n' >"$work/german.script"
check "Another one is spoken for a run, until that is chosen" runs 0 --data "$data" --24h --language en --script "$work/german.script"
check "English is stored again" scripted 0 <<<'set language en'

# Motion, in applications that run already.
check "Motion is switched off and on again while applications run" scripted 0 <<'SCRIPT'
tap Create
wait idle
record start moves.webp 30
key XF86Back
wait idle
record stop
tap Create
set motion off
wait idle
record start jumps.webp 30
key XF86Back
wait idle
record stop
set motion on
tap Create
scroll-to "Alarm tone"
tap "Alarm tone"
wait Marimba
bezel 1
wait idle
record start tones-move.webp 30
bezel 1
wait idle
record stop
set motion off
wait idle
record start tones-jump.webp 30
bezel -1
wait idle
record stop
set motion on
wait idle
record start tones-again.webp 30
bezel 1
wait idle
record stop
SCRIPT
check "Pages moved" test "$(frames_of moves.webp)" -gt "$(($(frames_of jumps.webp) + 2))"
check "Pages jumped" test "$(frames_of jumps.webp)" -le 3
check "The tone picker moved" test "$(frames_of tones-move.webp)" -gt 4
check "It jumped while motion was off" test "$(frames_of tones-jump.webp)" -le 3
check "It moved again" test "$(frames_of tones-again.webp)" -gt 4

# Nobody looks at the applications.
check "The time is shown instead of the applications" scripted 0 <<'SCRIPT'
set time-zone Europe/Berlin
set clock "2026-11-18 09:41"
tap Create
background
expect 09:41
expect-not Done
screenshot away.png
key XF86Back
foreground
expect Done
expect-not 09:41
scroll-to "Alarm tone"
tap "Alarm tone"
wait Marimba
background
expect 09:41
expect-not Marimba
key XF86Back
foreground
expect Marimba
key XF86Back
expect "Alarm tone"
set clock real
SCRIPT
check "The picture of it is there" is_png away.png

# Scripts that fail.
check "A text that is not there ends a script" scripted 1 <<'SCRIPT'
tap Create

tap Snoze
SCRIPT
check "The line, the command and what is there are told" says 3 'tap: no text reads "Snoze" or begins so; the face shows "Create"'
check "A text that is there twice ends a script" scripted 1 <<'SCRIPT'
tap Create
scroll-to "Alarm name"
tap A
SCRIPT
check "All that it may mean is told" says 3 'tap: "A" may mean "Alarm name"'
check "A wrong expectation ends a script" scripted 1 <<<'expect-not "World clock"'
check "It is told" says 1 'expect-not: the face shows "World clock"'
check "A text that does not come ends a script" scripted 1 <<<'wait Never 0.3'
check "It is told as well" says 1 'wait: "Never" did not come'
check "A watch that ends early ends a script" scripted 1 <<'SCRIPT'
key XF86Back
wait 0.5
tap 10 10
SCRIPT
check "The end is told" says 3 'tap: the watch has ended'
check "Typing needs a field" scripted 1 <<<'type abc'
check "The missing field is told" says 1 'type: no text field has the focus'
check "An unknown setting ends a script" scripted 1 <<<'set mood good'
check "The settings are told" contains "$(grep -a day.script: "$work/err")" "there is no setting 'mood'; there are language"
check "A setting's wrong value ends a script" scripted 1 <<<'set volume 99'
check "The setting that is not so ends a script" scripted 1 <<'SCRIPT'
set time-form 12
expect-setting time-form 12
expect-setting time-form 24
SCRIPT
check "Its value is told" says 3 "expect-setting: it is '12'"
rm -f unseen.png
check "A mistake in the last line is found before the first runs" scripted 1 <<'SCRIPT'
screenshot unseen.png
tap "World clock
SCRIPT
check "The mistake is told" says 2 'a quoted text has no end'
check "Nothing has run" test ! -e unseen.png

# Hostile input.
check "A picture that cannot be written ends a script" scripted 1 <<<'screenshot /nowhere/a.png'
check "The file is named" says 1 'screenshot: /nowhere/a.png cannot be written: No such file'
check "A recording that cannot be written ends a script" scripted 1 <<<'record start /nowhere/a.webp'
check "That file is named as well" says 1 'record: /nowhere/a.webp cannot be written: No such file'
check "Zero bytes are refused" scripted 1 < <(printf 'tap \0\n')
check "They are named" says 1 'the line has a zero byte in it'
check "Broken characters are refused" scripted 1 < <(printf 'tap \xff\n')
check "They are named too" says 1 'the line is not in UTF-8'
check "A huge line is refused" scripted 1 < <(head -c 900000 /dev/zero | tr '\0' x)
check "Its length is told" says 1 'the line is longer than 4096 bytes'
check "A huge script is refused" scripted 1 < <(head -c 1100000 /dev/zero | tr '\0' '\n')
check "Its size is told" contains "$err" 'is longer than 1 MB'
check "A missing script is refused" runs 1 --data "$data" --script "$work/nowhere"
check "It is named" contains "$err" "clock-sim: the script $work/nowhere cannot be read: No such file"
check "A folder is no script" runs 1 --data "$data" --script "$work"
check "An empty script does nothing" scripted 0 <<<''

# Commands for a watch that runs.
check "Without a watch a command fails" command_gives 1 'tap Create'
check "It says why" contains "$err" 'clock-sim: no simulator runs'
ELM_ENGINE=buffer "$simulator" --data "$data" --24h >"$work/watch.log" 2>&1 &
watch=$!
watch_pids+=($watch)
runs_watches() { [ "$(find "$XDG_RUNTIME_DIR/clock-ui/simulators" -type s 2>/dev/null | wc -l)" = "$1" ]; }
check "A watch starts" watch_wait 20 runs_watches 1
check "It does what commands say" command_gives 0 'wait idle' 'tap "World clock"' 'expect Kathmandu' 'texts'
check "It prints what is asked for" contains "$out" Kathmandu
check "A failing command tells why" command_gives 1 'tap Nowhere' 'tap Alarm'
check "The reason is one line" contains "$(grep -a '^--command:1: ' "$work/err")" '--command:1: tap: no text reads "Nowhere"'
check "What follows a failing command is not done" command_gives 0 'expect "Add city"'
check "Commands come from the standard input too" runs 0 --command - < <(printf 'wait idle\n# a remark\nget time-form\n')
check "Their answers are printed" is "$out" 24
check "A mistake in the standard input is told with its line" runs 1 --command - < <(printf 'wait idle\nwiggle\n')
check "It is the second line" contains "$err" '-:2: wiggle: there is no such command'
check "A recording is begun by one process" command_gives 0 'record start two.webp 20'
check "Another one cannot be begun" command_gives 1 'record start three.webp'
check "That is told" contains "$err" 'a recording runs already'
check "Something moves" command_gives 0 'tap Alarm' 'wait idle' 'tap "World clock"' 'wait idle'
check "Another process ends it" command_gives 0 'record stop'
check "The recording is there" test "$(frames_of two.webp)" -gt 3
check "There is nothing left to end" command_gives 1 'record stop'

# Somebody who connects and does not speak the language, or hangs up.
face=$(find "$XDG_RUNTIME_DIR/clock-ui/simulators" -type s)
hangs_up() {
    python3 - "$face" <<'PYTHON'
import os, socket, struct, sys
def text(t): return struct.pack(">I", len(t)) + t
def message(*texts):
    body = b"".join(text(t) for t in texts)
    return struct.pack(">I", len(body)) + body
def connect():
    s = socket.socket(socket.AF_UNIX)
    s.connect(sys.argv[1])
    return s
for sent in (b"", b"\x00\x00", b"\xff" * 64, message(b"still", b"60"), message(b"picture"), message(b"picture") * 20,
             message(), message(b"pointer", b"down"), message(b"key", b"", b"", b"down"), message(b"texts", b"x"),
             message(b"set", b"a\0b", b"c"), message(b"still", b"nan"), message(b"\xff"), b"GET / HTTP/1.0\r\n\r\n"):
    s = connect()
    s.sendall(sent)
    s.close()
s = connect()
s.sendall(message(b"key", b"F\0", b"", b"down"))
assert s.recv(100)
PYTHON
}
check "Callers may hang up or talk nonsense" hangs_up
check "The watch goes on" command_gives 0 'wait idle' 'expect "World clock"'

ELM_ENGINE=buffer "$simulator" --data "$work/other" --24h >"$work/other.log" 2>&1 &
watch_pids+=($!)
check "A second watch starts" watch_wait 20 runs_watches 2
check "Two watches are one too many" command_gives 1 'tap Create'
check "Both are named" contains "$err" "several simulators run (processes "
watch_end
check "A watch that was killed does not count" command_gives 1 'tap Create'
check "There is none again" contains "$err" 'no simulator runs'
check_end
