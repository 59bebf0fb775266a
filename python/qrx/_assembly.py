"""Parts, instances and the assembly."""

from typing import NamedTuple

from . import _records
from ._containers import Named, no_such
from ._errors import wrong
from ._mesh import Mesh


class _Attributes:
    """A list of what is assigned to sets."""

    def __init__(self, name, class_name):
        self.name = name
        self.class_name = class_name

    def __set_name__(self, owner, name):
        self.slot = "_" + name

    def __get__(self, owner, kind=None):
        return self if owner is None else getattr(owner, self.slot)

    def __set__(self, owner, value):
        if value is None and owner._optional_lists:
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
    mesh = _Mesh()
    section_assignments = _Attributes("sectionAssignments", "ptoC_SectionAssignment")
    material_orientations = _Attributes("materialOrientations", "ptoC_MaterialOrientation")
    beam_orientations = _Attributes("beamOrientations", "ptoC_BeamOrientation")

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
        self.point_labels = list(range(1, len(self.points) + 1)) if point_labels is None else plain(point_labels)
        self.cells = []
        first = 1
        for block in cells.items() if isinstance(cells, dict) else cells:
            kind, rows, *labels = block
            rows = [list(row) for row in plain(rows)]
            given = plain(labels[0]) if labels else list(range(first, first + len(rows)))
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


def plain(values):
    return values.tolist() if hasattr(values, "tolist") else list(values)


class Assembly(_records.class_named("odiK_Assembly")):
    """The assembly: instances, and what spans them."""

    __slots__ = ("instances", "sets", "_mesh", "_section_assignments", "_connector_orientations")
    _tells_class = False
    _optional_lists = False
    section_assignments = _Attributes("sectionAssignments", "ptoC_SectionAssignment")
    connector_orientations = _Attributes("connectorOrientations", "ptoC_ConnectorOrientation")

    def __init__(self, **fields):
        object.__setattr__(self, "instances", Named("instances", Instance))
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
        raise no_such("sets of the assembly", name, self)
