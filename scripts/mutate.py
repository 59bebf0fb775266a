#!/usr/bin/env python3
"""Asks whether the tests notice wrong deck writers.

usage: mutate.py [--count N] [--seed N] [--decks-only] [--keep]

Takes a sample of places in the deck writer, each a condition to negate, a text to change, a comparison to turn or
an "and" to make an "or". All go into one copy of the tree, each asleep until the variable QRX_MUTANT names it, so
that the copy is built once, without optimising. Then each is woken alone: the golden decks are run, where these see
nothing the tests of its folder, and then all test programs, the quickest first. Prints which tests killed how many,
and names every mutant that lives; those in scripts/equivalent.txt, which change nothing that anybody could see, are
counted apart.
"""

import argparse
import concurrent.futures
import os
import pathlib
import random
import re
import shutil
import subprocess
import sys
import time

import reasons

ROOT = pathlib.Path(__file__).resolve().parent.parent
COPY = ROOT / "build" / "mutants"
BUILD = COPY / "build" / "debug"
WRITER = "QRXZptIfwOif.m/src"
PRECOMPILED = "mutants.h"

HEADER = """#ifndef QRX_MUTANT_H
#define QRX_MUTANT_H
#include <cstdlib>
inline bool qrx_IsAwake(int number) {
    static const int awake = [] {
        const char* text = std::getenv("QRX_MUTANT");
        return text == nullptr ? 0 : std::atoi(text);
    }();
    return number == awake;
}
#endif
"""

TURNED = {"==": "!=", "!=": "==", "<": "<=", ">": ">=", "<=": "<", ">=": ">"}
CONDITION = re.compile(r"^(\s+(?:\} else )?if \()(.+)(\) (?:\{|return.*;|continue;|break;)|\))$")
OPERAND = r"[A-Za-z_][\w.:]*(?:(?:->|\.|::)\w+|\(\)|\[\w+\])*|\d+"
COMPARISON = re.compile(rf"(?<=[(!])({OPERAND}) (==|!=|<=|>=|<|>) ({OPERAND}|\"[^\"]*\")(?=\)| &&| \|\|)"
                        rf"|(?<=&& )({OPERAND}) (==|!=|<=|>=|<|>) ({OPERAND})(?=\)| &&|;)"
                        rf"|(?<=return )({OPERAND}) (==|!=|<=|>=|<|>) ({OPERAND})(?=;| &&)")
TEXT = re.compile(r"\"((?:[^\"\\]|\\.)+)\"")


def is_balanced(text):
    depth = 0
    for c in re.sub(TEXT, "", text):
        depth += (c == "(") - (c == ")")
        if depth < 0:
            return False
    return depth == 0


def split_and(condition):
    """The two sides of a condition that has just one "and" outside of parentheses, and no "or"."""
    depth = 0
    places = []
    for i, c in enumerate(condition):
        depth += (c == "(") - (c == ")")
        if depth == 0 and condition.startswith(" && ", i):
            places.append(i)
        if depth == 0 and condition.startswith(" || ", i):
            return None
    return (condition[:places[0]], condition[places[0] + 4:]) if len(places) == 1 else None


