#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# check_shares.sh CLUSTER: what describe.sbatch and describe_ssh.sh of the folder CLUSTER call for each share, how
# they end, and when a task puts itself back. Program, Slurm and parallel are stand-ins.
set -euo pipefail
cluster=$1
folder=$(mktemp -d "/tmp/cluster shares.XXXXXX")
trap 'rm -rf "$folder"' EXIT
fail() { printf 'shares: %s\n' "$*" >&2; exit 1; }
cd "$folder"

mkdir bin
# The program notes each call, and ends as the file STATUS-VERB says.
cat >"bin/clip host" <<'SH'
#!/usr/bin/env bash
printf '[%s]' "$@" >>calls
printf '\n' >>calls
[ -d "${OUT:?}" ] || { echo "no $OUT" >>calls; exit 2; }
if [ -e "status-$1" ]; then exit "$(cat "status-$1")"; fi
SH
printf '#!/bin/sh\necho "$@" >>requeued\nexit 1\n' >bin/scontrol
# parallel: each line of its input in the place of {}, one after the other.
cat >bin/parallel <<'SH'
#!/usr/bin/env bash
while [ "$1" != "$CLIPHOST" ]; do shift; done
failed=0
while read -r line; do "${@//\{\}/$line}" || failed=1; done
exit $failed
SH
chmod +x bin/*
export PATH=$folder/bin:$PATH CLIPHOST="$folder/bin/clip host" OUT="$folder/out here"

# expect_calls LINE ...: nothing else was called.
expect_calls() {
  printf '%s\n' "$@" | diff - calls || fail "other calls"
  rm calls
}
expect_status() { # expect_status STATUS COMMAND ...
  local status=0
  "${@:2}" >said 2>&1 || status=$?
  [ $status = "$1" ] || fail "status $status instead of $1: ${*:2}: $(cat said)"
}
task() { # task NUMBER ARGUMENT ...
  SLURM_ARRAY_TASK_ID=$1 SLURM_JOB_ID=77 SLURM_CPUS_PER_TASK=2 SLURMD_NODENAME=n bash "$cluster/describe.sbatch" \
    "${@:2}"
}

movies="$folder/my movies"
share="[$movies][--recursive][--shard]"
limit='[--limit-seconds][3600]'
expect_status 0 task 2 3 "$movies" "$OUT" --extensions 'mov,m p4' -- --map '/a b=M:'
expect_calls \
  "[describe]${share}[2/3][--jobs][2][--extensions][mov,m p4]${limit}[--out-dir][$OUT/2][--skip-done][--quiet][--map][/a b=M:]" \
  "[catalog]${share}[2/3][--jobs][2][--extensions][mov,m p4]${limit}[--update][-o][$OUT/2.sqlite]"
grep -qx 'start 1 of share 2/3 on n' said || fail "the task begins otherwise: $(cat said)"
expect_status 0 task 3 3 "$movies" "$OUT" --limit-memory 500
expect_calls \
  "[describe]${share}[3/3][--jobs][2][--limit-memory][500][--out-dir][$OUT/3][--skip-done][--quiet]" \
  "[catalog]${share}[3/3][--jobs][2][--limit-memory][500][--update][-o][$OUT/3.sqlite]"

# Calls without a share.
expect_status 0 task 4 3 "$movies" "$OUT"
for call in "task 0 3 m o" "task 1 x m o" "task 1 0 m o" "task 1 3 m" "bash $cluster/describe.sbatch 3 m o"; do
  # shellcheck disable=SC2086
  expect_status 2 $call
  grep -q '^usage: sbatch --array=1-SHARES' said || fail "no usage: $(cat said)"
done
[ ! -e calls ] || fail "called without a share"

# The worst status counts; what was killed is tried again, and what Slurm ends is not.
ends() { # ends STATUS DESCRIBED CATALOGUED REQUEUED [START]
  echo "$2" >status-describe
  echo "$3" >status-catalog
  rm -f requeued
  SLURM_RESTART_COUNT=$((${5:-1} - 1)) expect_status "$1" task 1 1 m "$OUT"
  local requeued=no
  [ ! -e requeued ] || requeued=$(cat requeued)
  [ "$requeued" = "$4" ] || fail "ended by $2 and $3: requeued: $requeued"
  rm calls
}
ends 1 1 0 no
ends 2 1 2 no
ends 2 2 1 no
ends 137 137 0 'requeue 77'
ends 139 1 139 'requeue 77'
ends 137 137 0 'requeue 77' 4
ends 137 137 0 no 5
ends 143 143 0 no
ends 130 0 130 no
rm status-*

# The same by parallel, and each share's catalog is merged, whichever others are there.
touch "$OUT/9.sqlite"
expect_status 0 bash "$cluster/describe_ssh.sh" hosts 2 'my movies' 'out here' --extensions mov -- --quiet
expect_calls \
  "[describe]${share}[1/2][--jobs][1][--extensions][mov]${limit}[--out-dir][$OUT/1][--skip-done][--quiet][--quiet]" \
  "[describe]${share}[2/2][--jobs][1][--extensions][mov]${limit}[--out-dir][$OUT/2][--skip-done][--quiet][--quiet]" \
  "[catalog]${share}[1/2][--jobs][1][--extensions][mov]${limit}[--update][-o][$OUT/1.sqlite]" \
  "[catalog]${share}[2/2][--jobs][1][--extensions][mov]${limit}[--update][-o][$OUT/2.sqlite]" \
  "[catalog][--merge][$OUT/1.sqlite][$OUT/2.sqlite][-o][$OUT/all.sqlite]"
for verb in describe catalog; do
  echo 2 >"status-$verb"
  expect_status 1 bash "$cluster/describe_ssh.sh" hosts 2 m "$OUT"
  [ "$(wc -l <calls)" = 5 ] || fail "one failure ends all: $(cat calls)"
  rm calls "status-$verb"
done
expect_status 2 bash "$cluster/describe_ssh.sh" hosts x m "$OUT"
[ ! -e calls ] || fail "called without shares"
