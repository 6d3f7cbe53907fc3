(Lumvex 0 0 "Z:\\work\\drawings\\" "Insert" "Close")
