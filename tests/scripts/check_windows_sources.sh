#!/usr/bin/env bash
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
#
# check_windows_sources.sh SCRIPT: what the build of the libraries for Windows answers when their sources can't be
# fetched: 3 without any list of packages, as without a network; 1 when the lists are there.
set -euo pipefail
script=$1
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT

# No apt that reaches anything: an update finds what $LISTS names, and no source comes.
mkdir "$folder/bin"
cat >"$folder/bin/apt-get" <<'TEXT'
#!/bin/bash
for option; do
  [[ $option != Dir::State=* ]] || state=${option#*=}
done
case " $* " in
  *' update '*) for list in $LISTS; do : >"$state/lists/$list"; done ;;
  *) echo "E: $* failed"; exit 100 ;;
esac
TEXT
printf '#!/bin/sh\necho any 1\n' >"$folder/bin/dpkg-query"
chmod +x "$folder/bin"/*

# answers STATUS WORDS LISTS
answers() {
  local status=0
  LISTS=$3 XDG_CACHE_HOME=$folder/cache PATH=$folder/bin:$PATH "$script" >"$folder/out" 2>"$folder/told" || status=$?
  if [ "$status" != "$1" ] || ! grep -q "$2" "$folder/told" || [ -s "$folder/out" ]; then
    printf 'windows_sources: exit status %s with the lists "%s", not %s with "%s"\n' "$status" "$3" "$1" "$2"
    cat "$folder/out" "$folder/told"
    exit 1
  fi
}
answers 3 'no list of packages can be fetched' ''
answers 3 'no list of packages can be fetched' 'lock'
answers 1 'no source package dav1d' 'deb.debian.org_debian_dists_bookworm_main_source_Sources.lz4'
