#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""check_access.py CLIPHOST MOVIES WORK

Has axe-core look at all views of a report. WORK is a folder that stays: what npm installs. Ends with status 77
where there is no axe-core or no browser.
"""

import shutil
import subprocess
import sys
from pathlib import Path

sys.dont_write_bytecode = True  # the modules lie in the sources
import browser  # noqa: E402
import report_test  # noqa: E402
from report_test import VIEWS, ReportTest  # noqa: E402

HERE = Path(__file__).resolve().parent
VIOLATIONS = "const done = arguments[0]; axe.run().then((all) => done(all.violations))"


def axe_script(work):
    """The script of axe-core, and why there is none."""
    script = work / "node_modules/axe-core/axe.min.js"
    if not script.exists():
        if not shutil.which("npm"):
            return "", "there is no npm (Debian's package npm), which axe-core comes by"
        work.mkdir(parents=True, exist_ok=True)
        for name in ("package.json", "package-lock.json"):
            shutil.copyfile(HERE / name, work / name)
        done = subprocess.run(["npm", "ci", "--no-audit", "--no-fund"], cwd=work, capture_output=True, encoding="utf-8")
        if done.returncode != 0:
            return "", f"npm can't install axe-core: {done.stderr.strip()[-300:]}"
    return script.read_text(encoding="utf-8"), ""


class ReportIsAccessible(ReportTest):
    def violations(self, view, **named):
        self.open(view, **named)
        self.page.run(self.axe)
        return [(one["id"], one["nodes"][0]["html"]) for one in self.page.wait(VIOLATIONS)]

    def test_in_all_views_at_two_widths_light_and_dark(self):
        for width in (360, 1440):
            for scheme in ("light", "dark"):
                for view in VIEWS:
                    self.assertEqual(self.violations(view, width=width, scheme=scheme), [], (width, scheme, view))

    def test_and_axe_finds_what_is_not(self):
        self.open()
        self.page.run("document.querySelector('main').append(document.createElement('button'))")
        self.page.run(self.axe)
        self.assertEqual([one["id"] for one in self.page.wait(VIOLATIONS)], ["button-name"])


def main(program, movies, work):
    ReportIsAccessible.axe, reason = axe_script(Path(work))
    return report_test.run(reason or browser.why_none(), program, movies)


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
