#!/usr/bin/env bash
# Makes the movies that the system tests describe:
# make_test_movies.sh FOLDER [LIST]
#
# The movies are those of tests/support/movies_ffmpeg/list.sh, or of another list
# there. One that is there already is kept, so a second run costs nothing; a
# changed list makes all anew.
# The same FFmpeg gives the same bytes: one thread, no encoder's names, fixed
# dates.
set -euo pipefail
folder=$1
list=$(dirname "${BASH_SOURCE[0]}")/../tests/support/movies_ffmpeg/${2:-list}.sh
mkdir -p "$folder"

fail() { printf 'make_test_movies: %s\n' "$*" >&2; exit 1; }
command -v ffmpeg >/dev/null || fail 'ffmpeg is needed; install the package ffmpeg'

# Two runs at once: the second finds what the first has made.
exec 9>"$folder/.lock"
flock 9

stamp=$(cat "$list" "${BASH_SOURCE[0]}" | sha256sum)
if [ "$(cat "$folder/.made" 2>/dev/null)" != "$stamp" ]; then
  rm -f "$folder"/*.* "$folder/.made"
fi

# A picture of moving patterns: video SIZE RATE FRAMES
video() { printf 'testsrc2=size=%s:rate=%s,trim=end_frame=%s' "$1" "$2" "$3"; }
# A tone: tone LAYOUT SECONDS [RATE]
tone() {
  printf 'sine=frequency=440:sample_rate=%s:duration=%s,aformat=channel_layouts=%s' \
    "${3:-48000}" "$2" "$1"
}

make_one() { # make_one NAME FFMPEG-ARGUMENT ...
  local target=$folder/$1 fresh=$folder/.new.$1
  shift
  ffmpeg -nostdin -y -loglevel error -threads 1 -filter_threads 1 "$@" -threads 1 \
    -fflags +bitexact -flags:v +bitexact -flags:a +bitexact \
    -metadata creation_time=2026-01-31T12:00:00Z "$fresh"
  touch -d 2026-01-31T12:00:00Z "$fresh"
  mv "$fresh" "$target"
}

jobs=0
make() { # the same, some at a time, unless the movie is there
  [ ! -s "$folder/$1" ] || return 0
  if ((jobs >= $(nproc))); then
    wait -n || fail "a movie could not be made"
    jobs=$((jobs - 1))
  fi
  make_one "$@" &
  jobs=$((jobs + 1))
}

finish_jobs() { # waits until every movie so far is there
  while ((jobs > 0)); do
    wait -n || fail "a movie could not be made"
    jobs=$((jobs - 1))
  done
}

# shellcheck source=tests/support/movies_ffmpeg/list.sh
source "$list"
finish_jobs
printf '%s\n' "$stamp" >"$folder/.made"
