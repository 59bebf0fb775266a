"""The classes of records and enumerations, made of the store's own tables when they are first asked for."""

import functools
import os

from . import _names, _qrx
from ._docs import Doc, SignatureOf, doc_of
from ._errors import Finding, ModelError, wrong
from ._values import HELD, enum_class, enum_names, region, shown_value

_MUTABLE = {"List", "Map", "Table", "Record", "Optional", "Variant"}


def _is_special(told):
    """Whether values of the type name sets and datums, or are records: what only Python can hold."""
    if told["kind"] in HELD or told["kind"] in ("Region", "Datum"):
        return True
    inner = told.get("item") or told.get("value")
    return inner is not None and _is_special(inner)


class Field:
    """An attribute of a record: what it is called, what it means and what may stand in it."""

    def __init__(self, native, name):
        self.native = native
        self.name = name
        self.file_name = native.name
        self.told = native.type
        self.kind = self.told["kind"]
        self.place = "/" + native.name
        self.is_text = native.verbatim
        self._default = None
        self._has_default = False
        if self.kind == "Attribute":
            self.mutable = self.told["value"]["kind"] in _MUTABLE
        else:
            self.mutable = self.kind in _MUTABLE
        if _is_special(self.told):
            self.checked = functools.partial(self._special, self.told)
        elif native.refers_to and self.kind == "String":
            self.checked = self._reference
        else:
            self.checked = native.checked

    @property
    def __doc__(self):
        return doc_of(self)

    def default(self):
        if self.mutable:
            return self.native.default()
        if not self._has_default:
            self._default = self.native.default()
            self._has_default = True
        return self._default

    def _reference(self, value):
        if not isinstance(value, str):
            value = getattr(value, "name", value)
        return self.native.checked(value)

    def _special(self, told, value):
        kind = told["kind"]
        if kind == "Region":
            return region(value, self.place)
        if kind == "Datum":
            value = getattr(value, "name", value)
            if value is None or isinstance(value, str):
                return value
            raise wrong(self.place, f"found {value!r}", "the name of a datum, or None")
        if kind in HELD:
            return self._held(told, value)
        if kind == "Attribute":
            if value is None or (isinstance(value, dict) and "state" in value):
                return value
            return self._special(told["value"], value)
        if value is None and kind == "List" and told["item"]["kind"] == "Attribute":
            return None
        if kind == "List":
            if isinstance(value, (str, dict, Record)) or not hasattr(value, "__iter__"):
                raise wrong(self.place, f"found {value!r}", "a list")
            return [self._special(told["item"], item) for item in value]
        if not isinstance(value, dict):
            raise wrong(self.place, f"found {value!r}", "a dict by name")
        return {name: self._special(told["item"], item) for name, item in value.items()}

    def _held(self, told, value):
        wanted = class_named(told["class"])
        if isinstance(value, wanted):
            return value
        if value is None and told["kind"] != "Record":
            return None
        if isinstance(value, dict):
            given = dict(value)
            name = given.pop("class", None)
            return (wanted if name is None else class_of(name))(**given)
        table = wanted._fields.get("table")
        if table is not None and table.kind == "Table" and not isinstance(value, (str, Record)):
            return wanted(table=_rows(value))
        raise wrong(self.place, f"found {value!r}", f"a qrx.{wanted.__name__}")

    def __get__(self, record, owner=None):
        if record is None:
            return self
        try:
            return record._values[self.name]
        except KeyError:
            return record._missing(self)

    def __set__(self, record, value):
        record._values[self.name] = self.checked(value)

    def __delete__(self, record):
        record._values.pop(self.name, None)


def _rows(value):
    """A table of one number, of one row, or of rows."""
    if hasattr(value, "tolist"):
        value = value.tolist()
    if isinstance(value, (int, float)):
        return [[value]]
    if isinstance(value, (list, tuple)) and value and not isinstance(value[0], (list, tuple)):
        if not hasattr(value[0], "__len__"):
            return [list(value)]
    return value


def _unknown(cls, name, known):
    hint = _qrx.nearest(name, known)
    return f"{cls.__name__} has no {name!r}" + (f"; {hint}" if hint else "")


