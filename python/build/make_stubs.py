#!/usr/bin/env python3
"""Writes the stubs of the package, __init__.pyi, from the store's tables: make_stubs.py OUTPUT"""

import pathlib
import sys
import textwrap

from qrx import _docs, _names, _qrx, _records, _values

HEAD = '''"""Stubs of the package; made from the store's tables."""

import builtins
import enum
import os
from collections.abc import Iterable, Iterator, Mapping, MutableMapping, Sequence
from typing import Any, Generic, IO, NamedTuple, Protocol, Self, TypeVar, overload

import numpy as np
from numpy.typing import ArrayLike, NDArray

__version__: str

_Get = TypeVar("_Get")
_Set = TypeVar("_Set")
_T = TypeVar("_T", bound="Record")
_Path = str | os.PathLike[str]
_Number = float | np.floating[Any] | np.integer[Any]
_Rows = Sequence[Sequence[float]] | NDArray[Any]
_Table = Sequence[Sequence[float] | float] | NDArray[Any] | _Number
_Triple = Sequence[float] | NDArray[Any]
_Places = Sequence[Sequence[int]] | NDArray[Any]
_Region = str | tuple[str | None, str] | tuple["Instance", str] | Mapping[str, str] | None
_Datum = str | "Datum" | None
_Complex = builtins.complex | "Polar" | Sequence[float]

class _Attr(Generic[_Get, _Set]):
    @overload
    def __get__(self, record: None, owner: Any) -> Self: ...
    @overload
    def __get__(self, record: object, owner: Any) -> _Get: ...
    def __set__(self, record: Any, value: _Set) -> None: ...
    def __delete__(self, record: Any) -> None: ...

class Finding(NamedTuple):
    place: str
    found: str
    expected: str = ...
    hint: str = ...
    severity: str = ...
    code: str = ...
    text: str = ...
    line: int = ...
    column: int = ...
    @property
    def is_error(self) -> bool: ...

class ModelError(ValueError):
    findings: list[Finding]
    def __init__(self, findings: Iterable[Finding]) -> None: ...

class DeckError(Exception):
    text: str
    context: str
    object: str
    step: str
    def __init__(self, text: str, context: str = ...) -> None: ...

class Polar:
    magnitude: float
    phase: float
    def __init__(self, magnitude: float, phase: float) -> None: ...

class Region(tuple[str | None, str]):
    def __new__(cls, instance: str | None, name: str) -> Self: ...

class _Word(str, enum.Enum):
    @property
    def number(self) -> int: ...

class Record:
    def copy(self) -> Self: ...

class CellBlock(NamedTuple):
    type: str
    data: NDArray[np.int32]
    labels: NDArray[np.int32]
    controls: ElemCtrlParams

class MeshSet(NamedTuple):
    kind: str
    internal: bool
    labels: NDArray[np.int32]
    faces: tuple[str, ...] | None = ...

class Count(NamedTuple):
    count: int  # type: ignore[assignment]
    first: tuple[int, ...]

class MeshQuality(NamedTuple):
    inverted: Count
    far_mid_sides: Count
    repeated_nodes: Count
    repeated_elements: Count
    unused_nodes: Count
    shared_faces: Count
    findings: tuple[Finding, ...]
    @property
    def is_good(self) -> bool: ...

class _HasCells(Protocol):
    @property
    def points(self) -> Any: ...
    @property
    def cells(self) -> Any: ...

_Cells = Mapping[str, _Places] | Iterable[tuple[str, _Places]]

class Mesh:
    @overload
    def __init__(self, points: _HasCells, /, *, scale: float = ..., element_types: Mapping[str, str | None] = ...,
                 surface_elements: str = ..., groups: Mapping[str, str | None] = ...,
                 group_arrays: Sequence[str] = ...,
                 surfaces: Mapping[str, Any] = ...) -> None: ...
    @overload
    def __init__(self, points: _Rows, cells: _Cells, *, point_labels: ArrayLike | None = ...,
                 cell_labels: Mapping[str, ArrayLike] | Sequence[ArrayLike] | None = ...,
                 point_sets: Mapping[str, ArrayLike] | None = ..., cell_sets: Mapping[str, Any] | None = ...,
                 surfaces: Mapping[str, Any] | None = ..., controls: Mapping[str, ElemCtrlParams] | None = ...,
                 scale: float = ..., element_types: Mapping[str, str | None] = ..., surface_elements: str = ...,
                 groups: Mapping[str, str | None] = ...) -> None: ...
    @classmethod
    def read(cls, path: _Path, *, scale: float | None = ..., element_types: Mapping[str, str | None] | None = ...,
             surface_elements: str | None = ..., groups: Mapping[str, str | None] | None = ...,
             group_arrays: Sequence[str] | None = ..., part: str | None = ...,
             controls: Mapping[str, ElemCtrlParams | Mapping[str, Any]] | None = ...) -> Mesh: ...
    @classmethod
    def of(cls, value: Mesh | _HasCells) -> Mesh: ...
    @property
    def points(self) -> NDArray[np.float32]: ...
    @property
    def point_labels(self) -> NDArray[np.int32]: ...
    @property
    def num_points(self) -> int: ...
    @property
    def num_cells(self) -> int: ...
    @property
    def cells(self) -> list[CellBlock]: ...
    @property
    def cells_dict(self) -> dict[str, NDArray[np.int32]]: ...
    @property
    def cell_labels(self) -> NDArray[np.int32]: ...
    @property
    def point_sets(self) -> Mapping[str, NDArray[np.int32]]: ...
    @property
    def cell_sets(self) -> Mapping[str, NDArray[np.int32]]: ...
    @property
    def surfaces(self) -> Mapping[str, NDArray[Any]]: ...
    @property
    def sets(self) -> Mapping[str, MeshSet]: ...
    @property
    def notes(self) -> tuple[str, ...]: ...
    def add_point_set(self, name: str, places: ArrayLike, *, internal: bool = ...) -> None: ...
    def add_cell_set(self, name: str, places: Any, *, internal: bool = ...) -> None: ...
    def add_surface(self, name: str, facets: Any, *, internal: bool = ...) -> None: ...
    def add_set(self, name: str, kind: str, labels: ArrayLike, *, internal: bool = ...) -> None: ...
    def quality(self) -> MeshQuality: ...

class AssemblySet(NamedTuple):
    kind: str
    members: list[tuple[str | None, list[int], list[Any] | None]]
    internal: bool = ...

class AssemblyMesh:
    points: list[tuple[float, ...]]
    point_labels: list[int]
    cells: list[tuple[str, list[list[int | str]], list[int]]]
    controls: dict[str, ElemCtrlParams]
    def __init__(self, points: ArrayLike = ..., cells: Any = ..., *, point_labels: ArrayLike | None = ...,
                 controls: Mapping[str, ElemCtrlParams] | None = ...) -> None: ...

class Parameter(NamedTuple):
    pointers: tuple[str, ...]
    unit: str = ...
    limits: str = ...
    description: str = ...

class Repository(MutableMapping[str, _T]):
    def __getitem__(self, name: str) -> _T: ...
    def __setitem__(self, name: str, record: _T) -> None: ...
    def __delitem__(self, name: str) -> None: ...
    def __iter__(self) -> Iterator[str]: ...
    def __len__(self) -> int: ...

class Steps(Mapping[str, "Step"]):
    def __getitem__(self, name: str) -> Step: ...
    def __delitem__(self, name: str) -> None: ...
    def __iter__(self) -> Iterator[str]: ...
    def __len__(self) -> int: ...
    def add(self, step: _S, *, before: str | Step | None = ..., after: str | Step | None = ...) -> _S: ...

_S = TypeVar("_S", bound="Step")

class HistoryCell(NamedTuple):
    status: PropagationStatus
    written: bool | None = ...
    op_new: bool | None = ...

class HistoryRow(NamedTuple):
    name: str
    suppressed: bool
    steps: dict[str, HistoryCell]

class History(list[HistoryRow]):
    text: str

class Page(str): ...

class _Owner(Record):
    mesh: _Attr[Mesh | None, Mesh | _HasCells | None]
    @property
    def name(self) -> str: ...
    section_assignments: list[SectionAssignment]
    material_orientations: list[MaterialOrientation]
    beam_orientations: list[BeamOrientation]
    def assign(self, region: str, section: str, *, offset: float = ...) -> SectionAssignment: ...
    def orient_material(self, region: str, datum: str | Datum | None = ..., **fields: Any) -> MaterialOrientation: ...
    def orient_beams(self, region: str, vector: _Triple) -> BeamOrientation: ...

class _SetOfAssembly(Protocol): ...
_Members = Mapping[Any, Any] | Iterable[tuple[Any, Any]]

class StudyResult(NamedTuple):
    row: int
    name: str
    parameters: dict[str, Any]
    deck: bytes | None
    sha256: str
    seconds: float
    findings: list[Finding]
    errors: list[Finding]
    @property
    def ok(self) -> bool: ...
    def write(self, path: _Path) -> None: ...

def study(model: Model, rows: Iterable[Mapping[str, Any]], jobs: int = ...) -> Iterator[StudyResult]: ...
def load(path: _Path, name: str | None = ...) -> Model: ...
def load_all(path: _Path) -> dict[str, Model]: ...
def save(models: Iterable[Model], target: _Path | IO[bytes]) -> None: ...
def schema() -> str: ...
'''

