#!/usr/bin/env bash
# The explorer driven from the keyboard alone: a folder chosen in the tree, Tab over to the
# drawings, arrows that move the mark (and the chosen drawing with it), Enter that accepts it;
# Tab and Shift+Tab through the search box to the accept button, Enter there; F2 to rename.
# Checked by the printed result and the files on disk.
# Usage: keys_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"
python3 "$root/tools/make_sample_drawings.py" "$world/Keys" 8 --seed 3 >/dev/null
mapfile -t names < <(ls "$world/Keys" | tr 'A-Z' 'a-z' | LC_ALL=C sort)
keys_folder="$drive\\Keys"
printf '[Size]\r\nSplitterSize=200\r\nWindowWidth=1000\r\nWindowHeight=700\r\n\r\n[View]\r\nSort=0\r\n' >"$state"

browse() {  # browse START-FOLDER
  "$run" "$bin/devhost.exe" --batch --eval "(Lumvex 0 0 \"${1//\\/\\\\}\" \"Insert\" \"Close\")" >"$work/out" 2>"$work/err" &
  host=$!
  window frame "^$drive"
  placed "$frame" 1000 700
}
press() {  # press KEY...: keys to the explorer, one at a time, as a person types them
  xdotool windowfocus --sync "$frame" >/dev/null 2>&1
  xdotool key --clearmodifiers --delay 250 "$@" 2>/dev/null
}
result() { echo "(\"${keys_folder//\\/\\\\}\\\\$1\" (\"\" \"\" \"\"))"; }

browse "$drive\\"
press Down
must "Down in the tree chooses the folder" "$keys_folder" "$(named "$frame" "$keys_folder")"
# The columns, from where the tiles lie: how many share the first one's row.
locate first tile "$drive" "${names[0]}"
columns=0
for name in "${names[@]}"; do
  locate at tile "$drive" "$name"
  [ "$(cut -d' ' -f2 <<<"$at")" == "$(cut -d' ' -f2 <<<"$first")" ] && columns=$((columns + 1))
done
target=${names[$((1 + columns))]}
press Tab Right Right Down
check "Tab, then arrows: the mark moves and the chosen drawing follows" "$keys_folder\\$target" "$(named "$frame" "$keys_folder\\$target")"
import -window root "$shots/keys.png"
press Return
check "Enter accepts the drawing the arrows moved to" "$(result "$target")" "$(ended)"

browse ""
press Tab Right
check "the next browse: an arrow chooses the first drawing" "$keys_folder\\${names[0]}" "$(named "$frame" "$keys_folder\\${names[0]}")"
press Tab Tab shift+Tab Tab Return
check "Tab and Shift+Tab reach the accept button, and Enter there accepts" "$(result "${names[0]}")" "$(ended)"

browse ""
press Tab Right F2
# The caption box has the keyboard now: typed straight at it, as a person goes on typing.
xdotool key --delay 250 End shift+Home
xdotool type --delay 60 keyed
xdotool key Return
renamed() { [ -e "$world/Keys/keyed.dwg" ] && [ ! -e "$world/Keys/${names[0]}" ]; }
until_true 10 renamed
check "F2 renames the marked drawing, and a name typed without .dwg keeps it" "keyed.dwg" "$(ls "$world/Keys" | grep -x -e keyed.dwg -e "${names[0]}")"
press Escape
check "Escape ends the browse" nil "$(ended)"

summary keys
