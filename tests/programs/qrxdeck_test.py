#!/usr/bin/env python3
"""Calls qrxdeck as a user does.

usage: qrxdeck_test.py PROGRAM [unittest options]
"""

import json
import os
import pathlib
import re
import resource
import shutil
import signal
import subprocess
import sys
import tempfile
import time
import unittest

from rigid_link import MODEL, changed

OLD_DECK = b"** the old deck\n"

DECK = b"""\
*Heading
One rigid link
**
** PARTS
**
*Part, name=ROD
*End Part
**
** ASSEMBLY
**
*Assembly, name=Assembly
*Instance, name=ROD-1, part=ROD
          0.,           1.,           0.
*Node
      1,           0.,           0.,           0.
      2,          2.5,           0.,           0.
*Element, type=R2D2
1, 1, 2
*Nset, nset=TIP
2,\x20
*End Instance
*End Assembly
"""


def without_positions(text):
    """Messages without the lines and columns behind their file names."""
    return re.sub(r"^([^:\n]+):\d+:\d+: ", r"\1: ", text, flags=re.MULTILINE)


def by_place(text):
    """The same, each with its place ahead of its text and without its code."""
    return re.sub(r"^([^:\n]+: (?:error|warning|note): )(.*) \((/.*)\) \[[a-z-]+\]$", r"\1\3: \2",
                  without_positions(text), flags=re.MULTILINE)


def large_model(nodes):
    def enlarge(model):
        mesh = model["parts"]["ROD"]["mesh"]
        mesh["nodes"] = {"labels": {"from": 1, "to": nodes}, "coordinates": [[0.5, 0, 0]] * nodes}

    return changed(enlarge)


class ProgramTest(unittest.TestCase):
    maxDiff = None

    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrxdeck_test_"))
        self.addCleanup(shutil.rmtree, self.folder)
        self.put("model.json", MODEL)

    def put(self, name, model):
        path = self.folder / name
        path.write_text(model if isinstance(model, str) else json.dumps(model), encoding="utf-8")
        return path

    def run_program(self, *arguments, program=None, **options):
        options = {"cwd": self.folder, "capture_output": True, **options}
        run = subprocess.run([program or PROGRAM, *arguments], **options)
        run.output = (run.stdout or b"").decode(errors="replace")
        run.errors = (run.stderr or b"").decode(errors="replace")
        return run

    def entries(self, folder="."):
        return sorted(os.listdir(os.fsencode(self.folder / folder)))

    def assert_refused(self, run, code, errors=None):
        self.assertEqual(run.returncode, code, run.errors)
        self.assertEqual(run.output, "")
        if errors is None:
            self.assertNotEqual(run.errors, "")
        else:
            self.assertEqual(run.errors, errors)


class Write(ProgramTest):
    def test_ModelAlone_WritesUnderItsNameIntoTheCurrentFolder(self):
        run = self.run_program("write", "model.json")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertEqual((self.folder / "model.inp").read_bytes(), DECK)
        self.assertEqual(self.entries(), [b"model.inp", b"model.json"])
        self.assertRegex(run.output, r"^model\.inp: %d bytes in \d+\.\d\d s: reading \d+\.\d\d, checking \d+\.\d\d, "
                                     r"writing \d+\.\d\d, syncing \d+\.\d\d\nwritten:\n" % len(DECK))
        self.assertIn("\n  2  nodes\n", run.output)
        self.assertNotIn("left out", run.output)

    def test_ModelElsewhere_WritesIntoTheCurrentFolderAllTheSame(self):
        (self.folder / "in").mkdir()
        (self.folder / "model.json").rename(self.folder / "in" / "rod.v2.json")
        run = self.run_program("write", "in/rod.v2.json")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertEqual((self.folder / "rod.v2.inp").read_bytes(), DECK)
        self.assertEqual(self.entries("in"), [b"rod.v2.json"])

    def test_JobNamesOfEveryKind_NameTheDeck(self):
        for job in ["a.b", "with blank", " ", "ä€漢", ".hidden", "--", "100% %s", "it's \"quoted\"",
                    "line\nend", "XXXXXX", "~", "x" * 250]:
            with self.subTest(job=job):
                run = self.run_program("write", "model.json", "--job=" + job)
                self.assertEqual((run.returncode, run.errors), (0, ""))
                self.assertEqual((self.folder / (job + ".inp")).read_bytes(), DECK)
                (self.folder / (job + ".inp")).unlink()
        self.assertEqual(self.entries(), [b"model.json"])

    def test_JobWithItsExtension_GetsNoSecondOne(self):
        for job, deck in [("job.inp", "job.inp"), ("job.v2", "job.v2.inp"), (".inp", ".inp.inp"),
                          ("job.inp.inp", "job.inp.inp")]:
            with self.subTest(job=job):
                self.assertEqual(self.run_program("write", "model.json", "--job", job).returncode, 0)
                self.assertEqual((self.folder / deck).read_bytes(), DECK)
                (self.folder / deck).unlink()

    def test_JobThatIsNoUtf8_NamesTheDeck(self):
        run = self.run_program("write", "model.json", "--job", b"\xff\xfe")
        self.assertEqual((run.returncode, run.stderr), (0, b""))
        self.assertIn(b"\xff\xfe.inp", self.entries())
        run = self.run_program("write", "model.json", "--job", b"\xff\xfe", "--json")
        self.assertEqual(json.loads(run.output)["written"]["target"], "\ufffd\ufffd.inp")

    def test_JobWithAFolder_IsRelativeToTheOutputFolder(self):
        (self.folder / "out" / "sub").mkdir(parents=True)
        run = self.run_program("write", "model.json", "--output-dir", "out", "--job", "sub/job")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertEqual((self.folder / "out" / "sub" / "job.inp").read_bytes(), DECK)
        self.assertTrue(run.output.startswith("out/sub/job.inp: "))
        self.assertEqual(self.entries("out"), [b"sub"])
        self.assertEqual(self.entries("out/sub"), [b"job.inp"])

    def test_OldDeck_IsReplaced(self):
        (self.folder / "model.inp").write_bytes(OLD_DECK)
        self.assertEqual(self.run_program("write", "model.json").returncode, 0)
        self.assertEqual((self.folder / "model.inp").read_bytes(), DECK)

    def test_TwoRuns_GiveTheSameBytes(self):
        self.run_program("write", "model.json", "--job", "a")
        self.run_program("write", "model.json", "--job", "b")
        self.assertEqual((self.folder / "a.inp").read_bytes(), (self.folder / "b.inp").read_bytes())

    def test_Locales_DoNotShowInTheDeck(self):
        known = subprocess.run(["locale", "-a"], capture_output=True, text=True).stdout.split()
        for name in ["C", "POSIX"] + [name for name in known if name.startswith(("C.", "de_DE", "tr_TR"))]:
            with self.subTest(locale=name):
                run = self.run_program("write", "model.json", env={**os.environ, "LC_ALL": name, "LANG": name})
                self.assertEqual((run.returncode, run.errors), (0, ""))
                self.assertEqual((self.folder / "model.inp").read_bytes(), DECK)

    def test_Deck_HasTheRightsOfAnyNewFile(self):
        previous = os.umask(0o027)
        try:
            self.run_program("write", "model.json")
        finally:
            os.umask(previous)
        self.assertEqual((self.folder / "model.inp").stat().st_mode & 0o777, 0o640)

    def test_SeveralModels_AreLeftOutByName(self):
        model = json.loads(json.dumps(MODEL))
        model["models"]["Study"] = {"steps": MODEL["models"]["Default Model"]["steps"]}
        self.put("model.json", model)
        run = self.run_program("write", "model.json")
        self.assertEqual(run.returncode, 0, run.errors)
        self.assertRegex(run.output, r"left out, since a deck can't carry it:\n +1  other models .*: Study\n$")

    def test_Json_TellsAllOnStandardOutput(self):
        run = self.run_program("write", "model.json", "--json")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        result = json.loads(run.output)
        seconds = result["written"].pop("seconds")
        times = result["written"].pop("times")
        self.assertEqual(list(times), ["reading", "checking", "writing", "syncing"])
        self.assertAlmostEqual(sum(times.values()), seconds)
        self.assertGreater(seconds, 0)
        self.assertLess(seconds, 60)
        self.assertEqual(result, {
            "exitCode": 0,
            "messages": [],
            "written": {
                "target": "model.inp",
                "bytes": len(DECK),
                "counts": {"parts": 1, "instances": 1, "nodes": 2, "elements": 1, "nodeSets": 1, "steps": 1},
                "leftOut": [],
            },
        })


