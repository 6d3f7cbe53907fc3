#!/usr/bin/env bash
# A short browse on a display nobody looks at (Xvfb), driven with real X input as a person
# would: the explorer opens on the samples drive, a sub-folder is chosen and expanded, the
# drive is chosen again, a drawing is clicked and accepted. A screenshot is saved on the way
# and the host's command line, the result list included, is printed.
# Usage: run_headless.sh DEVHOST_EXE DRIVE_LETTER SCREENSHOT_DIR
set -euo pipefail
exe=$1
drive=$2
shots=$3
mkdir -p "$shots"
bin=$(dirname "$exe")
state="$bin/Lumvex1.ini"
work=$(mktemp -d)
saved=""
[ -f "$state" ] && saved="$work/state.ini" && cp "$state" "$saved"
cleanup() {
  if [ -n "$saved" ]; then cp "$saved" "$state"; else rm -f "$state"; fi
  rm -rf "$work"
}
trap cleanup EXIT

# A known window size and tree width, so that the drawing and the button can be clicked.
splitter=260
printf '[CurrentPath]\r\nPath=\r\nName=\r\nShellPath=\r\n\r\n[Size]\r\nSplitterSize=%s\r\nWindowWidth=1180\r\nWindowHeight=760\r\n\r\n[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=0\r\n\r\n' \
  "$splitter" >"$state"

call="(Lumvex 0 0 \"$drive:\\\\\" \"Insert\" \"Close\")"
wine "$exe" --layers "0=7;WALLS=1" --eval "$call" >"$work/out" 2>&1 &
host=$!

wait_for_window() {
  local name=$1 window=""
  for _ in $(seq 100); do
    window=$(xdotool search --onlyvisible --name "$name" 2>/dev/null | head -n 1 || true)
    [ -n "$window" ] && break
    sleep 0.2
  done
  echo "$window"
}

key() {  # key WINDOW KEY...
  local window=$1
  shift
  xdotool windowactivate --sync "$window" >/dev/null 2>&1 || xdotool windowfocus "$window" >/dev/null 2>&1 || true
  xdotool key --clearmodifiers "$@" 2>/dev/null
  sleep 0.4
}

explorer=$(wait_for_window "^$drive:\\\\\$")
if [ -z "$explorer" ]; then
  echo "lumvex: the explorer did not open" >&2
  kill "$host" 2>/dev/null || true
  cat "$work/out"
  exit 1
fi
sleep 0.5
# The drive is selected and open: down to its first folder, open it, and back to the drive.
key "$explorer" Down
key "$explorer" Right
key "$explorer" Up
sleep 0.5

eval "$(xdotool getwindowgeometry --shell "$explorer")"
shot="$shots/explorer-$(date +%Y%m%d-%H%M%S).png"
import -window root -crop "${WIDTH}x${HEIGHT}+${X}+${Y}" +repage "$shot"
echo "screenshot: $shot"

# The first drawing, top left in the thumbnail view, then the accept button.
xdotool mousemove $((X + splitter + 100)) $((Y + 150)) click 1 2>/dev/null
sleep 0.5
xdotool mousemove $((X + 40)) $((Y + HEIGHT - 43)) click 1 2>/dev/null
sleep 1
# Nothing chosen (no drawing in view): the browse is cancelled instead.
xdotool search --onlyvisible --name "^$drive:" >/dev/null 2>&1 && key "$explorer" Escape

hostWindow=$(wait_for_window '^Lumvex development host$')
sleep 0.5
[ -n "$hostWindow" ] && key "$hostWindow" alt+F4
for _ in $(seq 50); do
  kill -0 "$host" 2>/dev/null || break
  sleep 0.2
done
if kill -0 "$host" 2>/dev/null; then
  echo "lumvex: the host did not close on Alt+F4" >&2
  kill "$host"
fi
wait "$host" || true
cat "$work/out"
