# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""The program of this system, and the folder for Windows under Wine."""

import os
import shutil
import subprocess


class Linux:
    """The program of this system."""

    def __init__(self, program, work):
        self.program = [str(program)]
        self.home = str(program.parent)
        self.folder = work / "linux"
        self.environment = dict(os.environ, XDG_CONFIG_HOME="/none", LC_ALL="C.UTF-8")

    def path(self, path):
        return str(path)

    def run(self, call, folder, seconds=600):
        done = subprocess.run([*self.program, *call], cwd=folder, env=self.environment, timeout=seconds,
                              stdin=subprocess.DEVNULL, capture_output=True)
        return done.returncode, done.stdout, done.stderr


class Windows(Linux):
    """The folder for Windows, copied to where it was not made, under Wine."""

    def __init__(self, laid_out, work):
        self.prefix = prefix = work / "wine"
        self.environment = dict(os.environ, WINEPREFIX=str(prefix), WINEDEBUG="-all", WINEARCH="win64",
                                WINEDLLOVERRIDES="mscoree,mshtml,winemenubuilder.exe=", LC_ALL="C.UTF-8")
        self.environment.pop("DISPLAY", None)
        self.wine = shutil.which("wine64") or "/usr/lib/wine/wine64"
        home = prefix / "drive_c" / "médiâ tools"
        if not home.parent.is_dir():
            self.program = [self.wine, "wineboot"]
            self.run(["--init"], work)
        shutil.rmtree(home, ignore_errors=True)
        shutil.copytree(laid_out, home)
        self.folder_of_program = home
        self.home = r"C:\médiâ tools"
        self.program = [self.wine, self.home + r"\cliphost.exe"]
        self.folder = work / "windows"
        # While a program runs, Wine's services stay; they would start and stop for each call, and some break at it.
        # They keep the outputs of the call that starts them, so that is this one, which has spoken before others come.
        self.waiting = subprocess.Popen([self.wine, r"C:\windows\system32\cmd.exe"], env=self.environment,
                                        stdin=subprocess.PIPE, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL)
        self.waiting.stdout.read(1)

    def path(self, path):
        return "Z:" + str(path).replace("/", "\\")

    def stop(self):
        server = shutil.which("wineserver") or "/usr/lib/wine/wineserver64"
        subprocess.run([server, "-k"], env=self.environment, check=False)
        self.waiting.kill()
        self.waiting.wait()
