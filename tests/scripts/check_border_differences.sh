#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# check_border_differences.sh SCRIPT HOST_INTERFACES: whether the comparison of compilers finds what
# they do differently, in copies of the headers that have it.
set -euo pipefail
script=$1
headers=$2
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# finds TEXT CHANGE: with the change, an expression of sed's, in a header it fails and says so.
finds() {
  rm -rf "$work/host_interfaces"
  cp -r "$headers" "$work/host_interfaces"
  sed -i "$2" "$work/host_interfaces/framework/Lock.h"
  if cmp -s "$headers/framework/Lock.h" "$work/host_interfaces/framework/Lock.h"; then
    echo "nothing was changed by: $2"
    exit 1
  fi
  if "$script" "$work" >"$work/told" 2>&1 || ! grep -q "$1" "$work/told"; then
    echo "was to find: $1"
    cat "$work/told"
    exit 1
  fi
}
finds 'places of operations differ' 's/virtual NCFRESULT Unlock() = 0;/& virtual NCFRESULT Lock(int) = 0;/'
finds 'layouts of records differ' 's/^struct INCFLock/struct Wide { char first; long double second; };\n&/'
finds 'call in two ways' \
  's/^struct INCFLock/struct Held { ~Held(); };\n&/; s/virtual NCFRESULT Unlock() = 0;/virtual NCFRESULT Unlock(Held) = 0;/'
finds 'call in two ways' \
  's/^struct INCFLock/struct Pair { int a, b; };\n&/; s/virtual NCFRESULT Unlock() = 0;/virtual Pair Unlock() = 0;/'
# One that the compiler doesn't see, and so was not compared.
finds 'operations are declared' 's/^struct INCFLock/#ifdef NEVER\n    virtual void Do() = 0;\n#endif\n&/'
