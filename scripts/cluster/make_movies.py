#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""make_movies.py COUNT FOLDER

Makes movies of a few kilobytes, each with a date and so a content of its own, in four folders that use
the same names.
"""

import struct
import subprocess
import sys
from pathlib import Path

FOLDERS = 4
FIRST_DATE = 3_000_000_000  # seconds from 1904
SOURCE = "testsrc2=size=160x90:rate=25:duration=0.2"
TONE = "sine=frequency=440:sample_rate=48000:duration=0.2"


def made_by_ffmpeg(file, codec):
    call = ["ffmpeg", "-nostdin", "-v", "error", "-y", "-f", "lavfi", "-i", SOURCE, "-f", "lavfi", "-i", TONE]
    subprocess.run([*call, "-c:v", codec, "-c:a", "pcm_s16le", "-t", "0.2", file], check=True)
    return bytearray(file.read_bytes())


def main(count, folder):
    folder.mkdir(parents=True)
    scratch = folder / "made.mov"
    kinds = [made_by_ffmpeg(scratch, codec) for codec in ("mjpeg", "prores_ks", "mpeg4")]
    scratch.unlink()
    for part in range(FOLDERS):
        (folder / f"reel {part + 1}").mkdir()
    for number in range(count):
        movie = kinds[number % len(kinds)]
        date = movie.index(b"mvhd") + 8
        movie[date : date + 4] = struct.pack(">I", FIRST_DATE + number)
        name = f"clip {number // FOLDERS + 1:05}.mov"
        (folder / f"reel {number % FOLDERS + 1}" / name).write_bytes(movie)


if __name__ == "__main__":
    main(int(sys.argv[1]), Path(sys.argv[2]))
