"""The classes that are made of the store's tables."""

import copy
import pickle

import pytest

import qrx
from qrx import _names, _qrx, _records, _values

ALL = [name for name, full in _records.classes().items() if not _qrx.class_of(full).abstract]


def sample(told, field, depth=0):
    """A value of a type that is no default of it."""
    kind = told["kind"]
    if kind == "Attribute":
        return sample(told["value"], field, depth)
    if kind == "Bool":
        return not field.default()
    if kind == "Int":
        return field.native.meanings[-1][0] if field.native.meanings else 7
    if kind in ("Double", "Float"):
        return 0.1
    if kind == "String":
        if field.native.words:
            return field.native.words[-1]
        return "*Line\n" if field.native.verbatim else "Some name"
    if kind == "Enum":
        return list(_values.enum_class(told["enum"]))[-1]
    if kind == "Triple":
        return (0.25, -0.0, 1e-30)
    if kind == "Segment":
        return ((0.0, 1.0, 2.0), (3.0, 4.0, 5.5))
    if kind == "Complex":
        return complex(1.5, -2.5)
    if kind == "Table":
        return [[1.0, 0.1], [1e300, -0.0]]
    if kind == "Region":
        return "Part-1.SET"
    if kind == "Datum":
        return "Csys"
    if kind == "List":
        return [sample(told["item"], field, depth)] * max(field.native.length, 1)
    if kind == "Map":
        return {"Key": sample(told["item"], field, depth)}
    cls = _records.class_named(told["class"])
    if _qrx.class_of(cls._full_name).abstract:
        cls = next(qrx_class for qrx_class in map(_records.class_of, ALL) if issubclass(qrx_class, cls))
    return filled(cls, depth + 1)


def filled(cls, depth=0):
    """A record of values that are no defaults; records in records three deep."""
    record = cls("Step") if issubclass(cls, _records.Step) else cls()
    for name, field in cls._fields.items():
        if depth > 2 and field.kind in ("Record", "Optional", "Variant", "List", "Map"):
            continue
        setattr(record, name, sample(field.told, field, depth))
    return record


def test_ShortNames_AreUnique():
    names = [_names.class_name(full) for full in _qrx.class_names() if full not in _names.ALIASES]
    names += [_names.enum_name(full) for full in _qrx.enum_names()]
    names += [name for name in qrx._PLACES if name not in ("Part", "Instance", "Assembly", "Record")]
    assert len(names) == len(set(names))


def test_EveryClass_IsFound():
    assert len(ALL) > 300
    for name in qrx.__dir__():
        assert getattr(qrx, name) is not None


@pytest.mark.parametrize("name", ALL)
def test_FieldsOfAClass_HaveNamesOfTheirOwn(name):
    cls = getattr(qrx, name)
    assert len(cls._fields) == len(cls._by_file_name)
    members = {"at", "end_at", "copy", "states", "given", "deactivated", "status"}
    assert not members & set(cls._fields)
    assert all(each.isidentifier() for each in cls._fields)


@pytest.mark.parametrize("name", ALL)
def test_RecordWithAllFields_ComesBackFromItsRepr(name):
    record = filled(getattr(qrx, name))
    assert list(record._values) == list(record._fields)
    twin = eval(repr(record))
    assert twin == record
    assert type(twin) is type(record)
    for field in record._fields:
        assert getattr(twin, field) == getattr(record, field)


@pytest.mark.parametrize("name", ALL)
def test_RecordWithAllFields_IsCopiedAndPickled(name):
    record = filled(getattr(qrx, name))
    for twin in (record.copy(), copy.copy(record), copy.deepcopy(record), pickle.loads(pickle.dumps(record))):
        assert twin == record
        assert twin is not record


@pytest.mark.parametrize("name", ALL)
def test_DocstringOfAClass_HasAllFields(name):
    cls = getattr(qrx, name)
    for field in cls._fields.values():
        assert f"{field.name} : " in cls.__doc__
        assert field.native.doc in cls.__doc__


@pytest.mark.parametrize("name", ALL)
def test_DefaultsOfAClass_AreWhatANewRecordHas(name):
    cls = getattr(qrx, name)
    record = cls("Step") if issubclass(cls, _records.Step) else cls()
    empty = cls("Step") if issubclass(cls, _records.Step) else cls()
    for field in cls._fields:
        getattr(record, field)
    assert record == empty
    # What was only looked at is not shown.
    assert repr(record) == repr(empty)


def test_FieldNames_AreThoseOfTheModelFileInPythonsWay():
    assert _names.field_name("timePeriod") == "time_period"
    assert _names.field_name("maxLPF") == "max_lpf"
    assert _names.field_name("u1") == "u1"
    assert _names.field_name("materialName", "material") == "material"
    assert _names.field_name("typeName") == "type_name"


