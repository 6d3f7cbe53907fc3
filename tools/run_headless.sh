#!/usr/bin/env bash
# A short browse on a display nobody looks at (Xvfb), driven with real X input as a person
# would: the explorer opens on the samples drive, its sub-folder Details is chosen and expanded,
# a drawing there is clicked and accepted with the Insert button. SCREENSHOT_DIR/explorer.png
# shows the explorer with the drawing chosen; the host's command line, with the result list, is
# printed.
# Usage: run_headless.sh DEVHOST_EXE DRIVE_LETTER SCREENSHOT_DIR
set -euo pipefail
exe=$1
drive=$2
shots=$3
mkdir -p "$shots"
bin=$(dirname "$exe")
source "$(dirname "$0")/host_session.sh"

# A known window size and tree width, so that the drawing and the button can be clicked.
splitter=260
printf '[CurrentPath]\r\nPath=\r\nName=\r\nShellPath=\r\n\r\n[Size]\r\nSplitterSize=%s\r\nWindowWidth=1180\r\nWindowHeight=520\r\n\r\n[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=0\r\n\r\n' \
  "$splitter" >"$state"

fail() {
  echo "lumvex: $*" >&2
  cat "$work/out"
  exit 1
}

wait_for_window() {  # wait_for_window TITLE-REGEX: the visible window so named, or nothing after 20 s
  for _ in $(seq 100); do
    xdotool search --onlyvisible --name "$1" >/dev/null 2>&1 && break
    sleep 0.2
  done
  # Wine may replace a window's X window while it is being shown: the settled one counts.
  sleep 0.5
  xdotool search --onlyvisible --name "$1" 2>/dev/null | head -n 1 || true
}

# The frame's title is the folder shown, or the drawing chosen in it.
titled() {  # titled TITLE-REGEX [SECONDS]: whether the explorer's title comes to match (in 20 s)
  for _ in $(seq $((${2:-20} * 5))); do
    [[ "$(xdotool getwindowname "$explorer" 2>/dev/null)" =~ $1 ]] && return 0
    sleep 0.2
  done
  return 1
}

key() {  # key WINDOW KEY...
  xdotool windowfocus --sync "$1" >/dev/null 2>&1 || true
  shift
  xdotool key --clearmodifiers "$@" 2>/dev/null
  sleep 0.4
}

call="(Lumvex 0 0 \"$drive:\\\\\" \"Insert\" \"Close\")"
wine "$exe" --layers "0=7;WALLS=1" --eval "$call" >"$work/out" 2>&1 &
host=$!

explorer=$(wait_for_window "^$drive:\\\\\$")
[ -n "$explorer" ] || fail "the explorer did not open"
# The drive is chosen and open: down to Details, which shows its drawings, and open it. A key
# that comes while the new explorer is still taking the focus is lost: it is sent again while
# the drive is shown.
for _ in 1 2 3; do
  key "$explorer" Down
  titled '\\Details$' 5 && break
done
titled '\\Details$' 1 || fail "the explorer did not show Details"
key "$explorer" Right

# The second drawing of the top row in the thumbnail view (178 pixels apart), then the accept
# button. The pointer leaves the tile first, so that its tooltip does not hide the others.
eval "$(xdotool getwindowgeometry --shell "$explorer")"
xdotool mousemove $((X + splitter + 100 + 178)) $((Y + 150)) click 1 2>/dev/null
titled '\\Details\\[^\\]+\.[dD][wW][gG]$' || fail "the click did not choose a drawing"
xdotool mousemove $((X + WIDTH - 100)) $((Y + HEIGHT - 100)) 2>/dev/null
sleep 1
import -window root -crop "${WIDTH}x${HEIGHT}+${X}+${Y}" +repage "$shots/explorer.png"
xdotool mousemove $((X + 40)) $((Y + HEIGHT - 43)) click 1 2>/dev/null

for _ in $(seq 50); do
  xdotool search --onlyvisible --name "^$drive:" >/dev/null 2>&1 || break
  sleep 0.2
done
xdotool search --onlyvisible --name "^$drive:" >/dev/null 2>&1 && fail "the browse did not end on Insert"
hostWindow=$(wait_for_window '^Lumvex development host$')
key "$hostWindow" alt+F4
for _ in $(seq 50); do
  kill -0 "$host" 2>/dev/null || break
  sleep 0.2
done
kill -0 "$host" 2>/dev/null && fail "the host did not close on Alt+F4"
wait "$host" || true
host=""
cat "$work/out"
