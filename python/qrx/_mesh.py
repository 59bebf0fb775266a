"""Meshes: arrays of numpy in and out, meshers' files, meshes of other programs."""

from collections.abc import Mapping
from typing import NamedTuple

from . import _qrx, _records
from ._errors import Finding, ModelError, wrong

# Cells by the names of meshers, and by their numbers in VTK.
_VTK = {
    "vertex": 1, "line": 3, "triangle": 5, "quad": 9, "tetra": 10, "hexahedron": 12, "wedge": 13, "pyramid": 14,
    "line3": 21, "triangle6": 22, "quad8": 23, "tetra10": 24, "hexahedron20": 25, "wedge15": 26, "pyramid13": 27,
    "quad9": 28, "hexahedron27": 29, "wedge18": 32, "triangle7": 34,
}
_NODES = {
    1: 1, 3: 2, 5: 3, 9: 4, 10: 4, 12: 8, 13: 6, 14: 5, 21: 3, 22: 6, 23: 8, 24: 10, 25: 20, 26: 15, 27: 13, 28: 9,
    29: 27, 32: 18, 34: 7,
}


class CellBlock(NamedTuple):
    """Elements of one type: rows of places of points, from 0, and the elements' labels."""

    type: str
    data: object
    labels: object
    controls: object


class MeshSet(NamedTuple):
    """A set of a mesh by the labels of its members; ``faces`` of surfaces alone."""

    kind: str
    internal: bool
    labels: object
    faces: object = None


class Count(NamedTuple):
    """How many there are, and the labels of the first ones."""

    count: int
    first: tuple

    def __bool__(self):
        return self.count > 0


class MeshQuality(NamedTuple):
    """What is wrong with the shape of a mesh."""

    inverted: Count
    far_mid_sides: Count
    repeated_nodes: Count
    repeated_elements: Count
    unused_nodes: Count
    shared_faces: Count
    findings: tuple

    @property
    def is_good(self):
        return not self.findings


class _Sets(Mapping):
    """The sets of one kind by name."""

    def __init__(self, native, kind, give):
        self._native = native
        self._kind = kind
        self._give = give

    def _heads(self):
        return {head[0]: head for head in self._native.set_heads() if self._kind in (None, head[1])}

    def __getitem__(self, name):
        if name not in self._heads():
            hint = _qrx.nearest(str(name), list(self._heads()))
            raise KeyError(f"no set {name!r}" + (f"; {hint}" if hint else ""))
        return self._give(name)

    def __iter__(self):
        return iter(self._heads())

    def __len__(self):
        return len(self._heads())

    def __repr__(self):
        counts = ", ".join(f"{name!r}: {head[3]}" for name, head in self._heads().items())
        return f"{{{counts}}}"


