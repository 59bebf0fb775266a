#!/usr/bin/env python3
"""Studies, each figure beside its yardstick in one run.

usage: bench_study.py QRXDECK [FOLDER]   (a temporary folder by default; some 6 GB are needed at a time)

Printed are decks a second beside a shell loop over `write` and beside raw copies of the same bytes, rows a second and
memory of a tiny model, and the time to resume a finished study.
"""

import json
import os
import pathlib
import re
import resource
import shutil
import statistics
import subprocess
import sys
import tempfile
import threading
import time

ROOT = pathlib.Path(__file__).resolve().parent.parent
PUSH = "/models/Default Model/loads/Push/states/Bend/component3"
TINY = {
    "format": "qrx-model/1",
    "models": {"Default Model": {
        "parts": {"BAR": {
            "mesh": {"nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
                     "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]}],
                     "sets": [{"name": "ALL", "kind": "element", "labels": [1]},
                              {"name": "FOOT", "kind": "node", "labels": [1]},
                              {"name": "TIP", "kind": "node", "labels": [2]}]},
            "sectionAssignments": [{"region": "ALL", "sectionName": "Bar"}]}},
        "assembly": {"instances": {"BAR-1": {"part": "BAR"}}},
        "materials": {"Steel": {"elastic": {"table": [[210000, 0.3]]}}},
        "sections": {"Bar": {"class": "kseC_TrussSection", "materialName": "Steel", "area": 2.5}},
        "steps": [{"name": "Initial", "class": "kprC_InitialStep"}, {"name": "Pull", "class": "kprC_StaticStep"}],
        "boundaryConditions": {"Fixed": {"class": "kbcC_DisplacementBC", "region": "BAR-1.FOOT",
                                         "states": {"Initial": {"u1": 0, "u2": 0, "u3": 0}}}},
        "loads": {"F": {"class": "kloC_ConcentratedForce", "region": "BAR-1.TIP",
                        "states": {"Pull": {"component1": 100}}}}}},
}


def timed(action):
    start = time.monotonic()
    action()
    return time.monotonic() - start


def peak_of_children():
    return resource.getrusage(resource.RUSAGE_CHILDREN).ru_maxrss / 1024


