#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""compare_systems.py FOLDER CLIPHOST MOVIES TYPES WORK [MEDIA]

Runs the folder that is made for Windows under Wine, and the program of this system beside it: the same calls
on the same movies. What they print, their exit status and every file that they write have to be equal. MEDIA
is a folder of further movies.
"""

import concurrent.futures
import os
import re
import shutil
import sys
from pathlib import Path

from systems import Linux, Windows

PINNED = ["--pin-time", "2026-01-31T12:00:00Z"]
# What two runs, or two systems, have not in common.
PASSING = [
    (re.compile(r'("made": ?)"[^"]*"'), r"\1"),  # when a report was made
    (re.compile(r"\b(libcom-api\.so|AAFCOAPI\.dll)"), "AAF LIBRARY"),
]


def plain(text, side):
    """A text of a side with this system's names of the files that it names, and of the program's own folder."""
    text = text.decode("utf-8", "replace").replace(side.home, "HOME")
    text = re.sub(r"/?\bZ:(?=[/\\])", "", text)
    text = re.sub(r"\\\\|\\", "/", text)
    for pattern, instead in PASSING:
        text = pattern.sub(instead, text)
    return text


# Equal failures would be no difference.
HAS_TO_SUCCEED = {"version", "plugin", "types", "check_data", "validate"}


def first_difference(one, other):
    for mine, yours in zip(one.splitlines() + [""], other.splitlines() + [""]):
        if mine != yours:
            at = next((i for i, (a, b) in enumerate(zip(mine, yours)) if a != b), 0)
            start = max(0, at - 60)
            return f"\n  Linux:   {mine[start:at + 200]}\n  Windows: {yours[start:at + 200]}"
    return "\n  one ends before the other"


def files_of(folder):
    return {str(file.relative_to(folder)): file for file in folder.rglob("*") if file.is_file()}


class Comparison:
    def __init__(self, linux, windows, places):
        self.sides = linux, windows
        self.places = places
        self.faults = []
        self.calls = self.files = 0
        self.kinds = set()

    def call(self, name, call):
        """Runs a call on both sides, each in its own folder of that name."""
        self.calls += 1
        answers, folders = [], []
        for side in self.sides:
            folder = side.folder / name
            shutil.rmtree(folder, ignore_errors=True)
            folder.mkdir(parents=True)
            given = [self.fill(side, argument) for argument in call]
            answers.append(side.run(["--no-config", *given], folder))
            folders.append(files_of(folder))
        self.compare(name, call, *answers)
        self.compare_files(name, *folders)
        return answers[0]

    def fill(self, side, argument):
        argument = argument.replace("{module}", side.home + "/plugins/QuickTimePlugin.nvx")
        return re.sub(r"\{(\w+)\}((?:/[^{}=]*)?)",
                      lambda m: side.path(str(self.places[m[1]]) + m[2]), argument)

    def compare(self, name, call, linux, windows):
        if name in HAS_TO_SUCCEED and linux[0] != 0:
            self.faults.append(f"{name}: exit status {linux[0]} on Linux: {linux[2][-500:]!r}")
        if linux[0] != windows[0]:
            self.faults.append(f"{name}: exit status {linux[0]} on Linux, {windows[0]} on Windows: "
                               f"{windows[2][-500:]!r}")
            return
        if call[-2:] == ["-o", "-"]:
            if linux[1] != windows[1]:
                self.faults.append(f"{name}: other bytes: {len(linux[1])} on Linux, {len(windows[1])} on Windows")
            linux, windows = (0, b"", linux[2]), (0, b"", windows[2])
        for what, *texts in zip(["output", "messages"], linux[1:], windows[1:]):
            texts = [plain(text, side) for text, side in zip(texts, self.sides)]
            if texts[0] != texts[1]:
                self.faults.append(f"{name}: other {what}:" + first_difference(*texts))

    def compare_files(self, name, linux, windows):
        for file in sorted(linux.keys() ^ windows.keys()):
            self.faults.append(f"{name}: {file} is written by one system alone")
        for file in sorted(linux.keys() & windows.keys()):
            self.files += 1
            self.kinds.add(Path(file).suffix)
            mine, yours = linux[file].read_bytes(), windows[file].read_bytes()
            if file.endswith((".html", ".csv")):
                mine, yours = (plain(text, side) for text, side in zip((mine, yours), self.sides))
            if mine != yours:
                count = sum(a != b for a, b in zip(mine, yours)) + abs(len(mine) - len(yours))
                self.faults.append(f"{name}: {file} differs at {count} of {len(mine)} places")


def folder_calls(place):
    """The calls on a whole folder of movies."""
    every = ["{" + place + "}", "--extensions", ENDINGS]
    server = "{work}=//server/media"
    yield "scan", ["scan", "{" + place + "}"]
    yield "describe", ["describe", *every, "--use-alpha", "--json", "--out-dir", "aaf", "--map", server, *PINNED]
    yield "bin", ["describe", *every, "-q", "--jobs", "2", "--bin", "bin.aaf", "--stringout", "--map", server,
                  "--columns-out", "columns.csv", *PINNED]
    yield "contact", ["contact", *every, "--out-dir", "sheets", "--frames", "4", "--jsonl"]


ENDINGS = "mov,mp4,m4v,mpg,mpe,mpeg,m2t,3gp,3g2,qt,moov,movie,avi,txt,mp2,mp3,m4a,wav,aiff,aif,au,aac,mid,mpa," \
          "gif,jpg,jpeg,jfif,tif,tiff,png,bmp,psd,dv,mxf"


def movie_calls(place, movie):
    """The calls on one movie: its samples, its parameters, a piece of its pictures, all its sound."""
    name, path = f"{place}/{movie.name}", "{" + place + "}/" + movie.name
    yield f"{name}/samples", ["samples", path, "--json"]
    yield f"{name}/params", ["params", path, "--use-alpha", "--json"]
    yield f"{name}/frames", ["frame", path, "--range", "0:4", "--format", "deepest", "-o", "frames"]
    yield f"{name}/raw", ["frame", path, "--range", "0:4", "-o", "-"]
    yield f"{name}/audio", ["audio", path, "-o", "sound.wav"]


def calls_of_all(places):
    """Each list of calls needs what those before it wrote."""
    movies = [place for place in places if place != "work"]
    yield [("version", ["--version"]), ("plugin", ["plugin"]), ("types", ["types"]),
           ("wrong_call", ["describe", "--no-such-option"]), ("no_such_file", ["describe", "{work}/none.mov"]),
           ("check_data", ["check-data"]), ("validate", ["validate", "{module}", "--seed", "7"])]
    yield [(f"{place}_{name}", call) for place in movies for name, call in folder_calls(place)]
    for place in movies:
        bin_file = f"../{place}_bin/bin.aaf"
        yield [(f"{place}_dump", ["dump", bin_file, "--json"]),
               (f"{place}_verify", ["verify", bin_file, "--json", "--map", "{work}=//server/media"])]
    for place in movies:
        for movie in sorted(places[place].iterdir()):
            if movie.is_file() and not movie.name.startswith("."):
                yield list(movie_calls(place, movie))


# Scripts, emoji, letters of two parts, and what shells and URLs take for something else.
NAMES = ["映画 🎬 ü.mov", "ملف.mov", "сцена №1.mov", "u\u0308 of two parts.mov", "it's 100% #1 & 50%41 +^;=.mov"]


def make_named_movies(movie, work):
    """Folders of a movie's copies: under such names, and at the end of a path of more than 260 characters."""
    names = work / "names"
    far = work / "far"
    while len(str(far)) < 190:
        far /= "folder of a long path"
    for folder, copies in ((names, NAMES), (far, ["far away" + " and on" * 14 + ".mov"])):
        shutil.rmtree(folder, ignore_errors=True)
        folder.mkdir(parents=True)
        for name in copies:
            shutil.copy2(movie, folder / name)
    return {"names": names, "far": far}


def main(laid_out, program, movies, types, work, media=None):
    work = Path(work).resolve()
    work.mkdir(parents=True, exist_ok=True)
    places = {"work": work}
    for name, folder in (("movies", movies), ("types", types), ("media", media)):
        if folder:
            places[name] = work / name
            if places[name].is_symlink():
                places[name].unlink()
            places[name].symlink_to(Path(folder).resolve())
    places.update(make_named_movies(places["movies"] / "h264_with_aac.mov", work))
    windows = Windows(Path(laid_out).resolve(), work)
    comparison = Comparison(Linux(Path(program).resolve(), work), windows, places)
    try:
        with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
            for calls in calls_of_all(places):
                list(pool.map(lambda call: comparison.call(*call), calls))
    finally:
        windows.stop()
    for kind in sorted({".aaf", ".png", ".wav"} - comparison.kinds):
        comparison.faults.append(f"no {kind} file was compared")
    for fault in sorted(comparison.faults):
        print(fault)
    print(f"{comparison.calls} calls under Wine and on Linux, {comparison.files} files written by both, "
          f"{len(comparison.faults)} differences")
    return 1 if comparison.faults else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
