"""Models, their decks, checks and files."""

import copy
import io
import json

import pytest

import qrx
import rod


def test_Rod_WritesTheDeckOfTheRules():
    assert rod.model().deck() == rod.DECK


def test_SavedModel_IsEqualAndWritesTheSameDeck(tmp_path):
    model = rod.model()
    path = tmp_path / "rod.json"
    model.save(path)
    read = qrx.load(path)
    assert read == model
    assert read.deck() == rod.DECK


def test_Copy_IsItsOwn():
    model = rod.model()
    for twin in (model.copy(), copy.copy(model), copy.deepcopy(model)):
        assert twin == model
        twin.materials["Steel"].elastic.table[0][0] = 70000.0
        twin.loads["Force"].states["Pull"].component1 = 5
        twin.parts["ROD"].assign("ALL", "Other")
        twin.steps["Pull"].time_period = 9
        twin.assembly.name = "Other"
        assert twin != model
    assert model.deck() == rod.DECK


def test_RightModel_HasNoFindings():
    assert rod.model().check() == []


def test_WhatTheModelIgnores_IsNotTold():
    model = rod.model()
    model.materials["Spare"] = qrx.Material()
    assert {finding.code for finding in model.check()} == {"empty-material", "unused"}
    model.ignore.append(qrx.IgnoredFinding(code="empty-material", reason="to come"))
    assert [finding.code for finding in model.check()] == ["unused"]
    model.ignore.append(qrx.IgnoredFinding(code="unused", reason="our library", place="/models/Default Model/parts"))
    assert [finding.code for finding in model.check()] == ["unused"]


def test_WrongModel_IsToldWithPlacesAndHints():
    model = rod.model()
    model.sections["Round"].material = "Stel"
    model.loads["Force"].region = "ROD-1.TOP"
    findings = model.check()
    assert [finding.place for finding in findings] == [
        "/models/Default Model/loads/Force/region",
        "/models/Default Model/sections/Round/materialName",
    ]
    assert findings[1].hint == "did you mean 'Steel'?"
    assert findings[1].is_error
    assert "Stel" in str(findings[1])
    for write in (model.deck, lambda: model.write(io.BytesIO()), lambda: model.save(io.BytesIO())):
        with pytest.raises(qrx.ModelError) as raised:
            write()
        assert [each.place for each in raised.value.findings if each.is_error] == [each.place for each in findings]


def test_WhatADeckLeavesOut_IsAWarning():
    model = rod.model()
    model.restart_job = "before"
    (finding,) = model.check()
    assert finding.severity == "warning"
    assert finding.place == "/models/Default Model/restartJob"
    assert model.deck() == rod.DECK


def test_WhatADeckCantSay_IsADeckError(tmp_path):
    model = rod.model()
    model.add_step(qrx.ComplexFrequencyStep("Whirl"))
    (tmp_path / "rod.inp").write_text("old")
    for write in (model.deck, lambda: model.write(tmp_path / "rod.inp"), lambda: model.write(io.BytesIO())):
        with pytest.raises(qrx.DeckError) as raised:
            write()
        assert raised.value.text == "Unimplemented function to write out *Step card"
        assert (raised.value.step, raised.value.object) == ("Whirl", "")
    assert (tmp_path / "rod.inp").read_text() == "old"
    assert [finding.place for finding in model.check()] == ["/models/Default Model/steps/2/class"]


def test_DeckError_TellsObjectAndStep():
    error = qrx.DeckError("no such thing", "step 'Load', load 'P1'")
    assert (error.text, error.step, error.object) == ("no such thing", "Load", "P1")
    assert str(error) == "no such thing (step 'Load', load 'P1')"


def test_ValueThatIsPutBehindTheRecordsBack_IsFoundByTheCheck():
    model = rod.model()
    model.materials["Steel"].elastic.table[0][0] = float("nan")
    (finding,) = model.check()
    assert finding.place == "/models/Default Model/materials/Steel/elastic/table/0/0"
    assert finding.found == "found nan"
    model.materials["Steel"].elastic.table[0] = ["x", 1]
    finding = next(each for each in model.check() if each.is_error)
    assert finding.place == "/models/Default Model/materials/Steel/elastic/table/0/0"
    with pytest.raises(qrx.ModelError):
        model.deck()


def test_Steps_HaveTheirOrder():
    model = qrx.Model()
    model.add_step(qrx.StaticStep("B"))
    model.add_step(qrx.StaticStep("D"))
    model.add_step(qrx.StaticStep("A"), before="B")
    model.add_step(qrx.StaticStep("C"), after=model.steps["B"])
    assert list(model.steps) == ["Initial", "A", "B", "C", "D"]
    del model.steps["C"]
    assert list(model.steps) == ["Initial", "A", "B", "D"]
    with pytest.raises(qrx.ModelError):
        model.add_step(qrx.StaticStep("A"))
    with pytest.raises(KeyError, match="did you mean"):
        model.steps["initia"]


