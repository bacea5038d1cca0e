# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""Calls of the program whose answers show all that its schemas tell of."""

import struct
import subprocess
from typing import NamedTuple


class Sample(NamedTuple):
    verb: str
    form: str  # empty for a call that others need
    arguments: str  # without spaces within one
    status: int = 0

    @property
    def call(self):
        return [self.verb, *self.form.split(), *self.arguments.split()]


# In this order: a call reads what those before it wrote.
SAMPLES = [
    Sample(*row)
    for row in (
        ("scan", "--json", "in"),
        ("scan", "--json", "odd", 2),
        ("scan", "--json", "empty", 1),
        ("scan", "--json", "absent", 2),
        ("describe", "--json", "in"),
        ("describe", "--json", "bad fragmented.mp4 --jobs 2", 1),
        ("describe", "--json", "in --quiet --bin bin.aaf"),
        ("describe", "--json", "away --bin mapped.aaf --map away=/nowhere/media"),
        ("describe", "--json", "in --out-dir out --skip-done"),
        ("describe", "--json", "in --out-dir out --skip-done"),
        ("describe", "--json", "bad/text.mov --bin none.aaf", 1),
        ("describe", "--json", "absent.mov", 2),
        ("describe", "--json", "--files-from absent", 2),
        ("describe", "--jsonl", "in fragmented.mp4 absent.mov --out-dir out", 2),
        ("describe", "--jsonl", "in --out-dir out --skip-done --jobs 2"),
        ("describe", "--jsonl", "bad --bin absent/bin.aaf", 2),
        ("describe", "--json", "in --against bin.aaf"),
        ("describe", "--json", "away --against bin.aaf", 1),
        ("describe", "--json", "bad/text.mov --against bin.aaf", 1),
        ("samples", "--json", "in/h264_with_aac.mov"),
        ("samples", "--json", "in/pcm_u8.mov --every"),
        ("samples", "--json", "bad/cut.mov", 1),
        ("samples", "--json", "bad/no_table.mov"),
        ("samples", "--json", "bad/no_utf8_\udcff.mov"),
        ("samples", "--json", "fragmented.mp4"),
        ("samples", "--json", "in/pcm_u8.mov --track 7", 2),
        ("formats", "--json", "in/h264_with_aac.mov"),
        ("formats", "--json", "in/png_alpha.mov --use-alpha"),
        ("formats", "--json", "bad/two_pictures.mov"),
        ("formats", "--json", "bad/no_table.mov"),
        ("formats", "--json", "bad/no_decoder.mov", 1),
        ("formats", "--json", "fragmented.mp4"),
        ("params", "--json", "in/h264_with_aac.mov"),
        ("params", "--json", "fragmented.mp4"),
        ("params", "--json", "bad/text.mov", 1),
        ("dump", "--json", "bin.aaf"),
        ("dump", "--json", "bad/no_aaf.aaf", 1),
        ("compare", "--json", "bin.aaf bin.aaf"),
        ("compare", "--json", "bin.aaf mapped.aaf", 1),
        ("compare", "--json", "bin.aaf bad/no_aaf.aaf", 1),
        ("verify", "--json", "bin.aaf"),
        ("verify", "--json", "mapped.aaf bad/no_aaf.aaf", 1),
        ("verify", "--json", "mapped.aaf --search away", 1),
        ("verify", "--json", "mapped.aaf --search absent", 2),
        ("relink", "--json", "mapped.aaf --search away -o linked.aaf"),
        ("relink", "--json", "mapped.aaf --search empty -o linked.aaf", 1),
        ("relink", "--json", "bad/no_aaf.aaf --search away -o linked.aaf", 1),
        ("contact", "--jsonl", "in bad absent.mov --out-dir sheets --frames 3 --width 16 --exact", 2),
        ("contact", "--jsonl", "in --out-dir sheets --frames 3 --width 16 --skip-done", 1),
        ("contact", "--jsonl", "in --out-dir sheets --frames 3 --width 16 --skip-done --jobs 2", 1),
        ("contact", "--jsonl", "in/pcm_u8.mov -o -", 2),
        ("catalog", "--jsonl", "in bad absent.mov -o lines.sqlite", 2),
        ("catalog", "--jsonl", "in bad -o lines.sqlite --update --jobs 2", 1),
        ("catalog", "--jsonl", "in -o absent/lines.sqlite", 2),
        ("catalog", "", "in bad --output clips.sqlite", 1),
        ("find", "--json", "clips.sqlite"),
        ("find", "--json", "clips.sqlite width:>100000", 1),
        ("find", "--json", "bad/no_aaf.aaf", 2),
        ("report", "--json", "in bad fragmented.mp4 clips.sqlite parts --map in=/nowhere/media", 1),
        ("report", "--json", "absent.mov --jobs 1", 2),
        ("report", "--json", "--files-from absent", 2),
        ("types", "--json", ""),
        ("types", "--json", "--plugin absent", 2),
        ("validate", "--json", "bad/no_aaf.aaf", 1),
        ("validate", "--json", "--list"),
        ("validate", "--json", "absent.nvx", 2),
        ("plugin", "--json", ""),
        ("plugin", "--json", "--plugin absent", 2),
        ("check-data", "--json", ""),
        ("check-data", "--json", "data", 1),
        ("check-data", "--json", "empty", 2),
        ("check-data", "--json", "absent", 2),
    )
]


