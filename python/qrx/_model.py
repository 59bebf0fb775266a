"""Models: parts, the assembly, materials, steps and what lives across them."""

import functools
import html
import json
import os
from collections.abc import Mapping, MutableMapping
from typing import NamedTuple

from . import _names, _qrx, _records
from ._errors import Finding, ModelError, wrong
from ._mesh import Mesh

DEFAULT_NAME = "Default Model"
FORMAT = "qrx-model/1"


class Repository(MutableMapping):
    """The objects of one kind by name."""

    def __init__(self, member, class_name, plural):
        self._member = member
        self._class_name = class_name
        self._plural = plural
        self._items = {}

    def _checked(self, name, record):
        if not isinstance(name, str):
            raise TypeError(f"names of {self._plural} are texts, not {name!r}")
        wanted = _records.class_named(self._class_name)
        if isinstance(record, wanted):
            return record
        raise wrong(f"/{self._member}/{name}", f"found {record!r}", f"a qrx.{wanted.__name__}")

    def __getitem__(self, name):
        try:
            return self._items[name]
        except KeyError:
            raise _no_such(self._plural, name, self._items) from None

    def __setitem__(self, name, record):
        self._items[name] = self._checked(name, record)

    def __delitem__(self, name):
        if name not in self._items:
            raise _no_such(self._plural, name, self._items)
        del self._items[name]

    def __iter__(self):
        return iter(self._items)

    def __len__(self):
        return len(self._items)

    def __repr__(self):
        return repr(self._items)

    def _document(self):
        return self._items


def _no_such(plural, name, known):
    hint = _qrx.nearest(str(name), list(known))
    return KeyError(f"{plural}: there is no {name!r}" + (f"; {hint}" if hint else ""))


class Steps(Mapping):
    """The steps by name, in their order; the initial one comes first."""

    def __init__(self):
        self._list = [_records.class_named("kprC_InitialStep")()]

    def __getitem__(self, name):
        for step in self._list:
            if step.name == name:
                return step
        raise _no_such("steps", name, [step.name for step in self._list])

    def __iter__(self):
        return iter([step.name for step in self._list])

    def __len__(self):
        return len(self._list)

    def __delitem__(self, name):
        self._list.remove(self[name])

    def add(self, step, *, before=None, after=None):
        """Adds a step, at the end or beside another one; an initial step takes the place of the one there is."""
        if not isinstance(step, _records.class_named("kprC_Step")):
            raise wrong("/steps", f"found {step!r}", "a step, such as qrx.StaticStep('Load')")
        if step._full_name == "kprC_InitialStep":
            self._list[:1] = [step]
            return step
        if step.name in self:
            raise wrong("/steps", f"found a second step named {step.name!r}", "names that are unique")
        place = len(self._list)
        if before is not None:
            place = self._place(before)
        elif after is not None:
            place = self._place(after) + 1
        self._list.insert(max(place, 1), step)
        return step

    def _place(self, step):
        return [each.name for each in self._list].index(self[_records.step_name(step)].name)

    def __eq__(self, other):
        return isinstance(other, Steps) and self._list == other._list

    __hash__ = None

    def __repr__(self):
        return repr(self._list)

    def _document(self):
        return self._list


class _Attributes:
    """A list of what is assigned to sets."""

    def __init__(self, name, class_name, optional):
        self.name = name
        self.class_name = class_name
        self.optional = optional

    def __set_name__(self, owner, name):
        self.slot = "_" + name

    def __get__(self, owner, kind=None):
        return self if owner is None else getattr(owner, self.slot)

    def __set__(self, owner, value):
        if value is None and self.optional:
            object.__setattr__(owner, self.slot, None)
            return
        wanted = _records.class_named(self.class_name)
        records = [wanted(**each) if isinstance(each, dict) else each for each in value]
        for each in records:
            if not isinstance(each, wanted):
                raise wrong("/" + self.name, f"found {each!r}", f"a qrx.{wanted.__name__}")
        object.__setattr__(owner, self.slot, records)


class _Mesh:
    def __get__(self, owner, kind=None):
        return self if owner is None else owner._mesh

    def __set__(self, owner, value):
        object.__setattr__(owner, "_mesh", None if value is None else Mesh.of(value))


_SLOTS = ("_mesh", "_section_assignments", "_material_orientations", "_beam_orientations")
_LISTS = {
    "section_assignments": "sectionAssignments",
    "material_orientations": "materialOrientations",
    "beam_orientations": "beamOrientations",
}