def test_WrongNamesInContainers_NameTheNearest():
    model = rod.model()
    with pytest.raises(KeyError, match="did you mean 'Steel'"):
        model.materials["Stel"]
    with pytest.raises(KeyError, match="did you mean 'ROD'"):
        model.parts["ROT"]
    with pytest.raises(AttributeError, match="did you mean 'boundary_conditions'"):
        model.boundary_condition = {}
    with pytest.raises(qrx.ModelError, match="qrx.Load"):
        model.loads["Steel"] = qrx.Material()
    with pytest.raises(qrx.ModelError, match="a second part"):
        model.add_part("ROD")


def test_Container_IsAssignedAsAWhole():
    model = rod.model()
    model.materials = {"Steel": qrx.Material(elastic=[[1, 0]])}
    assert list(model.materials) == ["Steel"]
    with pytest.raises(qrx.ModelError):
        model.materials = {"Steel": 5}
    model.steps = [qrx.StaticStep("A"), qrx.StaticStep("B")]
    assert list(model.steps) == ["Initial", "A", "B"]
    model.parts = dict(model.parts)
    assert model.parts["ROD"].name == "ROD"
    for name, value in (("parts", {"A": 5}), ("datums", {"A": 5}), ("assembly", {}), ("steps", [5])):
        with pytest.raises(qrx.ModelError):
            setattr(model, name, value)


def test_Heading_IsTheTextBelowTheKeyword():
    assert qrx.Model(heading="A").top_level_solver_input == "*Heading\nA\n"
    assert qrx.Model(top_level_solver_input=["*Heading", "B"]).heading == "B"
    assert qrx.Model().heading is None
    with pytest.raises(TypeError):
        qrx.Model(heading="A", top_level_solver_input="B")


def test_History_HasTheRowsOfTheTable():
    history = rod.model().history("loads")
    (row,) = history
    assert row.name == "Force"
    assert not row.suppressed
    assert row.steps["Initial"].status == "NOT_YET_ACTIVE"
    assert row.steps["Pull"] == (qrx.PropagationStatus.CREATED, True, False)
    assert str(history).splitlines()[1:3] == [
        "           Initial  Pull",
        "    Force  -        created *",
    ]
    assert set(rod.model().history()) >= {"loads", "boundary_conditions", "fields", "interactions"}
    with pytest.raises(qrx.ModelError, match="did you mean 'loads'"):
        rod.model().history("load")


def test_History_IsThatOfTheProgram(tmp_path, program):
    from conftest import run

    model = rod.model()
    model.save(tmp_path / "rod.json")
    told = json.loads(run(program, "info", "--history", "--json", tmp_path / "rod.json").stdout)
    history = told["models"]["Default Model"]["history"]
    for kind, rows in model.history().items():
        file_kind = {"boundary_conditions": "boundaryConditions", "field_output_requests": "fieldOutputRequests",
                     "history_output_requests": "historyOutputRequests"}.get(kind, kind)
        assert [row.name for row in rows] == list(history[file_kind])
    printed = run(program, "info", "--history", tmp_path / "rod.json").stdout
    for line in str(model.history("loads")).splitlines()[:3]:
        assert line in printed.splitlines()


def test_DeckLines_AreThoseOfTheDeck():
    model = rod.model()
    lines = model.deck_lines("loads", "Force", "Pull")
    assert lines == ["** Name: Force   Type: Concentrated force", "*Cload", "ROD-1.TIP, 1, 1000."]
    assert "\n".join(lines) in rod.DECK
    assert model.deck_lines("loads", "Force", "Initial") == []
    assert model.deck_lines("steps", "Pull", "Pull")[0].startswith("*Step, name=Pull")
    with pytest.raises(KeyError):
        model.deck_lines("loads", "Forse", "Pull")
    with pytest.raises(KeyError):
        model.deck_lines("loads", "Force", "Pul")


def test_Notebook_ShowsASummary():
    model = rod.model()
    model.heading = "<b>"
    shown = model._repr_html_()
    assert "<td style='text-align:left'>ROD</td>" in shown
    assert "&lt;b&gt;" in shown
    assert "<b>" not in shown
    model.loads["Force"].region = "NOWHERE"
    assert "NOWHERE" not in shown
    assert "found set &#x27;NOWHERE&#x27;" in model._repr_html_()


def test_View_IsThePage(tmp_path):
    model = rod.model()
    try:
        page = model.view(tmp_path / "rod.html")
    except RuntimeError as error:
        assert "viewer" in str(error)
        return
    assert (tmp_path / "rod.html").read_text(encoding="utf-8") == page
    assert page._repr_html_().startswith("<iframe")


