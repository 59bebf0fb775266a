#!/usr/bin/env python3
"""Measures what of the library the tests reach, and prints it by folder.

usage: coverage.py [--no-run] [--lines]

Builds the preset "coverage", runs its tests (not those labelled "long") and reads what gcov counted: lines, and
branches without the edges that only an exception takes. --no-run reads the counts of the last run. --lines names
each line that nothing reached; those in scripts/unreached.txt, with their reasons, are left out.
"""

import argparse
import collections
import concurrent.futures
import json
import os
import pathlib
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
BUILD = ROOT / "build" / "coverage"
FOLDERS = ["foundation", "store_interface", "keyword_layer", "QRXZptIfwOif.m", "deck_checks", "model_file", "study", "tools"]


def run_tests():
    subprocess.run(["cmake", "--preset", "coverage", "-DQRX_BUILD_TESTS=ON", "-DCMAKE_CXX_COMPILER_LAUNCHER="],
                   cwd=ROOT, check=True, stdout=subprocess.DEVNULL)
    subprocess.run(["cmake", "--build", "--preset", "coverage", "--parallel", str(os.cpu_count())], cwd=ROOT,
                   check=True, stdout=subprocess.DEVNULL)
    for counts in BUILD.rglob("*.gcda"):
        counts.unlink()
    # What fails is told by the tests themselves; here it only counts what was reached.
    subprocess.run(["ctest", "--test-dir", str(BUILD), "--label-exclude", "^long$", "--parallel",
                    str(os.cpu_count())], check=False)


def counts_of(path):
    """What gcov says of one object, file by file."""
    text = subprocess.run(["gcov", "--json-format", "--stdout", "--branch-probabilities", path.name],
                          cwd=path.parent, check=True, capture_output=True, text=True).stdout
    found = []
    for document in text.splitlines():
        data = json.loads(document)
        for file in data["files"]:
            name = os.path.relpath(os.path.normpath(os.path.join(data["current_working_directory"], file["file"])),
                                   ROOT)
            if name.split("/")[0] in FOLDERS:
                found.append((name, file["lines"]))
    return found


class Counts:
    def __init__(self):
        # A line of a template counts once, however often it was made.
        self.lines = collections.defaultdict(int)
        self.branches = collections.defaultdict(int)

    def add(self, name, lines):
        for line in lines:
            place = (name, line["line_number"])
            self.lines[place] += line["count"]
            ordinary = [branch for branch in line["branches"] if not branch["throw"]]
            # One way on is no branch.
            if len(ordinary) < 2:
                continue
            for index, branch in enumerate(ordinary):
                self.branches[place + (index,)] += branch["count"]


def folder_of(name):
    parts = name.split("/")[:-1]
    deep = {"store_interface": 3, "QRXZptIfwOif.m": 3}.get(parts[0], 1)
    return "/".join(parts[:deep])


def table(counts):
    rows = collections.defaultdict(lambda: [0, 0, 0, 0])
    for (name, _), count in counts.lines.items():
        for key in (folder_of(name), "all"):
            rows[key][0] += 1
            rows[key][1] += count > 0
    for (name, _, _), count in counts.branches.items():
        for key in (folder_of(name), "all"):
            rows[key][2] += 1
            rows[key][3] += count > 0
    print(f"{'folder':42} {'lines':>7} {'reached':>8} {'branches':>9} {'reached':>8}")
    for key in sorted(rows, key=lambda k: (k == "all", k)):
        lines, reached, branches, taken = rows[key]
        print(f"{key:42} {lines:7} {100 * reached / max(lines, 1):7.1f}% {branches:9} "
              f"{100 * taken / max(branches, 1):7.1f}%")


def known_reasons():
    """Texts of lines by file; a reason stands behind "  -- "."""
    path = ROOT / "scripts" / "unreached.txt"
    known = set()
    if path.exists():
        for line in path.read_text().splitlines():
            if line and not line.startswith("#"):
                place = line.split("  -- ")[0]
                name, _, text = place.partition(": ")
                known.add((name, text.strip()))
    return known


def unreached(counts):
    known = known_reasons()
    left = 0
    for name in sorted({name for name, _ in counts.lines}):
        text = (ROOT / name).read_text().splitlines()
        for number in sorted(n for f, n in counts.lines if f == name and counts.lines[(f, n)] == 0):
            line = text[number - 1].strip()
            # The last brace of a function that never returns.
            if line in ("}", "};") or (name, line) in known:
                continue
            left += 1
            print(f"{name}:{number}: {line}")
    print(f"{left} lines that nothing reaches and no reason is given for")
    return left


def main():
    arguments = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    arguments.add_argument("--no-run", action="store_true")
    arguments.add_argument("--lines", action="store_true")
    options = arguments.parse_args()
    if not options.no_run:
        run_tests()
    counts = Counts()
    paths = sorted(BUILD.rglob("*.gcda"))
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        for found in pool.map(counts_of, paths):
            for name, lines in found:
                counts.add(name, lines)
    if not counts.lines:
        sys.exit("coverage.py: nothing was counted; run it without --no-run")
    table(counts)
    if options.lines:
        unreached(counts)


if __name__ == "__main__":
    main()