MODEL = '''
class Model:
    name: str
    heading: _Attr[str | None, str]
    datums: _Attr[MutableMapping[str, Datum], Mapping[str, Datum]]
    parts: _Attr[MutableMapping[str, Part], Mapping[str, Part]]
    assembly: Assembly
    steps: _Attr[Steps, Steps | Mapping[str, Step] | Iterable[Step]]
    parameters: _Attr[MutableMapping[str, Parameter], Mapping[str, Parameter | str | Sequence[str] | Mapping[str, Any]]]
    @property
    def instances(self) -> MutableMapping[str, Instance]: ...
    def add_part(self, name: str, mesh: Mesh | _HasCells | None = ..., *, solver_input: str = ...) -> Part: ...
    def add_instance(self, name: str, part: str | Part, *, translation: _Triple = ..., rotation: _Triple = ...,
                     part_instance: bool = ..., solver_input: str = ...) -> Instance: ...
    def add_step(self, step: _S, *, before: str | Step | None = ..., after: str | Step | None = ...) -> _S: ...
    def add_datum(self, datum: Datum) -> Datum: ...
    def add_node_set(self, name: str, members: _Members, *, internal: bool = ...) -> str: ...
    def add_element_set(self, name: str, members: _Members, *, internal: bool = ...) -> str: ...
    def add_surface(self, name: str, members: _Members, *, internal: bool = ...) -> str: ...
    def check(self) -> list[Finding]: ...
    def write(self, target: _Path | IO[bytes], *, threads: int = ...) -> None: ...
    def deck(self) -> str: ...
    def save(self, target: _Path | IO[bytes]) -> None: ...
    @overload
    def history(self) -> dict[str, History]: ...
    @overload
    def history(self, kind: str) -> History: ...
    def deck_lines(self, kind: str, name: str, step: str | Step, load_case: str = ...) -> list[str]: ...
    def view(self, target: _Path | None = ..., *, title: str | None = ...) -> Page: ...
    def copy(self) -> Model: ...
'''


