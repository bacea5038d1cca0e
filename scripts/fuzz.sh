#!/usr/bin/env bash
# Runs fuzz targets of a build side by side, each for the given minutes.
# fuzz.sh BUILD MINUTES SEEDS TARGET
# SEEDS, a folder of movies, and TARGET, a part of a name, may be empty.
set -euo pipefail
build=$1 minutes=$2 seeds=$3 wanted=$4
logs=$build/logs findings=$build/findings

# What one input may cost. Targets count five seconds of the processor
# themselves, since seconds on the wall are others' too on a busy machine.
most_megabytes=512 most_seconds_on_the_wall=100 largest_input=262144

# The words that a target's inputs are made of; those of movies take seeds.
declare -A dictionary=(
  [essence]=movie [header_parser]=movie [movie_wrapper]=movie [whole_load]=movie
  [attribute_texts]=xml [data_files]=xml [parameter_documents]=xml
  [parameter_model]=xml [sax_parser]=xml [xml_document]=xml
)

mapfile -t targets < <(find "$build/fuzz" -maxdepth 1 -type f -executable -name "fuzz_*$wanted*" | sort)
((${#targets[@]})) || { echo "no fuzz target '$wanted' in $build"; exit 2; }
mkdir -p "$logs" "$findings"

cut=$(mktemp -d)
if [ -n "$seeds" ]; then "$build/cut_seeds" "$seeds" "$cut"; fi

before=$(mktemp)
ls "$findings" >"$before"
running=()
stop() { kill "${running[@]}" 2>/dev/null || true; rm -rf "$before" "$cut"; }
trap stop EXIT
for target in "${targets[@]}"; do
  name=$(basename "$target")
  name=${name#fuzz_}
  words=${dictionary[$name]:-}
  work=$build/corpus/$name
  mkdir -p "$work"
  arguments=(-fork=1 -ignore_crashes=1 -ignore_ooms=1 -ignore_timeouts=1
    -max_total_time=$((minutes * 60)) -timeout=$most_seconds_on_the_wall
    -report_slow_units=$most_seconds_on_the_wall
    -rss_limit_mb=$most_megabytes -malloc_limit_mb=$most_megabytes -max_len=$largest_input
    -artifact_prefix="$findings/$name-")
  [ -z "$words" ] || arguments+=(-dict="fuzz/dictionaries/$words.dict")
  folders=("$work" "fuzz/$name/corpus")
  [ "$words" != movie ] || folders+=("$cut" fuzz/header_parser/corpus)
  "$target" "${arguments[@]}" "${folders[@]}" >"$logs/$name.log" 2>&1 &
  running+=($!)
done
echo "${#targets[@]} targets for $minutes min; logs are in $logs"
for process in "${running[@]}"; do wait "$process" || true; done
running=()

# The last line of a log that counts, such as
# "#5123: cov: 410 ft: 1502 corp: 210 exec/s 90 oom/timeout/crash: 0/0/0 time: 60s".
failed=0
for target in "${targets[@]}"; do
  name=$(basename "$target")
  name=${name#fuzz_}
  last=$(grep -E '^#[0-9]+: cov: ' "$logs/$name.log" | tail -n 1 || true)
  if [ -z "$last" ]; then
    echo "$name: did not run; see $logs/$name.log"
    failed=1
    continue
  fi
  sed -E 's/^#([0-9]+): cov: ([0-9]+) ft: ([0-9]+) corp: ([0-9]+) .*/'"$name"': \1 inputs, \2 places reached, \4 kept/' <<<"$last"
done
mapfile -t new < <(ls "$findings" | grep -vxFf "$before" || true)
for finding in "${new[@]}"; do
  # A job that is stopped at the end leaves an empty input. It counts if it fails again.
  if [[ $finding == *-crash-* && ! -s $findings/$finding ]] && "$build/fuzz/fuzz_${finding%%-*}" "$findings/$finding" 2>/dev/null; then
    rm "$findings/$finding"
    continue
  fi
  echo "found: $findings/$finding"
  failed=1
done
((failed == 0)) && echo "no findings"
exit $failed
