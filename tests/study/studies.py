"""What the tests of studies share: a small model, tables, runs of the program, ledgers."""

import copy
import csv
import hashlib
import io
import json
import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

PROGRAM = os.path.abspath(sys.argv.pop(1)) if len(sys.argv) > 1 else None
ROOT = pathlib.Path(__file__).resolve().parents[2]
MODEL_POINTER = "/models/Default Model"

# A bar of two elements with a part for each kind of place that a row can change.
MODEL = {
    "format": "qrx-model/1",
    "models": {
        "Default Model": {
            "topLevelSolverInput": ["*Heading", "A bar"],
            "datums": [{"name": "Turned", "xAxis": [0, 1, 0], "yAxis": [-1, 0, 0]}],
            "parts": {
                "BAR": {
                    "mesh": {
                        "nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [2.5, 0, 0]]},
                        "elements": [{"type": "T3D2", "labels": [1, 2], "connectivity": [[1, 2], [2, 3]]}],
                        "sets": [{"name": "ALL", "kind": "element", "labels": [1, 2]},
                                 {"name": "FOOT", "kind": "node", "labels": [1]},
                                 {"name": "TIP", "kind": "node", "labels": [3]}],
                    },
                    "sectionAssignments": [{"region": "ALL", "sectionName": "Bar"}],
                }
            },
            "assembly": {"instances": {"BAR-1": {"part": "BAR", "translation": [0, 1, 0]}},
                         "sets": [{"name": "ENDS", "kind": "node",
                                   "members": [{"instance": "BAR-1", "labels": [1, 3]}]}]},
            "materials": {"Steel": {"elastic": {"table": [[210000, 0.3]]}, "density": {"table": [[7.85e-09]]}},
                          "Aluminium": {"elastic": {"table": [[70000, 0.33]]}}},
            "sections": {"Bar": {"class": "kseC_TrussSection", "materialName": "Steel", "area": 2.5}},
            "amplitudes": {"Ramp": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]}},
            "steps": [{"name": "Initial", "class": "kprC_InitialStep"},
                      {"name": "Pull", "class": "kprC_StaticStep", "description": "Pulls", "timePeriod": 1.0},
                      {"name": "Hold", "class": "kprC_StaticStep"}],
            "boundaryConditions": {"Fixed": {"class": "kbcC_DisplacementBC", "region": "BAR-1.FOOT",
                                             "states": {"Initial": {"u1": 0, "u2": 0, "u3": 0}}}},
            "loads": {"F": {"class": "kloC_ConcentratedForce", "region": "BAR-1.TIP",
                            "states": {"Pull": {"component1": 100, "component3": -5, "amplitude": "Ramp"}}},
                      "G": {"class": "kloC_ConcentratedForce", "region": "ENDS", "suppressed": False,
                            "states": {"Hold": {"component2": 7}}}},
        }
    },
}
FORCE = MODEL_POINTER + "/loads/F/states/Pull/component1"


def tokens_of(pointer):
    return [token.replace("~1", "/").replace("~0", "~") for token in pointer.split("/")[1:]]


def put(model, pointer, value):
    """Changes the value at a JSON pointer."""
    *way, last = tokens_of(pointer)
    at = model
    for token in way:
        at = at[int(token)] if isinstance(at, list) else at[token]
    if isinstance(at, list):
        at[int(last)] = value
    else:
        at[last] = value


def cell_of(value):
    return value if isinstance(value, str) else json.dumps(value)


class StudyTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrxdeck-study-"))
        self.addCleanup(shutil.rmtree, self.folder, ignore_errors=True)

    def path(self, name):
        return str(self.folder / name)

    def write_model(self, model=None, name="template.json"):
        (self.folder / name).write_text(json.dumps(MODEL if model is None else model))
        return name

    def write_csv(self, header, rows, name="table.csv", delimiter=",", **options):
        with open(self.folder / name, "w", newline="", encoding="utf-8") as file:
            writer = csv.writer(file, delimiter=delimiter, **options)
            writer.writerow(header)
            writer.writerows([cell_of(value) for value in row] for row in rows)
        return name

    def write_lines(self, rows, name="table.jsonl"):
        (self.folder / name).write_text("".join(json.dumps(row) + "\n" for row in rows))
        return name

    def run_program(self, *arguments, **options):
        return subprocess.run([PROGRAM, *map(str, arguments)], cwd=self.folder, stdout=subprocess.PIPE,
                              stderr=subprocess.PIPE, text=True, timeout=300, check=False, **options)

    def study(self, *arguments, code=0, **options):
        run = self.run_program("study", *arguments, **options)
        self.assertEqual(run.returncode, code, run.stdout + run.stderr)
        return run

    def ledger(self, folder, name="study.jsonl"):
        """The lines by row; each row has one."""
        lines = [json.loads(line) for line in (self.folder / folder / name).read_text().splitlines()]
        by_row = {line["row"]: line for line in lines}
        self.assertEqual(len(by_row), len(lines), "a row has two lines")
        return by_row

    def deck(self, folder, line):
        """The bytes of the deck, which are those that the ledger's line tells of."""
        data = (self.folder / folder / line["deck"]).read_bytes()
        self.assertEqual(len(data), line["bytes"])
        self.assertEqual(hashlib.sha256(data).hexdigest(), line["sha256"])
        return data

    def decks_in(self, folder):
        return sorted(str(path.relative_to(self.folder / folder)) for path in (self.folder / folder).rglob("*.inp"))

    def written(self, model):
        """The deck, or what is said against it, that `write` gives for a model."""
        name = "written.json"
        (self.folder / name).write_text(json.dumps(model))
        deck = self.folder / "written.inp"
        deck.unlink(missing_ok=True)
        run = self.run_program("write", name, "--json")
        return (deck.read_bytes() if run.returncode == 0 else None), json.loads(run.stdout)["messages"]

    def assert_decks_as_written(self, folder, model, rows, ledger=None):
        """Each row's deck and findings are those of `write` for the template with the row's values.

        Rows are objects of values by pointer."""
        lines = self.ledger(folder) if ledger is None else ledger
        _, common = self.written(model)
        told = {(m["code"], m["pointer"], m["text"]) for m in common}
        for number, row in enumerate(rows, 1):
            changed = copy.deepcopy(model)
            for pointer, value in row.items():
                put(changed, pointer, value)
            deck, messages = self.written(changed)
            line = lines[number]
            if deck is None:
                self.assertIn("error", line, f"row {number}: {row}")
                expected = [(m.get("pointer", ""), m["text"]) for m in messages if m.get("severity") == "error"
                            and "context" not in m]
                if expected:
                    self.assertEqual([(e.get("pointer", ""), e["text"]) for e in line["error"]], expected[:20])
                continue
            self.assertNotIn("error", line, f"row {number}: {row}")
            self.assertEqual(self.deck(folder, line), deck, f"row {number}: {row}")
            own = [(m["code"], m["pointer"], m["text"]) for m in messages
                   if (m["code"], m["pointer"], m["text"]) not in told]
            got = [(f["code"], f["pointer"], f["text"]) for f in line["findings"]]
            self.assertEqual(sorted(got), sorted(own), f"row {number}: {row}")


def main():
    unittest.main()
