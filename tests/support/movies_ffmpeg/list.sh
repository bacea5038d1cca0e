# The movies of the system tests; scripts/make_test_movies.sh reads this.
# make NAME FFMPEG-ARGUMENTS, with pictures and tones from video and tone.
# All are short: what counts is what their headers say.

ntsc=30000/1001

# --- ProRes: six profiles, nine rasters ---------------------------------------
for profile in proxy lt standard hq 4444 4444xq; do
  format=yuv422p10le
  case $profile in 4444*) format=yuv444p10le ;; esac
  for raster in 480i:720x480:$ntsc:bff 480p:720x480:$ntsc:prog \
                486i:720x486:$ntsc:bff 486p:720x486:$ntsc:prog \
                576i:720x576:25:tff 576p:720x576:25:prog \
                720p:1280x720:50:prog \
                1080i:1920x1080:25:tff 1080p:1920x1080:24:prog; do
    IFS=: read -r name size rate order <<<"$raster"
    woven=()
    [ "$order" = prog ] || woven=(-flags:v +ildct+ilme)
    make "prores_${profile}_$name.mov" -f lavfi -i "$(video "$size" "$rate" 2)" \
      -vf "format=$format,setfield=$order" "${woven[@]}" -c:v prores_ks -profile:v "$profile" \
      -quant_mat proxy -bits_per_mb 200
  done
done
make prores_odd_raster.mov -f lavfi -i "$(video 320x240 25 2)" -c:v prores_ks -profile:v standard
make prores_vendor_apl0.mov -f lavfi -i "$(video 1920x1080 25 2)" -c:v prores_ks -profile:v hq -vendor apl0
make prores_4444_alpha.mov -f lavfi -i "$(video 1280x720 25 2)" \
  -vf 'format=yuva444p10le,geq=lum=p(X\,Y):cb=p(X\,Y):cr=p(X\,Y):a=X/2' -c:v prores_ks -profile:v 4444

# --- other codecs whose files a host may read itself ---------------------------
make dv_ntsc.mov -f lavfi -i "$(video 720x480 $ntsc 2)" -c:v dvvideo -pix_fmt yuv411p
make dv_pal.mov -f lavfi -i "$(video 720x576 25 2)" -c:v dvvideo -pix_fmt yuv420p
make dvcpro_pal.mov -f lavfi -i "$(video 720x576 25 2)" -c:v dvvideo -pix_fmt yuv411p
make dvcpro50_ntsc.mov -f lavfi -i "$(video 720x480 $ntsc 2)" -c:v dvvideo -pix_fmt yuv422p
make dvcpro50_pal.mov -f lavfi -i "$(video 720x576 25 2)" -c:v dvvideo -pix_fmt yuv422p
make dvcprohd_1080i50.mov -f lavfi -i "$(video 1440x1080 25 2)" -c:v dvvideo -pix_fmt yuv422p -flags:v +ildct
make dvcprohd_1080i60.mov -f lavfi -i "$(video 1280x1080 $ntsc 2)" -c:v dvvideo -pix_fmt yuv422p -flags:v +ildct
make dvcprohd_720p60.mov -f lavfi -i "$(video 960x720 60000/1001 2)" -c:v dvvideo -pix_fmt yuv422p
make v210.mov -f lavfi -i "$(video 1920x1080 25 2)" -c:v v210
make v210_720.mov -f lavfi -i "$(video 1280x720 50 2)" -c:v v210
make 2vuy.mov -f lavfi -i "$(video 1280x720 25 2)" -c:v rawvideo -pix_fmt uyvy422 -tag:v 2vuy
make 2vuy_ntsc.mov -f lavfi -i "$(video 720x486 $ntsc 2)" -c:v rawvideo -pix_fmt uyvy422 -tag:v 2vuy
mpeg2=(-c:v mpeg2video -b:v 5M -strict unofficial)
imx=(-c:v mpeg2video -pix_fmt yuv422p -g 1 -intra_vlc 1 -flags:v +ildct+low_delay -b:v 30M -top 1
     -strict unofficial)
make imx50_pal.mov -f lavfi -i "$(video 720x608 25 2)" -vf setfield=tff "${imx[@]}" -tag:v mx5p
make imx50_ntsc.mov -f lavfi -i "$(video 720x512 $ntsc 2)" -vf setfield=tff "${imx[@]}" -tag:v mx5n
make xdcam_hd422_1080i50.mov -f lavfi -i "$(video 1920x1080 25 2)" -vf setfield=tff \
  "${mpeg2[@]}" -pix_fmt yuv422p -flags:v +ildct+ilme -tag:v xd5c
make xdcam_hd422_720p50.mov -f lavfi -i "$(video 1280x720 50 2)" "${mpeg2[@]}" -pix_fmt yuv422p -tag:v xd5a
make xdcam_ex_1080i50.mov -f lavfi -i "$(video 1920x1080 25 2)" -vf setfield=tff \
  "${mpeg2[@]}" -flags:v +ildct+ilme -tag:v xdvc
make xdcam_ex_1080p25.mov -f lavfi -i "$(video 1920x1080 25 2)" "${mpeg2[@]}" -tag:v xdve
make hdv_1080i50.mov -f lavfi -i "$(video 1440x1080 25 2)" -vf setfield=tff \
  "${mpeg2[@]}" -flags:v +ildct+ilme -tag:v hdv3
intra=(-c:v libx264 -preset ultrafast -g 1 -bf 0 -qp 30 -strict unofficial)
make avc_intra100_1080p25.mov -f lavfi -i "$(video 1920x1080 25 2)" "${intra[@]}" \
  -pix_fmt yuv422p10le -profile:v high422 -tag:v ai12
