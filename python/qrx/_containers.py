"""What a model holds by name: objects, steps, parts, datums, parameters."""

import functools
from collections.abc import Mapping, MutableMapping
from typing import NamedTuple

from . import _names, _qrx, _records
from ._errors import wrong


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
            raise no_such(self._plural, name, self._items) from None

    def __setitem__(self, name, record):
        self._items[name] = self._checked(name, record)

    def __delitem__(self, name):
        if name not in self._items:
            raise no_such(self._plural, name, self._items)
        del self._items[name]

    def __iter__(self):
        return iter(self._items)

    def __len__(self):
        return len(self._items)

    def __repr__(self):
        return repr(self._items)

    def _document(self):
        return self._items


def no_such(plural, name, known):
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
        raise no_such("steps", name, [step.name for step in self._list])

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


class Named(MutableMapping):
    """Parts or instances by name."""

    def __init__(self, plural, kind):
        self._plural = plural
        self._kind = kind
        self._items = {}

    def __getitem__(self, name):
        try:
            return self._items[name]
        except KeyError:
            raise no_such(self._plural, name, self._items) from None

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
        return isinstance(other, Named) and self._items == other._items

    __hash__ = None

    def __repr__(self):
        return repr(self._items)

    def _document(self):
        return self._items


class Datums(Named):
    def __init__(self):
        super().__init__("datums", _records.class_named("odiK_Datum"))

    def __setitem__(self, name, value):
        if not isinstance(value, self._kind):
            raise wrong(f"/datums/{name}", f"found {value!r}", "a qrx.Datum")
        value.name = name
        self._items[name] = value

    def __eq__(self, other):
        return isinstance(other, Datums) and list(self._items.items()) == list(other._items.items())

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


class Parameters(dict):
    """Parameters by name."""

    def __setitem__(self, name, value):
        super().__setitem__(name, Parameter.of(value))

    def __missing__(self, name):
        raise no_such("parameters", name, self)


def filled(container, value):
    for name, each in dict(value).items():
        container[name] = each
    return container


@functools.cache
def repositories():
    """The rows of the repositories but the steps, by Python's names."""
    return {
        _names.repository_name(member): (member, class_name, plural)
        for member, class_name, plural, _ in _qrx.repositories()
        if member != "steps"
    }