class _Owner:
    """What parts and instances have: a mesh, and what its sets are assigned."""

    __slots__ = ()

    def _extras(self):
        return ("mesh", *_LISTS)

    def __setattr__(self, name, value):
        if name in self._extras():
            object.__setattr__(self, name, value)
        else:
            super().__setattr__(name, value)

    def assign(self, region, section, *, offset=0.0):
        """Gives a section to the elements of a set of the mesh; a later assignment wins."""
        record = _records.class_named("ptoC_SectionAssignment")(region, getattr(section, "name", section))
        if offset:
            record.offset = offset
        self._append("section_assignments", record)
        return record

    def orient_material(self, region, datum=None, **fields):
        """Gives the material of a set's elements a coordinate system."""
        record = _records.class_named("ptoC_MaterialOrientation")(region=region, datum=datum, **fields)
        self._append("material_orientations", record)
        return record

    def orient_beams(self, region, vector):
        """Gives the beams of a set the direction of their first cross-section axis."""
        record = _records.class_named("ptoC_BeamOrientation")(region=region, vector=vector)
        self._append("beam_orientations", record)
        return record

    def _append(self, name, record):
        if getattr(self, name) is None:
            setattr(self, name, [])
        getattr(self, name).append(record)

    def _document(self):
        document = super()._document()
        document.pop("class", None)
        if self.mesh is not None:
            document["mesh"] = self.mesh._native
        for name, member in _LISTS.items():
            records = getattr(self, name)
            if records or (records is not None and self._optional_lists):
                document[member] = records
        return document

    def _fill(self, tree):
        record = type(self)._taken(tree)
        self._values = record._values
        if "mesh" in tree:
            self.mesh = Mesh._of(tree["mesh"])
        for name, member in _LISTS.items():
            if member in tree:
                setattr(self, name, tree[member])

    def _same(self, other):
        return super()._same(other) and all(getattr(self, name) == getattr(other, name) for name in self._extras())

    def __deepcopy__(self, memo):
        twin = super().__deepcopy__(memo)
        twin._adopt({name: _records._deep(getattr(self, name), memo) for name in self._extras()}, self.name)
        return twin

    def __copy__(self):
        twin = super().__copy__()
        twin._adopt({name: getattr(self, name) for name in self._extras()}, self.name)
        return twin

    def _adopt(self, extras, name):
        object.__setattr__(self, "_name", name)
        for each, value in extras.items():
            setattr(self, each, value)

    @property
    def name(self):
        """By what the model calls it."""
        return self._name

    def __repr__(self):
        text = super().__repr__()
        return f"<{text.replace('()', '')} {self._name!r}: {self.mesh!r}>" if self.mesh is not None else text

    def __reduce__(self):
        raise TypeError("save a model as a file instead")


class Part(_Owner, _records.class_named("odiK_Part")):
    """A part: a mesh, and what its sets are assigned. Made by ``Model.add_part``."""

    __slots__ = (*_SLOTS, "_name")
    _tells_class = False
    _optional_lists = False
    mesh = _Mesh()
    section_assignments = _Attributes("sectionAssignments", "ptoC_SectionAssignment", False)
    material_orientations = _Attributes("materialOrientations", "ptoC_MaterialOrientation", False)
    beam_orientations = _Attributes("beamOrientations", "ptoC_BeamOrientation", False)

    def __init__(self, name, mesh=None, **fields):
        object.__setattr__(self, "_name", name)
        self.mesh = mesh
        for each in _LISTS:
            setattr(self, each, [])
        super().__init__(**fields)


class Instance(_Owner, _records.class_named("odiK_Instance")):
    """An instance of a part, moved and turned. What it has of its own takes the place of the part's."""

    __slots__ = (*_SLOTS, "_name")
    _tells_class = False
    _optional_lists = True
    mesh = _Mesh()
    section_assignments = _Attributes("sectionAssignments", "ptoC_SectionAssignment", True)
    material_orientations = _Attributes("materialOrientations", "ptoC_MaterialOrientation", True)
    beam_orientations = _Attributes("beamOrientations", "ptoC_BeamOrientation", True)

    def __init__(self, name, part=None, **fields):
        object.__setattr__(self, "_name", name)
        for each in ("mesh", *_LISTS):
            setattr(self, each, None)
        super().__init__(**fields)
        if part is not None:
            self.part = getattr(part, "name", part)