def changes_of(line):
    """Pairs of a description and a function from the mutant's number to the changed line."""
    code = line.split("//")[0].rstrip()
    changes = []
    match = CONDITION.match(code)
    if match and is_balanced(match[2]) and " = " not in match[2] and ";" not in match[2] and "constexpr" not in code:
        head, condition, tail = match.groups()
        changes.append((f"not ({condition})",
                        lambda n: f"{head}qrx_IsAwake({n}) != static_cast<bool>({condition}){tail}"))
        sides = split_and(condition)
        if sides and all(is_balanced(side) for side in sides):
            changes.append((f"({sides[0]}) or ({sides[1]})",
                            lambda n: f"{head}qrx_IsAwake({n}) ? (({sides[0]}) || ({sides[1]})) "
                                      f": (({sides[0]}) && ({sides[1]})){tail}"))
    for match in COMPARISON.finditer(code):
        left, sign, right = [group for group in match.groups() if group is not None]
        changed = f"{left} {TURNED[sign]} {right}"
        changes.append((changed, lambda n, m=match, c=changed: code[:m.start()] + f"(qrx_IsAwake({n}) ? {c} : {m[0]})"
                        + code[m.end():]))
    for match in TEXT.finditer(code):
        if code.lstrip().startswith(("#", "static_assert", "case", "namespace")) or "nex_" in code:
            continue
        other = match[1][:-1] + ("x" if match[1][-1] != "x" else "y") if not match[1].endswith("\\n") else match[1] + "x"
        if other.endswith("\\x") or other.endswith("\\y"):
            continue
        changes.append((f'"{other}"', lambda n, m=match, o=other: code[:m.start()] + f'(qrx_IsAwake({n}) ? "{o}" : {m[0]})'
                        + code[m.end():]))
    return changes


def candidates():
    found = []
    for path in sorted((ROOT / WRITER).rglob("*.cpp")):
        for number, line in enumerate(path.read_text().splitlines(), 1):
            # Bodies of functions are indented; texts that go on in the next line are left out.
            if line.startswith("    ") and not line.rstrip().endswith('"'):
                for description, change in changes_of(line):
                    found.append((str(path.relative_to(ROOT)), number, description, change))
    return found


def copy_tree():
    shutil.rmtree(COPY, ignore_errors=True)
    names = subprocess.run(["git", "ls-files", "-z"], cwd=ROOT, check=True, capture_output=True).stdout
    for name in names.decode().split("\0"):
        if name:
            target = COPY / name
            target.parent.mkdir(parents=True, exist_ok=True)
            shutil.copy2(ROOT / name, target)
    (COPY / "foundation" / "qrx_Mutant.h").write_text(HEADER)


def plant(name, mutants):
    """Writes the file of the copy with these mutants in it."""
    lines = (ROOT / name).read_text().splitlines()
    for number, line, _, change in mutants:
        lines[line - 1] = change(number)
    (COPY / name).write_text('#include "foundation/qrx_Mutant.h"\n' + "\n".join(lines) + "\n")


def refused(name):
    """The lines of the file that the compiler refuses, and whether it refuses the file."""
    run = subprocess.run(["g++", "-std=c++20", "-fsyntax-only", "-I.", f"-I{WRITER}", "-include", PRECOMPILED, name],
                         cwd=COPY, capture_output=True, text=True)
    # The header of the mutants stands ahead of the first line.
    return [int(line) - 1 for line in re.findall(re.escape(name) + r":(\d+):\d+: error", run.stderr)], run.returncode != 0


def without_refused(name, mutants):
    """Plants those of the mutants that can be; what has to be a constant can't be put to sleep."""
    while True:
        plant(name, mutants)
        wrong, fails = refused(name)
        if not fails:
            return mutants
        kept = [m for m in mutants if not any(abs(m[1] - line) <= 1 for line in wrong)]
        mutants = kept if len(kept) < len(mutants) else []


def take_sample(count, seed):
    random.seed(seed)
    pool = candidates()
    random.shuffle(pool)
    chosen = {}
    lines = set()
    total = 0
    for name, line, description, change in pool:
        if total >= count + count // 4:
            break
        if (name, line) in lines:
            continue
        lines.add((name, line))
        total += 1
        chosen.setdefault(name, []).append((total, line, description, change))
    (COPY / PRECOMPILED).write_text(f'#include "foundation/qrx_Mutant.h"\n#include "{WRITER}/base/oif_ModelInfo.h"\n')
    subprocess.run(["g++", "-std=c++20", "-I.", f"-I{WRITER}", "-x", "c++-header", PRECOMPILED], cwd=COPY, check=True)
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        chosen = dict(zip(chosen, pool.map(without_refused, chosen.keys(), chosen.values())))
    mutants = sorted((m[0], name, m[1], m[2]) for name, list_ in chosen.items() for m in list_)
    return mutants[:count]