class Mesh:
    """Nodes, elements and sets.

    ``points`` are N rows of three coordinates. ``cells`` are rows of places of points, from 0, by element type:
    ``{"C3D8": array}``, or a list of (type, array). Cells by the names of meshers ("tetra10", "hexahedron", ...) and
    whole meshes with ``points``, ``cells``, ``cell_sets`` and ``point_sets``, or unstructured grids with
    ``celltypes``, become elements and sets as meshers' files do.

    Sets are places, from 0, or masks: ``point_sets`` of points, ``cell_sets`` of cells, counted over all of them.
    ``surfaces`` are rows of (label of an element, name of its face).
    """

    def __init__(
        self, points, cells=None, *, point_labels=None, cell_labels=None, point_sets=None, cell_sets=None,
        surfaces=None, controls=None, **request,
    ):
        if cells is None:
            self._native = _of_object(points, request)._native
        else:
            blocks = _blocks_of(cells)
            if blocks and all(kind in _VTK for kind, _ in blocks):
                self._native = _of_cells(points, blocks, point_sets, cell_sets, request)
                point_sets = cell_sets = None
            else:
                if request:
                    raise TypeError(f"Mesh takes no {next(iter(request))!r} beside elements by type")
                self._native = _of_arrays(points, blocks, point_labels, cell_labels, controls)
        for name, members in (point_sets or {}).items():
            self.add_point_set(name, members)
        for name, members in (cell_sets or {}).items():
            self.add_cell_set(name, members)
        for name, members in (surfaces or {}).items():
            self.add_surface(name, members)

    @classmethod
    def _of(cls, native):
        mesh = cls.__new__(cls)
        mesh._native = native
        return mesh

    @classmethod
    def read(
        cls, path, *, scale=None, element_types=None, surface_elements=None, groups=None, group_arrays=None,
        part=None, controls=None,
    ):
        """Reads a mesher's file: MSH, UNV, MED, VTU, VTK or STL, or the mesh of a deck.

        scale : coordinates are multiplied by it
        element_types : element type by kind of cell, {"tetra10": "C3D10M"}; None: such cells make no elements
        surface_elements : "shell", "membrane", "plane stress", "plane strain" or "axisymmetric"
        groups : new names by group, None leaves a group out
        group_arrays : names of integer arrays of cells that become groups (VTK, VTU)
        part : the mesh to take of a file with several
        controls : element controls by element type
        """
        name = _records.file_path(path)
        with open(name, "rb"):
            pass
        request = _request(
            scale=scale, element_types=element_types, surface_elements=surface_elements, groups=groups,
            group_arrays=group_arrays, part=part, controls=controls,
        )
        return cls._of(_qrx.Mesh.of_file({"file": name, **request}))

    @classmethod
    def of(cls, value):
        """The mesh itself, or one made of an object with points and cells."""
        return value if isinstance(value, Mesh) else cls(value)

    @property
    def points(self):
        """N rows of three coordinates, in single precision; a view that can't be written."""
        return self._native.points

    @property
    def point_labels(self):
        return self._native.point_labels

    @property
    def num_points(self):
        return self._native.num_points

    @property
    def num_cells(self):
        return self._native.num_cells

    @property
    def cells(self):
        """The elements, a block for each type in the deck's order; their arrays are views that can't be written."""
        return [CellBlock(*block) for block in self._native.blocks]

    @property
    def cells_dict(self):
        """The rows of places by element type."""
        import numpy

        found = {}
        for block in self.cells:
            found.setdefault(block.type, []).append(block.data)
        return {kind: rows[0] if len(rows) == 1 else numpy.vstack(rows) for kind, rows in found.items()}

    @property
    def cell_labels(self):
        """The labels of all elements, block after block."""
        import numpy

        blocks = [block.labels for block in self.cells]
        return numpy.concatenate(blocks) if blocks else numpy.empty(0, dtype=numpy.int32)

    @property
    def point_sets(self):
        """Sets of nodes as places of points."""
        return _Sets(self._native, "node", self._native.places)

    @property
    def cell_sets(self):
        """Sets of elements as places among all cells."""
        return _Sets(self._native, "element", self._native.places)

    @property
    def surfaces(self):
        """Surfaces as arrays with the fields "label" and "face"."""
        return _Sets(self._native, "surface", self._surface)

    @property
    def sets(self):
        """All sets, by the labels of their members."""
        return _Sets(self._native, None, self._set)

    def _surface(self, name):
        import numpy

        labels, faces = self._native.facets(name)
        rows = numpy.empty(len(labels), dtype=[("label", numpy.int32), ("face", "U8")])
        rows["label"] = labels
        rows["face"] = faces
        return rows

    def _set(self, name):
        head = next(head for head in self._native.set_heads() if head[0] == name)
        if head[1] == "surface":
            labels, faces = self._native.facets(name)
            return MeshSet(head[1], head[2], labels, tuple(faces))
        return MeshSet(head[1], head[2], self._native.labels(name))

    def add_point_set(self, name, places, *, internal=False):
        """Adds a set of points by their places, or a mask of all points."""
        labels = _chosen(places, self.num_points, "point_sets", name, "points")
        self._native.add_set(name, "node", self.point_labels[labels], internal)

    def add_cell_set(self, name, places, *, internal=False):
        """Adds a set of cells by their places, a mask of all cells, or of each block the places in it."""
        places = _flat(places, [len(block.labels) for block in self.cells])
        chosen = _chosen(places, self.num_cells, "cell_sets", name, "cells")
        self._native.add_set(name, "element", self.cell_labels[chosen], internal)

    def add_surface(self, name, facets, *, internal=False):
        """Adds a surface: rows of (label of an element, face), or {face: labels}."""
        labels, faces = _facets(facets)
        self._native.add_set(name, "surface", (labels, faces), internal)

    def add_set(self, name, kind, labels, *, internal=False):
        """Adds a set by the labels of its members; kind is "node" or "element"."""
        if kind == "surface":
            self.add_surface(name, labels, internal=internal)
        else:
            self._native.add_set(name, kind, labels, internal)

    @property
    def notes(self):
        """What was merged, renamed, numbered anew or left out when the mesh was taken from a file or a grid."""
        return tuple(self._native.notes)

    def quality(self):
        """Elements of no or negative size, far mid-side nodes, what stands twice and what nobody uses."""
        told = self._native.quality()
        findings = tuple(Finding(*finding) for finding in told.pop("findings"))
        counts = {name: Count(count["count"], tuple(count["first"])) for name, count in told.items()}
        return MeshQuality(**counts, findings=findings)

    def __eq__(self, other):
        if not isinstance(other, Mesh):
            return NotImplemented
        if self._native.same_as == other._native.same_as:
            return True
        return _arrays_of(self) == _arrays_of(other)

    __hash__ = None

    def __repr__(self):
        kinds = ", ".join(f"{len(block.labels)} {block.type}" for block in self.cells)
        sets = len(self._native.set_heads())
        return f"<qrx.Mesh: {self.num_points} points, {kinds or 'no cells'}, {sets} sets>"


