#!/usr/bin/env python3
"""Calls qrxdeck on mesher's files, as a user does.

usage: mesh_test.py PROGRAM PROJECT [unittest options]
"""

import json
import math
import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

PROGRAM = pathlib.Path(sys.argv[1]).resolve()
PROJECT = pathlib.Path(sys.argv[2]).resolve()
MESHES = PROJECT / "tests" / "mesh_file" / "meshes"


def model_of(mesh):
    return {"format": "qrx-model/1", "models": {"Default Model": {
        "parts": {"P": {"mesh": mesh}}, "assembly": {"instances": {"P-1": {"part": "P"}}},
        "steps": [{"name": "Initial", "class": "kprC_InitialStep"}]}}}


class MeshTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrx-mesh-"))
        self.addCleanup(shutil.rmtree, self.folder)

    def run_program(self, *arguments):
        return subprocess.run([PROGRAM, *map(str, arguments)], cwd=self.folder, capture_output=True, text=True,
                              encoding="utf-8", timeout=120)

    def deck_of(self, mesh):
        (self.folder / "m.json").write_text(json.dumps(model_of(mesh)), encoding="utf-8")
        run = self.run_program("write", "m.json")
        self.assertEqual(run.returncode, 0, run.stderr)
        return (self.folder / "m.inp").read_bytes()

    def test_new_then_write_in_an_empty_folder_gives_a_deck(self):
        shutil.copy(PROJECT / "examples" / "bracket" / "bracket.msh", self.folder)
        run = self.run_program("new", "bracket.msh")
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        text = (self.folder / "bracket.json").read_text(encoding="utf-8")
        for words in ['surface "LOADED-FACE", 596 faces', 'node set "CLAMPED-FACE_NODES"', "PLACEHOLDER", '"file": "bracket.msh"',
                      'element set "ALL", 7829 elements']:
            self.assertIn(words, text)
        run = self.run_program("write", "bracket.json")
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        deck = (self.folder / "bracket.inp").read_text()
        for line in ["*Element, type=C3D10", "*Solid Section, elset=ALL, material=PLACEHOLDER", "*Surface, type=ELEMENT, name=LOADED-FACE",
                     "*Static", "*End Step"]:
            self.assertIn(line + "\n", deck)
        self.assertEqual(self.run_program("check", "bracket.json").stderr, "")

    def test_new_never_overwrites_without_force(self):
        shutil.copy(MESHES / "plate_41.msh", self.folder / "plate.msh")
        (self.folder / "plate.json").write_text("mine")
        run = self.run_program("new", "plate.msh")
        self.assertEqual((run.returncode, run.stderr), (3, "plate.json: error: the file is there already; --force overwrites it\n"))
        self.assertEqual((self.folder / "plate.json").read_text(), "mine")
        self.assertEqual(self.run_program("new", "plate.msh", "--force").returncode, 0)
        self.assertIn("HomogenousShellSection", (self.folder / "plate.json").read_text())

    def test_new_elsewhere_names_the_file_from_there_and_gives_each_solid_group_a_section(self):
        (self.folder / "deep").mkdir()
        shutil.copy(MESHES / "tets_41b.msh", self.folder)
        self.assertEqual(self.run_program("new", "tets_41b.msh", "-o", "deep/model.json").returncode, 0)
        text = (self.folder / "deep" / "model.json").read_text(encoding="utf-8")
        self.assertIn('"file": "../tets_41b.msh"', text)
        for group in ["Bloc à droite", "left block"]:
            self.assertIn(f'{{ "region": "{group}", "sectionName": "{group}" }}', text)
        run = self.run_program("write", "deep/model.json")
        self.assertEqual((run.returncode, run.stderr), (0, ""))

    def test_new_of_a_file_that_is_none_leaves_nothing(self):
        (self.folder / "x.msh").write_text("hello")
        run = self.run_program("new", "x.msh")
        self.assertEqual(run.returncode, 1)
        self.assertEqual(run.stderr, "x.msh: error: x.msh: the file begins with 'hello', expected a mesh as MSH, VTU, VTK, UNV, STL or MED [mesh-file]\n")
        self.assertEqual(sorted(os.listdir(self.folder)), ["x.msh"])

    def test_mesh_of_the_bracket_has_the_measures_of_its_geometry(self):
        run = self.run_program("mesh", PROJECT / "examples" / "bracket" / "bracket.msh", "--json")
        self.assertEqual(run.returncode, 0)
        mesh = json.loads(run.stdout)["mesh"]
        self.assertEqual((mesh["format"], mesh["nodes"], mesh["box"]["max"]), ("MSH 4.1, binary", 14117, [90.0, 60.0, 70.0]))
        solids = {cells["kind"]: cells for cells in mesh["cells"]}
        corner = 1 - math.pi / 4
        profile = 90 * 10 + 60 * 10 + corner * 8**2
        volume = profile * 60 - 10 * (4 * corner * 12**2 + math.pi * (2 * 5.5**2 + 10**2))
        # Straight edges cut round holes and fillets short.
        self.assertAlmostEqual(solids["tetra10"]["size"] / volume, 1, delta=2e-3)
        groups = {group["name"]: group for group in mesh["groups"]}
        self.assertAlmostEqual(groups["BORE"]["size"] / (2 * math.pi * 10 * 10), 1, delta=1e-2)
        self.assertEqual(groups["BOLTS"]["cells"], groups["BOLT-HOLE-1"]["cells"] + groups["BOLT-HOLE-2"]["cells"])
        self.assertEqual(sum(count["count"] for count in mesh["quality"].values()), 0)

    def test_one_mesh_gives_the_same_deck_through_every_format_that_keeps_groups(self):
        decks = {name: self.deck_of({"file": str(MESHES / name)})
                 for name in ["prisms_41.msh", "prisms_41b.msh", "prisms_22.msh", "prisms_22b.msh", "prisms.unv"]}
        self.assertEqual(len(set(decks.values())), 1)
        self.assertIn(b"*Surface, type=ELEMENT, name=base\n", decks["prisms.unv"])

    def test_a_mesh_file_that_changes_changes_the_deck(self):
        shutil.copy(MESHES / "prisms_41.msh", self.folder / "part.msh")
        first = self.deck_of({"file": "part.msh"})
        shutil.copy(MESHES / "tets_41.msh", self.folder / "part.msh")
        self.assertNotEqual(self.deck_of({"file": "part.msh"}), first)

    def test_an_instance_may_have_a_mesh_file_of_its_own(self):
        model = model_of({"file": str(MESHES / "prisms_41.msh")})
        model["models"]["Default Model"]["assembly"]["instances"]["P-2"] = {"part": "P", "mesh": {"file": str(MESHES / "tets_41.msh")}}
        (self.folder / "m.json").write_text(json.dumps(model))
        run = self.run_program("info", "m.json")
        self.assertEqual(run.returncode, 0, run.stderr)
        self.assertIn("own mesh: 157 nodes, 68 elements: 68 C3D10", run.stdout)
        self.assertIn("surface group 'fix holes'", run.stdout)
        self.assertIn("for /models/Default Model/assembly/instances/P-2/mesh", run.stdout)

    def test_check_tells_of_elements_inside_out_in_inline_meshes_too(self):
        mesh = {"nodes": {"labels": [1, 2, 3, 4], "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0], [0, 0, 1]]},
                "elements": [{"type": "C3D4", "labels": [7], "connectivity": [[1, 3, 2, 4]]}]}
        (self.folder / "m.json").write_text(json.dumps(model_of(mesh)))
        self.assertRegex(self.run_program("check", "m.json").stderr,
                         r"(?m)^m\.json:\d+:\d+: warning: "
                         r"1 element of negative or zero size: 7 \(/models/Default Model/parts/P/mesh\) \[inverted-elements\]$")

    def test_files_that_cant_be_read_end_in_one_message(self):
        os.mkfifo(self.folder / "pipe.msh")
        (self.folder / "folder.msh").mkdir()
        (self.folder / "cut.msh").write_bytes((MESHES / "tets_41b.msh").read_bytes()[:5000])
        for name, code in [("pipe.msh", 3), ("folder.msh", 3), ("none.msh", 3), ("cut.msh", 1)]:
            run = self.run_program("mesh", name)
            self.assertEqual((run.returncode, run.stderr.count("\n"), run.stdout), (code, 1, ""), run.stderr)
            (self.folder / "m.json").write_text(json.dumps(model_of({"file": name})))
            run = self.run_program("write", "m.json")
            self.assertEqual((run.returncode, run.stderr.count("\n")), (code, 1), run.stderr)

    def test_examples_with_mesh_files_have_decks(self):
        for name in ["bracket/bracket", "perforated_plate/perforated_plate", "bonded_blocks/bonded_blocks"]:
            run = self.run_program("write", PROJECT / "examples" / f"{name}.json")
            self.assertEqual(run.returncode, 0)
            self.assertNotRegex(run.stderr, "warning|error")
        deck = (self.folder / "bonded_blocks.inp").read_text()
        self.assertIn("*Tie, name=Bond, adjust=yes\nBLOCKS-1.ABOVE, BLOCKS-1.BELOW\n", deck)
        self.assertIn("*Elset, elset=RUBBER", deck)


if __name__ == "__main__":
    unittest.main(argv=[sys.argv[0], *sys.argv[3:]])
