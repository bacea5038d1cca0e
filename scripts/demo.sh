#!/usr/bin/env bash
# The main job on real movies: demo.sh BUILD [PATH ...]
# Without a path a folder of sample movies is made first.
set -euo pipefail
build=$1
shift
cliphost=$build/cliphost
out=demo-output
mkdir -p "$out"

make_movies() { # make_movies FOLDER
  local folder=$1
  mkdir -p "$folder"
  make() { # make NAME FFMPEG-ARGUMENTS...
    local name=$1
    shift
    [ ! -s "$folder/$name" ] || return 0
    # Whole or not at all, also for a run beside this one.
    local fresh=$folder/.$$.$name
    ffmpeg -nostdin -y -loglevel error "$@" -metadata creation_time=2026-01-31T12:00:00Z "$fresh" \
      && mv "$fresh" "$folder/$name"
  }
  # High definition is Rec. 709, and says so.
  local hd='testsrc2=size=1920x1080:rate=25:duration=2,scale=out_color_matrix=bt709:out_range=tv,setparams=colorspace=bt709:color_primaries=bt709:color_trc=bt709'
  local ntsc='testsrc2=size=720x486:rate=30000/1001:duration=2'
  local tone='sine=frequency=440:sample_rate=48000:duration=2'
  make prores_hq_1080p25.mov -f lavfi -i "$hd" -f lavfi -i "$tone" -c:v prores_ks -profile:v hq \
    -vendor apl0 -c:a pcm_s24le -ac 2 -timecode 10:00:00:00
  make prores_422_486i_bottom_first.mov -f lavfi -i "$ntsc" -vf setfield=bff -flags +ildct \
    -c:v prores_ks -profile:v standard -timecode '01:00:00;00'
  make prores_4444_alpha.mov -f lavfi -i "$hd" -vf 'format=yuva444p10le,geq=lum=p(X\,Y):cb=p(X\,Y):cr=p(X\,Y):a=X/2' \
    -t 0.2 -c:v prores_ks -profile:v 4444
  make h264_aac_bframes.mov -f lavfi -i "$hd" -f lavfi -i "$tone" -c:v libx264 -bf 2 -c:a aac -movflags +faststart
  make dv_pal.mov -f lavfi -i 'testsrc2=size=720x576:rate=25:duration=1' -c:v dvvideo -pix_fmt yuv420p -top 0
  make mjpeg_three_sounds.mov -f lavfi -i 'testsrc2=size=640x480:rate=24:duration=2' -f lavfi -i "$tone" \
    -map 0 -map 1 -map 1 -map 1 -c:v mjpeg -c:a pcm_s16le -ac:a:0 1 -ac:a:1 2 -ac:a:2 6
  make v210_10bit.mov -f lavfi -i "$hd" -t 0.2 -c:v v210
  make mpeg2_1080.mov -f lavfi -i "$hd" -c:v mpeg2video -b:v 25M
  make sound_only.mov -f lavfi -i "$tone" -c:a pcm_s24be -ac 2
  make one_picture.mov -f lavfi -i 'testsrc2=size=400x300:rate=25:duration=1' -frames:v 1 -c:v png
  # The header parser gives these up; the movie wrapper opens them.
  make fragmented.mp4 -f lavfi -i "$hd" -f lavfi -i "$tone" -c:v libx264 -bf 2 -c:a aac \
    -movflags frag_keyframe+empty_moov
  make mjpeg_pcm.avi -f lavfi -i 'testsrc2=size=640x480:rate=25:duration=2' -f lavfi -i "$tone" \
    -c:v mjpeg -c:a pcm_s16le
  make tone.wav -f lavfi -i "$tone" -c:a pcm_s24le -ac 2
  make still.png -f lavfi -i 'testsrc2=size=400x300:rate=25:duration=1' -frames:v 1
}

if [ $# -eq 0 ]; then
  echo "making sample movies in $out/movies ..."
  make_movies "$out/movies"
  set -- "$out/movies"
fi

echo
echo '== the module'
"$cliphost" plugin

status=0
for path in "$@"; do
  if [ -d "$path" ]; then
    echo
    echo "== scan $path"
    "$cliphost" scan "$path" || status=$?
  fi
done

# The endings of all kinds of files that the module claims, as find's tests; of
# texts and MIDI files there is nothing to show.
endings=(-false)
while read -r _ ending _; do
  case $ending in
    TXT | MID) ;;
    *) endings+=(-o -iname "*.$ending") ;;
  esac
done < <("$cliphost" types)

movies_of() { # movies_of PATH: the movies that it names
  if [ -d "$1" ]; then
    find "$1" -maxdepth 1 -type f \( "${endings[@]}" \) | sort
  else
    printf '%s\n' "$1"
  fi
}

# A folder goes through the module's list, which names its .mov files; files of
# other kinds are opened one by one.
others=()
for path in "$@"; do
  if [ -d "$path" ]; then
    while read -r file; do others+=("$file"); done \
      < <(movies_of "$path" | grep -iv '\.mov$')
  fi
done

echo
echo '== describe'
"$cliphost" describe "$@" "${others[@]}" --use-alpha --out-dir "$out/aaf" || status=$?

# --- what the movies look and sound like ----------------------------------------
pictures=$out/pictures
sounds=$out/sounds
mkdir -p "$pictures" "$sounds"

kinds_of() { # kinds_of MOVIE: picture, alpha and sound tracks as lines "number kind"
  "$cliphost" formats "$1" --use-alpha 2>/dev/null | sed -n 's/^track \([0-9]*\): \([a-z]*\),.*/\1 \2/p'
}

show() { # show MOVIE: a sheet, the deepest picture there is, its alpha, each sound
  local movie=$1 name number kind
  name=$(basename "$movie")
  while read -r number kind; do
    case $kind in
      picture)
        "$cliphost" contact "$movie" -o "$pictures/${name}_sheet.png" || status=$?
        "$cliphost" frame "$movie" --format deepest -o "$pictures/$name.png" || status=$?
        ;;
      alpha)
        "$cliphost" frame "$movie" --use-alpha --track "$number" --format deepest \
          -o "$pictures/${name}_alpha.png" || status=$?
        ;;
      sound)
        "$cliphost" audio "$movie" --use-alpha --track "$number" \
          -o "$sounds/${name}_$number.wav" || status=$?
        ;;
    esac
  done < <(kinds_of "$movie")
}

echo
echo '== pictures and sound'
for path in "$@"; do
  while read -r movie; do
    show "$movie"
  done < <(movies_of "$path")
done

echo
echo '== report'
"$cliphost" report "$@" "${others[@]}" --use-alpha --title 'Demo movies' -o "$out/report.html" || status=$?

echo
echo "AAF files are in $out/aaf; any program that reads AAF opens them."
echo "Contact sheets, pictures and alpha are in $pictures, the sounds in $sounds."
echo "All of them in a browser: $(realpath "$out/report.html")"
exit $status
