# Sourced: gives a folder a drive letter of its own in the Wine prefix ($WINEPREFIX), so that
# the shell shows it as a drive holding only what that folder holds.
# drive_letter FOLDER [LETTERS] sets letter (lower case): the one already pointing at FOLDER, or
# the first free one of LETTERS (d to y unless given), made now. A new letter ends the running Wine server, which knows only the drives it
# found when it started; drive_made is then 1. Fails when every letter is taken.
drive_letter() {
  local folder candidate link letters
  folder=$(realpath -m "$1")
  letters=${2:-d e f g h i j k l m n o p q r s t u v w x y}
  drive_made=0
  for candidate in d e f g h i j k l m n o p q r s t u v w x y; do
    link="$WINEPREFIX/dosdevices/$candidate:"
    if [ -L "$link" ] && [ "$(readlink "$link")" = "$folder" ]; then
      letter=$candidate && return 0
    fi
  done
  for candidate in $letters; do
    link="$WINEPREFIX/dosdevices/$candidate:"
    [ -e "$link" ] || [ -L "$link" ] && continue
    ln -s "$folder" "$link" || continue
    wineserver -k >/dev/null 2>&1 || true
    drive_made=1
    letter=$candidate && return 0
  done
  return 1
}
