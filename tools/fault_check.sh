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

# Reads ctest's output (with --output-on-failure) and prints what failed, one a line:
#   PROGRAM<tab>KIND<tab>CASE
# A GoogleTest case that failed is an assertion, one the case time limit ended is a timeout; a
# case that began and never ended is a crash, or a timeout when ctest's limit ended its program.
# A failed program with no failing case of its own is listed as "ctest: PROGRAM".
classify() {
  # Programs may write any bytes; only printable text can name a case.
  tr -cd '\11\12\40-\176' | LC_ALL=C awk -v OFS='\t' '
    function flush() {
      if (program == "" || status == "passed") return
      if (running != "") found(running, status == "timeout" ? "timeout" : "crash")
      if (!count) found("ctest: " program, status == "timeout" ? "timeout" : "crash")
    }
    function found(name, kind) {
      if ((program, name) in seen) return
      seen[program, name] = 1
      count++
      print program, kind, name
    }
    /^ *[0-9]+\/[0-9]+ Test +#[0-9]+: / {
      flush()
      program = $4; running = ""; count = 0
      status = /\*\*\*Timeout/ ? "timeout" : /\*\*\*Exception/ ? "crash" : /\*\*\*Failed/ ? "failed" : "passed"
      next
    }
    /^\[ RUN      \] / { running = $4; next }
    /^\[       OK \] / { if ($4 == running) running = ""; next }
    /^\[ TIMEOUT  \] / { if ($4 == running) running = ""; found($4, "timeout"); next }
    /^\[  FAILED  \] [A-Za-z0-9_\/]+\.[A-Za-z0-9_\/]+/ { if ($4 == running) running = ""; found($4, "assertion"); next }
    /^FAILED / { sub(/^FAILED /, ""); found("e2e: " $0, "assertion"); next }
    END { flush() }
  '
}

# Runs the tests but the fuzz targets, or only the programs named by an extended regular
# expression; prints what failed, as classify does.
failing_cases() {
  local out filter=("${ctest_filter[@]}")
  [ $# -gt 0 ] && filter=(-R "$1")
  out=$(mktemp)
  : >"$out"
  [ $native_run = yes ] && ctest --test-dir build/native -LE fuzz "${filter[@]}" --output-on-failure -j2 >>"$out" 2>&1
  if [ ${#win_programs[@]} -gt 0 ] || [ $e2e_run = yes ]; then
    ctest --test-dir build/win64 "${filter[@]}" --output-on-failure >>"$out" 2>&1
  fi
  classify <"$out" | sort -u
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
[ -n "$baseline" ] && log "failing without a fault (left out of the results): $(echo "$baseline" | cut -f3 | paste -sd, -)"

mkdir -p "$(dirname "$results")"
echo "$(date -u '+%Y-%m-%d %H:%M UTC'), commit $(git rev-parse --short HEAD)" >"$results"
for fault in "${faults[@]}"; do
  patch="tools/faults/$fault.patch"
  if ! git apply "$patch"; then
    echo "$fault: does not apply" | tee -a "$results"
    continue
  fi
  applied=$fault
  log "$fault"
  line="$fault: NOT CAUGHT"
  caught=""
  if ! build_tests; then
    line="$fault: does not build"
  else
    caught=$(failing_cases | awk -F'\t' 'NR == FNR { clean[$1, $3] = 1; next } !(($1, $3) in clean)' <(echo "$baseline") -)
  fi
  git apply -R "$patch"
  applied=""
  if [ -n "$caught" ]; then
    # The catching programs again, on the clean tree: what fails there as well is no catch.
    build_tests
    programs_re="^($(echo "$caught" | cut -f1 | sort -u | paste -sd'|' -))\$"
    flaky=$(comm -12 <(echo "$caught" | cut -f1,3 | sort -u) <(failing_cases "$programs_re" | cut -f1,3 | sort -u))
    counted=$(echo "$caught" | while IFS=$'\t' read -r program kind name; do
      grep -qxF "$program"$'\t'"$name" <<<"$flaky" || echo "$name ($kind)"
    done | paste -sd, - | sed 's/,/, /g')
    [ -n "$counted" ] && line="$fault: caught by $counted"
    [ -n "$flaky" ] && line="$line; failing on the clean tree too, not counted: $(echo "$flaky" | cut -f2 | paste -sd, - | sed 's/,/, /g')"
  fi
  echo "$line" | tee -a "$results"
done
# Leave the builds matching the clean tree.
build_tests
log "results in $results"
! grep -q 'NOT CAUGHT\|does not' "$results"
