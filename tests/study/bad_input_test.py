#!/usr/bin/env python3
"""What studies are given by mistake: nothing is lost, nothing that isn't theirs is written over.

usage: bad_input_test.py PROGRAM [unittest options]
"""

import copy
import json
import os
import resource
import subprocess

import studies
from studies import FORCE, MODEL, MODEL_POINTER, StudyTest, main


class BadInput(StudyTest):
    def refused(self, table, text, code=2, template="template.json"):
        """The study is refused before anything is written."""
        run = self.study(template, table, "--out", "out", code=code)
        self.assertIn(text, run.stderr)
        self.assertFalse((self.folder / "out").exists())
        return run

    def table(self, text, name="table.csv"):
        (self.folder / name).write_bytes(text if isinstance(text, bytes) else text.encode())
        return name

    def failed(self, table, row, *texts):
        """The row fails alone, for this reason."""
        self.study("template.json", table, "--out", "out", code=1)
        lines = self.ledger("out")
        self.assertEqual([number for number, line in lines.items() if "error" in line], [row])
        for text in texts:
            self.assertIn(text, json.dumps(lines[row]["error"], ensure_ascii=False))

    def setUp(self):
        super().setUp()
        self.write_model()

    def test_EmptyTables_AreRefused(self):
        self.refused(self.table(""), "the table is empty, expected a header and rows")
        self.refused(self.table(FORCE + "\n\n"), "the table has no rows")
        self.refused(self.table("\n", "table.jsonl"), "the table has no rows")

    def test_TableThatIsntThere_IsRefused(self):
        self.refused("none.csv", "can't be read: No such file or directory", code=3)

    def test_TableOfAnotherFormat_IsRefused(self):
        self.refused(self.table("a\n1\n", "table.xlsx"), "expected .csv, .tsv or .jsonl")

    def test_RepeatedColumns_AreRefused(self):
        self.refused(self.table(f"{FORCE},{FORCE}\n1,2\n"), f"found a second column '{FORCE}'")

    def test_ColumnWithoutName_IsRefused(self):
        self.refused(self.table(f"{FORCE},\n1,2\n"), "column 2 has no name")

    def test_ColumnOfUnknownName_IsRefusedWithAHint(self):
        model = copy.deepcopy(MODEL)
        model["parameters"] = {"force": FORCE}
        self.write_model(model)
        self.refused(self.table("forse\n1\n"), "did you mean 'force'?")

    def test_ColumnsOfOnePlace_AreRefused(self):
        table = MODEL_POINTER + "/materials/Steel/elastic/table"
        self.refused(self.table(f"{table},{FORCE},{table}/0/0\n[[1,2]],1,2\n"), "change one place of the template")

    def test_SemicolonsInsteadOfCommas_AreRefused(self):
        self.refused(self.table(f"{FORCE};name\n1;a\n"), "expected commas between its columns")

    def test_AMillionColumns_AreRefused(self):
        self.refused(self.table(",".join(f"c{i}" for i in range(1_000_000)) + "\n"), "found 1000000 columns")

    def test_QuoteThatIsNotClosed_IsRefused(self):
        self.refused(self.table(f"{FORCE}\n1\n\"2\n3\n"), "line 3: found a quote that is opened and not closed")

    def test_RepeatedNames_AreRefused(self):
        self.refused(self.table(f"name,{FORCE}\na,1\nb,2\na,3\n"), "rows 1 and 3 have the name 'a'")

    def test_TemplateThatIsWrong_IsRefused(self):
        model = copy.deepcopy(MODEL)
        model["models"]["Default Model"]["loads"]["F"]["region"] = "BAR-1.NOWHERE"
        self.write_model(model)
        run = self.refused(self.table(f"{FORCE}\n1\n"), "the template is wrong")
        self.assertRegex(run.stderr, r"error: found set 'NOWHERE', .* \(/models/Default Model/loads/F/region\) \[no-such-set\]")
        self.refused("table.csv", "the template can't be read", code=3, template="none.json")
        (self.folder / "broken.json").write_text("{")
        self.refused("table.csv", "the template is wrong", template="broken.json")

    def test_WrongParameters_AreErrorsOfTheTemplate(self):
        for wrong, text in (({"force": "loads"}, "expected a JSON pointer that begins with \"/models/\""),
                            ({"name": FORCE}, "found a parameter named 'name'"),
                            ({"f": {"pointers": FORCE, "limits": "small"}}, "expected limits such as"),
                            ({"f": {"pointers": FORCE, "limits": "5 .. 1"}}, "expected limits such as"),
                            ({"f": {"pointer": FORCE}}, "found an unknown member 'pointer'")):
            with self.subTest(wrong):
                self.write_model(dict(MODEL, parameters=wrong))
                run = self.run_program("check", "template.json")
                self.assertEqual(run.returncode, 1)
                self.assertIn(text, run.stderr)

    def test_ParameterThatLeadsNowhere_IsAWarningWithAHint(self):
        self.write_model(dict(MODEL, parameters={"f": FORCE.replace("component1", "componnt1")}))
        run = self.run_program("check", "template.json")
        self.assertEqual(run.returncode, 0)
        self.assertRegex(run.stderr, r"warning: found no 'componnt1' .* \(/parameters/f\) \[no-such-place\]")
        self.assertIn("did you mean 'component1'?", run.stderr)

    def test_TableThatIsALedger_IsRefused(self):
        self.study("template.json", self.table(f"{FORCE}\n1\n"), "--out", "first")
        self.refused("first/study.jsonl", "found the ledger of a study")

    def test_FolderOfAnotherStudy_IsRefusedAndStays(self):
        self.study("template.json", self.table(f"{FORCE}\n1\n"), "--out", "out")
        ledger = (self.folder / "out/study.jsonl").read_bytes()
        run = self.study("template.json", self.table(f"{FORCE}\n2\n", "other.csv"), "--out", "out", code=2)
        self.assertIn("found another study: the table 'other.csv' is another one than 'table.csv'", run.stderr)
        self.assertEqual((self.folder / "out/study.jsonl").read_bytes(), ledger)
        self.assertEqual(self.decks_in("out"), ["1.inp"])

    def test_FolderWithOtherFiles_IsRefusedAndStays(self):
        (self.folder / "out").mkdir()
        (self.folder / "out/1.inp").write_text("mine")
        run = self.study("template.json", self.table(f"{FORCE}\n1\n"), "--out", "out", code=2)
        self.assertIn("found a folder with other files", run.stderr)
        self.assertEqual(sorted(os.listdir(self.folder / "out")), ["1.inp"])

    def test_FileInThePlaceOfADeck_StaysAndItsRowFails(self):
        table = self.table(f"{FORCE}\n1\n2\n3\n")
        self.study("template.json", table, "--out", "out", "--shard", "1/3")
        (self.folder / "out/3.inp").write_text("mine")
        self.study("template.json", table, "--out", "out", "--resume", code=1)
        self.assertEqual((self.folder / "out/3.inp").read_text(), "mine")
        self.assertIn("isn't the row's deck", self.ledger("out")[3]["error"][0]["text"])

    def test_FolderThatIsAFile_IsRefused(self):
        (self.folder / "out").write_text("mine")
        run = self.study("template.json", self.table(f"{FORCE}\n1\n"), "--out", "out", code=3)
        self.assertIn("cannot open the folder 'out'", run.stderr)
        self.assertEqual((self.folder / "out").read_text(), "mine")

    def test_RaggedRow_FailsAlone(self):
        self.failed(self.table(f"{FORCE},name\n1,a\n2\n3,c\n"), 2, "found 1 cell, expected 2")

    def test_EmptyCell_FailsAlone(self):
        self.failed(self.table(f"name,{FORCE}\na,1\nb,\n"), 2, "found an empty cell")

    def test_RowThatIsntUtf8_FailsAlone(self):
        self.failed(self.table(f"{FORCE},name\n1,a\n".encode() + b"2,\xff\n"), 2, "isn't UTF-8")

    def test_NamesWithSlashesOrDots_FailAlone(self):
        for name, text in (("../../etc/x", "without slashes"), ("a\\\\b", "without slashes"),
                           ("..", "doesn't begin with a dot"), (".hidden", "doesn't begin with a dot"),
                           ("x" * 300, "at most 200 bytes")):
            with self.subTest(name):
                table = self.table(f"{FORCE},name\n1,a\n2,{name}\n3,c\n")
                subprocess.run(["rm", "-rf", self.path("out")], check=True)
                self.failed(table, 2, text)
                self.assertEqual(self.decks_in("out"), ["a.inp", "c.inp"])

    def test_LineThatIsNoObject_FailsAlone(self):
        self.failed(self.table(json.dumps({FORCE: 1}) + "\n[1]\n", "table.jsonl"), 2, "expected a JSON object a line")

    def test_LineThatIsNoJson_FailsAlone(self):
        self.failed(self.table(json.dumps({FORCE: 1}) + "\n{\"a\": }\n", "table.jsonl"), 2, "found '}', expected a value (column 7)")

    def test_UnknownMemberOfALine_FailsAlone(self):
        self.failed(self.write_lines([{FORCE: 1}, {"forse": 1}]), 2, "found a column 'forse'")

    def test_PointerThatIsntThere_FailsItsRowWithColumnAndPointer(self):
        wrong = FORCE.replace("component1", "component9")
        self.failed(self.write_lines([{FORCE: 1}, {wrong: 1}]), 2, f'"column": "{wrong}", "pointer": "{wrong}"',
                    "found no 'component9'")

    def test_PointerThatIsntThereInAHeader_FailsAllRowsAndWarnsAhead(self):
        wrong = FORCE.replace("/F/", "/H/")
        run = self.study("template.json", self.table(f"{wrong}\n1\n2\n"), "--out", "out", code=1)
        self.assertIn("all rows will fail: found no 'H' in '/models/Default Model/loads' of the template", run.stderr)
        self.assertEqual(len(self.ledger("out")), 2)

    def test_ValuesOutOfLimits_FailAlone(self):
        model = dict(MODEL, parameters={"force": {"pointers": FORCE, "limits": "> 0, <= 10", "unit": "N"}})
        self.write_model(model)
        self.study("template.json", self.table("force\n10\n0\n10.5\nabc\n1e-9\n"), "--out", "out", code=1)
        texts = {row: line["error"][0]["text"] for row, line in self.ledger("out").items() if "error" in line}
        self.assertEqual(texts, {2: "found 0, expected > 0, <= 10 N", 3: "found 10.5, expected > 0, <= 10 N",
                                 4: "found 'abc', expected a number, > 0, <= 10 N"})

    def test_ObjectInACell_FailsAlone(self):
        self.failed(self.write_lines([{FORCE: 1}, {FORCE: {"value": 1}}]), 2, "expected a JSON scalar or array")

    def test_RowThatNoDeckCanTell_FailsWithTheWritersWords(self):
        profile = MODEL_POINTER + "/sections/Bar/area"
        run = self.study("template.json", self.write_lines([{profile: 1}, {profile: "x"}]), "--out", "out", code=1)
        self.assertIn("row 2: ", run.stdout)

    def test_WrongUsage_IsTold(self):
        table = self.table(f"{FORCE}\n1\n")
        for arguments, text in ((("--shard", "0/3"), "expected K/N"), (("--shard", "4/3"), "expected K/N"),
                                (("--shard", "1"), "expected K/N"), (("--jobs", "-1"), "expected 1 to"),
                                (("--emit", "cron", "--shards", "3"), "expected slurm or snakemake"),
                                (("--emit", "slurm"), "needs --shards")):
            with self.subTest(arguments):
                run = self.study("template.json", table, "--out", "out", *arguments, code=2)
                self.assertIn(text, run.stderr)
        self.study("template.json", code=2)
        self.study("--merge", "none", code=2)
        (self.folder / "plain").mkdir()
        run = self.study("--merge", "plain", code=2)
        self.assertIn("found a folder without a study", run.stderr)

    def test_FileLimitInTheMiddle_StopsWithCodeThreeAndGoesOnLater(self):
        table = self.write_csv([FORCE], [[i] for i in range(1, 301)])

        def limit():
            resource.setrlimit(resource.RLIMIT_FSIZE, (20_000, 20_000))

        run = self.study("template.json", table, "--out", "out", "--jobs", 2, code=3, preexec_fn=limit)
        self.assertIn("File too large", run.stderr)
        self.assertIn("--resume goes on", run.stdout)
        done = self.ledger("out")
        self.assertGreater(len(done), 0)
        self.assertLess(len(done), 300)
        self.study("template.json", table, "--out", "out", "--resume")
        self.assertEqual(len(self.ledger("out")), 300)

    def test_FullDiskAtRow700_StopsWithCodeThree_LosesNothing_AndGoesOnLater(self):
        disk = self.folder / "disk"
        disk.mkdir()
        # A deck and its inode take two pages or so; the disk is full behind some seven hundred.
        mount = ["mount", "-t", "tmpfs", "-o", "size=3500k", "none", str(disk)]
        if subprocess.run(mount, check=False, stderr=subprocess.DEVNULL).returncode != 0:
            self.skipTest("no file system can be mounted here")
        self.addCleanup(subprocess.run, ["umount", str(disk)], check=False)
        table = self.write_csv([FORCE], [[i] for i in range(1, 2001)])
        run = self.study("template.json", table, "--out", disk / "out", "--jobs", 2, code=3)
        self.assertIn("No space left on device", run.stderr)
        lines = self.ledger(disk / "out")
        self.assertGreater(len(lines), 300)
        self.assertLess(len(lines), 2000)
        for line in lines.values():
            self.deck(disk / "out", line)
        subprocess.run(["mount", "-o", "remount,size=40m", str(disk)], check=True)
        self.study("template.json", table, "--out", disk / "out", "--resume")
        lines = self.ledger(disk / "out")
        self.assertEqual(len(lines), 2000)
        for line in lines.values():
            self.deck(disk / "out", line)
        self.assertEqual(len(self.decks_in(disk / "out")), 2000)


if __name__ == "__main__":
    main()
