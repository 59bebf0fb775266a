"""Meshes of arrays, of files and of other programs."""

import gc
import pathlib
import sys
import types
import weakref

import numpy as np
import pytest

import qrx
import rod
from conftest import ROOT

POINTS = np.array([[0, 0, 0], [1, 0, 0], [1, 1, 0], [0, 1, 0], [0, 0, 1], [1, 0, 1], [1, 1, 1], [0, 1, 1]], float)
BRICK = [[0, 1, 2, 3, 4, 5, 6, 7]]


@pytest.mark.parametrize("points", [np.float32, np.float64, np.int64, np.int16, np.float16])
@pytest.mark.parametrize("cells", [np.int32, np.int64, np.uint8, np.uint32, np.uint64])
def test_NumbersOfAnyType_AreTaken(points, cells):
    mesh = qrx.Mesh(POINTS.astype(points), {"C3D8": np.array(BRICK, cells)})
    assert mesh.points.dtype == np.float32
    assert (mesh.points == POINTS).all()
    assert mesh.cells[0].data.dtype == np.int32
    assert (mesh.cells[0].data == BRICK).all()
    assert mesh.point_labels.tolist() == list(range(1, 9))


def test_ArraysInAnyOrder_AreTaken():
    mesh = qrx.Mesh(np.asfortranarray(POINTS), {"C3D8": np.array([BRICK[0], BRICK[0]], order="F")[::2]})
    assert (mesh.points == POINTS).all()
    assert (mesh.cells[0].data == BRICK).all()
    strided = np.zeros((16, 6))
    strided[::2, ::2] = POINTS
    assert (qrx.Mesh(strided[::2, ::2], {"C3D8": BRICK}).points == POINTS).all()
    big = POINTS.astype(">f8")
    assert (qrx.Mesh(big, {"C3D8": np.array(BRICK, ">i4")}).points == POINTS).all()


def test_PlanePoints_LieInThePlane():
    mesh = qrx.Mesh(POINTS[:4, :2], {"CPS4": [[0, 1, 2, 3]]})
    assert (mesh.points[:, 2] == 0).all()


@pytest.mark.parametrize(
    ("make", "place", "found"),
    [
        (lambda: qrx.Mesh(POINTS.ravel(), {"C3D8": BRICK}), "/points", "found an array of shape (24,)"),
        (lambda: qrx.Mesh(np.zeros((3, 4)), {}), "/points", "found an array of shape (3, 4)"),
        (lambda: qrx.Mesh([["a", "b", "c"]], {}), "/points", "found an array of <U1"),
        (lambda: qrx.Mesh([[0, 0, np.nan]], {}), "/points/0/2", "found a coordinate beyond single precision"),
        (lambda: qrx.Mesh([[0, 1e39, 0]], {}), "/points/0/1", "found a coordinate beyond single precision"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK[0]}), "/cells/0", "found an array of shape (8,)"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": [[0.5] * 8]}), "/cells/0", "found an array of shape (1, 8) of float64"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": [[0, 1, 2, 3, 4, 5, 6, 8]]}), "/cells/0/0/7", "found 8"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": [[0, 1, 2, 3, 4, 5, 6, -1]]}), "/cells/0/0/7", "found -1"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": [[0, 1, 2, 3, 4, 5, 6, 2**40]]}), "/cells/0/0/7", "found 1099511627776"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": [[0, 1, 2, 3]]}), "/cells/0", "found rows of 4 nodes"),
        (lambda: qrx.Mesh(POINTS, {"C3D9Q": BRICK}), "/cells/0", "found 'C3D9Q'"),
        (lambda: qrx.Mesh(POINTS, {"hexahedron": [[0, 1, 2]]}), "/cells/0", "found an array of shape (1, 3)"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_labels=[1] * 8), "/points/labels/1", "node label 1"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_labels=[1]), "/points/coordinates", "found 8 points"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_labels=[0] * 8), "/points/labels/0", "found 0"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_labels=[2**40] * 8), "/point_labels/0", "found 1099511627776"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, cell_labels={"C3D8": [5, 6]}), "/cells/0/connectivity", "found 8"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK * 2}, cell_labels=[[5, 5]]), "/elements/0/labels/1", "element label"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, cell_labels=[[1], [2]]), "/cell_labels", "found 2 arrays"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_sets={"A": [8]}), "/point_sets/A", "found 8"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_sets={"A": [0.5]}), "/point_sets/A", "found an array"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_sets={"A": [True]}), "/point_sets/A", "found a mask of 1"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, cell_sets={"A": [[0], [0]]}), "/cell_sets", "found 2 arrays"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, surfaces={"A": [(1, "S7")]}), "/facets/0/1", "found 'S7'"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, surfaces={"A": [(2, "S1")]}), "/facets/0/0", "found 2"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, surfaces={"A": [5]}), "/surfaces", "found something else"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, point_sets={'A"': [0]}), "/name", "found"),
        (lambda: qrx.Mesh(POINTS, {"C3D8": BRICK}, controls={"C3D4": {}}), "/controls", "found 'C3D4'"),
    ],
)
def test_WrongArrays_AreRefusedByName(make, place, found):
    with pytest.raises(qrx.ModelError) as raised:
        make()
    finding = raised.value.findings[0]
    assert (finding.place, finding.found[: len(found)]) == (place, found)


