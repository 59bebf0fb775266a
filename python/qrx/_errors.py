"""Findings, and the errors that carry them."""

import re
from typing import NamedTuple


class Finding(NamedTuple):
    """Something to say of a model: where, what, and how to mend it.

    ``place`` is a JSON pointer into the model file that the model would make; in a file that was read it has a
    ``line`` and a ``column`` too, from 1.
    """

    place: str
    found: str
    expected: str = ""
    hint: str = ""
    severity: str = "error"
    code: str = ""
    text: str = ""
    line: int = 0
    column: int = 0

    @property
    def is_error(self):
        return self.severity == "error"

    def __str__(self):
        text = self.text or ", expected ".join(part for part in (self.found, self.expected) if part)
        if not self.text and self.hint:
            text += "; " + self.hint
        where = f"line {self.line}, column {self.column}: " if self.line else ""
        return f"{self.severity}: {where}{self.place + ': ' if self.place else ''}{text}"


class ModelError(ValueError):
    """A model, a mesh or a value is wrong; ``findings`` tells what."""

    def __init__(self, findings):
        self.findings = [finding if isinstance(finding, Finding) else Finding(*finding) for finding in findings]
        super().__init__(self.findings)

    def __str__(self):
        errors = [finding for finding in self.findings if finding.is_error] or self.findings
        lines = [str(finding).removeprefix("error: ") for finding in errors[:10]]
        if len(errors) > 10:
            lines.append(f"... and {len(errors) - 10} more")
        return "\n".join(lines)


class DeckError(Exception):
    """A deck can't express the model: ``text`` says why, ``object`` and ``step`` where."""

    def __init__(self, text, context=""):
        super().__init__(text, context)
        self.text = text
        self.context = context
        frames = re.findall(r"([^',]+) '((?:[^']|'(?!, |$))*)'", context)
        named = {kind.strip(): name for kind, name in frames}
        self.step = named.pop("step", "")
        self.object = list(named.values())[-1] if named else ""

    def __str__(self):
        return f"{self.text} ({self.context})" if self.context else self.text


for _class in (Finding, ModelError, DeckError):
    _class.__module__ = "qrx"


def wrong(place, found, expected="", hint=""):
    """The error of one finding."""
    return ModelError([Finding(place, found, expected, hint, "error", "wrong-value")])
