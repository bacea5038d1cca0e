#!/bin/sh
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# run.sh PREFIX FOLDERS PROGRAM [ARGUMENT ...]: a program for Windows under Wine. What Wine keeps lies in PREFIX;
# in FOLDERS, with colons between them, lie the libraries that the program loads.
WINEPREFIX=$1 WINEPATH=$(printf 'Z:%s' "$2" | sed 's/:/;Z:/2g')
export WINEPREFIX WINEPATH WINEARCH=win64 WINEDEBUG=-all WINEDLLOVERRIDES='mscoree,mshtml,winemenubuilder.exe='
unset DISPLAY
# Programs that run at the same time can't append to one file there.
[ -z "$CLIPHOST_TEST_TALLY" ] || export CLIPHOST_TEST_TALLY="$CLIPHOST_TEST_TALLY.$$"
shift 2
wine=$(command -v wine64) || wine=/usr/lib/wine/wine64
if [ ! -d "$WINEPREFIX/drive_c" ]; then
  mkdir -p "$WINEPREFIX"
  "$wine" wineboot --init >/dev/null 2>&1
fi
exec "$wine" "$@"