class Refusals(ProgramTest):
    def setUp(self):
        super().setUp()
        (self.folder / "model.inp").write_bytes(OLD_DECK)

    def tearDown(self):
        deck = self.folder / "model.inp"
        if deck.is_file():
            self.assertEqual(deck.read_bytes(), OLD_DECK)
        self.assertEqual([name for name in self.entries() if name.startswith(b".")], [])

    def test_WrongModel_IsCodeOneWithPointer(self):
        def spoil(model):
            model["assembly"]["instances"]["ROD-1"]["part"] = "RUD"
        self.put("model.json", changed(spoil))
        for command in ["write", "check", "info"]:
            with self.subTest(command=command):
                run = self.run_program(command, "model.json")
                self.assert_refused(run, 1)
                self.assertRegex(without_positions(run.errors), r"^model\.json: error: .*'RUD'.* "
                                 r"\(/models/Default Model/assembly/instances/ROD-1/part\) \[no-such-name\]$")

    def test_WrongModel_HasPointerInJson(self):
        self.put("model.json", changed(lambda model: model.update(parts=3)))
        run = self.run_program("write", "model.json", "--json")
        self.assertEqual((run.returncode, run.errors), (1, ""))
        result = json.loads(run.output)
        self.assertEqual(result["exitCode"], 1)
        self.assertNotIn("written", result)
        message = result["messages"][0]
        self.assertEqual((message["severity"], message["file"], message["pointer"]),
                         ("error", "model.json", "/models/Default Model/parts"))
        self.assertTrue(message["text"])

    def test_ErrorsAndWarnings_TellLineAndColumnOfTheMemberOrItem(self):
        self.put("model.json", '''{ "format": "qrx-model/1",
  "models": { "Default Model": {
    // A comment: "loads"
    "materials": { "Steel": { "elastic": { "table": [[210000, 0.3]] },
                              "densitty": 7 } },

    "steps": [ { "name": "Initial", "class": "kprC_InitialStep" },
      { "name": "Pull", "class": "kprC_StaticStep",
        "timePeriod": "long" } ] } } }''')
        run = self.run_program("check", "model.json")
        self.assertEqual((run.returncode, run.errors.splitlines()), (1, [
            "model.json:5:31: error: found an unknown member 'densitty'; did you mean 'density'? Expected one of %s "
            "(/models/Default Model/materials/Steel/densitty) [unknown-member]"
            % re.search("Expected (one of .*) [(]/models", run.errors)[1][7:],
            "model.json:9:9: error: found 'long', expected a number (/models/Default Model/steps/1/timePeriod) "
            "[wrong-value]"]))
        message = json.loads(self.run_program("check", "model.json", "--json").output)["messages"][1]
        self.assertEqual((message["line"], message["column"], message["pointer"]),
                         (9, 9, "/models/Default Model/steps/1/timePeriod"))

    def test_FindingsOfTheDeck_TellTheirLinesToo(self):
        self.put("model.json", changed(lambda model: model.update(
            materials={"RING": {"density": {"table": [[1]]}, "membraneElastic": {"table": [[2, 0.3]]}}})))
        with open(self.folder / "model.json", encoding="utf-8") as file:
            text = file.read()
        run = self.run_program("check", "model.json")
        line, column = map(int, run.errors.split(":")[1:3])
        self.assertTrue(text.splitlines()[line - 1][column - 1:].startswith('"membraneElastic"'))

    def test_SyntaxError_IsCodeOneWithLineAndColumn(self):
        self.put("model.json", '{\n  "format": oops\n}\n')
        run = self.run_program("write", "model.json")
        self.assert_refused(run, 1)
        self.assertRegex(run.errors, r"^model\.json:2:\d+: error: ")
        message = json.loads(self.run_program("check", "model.json", "--json").output)["messages"][0]
        self.assertEqual(message["line"], 2)
        self.assertGreater(message["column"], 0)

    def named(self, *names):
        """A model file with copies of the model under these names."""
        model = json.loads(json.dumps(MODEL))
        content = model["models"].pop("Default Model")
        model["models"] = {name: content for name in names}
        return model

    def test_TheOnlyModel_IsWrittenWhateverItsName(self):
        self.put("model.json", MODEL)
        self.assertEqual(self.run_program("write", "model.json", "--job", "expected").returncode, 0)
        expected = (self.folder / "expected.inp").read_bytes()
        for name in ["Study", "a/b~c", "default model"]:
            with self.subTest(name=name):
                self.put("model.json", self.named(name))
                for verb in [["write", "--job", "deck"], ["check"], ["info"], ["format", "-o", "again.json"]]:
                    self.assertEqual(self.run_program(verb[0], "model.json", *verb[1:]).returncode, 0)
                self.assertEqual((self.folder / "deck.inp").read_bytes(), expected)
                self.assertEqual(list(json.loads((self.folder / "again.json").read_text())["models"]), [name])

    def test_OneOfSeveralModels_IsChosenByItsName(self):
        model = self.named("A", "B")
        model["models"]["B"] = {"steps": [{"name": "Start", "class": "InitialStep"}]}
        self.put("model.json", model)
        for name, has in [("A", True), ("B", False)]:
            run = self.run_program("write", "model.json", "--model", name, "--job", name)
            self.assertEqual(run.returncode, 0, run.errors)
            self.assertEqual(b"*Element" in (self.folder / f"{name}.inp").read_bytes(), has)
            self.assertEqual(self.run_program("check", "model.json", "--model", name).returncode, 0)
        self.assertEqual(self.run_program("info", "model.json").returncode, 0)
        self.assertEqual(self.run_program("format", "model.json").returncode, 0)

    def test_SeveralModels_NoneNamedAndNoneTheDefault_IsCodeOneAndListsThem(self):
        self.put("model.json", self.named("Sketch", "Defalt Model"))
        run = self.run_program("write", "model.json")
        self.assert_refused(run, 1)
        self.assertIn("did you mean 'Defalt Model'? there are 'Sketch', 'Defalt Model'", run.errors)
        run = self.run_program("write", "model.json", "--model", "Sketsh")
        self.assert_refused(run, 1)
        self.assertIn("found no model named 'Sketsh'", run.errors)
        self.assertIn("did you mean 'Sketch'?", run.errors)

    def test_SchemaMember_IsAccepted(self):
        self.put("model.json", {"$schema": "./model.schema.json", **MODEL})
        self.assertEqual(self.run_program("check", "model.json").returncode, 0)

    def test_WrongUsage_IsCodeTwo(self):
        for arguments in [[], ["write"], ["frobnicate"], ["write", "model.json", "--frob"],
                          ["write", "model.json", "--job"], ["check"], ["schema", "--output"],
                          ["write", "model.json", "--job", "folder/"], ["write", "model.json", "--job", "."],
                          ["write", "model.json", "--job", "a/.."]]:
            with self.subTest(arguments=arguments):
                run = self.run_program(*arguments)
                self.assert_refused(run, 2)
                self.assertRegex(run.errors, r"^qrxdeck: error: ")

    def test_UnknownCommand_GetsTheNearest(self):
        self.assert_refused(self.run_program("wirte", "model.json"), 2,
                            "qrxdeck: error: there is no command 'wirte'; did you mean 'write'?\n"
                            "Run with --help for more information.\n")
        self.assert_refused(self.run_program("help", "chekc"), 2,
                            "qrxdeck: error: there is no command 'chekc'; did you mean 'check'?\n")
        run = self.run_program("frobnicate")
        self.assert_refused(run, 2)
        self.assertIn("the commands are write, check, diff, flatten, info, mesh, new, format, study, view, ", run.errors)

    def test_UnknownOption_GetsTheNearest(self):
        self.assert_refused(self.run_program("write", "model.json", "--jbo=x"), 2,
                            "qrxdeck: error: the command write has no option '--jbo'; did you mean '--job'?\n"
                            "Run with --help for more information.\n")

    def test_WrongUsage_IsToldInJson(self):
        run = self.run_program("write", "--json")
        self.assertEqual((run.returncode, run.errors), (2, ""))
        result = json.loads(run.output)
        self.assertEqual(result["exitCode"], 2)
        self.assertEqual([message["severity"] for message in result["messages"]], ["error"])

    def test_ModelThatCannotBeRead_IsCodeThree(self):
        (self.folder / "folder.json").mkdir()
        for name in ["none.json", "folder.json", "model.json/x", ""]:
            for command in ["write", "check", "info"]:
                with self.subTest(name=name, command=command):
                    arguments = ["--job", "model"] if command == "write" else []
                    self.assert_refused(self.run_program(command, name, *arguments), 3)

    def test_OutputFolderThatIsNotThere_IsCodeThreeAndNotMade(self):
        run = self.run_program("write", "model.json", "--output-dir", "none")
        self.assert_refused(run, 3, "none/model.inp: error: cannot open the folder 'none': No such file or directory\n")
        self.assertFalse((self.folder / "none").exists())

    def test_OutputFolderThatIsAFile_IsCodeThree(self):
        self.assert_refused(self.run_program("write", "model.json", "--output-dir", "model.json"), 3)

    def test_TargetThatIsAFolder_IsCodeThreeAndStays(self):
        (self.folder / "job.inp").mkdir()
        run = self.run_program("write", "model.json", "--job", "job")
        self.assert_refused(run, 3, "job.inp: error: a folder is in its place: Is a directory\n")
        self.assertEqual(self.entries("job.inp"), [])

    def test_NameThatIsTooLong_IsCodeThree(self):
        self.assert_refused(self.run_program("write", "model.json", "--job", "x" * 300), 3)

    @unittest.skipIf(os.geteuid() == 0, "rights do not hold for root")
    def test_ReadOnlyFolder_IsCodeThree(self):
        (self.folder / "out").mkdir(mode=0o555)
        run = self.run_program("write", "model.json", "--output-dir", "out")
        self.assert_refused(run, 3)
        self.assertIn("Permission denied", run.errors)

    def test_FileThatOutgrowsItsLimit_IsCodeThreeAndLeavesTheOldDeck(self):
        self.put("model.json", large_model(20000))
        run = self.run_program(
            "write", "model.json",
            preexec_fn=lambda: resource.setrlimit(resource.RLIMIT_FSIZE, (4096, resource.RLIM_INFINITY)))
        self.assert_refused(run, 3, "model.inp: error: cannot write the deck: File too large\n")
        self.assertEqual(self.entries(), [b"model.inp", b"model.json"])

    def test_MemoryThatRunsOut_IsCodeThreeAndLeavesTheOldDeck(self):
        def limit():
            resource.setrlimit(resource.RLIMIT_AS, (32 << 20, resource.RLIM_INFINITY))
        if self.run_program("--version", preexec_fn=limit).returncode != 0:
            self.skipTest("a program with sanitizers does not start in so little memory")
        self.put("model.json", large_model(1000000))
        self.assert_refused(self.run_program("write", "model.json", preexec_fn=limit), 3,
                            "qrxdeck: error: not enough memory\n")

    def test_OutputThatIsFull_IsCodeThree(self):
        for arguments in [["info", "model.json"], ["schema"], ["check", "model.json", "--json"], ["--version"]]:
            with self.subTest(arguments=arguments), open("/dev/full", "wb") as full:
                run = self.run_program(*arguments, stdout=full, stderr=subprocess.PIPE, capture_output=False)
                self.assertEqual(run.returncode, 3)
                self.assertRegex(run.errors, r"^standard output: error: ")

    def test_RefusalByTheFileSystem_IsToldInJson(self):
        (self.folder / "job.inp").mkdir()
        run = self.run_program("write", "model.json", "--job", "job", "--json")
        self.assertEqual((run.returncode, run.errors), (3, ""))
        self.assertEqual(json.loads(run.output), {
            "exitCode": 3,
            "messages": [{"severity": "error", "code": "run-failed", "file": "job.inp", "pointer": "",
                          "text": "a folder is in its place: Is a directory",
                          "found": "a folder is in its place: Is a directory"}],
        })


