#!/usr/bin/env python3
"""Studies on a cluster: Slurm and Snakemake run the shards of 2,000 rows, of which two must fail; one shard is killed
half-way and taken up again.

usage: cluster_test.py PROGRAM [unittest options]

Needs root, for namespaces of its own, and the packages of "scripts/install-dependencies.sh cluster".
"""

import json
import os
import pathlib
import re
import shutil
import stat
import subprocess
import sys
import tempfile
import unittest

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parent))
from slurm_cluster import Cluster  # noqa: E402

ROOT = pathlib.Path(__file__).resolve().parents[2]
INSIDE = "QRX_INSIDE_NAMESPACES"
ROWS = 2000
SHARDS = 40
WRONG = {123, 1777}
KILLED = 17

# Runs the program; the first run of one shard is killed when half of its rows are done.
WRAPPER = """\
#!/bin/bash
case " $* " in
    *" --shard {killed}/{shards} "*)
        if [ ! -e {mark} ]; then
            touch {mark}
            {program} "$@" &
            until [ "$(cat {ledger} 2>/dev/null | wc -l)" -ge {half} ]; do :; done
            kill -KILL $!
            wait $!
            exit 137
        fi ;;
esac
exec {program} "$@"
"""


class ClusterTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="qrx-cluster-"))
        self.folder.chmod(0o755)
        self.addCleanup(shutil.rmtree, self.folder, ignore_errors=True)
        example = ROOT / "examples/perforated_plate"
        shutil.copy(example / "plate.unv", self.folder)
        text = (example / "perforated_plate.json").read_text()
        # Every row scales the mesher's file by another factor, which gives a killer the time to come in between.
        text = text.replace('"file": "plate.unv"', '"file": "plate.unv", "scale": 1.0', 1)
        self.assertIn('"scale"', text)
        (self.folder / "plate.json").write_text(text)
        part = re.search(r'"parts"\s*:\s*{\s*"([^"]+)"', text).group(1)
        with open(self.folder / "rows.csv", "w", encoding="utf-8") as table:
            table.write(f"/models/Default Model/parts/{part}/mesh/scale\n")
            for row in range(1, ROWS + 1):
                table.write("wide\n" if row in WRONG else f"{1 + row / 1000}\n")
        self.ledger = self.folder / f"out/study.{KILLED}-of-{SHARDS}.jsonl"
        self.wrapper = self.folder / "qrxdeck"
        self.wrapper.write_text(WRAPPER.format(killed=KILLED, shards=SHARDS, mark=self.folder / "killed",
                                               program=PROGRAM, ledger=self.ledger, half=ROWS // SHARDS // 2))
        self.wrapper.chmod(self.wrapper.stat().st_mode | stat.S_IXUSR)

    def program(self, *arguments):
        return subprocess.run([PROGRAM, "study", *map(str, arguments)], cwd=self.folder, stdout=subprocess.PIPE,
                              stderr=subprocess.STDOUT, text=True, check=False)

    def emit(self, scheduler, name):
        script = self.program("plate.json", "rows.csv", "--out", "out", "--jobs", 1, "--emit", scheduler, "--shards",
                              SHARDS)
        self.assertEqual(script.returncode, 0, script.stdout)
        # As a user sets another program in the script.
        quote = "'" if scheduler == "slurm" else '"'
        text = script.stdout.replace(quote + str(PROGRAM) + quote, quote + str(self.wrapper) + quote)
        self.assertNotEqual(text, script.stdout)
        (self.folder / name).write_text(text)

    def assert_killed_half_way(self):
        lines = self.ledger.read_bytes().count(b"\n")
        self.assertGreaterEqual(lines, ROWS // SHARDS // 2)
        self.assertLess(lines, ROWS // SHARDS, "the shard ended before it was killed")

    def assert_whole(self):
        """All rows have one line; all but the wrong ones have a deck that a run in one piece gives too."""
        lines = [json.loads(line) for line in (self.folder / "out/study.jsonl").read_text().splitlines()]
        self.assertEqual([line["row"] for line in lines], list(range(1, ROWS + 1)))
        self.assertEqual({line["row"] for line in lines if "error" in line}, WRONG)
        self.program("plate.json", "rows.csv", "--out", "once", "--jobs", 2)
        for line in map(json.loads, (self.folder / "once/study.jsonl").read_text().splitlines()):
            self.assertEqual(line.get("sha256"), lines[line["row"] - 1].get("sha256"))
            if "deck" in line:
                self.assertEqual((self.folder / "out" / line["deck"]).stat().st_size, line["bytes"])
        # No shard did a row twice, and nothing but decks and ledgers is left.
        for ledger in (self.folder / "out").glob("study.*-of-*.jsonl"):
            rows = [json.loads(line)["row"] for line in ledger.read_text().splitlines()]
            self.assertEqual(len(rows), len(set(rows)))
        self.assertEqual(len(list((self.folder / "out").rglob("*.inp"))), ROWS - len(WRONG))

    def test_Slurm_ArrayOfShards_OneKilledAndTakenUpAgain(self):
        self.emit("slurm", "job.sh")
        with Cluster(self.folder / "slurm") as cluster:
            submitted = subprocess.run(["bash", "job.sh"], cwd=self.folder, stdout=subprocess.PIPE, text=True,
                                       check=True).stdout
            job = int(re.search(r"array job (\d+)", submitted).group(1))
            cluster.wait_for_jobs()
            states = cluster.states_of(job)
            shards_of_wrong = {(row - 1) * SHARDS // ROWS + 1 for row in WRONG}
            self.assertEqual(len(states), SHARDS)
            self.assertEqual({task for task, state in states.items() if state != "COMPLETED"},
                             shards_of_wrong | {KILLED})
            self.assert_killed_half_way()
            merged = self.program("--merge", "out")
            self.assertEqual(merged.returncode, 1)
            self.assertNotIn(" 0 missing", merged.stdout)
            # The one task again, as a user would ask for it.
            subprocess.run(["sbatch", f"--array={KILLED}", "job.sh"], cwd=self.folder, check=True,
                           stdout=subprocess.DEVNULL)
            cluster.wait_for_jobs()
            log = "".join(path.read_text() for path in self.folder.glob("slurm-*_%d.out" % KILLED))
            self.assertRegex(log, r"\d+ decks written, 0 rows failed, \d+ done before")
        merged = self.program("--merge", "out")
        self.assertIn(f"{ROWS - len(WRONG)} of {ROWS} decks, {len(WRONG)} rows failed, 0 missing", merged.stdout)
        self.assert_whole()

    def test_Snakemake_Shards_OneKilledAndTakenUpAgain(self):
        self.emit("snakemake", "Snakefile")
        command = ["snakemake", "--cores", "2", "--keep-going", "--rerun-incomplete", "--nocolor"]
        environment = dict(os.environ, XDG_CACHE_HOME=str(self.folder / "cache"), HOME=str(self.folder))

        def snakemake():
            return subprocess.run(command, cwd=self.folder, env=environment, stdout=subprocess.PIPE,
                                  stderr=subprocess.STDOUT, text=True, check=False)

        first = snakemake()
        self.assertNotEqual(first.returncode, 0)
        self.assertIn("\nError in rule shard:\n", first.stdout[-20000:])
        self.assert_killed_half_way()
        marks = self.folder / "out/.study/snakemake"
        self.assertEqual(len(list(marks.iterdir())), SHARDS - 1, first.stdout[-3000:])
        # Only the killed shard is left, and joining, which tells of the wrong rows.
        second = snakemake()
        self.assertNotEqual(second.returncode, 0)
        self.assertIn(f"{ROWS - len(WRONG)} of {ROWS} decks, {len(WRONG)} rows failed, 0 missing", second.stdout)
        self.assertEqual(second.stdout.count("\nrule shard:"), 1, second.stdout[-3000:])
        self.assert_whole()


def main():
    if os.environ.get(INSIDE):
        unittest.main()
    if os.geteuid() != 0:
        sys.exit("cluster_test.py: needs root, for namespaces of its own")
    for program in ("slurmctld", "slurmd", "munged", "snakemake", "ip", "unshare"):
        if shutil.which(program) is None:
            sys.exit(f"cluster_test.py: there is no {program}; scripts/install-dependencies.sh cluster installs it")
    # Whatever the daemons start ends with the first process of their namespace.
    space = ["unshare", "--net", "--uts", "--mount", "--pid", "--fork", "--kill-child", "--mount-proc"]
    command = [sys.executable, os.path.abspath(__file__), str(PROGRAM), *sys.argv[1:]]
    sys.exit(subprocess.run(space + command, env=dict(os.environ, **{INSIDE: "1"}), check=False).returncode)


if __name__ == "__main__":
    PROGRAM = pathlib.Path(sys.argv.pop(1)).resolve()
    main()
