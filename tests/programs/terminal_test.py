#!/usr/bin/env python3
"""What qrxdeck does on a terminal, with streams, and with several files in one call.

usage: terminal_test.py PROGRAM PROJECT
"""

import fcntl
import json
import os
import pathlib
import pty
import re
import select
import shutil
import signal
import struct
import subprocess
import sys
import tempfile
import termios
import time
import unittest

from rigid_link import MODEL, changed

PROGRAM = str(pathlib.Path(sys.argv[1]).resolve())
PROJECT = pathlib.Path(sys.argv[2]).resolve()
ERASE = b"\r\x1b[K"


def with_warning(model):
    """Nothing refers to the material, and it is empty: a note and a warning."""
    model["materials"] = {"Spare": {}}


def with_many_nodes(nodes):
    def enlarge(model):
        model["parts"]["ROD"]["mesh"]["nodes"] = {
            "labels": {"from": 1, "to": nodes}, "coordinates": [[0.123456, 1.5, 2.25]] * nodes}
        model["ignore"] = [{"code": code, "reason": "they only take time"} for code in ("repeated-nodes", "unused-nodes")]
    return enlarge


class Program(unittest.TestCase):
    maxDiff = None

    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrxdeck_terminal_"))
        self.addCleanup(shutil.rmtree, self.folder)
        self.put("bridge.json", MODEL)
        self.environment = {**os.environ, "TERM": "xterm", "TMPDIR": str(self.folder)}
        self.environment.pop("NO_COLOR", None)

    def put(self, name, model):
        path = self.folder / name
        path.parent.mkdir(exist_ok=True)
        path.write_text(model if isinstance(model, str) else json.dumps(model), encoding="utf-8")
        return path

    def run_program(self, *words, **options):
        run = subprocess.run([PROGRAM, *words], cwd=self.folder, env=self.environment, capture_output=True, **options)
        run.output, run.errors = run.stdout.decode(), run.stderr.decode()
        return run

    @staticmethod
    def halt(run, seconds):
        time.sleep(0.05)
        run.send_signal(signal.SIGSTOP)
        time.sleep(seconds)
        run.send_signal(signal.SIGCONT)

    def on_terminal(self, *words, columns=80, stdout=None, pause=0.0):
        """The exit code, and all that a terminal was sent: on both streams, or the standard error alone.

        With a pause the run is halted soon after its beginning, so that it takes as long by the clock as a larger one.
        """
        ours, theirs = pty.openpty()
        fcntl.ioctl(theirs, termios.TIOCSWINSZ, struct.pack("HHHH", 24, columns, 0, 0))
        run = subprocess.Popen([PROGRAM, *words], cwd=self.folder, env=self.environment, stdin=theirs,
                               stdout=theirs if stdout is None else stdout, stderr=theirs)
        os.close(theirs)
        if pause:
            self.halt(run, pause)
        seen = b""
        while True:
            try:
                ready, _, _ = select.select([ours], [], [], 120)
                part = os.read(ours, 65536) if ready else b""
            except OSError:  # the other end is closed
                part = b""
            if not part:
                break
            seen += part
        os.close(ours)
        return run.wait(), seen


