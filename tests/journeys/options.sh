#!/usr/bin/env bash
# usage: options.sh CLOCK_SIM
# The simulator's command line: what it understands, what it refuses, and how it says so.
set -u
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd) || exit 1
. "$here/check.sh"
simulator=$1
check_environment
trap 'rm -rf "$work"' EXIT

# runs STATUS ARGUMENT...: runs the simulator; what it prints is in $out and $err afterwards.
runs() {
    local expected=$1 status
    shift
    timeout 60 "$simulator" "$@" >"$work/out" 2>"$work/err"
    status=$?
    out=$(cat "$work/out") err=$(cat "$work/err")
    is "$status" "$expected"
}
# The device may have written its log line before it.
says_one_line() { is "$(grep -ac '^clock-sim: ' "$work/err")" 1 && contains "$(grep -a '^clock-sim: ' "$work/err")" "$1"; }

check "--help ends well" runs 0 --help
for word in --data --resources --language --12h --24h --create --edit --world-clock --pick-city --set-volume --power-saving --region --time-zone --clock --network --motion --panel --script --command --version Escape F2 F3 F4 F5 F6 F7 F8 F9 F10 "Exit status"; do
    check "--help tells about $word" contains "$out" "$word"
done
check "--help is quiet on the error stream" is "$err" ""

check "--version ends well" runs 0 --version
check "--version prints name and number" grep -Eqx 'clock-sim [0-9]+\.[0-9]+\.[0-9]+' "$work/out"

check "An unknown option is refused" runs 2 --loud
check "The unknown option is named" says_one_line "unknown option '--loud'"
check "A stray word is refused" runs 2 seven
check "The stray word is named" says_one_line "'seven'"
check "--data without a folder is refused" runs 2 --data
check "The missing folder is asked for" says_one_line "'--data' needs"
check "--data= without a folder is refused" runs 2 --data=
check "A language with a slash in it is refused" runs 2 --language ../x
check "A language code is asked for" says_one_line "needs a language code"
check "--edit without a number is refused" runs 2 --edit seven
check "An alarm's number is asked for" says_one_line "needs the number of an alarm"
check "A negative alarm number is refused" runs 2 --edit -1
check "A number too big for an alarm is refused" runs 2 --edit 99999999999
check "A value for an option without one is refused" runs 2 --24h=yes
check "The option without a value is named" says_one_line "'--24h' takes no value"
check "--create and --edit together are refused" runs 2 --create --edit 1
check "The two options are named" says_one_line "exclude each other"
check "The alarms and the world clock together are refused" runs 2 --create --world-clock
check "These two options are named" says_one_line "'--create' and '--world-clock' exclude each other"
check "A volume above the loudest is refused" runs 2 --set-volume 16
check "A level is asked for" says_one_line "needs a level from 0 to 15"
check "Power saving is on or off" runs 2 --power-saving 2
check "The two words are named" says_one_line "needs 'on' or 'off'"
check "A watch that only sets opens no editor" runs 2 --set-volume 3 --create
check "The first mistake counts, --help or not" runs 2 --loud --help
check "A region that is none is refused" runs 2 --data "$work/data" --region Germany
check "The region is named" says_one_line "option '--region' cannot be used: 'Germany' is not a language and a country"
check "A time zone that is none is refused" runs 2 --data "$work/data" --time-zone Mars/Olympus
check "The zone is named" says_one_line "'Mars/Olympus' is not a time zone"
check "A time that is none is refused" runs 2 --data "$work/data" --clock "2027-02-29 10:00"
check "The time is named" says_one_line "there is no 2027-02-29 10:00 in the calendar"
check "A network that is none is refused" runs 2 --data "$work/data" --network 262
check "The network is named" says_one_line "'262' is not a network"
check "Motion is on or off" runs 2 --data "$work/data" --motion=slow
check "Both are named" says_one_line "'slow' is neither on nor off"
check "A good setting before a bad one is not made" runs 2 --data "$work/data" --region de_DE --motion slow
check "Nothing was written" test ! -e "$work/data"

mkdir "$work/file-in-the-way.d" && : >"$work/file-in-the-way"
check "A data folder that is a file is refused" runs 1 --data "$work/file-in-the-way"
check "The data folder is named" says_one_line "$work/file-in-the-way"
check "A data folder that cannot be made is refused" runs 1 --data /proc/nowhere
check "The folder that cannot be made is named" says_one_line "/proc/nowhere"
check "Missing resources are refused" runs 1 --data "$work/data" --resources "$work/nowhere"
check "The resource folder is named" says_one_line "$work/nowhere"
check "Resources without themes are refused" runs 1 --data "$work/data" --resources "$work/home"
check "The theme is named" says_one_line "simulator.edj"

check "Without a display the simulator ends" runs 1 --data "$work/data"
check "Without a display one line says so" says_one_line "there is no X display"
check "A display that is not there is none" env DISPLAY=:4711 bash -c '"$1" --data "$2" >/dev/null 2>"$3"; [ $? = 1 ]' - "$simulator" "$work/data" "$work/err"
check "One line says so as well" says_one_line "there is no X display"
err=$(cat "$work/err")
check "An alarm that is not stored is not opened" runs 1 --data "$work/data" --edit 4711
check "The alarm is named" says_one_line "alarm 4711 is not stored"

check "The 12-hour form is written into the settings" runs 1 --data "$work/data" --12h
check "The setting is there" grep -rqs 1 "$work/data" --include='*regionformat_time1224*'

# Without a display: what is set is for a watch that runs elsewhere.
setting() { cat "$work/data/settings/db%2F$1"; }
check "The volume is set and the simulator ends well" runs 0 --data "$work/data" --set-volume 0
check "The volume is there" is "$(setting private%2Fsound%2Fvolume%2Falarm)" "int 0"
check "Power saving is switched on, at another volume" runs 0 --data "$work/data" --power-saving on --set-volume=15
check "Power saving is on" is "$(setting setting%2Fpsmode)" "int 2"
check "The other volume is there" is "$(setting private%2Fsound%2Fvolume%2Falarm)" "int 15"
check "Power saving is switched off" runs 0 --data "$work/data" --power-saving off
check "Power saving is off" is "$(setting setting%2Fpsmode)" "int 0"
chmod a-w "$work/data/settings"
[ "$(id -u)" = 0 ] || check "A setting that cannot be written is told about" runs 1 --data "$work/data" --set-volume 3
chmod u+w "$work/data/settings"
check_end
