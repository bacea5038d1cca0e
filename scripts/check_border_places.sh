#!/usr/bin/env bash
# check_border_places.sh [FOLDER]: whether everything that crosses the border between host and module
# stands at the same place for Microsoft's compiler as for MinGW's: layouts of records, places of
# virtual operations, and how their arguments are passed. Clang tells all of it for both.
# FOLDER holds host_interfaces/, this project unless it is given. No header of a system or library is
# read, only the few of tests/support/windows_headers/stubs.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
border=${1:-.}
stubs=$PWD/tests/support/windows_headers/stubs
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# compile ENVIRONMENT SOURCE OPTIONS ...
compile() {
  local environment=$1 source=$2
  shift 2
  clang++ --target="x86_64-pc-$environment" -std=c++17 -ffreestanding -nostdinc++ -nostdlibinc -Werror \
    -isystem "$stubs" -I"$border" "$@" "$source"
}

(cd "$border" && find host_interfaces -name '*.h' | LC_ALL=C sort | sed 's/.*/#include "&"/') \
  >"$work/border.cpp"
operations=$(cd "$border" && grep -rhE --include='*.h' '^ *virtual ' host_interfaces | wc -l)

# Layouts, each record from its first line on. Those of the compiler's own records, and what only one
# of the compilers tells (room at the end of a base, which shows in records that have the base), are
# left out; the table's pointer has two names.
layouts() {
  compile "$1" "$work/border.cpp" -fsyntax-only -Xclang -fdump-record-layouts-complete \
    | awk -v RS= '!/\| (struct|class|union) (__|\(unnamed)/' \
    | sed -E '/nvsize=/d; s/dsize=[0-9]+, //; s/vftable/vtable/'
}
layouts windows-msvc >"$work/layouts.msvc"
layouts windows-gnu >"$work/layouts.gnu"

# A constructor makes the compiler lay out the table of a class.
{
  cat "$work/border.cpp"
  awk '/Dumping AST/ { getline; name = $0; sub(/.*\| (struct|class) /, "", name) }
       /^ +0 \| +\(.* vtable pointer\)/ && name != "" {
         printf "struct Table%d : %s { Table%d(); };\nTable%d::Table%d() {}\n", ++n, name, n, n, n
         name = ""
       }' "$work/layouts.gnu"
} >"$work/tables.cpp"
# CLASS: PLACE | OPERATION, for each operation where it is declared.
places() {
  compile "$1" "$work/tables.cpp" -S -emit-llvm -o /dev/null -Xclang -fdump-vtable-layouts \
    | awk '/^VF?Table indices for/ { on = 1; name = $0; sub(/[^\047]*\047/, "", name)
                                     sub(/\047.*/, "", name); next }
           /^$/ { on = 0 }
           on { print name ":" $0 }' | LC_ALL=C sort
}
places windows-msvc >"$work/places.msvc"
places windows-gnu >"$work/places.gnu"
places linux-gnu >"$work/places.linux"

failed=0
# same WHAT ONE OTHER
same() {
  diff -U 3 --label "$2" --label "$3" "$work/$2" "$work/$3" >"$work/difference" && return
  printf '%s differ between %s and %s:\n' "$1" "$2" "$3"
  head -n 40 "$work/difference"
  failed=1
}
same 'layouts of records' layouts.msvc layouts.gnu
same 'places of operations' places.msvc places.gnu
same 'places of operations' places.linux places.gnu

# Every operation that the headers have was compared.
found=$(wc -l <"$work/places.msvc")
if ((found != operations || found == 0)); then
  echo "$operations operations are declared, $found were compared"
  failed=1
fi

# A result or an argument that is a class with a constructor or destructor of its own, or a result that
# is any class, is passed and destroyed in two ways by the two compilers.
{
  cat "$work/border.cpp" - <<'TEXT'
template <class Type>
constexpr bool IsPassedAlike() {
    return !__is_class(Type) || (__is_trivially_copyable(Type) && __is_standard_layout(Type));
}
template <class Interface, class Result, class... Arguments>
constexpr bool IsCalledAlike(Result (Interface::*)(Arguments...)) {
    return !__is_class(Result) && (IsPassedAlike<Arguments>() && ...);
}
template <class Interface, class Result, class... Arguments>
constexpr bool IsCalledAlike(Result (Interface::*)(Arguments..., ...)) {
    return !__is_class(Result) && (IsPassedAlike<Arguments>() && ...);
}
TEXT
  sed -E 's/:  *[0-9]+ \|.*::([A-Za-z0-9_]+)\(.*/ \1/' "$work/places.gnu" | while read -r name operation; do
    echo "static_assert(IsCalledAlike(&$name::$operation), \"$name::$operation\");"
  done
} >"$work/calls.cpp"
if ! compile windows-msvc "$work/calls.cpp" -fsyntax-only 2>"$work/errors"; then
  echo 'operations that the compilers call in two ways:'
  grep error: "$work/errors" | sed 's/.*error: //' | head -n 20
  failed=1
fi
((failed)) || echo "border: $found operations and $(grep -c 'sizeof=' "$work/layouts.msvc") records stand alike"
exit $failed
