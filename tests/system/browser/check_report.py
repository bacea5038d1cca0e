#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""check_report.py CLIPHOST MOVIES

Opens reports in Chromium and does what people do there. Ends with status 77 where there is no browser.
"""

import collections
import sys
from pathlib import Path

sys.dont_write_bytecode = True  # the modules lie in the sources
import browser  # noqa: E402
import pages  # noqa: E402
import report_test  # noqa: E402
from clip_parts import ClipParts  # noqa: E402, F401
from printing import Printing  # noqa: E402, F401
from report_test import NAMES, VIEWS, ReportTest  # noqa: E402

WIDTHS = (360, 1440, 3840)
# The numbers of the clips in the table's order.
PLACES = "return [...document.querySelectorAll(arguments[0])].map((one) => one.hash.split('/')[2] - 1)"
# Values that come before smaller ones; texts as a dictionary has them, and numbers in them by their size.
OUT_OF_ORDER = """
    const words = new Intl.Collator('en', {numeric: true, sensitivity: 'base'});
    const compare = (a, b) => typeof a === 'string' ? words.compare(a, b) : a - b;
    return arguments[0].filter((value, i, all) => i > 0 && compare(all[i - 1], value) > 0)"""
# What comes of decoding all pictures: their number, or the fault.
DECODED = """
    const done = arguments[0];
    Promise.all([...document.images].map((one) => one.decode()))
        .then(() => done(document.images.length), (error) => done(String(error)))"""


class ReportInBrowser(ReportTest):
    def test_opens_without_a_complaint_and_asks_for_nothing(self):
        for view in VIEWS:
            self.open(view)
            self.page.frame()
            self.assertEqual(self.page.complaints(), [])
            other = [url for url in self.page.requests() if not url.startswith(("data:", "about:"))]
            self.assertEqual({url.split("#")[0] for url in other}, {self.report.as_uri()})

    def test_shows_hostile_names_as_text(self):
        self.open()
        names = self.names()
        self.assertIn(pages.HOSTILE.replace("\x1b", "\u241b").replace("\n", "\u240a"), names)
        self.assertIn(pages.TURNED.replace("\u202e", "\u2039U+202E\u203a"), names)
        self.assertIn(pages.ARABIC, names)
        for view in VIEWS:
            self.open(view)
            self.assertEqual(self.page.run("return [typeof hacked, document.querySelectorAll('[onerror]').length]"),
                             ["undefined", 0])
        self.assertEqual(self.page.run("return document.querySelectorAll('bdi').length > 5"), True)

    def test_sorts_by_every_column_both_ways(self):
        self.open(width=3840)
        clips = pages.document(self.report.read_text(encoding="utf-8"))["clips"]
        columns = self.page.run("return [...document.querySelectorAll('thead th')].map((one) => one.dataset.column)")
        self.assertCountEqual(columns, pages.COLUMNS)
        for column in columns:
            selector = f'thead th[data-column="{column}"]'
            directions = set()
            for _ in range(2):
                self.page.click(selector + " button")
                direction = self.page.one(selector).get_attribute("aria-sort")
                directions.add(direction)
                places = self.page.run(PLACES, NAMES)
                self.assertCountEqual(places, range(len(clips)))
                values = [pages.COLUMNS[column](clips[place]) for place in places]
                known = [value for value in values if value is not None]
                self.assertEqual(values, known + [None] * (len(values) - len(known)), (column, direction))
                if direction == "descending":
                    known.reverse()
                self.assertEqual(self.page.run(OUT_OF_ORDER, known), [], (column, direction))
            self.assertEqual(directions, {"ascending", "descending"}, column)

    def test_sorts_where_columns_are_hidden(self):
        for width in (800, 1600):
            self.open(width=width)
            before = self.names()
            self.assertTrue(self.page.one("select#sort").is_displayed(), width)
            self.page.click("button.sortby")
            self.assertEqual(self.names(), before[::-1], width)

    def test_searches_as_one_types(self):
        self.open()
        search = self.page.one("#search")
        for typed, expected in (("timecode_", 2), ("29", 1), ("zzz", 0)):
            search.send_keys(typed)
            self.page.frame()
            self.assertEqual(len(self.names()), expected, typed)
        self.assertTrue(self.page.one(".nothing").is_displayed())
        self.page.click(".nothing button")
        self.assertEqual(len(self.names()), self.count)
        search.send_keys("undefined")  # of clips without pictures
        self.page.frame()
        self.assertEqual(self.names(), [])
        search.clear()
        search.send_keys("PRORES 1080")
        self.page.frame()
        self.assertEqual(self.names(), ["prores_hq_1080i"])

    def test_filters_by_chips(self):
        self.open()
        self.page.click(".chip", "Not described")
        self.assertEqual(self.names(), ["none"])
        self.assertEqual([one.text for one in self.page.all('.chip[aria-pressed="true"]')], ["Not described1"])
        self.page.click(".chip", "Rotated")
        self.assertCountEqual(self.names(), ["none", "rotated_270"])
        self.page.click(".reset")
        self.assertEqual(len(self.names()), self.count)
        self.assertEqual(self.page.all('.chip[aria-pressed="true"]'), [])

    def test_groups_by_folder_codec_and_rate(self):
        self.open(height=3000)
        clips = pages.document(self.report.read_text(encoding="utf-8"))["clips"]
        for grouping, of in pages.GROUPINGS.items():
            self.page.run("const by = document.querySelector('#group'); by.value = arguments[0];"
                          "by.dispatchEvent(new Event('change'))", grouping)
            self.page.frame()
            told = dict(zip(self.page.texts("tr.group bdi"), self.page.texts("tr.group .count")))
            counts = collections.Counter(of(clip) for clip in clips)
            self.assertEqual({group: int(count.split("\u00a0")[0]) for group, count in told.items()}, counts)
            self.assertEqual(len(self.names()), self.count)

    def test_opens_a_clip_and_comes_back_to_it(self):
        self.open()
        name = self.names()[3]
        self.page.click(NAMES, name)
        self.assertEqual(self.page.texts("h1"), [name])
        self.assertEqual(self.page.focused(), name)
        self.page.driver.back()
        self.page.frame()
        self.assertEqual(self.page.focused(), name)

    def test_shows_all_of_a_clip(self):
        self.open()
        self.page.click(NAMES, "h264_with_aac")
        self.assertEqual(self.page.texts(".part > h2"), ["Worth a look", "Pictures", "Sound", "Facts", "Bin columns",
                                                         "Parameters", "Samples in the file", "Mobs"])
        self.assertEqual(len(self.page.all(".strip .cell img")), 10)  # as many as it has frames
        self.assertEqual(len(self.page.all(".wave path.peak")), 1)
        self.assertEqual(self.page.texts(".mob > h3"), ["Master mob", "File mob", "Source mob"])
        self.page.frame()
        slots = len(self.page.all(".slot[data-target]"))
        self.assertGreater(slots, 3)
        self.assertEqual(len(self.page.all(".arrows .arrow")), slots)
        self.page.click(".mob summary", "Descriptor")
        self.assertIn("CDCIDescriptor", " ".join(self.page.texts(".node summary")))

    def test_shows_mobs_beyond_those_of_a_movie(self):
        leads = {"class": "SourceClip", "SourceID": "tape", "SourceMobSlotID": "1", "StartTime": "0"}
        slot = {"class": "TimelineMobSlot", "SlotID": "1", "Segment": [leads]}
        mobs = [{"class": "MasterMob", "MobID": "a"}, {"class": "SourceMob", "MobID": "b"},
                {"class": "SourceMob", "MobID": "c", "Slots": [slot]},
                {"class": "ImportMob", "MobID": "tape", "Slots": [{"class": "TimelineMobSlot", "SlotID": "1"}]}]
        page = pages.with_details(self.report, 0, {"description": {"Mobs": mobs}}, self.report.with_name("mobs.html"))
        self.page.open(page, "#/clip/1")
        self.assertEqual(self.page.complaints(), [])
        self.assertEqual(self.page.texts(".mob > h3"), ["Master mob", "File mob", "Source mob", "ImportMob"])
        self.assertIn("importmob, slot 1", self.page.all(".mob")[2].text)

    def test_tells_why_a_clip_failed(self):
        self.open()
        self.page.click(NAMES, "none")
        told = self.page.one(".warning.bad").text
        self.assertIn("can't be opened", told)
        self.assertEqual(len(self.page.all(".placeholder")), 1)

    def test_tells_why_a_clip_has_no_pictures(self):
        self.page.open(self.undrawn, "#/clip/1")
        self.assertRegex(self.page.one(".placeholder").text, "^No pictures. pictures: .*xyz1")
        self.page.open(self.undrawn)
        self.assertEqual(self.page.texts(".poster"), ["no picture"])

    def test_draws_sound_without_a_sample(self):
        wave = {"track": 1, "seconds": 0, "isWhole": True, "lacksSamples": False, "peaks": [], "means": []}
        page = pages.with_details(self.report, 0, {"waves": [wave]}, self.report.with_name("empty sound.html"))
        self.page.open(page, "#/clip/1")
        self.assertEqual(len(self.page.all(".wave path.peak")), 1)
        self.assertEqual(self.page.complaints(), [])

    def test_calls_sound_silent_where_all_of_it_was_read(self):
        base = {"track": 1, "seconds": 1, "peaks": [0, 0], "means": [0, 0]}
        waves = [dict(base, isWhole=whole, lacksSamples=lacks) for whole in (True, False) for lacks in (False, True)]
        page = pages.with_details(self.report, 0, {"waves": waves}, self.report.with_name("silent.html"))
        self.page.open(page, "#/clip/1")
        for selector, text in ((".wave figcaption .fine", lambda one: one.text),
                               (".wave svg", lambda one: one.get_attribute("aria-label"))):
            told = [text(one) for one in self.page.all(selector)]
            self.assertEqual(["silent" in one for one in told], [True, False, False, False], told)
            self.assertEqual(["nothing heard in what was read" in one for one in told],
                             [False, True, True, True], told)

    def test_shows_timecode_where_the_movie_is_known_to_have_it(self):
        start = "10:11:12:13"
        for has, failed, shown in ((True, False, True), (False, False, False), (None, False, False),
                                   (None, True, True)):
            members = {"start": start, "hasTimecode": has, "failed": failed}
            page = pages.with_clip(self.report, 0, members, self.report.with_name("timecode.html"))
            self.page.open(page)
            self.assertEqual(start in self.page.texts("td.start"), shown, members)

    def test_tells_that_the_map_of_a_movie_is_not_known(self):
        text = "Where they lie is not known"
        bare = pages.with_details(self.report, 0, {"samples": None}, self.report.with_name("unmapped.html"))
        warning = {"kind": "samples", "reason": "r"}
        for members, told in (({"route": "library"}, True), ({"route": "header"}, False),
                              ({"route": "library", "failed": True}, False),
                              ({"route": "library", "warnings": [warning]}, False)):
            page = pages.with_clip(bare, 0, members, bare.with_name("route.html"))
            self.page.open(page, "#/clip/1")
            self.assertEqual(any(text in part for part in self.page.texts(".part")), told, members)

    def test_cuts_chips_of_codecs_and_shows_all_that_is_worth_a_look(self):
        ids = [f"kind {i}" for i in range(20)]
        traits = [{"id": one, "words": "w"} for one in ids]
        clips = pages.document(self.report.read_text(encoding="utf-8"))["clips"]
        page = self.report.with_name("chips.html")
        pages.with_clip(self.report, 0, {"traits": traits}, page)
        for number in range(len(clips)):
            pages.with_clip(page, number, {"codec": f"c{number}", "codecName": f"codec {number}"}, page)
        self.page.open(page)
        self.assertGreater(len(clips), 8)
        told = self.page.texts(".chip")
        self.assertEqual(sum(one.startswith("codec ") for one in told), 8, told)
        self.assertEqual({one[:-1] for one in told if one.startswith("kind ")}, set(ids))

    def test_tells_how_many_breaks_are_not_listed(self):
        broken = {"position": 1, "track": 1, "from": 2, "at": 0, "seconds": 3}
        for count, told in ((8, False), (1234, True)):
            samples = {"tracks": [], "interleaving": {"widest": 3, "count": count, "breaks": [broken] * 8}}
            page = pages.with_details(self.report, 0, {"samples": samples}, self.report.with_name("breaks.html"))
            self.page.open(page, "#/clip/1")
            caption = self.page.one(".samples caption, .part caption").text
            self.assertEqual("The first 8 of 1,234" in caption, told, caption)
            self.assertEqual("The first" in caption, told, caption)

    def test_walks_with_the_keyboard(self):
        keys = browser.Keys
        self.open()
        self.page.run("document.querySelector('.chip:last-child').focus()")
        for _ in range(30):
            self.page.keys(keys.TAB)
            if self.page.run("return document.activeElement.matches('a.open')"):
                break
        names = self.names()
        self.assertEqual(self.page.focused(), names[0])
        self.page.keys(keys.ARROW_DOWN, keys.ARROW_DOWN)
        self.assertEqual(self.page.focused(), names[2])
        self.page.keys(keys.END)
        self.assertEqual(self.page.focused(), names[-1])
        self.page.keys(keys.HOME, keys.ARROW_DOWN, keys.ENTER)
        self.assertEqual(self.page.texts("h1"), [names[1]])
        self.page.keys("j")
        self.assertEqual(self.page.texts("h1"), [names[2]])
        self.page.run("document.activeElement.blur()")  # as after a click beside the text
        self.page.keys("k", "k")
        self.assertEqual(self.page.texts("h1"), [names[0]])
        self.page.keys(keys.ESCAPE)
        self.assertEqual(self.page.focused(), names[0])
        self.page.keys("/")
        self.assertEqual(self.page.run("return document.activeElement.id"), "search")

    def test_copies_a_value_by_click_and_by_key(self):
        self.page.command("Browser.grantPermissions", permissions=["clipboardReadWrite", "clipboardSanitizedWrite"])
        self.open("#/clip/1")
        read = "const done = arguments[0]; navigator.clipboard.readText().then(done, (error) => done(String(error)))"
        path = self.page.all(".facts .value")[0]
        path.click()
        self.page.frame()
        self.assertEqual(self.page.wait(read), path.text)
        self.assertIn(path.text, self.page.one(".told").text)
        self.page.keys(browser.Keys.ARROW_DOWN, browser.Keys.ENTER)
        self.assertNotEqual(self.page.wait(read), path.text)

    def test_changes_the_theme(self):
        paper = "return getComputedStyle(document.documentElement).backgroundColor"
        self.open()
        self.page.run("try { localStorage.clear() } catch {}")
        self.open()
        light = self.page.run(paper)
        self.open(scheme="dark")
        dark = self.page.run(paper)
        self.assertNotEqual(light, dark)
        self.page.click(".theme")
        self.assertEqual((self.page.run(paper), self.page.one(".theme").text), (light, "Theme: light"))
        self.page.click(".theme")
        self.assertEqual(self.page.run(paper), dark)
        self.page.click(".theme")
        self.assertEqual(self.page.one(".theme").text, "Theme: system")

    def test_fits_screens_of_all_widths(self):
        for width in WIDTHS:
            for view in VIEWS:
                self.open(view, width=width)
                self.assertEqual(self.page.run("return document.documentElement.scrollWidth"), width, view)

    def test_names_what_is_odd_and_leads_to_it(self):
        self.open("#/odd")
        titles = self.page.texts(".finding h2")
        for title in ("Not described", "Copies of one movie", "Mixed rates"):
            self.assertTrue(any(title in one for one in titles), titles)
        self.page.click(".finding .chip", "copies")
        self.assertEqual(len(self.names()), 2)
        self.page.click(".reset")
        self.assertEqual(len(self.names()), self.count)

    def test_names_rates_by_their_size(self):
        labels = ["24/1", "24000/1001", "30/1", "30000/1001", "5/1", "50/1"]

        def change(whole):
            whole["odd"] = [{"id": "rates", "title": "Mixed rates", "words": "w",
                             "groups": [{"label": label, "clips": [0]} for label in labels]}]
        self.page.open(pages.with_report(self.report, change, self.report.with_name("rates.html")), "#/odd")
        told = [float(one.split("\u00a0")[0]) for one in self.page.texts(".finding .chip")]
        self.assertEqual(told, [5, 23.976, 24, 29.97, 30, 50])

    def test_shows_all_marks_of_a_clip(self):
        warning = {"kind": "pictures", "reason": "r"}
        for traits in (["noSound"], ["noSound", "noTimecode"], ["sampleProvider", "noSound", "rotated"]):
            for warnings in ([], [warning]):
                members = {"warnings": warnings, "traits": [{"id": one, "words": "w"} for one in traits]}
                page = self.report.with_name("marks.html")
                pages.with_clip(self.report, 0, members, page)
                for width in (800, 1280, 1440, 3840):
                    self.page.open(page, width=width)
                    cut = self.page.run(
                        "return [...document.querySelectorAll('.marks')].filter((one) => one.scrollHeight >"
                        "one.clientHeight || one.scrollWidth > one.clientWidth).map((one) => one.textContent)")
                    self.assertEqual(cut, [], (width, members))

    def test_keeps_few_rows_of_many_and_shows_each(self):
        self.page.open(self.many)
        self.assertLess(len(self.names()), 60)
        self.assertEqual(self.page.one("table.clips").get_attribute("aria-rowcount"), "1001")
        self.page.run("scrollTo(0, document.body.scrollHeight)")
        self.page.frame()
        self.assertEqual(self.names()[-1], "clip 00999")
        self.page.run("scrollTo(0, 0)")
        self.page.frame()
        self.assertEqual(self.names()[0], "clip 00000")
        self.page.run("document.querySelector('a.open').focus()")
        self.page.keys(browser.Keys.END)
        self.assertEqual(self.page.focused(), "clip 00999")

    def test_prints_all_rows(self):
        self.page.open(self.many)
        self.page.run("dispatchEvent(new Event('beforeprint'))")
        self.assertEqual(len(self.names()), 1000)
        self.page.run("dispatchEvent(new Event('afterprint'))")
        self.assertLess(len(self.names()), 60)

    def test_shows_pictures_that_lie_beside_it(self):
        clips = pages.document(self.split.read_text(encoding="utf-8"))["clips"]
        posters = sum("poster" in clip for clip in clips)
        beside = self.split.with_name(self.split.stem + "_files").as_uri() + "/"
        for view, pictures, files in (("", posters, posters), ("#/clip/1", 10, 1)):
            self.page.open(self.split, view, height=3000)
            self.assertEqual(self.page.wait(DECODED), pictures, view)
            self.assertEqual(self.page.complaints(), [])
            asked = {url for url in self.page.requests() if url.startswith(beside)}
            self.assertEqual(len(asked), files, view)

    def test_leaves_no_files_of_the_browser(self):
        page = browser.start()
        folder = Path(page.temporary.name)
        self.assertNotEqual(list(folder.iterdir()), [])
        page.quit()
        self.assertFalse(folder.exists())


def main(program, movies):
    def make_more(folder):
        ReportTest.split = pages.write(program, folder / "movies", folder / "a split #1 100%.html", "--split")
        pages.make_undrawn(Path(movies), folder / "undrawn")
        ReportTest.undrawn = pages.write(program, folder / "undrawn", folder / "undrawn.html")
        ReportTest.many = pages.multiply(ReportTest.report, 1000, folder / "many.html")
        ReportTest.count = len(pages.document(ReportTest.report.read_text(encoding="utf-8"))["clips"])

    return report_test.run(browser.why_none(), program, movies, make_more)


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
