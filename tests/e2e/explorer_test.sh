#!/usr/bin/env bash
# A browse through the development host driven with real X input: the explorer opens with the
# remembered drawing's name in its search box, Escape ends it with nil, the state file keeps
# every key with the name emptied, and a screenshot shows what the person saw.
# Usage: explorer_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"


printf '[CurrentPath]\r\nPath=\r\nName=plan.dwg\r\nShellPath=\r\n\r\n[Size]\r\nSplitterSize=180\r\nWindowWidth=900\r\nWindowHeight=600\r\n\r\n[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=1\r\n\r\n' >"$state"

"$run" "$bin/devhost.exe" --batch --eval '(Lumvex 0 0 "" "Insert" "Close")' >"$work/out" 2>"$work/err" &
host=$!
window frame '^ombra3$'
import -window root "$shots/explorer.png"
locate remembered search-text ombra3
check "the search box holds the remembered drawing's name" "plan" "$remembered"

# Escape, until the browse has ended: a key that comes while the frame takes the focus is lost.
escaped() {
  kill -0 "$host" 2>/dev/null || return 0
  xdotool windowactivate --sync "$frame" >/dev/null 2>&1 || xdotool windowfocus "$frame" >/dev/null 2>&1
  xdotool key --clearmodifiers Escape >/dev/null 2>&1
  sleep 0.3
  ! kill -0 "$host" 2>/dev/null
}
until_true 20 escaped
check "Escape gives nil" "nil" "$(ended)"
ini=$(tr -d '\r' <"$state")
check "state file: every key, the name emptied" "[CurrentPath]
Path=
Name=
ShellPath=

[Size]
SplitterSize=180
WindowWidth=900
WindowHeight=600

[View]
PictureWidth=173
PictureHeight=143
Sort=1" "$ini"

summary explorer