class Help(Program):
    def verbs(self):
        listed = self.run_program("help").output
        return re.findall(r"^  ([a-z]+)  ", listed.split("Commands:\n")[1].split("\n\n")[0], re.MULTILINE)

    def test_ProgramAlone_ListsTheCommands(self):
        run = self.run_program()
        self.assertEqual((run.returncode, run.output), (2, ""))
        for verb in ["write", "check", "explain", "completion"]:
            self.assertRegex(run.errors, rf"(?m)^  {verb}  +[A-Z]")

    def test_HelpOfEveryCommand_EndsWithAnExample(self):
        self.assertGreater(len(self.verbs()), 12)
        for verb in self.verbs():
            with self.subTest(verb=verb):
                run = self.run_program("help", verb)
                self.assertEqual((run.returncode, run.errors), (0, ""))
                self.assertRegex(run.output.split("\n\n")[-1], rf"^Examples?:\n  qrxdeck {verb}\b")
                self.assertEqual(self.run_program(verb, "--help").output, run.output)

    def test_Help_FitsTheTerminal(self):
        for columns in (60, 100):
            code, seen = self.on_terminal("help", "write", columns=columns)
            self.assertEqual(code, 0)
            lines = [line for line in seen.decode().replace("\r", "").split("\n") if not line.startswith("  qrxdeck")]
            self.assertLessEqual(max(len(line) for line in lines), columns)
            self.assertGreater(max(len(line) for line in lines), columns - 15)

    def test_EveryExample_Works(self):
        shutil.copytree(PROJECT / "examples", self.folder / "examples")
        self.put("frame.json", MODEL)
        shutil.copy(self.mesh(), self.folder / "plate.msh")
        self.put("loads.csv", "/models/Default Model/parts/ROD/mesh/nodes/coordinates/1/0,name\n2.5,one\n3,two\n")
        self.run_program("write", "bridge.json")
        self.run_program("format", "bridge.json", "-o", "bridge.json")
        self.run_program("format", "frame.json", "-o", "frame.json")
        shutil.copy(self.folder / "bridge.inp", self.folder / "old.inp")
        (self.folder / "decks").mkdir()
        (self.folder / "bin").mkdir()
        (self.folder / "bin" / "qrxdeck").symlink_to(PROGRAM)
        environment = {**self.environment, "PATH": f"{self.folder / 'bin'}:{os.environ['PATH']}"}
        for verb in self.verbs():
            text = self.run_program("help", verb).output
            for command in re.findall(r"^  (qrxdeck .+)$", text.split("Example")[-1], re.MULTILINE):
                if "--out decks" in command:
                    shutil.rmtree(self.folder / "decks")
                with self.subTest(command=command):
                    run = subprocess.run(["bash", "-c", command], cwd=self.folder, env=environment,
                                         capture_output=True, text=True, timeout=60)
                    needs_page = verb == "view" and "built without the page" in run.stderr
                    if "man -l" in command and shutil.which("man") is None or needs_page:
                        continue
                    self.assertEqual(run.returncode, 0, run.stderr)

    def mesh(self):
        path = self.folder / "one.msh"
        path.write_text("$MeshFormat\n2.2 0 8\n$EndMeshFormat\n$Nodes\n4\n1 0 0 0\n2 1 0 0\n3 0 1 0\n4 0 0 1\n$EndNodes\n"
                        "$Elements\n1\n1 4 2 1 1 1 2 3 4\n$EndElements\n")
        return path


