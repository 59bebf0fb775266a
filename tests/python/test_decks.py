"""Every model of the deck tests and examples, through Python."""

import io

import pytest

import qrx
import rod
from conftest import model_files, run
from qrx import _qrx, _records


def name_of(path):
    return path.stem


@pytest.mark.parametrize("path", model_files(), ids=name_of)
def test_ModelFile_ThroughPython_IsTheSameModelAndDeck(path, program, tmp_path):
    models = qrx.load_all(path)
    text = io.BytesIO()
    qrx.save(models.values(), text)
    if '"file"' not in path.read_text(encoding="utf-8"):
        assert text.getvalue().decode() == run(program, "format", path).stdout
    model = models["Default Model"]
    deck = path.with_suffix(".inp")
    if not deck.exists():
        run(program, "write", path, "--job", tmp_path / "job")
        deck = tmp_path / "job.inp"
    assert model.deck().encode("utf-8", "surrogateescape") == deck.read_bytes()
    assert qrx.load_all(path) == models
    assert model.copy() == model


@pytest.mark.parametrize("path", model_files(), ids=name_of)
def test_RecordsOfAModel_ComeBackFromTheirRepr(path):
    for model in qrx.load_all(path).values():
        for repository in _repositories():
            for record in getattr(model, repository).values():
                assert eval(repr(record)) == record
        for step in model.steps.values():
            assert eval(repr(step)) == step


def _repositories():
    from qrx import _containers

    return list(_containers.repositories())


# Classes that no field of a model holds, so that no model file can.
WITHOUT_PLACE = {
    "AcousticBulkModulus", "AcousticVolumetricDrag", "ContactPairState", "ContactStabilization", "FluidBulkModulus",
    "FluidDensity", "FluidExpansion", "IntegratedOutputSection", "PointMassInertia", "RemeshingRule",
    "SelfContactState", "SurfaceToSurfaceContactState", "TransverseShearBeam", "VectorState", "BrittleCracking",
    "BrittleShear", "JointShearRetention", "JointedMaterial", "BulkFailure", "FirstDirection", "SecondDirection",
    "ThirdDirection",
}
ALL = [name for name, full in _records.classes().items() if not _qrx.class_of(full).abstract]


def _held(told):
    while told["kind"] in ("List", "Map", "Attribute"):
        told = told.get("item") or told.get("value")
    return _records.class_named(told["class"]) if told["kind"] in ("Record", "Optional", "Variant") else None


def _wrapped(told, record):
    if told["kind"] == "List":
        return [_wrapped(told["item"], record)]
    if told["kind"] == "Map":
        return {"Key": _wrapped(told["item"], record)}
    return _wrapped(told["value"], record) if told["kind"] == "Attribute" else record


def _new(cls):
    if cls is qrx.InitialStep:
        return cls()
    return cls("X") if issubclass(cls, _records.Step) or cls is qrx.Datum else cls()


def _place(model, record, depth=0):
    """Puts the record where a model can hold it, by itself or in others; false when nothing holds it."""
    if isinstance(record, _records.Step):
        model.add_step(record)
        return True
    if isinstance(record, qrx.Datum):
        model.add_datum(record)
        return True
    if isinstance(record, qrx.ElemCtrlParams):
        model.add_part("P", qrx.Mesh([[0, 0, 0], [1, 0, 0]], {"T3D2": [[0, 1]]}, controls={"T3D2": record}))
        return True
    if isinstance(record, qrx.ModelSectorDefinition):
        model.cyclic_symmetry = record
        return True
    if isinstance(record, qrx.IgnoredFinding):
        model.ignore.append(record)
        return True
    if isinstance(record, qrx.PartAttribute):
        name = {"SectionAssignment": "section_assignments", "ConnectorOrientation": "connector_orientations"}
        if type(record).__name__ in name:
            getattr(model.assembly, name[type(record).__name__]).append(record)
        else:
            record.region = "ALL"
            kinds = {"MaterialOrientation": "material_orientations", "BeamOrientation": "beam_orientations"}
            getattr(model.parts["ROD"], kinds[type(record).__name__]).append(record)
        return True
    for name in _repositories():
        repository = getattr(model, name)
        if isinstance(record, _records.class_named(repository._class_name)):
            if isinstance(record, _records.Propagating) and not record.states:
                record.at("Pull")
            repository["X"] = record
            return True
    if depth > 3:
        return False
    for holder in map(_records.class_of, ALL):
        if issubclass(holder, _records.Propagating) and holder._state_class() is type(record):
            owner = holder()
            owner.states["Pull"] = record
            return _place(model, owner, depth + 1)
        for field in holder._fields.values():
            held = _held(field.told)
            if held is not None and isinstance(record, held):
                owner = _new(holder)
                setattr(owner, field.name, _wrapped(field.told, record))
                if _place(model, owner, depth + 1):
                    return True
    return False


@pytest.mark.parametrize("name", ALL)
def test_EveryClass_ThroughTheModelFile_IsTheSame(name, tmp_path):
    model = rod.model()
    record = _new(getattr(qrx, name))
    placed = _place(model, record)
    assert placed == (name not in WITHOUT_PLACE)
    errors = [finding for finding in model.check() if finding.is_error]
    if errors:
        # A record of defaults alone that its rules refuse: told, and told when it is written too.
        with pytest.raises(qrx.ModelError):
            model.save(tmp_path / "x.json")
        return
    model.save(tmp_path / "x.json")
    read = qrx.load(tmp_path / "x.json")
    assert read == model
    try:
        deck = model.deck()
    except qrx.DeckError as error:
        assert error.text
        return
    assert read.deck() == deck


def _records_in(value):
    if isinstance(value, _records.Record):
        yield value
        yield from _records_in(value._values)
        yield from _records_in(getattr(value, "states", {}))
    elif isinstance(value, dict):
        for item in value.values():
            yield from _records_in(item)
    elif isinstance(value, list):
        for item in value:
            yield from _records_in(item)


# Classes that no golden deck has beside those without a place: what no deck carries, or carries what stands for it.
WITHOUT_DECK = {
    "ActuatorSensor", "ActuatorSensorProp", "ActuatorSensorState", "AdptMeshCons", "AdptMeshConsState", "AdptMeshCtrl",
    "ComplexFrequencyStep", "ConcFilmCondition", "ConcFilmConditionState", "ContactInitialization",
    "GeneralShellSection", "IgnoredFinding", "SubmodelStressBased", "SubmodelStressBasedState", "UnwrittenLoad",
    "UserShellSection",
}


def test_EveryClass_IsInADeckOfTheTests():
    seen = set()
    for path in model_files():
        for model in qrx.load_all(path).values():
            values = [getattr(model, name)._items for name in _repositories()]
            values += [list(model.steps.values()), list(model.datums.values()), model.assembly.section_assignments]
            values += [model.assembly.connector_orientations, model._data._values]
            for owner in [*model.parts.values(), *model.instances.values()]:
                values += [owner.section_assignments, owner.material_orientations, owner.beam_orientations]
                if owner.mesh is not None:
                    values += [[block.controls for block in owner.mesh.cells]]
            for value in values:
                seen |= {type(record).__name__ for record in _records_in(value)}
    known = {name for name, full in _records.classes().items() if not _qrx.class_of(full).abstract}
    assert known - seen == WITHOUT_DECK | WITHOUT_PLACE
