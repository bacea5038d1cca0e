# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""open_report.py CLIPHOST FOLDER CLIPS TIMES

Makes a report of so many clips in FOLDER, opens it so many times, and tells how long each took.
"""

import subprocess
import sys
from pathlib import Path

sys.dont_write_bytecode = True  # the modules lie in the sources
sys.path.insert(0, str(Path(__file__).resolve().parents[2] / "tests/system/browser"))
import browser  # noqa: E402
import pages  # noqa: E402

# Full of detail, so that their pictures take as many bytes as a report lets them.
SOURCES = ("testsrc2", "mandelbrot", "life=mold=10:ratio=0.3,scale=sws_flags=neighbor", "cellauto")
USABLE = """
const done = arguments[0];
const look = () => {
  const mark = performance.getEntriesByName('usable')[0];
  if (mark) done(mark.startTime); else setTimeout(look, 10);
};
look();
"""


def make_movies(folder):
    folder.mkdir()
    for number, source in enumerate(SOURCES):
        name, _, rest = source.partition(",")
        video = f"{name}{':' if '=' in name else '='}size=640x360:rate=25" + (f",{rest}=640:360" if rest else "")
        subprocess.run(
            ["ffmpeg", "-nostdin", "-v", "error", "-f", "lavfi", "-i", video, "-f", "lavfi",
             "-i", "sine=frequency=440:sample_rate=48000", "-t", "2", "-c:v", "mjpeg", "-c:a", "pcm_s16le",
             folder / f"{number}.mov"],
            check=True,
        )


def main(program, folder, clips, times):
    reason = browser.why_none()
    if reason:
        print(f"skipped: {reason}")
        return 0
    folder = Path(folder)
    make_movies(folder / "movies")
    few = pages.write(program, folder / "movies", folder / "few.html")
    page = pages.multiply(few, int(clips), folder / "many.html")
    print(f"{clips} clips, {page.stat().st_size / 1e6:.1f} MB")
    chromium = browser.start()
    try:
        for _ in range(int(times)):
            chromium.open(page)
            print(f"opened in {chromium.wait(USABLE) / 1000:.4f} s")
    finally:
        chromium.quit()
    return 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