def test_NameOfTheModelFile_IsTakenToo():
    step = qrx.StaticStep("Load", timePeriod=2)
    assert step.time_period == 2.0
    assert step.timePeriod == 2.0
    step.timePeriod = 3
    assert step == qrx.StaticStep("Load", time_period=3.0)


def test_MisspeltArgument_NamesTheNearest():
    with pytest.raises(TypeError, match=r"StaticStep has no 'nlgeon'; did you mean 'nlgeom'\?"):
        qrx.StaticStep("Load", nlgeon=True)
    with pytest.raises(AttributeError, match=r"did you mean 'density'\?"):
        qrx.Material().denisty = 1
    with pytest.raises(AttributeError, match=r"did you mean 'elastic'\?"):
        qrx.Material().elastc
    with pytest.raises(AttributeError, match=r"did you mean 'StaticStep'\?"):
        qrx.StaticStp
    with pytest.raises(TypeError, match=r"did you mean 'magnitude'\?"):
        qrx.Pressure("A.B").at("Load", magnitud=1)


def test_WrongValue_TellsWhatAModelFileWouldTell():
    with pytest.raises(qrx.ModelError) as raised:
        qrx.Elastic(type="ISOTROPC")
    (finding,) = raised.value.findings
    assert finding.place == "/type"
    assert finding.found == "found 'ISOTROPC'"
    assert finding.expected.startswith("'ISOTROPIC (0)'") or "ISOTROPIC" in finding.expected
    assert finding.hint == "did you mean 'ISOTROPIC'?"
    assert isinstance(raised.value, ValueError)


@pytest.mark.parametrize(
    ("make", "found"),
    [
        (lambda: qrx.TrussSection(area="wide"), "found 'wide'"),
        (lambda: qrx.TrussSection(area=None), "found null"),
        (lambda: qrx.TrussSection(area=float("nan")), "found nan"),
        (lambda: qrx.TrussSection(area=float("-inf")), "found -inf"),
        (lambda: qrx.Elastic(table=[[1, 2], [3]]), "found an array of 1 item"),
        (lambda: qrx.Elastic(table=[["x"]]), "found 'x'"),
        (lambda: qrx.Elastic(dependencies=2**40), "found"),
        (lambda: qrx.Elastic(dependencies=10**400), "found an integer of many digits"),
        (lambda: qrx.Elastic(dependencies=1.5), "found 1.5"),
        (lambda: qrx.Material(elastic="stiff"), "found 'stiff'"),
        (lambda: qrx.TrussSection(material="a\x00b"), "found"),
        (lambda: qrx.StaticStep("Load", description="\ud800"), "found a text with half a surrogate pair"),
        (lambda: qrx.Datum("Csys", origin=(1, 2)), "found an array of 2 items"),
        (lambda: qrx.Pressure(5), "found 5"),
        (lambda: qrx.Pressure("A.B").at("Load", magnitude="much"), "found 'much'"),
        (lambda: qrx.Pressure("A.B").at("Load", status="ALIVE"), "found 'ALIVE'"),
        (lambda: qrx.StaticStep("Load", load_cases={"A": 5}), "found 5"),
        (lambda: qrx.StaticStep("Load", time_period=object()), "found object, which no model file can hold"),
    ],
)
def test_WrongValues_AreRefusedWithAFinding(make, found):
    with pytest.raises(qrx.ModelError) as raised:
        make()
    assert raised.value.findings[0].found.startswith(found)


def test_Words_AreMembersInAnyCapitals():
    assert qrx.Elastic(type="lamina").type is qrx.ElasticType.LAMINA
    assert qrx.Elastic(type=4).type is qrx.ElasticType.LAMINA
    assert qrx.Elastic(type=qrx.ElasticType.LAMINA).type == "LAMINA"
    assert qrx.ElasticType("lamina") is qrx.ElasticType.LAMINA
    assert qrx.ElasticType(4).number == 4
    assert repr(qrx.ElasticType.LAMINA) == "qrx.ElasticType.LAMINA"
    assert f"{qrx.ElasticType.LAMINA:>8}" == "  LAMINA"
    with pytest.raises(ValueError):
        qrx.ElasticType("laminate")


def test_Truth_StandsForOnAndOff():
    assert qrx.StaticStep("Load", nlgeom=True).nlgeom == "ON"
    assert qrx.StaticStep("Load", nlgeom=False).nlgeom == "OFF"


