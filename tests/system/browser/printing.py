# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""A report on paper."""

import base64
import re
import subprocess

import pages
from report_test import VIEWS, ReportTest

A4 = {"paperWidth": 8.27, "paperHeight": 11.69}
FOR_SCREENS = ".tools, .steps, .theme, .bar nav, .found button, .told, .arrows"
COLOURS = """
    const style = getComputedStyle(document.documentElement);
    return [style.backgroundColor, style.color].map((one) => one.match(/[0-9.]+/g).map(Number))"""
# Of texts that end beyond an element that cuts them off.
CUT = """
    return [...document.querySelectorAll('main *')].filter((one) => one.checkVisibility() &&
        getComputedStyle(one).overflowX !== 'visible' && !one.matches('.cell, .unseen') && !one.closest('svg') &&
        one.scrollWidth > one.clientWidth + 1).map((one) => one.className + ': ' + one.textContent.slice(0, 80))"""


def bare(text):
    return re.sub(r"\s", "", text)


class Printing(ReportTest):
    def emulate(self, scheme="light"):
        self.page.command("Emulation.setEmulatedMedia", media="print",
                          features=[{"name": "prefers-color-scheme", "value": scheme}])

    def sheets(self):
        """The texts of the sheets of paper."""
        pdf = base64.b64decode(self.page.command("Page.printToPDF", **A4)["data"])
        text = subprocess.run(["pdftotext", "-raw", "-", "-"], input=pdf, capture_output=True, check=True).stdout
        return text.decode("utf-8").split("\f")[:-1]

    def test_leaves_out_what_only_screens_can_do(self):
        for view in VIEWS:
            self.open(view)
            shown = [one for one in self.page.all(FOR_SCREENS) if one.is_displayed()]
            self.assertGreater(len(shown), 1, view)
            self.emulate()
            self.assertEqual([one.text for one in self.page.all(FOR_SCREENS) if one.is_displayed()], [], view)
            self.assertTrue(self.page.one("main").is_displayed(), view)

    def test_is_dark_on_light_whatever_the_theme(self):
        for scheme in ("light", "dark"):
            self.open(scheme=scheme)
            self.emulate(scheme)
            paper, ink = self.page.run(COLOURS)
            self.assertEqual(paper[:3], [255, 255, 255], scheme)
            self.assertLess(max(ink[:3]), 80, scheme)

    def test_has_all_clips_once_on_sheets_one_behind_the_other(self):
        self.page.open(self.many)
        sheets = self.sheets()
        self.assertGreater(len(sheets), 10)
        found = re.findall(r"clip (\d{5})", "".join(sheets))
        self.assertEqual([int(number) for number in found], list(range(1000)))
        self.assertEqual(len(self.page.texts("tr.clip")) < 60, True)  # afterwards

    def test_has_the_marks_and_timecodes_of_clips(self):
        self.open()
        self.emulate()
        marks, starts = ([one for one in self.page.all(f"tr.clip {cell}") if one.is_displayed()]
                         for cell in (".warnings", ".start"))
        self.assertEqual((len(marks), len(starts)), (self.count, self.count))
        text = bare("".join(self.sheets()))
        self.assertIn("Notdescribed", text)
        told = [one for one in self.page.texts("tr.clip .start") if one]
        self.assertGreater(len(told), 2)
        self.assertEqual([one for one in told if one not in text], [])

    def test_has_whole_names(self):
        self.open()
        text = bare("".join(self.sheets()))
        long = "a long name " * 12 + "end"
        page = pages.with_clip(self.report, 0, {"name": long}, self.report.with_name("long.html"))
        self.page.open(page)
        self.assertIn(bare(long), bare("".join(self.sheets())))
        for name in ("prores_hq_1080i", "timecode_2997_drop"):
            self.assertIn(name, text)

    def test_has_all_of_a_clip(self):
        for name in ("h264_with_aac", "timecode_25", "three_sounds"):
            self.open()
            self.page.click("tr.clip a.open", name)
            parts = self.page.texts(".part > h2")
            values = self.page.texts(".value")
            self.assertGreater(len(values), 50)
            sheets = self.sheets()
            text = "\n".join(sheets)
            places = [re.search(rf"^\s*{part}$", text, re.MULTILINE).start() for part in parts]
            self.assertEqual(places, sorted(places), name)
            self.assertEqual([value for value in values if bare(value) not in bare(text)], [], name)

    def test_cuts_nothing_off_at_the_edge_of_the_paper(self):
        for view in [*VIEWS, "#/clip/6"]:
            self.open(view, width=718)  # A4 within its margins
            self.emulate()
            self.page.frame()
            self.assertEqual(self.page.run("return document.documentElement.scrollWidth"), 718, view)
            self.assertEqual(self.page.run(CUT), [], view)
