#!/usr/bin/env python3
"""Runs of studies: ledgers, resuming, kills, shards, scripts for schedulers.

usage: runs_test.py PROGRAM [unittest options]
"""

import copy
import hashlib
import json
import os
import pty
import re
import shutil
import signal
import subprocess
import time

import studies
from studies import FORCE, MODEL_POINTER, StudyTest, main


class Runs(StudyTest):
    def rows(self, count, wrong=()):
        """A table of forces, of which some are no numbers."""
        return self.write_csv([FORCE], [["weak" if i in wrong else i] for i in range(1, count + 1)])

    def start(self, *arguments, **options):
        return subprocess.Popen([studies.PROGRAM, "study", *map(str, arguments)], cwd=self.folder,
                                stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True, **options)

    def wait_for_lines(self, path, count):
        end = time.monotonic() + 60
        while time.monotonic() < end:
            if path.exists() and path.read_bytes().count(b"\n") >= count:
                return
            time.sleep(0.002)
        self.fail("the ledger doesn't grow")

    def snapshot(self, folder):
        """Every deck by its path: what it is and when it was made."""
        return {str(path): (path.stat().st_ino, path.stat().st_mtime_ns)
                for path in (self.folder / folder).rglob("*.inp")}

    def test_RowsThatFail_FailAlone_AndAreTold(self):
        self.write_model()
        run = self.study("template.json", self.rows(30, {4, 17}), "--out", "out", "--jobs", 2, code=1)
        lines = self.ledger("out")
        self.assertEqual(sorted(lines), list(range(1, 31)))
        self.assertEqual([row for row, line in sorted(lines.items()) if "error" in line], [4, 17])
        self.assertEqual(lines[17]["error"],
                         [{"text": "found 'weak', expected a number", "column": FORCE, "pointer": FORCE}])
        self.assertEqual(len(self.decks_in("out")), 28)
        self.assertRegex(run.stdout, r"^out: 28 decks written, 2 rows failed; [0-9.]+ s, [0-9.]+ decks/s\n"
                                     r"  row 4: .*found 'weak', expected a number\n  row 17: ")

    def test_MoreThanTenFailures_TheFirstTenAreTold(self):
        self.write_model()
        run = self.study("template.json", self.rows(40, set(range(3, 20))), "--out", "out", "--jobs", 2, code=1)
        told = re.findall(r"^  row (\d+):", run.stdout, re.MULTILINE)
        self.assertEqual(told, [str(row) for row in range(3, 13)])
        self.assertIn("and 7 more", run.stdout)

    def test_AsJson_OneObjectTellsAll(self):
        self.write_model()
        run = self.study("template.json", self.rows(5, {2}), "--out", "out", "--json", code=1)
        told = json.loads(run.stdout)
        self.assertEqual(told["exitCode"], 1)
        study = told["study"]
        self.assertEqual([study[key] for key in ("rows", "done", "failed", "earlier", "left")], [5, 4, 1, 0, 0])
        self.assertEqual(study["failures"][0]["row"], 2)
        self.assertEqual(study["bytes"], sum(line.get("bytes", 0) for line in self.ledger("out").values()))
        self.assertEqual(run.stderr, "")

    def test_DryRun_TellsTheSameAndWritesNothing(self):
        self.write_model()
        run = self.study("template.json", self.rows(6, {3}), "--out", "out", "--dry-run", code=1)
        self.assertIn("5 rows are right, 1 rows failed", run.stdout)
        self.assertIn("row 3: ", run.stdout)
        self.assertFalse((self.folder / "out").exists())

    def test_WithoutOut_TheFolderHasTheTablesName(self):
        self.write_model()
        self.study("template.json", self.rows(2))
        self.assertEqual(self.decks_in("table"), ["1.inp", "2.inp"])

    def test_SecondRunWithoutResume_IsRefusedAndChangesNothing(self):
        self.write_model()
        self.study("template.json", self.rows(3), "--out", "out")
        before = self.snapshot("out"), (self.folder / "out/study.jsonl").read_bytes()
        run = self.study("template.json", "table.csv", "--out", "out", code=2)
        self.assertIn("--resume goes on with it", run.stderr)
        self.assertEqual((self.snapshot("out"), (self.folder / "out/study.jsonl").read_bytes()), before)

    def test_ResumeOfAFinishedStudy_DoesNothing(self):
        self.write_model()
        self.study("template.json", self.rows(3), "--out", "out")
        before = self.snapshot("out"), (self.folder / "out/study.jsonl").read_bytes()
        run = self.study("template.json", "table.csv", "--out", "out", "--resume")
        self.assertIn("0 decks written, 0 rows failed, 3 done before", run.stdout)
        self.assertEqual((self.snapshot("out"), (self.folder / "out/study.jsonl").read_bytes()), before)

    def test_ResumeWithNothingThere_Begins(self):
        self.write_model()
        self.study("template.json", self.rows(3), "--out", "out", "--resume")
        self.assertEqual(sorted(self.ledger("out")), [1, 2, 3])

    def test_Resume_DoesWhatFailedAndWhatIsGone_AndNothingTwice(self):
        self.write_model()
        self.study("template.json", self.rows(8, {5}), "--out", "out", code=1)
        (self.folder / "out/3.inp").unlink()
        (self.folder / "out/4.inp").write_bytes(b"by hand")
        # As a failure of power may leave it.
        (self.folder / "out/8.inp").write_bytes(b"")
        before = self.snapshot("out")
        run = self.study("template.json", "table.csv", "--out", "out", "--resume", code=1)
        self.assertIn("4 done before", run.stdout)
        lines = self.ledger("out")
        self.assertEqual(sorted(lines), list(range(1, 9)))
        self.assertIn("error", lines[5])
        # A deck that is not what the ledger tells of is nobody's any more.
        self.assertIn("isn't the row's deck", lines[4]["error"][0]["text"])
        self.deck("out", lines[3])
        self.deck("out", lines[8])
        after = self.snapshot("out")
        for row in (1, 2, 6, 7):
            name = str(self.folder / f"out/{row}.inp")
            self.assertEqual(after[name], before[name])

    def test_LineThatWasCutOff_IsDroppedAndItsRowDoneAgain(self):
        self.write_model()
        self.study("template.json", self.rows(5), "--out", "out", "--jobs", 1)
        ledger = self.folder / "out/study.jsonl"
        whole = ledger.read_bytes()
        for cut in (1, 30, len(whole.splitlines()[-1])):
            with self.subTest(cut):
                ledger.write_bytes(whole[:-cut])
                self.study("template.json", "table.csv", "--out", "out", "--resume")
                self.assertEqual(sorted(self.ledger("out")), [1, 2, 3, 4, 5])

    def test_KilledAgainAndAgain_EndsAsOneRunDoes(self):
        self.write_model()
        table = self.rows(3000, {1234})
        self.study("template.json", table, "--out", "once", code=1)
        (self.folder / "table.csv").rename(self.folder / "other.csv")
        ledger = self.folder / "out/study.jsonl"
        for part in range(1, 5):
            process = self.start("template.json", "other.csv", "--out", "out", "--jobs", 2, "--resume")
            self.wait_for_lines(ledger, 500 * part)
            process.kill()
            process.communicate()
        self.study("template.json", "other.csv", "--out", "out", "--resume", code=1)
        once, killed = self.ledger("once"), self.ledger("out")
        self.assertEqual(sorted(once), sorted(killed))
        for row, line in once.items():
            for key in ("deck", "bytes", "sha256", "parameters", "error"):
                self.assertEqual(line.get(key), killed[row].get(key))
        self.assertEqual(self.decks_in("once"), self.decks_in("out"))
        hidden = sorted(path.name for path in (self.folder / "out/.study").iterdir())
        self.assertEqual(hidden, ["1-of-1.lock"])
        left = [str(path) for path in (self.folder / "out").rglob(".study-*")]
        self.assertEqual(left, [])

    def test_Interrupted_TheRowsInHandEnd_AndItSaysHowToGoOn(self):
        self.write_model()
        table = self.rows(20000)
        for number in (signal.SIGINT, signal.SIGTERM):
            with self.subTest(number.name):
                process = self.start("template.json", table, "--out", number.name, "--jobs", 2)
                ledger = self.folder / number.name / "study.jsonl"
                self.wait_for_lines(ledger, 100)
                process.send_signal(number)
                output, _ = process.communicate(timeout=60)
                self.assertEqual(process.returncode, -number)
                lines = self.ledger(number.name)
                self.assertLess(len(lines), 20000)
                self.assertEqual(len(lines), len(self.decks_in(number.name)))
                self.assertIn("left; ", output)
                self.assertIn("--resume goes on", output)

    def test_AnotherRunAtWork_IsRefused(self):
        self.write_model()
        table = self.rows(20000)
        process = self.start("template.json", table, "--out", "out")
        self.wait_for_lines(self.folder / "out/study.jsonl", 10)
        process.send_signal(signal.SIGSTOP)
        run = self.study("template.json", table, "--out", "out", "--resume", code=2)
        self.assertIn("another run is at work", run.stderr)
        process.kill()
        process.communicate()

    def test_ChangedTemplateTableOrMesh_IsNoticed(self):
        shutil.copy(studies.ROOT / "examples/perforated_plate/plate.unv", self.folder / "plate.unv")
        source = (studies.ROOT / "examples/perforated_plate/perforated_plate.json").read_text()
        (self.folder / "template.json").write_text(source)
        pointer = MODEL_POINTER + "/description"
        self.write_csv([pointer], [["a"], ["b"]])
        (self.folder / "template.json").write_text(source.replace(
            '"parts"', '"description": "", "parts"', 1))
        self.study("template.json", "table.csv", "--out", "out")
        for name, word in (("template.json", "template"), ("table.csv", "table"), ("plate.unv", "mesh file")):
            with self.subTest(name):
                held = (self.folder / name).read_bytes()
                (self.folder / name).write_bytes(held + b" \n")
                run = self.study("template.json", "table.csv", "--out", "out", "--resume", code=2)
                self.assertIn(f"the {word} '{name}' has changed since", run.stderr)
                (self.folder / name).write_bytes(held)
        self.study("template.json", "table.csv", "--out", "out", "--resume")

    def test_OneOfSeveralModels_IsChosen_AndTheFolderIsItsAlone(self):
        model = copy.deepcopy(studies.MODEL)
        other = copy.deepcopy(model["models"].pop("Default Model"))
        other["loads"]["F"]["states"]["Pull"]["component3"] = -50
        model["models"] = {"A": copy.deepcopy(studies.MODEL["models"]["Default Model"]), "B b": other}
        self.write_model(model)
        self.write_csv([FORCE.replace("Default Model", "B b")], [[1], [2]])
        run = self.study("template.json", "table.csv", "--out", "out", code=2)
        self.assertIn("found 2 models, none of them 'Default Model'", run.stderr)
        run = self.study("template.json", "table.csv", "--out", "out", "--model", "C", code=2)
        self.assertIn("found no model named 'C'", run.stderr)
        self.study("template.json", "table.csv", "--out", "out", "--model", "B b")
        decks = [(self.folder / "out" / name).read_text() for name in self.decks_in("out")]
        self.assertEqual([("BAR-1.TIP, 1, 1.\n" in deck, "BAR-1.TIP, 1, 2.\n" in deck, "BAR-1.TIP, 3, -50.\n" in deck)
                          for deck in decks], [(True, False, True), (False, True, True)])
        run = self.study("template.json", "table.csv", "--out", "out", "--model", "A", "--resume", code=2)
        self.assertIn("the model 'A' is another one than 'B b'", run.stderr)
        self.study("template.json", "table.csv", "--out", "out", "--model", "B b", "--resume")
        for scheduler, words in (("slurm", "\nmodel='B b'\n"), ("snakemake", '\nMODEL = "B b"\n')):
            run = self.study("template.json", "table.csv", "--out", "out", "--model", "B b", "--emit", scheduler,
                             "--shards", 2)
            self.assertIn(words, run.stdout)

    def write_plates(self, names):
        """A template with a mesh file, and a table whose rows name others; each has a description of its own."""
        mesh = (studies.ROOT / "examples/perforated_plate/plate.unv").read_bytes()
        source = (studies.ROOT / "examples/perforated_plate/perforated_plate.json").read_text()
        (self.folder / "models").mkdir()
        (self.folder / "models/template.json").write_text(source)
        for name in {"plate.unv", *names}:
            (self.folder / "models" / name).write_bytes(mesh)
        self.write_csv([MODEL_POINTER + "/parts/PLATE/mesh/file"], [[name] for name in names])
        return "models/template.json", "table.csv"

    def test_ChangedMeshThatOnlyRowsName_IsNoticed(self):
        study = self.write_plates(["plate.unv", "b.unv", "c.unv", "b.unv"])
        self.study(*study, "--out", "out")
        lines = self.ledger("out")
        digest = hashlib.sha256((self.folder / "models/b.unv").read_bytes()).hexdigest()
        self.assertEqual(lines[4]["meshes"], [{"file": "b.unv", "sha256": digest}])
        before = self.snapshot("out"), (self.folder / "out/study.jsonl").read_bytes()
        self.study(*study, "--out", "out", "--resume")
        held = (self.folder / "models/b.unv").read_bytes()
        (self.folder / "models/b.unv").write_bytes(held + b" \n")
        for options in ([], ["--shard", "1/2"]):
            run = self.study(*study, "--out", "out", "--resume", *options, code=2)
            self.assertRegex(run.stderr, "the mesh file 'models/b.unv' has changed since row [24] was written")
        (self.folder / "models/b.unv").unlink()
        run = self.study(*study, "--out", "out", "--resume", code=2)
        self.assertIn("the mesh file 'models/b.unv' has changed since", run.stderr)
        # Of the same content it is the same, wherever it comes from.
        (self.folder / "models/b.unv").write_bytes(held)
        self.study(*study, "--out", "out", "--resume")
        self.assertEqual((self.snapshot("out"), (self.folder / "out/study.jsonl").read_bytes()), before)

    def test_MergeOfShardsThatFoundOtherMeshes_SaysSo(self):
        study = self.write_plates(["b.unv", "c.unv", "b.unv", "b.unv"])
        self.study(*study, "--out", "out", "--shard", "1/2")
        held = (self.folder / "models/b.unv").read_bytes()
        (self.folder / "models/b.unv").write_bytes(held + b" \n")
        self.study(*study, "--out", "out", "--shard", "2/2")
        run = self.study("--merge", "out", code=1)
        self.assertIn("out: 4 of 4 decks, 0 rows failed, 0 missing", run.stdout)
        self.assertIn("row 3: the mesh file 'models/b.unv' has changed since row 1 was written", run.stderr)
        self.assertNotIn("row 4", run.stderr)
        told = json.loads(self.study("--merge", "out", "--json", code=1).stdout)["study"]["contradictions"]
        self.assertEqual([each["row"] for each in told], [3])
        # Done again with the mesh of the others, all is well.
        (self.folder / "models/b.unv").write_bytes(held)
        (self.folder / "out/study.2-of-2.jsonl").unlink()
        for deck in ("3.inp", "4.inp"):
            (self.folder / "out" / deck).unlink()
        (self.folder / "out/study.jsonl").unlink()
        self.study(*study, "--out", "out", "--shard", "2/2")
        self.study("--merge", "out")

    def test_MeshOfRowThatFailed_MayBeMended(self):
        study = self.write_plates(["b.unv", "c.unv"])
        (self.folder / "models/c.unv").write_bytes(b"no mesh")
        self.study(*study, "--out", "out", code=1)
        self.assertNotIn("meshes", self.ledger("out")[2])
        shutil.copy(self.folder / "models/b.unv", self.folder / "models/c.unv")
        self.study(*study, "--out", "out", "--resume")
        self.assertEqual(len(self.decks_in("out")), 2)

    def test_MeshThatChangesWhileRowsAreWritten_FailsTheOthers(self):
        study = self.write_plates(["b.unv"] * 2000)
        process = self.start(*study, "--out", "out", "--jobs", 1)
        self.wait_for_lines(self.folder / "out/study.jsonl", 20)
        mesh = self.folder / "models/b.unv"
        process.send_signal(signal.SIGSTOP)
        mesh.write_bytes(mesh.read_bytes() + b" \n")
        process.send_signal(signal.SIGCONT)
        process.communicate()
        failed = [line for line in self.ledger("out").values() if "error" in line]
        self.assertGreater(len(failed), 0)
        for line in failed:
            self.assertIn("the mesh file 'models/b.unv' has changed since row 1 was written", line["error"][0]["text"])

    def test_Shards_TogetherAreTheStudy(self):
        self.write_model()
        table = self.rows(103, {50, 103})
        self.study("template.json", table, "--out", "whole", code=1)
        codes = []
        for shard in range(1, 8):
            codes.append(self.run_program("study", "template.json", table, "--out", "out", "--shard",
                                          f"{shard}/7").returncode)
        self.assertEqual(codes, [0, 0, 0, 1, 0, 0, 1])
        counts = [len(self.ledger("out", f"study.{shard}-of-7.jsonl")) for shard in range(1, 8)]
        self.assertEqual(sum(counts), 103)
        self.assertLessEqual(max(counts) - min(counts), 1)
        run = self.study("--merge", "out", code=1)
        self.assertIn("out: 101 of 103 decks, 2 rows failed, 0 missing", run.stdout)
        merged = (self.folder / "out/study.jsonl").read_text().splitlines()
        self.assertEqual([json.loads(line)["row"] for line in merged], list(range(1, 104)))
        whole, parts = self.ledger("whole"), self.ledger("out")
        for row, line in whole.items():
            for key in ("deck", "sha256", "error"):
                self.assertEqual(line.get(key), parts[row].get(key))

    def test_ShardsAtOnce_DontDisturbEachOther(self):
        self.write_model()
        table = self.rows(400)
        running = [self.start("template.json", table, "--out", "out", "--shard", f"{shard}/8", "--jobs", 2)
                   for shard in range(1, 9)]
        for process in running:
            output, errors = process.communicate(timeout=120)
            self.assertEqual(process.returncode, 0, output + errors)
        self.study("--merge", "out")
        self.assertEqual(len(self.decks_in("out")), 400)

    def test_MergeOfUnfinishedShards_TellsWhatIsMissing(self):
        self.write_model()
        table = self.rows(100, {95})
        for shard in (1, 3, 10):
            self.run_program("study", "template.json", table, "--out", "out", "--shard", f"{shard}/10")
        (self.folder / "out/005.inp").unlink()
        run = self.study("--merge", "out", code=1)
        self.assertIn("28 of 100 decks, 1 rows failed, 71 missing", run.stdout)
        self.assertIn("missing: rows 5, 11-20, 31-90\n", run.stdout)
        self.assertIn("row 95: found 'weak', expected a number", run.stdout)

    def test_OtherDivisionAndTheWholeStudy_GoOnWithWhatShardsDid(self):
        self.write_model()
        table = self.rows(60)
        for shard in (1, 2):
            self.study("template.json", table, "--out", "out", "--shard", f"{shard}/4")
        run = self.study("template.json", table, "--out", "out", "--shard", "1/3")
        self.assertIn("0 decks written, 0 rows failed, 20 done before", run.stdout)
        run = self.study("template.json", table, "--out", "out", "--resume")
        self.assertIn("30 decks written, 0 rows failed, 30 done before", run.stdout)
        self.study("--merge", "out")

    def test_OnATerminal_ProgressIsOneLine(self):
        self.write_model()
        table = self.rows(3000)
        near, far = pty.openpty()
        process = subprocess.Popen([studies.PROGRAM, "study", "template.json", table, "--out", "out"],
                                   cwd=self.folder, stdout=subprocess.PIPE, stderr=far, text=True)
        os.close(far)
        shown = b""
        while True:
            try:
                piece = os.read(near, 65536)
            except OSError:
                break
            if not piece:
                break
            shown += piece
        os.close(near)
        process.communicate()
        # What there is to say of the template stands above it.
        shown = shown[shown.rindex(b"\n") + 1:] if b"\n" in shown else shown
        self.assertNotIn(b"warning", shown)
        self.assertRegex(shown.decode(), r"\r\d+ of 3000 rows, 0 failed, [0-9.]+ rows/s, [0-9.]+ s left")
        self.assertTrue(shown.endswith(b"\r\x1b[K"))
        self.assertGreater(shown.count(b"\r"), 1)

    def test_SlurmScript_IsAShellScriptWithTheShards(self):
        self.write_model()
        table = self.rows(3)
        script = self.study("template.json", table, "--out", "it's out", "--emit", "slurm", "--shards", 40).stdout
        (self.folder / "job.sh").write_text(script)
        self.assertEqual(subprocess.run(["bash", "-n", self.path("job.sh")], check=False).returncode, 0)
        for line in ("#SBATCH --array=1-40", "account=", "time=01:00:00", "memory=2G"):
            self.assertIn("\n" + line + "\n", script)
        environment = dict(os.environ, SLURM_ARRAY_TASK_ID="2", SLURM_CPUS_PER_TASK="2")
        subprocess.run(["bash", self.path("job.sh")], check=True, env=environment, stdout=subprocess.DEVNULL)
        self.assertTrue((self.folder / "it's out/study.02-of-40.jsonl").exists())

    def test_SlurmScript_ChoosesTheModel(self):
        model = {**studies.MODEL, "models": {"A": studies.MODEL["models"]["Default Model"], "B b": {}}}
        self.write_model(model)
        self.write_csv([FORCE.replace("Default Model", "A")], [[1]])
        script = self.study("template.json", "table.csv", "--out", "out", "--model", "A", "--emit", "slurm",
                            "--shards", 1).stdout
        (self.folder / "job.sh").write_text(script)
        environment = dict(os.environ, SLURM_ARRAY_TASK_ID="1", SLURM_CPUS_PER_TASK="1")
        subprocess.run(["bash", self.path("job.sh")], check=True, env=environment, stdout=subprocess.DEVNULL)
        self.assertEqual(self.decks_in("out"), ["1.inp"])

    def test_Snakefile_IsPython(self):
        self.write_model()
        script = self.study("template.json", self.rows(3), "--out", "o{u}t", "--emit", "snakemake", "--shards",
                            12).stdout
        self.assertIn("\nSHARDS = 12\n", script)
        self.assertIn("--shard {wildcards.shard}/{params.shards}", script)
        self.assertIn(json.dumps(str((self.folder / "o{u}t").resolve())), script)


if __name__ == "__main__":
    main()