class AssemblySet(NamedTuple):
    """A set of the assembly: ``members`` are (instance or None, labels, faces or None)."""

    kind: str
    members: list
    internal: bool = False

    def _document_as(self, name):
        entries = []
        for instance, labels, faces in self.members:
            labels = labels.tolist() if hasattr(labels, "tolist") else list(labels)
            entry = {} if instance is None else {"instance": instance}
            if self.kind == "surface":
                entry["facets"] = [[label, face] for label, face in zip(labels, faces)]
            else:
                entry["labels"] = labels
            entries.append(entry)
        document = {"name": name, "kind": self.kind, "members": entries}
        if self.internal:
            document["internal"] = True
        return document


class AssemblyMesh:
    """The assembly's own mesh: few nodes, and elements such as connectors, whose ends may lie in instances.

    ``cells`` are (type, rows of ends) or (type, rows, labels); an end is the label of a node of this mesh, or
    "INSTANCE.LABEL".
    """

    def __init__(self, points=(), cells=(), *, point_labels=None, controls=None):
        self.points = [tuple(float(number) for number in point) for point in points]
        self.point_labels = list(range(1, len(self.points) + 1)) if point_labels is None else _plain(point_labels)
        self.cells = []
        first = 1
        for block in cells.items() if isinstance(cells, dict) else cells:
            kind, rows, *labels = block
            rows = [list(row) for row in _plain(rows)]
            given = _plain(labels[0]) if labels else list(range(first, first + len(rows)))
            first = max([first - 1, *given]) + 1
            self.cells.append((kind, rows, given))
        self.controls = dict(controls or {})

    def _document(self):
        elements = []
        for kind, rows, labels in self.cells:
            block = {"type": kind, "labels": labels, "connectivity": rows}
            controls = self.controls.get(kind)
            if controls is not None:
                document = dict(controls._document())
                document.pop("class", None)
                block["controls"] = document
            elements.append(block)
        document = {"nodes": {"labels": self.point_labels, "coordinates": self.points}} if self.points else {}
        return {**document, "elements": elements} if elements else document

    def __eq__(self, other):
        return isinstance(other, AssemblyMesh) and self._document() == other._document()

    __hash__ = None

    def __repr__(self):
        cells = [(kind, rows, labels) for kind, rows, labels in self.cells]
        text = f"qrx.AssemblyMesh({self.points!r}, {cells!r}, point_labels={self.point_labels!r}"
        return text + (f", controls={self.controls!r})" if self.controls else ")")


def _plain(values):
    return values.tolist() if hasattr(values, "tolist") else list(values)


class Assembly(_records.class_named("odiK_Assembly")):
    """The assembly: instances, and what spans them."""

    __slots__ = ("instances", "sets", "_mesh", "_section_assignments", "_connector_orientations")
    _tells_class = False
    section_assignments = _Attributes("sectionAssignments", "ptoC_SectionAssignment", False)
    connector_orientations = _Attributes("connectorOrientations", "ptoC_ConnectorOrientation", False)

    def __init__(self, **fields):
        object.__setattr__(self, "instances", _Named("instances", Instance))
        object.__setattr__(self, "sets", _AssemblySets())
        object.__setattr__(self, "_mesh", None)
        self.section_assignments = []
        self.connector_orientations = []
        super().__init__(**fields)

    def _extras(self):
        return ("instances", "sets", "mesh", "section_assignments", "connector_orientations")

    @property
    def mesh(self):
        """The assembly's own mesh, or None."""
        return self._mesh

    @mesh.setter
    def mesh(self, value):
        if value is not None and not isinstance(value, AssemblyMesh):
            raise wrong("/assembly/mesh", f"found {value!r}", "a qrx.AssemblyMesh")
        object.__setattr__(self, "_mesh", value)

    def _document(self):
        document = super()._document()
        if self.instances:
            document["instances"] = self.instances
        if self.mesh is not None:
            document["mesh"] = self.mesh
        if self.sets:
            document["sets"] = [each._document_as(name) for name, each in self.sets.items()]
        if self.section_assignments:
            document["sectionAssignments"] = self.section_assignments
        if self.connector_orientations:
            document["connectorOrientations"] = self.connector_orientations
        return document

    def _same(self, other):
        return super()._same(other) and all(getattr(self, name) == getattr(other, name) for name in self._extras())

    def __deepcopy__(self, memo):
        twin = type(self)()
        twin._values = {name: _records._deep(value, memo) for name, value in self._values.items()}
        for name, instance in self.instances.items():
            twin.instances._items[name] = instance.__deepcopy__(memo)
        twin.sets.update(self.sets)
        twin.mesh = self.mesh
        twin.section_assignments = _records._deep(self.section_assignments, memo)
        twin.connector_orientations = _records._deep(self.connector_orientations, memo)
        return twin


