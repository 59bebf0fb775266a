#!/usr/bin/env python3
"""Validates model files against the schema that qrxdeck prints, and checks that broken ones fail.

usage: check_schema.py QRXDECK SOURCE_FOLDER; exit code 77 when the package jsonschema is missing.
"""

import copy
import glob
import json
import os
import re
import subprocess
import sys

try:
    import jsonschema
except ImportError:
    print("python3-jsonschema is not installed")
    sys.exit(77)

STRING_OR_COMMENT = re.compile(r'"(?:[^"\\]|\\.)*"|//[^\n]*|/\*.*?\*/', re.S)


def load(path):
    with open(path, encoding="utf-8-sig") as file:
        text = file.read()
    return json.loads(STRING_OR_COMMENT.sub(lambda m: m.group() if m.group()[0] == '"' else " ", text))


def sample():
    return {
        "format": "qrx-model/1",
        "models": {
            "Default Model": {
                "datums": [{"name": "D"}],
                "parts": {
                    "P": {
                        "mesh": {
                            "nodes": {"labels": {"from": 1, "to": 2}, "coordinates": [[0, 0, 0], [1, 0, 0.5]]},
                            "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]}],
                            "sets": [
                                {"name": "A", "kind": "element", "labels": [1]},
                                {"name": "F", "kind": "surface", "facets": [[1, "END1"], [1, 1]]},
                            ],
                        },
                        "beamOrientations": [{"region": "A", "vector": [0, 0, 1]}],
                    }
                },
                "assembly": {"instances": {"I": {"part": "P", "translation": [1, 0, 0]}}},
                "timePoints": {"T": {"points": [[0], [1]]}},
                "steps": [{"name": "Initial", "class": "kprC_InitialStep", "solverInput": ["**"]}],
                "cyclicSymmetry": {"symmetryType": "cyclic", "numberOfSectors": 4},
            }
        },
    }


def broken():
    """Pairs of a description and the sample with that error."""

    def changed(text, change):
        document = copy.deepcopy(sample())
        change(document["models"]["Default Model"], document)
        return text, document

    return [
        changed("no format", lambda m, d: d.pop("format")),
        changed("another format", lambda m, d: d.update(format="qrx-model/9")),
        changed("unknown member of a model", lambda m, d: m.update(material={})),
        changed("number as text", lambda m, d: m.update(absoluteZero="0")),
        changed("unknown wave formulation", lambda m, d: m.update(waveFormulation="NO")),
        changed("datum without a name", lambda m, d: m["datums"][0].pop("name")),
        changed("axis of two numbers", lambda m, d: m["datums"][0].update(xAxis=[1, 0])),
        changed("range without an end", lambda m, d: m["parts"]["P"]["mesh"]["nodes"]["labels"].pop("to")),
        changed("unknown kind of set", lambda m, d: m["parts"]["P"]["mesh"]["sets"][0].update(kind="line")),
        changed("facet of three", lambda m, d: m["parts"]["P"]["mesh"]["sets"][1]["facets"][0].append(1)),
        changed("unknown field", lambda m, d: m["parts"]["P"]["beamOrientations"][0].update(axis=1)),
        changed("translation as text", lambda m, d: m["assembly"]["instances"]["I"].update(translation="x")),
        changed("flag as number", lambda m, d: m["timePoints"]["T"].update(generate=1)),
        changed("real as integer", lambda m, d: m["cyclicSymmetry"].update(numberOfSectors=1.5)),
        changed("step without a class", lambda m, d: m["steps"][0].pop("class")),
        changed("two lines in a name of a job", lambda m, d: m.update(globalJob="a\n*Step")),
        changed("number in a text of lines", lambda m, d: m["steps"][0].update(solverInput=["a", 1])),
    ]


def main():
    program, source = sys.argv[1:]
    schema = json.loads(subprocess.run([program, "schema"], check=True, stdout=subprocess.PIPE).stdout)
    jsonschema.Draft202012Validator.check_schema(schema)
    validator = jsonschema.Draft202012Validator(schema)

    failures = 0
    paths = sorted(glob.glob(os.path.join(source, "examples/**/*.json"), recursive=True))
    paths += sorted(glob.glob(os.path.join(source, "tests/decks/**/*.json"), recursive=True))
    good = [(path, load(path)) for path in paths] + [("the sample", sample())]
    for name, document in good:
        error = jsonschema.exceptions.best_match(validator.iter_errors(document))
        if error is not None:
            failures += 1
            print(f"{name}: /{'/'.join(map(str, error.absolute_path))}: {error.message[:300]}")
    for name, document in broken():
        if validator.is_valid(document):
            failures += 1
            print(f"{name}: the schema takes it")
    print(f"{len(good)} right and {len(broken())} wrong files, {failures} failures")
    return 1 if failures else 0


if __name__ == "__main__":
    sys.exit(main())
