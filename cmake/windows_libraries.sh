#!/usr/bin/env bash
# Builds for 64-bit Windows what the program links, out of the sources of Debian's packages, and prints the
# folder where it lies. A machine does that once: the folder's name tells the recipe, the compiler, and the
# versions that Linux has. Of apt it has lists of its own, so the machine's stay as they are. Exit status: 3, no
# list of packages can be fetched, as without a network; 1, anything else.
set -Eeuo pipefail

release=bookworm
host=x86_64-w64-mingw32
here=$(realpath "$(dirname "${BASH_SOURCE[0]}")")
toolchain=$here/mingw-w64.cmake
# Source packages, the longest first; and packages of this machine with headers alone.
sources=(ffmpeg sqlite3 googletest libwebp libpng1.6 expat fmtlib pugixml libcsv)
headers=(libcli11-dev nlohmann-json3-dev libtomlplusplus-dev)
# Packages whose version says that there is another to be built.
known=(libavcodec-dev libdav1d6 libsqlite3-dev libwebp-dev libpng-dev libexpat1-dev libfmt-dev
       libpugixml-dev libcsv-dev libz-mingw-w64-dev g++-mingw-w64-x86-64-posix "${headers[@]}")

# What movies hold, and the kinds of files that hold them. Probing of other kinds could find them in
# what is damaged, so the kinds that Linux knows and this list lacks are refused here.
demuxers=aac,ac3,aiff,amr,apng,asf,au,avi,caf,dirac,dnxhd,dts,dv,eac3,flac,flv,gif,gxf,h261,h263,h264,hevc
demuxers+=,image2,'image_*_pipe',ivf,loas,m4v,matroska,mjpeg,mlp,mov,mp3,'mpeg*',mxf,obu,ogg,qcp
demuxers+=,truehd,tty,vc1,voc,w64,wav,yuv4mpegpipe
decoders=aasc,aic,amv,apng,'asv*',avrn,avrp,avui,ayuv,bmp,cfhd,cinepak,cljr,cscd,cyuv,dirac,dnxhd,dpx,dvvideo
decoders+=,dxv,eightbps,exr,ffv1,ffvhuff,flashsv,flv,fraps,gif,h261,'h263*',h264,hap,hevc,hq_hqa,hqx,huffyuv
decoders+=,hymt,'indeo*',jpeg2000,jpegls,lagarith,magicyuv,'mjpeg*','mpeg*video',mpeg4,'msmpeg4*',msrle,msvideo1
decoders+=,notchlc,pam,pbm,pcx,pgm,pixlet,png,ppm,prores,psd,qdraw,qtrle,r10k,r210,rawvideo,rpza,sgi,sheervideo
decoders+=,smc,snow,speedhq,svq1,svq3,targa,targa_y216,theora,tiff,tscc,utvideo,'v[234][0-9][0-9x]*',vc1,vp3
decoders+=,vp5,'vp6*',vp8,vp9,webp,'wmv*',y41p,yuv4,zlib,zmbv
decoders+=,aac,aac_latm,ac3,'adpcm_*',alac,amrnb,amrwb,dca,dss_sp,dvaudio,eac3,evrc,flac,g723_1,gsm,gsm_ms,ilbc
decoders+=,'mace*',mlp,'mp[123]','mp[123]float',nellymoser,opus,'pcm_*',qcelp,'qdm*',s302m,speex,truehd,vorbis
decoders+=,'wma*',ansi,libdav1d

# Its tables of sound decoders are calculated here, so that decoded sound is Linux's: Windows' sines differ in
# the last bit.
build_ffmpeg() {
  "$1/configure" --prefix="$prefix" --enable-cross-compile --target-os=mingw32 --arch=x86_64 \
    --cross-prefix=$host- --cc=$host-gcc-posix --pkg-config=pkg-config --extra-cflags=-I"$stage/include" \
    --extra-ldflags=-L"$stage/lib" --enable-shared --disable-static --disable-autodetect --disable-everything \
    --disable-programs --disable-doc --disable-avdevice --disable-avfilter --disable-network --disable-debug \
    --enable-hardcoded-tables --enable-w32threads --enable-zlib --enable-libdav1d --enable-parsers \
    --enable-demuxer="$demuxers" --enable-decoder="$decoders"
  make -j"$(nproc)"
  make install DESTDIR="$root"
}

build_dav1d() {
  printf '%s\n' '[binaries]' "c = '$host-gcc-posix'" "ar = '$host-ar'" "strip = '$host-strip'" \
    "windres = '$host-windres'" '[host_machine]' "system = 'windows'" "cpu_family = 'x86_64'" \
    "cpu = 'x86_64'" "endian = 'little'" >cross
  meson setup . "$1" --cross-file=cross --prefix="$prefix" --libdir=lib --default-library=static \
    --buildtype=release -Denable_tools=false -Denable_tests=false
  DESTDIR=$root ninja -j"$(nproc)" install
}

build_sqlite3() {
  "$1/configure" --disable-tcl
  make sqlite3.c
  $host-gcc-posix -O2 -DSQLITE_THREADSAFE=1 -DSQLITE_ENABLE_FTS5 -DSQLITE_OMIT_LOAD_EXTENSION -c sqlite3.c
  archive sqlite3 sqlite3.o
  cp sqlite3.h "$stage/include/"
}

build_libcsv() {
  $host-gcc-posix -O2 -c "$1/libcsv.c"
  archive csv libcsv.o
  cp "$1/csv.h" "$stage/include/"
}