def got(told):
    """What an attribute of the type gives."""
    kind = told["kind"]
    if kind == "Attribute":
        return f"{got(told['value'])} | None"
    if kind == "List":
        return f"list[{got(told['item'])}]"
    if kind == "Map":
        return f"dict[str, {got(told['item'])}]"
    if kind == "Enum":
        return _names.enum_name(told["enum"])
    if kind in ("Record", "Optional", "Variant"):
        return _names.class_name(told["class"]) + ("" if kind == "Record" else " | None")
    return {
        "Bool": "bool", "Int": "int", "Double": "float", "Float": "float", "String": "str",
        "Triple": "tuple[float, float, float]",
        "Segment": "tuple[tuple[float, float, float], tuple[float, float, float]]", "Complex": "builtins.complex | Polar",
        "Table": "list[list[float]]", "Region": "str | Region | None", "Datum": "str | None",
    }[kind]


def taken(told, meanings=()):
    """What may be put into an attribute of the type."""
    kind = told["kind"]
    if kind == "Attribute":
        return f"{taken(told['value'])} | Mapping[str, Any] | None"
    if kind == "List":
        return f"Iterable[{taken(told['item'])}]" + (" | NDArray[Any]" if told["item"]["kind"] in ("Int", "Double") else "")
    if kind == "Map":
        return f"Mapping[str, {taken(told['item'])}]"
    if kind == "Enum":
        words = {row[0] for row in _qrx.enum_rows(told["enum"])}
        return f"{_names.enum_name(told['enum'])} | str | int" + (" | bool" if {"ON", "OFF"} <= words else "")
    if kind in ("Record", "Optional", "Variant"):
        held = _records.class_named(told["class"])
        table = held._fields.get("table")
        text = f"{held.__name__} | Mapping[str, Any]"
        if table is not None and table.kind == "Table":
            text += " | _Table"
        return text + ("" if kind == "Record" else " | None")
    return {
        "Bool": "bool", "Int": "int | str" if meanings else "int", "Double": "_Number", "Float": "_Number",
        "String": "str", "Triple": "_Triple", "Segment": "Sequence[_Triple] | NDArray[Any]", "Complex": "_Complex",
        "Table": "_Rows", "Region": "_Region", "Datum": "_Datum",
    }[kind]