class CannotBeExpressed(ProgramTest):
    def setUp(self):
        super().setUp()
        self.put("model.json", changed(lambda model: model["steps"].extend([
            {"name": "Fine", "class": "kprC_StaticStep"},
            {"name": "Whirl", "class": "kprC_ComplexFrequencyStep"},
        ])))
        (self.folder / "model.inp").write_bytes(OLD_DECK)

    def test_StepThatNoDeckCanCarry_IsCodeFourAndLeavesTheOldDeck(self):
        run = self.run_program("write", "model.json")
        self.assertEqual((run.returncode, run.output), (4, ""))
        lines = run.errors.splitlines()
        self.assertRegex(lines[0], r"^model\.json:\d+:\d+: warning: found a complex frequency step, .*"
                                   r" \(/models/Default Model/steps/2/class\) \[cannot-be-written\]$")
        self.assertEqual(lines[1:], ["Unimplemented function to write out *Step card", "step 'Whirl'"])
        self.assertEqual((self.folder / "model.inp").read_bytes(), OLD_DECK)
        self.assertEqual(self.entries(), [b"model.inp", b"model.json"])

    def test_InJson_TextAndContextAreMembers(self):
        run = self.run_program("write", "model.json", "--json")
        self.assertEqual((run.returncode, run.errors), (4, ""))
        result = json.loads(run.output)
        self.assertEqual(result["exitCode"], 4)
        self.assertEqual(result["messages"][-1], {
            "severity": "error", "text": "Unimplemented function to write out *Step card",
            "context": "step 'Whirl'"})
        self.assertEqual((self.folder / "model.inp").read_bytes(), OLD_DECK)


