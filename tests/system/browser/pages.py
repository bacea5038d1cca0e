# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""Reports that the tests open: made by the program, and taken apart and multiplied here."""

import json
import re
import shutil
import subprocess

HOSTILE = "<script>hacked = 1<!-- \"quotes' & <img src=x onerror=hacked=1> \x1b[31m\n end"
TURNED = "abc \u202egnp.exe"
ARABIC = "\u0645\u0642\u0637\u0639 \u0641\u064a\u062f\u064a\u0648"
ELEMENT = '<script type="application/json" id="%s">'
END = "</script>\n"


def ratio(clip):
    """Of pictures; nothing for sound alone, whose rate is that of edit units."""
    if "rate" not in clip or "width" not in clip:
        return None
    numerator, denominator = clip["rate"].split("/")
    return int(numerator) / int(denominator)


def sound(clip):
    name = clip.get("soundName") or clip.get("soundCodec") or "sound"
    rate = f", {clip['soundRate'] / 1000:g}\u00a0kHz" if clip.get("soundRate") else ""
    return f"{name}, {clip['channels']}\u00a0ch{rate}"


# What a column of the table goes by; nothing for a clip that has none.
COLUMNS = {
    "name": lambda clip: clip["name"],
    "length": lambda clip: clip.get("seconds"),
    "start": lambda clip: clip.get("start") if clip.get("hasTimecode") or clip["failed"] else None,
    "rate": ratio,
    "raster": lambda clip: clip["width"] * clip["height"] if "width" in clip else None,
    "codec": lambda clip: clip.get("codecName") or clip.get("codec"),
    "sound": lambda clip: sound(clip) if clip.get("channels") else None,
    "size": lambda clip: clip.get("size"),
    "date": lambda clip: clip.get("date"),
    "warnings": lambda clip: len(clip["warnings"]) + len(clip["traits"]) / 100,
}

# What clips of a group have in common.
GROUPINGS = {
    "folder": lambda clip: clip["folder"],
    "codec": lambda clip: COLUMNS["codec"](clip) or "No picture",
    "rate": lambda clip: f"{round(ratio(clip), 3):g}\u00a0fps" if ratio(clip) else "No rate",
}


def make_movies(made, folder):
    """Movies under ordinary and hostile names; one that is none."""
    for name in ("h264_with_aac", "timecode_25", "timecode_2997_drop", "rotated_270", "prores_hq_1080i", "three_sounds"):
        copy(made, name, folder / "day 1" / f"{name}.mov")
    copy(made, "pcm_u8", folder / "day 2" / f"{HOSTILE}.mov")
    copy(made, "pcm_u8", folder / "day 2" / f"{TURNED}.mov")
    copy(made, "png_alpha", folder / "day 2" / f"{ARABIC}.mov")
    (folder / "day 2" / "none.mov").write_bytes(b"no movie at all\n" * 100)


def make_undrawn(made, folder):
    """A movie whose codec nobody knows."""
    folder.mkdir()
    movie = (made / "png.mov").read_bytes()
    (folder / "unknown.mov").write_bytes(movie.replace(b"png ", b"xyz1"))


def copy(made, name, to):
    to.parent.mkdir(parents=True, exist_ok=True)
    shutil.copyfile(made / f"{name}.mov", to)


def write(program, folder, page, *options):
    done = subprocess.run(
        [program, "report", folder, "--recursive", "-o", page, *options], capture_output=True, encoding="utf-8"
    )
    if done.returncode not in (0, 1):
        raise RuntimeError(done.stderr)
    return page


def element(text, name):
    """Start and end of the JSON in an element of a page."""
    mark = ELEMENT % name
    start = text.index(mark) + len(mark)
    return start, text.index(END, start)


def document(text):
    start, end = element(text, "report")
    return json.loads(text[start:end])


def in_script(value):
    text = json.dumps(value, ensure_ascii=False, separators=(",", ":"))
    return re.sub("[<>&\u2028\u2029]", lambda found: "\\u%04x" % ord(found[0]), text)


def with_details(page, number, members, to):
    """The page, but for members of a clip's details."""
    text = page.read_text(encoding="utf-8")
    start, end = element(text, f"clip-{number}")
    details = dict(json.loads(text[start:end]), **members)
    to.write_text(text[:start] + in_script(details) + text[end:], encoding="utf-8")
    return to


def with_report(page, change, to):
    """The page, but for what a call changes of what it shows of all clips together."""
    text = page.read_text(encoding="utf-8")
    start, end = element(text, "report")
    whole = json.loads(text[start:end])
    change(whole)
    to.write_text(text[:start] + in_script(whole) + text[end:], encoding="utf-8")
    return to


def with_clip(page, number, members, to):
    """The page, but for what the table shows of a clip; what is None is left out."""
    def change(whole):
        changed = dict(whole["clips"][number], **members)
        whole["clips"][number] = {name: value for name, value in changed.items() if value is not None}
    return with_report(page, change, to)


def multiply(page, count, to):
    """A page of so many clips: those of another one, again and again, under other names."""
    text = page.read_text(encoding="utf-8")
    first, end = element(text, "report")
    whole = document(text)
    clips = whole["clips"]
    details = [text[slice(*element(text, f"clip-{i}"))] for i in range(len(clips))]
    begin = text.index(ELEMENT % "clip-0")
    with to.open("w", encoding="utf-8") as out:
        out.write(text[:begin])
        many = []
        for i in range(count):
            clip = dict(clips[i % len(clips)], name=f"clip {i:05}")
            many.append(clip)
            out.write(ELEMENT % f"clip-{i}" + details[i % len(clips)] + END)
        out.write(ELEMENT % "report" + in_script(dict(whole, clips=many)) + text[end:])
    return to