class _AssemblySets(dict):
    def __missing__(self, name):
        raise _no_such("sets of the assembly", name, self)


class _Named(MutableMapping):
    """Parts or instances by name."""

    def __init__(self, plural, kind):
        self._plural = plural
        self._kind = kind
        self._items = {}

    def __getitem__(self, name):
        try:
            return self._items[name]
        except KeyError:
            raise _no_such(self._plural, name, self._items) from None

    def __setitem__(self, name, value):
        if not isinstance(value, self._kind):
            raise wrong(f"/{self._plural}/{name}", f"found {value!r}", f"a qrx.{self._kind.__name__}")
        object.__setattr__(value, "_name", name)
        self._items[name] = value

    def __delitem__(self, name):
        del self._items[name]

    def __iter__(self):
        return iter(self._items)

    def __len__(self):
        return len(self._items)

    def __eq__(self, other):
        return isinstance(other, _Named) and self._items == other._items

    __hash__ = None

    def __repr__(self):
        return repr(self._items)

    def _document(self):
        return self._items


class _Datums(_Named):
    def __init__(self):
        super().__init__("datums", _records.class_named("odiK_Datum"))

    def __setitem__(self, name, value):
        if not isinstance(value, self._kind):
            raise wrong(f"/datums/{name}", f"found {value!r}", "a qrx.Datum")
        value.name = name
        self._items[name] = value

    def __eq__(self, other):
        return isinstance(other, _Datums) and list(self._items.items()) == list(other._items.items())

    __hash__ = None

    def _document(self):
        return list(self._items.values())


class Parameter(NamedTuple):
    """A short name for places of the model that studies vary together.

    ``pointers`` are JSON pointers into the model file, ``limits`` a text such as "> 0, <= 20" or "0.5 .. 20".
    """

    pointers: tuple
    unit: str = ""
    limits: str = ""
    description: str = ""

    @classmethod
    def of(cls, value):
        """A parameter of pointers, or of what a model file says."""
        if isinstance(value, dict):
            fields = dict(value)
            return cls(_pointers(fields.pop("pointers", ())), **fields)
        if isinstance(value, Parameter):
            return cls(_pointers(value.pointers), *value[1:])
        return cls(_pointers(value))

    def _document(self):
        texts = {name: text for name, text in zip(self._fields[1:], self[1:]) if text}
        return {"pointers": list(self.pointers), **texts}


def _pointers(value):
    return (value,) if isinstance(value, str) else tuple(value)


class _Parameters(dict):
    """Parameters by name."""

    def __setitem__(self, name, value):
        super().__setitem__(name, Parameter.of(value))

    def __missing__(self, name):
        raise _no_such("parameters", name, self)


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


class _Data:
    """A field of the model's own."""

    def __init__(self, field):
        self._field = field
        self.__doc__ = _records.doc_of(field)

    def __get__(self, model, kind=None):
        return self if model is None else self._field.__get__(model._data)

    def __set__(self, model, value):
        self._field.__set__(model._data, value)