class WrongDatum(ProgramTest):
    def test_ConnectorOnADatumThatIsNoSystem_IsCodeFourAndLeavesTheOldDeck(self):
        def orient(model):
            model["datums"] = [{"name": "Corner", "type": "point"}]
            model["assembly"]["sets"] = [{"name": "WIRE", "kind": "element",
                                          "members": [{"instance": "ROD-1", "labels": [1]}]}]
            model["assembly"]["connectorOrientations"] = [{"region": "WIRE", "csys1": "Corner"}]

        self.put("model.json", changed(orient))
        (self.folder / "model.inp").write_bytes(OLD_DECK)
        run = self.run_program("write", "model.json")
        self.assertEqual((run.returncode, run.output), (4, ""))
        self.assertEqual(run.errors.splitlines(),
                         ["Wrong datum type during input generation", "orientation 'Corner'"])
        self.assertEqual((self.folder / "model.inp").read_bytes(), OLD_DECK)
        self.assertEqual(self.entries(), [b"model.inp", b"model.json"])

    def test_InteractionsWhoseFamilyCannotBeEnded_FailWithTheTextOfAnAssertion(self):
        for name in ["kinC_ConcFilmCondition", "kinC_AcousticImpedance", "kinC_IncidentWave"]:
            with self.subTest(interaction=name):
                def add(model, name=name):
                    model["steps"].append({"name": "Heat", "class": "kprC_HeatTransferStep"})
                    model["interactions"] = {"Edge": {"class": name, "states": {"Heat": {}}}}
                self.put("model.json", changed(add))
                (self.folder / "model.inp").write_bytes(OLD_DECK)
                run = self.run_program("write", "model.json")
                self.assertEqual((run.returncode, run.output), (4, ""))
                self.assertEqual(run.errors.splitlines(),
                                 ['"Unimplemented interaction->statusKey conversion" == 0',
                                  "step 'Heat', interaction 'Edge'"])
                self.assertEqual((self.folder / "model.inp").read_bytes(), OLD_DECK)
                self.assertEqual(self.entries(), [b"model.inp", b"model.json"])
                check = self.run_program("check", "model.json")
                self.assertEqual(check.returncode, 0)
                self.assertIn("/interactions/Edge: writing fails with", by_place(check.errors))

    def test_InteractionsThatNoDeckCarries_AreToldAsLeftOut(self):
        self.put("model.json", changed(lambda model: model.update(
            interactionProperties={"Wave": {"class": "kinC_IncidentWaveProperty"},
                                   "Code": {"class": "kinC_ActuatorSensorProp"}},
            interactions={"Bed": {"class": "kinC_ElasticFoundation", "states": {"Initial": {}}},
                          "Off": {"class": "kinC_ElasticFoundation", "suppressed": True},
                          "Valve": {"class": "kinC_ActuatorSensor", "states": {"Initial": {}}}})))
        run = self.run_program("write", "model.json")
        self.assertEqual(run.returncode, 0)
        left_out = run.output[run.output.index("left out"):].splitlines()[1:]
        self.assertEqual([" ".join(line.split()) for line in left_out], [
            "1 incident wave properties (they are not written): Wave",
            "1 elastic foundations (they have no keyword): Bed",
            "1 control elements (they are not written): Valve",
            "1 properties of control elements (they are not written): Code",
            "1 suppressed objects (they are suppressed): Off"])


class Signals(ProgramTest):
    def caught_writing(self, model):
        """A run that is stopped while it writes. On a busy machine many are done before they are caught."""
        others = len(self.scratch_files())
        for _ in range(100):
            run = subprocess.Popen([PROGRAM, "write", model], cwd=self.folder, stdout=subprocess.DEVNULL,
                                   preexec_fn=no_core)
            self.addCleanup(run.kill)
            # The file comes when the folder has been locked.
            while run.poll() is None and len(self.scratch_files()) <= others:
                time.sleep(0.001)
            if run.returncode is not None:
                continue
            run.send_signal(signal.SIGSTOP)
            _, status = os.waitpid(run.pid, os.WUNTRACED)
            if not os.WIFSTOPPED(status):
                run.returncode = os.waitstatus_to_exitcode(status)
            elif len(self.scratch_files()) > others:
                return run
            else:
                run.send_signal(signal.SIGCONT)
                run.wait()
        self.fail("no run could be caught")

    def scratch_files(self):
        return list(self.folder.glob(".qrxdeck-*/*"))

    def test_RunThatIsEnded_LeavesTheOldDeckAndNoDebris(self):
        self.put("model.json", large_model(300000))
        for number in [signal.SIGINT, signal.SIGTERM, signal.SIGHUP, signal.SIGQUIT, signal.SIGXCPU]:
            with self.subTest(signal=number):
                run = self.caught_writing("model.json")
                (self.folder / "model.inp").write_bytes(OLD_DECK)
                run.send_signal(number)
                run.send_signal(signal.SIGCONT)
                run.wait()
                self.assertEqual(run.returncode, -number)
                self.assertEqual((self.folder / "model.inp").read_bytes(), OLD_DECK)
                self.assertEqual(self.entries(), [b"model.inp", b"model.json"])

    def test_RunThatIsKilled_IsClearedUpByTheNextOneAlone(self):
        self.put("large.json", large_model(300000))
        dead, alive = self.caught_writing("large.json"), self.caught_writing("large.json")
        dead.kill()
        dead.wait()
        self.assertEqual(sum(n.startswith(b".qrxdeck") for n in self.entries()), 2)
        self.assertEqual(self.run_program("write", "model.json").returncode, 0)
        self.assertEqual(sum(n.startswith(b".qrxdeck") for n in self.entries()), 1)
        alive.send_signal(signal.SIGCONT)
        self.assertEqual(alive.wait(), 0)
        self.assertEqual(self.entries(), [b"large.inp", b"large.json", b"model.inp", b"model.json"])


def no_core():
    resource.setrlimit(resource.RLIMIT_CORE, (0, 0))


