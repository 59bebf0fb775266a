"""Values that fields hold: words of enumerations, complex numbers, regions."""

import enum
import functools

from . import _names, _qrx
from ._errors import wrong

HELD = {"Record", "Optional", "Variant"}


class Word(str, enum.Enum):
    """A word of the store. Members equal their words, and are found by them in any capitals, by number too."""

    @classmethod
    def _missing_(cls, value):
        return _word_table(cls.__name__).get(value.lower() if isinstance(value, str) else value)

    @property
    def number(self):
        """The number by which model files may call it."""
        return _word_numbers(type(self).__name__)[self.value]

    def __repr__(self):
        return f"qrx.{type(self).__name__}.{self.name}"

    def __str__(self):
        return self.value

    __format__ = str.__format__


@functools.cache
def enum_names():
    """The full name of each enumeration by Python's."""
    return {_names.enum_name(name): name for name in _qrx.enum_names()}


@functools.cache
def enum_class(full):
    """The class of an enumeration by its full name."""
    rows = _qrx.enum_rows(full)
    name = _names.enum_name(full)
    return Word(name, [(_names.member_name(row[0]), row[0]) for row in rows], module="qrx", qualname=name)


@functools.cache
def _word_numbers(name):
    return {row[0]: row[1] for row in _qrx.enum_rows(enum_names()[name])}


@functools.cache
def _word_table(name):
    members = enum_class(enum_names()[name])
    table = {}
    for word, number, text, deck in _qrx.enum_rows(enum_names()[name]):
        for key in (word.lower(), number, text.lower(), (deck or word).lower()):
            table.setdefault(key, members._value2member_map_[word])
    return table


def member_of(full, word):
    return enum_class(full)._value2member_map_[word]


class Polar:
    """A complex number by magnitude and phase, in degrees."""

    __slots__ = ("magnitude", "phase")

    def __init__(self, magnitude, phase):
        self.magnitude = float(magnitude)
        self.phase = float(phase)

    def _document(self):
        return {"form": "POLAR", "real": self.magnitude, "imag": self.phase}

    def __eq__(self, other):
        if not isinstance(other, Polar):
            return NotImplemented
        return (self.magnitude, self.phase) == (other.magnitude, other.phase)

    def __hash__(self):
        return hash((self.magnitude, self.phase))

    def __repr__(self):
        return f"qrx.Polar({self.magnitude!r}, {self.phase!r})"


def region(value, place="/region"):
    """A set of the assembly ("SET") or of an instance ("INSTANCE.SET"); as (instance, set) where a name has a dot."""
    if value is None or isinstance(value, str):
        return value
    if isinstance(value, dict) and "set" in value:
        value = (value.get("instance"), value["set"])
    if isinstance(value, (tuple, list)) and len(value) == 2:
        instance, name = (getattr(part, "name", part) for part in value)
        if isinstance(name, str) and (instance is None or isinstance(instance, str)):
            if "." in name or (instance and "." in instance):
                return Region(instance or None, name)
            return f"{instance}.{name}" if instance else name
    raise wrong(place, f"found {value!r}", "'SET', 'INSTANCE.SET', (instance, set) or None")


class Region(tuple):
    """A set of an instance, or of the assembly, where a name has a dot."""

    __slots__ = ()

    def __new__(cls, instance, name):
        return super().__new__(cls, (instance, name))

    def _document(self):
        return {"instance": self[0], "set": self[1]} if self[0] else {"set": self[1]}

    def __getnewargs__(self):
        return tuple(self)


def shown_value(value):
    """A value as it can be pasted back."""
    if isinstance(value, Word):
        return repr(value.value)
    if isinstance(value, list):
        return "[" + ", ".join(map(shown_value, value)) + "]"
    if isinstance(value, dict):
        return "{" + ", ".join(f"{name!r}: {shown_value(item)}" for name, item in value.items()) + "}"
    return repr(value)