def run(program, number, *arguments, timeout=300):
    """Whether the program fails with the mutant awake."""
    environment = {**os.environ, "QRX_MUTANT": str(number)}
    try:
        return subprocess.run([program, "--gtest_brief=1", "--gtest_fail_fast", *arguments], cwd=program.parent, env=environment,
                              stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, timeout=timeout).returncode != 0
    except subprocess.TimeoutExpired:
        return True


def build(decks_only):
    """Builds the copy; its program of golden decks, and the other test programs with the quickest first."""
    ccache = shutil.which("ccache") or ""
    subprocess.run(["cmake", "--preset", "debug", f"-DCMAKE_CXX_COMPILER_LAUNCHER={ccache}", "-DQRX_BUILD_TESTS=ON",
                    "-DCMAKE_CXX_FLAGS_DEBUG=-O0", "-DQRX_UNITY_BUILD=ON", "-DQRX_BUILD_PYTHON=OFF"],
                   cwd=COPY, check=True, stdout=subprocess.DEVNULL)
    target = ["--target", "qrx_deck_tests"] if decks_only else []
    subprocess.run(["cmake", "--build", str(BUILD), "--parallel", str(os.cpu_count()), *target], check=True,
                   stdout=subprocess.DEVNULL)
    decks = BUILD / "tests" / "decks" / "qrx_deck_tests"
    others = [] if decks_only else sorted(
        path for path in (BUILD / "tests").glob("*/*") if path.is_file() and os.access(path, os.X_OK)
        and path.name.endswith(("_test", "_tests")) and path != decks and "long" not in path.name)
    seconds = {}
    for program in [decks, *others]:
        begin = time.monotonic()
        if run(program, 0):
            sys.exit(f"mutate.py: {program.name} fails although all mutants sleep")
        seconds[program] = time.monotonic() - begin
    return decks, sorted(others, key=seconds.get)


def killer_of(mutant, decks, others):
    """The name of the first program that fails with this mutant awake."""
    number, name = mutant[:2]
    # Of the six ways of each deck the plain one sees nearly all.
    if run(decks, number, "--gtest_filter=*Plainly*"):
        return decks.name
    family = name[len(WRITER) + 1:].split("/")[0]
    near = [program for program in others if program.parent.name == family]
    far = [program for program in others if program.parent.name != family]
    return next((program.name for program in [*near, decks, *far] if run(program, number)), None)


def main():
    arguments = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    arguments.add_argument("--count", type=int, default=200)
    arguments.add_argument("--seed", type=int, default=1)
    arguments.add_argument("--decks-only", action="store_true", help="don't ask the other tests")
    arguments.add_argument("--keep", action="store_true", help="use the copy of the last run, built with these arguments")
    options = arguments.parse_args()

    if not options.keep:
        copy_tree()
    mutants = take_sample(options.count, options.seed)
    print(f"{len(mutants)} mutants, seed {options.seed}", flush=True)
    decks, others = build(options.decks_only)
    known = reasons.known(ROOT / "scripts" / "equivalent.txt")
    killers = {}
    living = []
    same = 0
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        for mutant, killer in zip(mutants, pool.map(lambda m: killer_of(m, decks, others), mutants)):
            _, name, line, description = mutant
            if killer is not None:
                killers[killer] = killers.get(killer, 0) + 1
            elif (name, description) in known:
                same += 1
            else:
                living.append(f"{name}:{line}: {description}")
                print("lives:", living[-1], flush=True)
    for killer, count in sorted(killers.items(), key=lambda item: -item[1]):
        print(f"{count:4} killed by {killer}")
    print(f"{same:4} equivalent")
    print(f"{len(living):4} live")


if __name__ == "__main__":
    main()