class Files(ProgramTest):
    def test_ReplacedDeck_KeepsItsRights(self):
        deck = self.folder / "model.inp"
        for mode in [0o600, 0o664, 0o640]:
            deck.write_bytes(OLD_DECK)
            deck.chmod(mode)
            self.assertEqual(self.run_program("write", "model.json").returncode, 0)
            self.assertEqual(deck.read_bytes(), DECK)
            self.assertEqual(deck.stat().st_mode & 0o7777, mode)

    def test_LinkAtTheTarget_IsFollowed(self):
        (self.folder / "decks").mkdir()
        (self.folder / "decks" / "real.inp").write_bytes(OLD_DECK)
        (self.folder / "model.inp").symlink_to("decks/real.inp")
        self.assertEqual(self.run_program("write", "model.json").returncode, 0)
        self.assertTrue((self.folder / "model.inp").is_symlink())
        self.assertEqual((self.folder / "decks" / "real.inp").read_bytes(), DECK)
        self.assertEqual(self.entries("decks"), [b"real.inp"])

    def test_DeckThatMayNotBeWritten_IsRefused(self):
        deck = self.folder / "model.inp"
        deck.write_bytes(OLD_DECK)
        deck.chmod(0o444)
        program, other = PROGRAM, {}
        if os.geteuid() == 0:
            program = shutil.copy(PROGRAM, self.folder)
            for path in [self.folder, deck, self.folder / "model.json"]:
                os.chown(path, 65534, 65534)
            other = {"user": 65534, "group": 65534, "extra_groups": []}
        run = self.run_program("write", "model.json", program=program, **other)
        self.assert_refused(run, 3, "model.inp: error: the file in its place may not be written: "
                            "Permission denied\n")
        self.assertEqual(deck.read_bytes(), OLD_DECK)

    def test_AbsoluteJobBesideAnOutputFolder_IsWrongUsage(self):
        job = str(self.folder / "job")
        run = self.run_program("write", "model.json", "--job", job, "--output-dir", "elsewhere")
        self.assert_refused(run, 2)
        self.assertIn("absolute", run.errors)
        self.assertEqual(self.run_program("write", "model.json", "--job", job).returncode, 0)
        self.assertEqual((self.folder / "job.inp").read_bytes(), DECK)

    def test_NamesOfFiles_DoNotActOnTheTerminal(self):
        name = "a\x1b[31m\nb"
        (self.folder / (name + ".json")).write_text(json.dumps(MODEL))
        for arguments in [["write"], ["check"], ["format", "--check"]]:
            run = self.run_program(arguments[0], name + ".json", *arguments[1:])
            self.assertNotIn("\x1b", run.output + run.errors)
            self.assertIn("a\\x1B[31m\\x0Ab", run.output)
        run = self.run_program("check", "none" + name)
        self.assertIn("none" + "a\\x1B[31m\\x0Ab: error:", run.errors)
        self.assertNotIn("\x1b", run.errors)

    def test_ReportThatCannotBePutOut_LeavesTheOldDeck(self):
        deck = self.folder / "model.inp"
        deck.write_bytes(OLD_DECK)
        with open("/dev/full", "wb") as full:
            run = self.run_program("write", "model.json", stdout=full, stderr=subprocess.PIPE, capture_output=False)
        self.assertEqual(run.returncode, 3)
        self.assertTrue(run.errors.endswith("standard output: error: No space left on device\n"), run.errors)
        self.assertEqual(deck.read_bytes(), OLD_DECK)
        run = self.run_program("write", "model.json", preexec_fn=lambda: os.close(1))
        self.assert_refused(run, 3, "standard output: error: it is closed\n")
        self.assertEqual(deck.read_bytes(), OLD_DECK)
        self.assertEqual(self.entries(), [b"model.inp", b"model.json"])

    def test_ReportInJsonThatIsLost_IsCodeSixAndTheDeckStands(self):
        with open("/dev/full", "wb") as full:
            run = self.run_program("write", "model.json", "--json", stdout=full, stderr=subprocess.PIPE,
                                   capture_output=False)
        self.assertEqual(run.returncode, 6)
        self.assertEqual((self.folder / "model.inp").read_bytes(), DECK)

    def test_ClosedStreams_DoNotGetIntoTheDeck(self):
        def close_all():
            for number in range(3):
                os.close(number)
        subprocess.run([PROGRAM, "write", "model.json", "--json"], cwd=self.folder, preexec_fn=close_all)
        self.assertFalse((self.folder / "model.inp").exists())
        subprocess.run([PROGRAM, "write", "model.json"], cwd=self.folder, stdout=subprocess.DEVNULL,
                       preexec_fn=lambda: os.close(2))
        self.assertEqual((self.folder / "model.inp").read_bytes(), DECK)

    def test_SchemaFile_IsReplacedAsAWhole(self):
        path = self.folder / "schema.json"
        path.write_bytes(OLD_DECK)
        run = self.run_program(
            "schema", "--output", "schema.json",
            preexec_fn=lambda: resource.setrlimit(resource.RLIMIT_FSIZE, (4096, resource.RLIM_INFINITY)))
        self.assertEqual(run.returncode, 3)
        self.assertEqual(path.read_bytes(), OLD_DECK)
        self.assertEqual(self.entries(), [b"model.json", b"schema.json"])

    def test_LastingShortageOfMemory_IsCodeThreeWhateverIsAsked(self):
        def limit(mebibytes):
            return lambda: resource.setrlimit(resource.RLIMIT_AS, (mebibytes << 20, resource.RLIM_INFINITY))
        # The libraries alone take some; sanitizers take more than can be had.
        least = next((size for size in range(16, 257, 16)
                      if self.run_program("--version", preexec_fn=limit(size)).returncode == 0), None)
        if least is None:
            self.skipTest("a program with sanitizers does not start in so little memory")
        self.put("model.json", large_model(200000))
        codes = set()
        for command in [["write"], ["check"], ["info"], ["write", "--json"], ["info", "--json"], ["format"]]:
            deck = self.folder / "model.inp"
            for mebibytes in range(least, least + 60, 9):
                deck.write_bytes(OLD_DECK)
                run = self.run_program(command[0], "model.json", *command[1:], preexec_fn=limit(mebibytes))
                with self.subTest(command=command, mebibytes=mebibytes, errors=run.errors):
                    self.assertIn(run.returncode, [0, 3])
                    codes.add(run.returncode)
                    if run.returncode == 3:
                        self.assertEqual(deck.read_bytes(), OLD_DECK)
                        if "--json" in command and run.output:
                            self.assertEqual(json.loads(run.output)["exitCode"], 3)
                    self.assertEqual([n for n in self.entries() if n.startswith(b".")], [])
        self.assertEqual(codes, {0, 3})


