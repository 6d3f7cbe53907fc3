# Sourced by the scripts that drive the development host: a scratch folder, the module's state
# file (beside it in $bin) kept aside and put back when the script ends, and a host started in
# the background ($host) ended with the script.
state="$bin/Lumvex1.ini"
work=$(mktemp -d /tmp/lumvex-session.XXXXXX)
saved=""
[ -f "$state" ] && saved="$work.ini" && cp "$state" "$saved"
host=""
end_session() {
  if [ -n "$host" ]; then kill "$host" 2>/dev/null || true; fi
  if [ -n "$saved" ]; then mv "$saved" "$state"; else rm -f "$state"; fi
  rm -rf "$work"
}
trap end_session EXIT