def make_files(movies, types, work):
    """What the calls read: a folder of movies, and bad ones."""

    def bytes_of(name, folder=movies):
        return (folder / name).read_bytes()

    def write(name, data):
        (work / name).parent.mkdir(parents=True, exist_ok=True)
        (work / name).write_bytes(data)

    for name in ("h264_with_aac.mov", "pcm_u8.mov", "png_alpha.mov", "timecode_25.mov"):
        write("in/" + name, bytes_of(name))
    write("in/copy.mov", bytes_of("pcm_u8.mov"))
    write("bad/cut.mov", bytes_of("h264_header_first.mov")[:-4000])
    write("bad/text.mov", b"no movie at all\n" * 100)
    write("bad/large.mov", with_size(bytes_of("png.mov"), b"png ", 30000))
    write("bad/no_decoder.mov", bytes_of("png.mov").replace(b"png ", b"xyz1"))
    write("bad/no_table.mov", bytes_of("png.mov").replace(b"stco", b"xxxx"))
    write("bad/no_aaf.aaf", b"no AAF file\n" * 100)
    write("bad/no_utf8_\udcff.mov", bytes_of("pcm_u8.mov"))
    inputs = ["-i", movies / "png.mov", "-i", movies / "pcm_u8.mov"]
    tracks = "-map 0:v -map 0:v -map 1:a -c copy".split()
    subprocess.run(["ffmpeg", "-nostdin", "-v", "error", *inputs, *tracks, work / "bad/two_pictures.mov"], check=True)
    write("fragmented.mp4", bytes_of("fragmented.mp4", types))
    write("odd/other.mp4", bytes_of("h264_mp4_header_last.mp4"))
    write("odd/back\\slash.mov", bytes_of("pcm_u8.mov"))
    (work / "odd/folder.mov").mkdir()
    (work / "empty").mkdir()
    write("away/pcm.mov", bytes_of("pcm_u8.mov"))
    write("data/FourCharMapper.xml", b"<Map><FourCharMapping FourChar='abc'/></Map>")
    write("data/AAFInfo.xml", b"<Infos")
    write("parts/colors.mov", bytes_of("h264_rec709.mov"))
    (work / "parts").mkdir(exist_ok=True)
    sources = "-f lavfi -i testsrc2=size=160x90:rate=25 -f lavfi -i sine -t 4 -c:v mjpeg -c:a pcm_s16le".split()
    for name, options in (("apart", []), ("first", ["-movflags", "+faststart"])):
        subprocess.run(["ffmpeg", "-nostdin", "-v", "error", *sources, *options, work / f"parts/{name}.mov"], check=True)
    movie = (work / "parts/apart.mov").read_bytes()
    write("parts/apart.mov", with_sound_behind(movie))
    movie = (work / "parts/first.mov").read_bytes()
    write("parts/first.mov", movie[: len(movie) * 2 // 3])


def with_sound_behind(movie):
    """The movie with a copy of all its bytes behind it, in which its second track has its samples."""
    at = movie.rindex(b"stco") + 8
    count = struct.unpack(">I", movie[at : at + 4])[0]
    places = struct.unpack(f">{count}I", movie[at + 4 : at + 4 + 4 * count])
    moved = struct.pack(f">{count}I", *(place + len(movie) for place in places))
    copy = struct.pack(">I4s", len(movie), b"free") + movie[8:]
    return movie[: at + 4] + moved + movie[at + 4 + 4 * count :] + copy


def with_size(movie, code, pixels):
    """The movie with another width and height in its first sample description of a code."""
    at = movie.index(code) + 28
    return movie[:at] + struct.pack(">HH", pixels, pixels) + movie[at + 4 :]
