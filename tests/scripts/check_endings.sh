#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# check_endings.sh PROGRAM: the statuses of a test program, by what became of its tests. 77 is a row that ctest
# counts as skipped, which one that passes or fails must not be.
set -euo pipefail
unset CLIPHOST_TEST_TALLY # these are none of the tests that a run counts
program=$1
fail() { printf 'endings: %s\n' "$*" >&2; exit 1; }

ends() { # ends FILTER STATUS WORDS
  local said status=0
  said=$("$program" --gtest_filter="$1" 2>&1) || status=$?
  [ "$status" = "$2" ] || fail "$1 ends with $status instead of $2: $said"
  grep -q "$3" <<<"$said" || fail "$1 does not say '$3': $said"
}
ends 'Skipped.*' 77 'needs what is nowhere'
ends 'Mixed.*' 0 'needs what is nowhere'
ends 'Failed.*' 1 'as it has to'
ends 'DISABLED_All.*' 77 'YOU HAVE 1 DISABLED TEST'
ends 'Absent.*' 2 'no test ran: the filter fits none'
ends 'Exits.*' 1 'a test ended the program before all tests ran'
