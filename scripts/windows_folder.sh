#!/usr/bin/env bash
# windows_folder.sh BUILD FOLDER: lays out what BUILD made for Windows as a folder that runs as it is,
# checks it against cmake/windows_folder/contents.txt, and makes FOLDER.zip of it.
set -euo pipefail
build=$(realpath "$1")
folder=$(realpath "$2")
contents=$(realpath "$(dirname "${BASH_SOURCE[0]}")")/../cmake/windows_folder/contents.txt
objdump=x86_64-w64-mingw32-objdump
fail() { printf 'windows_folder: %s\n' "$*" >&2; exit 1; }

rm -rf "$folder" "$folder.zip"
cmake --install "$build" --prefix "$folder" >/dev/null
cd "$folder"
find . -name '*.dll' -o -name '*.exe' -o -name '*.nvx' | xargs -d '\n' x86_64-w64-mingw32-strip
# The licences name texts that lie on every Debian system.
mkdir licences/common-licenses
grep -rhoE '/usr/share/common-licenses/[A-Za-z0-9.-]*[A-Za-z0-9]' licences | sort -u \
  | xargs cp -L -t licences/common-licenses

# --- what lies there, and what it asks of Windows ---------------------------------
# The lists name a file in each row; behind a colon the libraries that it may import.
listed() { sed '/^#/d; /^$/d; s/:.*//' "$contents" | sort; }
there() { find . -type f -printf '%P\n' | sort; }
difference=$(diff <(listed) <(there)) || fail "other files lie there (>) than are listed (<):
$difference"

imports() { $objdump -p "$1" | sed -n 's/.*DLL Name: //p' | sort -u; }
exports() { $objdump -p "$1" | sed -n '/^\[Ordinal\/Name Pointer\]/,/^$/s/^\t\[ *[0-9]*\] //p' | sort; }
while IFS=: read -r file allowed; do
  [ -n "$(imports "$file")" ] || fail "$file: no imports can be read"
  more=$(comm -13 <(tr ' ' '\n' <<<"$allowed" | sort) <(imports "$file"))
  [ -z "$more" ] || fail "$file imports what its list lacks:" $more
done < <(grep '^[^#].*: ' "$contents")

wanted=$(sed -n 's/^ *\(NCF[A-Za-z]*\);$/\1/p' "${contents%/cmake/*}/source/plugin/entry/exports.map" | sort)
[ -n "$wanted" ] || fail "no function can be read out of exports.map"
[ "$(exports plugins/QuickTimePlugin.nvx)" = "$wanted" ] \
  || fail "the module exports" $(exports plugins/QuickTimePlugin.nvx)

cd ..
cmake -E tar cf "$folder.zip" --format=zip "${folder##*/}"
