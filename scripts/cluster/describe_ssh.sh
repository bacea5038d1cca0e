#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# describe_ssh.sh HOSTS SHARES MOVIES OUT [OPTION ...]
# The same as describe.sbatch, on machines that ssh reaches: HOSTS is a file with a line for each, such
# as 2/user@host for two shares at a time, and : for this machine. Needs GNU parallel here alone.
# The same call again does what is left.
set -euo pipefail
(($# >= 4)) || { sed -n '5s/# /usage: /p' "$0" >&2; exit 2; }
hosts=$1 shares=$2 movies=$3 out=$4
shift 4
mkdir -p "$out"

status=0
each_share() { # each_share VERB OPTION ...
  # A share that fails, or whose machine goes away, is tried on another one.
  seq "$shares" | parallel --quote --sshloginfile "$hosts" --retries 3 --line-buffer \
    --tagstring "$1 {}" --joblog "$out/$1.log" \
    "${CLIPHOST:-cliphost}" "$1" "$movies" --recursive --shard "{}/$shares" --jobs 1 "${@:2}" || status=1
}
each_share describe --out-dir "$out/{}" --skip-done --quiet "$@"
each_share catalog --update -o "$out/{}.sqlite"
"${CLIPHOST:-cliphost}" catalog --merge "$out"/[0-9]*.sqlite -o "$out/all.sqlite" || status=1
exit $status
