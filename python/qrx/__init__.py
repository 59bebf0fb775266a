"""Finite-element models as keyword decks: made, checked and written from Python.

    import qrx
    m = qrx.Model(heading="A plate with a hole, N and mm")
    plate = m.add_part("PLATE", qrx.Mesh.read("plate.msh"))
    m.materials["Steel"] = qrx.Material(elastic=[[210e3, 0.3]])
    ...
    m.write("plate.inp")

Every class of the store is here under its short name (StaticStep, Elastic, Pressure, ...), and every enumeration.
"""

from . import _qrx

__version__ = _qrx.__version__

# What is written by hand; all else is made of the store's tables when it is first asked for.
_PLACES = {
    "Model": "_model",
    "Part": "_assembly",
    "Instance": "_assembly",
    "Assembly": "_assembly",
    "AssemblyMesh": "_assembly",
    "AssemblySet": "_assembly",
    "Parameter": "_containers",
    "load": "_model",
    "load_all": "_model",
    "save": "_model",
    "Mesh": "_mesh",
    "CellBlock": "_mesh",
    "MeshQuality": "_mesh",
    "Finding": "_errors",
    "ModelError": "_errors",
    "DeckError": "_errors",
    "Record": "_records",
    "Polar": "_values",
    "study": "_study",
    "StudyResult": "_study",
    "Region": "_values",
}


def __getattr__(name):
    import importlib

    if name in _PLACES:
        value = getattr(importlib.import_module("." + _PLACES[name], __name__), name)
    elif name.startswith("_"):
        raise AttributeError(name)
    else:
        from . import _records

        value = _records.public(name)
        if value is None:
            hint = _qrx.nearest(name, __dir__())
            raise AttributeError(f"qrx has no {name!r}" + (f"; {hint}" if hint else ""))
    globals()[name] = value
    return value


def __dir__():
    from . import _records

    return sorted({*_PLACES, *_records.public_names(), "schema", "__version__"})


def schema():
    """The JSON Schema of model files, as a text."""
    return _qrx.schema()


def _hooks():
    def lazily(module, name):
        def call(*arguments):
            import importlib

            return getattr(importlib.import_module(module, __name__), name)(*arguments)

        return call

    _qrx.set_hooks(
        record=lazily("._records", "record_of"),
        member=lazily("._values", "member_of"),
        polar=lazily("._values", "Polar"),
        region=lazily("._values", "Region"),
        model_error=lazily("._records", "model_error"),
        deck_error=lazily("._errors", "DeckError"),
    )


_hooks()
