"""The fenced blocks of a page, and what HTML comments ahead of them say about how they are tried.

A comment `<!-- WORD: VALUE -->` (or `<!-- WORD -->`) belongs to the next block:

  files       files and folders of the repository that the page's folder gets copies of; of a folder with a slash
              behind its name, what is in it
  save        the block is written to a file of this name
  model       the model that JSON fragments and deck lines are parts of, from here on
  deck        the deck that the lines are part of
  schema      the definition in the schema of model files that the block has to satisfy
  like        a file whose lines have the same members
  merge       a model that the piece of JSON is laid over; the result has no errors
  before      commands that are run ahead of the block
  include     headers that the C++ takes, by their places in the repository
  setup       Python that is run ahead of the block
  exit        the exit code of the block's last command, where it isn't 0
  not run     why the block's commands are looked at and not run
"""

import dataclasses
import json
import re


@dataclasses.dataclass
class Block:
    language: str
    text: str
    line: int
    words: dict


def blocks_of(text):
    """All fenced blocks of a page."""
    found, words, inside = [], {}, None
    for number, line in enumerate(text.split("\n"), 1):
        fence = re.match(r"^\s*(`{3,})(.*)$", line)
        if inside is not None:
            if fence and fence[1] == inside[0] and not fence[2].strip():
                _, language, begin, lines, indent = inside
                found.append(Block(language, "".join(each.removeprefix(indent) + "\n" for each in lines), begin, words))
                words, inside = {}, None
            else:
                inside[3].append(line)
            continue
        for word, value in re.findall(r"<!-- ([a-z ]+?)(?:: (.*?))? -->", line):
            words[word] = value
        if fence:
            inside = (fence[1], fence[2].strip(), number, [], re.match(r"\s*", line)[0])
    if inside is not None:
        raise ValueError(f"the block at line {inside[2]} has no end")
    return found


def without_comments(text):
    """JSON without // and /* */ comments."""
    pattern = r'("(?:[^"\\]|\\.)*")|//[^\n]*|/\*.*?\*/'
    return re.sub(pattern, lambda match: match[1] or " ", text, flags=re.DOTALL)


def json_of(text):
    """A JSON value, or the members of an object without its braces."""
    text = without_comments(text).strip()
    if re.match(r'^"(?:[^"\\]|\\.)*"\s*:', text):
        text = "{" + text.rstrip(",") + "}"
    return json.loads(text)


def is_part(fragment, whole):
    """Whether all that the fragment says stands in the value: members of objects, entries of arrays in their order."""
    if isinstance(fragment, dict):
        return isinstance(whole, dict) and all(
            name in whole and (is_part(value, whole[name]) or name == "class" and is_class(value, whole[name]))
            for name, value in fragment.items())
    if isinstance(fragment, list):
        if not isinstance(whole, list):
            return False
        place = iter(whole)
        return all(any(is_part(each, other) for other in place) for each in fragment)
    return type(fragment) is type(whole) and fragment == whole or (
        not isinstance(fragment, bool) and isinstance(fragment, (int, float)) and fragment == whole)


def is_class(name, other):
    """Whether two names of a class, with its prefix or without it, are one."""
    return len({re.sub(r"^[a-z]+[A-Z]?_", "", each).lower() for each in (name, other)}) == 1


def is_somewhere(fragment, whole):
    """Whether the fragment is a part of the value or of any value within it."""
    if is_part(fragment, whole):
        return True
    values = whole.values() if isinstance(whole, dict) else whole if isinstance(whole, list) else ()
    return any(is_somewhere(fragment, value) for value in values)


def fits(expected, line):
    """Whether a line is the expected one, where three points stand for any text."""
    pattern = ".*".join(re.escape(piece) for piece in expected.split("..."))
    return re.fullmatch(pattern, line) is not None


def shows(expected, lines):
    """Whether the lines are the expected ones, where a line of three points stands for any number of lines."""
    pieces, piece = [], []
    for line in expected:
        if line.strip() == "...":
            pieces.append(piece)
            piece = []
        else:
            piece.append(line.rstrip())
    pieces.append(piece)
    lines = [line.rstrip() for line in lines]
    place = 0
    for number, piece in enumerate(pieces):
        last = len(lines) - len(piece)
        starts = [0] if number == 0 else [last] if number == len(pieces) - 1 and piece else range(place, last + 1)
        if number == 0 and len(pieces) == 1 and len(lines) != len(piece):
            return False
        start = next((at for at in starts if at >= place and at + len(piece) <= len(lines)
                      and all(map(fits, piece, lines[at:at + len(piece)]))), None)
        if start is None:
            return False
        place = start + len(piece)
    return True


def holds(expected, lines):
    """Whether the lines have the expected ones somewhere, three points standing for any number of lines."""
    return shows(["...", *expected, "..."], lines)
