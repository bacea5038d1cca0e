#!/usr/bin/python3
# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""check_json_schemas.py CLIPHOST SCHEMAS MOVIES TYPES

Runs every verb that has --json or --jsonl, on sound and bad files, and compares what it prints with
its schema. Every such verb needs a schema, and every member of a schema has to occur in an answer.
"""

import json
import re
import subprocess
import sys
import tempfile
from pathlib import Path

sys.dont_write_bytecode = True  # the schemas' module lies in the sources
import samples  # noqa: E402
import schemas  # noqa: E402


class Program:
    def __init__(self, file):
        self.file = str(Path(file).resolve())

    def run(self, call, folder):
        return subprocess.run(
            [self.file, *call], cwd=folder, capture_output=True, timeout=300,
            encoding="utf-8", errors="replace",
        )

    def forms(self):
        """Each verb's ways to answer in JSON, by its own help."""
        verbs = self.run(["--help"], ".").stdout.split("Subcommands:\n", 1)[1]
        for verb in re.findall(r"^  (\S+)", verbs, re.MULTILINE):
            for form in re.findall(r"(?<!\S)--jsonl?(?![\w-])", self.run([verb, "--help"], ".").stdout):
                yield verb, form


def name_of(verb, form):
    """The schema of an answer: of a document by the verb's name alone."""
    return verb + ("_line" if form == "--jsonl" else "")


def answers_of(form, text):
    return [json.loads(line) for line in text.splitlines()] if form == "--jsonl" else [json.loads(text)]


def check(program, known, sample, folder):
    """What is wrong with a sample's answers."""
    done = program.run(sample.call, folder)
    if done.returncode != sample.status:
        yield f"status {done.returncode}, not {sample.status}: {done.stderr}"
    if not sample.form:
        return
    try:
        answers = answers_of(sample.form, done.stdout)
    except ValueError as error:
        yield f"no JSON: {error}: {done.stdout[:200]!r}"
        return
    if not answers:
        yield "no answer"
    for answer in answers:
        fault = known.check(name_of(sample.verb, sample.form), answer)
        if fault:
            yield fault


def main(program, folder, movies, types):
    program = Program(program)
    known = schemas.Schemas(folder)
    faults = known.faults()
    needed = {name_of(*form) for form in program.forms()}
    if not needed:
        faults.append("the help names no verb with --json")
    faults += [f"{name}: no such schema" for name in sorted(needed - known.names())]
    faults += [f"{name}: the schema of no verb" for name in sorted(known.names() - needed)]
    with tempfile.TemporaryDirectory() as work:
        samples.make_files(Path(movies), Path(types), Path(work))
        for sample in samples.SAMPLES:
            faults += [f"{' '.join(sample.call)}: {fault}" for fault in check(program, known, sample, work)]
    faults += [f"{place}: {member} is in no sample" for place, member in known.unseen()]
    for fault in faults:
        print(fault)
    print(f"{len(samples.SAMPLES)} calls, {len(needed)} schemas, {len(faults)} faults")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
