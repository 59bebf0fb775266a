"""The lines that a single object of a model becomes: those that are gone when the object is."""

import copy
import difflib
import json
import pathlib
import re
import subprocess
import tempfile

# Banners stand for all objects of a kind.
BANNER = re.compile(r"^\*\*( *$| -+$| [A-Z ]+$)")


def tokens(pointer):
    return [each.replace("~1", "/").replace("~0", "~") for each in pointer.split("/")[1:]]


def parent_of(document, pointer):
    *path, last = tokens(pointer)
    for token in path:
        document = document[int(token)] if isinstance(document, list) else document[token]
    return document, int(last) if isinstance(document, list) else last


def without(document, pointer):
    changed = copy.deepcopy(document)
    parent, last = parent_of(changed, pointer)
    del parent[last]
    return changed


def with_absolute_files(value, folder):
    """A model whose mesh files are found from anywhere."""
    if isinstance(value, dict):
        return {name: str((folder / each).resolve()) if name == "file" and isinstance(each, str)
                else with_absolute_files(each, folder) for name, each in value.items()}
    if isinstance(value, list):
        return [with_absolute_files(each, folder) for each in value]
    return value


class Decks:
    """Decks of models and of their variants, each made once."""

    def __init__(self, program):
        self.program = program
        self.scratch = tempfile.TemporaryDirectory()
        self.made = {}

    def close(self):
        self.scratch.cleanup()

    def canonical(self, path):
        result = subprocess.run([self.program, "format", path], capture_output=True, text=True, timeout=120)
        if result.returncode != 0:
            return None
        return with_absolute_files(json.loads(result.stdout), pathlib.Path(path).parent)

    def deck(self, document):
        """Lines of its deck, or None and the places of names that lead nowhere."""
        folder = pathlib.Path(self.scratch.name)
        (folder / "model.json").write_text(json.dumps(document), encoding="utf-8")
        result = subprocess.run([self.program, "write", "model.json", "--json"], cwd=folder, capture_output=True,
                                text=True, timeout=120)
        if result.returncode == 0:
            return (folder / "model.inp").read_text(encoding="utf-8").split("\n"), []
        messages = json.loads(result.stdout).get("messages", [])
        places = [each.get("pointer", each.get("place", "")) for each in messages
                  if each.get("code") in ("no-such-name", "no-such-set")]
        return None, places

    def why_not(self, document, pointer):
        """Why no deck has lines of the object at the pointer, as the program says it; empty where it doesn't."""
        alone = copy.deepcopy(document)
        parent, last = parent_of(alone, pointer)
        if isinstance(parent[last], dict) and parent[last].get("suppressed"):
            return ""
        if isinstance(parent, dict):
            for other in set(parent) - {last}:
                del parent[other]
        # Of several that can't be written the program may tell one.
        return self.reason(document, pointer) or self.reason(alone, pointer)

    def reason(self, document, pointer):
        folder = pathlib.Path(self.scratch.name)
        (folder / "model.json").write_text(json.dumps(document), encoding="utf-8")
        result = subprocess.run([self.program, "check", "model.json", "--json"], cwd=folder, capture_output=True, text=True,
                                timeout=120)
        told = json.loads(result.stdout)
        for message in told["messages"]:
            if message.get("code") == "cannot-be-written" and (message["pointer"] + "/").startswith(pointer + "/"):
                return message["text"]
        name = tokens(pointer)[-1]
        reasons = [each["why"] for each in told.get("leftOut", []) if name in each["names"]]
        return reasons[0] if reasons else ""

    def lines_of(self, name, document, pointer):
        """The lines of the object at the pointer, with those of objects that can't be without it; None where
        there are none to be found."""
        if name not in self.made:
            self.made[name] = self.deck(document)[0]
        whole = self.made[name]
        if whole is None:
            return None
        changed = without(document, pointer)
        for _ in range(4):
            rest, places = self.deck(changed)
            if rest is not None:
                return gone(whole, rest)
            users = {user for user in map(user_of, places) if user}
            if not users:
                return None
            for user in sorted(users, key=order, reverse=True):
                try:
                    changed = without(changed, user)
                except (KeyError, IndexError, TypeError):
                    return None
        return None


def order(pointer):
    return [(0, int(token), "") if token.isdigit() else (1, 0, token) for token in tokens(pointer)]


def user_of(place):
    """The object, or the entry of a list, that the place lies in."""
    match = re.match(r"(/models/[^/]*/(?:parts|assembly/instances)/[^/]*/\w+/\d+"
                     r"|/models/[^/]*/assembly/\w+/\d+|/models/[^/]*/\w+/[^/]+)", place)
    return match[1] if match else None


def gone(whole, rest):
    """Lines that only the first has; pieces that lie apart with three points between them."""
    lines = []
    matcher = difflib.SequenceMatcher(a=whole, b=rest, autojunk=False)
    for word, begin, end, _, _ in matcher.get_opcodes():
        if word not in ("delete", "replace"):
            continue
        piece = [line for line in aligned(whole, begin, end) if not BANNER.match(line)]
        if piece and lines:
            lines.append("...")
        lines += piece
    return lines


def aligned(lines, begin, end):
    """A piece that was cut out shows as well some lines up or down where these repeat. The one that reads best: it ends
    where something ends, begins with a keyword or comment, and doesn't begin with the end of something else."""
    size = end - begin
    shifts = [begin]
    while shifts[-1] > 0 and lines[shifts[-1] - 1] == lines[shifts[-1] + size - 1]:
        shifts.append(shifts[-1] - 1)
    down = begin
    while down + size < len(lines) and lines[down] == lines[down + size]:
        down += 1
        shifts.append(down)

    def score(place):
        piece = [line for line in lines[place:place + size] if not BANNER.match(line)]
        if not piece:
            return 0
        return 4 * piece[-1].startswith("*End") + 2 * piece[0].startswith("*") - 4 * piece[0].startswith("*End")

    best = max(shifts, key=lambda place: (score(place), -abs(place - begin)))
    return lines[best:best + size]
