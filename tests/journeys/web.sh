#!/usr/bin/env bash
# usage: web.sh CLOCK_SIM PICTURE_DIRECTORY
# The watch in browsers: used in one, looked at in another, and out of reach for everybody else.
# shellcheck disable=SC2086 # a place of watch.sh is two words: x and y
set -u
. "$(dirname "${BASH_SOURCE[0]}")/journey.sh" "$@"
export NO_PROXY=127.0.0.1,localhost no_proxy=127.0.0.1,localhost TMPDIR=$work/temporary
mkdir "$TMPDIR" "$work/browsers"
log=$pictures/log
webs=()
# A browser that ends too early must not end this script.
trap '' PIPE

# served NAME ARGUMENT...: serves a watch, and waits for its address.
served() {
    local name=$1
    shift
    # What a script starts in the background does not hear Ctrl-C otherwise.
    env --default-signal=INT "$journeys/../../scripts/web" "$(dirname "$(dirname "$simulator")")" "$@" --data "$work/$name" --24h \
        >"$work/$name.out" 2>"$pictures/$name.log" &
    web=$!
    webs+=($web)
    watch_wait 60 address_or_end $web "$name" && address_of "$name" >"$work/$name.address"
}
address_of() { grep -ao 'http://[^ ]*' "$work/$1.out"; }
address_or_end() { ! kill -0 "$1" || address_of "$2"; }
# Programs of served watches, which alone have been given this.
left_running() { grep -alzs "^XAUTHORITY=$TMPDIR" /proc/[0-9]*/environ | cut -d / -f 3; }
nothing_runs() { [ -z "$(left_running)" ]; }
program() { pgrep -f "^$simulator.* --data $work/$1 "; }
end_all() {
    [ -z "${browsers_PID-}" ] || { exec {orders}>&- && wait "$browsers_PID"; } 2>/dev/null
    [ ${#webs[@]} = 0 ] || kill "${webs[@]}" 2>/dev/null
    watch_wait 20 nothing_runs || kill $(left_running)
    rm -rf "$work"
}
trap end_all EXIT

# b ORDER...: gives an order to a browser and prints the answer.
b() {
    local answer
    echo "$*" >&"$orders" && read -r -t 120 answer <&"$answers" && echo "$answer"
}
# does ORDER...: one that has nothing to answer unless it fails.
does() { is "$(b "$@")" ""; }

# status ADDRESS HEADER...: the answer's number to a plain request.
status() {
    local path=${1#http://*/} header answer
    shift
    {
        exec {socket}<>"/dev/tcp/127.0.0.1/$port"
        printf '%s\r\n' "GET /$path HTTP/1.1" "$@" "" >&"$socket"
        read -r -t 20 _ answer _ <&"$socket"
        exec {socket}>&-
    } 2>/dev/null
    echo "$answer"
}
listens() { (exec 3<>"/dev/tcp/$1/$port") 2>/dev/null; }

check "A watch is served" served one || exit 1
address=$(address_of one) port=${address#http://127.0.0.1:} port=${port%%/*}
coproc browsers { TMPDIR=$work/browsers exec "$journeys/browser" "$work/browsers" 2>"$pictures/browser.log"; }
# Copies: bash closes its own in some of its subshells.
exec {answers}<&"${browsers[0]}" {orders}>&"${browsers[1]}" {browsers[1]}>&-

# Used in a browser.
check "A browser opens the page" does a open "$address"
check "The watch comes" does a wait connected
check "The face comes to rest" does a keep
check "The face is seen" test "$(b a lit)" -gt 200
check "The watch has the keys" is "$(b a focus)" canvas
check "The page lists the keys" contains "$(b a listed)" "the back key"
check "The page tells about the sound" contains "$(b a text aside)" "No sound"
does a picture "$pictures/1-list.png"
check "Create is tapped" does a tap $WATCH_CREATE
check "The editor opens" does a differs
check "It comes to rest" does a keep
# What was touched is what the bezel turns.
check "The hour is touched" does a tap $WATCH_HOUR_X 170
check "It comes to rest" does a keep
check "The wheel is turned over it" does a wheel $WATCH_HOUR_X 170 1
check "The hour moves" does a differs
check "It comes to rest" does a keep
check "Escape is pressed" does a key escape
check "The wheel is left" does a differs
check "It comes to rest" does a keep
check "Escape is pressed again" does a key escape
check "The watch asks whether to discard" does a differs
does a picture "$pictures/2-asked.png"
check "It comes to rest" does a keep
check "Escape is pressed again" does a key escape
check "The question goes" does a differs
check "It comes to rest" does a keep
does a picture "$pictures/3-editor.png"
check "The page is loaded again" does a reload
check "The watch comes back" does a wait connected
check "It is as it was" does a same

# Seen in two.
check "A second browser opens the page" does b open "$address"
check "The watch comes there too" does b wait connected
does b picture "$pictures/4-second.png"
check "It looks the same there" does b same a
check "Done is tapped in the second" does b tap $WATCH_DONE
database=$work/one/clock.db
check "The alarm is stored" watch_wait 20 alarms_are 1
check "It rings at the turned hour" is "$(column 'hour, min')" "7|0"
check "The first one sees the list" does a differs

# Left by keys.
check "Shift and F6 leave the watch" does a leave
check "The page's own text has the keys" is "$(b a focus)" summary
check "They lead back" does a leave
check "The watch has the keys again" is "$(b a focus)" canvas

# Out of reach.
host="Host: 127.0.0.1:$port"
check "It listens on this address alone" listens 127.0.0.1
for other in 127.0.0.2 ::1 $(hostname -I); do
    check "It does not listen on $other" eval "! listens $other"
done
check "Its page is there for those who know the word" is "$(status "$address" "$host")" 200
check "Nothing is there without the word" is "$(status "http://x/" "$host")" 404
check "Nothing is there for a wrong word" is "$(status "${address%??}x/" "$host")" 404
check "Other files of the machine are not" is "$(status "${address}../../../../../etc/passwd" "$host")" 404
check "Another name of this machine is not served" is "$(status "$address" "Host: example.org:$port")" 421
upgrade=("Upgrade: websocket" "Connection: Upgrade" "Sec-WebSocket-Version: 13" "Sec-WebSocket-Key: dGhlIHNhbXBsZSBub25jZQ==" "Sec-WebSocket-Protocol: binary")
check "The display answers the page" is "$(status "${address}display" "$host" "Origin: http://127.0.0.1:$port" "${upgrade[@]}")" 101
check "It refuses the pages of others" is "$(status "${address}display" "$host" "Origin: http://example.org" "${upgrade[@]}")" 403
check "It refuses those who do not know the word" is "$(status "http://x/wrong/display" "$host" "${upgrade[@]}")" 404
check "Its folder is the user's alone" is "$(stat -c %a "$(dirname "$TMPDIR"/*/picture)")" 700

# Several, and ports.
first=$web
check "A second watch is served" served two
check "It has a port of its own" test "$(address_of two)" != "$address"
check "It says that the usual port is in use" grep -q 'port 8360 is in use' "$pictures/two.log"
check "A browser sees the second watch" does b open "$(address_of two)"
check "It is there" does b wait connected
kill -INT $web && wait $web
check "Ctrl-C ends it" is $? 130
check "Its page says so" does b wait ended
check "In words" contains "$(b b text '#state')" "switched off"
does b picture "$pictures/5-ended.png"
check "The first watch goes on" is "$(b a text '#state' && kill -0 $first && program one >/dev/null && echo runs)" "The watch is here.
runs"
check "A port that is in use is refused when it was asked for" eval '! served three "$port" '
check "The port is named" grep -q "port $port cannot be used" "$pictures/three.log"
check "A port that is none is refused" eval '! served four 70000 '
check "An option that is none is told" eval '! served five --none || ! wait $web'
check "By name" grep -q "unknown option '--none'" "$pictures/five.log"

# The end.
kill -TERM "$(program one)" && wait $first
check "The watch's end ends all, well" is $? 0
check "The page says so" does a wait ended
check "The page had nothing to complain about" is "$(b a complaints | grep -v -e WebSocket -e ERR_CONNECTION)" ""
check "Nothing is left running" watch_wait 10 nothing_runs
check "No file is left" is "$(ls "$TMPDIR")" ""
check "A watch is served once more" served six
kill -KILL $web && wait $web 2>/dev/null
check "Nothing outlives even a killed script" watch_wait 10 nothing_runs
check_end
