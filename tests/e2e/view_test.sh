#!/usr/bin/env bash
# The thumbnail view through the development host with real X input: clicks, Ctrl+click, the
# search box, the wheel, a larger picture size, renaming in place and the double click that
# accepts, checked by the frame's title, the files on disk and the printed result list.
# Usage: view_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"


python3 "$root/tools/make_sample_drawings.py" "$work/drawings" 40 --seed 2 >/dev/null
mapfile -t names < <(ls "$work/drawings" | tr 'A-Z' 'a-z' | LC_ALL=C sort)
folder="Z:$(echo "$work/drawings" | tr '/' '\\')"
printf '[Size]\r\nSplitterSize=150\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n[View]\r\nSort=0\r\n' >"$state"

"$root/cmake/wine-run" "$bin/devhost.exe" --batch --eval "(Lumvex 0 0 \"${folder//\\/\\\\}\\\\\" \"Insert\" \"Close\")" \
  >"$work/out" 2>"$work/err" &
host=$!
frame=$(window '^Z:')
check "the explorer shows the folder" "$folder" "$(xdotool getwindowname "$frame" 2>/dev/null)"
# The frame shows, and its title names the folder, before it takes its remembered size and
# place, and before the view has built its tiles: the first tile's picture shows there at last,
# dark beside the white gap between two columns.
placed "$frame" 1000 700
# The view starts below the tool bar, right of the folder pane; 4 columns 178 pixels apart, rows 163.
view_x=$((X + 163)) view_y=$((Y + 74))
for _ in $(seq 60); do
  import -window root "$work/shot.png"
  [ "$(convert "$work/shot.png" -format '%[fx:p{'$((view_x + 6))','$((view_y + 6))'}.r<0.5 && p{'$((view_x + 175))','$((view_y + 70))'}.r>0.5 ? 1 : 0]' info:)" == 1 ] && break
  sleep 0.25
done
tile() { echo $((view_x + 86 + 178 * ($1 % 4))) $((view_y + 70 + 163 * ($1 / 4))); }
shows() {  # shows NAME DRAWING: the frame's title names the drawing once the input is handled
  check "$1" "$folder\\$2" "$(named "$frame" "$folder\\$2")"
}

xdotool mousemove $(tile 0) click 1
shows "a click chooses a drawing" "${names[0]}"
xdotool mousemove $(tile 5) keydown ctrl click 1 keyup ctrl
shows "Ctrl+click adds one" "${names[5]}"

xdotool mousemove $((X + 240)) $((Y + 55)) click 1 sleep 0.3 type --delay 80 "${names[12]:0:6}"
shows "the search box finds by prefix" "${names[12]}"

# The search put row 3 at the top; a notch down scrolls three rows that come with their tiles.
xdotool mousemove $(tile 1) click 5 sleep 0.5 click 1
shows "the wheel scrolls whole rows" "${names[$((6 * 4 + 1))]}"
xdotool key Home

xdotool mousemove $((X + 51)) $((Y + 55)) click 1
xdotool mousemove $((view_x + 400)) $((view_y + 70)) click 1
shows "larger pictures: the third column now shows the second drawing" "${names[1]}"

# The caption under the first tile: double click, type, Enter.
xdotool mousemove $((view_x + 60)) $((view_y + 179 + 12)) click --repeat 2 --delay 80 1 type "renamed.dwg"
xdotool key Return
for _ in $(seq 50); do [ -e "$work/drawings/renamed.dwg" ] && break; sleep 0.2; done
check "rename in place" "renamed.dwg" "$(ls "$work/drawings" | tr 'A-Z' 'a-z' | grep -x -e renamed.dwg -e "${names[0]}")"

import -window root "$shots/view.png"
mapfile -t names < <(ls "$work/drawings" | tr 'A-Z' 'a-z' | LC_ALL=C sort)
xdotool mousemove $(tile 0) click --repeat 2 --delay 80 1

check "the double click accepts" "(\"${folder//\\/\\\\}\\\\${names[0]}\" (\"\" \"\" \"\"))" "$(ended)"

summary view
