#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# describe_ssh.sh HOSTS SHARES MOVIES OUT [OPTION ...] [-- OPTION ...]
# The same as describe.sbatch, on machines that ssh reaches: HOSTS is a file with a line for each, such
# as 2/user@host for two shares at a time, and : for this machine. Needs GNU parallel here alone.
# The same call again does what is left.
set -euo pipefail
[[ $# -ge 4 && $2 =~ ^[1-9][0-9]*$ ]] || { sed -n '5s/# /usage: /p' "$0" >&2; exit 2; }
# Other machines begin in another folder.
hosts=$1 shares=$2 movies=$(realpath -sm -- "$3") out=$(realpath -sm -- "$4") both=()
shift 4
while (($#)) && [ "$1" != -- ]; do
  both+=("$1")
  shift
done
(($# == 0)) || shift # what is left is for `describe`
# With a limit a process of its own reads each movie: what a movie does to it costs that movie alone.
[[ " ${both[*]} " == *' --limit-'* ]] || both+=(--limit-seconds 3600)
trap 'exit 130' INT # parallel ends its tasks
mkdir -p "$out"

status=0
each_share() { # each_share VERB OPTION ...
  # A share that fails, or whose machine goes away, is tried on another one.
  seq "$shares" | parallel --quote --sshloginfile "$hosts" --retries 3 --line-buffer \
    --tagstring "$1 {}" --joblog "$out/$1.log" \
    "${CLIPHOST:-cliphost}" "$1" "$movies" --recursive --shard "{}/$shares" --jobs 1 "${both[@]}" "${@:2}" \
    || status=1
}
each_share describe --out-dir "$out/{}" --skip-done --quiet "$@"
each_share catalog --update -o "$out/{}.sqlite"
catalogs=()
for ((share = 1; share <= shares; ++share)); do
  catalogs+=("$out/$share.sqlite")
done
"${CLIPHOST:-cliphost}" catalog --merge "${catalogs[@]}" -o "$out/all.sqlite" || status=1
exit $status