def test_AssemblySets_ComeBack(tmp_path):
    model = rod.model()
    model.add_instance("ROD-2", "ROD", rotation=(0, 0, 0.1))
    model.add_node_set("TIPS", {"ROD-1": [3], "ROD-2": [3]})
    model.add_element_set("ENDS", [("ROD-1", [2]), ("ROD-2", [1])], internal=True)
    model.assembly.mesh = qrx.AssemblyMesh(
        [(0, 0, 0.1)], [("CONN3D2", [["ROD-1.3", 1]], [7])], controls={"CONN3D2": qrx.ElemCtrlParams(length_ratio=0.3)}
    )
    model.add_node_set("REF", {None: [1]})
    model.save(tmp_path / "rod.json")
    read = qrx.load(tmp_path / "rod.json")
    assert read.assembly.sets == model.assembly.sets
    assert read.assembly.mesh == model.assembly.mesh
    assert read == model
    with pytest.raises(qrx.ModelError):
        model.add_node_set("REF", {})


def test_Instance_HasMeshAndSectionsOfItsOwn(tmp_path):
    model = rod.model()
    other = model.add_instance("ROD-2", "ROD")
    other.mesh = rod.mesh()
    other.assign("ALL", "Round")
    assert "ROD-2" in model.deck()
    model.save(tmp_path / "rod.json")
    assert qrx.load(tmp_path / "rod.json") == model


def test_MeshOfSeveralInstances_IsOneObject(tmp_path):
    model = rod.model()
    model.add_part("TWIN", model.parts["ROD"].mesh)
    copied = model.copy()
    assert copied.parts["TWIN"].mesh is copied.parts["ROD"].mesh


def test_OtherModels_StayInTheFile(tmp_path):
    first = rod.model()
    second = rod.model()
    second.name = "Other"
    second.heading = "The other one"
    qrx.save([first, second], tmp_path / "both.json")
    assert qrx.load_all(tmp_path / "both.json") == {"Default Model": first, "Other": second}
    assert qrx.load(tmp_path / "both.json", "Other").heading == "The other one"
    with pytest.raises(KeyError):
        qrx.load(tmp_path / "both.json", "Third")


def test_NameOfAModel_IsNothingToItsDeck(tmp_path):
    model = rod.model()
    expected = model.deck()
    model.name = "Mine"
    assert model.deck() == expected
    model.save(tmp_path / "mine.json")
    assert qrx.load(tmp_path / "mine.json").name == "Mine"


def test_Datums_AreFoundByName(tmp_path):
    model = rod.model()
    csys = model.add_datum(qrx.Datum("Axes", system="cylindrical", x_axis=(1, 1, 0), y_axis=(-1, 1, 0)))
    model.loads["Force"].datum = csys
    assert model.loads["Force"].datum == "Axes"
    assert "*Transform" in model.deck()
    model.save(tmp_path / "rod.json")
    assert qrx.load(tmp_path / "rod.json") == model


def test_ModelsOfPython_TellAllFields():
    for name in ("description", "absolute_zero", "wave_formulation", "analysis_product"):
        assert getattr(qrx.Model, name).__doc__
    assert qrx.Model(wave_formulation="total").wave_formulation == "TOTAL"
    with pytest.raises(TypeError, match="did you mean 'absolute_zero'"):
        qrx.Model(absolut_zero=1)


def test_Parameters_StayWithTheModel(tmp_path):
    model = rod.model()
    force = "/models/Default Model/loads/Force/states/Pull/component1"
    model.parameters["force"] = force
    model.parameters["stiffness"] = {
        "pointers": ["/models/Default Model/materials/Steel/elastic/table/0/0"], "unit": "MPa", "limits": "> 0",
        "description": "Young's modulus",
    }
    model.parameters["title"] = "/models/Default Model/topLevelSolverInput/1"
    assert model.check() == []
    assert model.parameters["force"] == qrx.Parameter((force,))
    model.save(tmp_path / "rod.json")
    read = qrx.load(tmp_path / "rod.json")
    assert read == model
    assert read.parameters["stiffness"].unit == "MPa"
    assert model.copy() == model
    model.parameters["force"] = force.replace("Force", "Forse")
    (finding,) = model.check()
    assert finding.place == "/parameters/force/pointers/0"
    assert finding.hint == "did you mean 'Force'?"
    with pytest.raises(KeyError, match="did you mean 'force'"):
        model.parameters["farce"]


def test_ParameterInAMeshFile_Stays(tmp_path):
    import shutil

    from conftest import ROOT

    shutil.copy(ROOT / "examples" / "bonded_blocks" / "blocks.msh", tmp_path)
    model = qrx.Model()
    model.add_part("P", qrx.Mesh.read(tmp_path / "blocks.msh", scale=2.0))
    model.parameters["scale"] = "/models/Default Model/parts/P/mesh/scale"
    model.save(tmp_path / "p.json")
    assert qrx.load(tmp_path / "p.json") == model


def test_FindingInAFile_HasItsLine(tmp_path):
    (tmp_path / "m.json").write_text('{"format": "qrx-model/1",\n "models": {"Default Model": {"lods": {}}}}')
    with pytest.raises(qrx.ModelError) as raised:
        qrx.load(tmp_path / "m.json")
    (finding,) = raised.value.findings
    assert finding.line == 2
    assert "line 2, column " in str(raised.value)
