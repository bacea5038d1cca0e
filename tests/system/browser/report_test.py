# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""What tests of reports have in common."""

import unittest

import browser

VIEWS = ("", "#/clip/1", "#/clip/8", "#/odd")
NAMES = "tr.clip a.open"


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
