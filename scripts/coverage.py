#!/usr/bin/env python3
"""Measures what of the library the tests reach, and prints it by folder.

usage: coverage.py [--no-run] [--lines] [--branches]

Builds the preset "coverage", runs its tests (not those labelled "long") and reads what gcov counted: lines, and
branches without those that only an exception reaches. --no-run reads the counts of the last run. --lines names
each line that nothing reached, --branches each line that was reached and has a way on that nothing took; those in
scripts/unreached.txt, with their reasons, are left out.
"""

import argparse
import collections
import concurrent.futures
import os
import pathlib
import re
import subprocess
import sys

import reasons

ROOT = pathlib.Path(__file__).resolve().parent.parent
BUILD = ROOT / "build" / "coverage"
LIBRARY = ["platform", "foundation", "store_interface", "keyword_layer", "QRXZptIfwOif.m", "deck_checks", "whole_file"]
FOLDERS = [*LIBRARY, "mesh_file", "model_file", "deck_reader", "view_page", "study", "tools"]


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


def statics_of(name):
    """The lines of declarations of statics in functions."""
    found = set()
    depth = None
    for number, line in enumerate((ROOT / name).read_text().splitlines(), 1):
        line = re.sub(r'R"\(.*?\)"|"(?:[^"\\]|\\.)*"|//.*', "", line)
        if depth is None and re.match(r"\s+(?:thread_local )?static (?!constexpr )", line):
            depth = 0
        if depth is not None:
            found.add(number)
            depth += sum(line.count(c) for c in "({[") - sum(line.count(c) for c in ")}]")
            if depth <= 0 and line.rstrip().endswith((";", "}")):
                depth = None
    return found


class Counts:
    """Counts by line and by branch; a line of a template counts once, however often it was made."""

    LINE = re.compile(r" *(-|#####|=====|\d+)\*?: *(\d+):")
    BLOCK = re.compile(r" *(\S+): *(\d+)-block +(\d+)")
    BRANCH = re.compile(r"branch +\d+ (?:taken (-?\d+)|never executed)(.*)")

    def __init__(self):
        self.lines = collections.defaultdict(int)
        self.branches = collections.defaultdict(int)
        self.statics = {}

    def add(self, text):
        name = None
        blocks = collections.defaultdict(dict)
        block = []
        never = False
        for line in text.splitlines():
            if found := self.BRANCH.match(line):
                if "(throw)" not in found[2]:
                    block.append(max(0, int(found[1] or 0)))
            elif line.startswith("call "):
                # Of a call that never was made gcov doesn't tell which way an exception takes; that nobody came
                # there is counted where the way parts.
                if never:
                    block = []
            elif found := self.BLOCK.match(line):
                block = []
                never = found[1] == "%%%%%"
                # Reached by exceptions only. gcov 12 has the marks of blocks the other way round than its manual.
                if name and found[1] != "$$$$$":
                    blocks[int(found[2])][int(found[3])] = block
            elif found := self.LINE.match(line):
                if found[2] == "0":
                    if ":Source:" in line:
                        self.close(name, blocks)
                        name = self.name_of(line.split(":Source:")[1])
                elif name and found[1] != "-":
                    place = (name, int(found[2]))
                    self.lines[place] += int(found[1]) if found[1].isdigit() else 0
            elif line.startswith(("function ", "---")):
                self.close(name, blocks)
        self.close(name, blocks)

    @staticmethod
    def name_of(source):
        for folder in (BUILD, ROOT):
            name = os.path.relpath(os.path.normpath(folder / source), ROOT)
            if name.split("/")[0] in FOLDERS and (ROOT / name).exists():
                return name
        return None

    def close(self, name, blocks):
        """Adds the branches of one function."""
        for line, found in blocks.items():
            # One way on is no branch.
            found = {number: block for number, block in found.items() if len(block) > 1}
            if line in self.statics.setdefault(name, name and statics_of(name)):
                self.drop_race(found)
            for number, block in found.items():
                for index, count in enumerate(block):
                    self.branches[name, line, number, index] += count
        blocks.clear()

    @staticmethod
    def drop_race(blocks):
        """A static's guard has a way for the thread that comes while another one makes the static."""
        numbers = sorted(blocks)
        for first, second in zip(numbers, numbers[1:]):
            if len(blocks[first]) == len(blocks[second]) == 2 and blocks[second] == [blocks[first][0], 0]:
                del blocks[second]
                return


def text_of(path):
    """What gcov says of one object, function by function and block by block."""
    return subprocess.run(["gcov", "--all-blocks", "--branch-probabilities", "--branch-counts", "--stdout",
                           "--relative-only", "--source-prefix", ROOT, "--object-directory", path.parent, path.name],
                          cwd=BUILD, check=True, capture_output=True, text=True).stdout


def folder_of(name):
    parts = name.split("/")[:-1]
    deep = {"store_interface": 3, "QRXZptIfwOif.m": 3}.get(parts[0], 1)
    return "/".join(parts[:deep])


def rows_of(name):
    together = ["the library", "all"] if name.split("/")[0] in LIBRARY else ["all"]
    return [folder_of(name), *together]


def table(counts):
    rows = collections.defaultdict(lambda: [0, 0, 0, 0])
    for (name, _), count in counts.lines.items():
        for key in rows_of(name):
            rows[key][0] += 1
            rows[key][1] += count > 0
    for (name, *_), count in counts.branches.items():
        for key in rows_of(name):
            rows[key][2] += 1
            rows[key][3] += count > 0
    print(f"{'folder':42} {'lines':>7} {'reached':>8} {'branches':>9} {'reached':>8}")
    for key in sorted(rows, key=lambda k: (k == "all", k == "the library", k)):
        lines, reached, branches, taken = rows[key]
        print(f"{key:42} {lines:7} {100 * reached / max(lines, 1):7.1f}% {branches:9} "
              f"{100 * taken / max(branches, 1):7.1f}%")


def unreached(counts):
    known = reasons.known(ROOT / "scripts" / "unreached.txt")
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


def ways_not_taken(counts):
    known = reasons.known(ROOT / "scripts" / "unreached.txt")
    ways = collections.defaultdict(list)
    for (name, number, *_), count in sorted(counts.branches.items()):
        ways[name, number].append(count)
    left = 0
    for (name, number), taken in sorted(ways.items()):
        line = (ROOT / name).read_text().splitlines()[number - 1].strip()
        if 0 in taken and counts.lines.get((name, number)) and (name, line) not in known:
            left += 1
            print(f"{name}:{number}: {taken.count(0)} of {len(taken)}: {line}")
    print(f"{left} lines with a way on that nothing takes and no reason is given for")


def main():
    arguments = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    arguments.add_argument("--no-run", action="store_true")
    arguments.add_argument("--lines", action="store_true")
    arguments.add_argument("--branches", action="store_true")
    options = arguments.parse_args()
    if not options.no_run:
        run_tests()
    counts = Counts()
    paths = sorted(BUILD.rglob("*.gcda"))
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        for text in pool.map(text_of, paths):
            counts.add(text)
    if not counts.lines:
        sys.exit("coverage.py: nothing was counted; run it without --no-run")
    table(counts)
    if options.lines:
        unreached(counts)
    if options.branches:
        ways_not_taken(counts)


if __name__ == "__main__":
    main()
