#!/usr/bin/env bash
# Deliberate faults against the tests: each patch in tools/faults is applied in turn, both builds
# are brought up to date, every test but the fuzz targets runs, and the failing cases are
# recorded; then the patch is taken back out. A fault that no test notices is reported as such.
#   tools/fault_check.sh [-o RESULTS] [FAULT...]
# FAULT is a patch name without its folder or ending (01-args-chain-not-released); none means
# all of them. RESULTS (default build/fault_check.txt) gets one line a fault:
#   NAME: caught by Suite.Case, ...      or      NAME: NOT CAUGHT
# The tree must hold no change to the files the patches touch. A clean run comes first, so that
# a case failing without any fault is not taken for a catch.
set -uo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
cd "$root"
results="$root/build/fault_check.txt"
if [ "${1:-}" = "-o" ]; then
  results=$(realpath -m "$2")
  shift 2
fi
faults=("$@")
if [ ${#faults[@]} -eq 0 ]; then
  for patch in tools/faults/*.patch; do faults+=("$(basename "$patch" .patch)"); done
fi

export WINEPREFIX="$root/build/wineprefix"
export WINEDEBUG="${WINEDEBUG:--all}"
export LANG="${LANG:-C.UTF-8}"
log() { printf 'fault_check: %s\n' "$*" >&2; }

# The tests need a display and the project's Wine prefix, as ./lumvex test gives them.
"$root/lumvex" build >/dev/null || { log "the clean tree does not build"; exit 1; }
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

# Builds what the tests run: the module, the host and the test programs (not the fuzz targets or
# the benchmarks, which no case here runs).
build_tests() {
  local win_targets=(Lumvex1 devhost devhostrt ClipboardTestReader)
  for source in tests/win/*Test.cpp; do win_targets+=("$(basename "$source" .cpp)"); done
  cmake --build build/native --target native_tests >/dev/null 2>&1 &&
    cmake --build build/win64 --target "${win_targets[@]}" >/dev/null 2>&1
}

# Runs every test but the fuzz targets; prints the failing cases, one a line.
failing_cases() {
  local out
  out=$(mktemp)
  ctest --test-dir build/native -LE fuzz --output-on-failure -j2 >"$out" 2>&1
  ctest --test-dir build/win64 --output-on-failure >>"$out" 2>&1
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