class Model:
    """All that one deck is written from.

    heading : the text below ``*Heading``, with which the deck opens
    name : by which a model file knows it; no deck tells of it

    All else is a field of the model: description, top_level_solver_input, solver_input, ...
    """

    def __init__(self, heading=None, *, name=DEFAULT_NAME, **fields):
        self.name = name
        self._data = _model_data()(**fields)
        self.datums = {}
        self.parts = {}
        self.assembly = Assembly()
        self.steps = Steps()
        self.parameters = {}
        for attribute in _repositories():
            setattr(self, attribute, {})
        if heading is not None:
            if "top_level_solver_input" in fields:
                raise TypeError("heading and top_level_solver_input both say how the deck opens")
            self.heading = heading

    def __setattr__(self, name, value):
        if name in _repositories():
            value = _filled(Repository(*_repositories()[name]), value)
        elif name in ("parts", "datums", "parameters"):
            value = _filled({"parts": _parts, "datums": _Datums, "parameters": _Parameters}[name](), value)
        elif name == "steps" and not isinstance(value, Steps):
            taken = Steps()
            for step in value.values() if isinstance(value, Mapping) else value:
                taken.add(step)
            value = taken
        elif name == "assembly" and not isinstance(value, Assembly):
            raise wrong("/assembly", f"found {value!r}", "a qrx.Assembly")
        elif not hasattr(type(self), name) and name not in _MEMBERS:
            known = [*_model_data()._fields, *_repositories(), *_MEMBERS, "heading"]
            hint = _qrx.nearest(name, known)
            raise AttributeError(f"Model has no {name!r}" + (f"; {hint}" if hint else ""))
        object.__setattr__(self, name, value)

    @property
    def heading(self):
        """The text below ``*Heading``, or None where the deck opens in another way."""
        text = self.top_level_solver_input
        lines = (text if isinstance(text, str) else "\n".join(text)).split("\n")
        return lines[1] if len(lines) > 1 and lines[0].lower() == "*heading" else None

    @heading.setter
    def heading(self, text):
        self.top_level_solver_input = f"*Heading\n{text}\n"

    @property
    def instances(self):
        """The instances of the assembly."""
        return self.assembly.instances

    def add_part(self, name, mesh=None, **fields):
        """Adds a part; the mesh may be any object with points and cells."""
        if name in self.parts:
            raise wrong(f"/parts/{name}", f"found a second part named {name!r}", "names that are unique")
        part = Part(name, mesh, **fields)
        self.parts[name] = part
        return part

    def add_instance(self, name, part, *, translation=(0.0, 0.0, 0.0), rotation=(0.0, 0.0, 0.0), **fields):
        """Adds an instance of a part: turned by the rotation vector (its length is the angle in radians), then moved."""
        if name in self.instances:
            raise wrong(f"/assembly/instances/{name}", f"found a second instance named {name!r}",
                        "names that are unique")
        instance = Instance(name, part, translation=translation, rotation=rotation, **fields)
        self.instances[name] = instance
        return instance

    def add_step(self, step, *, before=None, after=None):
        """Adds a step, at the end or beside another one."""
        return self.steps.add(step, before=before, after=after)

    def add_datum(self, datum):
        """Adds a coordinate system, a point, an axis or a plane."""
        self.datums[datum.name] = datum
        return datum

    def _add_set(self, name, kind, members, internal):
        if name in self.assembly.sets:
            raise wrong(f"/assembly/sets/{name}", f"found a second set named {name!r}", "names that are unique")
        entries = []
        for instance, labels in members.items() if isinstance(members, dict) else members:
            instance = None if instance is None else getattr(instance, "name", instance)
            faces = None
            if kind == "surface":
                from ._mesh import _facets

                labels, faces = _facets(labels)
            entries.append((instance, _plain(labels), faces))
        self.assembly.sets[name] = AssemblySet(kind, entries, internal)
        return name

    def add_node_set(self, name, members, *, internal=False):
        """Adds a set of the assembly: {instance: labels of nodes}, None for the assembly's own mesh."""
        return self._add_set(name, "node", members, internal)

    def add_element_set(self, name, members, *, internal=False):
        """Adds a set of the assembly: {instance: labels of elements}."""
        return self._add_set(name, "element", members, internal)

    def add_surface(self, name, members, *, internal=False):
        """Adds a surface of the assembly: {instance: rows of (label of an element, face)}."""
        return self._add_set(name, "surface", members, internal)

    def _document(self):
        document = self._data._document()
        document.pop("class", None)
        for member, value in (("datums", self.datums), ("parts", self.parts)):
            if value:
                document[member] = value
        assembly = self.assembly._document()
        if assembly:
            document["assembly"] = assembly
        document["steps"] = self.steps
        for attribute, row in _repositories().items():
            repository = getattr(self, attribute)
            if repository:
                document[row[0]] = repository
        return document

    def _store(self):
        return _store_of([self])

    def check(self):
        """All that there is to say of the model and its deck, as a list of findings; empty when all is well."""
        try:
            return [Finding(*finding) for finding in _qrx.check(self._checked())]
        except ModelError as error:
            # Of a value that no model file can hold, put into a list behind the record's back.
            return error.findings

    def _checked(self):
        # A mesh stands in the document by its number: what lies in one is looked for when a study reads the file.
        parameters = {
            name: parameter
            for name, parameter in self.parameters.items()
            if not any("/mesh/" in pointer for pointer in parameter.pointers)
        }
        document = _file_of([self])
        return {**document, "parameters": parameters} if parameters else document

    def write(self, target, *, threads=0):
        """Writes the deck to a path, which is replaced as a whole or not at all, or to a binary file.

        Large meshes are laid out by as many threads, 0: one a core; the deck is the same with any number.
        """
        if hasattr(target, "write"):
            self._store().write_deck_to(target.write, threads)
        else:
            self._store().write_deck(_records.file_path(target), threads)

    def deck(self):
        """The deck as a text."""
        return self._store().deck().decode("utf-8", "surrogateescape")

    def save(self, target):
        """Writes the model file. Meshes that are a mesher's file stay in it."""
        save([self], target)

    def history(self, kind=None):
        """What the objects of a kind ("loads", ...) are in each step; of all kinds, by kind, when none is given."""
        told = json.loads(self._store().history())
        kinds = {_names.repository_name(member): member for member in told if member in _texts(told)}
        if kind is None:
            return {name: _history(told, member) for name, member in kinds.items()}
        member = _member_of(kind, kinds)
        return _history(told, member)

    def deck_lines(self, kind, name, step, load_case=""):
        """The lines that an object becomes in a step of the deck, or in a load case of it."""
        member = _member_of(kind, {each: row[0] for each, row in _repositories().items()})
        if name not in getattr(self, _names.repository_name(member)):
            raise _no_such(kind, name, getattr(self, _names.repository_name(member)))
        lines = self._store().deck_lines(member, name, self.steps[_records.step_name(step)].name)
        found = [text for case, text in lines if case == load_case]
        return "".join(found).splitlines()

    def view(self, target=None, *, title=None):
        """The page that shows the model, step by step; written to a path when one is given."""
        page = self._store().page(title or self.heading or self.name)
        if not page:
            raise RuntimeError(
                "this package was built without the page that shows models: run scripts/install-dependencies.sh "
                "viewer in its sources and install it again"
            )
        if target is not None:
            _qrx.replace_file(_records.file_path(target), "page", page.encode())
        return Page(page)

    def copy(self):
        """A copy whose records are its own; meshes are shared."""
        twin = Model(name=self.name)
        twin._data = self._data.copy()
        for name, datum in self.datums.items():
            twin.datums[name] = datum.copy()
        for name, part in self.parts.items():
            twin.parts[name] = part.copy()
        twin.assembly = self.assembly.copy()
        twin.steps._list = [step.copy() for step in self.steps._list]
        twin.parameters = self.parameters
        for attribute in _repositories():
            for name, record in getattr(self, attribute).items():
                getattr(twin, attribute)[name] = record.copy()
        return twin

    __copy__ = copy

    def __deepcopy__(self, memo):
        return self.copy()

    def __eq__(self, other):
        if not isinstance(other, Model):
            return NotImplemented
        return all(
            getattr(self, name) == getattr(other, name)
            for name in ("name", "_data", "datums", "parts", "assembly", "steps", "parameters", *_repositories())
        )

    __hash__ = None

    def __repr__(self):
        counts = [f"{len(self.parts)} parts", f"{len(self.instances)} instances", f"{len(self.steps)} steps"]
        counts += [f"{len(getattr(self, name))} {name}" for name in _repositories() if getattr(self, name)]
        return f"<qrx.Model {self.heading or self.name!r}: {', '.join(counts)}>"

    def _repr_html_(self):
        return _summary(self)