class OtherCommands(ProgramTest):
    def test_Check_OfARightModel_SaysSoAndWritesNothing(self):
        run = self.run_program("check", "model.json")
        self.assertEqual((run.returncode, run.output, run.errors), (0, "model.json: no errors\n", ""))
        self.assertEqual(self.entries(), [b"model.json"])

    def test_Check_WithWarningsAlone_IsCodeZero(self):
        def empty_set(model):
            model["parts"]["ROD"]["mesh"]["sets"].append({"name": "NONE", "kind": "node", "labels": []})
        self.put("model.json", changed(empty_set))
        run = self.run_program("check", "model.json")
        self.assertEqual(run.returncode, 0)
        self.assertRegex(run.errors, r"^model\.json:\d+:\d+: warning: .* \(/models/Default Model/parts/ROD/mesh/sets/1\) ")
        result = json.loads(self.run_program("check", "model.json", "--json").output)
        self.assertEqual((result["exitCode"], [m["severity"] for m in result["messages"]]), (0, ["warning"]))

    def test_Check_OfGasketOptionsThatNothingAsksFor_WarnsOfThem(self):
        self.put("model.json", changed(lambda model: model.update(
            materials={"RING": {"density": {"table": [[1]]}, "membraneElastic": {"table": [[2, 0.3]]}}})))
        run = self.run_program("check", "model.json")
        self.assertEqual((run.returncode, by_place(run.errors)),
                         (0, "model.json: warning: /models/Default Model/materials/RING/membraneElastic: no "
                             "gasket section names this material, so this will not stand in the deck\n"
                             "model.json: note: /models/Default Model/materials: nothing uses 1 of the "
                             "materials: RING\n"))
        run = self.run_program("write", "model.json")
        self.assertRegex(run.output, r"left out, since a deck can't carry it:\n +1  gasket options \(no gasket "
                                     r"section names their materials\): RING membraneElastic\n$")

    def test_Write_OfAGasketWithFurtherOptions_WarnsOfThem(self):
        self.put("model.json", changed(lambda model: model.update(
            materials={"RING": {"density": {"table": [[1]]}, "membraneElastic": {"table": [[2, 0.3]]}}},
            sections={"S": {"class": "kseC_GasketSection", "materialName": "RING"}})))
        run = self.run_program("write", "model.json")
        self.assertIn("/materials/RING/density: the material is a gasket behaviour", by_place(run.errors))
        self.assertRegex(run.output, r" +1  other options of gasket materials \(a gasket behaviour has no place "
                                     r"for them\): RING density\n$")

    def test_Check_OfAModelNamedLikeACommand_Works(self):
        self.put("info", MODEL)
        run = self.run_program("check", "info")
        self.assertEqual((run.returncode, run.output), (0, "info: no errors\n"))

    def test_Info_TellsWhatIsInTheModel(self):
        run = self.run_program("info", "model.json")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertEqual(run.output, 'model "Default Model"\n'
                         "  parts (1)\n"
                         "    ROD  2 nodes, 1 elements: 1 R2D2\n"
                         "  instances (1)\n"
                         "    ROD-1  of ROD  moved by (0, 1, 0)\n"
                         "  sets\n"
                         "    part ROD  1 node sets  0 element sets  0 surfaces\n"
                         "  steps (1)\n"
                         "       name     procedure  nlgeom  period  initial  min  max  load cases\n"
                         "    0  Initial  initial\n")

    def test_Info_ShowsTheAnalysisAsATableOfSteps(self):
        self.put("model.json", changed(lambda model: model["steps"].extend([
            {"name": "Press", "class": "kprC_StaticStep", "nlgeom": "ON", "timePeriod": 2.5, "initialInc": 0.1,
             "maxInc": 0.5},
            {"name": "Cases", "class": "kprC_StaticLinearPerturbationStep",
             "loadCases": {"up": {}, "down": {}}},
            {"name": "Hit", "class": "kprC_ExplicitDynamicsStep", "timePeriod": 1e-3, "suppressed": True},
            {"name": "Snap", "class": "kprC_StaticRiksStep"},
        ])))
        run = self.run_program("info", "model.json")
        self.assertEqual(run.returncode, 0, run.errors)
        self.assertTrue(run.output.endswith(
            "  steps (5)\n"
            "       name     procedure                   nlgeom  period  initial  min    max    load cases\n"
            "    0  Initial  initial\n"
            "    1  Press    static                      on      2.5     0.1      1e-05  0.5    -\n"
            "    2  Cases    static linear perturbation  off     -       -        -      -      down, up\n"
            "    3  Hit      explicit dynamics           on      0.001   0        -      -      -\n"
            "    4  Snap     static riks                 off     1       1        1e-05  1e+36  -\n"), run.output)
        model = json.loads(self.run_program("info", "model.json", "--json").output)["models"]["Default Model"]
        self.assertEqual(model["steps"][0], {
            "name": "Initial", "class": "InitialStep", "procedure": "initial", "perturbation": False,
            "explicit": False, "suppressed": False})
        self.assertEqual(model["steps"][2], {
            "name": "Cases", "class": "StaticLinearPerturbationStep",
            "procedure": "static linear perturbation", "perturbation": True, "explicit": False,
            "suppressed": False, "nlgeom": False, "increments": {}, "loadCases": ["down", "up"]})
        self.assertEqual(model["steps"][3], {
            "name": "Hit", "class": "ExplicitDynamicsStep", "procedure": "explicit dynamics",
            "perturbation": False, "explicit": True, "suppressed": True, "nlgeom": True, "period": 0.001,
            "increments": {"initial": 0.0}, "loadCases": []})

    def test_InfoWithHistory_IsATableOfObjectsBySteps(self):
        def conditions(model):
            model["steps"].extend([{"name": "Press", "class": "kprC_StaticStep"},
                                   {"name": "Cases", "class": "kprC_StaticLinearPerturbationStep",
                                    "loadCases": {"up": {"bcs": {"Tip": 2}}}},
                                   {"name": "Release", "class": "kprC_StaticStep"}])
            support = {"class": "TypeBC", "region": "ROD-1.TIP"}
            model["boundaryConditions"] = {
                "Hold": dict(support, states={"Initial": {"typeName": "PINNED"}, "Release": {"deactivated": True}}),
                "Off": dict(support, suppressed=True, states={"Initial": {"typeName": "PINNED"}}),
                "Tip": dict(support, states={"Press": {"typeName": "XSYMM"}})}
            model["loads"] = {
                "Bolt": {"class": "BoltLoad", "region": "ROD-1.TIP",
                         "states": {"Press": {"magnitude": 5}, "Release": {"boltMethod": "FIX_LENGTH"}}}}
        self.put("model.json", changed(conditions))
        run = self.run_program("info", "model.json", "--history")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertTrue(run.output.endswith(
            "  history of boundary conditions\n"
            "                      Initial    Press       Cases                         Release\n"
            "    Hold              created *  propagated  propagated from base state !  deactivated !\n"
            "    Off (suppressed)  created    propagated  propagated from base state    propagated\n"
            "    Tip               -          created *   propagated from base state !  propagated !\n"
            "  history of loads\n"
            "          Initial  Press      Cases                  Release\n"
            "    Bolt  -        created *  built into base state  modified !\n"
            "  (* written in the step, ! with op=NEW; of interactions and output requests only the status)\n"),
            run.output)
        plain = self.run_program("info", "model.json")
        self.assertNotIn("history", plain.output)
        model = json.loads(self.run_program("info", "model.json", "--history", "--json").output)["models"]["Default Model"]
        self.assertEqual(model["history"]["boundaryConditions"]["Hold"], {
            "class": "TypeBC", "suppressed": False, "steps": [
                {"step": "Initial", "status": "CREATED", "written": True, "opNew": False},
                {"step": "Press", "status": "PROPAGATED", "written": False, "opNew": False},
                {"step": "Cases", "status": "PROPAGATED_FROM_BASE_STATE", "written": True, "opNew": True},
                {"step": "Release", "status": "DEACTIVATED", "written": True, "opNew": True}]})
        self.assertEqual(model["history"]["interactions"], {})

    def test_InfoWithHistory_OfAModelWithoutObjects_AddsNothing(self):
        self.assertEqual(self.run_program("info", "model.json", "--history").output,
                         self.run_program("info", "model.json").output)

    def test_Check_OfConditionsThatNameWhatIsNotThere_TellsAllOfIt(self):
        def conditions(model):
            model["steps"].append({"name": "Cases", "class": "kprC_StaticLinearPerturbationStep",
                                   "loadCases": {"up": {"bcs": {"Tipp": 2}, "loads": {"Bolts": 1}}}})
            model["boundaryConditions"] = {
                "Tip": {"class": "TypeBC", "region": "ROD-1.TIPP",
                        "states": {"Casez": {"typeName": "PINNED"}, "Initial": {"typeName": "FREE"}}},
                "Wire": {"class": "kbcC_ConnVelocityBC", "connectors": ["ROD-1.WIRE"], "datum": "System",
                         "states": {"Initial": {"v1": 0, "amplitude": "Ramp"}, "Cases": {"u1": 0}}}}
        self.put("model.json", changed(conditions))
        run = self.run_program("check", "model.json")
        self.assertEqual(run.returncode, 1)
        for place in ["steps/1/loadCases/up/bcs/Tipp", "steps/1/loadCases/up/loads/Bolts", "boundaryConditions/Tip/region",
                      "boundaryConditions/Tip/states/Casez", "boundaryConditions/Tip/states/Initial/typeName",
                      "boundaryConditions/Wire/connectors/0", "boundaryConditions/Wire/datum",
                      "boundaryConditions/Wire/states/Initial/amplitude", "boundaryConditions/Wire/states/Cases/u1"]:
            self.assertIn("model.json: error: /models/Default Model/" + place + ": found ",
                          by_place(run.errors))
        self.assertEqual(len(run.errors.splitlines()), 9, run.errors)

    def test_Check_OfASubmodelWithANegativeTolerance_Warns(self):
        def conditions(model):
            model["boundaryConditions"] = {
                "Cut": {"class": "kbcC_SubmodelBC", "region": "ROD-1.TIP", "shellThickness": -1.5,
                        "absoluteExteriorTolerance": -0.5, "exteriorTolerance": -2.5,
                        "states": {"Initial": {"dofs": [1]}}}}
        self.put("model.json", changed(conditions))
        run = self.run_program("check", "model.json")
        cut = "model.json: warning: /models/Default Model/boundaryConditions/Cut/"
        self.assertEqual((run.returncode, by_place(run.errors).splitlines()), (0, [
            cut + "shellThickness: found -1.5, expected 0 or more",
            cut + "absoluteExteriorTolerance: found -0.5, expected 0 or more",
            cut + "exteriorTolerance: found -2.5, expected 0 or more"]))

    def test_Check_ForetellsWhatIsOddAboutSteps(self):
        self.put("model.json", changed(lambda model: model["steps"].extend([
            {"name": "A", "class": "kprC_StaticStep", "loadCases": {"up": {}}},
            {"name": "B", "class": "kprC_StaticStep", "suppressed": True},
            {"name": "C", "class": "kprC_ComplexFrequencyStep"},
        ])))
        run = self.run_program("check", "model.json")
        steps = "model.json: warning: /models/Default Model/steps/"
        self.assertEqual((run.returncode, run.output), (0, "model.json: no errors\n"))
        self.assertEqual(by_place(run.errors).splitlines(), [
            steps + "1/loadCases: found load cases, expected none: this procedure allows none",
            steps + "2/suppressed: found true, which changes nothing: a suppressed step is written like any "
                    "other",
            steps + "3/class: found a complex frequency step, of which no deck can be written: writing fails "
                    "with \"Unimplemented function to write out *Step card\""])

    def test_InfoInJson_HasTheSame(self):
        model = json.loads(self.run_program("info", "model.json", "--json").output)["models"]["Default Model"]
        self.assertEqual(model["parts"]["ROD"]["mesh"], {"nodes": 2, "elements": 1, "elementTypes": {"R2D2": 1}})
        self.assertEqual(model["parts"]["ROD"]["sets"], {"node": {"TIP": 1}, "element": {}, "surface": {}})
        self.assertEqual(model["instances"]["ROD-1"]["translation"], [0, 1, 0])
        self.assertEqual([step["class"] for step in model["steps"]], ["InitialStep"])

    def test_Schema_IsJsonAndTheSameInAFile(self):
        run = self.run_program("schema")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertIsInstance(json.loads(run.output), dict)
        self.assertEqual(self.run_program("schema", "--output", "schema.json").returncode, 0)
        self.assertEqual((self.folder / "schema.json").read_text(), run.output)

    def test_SchemaInAFolderThatIsNotThere_IsCodeThree(self):
        run = self.run_program("schema", "--output", "none/schema.json")
        self.assert_refused(run, 3, "none/schema.json: error: cannot open the folder 'none': "
                            "No such file or directory\n")

    def test_SchemaOntoADevice_IsCodeThree(self):
        run = self.run_program("schema", "--output", "/dev/full")
        self.assert_refused(run, 3, "/dev/full: error: something that is no file is in its place\n")

    def test_Version_IsOnALineOfItsOwn(self):
        run = self.run_program("--version")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertRegex(run.output, r"^qrxdeck \d+\.\d+\.\d+( \([0-9a-f]{12}\+?\))?\n$")

    def test_Help_NamesCommandsAndExitCodes(self):
        run = self.run_program("--help")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        for word in ["write", "check", "info", "format", "schema", "--version", "Exit codes:"]:
            self.assertIn(word, run.output)
        self.assertIn("--output-dir DIR", self.run_program("write", "--help").output)


