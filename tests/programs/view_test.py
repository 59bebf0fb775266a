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
# The second instance is moved by (1, 2, 3), then turned a quarter about an axis along z through (1, 0, 0).
DECK = """*Part, name=ROD
*Node
1, 0., 0., 0.
2, 1., 0., 0.
*Element, type=T3D2
1, 1, 2
*Nset, nset=ENDS
1, 2
*End Part
*Assembly, name=A
*Instance, name=ROD-1, part=ROD
*End Instance
*Instance, name=ROD-2, part=ROD
1., 2., 3.
1., 0., 0., 1., 0., 1., 90.
*End Instance
*Nset, nset=FAR, instance=ROD-2
2,
*End Assembly
*Boundary
ROD-1.ENDS, PINNED
*Step, name=Pull
*Static
*Cload
FAR, 1, 5.
FAR, 2, -3.
*End Step
*Step, name=Shake, perturbation
*Frequency
*End Step
*Step, name=Rest
*Static
*Boundary
ROD-1.ENDS, 1, 2, 0.5
*Cload, op=NEW
*End Step
"""
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

    def header(self, name):
        page = (self.folder / name).read_text()
        return json.loads(page.split('id="header">')[1].split("</script>")[0])

    def test_Deck_IsShownWithItsInstancesStepsAndLines(self):
        (self.folder / "job.inp").write_text(DECK)
        run = self.view_with_page("job.inp")
        self.assertEqual((run.returncode, run.stderr), (0, ""))
        header = self.header("job.html")
        self.assertEqual([(i["name"], i["part"]) for i in header["instances"]], [("ROD-1", "ROD"), ("ROD-2", "ROD")])
        placement = header["instances"][1]["placement"]
        for found, expected in zip(placement, [0, -1, 0, -1, 1, 0, 0, 0, 0, 0, 1, 3], strict=True):
            self.assertAlmostEqual(found, expected, places=5)
        self.assertEqual([(step["name"], step["procedure"], step["perturbation"]) for step in header["steps"]][1:],
                         [("Pull", "Static", False), ("Shake", "Frequency", True), ("Rest", "Static", False)])
        held, pulled = header["objects"]
        status = {entry["name"]: place for place, entry in enumerate(header["statuses"])}
        self.assertEqual((held["kind"], held["name"], held["regions"]),
                         ("boundaryConditions", "ROD-1.ENDS", [{"role": "region", "instance": 0, "set": 0}]))
        self.assertEqual([place[0] for place in held["steps"]],
                         [status["CREATED"], status["PROPAGATED"], status["PROPAGATED_FROM_BASE_STATE"],
                          status["MODIFIED"]])
        self.assertEqual([state["components"] for state in held["states"]],
                         [[0, 0, 0, None, None, None], [0.5, 0.5, None, None, None, None]])
        self.assertEqual((pulled["kind"], pulled["name"], pulled["regions"]),
                         ("loads", "FAR", [{"role": "region", "instance": -1, "set": 0}]))
        self.assertEqual([place[0] for place in pulled["steps"]],
                         [status["NOT_YET_ACTIVE"], status["CREATED"], status["PROPAGATED_FROM_BASE_STATE"],
                          status["DEACTIVATED"]])
        self.assertEqual(pulled["states"][0]["components"], [5, -3, 0])
        self.assertEqual(pulled["cards"][0], [{"loadCase": "", "text": "*Cload\nFAR, 1, 5.\nFAR, 2, -3.\n"}])
        self.assertEqual([field["value"] for field in pulled["states"][0]["fields"]], ["1, 5.", "2, -3."])

    def test_DeckWithGravityAndCoupling_TellsDirectionAndReferenceNode(self):
        deck = DECK.replace("*Cload\n", "*Dload\nFAR, GRAV, 9.81, 0., 0., -1.\n*Cload\n", 1)
        deck = deck.replace("*End Part", "*Elset, elset=ALL\n1,\n*End Part")
        deck = deck.replace("*Boundary", "*Rigid Body, ref node=FAR, elset=ROD-1.ALL\n*Boundary", 1)
        (self.folder / "job.inp").write_text(deck)
        run = self.view_with_page("job.inp")
        self.assertEqual(run.returncode, 0, run.stderr)
        objects = {shown["class"]: shown for shown in self.header("job.html")["objects"]}
        self.assertEqual((objects["dload"]["mark"], objects["dload"]["states"][0]["components"]),
                         ("gravity", [0, 0, -9.81]))
        self.assertEqual([region["role"] for region in objects["rigidbody"]["regions"]], ["region", "refNode"])

    def test_DeckWithErrors_HasNoPage(self):
        (self.folder / "job.inp").write_text("*Node\n1, 0., zero, 0.\n")
        run = self.view("job.inp")
        self.assertEqual(run.returncode, 1)
        self.assertIn("job.inp:2", run.stderr)
        self.assertEqual(self.entries(), ["job.inp", "rod.json"])

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