class Bench:
    def __init__(self, program, folder):
        self.program = program
        self.folder = folder
        self.cleared = []

    def study(self, template, table, out, *options):
        subprocess.run([self.program, "study", template, table, "--out", out, "--jobs", "2", *options],
                       cwd=self.folder, check=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)

    def clear(self, *names):
        """Empties the files of folders and puts them aside. Removed they would slow down what comes next: ext4 gives
        a file no number that was another's within the last minutes, and looks past all of these each time."""
        for name in names:
            for folder, _, files in os.walk(self.folder / name):
                for file in files:
                    os.truncate(os.path.join(folder, file), 0)
            (self.folder / name).rename(self.folder / f"cleared-{len(self.cleared)}")
            self.cleared.append(self.folder / f"cleared-{len(self.cleared)}")

    def remove_cleared(self):
        for folder in self.cleared:
            shutil.rmtree(folder)

    def table(self, name, column, values):
        (self.folder / name).write_text("\n".join([column, *map(str, values)]) + "\n")
        return name

    def copies(self, out, data, count):
        """Raw copies, on two threads, into folders of a thousand."""
        def copy(job):
            for row in range(job, count, 2):
                folder = self.folder / out / str(row // 1000)
                folder.mkdir(parents=True, exist_ok=True)
                with open(folder / str(row), "wb", buffering=0) as file:
                    file.write(data)
        threads = [threading.Thread(target=copy, args=(job,)) for job in range(2)]
        for thread in threads:
            thread.start()
        for thread in threads:
            thread.join()

    def write_loop(self, count):
        """`qrxdeck write` on two jobs, each deck from a model file of its own, which are made before."""
        text = (self.folder / "bracket.json").read_text()
        for row in range(count):
            (self.folder / f"loop-{row}.json").write_text(text.replace('"component3": -100', f'"component3": {-row - 1}'))
        command = f"seq 0 {count - 1} | xargs -P 2 -I@ {self.program} write loop-@.json --output-dir loop >/dev/null 2>&1"
        (self.folder / "loop").mkdir()
        seconds = timed(lambda: subprocess.run(command, shell=True, cwd=self.folder, check=False))
        made = len(list((self.folder / "loop").glob("*.inp")))
        self.clear("loop")
        for file in self.folder.glob("loop-*.json"):
            file.unlink()
        return made / seconds

    def bracket(self, rows=2000, rounds=5):
        for name in ("bracket.json", "bracket.msh"):
            shutil.copy(ROOT / "examples/bracket" / name, self.folder)
        table = self.table("push.csv", PUSH, (-1 - row / 4 for row in range(rows)))
        best = {"study": 0.0, "copies": 0.0, "loop": 0.0}
        ratios = []
        self.study("bracket.json", table, "push")
        data = (self.folder / "push/000/0002.inp").read_bytes()
        self.clear("push")
        for _ in range(rounds):
            # A virtual machine gives freed memory back after a while, and gets it anew page by page: whoever comes
            # first would pay for that alone.
            self.copies("copies", data, rows)
            self.clear("copies")
            study = rows / timed(lambda: self.study("bracket.json", table, "push"))
            self.clear("push")
            copies = rows / timed(lambda: self.copies("copies", data, rows))
            self.clear("copies")
            loop = self.write_loop(100)
            ratios.append(study / copies)
            for name, rate in (("study", study), ("copies", copies), ("loop", loop)):
                best[name] = max(best[name], rate)
        print(f"bracket, {rows} variants of a load, two jobs, {len(data)} bytes a deck, best of {rounds}:")
        print(f"  study             {best['study']:9.0f} decks/s")
        print(f"  loop over write   {best['loop']:9.0f} decks/s   study/loop   {best['study'] / best['loop']:6.1f}   (10)")
        print(f"  raw copies        {best['copies']:9.0f} decks/s   study/copies {best['study'] / best['copies']:6.2f}   (0.6)"
              f"   pair by pair {', '.join(f'{ratio:.2f}' for ratio in ratios)}, median {statistics.median(ratios):.2f}")

    def tiny(self, rows=100_000):
        (self.folder / "tiny.json").write_text(json.dumps(TINY))
        table = self.table("tiny.csv", "/models/Default Model/loads/F/states/Pull/component1", range(1, rows + 1))
        before = peak_of_children()
        seconds = timed(lambda: self.study("tiny.json", table, "tiny"))
        peak = peak_of_children()
        print(f"tiny model, {rows} rows, two jobs:")
        print(f"  study             {rows / seconds:9.0f} rows/s    (10000)")
        print(f"  memory            {peak:9.0f} MiB       (200){' or less' if peak == before else ''}")
        resume = min(timed(lambda: self.study("tiny.json", table, "tiny", "--resume")) for _ in range(3))
        print(f"  resume, all done  {resume:9.2f} s         (2)")
        data = (self.folder / "tiny/000/000001.inp").read_bytes()
        copies = rows / timed(lambda: self.copies("copies", data, rows))
        print(f"  raw copies        {copies:9.0f} files/s, for comparison")
        self.clear("tiny", "copies")


def main():
    program = os.path.abspath(sys.argv[1])
    folder = pathlib.Path(sys.argv[2] if len(sys.argv) > 2 else tempfile.mkdtemp(prefix="qrx-bench-"))
    folder.mkdir(exist_ok=True)
    bench = Bench(program, folder)
    load = re.split(r"\s+", pathlib.Path("/proc/loadavg").read_text())[0]
    print(f"{os.cpu_count()} processors, load {load}")
    try:
        bench.tiny()
        bench.bracket()
    finally:
        bench.remove_cleared()
        if len(sys.argv) <= 2:
            shutil.rmtree(folder)


if __name__ == "__main__":
    main()
