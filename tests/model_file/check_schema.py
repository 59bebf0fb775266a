#!/usr/bin/env python3
"""Validates model files and the schema's own examples against the schema that qrxdeck prints, and checks that
broken files fail at the member that is broken.

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
        "$schema": "./model.schema.json",
        "format": "qrx-model/1",
        "models": {
            "Plate": {
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
                "sections": {"S": {"class": "kseC_TrussSection", "materialName": "M", "area": 2}},
                "steps": [
                    {"name": "Initial", "class": "kprC_InitialStep", "solverInput": ["**"]},
                    {"name": "Pull", "class": "static", "nlgeom": "on", "amplitude": 1, "maxNumInc": 10},
                ],
                "loads": {
                    "F": {"class": "PointForce", "region": ["I.A", "I.B"], "states": {"Pull": {"component1": 5}}},
                    "P": {"class": "PRESSURE", "states": {"Pull": {"magnitude": {"value": 1, "state": "SET"}}}},
                },
                "interactions": {
                    "C": {
                        "class": "GeneralContact",
                        "states": {"Pull": {"propertyAssignments": [{"first": "I.F", "property": "P"}]}},
                    }
                },
                "cyclicSymmetry": {"symmetryType": "cyclic", "numberOfSectors": 4},
            }
        },
    }


def broken():
    """Triples of a description, the sample with that error, and the place where it is."""

    def changed(text, place, change):
        document = copy.deepcopy(sample())
        change(document["models"]["Plate"], document)
        return text, document, place

    in_model = "/models/Plate"
    mesh = in_model + "/parts/P/mesh"
    return [
        changed("no format", "", lambda m, d: d.pop("format")),
        changed("another format", "/format", lambda m, d: d.update(format="qrx-model/9")),
        changed("schema as number", "/$schema", lambda m, d: d.update({"$schema": 1})),
        changed("no model", "/models", lambda m, d: d["models"].clear()),
        changed("unknown member of a model", in_model, lambda m, d: m.update(material={})),
        changed("number as text", in_model + "/absoluteZero", lambda m, d: m.update(absoluteZero="0")),
        changed("unknown wave formulation", in_model + "/waveFormulation", lambda m, d: m.update(waveFormulation="NO")),
        changed("datum without a name", in_model + "/datums/0", lambda m, d: m["datums"][0].pop("name")),
        changed("axis of two numbers", in_model + "/datums/0/xAxis", lambda m, d: m["datums"][0].update(xAxis=[1, 0])),
        changed("range without an end", mesh + "/nodes/labels",
                lambda m, d: m["parts"]["P"]["mesh"]["nodes"]["labels"].pop("to")),
        changed("unknown kind of set", mesh + "/sets/0/kind",
                lambda m, d: m["parts"]["P"]["mesh"]["sets"][0].update(kind="line")),
        changed("facet of three", mesh + "/sets/1/facets/0",
                lambda m, d: m["parts"]["P"]["mesh"]["sets"][1]["facets"][0].append(1)),
        changed("unknown field", in_model + "/parts/P/beamOrientations/0",
                lambda m, d: m["parts"]["P"]["beamOrientations"][0].update(axis=1)),
        changed("translation as text", in_model + "/assembly/instances/I/translation",
                lambda m, d: m["assembly"]["instances"]["I"].update(translation="x")),
        changed("flag as number", in_model + "/timePoints/T/generate", lambda m, d: m["timePoints"]["T"].update(generate=1)),
        changed("real as integer", in_model + "/cyclicSymmetry/numberOfSectors",
                lambda m, d: m["cyclicSymmetry"].update(numberOfSectors=1.5)),
        changed("step without a class", in_model + "/steps/0", lambda m, d: m["steps"][0].pop("class")),
        changed("unknown class", in_model + "/steps/1/class", lambda m, d: m["steps"][1].update({"class": "Statik"})),
        changed("class of another place", in_model + "/loads/F/class",
                lambda m, d: m["loads"]["F"].update({"class": "Displacement"})),
        changed("unknown word", in_model + "/steps/1/nlgeom", lambda m, d: m["steps"][1].update(nlgeom="MAYBE")),
        changed("unknown number of a word", in_model + "/steps/1/amplitude", lambda m, d: m["steps"][1].update(amplitude=7)),
        changed("number as a text in a step", in_model + "/steps/1/initialInc",
                lambda m, d: m["steps"][1].update(initialInc="small")),
        changed("unknown member of a step", in_model + "/steps/1", lambda m, d: m["steps"][1].update(period=1)),
        changed("unknown member of a state", in_model + "/loads/P/states/Pull",
                lambda m, d: m["loads"]["P"]["states"]["Pull"].update(pressure=1)),
        changed("member of another class", in_model + "/sections/S", lambda m, d: m["sections"]["S"].update(thickness=1)),
        changed("several regions of a pressure", in_model + "/loads/P/region",
                lambda m, d: m["loads"]["P"].update(region=["I.F", "I.G"])),
        changed("pair without its property", in_model + "/interactions/C/states/Pull/propertyAssignments/0",
                lambda m, d: m["interactions"]["C"]["states"]["Pull"]["propertyAssignments"][0].pop("property")),
        changed("a name of 81 characters", in_model + "/loads", lambda m, d: m["loads"].update({"L" * 81: m["loads"]["P"]})),
        changed("a reference of 81 characters", in_model + "/sections/S/materialName",
                lambda m, d: m["sections"]["S"].update(materialName="M" * 81)),
        changed("two lines in a name of a job", in_model + "/globalJob", lambda m, d: m.update(globalJob="a\n*Step")),
        changed("number in a text of lines", in_model + "/steps/0/solverInput",
                lambda m, d: m["steps"][0].update(solverInput=["a", 1])),
    ]


def places(errors):
    """Where errors are, those within alternatives included."""
    for error in errors:
        yield "".join(f"/{token}" for token in error.absolute_path)
        yield from places(error.context)


def main():
    program, source = sys.argv[1:]
    text = subprocess.run([program, "schema"], check=True, stdout=subprocess.PIPE).stdout
    schema = json.loads(text)
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
    for name, document, place in broken():
        errors = list(validator.iter_errors(document))
        best = jsonschema.exceptions.best_match(errors)
        found = "" if best is None else "".join(f"/{token}" for token in best.absolute_path)
        # Of a value that fits none of several forms, the validator may name what is in it.
        if best is None or not found.startswith(place) or place not in places(errors):
            failures += 1
            print(f"{name}: {'the schema takes it' if best is None else f'told at {found}, not at {place}'}")
    examples = 0
    for name, definition in schema["$defs"].items():
        one = jsonschema.Draft202012Validator({"$defs": schema["$defs"], "$ref": f"#/$defs/{name}"})
        for example in definition.get("examples", []):
            examples += 1
            error = jsonschema.exceptions.best_match(one.iter_errors(example))
            if error is not None:
                failures += 1
                print(f"example of {name}: /{'/'.join(map(str, error.absolute_path))}: {error.message[:300]}")
    print(f"{len(good)} right and {len(broken())} wrong files, {examples} examples, {len(text)} bytes: {failures} failures")
    return 1 if failures else 0


if __name__ == "__main__":
    sys.exit(main())