def types(field):
    """What the field gives and takes; None where it may be without a value, or is a text of lines."""
    get = got(field.told)
    put = taken(field.told, field.native.meanings)
    if field.kind in ("Int", "Double") and field.native.default() is None:
        get += " | None"
        put += " | None"
    if field.kind == "String" and field.native.verbatim:
        put += " | Sequence[str]"
    if field.kind == "String" and field.native.refers_to:
        put += " | Step" if field.native.refers_to == "step" else ""
    return get, put


def arguments(fields):
    return [f"{name}: {types(field)[1]} = ..." for name, field in fields.items()]


def own_fields(cls):
    base = cls.__mro__[1]
    return {name: field for name, field in cls._fields.items() if name not in getattr(base, "_fields", {})}


def doc(cls, indent="    "):
    text = _docs.class_doc(cls).replace("\\", "\\\\").replace('"""', '\\"\\"\\"')
    return textwrap.indent(f'"""{text}\n"""', indent, lambda line: bool(line.strip()))


def init(cls, extra=()):
    positional = [name for name in cls._positional if name in cls._fields]
    words = ["self", *extra, *[f"{name}: {types(cls._fields[name])[1]} = ..." for name in positional]]
    named = arguments({name: field for name, field in cls._fields.items() if name not in positional})
    if issubclass(cls, _records.Propagating):
        named.append("states: Mapping[str, Any] = ...")
    if issubclass(cls, _records.State):
        named += ["deactivated: bool = ...", "status: PropagationStatus | str | None = ..."]
    if named:
        words += ["*", *named]
    return f"    def __init__({', '.join(words)}) -> None: ..."


def class_stub(cls):
    base = cls.__mro__[1].__name__
    lines = [f"class {cls.__name__}({base.lstrip('_') if base != 'Record' else 'Record'}):", doc(cls)]
    for name, field in own_fields(cls).items():
        get, put = types(field)
        lines.append(f"    {name}: _Attr[{get}, {put}]")
    if _qrx.class_of(cls._full_name).abstract:
        return lines
    if issubclass(cls, _records.Step):
        lines.append(init(cls, ['name: str = "Initial"' if cls.__name__ == "InitialStep" else "name: str"]))
    else:
        lines.append(init(cls))
    if issubclass(cls, _records.Propagating):
        state = cls._state_class()
        given = arguments(state._fields)
        given += ["deactivated: bool = ...", "status: PropagationStatus | str | None = ..."]
        narrowed = "  # type: ignore[assignment]" if not _is_abstract(cls.__mro__[1]) else ""
        lines.append(f"    states: dict[str, {state.__name__}]{narrowed}")
        lines.append(f"    def at(self, step: str | Step, /, *, {', '.join(given)}) -> Self: ...  # type: ignore[override]")
    return lines


