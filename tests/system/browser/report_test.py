# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""What tests of reports have in common."""

import sys
import tempfile
import unittest
from pathlib import Path

import browser
import pages

VIEWS = ("", "#/clip/1", "#/clip/8", "#/odd")
NAMES = "tr.clip a.open"


def run(reason, program, movies, make_more=lambda folder: None):
    """Runs the tests of the calling program over the report of these movies, and of what it makes in the folder; an
    exit status. `reason`: why they can't run."""
    if reason:
        print(f"skipped: {reason}")
        return browser.SKIPPED
    with tempfile.TemporaryDirectory() as folder:
        folder = Path(folder)
        pages.make_movies(Path(movies), folder / "movies")
        ReportTest.report = pages.write(program, folder / "movies", folder / "report.html")
        make_more(folder)
        result = unittest.main(argv=sys.argv[:1], exit=False, verbosity=2).result
    return 0 if result.wasSuccessful() else 1


class ReportTest(unittest.TestCase):
    """A browser, and the reports that a program opens in it, as members of this class."""

    @classmethod
    def setUpClass(cls):
        cls.page = browser.start()
        cls.addClassCleanup(cls.page.quit)

    def open(self, *arguments, **named):
        self.page.open(self.report, *arguments, **named)

    def names(self):
        return self.page.texts(NAMES)
