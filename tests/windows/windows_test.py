#!/usr/bin/env python3
"""Runs what was built for Windows under Wine, and compares every golden deck to the byte.

usage: windows_test.py REPOSITORY BUILD ZIP
"""

import json
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile
import unittest
import zipfile

REPOSITORY = pathlib.Path(sys.argv[1]).resolve()
sys.path.insert(0, str(REPOSITORY / "tests/programs"))
import two_instances_test  # noqa: E402
BUILD = pathlib.Path(sys.argv[2]).resolve()
ARCHIVE = pathlib.Path(sys.argv[3]).resolve()
SYSTEM_LIBRARIES = {"advapi32.dll", "kernel32.dll", "msvcrt.dll", "shell32.dll", "bcrypt.dll", "user32.dll"}
# The program itself, where Debian has it; the script ahead of it talks of what is missing.
WINE = next((path for path in ("/usr/lib/wine/wine64", shutil.which("wine64"), shutil.which("wine"))
             if path and os.path.exists(path)), "wine64")

# A rod, held at one end.
ROD = """{ "format": "qrx-model/1",
  "models": { "Default Model": {
    "topLevelSolverInput": ["*Heading", "A rod"],
    "parts": { "ROD": {
      "mesh": {
        "nodes": { "labels": [1, 2], "coordinates": [[0, 0, 0], [100, 0, 0]] },
        "elements": [ { "type": "T3D2", "labels": [1], "connectivity": [[1, 2]] } ],
        "sets": [ { "name": "ALL", "kind": "element", "labels": [1] } ] },
      "sectionAssignments": [ { "region": "ALL", "sectionName": "Round" } ] } },
    "assembly": { "instances": { "ROD-1": { "part": "ROD" } } },
    "sections": { "Round": { "class": "kseC_TrussSection", "materialName": "Steel", "area": 78.5 } },
    "materials": { "Steel": { "elastic": { "table": [[210000, 0.3]] } } },
    "steps": [ { "name": "Initial", "class": "kprC_InitialStep" }, { "name": "Pull", "class": "kprC_StaticStep" } ] } } }
"""


