# Copyright (c) 2026 The Cliphost authors
# SPDX-License-Identifier: MIT
"""The schemas of docs/json_schema, and what has been seen of them."""

import json
import warnings
from pathlib import Path

with warnings.catch_warnings():
    warnings.simplefilter("ignore", DeprecationWarning)  # of versions after Debian 12's
    from jsonschema import Draft202012Validator, RefResolver

ENDING = ".schema.json"
COMMON = "common"
FILES_OWN_NAMES = "node"  # its members are named by AAF files


class Schemas:
    def __init__(self, folder):
        self._documents = {}  # by address
        self._addresses = {}  # by name
        for file in sorted(Path(folder).glob("*" + ENDING)):
            address = file.resolve().as_uri()
            self._addresses[file.name[: -len(ENDING)]] = address
            self._documents[address] = json.loads(file.read_text(encoding="utf-8"))
        self._unseen = set()
        for name, address in self._addresses.items():
            Draft202012Validator.check_schema(self._documents[address])
            self._list(name, self._documents[address])

    def names(self):
        return set(self._addresses) - {COMMON}

    def unseen(self):
        """Members that no sample had."""
        return sorted(self._unseen)

    def faults(self):
        """What every schema has to keep, beyond being one."""
        found = []
        for name, address in self._addresses.items():
            for where, schema in _places(name, self._documents[address]):
                is_open = "properties" in schema and schema.get("additionalProperties") is not False
                if is_open and not where.endswith("/" + FILES_OWN_NAMES):
                    found.append(f"{where}: an object without additionalProperties false")
                for member, about in schema.get("properties", {}).items():
                    if not self._is_explained(address, about):
                        found.append(f"{where}: {member} has no description")
        return found

    def check(self, name, answer):
        """The first fault of an answer, or nothing; notes which members it has."""
        if name not in self._addresses:
            return f"there is no {name}{ENDING}"
        address = self._addresses[name]
        for fault in self._validator(address, self._documents[address]).iter_errors(answer):
            inner = min(fault.context, key=lambda one: len(one.message), default=fault)
            return f"{inner.json_path}: {inner.message[:300]}"
        self._see(address, self._documents[address], answer)
        return None

    def _validator(self, address, schema):
        resolver = RefResolver(address, self._documents[address], store=self._documents)
        return Draft202012Validator(schema, resolver=resolver)

    def _target(self, address, reference):
        file, _, pointer = reference.partition("#")
        if file:
            address = address.rsplit("/", 1)[0] + "/" + file
        schema = self._documents[address]
        for part in pointer.split("/")[1:]:
            schema = schema[part]
        return address, schema

    def _is_explained(self, address, schema):
        while "description" not in schema and "$ref" in schema:
            address, schema = self._target(address, schema["$ref"])
        return "description" in schema or "const" in schema or "enum" in schema

    def _list(self, name, document):
        for where, schema in _places(name, document):
            self._unseen.update((where, member) for member in schema.get("properties", {}))
            schema["$comment"] = where  # for _see

    def _see(self, address, schema, answer):
        if "$ref" in schema:
            self._see(*self._target(address, schema["$ref"]), answer)
        for branch in schema.get("anyOf", ()):
            if self._validator(address, branch).is_valid(answer):
                self._see(address, branch, answer)
        if isinstance(answer, list) and "items" in schema:
            for item in answer:
                self._see(address, schema["items"], item)
        if isinstance(answer, dict):
            for member in answer.keys() & schema.get("properties", {}).keys():
                self._unseen.discard((schema["$comment"], member))
                self._see(address, schema["properties"][member], answer[member])


def _places(where, schema):
    """All schemas in a schema, each with a name."""
    if isinstance(schema, dict):
        yield where, schema
        for key in ("properties", "$defs"):
            for name, inner in schema.get(key, {}).items():
                yield from _places(f"{where}/{name}", inner)
        for key in ("items", "additionalProperties"):
            yield from _places(where + "/" + key, schema.get(key))
        for number, inner in enumerate(schema.get("anyOf", ())):
            yield from _places(f"{where}/{number}", inner)
