#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""compare.py ONE OUT MOVIES SHARES

Compares the outputs of shares, OUT/1 to OUT/SHARES, and their merged catalog, OUT/all.sqlite, with
those of a single run over the folder MOVIES, and tells how often a movie was described again, by the records
that each run keeps.
"""

import json
import sqlite3
import sys
from pathlib import Path


def outputs(folder):
    return {file.name: file.read_bytes() for file in folder.glob("*.aaf")}


def described(folder):
    """The movies that runs into a folder described; a killed run's last line may be cut off."""
    for file in (folder / ".cliphost-done").glob("*.jsonl"):
        for line in file.read_text(encoding="utf-8").splitlines():
            try:
                yield json.loads(line)["movie"]
            except ValueError:
                pass


def rows_of(catalog):
    """All that a catalog tells, but when it looked."""
    database = sqlite3.connect(f"file:{catalog}?mode=ro", uri=True)
    tables = database.execute("SELECT name FROM sqlite_schema WHERE type = 'table' AND sql NOT NULL")
    rows = {}
    for (table,) in tables.fetchall():
        if table.startswith("texts_"):  # how the table texts is stored
            continue
        cursor = database.execute(f'SELECT * FROM "{table}"')
        names = [column[0] for column in cursor.description]
        told = [{name: value for name, value in zip(names, row) if name != "looked"} for row in cursor]
        rows[table] = sorted(told, key=repr)
    return rows


def main(one, out, movies, shares):
    folders = [out / str(share + 1) for share in range(shares)]
    faults = []
    wanted = outputs(one)
    count = sum(1 for _ in movies.rglob("*.mov"))
    if len(wanted) != count:
        faults.append(f"the single run has {len(wanted)} outputs of {count} movies")
    found = {}
    for folder in folders:
        for name, content in outputs(folder).items():
            if name in found:
                faults.append(f"{name} is in two shares")
            found[name] = content
    faults += [f"{name} is missing" for name in sorted(wanted.keys() - found.keys())]
    faults += [f"{name} is too much" for name in sorted(found.keys() - wanted.keys())]
    faults += [f"{name} differs" for name in sorted(wanted.keys() & found.keys()) if wanted[name] != found[name]]

    done = [movie for folder in folders for movie in described(folder)]
    if len(set(done)) != count:
        faults.append(f"the records tell of {len(set(done))} movies of {count}")
    single, merged = rows_of(one / "all.sqlite"), rows_of(out / "all.sqlite")
    if len(single["movies"]) != count:
        faults.append(f"the single catalog has {len(single['movies'])} movies of {count}")
    faults += [f"the table {table} differs" for table in single if merged.get(table) != single[table]]
    files = [file for file in out.rglob("*") if file.is_file()]
    # What a killed run was writing, and what its child processes were.
    parts = [file for file in files if file.suffix == ".part" or file.relative_to(out).match("*/cliphost-*/*/*")]
    known = (".aaf", ".jsonl", ".sqlite", ".log")
    faults += [f"{file} is left over" for file in files if file not in parts and file.suffix not in known]
    for fault in faults:
        print(fault)
    again = len(done) - len(set(done))
    print(
        f"{count} movies have {len(found)} AAF files in {shares} shares, and {len(merged['movies'])} entries in "
        + "the merged catalog; " + ("all are those of the single run" if not faults else f"{len(faults)} faults")
    )
    print(f"done again: {again} of {count} movies, and those that a run was at when it ended; "
          f"unfinished files of a killed run: {len(parts)}")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main(*(Path(argument) for argument in sys.argv[1:4]), int(sys.argv[4])))
