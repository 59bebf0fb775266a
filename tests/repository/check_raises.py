#!/usr/bin/env python3
"""Holds what the writer raises against the table that says what foretells it.

usage: check_raises.py REPOSITORY
"""

import pathlib
import re
import sys

RAISE = re.compile(r"\b(?:nex_Raise\((?P<text>.+)\)|(?P<container>cow_Raise\w+\(.+\)));")


def raised(sources):
    for source in sorted(sources.rglob("*.cpp")):
        for match in RAISE.finditer(source.read_text(encoding="utf-8")):
            yield source.relative_to(sources).as_posix(), match["text"] or match["container"]


def main():
    if len(sys.argv) != 2:
        sys.exit(__doc__.strip())
    root = pathlib.Path(sys.argv[1])
    tests = {f"{suite}.{name}" for source in (root / "tests").rglob("*.cpp")
             for suite, name in re.findall(r"^TEST(?:_[FP])?\((\w+), (\w+)\)", source.read_text(encoding="utf-8"),
                                           re.MULTILINE)}
    findings, rows = [], set()
    table = root / "tests" / "deck_checks" / "raises.txt"
    for line in table.read_text(encoding="utf-8").splitlines():
        if not line or line.startswith("#"):
            continue
        source, text, why = (part.strip() for part in line.split(" | "))
        rows.add((source, text))
        if why.startswith("by ") and why[3:] not in tests:
            findings.append(f"{table.name}: there is no test {why[3:]}")
        elif not why.startswith(("by ", "never: ")):
            findings.append(f"{table.name}: {why!r} begins with neither \"by\" nor \"never:\"")
    found = set(raised(root / "QRXZptIfwOif.m" / "src"))
    findings += [f"{source} raises {text}, of which {table.name} tells nothing" for source, text in sorted(found - rows)]
    findings += [f"{table.name}: {source} doesn't raise {text}" for source, text in sorted(rows - found)]
    for finding in findings:
        print(finding)
    print(f"{len(found)} failures, {len(findings)} findings")
    sys.exit(1 if findings or not found else 0)


if __name__ == "__main__":
    main()
