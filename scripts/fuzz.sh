#!/usr/bin/env bash
# Runs every fuzz target of a build for its share of the given minutes.
# fuzz.sh BUILD MINUTES
set -euo pipefail
build=$1
minutes=$2
mapfile -t targets < <(find "$build/fuzz" -maxdepth 1 -type f -executable | sort)
((${#targets[@]})) || { echo "no fuzz targets in $build"; exit 1; }
seconds=$((minutes * 60 / ${#targets[@]}))
((seconds > 5)) || seconds=5
found=0
for target in "${targets[@]}"; do
  name=$(basename "$target")
  folder=fuzz/${name#fuzz_}
  work=$build/corpus/$name
  mkdir -p "$work" "$build/findings"
  echo "$name: $seconds s"
  "$target" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 -print_final_stats=1 \
    -artifact_prefix="$build/findings/$name-" "$work" "$folder/corpus" \
    2>&1 | grep -E 'ERROR|SUMMARY|number_of_executed_units|Test unit written' || true
  if compgen -G "$build/findings/$name-*" >/dev/null; then found=1; fi
done
if ((found)); then
  echo "findings lie in $build/findings; keep each as a small file in the target's corpus"
  exit 1
fi
echo "no findings"