def test_Sets_AreePlacesMasksAndLabels():
    mesh = qrx.Mesh(
        POINTS, {"C3D8": BRICK}, point_labels=range(10, 90, 10), cell_labels={"C3D8": [7]},
        point_sets={"LEFT": POINTS[:, 0] == 0, "TWO": np.array([1, 0])},
        cell_sets={"ALL": [0]},
        surfaces={"TOP": [(7, "S2")], "SIDES": {"S3": [7], "S4": [7]}},
    )
    assert mesh.point_sets["LEFT"].tolist() == [0, 3, 4, 7]
    assert mesh.sets["LEFT"].labels.tolist() == [10, 40, 50, 80]
    assert mesh.point_sets["TWO"].tolist() == [1, 0]
    assert mesh.cell_sets["ALL"].tolist() == [0]
    assert mesh.sets["ALL"].labels.tolist() == [7]
    assert mesh.surfaces["TOP"].dtype.names == ("label", "face")
    assert mesh.surfaces["SIDES"].tolist() == [(7, "S3"), (7, "S4")]
    twin = qrx.Mesh(POINTS, {"C3D8": BRICK}, cell_labels=[[7]], surfaces={"SIDES": mesh.surfaces["SIDES"]})
    assert twin.surfaces["SIDES"].tolist() == [(7, "S3"), (7, "S4")]
    assert list(mesh.sets) == ["LEFT", "TWO", "ALL", "TOP", "SIDES"]
    with pytest.raises(KeyError, match="did you mean 'LEFT'"):
        mesh.point_sets["LEFD"]
    with pytest.raises(qrx.ModelError, match="second set named"):
        mesh.add_point_set("LEFT", [0])
    # A set that is refused leaves no trace.
    with pytest.raises(qrx.ModelError):
        mesh.add_set("WRONG", "node", [10, 11])
    assert "WRONG" not in mesh.sets


def test_Views_AreOfTheStoresOwnNumbersAndReadOnly():
    mesh = rod.mesh()
    points = mesh.points
    assert not points.flags.writeable and not points.flags.owndata
    assert points.__array_interface__["data"] == mesh.points.__array_interface__["data"]
    with pytest.raises(ValueError):
        points[0, 0] = 5
    with pytest.raises(ValueError):
        points.setflags(write=True)
    assert not mesh.cells[0].data.flags.writeable
    assert not mesh.cells[0].labels.flags.writeable


def test_Views_OutliveMeshesAndModels():
    model = rod.model()
    mesh = weakref.ref(model.parts["ROD"])
    points = model.parts["ROD"].mesh.points
    cells = model.parts["ROD"].mesh.cells[0]
    del model
    gc.collect()
    assert mesh() is None
    assert points.tolist() == [[0, 0, 0], [50, 0, 0], [100, 0, 0]]
    assert cells.data.tolist() == [[0, 1], [1, 2]]
    assert cells.labels.tolist() == [1, 2]