def _is_abstract(cls):
    return cls is _records.Propagating or _qrx.class_of(cls._full_name).abstract


BASES = '''
class {step}(Record):
    name: str

class {state}(Record):
    """What was said of an object in one step."""
    deactivated: bool
    status: _Attr[PropagationStatus | None, PropagationStatus | str | None]
    @property
    def given(self) -> tuple[str, ...]: ...

class {propagating}(Record):
    """What lives across steps."""
    states: Any
    def at(self, step: str | Step, /, **fields: Any) -> Self: ...
    def end_at(self, step: str | Step, /) -> Self: ...
'''


def frame_stub(name, full, base, extra, body=""):
    cls = _records.class_named(full)
    lines = [f"class {name}({base}):", doc(cls)]
    for each, field in cls._fields.items():
        get, put = types(field)
        lines.append(f"    {each}: _Attr[{get}, {put}]")
    if extra is not None:
        lines.append(f"    def __init__(self, {extra}*, {', '.join(arguments(cls._fields))}) -> None: ...")
    return lines + ([body] if body else [])


def stubs():
    lines = [HEAD]
    for full in _qrx.enum_names():
        members = _values.enum_class(full)
        lines.append(f"class {members.__name__}(_Word):")
        lines += [f"    {each} = {member.value!r}" for each, member in members.__members__.items()]
    lines.append(BASES.format(step="_StepBase", state="State", propagating="Propagating"))
    done = {"Record", "State", "Propagating"}
    waiting = [_records.class_named(full) for full in _records.classes().values()]
    while waiting:
        ready = [cls for cls in waiting if base_name(cls) in done]
        for cls in ready:
            text = class_stub(cls)
            text[0] = f"class {cls.__name__}({'_StepBase' if cls._full_name == 'kprC_Step' else base_name(cls)}):"
            lines += text
            done.add(cls.__name__)
        waiting = [cls for cls in waiting if cls not in ready]
    lines += frame_stub("Part", "odiK_Part", "_Owner", "name: str, mesh: Mesh | _HasCells | None = ..., ")
    lines += frame_stub("Instance", "odiK_Instance", "_Owner", None)
    lines.append(
        "    def __init__(self, name: str, part: str | Part | None = ..., *, translation: _Triple = ..., "
        "rotation: _Triple = ..., part_instance: bool = ..., solver_input: str | Sequence[str] = ...) -> None: ..."
    )
    lines += frame_stub("Assembly", "odiK_Assembly", "Record", "", (
        "    instances: MutableMapping[str, Instance]\n    sets: dict[str, AssemblySet]\n"
        "    mesh: AssemblyMesh | None\n    section_assignments: list[SectionAssignment]\n"
        "    connector_orientations: list[ConnectorOrientation]"
    ))
    lines.append(MODEL)
    data = _records.class_named("odiK_ModelData")
    for name, field in data._fields.items():
        get, put = types(field)
        lines.append(f"    {name}: _Attr[{get}, {put}]")
    for member, class_name, _, _ in _qrx.repositories():
        if member != "steps":
            held = _names.class_name(class_name)
            lines.append(f"    {_names.repository_name(member)}: _Attr[Repository[{held}], Mapping[str, {held}]]")
    lines.append(
        f"    def __init__(self, heading: str | None = ..., *, name: str = ..., {', '.join(arguments(data._fields))}) "
        "-> None: ..."
    )
    return "\n".join(lines) + "\n"


def base_name(cls):
    if cls._full_name in ("kprC_Step", "kprC_PropagatingObject"):
        return "Record" if cls._full_name == "kprC_Step" else "Propagating"
    base = cls.__mro__[1]
    return base.__name__


def main():
    if len(sys.argv) != 2:
        sys.exit(__doc__)
    pathlib.Path(sys.argv[1]).write_text(stubs(), encoding="utf-8")


if __name__ == "__main__":
    main()
