#!/usr/bin/env bash
# Deliberate faults against the tests: each patch in tools/faults is applied in turn, the module,
# the host and the test programs are brought up to date, every test but the fuzz targets runs,
# and the failing cases are recorded; then the patch is taken back out. A fault that no test
# notices is reported as such.
#   tools/fault_check.sh [-o RESULTS] [-p PROGRAMS] [FAULT...]
# FAULT is a patch name without its folder or ending (01-args-chain-not-released); none means
# all of them. PROGRAMS limits the run to some test programs, by their ctest names separated by
# commas (native_tests,win_ArgumentCheckTest,e2e_batch): quicker, to see that a fault is still
# caught where it was. RESULTS (default build/fault_check.txt) gets one line a fault:
#   NAME: caught by Suite.Case, ...      or      NAME: NOT CAUGHT
# The tree must hold no change to the files the patches touch, and ./lumvex test must have run
# once (it makes the Wine prefix). A clean run comes first, so that a case failing without any
# fault is not taken for a catch.
set -uo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
cd "$root"
results="$root/build/fault_check.txt"
programs=""
while [ $# -gt 0 ]; do
  case "$1" in
  -o) results=$(realpath -m "$2"); shift 2 ;;
  -p) programs=$2; shift 2 ;;
  *) break ;;
  esac
done
faults=("$@")
if [ ${#faults[@]} -eq 0 ]; then
  for patch in tools/faults/*.patch; do faults+=("$(basename "$patch" .patch)"); done
fi

export WINEPREFIX="$root/build/wineprefix"
export WINEDEBUG="${WINEDEBUG:--all}"
export LANG="${LANG:-C.UTF-8}"
log() { printf 'fault_check: %s\n' "$*" >&2; }

# The test programs to build and run: all of them, or those named.
native_run=yes
win_programs=()
for source in tests/win/*Test.cpp; do win_programs+=("$(basename "$source" .cpp)"); done
e2e_run=yes
if [ -n "$programs" ]; then
  native_run=no e2e_run=no
  wanted=",$programs,"
  [[ $wanted == *,native_tests,* ]] && native_run=yes
  [[ $wanted == *,e2e_* ]] && e2e_run=yes
  selected=()
  for program in "${win_programs[@]}"; do [[ $wanted == *,win_$program,* ]] && selected+=("$program"); done
  win_programs=("${selected[@]}")
fi
ctest_filter=()
[ -n "$programs" ] && ctest_filter=(-R "^($(echo "$programs" | tr ',' '|'))\$")

# Builds what the tests run: the module, the host and the test programs (not the fuzz targets or
# the benchmarks, which no case here runs).
build_tests() {
  if [ $native_run = yes ]; then cmake --build build/native --target native_tests >/dev/null 2>&1 || return 1; fi
  cmake --build build/win64 --target Lumvex1 devhost devhostrt ClipboardTestReader "${win_programs[@]}" >/dev/null 2>&1
}

# Runs the tests but the fuzz targets; prints the failing cases, one a line.
failing_cases() {
  local out
  out=$(mktemp)
  : >"$out"
  [ $native_run = yes ] && ctest --test-dir build/native -LE fuzz "${ctest_filter[@]}" --output-on-failure -j2 >>"$out" 2>&1
  if [ ${#win_programs[@]} -gt 0 ] || [ $e2e_run = yes ]; then
    ctest --test-dir build/win64 "${ctest_filter[@]}" --output-on-failure >>"$out" 2>&1
  fi
  {
    # GoogleTest cases; the summary repeats them with a count first.
    sed -n 's/^\[  FAILED  \] \([A-Za-z0-9_/]*\.[A-Za-z0-9_/]*\).*/\1/p' "$out"
    # End-to-end checks.
    sed -n 's/^FAILED \(.*\)$/e2e: \1/p' "$out"
    # The test programs that failed: alone, they tell of a crash or a sanitizer report.
    sed -n 's/^ *[0-9]*\/[0-9]* Test *#[0-9]*: \([^ ]*\) \.*\*\*\*.*/ctest: \1/p' "$out"
  } | sort -u
  rm -f "$out"
}

build_tests || { log "the clean tree does not build"; exit 1; }
if [ -z "${DISPLAY:-}" ]; then
  for n in $(seq 121 160); do
    [ -e "/tmp/.X11-unix/X$n" ] || [ -e "/tmp/.X$n-lock" ] && continue
    Xvfb ":$n" -screen 0 1600x1000x24 -nolisten tcp >/dev/null 2>&1 &
    xvfb_pid=$!
    for _ in $(seq 50); do [ -e "/tmp/.X11-unix/X$n" ] && break; sleep 0.1; done
    export DISPLAY=":$n"
    break
  done
fi
[ -f "$WINEPREFIX/.lumvex-ready" ] || { log "no Wine prefix: run ./lumvex test once first"; exit 1; }
wineserver -p >/dev/null 2>&1 </dev/null || true

applied=""
cleanup() {
  [ -n "$applied" ] && git apply -R "tools/faults/$applied.patch"
  [ -n "${xvfb_pid:-}" ] && kill "$xvfb_pid" 2>/dev/null
  return 0
}
trap cleanup EXIT
trap 'exit 130' INT TERM

log "clean run"
baseline=$(failing_cases)
[ -n "$baseline" ] && log "failing without a fault (left out of the results): $(echo $baseline)"

mkdir -p "$(dirname "$results")"
: >"$results"
for fault in "${faults[@]}"; do
  patch="tools/faults/$fault.patch"
  if ! git apply "$patch"; then
    echo "$fault: does not apply" | tee -a "$results"
    continue
  fi
  applied=$fault
  log "$fault"
  if ! build_tests; then
    line="$fault: does not build"
  else
    caught=$(comm -23 <(failing_cases) <(echo "$baseline" | sort -u) | paste -sd, - | sed 's/,/, /g')
    if [ -n "$caught" ]; then line="$fault: caught by $caught"; else line="$fault: NOT CAUGHT"; fi
  fi
  git apply -R "$patch"
  applied=""
  echo "$line" | tee -a "$results"
done
# Leave the builds matching the clean tree.
build_tests
log "results in $results"
! grep -q 'NOT CAUGHT\|does not' "$results"
