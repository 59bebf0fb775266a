#!/usr/bin/env python3
"""Prints docs/findings.md: every kind of finding with its code, from the tables in the sources.

usage: list-findings.py [--check FILE]   (with a file: fails when that is not what would be printed)
"""

import argparse
import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
TABLES = [("Models", ROOT / "store_interface/findings/fnd_Codes.inl", ROOT / "store_interface/findings/fnd_Explanations.inl"),
          ("Decks", ROOT / "deck_reader/drd_Codes.inl", ROOT / "deck_reader/drd_Explanations.inl")]

HEAD = """# Findings

Whatever `qrxdeck` says of a model or a deck has a code, which never changes. Messages end with it, and `--json` gives it
as `code`. An error stops the run; a warning doesn't, but the deck is hardly what was meant; a note tells what the deck
leaves out or is worth a look. `qrxdeck explain CODE` says of each what stands here; `--ignore CODE`, or an entry with a
reason in the member `ignore` of a model, silences warnings and notes that are meant to be so. This page is made from
the sources by `scripts/list-findings.py`.
"""


STRING = r'"(?:[^"\\]|\\.)*"'


def value(literals):
    """The text of string literals that stand one behind the other."""
    return "".join(literal[1:-1] for literal in re.findall(STRING, literals)).replace('\\"', '"').replace("\\\\", "\\")


def explanations(text):
    """What each code means, why that matters and what to do about it: three texts by code."""
    row = r'\{"([a-z0-9-]+)"' + (r",\s*((?:" + STRING + r"\s*)+)") * 3 + r"\}"
    return {match[1]: tuple(value(match[part]) for part in (2, 3, 4)) for match in re.finditer(row, text)}


def escaped(text):
    """As it stands, in Markdown."""
    return re.sub(r"([*_<>\[\]`])", r"\\\1", text)


def rows(text):
    """Sections of rows: (heading, [(code, severity, meaning)])."""
    sections = []
    row = r'\{"([a-z0-9-]+)",\s*\w+::(\w+),\s*((?:' + STRING + r"\s*)+)\}"
    for match in re.finditer(r"^// (.+)\.$|" + row, text, re.MULTILINE):
        if match[1]:
            sections.append((match[1], []))
        else:
            meaning = value(match[4])
            sections[-1][1].append((match[2], match[3].lower(), meaning))
    return sections


def page():
    lines = [HEAD]
    for title, table, texts in TABLES:
        lines.append(f"## {title}\n")
        explained = explanations(texts.read_text(encoding="utf-8"))
        for heading, codes in rows(table.read_text(encoding="utf-8")):
            lines.append(f"### {heading}\n")
            for code, severity, meaning in sorted(codes):
                lines.append(f"#### `{code}`\n\n*{severity}*: {escaped(meaning)}.\n")
                lines += [escaped(part) + "\n" for part in explained[code]]
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
