#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""check_windows.py FOLDER CLIPHOST MOVIES WORK MODULE

Runs the folder that is made for Windows under Wine where Linux has nothing to compare it with: paths and names as
Windows has them, child processes that a movie breaks, and runs that go on until Ctrl+C. What a stopped run says is
compared with the program of this system. MODULE is a module for Windows that breaks its process.
"""

import fcntl
import os
import pty
import re
import shutil
import signal
import subprocess
import sys
import termios
import time
from pathlib import Path

from systems import Linux, Windows

PATIENCE = 600  # seconds; for what happens at last, so a slow machine changes nothing

# {in} is the folder of a.mov, as a path of Windows, and what the call's folder is.
# Path, exit status, words of the answer.
PATHS = [
    (r"{in}\a.mov", 0, r"{in}\a.mov"),
    (r"{in}\A.MOV", 0, r"{in}\A.MOV"),
    (r"\\?\{in}\a.mov", 0, r"{in}\a.mov"),
    (r"{in}\..\in\.\a.mov", 0, "a.mov"),
    ("{in}/a.mov", 0, "a.mov"),
    ("Z:a.mov", 0, "a.mov"),
    ("Z:{rooted}/a.mov", 0, "a.mov"),
    ("{rooted}/a.mov", 0, "a.mov"),
    ("file:///Z:{rooted}/a.mov", 0, r"{in}\a.mov"),
    (r"\\server\media\a.mov", 0, r"\\server\media\a.mov"),
    (r"\\?\UNC\server\media\a.mov", 0, r"\\server\media\a.mov"),
    ("//server/media/a.mov", 0, "a.mov"),
    ("file://server/media/a.mov", 0, r"\\server\media\a.mov"),
    (r"\\server\none\a.mov", 2, "there is no such file or folder"),
    ("C:a.mov", 2, "there is no such file or folder"),
    # Not for its length.
    (r"{in}\none" + r"\folder of a long path" * 15 + r"\a.mov", 2, "there is no such file or folder, and no folder"),
    (r"Q:\a.mov", 2, r"there is no such file or folder, and no folder Q:\\"),
    ("NUL", 2, "'NUL' is the name of a device"),
    (r"{in}\con.mov", 2, "'con.mov' is the name of a device"),
    (r"{in}\com¹.mov", 2, "'com¹.mov' is the name of a device"),
    (r"\\.\pipe\a.mov", 2, "it names a device"),
    (r"\\?\Volume{{1}}\a.mov", 2, "neither a drive nor a share"),
    (r"{in}\a.mov.", 2, "'a.mov.' ends with a dot"),
    (r"{in}\a.mov ", 2, "'a.mov ' ends with a space"),
    (r"{in}\a.mov:stream", 2, "has : in it"),
    (r"{in}\?.mov", 2, "has ? in it"),
    (r"{in}\*.mov", 2, "has * in it"),
]
# The same of outputs, and the file that is written, from the call's folder on.
OUTPUTS = [
    (r"{in}\con.aaf", 2, "is the name of a device", None),
    (r"{in}\b.aaf.", 2, "ends with a dot", None),
    (r"{in}\b:c.aaf", 2, "has : in it", None),
    (r"\\.\b.aaf", 2, "it names a device", None),
    (r"\\?\{in}\verbatim.aaf", 0, r"{in}\verbatim.aaf", "verbatim.aaf"),
    (r"\\server\media\share.aaf", 0, r"\\server\media\share.aaf", "share.aaf"),
    ("Z:relative.aaf", 0, "relative.aaf", "relative.aaf"),
    (r"{in}\映画 🎬 ü.aaf", 0, "映画 🎬 ü.aaf", "映画 🎬 ü.aaf"),
]


def names_in(folder):
    return sorted(entry.name for entry in folder.iterdir() if entry.name != ".cliphost-done")


def wait_until(holds, patience=PATIENCE):
    """Whether something holds at last."""
    end = time.monotonic() + patience
    while not holds():
        if time.monotonic() > end:
            return False
        time.sleep(0.05)
    return True


class Run:
    """A call that goes on, at a terminal whose Ctrl+C is pressed."""

    def __init__(self, side, call, folder):
        self.told_in = folder / "told"
        self.terminal, slave = pty.openpty()
        with self.told_in.open("wb") as told:
            self.process = subprocess.Popen(
                [*side.program, "--no-config", *call], cwd=folder, env=side.environment, stdin=slave,
                stdout=subprocess.DEVNULL, stderr=told, start_new_session=True,
                preexec_fn=lambda: fcntl.ioctl(0, termios.TIOCSCTTY, 0))
        os.close(slave)

    def told(self):
        return self.told_in.read_bytes().decode("utf-8", "replace")

    def reaches(self, holds):
        """Whether something holds before the call ends."""
        wait_until(lambda: holds() or self.process.poll() is not None)
        return holds()

    def press_ctrl_c(self):
        """The exit status, once the server behind Wine's processes has closed the files of this one."""
        try:
            os.write(self.terminal, b"\x03")
            status = self.process.wait(PATIENCE)
            wait_until(lambda: not any(self.told_in.parent.rglob("*.part")), 30)
            return status
        finally:
            self.process.kill()
            os.close(self.terminal)