def _parts():
    return _Named("parts", Part)


def _filled(container, value):
    for name, each in dict(value).items():
        container[name] = each
    return container


_MEMBERS = ("name", "_data", "datums", "parts", "assembly", "steps", "parameters")


@functools.cache
def _model_data():
    return _records.class_named("odiK_ModelData")


@functools.cache
def _repositories():
    """The rows of the repositories but the steps, by Python's names."""
    return {
        _names.repository_name(member): (member, class_name, plural)
        for member, class_name, plural, _ in _qrx.repositories()
        if member != "steps"
    }


for _name, _field in _model_data()._fields.items():
    setattr(Model, _name, _Data(_field))


def _member_of(kind, known):
    for name, member in known.items():
        if kind in (name, member):
            return member
    hint = _qrx.nearest(str(kind), list(known))
    raise wrong("/", f"found {kind!r}", "one of " + ", ".join(known), hint)


def _texts(told):
    return {member for member in told if member != "failures"}


def _history(told, member):
    statuses = _records.enum_class("mdl_PropagationStatusEnm")
    rows = []
    for name, entry in told[member].items():
        cells = {
            state["step"]: HistoryCell(statuses(state["status"]), state.get("written"), state.get("opNew"))
            for state in entry["steps"]
        }
        rows.append(HistoryRow(name, entry["suppressed"], cells))
    return History(rows, _qrx.history_text(json.dumps(told), member))


