# Sourced by the end-to-end scripts: their arguments, a scratch folder, the state file beside
# the module kept aside and put back, a host started in the background ended with the script,
# and the check that counts passes and failures.
# Usage: source common.sh BIN_DIR REPO_ROOT [SCREENSHOT_DIR]
set -uo pipefail
bin=$1
root=$2
shots=${3:-}
run="$root/cmake/wine-run"
passed=0
failed=0
source "$root/tools/host_session.sh"
[ -n "$shots" ] && mkdir -p "$shots"

check() {  # check NAME EXPECTED ACTUAL
  if [ "$2" == "$3" ]; then
    passed=$((passed + 1))
  else
    failed=$((failed + 1))
    printf 'FAILED %s\n--- expected\n%s\n--- actual\n%s\n' "$1" "$2" "$3"
  fi
}

window() {  # window TITLE-REGEX: the visible window, waiting for it
  local found=""
  for _ in $(seq 100); do
    found=$(xdotool search --onlyvisible --name "$1" 2>/dev/null | head -n 1)
    [ -n "$found" ] && break
    sleep 0.1
  done
  # Wine may replace a window's X window while it is being shown: the settled one counts.
  sleep 0.5
  xdotool search --onlyvisible --name "$1" 2>/dev/null | head -n 1
}

placed() {  # placed WINDOW WIDTH HEIGHT: its X Y WIDTH HEIGHT once it has that size (or after 15 s)
  for _ in $(seq 60); do
    eval "$(xdotool getwindowgeometry --shell "$1" 2>/dev/null)"
    [ "${WIDTH:-0}x${HEIGHT:-0}" == "$2x$3" ] && return
    sleep 0.25
  done
}

named() {  # named WINDOW EXPECTED: the window's title once it reads EXPECTED (or after 15 s)
  local name=""
  for _ in $(seq 150); do
    name=$(xdotool getwindowname "$1" 2>/dev/null)
    [ "$name" == "$2" ] && break
    sleep 0.1
  done
  echo "$name"
}

ended() {  # ended: what the host printed once the browse has ended (or been ended after 10 s)
  for _ in $(seq 100); do kill -0 "$host" 2>/dev/null || break; sleep 0.1; done
  kill -0 "$host" 2>/dev/null && kill "$host"
  wait "$host"
  tr -d '\r' <"$work/out"
}

summary() {  # summary NAME: the counts, and the exit status of the script
  echo "e2e $1: $passed passed, $failed failed"
  [ "$failed" -eq 0 ]
}