class Streams(Program):
    def test_Minus_ReadsTheStandardInputAndWritesTheStandardOutput(self):
        self.assertEqual(self.run_program("write", "bridge.json").returncode, 0)
        deck = (self.folder / "bridge.inp").read_bytes()
        text = (self.folder / "bridge.json").read_bytes()
        for words in (["--job", "-"], ["-o", "-"], ["--output=-"]):
            with self.subTest(words=words):
                run = self.run_program("write", "-", *words, input=text)
                self.assertEqual((run.returncode, run.stdout, run.errors), (0, deck, ""))
        run = self.run_program("write", "-", "--job", "named", input=text)
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertEqual((self.folder / "named.inp").read_bytes(), deck)

    def test_DeckOnTheStandardOutput_HasNothingElseBesideIt(self):
        self.put("bridge.json", changed(lambda model: model.update(
            materials={"Spare": {}}, ignore=[{"code": "unused", "reason": "a library of materials"}])))
        run = self.run_program("write", "bridge.json", "-o", "-")
        self.assertEqual(run.returncode, 0)
        self.assertTrue(run.output.startswith("*Heading\n"))
        self.assertNotIn("ignored", run.output)
        self.assertRegex(run.errors, r"^bridge\.json:\d+:\d+: warning: .* \[empty-material\]\n$")

    def test_ModelThatNoDeckCanCarry_GivesNothingOnTheStandardOutput(self):
        self.put("bridge.json", changed(lambda model: model["steps"].append(
            {"name": "Whirl", "class": "ComplexFrequencyStep"})))
        run = self.run_program("write", "bridge.json", "-o", "-")
        self.assertEqual((run.returncode, run.stdout), (4, b""))
        self.assertIn("step 'Whirl'", run.errors)

    def test_FullStandardOutput_IsCodeThree(self):
        with open("/dev/full", "wb") as full:
            run = subprocess.run([PROGRAM, "write", "bridge.json", "-o", "-"], cwd=self.folder, stdout=full,
                                 stderr=subprocess.PIPE)
        self.assertEqual((run.returncode, run.stderr), (3, b"standard output: error: No space left on device\n"))

    def test_ErrorsInTheStandardInput_TellTheirLines(self):
        text = json.dumps(changed(lambda model: model.update(loads=3)), indent=1).encode()
        for words in (["write", "-", "-o", "-"], ["check", "-"], ["info", "-"], ["format", "-"]):
            with self.subTest(words=words):
                run = self.run_program(*words, input=text)
                self.assertEqual((run.returncode, run.stdout), (1, b""))
                line = 1 + text.split(b'"loads"')[0].count(b"\n")
                self.assertRegex(run.errors, rf"^<stdin>:{line}:\d+: error: found 3, .*\[wrong-value\]\n$")
        spare = json.dumps(changed(with_warning)).encode()
        self.assertRegex(self.run_program("check", "-", input=spare).errors, r"<stdin>:1:\d+: warning: .*empty-material")

    def test_WrongUsesOfStreams_AreCodeTwo(self):
        for words in (["write", "-"], ["write", "bridge.json", "-o", "-", "--json"],
                      ["write", "bridge.json", "-o", "-", "--verify"], ["view", "-"],
                      ["write", "bridge.json", "-o", "a.inp", "--job", "b"],
                      ["write", "bridge.json", "-o", "a.inp", "--output-dir", "b"]):
            with self.subTest(words=words):
                run = self.run_program(*words, input=b"{}")
                self.assertEqual((run.returncode, run.stdout if "--json" not in words else b""), (2, b""))

    def test_OutputFile_IsTakenAsItStandsAndALinkFollowed(self):
        self.assertEqual(self.run_program("write", "bridge.json", "-o", "deck.txt").returncode, 0)
        deck = (self.folder / "deck.txt").read_bytes()
        self.assertTrue(deck.startswith(b"*Heading\n"))
        (self.folder / "store").mkdir()
        (self.folder / "store" / "real.inp").write_bytes(b"** old\n")
        (self.folder / "link.inp").symlink_to("store/real.inp")
        self.assertEqual(self.run_program("write", "bridge.json", "-o", "link.inp").returncode, 0)
        self.assertTrue((self.folder / "link.inp").is_symlink())
        self.assertEqual((self.folder / "store" / "real.inp").read_bytes(), deck)
        self.assertEqual(os.listdir(self.folder / "store"), ["real.inp"])


class Several(Program):
    def setUp(self):
        super().setUp()
        self.put("frame.json", MODEL)
        self.put("wrong.json", changed(lambda model: model.update(loads=3)))
        self.put("whirl.json", changed(lambda model: model["steps"].append(
            {"name": "Whirl", "class": "ComplexFrequencyStep"})))

    def decks(self):
        return sorted(path.name for path in self.folder.glob("*.inp"))

    def test_AllModels_AreWrittenAndTheWorstCodeCounts(self):
        run = self.run_program("write", "wrong.json", "bridge.json", "whirl.json", "frame.json")
        self.assertEqual(run.returncode, 4)
        self.assertEqual(self.decks(), ["bridge.inp", "frame.inp"])
        self.assertEqual(re.findall(r"^(\w+\.inp): ", run.output, re.MULTILINE), ["bridge.inp", "frame.inp"])
        self.assertEqual(self.run_program("check", "bridge.json", "wrong.json", "frame.json").returncode, 1)
        self.assertEqual(self.run_program("check", "none.json", "wrong.json").returncode, 3)
        self.assertEqual(self.run_program("write", "bridge.json", "frame.json").returncode, 0)

    def test_FailFast_EndsWithTheFirstThatFails(self):
        run = self.run_program("write", "bridge.json", "wrong.json", "whirl.json", "frame.json", "--fail-fast")
        self.assertEqual((run.returncode, self.decks()), (1, ["bridge.inp"]))

    def test_InJson_EachHasAnObjectOfItsOwn(self):
        run = self.run_program("write", "wrong.json", "bridge.json", "--json")
        self.assertEqual((run.returncode, run.errors), (1, ""))
        result = json.loads(run.output)
        self.assertEqual(result["exitCode"], 1)
        self.assertEqual([(one["file"], one["exitCode"]) for one in result["runs"]],
                         [("wrong.json", 1), ("bridge.json", 0)])
        self.assertEqual([message["code"] for message in result["runs"][0]["messages"]], ["wrong-value"])
        self.assertEqual(result["runs"][1]["messages"], [])
        self.assertEqual(result["runs"][1]["written"]["target"], "bridge.inp")

    def test_TwoModelsOfOneDeck_AreRefusedAhead(self):
        self.put("other/bridge.json", MODEL)
        run = self.run_program("write", "bridge.json", "other/bridge.json")
        self.assertEqual((run.returncode, self.decks()), (2, []))
        self.assertIn("'bridge.json' and 'other/bridge.json' would have one deck, 'bridge.inp'", run.errors)
        self.assertEqual(self.run_program("write", "bridge.json", "frame.json", "--job", "x").returncode, 2)

    def test_ModelsAndDecks_AreCheckedTogether(self):
        self.run_program("write", "bridge.json")
        run = self.run_program("check", "bridge.json", "bridge.inp")
        self.assertEqual((run.returncode, run.output), (0, "bridge.json: no errors\nbridge.inp: no errors\n"))

    def test_FormatCheck_NamesAllThatAreNotCanonical(self):
        self.assertEqual(self.run_program("format", "frame.json", "-o", "frame.json").returncode, 0)
        self.put("b.json", MODEL)
        run = self.run_program("format", "--check", "b.json", "frame.json", "bridge.json")
        self.assertEqual((run.returncode, run.output), (1, "b.json\nbridge.json\n"))
        self.assertEqual(self.run_program("format", "b.json", "frame.json").returncode, 2)


