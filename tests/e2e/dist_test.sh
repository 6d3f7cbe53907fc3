#!/usr/bin/env bash
# The Windows package as a person gets it: ./lumvex dist makes the zip, which is unzipped into a
# fresh folder and run in a fresh Wine prefix; the unzipped host evaluates a line in batch, says
# its version, and browses the unzipped samples with real input until a drawing is accepted.
# Usage: dist_test.sh BIN_DIR REPO_ROOT SCREENSHOT_DIR
source "$(dirname "$0")/common.sh" "$@"

version=$(head -n 1 "$root/VERSION")
zip=$("$root/lumvex" dist 2>"$work/dist.log" | tail -n 1)
must "./lumvex dist makes the zip" "$(realpath -m "$bin/../../dist/lumvex-$version-win64.zip")" "$zip"
unzipped="$work/unzipped"
python3 -m zipfile -e "$zip" "$unzipped"
package="$unzipped/lumvex-$version-win64"
check "the package holds the host, its runtime, the module, the samples and START.txt" \
  "Lumvex1.arx START.txt devhost.exe devhostrt.dll samples" "$(ls "$package" | LC_ALL=C sort | xargs)"
for program in devhost.exe devhostrt.dll Lumvex1.arx; do
  foreign=$(x86_64-w64-mingw32-objdump -p "$package/$program" | sed -n 's/^\s*DLL Name: //p' | tr 'A-Z' 'a-z' |
    grep -v -x -e kernel32.dll -e user32.dll -e gdi32.dll -e comctl32.dll -e comdlg32.dll -e shell32.dll -e shlwapi.dll \
      -e ole32.dll -e oleaut32.dll -e winmm.dll -e gdiplus.dll -e msvcrt.dll -e devhostrt.dll -e windowscodecs.dll | xargs)
  check "$program needs no DLL beyond the system's" "" "$foreign"
  check "$program is stripped" "" "$(x86_64-w64-mingw32-objdump -h "$package/$program" | grep -o '\.debug_info')"
done

# A prefix nobody has used: what a Windows machine without Lumvex has.
export WINEPREFIX="$work/prefix"
fresh_prefix_end() { wineserver -k >/dev/null 2>&1 || true; }
trap 'fresh_prefix_end; end_session' EXIT
WINEDLLOVERRIDES="mscoree,mshtml=" wineboot -i >/dev/null 2>&1
wine reg add 'HKCU\Software\Wine\X11 Driver' /v Managed /d N /f >/dev/null 2>&1
drive_letter "$package/samples" || stop "giving the unzipped samples a drive letter"
wineserver -k >/dev/null 2>&1
wineserver -p >/dev/null 2>&1 </dev/null

check "the unzipped host evaluates in batch" "3" "$(wine "$package/devhost.exe" --batch --eval "(+ 1 2)" 2>/dev/null | tr -d '\r')"
check "the unzipped host says its version" "devhost $version" "$(wine "$package/devhost.exe" --version 2>/dev/null | tr -d '\r')"

"$root/tools/run_headless.sh" "$package/devhost.exe" "${letter^^}" "$shots/dist" >"$work/browse" 2>&1
accepted=$(tr -d '\r' <"$work/browse" | sed -n 's/^("\([^"]*\)" ("" "" ""))$/\1/p')
check "the browse of the unzipped samples accepts a drawing" 1 "$([ -n "$accepted" ] && echo 1)"
check "the accepted drawing lies in the unzipped samples" \
  "${letter^^}:\\\\Details\\\\" "$(echo "$accepted" | grep -o '^.:\\\\Details\\\\')"
name=${accepted##*\\}
check "the accepted drawing is a file there" 1 "$(ls "$package/samples/Details" | tr 'A-Z' 'a-z' | grep -c -x -F "$name")"
[ -n "$accepted" ] || { echo '--- the browse said'; cat "$work/browse"; }

summary dist
