#!/usr/bin/env python3
"""The decks of studies, byte for byte those that `write` makes of the template with a row's values in it.

usage: decks_test.py PROGRAM [unittest options]
"""

import copy
import json
import shutil
import subprocess
import sys

from studies import FORCE, MODEL, MODEL_POINTER, ROOT, StudyTest, main, put


def at(place):
    return MODEL_POINTER + place


class Decks(StudyTest):
    def study_of(self, rows, model=MODEL, code=0, jobs=2):
        """Runs rows of values by pointer, and holds all decks against those of `write`."""
        self.write_model(model)
        table = self.write_lines(rows)
        self.study("template.json", table, "--out", "out", "--jobs", jobs, code=code)
        self.assert_decks_as_written("out", model, rows)

    def test_OneLoadVaries_DecksAreThoseOfWrite(self):
        self.study_of([{FORCE: value} for value in (1, -2.5, 1e-7, 123456.789, 0, -0.0, 1e300)])

    def test_ObjectsOfRepositoriesVary_DecksAreThoseOfWrite(self):
        self.study_of([
            {at("/materials/Steel/elastic/table/0/0"): 190000},
            {at("/materials/Steel/elastic/table/0"): [200000, 0.29]},
            {at("/materials/Steel/elastic/table"): [[200000, 0.29]], at("/materials/Steel/density/table/0/0"): 8e-9},
            {at("/sections/Bar/area"): 3},
            {at("/sections/Bar/materialName"): "Aluminium", at("/sections/Bar/area"): 4.25},
            {at("/amplitudes/Ramp/table"): [[0, 0], [0.5, 1], [1, 1]]},
            {at("/boundaryConditions/Fixed/states/Initial/u2"): None},
            {at("/boundaryConditions/Fixed/region"): "ENDS", FORCE: 8},
            {at("/loads/F/region"): "BAR-1.FOOT"},
            {at("/loads/G/suppressed"): True},
            {at("/loads/F/states/Pull/amplitude"): None},
        ])

    def test_TheTreeAndTheStepsVary_DecksAreThoseOfWrite(self):
        self.study_of([
            {at("/steps/1/timePeriod"): 2.5},
            {at("/steps/1/description"): "Pulls harder", FORCE: 200},
            {at("/steps/1/class"): "kprC_StaticLinearPerturbationStep"},
            {at("/assembly/instances/BAR-1/translation"): [1, 2, 3]},
            {at("/assembly/instances/BAR-1/translation/1"): 0},
            {at("/parts/BAR/mesh/nodes/coordinates/2/0"): 3.75},
            {at("/parts/BAR/mesh/nodes/coordinates/2"): [2.5, 0.5, 0]},
            {at("/parts/BAR/mesh/elements/0/type"): "T2D2"},
            {at("/parts/BAR/mesh/sets/2/labels/0"): 2},
            {at("/parts/BAR/mesh/sets/2/labels"): [2, 3]},
            {at("/parts/BAR/sectionAssignments/0/sectionName"): "Bar"},
            {at("/assembly/sets/0/members/0/labels"): [1, 2, 3]},
            {at("/datums/0/xAxis"): [1, 0, 0], at("/datums/0/yAxis"): [0, 1, 0]},
            {at("/topLevelSolverInput"): ["*Heading", "Another bar"]},
            {at("/topLevelSolverInput/1"): "A third bar"},
            {at("/loads/F/class"): "kloC_Moment"},
        ], code=1)

    def test_OneOfManyObjectsVaries_DecksAreThoseOfWrite(self):
        model = copy.deepcopy(MODEL)
        for i in range(50):
            model["models"]["Default Model"]["loads"][f"L{i}"] = {
                "class": "kloC_ConcentratedForce", "region": "BAR-1.TIP", "states": {"Pull": {"component1": i + 1}}}
        self.study_of([{at(f"/loads/L{i}/states/Pull/component1"): 1000 + i} for i in range(0, 50, 7)], model)

    def test_RowsThatAreWrong_FailAsWriteFails(self):
        self.study_of([
            {FORCE: "strong"},
            {FORCE: [1, 2]},
            {FORCE: 12},
            {at("/sections/Bar/materialName"): "Iron"},
            {at("/sections/Bar/class"): "kseC_Truss"},
            {at("/loads/F/region"): "BAR-1.TOP"},
            {at("/steps/1/name"): "Push"},
            {at("/steps/1/timePeriod"): "long"},
            {at("/parts/BAR/mesh/sets/2/labels"): [4]},
            {at("/assembly/instances/BAR-1/part"): "BEAM"},
            {at("/materials/Steel/elastic/table"): [[1, 2], [3]]},
            {FORCE: 13},
        ], code=1)

    def test_WarningsOfARow_StandInItsLine_ThoseOfTheTemplateDont(self):
        self.study_of([{at("/materials/Steel/elastic/table/0/1"): 0.7},
                       {at("/parts/BAR/mesh/nodes/coordinates/1"): [0, 0, 0]},
                       {FORCE: 3}])
        lines = self.ledger("out")
        self.assertEqual([f["code"] for f in lines[1]["findings"]], ["poisson-ratio"])
        self.assertNotEqual(lines[2]["findings"], [])
        self.assertEqual(lines[3]["findings"], [])

    def test_WhatTheTemplateIgnores_IsToldOfNoRow(self):
        model = copy.deepcopy(MODEL)
        model["models"]["Default Model"]["ignore"] = [{"code": "poisson-ratio", "reason": "auxetic"},
                                                      {"code": "unused", "reason": "our library"}]
        self.write_model(model)
        self.write_lines([{at("/materials/Steel/elastic/table/0/1"): 0.7}])
        run = self.study("template.json", "table.jsonl", "--out", "out")
        self.assertNotIn("[unused]", run.stderr)
        self.assertEqual(self.ledger("out")[1]["findings"], [])

    def test_PointerWithEscapesAndNamesWithSlashes_FindsItsPlace(self):
        model = copy.deepcopy(MODEL)
        loads = model["models"]["Default Model"]["loads"]
        loads["a/b~c"] = loads.pop("F")
        self.study_of([{at("/loads/a~1b~0c/states/Pull/component1"): 4}], model)

    def test_OtherModelsOfTheFile_AreLeftAlone(self):
        model = copy.deepcopy(MODEL)
        model["models"]["Other"] = copy.deepcopy(MODEL["models"]["Default Model"])
        self.study_of([{FORCE: 4}, {"/models/Other/loads/F/states/Pull/component1": 4},
                       {"/models/Other/loads/F/states/Pull/component1": "x"}], model, code=1)

    def test_MeshFilesVary_DecksAreThoseOfWrite(self):
        plate = ROOT / "examples" / "perforated_plate"
        first = (plate / "plate.unv").read_text()
        (self.folder / "a.unv").write_text(first)
        # Another plate: the same nodes, wider.
        (self.folder / "b.unv").write_text(first)
        shutil.copy(ROOT / "examples/bonded_blocks/blocks.msh", self.folder / "blocks.msh")
        text = (plate / "perforated_plate.json").read_text()
        model = json.loads("\n".join(line.split("//")[0] if line.lstrip().startswith("//") else line
                                     for line in text.splitlines()))
        (part, body), = model["models"]["Default Model"]["parts"].items()
        body["mesh"]["file"] = "a.unv"
        body["mesh"]["scale"] = 1.0
        file, scale = at(f"/parts/{part}/mesh/file"), at(f"/parts/{part}/mesh/scale")
        self.study_of([{file: "a.unv"}, {file: "b.unv", scale: 2.0}, {scale: 0.5}, {file: "a.unv", scale: 2.0},
                       {file: "none.unv"}, {file: "blocks.msh"}, {file: "b.unv", scale: 2}, {scale: -1}],
                      model, code=1)

    def test_Bracket_TwoThreads_DecksAreThoseOfWrite(self):
        for name in ("bracket.json", "bracket.msh"):
            shutil.copy(ROOT / "examples/bracket" / name, self.folder / name)
        text = "\n".join(line for line in (self.folder / "bracket.json").read_text().splitlines()
                         if not line.lstrip().startswith("//"))
        model = json.loads(text)
        self.study_of([row for i in range(4) for row in (
            {at("/loads/Push/states/Bend/component3"): -50 - i},
            {at("/materials/Aluminium/elastic/table/0/0"): 70000 + i, at("/steps/4/frequencies/0/points"): 40 + i},
            {at("/assembly/instances/BRACKET-1/rotation"): [0, 0, 0.1 * i]})], model)

    def test_AllModelsOfTheExamples_UnchangedRow_IsTheDeckOfWrite(self):
        for folder, name in (("assembly", "assembly"), ("bolted_joint", "bolted_joint"), ("materials", "materials"),
                             ("thermo_mechanical", "thermo_mechanical")):
            with self.subTest(name):
                model = json.loads("\n".join(
                    line for line in (ROOT / "examples" / folder / (name + ".json")).read_text().splitlines()
                    if not line.lstrip().startswith("//")))
                default = model["models"]["Default Model"]
                default.setdefault("description", "")
                rows = [{at("/description"): "The same"}]
                for container in ("materials", "sections", "loads", "boundaryConditions", "interactions"):
                    for object_name, record in default.get(container, {}).items():
                        pointer = object_name.replace("~", "~0").replace("/", "~1")
                        for key, value in record.items():
                            if key not in ("class", "states") and not isinstance(value, dict):
                                rows.append({at(f"/{container}/{pointer}/{key}"): value})
                self.write_model(model)
                self.study("template.json", self.write_lines(rows), "--out", name + "-out")
                deck, _ = self.written(model)
                for line in self.ledger(name + "-out").values():
                    self.assertEqual(self.deck(name + "-out", line), deck, line["parameters"])

    def test_ExampleOfAPlate_200Decks_EveryTwentiethIsThatOfWrite(self):
        example = ROOT / "examples/plate_study"
        for name in ("plate_study.json", "make_study.py"):
            shutil.copy(example / name, self.folder / name)
        subprocess.run([sys.executable, self.path("make_study.py"), str(self.folder)], check=True)
        self.study("plate_study.json", "plates.csv")
        lines = self.ledger("plates")
        self.assertEqual(len(lines), 200)
        self.assertEqual(len({line["sha256"] for line in lines.values()}), 200)
        loads = sorted(line["parameters"]["load"] for line in lines.values())
        # A Latin hypercube: one value in each part of the range.
        for part, load in enumerate(loads):
            self.assertAlmostEqual(load, 0.0005 + 0.0045 * (part + 0.5) / 200, delta=0.0045 / 400 + 1e-6)
        model = json.loads("\n".join(line for line in (self.folder / "plate_study.json").read_text().splitlines()
                                     if not line.lstrip().startswith("//")))
        for row in range(1, 201, 20):
            changed = copy.deepcopy(model)
            for name, value in lines[row]["parameters"].items():
                put(changed, model["parameters"][name]["pointers"], value)
            self.assertEqual(self.deck("plates", lines[row]), self.written(changed)[0])

    def test_Parameters_StandForTheirPointers(self):
        model = copy.deepcopy(MODEL)
        model["parameters"] = {
            "force": {"pointers": FORCE, "unit": "N", "limits": "> 0, <= 1e6", "description": "pull"},
            "stiffness": {"pointers": [at("/materials/Steel/elastic/table/0/0"),
                                       at("/materials/Aluminium/elastic/table/0/0")]},
            "time": at("/steps/1/timePeriod")}
        self.write_model(model)
        table = self.write_csv(["force", "stiffness", "time"], [[5, 1000, 1], [6.5, 2000, 2]])
        self.study("template.json", table, "--out", "out")
        rows = [{FORCE: f, at("/materials/Steel/elastic/table/0/0"): s,
                 at("/materials/Aluminium/elastic/table/0/0"): s, at("/steps/1/timePeriod"): t}
                for f, s, t in ((5, 1000, 1), (6.5, 2000, 2))]
        self.assert_decks_as_written("out", model, rows)
        self.assertEqual(self.ledger("out")[2]["parameters"], {"force": 6.5, "stiffness": 2000, "time": 2})

    def test_CsvTsvAndJsonLines_GiveTheSameDecks(self):
        self.write_model()
        description = at("/steps/1/description")
        translation = at("/assembly/instances/BAR-1/translation")
        rows = [[10, "Zug, \"fest\" – größer", [0, 0, 1.5]], [-2.5, "a\\b", [1, 2, 3]]]
        header = [FORCE, description, translation]
        decks = []
        for name, table in (("csv", self.write_csv(header, rows)),
                            ("tsv", self.write_csv(header, rows, "table.tsv", "\t")),
                            ("crlf", self.write_csv(header, rows, "crlf.csv", lineterminator="\r\n")),
                            ("json", self.write_lines([dict(zip(header, row)) for row in rows]))):
            self.study("template.json", table, "--out", name)
            decks.append([self.deck(name, line) for _, line in sorted(self.ledger(name).items())])
        self.assertEqual(decks[0], decks[1])
        self.assertEqual(decks[0], decks[2])
        self.assertEqual(decks[0], decks[3])
        changed = copy.deepcopy(MODEL)
        for pointer, value in zip(header, rows[0]):
            put(changed, pointer, value)
        self.assertEqual(decks[0][0], self.written(changed)[0])

    def test_CellsOfCsv_AreJsonOrElseText(self):
        self.write_model()
        description = at("/steps/1/description")
        (self.folder / "table.csv").write_text(
            "\ufeff" + f"{description},{FORCE}\n\n\"plain, text\",1\n\"\"\"7\"\"\", 2 \n\"two\nlines\",3\n7,4\n")
        self.study("template.json", "table.csv", "--out", "out", code=1)
        lines = self.ledger("out")
        self.assertEqual(lines[1]["parameters"], {description: "plain, text", FORCE: 1})
        self.assertEqual(lines[2]["parameters"], {description: "7", FORCE: 2})
        self.assertEqual(lines[3]["parameters"][description], "two\nlines")
        self.assertEqual(lines[4]["error"][0]["column"], description)
        self.assertEqual(lines[4]["error"][0]["text"], "found 7, expected a string")

    def test_ColumnNamedName_NamesTheDecks(self):
        self.write_model()
        table = self.write_csv(["name", FORCE], [["Größe 1", 5], ["007", 6], ["b.c", 7]])
        self.study("template.json", table, "--out", "out")
        self.assertEqual(self.decks_in("out"), ["007.inp", "Größe 1.inp", "b.c.inp"])
        self.assertEqual(self.ledger("out")[2]["name"], "007")

    def test_MoreThanAThousandRows_NoFolderHasMoreThanAThousandDecks(self):
        self.write_model()
        table = self.write_csv([FORCE], [[i + 1] for i in range(2001)])
        self.study("template.json", table, "--out", "out")
        decks = self.decks_in("out")
        self.assertEqual(len(decks), 2001)
        self.assertEqual(decks[0], "000/0001.inp")
        self.assertEqual(decks[1000], "001/1001.inp")
        self.assertEqual(decks[2000], "002/2001.inp")

    def test_ModelFileWithParameters_IsStillAModelFile(self):
        model = copy.deepcopy(MODEL)
        model["parameters"] = {"force": {"pointers": FORCE, "limits": "0 .. 10", "unit": "kN"}}
        deck, _ = self.written(model)
        self.assertEqual(deck, self.written(MODEL)[0])
        self.write_model(model)
        formatted = json.loads(self.run_program("format", "template.json").stdout)
        self.assertEqual(formatted["parameters"], model["parameters"])


if __name__ == "__main__":
    main()