class Format(ProgramTest):
    CANONICAL = """\
{
  "format": "qrx-model/1",
  "models": {
    "Default Model": {
      "topLevelSolverInput": ["*Heading"],
      "assembly": {}
    }
  }
}
"""
    COMMENTED = """\
// A heading.
{"format": "qrx-model/1", "models": {"Default Model":
    {"topLevelSolverInput": "*Heading\\n", "absoluteZero": 0, "assembly": {"name": "Assembly"}}}}
"""

    def test_ToTheStandardOutput_LeavesTheFileAsItIs(self):
        self.put("model.json", self.COMMENTED)
        run = self.run_program("format", "model.json")
        self.assertEqual((run.returncode, run.errors), (0, "model.json: warning: its comments are left out\n"))
        self.assertEqual(run.output, self.CANONICAL)
        self.assertEqual((self.folder / "model.json").read_text(), self.COMMENTED)

    def test_OntoTheFileItself_ReplacesIt(self):
        self.put("model.json", self.COMMENTED.split("\n", 1)[1])
        run = self.run_program("format", "model.json", "-o", "model.json")
        self.assertEqual((run.returncode, run.output, run.errors), (0, "", ""))
        self.assertEqual((self.folder / "model.json").read_text(), self.CANONICAL)
        self.assertEqual(self.entries(), [b"model.json"])

    def test_Check_TellsTheNameOfAFileThatIsNotCanonical(self):
        self.put("model.json", self.COMMENTED)
        run = self.run_program("format", "--check", "model.json")
        self.assertEqual((run.returncode, run.output, run.errors), (1, "model.json\n", ""))
        self.put("model.json", self.CANONICAL)
        run = self.run_program("format", "--check", "model.json")
        self.assertEqual((run.returncode, run.output, run.errors), (0, "", ""))

    def test_InJson_TheTextIsAMember(self):
        self.put("model.json", self.COMMENTED)
        run = self.run_program("format", "model.json", "--json")
        self.assertEqual(json.loads(run.output)["formatted"],
                         {"file": "model.json", "wasCanonical": False, "text": self.CANONICAL})

    def test_WrongModel_IsCodeOneAndNothingIsWritten(self):
        self.put("model.json", '{"format": "qrx-model/1"}')
        self.assert_refused(self.run_program("format", "model.json", "-o", "out.json"), 1,
                            "model.json:1:1: error: found nothing, expected an object of models (/models) [missing-field]\n")
        self.assertEqual(self.entries(), [b"model.json"])

    def test_FileThatCannotBeReadOrWritten_IsCodeThree(self):
        self.assert_refused(self.run_program("format", "none.json"), 3,
                            "none.json: error: the file can't be read: No such file or directory [unreadable-file]\n")
        run = self.run_program("format", "model.json", "-o", "none/out.json")
        self.assert_refused(run, 3, "none/out.json: error: cannot open the folder 'none': "
                            "No such file or directory\n")

    def test_FileThatOutgrowsItsLimit_LeavesTheOldFile(self):
        self.put("model.json", large_model(20000))
        old = (self.folder / "model.json").read_bytes()
        run = self.run_program(
            "format", "model.json", "-o", "model.json",
            preexec_fn=lambda: resource.setrlimit(resource.RLIMIT_FSIZE, (4096, resource.RLIM_INFINITY)))
        self.assert_refused(run, 3, "model.json: error: cannot write the model file: File too large\n")
        self.assertEqual((self.folder / "model.json").read_bytes(), old)
        self.assertEqual(self.entries(), [b"model.json"])

    def test_CheckAndOutput_ExcludeEachOther(self):
        self.assert_refused(self.run_program("format", "model.json", "--check", "-o", "out.json"), 2)


