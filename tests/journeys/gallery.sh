#!/usr/bin/env bash
# usage: gallery.sh BUILD_DIRECTORY PICTURE_DIRECTORY
# Every scene can be played, and the gallery shows what the watch draws.
set -u
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd) || exit 1
. "$here/check.sh"
root=$here/../.. build=$1 pictures=$2
check_environment
trap 'rm -rf "$work"' EXIT

# What is told, in a small gallery of its own.
tree=$work/tree
mkdir -p "$tree/simulator" "$tree/docs"
cp -r "$root/scripts" "$tree" && cp -r "$root/simulator/web" "$tree/simulator" || exit 1
rm "$tree"/scripts/scenes/[!5s]*
small=$tree/docs/gallery scene=$tree/scripts/scenes/5-device.script
gallery() { "$tree/scripts/gallery" "$@" >"$work/out" 2>&1; }
refuses() { ! gallery --check "$build" && contains "$(cat "$work/out")" "$1"; }
# moved FILE: moves the lower half down by a row of pixels.
moved() { convert "$1" \( +clone -crop 360x180+0+180 +repage \) -geometry +0+181 -compose Copy -composite "$1"; }

check "A gallery is drawn" gallery "$build" || cat "$work/out"
for file in README.md alarm.gif control-panel.png {en,de,ar,ja}/quick-panel.png; do
    check "It has $file" test -s "$small/$file"
done
check "Pictures are round" is "$(convert "$small/en/quick-panel.png" -format '%[fx:p{2,2}.a] %[fx:p{180,180}.a]' info:)" "0 1"
check "The moving picture moves" test "$(identify "$small/alarm.gif" | wc -l)" -gt 20
check "It is what the watch draws" gallery --check "$build" || cat "$work/out"
cp "$small/ja/quick-panel.png" "$work/kept.png"
moved "$small/ja/quick-panel.png"
check "A row that has moved by a pixel is found" refuses "ja/quick-panel.png differs"
rm "$small/ja/quick-panel.png"
check "A missing picture is found" refuses "ja/quick-panel.png is missing"
mv "$work/kept.png" "$small/ja/quick-panel.png"
cp "$small/en/volume.png" "$small/en/old.png"
check "A picture that nothing draws is found" refuses "en/old.png is not drawn any more"
rm "$small/en/old.png"
sed -i 's/^# Quick panel/# Another caption/' "$scene"
check "A page that is not the scenes' is found" refuses "README.md differs"
echo 'expect "What no screen shows"' >>"$scene"
check "A scene that fails is named" refuses "5-device.script failed in Deutsch"

# The real one.
rm -rf "$pictures" && mkdir -p "$pictures" || exit 1
check "The gallery is what the watch draws" "$root/scripts/gallery" --check "$build" "$pictures"
check_end
