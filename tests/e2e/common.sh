# Sourced by the end-to-end scripts: their arguments, a folder world on a drive of its own and a
# scratch folder (tools/host_session.sh), the checks that count passes and failures, and the
# steps that stop the script at the first one that goes wrong, naming it, rather than go on
# clicking into windows it did not mean.
# Usage: source common.sh BIN_DIR REPO_ROOT [SCREENSHOT_DIR]
set -uo pipefail
bin=$1
root=$2
shots=${3:-}
run="$root/cmake/wine-run"
passed=0
failed=0
source "$root/tools/host_session.sh"
drive=$world_drive
[ -n "$shots" ] && mkdir -p "$shots"

check() {  # check NAME EXPECTED ACTUAL
  if [ "$2" == "$3" ]; then
    passed=$((passed + 1))
  else
    failed=$((failed + 1))
    printf 'FAILED %s\n--- expected\n%s\n--- actual\n%s\n' "$1" "$2" "$3"
  fi
}

summary() {  # summary NAME: the counts, and the exit status of the script
  echo "e2e $1: $passed passed, $failed failed"
  [ "$failed" -eq 0 ]
}

stop() {  # stop WHAT: the step that went wrong first ends the script, failed
  [ "${checked_already:-}" == 1 ] || failed=$((failed + 1))
  printf 'FAILED %s: the script stops here\n' "$1"
  # What a person would have seen at that moment.
  [ -n "$shots" ] && import -window root "$shots/stopped-$(basename "$0" .sh).png" 2>/dev/null && echo "screenshot: $shots/stopped-$(basename "$0" .sh).png"
  [ -s "$work/err" ] && { echo '--- the host said'; grep -v '^wine: ' "$work/err"; }
  summary "$(basename "$0" .sh)"
  exit 1
}

must() {  # must NAME EXPECTED ACTUAL: a check whose failure leaves nothing sound to go on with
  check "$@"
  [ "$2" == "$3" ] || checked_already=1 stop "$1"
}

until_true() {  # until_true SECONDS COMMAND...: whether COMMAND succeeds within SECONDS
  local deadline=$((SECONDS + $1))
  shift
  while :; do
    "$@" && return 0
    [ $SECONDS -ge $deadline ] && return 1
    sleep 0.1
  done
}

visible() { xdotool search --onlyvisible --name "$1" 2>/dev/null | head -n 1; }
shown() { [ -n "$(visible "$1")" ]; }

window() {  # window VARIABLE TITLE-REGEX: sets VARIABLE to the visible window so named, or stops
  local previous="" now="" deadline=$((SECONDS + 30))
  # Wine may replace a window's X window while it is being shown: the one that stays counts.
  while :; do
    now=$(visible "$2")
    [ -n "$now" ] && [ "$now" == "$previous" ] && break
    [ $SECONDS -ge $deadline ] && stop "waiting for a window titled /$2/"
    previous=$now
    sleep 0.4
  done
  printf -v "$1" '%s' "$now"
}

placed() {  # placed WINDOW WIDTH HEIGHT: sets X Y WIDTH HEIGHT once the window has that size, or stops
  sized() { eval "$(xdotool getwindowgeometry --shell "$1" 2>/dev/null)"; [ "${WIDTH:-0}x${HEIGHT:-0}" == "$2x$3" ]; }
  until_true 20 sized "$@" || stop "waiting for window $1 to take its remembered size $2x$3 (it is ${WIDTH}x${HEIGHT})"
}

title() { xdotool getwindowname "$1" 2>/dev/null; }

named() {  # named WINDOW EXPECTED: the window's title once it reads EXPECTED (or what it reads after 15 s)
  local now=""
  titled() { now=$(title "$1"); [ "$now" == "$2" ]; }
  until_true 15 titled "$@"
  echo "$now"
}

ended() {  # ended: what the host printed once the browse has ended (or been ended after 10 s)
  running() { kill -0 "$host" 2>/dev/null; }
  until_true 10 eval '! running'
  running && kill "$host"
  wait "$host"
  tr -d '\r' <"$work/out"
}

probe() {  # probe QUESTION TITLE-PREFIX [ARGUMENT]: WindowProbe's answer (see WindowProbe.cpp), or fails
  "$run" "$bin/WindowProbe.exe" "$@" 2>/dev/null | tr -d '\r' | grep .
}

locate() {  # locate VARIABLE QUESTION TITLE-PREFIX [ARGUMENT]: sets VARIABLE to the answer once there is one, or stops
  local variable=$1 answer=""
  shift
  asked() { answer=$(probe "$@"); }
  until_true 15 asked "$@" || stop "waiting for the explorer to show: $*"
  printf -v "$variable" '%s' "$answer"
}

middle() { local x y w h; read -r x y w h <<<"$1"; echo $((x + w / 2)) $((y + h / 2)); }  # middle "X Y W H": its centre