build_expat() {
  # Debian's corrections ask for its number; CMake's header gives it none.
  sed -i 's/^#cmakedefine XML_DTD$/& 1/' "$1/expat/expat_config.h.cmake"
  with_cmake "$1/expat" -DEXPAT_BUILD_{TOOLS,EXAMPLES,TESTS,DOCS}=OFF -DEXPAT_SHARED_LIBS=OFF
}
build_fmtlib() { with_cmake "$1" -DFMT_TEST=OFF -DFMT_DOC=OFF; }
build_googletest() { with_cmake "$1"; }
build_libpng1_6() { with_cmake "$1" -DPNG_SHARED=OFF -DPNG_TESTS=OFF; }
build_libwebp() {
  with_cmake "$1" -DWEBP_BUILD_{ANIM_UTILS,CWEBP,DWEBP,GIF2WEBP,IMG2WEBP,VWEBP,WEBPINFO,WEBPMUX,EXTRAS}=OFF
}
build_pugixml() { with_cmake "$1"; }

with_cmake() { # with_cmake SOURCE [OPTION ...]
  cmake -S "$1" -B . -G Ninja --toolchain "$toolchain" -DCMAKE_BUILD_TYPE=Release \
    -DCMAKE_INSTALL_PREFIX="$prefix" -DCMAKE_FIND_ROOT_PATH="$stage" -DBUILD_SHARED_LIBS=OFF "${@:2}"
  DESTDIR=$root ninja -j1 install
}
archive() { # archive NAME OBJECT
  $host-ar rcs "$stage/lib/lib$1.a" "$2"
}

build() { # build NAME: one library, into the stage
  mkdir "$work/build/$1"
  cd "$work/build/$1"
  local source
  source=$(printf '%s\n' "$work/source/$1"-[0-9]*/)
  install -D -m 644 "$source/debian/copyright" "$stage/licences/$1"
  # 255: xargs begins no other.
  trap "tail -n 40 '$PWD/log' >&3; exit 255" ERR
  "build_${1//./_}" "${source%/}" 3>&2 >log 2>&1
}

fetch() { # apt's own lists, keys and cache, and what they name
  mkdir -p "$work/apt/lists" "$work/source"
  local archive="[signed-by=/usr/share/keyrings/debian-archive-keyring.gpg] http://deb.debian.org"
  printf 'deb-src %s/%s %s main\n' "$archive" debian $release "$archive" debian $release-updates \
    "$archive" debian-security $release-security >"$work/apt/sources.list"
  local options=(-qq -o Dir::State="$work/apt" -o Dir::State::status=/dev/null -o Dir::Cache="$work/apt"
                 -o Dir::Etc::sourcelist="$work/apt/sources.list" -o Dir::Etc::sourceparts=-
                 -o Dir::Etc::preferencesparts=- -o APT::Sandbox::User= -o Acquire::Retries=3)
  cd "$work/source"
  apt-get "${options[@]}" update >log 2>&1 || true # what lacks then is told below
  if ! compgen -G "$work/apt/lists/*Sources*" >/dev/null; then
    tail -n 20 log >&2
    printf 'windows_libraries: no list of packages can be fetched from http://deb.debian.org\n' >&2
    exit 3
  fi
  local source
  for source in dav1d "${sources[@]}"; do # the release's own, where a mirror has no security updates
    apt-get "${options[@]}" --only-source source "$source" >>log 2>&1 \
      || apt-get "${options[@]}" --only-source source "$source/$release" >>log 2>&1 \
      || { tail -n 20 log >&2
           printf 'windows_libraries: Debian %s has no source package %s at http://deb.debian.org that can be fetched\n' \
             $release "$source" >&2
           exit 1; }
  done
}

take_headers() { # what this machine has already: the compression library, and libraries of headers alone
  mkdir -p "$stage/include" "$stage/lib" "$stage/licences" "$stage/share/cmake" "$work/build"
  cp /usr/$host/include/{zlib,zconf}.h "$stage/include/"
  cp /usr/$host/lib/libz.a "$stage/lib/"
  cp -r /usr/include/{CLI,nlohmann,toml++} "$stage/include/"
  cp -r /usr/share/cmake/{CLI11,nlohmann_json} "$stage/share/cmake/"
  local package
  for package in libz-mingw-w64-dev "${headers[@]}"; do
    cp "/usr/share/doc/$package/copyright" "$stage/licences/$package"
  done
}

if [ "${1:-}" = --build ]; then # by this script alone, with its environment
  for name in "${@:2}"; do build "$name"; done
  exit
fi

cache=${XDG_CACHE_HOME:-$HOME/.cache}/cliphost
recipe=$({ cat "${BASH_SOURCE[0]}" "$toolchain"
           dpkg-query -W -f='${Package} ${Version}\n' "${known[@]}"; } | sha256sum | cut -c 1-16)
export prefix=$cache/windows-$recipe
mkdir -p "$cache"
exec 9>"$cache/windows.lock"
flock 9 # of two runs at once the second finds what the first has built
if [ ! -d "$prefix" ]; then
  rm -rf "$cache/windows.unfinished"
  export work=$cache/windows.unfinished
  export root=$work/root stage=$work/root$prefix
  export PKG_CONFIG_LIBDIR=$stage/lib/pkgconfig PKG_CONFIG_SYSROOT_DIR=$root
  (fetch)
  take_headers
  { echo dav1d ffmpeg; printf '%s\n' "${sources[@]:1}"; } \
    | xargs -P "$(nproc)" -L 1 "$here/windows_libraries.sh" --build >&2
  (cd "$work/source" && printf '%s\n' *.dsc) >"$stage/licences/sources"
  mv "$stage" "$prefix"
  rm -rf "$work"
fi
printf '%s\n' "$prefix"
