"""What help() tells of records, made when somebody asks for it."""

from . import _names
from ._values import HELD, shown_value


class Doc:
    """Made when somebody asks for it."""

    def __get__(self, record, owner=None):
        return class_doc(owner)


class SignatureOf:
    """Made when somebody asks for it."""

    def __get__(self, record, owner=None):
        from inspect import Parameter, Signature

        parameters = [
            Parameter(name, Parameter.POSITIONAL_OR_KEYWORD, default=_default_of(owner, name))
            for name in owner._positional
        ]
        parameters += [
            Parameter(name, Parameter.KEYWORD_ONLY, default=_default_of(owner, name))
            for name in owner._fields
            if name not in owner._positional
        ]
        return Signature(parameters)


def _default_of(owner, name):
    from inspect import Parameter

    return owner._fields[name].default() if name in owner._fields else Parameter.empty


def type_text(told):
    """A type in words."""
    kind = told["kind"]
    if kind == "Attribute":
        return type_text(told["value"])
    if kind == "List":
        return f"list of {type_text(told['item'])}"
    if kind == "Map":
        return f"dict of {type_text(told['item'])} by name"
    if kind == "Enum":
        return _names.enum_name(told["enum"])
    if kind in HELD:
        return _names.class_name(told["class"]) + ("" if kind == "Record" else " or None")
    return {
        "Bool": "bool", "Int": "int", "Double": "float", "Float": "float", "String": "str", "Triple": "three floats",
        "Segment": "two points", "Complex": "complex", "Table": "rows of floats", "Region": "region, 'INSTANCE.SET'",
        "Datum": "name of a datum or None",
    }[kind]


def doc_of(field):
    text = f"{field.name} : {type_text(field.told)}"
    if not field.native.required and field.kind != "Attribute":
        text += f", default {shown_value(field.default())}"
    text += f"\n    {field.native.doc}"
    words = list(field.native.words) + [f"{word[1]} ({word[0]})" for word in field.native.meanings]
    if words:
        text += "\n    One of: " + ", ".join(words)
    if field.native.refers_to:
        text += f"\n    Names: {field.native.refers_to}"
    if field.native.not_in_deck:
        text += f"\n    Never in a deck: {field.native.not_in_deck}"
    return text


def class_doc(cls):
    text = cls._doc[:1].upper() + cls._doc[1:]
    if not text.endswith("."):
        text += "."
    if cls._fields:
        text += "\n\n" + "\n".join(doc_of(field) for field in cls._fields.values())
    if getattr(cls, "_state_full_name", None):
        state = cls._state_class()
        text += "\n\nIn each step, by at(step, ...):\n\n"
        text += "\n".join(doc_of(field) for field in state._fields.values())
    return text
