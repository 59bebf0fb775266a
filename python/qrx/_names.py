"""What Python calls the store's classes, fields and enumerations."""

import keyword
import re

# Short names that two classes would share.
_CLASSES = {
    "kinC_Damping": "ContactDamping",
    "kinC_HeatGeneration": "ContactHeatGeneration",
    "kbeC_TangentialBehavior": "ConnectorTangentialBehavior",
    "odiK_Coupling": "OtherCoupling",
}
_ENUMS = {"kmaC_Foam::HardeningEnm": "FoamHardeningRule"}
# Classes that answer with the name of another one.
ALIASES = {"odiK_Tie": "kcoC_Tie"}
# The tree of a model, which has classes of its own in Python.
FRAMES = {"odiK_ModelData", "odiK_Part", "odiK_Instance", "odiK_Assembly"}


def class_name(full):
    """'StaticStep' of 'kprC_StaticStep'."""
    return _CLASSES.get(full) or full.split("_", 1)[-1]


def field_name(name, refers_to=None):
    """'time_period' of 'timePeriod'; what names another object loses its ending, 'material' of 'materialName'."""
    if refers_to and name.endswith("Name") and len(name) > 4:
        name = name[:-4]
    name = re.sub(r"([^_])([A-Z][a-z]+)", r"\1_\2", name)
    name = re.sub(r"([a-z0-9])([A-Z])", r"\1_\2", name).lower()
    return name + "_" if keyword.iskeyword(name) else name


def field_names(fields):
    """The names of a class's fields, in their order; where a shortened one would repeat, the long one stays."""
    long = [field_name(field.name) for field in fields]
    names = []
    for field, whole in zip(fields, long):
        short = field_name(field.name, field.refers_to)
        names.append(whole if short != whole and short in long else short)
    return names


def enum_name(type_name):
    """'StepNlgeom' of 'kprC_Step::NlgeomEnm'."""
    if type_name in _ENUMS:
        return _ENUMS[type_name]
    words = type_name.split("::")
    last = re.sub(r"(Enm|Enum)$", "", words[-1])
    if len(words) > 1:
        return class_name(words[0]) + last[:1].upper() + last[1:]
    return re.sub(r"(Enm|Enum)$", "", class_name(words[0]))


def member_name(word):
    """A word of an enumeration as an identifier."""
    name = re.sub(r"\W+", "_", word).strip("_").upper()
    if not name or name[0].isdigit() or keyword.iskeyword(name) or name == "MRO":
        name = "_" + name if name[:1].isdigit() else name + "_"
    return "N" + name if name.startswith("_") else name


def repository_name(member):
    """'boundary_conditions' of 'boundaryConditions'."""
    return field_name(member)