class Windows(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.scratch = pathlib.Path(cls.enterClassContext(tempfile.TemporaryDirectory(ignore_cleanup_errors=True)))
        cls.environment = {**os.environ, "WINEPREFIX": str(cls.scratch / "prefix"), "WINEDEBUG": "-all",
                           "WINEDLLOVERRIDES": "mscoree,mshtml=", "WINEARCH": "win64"}
        cls.environment.pop("DISPLAY", None)
        # One that goes on between the programs makes each of them start at once.
        subprocess.run([WINE, "wineboot", "--init"], env=cls.environment, check=True, capture_output=True, timeout=300)
        cls.addClassCleanup(subprocess.run, [shutil.which("wineserver") or "/usr/lib/wine/wineserver", "-k"],
                            env=cls.environment)
        # The program alone, as it is in the archive.
        with zipfile.ZipFile(ARCHIVE) as archive:
            names = archive.namelist()
            cls.programs = [name for name in names if name.endswith((".exe", ".dll"))]
            archive.extractall(cls.scratch / "alone")
        cls.program = cls.scratch / "alone" / cls.programs[0]
        os.chmod(cls.program, 0o755)

    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(dir=self.scratch))

    def run_there(self, *words, program=None, text=None, seconds=120):
        return subprocess.run([WINE, program or self.program, *map(str, words)], cwd=self.folder, input=text,
                              env=self.environment, capture_output=True, timeout=seconds)

    def run_batch(self, lines):
        """Many runs of the program in one start of the command interpreter."""
        batch = self.folder / "all.bat"
        batch.write_text("\r\n".join(["@echo off", *lines, ""]), encoding="ascii")
        done = subprocess.run([WINE, "cmd", "/c", "all.bat"], cwd=self.folder, env=self.environment, capture_output=True,
                              timeout=1200)
        return done.stdout.decode(errors="replace") + done.stderr.decode(errors="replace")

    @staticmethod
    def windows_path(path):
        return "Z:" + str(path).replace("/", "\\")

    def test_Archive_HasTheProgramAlone(self):
        self.assertEqual([pathlib.Path(name).name for name in self.programs], ["qrxdeck.exe"])
        imports = subprocess.run(["x86_64-w64-mingw32-objdump", "-p", self.program], capture_output=True, text=True,
                                 check=True).stdout
        needed = {name.lower() for name in re.findall(r"DLL Name: (\S+)", imports)}
        self.assertLessEqual(needed, SYSTEM_LIBRARIES)

    def test_GoldenDecks_AreTheSameToTheByte(self):
        pairs = sorted(model for folder in ("tests/decks", "examples") for model in (REPOSITORY / folder).rglob("*.json")
                       if model.with_suffix(".inp").exists())
        self.assertGreater(len(pairs), 120)
        output = self.run_batch(f'"{self.windows_path(self.program)}" write "{self.windows_path(model)}" --job {number}'
                                for number, model in enumerate(pairs))
        different = []
        for number, model in enumerate(pairs):
            deck = self.folder / f"{number}.inp"
            if not deck.exists() or deck.read_bytes() != model.with_suffix(".inp").read_bytes():
                different.append(model.name)
        self.assertEqual(different, [], output[-2000:])
        print(f"{len(pairs)} decks are the same", file=sys.stderr)

    def test_GoldenDecksOfAllWays_AreTheSameToTheByte(self):
        """Through a buffer of one byte, from copies, from the model written back, twice, from shuffled members."""
        done = self.run_there("--gtest_brief=1", program=BUILD / "tests/decks/qrx_deck_tests.exe", seconds=1200)
        passed = re.search(rb"\[  PASSED  \] (\d+) tests", done.stdout)
        self.assertEqual((done.returncode, passed is not None), (0, True), (done.stdout + done.stderr)[-3000:])
        self.assertGreater(int(passed[1]), 780)
        print(f"{int(passed[1])} tests of decks pass", file=sys.stderr)

    def test_ModelsOfMeshersFiles_AreReadAndWritten(self):
        meshes = [mesh for mesh in sorted((REPOSITORY / "tests/mesh_file/meshes").iterdir())
                  if mesh.suffix in (".msh", ".unv", ".vtk", ".stl")][:12]
        self.assertGreater(len(meshes), 6)
        self.run_batch(line for number, mesh in enumerate(meshes) for line in (
            f'"{self.windows_path(self.program)}" mesh "{self.windows_path(mesh)}" --json > {number}.json',))
        for number, mesh in enumerate(meshes):
            text = (self.folder / f"{number}.json").read_bytes()
            self.assertNotIn(b"\r", text)
            self.assertIn("exitCode", json.loads(text), mesh.name)

    def test_WhatIsLeftOut_SaysSo(self):
        vtu = next((REPOSITORY / "tests/mesh_file/meshes").glob("*.vtu"))
        done = self.run_there("mesh", self.windows_path(vtu))
        self.assertNotEqual(done.returncode, 0)
        self.assertIn(b"built without pugixml and zlib", done.stderr)
        self.put_rod("model.json")
        done = self.run_there("view", "model.json")
        if done.returncode != 0:
            self.assertIn(b"built without the page", done.stderr)

    def put_rod(self, name):
        (self.folder / name).write_text(ROD, encoding="utf-8", newline="\n")

    def test_NamesOfAllLanguages_AreKept(self):
        name = "Träger 梁 Балка"
        (self.folder / name).mkdir()
        self.put_rod(f"{name}/{name}.json")
        done = self.run_there("write", f"{name}/{name}.json", "--output-dir", name)
        self.assertEqual(done.returncode, 0, done.stderr)
        self.assertEqual(sorted(path.name for path in (self.folder / name).iterdir()), [f"{name}.inp", f"{name}.json"])
        self.assertIn(name.encode(), done.stdout)
        done = self.run_there("check", f"{name}/{name}.inp")
        self.assertEqual(done.returncode, 0, done.stderr)
        done = self.run_there("check", f"{name}/keins.json")
        self.assertEqual(done.returncode, 3)
        self.assertIn(name.encode(), done.stderr)
        self.assertNotIn(b"\r", done.stderr)

    def test_OldDeck_IsReplacedOrStays(self):
        self.put_rod("rod.json")
        (self.folder / "rod.inp").write_text("old")
        self.assertEqual(self.run_there("write", "rod.json").returncode, 0)
        deck = (self.folder / "rod.inp").read_bytes()
        self.assertTrue(deck.startswith(b"*Heading\n"))
        # What a killed run left goes with the next one.
        (self.folder / ".qrxdeck-abcdefghijkl").mkdir()
        (self.folder / ".qrxdeck-abcdefghijkl" / "deck.inp").write_text("half")
        model = (self.folder / "rod.json").read_text(encoding="utf-8")
        (self.folder / "wrong.json").write_text(model.replace('"part": "ROD"', '"part": "ROT"'), encoding="utf-8")
        self.assertEqual(self.run_there("write", "wrong.json", "--job", "rod").returncode, 1)
        self.assertEqual((self.folder / "rod.inp").read_bytes(), deck)
        self.assertEqual(self.run_there("write", "rod.json").returncode, 0)
        self.assertEqual(sorted(path.name for path in self.folder.iterdir()), ["rod.inp", "rod.json", "wrong.json"])

    def test_DeckThatMayNotBeWritten_IsRefused(self):
        self.put_rod("rod.json")
        (self.folder / "rod.inp").write_text("old")
        os.chmod(self.folder / "rod.inp", 0o444)
        done = self.run_there("write", "rod.json")
        self.assertEqual(done.returncode, 3, done.stderr)
        self.assertIn(b"the file in its place may not be written", done.stderr)
        self.assertEqual((self.folder / "rod.inp").read_text(), "old")

    def test_Studies_WriteTheirDecksAndLedgers(self):
        self.put_rod("rod.json")
        (self.folder / "table.csv").write_text("name,/models/Default Model/sections/Round/area\nthin,10\nthick,20.5\n")
        done = self.run_there("study", "rod.json", "table.csv", "--out", "decks")
        self.assertEqual(done.returncode, 0, done.stderr)
        self.assertIn(b"\n10.,\n", (self.folder / "decks/thin.inp").read_bytes())
        self.assertIn(b"\n20.5,\n", (self.folder / "decks/thick.inp").read_bytes())
        lines = [json.loads(line) for line in (self.folder / "decks/study.jsonl").read_text().splitlines()]
        import hashlib
        for line in lines:
            deck = (self.folder / "decks" / line["deck"]).read_bytes()
            self.assertEqual((line["bytes"], line["sha256"]), (len(deck), hashlib.sha256(deck).hexdigest()))
        done = self.run_there("study", "rod.json", "table.csv", "--out", "decks", "--resume")
        self.assertEqual(done.returncode, 0, done.stderr)
        self.assertIn(b"2 done before", done.stdout)

    def test_ExampleInMemory_WritesItsDeck(self):
        done = self.run_there(program=BUILD / "examples" / "two_instances.exe")
        self.assertEqual(done.returncode, 0, done.stderr)
        decks = list(self.folder.glob("*.inp"))
        self.assertEqual([deck.read_bytes() for deck in decks], [two_instances_test.DECK.encode()])

    def test_Version_IsOnALineOfItsOwn(self):
        self.assertRegex(self.run_there("--version").stdout.decode(), r"^qrxdeck \d+\.\d+\.\d+( \([0-9a-f]{12}\+?\))?\n$")


if __name__ == "__main__":
    unittest.main(argv=[sys.argv[0], *sys.argv[4:]], verbosity=2)