class Record:
    """A record of the store: plain values under the names of its fields."""

    __slots__ = ("_values", "__weakref__")
    _fields = {}
    _by_file_name = {}
    _positional = ()
    _full_name = "cls_Record"
    _tells_class = True

    def __init__(self, *args, **fields):
        self._values = {}
        if args:
            if len(args) > len(self._positional):
                most = ", ".join(self._positional) or "none"
                raise TypeError(f"{type(self).__name__} takes these without a name: {most}")
            for name, value in zip(self._positional, args):
                if name in fields:
                    raise TypeError(f"{type(self).__name__} got two values for {name!r}")
                setattr(self, name, value)
        for name, value in fields.items():
            field = self._fields.get(name)
            if field is None:
                self._set_other(name, value)
            else:
                self._values[name] = field.checked(value)

    def _set_other(self, name, value):
        field = self._by_file_name.get(name)
        if field is not None:
            self._values[field.name] = field.checked(value)
        elif name in self._extras():
            object.__setattr__(self, name, value)
        else:
            raise TypeError(_unknown(type(self), name, list(self._fields) + list(self._extras())))

    def _extras(self):
        return ()

    @classmethod
    def _taken(cls, values):
        """A record of values that are right, by the names of model files."""
        record = cls.__new__(cls)
        names = cls._by_file_name
        record._values = {names[name].name: value for name, value in values.items() if name in names}
        return record

    def _missing(self, field):
        value = field.default()
        if field.mutable and value is not None and not field.native.default_items:
            self._values[field.name] = value
        return value

    def __getattr__(self, name):
        field = type(self)._by_file_name.get(name)
        if field is not None:
            return field.__get__(self)
        if name.startswith("_"):
            raise AttributeError(name)
        raise AttributeError(_unknown(type(self), name, list(self._fields) + list(self._extras())))

    def __setattr__(self, name, value):
        if name in self._fields or name.startswith("_") or name in self._extras():
            object.__setattr__(self, name, value)
        elif name in self._by_file_name:
            object.__setattr__(self, self._by_file_name[name].name, value)
        else:
            raise AttributeError(_unknown(type(self), name, list(self._fields) + list(self._extras())))

    def _document(self):
        document = {"class": self._full_name} if self._tells_class else {}
        fields = self._fields
        for name, value in self._values.items():
            field = fields[name]
            # Deck text by its lines, as model files have it: what points to a line finds it.
            if field.is_text and isinstance(value, str) and value.endswith("\n"):
                value = value[:-1].split("\n")
            document[field.file_name] = value
        return document

    def _same(self, other):
        if self._values.keys() == other._values.keys():
            return self._values == other._values
        return all(
            self._values.get(name, _ABSENT) == other._values.get(name, _ABSENT)
            if name in self._values and name in other._values
            else _effective(self, field) == _effective(other, field)
            for name, field in self._fields.items()
        )

    def __eq__(self, other):
        if type(self) is not type(other):
            return NotImplemented
        return self._same(other)

    __hash__ = None

    def copy(self):
        """A copy of its own, records in it too."""
        return self.__deepcopy__({})

    def __copy__(self):
        twin = type(self).__new__(type(self))
        twin._values = dict(self._values)
        return twin

    def __deepcopy__(self, memo):
        twin = type(self).__new__(type(self))
        twin._values = {name: _deep(value, memo) for name, value in self._values.items()}
        return twin

    def __getstate__(self):
        return self._values

    def __setstate__(self, values):
        self._values = values

    def _shown(self):
        """What differs from the defaults, as arguments."""
        shown = []
        for name, field in self._fields.items():
            if name in self._values:
                value = self._values[name]
                if not field.native.required and value == field.default():
                    continue
                shown.append((name, value))
        return shown

    def __repr__(self):
        shown = dict(self._shown())
        parts = []
        for name in self._positional:
            if name not in shown:
                break
            parts.append(shown_value(shown.pop(name)))
        parts += [f"{name}={shown_value(value)}" for name, value in shown.items()]
        return f"qrx.{type(self).__name__}({', '.join(parts)})"

    def __dir__(self):
        return list(self._fields) + list(self._extras()) + ["copy"]


_ABSENT = object()


def _effective(record, field):
    return record._values[field.name] if field.name in record._values else field.default()


def _deep(value, memo):
    if isinstance(value, list):
        return [_deep(item, memo) for item in value]
    if isinstance(value, dict):
        return {name: _deep(item, memo) for name, item in value.items()}
    if isinstance(value, Record):
        return value.__deepcopy__(memo)
    return value


