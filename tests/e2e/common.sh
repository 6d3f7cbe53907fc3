# Sourced by the end-to-end scripts: their arguments, a scratch folder, the state file beside
# the module kept aside and put back, a host started in the background ended with the script,
# and the check that counts passes and failures.
# Usage: source common.sh BIN_DIR REPO_ROOT [SCREENSHOT_DIR]
set -uo pipefail
bin=$1
root=$2
shots=${3:-}
run="$root/cmake/wine-run"
state="$bin/Lumvex1.ini"
passed=0
failed=0
work=$(mktemp -d /tmp/lumvex-e2e.XXXXXX)
saved=""
[ -f "$state" ] && saved="$work.ini" && cp "$state" "$saved"
host=""
cleanup() {
  [ -n "$host" ] && kill "$host" 2>/dev/null
  if [ -n "$saved" ]; then mv "$saved" "$state"; else rm -f "$state"; fi
  rm -rf "$work"
}
trap cleanup EXIT
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
