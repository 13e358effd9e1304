#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Checks a JSON document against a schema, as far as schemas of ours go.

Usage: validate_json.py SCHEMA DOCUMENT
"""

import json
import sys

TYPES = {
    "object": dict,
    "array": list,
    "string": str,
    "integer": int,
    "boolean": bool,
    "number": (int, float),
    "null": type(None),
}


def complaints(value, schema, root, place):
    if "$ref" in schema:
        name = schema["$ref"].removeprefix("#/$defs/")
        yield from complaints(value, root["$defs"][name], root, place)
        return
    for several, fewest, most in (("anyOf", 1, None), ("oneOf", 1, 1)):
        if several in schema:
            fitting = sum(not list(complaints(value, one, root, place)) for one in schema[several])
            if fitting < fewest or (most is not None and fitting > most):
                yield f"{place}: fits {fitting} of {several}"
    if "const" in schema and value != schema["const"]:
        yield f"{place}: not {schema['const']}"
    if "enum" in schema and value not in schema["enum"]:
        yield f"{place}: not one of {schema['enum']}"
    if "type" in schema:
        is_bool = isinstance(value, bool) and schema["type"] == "integer"
        if is_bool or not isinstance(value, TYPES[schema["type"]]):
            yield f"{place}: no {schema['type']}"
            return
    if "minimum" in schema and value < schema["minimum"]:
        yield f"{place}: below {schema['minimum']}"
    if isinstance(value, dict):
        known = schema.get("properties", {})
        yield from (f"{place}: lacks {name}" for name in schema.get("required", []) if name not in value)
        for name, entry in value.items():
            if name in known:
                yield from complaints(entry, known[name], root, f"{place}.{name}")
            elif schema.get("additionalProperties") is False:
                yield f"{place}: has {name}"
    if isinstance(value, list):
        if not schema.get("minItems", 0) <= len(value) <= schema.get("maxItems", len(value)):
            yield f"{place}: {len(value)} entries"
        for i, entry in enumerate(value):
            yield from complaints(entry, schema["items"], root, f"{place}[{i}]")


def main():
    schema, document = (json.load(open(path, encoding="utf-8")) for path in sys.argv[1:3])
    found = list(complaints(document, schema, schema, "document"))
    if found:
        raise SystemExit("\n".join(found))


if __name__ == "__main__":
    main()
