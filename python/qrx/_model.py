"""Models: parts, the assembly, materials, steps and what lives across them."""

import functools
import json
import os
from collections.abc import Mapping

from . import _names, _qrx, _records
from ._assembly import Assembly, AssemblyMesh, AssemblySet, Instance, Part, plain
from ._containers import Datums, Named, Parameter, Parameters, Repository, Steps, filled, no_such, repositories
from ._docs import doc_of
from ._errors import Finding, ModelError, wrong
from ._told import Page, history_of, kinds_of, summary

DEFAULT_NAME = "Default Model"
FORMAT = "qrx-model/1"


class _Data:
    """A field of the model's own."""

    def __init__(self, field):
        self._field = field
        self.__doc__ = doc_of(field)

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
        for attribute in repositories():
            setattr(self, attribute, {})
        if heading is not None:
            if "top_level_solver_input" in fields:
                raise TypeError("heading and top_level_solver_input both say how the deck opens")
            self.heading = heading

    def __setattr__(self, name, value):
        if name in repositories():
            value = filled(Repository(*repositories()[name]), value)
        elif name in ("parts", "datums", "parameters"):
            value = filled({"parts": _parts, "datums": Datums, "parameters": Parameters}[name](), value)
        elif name == "steps" and not isinstance(value, Steps):
            taken = Steps()
            for step in value.values() if isinstance(value, Mapping) else value:
                taken.add(step)
            value = taken
        elif name == "assembly" and not isinstance(value, Assembly):
            raise wrong("/assembly", f"found {value!r}", "a qrx.Assembly")
        elif not hasattr(type(self), name) and name not in _MEMBERS:
            known = [*_model_data()._fields, *repositories(), *_MEMBERS, "heading"]
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
            entries.append((instance, plain(labels), faces))
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
        for attribute, row in repositories().items():
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
        text, tables = self._store().history()
        told = json.loads(text)
        kinds = {_names.repository_name(member): member for member in told if member in kinds_of(told)}
        if kind is None:
            return {name: history_of(told, tables, member) for name, member in kinds.items()}
        return history_of(told, tables, _member_of(kind, kinds))

    def deck_lines(self, kind, name, step, load_case=""):
        """The lines that an object becomes in a step of the deck, or in a load case of it."""
        member = _member_of(kind, {"steps": "steps", **{each: row[0] for each, row in repositories().items()}})
        if name not in getattr(self, _names.repository_name(member)):
            raise no_such(kind, name, getattr(self, _names.repository_name(member)))
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
        for attribute in repositories():
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
            for name in ("name", "_data", "datums", "parts", "assembly", "steps", "parameters", *repositories())
        )

    __hash__ = None

    def __repr__(self):
        counts = [f"{len(self.parts)} parts", f"{len(self.instances)} instances", f"{len(self.steps)} steps"]
        counts += [f"{len(getattr(self, name))} {name}" for name in repositories() if getattr(self, name)]
        return f"<qrx.Model {self.heading or self.name!r}: {', '.join(counts)}>"

    def _repr_html_(self):
        return summary(self)


def _parts():
    return Named("parts", Part)


_MEMBERS = ("name", "_data", "datums", "parts", "assembly", "steps", "parameters")


@functools.cache
def _model_data():
    return _records.class_named("odiK_ModelData")


for _name, _field in _model_data()._fields.items():
    setattr(Model, _name, _Data(_field))


def _member_of(kind, known):
    for name, member in known.items():
        if kind in (name, member):
            return member
    hint = _qrx.nearest(str(kind), list(known))
    raise wrong("/", f"found {kind!r}", "one of " + ", ".join(known), hint)


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
        raise no_such("models", name, models)
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
    for attribute, row in repositories().items():
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
