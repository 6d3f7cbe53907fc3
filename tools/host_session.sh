# Sourced by the scripts that drive the development host: a folder world of their own on a drive
# letter of its own ($world, shown to Windows as $world_drive, for example "E:"), a scratch folder for
# their own files ($work), the module's state file (beside it in $bin) kept aside and put back
# when the script ends, and a host started in the background ($host) ended with the script.
# The world is emptied at the start and the end: the tree then shows under $drive only what the
# script made, whatever else lies in the machine's temporary folder.
here=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
export WINEPREFIX="${WINEPREFIX:-$here/build/wineprefix}"
export WINEDEBUG="${WINEDEBUG:--all}"
source "$here/tools/wine_drive.sh"
state="$bin/Lumvex1.ini"
work=$(mktemp -d /tmp/lumvex-session.XXXXXX)
world="$(dirname "$WINEPREFIX")/e2e-world"
rm -rf "$world" && mkdir -p "$world"
drive_letter "$world" "y x w v u t s r q p" || { echo "no free drive letter for $world" >&2; exit 1; }
world_drive="${letter^^}:"
if [ "$drive_made" = 1 ]; then
  # Wine's services started here with their output on /dev/null, so that they hold no pipe of ours.
  wineserver -p >/dev/null 2>&1 </dev/null || true
  wine cmd.exe /c exit 0 >/dev/null 2>&1 </dev/null || true
fi
saved=""
[ -f "$state" ] && saved="$work.ini" && cp "$state" "$saved"
host=""
end_session() {
  if [ -n "$host" ]; then kill "$host" 2>/dev/null || true; fi
  # Whatever else the script left running in the background (a watcher, say) ends with it.
  local job
  for job in $(jobs -p); do kill "$job" 2>/dev/null || true; done
  if [ -n "$saved" ]; then mv "$saved" "$state"; else rm -f "$state"; fi
  rm -rf "$work" "$world"
  mkdir -p "$world"
}
trap end_session EXIT
