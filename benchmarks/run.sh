#!/usr/bin/env bash
# Runs every benchmark program of a build: run.sh BUILD [FILTER]
# FILTER is part of a program's name. Each prints its peers beside it.
set -euo pipefail
build=$1
filter=${2:-}
grep -m1 'model name' /proc/cpuinfo || true
uname -sr
c++ --version | head -n 1
for program in "$build"/benchmarks/bench_*"$filter"*; do
  [ -x "$program" ] || continue
  echo
  echo "== $(basename "$program")"
  "$program" --benchmark_min_time=0.2
done
