#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# check_test_rows.sh TESTROWS CTEST: ctest's rows of a program are those that it lists; one that ends with 77 is
# skipped, and a program that lists none is an error.
set -euo pipefail
rows_script=$1 ctest=$2
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
fail() { printf 'test_rows: %s\n' "$*" >&2; exit 1; }
cd "$folder"

settings() { # settings [LINE ...]: those of every program, and these
  { cat <<CMAKE
set(name test_some)
set(program "$folder/test_some")
set(rows "$folder/test_some_rows.cmake")
set(apart "Apart")
set(filter "*")
set(properties TIMEOUT 5)
CMAKE
    [ $# = 0 ] || printf '%s\n' "$@"
    printf 'include("%s")\n' "$rows_script"
  } >CTestTestfile.cmake
}
settings
program() { # program LINE ...: lists these
  { printf '#!/bin/sh\n'; [ $# = 0 ] || printf 'echo "%s"\n' "$@"; } >test_some
  chmod +x test_some
  rm -f test_some_rows.cmake
}

program First. '  One' '  Two  # GetParam() = 2' Apart. '  Three'
listed=$("$ctest" -N)
for row in test_some.First Apart.Three; do
  grep -q ": $row\$" <<<"$listed" || fail "no row $row: $listed"
done
grep -q '^Total Tests: 2$' <<<"$listed" || fail "other rows: $listed"
[ "$(echo test_some_rows*)" = test_some_rows.cmake ] || fail "left over: $(echo test_some_rows*)"

printf '#!/bin/sh\n[ "$1" = --gtest_list_tests ] && printf "First.\\n  One\\n" && exit\necho no browser\nexit 77\n' >test_some
rm -f test_some_rows.cmake
said=$("$ctest" -V 2>&1) || fail "a row that is skipped fails: $said"
grep -q 'test_some.First .*Skipped' <<<"$said" || fail "a row that is skipped counts as another: $said"
grep -q 'no browser' <<<"$said" || fail "a row that is skipped does not say why: $said"

printf '#!/bin/sh\nexec "$@"\n' >run
chmod +x run
settings "set(emulator \"$folder/run\")"
program First. '  One' Second. '  Two' Apart. '  Three' '  Four'
listed=$("$ctest" -N)
for row in test_some Apart.Three Apart.Four; do
  grep -q ": $row\$" <<<"$listed" || fail "no row $row under an emulator: $listed"
done
grep -q '^Total Tests: 3$' <<<"$listed" || fail "other rows under an emulator: $listed"
grep -qF "$folder/run" test_some_rows.cmake || fail "the emulator is not called"

settings 'set(left_out First.One "Apart.T*")'
rm test_some_rows.cmake
"$ctest" -N >/dev/null || fail "tests that there are can't be left out"
settings 'set(left_out First.One Apart.Five)'
rm test_some_rows.cmake
if said=$("$ctest" -N 2>&1); then
  fail "a test that there isn't is left out"
fi
grep -q 'test_some has no test Apart.Five' <<<"$said" || fail "ctest says: $said"

settings
program
if said=$("$ctest" 2>&1); then
  fail "a program without tests is taken: $said"
fi
grep -q 'test_some lists no tests' <<<"$said" || fail "ctest says: $said"
[ ! -e test_some_rows.cmake ] || fail "rows are kept of a program without tests"
