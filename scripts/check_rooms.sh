#!/usr/bin/env bash
# Whether each include runs along an arrow of the tables of rooms in docs/architecture.md.
# The first cell of a row names a room, its last one the rooms that it may include. These
# stand higher up, so no circle can be written down. Files in a folder without a row
# belong to the room above it.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

git grep -n '#include "\(source\|reference_host\)/' -- 'source/*' 'reference_host/*' \
  | awk -F '[:"]' '
  # The last room whose folder begins the path.
  function room_of(path, folder) {
    folder = path
    while (sub(/\/[^\/]*\/?$/, "/", folder)) {
      if (folder in uses) return folder
      sub(/\/$/, "", folder)
    }
    return ""
  }
  function complain(text) { print text; failed = 1 }
  FNR == NR {
    if (/^## The module/) wing = "source/"
    else if (/^## The host/) wing = "reference_host/"
    else if (/^## /) wing = ""
    if (wing == "" || !/^\| `/) next
    cells = split($0, cell, "|")
    room = wing substr(cell[2], 3, index(substr(cell[2], 3), "`") - 1)
    uses[room] = ""
    arrows = cell[cells - 1]
    while (match(arrows, /`[a-z_\/]+\/`/)) {
      used = wing substr(arrows, RSTART + 1, RLENGTH - 2)
      arrows = substr(arrows, RSTART + RLENGTH)
      if (used == room || !(used in uses))
        complain("docs/architecture.md: " room " uses " used ", which stands in no row above it")
      arrow[room, used] = 1
    }
    next
  }
  {
    from = room_of($1); to = room_of($4)
    if (from == "") complain($1 ": its folder has no row in docs/architecture.md")
    else if (from != to && !((from, to) in arrow))
      complain($1 ":" $2 ": " from " may not include " $4)
    used_arrow[from, to] = 1
  }
  END {
    if (NR == FNR) complain("docs/architecture.md: no table of rooms, or no includes found")
    for (pair in arrow)
      if (!(pair in used_arrow)) {
        split(pair, ends, SUBSEP)
        complain("docs/architecture.md: " ends[1] " includes nothing of " ends[2])
      }
    exit failed
  }' docs/architecture.md -