class Step(Record):
    """A step. ``name`` is by what everything else calls it."""

    __slots__ = ("name",)
    _positional = ("name",)

    def __init__(self, *args, **fields):
        object.__setattr__(self, "name", None)
        super().__init__(*args, **fields)
        if self.name is None:
            object.__setattr__(self, "name", "Initial" if self._full_name == "kprC_InitialStep" else None)
        if not isinstance(self.name, str):
            raise TypeError(f"{type(self).__name__} needs the name of the step")

    def _extras(self):
        return ("name",)

    def _document(self):
        return {"name": self.name, **super()._document()}

    def _same(self, other):
        return self.name == other.name and super()._same(other)

    def _shown(self):
        return [("name", self.name), *super()._shown()]

    def __copy__(self):
        twin = super().__copy__()
        object.__setattr__(twin, "name", self.name)
        return twin

    def __deepcopy__(self, memo):
        twin = super().__deepcopy__(memo)
        object.__setattr__(twin, "name", self.name)
        return twin

    def __getstate__(self):
        return (self.name, self._values)

    def __setstate__(self, state):
        object.__setattr__(self, "name", state[0])
        self._values = state[1]


class State(Record):
    """What was said of an object in one step: only what is given counts, all else is carried on.

    ``None`` clears a value in the step, ``deactivated`` ends the object.
    """

    __slots__ = ()
    _tells_class = False

    def _extras(self):
        return ("deactivated", "status")

    @property
    def deactivated(self):
        """Whether the object ends in this step."""
        return self._values.get("deactivated", False)

    @deactivated.setter
    def deactivated(self, value):
        if value:
            self._values["deactivated"] = True
        else:
            self._values.pop("deactivated", None)

    @property
    def status(self):
        """The status that takes the place of the one that follows from the rules; None: that one."""
        return self._values.get("status")

    @status.setter
    def status(self, value):
        if value is None:
            self._values.pop("status", None)
            return
        words = enum_class("mdl_PropagationStatusEnm")
        try:
            self._values["status"] = words(value)
        except ValueError:
            raise wrong("/status", f"found {value!r}", "one of " + ", ".join(words.__members__)) from None

    @property
    def given(self):
        """The names of what was given."""
        return tuple(self._values)

    @classmethod
    def _taken(cls, values):
        record = super()._taken(values)
        for name in ("deactivated", "status"):
            if name in values:
                record._values[name] = values[name]
        return record

    def _missing(self, field):
        return None if field.kind == "Attribute" else field.default()

    def _document(self):
        fields = self._fields
        return {fields[name].file_name if name in fields else name: value for name, value in self._values.items()}

    def _same(self, other):
        return self._values == other._values

    def _shown(self):
        return list(self._values.items())

    def __setattr__(self, name, value):
        if name in ("deactivated", "status"):
            object.__setattr__(self, name, value)
        else:
            super().__setattr__(name, value)


class Propagating(Record):
    """What lives across steps: ``at`` says what it is from a step on, ``end_at`` ends it."""

    __slots__ = ("states",)
    _state_full_name = ""

    def __init__(self, *args, **fields):
        object.__setattr__(self, "states", {})
        super().__init__(*args, **fields)

    def _extras(self):
        return ("states",)

    @classmethod
    def _taken(cls, values):
        record = super()._taken(values)
        object.__setattr__(record, "states", values.get("states", {}))
        return record

    def __setattr__(self, name, value):
        if name == "states":
            made = {}
            for step, state in dict(value).items():
                made[step_name(step)] = state if isinstance(state, State) else self._state_class()(**state)
            object.__setattr__(self, "states", made)
        else:
            super().__setattr__(name, value)

    def _set_other(self, name, value):
        if name == "states":
            self.states = value
        else:
            super()._set_other(name, value)

    @classmethod
    def _state_class(cls):
        return class_named(cls._state_full_name)

    def at(self, step, /, **fields):
        """Says what the object is from the step on: it begins, or changes, there. Gives the object itself."""
        name = step_name(step)
        state = self.states.get(name)
        if state is None:
            self.states[name] = self._state_class()(**fields)
        else:
            for field, value in fields.items():
                setattr(state, field, value)
        return self

    def end_at(self, step, /):
        """Ends the object in the step. Gives the object itself."""
        return self.at(step, deactivated=True)

    def _document(self):
        document = super()._document()
        if self.states:
            document["states"] = self.states
        return document

    def _same(self, other):
        return self.states == other.states and super()._same(other)

    def __copy__(self):
        twin = super().__copy__()
        object.__setattr__(twin, "states", dict(self.states))
        return twin

    def __deepcopy__(self, memo):
        twin = super().__deepcopy__(memo)
        object.__setattr__(twin, "states", {name: state.__deepcopy__(memo) for name, state in self.states.items()})
        return twin

    def __getstate__(self):
        return (self._values, self.states)

    def __setstate__(self, state):
        self._values = state[0]
        object.__setattr__(self, "states", state[1])

    def __repr__(self):
        text = super().__repr__()
        for step, state in self.states.items():
            if state._values == {"deactivated": True}:
                text += f".end_at({step!r})"
            else:
                given = "".join(f", {name}={shown_value(value)}" for name, value in state._values.items())
                text += f".at({step!r}{given})"
        return text


