#!/usr/bin/env python3
"""Prints docs/findings.md: every kind of finding with its code, from the tables in the sources.

usage: list-findings.py [--check FILE]   (with a file: fails when that is not what would be printed)
"""

import argparse
import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
TABLES = [("Models", ROOT / "store_interface/findings/fnd_Codes.inl"),
          ("Decks", ROOT / "deck_reader/drd_Codes.inl")]

HEAD = """# Findings

Whatever `qrxdeck` says of a model or a deck has a code, which never changes. `--json` gives it as `code`. An error stops the
run; a warning doesn't, but the deck is hardly what was meant; a note tells what the deck leaves out or is worth a
look. This page is made from the sources by `scripts/list-findings.py`.
"""


def rows(text):
    """Sections of rows: (heading, [(code, severity, meaning)])."""
    sections = []
    row = r'\{"([a-z0-9-]+)",\s*\w+::(\w+),\s*((?:"(?:[^"\\]|\\.)*"\s*)+)\}'
    for match in re.finditer(r"^// (.+)\.$|" + row, text, re.MULTILINE):
        if match[1]:
            sections.append((match[1], []))
        else:
            meaning = "".join(re.findall(r"\"((?:[^\"\\]|\\.)*)\"", match[4])).replace('\\"', '"')
            sections[-1][1].append((match[2], match[3].lower(), meaning))
    return sections


def page():
    lines = [HEAD]
    for title, table in TABLES:
        lines.append(f"## {title}\n")
        for heading, codes in rows(table.read_text(encoding="utf-8")):
            lines.append(f"### {heading}\n")
            lines.append("| code | | meaning |\n|---|---|---|")
            lines += [f"| `{code}` | {severity} | {meaning} |" for code, severity, meaning in sorted(codes)]
            lines.append("")
    return "\n".join(lines)


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--check", metavar="FILE", type=pathlib.Path)
    arguments = parser.parse_args()
    if arguments.check is None:
        sys.stdout.write(page())
        return 0
    if arguments.check.read_text(encoding="utf-8") == page():
        return 0
    print(f"{arguments.check} is out of date: run scripts/list-findings.py > {arguments.check}", file=sys.stderr)
    return 1


if __name__ == "__main__":
    sys.exit(main())
