#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# prove.sh BUILD [MOVIES]: describes movies by describe.sbatch on a Slurm of its own, kills a task, has
# another put back and takes a node out of use; then compares all outputs with those of a single run.
set -euo pipefail
here=$(realpath "$(dirname "${BASH_SOURCE[0]}")")
# shellcheck source=scripts/farm/slurm.sh
. "$here/slurm.sh"
build=$(realpath "$1") movies=${2:-2000}
shares=16 nodes=(farm1 farm2 farm3 farm4)
pinned=(--pin-time 2026-01-31T12:00:00Z)
fail() { printf 'farm: %s\n' "$*" >&2; exit 1; }
say() { printf '%s\n' "$*"; }
begin() { begun=$(date +%s%N); }
since_begin() { awk -v a="$begun" -v b="$(date +%s%N)" 'BEGIN { printf "%.1f", (b - a) / 1e9 }'; }

# Slurm takes no blanks in paths, and a socket's path may not be long.
short=$(mktemp -d /tmp/cliphost-farm.XXXXXX)
chmod 711 "$short"
stop() {
  stop_slurm || true
  rm -rf "$short"
}
trap stop EXIT
trap 'exit 129' HUP
trap 'exit 130' INT
trap 'exit 143' TERM
rm -rf build/farm
mkdir -p build/farm/log
ln -s "$PWD/build/farm" "$short/farm"
farm=$short/farm
cd "$farm"

"$here/make_movies.py" "$movies" movies
say "$movies movies are made"
begin
"$build/cliphost" describe "$farm/movies" --recursive --out-dir one --skip-done --jobs 1 --quiet \
  "${pinned[@]}" >log/one
say "one process describes them in $(since_begin) s"

start_slurm "$farm/slurm" "${nodes[@]}" || fail "Slurm does not start"
export CLIPHOST=$build/cliphost
begin
job=$(sbatch --parsable --array="1-$shares" --output="$farm/log/%a" "$here/describe.sbatch" \
  "$shares" "$farm/movies" "$farm/out" "${pinned[@]}")
say "Slurm has ${#nodes[@]} nodes, and $shares tasks to do"

tasks_of_node() { squeue --noheader --states=R --nodelist="$1" --format=%K; }
node_has_task() { [ -n "$(tasks_of_node "$1")" ]; }
states() { squeue --noheader --array --states=all --job="$job" --format=%T; }
done_by() { cat out/"$1"/.cliphost-done/*.jsonl 2>/dev/null | wc -l; }
# The process of a task, once it has described some movies.
process_at_work() {
  (($(done_by "$1") >= 5)) && pgrep -f "^$CLIPHOST describe .* --shard $1/$shares "
}

# A node goes out of use: what runs there ends, and nothing new begins.
drained=${nodes[-1]}
until_true 60 node_has_task "$drained" || fail "no task starts on $drained"
scontrol update "nodename=$drained" state=drain reason=maintenance
last_there=$(tasks_of_node "$drained" | sort -u)
[ "$(states | grep -c PENDING)" != 0 ] || fail "no task is left that $drained could have had; take more movies"
say "$drained is drained while it runs task ${last_there//$'\n'/ }"

# Of two tasks that are at work, one is killed, and one put back by Slurm.
killed='' put_back=''
interrupt() {
  local task process
  for task in $(squeue --noheader --states=R --format=%K); do
    [ "$task" != "$killed" ] || continue
    process=$(process_at_work "$task") || continue
    if [ -z "$killed" ]; then
      kill -KILL "$process" || continue
      killed=$task
      say "task $task is killed when $(done_by "$task") of its movies are done"
    else
      scontrol requeue "${job}_$task" || continue
      put_back=$task
      say "task $task is put back when $(done_by "$task") of its movies are done"
      return 0
    fi
  done
  return 1
}
until_true 120 interrupt || fail "no two tasks could be interrupted at work; take more movies"

all_ended() { ! states | grep -qvE 'COMPLETED|FAILED|CANCELLED|TIMEOUT|NODE_FAIL'; }
until_true 600 all_ended || fail "the tasks don't end: $(states | sort | uniq -c)"
say "the tasks are through after $(since_begin) s; starts by node: $(sed -n 's/^start .* on //p' log/[0-9]* \
  | sort | uniq -c | awk '{ printf "%s%s %d", sep, $2, $1; sep = ", " }')"
[ "$(states | sort -u)" = COMPLETED ] || fail "not all tasks are well: $(states | sort | uniq -c)"
for task in "$killed" "$put_back"; do
  grep -q '^start 2 ' "log/$task" || fail "task $task was not started again"
done
while read -r task; do
  grep -qx "$task" <<<"$last_there" || fail "task $task was started on $drained after it was drained"
done < <(grep -l " on $drained\$" log/[0-9]* | sed 's|log/||')

"$here/compare.py" one out movies "$shares" || fail "the outputs are not those of the single run"

printf '2/:\n' >hosts
"$here/describe_ssh.sh" hosts 4 "$farm/movies" "$farm/out-ssh" "${pinned[@]}" >log/ssh
say "GNU parallel, 4 shares:"
"$here/compare.py" one out-ssh movies 4 || fail "the outputs are not those of the single run"