class Messages(Program):
    def test_Message_IsAsEditorsReadIt(self):
        self.put("bridge.json", json.dumps(changed(lambda model: model.update(loads=3)), indent=1))
        run = self.run_program("check", "bridge.json")
        file, line, column, severity, _ = run.errors.split(":", 4)
        self.assertEqual((file, severity), ("bridge.json", " error"))
        text = (self.folder / "bridge.json").read_text().splitlines()
        self.assertTrue(text[int(line) - 1][int(column) - 1:].startswith('"loads"'))
        self.assertTrue(run.errors.endswith(" (/models/Default Model/loads) [wrong-value]\n"), run.errors)

    def test_FindingsOfContent_HaveLinesToo(self):
        self.put("bridge.json", json.dumps(changed(with_warning), indent=1))
        run = self.run_program("check", "bridge.json")
        self.assertEqual(len(run.errors.splitlines()), 2)
        for message in run.errors.splitlines():
            self.assertRegex(message, r"^bridge\.json:\d+:\d+: (warning|note): .* \[[a-z-]+\]$")

    def test_LongLists_ComeBehindTheHintAndAreCutToTheNearest(self):
        self.put("bridge.json", changed(lambda model: model.update(materialls={})))
        line = self.run_program("check", "bridge.json").errors
        self.assertIn("found an unknown member 'materialls'; did you mean 'materials'? Expected one of ", line)
        listed = line.split("Expected one of ")[1].split(", ... (")[0].split(", ")
        self.assertEqual(len(listed), 10)
        self.assertIn("materials", listed)
        self.assertRegex(line, r", \.\.\. \(\d+ more\) \(/models/Default Model/materialls\) \[unknown-member\]\n$")

    def test_BeyondFifty_TheRestIsCounted(self):
        self.put("bridge.json", changed(lambda model: model.update({f"wrong{i:03}": 1 for i in range(73)})))
        run = self.run_program("check", "bridge.json")
        lines = run.errors.splitlines()
        self.assertEqual((run.returncode, len(lines)), (1, 51))
        self.assertEqual(lines[-1], "bridge.json: ... and 23 errors more; --all shows them")
        run = self.run_program("check", "bridge.json", "--all")
        self.assertEqual(len(run.errors.splitlines()), 73)
        result = json.loads(self.run_program("check", "bridge.json", "--json").output)
        self.assertEqual((len(result["messages"]), result["more"]), (50, {"errors": 23}))

    def test_Colours_AreOfTerminalsAlone(self):
        self.put("bridge.json", changed(with_warning))
        code, seen = self.on_terminal("check", "bridge.json")
        self.assertEqual(code, 0)
        self.assertIn(b"\x1b[1;35mwarning:\x1b[0m ", seen)
        self.assertNotIn("\x1b", self.run_program("check", "bridge.json").errors)
        self.assertNotIn(b"\x1b[", self.on_terminal("check", "bridge.json", "--color=never")[1])
        self.assertNotIn(b"\x1b[", self.on_terminal("--color", "never", "check", "bridge.json")[1])
        self.assertIn("\x1b[1;35mwarning:", self.run_program("check", "bridge.json", "--color", "always").errors)
        self.environment["NO_COLOR"] = "1"
        self.assertNotIn(b"\x1b[", self.on_terminal("check", "bridge.json")[1])
        self.environment["NO_COLOR"] = ""
        self.assertIn(b"\x1b[1;35m", self.on_terminal("check", "bridge.json")[1])
        self.environment["TERM"] = "dumb"
        self.assertNotIn(b"\x1b[", self.on_terminal("check", "bridge.json")[1])
        self.assertEqual(self.run_program("check", "bridge.json", "--color=sometimes").returncode, 2)

    def test_ColoursOfDifferences_FollowTheSameOption(self):
        self.run_program("write", "bridge.json")
        other = (self.folder / "bridge.inp").read_text().replace("2.5", "2.75")
        (self.folder / "other.inp").write_text(other)
        self.assertNotIn("\x1b", self.run_program("diff", "bridge.inp", "other.inp").output)
        self.assertIn("\x1b[33m", self.run_program("diff", "bridge.inp", "other.inp", "--color=always").output)


