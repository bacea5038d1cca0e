#!/usr/bin/env bash
# Runs every benchmark program of a build: run.sh BUILD [--against BUILD] [FILTER]
# FILTER is part of a program's name. Each prints its peers beside it, measured in the same run;
# what they have to reach comes as one table in the end. With another build, both run each program
# in turn, and a second table tells the change.
set -euo pipefail
build=$1
shift
other=
if [ "${1:-}" = --against ]; then
  other=$2
  shift 2
fi
filter=${1:-}
log=$(mktemp -d)
trap 'rm -rf "$log"' EXIT

measure() {  # BUILD NAME PROGRAM: its lines to $log/NAME.out, its times to $log/NAME.csv
  "$1/benchmarks/$3" --benchmark_min_time=0.2 --benchmark_out="$log/$2.csv" \
    --benchmark_out_format=csv | tee "$log/$2.out"
}

{
  date -u '+%Y-%m-%d %H:%M UTC'
  grep -m1 'model name' /proc/cpuinfo || true
  printf '%s cores, load %s\n' "$(nproc)" "$(cut -d' ' -f1 /proc/loadavg)"
  uname -sr
  c++ --version | head -n 1
} | tee "$log/machine"
for program in "$build"/benchmarks/bench_*"$filter"*; do
  [ -x "$program" ] || continue
  name=$(basename "$program")
  printf '\n== %s\n' "$name"
  measure "$build" "$name" "$name"
  if [ -n "$other" ] && [ -x "$other/benchmarks/$name" ]; then
    printf '\n== %s of %s\n' "$name" "$other"
    measure "$other" "other-$name" "$name"
  fi
done

printf '\n'
cat "$log/machine"
printf '\n| Work | Peer | Peer takes | We take | Ratio | Wanted | |\n|---|---|---|---|---|---|---|\n'
for out in "$log"/bench_*.out; do
  [ -e "$out" ] && grep '^| ' "$out" || true
done
[ -n "$other" ] || exit 0
printf '\n| Benchmark | Before | Now | Now / before |\n|---|---|---|---|\n'
for now in "$log"/bench_*.csv; do
  before=$log/other-$(basename "$now")
  [ -e "$before" ] || continue
  # Columns: name, iterations, real time, processor time, unit ...
  awk -F, '$1 ~ /^"/ && NF > 5 {
      name = $1; gsub(/"/, "", name)
      if (FNR == NR) { was[name] = $3; next }
      if (name in was && was[name] > 0 && $3 > 0)
        printf "| %s | %s %s | %s %s | %.2f |\n", name, was[name], $5, $3, $5, $3 / was[name]
    }' "$before" "$now"
done
