"""Studies from Python: the decks are those of the changed models."""

import hashlib
import itertools

import numpy as np
import pytest

import qrx
from conftest import ROOT

FORCE = "/models/Default Model/loads/F/states/Pull/component1"
AREA = "/models/Default Model/sections/Bar/area"
PLACE = "/models/Default Model/assembly/instances/BAR-1/translation"


def bar(force=100, area=2.5, translation=(0, 0, 0)):
    m = qrx.Model(heading="A bar")
    mesh = qrx.Mesh([[0, 0, 0], [1, 0, 0]], {"T3D2": [[0, 1]]}, point_sets={"FOOT": [0], "TIP": [1]},
                    cell_sets={"ALL": [0]})
    part = m.add_part("BAR", mesh)
    m.materials["Steel"] = qrx.Material(elastic=[[210e3, 0.3]])
    m.sections["Bar"] = qrx.TrussSection(material="Steel", area=area)
    part.assign("ALL", "Bar")
    m.add_instance("BAR-1", part, translation=list(translation))
    pull = m.add_step(qrx.StaticStep("Pull"))
    m.boundary_conditions["Fixed"] = qrx.DisplacementBC("BAR-1.FOOT").at("Initial", u1=0, u2=0, u3=0)
    m.loads["F"] = qrx.ConcentratedForce("BAR-1.TIP").at(pull, component1=force)
    return m


@pytest.mark.parametrize("jobs", [1, 3])
def test_Decks_AreThoseOfTheChangedModels_InTheOrderOfRows(jobs):
    rows = [{"name": f"r{i}", FORCE: 10 + i, AREA: 1 + i / 4, PLACE: [0, i, 0]} for i in range(40)]
    results = list(qrx.study(bar(translation=(1, 1, 1)), rows, jobs=jobs))
    assert [result.row for result in results] == list(range(1, 41))
    for i, result in enumerate(results):
        assert result.ok and result.name == f"r{i}" and result.errors == []
        assert result.deck == bar(10 + i, 1 + i / 4, (0, i, 0)).deck().encode()
        assert result.sha256 == hashlib.sha256(result.deck).hexdigest()
        assert result.parameters == {FORCE: 10 + i, AREA: 1 + i / 4, PLACE: [0, i, 0]}


def test_RowsThatAreWrong_FailAlone():
    rows = [{FORCE: 1}, {FORCE: "strong"}, {FORCE.replace("/F/", "/H/"): 1}, {"forse": 1}, {FORCE: 2}]
    results = list(qrx.study(bar(), rows))
    assert [result.ok for result in results] == [True, False, False, False, True]
    assert results[1].errors[0].place == FORCE
    assert results[1].errors[0].text == "found 'strong', expected a number"
    assert "found no 'H'" in results[2].errors[0].text
    with pytest.raises(ValueError, match="row 2 failed"):
        results[1].write("nowhere.inp")


def test_ValuesOfNumpy_AreTaken(tmp_path):
    (result,) = qrx.study(bar(), [{FORCE: np.float64(7), PLACE: np.array([0.0, 1.0, 2.0])}])
    result.write(tmp_path / "bar.inp")
    assert (tmp_path / "bar.inp").read_bytes() == bar(7, translation=(0, 1, 2)).deck().encode()


def test_EndlessRows_AreTakenAsResultsAreAskedFor():
    taken = []

    def rows():
        for i in itertools.count(1):
            taken.append(i)
            yield {FORCE: i}

    results = list(itertools.islice(qrx.study(bar(), rows(), jobs=2), 20))
    assert len(results) == 20
    assert len(taken) <= 20 + 4 * 2


def test_ModelThatIsWrong_IsRefusedAtOnce():
    model = bar()
    model.loads["F"] = qrx.ConcentratedForce("BAR-1.NOWHERE").at("Pull", component1=1)
    with pytest.raises(qrx.ModelError, match="NOWHERE"):
        qrx.study(model, [{}])
    with pytest.raises(ValueError, match="jobs"):
        qrx.study(bar(), [], jobs=0)


def test_ModelWithAMeshersFile_HasTheDecksOfItsChanges():
    model = qrx.load(ROOT / "examples/perforated_plate/perforated_plate.json")
    thickness = "/models/Default Model/sections/Sheet/thickness"
    for value, result in zip((1.5, 3), qrx.study(model, [{thickness: 1.5}, {thickness: 3}])):
        model.sections["Sheet"].thickness = value
        assert result.deck == model.deck().encode()