class Strictness(Program):
    def setUp(self):
        super().setUp()
        self.put("bridge.json", changed(with_warning))

    def test_Strict_MakesErrorsOfWarningsAndWritesNoDeck(self):
        for verb in ("check", "write"):
            with self.subTest(verb=verb):
                self.assertEqual(self.run_program(verb, "bridge.json").returncode, 0)
                (self.folder / "bridge.inp").unlink(missing_ok=True)
                run = self.run_program(verb, "bridge.json", "--strict")
                self.assertEqual((run.returncode, run.output), (1, ""))
                self.assertRegex(run.errors, r"(?m)^bridge\.json:\d+:\d+: error: .* \[empty-material\]$")
                self.assertRegex(run.errors, r"(?m)^bridge\.json:\d+:\d+: note: .* \[unused\]$")
                self.assertFalse((self.folder / "bridge.inp").exists())
        message = json.loads(self.run_program("check", "bridge.json", "--strict", "--json").output)["messages"][0]
        self.assertEqual((message["severity"], message["code"]), ("error", "empty-material"))

    def test_Strict_TakesWarningsThatTheDeckMakes(self):
        self.put("bridge.json", changed(lambda model: model.update(
            loads={"Late": {"class": "ConcentratedForce", "region": "ROD-1.NONE"}})))
        self.put("bridge.json", changed(lambda model: model.update(
            boundaryConditions={"Held": {"class": "TypeBC", "states": {"Initial": {"typeName": "PINNED"}}}})))
        self.assertIn("[no-region]", self.run_program("write", "bridge.json").errors)
        (self.folder / "bridge.inp").unlink()
        run = self.run_program("write", "bridge.json", "--strict")
        self.assertEqual(run.returncode, 1)
        self.assertFalse((self.folder / "bridge.inp").exists())

    def test_Ignore_SilencesACode(self):
        run = self.run_program("check", "bridge.json", "--strict", "--ignore", "empty-material", "--ignore=unused")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        run = self.run_program("check", "--ignore", "unused", "bridge.json")
        self.assertEqual(run.errors.count("\n"), 1)
        run = self.run_program("check", "bridge.json", "--ignore", "unusd")
        self.assertEqual(run.returncode, 2)
        self.assertIn("there is no finding 'unusd' to ignore; did you mean 'unused'?", run.errors)

    def test_Ignore_LeavesErrors(self):
        self.put("bridge.json", changed(lambda model: model.update(loads=3)))
        run = self.run_program("check", "bridge.json", "--ignore", "wrong-value")
        self.assertEqual(run.returncode, 1)
        self.assertIn("[wrong-value]", run.errors)

    def ignoring(self, *entries):
        def change(model):
            with_warning(model)
            model["ignore"] = list(entries)
        self.put("bridge.json", changed(change))

    def test_IgnoreInTheModel_GivesAReason(self):
        self.ignoring({"code": "unused", "reason": "our library"}, {"code": "empty-material", "reason": "to come"})
        run = self.run_program("check", "bridge.json", "--strict")
        self.assertEqual((run.returncode, run.errors), (0, ""))
        self.assertEqual(run.output, "bridge.json: no errors\nignored: 1 unused, our library\n"
                                     "ignored: 1 empty-material, to come\n")
        result = json.loads(self.run_program("write", "bridge.json", "--json").output)
        self.assertEqual(result["ignored"], [{"code": "unused", "count": 1, "reason": "our library"},
                                             {"code": "empty-material", "count": 1, "reason": "to come"}])
        formatted = json.loads(self.run_program("format", "bridge.json").output)
        self.assertEqual(formatted["models"]["Default Model"]["ignore"][0], {"code": "unused", "reason": "our library"})

    def test_IgnoreInTheModel_MayBeOfOnePlace(self):
        place = "/models/Default Model/materials/"
        self.ignoring({"code": "empty-material", "reason": "x", "place": place + "Spare"})
        self.assertNotIn("empty-material]", self.run_program("check", "bridge.json").errors)
        self.ignoring({"code": "empty-material", "reason": "x", "place": place + "Spa"})
        self.assertIn("empty-material]", self.run_program("check", "bridge.json").errors)

    def test_IgnoreInTheModel_IsOfThatModelAlone(self):
        model = changed(with_warning)
        model["models"]["Other"] = changed(with_warning)["models"]["Default Model"]
        model["models"]["Other"]["ignore"] = [{"code": "empty-material", "reason": "x"}]
        self.put("bridge.json", model)
        run = self.run_program("check", "bridge.json")
        self.assertIn("(/models/Default Model/materials/Spare) [empty-material]", run.errors)
        self.assertNotIn("/models/Other", run.errors)

    def test_IgnoreInTheModel_IsOfWarningsAndNotesWithAReason(self):
        for entry, found in (({"code": "unusd", "reason": "x"}, "did you mean 'unused'?"),
                             ({"code": "syntax", "reason": "x"}, "errors can't be passed over"),
                             ({"code": "unused"}, "/ignore/0/reason) [missing-field]")):
            self.ignoring(entry)
            run = self.run_program("check", "bridge.json")
            self.assertEqual(run.returncode, 1)
            self.assertIn(found, run.errors)


