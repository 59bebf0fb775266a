"""What a model tells of itself: histories, pages, summaries."""

import html
from typing import NamedTuple

from ._containers import repositories
from ._errors import ModelError
from ._values import enum_class


class HistoryCell(NamedTuple):
    """What an object is in a step; whether the step writes it, and with op=NEW. None: only the status is known."""

    status: object
    written: object = None
    op_new: object = None


class HistoryRow(NamedTuple):
    """An object through all steps."""

    name: str
    suppressed: bool
    steps: dict


class History(list):
    """Rows of a history; as a text, the table that the command line prints."""

    def __init__(self, rows, text):
        super().__init__(rows)
        self.text = text

    def __str__(self):
        return self.text

    def _repr_html_(self):
        return f"<pre>{html.escape(self.text)}</pre>"


class Page(str):
    """A page that shows a model; notebooks show it in a frame."""

    __slots__ = ()

    def _repr_html_(self):
        return (
            f'<iframe srcdoc="{html.escape(self)}" style="width:100%;height:640px;border:1px solid #ccc"></iframe>'
        )


def kinds_of(told):
    return {member for member in told if member != "failures"}


def history_of(told, tables, member):
    statuses = enum_class("mdl_PropagationStatusEnm")
    rows = []
    for name, entry in told[member].items():
        cells = {
            state["step"]: HistoryCell(statuses(state["status"]), state.get("written"), state.get("opNew"))
            for state in entry["steps"]
        }
        rows.append(HistoryRow(name, entry["suppressed"], cells))
    return History(rows, tables[member])


def _table(head, rows):
    cells = "".join(f"<th style='text-align:left'>{html.escape(word)}</th>" for word in head)
    body = "".join(
        "<tr>" + "".join(f"<td style='text-align:left'>{html.escape(str(cell))}</td>" for cell in row) + "</tr>"
        for row in rows
    )
    return f"<table><thead><tr>{cells}</tr></thead><tbody>{body}</tbody></table>"


def summary(model):
    """The model as notebooks show it."""
    title = f"<h4>{html.escape(model.heading or model.name)}</h4>"
    parts = [
        (name, part.mesh.num_points if part.mesh else 0, part.mesh.num_cells if part.mesh else 0,
         ", ".join(sorted({block.type for block in part.mesh.cells})) if part.mesh else "")
        for name, part in model.parts.items()
    ]
    text = title + _table(("part", "nodes", "elements", "types"), parts)
    text += _table(("instance", "part"), [(name, each.part) for name, each in model.instances.items()])
    text += _table(("step", "procedure"), [(step.name, type(step).__name__) for step in model.steps._list])
    rows = [
        (name.replace("_", " "), len(getattr(model, name)), ", ".join(getattr(model, name)))
        for name in repositories()
        if getattr(model, name)
    ]
    text += _table(("kind", "count", "names"), rows)
    try:
        model._store()
    except ModelError as error:
        text += _table(("errors",), [(str(finding),) for finding in error.findings if finding.is_error])
    return text
