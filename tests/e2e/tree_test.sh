#!/usr/bin/env bash
# The folder tree driven with real X input through the development host: a start folder typed
# in another letter case, the loading animation caught while a folder of 20,000 sub-folders
# fills, another folder chosen with the keys, Tab over to the thumbnail view and Escape from
# there, the next browses opening at the remembered folder, and its defaults set through a right
# click on its tree item: taken with an accepted drawing, then dropped with "Use current layer".
# Usage: tree_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"
mkdir -p "$work/Plans/Details"
(cd "$work/Plans" && mkdir -p Archive && cd Archive && seq -f 'f%05g' 20000 | xargs mkdir)
python3 "$root/tools/make_sample_drawings.py" "$work/one" 1 >/dev/null && mv "$work"/one/* "$work/Plans/Details/plan.dwg"
plans="Z:${work//\//\\}\\Plans"


keys() {  # keys WINDOW KEY...
  local target=$1
  shift
  xdotool windowfocus --sync "$target" >/dev/null 2>&1
  xdotool key --clearmodifiers --delay 150 "$@" 2>/dev/null
  sleep 0.4
}

browse() {  # browse START-FOLDER: runs a browse call in the background
  "$run" "$bin/devhost.exe" --batch --layers "0=7;WALLS=1" --eval "(Lumvex 0 0 \"${1//\\/\\\\}\" \"Insert\" \"Close\")" \
    >"$work/out" 2>"$work/err" &
  host=$!
}

finish() {  # finish NAME: Escape in the tree ends the browse with nil
  keys "$frame" Escape
  check "$1: Escape gives nil" "nil" "$(ended)"
}

printf '[Size]\r\nSplitterSize=260\r\nWindowWidth=1000\r\nWindowHeight=700\r\n' >"$state"
browse "$(echo "$plans" | tr '[:lower:]' '[:upper:]')\\"
title='Plans$'
frame=$(window "$title")
placed "$frame" 1000 700
check "a start folder in other case opens the folder" "$plans" "$(xdotool getwindowname "$frame" 2>/dev/null)"

# Down to Archive, open it and look while its children load.
keys "$frame" Down
xdotool key Right 2>/dev/null
bar() {  # bar SHOT: 1 when the tree pane shows red, the bar's fill (the Close cross lies outside)
  import -window root "$1"
  convert "$1" -crop "260x$((HEIGHT - 160))+$X+$((Y + 60))" +repage -fill black +opaque '#FF0000' \
    -format '%[fx:maxima.r>0?1:0]' info:
}
red=0
for i in 1 2 3; do [ "$(bar "$shots/tree-loading-$i.png")" == 1 ] && red=1; done
check "the progress bar shows while 20,000 folders load" 1 "$red"
for _ in $(seq 60); do [ "$(bar "$work/loaded.png")" == 0 ] && break; sleep 0.5; done
keys "$frame" Left
for _ in 1 2 3; do  # a key pressed as the load ends is now and then lost under a busy X server
  keys "$frame" Down
  [ "$(xdotool getwindowname "$frame" 2>/dev/null)" == "$plans\\Archive" ] || break
done
check "the keys choose the next folder once the load is done" "$plans\\Details" "$(named "$frame" "$plans\\Details")"
keys "$frame" Tab
finish "first browse"

highlight() {  # highlight: the highlighted tree items' box on the screen, as X Y WIDTH HEIGHT
  local X Y WIDTH HEIGHT w h x y
  for _ in $(seq 20); do  # until the frame has settled where it is shown
    eval "$(xdotool getwindowgeometry --shell "$frame" 2>/dev/null)"
    import -window root "$shots/tree-settings.png"
    IFS='x+' read -r w h x y < <(convert "$shots/tree-settings.png" -crop "260x$((HEIGHT - 160))+$X+$((Y + 60))" \
      +repage -fill black +opaque 'rgb(48,150,250)' -format '%@' info: 2>/dev/null)
    [ "$w" -gt 0 ] && break
    sleep 0.25
  done
  echo $((X + x)) $((Y + 60 + y)) "$w" "$h"
}

settings() {  # settings: right click on the shown folder's tree item and choose the menu
  local x y w h
  read -r x y w h < <(highlight)
  # Under a busy X server the first click of a popup menu is now and then lost: try again.
  for _ in 1 2 3; do
    xdotool mousemove $((x + w / 2)) $((y + h / 2)) click 3 sleep 0.5
    # The menu opens at the item's lower right corner.
    xdotool mousemove $((x + w + 40)) $((y + h + 11)) click 1 sleep 1
    dialog=$(xdotool search --onlyvisible --name '^Folder settings$' 2>/dev/null | head -n 1)
    [ -n "$dialog" ] && break
    xdotool key Escape
  done
  dialog=$(window '^Folder settings$')
}
ini="$work/Plans/Details/datains.ini"

browse ""
frame=$(window 'Details$')
placed "$frame" 1000 700
check "the next browse opens at the remembered folder" "$plans\\Details" "$(xdotool getwindowname "$frame" 2>/dev/null)"
settings
keys "$dialog" alt+u shift+Tab
xdotool type --delay 80 WALLS
keys "$dialog" Tab Tab
xdotool type --delay 80 MYCMD
eval "$(xdotool getwindowgeometry --shell "$dialog" 2>/dev/null | sed 's/^/D/')"
xdotool mousemove $((DX + DWIDTH * 193 / 212)) $((DY + 44)) click 1  # the colour swatch
keys "$(window '^Select Color$')" 1 Return
keys "$dialog" Return
check "folder settings saved" "[Default Parameters] Layer=WALLS Lisp command=MYCMD Color=1" "$(tr -d '\r' <"$ini" | xargs)"
eval "$(xdotool getwindowgeometry --shell "$frame" 2>/dev/null)"
xdotool mousemove $((X + 360)) $((Y + 150)) click --repeat 2 --delay 80 1
check "the accepted drawing carries the folder's defaults" \
  "(\"${plans//\\/\\\\}\\\\Details\\\\plan.dwg\" (\"WALLS\" \"1\" \"MYCMD\"))" "$(ended)"

browse ""
frame=$(window 'plan.dwg$')
placed "$frame" 1000 700
shown=$(highlight)
read -r x y _ h <<<"$shown"
xdotool mousemove $((x + 10)) $((y + h / 2 - 16)) click 3 sleep 0.5 key Escape  # Archive, just above
check "another folder's menu leaves the highlight on the folder shown" "$shown" "$(highlight)"
settings
keys "$dialog" alt+u Tab BackSpace Return
check "current layer without a command removes datains.ini" "removed" "$([ -e "$ini" ] || echo removed)"
finish "third browse"

summary tree
