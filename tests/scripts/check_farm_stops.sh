#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# check_farm_stops.sh SLURM_SH: stop_slurm ends what the farm started, within its time, also a daemon that
# does not end when it is asked and one that was not noted yet; and nothing before anything was started.
set -euo pipefail
folder=$(mktemp -d /tmp/cluster-stops.XXXXXX)
others=()
trap 'kill -KILL "${others[@]}" 2>/dev/null || true; rm -rf "$folder"' EXIT
fail() { printf 'farm_stops: %s\n' "$*" >&2; exit 1; }

# No Slurm is there to ask.
mkdir "$folder/bin"
for name in squeue scancel; do
  printf '#!/bin/sh\n' >"$folder/bin/$name"
  chmod +x "$folder/bin/$name"
done
PATH=$folder/bin:$PATH
# shellcheck source=scripts/cluster/slurm.sh
. "$1"
export slurm_patience=1
is_gone() { ! kill -0 "$1" 2>/dev/null; }

# Another Slurm, by the caller's environment.
export SLURM_CONF=$folder/other.conf
sleep 300 &
others=($!)
stop_slurm
is_gone "${others[0]}" && fail "it ended another Slurm"

# As start_slurm begins.
export SLURM_CONF=$folder/slurm.conf
export slurm=$folder
for number in 1 2; do
  daemon "stubborn$number" bash -c 'trap "" TERM; while :; do sleep 0.1; done'
done
setsid sleep 300 &
unnoted=$!
others+=("${slurm_daemons[@]}" "$unnoted")
until_true 20 grep -qxzF "SLURM_CONF=$SLURM_CONF" "/proc/$unnoted/environ"
sleep 0.3 # the traps are set
before=$SECONDS
stop_slurm || true
((SECONDS - before < 20)) || fail "it took $((SECONDS - before)) s"
for process in "${others[@]:1}"; do
  until_true 5 is_gone "$process" || fail "$process goes on"
done
is_gone "${others[0]}" && fail "it ended another Slurm's process"

# A daemon alone, before it was noted.
export slurm=$folder
setsid sleep 300 &
others+=($!)
until_true 20 grep -qxzF "SLURM_CONF=$SLURM_CONF" "/proc/$!/environ"
stop_slurm || true
until_true 5 is_gone "${others[-1]}" || fail "what was not noted goes on"
