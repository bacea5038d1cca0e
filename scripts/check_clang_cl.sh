#!/usr/bin/env bash
# Whether Clang compiles module and utility library in the manner of Microsoft's compiler, with that
# compiler's options, macros, layouts and keywords, without a warning (cmake/clang-cl.cmake). Nothing is
# linked: the standard library is MinGW's.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
folder=build/clang-cl
log=$(mktemp)
trap 'rm -f "$log"' EXIT

cmake -S . -B "$folder" -G Ninja -DCMAKE_TOOLCHAIN_FILE=cmake/clang-cl.cmake -DCMAKE_BUILD_TYPE=Debug \
  -DCLIPHOST_HOST=OFF -DCLIPHOST_TESTS=OFF -DCLIPHOST_BATCHES=ON >"$log" 2>&1 \
  || { tail -n 20 "$log"; echo 'clang-cl: configuring failed'; exit 1; }
# But for what the utility library shares with the program: that needs headers of MinGW's library which
# can't be compiled so (two comparisons of string_view get one name, for example).
mapfile -t objects < <(ninja -C "$folder" -t targets all | sed -n 's/\.obj: CXX_.*/.obj/p' \
  | grep -v -e /host_system.dir/ -e /host_text.dir/)
((${#objects[@]})) || { echo 'clang-cl: nothing to compile'; exit 1; }
if ! ninja -C "$folder" -k 0 "${objects[@]}" >"$log" 2>&1 || grep -q 'warning:' "$log"; then
  grep -E 'error:|warning:' "$log" | sort -u | head -n 40
  echo 'clang-cl: Microsoft'"'"'s compiler would take some of this otherwise'
  exit 1
fi