def test_Mesh_OutlivesPartAndModelAndModelThePart():
    model = rod.model()
    mesh = model.parts["ROD"].mesh
    part = model.parts["ROD"]
    del model.parts["ROD"]
    del model
    gc.collect()
    assert part.mesh is mesh
    del part
    gc.collect()
    assert mesh.num_points == 3
    assert mesh.sets["TIP"].labels.tolist() == [3]


def test_Views_HoldTheMeshAndNothingHoldsTheArraysGiven():
    points = POINTS.astype(np.float32)
    cells = np.array(BRICK, np.int32)
    before = [sys.getrefcount(points), sys.getrefcount(cells)]
    mesh = qrx.Mesh(points, {"C3D8": cells})
    after = [sys.getrefcount(points), sys.getrefcount(cells)]
    assert after == before
    native = mesh._native
    held = [sys.getrefcount(native)]
    views = [mesh.points, mesh.cells[0].data]
    held.append(sys.getrefcount(native))
    del views
    gc.collect()
    held.append(sys.getrefcount(native))
    assert held[1] == held[0] + 2
    assert held[2] == held[0]


def test_ModelsThatAreGone_LeaveNothing():
    def resident():
        return int(pathlib.Path("/proc/self/statm").read_text().split()[1]) * 4096

    def once():
        model = rod.model()
        model.add_part("LARGE", qrx.Mesh(np.zeros((100000, 3)), {"T3D2": np.zeros((100000, 2), np.int64)}))
        model.add_instance("LARGE-1", "LARGE")
        model.copy().deck()
        model.loads["Force"].region = "NOWHERE"
        with pytest.raises(qrx.ModelError):
            model.deck()

    for _ in range(5):
        once()
    gc.collect()
    before = resident()
    for _ in range(20):
        once()
    gc.collect()
    # Each has meshes of 2.4 MB and a deck of as much; what is kept of 20 would be 80 MB and more.
    assert resident() - before < 30e6


def test_NumbersOfAnArray_AreCopiedOnce():
    points = POINTS.astype(np.float32)
    mesh = qrx.Mesh(points, {"C3D8": BRICK})
    points[0, 0] = 99
    assert mesh.points[0, 0] == 0


def test_CellsByMeshersNames_BecomeElementsAndSetsAsFilesDo():
    given = types.SimpleNamespace(
        points=POINTS,
        cells=[types.SimpleNamespace(type="hexahedron", data=np.array(BRICK)),
               types.SimpleNamespace(type="quad", data=np.array([[4, 5, 6, 7]])),
               ("line", np.array([[0, 1]]))],
        cell_sets={"BODY": [[0], [], []], "TOP": [None, np.array([0]), None], "EDGE": [[], [], [0]],
                   "gmsh:bounding_entities": [[0], [0], [0]]},
        point_sets={"CORNER": [0]},
    )
    mesh = qrx.Mesh(given)
    assert [block.type for block in mesh.cells] == ["C3D8"]
    # A boundary cell is the face behind it and its nodes; an edge its nodes.
    assert mesh.surfaces["TOP"].tolist() == [(1, "S2")]
    assert mesh.sets["TOP_NODES"].labels.tolist() == [5, 6, 7, 8]
    assert mesh.sets["EDGE"].labels.tolist() == [1, 2]
    assert mesh.sets["CORNER"].labels.tolist() == [1]
    assert mesh.sets["BODY"].kind == "element"
    scaled = qrx.Mesh(given, scale=1000, element_types={"hexahedron8": "C3D8R"}, groups={"TOP": "LID", "EDGE": None})
    assert scaled.cells[0].type == "C3D8R"
    assert scaled.points.max() == 1000
    assert "LID" in scaled.surfaces and "EDGE" not in scaled.sets
    assert qrx.Model().add_part("P", given).mesh == mesh


def test_CellsByMeshersNames_AsADict():
    mesh = qrx.Mesh(POINTS, {"hexahedron": BRICK}, cell_sets={"A": [0]}, point_sets={"B": [1]})
    assert mesh.cells[0].type == "C3D8"
    assert mesh.sets["A"].labels.tolist() == [1]
    with pytest.raises(qrx.ModelError):
        qrx.Mesh(types.SimpleNamespace(points=POINTS, cells=[("polygon", BRICK)]))
    with pytest.raises(TypeError):
        qrx.Mesh(5)