def test_Table_MayStandForItsRecord():
    by_hand = qrx.Material(elastic=qrx.Elastic(table=[[210e3, 0.3]]), density=qrx.Density(table=[[7.85e-9]]))
    assert qrx.Material(elastic=[[210e3, 0.3]], density=7.85e-9) == by_hand
    assert qrx.Material(elastic=(210e3, 0.3), density=[7.85e-9]) == by_hand
    assert qrx.Material(elastic={"table": [[210e3, 0.3]]}, density=7.85e-9) == by_hand
    numpy = pytest.importorskip("numpy")
    given = qrx.Material(elastic=numpy.array([[210e3, 0.3]]), density=numpy.float32(0.5))
    assert given == qrx.Material(elastic=[[210e3, 0.3]], density=0.5)


def test_NestedRecord_ChangesInItsPlace():
    material = qrx.Material(elastic=[[210e3, 0.3]])
    material.elastic.table[0][1] = 0.25
    material.elastic.type = "LAMINA"
    assert material == qrx.Material(elastic=qrx.Elastic(type="LAMINA", table=[[210e3, 0.25]]))


def test_ListThatWasEmpty_ChangesInItsPlace():
    request = qrx.FieldOutput()
    request.interactions.append("Faces")
    assert request == qrx.FieldOutput(interactions=["Faces"])


def test_DeletedField_HasItsDefaultAgain():
    step = qrx.StaticStep("Load", time_period=5)
    del step.time_period
    assert step == qrx.StaticStep("Load")


def test_KindOfRecords_IsNoRecord():
    with pytest.raises(TypeError, match="Load is a kind of records"):
        qrx.Load()
    assert issubclass(qrx.Pressure, qrx.Load)
    assert issubclass(qrx.StaticStep, qrx.Step)


def test_Step_NeedsAName():
    with pytest.raises(TypeError, match="needs the name of the step"):
        qrx.StaticStep(nlgeom=True)
    assert qrx.InitialStep().name == "Initial"


def test_States_AreGivenStepByStep():
    load = qrx.Pressure("A.TOP").at("Pull", magnitude=-50).at("Hold", amplitude=None).end_at("Rest")
    assert list(load.states) == ["Pull", "Hold", "Rest"]
    assert load.states["Pull"] == qrx.PressureState(magnitude=-50.0)
    assert load.states["Pull"].given == ("magnitude",)
    assert load.states["Hold"].amplitude is None
    assert load.states["Rest"].deactivated
    assert repr(load) == (
        "qrx.Pressure('A.TOP').at('Pull', magnitude=-50.0).at('Hold', amplitude=None).end_at('Rest')"
    )
    assert load.at("Pull", amplitude="Ramp").states["Pull"].given == ("magnitude", "amplitude")


def test_StateOfAStep_IsFoundByTheStepItself():
    step = qrx.StaticStep("Pull")
    assert qrx.Pressure("A.TOP").at(step, magnitude=1) == qrx.Pressure("A.TOP").at("Pull", magnitude=1)
    with pytest.raises(TypeError):
        qrx.Pressure("A.TOP").at(5, magnitude=1)


def test_States_MayBeGivenAtOnce():
    load = qrx.Pressure("A.TOP", states={"Pull": {"magnitude": 2}})
    assert load == qrx.Pressure("A.TOP").at("Pull", magnitude=2)


def test_Region_OfNamesWithDots_IsAPair():
    assert qrx.Pressure(("Bolt", "TOP")).region == "Bolt.TOP"
    assert qrx.Pressure((None, "TOP")).region == "TOP"
    dotted = qrx.Pressure(("Bolt.1", "TOP"))
    assert dotted.region == ("Bolt.1", "TOP")
    assert eval(repr(dotted)) == dotted
    assert qrx.Pressure({"instance": "Bolt", "set": "TOP"}).region == "Bolt.TOP"


def test_ComplexNumbers_HaveTwoForms():
    load = qrx.ConcentratedForce(complex_component1=qrx.Polar(2, 90), complex_component2=1 + 2j)
    assert load.complex_component1 == qrx.Polar(2.0, 90.0)
    assert load.complex_component2 == complex(1, 2)
    assert eval(repr(load)) == load


def test_SignedZero_IsKept():
    vector = qrx.BeamOrientation("ALL", (0.0, -0.0, 1.0)).vector
    assert str(vector[1]) == "-0.0"


def test_Signature_HasTheFields():
    import inspect

    parameters = inspect.signature(qrx.Elastic).parameters
    assert list(parameters)[0] == "type"
    assert parameters["long_term_moduli"].default is True
    assert "name" in inspect.signature(qrx.StaticStep).parameters
