# Files that take the movie wrapper, and one of each type that the module claims,
# as far as FFmpeg writes them; see list.sh for how they are told.

# --- a file of each type that is claimed, as far as FFmpeg writes them -----------
small() { video 64x48 25 10; }
mpeg4=(-f lavfi -i "$(small)" -f lavfi -i "$(tone mono 0.4)" -c:v mpeg4 -c:a aac)
mpeg=(-f lavfi -i "$(small)" -f lavfi -i "$(tone stereo 0.4)" -c:a mp2)
for type in mov qt moov movie; do
  make "type.$type" -f lavfi -i "$(small)" -f lavfi -i "$(tone stereo 0.4)" -c:v png -c:a pcm_s16le -f mov
done
for type in mp4 m4v 3gp 3g2; do
  make "type.$type" "${mpeg4[@]}"
done
make type.mpg "${mpeg[@]}" -c:v mpeg1video
make type.mpe "${mpeg[@]}" -c:v mpeg1video -f mpeg
make type.mpeg "${mpeg[@]}" -c:v mpeg2video -f mpeg
make type.m2t "${mpeg[@]}" -c:v mpeg2video -bf 2 -f mpegts
make type.avi -f lavfi -i "$(small)" -f lavfi -i "$(tone stereo 0.4)" -c:v mjpeg -c:a pcm_s16le
make type.dv -f lavfi -i "$(video 720x576 25 10)" -f lavfi -i "$(tone stereo 0.4)" -c:v dvvideo -pix_fmt yuv420p \
  -c:a pcm_s16le
for type in mp2:mp2 mp3:mp3 m4a:ipod wav:wav aiff:aiff aif:aiff au:au aac:adts mpa:mp2; do
  make "type.${type%:*}" -f lavfi -i "$(tone stereo 0.4)" -f "${type#*:}"
done
make type.gif -f lavfi -i "$(small)"
for type in jpg jpeg jfif tif tiff png bmp; do
  codec=()
  [ "$type" != jfif ] || codec=(-c:v mjpeg)
  make "type.$type" -f lavfi -i "$(video 64x48 25 1)" "${codec[@]}" -update 1 -f image2
done

# --- movies that the header parser gives up -------------------------------------
make fragmented.mp4 -f lavfi -i "$(small)" -f lavfi -i "$(tone stereo 0.4)" -c:v libx264 -bf 2 \
  -pix_fmt yuv420p -c:a aac -movflags frag_keyframe+empty_moov
