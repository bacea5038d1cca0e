#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""The checks in a browser are skipped, and say why, where something that they need is missing."""

import os
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path
from unittest import mock

sys.dont_write_bytecode = True  # the modules lie in the sources
import browser  # noqa: E402

HERE = Path(__file__).resolve().parent


class Skips(unittest.TestCase):
    def setUp(self):
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.folder = Path(temporary.name)
        (self.folder / "bin").mkdir()

    def have(self, *programs):
        """Programs that are found, and end with a failure when they are run."""
        for program in programs:
            file = self.folder / "bin" / program
            file.write_text("#!/bin/sh\necho no such luck >&2\nexit 1\n")
            file.chmod(0o755)

    def run_check(self, check, *arguments):
        """How a check ends where no other programs are found, and what it prints."""
        done = subprocess.run(["/usr/bin/python3", HERE / check, "no program", "no movies", *arguments],
                              env={**os.environ, "PATH": str(self.folder / "bin")}, capture_output=True,
                              encoding="utf-8")
        self.assertEqual(done.stderr, "")
        return done.returncode, done.stdout

    def test_of_reports_without_each_program(self):
        needed = list(browser.NEEDED)
        for i, program in enumerate(needed):
            told = f"skipped: there is no {program} (Debian's package {browser.NEEDED[program]})\n"
            self.assertEqual(self.run_check("check_report.py"), (77, told))
            self.have(*needed[: i + 1])

    def test_of_reports_without_the_driver_for_python(self):
        with mock.patch.object(browser, "webdriver", None):
            self.assertEqual(browser.why_none(), "Python has no selenium (Debian's python3-selenium)")

    def test_of_reports_where_chromium_starts_for_root_alone(self):
        self.have(*browser.NEEDED)
        with mock.patch.dict(os.environ, PATH=str(self.folder / "bin")):
            with mock.patch.object(os, "geteuid", return_value=1000):
                self.assertRegex(browser.why_none(), "^Chromium does not start for this user: .")
            with mock.patch.object(os, "geteuid", return_value=0):
                self.assertEqual(browser.why_none(), "")

    def test_of_access_without_npm(self):
        told = "skipped: there is no npm (Debian's package npm), which axe-core comes by\n"
        self.assertEqual(self.run_check("check_access.py", self.folder / "work"), (77, told))

    def test_of_access_where_npm_can_not_install_it(self):
        self.have("npm")
        status, told = self.run_check("check_access.py", self.folder / "work")
        self.assertEqual((status, told), (77, "skipped: npm can't install axe-core: no such luck\n"))

    def test_of_access_without_a_browser(self):
        script = self.folder / "work/node_modules/axe-core/axe.min.js"
        script.parent.mkdir(parents=True)
        script.write_text("")
        status, told = self.run_check("check_access.py", self.folder / "work")
        self.assertEqual(status, 77)
        self.assertTrue(told.startswith("skipped: there is no chromium"), told)


if __name__ == "__main__":
    if browser.webdriver is None:
        print(f"skipped: {browser.why_none()}")
        sys.exit(browser.SKIPPED)
    unittest.main(verbosity=2)
