# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""The parts of a clip's own view."""

import browser
import pages
from report_test import ReportTest

# Texts with a number that is in no value, within what shows numbers.
PLAIN_NUMBERS = """
    const parts = document.querySelectorAll('.strip, .wave .fine, .chart .fine, .samples > p, .slot .slot-title, dd');
    return [...parts].flatMap((part) => {
      const texts = document.createTreeWalker(part, NodeFilter.SHOW_TEXT);
      const found = [];
      while (texts.nextNode()) {
        const text = texts.currentNode;
        if (/[0-9]/.test(text.data) && !text.parentElement.closest('.value, bdi')) found.push(text.data);
      }
      return found;
    })"""
READ = "const done = arguments[0]; navigator.clipboard.readText().then(done, (error) => done(String(error)))"
TRACK = {"track": 1, "kind": "picture", "samples": 40, "bytes": 4000, "runs": 4, "faults": []}


class ClipParts(ReportTest):
    def open_with(self, name, details):
        self.page.open(pages.with_details(self.report, 0, details, self.report.with_name(name)), "#/clip/1")
        self.assertEqual(self.page.complaints(), [])

    def open_samples(self, tracks, interleaving=None):
        samples = {"tracks": [dict(TRACK, **track) for track in tracks], "interleaving": interleaving}
        self.open_with("samples.html", {"samples": samples})

    def row(self, label):
        """What the facts of samples say under a label, for each track that says it."""
        rows = self.page.run(
            "return [...document.querySelectorAll('.samples dt')].map((one) =>"
            "[one.textContent, one.nextElementSibling.textContent])")
        return [text for name, text in rows if name == label]

    def copied(self, selector, number=0):
        one = self.page.all(selector)[number]
        one.click()
        self.page.frame()
        text = one.get_attribute("textContent")
        self.assertEqual(self.page.wait(READ), text, selector)
        return text

    def test_every_number_is_a_value(self):
        for number in range(1, self.count + 1):
            self.open(f"#/clip/{number}")
            self.assertEqual(self.page.run(PLAIN_NUMBERS), [], number)

    def test_a_click_copies_each_kind_of_number(self):
        self.page.command("Browser.grantPermissions", permissions=["clipboardReadWrite", "clipboardSanitizedWrite"])
        self.open()
        self.page.click("tr.clip a.open", "h264_with_aac")
        self.assertEqual(self.copied(".strip .fine .value", 3), "3")
        self.assertRegex(self.copied(".wave .value"), r"^-\d+(\.\d)?\sdB$")
        self.assertRegex(self.copied(".wave .value", 1), r"^0\.4\ss$")
        self.assertRegex(self.copied(".chart .value"), r"^[\d.]+\s(kB|B)$")
        self.assertRegex(self.copied(".samples > p .value"), r"^[\d.]+\ss$")
        self.assertRegex(self.copied(".slot-title .value"), r"^\d+$")
        self.open()
        self.page.click("tr.clip a.open", "timecode_25")
        self.assertRegex(self.copied(".strip .value", 2), r"^\d\d:\d\d:\d\d:\d\d$")
        self.assertEqual(self.copied(".strip .fine .value", 1), "1")

    def test_keys_reach_each_number_and_copy_it(self):
        keys = browser.Keys
        self.page.command("Browser.grantPermissions", permissions=["clipboardReadWrite", "clipboardSanitizedWrite"])
        self.open()
        self.page.click("tr.clip a.open", "h264_with_aac")
        for part in (".strip", ".wave .fine", ".chart .fine", ".samples > p", ".slot"):
            values = self.page.all(f"{part} .value")
            within = len(self.page.all(part))
            self.assertEqual(len(self.page.all(f'{part} .value[tabindex="0"]')), within, part)
            self.assertTrue(all(one.get_attribute("role") == "button" for one in values), part)
        self.page.run("document.querySelector('.slot-title .value').focus()")
        self.page.keys(keys.ARROW_DOWN, keys.ENTER)
        self.assertEqual(self.page.wait(READ), self.page.all(".slot dd .value")[0].text)
        self.page.keys(keys.HOME, keys.SPACE)
        self.assertEqual(self.page.wait(READ), self.page.all(".slot-title .value")[0].text)

    def test_a_number_has_its_name_for_screen_readers(self):
        self.open()
        self.page.click("tr.clip a.open", "h264_with_aac")
        for part, name in ((".strip .fine", "Frame: 0, copy"), (".wave", "Highest: "), (".chart", "Largest: "),
                           (".samples > p", "Apart: "), (".slot-title", "Slot: ")):
            label = self.page.one(f"{part} .value").get_attribute("aria-label")
            self.assertTrue(label.startswith(name), label)

    def test_gives_long_values_the_whole_width(self):
        for width in (360, 1280, 3840):
            self.page.open(self.report, "#/clip/1", width=width)
            boxes = self.page.run(
                "return [...document.querySelectorAll('#part-facts ~ .facts > div')].map((one) =>"
                "[one.querySelector('dd').textContent, one.offsetWidth, one.parentElement.clientWidth])")
            long = [(row, whole) for text, row, whole in boxes if len(text) > 40]
            self.assertGreaterEqual(len(long), 2, width)  # path and id
            self.assertEqual([row for row, _ in long], [whole for _, whole in long], width)
            if width > 1000:
                self.assertLess(boxes[1][1], boxes[1][2] / 2)  # the length

    def test_leaves_no_gap_where_nothing_is_known_of_a_clip(self):
        self.open()
        self.page.click("tr.clip a.open", "none")
        self.assertEqual(self.page.all("p.brief"), [])

    def test_draws_the_sizes_of_samples(self):
        self.open_samples([{"sizes": [100, 50, 200, 0], "samples": 40}])
        bars = self.page.run("return [...document.querySelectorAll('.chart rect')].map((one) =>"
                             "['x', 'y', 'height'].map((name) => Number(one.getAttribute(name))))")
        self.assertEqual([round(x - bars[0][0], 3) for x, _, _ in bars], [0, 1, 2, 3])
        self.assertEqual([(y, height) for _, y, height in bars], [(50, 50), (75, 25), (0, 100), (100, 0)])
        self.assertEqual(self.page.one(".chart figcaption .fine").text, "up to 200 B, means of 10 samples")
        self.assertEqual(self.page.one(".chart svg").get_attribute("aria-label"),
                         "Sizes of samples over time, from 0\u00a0B to 200\u00a0B")
        drawn = self.page.run("return [...document.querySelectorAll('.chart svg, .chart rect')].map((one) =>"
                              "one.getBoundingClientRect()).map((one) => [one.width, one.height])")
        self.assertGreater(drawn[0][0], 500)
        self.assertAlmostEqual(drawn[3][1], drawn[0][1], delta=1)  # the largest is as high as the chart

    def test_draws_each_sample_where_they_are_few(self):
        self.open_samples([{"sizes": [1, 2, 3], "samples": 3}])
        self.assertEqual(self.page.one(".chart figcaption .fine").text, "up to 3 B")

    def test_draws_no_chart_of_one_sample_or_none(self):
        self.open_samples([{"sizes": [7], "samples": 1}, {"track": 2}, {"track": 3, "sizes": []}])
        self.assertEqual(len(self.page.all(".samples h3")), 3)
        self.assertEqual(self.page.all(".chart"), [])

    def test_tells_how_many_pictures_lie_between_those_that_stand_alone(self):
        groups = [({"count": 3, "shortest": 12, "longest": 12, "mean": 12}, "3\u00a0groups of 12\u00a0pictures"),
                  ({"count": 1, "shortest": 10, "longest": 10, "mean": 10}, "1\u00a0group of 10\u00a0pictures"),
                  ({"count": 4, "shortest": 2, "longest": 15, "mean": 9.25},
                   "4\u00a0groups of 2 to 15 pictures, 9.3 in the mean"),
                  ({"count": 9, "shortest": 1, "longest": 1, "mean": 1}, "every picture stands alone"),
                  (None, "none stands alone")]
        self.open_samples([{"track": i + 1, "sizes": [1, 2], "groups": group} for i, (group, _) in enumerate(groups)] +
                          [{"track": 9, "kind": "sound"}])
        self.assertEqual(self.row("Pictures between those that stand alone"), [told for _, told in groups])

    def test_lists_where_interleaving_breaks(self):
        breaks = [{"position": 123456789, "track": 2, "from": 1, "at": 75, "seconds": 3.5},
                  {"position": 5, "track": 1, "from": 2, "at": 0, "seconds": 7205}]
        self.open_samples([{}], {"widest": 7205, "count": 2, "breaks": breaks})
        self.assertEqual(self.page.texts(".samples > p"),
                         ["Sound and picture of one time lie at most 7205\u00a0s of playing apart."])
        self.assertEqual(self.page.texts(".samples thead th"), ["At byte", "Track", "At", "Apart from", "By"])
        self.assertEqual(self.page.texts(".samples tbody td"),
                         ["123456789", "2", "1:15", "track 1", "3.5\u00a0s",
                          "5", "1", "0\u00a0s", "track 2", "2:00:05"])
        self.assertEqual(self.page.texts(".samples caption"), ["Where they are more than 2 seconds apart"])
        self.assertEqual(len(self.page.all(".samples tbody .value")), 10)

    def test_lists_no_breaks_where_there_are_none(self):
        self.open_samples([{}], {"widest": 0.5, "count": 0, "breaks": []})
        self.assertEqual(len(self.page.all(".samples > p")), 1)
        self.assertEqual(self.page.all(".samples table"), [])