def step_name(step):
    name = getattr(step, "name", step) if not isinstance(step, str) else step
    if not isinstance(name, str):
        raise TypeError(f"a step, or the name of one, is wanted, not {step!r}")
    return name


def _bases(native):
    if native.base and native.base != "cls_Record":
        base = class_named(native.base)
    else:
        base = Record
    name = native.name
    if name == "kprC_PropagatingObject":
        return (Propagating,)
    if name == "kprC_Step":
        return (Step,)
    if name.endswith("State") and base is Record:
        return (State,)
    return (base,)


@functools.cache
def class_named(full):
    """The class of records by its name in the store."""
    if full in _names.ALIASES:
        return class_named(_names.ALIASES[full])
    native = _qrx.class_of(full)
    name = _names.class_name(full)
    natives = [field for field in native.fields if field.type["kind"] != "Tree" and field.model_data]
    fields = {each: Field(field, each) for each, field in zip(_names.field_names(natives), natives)}
    bases = _bases(native)
    members = {
        "__slots__": (),
        "__module__": "qrx",
        "__qualname__": name,
        "__doc__": Doc(),
        "__signature__": SignatureOf(),
        "_doc": native.doc,
        "_full_name": full,
        "_fields": fields,
        "_by_file_name": {field.file_name: field for field in fields.values()},
        "_positional": _positional(full, bases[0], fields),
        "_tells_class": bases[0]._tells_class and not full.startswith("odiK_D"),
        **fields,
    }
    if issubclass(bases[0], Propagating) and not native.abstract:
        members["_state_full_name"] = native.state_class
    if native.abstract:
        members["__init__"] = _no_abstract
    elif bases[0].__init__ is _no_abstract:
        members["__init__"] = next(
            base.__init__ for base in (Propagating, Step, State, Record) if issubclass(bases[0], base)
        )
    return type(name, bases, members)


def _positional(full, base, fields):
    if issubclass(base, Step):
        return ("name",)
    if full == "odiK_Datum":
        return ("name",)
    if full.startswith("ptoC_"):
        return tuple(fields)[:2]
    return ("region",) if "region" in fields else ()


def _no_abstract(self, *args, **fields):
    raise TypeError(f"{type(self).__name__} is a kind of records, not one of them")


@functools.cache
def classes():
    """The full name of each class of records by Python's."""
    return {
        _names.class_name(full): full
        for full in _qrx.class_names()
        if full not in _names.FRAMES and full not in _names.ALIASES
    }


def class_of(name):
    """The class by Python's name, or by the store's."""
    known = classes()
    if name in known:
        return class_named(known[name])
    if name in known.values() or name in _names.ALIASES:
        return class_named(name)
    hint = _qrx.nearest(name, list(known))
    raise wrong("/class", f"found {name!r}", "the name of a class", hint)


def public(name):
    """A class of records or an enumeration, or None."""
    if name in classes():
        return class_named(classes()[name])
    full = enum_names().get(name)
    return None if full is None else enum_class(full)


def public_names():
    return [*classes(), *enum_names()]


def record_of(full, values):
    return class_named(full)._taken(values)


def file_path(path):
    return os.fspath(path)


def model_error(findings):
    return ModelError([Finding(*finding) for finding in findings])
