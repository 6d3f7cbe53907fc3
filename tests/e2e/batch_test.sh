#!/usr/bin/env bash
# devhost.exe --batch driven as a script would drive it: exact standard output, alerts on
# standard error, exit codes, and the same behaviour through ./lumvex devhost.
# Usage: batch_test.sh BIN_DIR REPO_ROOT
source "$(dirname "$0")/common.sh" "$@"

# Presses Escape in every titled window that the process PID or its children show, until it
# ends, as a person cancelling each browse would. Windows are found by their process (Wine gives
# each X window its process id), whatever their title.
family() { local child; echo "$1"; for child in $(pgrep -P "$1"); do family "$child"; done; }
cancel_explorers() {
  local pid=$1 frame member
  while kill -0 "$pid" 2>/dev/null; do
    for frame in $(for member in $(family "$pid"); do xdotool search --onlyvisible --pid "$member" --name . 2>/dev/null; done); do
      xdotool windowactivate --sync "$frame" >/dev/null 2>&1 || xdotool windowfocus "$frame" >/dev/null 2>&1
      xdotool key --clearmodifiers Escape >/dev/null 2>&1
    done
    sleep 0.3
  done
}

host() {
  "$run" "$bin/devhost.exe" "$@" >"$work/out" 2>"$work/err" &
  local pid=$!
  cancel_explorers "$pid"
  wait "$pid"
  echo $? >"$work/rc"
}
alerts() { grep '^alert: ' "$work/err" || true; }
# A state file of its own, empty: no folder or drawing remembered from another run.
: >"$state"


# Missing arguments, a wrong type and a well-typed call inside a list: the same run is then
# made through ./lumvex devhost.
calls=(--batch --eval '(Lumvex 0)' --eval '(Lumvex 0 0 1 "" "")' --eval '(list "x" (Lumvex 0 0 "" "" "" 7))')
host "${calls[@]}"
check "argument checks: stdout" $'\nMissing parametrs\n\nArgument should be an short\n("x" nil)\n.' "$(cat "$work/out"; echo .)"
check "argument checks: alerts" 'alert: \nMissing parametrs\n'$'\n''alert: \nArgument should be an short' "$(alerts)"
check "argument checks: exit code" 0 "$(cat "$work/rc")"
direct_out=$(cat "$work/out")
direct_alerts=$(alerts)

# Text outside ASCII leaves as UTF-8 on both streams, whatever the ANSI code page.
host --batch --module 'C:\nö\such.arx'
check "UTF-8 on standard error" 'devhost: cannot load C:\nö\such.arx: the file is missing or is not a loadable module' \
  "$(cat "$work/err")"
host --batch --eval '(princ "ä")' --eval '(list "é" "図")' --eval '(setq x (list 1 2.5 "a\\b" (list "c")))' --eval '(cadr x)'
check "UTF-8 on standard output, setq and cadr" $'ä\n"ä"\n("é" "図")\n(1 2.5 "a\\\\b" ("c"))\n2.5' "$(cat "$work/out")"

host --batch --eval '(car (list 1' --eval '(foo 1)' --eval '"still here"'
check "errors are reported and evaluation goes on" \
  $'; error: malformed list on input\n; error: no function definition: FOO\n"still here"' "$(cat "$work/out")"
check "errors do not change the exit code" 0 "$(cat "$work/rc")"

host --batch --eval '(princ "abc")' --eval '(Lumvex 0 0 "" "" "")'
check "printed text then results on their own lines" $'abc\n"abc"\nnil' "$(cat "$work/out")"
check "a well-typed call alerts nothing" "" "$(alerts)"

host --batch --drawings 0 --eval '(Lumvex 0 0 "" "" "")'
check "no drawing, no function" '; error: no function definition: LUMVEX' "$(cat "$work/out")"

host --batch --drawings 2 --eval '(Lumvex 0 0 "C:\\Proj\\plan.dwg" "Insert" "Close")'
check "two drawings" 'nil' "$(cat "$work/out")"

host --batch --module 'C:\no\such\module.arx' --eval '(Lumvex 0)'
check "missing module: exit code" 2 "$(cat "$work/rc")"
check "missing module: nothing evaluated" "" "$(cat "$work/out")"

host --batch --module "$bin/devhostrt.dll" --eval '(Lumvex 0)'
check "a DLL that is no module is refused" 2 "$(cat "$work/rc")"

host --batch --frobnicate
check "unknown option" 64 "$(cat "$work/rc")"

"$root/lumvex" devhost "${calls[@]}" >"$work/out" 2>"$work/err" &
cancel_explorers $!
wait $!
check "./lumvex devhost: same stdout" "$direct_out" "$(cat "$work/out")"
check "./lumvex devhost: same alerts" "$direct_alerts" "$(alerts)"
"$root/lumvex" devhost --batch --module 'C:\nothing.arx' >/dev/null 2>&1
check "./lumvex devhost: exit code passed through" 2 "$?"

summary batch
