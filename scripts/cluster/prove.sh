#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# prove.sh BUILD [MOVIES]: describes movies by describe.sbatch on a Slurm of its own, kills a task, has
# another put back and takes a node out of use; then compares all outputs with those of a single run.
set -euo pipefail
here=$(realpath "$(dirname "${BASH_SOURCE[0]}")")
# shellcheck source=scripts/cluster/slurm.sh
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
rm -rf build/cluster
mkdir -p build/cluster/log
ln -s "$PWD/build/cluster" "$short/cluster"
farm=$short/cluster
cd "$farm"

"$here/make_movies.py" "$movies" movies
say "$movies movies are made"
begin
"$build/cliphost" describe "$farm/movies" --recursive --out-dir one --skip-done --jobs 1 --quiet \
  "${pinned[@]}" >log/one
"$build/cliphost" catalog "$farm/movies" --recursive --jobs 1 -o one/all.sqlite >>log/one
say "one process describes and catalogues them in $(since_begin) s"

start_slurm "$farm/slurm" "${nodes[@]}" || fail "Slurm does not start"
export CLIPHOST=$build/cliphost
begin
job=$(sbatch --parsable --array="1-$shares" --output="$farm/log/%a" "$here/describe.sbatch" \
  "$shares" "$farm/movies" "$farm/out" -- "${pinned[@]}")
say "Slurm has ${#nodes[@]} nodes, and $shares tasks to do"

tasks_of_node() { squeue --noheader --states=R --nodelist="$1" --format=%K; }
node_has_task() { [ -n "$(tasks_of_node "$1")" ]; }
states() { squeue --noheader --array --states=all --job="$job" --format=%T; }
done_by() { cat out/"$1"/.cliphost-done/*.jsonl 2>/dev/null | wc -l; }
# at_work VERB: "PROCESS TASK" of each task that is at it.
at_work() { pgrep -a -f "^$CLIPHOST $1 " | sed -nE 's|^([0-9]+) .* --shard ([0-9]+)/.*|\1 \2|p'; }

# A node goes out of use: what runs there ends, and nothing new begins.
drained=${nodes[-1]}
until_true 60 node_has_task "$drained" || fail "no task starts on $drained"
scontrol update "nodename=$drained" state=drain reason=maintenance
last_there=$(tasks_of_node "$drained" | sort -u)
[ "$(states | grep -c PENDING)" != 0 ] || fail "no task is left that $drained could have had; take more movies"
say "$drained is drained while it runs task ${last_there//$'\n'/ }"

# Tasks are interrupted at work, each once.
interrupted=' '
hit() { # hit VERB DONE COMMAND ...: a task at this verb that has described so many; the command gets both numbers
  local process task verb=$1 least=$2
  while read -r process task; do
    if [[ $interrupted != *" $task "* ]] && (($(done_by "$task") >= least)) && "${@:3}" "$process" "$task"; then
      say "task $task $what at $verb, when $(done_by "$task") of its movies were described"
      interrupted+="$task "
      return 0
    fi
  done < <(at_work "$verb")
  return 1
}
kill_process() { what='is killed' && kill -KILL "$1"; }
put_back() { what='is put back' && scontrol requeue "${job}_$2"; }
for hits in 'describe 5 kill_process' 'describe 5 put_back' 'catalog 1 kill_process'; do
  # shellcheck disable=SC2086
  until_true 120 hit $hits || fail "no task could be hit at work ($hits); take more movies"
done

all_ended() { ! states | grep -qvE 'COMPLETED|FAILED|CANCELLED|TIMEOUT|NODE_FAIL'; }
until_true 600 all_ended || fail "the tasks don't end: $(states | sort | uniq -c)"
say "the tasks are through after $(since_begin) s; starts by node: $(sed -n 's/^start .* on //p' log/[0-9]* \
  | sort | uniq -c | awk '{ printf "%s%s %d", sep, $2, $1; sep = ", " }')"
[ "$(states | sort -u)" = COMPLETED ] || fail "not all tasks are well: $(states | sort | uniq -c)"
for task in $interrupted; do
  grep -q '^start 2 ' "log/$task" || fail "task $task was not started again"
done
while read -r task; do
  grep -qx "$task" <<<"$last_there" || fail "task $task was started on $drained after it was drained"
done < <(grep -l " on $drained\$" log/[0-9]* | sed 's|log/||')

merge=$(sbatch --parsable --dependency="afterany:$job" --output="$farm/log/merge" \
  --wrap "'$CLIPHOST' catalog --merge $(seq -s ' ' -f "$farm/out/%g.sqlite" "$shares") -o '$farm/out/all.sqlite'")
job=$merge
until_true 60 all_ended || fail "the catalogs are not merged"
cat log/merge

is_as_single() { # is_as_single OUT SHARES
  "$here/compare.py" one "$1" movies "$2" || fail "the outputs are not those of the single run"
}
is_as_single out "$shares"
read -ra hit_tasks <<<"$interrupted"
say "of the catalog, task ${hit_tasks[-1]} may have done as many again as its next start read:" \
  "$(sed -n 's/^\([0-9]*\) catalogued.*/\1/p' "log/${hit_tasks[-1]}")"

printf '2/:\n' >hosts
say "the same by GNU parallel, 4 shares:"
"$here/describe_ssh.sh" hosts 4 "$farm/movies" "$farm/out-ssh" -- "${pinned[@]}" >log/ssh
is_as_single out-ssh 4

rm -rf movies one out out-ssh  # kept where something was wrong
