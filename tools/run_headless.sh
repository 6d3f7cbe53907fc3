#!/usr/bin/env bash
# Runs the development host on a display nobody looks at (Xvfb): evaluates the browse call,
# saves a screenshot of the open explorer, cancels it and closes the host with real X input,
# and prints the command line (the LISP result included).
# Usage: run_headless.sh DEVHOST_EXE LISP_CALL SCREENSHOT_DIR
set -euo pipefail
exe=$1
call=$2
shots=$3
mkdir -p "$shots"
out=$(mktemp)
trap 'rm -f "$out"' EXIT

wine "$exe" --eval "$call" >"$out" 2>&1 &
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

press() {  # press WINDOW KEY
  xdotool windowactivate --sync "$1" >/dev/null 2>&1 || xdotool windowfocus "$1" >/dev/null 2>&1 || true
  xdotool key --clearmodifiers "$2"
}

# The frame's title is "ombra3" until it shows a folder, then the folder's path.
explorer=$(wait_for_window '^ombra3$|^[A-Za-z]:\\')
if [ -z "$explorer" ]; then
  echo "lumvex: the explorer did not open" >&2
  kill "$host" 2>/dev/null || true
  cat "$out"
  exit 1
fi
sleep 1
shot="$shots/explorer-$(date +%Y%m%d-%H%M%S).png"
import -window root "$shot"
echo "screenshot: $shot"
press "$explorer" Escape

hostWindow=$(wait_for_window '^Lumvex development host$')
sleep 0.5
[ -n "$hostWindow" ] && press "$hostWindow" alt+F4
for _ in $(seq 50); do
  kill -0 "$host" 2>/dev/null || break
  sleep 0.2
done
if kill -0 "$host" 2>/dev/null; then
  echo "lumvex: the host did not close on Alt+F4" >&2
  kill "$host"
fi
wait "$host" || true
cat "$out"