def _file_of(models):
    return {"format": FORMAT, "models": {model.name: model for model in models}}


def _store_of(models):
    store = _qrx.store_of(_file_of(models))
    store.set_parameters([
        (name, *parameter) for model in models for name, parameter in model.parameters.items()
    ])
    return store


def save(models, target):
    """Writes a model file of several models."""
    models = list(models)
    is_file = hasattr(target, "write")
    folder = "" if is_file else os.path.dirname(_records.file_path(target))
    text = _store_of(models).model_file(folder)
    if is_file:
        target.write(text)
    else:
        _qrx.replace_file(_records.file_path(target), "model file", text)


def load(path, name=None):
    """Reads a model file. Of a file with several models the one of the name, or "Default Model"."""
    models = load_all(path)
    if name is None:
        name = next(iter(models)) if len(models) == 1 else DEFAULT_NAME
    if name not in models:
        raise _no_such("models", name, models)
    return models[name]


def load_all(path):
    """Reads all models of a model file, by name."""
    path = _records.file_path(path)
    with open(path, "rb"):
        pass
    store = _qrx.load(path)
    models = {name: _model_of(name, tree) for name, tree in store.trees().items()}
    for name, *parameter in store.parameters:
        # A model's own: the first pointer says whose.
        token = parameter[0][0].split("/")[2].replace("~1", "/").replace("~0", "~")
        models[token].parameters[name] = Parameter(*parameter)
    return models


def _model_of(name, tree):
    model = Model(name=name)
    model._data = _model_data()._taken(tree)
    for datum in tree["datums"]:
        model.datums[datum.name] = datum
    meshes = {}
    for each, told in tree["parts"].items():
        model.parts[each] = _owner_of(Part(each), told, meshes)
    assembly = tree["assembly"]
    model.assembly._values = Assembly._taken(assembly)._values
    for each, told in assembly["instances"].items():
        model.instances[each] = _owner_of(Instance(each), told, meshes)
    if "mesh" in assembly:
        model.assembly.mesh = _assembly_mesh_of(assembly["mesh"])
    for each, kind, internal, members in assembly["sets"]:
        model.assembly.sets[each] = AssemblySet(kind, list(members), internal)
    model.assembly.section_assignments = assembly.get("sectionAssignments", [])
    model.assembly.connector_orientations = assembly.get("connectorOrientations", [])
    model.steps._list = tree["steps"]
    for attribute, row in _repositories().items():
        getattr(model, attribute)._items.update(tree[row[0]])
    return model


def _owner_of(owner, told, meshes):
    owner._fill(told)
    if owner.mesh is not None:
        # One object for a mesh that several show.
        owner.mesh = meshes.setdefault(owner.mesh._native.same_as, owner.mesh)
    return owner


def _assembly_mesh_of(told):
    cells = [(kind, rows, labels) for kind, rows, labels, _ in told["blocks"]]
    mesh = AssemblyMesh(told["points"], cells, point_labels=told["labels"])
    for kind, _, _, controls in told["blocks"]:
        if controls._values:
            mesh.controls[kind] = controls
    return mesh


def _table(head, rows):
    cells = "".join(f"<th style='text-align:left'>{html.escape(word)}</th>" for word in head)
    body = "".join(
        "<tr>" + "".join(f"<td style='text-align:left'>{html.escape(str(cell))}</td>" for cell in row) + "</tr>"
        for row in rows
    )
    return f"<table><thead><tr>{cells}</tr></thead><tbody>{body}</tbody></table>"


def _summary(model):
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
        for name in _repositories()
        if getattr(model, name)
    ]
    text += _table(("kind", "count", "names"), rows)
    try:
        model._store()
    except ModelError as error:
        text += _table(("errors",), [(str(finding),) for finding in error.findings if finding.is_error])
    return text


__all__ = ["Assembly", "AssemblyMesh", "AssemblySet", "Instance", "Model", "Parameter", "Part", "load", "load_all",
           "save"]