class Variables(ProgramTest):
    def rows(self, *arguments):
        """The columns of each line, the header first."""
        run = self.run_program("variables", *arguments)
        self.assertEqual((run.returncode, run.errors), (0, ""))
        return [re.split("  +", line) for line in run.output.splitlines()]

    def test_OfAllProcedures_IsATableWithAColumnForThem(self):
        header, *rows = self.rows()
        self.assertEqual(header, ["name", "channels", "keyword", "place", "procedures", "meaning (components)"])
        by_name = {row[0]: row for row in rows}
        self.assertEqual(len(by_name), len(rows))
        self.assertEqual(by_name["U"], ["U", "field, history", "*Node Output", "node", "20",
                                        "displacements and rotations (U1 U2 U3 UR1 UR2 UR3 WARP)"])
        self.assertEqual(by_name["EVOL"][4], "all")
        self.assertEqual(by_name["DT"][1:5], ["history", "*Incrementation Output", "whole set",
                                              "ExplicitDynamics TempDisplacementDynamics"])
        self.assertEqual(by_name["HFL"][2], "*Element Output, *Contact Output")

    def test_OfOneProcedure_ShowsWhatIsPreselected(self):
        header, *rows, legend = self.rows("--step-type", "Buckle")
        self.assertEqual(header, ["name", "channels", "keyword", "place", "meaning (components)"])
        self.assertEqual(legend, ["* preselected"])
        channels = {row[0]: row[1] for row in rows}
        self.assertEqual(channels["U"], "field*, history")
        self.assertEqual(channels["RF"], "field, history")
        self.assertNotIn("ALLKE", channels)
        channels = {row[0]: row[1] for row in self.rows("--step-type", "Static")[1:-1]}
        self.assertEqual(channels["ALLKE"], "history*")

    def test_StepTypes_AreKnownByShortAndByWholeNamesInAnyCapitals(self):
        expected = self.run_program("variables", "--step-type", "StaticRiks").output
        for name in ["staticriks", "STATICRIKSSTEP", "StaticRiksStep", "kprC_StaticRiksStep", "KPRC_staticriksstep"]:
            with self.subTest(name=name):
                run = self.run_program("variables", "--step-type", name)
                self.assertEqual((run.returncode, run.output), (0, expected))

    def test_StepTypeThatIsNotThere_IsCodeTwoAndNamesThoseThatAre(self):
        for name in ["Nosuch", "Step", "kprC_StaticRiks", "kprC_InitialStep", "kprC_AnalysisStep", " Static"]:
            with self.subTest(name=name):
                run = self.run_program("variables", "--step-type", name)
                self.assert_refused(run, 2)
                self.assertRegex(run.errors, "^qrxdeck: error: there is no step type '%s'; the step types are "
                                             "Static, StaticRiks, .*, SteadyStateSubspace\n$" % name)
        run = self.run_program("variables", "--json", "--step-type", "Nosuch")
        self.assertEqual((run.returncode, run.errors), (2, ""))
        result = json.loads(run.output)
        self.assertEqual(result["exitCode"], 2)
        self.assertNotIn("variables", result)

    def test_InJson_EveryVariableHasItsProcedures(self):
        result = json.loads(self.run_program("variables", "--json").output)
        self.assertEqual((result["exitCode"], result["messages"]), (0, []))
        by_name = {variable["name"]: variable for variable in result["variables"]}
        self.assertEqual(len(by_name), len(result["variables"]))
        self.assertEqual(by_name["DT"], {
            "name": "DT", "meaning": by_name["DT"]["meaning"], "components": [],
            "keyword": "*Incrementation Output", "location": "WHOLE SET", "field": False, "history": True,
            "procedures": ["ExplicitDynamics", "TempDisplacementDynamics"], "preselectField": [],
            "preselectHistory": ["ExplicitDynamics", "TempDisplacementDynamics"]})
        self.assertEqual(by_name["S"]["components"], ["S11", "S22", "S33", "S12", "S13", "S23"])

    def test_InJsonOfOneProcedure_TheListsNameThatOneAlone(self):
        run = self.run_program("variables", "--json", "--step-type", "static")
        by_name = {variable["name"]: variable for variable in json.loads(run.output)["variables"]}
        self.assertEqual(by_name["U"]["procedures"], ["Static"])
        self.assertEqual(by_name["U"]["preselectField"], ["Static"])
        self.assertEqual(by_name["U"]["preselectHistory"], [])
        self.assertNotIn("NT", by_name)


if __name__ == "__main__":
    PROGRAM = os.path.abspath(sys.argv.pop(1))
    unittest.main()