def _arrays_of(mesh):
    blocks = [
        (block.type, block.data.shape, block.data.tobytes(), block.labels.tobytes(), block.controls)
        for block in mesh.cells
    ]
    sets = [
        (name, each.kind, each.internal, each.labels.tobytes(), each.faces)
        for name, each in ((name, mesh.sets[name]) for name in mesh.sets)
    ]
    return mesh.points.tobytes(), mesh.point_labels.tobytes(), blocks, sets


def _request(*, scale=None, element_types=None, surface_elements=None, groups=None, group_arrays=None, part=None,
             controls=None):
    given = {
        "scale": scale, "elementTypes": element_types, "surfaceElements": surface_elements, "groups": groups,
        "groupArrays": group_arrays, "part": part, "controls": _controls(controls),
    }
    return {name: value for name, value in given.items() if value is not None}


def _controls(controls):
    if not controls:
        return None
    plain = {}
    for kind, value in controls.items():
        document = dict(value._document() if isinstance(value, _records.Record) else value)
        document.pop("class", None)
        plain[kind] = document
    return plain


def _blocks_of(cells):
    if isinstance(cells, dict):
        return list(cells.items())
    blocks = []
    for block in cells:
        if hasattr(block, "type") and hasattr(block, "data"):
            blocks.append((block.type, block.data))
        else:
            kind, data = block
            blocks.append((kind, data))
    return blocks


def _points(points):
    import numpy

    array = numpy.asarray(points)
    if array.dtype.kind not in "fiu":
        raise wrong("/points", f"found an array of {array.dtype}", "N rows of three coordinates")
    if array.ndim == 2 and array.shape[1] == 2:
        array = numpy.column_stack([array, numpy.zeros(len(array), dtype=array.dtype)])
    return array


def _of_arrays(points, blocks, point_labels, cell_labels, controls):
    if isinstance(cell_labels, dict):
        by_block = [cell_labels.get(kind) for kind, _ in blocks]
    elif cell_labels is None:
        by_block = [None] * len(blocks)
    else:
        by_block = list(cell_labels)
        if len(by_block) != len(blocks):
            raise wrong("/cell_labels", f"found {len(by_block)} arrays", f"one for each of {len(blocks)} blocks")
    kinds = [kind for kind, _ in blocks]
    for kind in controls or {}:
        if kind not in kinds:
            raise wrong("/controls", f"found {kind!r}", "a type of the elements", _qrx.nearest(str(kind), kinds))
    made = [
        (kind, data, labels, (controls or {}).get(kind)) for (kind, data), labels in zip(blocks, by_block)
    ]
    import numpy

    # What is beyond single precision is refused with its place.
    with numpy.errstate(over="ignore"):
        return _qrx.Mesh.of_arrays(_points(points), point_labels, made)


def _of_cells(points, blocks, point_sets, cell_sets, request):
    import numpy

    types = []
    rows = []
    ends = []
    end = 0
    counts = []
    for number, (kind, data) in enumerate(blocks):
        data = numpy.asarray(data)
        code = _VTK[kind]
        if data.ndim != 2 or data.shape[1] != _NODES[code] or data.dtype.kind not in "iu":
            raise wrong(f"/cells/{number}", f"found an array of shape {data.shape} of {data.dtype}",
                        f"rows of {_NODES[code]} integers for cells of kind {kind}")
        types.append(numpy.full(len(data), code, dtype=numpy.uint8))
        rows.append(data.astype(numpy.int64, copy=False).ravel())
        ends.append(numpy.arange(1, len(data) + 1, dtype=numpy.int64) * data.shape[1] + end)
        end += data.size
        counts.append(len(data))
    points = _points(points)
    groups = []
    for name, places in (cell_sets or {}).items():
        if name.startswith("gmsh:"):
            continue
        groups.append((name, False, _chosen(_flat(places, counts), sum(counts), "cell_sets", name, "cells")))
    for name, places in (point_sets or {}).items():
        groups.append((name, True, _chosen(places, len(points), "point_sets", name, "points")))
    return _grid(points, types, rows, ends, groups, [], request)


def _grid(points, types, rows, ends, groups, arrays, request):
    import numpy

    def joined(parts, kind):
        return numpy.concatenate(parts) if parts else numpy.empty(0, dtype=kind)

    return _qrx.Mesh.of_grid(
        points, joined(types, numpy.uint8), joined(rows, numpy.int64), joined(ends, numpy.int64), groups, arrays,
        {"file": "arrays", **_request(**request)},
    )