make avc_intra50_720p50.mov -f lavfi -i "$(video 960x720 50 2)" "${intra[@]}" \
  -pix_fmt yuv420p10le -profile:v high10 -tag:v ai5q

# --- codecs that take the sample provider --------------------------------------
h264=(-c:v libx264 -preset ultrafast -qp 30)
make h264_bframes.mov -f lavfi -i "$(video 640x360 25 10)" -c:v libx264 -preset veryfast -bf 2 -qp 30 -pix_fmt yuv420p
make h264_mp4_header_last.mp4 -f lavfi -i "$(video 640x360 25 5)" "${h264[@]}" -pix_fmt yuv420p
make h264_header_first.mov -f lavfi -i "$(video 640x360 25 5)" "${h264[@]}" -pix_fmt yuv420p -movflags +faststart
make h264_rec709.mov -f lavfi -i "$(video 1280x720 25 5)" "${h264[@]}" -pix_fmt yuv420p \
  -color_primaries bt709 -color_trc bt709 -colorspace bt709 -movflags +write_colr
make h264_aspect.mov -f lavfi -i "$(video 720x576 25 5)" -vf setsar=64/45 "${h264[@]}" -pix_fmt yuv420p
make h264_23976.mov -f lavfi -i "$(video 320x180 24000/1001 6)" "${h264[@]}" -pix_fmt yuv420p
make h264_50.mov -f lavfi -i "$(video 320x180 50 6)" "${h264[@]}" -pix_fmt yuv420p
make h264_5994.mov -f lavfi -i "$(video 320x180 60000/1001 6)" "${h264[@]}" -pix_fmt yuv420p
make mjpeg.mov -f lavfi -i "$(video 640x480 24 4)" -c:v mjpeg -pix_fmt yuvj420p
make png_alpha.mov -f lavfi -i "$(video 320x240 25 3)" -c:v png -pix_fmt rgba
make png.mov -f lavfi -i "$(video 320x240 25 3)" -c:v png -pix_fmt rgb24
make animation_alpha.mov -f lavfi -i "$(video 320x240 25 3)" -c:v qtrle -pix_fmt argb
make animation.mov -f lavfi -i "$(video 320x240 25 3)" -c:v qtrle -pix_fmt rgb24
make mpeg2.mov -f lavfi -i "$(video 720x576 25 5)" -c:v mpeg2video -b:v 5M
make mpeg4.mov -f lavfi -i "$(video 352x288 25 5)" -c:v mpeg4 -b:v 1M
make raw_rgb.mov -f lavfi -i "$(video 64x48 25 3)" -c:v rawvideo -pix_fmt rgb24
make one_picture.mov -f lavfi -i "$(video 400x300 25 1)" -c:v png -pix_fmt rgb24

# --- sound ---------------------------------------------------------------------
for kind in s16le s16be s24le s24be s32le s32be f32le f32be f64le f64be u8 s8 alaw mulaw; do
  make "pcm_$kind.mov" -f lavfi -i "$(tone stereo 0.4)" -c:a "pcm_$kind"
done
make pcm_44100.mov -f lavfi -i "$(tone stereo 0.4 44100)" -c:a pcm_s16le
make pcm_96000_mono.mov -f lavfi -i "$(tone mono 0.4 96000)" -c:a pcm_s24le
make aac.mov -f lavfi -i "$(tone stereo 0.4)" -c:a aac
make aac.m4a -f lavfi -i "$(tone mono 0.4 44100)" -c:a aac
make alac.mov -f lavfi -i "$(tone stereo 0.4)" -c:a alac
make ima4.mov -f lavfi -i "$(tone mono 0.4)" -c:a adpcm_ima_qt
make three_sounds.mov -f lavfi -i "$(video 320x240 25 10)" -f lavfi -i "$(tone mono 0.4)" \
  -f lavfi -i "$(tone stereo 0.4)" -f lavfi -i "$(tone 5.1 0.4)" -map 0 -map 1 -map 2 -map 3 \
  -c:v mjpeg -c:a pcm_s16le
make prores_with_pcm.mov -f lavfi -i "$(video 1920x1080 25 5)" -f lavfi -i "$(tone stereo 0.2)" \
  -c:v prores_ks -profile:v hq -c:a pcm_s24le -timecode 10:00:00:00
make h264_with_aac.mov -f lavfi -i "$(video 640x360 25 10)" -f lavfi -i "$(tone stereo 0.4)" \
  "${h264[@]}" -pix_fmt yuv420p -c:a aac

# --- timecode ------------------------------------------------------------------
clock=(-c:v mjpeg -pix_fmt yuvj420p)
make timecode_24.mov -f lavfi -i "$(video 320x240 24 4)" "${clock[@]}" -timecode 01:02:03:04
make timecode_25.mov -f lavfi -i "$(video 320x240 25 4)" "${clock[@]}" -timecode 10:00:00:00
make timecode_2997_drop.mov -f lavfi -i "$(video 320x240 $ntsc 4)" "${clock[@]}" -timecode '01:00:00;00'
make timecode_2997_nondrop.mov -f lavfi -i "$(video 320x240 $ntsc 4)" "${clock[@]}" -timecode 01:00:00:00

# --- display matrix: only a copied track takes one ------------------------------
finish_jobs
make rotated_90.mov -i "$folder/timecode_25.mov" -map 0:v -c copy -metadata:s:v rotate=90
make rotated_180.mov -i "$folder/timecode_25.mov" -map 0:v -c copy -metadata:s:v rotate=180
make rotated_270.mov -i "$folder/timecode_25.mov" -map 0:v -c copy -metadata:s:v rotate=270
