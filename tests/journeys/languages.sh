#!/usr/bin/env bash
# usage: languages.sh CLOCK_SIM PICTURE_DIRECTORY
# Another language is chosen while applications are open that are processes of their own, and while
# a screen shows times in the form of a region.
set -u
. "$(dirname "${BASH_SOURCE[0]}")/begin.sh" "$@"
cd "$pictures" || exit 1

# scripted NAME ARGUMENT...: runs the script of the standard input on a watch of its own.
scripted() {
    local name=$1
    shift
    cat >"$work/$name.script"
    timeout 180 "$simulator" --data "$work/data" --24h "$@" --script "$work/$name.script" \
        >"$work/out" 2>"$work/err" || {
        tail -n 3 "$work/err"
        return 1
    }
}

check "The tone picker follows the language" scripted tones <<'SCRIPT'
tap Create
scroll-to "Alarm tone"
tap "Alarm tone"
wait "Music Box"
expect Cancel
set language de
wait Abbrechen
expect Fertig
expect Weckton
expect "Music Box"
screenshot tones-de.png
set language ar
wait إلغاء
expect "نغمة المنبّه"
# The buttons have changed sides.
screenshot tones-ar.png
tap تم
wait "نغمة المنبّه"
set language hi
wait "अलार्म की धुन"
SCRIPT

mkdir -p "$work/empty" || exit 1
CLOCK_TONE_DIR=$work/empty check "An empty tone picker follows it, too" scripted empty --language en <<'SCRIPT'
tap Create
scroll-to "Alarm tone"
tap "Alarm tone"
wait "No tones"
set language fr
wait "Aucune sonnerie"
expect Annuler
expect-not "No tones"
set language ar
wait "لا توجد نغمات"
screenshot no-tones-ar.png
SCRIPT

check "The city picker follows it as an application of its own" scripted cities --language en --pick-city <<'SCRIPT'
expect "Add city"
expect Cancel
set language de
wait "Suchen"
expect Abbrechen
expect-not Cancel
tap Suchen
type kathm
wait "Kathmandu, Nepal"
set language ru
wait "Катманду, Непал"
set language ja
wait "カトマンズ, ネパール"
screenshot found-ja.png
set language ar
wait "كاتماندو, نيبال"
screenshot found-ar.png
type qqxx
wait "لا توجد نتائج"
set language de
wait "Keine Ergebnisse"
SCRIPT

check "Lists follow the hours, the region and the language" scripted lists --language en <<'SCRIPT'
set clock "2026-11-20 12:00"
set region en_US
tap Create
time 18:25
scroll-to Alarm
tap Alarm
type "Tea"
tap Done
wait "Alarm set for"
expect "18:25"
set time-form 12
wait "6:25 PM"
expect-not "18:25"
set language ko
wait "오후 6:25"
set region de_DE
set time-form 24
wait "18:25"
set language ar
wait "المنبّهات"
expect "18:25"
expect "Tea"
screenshot alarms-ar.png
set language en
wait "World clock"
tap "World clock"
tap "Add city"
tap Search
type kathm
tap "Kathmandu, Nepal"
wait "16:4"
set time-form 12
wait "4:4"
expect-not "16:4"
set language ja
wait "午後4:4"
expect "カトマンズ"
screenshot cities-ja.png
set language de
wait Kathmandu
SCRIPT
check_end