def _of_object(value, request):
    if hasattr(value, "celltypes"):
        return Mesh._of(_of_unstructured(value, request))
    if hasattr(value, "points") and hasattr(value, "cells"):
        blocks = _blocks_of(value.cells)
        for kind, _ in blocks:
            if kind not in _VTK:
                raise wrong("/cells", f"found cells of kind {kind!r}", "one of " + ", ".join(_VTK),
                            _qrx.nearest(str(kind), list(_VTK)))
        native = _of_cells(
            value.points, blocks, getattr(value, "point_sets", None), getattr(value, "cell_sets", None), request
        )
        return Mesh._of(native)
    raise TypeError(f"a mesh, or an object with points and cells, is wanted, not {type(value).__name__}")


def _of_unstructured(value, request):
    import numpy

    flat = numpy.asarray(value.cells, dtype=numpy.int64).ravel()
    types = numpy.asarray(value.celltypes, dtype=numpy.uint8)
    # Each cell's nodes stand behind their number.
    counts = numpy.empty(len(types), dtype=numpy.int64)
    at = 0
    for number in range(len(types)):
        if at >= len(flat):
            raise wrong("/cells", f"found the nodes of {number} cells", f"those of {len(types)}")
        counts[number] = flat[at]
        at += int(flat[at]) + 1
    heads = numpy.concatenate([[0], numpy.cumsum(counts + 1)[:-1]]) if len(types) else []
    rows = numpy.delete(flat[:at], numpy.asarray(heads, dtype=numpy.int64))
    wanted = request.get("group_arrays") or []
    data = getattr(value, "cell_data", {})
    arrays = []
    for name in wanted:
        if name not in data.keys():
            raise wrong("/group_arrays", f"found {name!r}", "the name of an array of cells",
                        _qrx.nearest(str(name), list(data.keys())))
        arrays.append((name, numpy.asarray(data[name])))
    return _grid(_points(value.points), [types], [rows], [numpy.cumsum(counts)], [], arrays, request)


def _flat(places, counts):
    """Places among all cells of places in each block, as meshers' programs have them."""
    import numpy

    if isinstance(places, dict) or not isinstance(places, (list, tuple)) or not places:
        return places
    if not all(part is None or hasattr(part, "__len__") for part in places):
        return places
    if len(places) != len(counts):
        raise wrong("/cell_sets", f"found {len(places)} arrays", f"one for each of {len(counts)} blocks of cells")
    starts = numpy.concatenate([[0], numpy.cumsum(counts)[:-1]]).astype(numpy.int64)
    parts = []
    for part, start, count in zip(places, starts, counts):
        if part is None or len(part) == 0:
            continue
        parts.append(_chosen(part, count, "cell_sets", "", "cells") + start)
    return numpy.concatenate(parts) if parts else numpy.empty(0, dtype=numpy.int64)


def _chosen(places, count, where, name, things):
    """Places as integers, of a mask too."""
    import numpy

    place = f"/{where}/{name}"
    array = numpy.asarray(places)
    if array.size == 0:
        return numpy.empty(0, dtype=numpy.int64)
    if array.ndim != 1 or array.dtype.kind not in "iub":
        raise wrong(place, f"found an array of shape {array.shape} of {array.dtype}", "integers, or a mask")
    if array.dtype.kind == "b":
        if len(array) != count:
            raise wrong(place, f"found a mask of {len(array)}", f"one of {count} {things}")
        return numpy.flatnonzero(array)
    array = array.astype(numpy.int64, copy=False)
    outside = (array < 0) | (array >= count)
    if outside.any():
        raise wrong(place, f"found {int(array[outside][0])}", f"places of {things}, 0 to {count - 1}")
    return array


def _facets(facets):
    import numpy

    if isinstance(facets, dict):
        labels = []
        faces = []
        for face, members in facets.items():
            members = numpy.asarray(members).tolist()
            labels += members
            faces += [str(face)] * len(members)
        return numpy.asarray(labels, dtype=numpy.int64), faces
    array = facets if isinstance(facets, numpy.ndarray) else None
    if array is not None and array.dtype.names:
        if not {"label", "face"} <= set(array.dtype.names):
            raise wrong("/surfaces", f"found an array with the fields {array.dtype.names}", "'label' and 'face'")
        return array["label"], [str(face) for face in array["face"].tolist()]
    rows = facets.tolist() if array is not None else list(facets)
    if any(not hasattr(row, "__len__") or isinstance(row, str) or len(row) != 2 for row in rows):
        raise wrong("/surfaces", "found something else", "rows of (label of an element, face)")
    labels = numpy.asarray([int(row[0]) for row in rows], dtype=numpy.int64)
    return labels, [str(row[1]) for row in rows]


__all__ = ["CellBlock", "Mesh", "MeshQuality", "ModelError"]