def test_UnstructuredGrid_IsTakenThroughItsArrays():
    grid = types.SimpleNamespace(
        points=POINTS, cells=np.array([8, 0, 1, 2, 3, 4, 5, 6, 7, 4, 4, 5, 6, 7]), celltypes=np.array([12, 9], np.uint8),
        cell_data={"region": np.array([3, 5])},
    )
    mesh = qrx.Mesh(grid, group_arrays=["region"])
    assert mesh.sets["region_3"].kind == "element"
    assert mesh.surfaces["region_5"].tolist() == [(1, "S2")]
    with pytest.raises(qrx.ModelError, match="region"):
        qrx.Mesh(grid, group_arrays=["regio"])


def test_WrongPlacesInGrids_AreRefused():
    with pytest.raises(qrx.ModelError, match="point 99"):
        qrx.Mesh(POINTS, {"tetra": [[0, 1, 2, 99]]})
    with pytest.raises(qrx.ModelError, match="beside elements by type"):
        try:
            qrx.Mesh(POINTS, {"C3D8": BRICK}, scale=2)
        except TypeError as error:
            raise qrx.ModelError([qrx.Finding("", str(error))]) from error


def test_MeshFile_IsReadAsInAModelFile(tmp_path):
    mesh = qrx.Mesh.read(ROOT / "examples" / "bracket" / "bracket.msh")
    assert (mesh.num_points, mesh.num_cells) == (14117, 7829)
    assert set(mesh.surfaces) >= {"LOADED-FACE", "BOLTS"}
    assert mesh.cells_dict["C3D10"].shape == (7829, 10)
    assert mesh == qrx.load(ROOT / "examples" / "bracket" / "bracket.json").parts["BRACKET"].mesh
    with pytest.raises(qrx.ModelError, match="did you mean"):
        qrx.Mesh.read(ROOT / "examples" / "bracket" / "bracket.msh", element_types={"tetra11": "C3D10"})
    with pytest.raises(FileNotFoundError):
        qrx.Mesh.read(tmp_path / "none.msh")
    (tmp_path / "bad.msh").write_text("$MeshFormat\n9 0 8\n")
    with pytest.raises(qrx.ModelError, match="bad.msh"):
        qrx.Mesh.read(tmp_path / "bad.msh")


def test_SavedModel_NamesItsMeshFile(tmp_path):
    import shutil

    shutil.copy(ROOT / "examples" / "bonded_blocks" / "blocks.msh", tmp_path)
    model = qrx.Model()
    model.add_part("P", qrx.Mesh.read(tmp_path / "blocks.msh", scale=0.001))
    model.save(tmp_path / "p.json")
    assert '"file"' in (tmp_path / "p.json").read_text()
    assert qrx.load(tmp_path / "p.json") == model
    # With a set more it is no longer what is in the file.
    model.parts["P"].mesh.add_point_set("MORE", [0])
    model.save(tmp_path / "q.json")
    assert '"file"' not in (tmp_path / "q.json").read_text()
    assert qrx.load(tmp_path / "q.json") == model


def test_Quality_TellsWhatIsWrong():
    good = qrx.Mesh(POINTS, {"C3D8": BRICK}).quality()
    assert good.is_good
    turned = qrx.Mesh(POINTS, {"C3D8": [[4, 5, 6, 7, 0, 1, 2, 3]]}, cell_labels=[[12]]).quality()
    assert not turned.is_good
    assert turned.inverted == (1, (12,))
    assert turned.findings[0].code == "inverted-elements"


def test_Controls_StandWithTheElements():
    controls = qrx.ElemCtrlParams(length_ratio=0.3)
    mesh = qrx.Mesh(POINTS, {"C3D8R": BRICK}, controls={"C3D8R": controls})
    assert mesh.cells[0].controls == controls


def test_EmptyMesh_IsAMesh():
    mesh = qrx.Mesh(np.empty((0, 3)), {})
    assert mesh.num_points == mesh.num_cells == 0
    assert mesh.cell_labels.tolist() == []
