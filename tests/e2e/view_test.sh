#!/usr/bin/env bash
# The thumbnail view through the development host with real X input: clicks, Ctrl+click, the
# search box, the wheel, a larger picture size, renaming in place and the double click that
# accepts, checked by the frame's title, the files on disk and the printed result list.
# Usage: view_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"


python3 "$root/tools/make_sample_drawings.py" "$world/drawings" 40 --seed 2 >/dev/null
mapfile -t names < <(ls "$world/drawings" | tr 'A-Z' 'a-z' | LC_ALL=C sort)
folder="$drive\\drawings"
printf '[Size]\r\nSplitterSize=150\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n[View]\r\nSort=0\r\n' >"$state"

"$run" "$bin/devhost.exe" --batch --eval "(Lumvex 0 0 \"${folder//\\/\\\\}\\\\\" \"Insert\" \"Close\")" \
  >"$work/out" 2>"$work/err" &
host=$!
window frame "^$drive"
must "the explorer shows the folder" "$folder" "$(title "$frame")"
# The frame shows, and its title names the folder, before it takes its remembered size and
# place and before the view has built its tiles.
placed "$frame" 1000 700

click() {  # click NAME [XDOTOOL-ARGUMENTS...]: clicks the tile of the drawing NAME
  local at
  locate at tile "$drive" "$1"
  shift
  [ $# -gt 0 ] || set -- click 1
  xdotool mousemove $(middle "$at") "$@"
}
shows() {  # shows NAME DRAWING: the frame's title names the drawing once the input is handled
  check "$1" "$folder\\$2" "$(named "$frame" "$folder\\$2")"
}

click "${names[0]}"
shows "a click chooses a drawing" "${names[0]}"
click "${names[5]}" keydown ctrl click 1 keyup ctrl
shows "Ctrl+click adds one" "${names[5]}"

locate search search "$drive"
xdotool mousemove $(middle "$search") click 1 sleep 0.3 type --delay 80 "${names[12]:0:6}"
shows "the search box finds by prefix" "${names[12]}"

# The search put row 3 at the top; a notch down scrolls three whole rows, whose tiles come with them.
locate at tile "$drive" "${names[13]}"
xdotool mousemove $(middle "$at") click 5
until_true 10 eval '! probe tile "$drive" "${names[13]}" >/dev/null' || stop "waiting for the wheel to scroll ${names[13]} away"
xdotool click 1
shows "the wheel scrolls whole rows" "${names[$((6 * 4 + 1))]}"
xdotool key Home

# Larger pictures: every tile grows.
locate before tile "$drive" "${names[0]}"
locate larger button "$drive" 32774
xdotool mousemove $(middle "$larger") click 1
grown() { locate after tile "$drive" "${names[0]}"; [ "$(cut -d' ' -f3 <<<"$after")" -gt "$(cut -d' ' -f3 <<<"$before")" ]; }
until_true 10 grown
check "larger pictures: the tiles grow" 1 "$(grown && echo 1)"

# The caption under the first tile: double click, type a name, Enter. The rename starts with the
# name selected, not ".dwg", which the drawing keeps.
locate caption caption "$drive" "${names[0]}"
xdotool mousemove $(middle "$caption") click --repeat 2 --delay 80 1 type "renamed"
xdotool key Return
until_true 10 eval '[ -e "$world/drawings/renamed.dwg" ]'
check "rename in place" "renamed.dwg" "$(ls "$world/drawings" | tr 'A-Z' 'a-z' | grep -x -e renamed.dwg -e "${names[0]}")"

import -window root "$shots/view.png"
mapfile -t names < <(ls "$world/drawings" | tr 'A-Z' 'a-z' | LC_ALL=C sort)
click "${names[0]}" click --repeat 2 --delay 80 1

check "the double click accepts" "(\"${folder//\\/\\\\}\\\\${names[0]}\" (\"\" \"\" \"\"))" "$(ended)"

summary view