class Explain(Program):
    def test_EveryCode_IsExplained(self):
        tables = [PROJECT / "store_interface/findings/fnd_Codes.inl", PROJECT / "deck_reader/drd_Codes.inl"]
        codes = [code for table in tables for code in re.findall(r'(?m)^\{"([a-z0-9-]+)"', table.read_text())]
        self.assertGreater(len(codes), 150)
        result = json.loads(self.run_program("explain", "--json").output)
        self.assertEqual(sorted(codes), [finding["code"] for finding in result["findings"]])
        for finding in result["findings"]:
            with self.subTest(code=finding["code"]):
                for part in ("means", "matters", "mend"):
                    self.assertRegex(finding[part], r"(?s)^[A-Z0-9*\"].{15,}\.$")
        texts = [finding[part] for finding in result["findings"] for part in ("means", "matters")]
        self.assertEqual(len(texts), len(set(texts)))

    def test_EachCode_IsExplainedInSomeTenLines(self):
        codes = [finding["code"] for finding in json.loads(self.run_program("explain", "--json").output)["findings"]]
        for code in codes:
            with self.subTest(code=code):
                run = self.run_program("explain", code)
                self.assertEqual((run.returncode, run.errors), (0, ""))
                lines = [line for line in run.output.splitlines() if line]
                self.assertTrue(lines[0].startswith(code + " ("))
                self.assertEqual([line for line in lines[1:] if not line.startswith("  ")][-3:],
                                 ["What it means", "Why it matters", "What to do"])
                self.assertTrue(10 <= len(lines) <= 14)
        run = self.run_program("explain", "unused-nodes")
        self.assertEqual(run.output.splitlines()[0], "unused-nodes (note): nodes belong to no element")

    def test_UnknownCode_GetsTheNearest(self):
        run = self.run_program("explain", "unused-node")
        self.assertEqual((run.returncode, run.output), (2, ""))
        self.assertEqual(run.errors, "qrxdeck: error: there is no finding 'unused-node'; did you mean 'unused-nodes'?\n")

    def test_WithoutCodes_AllAreListed(self):
        run = self.run_program("explain")
        self.assertEqual(run.returncode, 0)
        self.assertRegex(run.output, r"(?m)^unused-nodes +note +nodes belong to no element$")


