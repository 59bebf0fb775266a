#!/usr/bin/env python3
"""Tests of what qrxdeck does with decks.

usage: decks_test.py QRXDECK PROJECT
"""

import json
import pathlib
import subprocess
import sys
import tempfile
import unittest

PROGRAM = str(pathlib.Path(sys.argv[1]).resolve())
PROJECT = pathlib.Path(sys.argv[2]).resolve()
CLAMP = PROJECT / "examples" / "thermo_mechanical" / "thermo_mechanical"


class Decks(unittest.TestCase):
    def setUp(self):
        self.folder = tempfile.TemporaryDirectory()
        self.addCleanup(self.folder.cleanup)

    def path(self, name):
        return pathlib.Path(self.folder.name) / name

    def run_program(self, *words):
        return subprocess.run([PROGRAM, *map(str, words)], cwd=self.folder.name, capture_output=True, text=True,
                              env={"TMPDIR": self.folder.name})

    def changed(self, **changes):
        text = CLAMP.with_suffix(".inp").read_text()
        for before, after in changes.values():
            self.assertIn(before, text)
            text = text.replace(before, after, 1)
        deck = self.path("changed.inp")
        deck.write_text(text)
        return deck

    def test_Check_OfADeckThatIsRight_SaysSo(self):
        result = self.run_program("check", CLAMP.with_suffix(".inp"))
        self.assertEqual((result.returncode, result.stderr), (0, ""))
        self.assertIn("no errors", result.stdout)

    def test_Check_OfAWrongDeck_TellsAllAtOnce(self):
        deck = self.changed(set=("FEET, ENCASTRE", "FET, ENCASTRE"), word=("*Density", "*Densty"))
        result = self.run_program("check", deck)
        self.assertEqual(result.returncode, 1)
        self.assertIn("did you mean 'FEET'?", result.stderr)
        self.assertIn("did you mean 'Density'?", result.stderr)
        report = json.loads(self.run_program("check", "--json", deck).stdout)
        codes = [(message["code"], message["severity"]) for message in report["messages"]]
        self.assertEqual(codes, [("unknown-keyword", "warning"), ("undefined-set", "error")])
        self.assertEqual(report["messages"][0]["line"], 185)

    def test_Check_OfNoFile_IsRefused(self):
        self.assertEqual(self.run_program("check", "none.inp").returncode, 3)

    def test_Diff_OfAModelAndItsDeck_IsEmpty(self):
        result = self.run_program("diff", CLAMP.with_suffix(".json"), CLAMP.with_suffix(".inp"))
        self.assertEqual((result.returncode, result.stdout, result.stderr), (0, "", ""))
        self.assertEqual(list(pathlib.Path(self.folder.name).iterdir()), [])

    def test_Diff_ReadsLikeAChangeNote(self):
        deck = self.changed(load=("Sleeve-1.SIDE, P, 6.", "Sleeve-1.SIDE, P, 6.5"), spelling=("*Static", "*STATIC"))
        result = self.run_program("diff", CLAMP.with_suffix(".inp"), deck)
        self.assertEqual(result.returncode, 1)
        self.assertEqual(result.stdout.splitlines()[0], "step Pressure: surface load on Sleeve-1.SIDE, P: 6. became 6.5")
        self.assertIn("changed.inp:329", result.stdout.splitlines()[1])
        self.assertEqual(result.stdout.splitlines()[2:], ["in all:", "  surface load: 1 changed"])
        report = json.loads(self.run_program("diff", "--json", CLAMP.with_suffix(".inp"), deck).stdout)
        self.assertEqual(report["exitCode"], 1)
        self.assertEqual(report["summary"], {"surface load": {"changed": 1}})
        self.assertEqual(report["differences"][0]["second"]["line"], 329)

    def test_Diff_IgnoresWhatItIsTold(self):
        deck = self.changed(title=("From 20 to 120", "From 20 to 125"), text=("** PARTS", "** NO PARTS"))
        clamp = CLAMP.with_suffix(".inp")
        self.assertEqual(self.run_program("diff", clamp, deck).returncode, 1)
        result = self.run_program("diff", "--ignore", "titles,comments", clamp, deck)
        self.assertEqual((result.returncode, result.stdout), (0, ""))
        self.assertEqual(self.run_program("diff", "--ignore", "everything", clamp, deck).returncode, 2)
        self.assertEqual(self.run_program("diff", clamp).returncode, 2)
        self.assertEqual(self.run_program("diff", clamp, "none.inp").returncode, 2)

    def test_Diff_GivesATextForProgramsThatCompareLines(self):
        result = self.run_program("diff", "--textconv", CLAMP.with_suffix(".inp"))
        self.assertEqual(result.returncode, 0)
        self.path("other.inp").write_text(result.stdout)
        result = self.run_program("diff", "--ignore", "comments", CLAMP.with_suffix(".inp"), "other.inp")
        self.assertEqual((result.returncode, result.stdout), (0, ""))

    def test_Flatten_WritesADeckWithoutParts(self):
        for source in (".inp", ".json"):
            result = self.run_program("flatten", CLAMP.with_suffix(source), "-o", "flat.inp")
            self.assertEqual((result.returncode, result.stderr), (0, ""))
            text = self.path("flat.inp").read_text()
            for word in ("*Part", "*Instance", "*Assembly", "*End Part"):
                self.assertNotIn("\n" + word, text)
            self.assertIn("Sleeve-1_SIDE, P, 6.", text)
            check = self.run_program("check", "flat.inp")
            self.assertEqual((check.returncode, check.stderr), (0, ""))
        result = self.run_program("flatten", CLAMP.with_suffix(".inp"))
        self.assertEqual(result.stdout, text)

    def test_Write_CanVerify(self):
        result = self.run_program("write", CLAMP.with_suffix(".json"), "--verify")
        self.assertEqual(result.returncode, 0, result.stderr)
        self.assertIn("read back, and as the store has it", result.stdout)
        report = json.loads(self.run_program("write", CLAMP.with_suffix(".json"), "--verify", "--json").stdout)
        self.assertIs(report["verified"], True)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
