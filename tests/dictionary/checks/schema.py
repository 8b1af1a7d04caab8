"""The files of the dictionary against their schema, and against the layout that keeps changes
small."""

import json
from pathlib import Path

import jsonschema

from generator import layout, load

from . import library


def run(_, __, folder):
    found = library.Findings()
    folder = Path(folder)
    schema = json.loads((folder / "schema.json").read_text(encoding="utf-8"))
    jsonschema.Draft7Validator.check_schema(schema)
    parts = json.loads((folder / "dictionary.json").read_text(encoding="utf-8"))["parts"]
    for part in ["dictionary", "schema"] + parts:
        text = (folder / f"{part}.json").read_text(encoding="utf-8")
        value = json.loads(text)
        found.expect(text == layout.text(value),
                     f"{part}.json is not laid out one line a row: dictionary/generate --layout")
        if part == "schema":
            continue
        rules = dict(schema, **{"$ref": f"#/definitions/{part}"})
        for error in jsonschema.Draft7Validator(rules).iter_errors(value):
            place = "/".join(map(str, error.absolute_path))
            found.expect(False, f"{part}.json, {place}: {error.message[:200]}")
    load.read(folder)
    return found.finish("schema")