class Watching(Program):
    LINE = re.compile(rb"\r((?:reading|checking|writing|rehearsing) [^\r\x1b]*)\x1b\[K")

    def lines_of_long_run(self, prepare, *words, columns=100, wanted=b""):
        """What a run shows that is long enough to show what is wanted: the larger, the quicker the machine."""
        for nodes in (300000, 1500000, 6000000, 24000000):
            prepare(nodes)
            code, seen = self.on_terminal(*words, columns=columns, pause=0.6)
            self.assertEqual(code, 0)
            lines = self.LINE.findall(seen)
            if any(wanted in line for line in lines):
                return lines, seen
        return self.fail(f"no run was long enough: {lines}")

    def test_LongRun_ShowsHowFarItIsAndCleansUp(self):
        lines, seen = self.lines_of_long_run(
            lambda nodes: self.put("bridge.json", changed(with_many_nodes(nodes))), "write", "bridge.json", "--threads", "1",
            wanted=b"B/s")
        for line in lines:
            self.assertRegex(line, rb"^(reading|checking|writing) bridge\.(json|inp)(: [\d.]+ [kMG]?B( of [\d.]+ [kMG]B)?, "
                                   rb"[\d.]+ [kMG]?B/s)?, \d+ s$")
        # What is left of it on the terminal is what was printed.
        shown = []
        for line in seen.replace(b"\r\n", b"\n").decode().split("\n"):
            shown.append(re.sub(r"^.*\r(\x1b\[K)?", "", line))
        self.assertTrue(shown[0].startswith("bridge.inp: "), shown[0])
        self.assertNotIn("reading bridge.json", "\n".join(shown))

    def test_DecksThatAreRead_ShowToo(self):
        def prepare(nodes):
            with open(self.folder / "large.inp", "w", encoding="utf-8") as deck:
                deck.write("*Heading\n*Part, name=P\n*Node\n")
                deck.writelines(f"{i}, {i}., 0., 0.\n" for i in range(1, 2 * nodes))
                deck.write("*End Part\n")

        lines, _ = self.lines_of_long_run(prepare, "check", "large.inp")
        self.assertRegex(b" ".join(lines), rb"(reading|checking) large\.inp")

    def test_RunThatIsEnded_TakesTheLineAway(self):
        self.put("bridge.json", changed(with_many_nodes(1500000)))
        ours, theirs = pty.openpty()
        run = subprocess.Popen([PROGRAM, "write", "bridge.json", "--threads", "1"], cwd=self.folder,
                               env=self.environment, stdin=theirs, stdout=theirs, stderr=theirs)
        os.close(theirs)
        self.addCleanup(os.close, ours)
        self.halt(run, 0.6)
        seen = b""
        while not self.LINE.search(seen):
            self.assertTrue(select.select([ours], [], [], 60)[0])
            seen += os.read(ours, 4096)
        run.send_signal(signal.SIGINT)
        self.assertEqual(run.wait(), -signal.SIGINT)
        while select.select([ours], [], [], 0.2)[0]:
            try:
                seen += os.read(ours, 4096)
            except OSError:
                break
        self.assertTrue(seen.endswith(ERASE), seen[-80:])

    def test_ShortRun_ShowsNothing(self):
        code, seen = self.on_terminal("write", "bridge.json")
        self.assertEqual(code, 0)
        self.assertEqual(self.LINE.findall(seen), [])
        self.assertNotIn(b"\x1b", seen)

    def test_RunElsewhere_ShowsNothing(self):
        self.put("bridge.json", changed(with_many_nodes(1500000)))
        run = self.run_program("write", "bridge.json", "--threads", "1")
        self.assertEqual((run.returncode, run.errors), (0, ""))

    def test_TimesOfTheSummary_AreThoseOfTheWholeRun(self):
        self.put("bridge.json", changed(with_many_nodes(600000)))
        begin = time.monotonic()
        run = self.run_program("write", "bridge.json", "--verify", "--json")
        wall = time.monotonic() - begin
        written = json.loads(run.output)["written"]
        self.assertEqual(list(written["times"]), ["reading", "checking", "writing", "syncing", "verifying"])
        self.assertAlmostEqual(sum(written["times"].values()), written["seconds"])
        self.assertGreater(written["seconds"], 0.7 * wall)
        self.assertLess(written["seconds"], wall)

    def test_LongNames_AreCutToTheTerminal(self):
        name = "b" * 120
        lines, _ = self.lines_of_long_run(lambda nodes: self.put(name + ".json", changed(with_many_nodes(nodes))),
                                          "check", name + ".json", "--threads", "1", columns=50)
        self.assertTrue(all(len(line) < 50 for line in lines), lines)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