class Checks:
    def __init__(self, linux, windows, movies, work):
        self.linux, self.windows = linux, windows
        self.movie = movies / "png.mov"
        self.long_movie = movies / "prores_4444_alpha.mov"
        self.work = work
        self.faults = []
        self.count = 0

    def expect(self, holds, what, *got):
        self.count += 1
        if not holds:
            self.faults.append(f"{what}: {' '.join(str(g) for g in got)}")

    def folder(self, name, *copies):
        """A fresh folder with copies of the movie."""
        folder = self.work / name
        shutil.rmtree(folder, ignore_errors=True)
        folder.mkdir(parents=True)
        for copy in copies:
            (folder / copy).parent.mkdir(exist_ok=True)
            shutil.copy2(self.movie, folder / copy)
        return folder

    def call(self, folder, *call):
        status, out, told = self.windows.run(["--no-config", *call], folder)
        return status, out.decode("utf-8", "replace"), told.decode("utf-8", "replace")

    # --- names ------------------------------------------------------------------------

    def check_paths(self):
        folder = self.folder("paths/in", "a.mov")
        share = self.windows.prefix / "dosdevices" / "unc" / "server" / "media"
        share.parent.mkdir(parents=True, exist_ok=True)
        share.unlink(missing_ok=True)
        share.symlink_to(folder)
        words = {"in": self.windows.path(folder), "rooted": str(folder)}
        for path, status, answer in PATHS:
            path, answer = path.format(**words), answer.format(**words)
            got, out, told = self.call(folder, "describe", "-q", path)
            self.expect(got == status and answer.replace(r"\\", "\\") in (out + told).replace(r"\\", "\\"),
                        f"describe {path}", got, out, told)
        far = self.folder("far/" + "/".join(["folder of a long path"] * 12), "a.mov")
        got, out, told = self.call(folder, "describe", self.windows.path(far))
        self.expect(got == 2 and "the folder can't be listed: its path has " in told, "a folder too far to list", got,
                    out, told)
        got, out, told = self.call(folder, "describe", "-q", self.windows.path(far / "a.mov"))
        self.expect(got == 0, "a movie in a folder too far to list", got, out, told)
        for path, status, answer, written in OUTPUTS:
            path, answer = path.format(**words), answer.format(**words)
            before = names_in(folder)
            got, out, told = self.call(folder, "describe", "-q", "a.mov", "--aaf", path)
            self.expect(got == status and answer in out + told, f"describe --aaf {path}", got, out, told)
            after = sorted(before + ([written] if written else []))
            self.expect(names_in(folder) == after, f"describe --aaf {path} writes", names_in(folder))
        got, out, told = self.call(folder, "describe", "--json", r"\\server\media\a.mov")
        self.expect("file://server/media/a.mov" in out, "a locator on a share", got, out[-500:], told)

    def check_names_that_differ_in_case(self):
        folder = self.folder("case", "one/Clip ü.mov", "two/CLIP Ü.mov", "two/clip-2.mov")
        wanted = ["CLIP Ü-2.aaf", "Clip ü.aaf", "clip-2.aaf"]
        for more in [], ["--jobs", "2"], ["--skip-done"], ["--skip-done"]:
            if "--skip-done" not in more:
                shutil.rmtree(folder / "out", ignore_errors=True)
            got, out, told = self.call(folder, "describe", "-q", "one", "two", "--out-dir", "out", *more)
            self.expect(got == 0 and names_in(folder / "out") == wanted,
                        f"outputs whose names differ in case {more}", got, names_in(folder / "out"), told)
        # The record of one movie keeps its output from another.
        shutil.rmtree(folder / "out")
        for movies in "one", "two":
            self.call(folder, "describe", "-q", movies, "--out-dir", "out", "--skip-done")
        self.expect(names_in(folder / "out") == wanted, "outputs of two runs", names_in(folder / "out"))
        got, _, told = self.call(folder, "describe", "one", "--bin", "b.aaf", "--columns-out", "B.AAF")
        self.expect(got == 2 and names_in(folder) == ["one", "out", "two"], "two outputs in one place", got, told)

    # --- processes ----------------------------------------------------------------------

    def check_children(self, module):
        """A movie that breaks its process is lost alone."""
        place = self.windows.folder_of_program / "tests"
        shutil.rmtree(place, ignore_errors=True)
        place.mkdir()
        shutil.copy2(module, place)
        module = self.windows.home + "\\tests\\" + module.name
        folder = self.folder("children", *(f"in/{name}.mov" for name in ["a", "crash", "hang", "leave", "z"]))
        got, out, told = self.call(folder, "--plugin", module, "describe", "in", "--out-dir", "out", "--jobs", "2",
                                 "--limit-seconds", "20")
        for words in ("crash.mov: the process that read it was ended by signal 11",
                      "hang.mov: took longer than 20 seconds",
                      "leave.mov: the process that read it ended with status 4", "2 described, 3 not"):
            self.expect(words in out + told, f"a broken child: {words}", out[-200:], told)
        self.expect(got == 1 and names_in(folder / "out") == ["a.aaf", "z.aaf"], "outputs beside broken children",
                    got, names_in(folder / "out"))

    def check_stop(self, call, ending):
        """Ctrl+C between the movies of a run."""
        movies = [f"in/{number:03}.mov" for number in range(400)]
        told = []
        for side, status in (self.linux, -signal.SIGINT), (self.windows, 0x3A):
            name = f"stop of {call[0]}, {type(side).__name__}"
            folder = self.folder(name, *movies)
            run = Run(side, [*call, "in", "--out-dir", "out"], folder)
            out = folder / "out"
            begun = run.reaches(lambda: out.is_dir() and any(name.endswith(ending) for name in names_in(out)))
            got = run.press_ctrl_c()
            names = names_in(out) if begun else []
            self.expect(got == status, f"{name}: exit status", got, run.told())
            self.expect(names and all(name.endswith(ending) for name in names), f"{name}: left", names)
            self.expect(f": {len(names)} of 400 movies done" in run.told(), f"{name}: {len(names)} outputs", run.told())
            told.append(re.sub(r"\d+", "N", run.told()))
        self.expect(told[0] == told[1], f"what a stopped {call[0]} says", *told)

    def check_stop_of_a_file(self):
        """Ctrl+C while one file is written: nothing of it stays."""
        folder = self.folder("file")
        run = Run(self.windows, ["frame", self.windows.path(self.long_movie), "--range", "0:", "-o", "a.raw"], folder)
        run.reaches(lambda: any("part" in name for name in names_in(folder)))
        got = run.press_ctrl_c()
        left = [name for name in names_in(folder) if name != "told"]
        # It may have been faster.
        self.expect((got, left) in [(0x3A, []), (0, ["a.raw"])], "a stopped file", got, left, run.told())

    def check_watch(self):
        """A watch sees a movie that arrives, and one that is moved in, and ends by Ctrl+C."""
        folder = self.folder("watch", "in/first.mov", "third.mov")
        run = Run(self.windows, ["describe", "-q", "--watch", "in", "--rest", "1", "--skip-done", "--out-dir", "out"],
                  folder)
        made = [run.reaches((folder / "out/first.aaf").exists)]
        (folder / "in/sub").mkdir()
        shutil.copy2(self.movie, folder / "in/second.mov")
        made.append(run.reaches((folder / "out/second.aaf").exists))
        (folder / "third.mov").rename(folder / "in/third.mov")
        made.append(run.reaches((folder / "out/third.aaf").exists))
        got = run.press_ctrl_c()
        self.expect(all(made), "movies that a watch sees", made, run.told())
        self.expect(got == 0x3A and "the watch ends by signal 2: 3 described, 0 not, 0 done already" in run.told(),
                    "the end of a watch", got, run.told())
        self.expect(names_in(folder / "out") == ["first.aaf", "second.aaf", "third.aaf"], "outputs of a watch",
                    names_in(folder / "out"))


def main(laid_out, program, movies, work, module):
    work = Path(work).resolve()
    work.mkdir(parents=True, exist_ok=True)
    windows = Windows(Path(laid_out).resolve(), work)
    checks = Checks(Linux(Path(program).resolve(), work), windows, Path(movies).resolve(), work / "alone")
    try:
        checks.check_paths()
        checks.check_names_that_differ_in_case()
        checks.check_children(Path(module).resolve())
        checks.check_stop(["describe", "-q", "--jobs", "2"], ".aaf")
        checks.check_stop(["contact", "--frames", "1", "--jobs", "1"], ".png")
        checks.check_stop_of_a_file()
        checks.check_watch()
    finally:
        windows.stop()
    for fault in checks.faults:
        print(fault)
    print(f"{checks.count} checks of Windows alone under Wine, {len(checks.faults)} failed")
    return 1 if checks.faults else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
