#!/usr/bin/env bash
# run.sh BUILD LIBRARIES PROGRAM [ARGUMENT ...]: a test program of a build for Windows, under Wine, with the
# libraries of the build, those of cmake/windows_libraries.sh and the compiler's.
set -euo pipefail
build=$1 libraries=$2
shift 2
compilers=$(x86_64-w64-mingw32-g++-posix -print-file-name=libstdc++-6.dll)
threads=$(x86_64-w64-mingw32-g++-posix -print-file-name=libwinpthread-1.dll)
WINEPATH=
for folder in "$build" "$libraries/bin" "${compilers%/*}" "${threads%/*}"; do
  WINEPATH+="Z:$(realpath "$folder");"
done
export WINEPATH WINEDEBUG=-all WINEDLLOVERRIDES='mscoree,mshtml,winemenubuilder.exe=' LC_ALL=C.UTF-8
export WINEPREFIX=${WINEPREFIX:-$(realpath "$build")/wine}
unset DISPLAY
exec "$(command -v wine64 || echo /usr/lib/wine/wine64)" "$@"
