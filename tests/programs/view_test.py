#!/usr/bin/env python3
"""Calls qrxdeck view as a user does. The page's behaviour is tested in a browser, by viewer/test/browser.mjs.

usage: view_test.py PROGRAM [unittest options]
"""

import json
import pathlib
import subprocess
import sys
import tempfile
import unittest

MODEL = {
    "format": "qrx-model/1",
    "models": {
        "Default Model": {
            "parts": {
                "ROD": {
                    "mesh": {
                        "nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [2.5, 0, 0]]},
                        "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]}],
                    }
                }
            },
            "assembly": {"instances": {"ROD-1": {"part": "ROD"}}},
            "steps": [{"name": "Initial", "class": "kprC_InitialStep"},
                      {"name": "Step-1", "class": "kprC_StaticStep"}],
        }
    },
}
NO_PAGE = ("qrxdeck: error: this qrxdeck was built without the page that shows models: run "
           "scripts/install-dependencies.sh viewer in its sources and build it again\n")


class View(unittest.TestCase):
    program = None

    def setUp(self):
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.folder = pathlib.Path(temporary.name)
        (self.folder / "rod.json").write_text(json.dumps(MODEL))

    def view(self, *arguments):
        return subprocess.run([self.program, "view", *arguments], cwd=self.folder, capture_output=True, text=True)

    def entries(self):
        return sorted(entry.name for entry in self.folder.iterdir())

    def view_with_page(self, *arguments):
        run = self.view(*arguments)
        if run.stderr == NO_PAGE:
            self.assertEqual(run.returncode, 2)
            self.skipTest("this build has no page")
        return run

    def put(self, change):
        model = json.loads(json.dumps(MODEL))
        change(model["models"]["Default Model"])
        (self.folder / "rod.json").write_text(json.dumps(model))

    def test_Page_WithoutAName_IsTheModels(self):
        run = self.view_with_page("rod.json")
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        self.assertEqual(self.entries(), ["rod.html", "rod.json"])
        page = (self.folder / "rod.html").read_text()
        self.assertTrue(page.startswith("<!doctype html>"))
        self.assertEqual(run.stdout, f"rod.html: {len(page.encode())} bytes\n")

    def test_Page_HasNoAddressOfAnythingElse(self):
        self.view_with_page("rod.json")
        page = (self.folder / "rod.html").read_text()
        for word in ["src=", "@import", "<link rel=\"stylesheet\"", "fetch(\"http"]:
            self.assertNotIn(word, page.split("<script>")[0])

    def test_Page_IsTheSameWheneverItIsMade(self):
        self.view_with_page("rod.json")
        self.view("rod.json", "-o", "again.html")
        self.assertEqual((self.folder / "rod.html").read_bytes(), (self.folder / "again.html").read_bytes())

    def test_Page_InJson_IsTold(self):
        self.view_with_page("rod.json")
        run = self.view("rod.json", "--json", "-o", "x.html")
        result = json.loads(run.stdout)
        self.assertEqual(result["exitCode"], 0)
        self.assertEqual(result["page"]["target"], "x.html")

    def test_WrongModel_HasNoPage(self):
        self.put(lambda model: model["assembly"]["instances"]["ROD-1"].update(part="none"))
        run = self.view("rod.json")
        self.assertEqual(run.returncode, 1)
        self.assertIn("error: ", run.stderr)
        self.assertEqual(self.entries(), ["rod.json"])

    def test_ModelThatNoDeckCanTell_HasNoPageAndLeavesTheOldOne(self):
        self.view_with_page("rod.json")
        old = (self.folder / "rod.html").read_bytes()
        self.put(lambda model: model.update(
            loads={"Odd": {"class": "kloC_UnwrittenLoad", "states": {"Step-1": {}}}}))
        run = self.view("rod.json")
        self.assertEqual((run.returncode, run.stderr),
                         (4, "Unimplemented load type conversion\nstep 'Step-1', load 'Odd'\n"))
        self.assertEqual((self.folder / "rod.html").read_bytes(), old)
        self.assertEqual(self.entries(), ["rod.html", "rod.json"])

    def test_FolderThatIsNotThere_IsCodeThree(self):
        run = self.view_with_page("rod.json", "-o", "none/rod.html")
        self.assertEqual(run.returncode, 3)
        self.assertEqual(self.entries(), ["rod.json"])

    def test_ModelThatIsNotThere_IsCodeThree(self):
        self.assertEqual(self.view("none.json").returncode, 3)

    def test_Vtu_StandsBesideThePage(self):
        self.view("rod.json", "--vtu", "rod.vtu")
        grid = (self.folder / "rod.vtu").read_bytes()
        self.assertIn(b'<Piece NumberOfPoints="2" NumberOfCells="1">', grid)
        self.assertIn(b'<AppendedData encoding="raw">', grid)


if __name__ == "__main__":
    View.program = pathlib.Path(sys.argv.pop(1)).resolve()
    unittest.main()
