#!/usr/bin/env bash
# The development host's command line typed at as a person types: after a browse ends, the keys
# go to the command line with no click; a line that leaves a list open waits for the rest; a bare
# word is a command name. Checked by what the host echoes on standard output.
# Usage: command_line_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"
: >"$state"

"$run" "$bin/devhost.exe" --eval '(Lumvex 0 0 "" "Insert" "Close")' >"$work/out" 2>"$work/err" &
host=$!
window frame '^ombra3$'
escaped() {
  xdotool windowactivate --sync "$frame" >/dev/null 2>&1 || xdotool windowfocus "$frame" >/dev/null 2>&1
  xdotool key --clearmodifiers Escape >/dev/null 2>&1
  sleep 0.3
  ! shown '^ombra3$'
}
until_true 20 escaped || stop "waiting for Escape to end the browse"
printed() { grep -q -x -F "$1" <(tr -d '\r' <"$work/out"); }
until_true 10 printed nil || stop "waiting for the browse's nil on the command line"

# No click: the keys go wherever the keyboard is once the browse has ended.
xdotool type --delay 60 '(+ 1'
xdotool key Return
xdotool type --delay 60 '2)'
xdotool key Return
xdotool type --delay 60 'line'
xdotool key Return
until_true 10 printed 'Unknown command "LINE".'
import -window root "$shots/command-line.png"
window console '^Lumvex development host$'
xdotool windowactivate --sync "$console" >/dev/null 2>&1
xdotool key alt+F4
check "the command line after a browse" 'Command: (Lumvex 0 0 "" "Insert" "Close")
nil
Command: (+ 1
(_> 2)
3
Command: line
Unknown command "LINE".' "$(ended)"

summary command_line
